#ifndef QRX_OIF_STATICPROCEDURES_H
#define QRX_OIF_STATICPROCEDURES_H

#include "steps/oif_Procedure.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

/// *Static, adiabatic, direct, fully plastic=SET, stabilize=M
/// initial, period, min, max
/// Fixed increments end the data line behind ", ".
class oif_Static final : public oif_ProcedureOf<oif_Static, kprC_StaticStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Static, adiabatic, direct, fully plastic=SET, long term, riks
/// initial arc, total arc, min arc, max arc, max load factor, node set, dof, value
class oif_StaticRiks final : public oif_ProcedureOf<oif_StaticRiks, kprC_StaticRiksStep> {
public:
    /// `setName` is the deck's name of the node set that is monitored.
    oif_StaticRiks(const kprC_AnalysisStep& step, const cow_String& setName)
        : oif_ProcedureOf(step), setName_(setName) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
};

/// *Static
class oif_StaticLinearPerturbation final
    : public oif_ProcedureOf<oif_StaticLinearPerturbation, kprC_StaticLinearPerturbationStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Geostatic
class oif_Geostatic final : public oif_ProcedureOf<oif_Geostatic, kprC_GeostaticStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Soils, consolidation, end=PERIOD, utol=U, cetol=C, creep=none, stabilize=M
/// initial, period, min, max, end
class oif_Soils final : public oif_ProcedureOf<oif_Soils, kprC_SoilsStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Visco, cetol=C, creep=explicit, stabilize=M
/// initial, period, min, max
class oif_Visco final : public oif_ProcedureOf<oif_Visco, kprC_ViscoStep> {
public:
    /// Without `v6Format` creep is worded "explicit".
    oif_Visco(const kprC_AnalysisStep& step, bool v6Format) : oif_ProcedureOf(step), v6Format_(v6Format) {}
    void Write(utl_Stream& stream) const override;

private:
    bool v6Format_;
};

/// *Anneal, temperature=T
class oif_Anneal final : public oif_ProcedureOf<oif_Anneal, kprC_AnnealStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Buckle
/// eigenvalues, max, vectors, iterations
/// or, with ", eigensolver=lanczos", eigenvalues, min, max and block size as one, blocks
class oif_Buckle final : public oif_ProcedureOf<oif_Buckle, kprC_BuckleStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

#endif
