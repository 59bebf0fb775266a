#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

namespace {

using LoadDistribution = kloC_Load::DistribTypeEnm;
using FieldDistribution = kpfC_Field::DistribTypeEnm;

template <class E>
std::string Word(E value) {
    return omu_EnumTableOf(value).Row(static_cast<int>(value))->name;
}

void CheckDistribution(const kloC_DistributedLoad& load, fnd_RecordCheck& report) {
    const bool isPressure =
        load.DynTypeId() == kloC_Pressure::TypeId() || load.DynTypeId() == kloC_PipePressure::TypeId();
    if (load.distributionType == LoadDistribution::TOTAL_FORCE) {
        report.Add("no-label", "distributionType", "found TOTAL_FORCE, for which decks have no label");
    } else if (load.distributionType == LoadDistribution::HYDROSTATIC && !isPressure) {
        report.Add("wrong-distribution", "distributionType",
                   "found HYDROSTATIC, which only pressures and pipe pressures can be; it counts as UNIFORM");
    }
}

void CheckRotation(const kloC_RotationalBodyForce& load, fnd_RecordCheck& report) {
    if (load.point1 == load.point2) {
        report.Add("no-direction", "point2", "found the first point again, so the axis has no direction");
    }
    if (!load.centrifugal && !load.rotaryAcceleration) {
        report.Add("no-label", "centrifugal",
                   "found neither a centrifugal nor a rotary load, so it has no label");
    }
}

void CheckTraction(const kloC_Traction& load, fnd_RecordCheck& report) {
    if (load.vectorGiven && load.direction.Start() == load.direction.End()) {
        report.Add("no-direction", "direction", "found two points that are one, so there is no direction");
    }
}

template <class Flux>
void CheckDegreeOfFreedom(const Flux& flux, fnd_RecordCheck& report) {
    if (flux.dof < 11) report.Add("wrong-dof", "dof", "found " + std::to_string(flux.dof), "11 or more");
}

/// Distributions that the keywords of the class have no form for leave the keyword line alone, or count as
/// uniform.
void CheckFieldDistribution(const kpfC_Field& field, fnd_RecordCheck& report) {
    const unsigned id = field.DynTypeId();
    const bool mayHaveAFile = id == kpfC_Temperature::TypeId() || id == kpfC_GeneralField::TypeId() ||
                              id == kpfC_PressureStress::TypeId() || id == kpfC_Stress::TypeId();
    bool fits = true;
    switch (field.distributionType) {
    case FieldDistribution::FIELD: fits = false; break;
    case FieldDistribution::GEOSTATIC: fits = id == kpfC_Stress::TypeId(); break;
    case FieldDistribution::FROM_FILE:
    case FieldDistribution::FROM_FILE_AND_USER_DEFINED: fits = mayHaveAFile; break;
    default: break;
    }
    if (!fits) {
        report.Add("wrong-distribution", "distributionType",
                   "found " + Word(field.distributionType) + ", which fields of this class have no form for");
    }
}

void CheckHardening(const kpfC_Hardening& field, fnd_RecordCheck& report) {
    if (field.backstress.Length() > 6) {
        report.Add("list-too-long", "backstress",
                   "found " + fnd_Counted(field.backstress.Length(), "component"), "6 at most");
    }
}

void CheckGeneralFieldState(const kpfC_GeneralFieldState& state, fnd_RecordCheck& report) {
    report.NotNegative("numberOfValues", state.numberOfValues);
    if (state.variable < 1) {
        report.Add("number-too-small", "variable", "found " + std::to_string(state.variable), "1 or more");
    }
}

} // namespace

void fnd_AddLoadRules(fnd_RecordRules& rules) {
    rules.Add<CheckDistribution>();
    rules.Add<CheckRotation>();
    rules.Add<CheckTraction>();
    rules.Add<CheckDegreeOfFreedom<kloC_ConcentratedHeatFlux>>();
    rules.Add<CheckDegreeOfFreedom<kloC_ConcentratedConcentrationFlux>>();
    rules.Add<CheckFieldDistribution>();
    rules.Add<CheckHardening>();
    rules.Add<CheckGeneralFieldState>();
}
