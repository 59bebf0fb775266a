#include "conditions/oif_OpStatus.h"

#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <string>
#include <unordered_set>

using Status = mdl_PropagationStatusEnm;
using Method = kloC_BoltLoad::MethodEnm;

namespace {

constexpr unsigned kGeneralField = 0x2EC0015;
constexpr unsigned kInteractionTypes[] = {0x2A0001F, 0x2A00023, 0x2A00033, 0x2A00070};

const kloC_BoltLoad* BoltLoad(const kloC_Load& load) {
    return load.DynTypeId() == kloC_BoltLoad::TypeId() ? &static_cast<const kloC_BoltLoad&>(load) : nullptr;
}

/// The load cases for which `scale` gives a factor, among those that `counts` lets in; the step itself if
/// there are none of these.
template <class Counts, class Scale>
oif_ConditionPlaces PlacesWhere(const kprC_Step& step, const Counts& counts, const Scale& scale) {
    oif_ConditionPlaces places;
    bool inCases = false;
    if (const auto* analysis = nex_canDynamicCastPtr<kprC_AnalysisStep>(&step)) {
        for (mdl_MapString2ObjCowIT<klcC_LoadCase> it(analysis->loadCases); !it.IsDone(); it.Next()) {
            const klcC_LoadCase& loadCase = it.CurrentValue();
            if (!counts(loadCase)) continue;
            inCases = true;
            if (const float* factor = scale(loadCase)) places.push_back({it.CurrentKey(), *factor});
        }
    }
    if (!inCases) places.emplace_back();
    return places;
}

bool All(const klcC_LoadCase&) {
    return true;
}

} // namespace

bool oif_OpStatus::OpNew(unsigned int typeId, const cow_String& stepName) const {
    const cow_List<int>& flags = opNewFlags.ConstGet(Key(typeId));
    // A step that is not there fails as place -1 of the list does.
    return flags.ConstGet(stepIndex_.Find(stepName)) != 0;
}

void oif_OpStatus::ForceOpNew(int stepIndex) {
    if (stepIndex >= stepNames.Length()) return;
    for (int key = 0; key < opNewFlags.Count(); ++key) SetFlag(key, stepIndex);
}

int oif_OpStatus::FindKey(std::span<const KeyRow> rows, unsigned typeId, const char* failure) {
    for (const KeyRow& row : rows) {
        if (row.typeId == typeId) return row.key;
    }
    QRXBasException::Throw(nex_PrimException<atr_String, 1>(failure));
}

void oif_OpStatus::InitializeMembers(const cow_List<cow_String>& steps, int numberOfKeys) {
    cow_List<int> flags;
    for (int i = 0; i < steps.Length(); ++i) {
        stepIndex_.Append(steps[i]);
        stepNames.Append(steps[i]);
        flags.Append(0);
    }
    for (int key = 0; key < numberOfKeys; ++key) opNewFlags.Insert(key, flags);
}

void oif_BCOpStatus::Configure(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                               const kprC_PropagatingContainer<kloC_Load>& loads,
                               const cow_List<cow_String>& steps) {
    InitializeMembers(steps, 2);
    PopulateMembers(bcs, loads);
}

void oif_BCOpStatus::PopulateMembers(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                                     const kprC_PropagatingContainer<kloC_Load>& loads) {
    SetFlagsWhere("boundary condition", bcs, [](const kbcC_BC& bc, const cow_String& step) {
        if (bc.suppressed) return false;
        switch (bc.Status(step)) {
        case Status::DEACTIVATED:
        case Status::DEACTIVATED_FROM_BASE_STATE: return true;
        case Status::MODIFIED:
        case Status::MODIFIED_FROM_BASE_STATE: return bc.ModifiedNeedsOpNew(step);
        default: return false;
        }
    });
    // A bolt that changes its method, or ends while it is held by its length, frees what held it.
    SetFlagsWhere("load", loads, [](const kloC_Load& load, const cow_String& step) {
        const kloC_BoltLoad* bolt = BoltLoad(load);
        if (bolt == nullptr || load.suppressed) return false;
        const Status status = bolt->Status(step);
        if (status == Status::BUILT_INTO_BASE_STATE) return false;
        const auto& method = bolt->BoltState(step).boltMethod;
        return (status != Status::CREATED && method.IsModified()) ||
               (status == Status::DEACTIVATED && method.ConstGet() != Method::APPLY_FORCE);
    });
}

bool oif_BCOpStatus::Writes(const kbcC_BC& bc, const cow_String& stepName, bool inLoadCase) const {
    if (bc.suppressed) return false;
    switch (bc.Status(stepName)) {
    case Status::CREATED:
    case Status::MODIFIED:
    case Status::DEACTIVATED:
    case Status::MODIFIED_FROM_BASE_STATE:
    case Status::DEACTIVATED_FROM_BASE_STATE: return true;
    case Status::PROPAGATED:
    case Status::PROPAGATED_FROM_BASE_STATE: return inLoadCase || OpNew(bc.DynTypeId(), stepName);
    default: return false;
    }
}

oif_ConditionPlaces oif_BCOpStatus::Places(const kprC_Step& step, const cow_String& name, Status status) {
    static constexpr float unscaled = 1.0F;
    return PlacesWhere(step, All, [&](const klcC_LoadCase& loadCase) -> const float* {
        if (const float* scale = loadCase.bcs.Find(name)) return scale;
        return loadCase.baseStateBCs && IsOfBaseState(status) ? &unscaled : nullptr;
    });
}

bool oif_BCOpStatus::IsOfBaseState(Status status) {
    return status == Status::PROPAGATED_FROM_BASE_STATE || status == Status::MODIFIED_FROM_BASE_STATE;
}

bool oif_BCOpStatus::WritesBolt(const kloC_BoltLoad& load, const cow_String& stepName, bool opMod) {
    if (load.suppressed) return false;
    const Status status = load.Status(stepName);
    const auto& method = load.BoltState(stepName).boltMethod;
    const bool byForce = method.ConstGet() == Method::APPLY_FORCE;
    switch (status) {
    case Status::CREATED: return !byForce;
    case Status::PROPAGATED: return !byForce && !opMod;
    case Status::MODIFIED: return !byForce || method.IsModified();
    case Status::DEACTIVATED: return true;
    default: return false;
    }
}

int oif_BCOpStatus::Key(unsigned int typeId) const {
    static constexpr KeyRow rows[] = {
        {0x2880024, 0}, {0x2980005, 0}, {0x2980007, 0}, {0x2980009, 0}, {0x298000C, 0}, {0x298000E, 0},
        {0x2980010, 0}, {0x2980014, 0}, {0x2980016, 0}, {0x2980018, 0}, {0x298001A, 0}, {0x298001C, 0},
        {0x2980022, 0}, {0x2980031, 0}, {0x2980024, 1}, {0x2980026, 1}, {0x2980028, 1}};
    return FindKey(rows, typeId, "Unimplemented bc->statusKey conversion");
}

void oif_LoadOpStatus::Configure(const kprC_PropagatingContainer<kloC_Load>& loads,
                                 const cow_List<cow_String>& steps, const qkw_ModelInfo& modelInfo) {
    InitializeMembers(steps, 17);
    PopulateMembers(loads);
    ResolveOverlapRegions(loads, modelInfo);
}

void oif_LoadOpStatus::PopulateMembers(const kprC_PropagatingContainer<kloC_Load>& loads) {
    SetFlagsWhere("load", loads, [](const kloC_Load& load, const cow_String& step) {
        if (load.suppressed) return false;
        const Status status = load.Status(step);
        if (status == Status::DEACTIVATED) return true;
        const kloC_BoltLoad* bolt = BoltLoad(load);
        return bolt != nullptr && status == Status::MODIFIED && bolt->BoltState(step).boltMethod.IsModified();
    });
}

void oif_LoadOpStatus::ResolveOverlapRegions(const kprC_PropagatingContainer<kloC_Load>& loads,
                                             const qkw_ModelInfo& modelInfo) {
    std::vector<std::unordered_set<std::string>> names(static_cast<std::size_t>(opNewFlags.Count()));
    std::vector<bool> overlaps(names.size());
    for (kprC_PropagatingContainerIT<kloC_Load> it(loads); !it.IsDone(); it.Next()) {
        const kloC_Load& load = it.CurrentValue();
        if (load.suppressed) continue;
        const nex_Context context("load", it.CurrentKey());
        const auto key = static_cast<std::size_t>(Key(load.DynTypeId()));
        // Regions without a value share the empty name.
        const cow_String name = oif_RegionName(load.region, modelInfo);
        if (!names[key].emplace(name.View()).second) overlaps[key] = true;
    }
    for (std::size_t key = 0; key < overlaps.size(); ++key) {
        if (!overlaps[key]) continue;
        for (int i = 1; i < stepNames.Length(); ++i) SetFlag(static_cast<int>(key), i);
    }
}

bool oif_LoadOpStatus::Writes(const kloC_Load& load, const cow_String& stepName) const {
    if (load.suppressed || IsInitialStep(stepName)) return false;
    const Status status = load.Status(stepName);
    const bool begunOrChanged = status == Status::CREATED || status == Status::MODIFIED;
    const bool carried = status == Status::PROPAGATED && OpNew(load.DynTypeId(), stepName);
    if (!begunOrChanged && !carried && status != Status::DEACTIVATED) return false;
    const kloC_BoltLoad* bolt = BoltLoad(load);
    if (bolt == nullptr) return true;
    // A bolt is a force only while a force tightens it; a change to another method is told once.
    const auto& method = bolt->BoltState(stepName).boltMethod;
    return method.ConstGet() == Method::APPLY_FORCE || (status == Status::MODIFIED && method.IsModified());
}

oif_ConditionPlaces oif_LoadOpStatus::Places(const kprC_Step& step, const cow_String& name) {
    return PlacesWhere(
        step, [](const klcC_LoadCase& loadCase) { return !loadCase.loadsAreStepLoads; },
        [&](const klcC_LoadCase& loadCase) { return loadCase.loads.Find(name); });
}

int oif_LoadOpStatus::Key(unsigned int typeId) const {
    static constexpr KeyRow rows[] = {
        {0x2880018, 0},  {0x2880022, 0},  {0x2880024, 0},  {0x288002A, 0},  {0x2880042, 0},  {0x2880047, 0},
        {0x2880014, 1},  {0x288001A, 1},  {0x288001C, 1},  {0x288001E, 1},  {0x2880020, 1},  {0x2880008, 2},
        {0x2880055, 2},  {0x2880057, 2},  {0x2880026, 3},  {0x288003C, 3},  {0x2880028, 4},  {0x2880040, 4},
        {0x288003E, 5},  {0x2880045, 5},  {0x288002C, 6},  {0x288002E, 7},  {0x2880012, 8},  {0x2880030, 9},
        {0x2880038, 10}, {0x2880034, 11}, {0x2880032, 12}, {0x288003A, 13}, {0x2880036, 14}, {0x288000E, 15},
        {0x2880049, 15}, {0x288004B, 16}};
    return FindKey(rows, typeId, "Unimplemented load->statusKey conversion");
}

void oif_FieldOpStatus::Configure(const kprC_PropagatingContainer<kpfC_Field>& fields,
                                  const cow_List<cow_String>& steps) {
    InitializeMembers(steps, 7);
    PopulateMembers(fields);
}

void oif_FieldOpStatus::PopulateMembers(const kprC_PropagatingContainer<kpfC_Field>& fields) {
    // Suppressed fields count too.
    SetFlagsWhere("field", fields, [](const kpfC_Field& field, const cow_String& step) {
        return field.Status(step) == Status::FIELD_RESET;
    });
}

bool oif_FieldOpStatus::Writes(const kpfC_Field& field, const cow_String& stepName) const {
    if (field.suppressed) return false;
    switch (field.Status(stepName)) {
    case Status::CREATED:
    case Status::MODIFIED:
    case Status::DEACTIVATED:
    case Status::FIELD_RESET: return true;
    case Status::PROPAGATED:
    case Status::FIELD_PROPAGATED: return WriteInEveryPropStep(field) || OpNew(field.DynTypeId(), stepName);
    default: return false;
    }
}

bool oif_FieldOpStatus::WriteInEveryPropStep(const kpfC_Field& field) {
    return !field.suppressed && field.DynTypeId() == kGeneralField;
}

oif_ConditionPlaces oif_FieldOpStatus::Places(const kprC_Step& step, const cow_String& name) {
    return PlacesWhere(step, All, [&](const klcC_LoadCase& loadCase) { return loadCase.fields.Find(name); });
}

int oif_FieldOpStatus::Key(unsigned int typeId) const {
    static constexpr KeyRow rows[] = {{0x2EC0008, 0}, {0x2EC000A, 1}, {0x2EC0013, 2}, {kGeneralField, 3},
                                      {0x2EC0016, 4}, {0x2EC001A, 5}, {0x2EC001F, 6}};
    return FindKey(rows, typeId, "Unimplemented field->statusKey conversion");
}

void oif_InteractionOpStatus::Configure(const kprC_PropagatingContainer<kinC_Interaction>& interactions,
                                        const cow_List<cow_String>& steps) {
    InitializeMembers(steps, static_cast<int>(std::size(kInteractionTypes)));
    PopulateMembers(interactions);
}

void oif_InteractionOpStatus::PopulateMembers(
    const kprC_PropagatingContainer<kinC_Interaction>& interactions) {
    // Suppressed interactions count too; those of other classes have no family.
    SetFlagsWhere("interaction", interactions,
                  [](const kinC_Interaction& interaction, const cow_String& step) {
                      return std::find(std::begin(kInteractionTypes), std::end(kInteractionTypes),
                                       interaction.DynTypeId()) != std::end(kInteractionTypes) &&
                             interaction.GetPropStatus(step) == Status::DEACTIVATED;
                  });
}

int oif_InteractionOpStatus::Key(unsigned int typeId) const {
    static constexpr KeyRow rows[] = {{kInteractionTypes[0], 0},
                                      {kInteractionTypes[1], 1},
                                      {kInteractionTypes[2], 2},
                                      {kInteractionTypes[3], 3}};
    // The text of an assertion, quotes and all, is the message.
    return FindKey(rows, typeId, "\"Unimplemented interaction->statusKey conversion\" == 0");
}
