#include "steps/oif_StepBuilder.h"

#include "base/oif_Comment.h"
#include "steps/oif_LoadCase.h"
#include "steps/oif_ProcedureRow.h"
#include "steps/oif_Step.h"
#include "store_interface/records/cls_ClassRegistrar.h"

void oif_StepBuilder::Build() {
    // An explicit job starts with large displacements on.
    bool nlgeomInherited = ModelInfo().AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT;
    unsigned previousProcedure = 0;
    for (const auto& [stepName, anyStep] : Model().Steps()) {
        // The initial step has no block.
        if (stepName == Model().InitialStepName()) continue;
        AddStepDefinition(
            stepName,
            oif_Comment(
                cow_String("----------------------------------------------------------------\n\nSTEP: ") +
                stepName + "\n"));
        const Making making(*this, "step", stepName);
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(anyStep, NEX_HERE);
        AddStepDefinition(stepName, oif_Step(step, nlgeomInherited, stepName));
        AddProcedure(stepName, step, previousProcedure);
        // What was once on stays on, for explicit steps that turn it off too.
        nlgeomInherited = nlgeomInherited || step.Nlgeom() == kprC_Step::NlgeomEnm::ON;
        AddLoadCases(stepName, step);
        previousProcedure = step.DynTypeId();
    }
}

void oif_StepBuilder::AddProcedure(const cow_String& stepName, const kprC_AnalysisStep& step,
                                   unsigned previousProcedure) {
    const oif_ProcedureRow* row = oif_FindProcedureRow(step.DynTypeId());
    if (row == nullptr) nex_Raise(oif_kProcedureError);
    for (const qkw_KeywordHandle& keyword : row->make(step, ModelInfo(), previousProcedure)) {
        AddStepDefinition(stepName, keyword);
    }
}

void oif_StepBuilder::AddLoadCases(const cow_String& stepName, const kprC_AnalysisStep& step) {
    bool first = true;
    for (const auto& [name, loadCase] : step.loadCases) {
        // The list of the empty key is the body.
        if (name.IsEmpty()) continue;
        if (first) AddStepDefinition(stepName, oif_Comment("\nLOAD CASES\n"), name);
        first = false;
        AddStepDefinition(stepName, oif_LoadCase(name), name);
    }
}
