#include "tools/LoadChecks.h"

#include "base/oif_ModelInfo.h"
#include "conditions/oif_OpStatus.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/kpfC_Fields.h"
#include "tools/FindingText.h"

namespace {

using Findings = std::vector<ModelFinding>;
using Status = mdl_PropagationStatusEnm;

enum RegionKind : int { ANY = 0, NODES = 1, ELEMENTS = 2, SURFACE = 8 };

/// What the lines of a load have to name. Those that name no set, or may go without, take anything.
RegionKind RegionOf(const kloC_Load& load) {
    switch (load.DynTypeId()) {
    case kloC_ConcentratedForce::Class.Id():
    case kloC_Moment::Class.Id():
    case kloC_ConcentratedPoreFluid::Class.Id():
    case kloC_InwardVolAccel::Class.Id():
    case kloC_ConcentratedHeatFlux::Class.Id():
    case kloC_ConcentratedConcentrationFlux::Class.Id():
    case kloC_HydroFluidFlow::Class.Id():
    case kloC_ConcentratedCharge::Class.Id():
    case kloC_ConcentratedCurrent::Class.Id(): return NODES;
    case kloC_ConnectorForce::Class.Id():
    case kloC_ConnectorMoment::Class.Id():
    case kloC_RotationalBodyForce::Class.Id():
    case kloC_LineLoad::Class.Id():
    case kloC_PipePressure::Class.Id():
    case kloC_BodyForce::Class.Id():
    case kloC_BodyHeatFlux::Class.Id():
    case kloC_BodyConcentrationFlux::Class.Id():
    case kloC_BodyCharge::Class.Id():
    case kloC_BodyCurrent::Class.Id(): return ELEMENTS;
    case kloC_Pressure::Class.Id():
    case kloC_SurfaceTraction::Class.Id():
    case kloC_ShellEdgeLoad::Class.Id():
    case kloC_SurfaceHeatFlux::Class.Id():
    case kloC_SurfaceConcentrationFlux::Class.Id():
    case kloC_SurfacePoreFluid::Class.Id():
    case kloC_SurfaceCharge::Class.Id():
    case kloC_SurfaceCurrent::Class.Id(): return SURFACE;
    default: return ANY;
    }
}

const char* Wanted(RegionKind kind) {
    return kind == NODES ? "nodes" : kind == ELEMENTS ? "elements" : "a surface";
}

void FindOnRegion(const rgnC_Region& region, RegionKind expected, const std::string& place, const char* what,
                  Findings& findings) {
    if (expected == ANY) return;
    if (!region.HasValue()) {
        findings.push_back({place, std::string("the ") + what + " has no region, so its lines name no set"});
    } else if (region.FlagWord() != expected) {
        findings.push_back({place + "/region", "found " + Quoted(region.SetName()) + ", which is " +
                                                   KindOf(region) + "; the " + what + " acts on " +
                                                   Wanted(expected)});
    }
}

bool IsOnDsload(const kloC_Load& load) {
    return load.DynTypeId() == kloC_Pressure::TypeId() ||
           nex_canDynamicCastPtr<kloC_Traction>(&load) != nullptr;
}

/// The text that writing the load in the step raises; null when it can be written.
const char* FailureOf(const kloC_Load& load, const cow_String& step) {
    if (load.DynTypeId() == kloC_UnwrittenLoad::TypeId()) return "Unimplemented load type conversion";
    if (load.DynTypeId() == kloC_ConcentratedPoreFluid::TypeId() && load.IsComplex() &&
        load.Status(step) != Status::DEACTIVATED) {
        return "\"Concentrated pore fluid load cannot be complex\" == 0";
    }
    cow_String fieldName;
    if (IsOnDsload(load) && !load.region.HasValue() && !load.UsesField(fieldName)) {
        return "! setName.Empty()";
    }
    return nullptr;
}

/// Why a deck has nothing but a comment of the load; null when it has more.
const char* CommentOnly(const kloC_Load& load) {
    if (load.DynTypeId() == kloC_InertiaRelief::TypeId()) {
        return "decks tell of inertia relief in a comment only";
    }
    cow_String fieldName;
    if (IsOnDsload(load) && load.UsesField(fieldName)) {
        return "decks tell of a load from a field in a comment only";
    }
    return nullptr;
}

/// The steps that write an object, in themselves or in a load case.
template <class OpStatus, class T>
std::vector<cow_String> WrittenIn(const OpStatus& status, const kprC_StepContainer& steps,
                                  const cow_String& name, const T& object) {
    std::vector<cow_String> written;
    for (int i = 0; i < steps.Size(); ++i) {
        const cow_String& step = steps.NameAt(i);
        if (status.Writes(object, step) && !OpStatus::Places(steps.StepAt(i), name).empty()) {
            written.push_back(step);
        }
    }
    return written;
}

bool IsHeldByItsLength(const kloC_Load& load, const kprC_StepContainer& steps) {
    if (load.DynTypeId() != kloC_BoltLoad::TypeId()) return false;
    const auto& bolt = static_cast<const kloC_BoltLoad&>(load);
    for (int i = 1; i < steps.Size(); ++i) {
        if (kloC_Load::IsActive(bolt.Status(steps.NameAt(i))) &&
            bolt.BoltState(steps.NameAt(i)).boltMethod.ConstGet() != kloC_BoltLoad::MethodEnm::APPLY_FORCE) {
            return true;
        }
    }
    return false;
}

void FindOnLoads(const oif_ModelInfo& info, Findings& findings) {
    const auto& loads = info.Model().Loads();
    const kprC_StepContainer& steps = info.Model().Steps();
    bool canBeWritten = true;
    for (kprC_PropagatingContainerIT<kloC_Load> it(loads); !it.IsDone(); it.Next()) {
        const kloC_Load& load = it.CurrentValue();
        if (load.suppressed || load.DynTypeId() != kloC_SubmodelStressBased::TypeId()) continue;
        canBeWritten = false;
        findings.push_back({Place("loads", it.CurrentKey()), "no deck can carry the load: writing fails with "
                                                             "\"Unimplemented load->statusKey conversion\""});
    }
    oif_LoadOpStatus status;
    if (canBeWritten) status.Configure(loads, steps.Keys(), info);
    for (kprC_PropagatingContainerIT<kloC_Load> it(loads); !it.IsDone(); it.Next()) {
        const kloC_Load& load = it.CurrentValue();
        if (load.suppressed) continue;
        const std::string place = Place("loads", it.CurrentKey());
        FindOnRegion(load.region, RegionOf(load), place, "load", findings);
        if (!canBeWritten) continue;
        const std::vector<cow_String> written = WrittenIn(status, steps, it.CurrentKey(), load);
        const char* failure = nullptr;
        for (const cow_String& step : written) {
            if (failure == nullptr) failure = FailureOf(load, step);
        }
        const bool isHeld = IsHeldByItsLength(load, steps);
        if (failure != nullptr) {
            findings.push_back(
                {place, std::string("no deck can carry the load: writing fails with \"") + failure + "\""});
        } else if (isHeld) {
            findings.push_back({place, "decks tell of a bolt that is held by its length in a comment only"});
        } else if (written.empty()) {
            findings.push_back({place, "no step writes the load"});
        } else if (const char* reason = CommentOnly(load)) {
            findings.push_back({place, reason});
        }
    }
}

void FindOnFields(const oif_ModelInfo& info, Findings& findings) {
    const auto& fields = info.Model().Fields();
    const kprC_StepContainer& steps = info.Model().Steps();
    oif_FieldOpStatus status;
    status.Configure(fields, steps.Keys());
    for (kprC_PropagatingContainerIT<kpfC_Field> it(fields); !it.IsDone(); it.Next()) {
        const kpfC_Field& field = it.CurrentValue();
        if (field.suppressed) continue;
        const std::string place = Place("fields", it.CurrentKey());
        const bool ofElements =
            field.DynTypeId() == kpfC_Stress::TypeId() || field.DynTypeId() == kpfC_Hardening::TypeId();
        // A field from a file is that of the whole model.
        const bool isOfTheModel =
            field.distributionType == kpfC_Field::DistribTypeEnm::FROM_FILE ||
            field.distributionType == kpfC_Field::DistribTypeEnm::FROM_FILE_AND_USER_DEFINED;
        FindOnRegion(field.region,
                     isOfTheModel ? ANY
                     : ofElements ? ELEMENTS
                                  : NODES,
                     place, "field", findings);
        if (WrittenIn(status, steps, it.CurrentKey(), field).empty()) {
            findings.push_back({place, "no step writes the field"});
        }
    }
}

} // namespace

std::vector<ModelFinding> LoadFindingsOf(const ddb_Model& model) {
    const oif_ModelInfo info(model);
    Findings findings;
    FindOnLoads(info, findings);
    FindOnFields(info, findings);
    return findings;
}
