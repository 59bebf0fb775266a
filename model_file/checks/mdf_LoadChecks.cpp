#include "model_file/checks/mdf_RecordChecks.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/kpfC_Fields.h"

namespace {

using LoadDistribution = kloC_Load::DistribTypeEnm;
using FieldDistribution = kpfC_Field::DistribTypeEnm;

template <class E>
std::string Word(E value) {
    return omu_EnumTableOf(value).Row(static_cast<int>(value))->name;
}

void CheckDistribution(const kloC_DistributedLoad& load, mdf_RecordCheck& report) {
    const bool isPressure =
        load.DynTypeId() == kloC_Pressure::TypeId() || load.DynTypeId() == kloC_PipePressure::TypeId();
    if (load.distributionType == LoadDistribution::TOTAL_FORCE) {
        report.Warning("distributionType", "found TOTAL_FORCE, for which decks have no label");
    } else if (load.distributionType == LoadDistribution::HYDROSTATIC && !isPressure) {
        report.Warning(
            "distributionType",
            "found HYDROSTATIC, which only pressures and pipe pressures can be; it counts as UNIFORM");
    }
}

void CheckRotation(const kloC_RotationalBodyForce& load, mdf_RecordCheck& report) {
    if (load.point1 == load.point2) {
        report.Warning("point2", "found the first point again, so the axis has no direction");
    }
    if (!load.centrifugal && !load.rotaryAcceleration) {
        report.Warning("centrifugal", "found neither a centrifugal nor a rotary load, so it has no label");
    }
}

void CheckTraction(const kloC_Traction& load, mdf_RecordCheck& report) {
    if (load.vectorGiven && load.direction.Start() == load.direction.End()) {
        report.Warning("direction", "found two points that are one, so there is no direction");
    }
}

template <class Flux>
void CheckDegreeOfFreedom(const Flux& flux, mdf_RecordCheck& report) {
    if (flux.dof < 11) report.Warning("dof", "found " + std::to_string(flux.dof) + ", expected 11 or more");
}

/// Distributions that the keywords of the class have no form for leave the keyword line alone, or count as
/// uniform.
void CheckFieldDistribution(const kpfC_Field& field, mdf_RecordCheck& report) {
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
        report.Warning("distributionType", "found " + Word(field.distributionType) +
                                               ", which fields of this class have no form for");
    }
}

void CheckHardening(const kpfC_Hardening& field, mdf_RecordCheck& report) {
    if (field.backstress.Length() > 6) {
        report.Error("backstress", "found " + std::to_string(field.backstress.Length()) +
                                       " components, expected 6 at most");
    }
}

void CheckGeneralFieldState(const kpfC_GeneralFieldState& state, mdf_RecordCheck& report) {
    report.NotNegative("numberOfValues", state.numberOfValues);
    if (state.variable < 1) {
        report.Error("variable", "found " + std::to_string(state.variable) + ", expected 1 or more");
    }
}

} // namespace

void mdf_AddLoadChecks(mdf_RecordChecks& checks) {
    checks.Add<kloC_DistributedLoad>(CheckDistribution);
    checks.Add<kloC_RotationalBodyForce>(CheckRotation);
    checks.Add<kloC_Traction>(CheckTraction);
    checks.Add<kloC_ConcentratedHeatFlux>(CheckDegreeOfFreedom);
    checks.Add<kloC_ConcentratedConcentrationFlux>(CheckDegreeOfFreedom);
    checks.Add<kpfC_Field>(CheckFieldDistribution);
    checks.Add<kpfC_Hardening>(CheckHardening);
    checks.Add<kpfC_GeneralFieldState>(CheckGeneralFieldState);
}
