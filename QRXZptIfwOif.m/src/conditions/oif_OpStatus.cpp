#include "conditions/oif_OpStatus.h"

#include "conditions/oif_BCTable.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"

#include <string>
#include <unordered_set>

using Status = mdl_PropagationStatusEnm;

namespace {

struct InteractionRow {
    unsigned typeId;
    oif_InteractionFamily family;
};
constexpr InteractionRow kInteractions[] = {
    {kinC_FilmCondition::Class.Id(), oif_InteractionFamily::FILM_CONDITION},
    {kinC_RadiationToAmbient::Class.Id(), oif_InteractionFamily::RADIATION_TO_AMBIENT},
    {kinC_ContactExp::Class.Id(), oif_InteractionFamily::GENERAL_CONTACT},
    {kinC_ConcRadiationToAmbient::Class.Id(), oif_InteractionFamily::CONCENTRATED_RADIATION},
};

/// The family of a row; raises the text without one.
template <class Row>
int KeyOf(const Row* row, const char* failure) {
    if (row == nullptr) nex_Raise(failure);
    return static_cast<int>(row->family);
}

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
        for (const auto& [name, loadCase] : analysis->loadCases) {
            if (!counts(loadCase)) continue;
            inCases = true;
            if (const float* factor = scale(loadCase)) places.push_back({name, *factor});
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
    // A step that is not there fails as place -1 of the list does.
    return Flags(typeId).ConstGet(stepIndex_.Find(stepName)) != 0;
}

void oif_OpStatus::ForceOpNew(int stepIndex) {
    if (stepIndex >= stepNames.Length()) return;
    for (cow_List<int>& flags : opNewFlags) flags.Put(stepIndex, 1);
}

void oif_OpStatus::InitializeMembers(const cow_List<cow_String>& steps, int numberOfKeys) {
    stepNames = steps;
    for (const cow_String& step : steps) stepIndex_.Append(step);
    cow_List<int> flags;
    flags.Fill(steps.Length(), 0);
    opNewFlags.assign(static_cast<std::size_t>(numberOfKeys), flags);
}

void oif_BCOpStatus::Configure(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                               const kprC_PropagatingContainer<kloC_Load>& loads,
                               const cow_List<cow_String>& steps) {
    InitializeMembers(steps, oif_NumberOfFamilies(oif_BCRows()));
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
        return (status != Status::CREATED && bolt->ChangesMethod(step)) ||
               (status == Status::DEACTIVATED && !bolt->IsByForce(step));
    });
}

bool oif_BCOpStatus::Writes(const kbcC_BC& bc, const cow_String& stepName, bool inLoadCase) const {
    if (bc.suppressed) return false;
    const bool opNew = inLoadCase || OpNew(bc.DynTypeId(), stepName);
    switch (bc.Status(stepName)) {
    case Status::CREATED:
    case Status::MODIFIED:
    case Status::DEACTIVATED:
    case Status::MODIFIED_FROM_BASE_STATE:
    case Status::DEACTIVATED_FROM_BASE_STATE: return true;
    case Status::PROPAGATED:
    case Status::PROPAGATED_FROM_BASE_STATE: return opNew;
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

bool oif_BCOpStatus::WritesBolt(const kloC_BoltLoad& load, const cow_String& stepName,
                                bool inLoadCase) const {
    if (load.suppressed) return false;
    const bool byLength = !load.IsByForce(stepName);
    switch (load.Status(stepName)) {
    case Status::CREATED: return byLength;
    case Status::PROPAGATED: return byLength && Op(load, stepName, inLoadCase) == oif_Op::NEW;
    case Status::MODIFIED: return byLength || load.ChangesMethod(stepName);
    case Status::DEACTIVATED: return true;
    default: return false;
    }
}

oif_ConditionPlaces oif_BCOpStatus::PlacesOfBolt(const kprC_Step& step, const cow_String& name) {
    return PlacesWhere(step, All, [&](const klcC_LoadCase& loadCase) { return loadCase.loads.Find(name); });
}

int oif_BCOpStatus::Key(unsigned int typeId) const {
    // What holds a bolt is written with "*Boundary".
    if (typeId == kloC_BoltLoad::TypeId()) return static_cast<int>(oif_BCFamily::BOUNDARY);
    return KeyOf(oif_FindBCRow(typeId), NoFamily);
}

void oif_LoadOpStatus::Configure(const kprC_PropagatingContainer<kloC_Load>& loads,
                                 const cow_List<cow_String>& steps, const qkw_ModelInfo& modelInfo) {
    InitializeMembers(steps, oif_NumberOfFamilies(oif_LoadRows()));
    PopulateMembers(loads);
    ResolveOverlapRegions(loads, modelInfo);
}

void oif_LoadOpStatus::PopulateMembers(const kprC_PropagatingContainer<kloC_Load>& loads) {
    SetFlagsWhere("load", loads, [](const kloC_Load& load, const cow_String& step) {
        if (load.suppressed) return false;
        const Status status = load.Status(step);
        if (status == Status::DEACTIVATED) return true;
        const kloC_BoltLoad* bolt = BoltLoad(load);
        return bolt != nullptr && status == Status::MODIFIED && bolt->ChangesMethod(step);
    });
}

void oif_LoadOpStatus::ResolveOverlapRegions(const kprC_PropagatingContainer<kloC_Load>& loads,
                                             const qkw_ModelInfo& modelInfo) {
    std::vector<std::unordered_set<std::string>> names(opNewFlags.size());
    std::vector<bool> overlaps(names.size());
    for (const auto& [name, load] : loads) {
        if (load.suppressed) continue;
        const nex_Context context("load", name);
        const auto key = static_cast<std::size_t>(Key(load.DynTypeId()));
        // Regions without a value share the empty name.
        const cow_String region = oif_RegionName(load.region, modelInfo);
        if (!names[key].emplace(region.View()).second) overlaps[key] = true;
    }
    for (std::size_t key = 0; key < overlaps.size(); ++key) {
        if (!overlaps[key]) continue;
        for (int i = 1; i < stepNames.Length(); ++i) SetFlag(static_cast<int>(key), i);
    }
}

bool oif_LoadOpStatus::Writes(const kloC_Load& load, const cow_String& stepName, bool) const {
    if (load.suppressed || IsInitialStep(stepName)) return false;
    const Status status = load.Status(stepName);
    const bool begunOrChanged = status == Status::CREATED || status == Status::MODIFIED;
    const bool carried = status == Status::PROPAGATED && OpNew(load.DynTypeId(), stepName);
    if (!begunOrChanged && !carried && status != Status::DEACTIVATED) return false;
    const kloC_BoltLoad* bolt = BoltLoad(load);
    if (bolt == nullptr) return true;
    // A bolt is a force only while a force tightens it; a change to another method is told once.
    return bolt->IsByForce(stepName) || (status == Status::MODIFIED && bolt->ChangesMethod(stepName));
}

oif_ConditionPlaces oif_LoadOpStatus::Places(const kprC_Step& step, const cow_String& name, Status) {
    return PlacesWhere(
        step, [](const klcC_LoadCase& loadCase) { return !loadCase.loadsAreStepLoads; },
        [&](const klcC_LoadCase& loadCase) { return loadCase.loads.Find(name); });
}

int oif_LoadOpStatus::Key(unsigned int typeId) const {
    return KeyOf(oif_FindLoadRow(typeId), NoFamily);
}

void oif_FieldOpStatus::Configure(const kprC_PropagatingContainer<kpfC_Field>& fields,
                                  const cow_List<cow_String>& steps) {
    InitializeMembers(steps, oif_NumberOfFamilies(oif_FieldRows()));
    PopulateMembers(fields);
}

void oif_FieldOpStatus::PopulateMembers(const kprC_PropagatingContainer<kpfC_Field>& fields) {
    // Suppressed fields count too.
    SetFlagsWhere("field", fields, [](const kpfC_Field& field, const cow_String& step) {
        return field.Status(step) == Status::FIELD_RESET;
    });
}

bool oif_FieldOpStatus::Writes(const kpfC_Field& field, const cow_String& stepName, bool) const {
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
    const oif_FieldRow* row = oif_FindFieldRow(field.DynTypeId());
    return row != nullptr && row->inEveryStep;
}

oif_ConditionPlaces oif_FieldOpStatus::Places(const kprC_Step& step, const cow_String& name, Status) {
    return PlacesWhere(step, All, [&](const klcC_LoadCase& loadCase) { return loadCase.fields.Find(name); });
}

int oif_FieldOpStatus::Key(unsigned int typeId) const {
    return KeyOf(oif_FindFieldRow(typeId), NoFamily);
}

const oif_InteractionFamily* oif_FindInteractionFamily(unsigned typeId) {
    const auto* row = oif_FindRow(kInteractions, typeId);
    return row == nullptr ? nullptr : &row->family;
}

void oif_InteractionOpStatus::Configure(const kprC_PropagatingContainer<kinC_Interaction>& interactions,
                                        const cow_List<cow_String>& steps) {
    InitializeMembers(steps, oif_NumberOfFamilies(std::span<const InteractionRow>(kInteractions)));
    PopulateMembers(interactions);
}

oif_ConditionPlaces oif_InteractionOpStatus::Places(const kprC_Step&, const cow_String&, Status) {
    return {{}};
}

void oif_InteractionOpStatus::PopulateMembers(
    const kprC_PropagatingContainer<kinC_Interaction>& interactions) {
    // Suppressed interactions count too; those of other classes have no family.
    SetFlagsWhere("interaction", interactions,
                  [](const kinC_Interaction& interaction, const cow_String& step) {
                      return oif_FindInteractionFamily(interaction.DynTypeId()) != nullptr &&
                             interaction.GetPropStatus(step) == Status::DEACTIVATED;
                  });
}

int oif_InteractionOpStatus::Key(unsigned int typeId) const {
    const oif_InteractionFamily* family = oif_FindInteractionFamily(typeId);
    if (family == nullptr) nex_Raise(NoFamily);
    return static_cast<int>(*family);
}
