#include "store_interface/records/steps/kprC_Step.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <iterator>

bool kprC_IsExplicit(unsigned stepType) {
    return stepType == 0x23C0065 || stepType == 0x23C0069 || stepType == 0x23C007B;
}

bool kprC_IsPerturbation(unsigned stepType) {
    static constexpr unsigned procedures[] = {
        0x23C0066, // buckling
        0x23C006A, // frequency
        0x23C006F, // modal dynamics
        0x23C0070, // random response
        0x23C0071, // response spectrum
        0x23C0075, // static linear perturbation
        0x23C0076, // steady state, direct
        0x23C0077, // steady state, modal
        0x23C007D, // complex frequency
        0x23C007E, // steady state, subspace
    };
    return std::find(std::begin(procedures), std::end(procedures), stepType) != std::end(procedures);
}

const omu_EnumTable& omu_EnumTableOf(kprC_Step::MatrixStorageEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SOLVER_DEFAULT", "SOLVER_DEFAULT"},
                                           {1, "SYMMETRIC", "SYMMETRIC"},
                                           {2, "UNSYMMETRIC", "UNSYMMETRIC"}};
    static constexpr omu_EnumTable table{"kprC_Step::MatrixStorageEnm", rows};
    return table;
}

unsigned kprC_Step::ProcedureType() const {
    return DynTypeId() == kprC_InitialStep::TypeId() ? 0 : DynTypeId();
}

const cls_FieldTable& kprC_Step::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_Step>(cls_Record::Fields())
            .Field<&kprC_Step::description>(
                "description",
                "free text; when not empty it stands on a line of its own below the step's first line")
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
            .Field<&kprC_AnalysisStep::loadCases>("loadCases", "load cases by name");
    return fields;
}

void cls_RegisterStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<klcC_LoadCase>();
    registrar.Add<kprC_Step>();
    registrar.Add<kprC_InitialStep>();
    registrar.Add<kprC_AnalysisStep>();
}
