#include "conditions/oif_BCTable.h"
#include "conditions/oif_BoundaryConditionBuilder.h"
#include "conditions/oif_WrittenSteps.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

#include <algorithm>
#include <optional>
#include <set>

namespace {

/// The names of the model's element sets, as lists of sets refer to them.
std::set<std::string> ElementSetsOf(const odiK_Model& model) {
    std::set<std::string> names;
    const auto add = [&names](const std::string& prefix, const auto& sets) {
        for (const auto& set : sets) {
            if (set->type == res_SetTypeEnm::ELEMENTS) names.insert(prefix + Text(set->name));
        }
    };
    add("", model.AssemblySets());
    for (const auto& [name, instance] : model.Instances()) {
        const auto mesh = instance->Mesh();
        if (mesh.IsNull()) continue;
        add(Text(name) + ".", mesh->Sets());
        add("\"" + Text(name) + "\".", mesh->Sets());
    }
    return names;
}

void FindOnRegion(const kbcC_BC& bc, const std::string& place, fnd_Sink& sink) {
    const oif_RegionKind expected = oif_FindBCRow(bc.DynTypeId())->region;
    if (!bc.region.HasValue()) {
        sink.Add("no-region", place, "the condition has no region, so its lines name no set");
    } else if (bc.region.FlagWord() != static_cast<int>(expected)) {
        const bool ofConnectors = expected == oif_RegionKind::ELEMENTS;
        sink.Add("wrong-region", place + "/region",
                 "found " + Quoted(bc.region.SetName()) + ", which is " + KindOf(bc.region) +
                     "; the condition acts on " + (ofConnectors ? "connector elements" : "nodes"));
    }
}

} // namespace

void dck_CheckConditions(const odiK_Model& model, fnd_Sink& sink) {
    const oif_BCOpStatus status =
        oif_BoundaryConditionBuilder::OpStatusOf(model.boundaryConditions, model.loads, model.steps);
    oif_WrittenSteps finder(model.steps, status);
    std::optional<std::set<std::string>> elementSets;
    for (const auto& [name, bc] : model.boundaryConditions) {
        if (bc.suppressed) continue;
        const std::string place = Place("boundaryConditions", name);
        FindOnRegion(bc, place, sink);
        if (bc.DynTypeId() == kbcC_SymmetryBC::TypeId()) {
            sink.Add("comment-only", place, "decks tell of a symmetry record in a comment only", {},
                     "for symmetry take TypeBC with XSYMM, YSYMM or ZSYMM");
        }
        if (const auto* motion = nex_canDynamicCastPtr<kbcC_ConnectorBC>(&bc)) {
            if (!elementSets) elementSets = ElementSetsOf(model);
            if (motion->connectors.IsEmpty()) {
                sink.Add("no-connectors", place + "/connectors",
                         "the condition names no connectors, so no element set carries its name");
            }
            for (int i = 0; i < motion->connectors.Length(); ++i) {
                if (elementSets->count(Text(motion->connectors[i])) != 0) continue;
                sink.Add("no-such-element-set", place + "/connectors/" + std::to_string(i),
                         "found " + Quoted(motion->connectors[i]) + ", which is no element set");
            }
        }
        const auto writes = [&](const kbcC_BC& each, const cow_String& stepName, bool inLoadCase) {
            return status.Writes(each, stepName, inLoadCase);
        };
        const std::vector<int> written = finder.Of("boundary condition", name, bc, writes);
        const bool isWritten = std::ranges::any_of(written, [&, &key = name, &of = bc](int i) {
            const cow_String& stepName = model.steps.NameAt(i);
            return !oif_BCOpStatus::Places(model.steps.StepAt(i), key, of.Status(stepName)).empty();
        });
        if (!isWritten) sink.Add("never-written", place, "no step writes the condition");
    }
}
