#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepFields.h"

const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::CreepEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "AUTOMATIC", "AUTOMATIC"}, {1, "EXPLICIT", "EXPLICIT"}, {2, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kprC_CoupledTempDisplacementStep::CreepEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::StabilizationMethodEnm) {
    static constexpr omu_EnumTable table{"kprC_CoupledTempDisplacementStep::StabilizationMethodEnm",
                                         kprC_StabilizationRows};
    return table;
}

const cls_FieldTable& kprC_CoupledTempDisplacementStep::Fields() {
    using R = kprC_CoupledTempDisplacementStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .With(kprC_ResponseField)
            .With(kprC_TimePeriodField)
            .With(kprC_StabilizationMethodField)
            .With(kprC_StabilizationMagnitudeField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::deltmx>("deltmx", "largest temperature change per increment, written above 0")
            .Unit("temperature")
            .Field<&R::cetol>("cetol", "largest creep strain error per increment, written above 0")
            .Unit("no unit")
            .Field<&R::creep>("creep", "how creep is integrated: AUTOMATIC choice, EXPLICIT alone, or none")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .Field<&R::solutionTechnique>(
                "solutionTechnique",
                "how the equations are solved: full Newton, separated fields, or quasi-Newton")
            .Example(R"({"timePeriod": 100, "initialInc": 1, "deltmx": 20})");
    return fields;
}

const cls_FieldTable& kprC_CoupledThermalElectricStep::Fields() {
    using R = kprC_CoupledThermalElectricStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_ResponseField)
            .With(kprC_EndField)
            .With(kprC_TimePeriodField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::deltmx>("deltmx", "largest temperature change per increment")
            .Unit("temperature")
            .Field<&R::mxdem>("mxdem", "largest emissivity change per increment; 0.1 is not written")
            .Unit("no unit")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .Field<&R::solutionTechnique>(
                "solutionTechnique",
                "how the equations are solved: full Newton, separated fields, or quasi-Newton")
            .Example(R"({"timePeriod": 100, "initialInc": 1})");
    return fields;
}

const cls_FieldTable& kprC_HeatTransferStep::Fields() {
    using R = kprC_HeatTransferStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_ResponseField)
            .With(kprC_EndField)
            .With(kprC_TimePeriodField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::deltmx>("deltmx", "largest temperature change per increment")
            .Unit("temperature")
            .Field<&R::mxdem>("mxdem", "largest emissivity change per increment; 0.1 is not written")
            .Unit("no unit")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .Example(
                R"({"timePeriod": 3600, "initialInc": 10, "minInc": 0.01, "maxInc": 360, "deltmx": 20})");
    return fields;
}

const cls_FieldTable& kprC_MassDiffusionStep::Fields() {
    using R = kprC_MassDiffusionStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_ResponseField)
            .Field<&R::end>("end", "rate of change that ends a transient step when it is reached; at zero "
                                   "the step ends with its period")
            .Unit("unit of the solution/time")
            .With(kprC_TimePeriodField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::dcmax>("dcmax", "largest change of normalised concentration per increment")
            .Unit("no unit")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ExtrapolationField)
            .Example(R"({"timePeriod": 3600, "initialInc": 10})");
    return fields;
}

void cls_RegisterThermalStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_CoupledTempDisplacementStep>();
    registrar.Add<kprC_CoupledThermalElectricStep>();
    registrar.Add<kprC_HeatTransferStep>();
    registrar.Add<kprC_MassDiffusionStep>();
}
