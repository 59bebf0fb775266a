#ifndef QRX_OIF_DYNAMICPROCEDURES_H
#define QRX_OIF_DYNAMICPROCEDURES_H

#include "keyword_layer/qkw_ModelInfo.h"
#include "steps/oif_Procedure.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"

#include <optional>
#include <utility>

/// *Dynamic,alpha=A,adiabatic,haftol=H,initial=NO
/// initial,period,min,max
/// without blanks behind the commas, unlike all others.
class oif_ImplicitDynamics final : public oif_ProcedureOf<oif_ImplicitDynamics, kprC_ImplicitDynamicsStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Dynamic, Explicit, adiabatic, scale factor=S
/// , period,, max increment
/// Raises when the step's kind of increments is none of its enumeration.
class oif_ExplicitDynamics final : public oif_ProcedureOf<oif_ExplicitDynamics, kprC_ExplicitDynamicsStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Dynamic Temperature-displacement, Explicit
/// and the rest as for oif_ExplicitDynamics.
class oif_DynamicTempDisplacement final
    : public oif_ProcedureOf<oif_DynamicTempDisplacement, kprC_TempDisplacementDynamicsStep> {
public:
    oif_DynamicTempDisplacement(const kprC_AnalysisStep& step, const qkw_ModelInfo& modelInfo)
        : oif_ProcedureOf(step), modelInfo_(&modelInfo) {}
    void Write(utl_Stream& stream) const override;

private:
    // Held, not asked.
    [[maybe_unused]] const qkw_ModelInfo* modelInfo_;
};

/// *Bulk Viscosity
/// linear, quadratic
/// for the two explicit procedures; for any other step it writes nothing.
class oif_BulkViscosity final : public qkw_KeywordOf<oif_BulkViscosity> {
public:
    template <class Step>
    explicit oif_BulkViscosity(const Step& step) {
        if constexpr (requires { step.linearBulkViscosity; }) {
            values_ = {step.linearBulkViscosity, step.quadraticBulkViscosity};
        }
    }
    void Write(utl_Stream& stream) const override;

private:
    std::optional<std::pair<double, double>> values_; ///< linear and quadratic
};

/// *Dynamic, subspace, vectors=N
/// initial, period,
class oif_SubspaceDynamics final : public oif_ProcedureOf<oif_SubspaceDynamics, kprC_SubspaceDynamicsStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

#endif
