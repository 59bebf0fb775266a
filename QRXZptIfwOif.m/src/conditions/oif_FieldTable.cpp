#include "conditions/oif_FieldTable.h"

#include "conditions/oif_InitialConditions.h"
#include "conditions/oif_PredefinedFields.h"

namespace {

using enum oif_RegionKind;

/// Fields of class R, written as keywords of class Initial in the initial step and of class Later behind it.
template <class R, class Initial, class Later>
constexpr oif_FieldRow FieldRow(const char* label, oif_FieldFamily family, oif_RegionKind region,
                                bool inEveryStep = false) {
    return {R::Class.Id(),
            label,
            family,
            region,
            inEveryStep,
            oif_MakeKeyword<Initial, R, oif_FieldCard, oif_FieldSetting>,
            oif_MakeKeyword<Later, R, oif_FieldCard, oif_FieldSetting>};
}
/// An initial condition in whatever step it is given.
template <class R>
constexpr oif_FieldRow InitialRow(const char* label, oif_FieldFamily family, oif_RegionKind region) {
    return FieldRow<R, oif_InitialConditions, oif_InitialConditions>(label, family, region);
}

constexpr oif_FieldRow kFieldRows[] = {
    FieldRow<kpfC_Temperature, oif_InitialConditions, oif_FieldTemperature>(
        "Temperature", oif_FieldFamily::TEMPERATURE, NODES),
    FieldRow<kpfC_PressureStress, oif_PressureStress, oif_PressureStress>(
        "Pressure stress", oif_FieldFamily::PRESSURE_STRESS, NODES),
    FieldRow<kpfC_MassFlowRate, oif_MassFlowRate, oif_MassFlowRate>("Mass flow rate",
                                                                    oif_FieldFamily::MASS_FLOW_RATE, NODES),
    FieldRow<kpfC_GeneralField, oif_InitialConditions, oif_GeneralField>("Field", oif_FieldFamily::FIELD,
                                                                         NODES, true),
    InitialRow<kpfC_Velocity>("Velocity", oif_FieldFamily::VELOCITY, NODES),
    InitialRow<kpfC_Stress>("Stress", oif_FieldFamily::STRESS, ELEMENTS),
    InitialRow<kpfC_Hardening>("Hardening", oif_FieldFamily::HARDENING, ELEMENTS),
};

} // namespace

std::span<const oif_FieldRow> oif_FieldRows() {
    return kFieldRows;
}

oif_RegionKind oif_FieldRow::RegionOf(const kpfC_Field& field) const {
    const bool isOfTheModel =
        field.distributionType == kpfC_Field::DistribTypeEnm::FROM_FILE ||
        field.distributionType == kpfC_Field::DistribTypeEnm::FROM_FILE_AND_USER_DEFINED;
    return isOfTheModel ? ANY : region;
}
