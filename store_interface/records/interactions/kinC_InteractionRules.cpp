#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

namespace {

/// Warns unless the table has no rows or a number of columns from `least` to `most`: what stands in other
/// columns than the deck's reader expects is not lost, but read as something else.
void WarnOfColumns(fnd_RecordCheck& check, const char* field, const cow_2DArray<double>& table,
                   long long least, long long most) {
    if (table.IsEmpty() || (table.NumColumns() >= least && table.NumColumns() <= most)) return;
    std::string text = "found rows of " + std::to_string(table.NumColumns()) +
                       ", where the flags stand for " + std::to_string(least);
    if (most > least) text += " or " + std::to_string(most);
    check.Add("table-width", field, text);
}

void CheckPair(const kinC_SurfaceToSurfaceContact& contact, fnd_RecordCheck& check) {
    if (contact.clearanceType == kinC_ClearanceTypeEnm::SINGLE_VALUE &&
        contact.initialClearance == kinC_SurfaceToSurfaceContact::initialClearanceDef()) {
        check.Add("missing-field", "initialClearance", "found nothing",
                  "the clearance of clearanceType SINGLE_VALUE");
    }
}

void CheckFriction(const kinC_TangentialBehavior& friction, fnd_RecordCheck& check) {
    constexpr int penalty = 1;
    constexpr int exponentialDecay = 2;
    constexpr int lagrange = 4;
    check.NotNegative("dependencies", friction.dependencies);
    check.NotNegative("nStateDependentVars", friction.nStateDependentVars);
    if (friction.formulation == penalty || friction.formulation == lagrange) {
        const long long columns = (friction.directionality == 2 ? 2LL : 1LL) +
                                  (friction.temperatureDependency ? 1 : 0) +
                                  (friction.pressureDependency ? 1 : 0) +
                                  (friction.slipRateDependency ? 1 : 0) + std::max(friction.dependencies, 0);
        WarnOfColumns(check, "table", friction.table, columns, columns);
    } else if (friction.formulation == exponentialDecay) {
        const int needed = friction.exponentialDecayDefinition == 1 ? 4 : 3;
        const long long found =
            static_cast<long long>(friction.table.NumRows()) * friction.table.NumColumns();
        if (found < needed) {
            check.Add("table-numbers", "table", "found " + fnd_Counted(found, "number"),
                      std::to_string(needed) + " for an exponential decay");
        }
    }
}

void CheckNormalBehavior(const kinC_NormalBehavior& behavior, fnd_RecordCheck& check) {
    constexpr int exponential = 1;
    constexpr int tabular = 3;
    const cow_2DArray<double>& table = behavior.table;
    if (behavior.pressureOverclosure == exponential && (table.NumRows() < 2 || table.NumColumns() < 2)) {
        check.Add("table-numbers", "table",
                  "found " + fnd_Counted(table.NumRows(), "row") + " of " +
                      fnd_Counted(table.NumColumns(), "number"),
                  "two rows of two for an exponential relation");
    }
    if (behavior.pressureOverclosure == tabular) WarnOfColumns(check, "table", table, 2, 2);
}

void CheckConductance(const kinC_ThermalConductance& conductance, fnd_RecordCheck& check) {
    const auto columns = [&](const char* table, const cow_2DArray<double>& values, const char* dependencies,
                             int count, bool byTemperature, bool byMassFlowRate) {
        check.NotNegative(dependencies, count);
        const long long expected =
            2LL + (byTemperature ? 1 : 0) + (byMassFlowRate ? 1 : 0) + std::max(count, 0);
        WarnOfColumns(check, table, values, expected, expected);
    };
    columns("clearanceTable", conductance.clearanceTable, "dependencies", conductance.dependencies,
            conductance.temperatureDependency, conductance.massFlowRateDependency);
    columns("pressureTable", conductance.pressureTable, "pressureTableDependencies",
            conductance.pressureTableDependencies, conductance.pressureTableTemperatureDependency,
            conductance.pressureTableMassFlowRateDependency);
}

void CheckFilmProperty(const kinC_FilmConditionProp& film, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", film.dependencies);
    const long long columns = 1LL + (film.temperatureDependency ? 1 : 0) + std::max(film.dependencies, 0);
    WarnOfColumns(check, "table", film.table, columns, columns);
}

void CheckImpedanceProperty(const kinC_AcousticImpedanceProp& impedance, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", impedance.dependencies);
    const long long columns = 2 + static_cast<long long>(std::max(impedance.dependencies, 0));
    WarnOfColumns(check, "table", impedance.table, columns, columns + 1);
}

void CheckDampingTable(const kinC_Damping& damping, fnd_RecordCheck& check) {
    WarnOfColumns(check, "table", damping.table, 2, 2);
}

void CheckRadiationTable(const kinC_Radiation& radiation, fnd_RecordCheck& check) {
    WarnOfColumns(check, "table", radiation.table, 2, 2);
}

void CheckActuatorSensor(const kinC_ActuatorSensor& sensor, fnd_RecordCheck& check) {
    check.NotNegative("coordinates", sensor.coordinates);
    check.NotNegative("variables", sensor.variables);
}

} // namespace

void fnd_AddInteractionRules(fnd_RecordRules& rules) {
    rules.Add<CheckPair>();
    rules.Add<CheckFriction>();
    rules.Add<CheckNormalBehavior>();
    rules.Add<CheckDampingTable>();
    rules.Add<CheckRadiationTable>();
    rules.Add<CheckConductance>();
    rules.Add<CheckFilmProperty>();
    rules.Add<CheckImpedanceProperty>();
    rules.Add<CheckActuatorSensor>();
}
