#include "materials/oif_MaterialTable.h"

#include "materials/Materials.h"

#include <random>

namespace {

std::string Printed(const oif_MaterialTable& table) {
    return Streamed([&](utl_Stream& stream) { stream << table; });
}

oif_MaterialTable DeckTable(std::initializer_list<std::initializer_list<double>> rows) {
    return oif_MaterialTable(Table(rows), 0, false);
}

} // namespace

TEST(MaterialTable, NoRows_PrintNothingNotEvenALineEnd) {
    EXPECT_EQ(Printed(oif_MaterialTable(cow_2DArray<double>(), 0, false)), "");
    EXPECT_EQ(Printed(oif_MaterialTable(kmaC_MaterialTable(0, 3), 0, false)), "");
}

TEST(MaterialTable, OneValue_HasATrailingComma) {
    EXPECT_EQ(Printed(DeckTable({{7850}})), "7850.,\n");
}

TEST(MaterialTable, TwoColumns_ArePaddedToTheLongestTextPlusOne) {
    EXPECT_EQ(Printed(DeckTable({{210000, 0.3}, {7, 12.5}})), "210000.,  0.3\n     7., 12.5\n");
}

TEST(MaterialTable, LaterColumns_ShareOneWidth) {
    EXPECT_EQ(Printed(DeckTable({{1, 2, 1000}})), "1.,   2.,1000.\n");
}

TEST(MaterialTable, Widths_CountTheTextWithoutItsPoint) {
    EXPECT_EQ(Printed(DeckTable({{-0.0}})), "-0.,\n");
    EXPECT_EQ(Printed(DeckTable({{1e20}})), " 1e+20,\n");
    EXPECT_EQ(Printed(DeckTable({{1e-5}})), " 1e-05,\n");
    EXPECT_EQ(Printed(DeckTable({{0.25}})), " 0.25,\n");
}

TEST(MaterialTable, MoreThanSixDigits_AreLost) {
    EXPECT_EQ(Printed(DeckTable({{1234567.8}})), " 1.23457e+06,\n");
    EXPECT_EQ(Printed(DeckTable({{0.123456789, -123456.7}})), " 0.123457,-123457.\n");
}

TEST(MaterialTable, EightColumns_FillALineWithoutATrailingComma) {
    EXPECT_EQ(Printed(DeckTable({{1, 2, 3, 4, 5, 6, 7, 8}})), "1.,2.,3.,4.,5.,6.,7.,8.\n");
}

TEST(MaterialTable, NineColumns_PutTheNinthAloneWithAComma) {
    EXPECT_EQ(Printed(DeckTable({{1, 2, 3, 4, 5, 6, 7, 8, 9}})), "1.,2.,3.,4.,5.,6.,7.,8.\n9.,\n");
}

TEST(MaterialTable, TenColumns_GoOnInTheNextLine) {
    EXPECT_EQ(Printed(DeckTable({{1, 2, 3, 4, 5, 6, 7, 8, 9, 10}})),
              "1., 2., 3., 4., 5., 6., 7., 8.\n 9.,10.\n");
}

TEST(MaterialTable, SixteenAndSeventeenColumns_EndLikeEightAndNine) {
    EXPECT_EQ(Printed(DeckTable({{1, 1, 1, 1, 1, 1, 1, 1, 2, 2, 2, 2, 2, 2, 2, 2}})),
              "1.,1.,1.,1.,1.,1.,1.,1.\n2.,2.,2.,2.,2.,2.,2.,2.\n");
    EXPECT_EQ(Printed(DeckTable({{1, 1, 1, 1, 1, 1, 1, 1, 2, 2, 2, 2, 2, 2, 2, 2, 3}})),
              "1.,1.,1.,1.,1.,1.,1.,1.\n2.,2.,2.,2.,2.,2.,2.,2.\n3.,\n");
}

TEST(MaterialTable, EmptyColumn_IsOneBlankWithoutAWidth) {
    oif_MaterialTable table = DeckTable({{100, 200}});
    table.InsertEmptyColumn(1);
    EXPECT_EQ(Printed(table), "100., ,200.\n");
    table.InsertEmptyColumn(0);
    EXPECT_EQ(Printed(table), " ,100., ,200.\n");
}

TEST(MaterialTable, EmptyColumn_IsNeverAddedAtTheEndOnPurpose) {
    oif_MaterialTable table = DeckTable({{1, 2}});
    table.InsertEmptyColumn(2);
    table.InsertEmptyColumn(3);
    table.InsertEmptyColumn(-1);
    EXPECT_EQ(Printed(table), "1.,2.\n");
}

TEST(MaterialTable, EmptyColumns_CountForTheLinesOfEight) {
    oif_MaterialTable table = DeckTable({{1, 2, 3, 4, 5, 6, 7, 8}});
    table.InsertEmptyColumn(7);
    EXPECT_EQ(Printed(table), "1.,2.,3.,4.,5.,6.,7., \n8.,\n");
}

TEST(MaterialTable, EmptyColumn_LeavesCopiesOfTheTableAlone) {
    const oif_MaterialTable table = DeckTable({{1, 2}});
    oif_MaterialTable copy = table;
    copy.InsertEmptyColumn(0);
    EXPECT_EQ(Printed(table), "1.,2.\n");
}

TEST(MaterialTable, ReplacedData_AreThoseCellsThatReadAsTheValue) {
    oif_MaterialTable table = DeckTable({{1, 2}, {3, 4}, {5, 2}});
    table.ReplaceColumnData(1, 2.0, "FREE");
    EXPECT_EQ(Printed(table), "1.,FREE\n3.,4.\n5.,FREE\n");
}

TEST(MaterialTable, ReplacedData_AreFoundByTheSixPrintedDigits) {
    oif_MaterialTable table = DeckTable({{0.1234567}});
    table.ReplaceColumnData(0, 0.1234567, "X");
    EXPECT_EQ(Printed(table), " 0.123457,\n");
    table.ReplaceColumnData(0, 0.123457, "X");
    EXPECT_EQ(Printed(table), "X,\n");
}

TEST(MaterialTable, ReplacedData_TakeABlankForZero) {
    oif_MaterialTable table = DeckTable({{1, 2}});
    table.InsertEmptyColumn(0);
    table.ReplaceColumnData(0, 0.0, "ANY");
    EXPECT_EQ(Printed(table), "ANY,1.,2.\n");
}

TEST(MaterialTable, ReplacedData_OfColumnsThatAreNotThere_AreNone) {
    oif_MaterialTable table = DeckTable({{1, 2}});
    for (const int column : {-1, 2, 3}) table.ReplaceColumnData(column, 2.0, "X");
    EXPECT_EQ(Printed(table), "1.,2.\n");
}

TEST(MaterialTable, SwappedColumns_KeepTheirWidths) {
    oif_MaterialTable table = DeckTable({{1, 20}});
    table.SwapColumns(0, 1);
    EXPECT_EQ(Printed(table), "20.,1.\n");
    table.SwapColumns(1, 1);
    EXPECT_EQ(Printed(table), "20.,1.\n");
}

TEST(MaterialTable, SwappedColumnThatIsNotThere_Raises) {
    oif_MaterialTable table = DeckTable({{1, 2}});
    EXPECT_EQ(Raised([&] { table.SwapColumns(0, 2); }).find("cow_2DArray: column 2"), 0u);
}

TEST(MaterialTable, SkippedColumns_StillCountForTheWidths) {
    oif_MaterialTable table = DeckTable({{1, 1000, 3}});
    table.SkipColumns(cow_List<int>(1));
    EXPECT_EQ(Printed(table), "1.,   3.\n");
}

TEST(MaterialTable, SkippedColumns_DoNotCountForTheLinesOfEight) {
    oif_MaterialTable nine = DeckTable({{1, 2, 3, 4, 5, 6, 7, 8, 9}});
    nine.SkipColumns(cow_List<int>(0));
    EXPECT_EQ(Printed(nine), "2.,3.,4.,5.,6.,7.,8.,9.\n");
    oif_MaterialTable two = DeckTable({{1, 2}});
    two.SkipColumns(cow_List<int>(0));
    EXPECT_EQ(Printed(two), "2.,\n");
}

TEST(MaterialTable, AllColumnsSkipped_LeaveAnEmptyLineForEachRow) {
    oif_MaterialTable table = DeckTable({{1}, {2}});
    table.SkipColumns(cow_List<int>(0));
    EXPECT_EQ(Printed(table), "\n\n");
}

TEST(MaterialTable, BlankLines_StandBehindEveryRow) {
    oif_MaterialTable table = DeckTable({{1}, {2}});
    table.SetBlankLineAfterRow(true);
    EXPECT_EQ(Printed(table), "1.,\n\n2.,\n\n");
}

TEST(MaterialTable, DependenciesAndTemperature_AreKeptAndChangeNothing) {
    const oif_MaterialTable table(kmaC_MaterialTable(Table({{1, 2, 3}})), 2, true);
    EXPECT_EQ(table.Dependencies(), 2);
    EXPECT_TRUE(table.TemperatureDependency());
    EXPECT_EQ(table.Values(), Table({{1, 2, 3}}));
    EXPECT_EQ(table.Cells().NumColumns(), 3);
    EXPECT_EQ(Printed(table), "1.,2.,3.\n");
}

TEST(MaterialTable, ConvertDouble_TakesItsFormFromWidthAndPrecision) {
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(2.0 / 3.0, 8, 3), "   0.667");
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(2.0 / 3.0, 0, 3), "0.667");
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(2.0 / 3.0, 0, 0), "0.666667");
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(12.0, 6, 6), "   12.");
}

TEST(MaterialTable, ConvertDouble_WithAWidthAlone_HasOneDigitOnPurpose) {
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(2.0 / 3.0, 8, 0), "     0.7");
    EXPECT_EQ(oif_MaterialTable::ConvertDouble(44.0, 8, 0), "   4e+01");
}

TEST(MaterialTable, CellsOfAnyNumbers_AreThoseOfConvertDoubleInTheWidthOfTheStrings) {
    std::mt19937_64 random(5);
    std::uniform_real_distribution<double> exponent(-30.0, 30.0);
    for (int round = 0; round < 2000; ++round) {
        cow_2DArray<double> values(2, 3);
        int first = 0;
        int other = 0;
        for (int i = 0; i < 6; ++i) {
            double value = std::pow(10.0, exponent(random)) * (random() % 2 == 0 ? 1.0 : -1.0);
            if (random() % 3 == 0) value = static_cast<double>(random() % 3000000) - 1000000.0;
            values.Put(i / 3, i % 3, value);
            int& width = i % 3 == 0 ? first : other;
            width = std::max(width, cow_String(value).Length() + 1);
        }
        const oif_MaterialTable table(values, 0, false);
        for (int i = 0; i < 6; ++i) {
            ASSERT_EQ(table.Cells().ConstGet(i / 3, i % 3),
                      oif_MaterialTable::ConvertDouble(values.ConstGet(i / 3, i % 3),
                                                       i % 3 == 0 ? first : other, 6));
        }
    }
}

TEST(RecordTable, MadeOfSizes_IsZero) {
    const kmaC_MaterialTable table(2, 3);
    EXPECT_EQ(table.NumRows(), 2);
    EXPECT_EQ(table.NumColumns(), 3);
    EXPECT_EQ(table.ConstGet(1, 2), 0.0);
    EXPECT_EQ(kmaC_MaterialTable().NumRows(), 0);
    EXPECT_EQ(kmaC_MaterialTable().NumColumns(), 0);
}

TEST(RecordTable, Copies_ShareUntilOneIsWritten) {
    const kmaC_MaterialTable table = Table({{1, 2}});
    kmaC_MaterialTable copy = table;
    EXPECT_EQ(copy, table);
    copy.Put(0, 1, 5.0);
    EXPECT_FALSE(copy == table);
    EXPECT_EQ(table.ConstGet(0, 1), 2.0);
}

TEST(RecordTable, Sort_ByTheLastColumn_KeepsTheOrderOfEqualRows) {
    kmaC_MaterialTable table = Table({{1, 7}, {2, 5}, {3, 7}, {4, 5}, {5, -1}});
    table.Sort(1);
    EXPECT_EQ(table.Values(), Table({{5, -1}, {2, 5}, {4, 5}, {1, 7}, {3, 7}}));
}

TEST(RecordTable, Sort_OfBothZeros_TakesThemForEqual) {
    kmaC_MaterialTable table = Table({{1, 0.0}, {2, -0.0}, {3, 0.0}});
    table.Sort(1);
    EXPECT_EQ(table.Values(), Table({{1, 0}, {2, 0}, {3, 0}}));
}

TEST(RecordTable, Sort_OfManyRowsWithNaN_PutsThemLast) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    kmaC_MaterialTable table(200, 2);
    for (int row = 0; row < 200; ++row) {
        table.Put(row, 0, row);
        table.Put(row, 1, row % 3 == 0 ? nan : 200 - row);
    }
    table.Sort(1);
    for (int row = 1; row < 133; ++row) EXPECT_LT(table.ConstGet(row - 1, 1), table.ConstGet(row, 1));
    for (int row = 133; row < 200; ++row) EXPECT_EQ(table.ConstGet(row, 0), 3 * (row - 133));
}

TEST(RecordTable, Sort_ByTwoColumns_LooksAtTheFirstOfThemFirst) {
    kmaC_MaterialTable table = Table({{1, 2, 1}, {2, 1, 9}, {3, 1, 2}});
    table.Sort(2);
    EXPECT_EQ(table.Values(), Table({{3, 1, 2}, {2, 1, 9}, {1, 2, 1}}));
}

TEST(RecordTable, Sort_ByColumnsThatAreNotThere_ChangesNothing) {
    for (const int n : {-1, 0, 3}) {
        kmaC_MaterialTable table = Table({{2, 1}, {1, 0}});
        table.Sort(n);
        EXPECT_EQ(table.Values(), Table({{2, 1}, {1, 0}}));
    }
    kmaC_MaterialTable empty;
    empty.Sort(1);
    EXPECT_EQ(empty.NumRows(), 0);
}

TEST(RecordTable, SwapColumns_TakesAllRows) {
    kmaC_MaterialTable table = Table({{1, 2, 3}, {4, 5, 6}});
    table.SwapColumns(0, 2);
    table.SwapColumns(1, 1);
    EXPECT_EQ(table.Values(), Table({{3, 2, 1}, {6, 5, 4}}));
}
