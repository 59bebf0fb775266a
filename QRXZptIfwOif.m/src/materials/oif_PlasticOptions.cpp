#include "materials/oif_SpecialOptions.h"

namespace {

constexpr int kColumnOfRate = 2;

/// The rows of a table with rates, each formatted alone: `startBlock(rate)` wherever the rate changes.
template <class R, class StartBlock>
void WriteByRate(utl_Stream& stream, const R& option, const kmaC_MaterialTable& table,
                 const StartBlock& startBlock) {
    const int columns = table.NumColumns();
    if (columns <= kColumnOfRate) return;
    for (int row = 0; row < table.NumRows(); ++row) {
        const double rate = table.ConstGet(row, kColumnOfRate);
        if (row == 0 || rate != table.ConstGet(row - 1, kColumnOfRate)) startBlock(rate);
        oif_MaterialTable line = oif_TableOfOneRow(
            [&](int column) { return table.ConstGet(row, column < kColumnOfRate ? column : column + 1); },
            columns - 1);
        oif_KeepFieldColumns(line, columns - 1, option.temperatureDependency, option.dependencies);
        stream << line;
    }
}

/// The rows in ascending order of their rates; those of one rate keep their order.
kmaC_MaterialTable SortedByRate(kmaC_MaterialTable table) {
    const int last = table.NumColumns() - 1;
    if (last < kColumnOfRate) return table;
    table.SwapColumns(kColumnOfRate, last);
    table.Sort(1);
    table.SwapColumns(kColumnOfRate, last);
    return table;
}

void WriteHardening(utl_Stream& stream, const char* keyword, const kmaC_Plastic& option) {
    using Hardening = kmaC_Plastic::HardeningEnm;
    using DataType = kmaC_Plastic::DataTypeEnm;
    oif_OptionLine line(stream, keyword);
    line.Dependencies(option.dependencies);
    if (option.hardening == Hardening::JOHNSON_COOK) {
        line.Breaking("hardening=JOHNSON COOK");
    } else {
        line.BreakingUnless("hardening=", option.hardening, option.hardeningDef());
    }
    line.BreakingUnless("datatype=", option.dataType, option.dataTypeDef());
    if (option.dataType == DataType::PARAMETERS) line.Breaking("numbackstress=", option.numBackstresses);
    if (option.hardening == Hardening::USER) {
        // One property a row in the record, all in one row in the deck.
        const int count = option.table.NumRows();
        line.Breaking("properties=", count).End();
        stream << oif_TableOfOneRow([&](int row) { return option.table.ConstGet(row, 0); }, count);
        return;
    }
    line.End();
    oif_MaterialTable table = oif_DependentTable(option);
    if (option.hardening == Hardening::COMBINED && option.dataType == DataType::STABILIZED &&
        !option.strainRangeDependency && (option.temperatureDependency || option.dependencies > 0)) {
        table.InsertEmptyColumn(2);
    }
    stream << table;
}

} // namespace

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Plastic& option) {
    if (option.rateDependentTable) {
        // The hardening law and its data type are not told with rates.
        WriteByRate(stream, option, SortedByRate(option.table), [&](double rate) {
            oif_OptionLine line(stream, keyword);
            line.Text(", rate=");
            stream << rate;
            line.Dependencies(option.dependencies).End();
        });
    } else {
        WriteHardening(stream, keyword, option);
    }
    oif_WriteOptions(stream, option.rateDependent, option.potential, option.cyclicHardening, option.ornl,
                     option.cycledPlastic, option.annealTemperature);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_DruckerPragerHardening& option) {
    if (option.rateDependentTable) {
        // Rows stay as they are given: a rate that comes back starts another block.
        WriteByRate(stream, option, option.table, [&](double rate) {
            oif_OptionLine line(stream, keyword);
            line.Dependencies(option.dependencies).Text(", rate=");
            stream << rate;
            line.BreakingUnless("type=", option.type, option.typeDef()).End();
        });
        return;
    }
    oif_OptionLine(stream, keyword)
        .Dependencies(option.dependencies)
        .BreakingUnless("type=", option.type, option.typeDef())
        .End();
    stream << oif_DependentTable(option);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_DruckerPrager& option) {
    using Criterion = kmaC_DruckerPrager::ShearCriterionEnm;
    oif_OptionLine(stream, keyword)
        .Dependencies(option.dependencies)
        .BreakingUnless("eccentricity=", option.eccentricity, option.eccentricityDef())
        .BreakingIf(option.shearCriterion == Criterion::HYPERBOLIC, "shearcriterion=HYPERBOLIC")
        .BreakingIf(option.shearCriterion == Criterion::EXPONENTIAL, "shearcriterion=EXPONENT FORM")
        .BreakingIf(option.testData, "testdata")
        .End();
    oif_MaterialTable table(option.table, option.dependencies, option.temperatureDependency);
    if (option.shearCriterion == Criterion::EXPONENTIAL && option.testData) {
        for (int i = 0; i < 3; ++i) table.InsertEmptyColumn(0);
    } else if (option.shearCriterion == Criterion::HYPERBOLIC ||
               option.shearCriterion == Criterion::EXPONENTIAL) {
        table.InsertEmptyColumn(2);
    }
    if (!option.temperatureDependency && option.dependencies >= 1) {
        table.InsertEmptyColumn(option.shearCriterion == Criterion::LINEAR ? 3 : 4);
    }
    stream << table;
    oif_WriteOptions(stream, option.druckerPragerCreep, option.druckerPragerHardening, option.rateDependent,
                     option.triaxialTestData);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ClayPlasticity& option) {
    oif_OptionLine(stream, keyword)
        .Dependencies(option.dependencies)
        .BreakingUnless("hardening=", option.hardening, option.hardeningDef())
        .BreakingUnless("intercept=", option.intercept, option.interceptDef())
        .End();
    // Tabular hardening has no first constant; its place is left open in the first row, and only there.
    if (option.hardening == kmaC_ClayPlasticity::HardeningEnm::TABULAR && option.table.NumRows() > 0) {
        stream << ", ";
    }
    stream << oif_DependentTable(option);
    oif_WriteOptions(stream, option.clayHardening);
}
