#include "store_interface/records/interactions/kinC_Interaction.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactControls.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

bool kinC_Interaction::HasStep(const cow_String& stepName) const {
    // IsActive() knows status 14 too, which interactions never have.
    return IsActive(Status(stepName)) && Status(stepName) != mdl_PropagationStatusEnm::FIELD_PROPAGATED;
}

bool kinC_Interaction::IsModified(const cow_String& stepName) const {
    const mdl_PropagationStatusEnm status = Status(stepName);
    return status == mdl_PropagationStatusEnm::CREATED || status == mdl_PropagationStatusEnm::MODIFIED ||
           status == mdl_PropagationStatusEnm::DEACTIVATED;
}

void kinC_Interaction::Insert(const cow_String& stepName, const kinC_InteractionState& state) {
    nex_CheckCast(state.DynTypeId(), ConstGetState(stepName).DynTypeId(), NEX_HERE);
    ReplaceState(stepName, state);
}

cow_List<rgnC_Region> kinC_Interaction::ConstGetContactNodeSets() const {
    constexpr int nodeSet = 1;
    cow_List<rgnC_Region> nodeSets;
    if (suppressed) return nodeSets;
    const cow_List<rgnC_Region> surfaces = ContactSurfaces();
    for (int i = 0; i < surfaces.Length(); ++i) {
        if (surfaces[i].FlagWord() == nodeSet) nodeSets.Append(surfaces[i]);
    }
    return nodeSets;
}

bool kinC_ContactControls::IsDefault() const {
    const std::unique_ptr<cls_Record> byDefault(cls_Classes().Find(DynTypeId())->create());
    return cls_RecordsEqual(*this, *byDefault);
}

void cls_RegisterInteractionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_InteractionState>();
    registrar.Add<kinC_Interaction>();
    registrar.Add<kinC_InteractionProperty>();
    registrar.Add<kinC_ContactControls>();
    registrar.Add<kinC_ContactInitialization>();
    registrar.Add<kinC_ContactStabilization>();
    cls_RegisterContactRecords(registrar);
    cls_RegisterGeneralContactRecords(registrar);
    cls_RegisterFilmAndRadiationRecords(registrar);
    cls_RegisterWaveInteractionRecords(registrar);
    cls_RegisterCyclicSymmetryRecords(registrar);
    cls_RegisterContactPropertyRecords(registrar);
    cls_RegisterContactControlsRecords(registrar);
    cls_RegisterActuatorSensorRecords(registrar);
}
