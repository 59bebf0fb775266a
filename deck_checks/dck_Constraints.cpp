#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/ddb_Model.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

namespace {

// As rgnC_Region::FlagWord() gives them.
constexpr int kNodeSet = 1;
constexpr int kElementSet = 2;
constexpr int kSurface = 8;

const char* Wanted(int kinds) {
    switch (kinds) {
    case kNodeSet: return "a node set";
    case kElementSet: return "an element set";
    case kSurface: return "a surface";
    default: return "a surface or a node set";
    }
}

/// A region of a constraint, and the kinds that it may be of.
struct RegionRule {
    unsigned typeId;
    const char* member;
    const rgnC_Region& (*region)(const kcoC_Constraint& constraint);
    int kinds;
    bool isNeeded;
};

template <auto Member, class C>
const rgnC_Region& RegionOf(const kcoC_Constraint& constraint) {
    return static_cast<const C&>(constraint).*Member;
}

template <auto Member, class C>
RegionRule Rule(const char* member, int kinds, bool isNeeded = true) {
    return {C::TypeId(), member, RegionOf<Member, C>, kinds, isNeeded};
}

const std::vector<RegionRule>& RegionRules() {
    using Tie = kcoC_Tie;
    using Coupling = kcoC_Coupling;
    using Body = kcoC_RigidBody;
    using Embedded = kcoC_EmbeddedRegion;
    using Edge = kcoC_ShellSolidCoupling;
    static const std::vector<RegionRule> rules{
        Rule<&Tie::master, Tie>("/master", kSurface | kNodeSet),
        Rule<&Tie::slave, Tie>("/slave", kSurface | kNodeSet),
        Rule<&Coupling::surface, Coupling>("/surface", kSurface | kNodeSet),
        Rule<&Coupling::refNode, Coupling>("/refNode", kNodeSet),
        Rule<&Body::refNode, Body>("/refNode", kNodeSet),
        Rule<&Body::elements, Body>("/elements", kElementSet, false),
        Rule<&Body::tieNodes, Body>("/tieNodes", kNodeSet, false),
        Rule<&Body::pinNodes, Body>("/pinNodes", kNodeSet, false),
        Rule<&Body::surface, Body>("/surface", kSurface, false),
        Rule<&Embedded::host, Embedded>("/host", kElementSet),
        Rule<&Embedded::embedded, Embedded>("/embedded", kElementSet),
        Rule<&Edge::shellEdge, Edge>("/shellEdge", kSurface),
        Rule<&Edge::solidFace, Edge>("/solidFace", kSurface),
    };
    return rules;
}

void FindOnRegions(const kcoC_Constraint& constraint, const std::string& place, fnd_Sink& sink) {
    const cls_ClassRegistrar& classes = cls_Classes();
    for (const RegionRule& rule : RegionRules()) {
        if (!classes.InheritanceCheck(constraint.DynTypeId(), rule.typeId)) continue;
        const rgnC_Region& region = rule.region(constraint);
        if (!region.HasValue()) {
            if (rule.isNeeded) {
                sink.Add("no-region", place + rule.member,
                         std::string("there is none; the deck will name nothing where it needs ") +
                             Wanted(rule.kinds));
            }
        } else if ((region.FlagWord() & rule.kinds) == 0) {
            sink.Add("wrong-region", place + rule.member,
                     Quoted(region.SetName()) + " is " + KindOf(region) + ", and the constraint needs " +
                         Wanted(rule.kinds));
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
                 "writing fails with \"Cyclic symmetry is not valid for Explicit.\"");
    }
    for (mdl_MapString2ObjCowIT<kcoC_Constraint> it(model.constraints); !it.IsDone(); it.Next()) {
        const kcoC_Constraint& constraint = it.CurrentValue();
        const std::string place = Place("constraints", it.CurrentKey());
        FindOnRegions(constraint, place, sink);
        const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&constraint);
        if (equation != nullptr) FindOnEquation(*equation, place, sink);
        if (constraint.IsCyclic() && !cyclicModel) {
            sink.Add("idle-cyclic", place, "cyclicSymmetry joins no sector: the model isn't cyclic");
        }
    }
}
