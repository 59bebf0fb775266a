#include "store_interface/records/sections/kseC_Section.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"
#include "store_interface/records/sections/kseC_PointSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

void cls_RegisterSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_Section>();
    cls_RegisterSolidSectionRecords(registrar);
    cls_RegisterShellSectionRecords(registrar);
    cls_RegisterBeamProfileRecords(registrar);
    cls_RegisterBeamSectionRecords(registrar);
    cls_RegisterPointSectionRecords(registrar);
    cls_RegisterConnectorBehaviorRecords(registrar);
    cls_RegisterConnectorSectionRecords(registrar);
}
