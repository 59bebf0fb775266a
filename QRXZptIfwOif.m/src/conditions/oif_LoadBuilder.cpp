#include "conditions/oif_LoadBuilder.h"

#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"

using Status = mdl_PropagationStatusEnm;

void oif_LoadBuilder::Build() {
    BuildLoadsHistory();
}

void oif_LoadBuilder::BuildLoadsHistory() {
    const kprC_StepContainer& steps = Model().Steps();
    oif_LoadOpStatus opStatus;
    opStatus.Configure(Model().Loads(), steps.Keys(), ModelInfo());
    const oif_ObjectsOfSteps<kloC_Load> written(
        "load", Model().Loads(), steps, opStatus,
        [&](const kloC_Load& load, const cow_String& step, bool) { return opStatus.Writes(load, step); });
    const kinC_CyclicSymmetry* cyclic = FindCyclicInteraction();
    for (int i = 0; i < steps.Size(); ++i) {
        oif_LoadSetting setting{ModelInfo()};
        if (cyclic != nullptr && steps.StepAt(i).DynTypeId() == kprC_SteadyStateModalStep::TypeId()) {
            setting.cyclicMode = cyclic->ConstGetState(steps.NameAt(i)).cyclicMode.ConstGet();
        }
        MakeCards(
            written, i, opStatus,
            [](const cow_String& name, const kloC_Load& load) {
                return cow_String("Name: ") + name + "   Type: " + oif_FindLoadRow(load.DynTypeId())->label;
            },
            [&](const oif_LoadCard& card, auto& entry) { LoadCardDetails(card, entry, setting); });
    }
}

const kinC_CyclicSymmetry* oif_LoadBuilder::FindCyclicInteraction() const {
    for (const auto& [name, interaction] : Model().Interactions()) {
        if (interaction.suppressed) continue;
        if (const auto* cyclic = nex_canDynamicCastPtr<kinC_CyclicSymmetry>(&interaction)) return cyclic;
    }
    return nullptr;
}

void oif_LoadBuilder::LoadCardDetails(const oif_LoadCard& card, oif_ObjectsOfSteps<kloC_Load>::Entry& entry,
                                      const oif_LoadSetting& setting) {
    const oif_LoadRow& row = *oif_FindLoadRow(card.Object().DynTypeId());
    // The end of one of several inertia reliefs isn't told; the banner stands all the same.
    if (row.family == oif_LoadFamily::INERTIA_RELIEF && card.Quad().status == Status::DEACTIVATED &&
        !CheckForUniqueIRLoad(card.name, card.step)) {
        return;
    }
    AddComment(card, entry);
    if (row.IsCommentAlone(card.Object())) return;
    if (row.CannotBeWritten()) nex_Raise(oif_LoadWithoutKeyword);
    const auto make = [&] { return row.make(card, setting); };
    // The cyclic mode may change where the load goes on.
    if (setting.cyclicMode) return Add(card, make());
    AddShared(card, entry, make);
}

bool oif_LoadBuilder::CheckForUniqueIRLoad(const cow_String& name, const cow_String& stepName) const {
    for (const auto& [otherName, load] : Model().Loads()) {
        if (load.suppressed || load.DynTypeId() != kloC_InertiaRelief::TypeId() || otherName == name)
            continue;
        switch (load.Status(stepName)) {
        case Status::CREATED:
        case Status::MODIFIED:
        case Status::DEACTIVATED: return false;
        default: break;
        }
    }
    return true;
}
