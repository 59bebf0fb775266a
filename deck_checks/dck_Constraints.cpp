#include "constraints/oif_ConstraintRow.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/ddb_Model.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

namespace {

const char* WantedRegion(oif_RegionKind kind) {
    switch (kind) {
    case oif_RegionKind::NODES: return "a node set";
    case oif_RegionKind::ELEMENTS: return "an element set";
    case oif_RegionKind::SURFACE: return "a surface";
    default: return "a surface or a node set";
    }
}

void FindOnRegions(const kcoC_Constraint& constraint, const std::string& place, fnd_Sink& sink) {
    const oif_ConstraintRow* row = oif_FindConstraintRow(constraint.DynTypeId());
    if (row == nullptr) return;
    for (const auto& rule : row->regions) {
        const rgnC_Region& region = rule.region(constraint);
        const std::string member = place + "/" + rule.member;
        if (!region.HasValue()) {
            if (rule.isNeeded) {
                sink.Add("no-region", member,
                         std::string("there is none; the deck will name nothing where it needs ") +
                             WantedRegion(rule.kind));
            }
        } else if (!oif_IsOfKind(region, rule.kind)) {
            sink.Add("wrong-region", member,
                     Quoted(region.SetName()) + " is " + KindOf(region) + ", and the constraint needs " +
                         WantedRegion(rule.kind));
        }
    }
}

void FindOnEquation(const kcoC_Equation& equation, const std::string& place, fnd_Sink& sink) {
    if (equation.terms.IsEmpty()) sink.Add("empty-equation", place, "the equation has no terms");
    for (int i = 0; i < equation.terms.Length(); ++i) {
        if (!equation.terms[i].setName.IsEmpty()) continue;
        sink.Add("no-region", place + "/terms/" + std::to_string(i) + "/setName",
                 "there is none; the deck will name no nodes");
    }
}

} // namespace

void dck_CheckConstraints(const odiK_Model& model, fnd_Sink& sink) {
    const bool cyclicModel = !model.cyclicSymmetry.IsNull() &&
                             model.cyclicSymmetry.ConstGet().symmetryType == calC_SymmetryTypeEnm::CYCLIC;
    if (cyclicModel && ddb_DdbStepContainer::AnalysisProductOf(model.steps, model.analysisProduct) ==
                           kprC_AnalysisProductEnm::EXPLICIT) {
        sink.Add("cannot-be-written", "/cyclicSymmetry",
                 std::string("writing fails with \"") + oif_kCyclicModelError + "\"");
    }
    for (const auto& [name, constraint] : model.constraints) {
        const std::string place = Place("constraints", name);
        FindOnRegions(constraint, place, sink);
        const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&constraint);
        if (equation != nullptr) FindOnEquation(*equation, place, sink);
        if (constraint.IsCyclic() && !cyclicModel) {
            sink.Add("idle-cyclic", place, "cyclicSymmetry joins no sector: the model isn't cyclic");
        }
    }
}
