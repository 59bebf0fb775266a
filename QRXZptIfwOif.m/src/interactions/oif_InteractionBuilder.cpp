#include "interactions/oif_InteractionBuilder.h"

#include "interactions/oif_ContactProperty.h"
#include "interactions/oif_InteractionProperty.h"
#include "interactions/oif_InteractionRow.h"
#include "interactions/oif_PropertyChanges.h"
#include "interactions/oif_StepInteractions.h"

void oif_InteractionBuilder::Build() {
    CreateInteractionProperties();
    CreateInteractionHistory();
    oif_CreateOpInteractions(*this);
}

void oif_InteractionBuilder::AddProperty(const qkw_Keyword& keyword) {
    AddModelDefinition(propertyBlockHeader_.ModelHeader().ConstGet());
    AddModelDefinition(keyword);
}

const qkw_KeywordHandle& oif_InteractionBuilder::ChangedFriction(const cow_String& property) {
    const kinC_InteractionProperty& record = Model().InteractionProperties().ConstGet(property);
    qkw_KeywordHandle& friction = frictions_[property];
    if (friction.IsNull()) friction = oif_Friction(record, ModelInfo(), true);
    return friction;
}

void oif_InteractionBuilder::CreateInteractionProperties() {
    mdl_MapString2ObjCow<kinC_InteractionProperty> properties = Model().InteractionProperties();
    oif_AddChangeableProperties(Model(), ModelInfo().AnalysisProduct(), properties);
    for (const auto& [name, property] : properties) {
        const nex_Context context("interaction property", name);
        const oif_InteractionPropertyRow* row = oif_FindInteractionPropertyRow(property.DynTypeId());
        if (row != nullptr && row->add != nullptr) row->add(*this, name, property);
    }
}

void oif_InteractionBuilder::CreateInteractionHistory() {
    for (const auto& [name, interaction] : Model().Interactions()) {
        if (interaction.suppressed) continue;
        const Making making(*this, "interaction", name);
        const oif_InteractionRow* row = oif_FindInteractionRow(interaction.DynTypeId());
        if (row != nullptr && row->history != nullptr) row->history(*this, name, interaction);
    }
}
