#include "model_file/checks/mdf_InteractionChecks.h"

#include "model_file/checks/mdf_RecordChecks.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

namespace {

std::string Count(int count, const char* singular) {
    return std::to_string(count) + " " + singular + (count == 1 ? "" : "s");
}

/// Warns unless the table has no rows or a number of columns from `least` to `most`: what stands in other
/// columns than the deck's reader expects is not lost, but read as something else.
void WarnOfColumns(mdf_RecordCheck& check, const char* field, const cow_2DArray<double>& table,
                   long long least, long long most) {
    if (table.IsEmpty() || (table.NumColumns() >= least && table.NumColumns() <= most)) return;
    std::string text = "found rows of " + std::to_string(table.NumColumns()) +
                       ", where the flags stand for " + std::to_string(least);
    if (most > least) text += " or " + std::to_string(most);
    check.Warning(field, text);
}

void CheckPair(const kinC_SurfaceToSurfaceContact& contact, mdf_RecordCheck& check) {
    if (contact.clearanceType == kinC_ClearanceTypeEnm::SINGLE_VALUE &&
        contact.initialClearance == kinC_SurfaceToSurfaceContact::initialClearanceDef()) {
        check.Error("initialClearance",
                    "found nothing, expected the clearance of clearanceType SINGLE_VALUE");
    }
}

void CheckFriction(const kinC_TangentialBehavior& friction, mdf_RecordCheck& check) {
    constexpr int penalty = 1;
    constexpr int exponentialDecay = 2;
    constexpr int lagrange = 4;
    check.NotNegative("dependencies", friction.dependencies);
    check.NotNegative("nStateDependentVars", friction.nStateDependentVars);
    if (friction.formulation == penalty || friction.formulation == lagrange) {
        const long long columns = (friction.directionality == 2 ? 2 : 1) +
                                  (friction.temperatureDependency ? 1 : 0) +
                                  (friction.pressureDependency ? 1 : 0) +
                                  (friction.slipRateDependency ? 1 : 0) + std::max(friction.dependencies, 0);
        WarnOfColumns(check, "table", friction.table, columns, columns);
    } else if (friction.formulation == exponentialDecay) {
        const int needed = friction.exponentialDecayDefinition == 1 ? 4 : 3;
        const int found = friction.table.NumRows() * friction.table.NumColumns();
        if (found < needed) {
            check.Error("table", "found " + Count(found, "number") + ", expected " + std::to_string(needed) +
                                     " for an exponential decay");
        }
    }
}

void CheckNormalBehavior(const kinC_NormalBehavior& behavior, mdf_RecordCheck& check) {
    constexpr int exponential = 1;
    constexpr int tabular = 3;
    const cow_2DArray<double>& table = behavior.table;
    if (behavior.pressureOverclosure == exponential && (table.NumRows() < 2 || table.NumColumns() < 2)) {
        check.Error("table", "found " + Count(table.NumRows(), "row") + " of " +
                                 Count(table.NumColumns(), "number") +
                                 ", expected two rows of two for an exponential relation");
    }
    if (behavior.pressureOverclosure == tabular) WarnOfColumns(check, "table", table, 2, 2);
}

void CheckConductance(const kinC_ThermalConductance& conductance, mdf_RecordCheck& check) {
    const auto columns = [&](const char* table, const cow_2DArray<double>& values, const char* dependencies,
                             int count, bool byTemperature, bool byMassFlowRate) {
        check.NotNegative(dependencies, count);
        const long long expected =
            2 + (byTemperature ? 1 : 0) + (byMassFlowRate ? 1 : 0) + std::max(count, 0);
        WarnOfColumns(check, table, values, expected, expected);
    };
    columns("clearanceTable", conductance.clearanceTable, "dependencies", conductance.dependencies,
            conductance.temperatureDependency, conductance.massFlowRateDependency);
    columns("pressureTable", conductance.pressureTable, "pressureTableDependencies",
            conductance.pressureTableDependencies, conductance.pressureTableTemperatureDependency,
            conductance.pressureTableMassFlowRateDependency);
}

void CheckFilmProperty(const kinC_FilmConditionProp& film, mdf_RecordCheck& check) {
    check.NotNegative("dependencies", film.dependencies);
    const long long columns = 1 + (film.temperatureDependency ? 1 : 0) + std::max(film.dependencies, 0);
    WarnOfColumns(check, "table", film.table, columns, columns);
}

void CheckImpedanceProperty(const kinC_AcousticImpedanceProp& impedance, mdf_RecordCheck& check) {
    check.NotNegative("dependencies", impedance.dependencies);
    const long long columns = 2 + static_cast<long long>(std::max(impedance.dependencies, 0));
    WarnOfColumns(check, "table", impedance.table, columns, columns + 1);
}

/// A list of a state and the pairs that its entries belong to.
struct PairList {
    const char* states;
    const char* pairs;
    int (*numStates)(const kinC_ContactExpState& state);
    int (*numPairs)(const kinC_ContactExp& contact);
};

#define QRX_PAIR_LIST(states, pairs)                                                                         \
    PairList {                                                                                               \
#states, #pairs,                                                                                     \
            [](const kinC_ContactExpState&                                                                   \
                   state) { return state.states.Length(); },                                                 \
                                                          [](const kinC_ContactExp&                          \
                                                                 contact) { return contact.pairs.Length(); } \
    }

constexpr PairList kPairLists[] = {
    QRX_PAIR_LIST(inclusions, inclusionPairs),
    QRX_PAIR_LIST(exclusions, exclusionPairs),
    QRX_PAIR_LIST(propertyAssignments, propertyAssignmentPairs),
    QRX_PAIR_LIST(surfacePropertyAssignments, surfacePropertyAssignmentPairs),
    QRX_PAIR_LIST(formulationAssignments, formulationAssignmentPairs),
};

#undef QRX_PAIR_LIST

} // namespace

void mdf_CheckGeneralContact(const odiK_Model& model, mdf_Diagnostics& diagnostics, const mdf_Path& path) {
    const mdf_Path interactions(path, "interactions");
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(model.interactions); !it.IsDone(); it.Next()) {
        const auto* contact = nex_canDynamicCastPtr<kinC_ContactExp>(&it.CurrentValue());
        if (contact == nullptr) continue;
        const mdf_Path place(interactions, it.CurrentKey().View());
        const mdf_Path states(place, "states");
        for (const mdl_GivenState& given : contact->GivenStates()) {
            const mdf_Path step(states, given.stepName.View());
            const auto& state = static_cast<const kinC_ContactExpState&>(given.record.ConstGet());
            for (const PairList& list : kPairLists) {
                const int found = list.numStates(state);
                const int most = list.numPairs(*contact);
                if (found <= most) continue;
                diagnostics.Error(mdf_Path(step, std::string_view(list.states)),
                                  "found " + Count(found, "item") + ", expected no more than the " +
                                      std::to_string(most) + " of " + list.pairs);
            }
        }
    }
}

void mdf_AddInteractionChecks(mdf_RecordChecks& checks) {
    checks.Add<kinC_SurfaceToSurfaceContact>(CheckPair);
    checks.Add<kinC_TangentialBehavior>(CheckFriction);
    checks.Add<kinC_NormalBehavior>(CheckNormalBehavior);
    checks.Add<kinC_Damping>([](const kinC_Damping& damping, mdf_RecordCheck& check) {
        WarnOfColumns(check, "table", damping.table, 2, 2);
    });
    checks.Add<kinC_Radiation>([](const kinC_Radiation& radiation, mdf_RecordCheck& check) {
        WarnOfColumns(check, "table", radiation.table, 2, 2);
    });
    checks.Add<kinC_ThermalConductance>(CheckConductance);
    checks.Add<kinC_FilmConditionProp>(CheckFilmProperty);
    checks.Add<kinC_AcousticImpedanceProp>(CheckImpedanceProperty);
}
