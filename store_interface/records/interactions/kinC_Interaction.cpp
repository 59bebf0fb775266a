#include "store_interface/records/interactions/kinC_Interaction.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"

bool kinC_Interaction::HasStep(const cow_String& stepName) const {
    // IsActive() knows status 14 too, which interactions never have.
    return IsActive(Status(stepName)) && Status(stepName) != mdl_PropagationStatusEnm::FIELD_PROPAGATED;
}

bool kinC_Interaction::IsModified(const cow_String& stepName) const {
    const mdl_PropagationStatusEnm status = Status(stepName);
    return status == mdl_PropagationStatusEnm::CREATED || status == mdl_PropagationStatusEnm::MODIFIED ||
           status == mdl_PropagationStatusEnm::DEACTIVATED;
}

void cls_RegisterInteractionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_InteractionState>();
    registrar.Add<kinC_Interaction>();
    registrar.Add<kinC_InteractionProperty>();
    registrar.Add<kinC_ContactControls>();
    registrar.Add<kinC_ContactInitialization>();
    registrar.Add<kinC_ContactStabilization>();
    cls_RegisterActuatorSensorRecords(registrar);
}
