#include "interactions/oif_StepInteractions.h"

#include "conditions/oif_OpStatus.h"
#include "interactions/oif_Contact.h"
#include "interactions/oif_ExplicitContactHistory.h"
#include "interactions/oif_InteractionBuilder.h"
#include "interactions/oif_InteractionRow.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <optional>
#include <set>
#include <vector>

using Status = mdl_PropagationStatusEnm;

namespace {

struct StepInteraction {
    cow_String name;
    oif_InteractionRow::Held record;
    const oif_InteractionRow* row;
    /// It has been in force in a general step.
    bool activated = false;

    bool SaysCarriedToo() const { return row->saying == oif_Saying::UNTIL_IN_FORCE_TOO && !activated; }
};

/// The step whose state the keyword tells of in the step: itself, or, of an interaction that the base state
/// has, the initial one. None where there is no keyword.
std::optional<cow_String> ToldStep(const StepInteraction& interaction, const cow_String& step, bool opNew,
                                   const cow_String& initialStep) {
    const Status status = interaction.record.ConstGet().GetPropStatus(step);
    if (status == Status::CREATED) return step;
    if (interaction.row->saying == oif_Saying::CREATION) return {};
    switch (status) {
    case Status::MODIFIED:
    case Status::DEACTIVATED: return step;
    case Status::PROPAGATED:
        if (opNew || interaction.SaysCarriedToo()) return step;
        return {};
    case Status::BUILT_INTO_BASE_STATE:
        if (interaction.SaysCarriedToo()) return initialStep;
        return {};
    default: return {};
    }
}

bool IsInForce(Status status) {
    return status == Status::CREATED || status == Status::PROPAGATED || status == Status::MODIFIED;
}

std::vector<StepInteraction> StepInteractionsOf(const oif_Model& model) {
    std::vector<StepInteraction> interactions;
    for (const auto& [name, record] : model.Interactions()) {
        const oif_InteractionRow* row = oif_FindInteractionRow(record.DynTypeId());
        if (row != nullptr && row->make != nullptr && !record.suppressed) {
            interactions.push_back({name, record, row});
        }
    }
    return interactions;
}

/// The steps with a *Contact that has content.
std::set<cow_String> GeneralContactSteps(const oif_Model& model) {
    std::set<cow_String> steps;
    for (const auto& [name, record] : model.Interactions()) {
        const auto* contact = nex_canDynamicCastPtr<kinC_ContactExp>(&record);
        if (contact == nullptr || contact->suppressed) continue;
        for (const auto& [stepName, step] : model.Steps()) {
            if (oif_SaysGeneralContact(*contact, stepName)) steps.insert(stepName);
        }
    }
    return steps;
}

} // namespace

void oif_CreateOpInteractions(oif_InteractionBuilder& builder) {
    const oif_Model& model = builder.Model();
    oif_InteractionOpStatus opStatus;
    opStatus.Configure(model.Interactions(), model.Steps().Keys());
    std::vector<StepInteraction> interactions = StepInteractionsOf(model);
    const std::set<cow_String> withGeneralContact = GeneralContactSteps(model);

    builder.ForEachAnalysisStep([&](const cow_String& step) {
        if (!withGeneralContact.empty() && withGeneralContact.count(step) == 0 &&
            opStatus.OpNew(kinC_ContactExp::TypeId(), step)) {
            builder.AddBlock(step, oif_Contact(builder.ModelInfo()));
        }
        const bool isGeneral = !model.Steps().ConstGet(step).Perturbation();
        for (StepInteraction& interaction : interactions) {
            const oif_InteractionBuilder::Making making(builder, "interaction", interaction.name);
            // Three of the classes have no family to ask for, and raise here.
            const bool opNew = opStatus.OpNew(interaction.row->typeId, step);
            const std::optional<cow_String> told =
                ToldStep(interaction, step, opNew, model.InitialStepName());
            if (told) {
                builder.AddBlock(step, oif_InteractionComment(interaction.name),
                                 interaction.row->make(builder.ModelInfo(), interaction.record, *told,
                                                       opNew ? oif_Op::NEW : oif_Op::MODIFY));
            }
            if (isGeneral && IsInForce(interaction.record.ConstGet().GetPropStatus(step))) {
                interaction.activated = true;
            }
        }
    });
}
