#include "store_interface/propagation/kprC_PropagatingObject.h"

#include "foundation/nex_Exception.h"

#include <algorithm>
#include <string>

using Status = mdl_PropagationStatusEnm;
using AttributeState = mdl_PropAttributeStateEnm;

namespace {

fnd_Finding Impossible(const cow_String& step, const char* found, const char* expected = "") {
    fnd_Finding finding = fnd_Make("impossible-state", "/states", std::string("found ") + found, expected);
    fnd_AppendPointer(finding.place, step.View());
    return finding;
}

} // namespace

const omu_EnumTable& omu_EnumTableOf(mdl_PropAttributeStateEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NEVER_SET", "NEVER_SET"},
                                           {1, "SET", "SET"},
                                           {2, "CARRIED", "CARRIED"},
                                           {3, "CLEARED", "CLEARED"}};
    static constexpr omu_EnumTable table{"mdl_PropAttributeStateEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(mdl_PropagationStatusEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NOT_YET_ACTIVE", "NOT_YET_ACTIVE"},
        {1, "CREATED", "CREATED"},
        {2, "PROPAGATED", "PROPAGATED"},
        {3, "MODIFIED", "MODIFIED"},
        {4, "DEACTIVATED", "DEACTIVATED"},
        {5, "NO_LONGER_ACTIVE", "NO_LONGER_ACTIVE"},
        {6, "TYPE_NOT_APPLICABLE", "TYPE_NOT_APPLICABLE"},
        {7, "INSTANCE_NOT_APPLICABLE", "INSTANCE_NOT_APPLICABLE"},
        {8, "BUILT_INTO_BASE_STATE", "BUILT_INTO_BASE_STATE"},
        {9, "PROPAGATED_FROM_BASE_STATE", "PROPAGATED_FROM_BASE_STATE"},
        {10, "MODIFIED_FROM_BASE_STATE", "MODIFIED_FROM_BASE_STATE"},
        {11, "DEACTIVATED_FROM_BASE_STATE", "DEACTIVATED_FROM_BASE_STATE"},
        {12, "BUILT_INTO_MODES", "BUILT_INTO_MODES"},
        {13, "NOT_APPLICABLE", "NOT_APPLICABLE"},
        {14, "FIELD_PROPAGATED", "FIELD_PROPAGATED"},
        {15, "FIELD_RESET", "FIELD_RESET"},
    };
    static constexpr omu_EnumTable table{"mdl_PropagationStatusEnm", rows};
    return table;
}

bool mdl_GivenState::IsGiven(const char* field) const {
    const auto& fields = record.ConstGet().DynFields().All();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (std::string_view(field) == fields[i].name) return marks[i] != mdl_GivenEnm::ABSENT;
    }
    return false;
}

mdl_GivenState* kprC_PropagatingObject::Given::Find(const cow_String& stepName) {
    if (!places.empty()) {
        const auto place = places.find(stepName.View());
        return place == places.end() ? nullptr : &states[place->second];
    }
    const auto place = std::ranges::find(states, stepName, &mdl_GivenState::stepName);
    return place == states.end() ? nullptr : &*place;
}

const std::vector<mdl_GivenState>& kprC_PropagatingObject::GivenStates() const {
    static const std::vector<mdl_GivenState> none;
    return given_.IsNull() ? none : given_.ConstGet().states;
}

const mdl_GivenState* kprC_PropagatingObject::GivenState(const cow_String& stepName) const {
    return given_.IsNull() ? nullptr : given_.Referent()->Find(stepName);
}

mdl_GivenState& kprC_PropagatingObject::Give(const cow_String& stepName) {
    constexpr std::size_t few = 16;
    if (given_.IsNull()) given_.Reset(new Given());
    Given& all = given_.Get();
    if (mdl_GivenState* known = all.Find(stepName)) return *known;
    mdl_GivenState given;
    given.stepName = stepName;
    given.record = mdl_ObjCow<cls_Record>(NewState(0));
    given.marks.assign(given.record.ConstGet().DynFields().All().size(), mdl_GivenEnm::ABSENT);
    all.states.push_back(std::move(given));
    if (all.states.size() > few) {
        for (std::size_t i = all.places.size(); i < all.states.size(); ++i) {
            all.places.emplace(all.states[i].stepName.View(), i);
        }
    }
    return all.states.back();
}

bool kprC_PropagatingObject::IsActive(Status status) {
    switch (status) {
    case Status::CREATED:
    case Status::PROPAGATED:
    case Status::MODIFIED:
    case Status::BUILT_INTO_BASE_STATE:
    case Status::PROPAGATED_FROM_BASE_STATE:
    case Status::MODIFIED_FROM_BASE_STATE:
    case Status::FIELD_PROPAGATED: return true;
    default: return false;
    }
}

bool kprC_PropagatingObject::IsBuiltIn(Status status) {
    return status == Status::BUILT_INTO_BASE_STATE;
}

void kprC_PropagatingObject::CompleteState(cls_Record&, Status, const mdl_GivenState*) const {}

void kprC_PropagatingObject::RaiseNoSuchStep(const cow_String& stepName) const {
    cow_RaiseNoSuchKey("kprC_PropagatingState", stepName);
}

const cls_FieldTable& kprC_PropagatingObject::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_PropagatingObject>(cls_Record::Fields())
            .Field<&kprC_PropagatingObject::suppressed>("suppressed",
                                                        "a suppressed object leaves no trace in the deck");
    return fields;
}

/// Walks the steps and keeps what one step hands to the next.
class kprC_PropagatingObject::Engine {
public:
    Engine(const kprC_PropagatingObject& object, std::vector<fnd_Finding>& problems)
        : object_(object), family_(object.Family()), problems_(problems) {}

    /// `given` is null where the user said nothing.
    StepResult Step(const cow_String& name, const kprC_Step& step, const mdl_GivenState* given) {
        const bool perturbation = step.Perturbation();
        if (!perturbation) run_ = Chain();
        const bool ownRun = perturbation && family_ == mdl_PropagationFamilyEnm::OUTPUT_REQUEST;
        Chain& chain = ownRun ? run_ : general_;

        std::optional<Status> status = FindStatus(given, perturbation, chain, name);
        if (!status) {
            given = nullptr;
            status = FindStatus(nullptr, perturbation, chain, name);
        }
        StepResult result{*status, {}};
        if (CarriesState(*status)) {
            const bool fromBase = perturbation && family_ == mdl_PropagationFamilyEnm::BOUNDARY_CONDITION &&
                                  IsBaseStateStatus(*status);
            result.state = given == nullptr ? Carried(chain, fromBase, *status)
                                            : Laid(Carried(chain, fromBase, *status), chain, *given, *status);
        } else if (*status == Status::CREATED || given != nullptr) {
            mdl_ObjCow<cls_Record> fresh(object_.NewState(step.ProcedureType()));
            if (*status == Status::CREATED) chain.defaults = fresh;
            result.state =
                given == nullptr ? Completed(fresh, *status, nullptr) : Laid(fresh, chain, *given, *status);
        }

        if (*status == Status::CREATED) begun_ = true;
        if (!perturbation || ownRun) Remember(chain, result);
        return result;
    }

private:
    struct Cache {
        mdl_ObjCow<cls_Record> state;
        Status status = Status::NOT_YET_ACTIVE;
    };
    struct Chain {
        bool alive = false;
        mdl_ObjCow<cls_Record> base;     // null: empty
        mdl_ObjCow<cls_Record> defaults; // of the step that created the object
        // What a step without a state of its own sees, once for the base and once for its zeroed form.
        Cache carried;
        Cache carriedIntoPerturbation;
    };

    static bool IsBaseStateStatus(Status status) {
        return status == Status::PROPAGATED_FROM_BASE_STATE || status == Status::MODIFIED_FROM_BASE_STATE ||
               status == Status::DEACTIVATED_FROM_BASE_STATE;
    }

    static bool CarriesState(Status status) {
        switch (status) {
        case Status::NOT_YET_ACTIVE:
        case Status::CREATED:
        case Status::NO_LONGER_ACTIVE:
        case Status::TYPE_NOT_APPLICABLE:
        case Status::INSTANCE_NOT_APPLICABLE:
        case Status::BUILT_INTO_MODES:
        case Status::NOT_APPLICABLE: return false;
        default: return true;
        }
    }

    // No value: the user's state can't be, and the problem has been noted.
    std::optional<Status> FindStatus(const mdl_GivenState* given, bool perturbation, const Chain& chain,
                                     const cow_String& step) {
        const bool condition = family_ == mdl_PropagationFamilyEnm::BOUNDARY_CONDITION;
        const bool output = family_ == mdl_PropagationFamilyEnm::OUTPUT_REQUEST;
        if (given == nullptr) {
            if (!chain.alive) {
                if (output && perturbation && general_.alive) return Status::TYPE_NOT_APPLICABLE;
                return begun_ ? Status::NO_LONGER_ACTIVE : Status::NOT_YET_ACTIVE;
            }
            if (!perturbation || output) return Status::PROPAGATED;
            return condition ? Status::PROPAGATED_FROM_BASE_STATE : Status::BUILT_INTO_BASE_STATE;
        }
        if (given->status) return *given->status;
        if (given->deactivated && !chain.alive) {
            return Refuse(step, "deactivated, but it is not active there");
        }
        if (!perturbation || output) {
            if (!given->deactivated) return chain.alive ? Status::MODIFIED : Status::CREATED;
            return family_ == mdl_PropagationFamilyEnm::FIELD ? Status::FIELD_RESET : Status::DEACTIVATED;
        }
        if (!chain.alive) return Status::CREATED;
        if (!condition) {
            return Refuse(step,
                          "a state in a linear perturbation step, but it belongs to the base state there",
                          "no state");
        }
        return given->deactivated ? Status::DEACTIVATED_FROM_BASE_STATE : Status::MODIFIED_FROM_BASE_STATE;
    }

    std::optional<Status> Refuse(const cow_String& step, const char* found, const char* expected = "") {
        problems_.push_back(Impossible(step, found, expected));
        return std::nullopt;
    }

    const cls_Record& Defaults(Chain& chain) {
        if (chain.defaults.IsNull()) chain.defaults = mdl_ObjCow<cls_Record>(object_.NewState(0));
        return chain.defaults.ConstGet();
    }

    mdl_ObjCow<cls_Record> Completed(mdl_ObjCow<cls_Record> state, Status status,
                                     const mdl_GivenState* given) {
        object_.CompleteState(state.Get(), status, given);
        return state;
    }

    // The base as the next step holds it.
    mdl_ObjCow<cls_Record> Carried(Chain& chain, bool fromBase, Status status) {
        Cache& cache = fromBase ? chain.carriedIntoPerturbation : chain.carried;
        if (cache.state.IsNull() || cache.status != status) {
            const cls_Record& defaults = Defaults(chain);
            mdl_ObjCow<cls_Record> state(chain.base.IsNull() ? defaults : chain.base.ConstGet());
            for (const cls_Field& field : state.ConstGet().DynFields().All()) {
                Carry(field, state.Get(), defaults, fromBase);
            }
            cache = {Completed(state, status, nullptr), status};
        }
        return cache.state;
    }

    static void Carry(const cls_Field& field, cls_Record& state, const cls_Record& defaults, bool fromBase) {
        void* value = field.In(state);
        if (field.type->Kind() == cls_FieldKind::Attribute) {
            const auto& type = static_cast<const cls_AttributeType&>(*field.type);
            CarryAttribute(type, value, type.Value(field.In(defaults)));
            if (!fromBase || field.baseState == cls_BaseStateRule::Carried) return;
            type.ValueType().Assign(type.WritableValue(value), type.Value(field.In(defaults)));
            if (field.baseState == cls_BaseStateRule::Dropped) type.SetState(value, 0);
        } else if (field.type->Kind() == cls_FieldKind::List) {
            const auto& list = static_cast<const cls_ListType&>(*field.type);
            if (list.ItemType().Kind() != cls_FieldKind::Attribute) return;
            const auto& type = static_cast<const cls_AttributeType&>(list.ItemType());
            for (int i = 0; i < list.Length(value); ++i)
                CarryAttribute(type, list.WritableItem(value, i), nullptr);
        } else if (fromBase && field.baseState != cls_BaseStateRule::Carried) {
            field.type->Assign(value, field.In(defaults));
        }
    }

    static void CarryAttribute(const cls_AttributeType& type, void* attribute, const void* defaultValue) {
        const auto state = static_cast<AttributeState>(type.State(attribute));
        if (state == AttributeState::SET || state == AttributeState::CARRIED) {
            type.SetState(attribute, static_cast<int>(AttributeState::CARRIED));
            return;
        }
        type.Reset(attribute);
        if (defaultValue != nullptr) type.ValueType().Assign(type.WritableValue(attribute), defaultValue);
    }

    // The user's state over what holds without it.
    mdl_ObjCow<cls_Record> Laid(mdl_ObjCow<cls_Record> state, Chain& chain, const mdl_GivenState& given,
                                Status status) {
        const cls_Record& source = given.record.ConstGet();
        const cls_Record& defaults = Defaults(chain);
        const auto& fields = source.DynFields().All();
        for (std::size_t i = 0; i < fields.size(); ++i) {
            const cls_Field& field = fields[i];
            if (given.marks[i] == mdl_GivenEnm::ABSENT) continue;
            void* value = field.In(state.Get());
            if (field.type->Kind() != cls_FieldKind::Attribute) {
                field.type->Assign(value,
                                   field.In(given.marks[i] == mdl_GivenEnm::CLEARED ? defaults : source));
                continue;
            }
            const auto& type = static_cast<const cls_AttributeType&>(*field.type);
            const auto& valueType = type.ValueType();
            switch (given.marks[i]) {
            case mdl_GivenEnm::VALUE:
                valueType.Assign(type.WritableValue(value), type.Value(field.In(source)));
                type.SetState(value, static_cast<int>(AttributeState::SET));
                break;
            case mdl_GivenEnm::CLEARED:
                valueType.Assign(type.WritableValue(value), type.Value(field.In(defaults)));
                type.SetState(value, static_cast<int>(AttributeState::CLEARED));
                break;
            case mdl_GivenEnm::STATE_ONLY: {
                const int number = type.State(field.In(source));
                if (number == 0 || number == 3) {
                    valueType.Assign(type.WritableValue(value), type.Value(field.In(defaults)));
                }
                type.SetState(value, number);
                break;
            }
            default: type.Assign(value, field.In(source)); break;
            }
        }
        return Completed(std::move(state), status, &given);
    }

    static void Remember(Chain& chain, const StepResult& result) {
        switch (result.status) {
        case Status::CREATED:
        case Status::PROPAGATED:
        case Status::MODIFIED:
        case Status::FIELD_PROPAGATED:
            chain.alive = true;
            if (!(result.status == Status::PROPAGATED && result.state == chain.carried.state)) {
                chain.carried = {};
            }
            chain.base = result.state;
            chain.carriedIntoPerturbation = {};
            break;
        case Status::NOT_YET_ACTIVE:
        case Status::DEACTIVATED:
        case Status::NO_LONGER_ACTIVE:
        case Status::FIELD_RESET:
            chain.alive = false;
            chain.base = {};
            chain.carried = {};
            chain.carriedIntoPerturbation = {};
            break;
        default: break;
        }
    }

    const kprC_PropagatingObject& object_;
    mdl_PropagationFamilyEnm family_;
    std::vector<fnd_Finding>& problems_;
    Chain general_;
    Chain run_; // of consecutive perturbation steps; output requests only
    bool begun_ = false;
};

/// Asks the engine for as few steps as tell of all.
class kprC_PropagatingObject::Walk {
public:
    Walk(Engine& engine, const kprC_Timeline& timeline) : engine_(engine), timeline_(timeline) {}

    void Given(int step, const mdl_GivenState& given) { Ask(step, &given); }

    /// Steps from `from` on, before `to`, for which nothing is given. What such a step hands on, the next of
    /// its kind hands on unchanged if it came to the same as the one before: then all that follow do.
    void Carry(int from, int to) {
        int general = timeline_.Next(false, from);
        int perturbation = timeline_.Next(true, from);
        bool isSettled = false;
        bool isGeneralNew = true;
        bool isPerturbationNew = true;
        while (std::min(general, perturbation) < to) {
            if (general < perturbation) {
                isSettled = !Ask(general, nullptr) && !isGeneralNew;
                isGeneralNew = false;
                // What a perturbation sees may have changed.
                isPerturbationNew = true;
                general = isSettled ? to : timeline_.Next(false, general + 1);
            } else {
                const bool same = !Ask(perturbation, nullptr) && !isPerturbationNew;
                isPerturbationNew = false;
                perturbation = same ? timeline_.Next(true, std::min(general, to))
                                    : timeline_.Next(true, perturbation + 1);
            }
        }
    }

    History Take() { return std::move(history_); }

private:
    /// Whether the step came to something else than the last one of its kind.
    bool Ask(int step, const mdl_GivenState* given) {
        const kprC_StepContainer& steps = timeline_.Steps();
        StepResult result = engine_.Step(steps.NameAt(step), steps.StepAt(step), given);
        std::vector<RunResult>& runs = history_.ofKind[timeline_.IsPerturbation(step) ? 1 : 0];
        if (!runs.empty() && IsSame(runs.back().result, result)) return false;
        runs.push_back({step, std::move(result)});
        return true;
    }

    static bool IsSame(const StepResult& a, const StepResult& b) {
        if (a.status != b.status || a.state.IsNull() != b.state.IsNull()) return false;
        return a.state == b.state || cls_RecordsEqual(a.state.ConstGet(), b.state.ConstGet());
    }

    Engine& engine_;
    const kprC_Timeline& timeline_;
    History history_;
};

kprC_PropagatingObject::History kprC_PropagatingObject::WorkOut(const kprC_Timeline& timeline,
                                                                std::vector<fnd_Finding>& problems) const {
    Engine engine(*this, problems);
    Walk walk(engine, timeline);
    std::vector<std::pair<int, const mdl_GivenState*>> givenAt;
    std::vector<cow_String> unknown;
    for (const mdl_GivenState& given : GivenStates()) {
        const int index = timeline.Steps().IndexOf(given.stepName);
        if (index < 0) {
            unknown.push_back(given.stepName);
        } else {
            givenAt.emplace_back(index, &given);
        }
    }
    std::ranges::sort(givenAt);
    int next = 0;
    for (const auto& [step, given] : givenAt) {
        walk.Carry(next, step);
        walk.Given(step, *given);
        next = step + 1;
    }
    walk.Carry(next, timeline.Size());
    for (const cow_String& name : unknown) {
        problems.push_back(Impossible(name, "a state, but there is no step of that name"));
    }
    return walk.Take();
}

void mdl_RaisePropagationProblem(const cow_String& object, const fnd_Finding& problem) {
    const std::string text =
        "object '" + std::string(object.View()) + "', " + problem.place + ": " + problem.Text();
    nex_Raise(atr_String(std::string_view(text)));
}
