#include "store_interface/records/steps/kprC_DynamicSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepFields.h"

const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::MassScalingTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SEMI_AUTOMATIC", "SEMI_AUTOMATIC"},
                                           {1, "AUTOMATIC", "AUTOMATIC"},
                                           {2, "REINITIALIZE", "REINITIALIZE"},
                                           {3, "DISABLE_THROUGHOUT_STEP", "DISABLE_THROUGHOUT_STEP"}};
    static constexpr omu_EnumTable table{"kprC_MassScaling::MassScalingTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::DtTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "UNIFORM", "UNIFORM"},
                                           {1, "BELOW_MIN", "BELOW_MIN"},
                                           {2, "SET_EQUAL_DT", "SET_EQUAL_DT"},
                                           {3, "NONUNIFORM", "NONUNIFORM"}};
    static constexpr omu_EnumTable table{"kprC_MassScaling::DtTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::RollingDirectionEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "X", "X"}, {1, "Y", "Y"}, {2, "Z", "Z"}, {3, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kprC_MassScaling::RollingDirectionEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::FrequencyKindEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NONE", "NONE"}, {1, "NUMBER_INTERVAL", "NUMBER_INTERVAL"}};
    static constexpr omu_EnumTable table{"kprC_MassScaling::FrequencyKindEnm", rows};
    return table;
}

bool kprC_MassScaling::IsVariable() const {
    switch (type) {
    case MassScalingTypeEnm::AUTOMATIC:
    case MassScalingTypeEnm::DISABLE_THROUGHOUT_STEP: return true;
    case MassScalingTypeEnm::SEMI_AUTOMATIC: return throughoutStep;
    default: return false;
    }
}

const cls_FieldTable& kprC_MassScaling::Fields() {
    using R = kprC_MassScaling;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::type>("type", "how mass is scaled: SEMI_AUTOMATIC, AUTOMATIC for rolling, given back, "
                                     "or not at all in the step")
            .Field<&R::region>("region", "element set that is scaled")
            .Field<&R::frequency>("frequency",
                                  "increments between two scalings; at zero numberInterval says it")
            .Field<&R::dt>("dt", "wanted stable time increment; zero is not written")
            .Unit("time")
            .Field<&R::factor>("factor", "mass factor, of the fixed form only; zero is not written")
            .Unit("no unit")
            .Field<&R::numberInterval>("numberInterval", "number of scalings, evenly spread over the step")
            .Field<&R::frequencyKind>("frequencyKind",
                                      "NUMBER_INTERVAL: the recurrence of SEMI_AUTOMATIC is written, which "
                                      "goes with throughoutStep; AUTOMATIC does not look at it")
            .Field<&R::feedRate>("feedRate", "rolling: velocity of the rolled piece")
            .Unit("length/time")
            .Field<&R::extrudedLength>("extrudedLength",
                                       "rolling: element length along the rolling direction")
            .Unit("length")
            .Field<&R::crossSection>(
                "crossSection",
                "rolling: number of nodes in the cross-section, cut to a whole number in the deck")
            .Unit("no unit")
            .Field<&R::direction>("direction", "rolling direction")
            .Field<&R::wholeModel>("wholeModel", "true: the whole model, region is not looked at")
            .Field<&R::dtType>("dtType", "how elements are scaled to the wanted increment")
            .Field<&R::throughoutStep>(
                "throughoutStep",
                "with SEMI_AUTOMATIC: scaling throughout the step, not just at its beginning")
            .Example(R"({"wholeModel": true, "factor": 4})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ImplicitDynamicsStep::InitialConditionsEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "DEFAULT", "DEFAULT"}, {1, "COMPUTE", "COMPUTE"}, {2, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kprC_ImplicitDynamicsStep::InitialConditionsEnm", rows};
    return table;
}

const cls_FieldTable& kprC_ImplicitDynamicsStep::Fields() {
    using R = kprC_ImplicitDynamicsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .With(kprC_AdiabaticField)
            .With(kprC_TimePeriodField)
            .With(kprC_TimeIncrementFields)
            .Field<&R::haftol>(
                "haftol",
                "half-increment residual tolerance; always written by any method but the direct one")
            .Unit("force")
            .Field<&R::nohaf>("nohaf", "direct method only: no half-increment residual")
            .With(kprC_StepAmplitudeField)
            .Field<&R::extrapolation>(
                "extrapolation", "how the solution is extrapolated from increment to increment; "
                                 "PROCEDURE_DEFAULT is not written, and any other than PARABOLIC prints NO")
            .Field<&R::alpha>("alpha", "numerical damping of the integration operator")
            .Unit("no unit")
            .With(kprC_NoStopField)
            .Field<&R::initialConditions>("initialConditions",
                                          "NONE bypasses the computation of initial accelerations")
            .Example(R"({"timePeriod": 0.1, "initialInc": 0.001})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ExplicitDynamicsStep::TimeIncrementationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "AUTOMATIC", "AUTOMATIC"},
                                           {1, "DIRECT_USER_CONTROL", "DIRECT_USER_CONTROL"},
                                           {2, "ELEMENT_BY_ELEMENT", "ELEMENT_BY_ELEMENT"},
                                           {3, "FIXED", "FIXED"}};
    static constexpr omu_EnumTable table{"kprC_ExplicitDynamicsStep::TimeIncrementationEnm", rows};
    return table;
}

const cls_FieldTable& kprC_ExplicitDynamicsStep::Fields() {
    using R = kprC_ExplicitDynamicsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "how the stable time increment is found")
            .With(kprC_AdiabaticField)
            .With(kprC_TimePeriodField)
            .Field<&R::initialInc>("initialInc", "time increment of direct user control")
            .Unit("time")
            .Field<&R::maxIncrement>("maxIncrement",
                                     "largest time increment, of AUTOMATIC and ELEMENT_BY_ELEMENT")
            .Unit("time")
            .Field<&R::scaleFactor>("scaleFactor", "factor on the stable time increment; 1.0 is not written")
            .Unit("no unit")
            .Field<&R::linearBulkViscosity>("linearBulkViscosity", "linear bulk viscosity coefficient")
            .Unit("no unit")
            .Field<&R::quadraticBulkViscosity>("quadraticBulkViscosity",
                                               "quadratic bulk viscosity coefficient")
            .Unit("no unit")
            .Field<&R::massScaling>("massScaling", "mass scaling definitions, written in list order")
            .With(kprC_NlgeomField)
            .Example(R"({"timePeriod": 0.01})");
    return fields;
}

const cls_FieldTable& kprC_TempDisplacementDynamicsStep::Fields() {
    using R = kprC_TempDisplacementDynamicsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "how the stable time increment is found")
            .With(kprC_TimePeriodField)
            .Field<&R::initialInc>("initialInc", "time increment of direct user control")
            .Unit("time")
            .Field<&R::maxIncrement>("maxIncrement",
                                     "largest time increment, of AUTOMATIC and ELEMENT_BY_ELEMENT")
            .Unit("time")
            .Field<&R::scaleFactor>("scaleFactor", "factor on the stable time increment; 1.0 is not written")
            .Unit("no unit")
            .Field<&R::linearBulkViscosity>("linearBulkViscosity", "linear bulk viscosity coefficient")
            .Unit("no unit")
            .Field<&R::quadraticBulkViscosity>("quadraticBulkViscosity",
                                               "quadratic bulk viscosity coefficient")
            .Unit("no unit")
            .Field<&R::massScaling>("massScaling", "mass scaling definitions, written in list order")
            .With(kprC_NlgeomField)
            .Example(R"({"timePeriod": 0.01})");
    return fields;
}

const cls_FieldTable& kprC_SubspaceDynamicsStep::Fields() {
    using R = kprC_SubspaceDynamicsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_NlgeomField)
            .Field<&R::vectors>("vectors",
                                "number of modes used; zero takes all and writes no '*Select Eigenmodes'")
            .With(kprC_TimePeriodField)
            .Field<&R::initialInc>("initialInc", "fixed time increment")
            .Unit("time")
            .With(kprC_MaxNumIncField)
            .With(kprC_StepAmplitudeField)
            .Example(R"({"timePeriod": 0.1, "initialInc": 0.001})");
    return fields;
}

void cls_RegisterDynamicStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_MassScaling>();
    registrar.Add<kprC_ImplicitDynamicsStep>();
    registrar.Add<kprC_ExplicitDynamicsStep>();
    registrar.Add<kprC_TempDisplacementDynamicsStep>();
    registrar.Add<kprC_SubspaceDynamicsStep>();
}
