#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"

#include "store_interface/records/sections/kseC_ConnectorSection.h"

#include <array>

namespace {

constexpr int kConnectorComponents = 6;

/// Components are numbers from 1 to 6, none of them twice.
void CheckComponents(const char* field, const cow_List<int>& components, fnd_RecordCheck& check) {
    std::array<bool, kConnectorComponents + 1> seen{};
    for (int i = 0; i < components.Length(); ++i) {
        const int component = components[i];
        if (component < 1 || component > kConnectorComponents) {
            check.Add("wrong-component", field, "found " + std::to_string(component),
                      "components from 1 to 6");
        } else if (seen[static_cast<std::size_t>(component)]) {
            check.Add("wrong-component", field, "found " + std::to_string(component) + " twice",
                      "each component once");
        } else {
            seen[static_cast<std::size_t>(component)] = true;
        }
    }
}

/// What a table is made of, column by column.
class Columns {
public:
    Columns(long long count, const std::string& what) { And(count, what); }
    Columns& And(long long count, const std::string& what) {
        if (count <= 0) return *this;
        least_ += count;
        what_ += (what_.empty() ? "" : ", ") + what;
        return *this;
    }
    Columns& If(bool isThere, const char* what) { return And(isThere ? 1 : 0, what); }
    /// How many more there may be.
    Columns& Optional(long long count) {
        optional_ = count;
        return *this;
    }
    Columns& Dependent(bool temperatureDependency, int dependencies) {
        return If(temperatureDependency, "temperature")
            .And(dependencies, fnd_Counted(dependencies, "field variable"));
    }
    /// An error unless the table has no rows, or these columns.
    void Check(const char* field, const cow_2DArray<double>& table, fnd_RecordCheck& check) const {
        if (table.IsEmpty()) return;
        const int found = table.NumColumns();
        if (found >= least_ && found <= least_ + optional_) return;
        std::string expected = std::to_string(least_);
        if (optional_ == kAny)
            expected += " or more";
        else if (optional_ > 0)
            expected += " to " + std::to_string(least_ + optional_);
        check.Add("table-columns", field, "found rows of " + std::to_string(found),
                  "rows of " + expected + ": " + what_);
    }
    static constexpr long long kAny = cls_UnsetInt;

private:
    long long least_ = 0;
    long long optional_ = 0;
    std::string what_;
};

/// Elasticity and damping; `motions` is how many columns a nonlinear coupled table has for a component's
/// motion.
template <class R>
void CheckSpring(const R& record, int motions, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", record.dependencies);
    CheckComponents("components", record.components, check);
    CheckComponents("independentComponents", record.independentComponents, check);
    if (static_cast<int>(record.behavior) > 1) return; // rigid: there is no table
    const long long count = record.components.Length();
    const bool isUncoupled = record.coupling == R::CouplingEnm::UNCOUPLED;
    const auto dependent = [&](Columns columns) {
        columns.Dependent(record.temperatureDependency, record.dependencies)
            .Check("table", record.table, check);
    };
    if (record.behavior == R::BehaviorEnm::LINEAR) {
        const bool isMatrix = record.coupling == R::CouplingEnm::COUPLED;
        Columns columns(isMatrix ? count * (count + 1) / 2 : count,
                        isMatrix ? "the matrix of the components up to its diagonal" : "one per component");
        dependent(columns.If(record.frequencyDependency, "frequency"));
    } else if (isUncoupled) {
        dependent(Columns(2, "force, motion"));
    } else {
        const int independent = record.independentComponents.Length();
        dependent(Columns(count * (1 + motions), motions == 0 ? "one per component" : "two per component")
                      .And(independent, "one per independent component"));
    }
}

void CheckElasticity(const kbeC_ConnectorElasticity& record, fnd_RecordCheck& check) {
    CheckSpring(record, 0, check);
}

void CheckDamping(const kbeC_ConnectorDamping& record, fnd_RecordCheck& check) {
    CheckSpring(record, 1, check);
}

template <class R>
void CheckComponentsOf(const R& record, fnd_RecordCheck& check) {
    CheckComponents("components", record.components, check);
}

void CheckConnectorFriction(const kbeC_ConnectorFriction& record, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", record.dependencies);
    CheckComponents("independentComponents", record.independentComponents, check);
    if (record.formulation == kbeC_ConnectorFriction::FormulationEnm::PREDEFINED) return;
    const int independent = record.independentComponents.Length();
    const bool isPlain = record.independentKind == kbeC_ConnectorFriction::IndependentKindEnm::NONE;
    Columns(1, "internal contact force")
        .And(isPlain ? 0 : independent, "one per independent component")
        .Optional(isPlain ? independent : 0)
        .If(record.contactArea, "contact area")
        .Dependent(record.temperatureDependency, record.dependencies)
        .Check("table", record.table, check);
}

void CheckTangentialBehavior(const kbeC_TangentialBehavior& record, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", record.dependencies);
    if (record.formulation == kbeC_TangentialBehavior::FormulationEnm::TABLE) {
        Columns(1, "friction coefficient")
            .If(record.slipRateDependency, "slip rate")
            .If(record.pressureDependency, "contact force")
            .Dependent(record.temperatureDependency, record.dependencies)
            .Check("table", record.table, check);
        return;
    }
    const int expected = record.testData == 1 ? 4 : 3;
    const long long found = static_cast<long long>(record.table.NumRows()) * record.table.NumColumns();
    if (found > 0 && found < expected) {
        check.Add("table-numbers", "table", "found " + std::to_string(found),
                  std::to_string(expected) + " numbers of an exponential decay");
    }
}

void CheckPlasticity(const kbeC_ConnectorPlasticity& record, fnd_RecordCheck& check) {
    CheckComponentsOf(record, check);
    check.NotNegative("isotropicDependencies", record.isotropicDependencies);
    check.NotNegative("kinematicDependencies", record.kinematicDependencies);
    const Columns data = Columns(2, "two of data, a third that may be left out").Optional(1);
    Columns(data)
        .Dependent(record.isotropicTemperatureDependency, record.isotropicDependencies)
        .Check("isotropicTable", record.isotropicTable, check);
    Columns(data)
        .Dependent(record.kinematicTemperatureDependency, record.kinematicDependencies)
        .Check("kinematicTable", record.kinematicTable, check);
}

void CheckDamage(const kbeC_ConnectorDamage& record, fnd_RecordCheck& check) {
    using Damage = kbeC_ConnectorDamage;
    CheckComponentsOf(record, check);
    CheckComponents("affectedComponents", record.affectedComponents, check);
    check.NotNegative("initiationDependencies", record.initiationDependencies);
    check.NotNegative("evolutionDependencies", record.evolutionDependencies);
    const bool isPlastic = record.criterion == Damage::CriterionEnm::PLASTIC_MOTION;
    const bool hasMix = isPlastic && record.modeMixDependency;
    Columns(isPlastic ? 1 : 2, isPlastic ? "plastic motion" : "lower bound, upper bound")
        .If(hasMix, "mode-mix ratio")
        .Dependent(record.initiationTemperatureDependency, record.initiationDependencies)
        .Check("initiationTable", record.initiationTable, check);
    const bool isOne = record.evolutionType == Damage::EvolutionTypeEnm::ENERGY ||
                       record.softening == Damage::SofteningEnm::LINEAR;
    Columns(isOne ? 1 : 2, isOne ? "motion or energy at failure" : "two of the softening")
        .If(hasMix, "mode-mix ratio")
        .Dependent(record.evolutionTemperatureDependency, record.evolutionDependencies)
        .Check("evolutionTable", record.evolutionTable, check);
}

void CheckTerm(const kbeC_CDCTerm& record, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", record.dependencies);
    CheckComponentsOf(record, check);
    Columns(record.components.Length(), "one per component")
        .If(record.independentGiven, "an independent component at least")
        .Optional(record.independentGiven ? Columns::kAny : 0)
        .Dependent(record.temperatureDependency, record.dependencies)
        .Check("table", record.table, check);
}

void CheckSection(const kseC_ConnectorSection& record, fnd_RecordCheck& check) {
    if (record.assembledType == kseC_ConnectorSection::AssembledTypeEnm::NONE) return;
    const auto warn = [&](const char* field, int type) {
        if (type == 0) return;
        check.Add("basic-beside-assembled", field,
                  "found a basic type beside an assembled one, which stands in the deck alone");
    };
    warn("translationalType", static_cast<int>(record.translationalType));
    warn("rotationalType", static_cast<int>(record.rotationalType));
}

} // namespace

void fnd_AddConnectorRules(fnd_RecordRules& rules) {
    rules.Add<CheckElasticity>();
    rules.Add<CheckDamping>();
    rules.Add<CheckComponentsOf<kbeC_ConnectorStop>>();
    rules.Add<CheckComponentsOf<kbeC_ConnectorLock>>();
    rules.Add<CheckComponentsOf<kbeC_ConnectorFailure>>();
    rules.Add<CheckConnectorFriction>();
    rules.Add<CheckTangentialBehavior>();
    rules.Add<CheckPlasticity>();
    rules.Add<CheckDamage>();
    rules.Add<CheckTerm>();
    rules.Add<CheckSection>();
}
