#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Kept.h"
#include "deck_checks/dck_Nodes.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/interactions/kinC_Contact.h"

#include <algorithm>
#include <array>
#include <optional>
#include <set>

namespace {

constexpr int kDofs = 6;
using Values = std::array<std::optional<double>, kDofs>;

/// The degrees of freedom that a named support holds, from 1.
struct Support {
    kbcC_TypeBC::TypeNameEnm type;
    std::initializer_list<int> held;
};
const Support kSupports[] = {
    {kbcC_TypeBC::TypeNameEnm::XSYMM, {1, 5, 6}},  {kbcC_TypeBC::TypeNameEnm::YSYMM, {2, 4, 6}},
    {kbcC_TypeBC::TypeNameEnm::ZSYMM, {3, 4, 5}},  {kbcC_TypeBC::TypeNameEnm::XASYMM, {2, 3, 4}},
    {kbcC_TypeBC::TypeNameEnm::YASYMM, {1, 3, 5}}, {kbcC_TypeBC::TypeNameEnm::ZASYMM, {1, 2, 6}},
    {kbcC_TypeBC::TypeNameEnm::PINNED, {1, 2, 3}}, {kbcC_TypeBC::TypeNameEnm::ENCASTRE, {1, 2, 3, 4, 5, 6}},
};

/// What a condition prescribes of the displacements in a step.
Values ValuesOf(const kbcC_BC& bc, const cow_String& step) {
    Values values;
    if (!kbcC_BC::IsActive(bc.Status(step))) return values;
    if (bc.DynTypeId() == kbcC_TypeBC::TypeId()) {
        const auto& state = static_cast<const kbcC_TypeBCState&>(bc.ConstGetStateQuad(step).state.ConstGet());
        for (const Support& support : kSupports) {
            if (support.type != state.typeName.ConstGet()) continue;
            for (const int dof : support.held) values[static_cast<std::size_t>(dof - 1)] = 0.0;
        }
        return values;
    }
    for (int i = 0; i < kDofs; ++i) {
        const kbcC_Component component = bc.Component(step, i);
        if (component.state == mdl_PropAttributeStateEnm::SET ||
            component.state == mdl_PropAttributeStateEnm::CARRIED) {
            values[static_cast<std::size_t>(i)] = component.real;
        }
    }
    return values;
}

/// The components of a concentrated load that aren't zero.
Values ValuesOf(const kloC_Load& load, const cow_String& step) {
    Values values;
    if (!kloC_Load::IsActive(load.Status(step))) return values;
    const std::size_t first = load.DynTypeId() == kloC_Moment::TypeId() ? 3 : 0;
    const std::vector<kloC_LoadValue> components = load.Values(step);
    for (std::size_t i = 0; i < components.size() && first + i < values.size(); ++i) {
        if (components[i].real != 0.0) values[first + i] = components[i].real;
    }
    return values;
}

/// A condition or a concentrated load: what acts on single nodes.
struct Actor {
    cow_String name;
    const kbcC_BC* bc = nullptr;
    const kloC_Load* load = nullptr;
    int datum = 0;

    Values In(const cow_String& step) const {
        return bc != nullptr ? ValuesOf(*bc, step) : ValuesOf(*load, step);
    }
    const std::vector<mdl_GivenState>& GivenStates() const {
        return bc != nullptr ? bc->GivenStates() : load->GivenStates();
    }
    std::string Where() const { return Place(bc != nullptr ? "boundaryConditions" : "loads", name); }
};

int DatumOf(const kloC_Load& load) {
    if (const auto* force = dynamic_cast<const kloC_ConcentratedForce*>(&load)) return force->datum.Id();
    return static_cast<const kloC_Moment&>(load).datum.Id();
}

/// An actor's place among all, at one of its nodes.
using Entry = std::pair<dck_Nodes::Key, int>;

/// The conditions on displacements, and the nodes that they act on.
struct Held {
    static constexpr int kSeveral = -1;

    std::vector<Actor> conditions;
    dck_Nodes nodes;
    dck_Nodes::Numbers by; // of each node the condition, counted from 1, or kSeveral
    std::vector<Entry> several;

    explicit Held(const odiK_Model& model) : nodes(model), by(nodes) {
        for (const auto& [name, bc] : model.boundaryConditions) {
            const bool isMotion =
                bc.DynTypeId() == kbcC_DisplacementBC::TypeId() || bc.DynTypeId() == kbcC_TypeBC::TypeId();
            if (bc.suppressed || !isMotion) continue;
            const int index = static_cast<int>(conditions.size());
            conditions.push_back({name, &bc, nullptr, bc.datum.Id()});
            for (const dck_Nodes::Key node : nodes.Of(bc.region)) {
                int& number = by.At(node);
                if (number > 0) several.emplace_back(node, number - 1);
                if (number != 0) several.emplace_back(node, index);
                number = number == 0 ? index + 1 : kSeveral;
            }
        }
    }
};

/// Conditions and loads that meet at a node. Each is compared with the first few at its node, so that the
/// work grows with the nodes of the regions alone.
class Meetings {
public:
    Meetings(const dck_Subject& subject, fnd_Sink& sink)
        : model_(subject.Model()), sink_(sink),
          held_(subject.Of("held nodes", [&] { return Held(subject.Model()); })), actors_(held_->conditions),
          entries_(held_->several) {
        for (const auto& [name, load] : model_.loads) {
            const bool isOnNodes = load.DynTypeId() == kloC_ConcentratedForce::TypeId() ||
                                   load.DynTypeId() == kloC_Moment::TypeId();
            if (!load.suppressed && isOnNodes) AddLoad({name, nullptr, &load, DatumOf(load)});
        }
    }

    void Run() {
        // Conditions stand ahead of loads at each node.
        std::ranges::sort(entries_);
        entries_.erase(std::unique(entries_.begin(), entries_.end()), entries_.end());
        std::size_t first = 0;
        for (std::size_t i = 0; i < entries_.size(); ++i) {
            if (entries_[i].first != entries_[first].first) first = i;
            for (std::size_t k = first; k < i && k < first + kCompared; ++k) {
                Meet(entries_[k].second, entries_[i].second, entries_[i].first);
            }
        }
    }

private:
    static constexpr std::size_t kCompared = 8;

    /// At the nodes that a condition acts on; loads alone don't contradict each other.
    void AddLoad(Actor actor) {
        const int index = static_cast<int>(actors_.size());
        for (const dck_Nodes::Key node : held_->nodes.Of(actor.load->region)) {
            const int holder = held_->by.At(node);
            if (holder == 0) continue;
            if (holder > 0) entries_.emplace_back(node, holder - 1);
            entries_.emplace_back(node, index);
        }
        actors_.push_back(std::move(actor));
    }

    void Meet(int first, int second, dck_Nodes::Key node) {
        if (!met_.emplace(first, second).second) return;
        const Actor& a = actors_[static_cast<std::size_t>(first)];
        const Actor& b = actors_[static_cast<std::size_t>(second)];
        if (a.bc == nullptr || a.datum != b.datum) return;
        // Elsewhere nothing changes.
        std::set<int> steps;
        for (const Actor* actor : {&a, &b}) {
            for (const mdl_GivenState& given : actor->GivenStates()) {
                steps.insert(model_.steps.IndexOf(given.stepName));
            }
        }
        for (const int step : steps) {
            if (step >= 0 && Compare(a, b, model_.steps.NameAt(step), node)) return;
        }
    }

    bool Compare(const Actor& a, const Actor& b, const cow_String& step, dck_Nodes::Key node) {
        const Values ours = a.In(step);
        const Values theirs = b.In(step);
        for (std::size_t i = 0; i < ours.size(); ++i) {
            if (!ours[i] || !theirs[i]) continue;
            const std::string dof =
                "degree of freedom " + std::to_string(i + 1) + " of node " + held_->nodes.NameOf(node);
            if (b.bc == nullptr) {
                sink_.Add("fixed-and-loaded", b.Where(),
                          "in step " + Quoted(step) + " the load acts on " + dof + ", which the condition " +
                              Quoted(a.name) + " prescribes");
                return true;
            }
            if (*ours[i] == *theirs[i]) continue;
            sink_.Add("conflicting-values", b.Where(),
                      "in step " + Quoted(step) + " it gives " + dof + " the value " + fnd_Shown(*theirs[i]) +
                          ", and " + Quoted(a.name) + " gives it " + fnd_Shown(*ours[i]));
            return true;
        }
        return false;
    }

    const odiK_Model& model_;
    fnd_Sink& sink_;
    std::shared_ptr<const Held> held_;
    std::vector<Actor> actors_; // the conditions first
    std::vector<Entry> entries_;
    std::set<std::pair<int, int>> met_;
};

/// The same members, under whatever names.
bool AreEqual(const rgnC_Region& a, const rgnC_Region& b) {
    if (!a.HasValue() || !b.HasValue()) return false;
    if (a == b) return true;
    const rgnC_SetData& first = a.ConstSet().Data();
    const rgnC_SetData& second = b.ConstSet().Data();
    if (first.IsNull() || second.IsNull() || first.Kind() != second.Kind() ||
        first.NumSubSets() != second.NumSubSets()) {
        return false;
    }
    for (int i = 0; i < first.NumSubSets(); ++i) {
        const rgnC_SubsetData ours = first.SubSet(i);
        const rgnC_SubsetData theirs = second.SubSet(i);
        if (ours.meshIndex != theirs.meshIndex || ours.classIndex != theirs.classIndex ||
            !(ours.subset == theirs.subset) || !(ours.facetIds == theirs.facetIds)) {
            return false;
        }
    }
    return true;
}

} // namespace

void dck_CheckMeetings(const dck_Subject& subject, fnd_Sink& sink) {
    Meetings(subject, sink).Run();
}

void dck_CheckTies(const odiK_Model& model, fnd_Sink& sink) {
    const dck_Nodes nodes(model);
    for (const auto& [name, constraint] : model.constraints) {
        const auto* tie = nex_canDynamicCastPtr<kcoC_Tie>(&constraint);
        if (tie == nullptr) continue;
        const std::vector<dck_Nodes::Key> master = nodes.Of(tie->master);
        const std::vector<dck_Nodes::Key> slave = nodes.Of(tie->slave);
        std::vector<dck_Nodes::Key> both;
        std::ranges::set_intersection(master, slave, std::back_inserter(both));
        if (both.empty()) continue;
        sink.Add("tie-shares-nodes", Place("constraints", name),
                 "found " + fnd_Counted(static_cast<long long>(both.size()), "node") +
                     " on both sides, the first " + nodes.NameOf(both.front()));
    }
}

void dck_CheckContactPairs(const odiK_Model& model, fnd_Sink& sink) {
    for (const auto& [name, interaction] : model.interactions) {
        if (interaction.suppressed) continue;
        const auto* pair = nex_canDynamicCastPtr<kinC_SurfaceToSurfaceContact>(&interaction);
        if (pair == nullptr || !AreEqual(pair->master, pair->slave)) continue;
        sink.Add("contact-with-itself", Place("interactions", name),
                 "found " + Quoted(pair->master.SetName()) + " and " + Quoted(pair->slave.SetName()) +
                     ", which are the same faces",
                 {}, "for a surface that meets itself there is self-contact");
    }
}
