#include "store_interface/records/steps/kprC_StaticSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepFields.h"

const omu_EnumTable& omu_EnumTableOf(kprC_StaticStep::StabilizationEnm) {
    static constexpr omu_EnumTable table{"kprC_StaticStep::StabilizationEnm", kprC_StabilizationRows};
    return table;
}

const cls_FieldTable& kprC_StaticStep::Fields() {
    using R = kprC_StaticStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .With(kprC_AdiabaticField)
            .With(kprC_PseudoTimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::amplitude>("amplitude",
                                  "course of loads without an amplitude: 0 step, 1 ramp; 1 is not written")
            .With(kprC_ExtrapolationField)
            .With(kprC_NoStopField)
            .With(kprC_FullyPlasticField)
            .With(kprC_UnwrittenTechniqueField);
    return fields;
}

const cls_FieldTable& kprC_StaticRiksStep::Fields() {
    using R = kprC_StaticRiksStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .With(kprC_AdiabaticField)
            .With(kprC_TimeIncrementationField)
            .With(kprC_MaxNumIncField)
            .Field<&R::initialArcInc>("initialArcInc", "first (or fixed) increment of arc length (no unit)")
            .Field<&R::totalArc>("totalArc", "arc length scale of the step (no unit)")
            .Field<&R::minArcInc>("minArcInc", "smallest arc length increment, automatic method only")
            .Field<&R::maxArcInc>("maxArcInc",
                                  "largest arc length increment, automatic method only; 1e36 is not written")
            .Field<&R::maxLPF>("maxLPF", "load proportionality factor that ends the step (no unit)")
            .With(kprC_ExtrapolationField)
            .With(kprC_NoStopField)
            .With(kprC_FullyPlasticField)
            .Field<&R::nodeMonitored>("nodeMonitored", "whether a displacement of region ends the step")
            .Field<&R::region>("region", "node set that is monitored")
            .Field<&R::dof>("dof", "degree of freedom monitored, 1 to 6")
            .Field<&R::dofValue>("dofValue", "displacement (length) or rotation (radians) that ends the step")
            .Field<&R::longTerm>("longTerm", "long-term (fully relaxed) response of time-dependent materials")
            .With(kprC_UnwrittenTechniqueField);
    return fields;
}

const cls_FieldTable& kprC_GeostaticStep::Fields() {
    using R = kprC_GeostaticStep;
    static const cls_FieldTable fields = cls_Describe<R>(kprC_AnalysisStep::Fields())
                                             .With(kprC_NlgeomField)
                                             .With(kprC_UnwrittenTechniqueField);
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_SoilsStep::ResponseEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "TRANSIENT", "TRANSIENT"},
                                           {1, "STEADY_STATE", "STEADY_STATE"}};
    static constexpr omu_EnumTable table{"kprC_SoilsStep::ResponseEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_SoilsStep::StabilizationMethodEnm) {
    static constexpr omu_EnumTable table{"kprC_SoilsStep::StabilizationMethodEnm", kprC_StabilizationRows};
    return table;
}

const cls_FieldTable& kprC_SoilsStep::Fields() {
    using R = kprC_SoilsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .Field<&R::response>("response", "0 transient consolidation, otherwise steady state")
            .With(kprC_EndField)
            .With(kprC_PseudoTimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::creep>("creep", "false writes creep=none")
            .Field<&R::cetol>("cetol", "largest creep strain error per increment (no unit), written above 0")
            .Field<&R::utol>("utol", "largest pore pressure change per increment (stress); above 0 written, "
                                     "else the text utol=1.0")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .With(kprC_UnwrittenTechniqueField);
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ViscoStep::CreepIntegrationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "AUTOMATIC", "AUTOMATIC"}, {1, "EXPLICIT", "EXPLICIT"}};
    static constexpr omu_EnumTable table{"kprC_ViscoStep::CreepIntegrationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ViscoStep::StabilizationMethodEnm) {
    static constexpr omu_EnumTable table{"kprC_ViscoStep::StabilizationMethodEnm", kprC_StabilizationRows};
    return table;
}

const cls_FieldTable& kprC_ViscoStep::Fields() {
    using R = kprC_ViscoStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .Field<&R::creepIntegration>("creepIntegration", "0 automatic, 1 explicit")
            .Field<&R::cetol>(
                "cetol",
                "largest creep strain error per increment (no unit); always written by the automatic method")
            .With(kprC_PseudoTimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .With(kprC_UnwrittenTechniqueField);
    return fields;
}

const cls_FieldTable& kprC_AnnealStep::Fields() {
    using R = kprC_AnnealStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::refTemp>("refTemp", "temperature at which the model is annealed (temperature)")
            .With(kprC_NlgeomField);
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_BuckleStep::EigensolverEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SUBSPACE", "SUBSPACE"}, {1, "LANCZOS", "LANCZOS"}};
    static constexpr omu_EnumTable table{"kprC_BuckleStep::EigensolverEnm", rows};
    return table;
}

const cls_FieldTable& kprC_BuckleStep::Fields() {
    using R = kprC_BuckleStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::numEigen>("numEigen", "number of eigenvalues")
            .Field<&R::maxEigen>("maxEigen", "upper bound of the eigenvalues (load factor)")
            .Field<&R::vectors>("vectors", "subspace: number of iteration vectors")
            .Field<&R::maxIterations>("maxIterations", "subspace: largest number of iterations")
            .Field<&R::eigensolver>("eigensolver", "0 subspace, 1 Lanczos")
            .Field<&R::minEigen>("minEigen", "Lanczos: lower bound of the eigenvalues (load factor)")
            .Field<&R::blockSize>("blockSize", "Lanczos: block size")
            .Field<&R::maxBlocks>("maxBlocks", "Lanczos: largest number of blocks");
    return fields;
}

void cls_RegisterStaticStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_StaticStep>();
    registrar.Add<kprC_StaticRiksStep>();
    registrar.Add<kprC_StaticLinearPerturbationStep>();
    registrar.Add<kprC_GeostaticStep>();
    registrar.Add<kprC_SoilsStep>();
    registrar.Add<kprC_ViscoStep>();
    registrar.Add<kprC_AnnealStep>();
    registrar.Add<kprC_BuckleStep>();
}
