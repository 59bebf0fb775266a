#include "interactions/oif_InteractionProperty.h"

#include "base/oif_ClassRows.h"
#include "interactions/oif_ContactProperty.h"
#include "interactions/oif_FilmAndRadiation.h"
#include "interactions/oif_InteractionBuilder.h"
#include "interactions/oif_WaveInteractions.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"

namespace {

void AddContactProperty(oif_InteractionBuilder& builder, const cow_String& name,
                        const kinC_InteractionProperty& property) {
    const auto& contact = static_cast<const kinC_ContactProperty&>(property);
    const mdl_ObjCow<kinC_InteractionProperty> held(property);
    const qkw_ModelInfo& modelInfo = builder.ModelInfo();
    const auto addIf = [&](const auto& behavior, const qkw_Keyword& keyword) {
        if (!behavior.IsNull()) builder.AddModelDefinition(keyword);
    };
    kinC_GeometricProperties geometry;
    if (!contact.geometricProperties.IsNull()) geometry = contact.geometricProperties.ConstGet();
    builder.AddProperty(oif_SurfaceInteraction(name, modelInfo, geometry.contactArea, geometry.padThickness));
    addIf(contact.tangentialBehavior, oif_Friction(held, modelInfo, false));
    addIf(contact.normalBehavior, oif_SurfaceBehavior(held, modelInfo));
    addIf(contact.damping, oif_ContactDamping(held, modelInfo));
    addIf(contact.thermalConductance, oif_GapConductance(held, modelInfo));
    addIf(contact.heatGeneration, oif_GapHeatGeneration(held, modelInfo));
    addIf(contact.radiation, oif_GapRadiation(held, modelInfo));
}

/// A class with one keyword.
template <class R, class Keyword>
constexpr oif_InteractionPropertyRow One() {
    return {R::Class.Id(),
            [](oif_InteractionBuilder& builder, const cow_String& name,
               const kinC_InteractionProperty& property) { builder.AddProperty(Keyword(name, property)); }};
}

/// A class that no deck tells of.
template <class R>
constexpr oif_InteractionPropertyRow NotInDeck() {
    return {R::Class.Id(), nullptr};
}

constexpr oif_InteractionPropertyRow kPropertyRows[] = {
    {kinC_ContactProperty::Class.Id(), AddContactProperty},
    One<kinC_FilmConditionProp, oif_FilmProperty>(),
    One<kinC_AcousticImpedanceProp, oif_AcousticImpedanceProp>(),
    NotInDeck<kinC_IncidentWaveProperty>(),
    NotInDeck<kinC_ActuatorSensorProp>(),
};

} // namespace

std::span<const oif_InteractionPropertyRow> oif_InteractionPropertyRows() {
    return kPropertyRows;
}

const oif_InteractionPropertyRow* oif_FindInteractionPropertyRow(unsigned typeId) {
    return oif_FindRow(kPropertyRows, typeId);
}
