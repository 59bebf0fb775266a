#include "interactions/oif_PropertyChanges.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"

cow_List<cow_String> oif_PropertyChanges(const kinC_Interaction& interaction,
                                         const kprC_StepContainer& steps) {
    cow_List<cow_String> names;
    const auto* contact = nex_canDynamicCastPtr<kinC_ContactPair>(&interaction);
    if (contact == nullptr || interaction.suppressed) return names;
    for (const auto& [stepName, step] : steps) {
        const mdl_PropagationStatusEnm status = contact->GetPropStatus(stepName);
        if (!kinC_Interaction::IsActive(status) || kinC_Interaction::IsBuiltIn(status)) continue;
        const auto& property = contact->ConstGetState(stepName).InteractionProperty;
        if (property.IsModified()) names.Append(property.ConstGet());
    }
    return names;
}

void oif_AddChangeableProperties(const qkw_Model& model, kprC_AnalysisProductEnm product,
                                 mdl_MapString2ObjCow<kinC_InteractionProperty>& properties) {
    if (product != kprC_AnalysisProductEnm::IMPLICIT) return;
    for (const auto& [name, interaction] : model.Interactions()) {
        const nex_Context context("interaction", name);
        const cow_List<cow_String> changes = oif_PropertyChanges(interaction, model.Steps());
        if (changes.Length() < 2) continue;
        properties.Insert(oif_ChangeablePropertyName(name), properties.ConstGet(changes[0]));
    }
}
