#include "deck/oif_FinalBuilder.h"

#include "base/oif_Comment.h"

#include <set>

void oif_FinalBuilder::Build() {
    const ddb_PartContainer parts = Model().Model().part();
    std::set<cow_String> partsDone;
    ForEachPartInstance([&](const cow_String& key, const ddb_PartInstance& instance) {
        const cow_String& partName = instance.partName();
        if (partsDone.insert(partName).second) {
            AddPartDefinition(partName, oif_RawKeyword(parts.get(partName).solverInput()));
            AddPartDefinition(partName, oif_RawKeyword("*End Part"));
        }
        AddInstanceDefinition(key, oif_RawKeyword(instance.solverInput()));
        if (ModelInfo().V6Format()) AddInstanceDefinition(key, oif_RawKeyword("*End Instance"));
    });
    AddAssemblyDefinition(oif_RawKeyword(Model().RootAssembly().solverInput()));
    if (ModelInfo().V6Format()) AddAssemblyDefinition(oif_RawKeyword("*End Assembly"));
    AddModelDefinition(oif_RawKeyword(Model().Model().solverInput()));

    int count = 0;
    for (kprC_StepContainerIT it(Model().Steps()); !it.IsDone(); it.Next(), ++count) {
        const cow_String& stepName = it.CurrentKey();
        const nex_Context context("step", stepName);
        const cow_String& text = it.CurrentValue().solverInput;
        if (!text.IsEmpty()) AddStepDefinition(stepName, oif_RawKeyword(text));
        if (count == 0) continue;
        const auto& step =
            nex_canDynamicCastRef<kprC_AnalysisStep>(Model().Steps().ConstGet(stepName), NEX_HERE);
        // With load cases the step ends behind the last of them, else behind its body.
        cow_String last;
        for (mdl_MapString2ObjCowIT<klcC_LoadCase> loadCase(step.loadCases); !loadCase.IsDone();
             loadCase.Next()) {
            last = loadCase.CurrentKey();
            AddStepDefinition(stepName, oif_RawKeyword("*End Load Case"), last);
        }
        AddStepDefinition(stepName, oif_RawKeyword("*End Step"), last);
    }
}
