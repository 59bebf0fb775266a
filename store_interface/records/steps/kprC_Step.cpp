#include "store_interface/records/steps/kprC_Step.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

const omu_EnumTable& omu_EnumTableOf(kprC_Step::MatrixStorageEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SOLVER_DEFAULT", "SOLVER_DEFAULT"},
                                           {1, "SYMMETRIC", "SYMMETRIC"},
                                           {2, "UNSYMMETRIC", "UNSYMMETRIC"}};
    static constexpr omu_EnumTable table{"kprC_Step::MatrixStorageEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::NlgeomEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "OFF", "OFF"}, {1, "ON", "ON"}};
    static constexpr omu_EnumTable table{"kprC_Step::NlgeomEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::ResponseEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STEADY_STATE", "STEADY_STATE"},
                                           {1, "TRANSIENT", "TRANSIENT"}};
    static constexpr omu_EnumTable table{"kprC_Step::ResponseEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::SolutionTechniqueEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FULL_NEWTON", "FULL_NEWTON"},
                                           {1, "SEPARATED", "SEPARATED"},
                                           {2, "QUASI_NEWTON", "QUASI_NEWTON"}};
    static constexpr omu_EnumTable table{"kprC_Step::SolutionTechniqueEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::AmplitudeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STEP", "STEP"}, {1, "RAMP", "RAMP"}};
    static constexpr omu_EnumTable table{"kprC_Step::AmplitudeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::ExtrapolationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LINEAR", "LINEAR"},
                                           {1, "PARABOLIC", "PARABOLIC"},
                                           {2, "NONE", "NONE"},
                                           {3, "RESERVED_3", "RESERVED_3"},
                                           {4, "PROCEDURE_DEFAULT", "PROCEDURE_DEFAULT"}};
    static constexpr omu_EnumTable table{"kprC_Step::ExtrapolationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::TimeIncrementationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "AUTOMATIC", "AUTOMATIC"}, {1, "DIRECT", "DIRECT"}};
    static constexpr omu_EnumTable table{"kprC_Step::TimeIncrementationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::FrequencyScaleEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LOGARITHMIC", "LOGARITHMIC"}, {1, "LINEAR", "LINEAR"}};
    static constexpr omu_EnumTable table{"kprC_Step::FrequencyScaleEnm", rows};
    return table;
}

unsigned kprC_Step::ProcedureType() const {
    return DynTypeId() == kprC_InitialStep::TypeId() ? 0 : DynTypeId();
}

const cls_FieldTable& kprC_Step::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_Step>(cls_Record::Fields())
            .Field<&kprC_Step::description>("description",
                                            "free text; when not empty it stands as it is below the step's "
                                            "first line, so that a line of it that "
                                            "begins with \"*\" is read as a keyword")
            .FreeText()
            .Field<&kprC_Step::suppressed>("suppressed", "a suppressed step is written like any other")
            .Field<&kprC_Step::solverInput>("solverInput",
                                            "deck text that closes the step's body, as it stands")
            .Verbatim()
            .Field<&kprC_Step::matrixStorage>("matrixStorage",
                                              "how the solver stores the matrix of the equation system");
    return fields;
}

const cls_FieldTable& kprC_AnalysisStep::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_AnalysisStep>(kprC_Step::Fields())
            .Field<&kprC_AnalysisStep::loadCases>("loadCases", "load cases by name")
            .Field<&kprC_AnalysisStep::controls>("controls", "solution controls of the step")
            .Field<&kprC_AnalysisStep::solverControls>("solverControls",
                                                       "controls of the iterative linear solver")
            .Field<&kprC_AnalysisStep::restart>("restart", "what is kept for a restart")
            .Field<&kprC_AnalysisStep::diagnosticPrint>("diagnosticPrint",
                                                        "what the solver prints to watch the run")
            .Field<&kprC_AnalysisStep::monitor>("monitor", "degree of freedom to watch during the run");
    return fields;
}

void cls_RegisterStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<klcC_LoadCase>();
    registrar.Add<kprC_Step>();
    registrar.Add<kprC_InitialStep>();
    registrar.Add<kprC_AnalysisStep>();
    cls_RegisterStepControlRecords(registrar);
    cls_RegisterStepRequestRecords(registrar);
    cls_RegisterModalDampingRecords(registrar);
    cls_RegisterStaticStepRecords(registrar);
    cls_RegisterThermalStepRecords(registrar);
    cls_RegisterDynamicStepRecords(registrar);
    cls_RegisterModalStepRecords(registrar);
}
