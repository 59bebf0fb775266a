#ifndef QRX_OIF_THERMALPROCEDURES_H
#define QRX_OIF_THERMALPROCEDURES_H

#include "steps/oif_Procedure.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

/// *Heat Transfer, end=PERIOD, deltmx=D, mxdem=M
/// initial, period, min, max, end
/// with ", steady state" in the place of "end". A steady state with fixed increments repeats the first
/// number in the places of min and max.
class oif_HeatTransfer final : public oif_ProcedureOf<oif_HeatTransfer, kprC_HeatTransferStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Coupled Thermal-Electrical, end=PERIOD, deltmx=D, mxdem=M
/// initial, period, min, max, end
class oif_CoupledThermalElectric final
    : public oif_ProcedureOf<oif_CoupledThermalElectric, kprC_CoupledThermalElectricStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Mass Diffusion, end=PERIOD, dcmax=D
/// initial, period, min, max, end
class oif_MassDiffusion final : public oif_ProcedureOf<oif_MassDiffusion, kprC_MassDiffusionStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Coupled Temperature-Displacement, creep=none, deltmx=D, cetol=C, stabilize=M
/// initial, period, min, max
class oif_CoupledTempDisplacement final
    : public oif_ProcedureOf<oif_CoupledTempDisplacement, kprC_CoupledTempDisplacementStep> {
public:
    /// Without `v6Format` creep is worded "no creep" and "explicit".
    oif_CoupledTempDisplacement(const kprC_AnalysisStep& step, bool v6Format)
        : oif_ProcedureOf(step), v6Format_(v6Format) {}
    void Write(utl_Stream& stream) const override;

private:
    bool v6Format_;
};

#endif
