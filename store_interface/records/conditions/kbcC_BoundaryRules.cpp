#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

namespace {

/// A deck can be written from whatever the tolerances are: only the solver refuses them.
void CheckSubmodel(const kbcC_SubmodelBC& bc, fnd_RecordCheck& report) {
    const std::pair<const char*, double> lengths[] = {
        {"shellThickness", bc.shellThickness},
        {"absoluteExteriorTolerance", bc.absoluteExteriorTolerance},
        {"exteriorTolerance", bc.exteriorTolerance},
    };
    for (const auto& [field, value] : lengths) {
        if (value < 0.0) report.Add("negative-tolerance", field, "found " + fnd_Shown(value), "0 or more");
    }
}

} // namespace

void fnd_AddBoundaryRules(fnd_RecordRules& rules) {
    rules.Add<CheckSubmodel>();
}
