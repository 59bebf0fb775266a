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
            .Field<&R::amplitude>(
                "amplitude",
                "course of loads without an amplitude: at once or along a ramp; RAMP is not written")
            .With(kprC_ExtrapolationField)
            .With(kprC_NoStopField)
            .With(kprC_FullyPlasticField)
            .With(kprC_UnwrittenTechniqueField)
            .Example(R"({"nlgeom": "ON", "initialInc": 0.1})");
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
            .Field<&R::initialArcInc>("initialArcInc", "first (or fixed) increment of arc length")
            .Unit("no unit")
            .Field<&R::totalArc>("totalArc", "arc length scale of the step")
            .Unit("no unit")
            .Field<&R::minArcInc>("minArcInc",
                                  "smallest increment of arc length, of the automatic method only")
            .Unit("no unit")
            .Field<&R::maxArcInc>(
                "maxArcInc",
                "largest increment of arc length, of the automatic method only; 1e36 is not written")
            .Unit("no unit")
            .Field<&R::maxLPF>("maxLPF", "load proportionality factor that ends the step")
            .Unit("no unit")
            .With(kprC_ExtrapolationField)
            .With(kprC_NoStopField)
            .With(kprC_FullyPlasticField)
            .Field<&R::nodeMonitored>("nodeMonitored", "whether a displacement of region ends the step")
            .Field<&R::region>("region", "node set that is monitored")
            .Field<&R::dof>("dof", "degree of freedom monitored, 1 to 6")
            .Field<&R::dofValue>("dofValue", "displacement or rotation that ends the step")
            .Unit("length or radians")
            .Field<&R::longTerm>("longTerm", "long-term (fully relaxed) response of time-dependent materials")
            .With(kprC_UnwrittenTechniqueField)
            .Example(R"({"nlgeom": "ON", "initialArcInc": 0.05})");
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
            .Field<&R::response>("response", "TRANSIENT consolidation or STEADY_STATE")
            .With(kprC_EndField)
            .With(kprC_PseudoTimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::creep>("creep", "false writes creep=none")
            .Field<&R::cetol>("cetol", "largest creep strain error per increment, written above 0")
            .Unit("no unit")
            .Field<&R::utol>(
                "utol", "largest pore pressure change per increment; above 0 written, else the text utol=1.0")
            .Unit("stress")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .With(kprC_UnwrittenTechniqueField)
            .Example(R"({"timePeriod": 1000, "initialInc": 1, "utol": 0.1})");
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
            .Field<&R::creepIntegration>("creepIntegration",
                                         "AUTOMATIC choice of the integration, or EXPLICIT alone")
            .Field<&R::cetol>(
                "cetol", "largest creep strain error per increment; always written by the automatic method")
            .Unit("no unit")
            .With(kprC_PseudoTimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .With(kprC_UnwrittenTechniqueField)
            .Example(R"({"timePeriod": 1000, "initialInc": 1, "cetol": 0.001})");
    return fields;
}

const cls_FieldTable& kprC_AnnealStep::Fields() {
    using R = kprC_AnnealStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::refTemp>("refTemp", "temperature at which the model is annealed")
            .Unit("temperature")
            .With(kprC_NlgeomField)
            .Example(R"({"refTemp": 20})");
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
            .Field<&R::maxEigen>("maxEigen", "upper bound of the eigenvalues")
            .Unit("no unit")
            .Field<&R::vectors>("vectors", "subspace: number of iteration vectors")
            .Field<&R::maxIterations>("maxIterations", "subspace: largest number of iterations")
            .Field<&R::eigensolver>("eigensolver", "solver of the eigenvalues")
            .Field<&R::minEigen>("minEigen", "Lanczos: lower bound of the eigenvalues")
            .Unit("no unit")
            .Field<&R::blockSize>("blockSize", "Lanczos: block size")
            .Field<&R::maxBlocks>("maxBlocks", "Lanczos: largest number of blocks")
            .Example(R"({"numEigen": 5, "vectors": 10})");
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
