#include "conditions/oif_FieldTable.h"

#include "conditions/oif_InitialConditions.h"
#include "conditions/oif_PredefinedFields.h"

namespace {

using enum oif_RegionKind;
using Family = oif_FieldFamily;
using Distribution = kpfC_Field::DistribTypeEnm;

/// Fields of class R, written as keywords of class Initial in the initial step and of class Later behind it.
template <class R, class Initial, class Later>
constexpr oif_FieldRow Row(const char* label, Family family, oif_RegionKind region,
                           bool inEveryStep = false) {
    return {R::Class.Id(),
            label,
            family,
            region,
            oif_MakeKeyword<Initial, R, oif_FieldCard, oif_FieldSetting>,
            oif_MakeKeyword<Later, R, oif_FieldCard, oif_FieldSetting>,
            inEveryStep};
}
/// An initial condition in whatever step it is given.
template <class R>
constexpr oif_FieldRow InitialRow(const char* label, Family family, oif_RegionKind region) {
    return Row<R, oif_InitialConditions, oif_InitialConditions>(label, family, region);
}

constexpr oif_FieldRow kRows[] = {
    Row<kpfC_Temperature, oif_InitialConditions, oif_FieldTemperature>("Temperature", Family::TEMPERATURE,
                                                                       NODES),
    Row<kpfC_PressureStress, oif_PressureStress, oif_PressureStress>("Pressure stress",
                                                                     Family::PRESSURE_STRESS, NODES),
    Row<kpfC_MassFlowRate, oif_MassFlowRate, oif_MassFlowRate>("Mass flow rate", Family::MASS_FLOW_RATE,
                                                               NODES),
    Row<kpfC_GeneralField, oif_InitialConditions, oif_GeneralField>("Field", Family::FIELD, NODES, true),
    InitialRow<kpfC_Velocity>("Velocity", Family::VELOCITY, NODES),
    InitialRow<kpfC_Stress>("Stress", Family::STRESS, ELEMENTS),
    InitialRow<kpfC_Hardening>("Hardening", Family::HARDENING, ELEMENTS),
};

} // namespace

std::span<const oif_FieldRow> oif_FieldRows() {
    return kRows;
}

oif_RegionKind oif_FieldRow::RegionOf(const kpfC_Field& field) const {
    const bool isOfTheModel = field.distributionType == Distribution::FROM_FILE ||
                              field.distributionType == Distribution::FROM_FILE_AND_USER_DEFINED;
    return isOfTheModel ? ANY : region;
}
