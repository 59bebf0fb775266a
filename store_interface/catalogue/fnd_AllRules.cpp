#include "store_interface/findings/fnd_RecordRules.h"

const fnd_RecordRules& fnd_RecordRules::All() {
    static const fnd_RecordRules rules = [] {
        fnd_RecordRules all;
        fnd_AddAmplitudeRules(all);
        fnd_AddBoundaryRules(all);
        fnd_AddConnectorRules(all);
        fnd_AddInteractionRules(all);
        fnd_AddLoadRules(all);
        fnd_AddMaterialRules(all);
        fnd_AddMaterialValueRules(all);
        fnd_AddPartAttributeRules(all);
        fnd_AddSectionRules(all);
        fnd_AddStepRules(all);
        return all;
    }();
    return rules;
}
