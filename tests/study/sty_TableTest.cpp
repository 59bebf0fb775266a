#include "study/sty_Table.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include <unistd.h>

namespace {

/// A table in a file that goes with it.
class TableFile {
public:
    TableFile(const std::string& ending, const std::string& text)
        : path_("/tmp/qrx-table-" + std::to_string(::getpid()) + ending) {
        std::ofstream(path_, std::ios::binary) << text;
    }
    ~TableFile() { std::filesystem::remove(path_); }
    const std::string& Path() const { return path_; }

private:
    std::string path_;
};

std::vector<sty_Row> RowsOf(const sty_Table& table) {
    std::vector<sty_Row> rows;
    sty_TableReader reader(table);
    sty_RawRow raw;
    while (reader.Next(raw)) rows.push_back(table.Parse(raw));
    return rows;
}

std::vector<std::string> CellsOf(const sty_Row& row) {
    std::vector<std::string> cells;
    for (const sty_Cell& cell : row.cells) cells.push_back(cell.json);
    return cells;
}

using Cells = std::vector<std::string>;

} // namespace

TEST(sty_Table, CellsOfCsv_AreSplitByTheRulesOfQuotes) {
    const TableFile file(".csv", "\xEF\xBB\xBF"
                                 "a,\"b,c\", d \r\n"
                                 "1,\"x \"\"y\"\"\",true\r\n"
                                 "\r\n"
                                 "\"[1, 2]\",5\" pipe,null\n"
                                 "-0.5e3,\"two\nlines\",\"\"\"7\"\"\"");
    const sty_Table table(file.Path());
    EXPECT_EQ(table.Columns(), (Cells{"a", "b,c", "d"}));
    EXPECT_EQ(table.Rows(), 3);
    const auto rows = RowsOf(table);
    ASSERT_EQ(rows.size(), 3u);
    EXPECT_EQ(CellsOf(rows[0]), (Cells{"1", "\"x \\\"y\\\"\"", "true"}));
    EXPECT_EQ(CellsOf(rows[1]), (Cells{"[1, 2]", "\"5\\\" pipe\"", "null"}));
    EXPECT_EQ(CellsOf(rows[2]), (Cells{"-0.5e3", "\"two\\u000alines\"", "\"7\""}));
    EXPECT_EQ(rows[2].cells[0].value.Real(), -500.0);
}

TEST(sty_Table, TextsThatLookLikeNumbersButAreNone_AreTexts) {
    const TableFile file(".tsv", "a\n01\n1.\n.5\n+1\n1e\n-\n0x1\nNaN\n1,5\n--1\n12345678901\n-0\n");
    const sty_Table table(file.Path());
    const auto rows = RowsOf(table);
    ASSERT_EQ(rows.size(), 12u);
    for (std::size_t i = 0; i < 10; ++i) EXPECT_TRUE(rows[i].cells[0].value.IsString()) << i;
    EXPECT_TRUE(rows[10].cells[0].value.IsLargeInteger());
    EXPECT_TRUE(rows[11].cells[0].value.IsInt());
}

TEST(sty_Table, JsonLines_HaveTheColumnsOfAllRows) {
    const TableFile file(".jsonl",
                         "{\"a\": 1, \"name\": \"x\"}\n\n{\"b\": [1, 2], \"name\": 7}\n{\"a\": 2}\n");
    const sty_Table table(file.Path());
    EXPECT_EQ(table.Columns(), (Cells{"a", "name", "b"}));
    const auto rows = RowsOf(table);
    ASSERT_EQ(rows.size(), 3u);
    EXPECT_EQ(rows[0].name, "x");
    EXPECT_EQ(rows[1].name, "7");
    EXPECT_EQ(CellsOf(rows[1]), Cells{"[1, 2]"});
    EXPECT_NE(rows[2].problem, "");
}

TEST(sty_Table, LongRows_AreReadAcrossPieces) {
    std::string text = "a,b\n";
    std::vector<std::string> wanted;
    for (int i = 0; i < 40; ++i) {
        wanted.push_back(
            std::string(static_cast<std::size_t>(70'000 + 13 * i), static_cast<char>('a' + i % 26)));
        text += "\"" + wanted.back() + "\",1\n";
    }
    const TableFile file(".csv", text);
    const auto rows = RowsOf(sty_Table(file.Path()));
    ASSERT_EQ(rows.size(), wanted.size());
    for (std::size_t i = 0; i < rows.size(); ++i) EXPECT_EQ(rows[i].cells[0].value.String(), wanted[i]);
}

TEST(sty_Table, ItsSum_IsThatOfTheFile) {
    const TableFile file(".csv", "\xEF\xBB\xBFname\nabc\n");
    EXPECT_EQ(sty_Table(file.Path()).Sha256(), sty_Sha256OfFile(file.Path()));
}

// The examples of FIPS 180-4.
TEST(sty_Sha256, OfTheStandardsExamples_IsTheirs) {
    const auto sumOf = [](std::string_view text) {
        sty_Sha256 sum;
        sum.Add(text);
        return sum.Hex();
    };
    EXPECT_EQ(sumOf(""), "e3b0c44298fc1c149afbf4c8996fb92427ae41e4649b934ca495991b7852b855");
    EXPECT_EQ(sumOf("abc"), "ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad");
    EXPECT_EQ(sumOf("abcdbcdecdefdefgefghfghighijhijkijkljklmklmnlmnomnopnopq"),
              "248d6a61d20638b8e5c026930c3e6039a33ce45964ff2167f6ecedd419db06c1");
    EXPECT_EQ(sumOf(std::string(1'000'000, 'a')),
              "cdc76e5c9914fb9281a1c7e284d73e67f1809a48a497200e046d39ccc7112cd0");
}

TEST(sty_Sha256, OfACopy_GoesOnFromThere) {
    sty_Sha256 first;
    first.Add("a");
    sty_Sha256 copy = first;
    copy.Add("bc");
    first.Add("bc");
    EXPECT_EQ(copy.Hex(), "ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad");
    EXPECT_EQ(first.Hex(), copy.Hex());
}
