#include "model_file/checks/mdf_RecordChecks.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

namespace {

/// A deck can be written from whatever the tolerances are: only the solver refuses them.
void CheckSubmodel(const kbcC_SubmodelBC& bc, mdf_RecordCheck& report) {
    const std::pair<const char*, double> lengths[] = {
        {"shellThickness", bc.shellThickness},
        {"absoluteExteriorTolerance", bc.absoluteExteriorTolerance},
        {"exteriorTolerance", bc.exteriorTolerance},
    };
    for (const auto& [field, value] : lengths) {
        if (value < 0.0) report.Warning(field, "found " + mdf_Shown(value) + ", expected 0 or more");
    }
}

} // namespace

void mdf_AddBoundaryChecks(mdf_RecordChecks& checks) {
    checks.Add<kbcC_SubmodelBC>(CheckSubmodel);
}
