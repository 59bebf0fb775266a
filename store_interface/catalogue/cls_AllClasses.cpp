#include "store_interface/model/ddb_Assembly.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "store_interface/records/materials/kmaC_Material.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kseC_Section.h"

cls_MetadataRegistrar::cls_MetadataRegistrar() {
    registrar_.AddView(ddb_BaseInstance::Class, 0);
    registrar_.AddView(ddb_PartInstance::Class, ddb_BaseInstance::TypeId());
    registrar_.Add<kprC_PropagatingObject>();
    registrar_.Add<odiK_IgnoredFinding>();
    cls_RegisterStepRecords(registrar_);
    cls_RegisterMaterialRecords(registrar_);
    cls_RegisterAmplitudeRecords(registrar_);
    cls_RegisterSectionRecords(registrar_);
    cls_RegisterElementControlRecords(registrar_);
    cls_RegisterPartAttributeRecords(registrar_);
    cls_RegisterConditionRecords(registrar_);
    cls_RegisterInteractionRecords(registrar_);
    cls_RegisterConstraintRecords(registrar_);
    cls_RegisterOutputRecords(registrar_);
}
