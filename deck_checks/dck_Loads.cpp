#include "base/oif_ModelInfo.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"
#include "conditions/oif_MechanicalLoads.h"
#include "conditions/oif_WrittenSteps.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"

namespace {

using Status = mdl_PropagationStatusEnm;

const char* ActedOn(oif_RegionKind kind) {
    return kind == oif_RegionKind::NODES      ? "nodes"
           : kind == oif_RegionKind::ELEMENTS ? "elements"
                                              : "a surface";
}

void FindOnRegion(const rgnC_Region& region, oif_RegionKind expected, const std::string& place,
                  const char* what, fnd_Sink& sink) {
    if (expected == oif_RegionKind::ANY) return;
    if (!region.HasValue()) {
        sink.Add("no-region", place, std::string("the ") + what + " has no region, so its lines name no set");
    } else if (region.FlagWord() != static_cast<int>(expected)) {
        sink.Add("wrong-region", place + "/region",
                 "found " + Quoted(region.SetName()) + ", which is " + KindOf(region) + "; the " + what +
                     " acts on " + ActedOn(expected));
    }
}

/// The text that writing the load in the step raises; null when it can be written.
const char* FailureOf(const kloC_Load& load, const oif_LoadRow& row, const cow_String& step) {
    if (row.CannotBeWritten()) return oif_LoadWithoutKeyword;
    if (oif_Cload::IsComplexPoreFluid(load) && load.Status(step) != Status::DEACTIVATED) {
        return oif_Cload::ComplexPoreFluid;
    }
    const bool needsSet = row.family == oif_LoadFamily::DSLOAD && !row.IsCommentAlone(load);
    return needsSet && !load.region.HasValue() ? oif_Dsload::EmptySetName : nullptr;
}

/// Why a deck has nothing but a comment of the load; null when it has more.
const char* CommentOnly(const kloC_Load& load, const oif_LoadRow& row) {
    if (!row.IsCommentAlone(load)) return nullptr;
    return row.comment == oif_LoadComment::ALONE ? "decks tell of inertia relief in a comment only"
                                                 : "decks tell of a load from a field in a comment only";
}

/// The steps that write an object, in themselves or in a load case.
template <class OpStatus, class T>
std::vector<cow_String> WrittenIn(oif_WrittenSteps& finder, const OpStatus& status,
                                  const kprC_StepContainer& steps, const char* kind, const cow_String& name,
                                  const T& object) {
    std::vector<cow_String> written;
    const auto writes = [&status](const T& each, const cow_String& step, bool) {
        return status.Writes(each, step);
    };
    for (const int step : finder.Of(kind, name, object, writes)) {
        if (!OpStatus::Places(steps.StepAt(step), name).empty()) written.push_back(steps.NameAt(step));
    }
    return written;
}

bool IsHeldByItsLength(const kloC_Load& load, const kprC_StepContainer& steps) {
    if (load.DynTypeId() != kloC_BoltLoad::TypeId()) return false;
    const auto& bolt = static_cast<const kloC_BoltLoad&>(load);
    return !oif_StepsWhere(load, steps.Size(), [&](int i) {
                return kloC_Load::IsActive(bolt.Status(steps.NameAt(i))) && !bolt.IsByForce(steps.NameAt(i));
            }).empty();
}

std::string CannotCarry(const char* failure) {
    return std::string("no deck can carry the load: writing fails with \"") + failure + "\"";
}

void FindOnLoads(const oif_ModelInfo& info, fnd_Sink& sink) {
    const auto& loads = info.Model().Loads();
    const kprC_StepContainer& steps = info.Model().Steps();
    bool canBeWritten = true;
    for (const auto& [name, load] : loads) {
        if (load.suppressed || oif_FindLoadRow(load.DynTypeId()) != nullptr) continue;
        canBeWritten = false;
        sink.Add("cannot-be-written", Place("loads", name), CannotCarry(oif_LoadOpStatus::NoFamily));
    }
    oif_LoadOpStatus status;
    if (canBeWritten) status.Configure(loads, steps.Keys(), info);
    oif_WrittenSteps finder(steps, status);
    for (const auto& [name, load] : loads) {
        const oif_LoadRow* row = oif_FindLoadRow(load.DynTypeId());
        if (load.suppressed || row == nullptr) continue;
        const std::string place = Place("loads", name);
        FindOnRegion(load.region, row->region, place, "load", sink);
        if (!canBeWritten) continue;
        const std::vector<cow_String> written = WrittenIn(finder, status, steps, "load", name, load);
        const char* failure = nullptr;
        for (const cow_String& step : written) {
            if (failure == nullptr) failure = FailureOf(load, *row, step);
        }
        if (failure != nullptr) {
            sink.Add("cannot-be-written", place, CannotCarry(failure));
        } else if (IsHeldByItsLength(load, steps)) {
            sink.Add("held-by-length", place,
                     "decks tell of a bolt that is held by its length in a comment only");
        } else if (written.empty()) {
            sink.Add("never-written", place, "no step writes the load");
        } else if (const char* reason = CommentOnly(load, *row)) {
            sink.Add("comment-only", place, reason);
        }
    }
}

void FindOnFields(const oif_ModelInfo& info, fnd_Sink& sink) {
    const auto& fields = info.Model().Fields();
    const kprC_StepContainer& steps = info.Model().Steps();
    oif_FieldOpStatus status;
    status.Configure(fields, steps.Keys());
    oif_WrittenSteps finder(steps, status);
    for (const auto& [name, field] : fields) {
        if (field.suppressed) continue;
        const std::string place = Place("fields", name);
        FindOnRegion(field.region, oif_FindFieldRow(field.DynTypeId())->RegionOf(field), place, "field",
                     sink);
        if (WrittenIn(finder, status, steps, "field", name, field).empty()) {
            sink.Add("never-written", place, "no step writes the field");
        }
    }
}

} // namespace

void dck_CheckLoads(const oif_ModelInfo& info, fnd_Sink& sink) {
    FindOnLoads(info, sink);
    FindOnFields(info, sink);
}
