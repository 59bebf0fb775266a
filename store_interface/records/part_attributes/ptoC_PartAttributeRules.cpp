#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

namespace {

void CheckOrientation(const ptoC_ConnectorOrientation& record, fnd_RecordCheck& check) {
    if (record.name.IsEmpty()) return;
    const fnd_NameProblem problem = fnd_ProblemOfName(record.name.View());
    if (!problem.found.empty()) {
        check.Add("name-in-deck", "name", "found " + problem.found, problem.expected);
        return;
    }
    // Sections name orientations by it, but orientations are defined under the name of their place.
    check.Add("orientation-name", "name",
              "found " + fnd_Quoted(record.name.View()) +
                  ", which is best left out: where an angle isn't 0, the connector section "
                  "refers to an orientation that is defined under 'ConnOri-' and its place");
}

} // namespace

void fnd_AddPartAttributeRules(fnd_RecordRules& rules) {
    rules.Add<CheckOrientation>();
}
