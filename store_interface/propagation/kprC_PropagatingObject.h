#ifndef QRX_STORE_KPRC_PROPAGATINGOBJECT_H
#define QRX_STORE_KPRC_PROPAGATINGOBJECT_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/propagation/kprC_Timeline.h"
#include "store_interface/propagation/mdl_PropAttr.h"

#include <algorithm>
#include <map>
#include <memory>
#include <optional>
#include <unordered_map>
#include <vector>

/// What the user said of one field of a state.
enum class mdl_GivenEnm : char {
    ABSENT,       ///< nothing: carried over
    VALUE,        ///< a value, set in this step
    CLEARED,      ///< cleared in this step
    AS_IT_STANDS, ///< value and attribute state, taken without any rule
    STATE_ONLY,   ///< an attribute state; its value follows from the state
};

/// What the user said of an object in one step.
struct mdl_GivenState {
    cow_String stepName;
    /// A record of the object's state class; only the fields that are marked count.
    mdl_ObjCow<cls_Record> record;
    /// One mark per field of the state class.
    std::vector<mdl_GivenEnm> marks;
    bool deactivated = false;
    /// Overrides the status that the rules give.
    std::optional<mdl_PropagationStatusEnm> status;

    bool IsGiven(const char* field) const;
};

/// What an object is in one step, worked out from what the user said in all steps.
template <class S>
struct kprC_PropagatingState {
    cow_String stepName;
    mdl_PropagationStatusEnm status = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
    /// Never null; a default state where the object has none in the step.
    mdl_ObjCow<S> state;
    bool hasState = false;
    /// The class number of the step's record; 0 for the initial step.
    unsigned procedureType = 0;
};

/// Which of the status rules an object follows.
enum class mdl_PropagationFamilyEnm { BOUNDARY_CONDITION, LOAD, FIELD, INTERACTION, OUTPUT_REQUEST };

/// Base of the records that live across steps. The user's states are given step by step; Propagate() works
/// out status and state for every step:
///  - a state creates the object, later states change or end it, steps without one carry it on;
///  - a linear perturbation step sees the state of the last general step and leaves nothing behind.
class kprC_PropagatingObject : public cls_AbstractRecordOf<kprC_PropagatingObject> {
public:
    static constexpr cls_ClassInfo Class{"kprC_PropagatingObject", "a record that lives across steps"};

    bool suppressed = false;

    virtual mdl_PropagationFamilyEnm Family() const = 0;
    /// A new state of the object's state class, with the defaults of a step of the procedure.
    virtual cls_Record* NewState(unsigned procedureType) const = 0;

    const std::vector<mdl_GivenState>& GivenStates() const;
    const mdl_GivenState* GivenState(const cow_String& stepName) const;
    /// The user's state of the step, made at its first use; to be filled before the object is copied.
    mdl_GivenState& Give(const cow_String& stepName);

    /// Works out all steps; must run again after a change of states or steps. Gives the states that can't
    /// be, in step order, then those of unknown steps; they are treated as if nothing had been said.
    virtual std::vector<fnd_Finding> Propagate(const kprC_Timeline& timeline) = 0;
    /// The status in the step. An unknown step raises.
    virtual mdl_PropagationStatusEnm StatusIn(const cow_String& stepName) const = 0;

    /// Statuses in which an object is in force: 1, 2, 3, 8, 9, 10 and 14.
    static bool IsActive(mdl_PropagationStatusEnm status);
    /// Status 8.
    static bool IsBuiltIn(mdl_PropagationStatusEnm status);

    static const cls_FieldTable& Fields();

protected:
    /// Lays a rule of the class's own over a state that has just been worked out. `given` is null where the
    /// user said nothing.
    virtual void CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                               const mdl_GivenState* given) const;

    struct StepResult {
        mdl_PropagationStatusEnm status = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
        mdl_ObjCow<cls_Record> state; // null: none
    };
    /// What the object is from a step on, in all steps of its kind.
    struct RunResult {
        int first = 0;
        StepResult result;
    };
    /// General steps and perturbations, each in ascending order.
    struct History {
        std::vector<RunResult> ofKind[2];
    };
    History WorkOut(const kprC_Timeline& timeline, std::vector<fnd_Finding>& problems) const;
    [[noreturn]] void RaiseNoSuchStep(const cow_String& stepName) const;

private:
    class Engine;
    class Walk;
    struct Given {
        std::vector<mdl_GivenState> states;
        // Where they are many; the views lie in the names' storage, which copies share.
        std::unordered_map<std::string_view, std::size_t> places;

        mdl_GivenState* Find(const cow_String& stepName);
    };
    // Shared by copies, since every keyword holds a copy of its object.
    cow_COW<Given, cow_Direct<Given>> given_;
};

/// Sets fields of a user's state by member: Edit<S>(given).Set<&S::u1>(0.5).Clear<&S::amplitude>().
template <class S>
class mdl_StateEdit {
public:
    explicit mdl_StateEdit(mdl_GivenState& given) : given_(given) {}
    template <auto Member, class V>
    mdl_StateEdit& Set(const V& value) {
        auto& member = static_cast<S&>(given_.record.Get()).*Member;
        if constexpr (requires { member.Set(value); }) {
            member.Set(value);
        } else {
            member = value;
        }
        return Mark(&member, mdl_GivenEnm::VALUE);
    }
    template <auto Member>
    mdl_StateEdit& Clear() {
        return Mark(&(static_cast<S&>(given_.record.Get()).*Member), mdl_GivenEnm::CLEARED);
    }
    mdl_StateEdit& Deactivate() {
        given_.deactivated = true;
        return *this;
    }
    mdl_StateEdit& Status(mdl_PropagationStatusEnm status) {
        given_.status = status;
        return *this;
    }

private:
    mdl_StateEdit& Mark(const void* member, mdl_GivenEnm mark) {
        const auto& fields = given_.record.ConstGet().DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if (fields[i].In(given_.record.ConstGet()) == member) given_.marks[i] = mark;
        }
        return *this;
    }

    mdl_GivenState& given_;
};

/// A propagating object T whose states are of class S or of classes derived from it; the base of each
/// family's root.
template <class T, class S>
class kprC_PropagatingOf : public cls_AbstractRecordOf<T, kprC_PropagatingObject> {
public:
    using StateRecord = S;

    mdl_PropagationStatusEnm Status(const cow_String& stepName) const {
        return RunAt(IndexOf(stepName)).status;
    }
    mdl_PropagationStatusEnm StatusIn(const cow_String& stepName) const override { return Status(stepName); }
    /// Status, state and procedure in the step. An unknown step raises.
    kprC_PropagatingState<S> ConstGetStateQuad(const cow_String& stepName) const {
        const int step = IndexOf(stepName);
        const Run& run = RunAt(step);
        const auto& replaced = states_.ConstGet().replaced;
        const auto own = replaced.empty() ? replaced.end() : replaced.find(step);
        const bool isOwn = own != replaced.end();
        return {timeline_.Steps().NameAt(step), run.status, isOwn ? own->second : run.state,
                isOwn || run.hasState, timeline_.Steps().StepAt(step).ProcedureType()};
    }
    /// Whether the user gave a state for the step, a deactivation included.
    bool HasStep(const cow_String& stepName) const { return this->GivenState(stepName) != nullptr; }
    /// The name of the first step of status 1; empty if there is none.
    cow_String CreateStepName() const {
        if (states_.IsNull()) return {};
        int first = timeline_.Size();
        for (const auto& runs : states_.ConstGet().ofKind) {
            const auto run = std::ranges::find(runs, mdl_PropagationStatusEnm::CREATED, &Run::status);
            if (run != runs.end()) first = std::min(first, run->first);
        }
        return first < timeline_.Size() ? timeline_.Steps().NameAt(first) : cow_String();
    }

    std::vector<fnd_Finding> Propagate(const kprC_Timeline& timeline) override {
        std::vector<fnd_Finding> problems;
        const auto history = this->WorkOut(timeline, problems);
        auto shared = std::make_unique<States>();
        mdl_ObjCow<S> none;
        for (std::size_t kind = 0; kind < 2; ++kind) {
            std::vector<Run>& runs = shared->ofKind[kind];
            runs.reserve(history.ofKind[kind].size());
            for (const auto& [first, result] : history.ofKind[kind]) {
                if (result.state.IsNull() && none.IsNull()) {
                    none = mdl_ObjCow<S>(static_cast<S*>(this->NewState(0)));
                }
                const bool hasState = !result.state.IsNull();
                runs.push_back(
                    {first, result.status, hasState,
                     hasState ? mdl_ObjCow<S>(static_cast<const S&>(result.state.ConstGet())) : none});
            }
        }
        states_.Reset(shared.release());
        timeline_ = timeline;
        return problems;
    }
    /// The steps when the statuses were worked out, and all runs of them in which status and state are the
    /// same, in the order of their first steps.
    const kprC_Timeline& Timeline() const { return timeline_; }
    std::vector<kprC_StepRun> Runs() const {
        std::vector<kprC_StepRun> all;
        if (states_.IsNull()) return all;
        for (const bool perturbation : {false, true}) {
            const auto& runs = states_.ConstGet().ofKind[perturbation ? 1 : 0];
            for (std::size_t i = 0; i < runs.size(); ++i) {
                const int end = i + 1 < runs.size() ? runs[i + 1].first : timeline_.Size();
                all.push_back({runs[i].first, end, perturbation});
            }
        }
        std::ranges::sort(all, {}, &kprC_StepRun::first);
        return all;
    }

protected:
    bool KnowsStep(const cow_String& stepName) const { return timeline_.Steps().IsMember(stepName); }
    /// Puts a copy of the state in the place of the step's; no status changes. An unknown step raises.
    void ReplaceState(const cow_String& stepName, const S& state) {
        const int step = IndexOf(stepName);
        states_.Get().replaced[step] = mdl_ObjCow<S>(state);
    }

private:
    /// What the object is from a step on, in all steps of its kind.
    struct Run {
        int first = 0;
        mdl_PropagationStatusEnm status = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
        bool hasState = false;
        mdl_ObjCow<S> state;
    };
    struct States {
        std::vector<Run> ofKind[2];
        std::map<int, mdl_ObjCow<S>> replaced; // states of single steps
    };

    int IndexOf(const cow_String& stepName) const {
        const int step = timeline_.Steps().IndexOf(stepName);
        if (step < 0) this->RaiseNoSuchStep(stepName);
        return step;
    }
    const Run& RunAt(int step) const {
        const auto& runs = states_.ConstGet().ofKind[timeline_.IsPerturbation(step) ? 1 : 0];
        return *std::prev(std::ranges::upper_bound(runs, step, {}, &Run::first));
    }

    cow_COW<States, cow_Direct<States>> states_; // shared by copies
    kprC_Timeline timeline_;                     // as it was when the states were worked out
};

/// Objects that live across steps, by name, in ascending byte order.
template <class T>
class kprC_PropagatingContainer : public mdl_MapString2ObjCow<T> {
public:
    /// Works out all steps of all objects; raises at the first state that can't be.
    void Propagate(const kprC_StepContainer& steps);
    kprC_PropagatingContainer DeepCopy() const {
        kprC_PropagatingContainer copy;
        for (mdl_MapString2ObjCowIT<T> it(*this); !it.IsDone(); it.Next()) {
            copy.Insert(it.CurrentKey(), it.CurrentValue());
        }
        return copy;
    }
};

template <class T>
class kprC_PropagatingContainerIT : public mdl_MapString2ObjCowIT<T> {
public:
    using mdl_MapString2ObjCowIT<T>::mdl_MapString2ObjCowIT;
};

[[noreturn]] void mdl_RaisePropagationProblem(const cow_String& object, const fnd_Finding& problem);

template <class T>
void kprC_PropagatingContainer<T>::Propagate(const kprC_StepContainer& steps) {
    const kprC_Timeline timeline(steps);
    for (const cow_String& key : this->Keys()) {
        const auto problems = this->Get(key).Propagate(timeline);
        if (!problems.empty()) mdl_RaisePropagationProblem(key, problems.front());
    }
}

#endif
