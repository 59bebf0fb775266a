#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/materials/kmaC_Material.h"

#include <algorithm>

namespace {

/// The value of the option's field of this name and C++ type, or null.
template <class V>
const V* Find(const kmaC_MaterialOption& option, const char* name) {
    const cls_Field* field = option.DynFields().Find(name);
    if (field == nullptr || field->type != &cls_TypeOf<V>::Instance()) return nullptr;
    return static_cast<const V*>(field->In(option));
}

bool IsSet(const kmaC_MaterialOption& option, const char* flag) {
    const bool* value = flag == nullptr ? nullptr : Find<bool>(option, flag);
    return value != nullptr && *value;
}

// Options name the same things alike, so that what their fields must satisfy is told once for all of them.
struct LeastCount {
    const char* field;
    int least;
};
constexpr LeastCount kCounts[] = {
    {"dependencies", 0},
    {"unloadingDependencies", 0},
    {"volumetricDragDependencies", 0},
    {"numVariables", 0},
    {"deleteVar", 0},
    {"nmax", 0},
    {"properties", 0},
    {"smoothing", 0},
    {"n", 1},
    {"numBackstresses", 1},
};

struct DependentTable {
    const char* table;
    const char* temperature;
    const char* dependencies;
};
constexpr DependentTable kTables[] = {
    {"table", "temperatureDependency", "dependencies"},
    {"unloadingTable", nullptr, "unloadingDependencies"},
    {"volumetricDragTable", "volumetricDragTemperatureDependency", "volumetricDragDependencies"},
};

/// What the third column of a table is, by the flag that tells of it.
struct ThirdColumn {
    const char* flag;
    const char* what;
};
constexpr ThirdColumn kThirdColumns[] = {
    {"rateDependentTable", "the plastic strain rate"},
    {"rateGiven", "the strain rate"},
    {"lateralStrainGiven", "the lateral strain"},
};

const char* ThirdColumnOf(const kmaC_MaterialOption& option) {
    for (const ThirdColumn& column : kThirdColumns) {
        if (IsSet(option, column.flag)) return column.what;
    }
    const auto* plastic = dynamic_cast<const kmaC_Plastic*>(&option);
    if (plastic != nullptr && plastic->strainRangeDependency &&
        plastic->hardening == kmaC_Plastic::HardeningEnm::COMBINED &&
        plastic->dataType == kmaC_Plastic::DataTypeEnm::STABILIZED) {
        return "the strain range";
    }
    return nullptr;
}

/// How many columns a table needs at least, and what they are.
struct LeastColumns {
    LeastColumns(const kmaC_MaterialOption& option, const DependentTable& names) {
        const char* third = ThirdColumnOf(option);
        count = third == nullptr ? 1 : 3;
        what = third == nullptr ? "1 of data" : std::string("2 of data, ") + third;
        if (IsSet(option, names.temperature)) {
            ++count;
            what += ", the temperature";
        }
        const int* fieldVariables = Find<int>(option, names.dependencies);
        if (fieldVariables != nullptr && *fieldVariables > 0) {
            count += *fieldVariables;
            what += ", " + fnd_Counted(*fieldVariables, "field variable");
        }
    }
    std::string Text() const { return std::to_string(count) + ": " + what; }

    long long count;
    std::string what;
};

void CheckColumns(const kmaC_MaterialOption& option, const DependentTable& names, fnd_RecordCheck& report) {
    const auto* table = Find<kmaC_MaterialTable>(option, names.table);
    if (table == nullptr || table->NumRows() == 0) return;
    const LeastColumns least(option, names);
    if (table->NumColumns() >= least.count) return;
    report.Add("table-columns", names.table, "found " + fnd_Counted(table->NumColumns(), "column"),
               "at least " + least.Text());
}

std::string TableHint(const kmaC_MaterialOption& option, const char* field) {
    for (const DependentTable& names : kTables) {
        if (std::string_view(names.table) != field) continue;
        return "the columns of this table are at least " + LeastColumns(option, names).Text();
    }
    return {};
}

void CheckOption(const kmaC_MaterialOption& option, fnd_RecordCheck& report) {
    for (const LeastCount& count : kCounts) {
        const int* value = Find<int>(option, count.field);
        if (value != nullptr && *value < count.least) {
            report.Add("number-too-small", count.field, "found " + std::to_string(*value),
                       std::to_string(count.least) + " or more");
        }
    }
    for (const DependentTable& table : kTables) CheckColumns(option, table, report);
}

void CheckContactArea(const kmaC_ContactArea& option, fnd_RecordCheck& report) {
    if (option.dependencies > 0 && option.table.NumRows() == 0) {
        report.Add("table-rows", "table", "found no row",
                   "at least 1: the first row stands in one line with \"dependencies=\"");
    }
}

/// What is given, but will not stand in the deck as the record is.
void WarnLeftOut(bool leftOut, const char* field, const char* why, fnd_RecordCheck& report) {
    if (leftOut) report.Add("not-in-deck", field, std::string(why) + ", so this will not stand in the deck");
}

void CheckRates(const kmaC_MaterialTable& table, bool rateDependentTable, fnd_RecordCheck& report) {
    if (rateDependentTable && table.NumRows() == 0) {
        report.Add("not-in-deck", "table",
                   "there are no rows to make a block for each rate, so this law will not stand "
                   "in the deck");
    }
}

void CheckPlastic(const kmaC_Plastic& option, fnd_RecordCheck& report) {
    constexpr auto kWhy = "a table with rates is written without it";
    CheckRates(option.table, option.rateDependentTable, report);
    WarnLeftOut(option.rateDependentTable && option.hardening != option.hardeningDef(), "hardening", kWhy,
                report);
    WarnLeftOut(option.rateDependentTable && option.dataType != option.dataTypeDef(), "dataType", kWhy,
                report);
}

void CheckDruckerPragerHardening(const kmaC_DruckerPragerHardening& option, fnd_RecordCheck& report) {
    CheckRates(option.table, option.rateDependentTable, report);
}

/// One test of a rubber or foam: whether it is there, and whether its data would be written.
struct Test {
    const char* field;
    bool isThere;
    bool counts;
};

template <class Tests>
void CheckTests(const Tests& tests, bool testData, const kmaC_MaterialTable& table, bool needsConstants,
                fnd_RecordCheck& report) {
    bool anyTest = false;
    for (const Test& test : tests) {
        anyTest = anyTest || (test.isThere && test.counts);
        WarnLeftOut(test.isThere && !testData, test.field, "testData is false", report);
        WarnLeftOut(test.isThere && testData && !test.counts, test.field, "a Marlow material leaves it out",
                    report);
    }
    WarnLeftOut(testData && table.NumRows() > 0, "table", "testData is true", report);
    if (testData && !anyTest) {
        report.Add("law-without-data", "testData",
                   "there is no test that would be written, so this law will have no data");
    }
    if (!testData && needsConstants && table.NumRows() == 0) {
        report.Add("law-without-data", "table", "there are no constants, so this law will have no data");
    }
}

void CheckHyperelastic(const kmaC_Hyperelastic& option, fnd_RecordCheck& report) {
    using Type = kmaC_Hyperelastic::TypeEnm;
    using Tested = kmaC_Hyperelastic::MarlowDeviatoricDataEnm;
    using Volumetric = kmaC_Hyperelastic::VolumetricResponseEnm;
    const bool marlow = option.type == Type::MARLOW;
    const auto counts = [&](Tested test) { return !marlow || option.marlowDeviatoricData == test; };
    const Test tests[] = {
        {"biaxialTestData", !option.biaxialTestData.IsNull(), counts(Tested::BIAXIAL)},
        {"planarTestData", !option.planarTestData.IsNull(), counts(Tested::PLANAR)},
        {"uniaxialTestData", !option.uniaxialTestData.IsNull(), counts(Tested::UNIAXIAL)},
        {"volumetricTestData", !option.volumetricTestData.IsNull(),
         !marlow || option.volumetricResponse == Volumetric::VOLUMETRIC_DATA},
    };
    CheckTests(tests, option.testData, option.table, !marlow && option.type != Type::USER, report);
    if (marlow && !option.testData) {
        report.Add("not-in-deck", "testData",
                   "a Marlow material has no constants, so without test data its law will "
                   "not stand in the deck");
    }
    if (option.type == Type::UNKNOWN) {
        report.Add("law-unknown", "type", "\"unknown\" will stand in the deck, which names no law");
    }
}

void CheckHyperfoam(const kmaC_Hyperfoam& option, fnd_RecordCheck& report) {
    const Test tests[] = {
        {"biaxialTestData", !option.biaxialTestData.IsNull(), true},
        {"planarTestData", !option.planarTestData.IsNull(), true},
        {"simpleShearTestData", !option.simpleShearTestData.IsNull(), true},
        {"uniaxialTestData", !option.uniaxialTestData.IsNull(), true},
        {"volumetricTestData", !option.volumetricTestData.IsNull(), true},
    };
    CheckTests(tests, option.testData, option.table, true, report);
}

void CheckThickness(const kmaC_ThicknessBehavior& option, fnd_RecordCheck& report) {
    WarnLeftOut(!option.contactArea.IsNull() &&
                    option.variableUnits != kmaC_ThicknessBehavior::VariableUnitsEnm::FORCE,
                "contactArea", "variableUnits is not FORCE", report);
}

void CheckSorption(const kmaC_Sorption& option, fnd_RecordCheck& report) {
    constexpr auto kWhy = "exsorption is false";
    WarnLeftOut(!option.exsorption && option.exsorptionTable.NumRows() > 0, "exsorptionTable", kWhy, report);
    WarnLeftOut(!option.exsorption && option.scanning != option.scanningDef(), "scanning", kWhy, report);
}

void CheckAcousticMedium(const kmaC_AcousticMedium& option, fnd_RecordCheck& report) {
    WarnLeftOut(!option.volumetricDrag && option.volumetricDragTable.NumRows() > 0, "volumetricDragTable",
                "volumetricDrag is false", report);
}

} // namespace

void fnd_AddMaterialRules(fnd_RecordRules& rules) {
    rules.Add<CheckOption>();
    rules.AddTableHint<TableHint>();
    rules.Add<CheckContactArea>();
    rules.Add<CheckPlastic>();
    rules.Add<CheckDruckerPragerHardening>();
    rules.Add<CheckHyperelastic>();
    rules.Add<CheckHyperfoam>();
    rules.Add<CheckThickness>();
    rules.Add<CheckSorption>();
    rules.Add<CheckAcousticMedium>();
}
