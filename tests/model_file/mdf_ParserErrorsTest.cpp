#include "model_file/mdf_Locate.h"
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

#include <fstream>
#include <ostream>
#include <string>
#include <vector>

namespace {

/// The line of a message without its kind and its code.
std::string Line(const std::string& fileName, const fnd_Finding& error) {
    std::string line = mdf_LineOf(fileName, error);
    const std::string code = " [" + std::string(error.code->name) + "]";
    EXPECT_TRUE(line.ends_with(code)) << line;
    line.resize(line.size() - code.size());
    const std::string severity = " error: ";
    const std::size_t place = line.find(severity);
    return place == std::string::npos ? line
                                      : line.substr(0, place) + " " + line.substr(place + severity.size());
}

std::vector<fnd_Finding> ErrorsOf(std::string_view text) {
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    EXPECT_FALSE(mdf_Parse(text, root, errors)) << text;
    return errors;
}

struct SyntaxCase {
    const char* name;
    std::string text;
    std::string message;
};

void PrintTo(const SyntaxCase& c, std::ostream* out) {
    *out << c.text;
}

class ModelFileSyntax : public testing::TestWithParam<SyntaxCase> {};

std::string CaseName(const testing::TestParamInfo<SyntaxCase>& param) {
    return param.param.name;
}

const SyntaxCase syntaxCases[] = {
    {"EmptyText", "", "1:1: found the end of the file, expected a value"},
    {"CommentOnly", "// a\n", "2:1: found the end of the file, expected a value"},
    {"CommaBeforeClosingBracket", "[1,\n 2,\n]", "3:1: found ']', expected no comma behind the last one"},
    {"CommaBeforeClosingBrace", "{\"a\": 1, }", "1:10: found '}', expected no comma behind the last one"},
    {"TwoCommas", "[1,,2]", "1:4: found ',', expected a value"},
    {"LeadingComma", "[,1]", "1:2: found ',', expected a value"},
    {"MissingCommaBetweenNumbers", "[1 23]", "1:4: found '23', expected ',' or ']'"},
    {"MissingCommaAfterString", "{\"a\": \"x\"\n \"b\": 1}", "2:2: found '\"b\"', expected ',' or '}'"},
    {"MissingColon", "{\"a\" 1}", "1:6: found '1', expected ':'"},
    {"ColonForComma", "[1 : 2]", "1:4: found ':', expected ',' or ']'"},
    {"WrongClosingBracket", "[1}", "1:3: found '}', expected ',' or ']'"},
    {"WrongClosingBracketAfterComment", "[1 /* x */ }", "1:12: found '}', expected ',' or ']'"},
    {"WrongClosingBrace", "{\"a\": [1]]", "1:10: found ']', expected ',' or '}'"},
    {"NameWithoutQuotes", "{a: 1}",
     "1:2: invalid literal; found 'a', expected a member name in double quotes"},
    {"NumberAsName", "{1: 1}", "1:2: found '1', expected a member name in double quotes"},
    {"EndInArray", "[1, 2", "1:6: found the end of the file, expected ',' or ']'"},
    {"EndInObject", "{\"a\": 1,\n",
     "2:1: found the end of the file, expected a member name in double quotes"},
    {"EndAfterKey", "{\"a\"", "1:5: found the end of the file, expected ':'"},
    {"TextAfterTheRoot", "{} x", "1:4: invalid literal; found 'x', expected the end of the file"},
    {"SecondRoot", "[1]\n[2]", "2:1: found '[', expected the end of the file"},
    {"NumberAfterNumberAtTheEnd", "01", "1:2: found '1', expected the end of the file"},
    {"LeadingZero", "[1, 012]", "1:6: found '12', expected ',' or ']'"},
    {"MisspelledLiteral", "[true, flase]", "1:8: invalid literal; found 'flase', expected a value"},
    {"CapitalLiteral", "{\"a\": True}", "1:7: invalid literal; found 'True', expected a value"},
    {"NotANumber", "[1, NaN]", "1:5: invalid literal; found 'NaN', expected a value"},
    {"PlusSign", "[+1]", "1:2: invalid literal; found '+1', expected a value"},
    {"SingleQuotes", "['a']", "1:2: invalid literal; found ''a'', expected a value"},
    {"NumberEndsWithPoint", "[1.]", "1:2: invalid number; expected a digit after '.'; found '1.'"},
    {"NumberWithoutDigits", "[1, -]", "1:5: invalid number; expected a digit after '-'; found '-'"},
    {"NumberWithoutExponent", "[1.5e, 2]",
     "1:2: invalid number; expected '+', '-' or a digit after 'e'; found '1.5e'"},
    {"NumberTooLarge", "[1,\n  1e999, 2]", "2:3: the number '1e999' is beyond the range of double precision"},
    {"NumberTooLargeNegative", "-1e999", "1:1: the number '-1e999' is beyond the range of double precision"},
    {"StringNotClosed", "{\"a\": \"xyz", "1:7: invalid string: missing closing quote; found '\"xyz'"},
    {"StringOverTwoLines", "{\"a\": \"xyz\n\"}",
     "1:11: invalid string: control character U+000A must be escaped as \\u000A; found "
     "'\"xyz\\x0A'"},
    {"StringWithBadEscape", "[\"a\\q\"]",
     "1:5: invalid string: forbidden character after backslash; found '\"a\\q'"},
    {"StringWithLoneSurrogate", "[\"\\udc00\"]",
     "1:8: invalid string: surrogate U+DC00..U+DFFF must follow U+D800..U+DBFF; found '\"\\udc00'"},
    {"StringWithHalfASurrogatePair", "[\"\\ud83d!\"]",
     "1:9: invalid string: surrogate U+DC00..U+DFFF must follow U+D800..U+DBFF; found '\"\\ud83d!'"},
    {"StringWithTooFewHexDigits", "[\"\\u00g0\"]",
     "1:7: invalid string: four hexadecimal digits must follow \\u; found '\"\\u00g'"},
    {"NumberWithoutDigitsBehindTheSign", "[1e+]",
     "1:2: invalid number; expected a digit after the sign of the exponent; found '1e+'"},
    {"NumberAtTheVeryEnd", "{\"a\": 10", "1:9: found the end of the file, expected ',' or '}'"},
    {"NegativeZeroBeforeADigit", "-01", "1:3: found '1', expected the end of the file"},
    {"ZerosInsideANumberAtTheEnd", "[1.001", "1:7: found the end of the file, expected ',' or ']'"},
    {"CommaInFrontOfTheEnd", "[1,", "1:4: found the end of the file, expected a value"},
    {"CommaBehindTheBracketAtTheEnd", "[,", "1:2: found ',', expected a value"},
    {"ColonAtTheEnd", "{\"a\" : // b", "1:12: found the end of the file, expected a value"},
    {"StringForComma", "[true \"b\"]", "1:7: found '\"b\"', expected ',' or ']'"},
    {"LiteralWithATail", "[nullify]", "1:6: invalid literal; found 'ify', expected ',' or ']'"},
    {"MemberWithoutAColonInARow", "[[1, 2], [3 4]]", "1:13: found '4', expected ',' or ']'"},
    {"InvalidUtf8", "[\"a\xFF\"]", "1:4: invalid string: ill-formed UTF-8 byte; found '\"a\\xFF'"},
    {"InvalidUtf8InLongString", "[\"" + std::string(100, 'x') + "\xC3(\"]",
     "1:104: invalid string: ill-formed UTF-8 byte; found '" + std::string(38, 'x') + "\\xC3('"},
    {"CommentNotClosed", "[1 /* x ]",
     "1:4: invalid comment; missing closing '*/'; found '/*', expected ',' or ']'"},
    {"CommentHalfBegun", "[1, / 2]",
     "1:5: invalid comment; expected '/' or '*' after '/'; found '/', expected a value"},
    {"ColumnsCountBytes", "[\"\xC3\xA9\", x]", "1:8: invalid literal; found 'x', expected a value"},
    {"ByteOrderMarkNotCounted", "\xEF\xBB\xBF[x]", "1:2: invalid literal; found 'x', expected a value"},
    {"CarriageReturns", "[1,\r\n2,\r\nx]", "3:1: invalid literal; found 'x', expected a value"},
    {"NulAfterTheRoot", std::string("[1]\n\0x", 6), "2:1: found a NUL byte, expected text"},
    {"NulAfterANumber", std::string("[1\0]", 4), "1:3: found a NUL byte, expected text"},
    {"NulInAComment", std::string("// a\0\n1", 7), "1:5: found a NUL byte, expected text"},
    {"NestedTooDeep", std::string(201, '['), "1:201: arrays and objects are nested deeper than 200 levels"},
    {"NestedTooDeepInObjects",
     [] {
         std::string text;
         for (int i = 0; i < 300; ++i) text += "{\"a\":\n";
         return text;
     }(),
     "201:1: arrays and objects are nested deeper than 200 levels"},
};

} // namespace

TEST_P(ModelFileSyntax, Document_WithAnErrorOfSyntax_TellsPositionFoundAndExpected) {
    const std::vector<fnd_Finding> errors = ErrorsOf(GetParam().text);
    ASSERT_EQ(errors.size(), 1u);
    EXPECT_EQ(Line("f", errors[0]), "f:" + GetParam().message);
    EXPECT_EQ(errors[0].place, "");
}

INSTANTIATE_TEST_SUITE_P(Cases, ModelFileSyntax, testing::ValuesIn(syntaxCases), CaseName);

TEST(ModelFileErrors, Syntax_AfterHalfTheDocument_LeavesNull) {
    mdf_Value root(3);
    std::vector<fnd_Finding> errors;
    EXPECT_FALSE(mdf_Parse("{\"a\": [1, 2], \"b\"}", root, errors));
    EXPECT_TRUE(root.IsNull());
    EXPECT_FALSE(mdf_Parse(std::string_view("3 \0", 3), root, errors));
    EXPECT_TRUE(root.IsNull());
}

TEST(ModelFileErrors, Members_OfOneName_AreReportedByPointerAndTheFirstStays) {
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    EXPECT_FALSE(
        mdf_Parse(R"({"a/b": [1, {"x~y": 1, "z": 2, "x~y": 3}], "a/b": 4, "c": 5, "a/b": 6})", root, errors));
    ASSERT_EQ(errors.size(), 3u);
    EXPECT_EQ(errors[0].place, "/a~1b/1/x~0y");
    EXPECT_EQ(errors[0].line, 1);
    EXPECT_EQ(errors[0].column, 32);
    EXPECT_EQ(errors[0].Text(), "the member 'x~y' stands more than once, expected names that differ");
    EXPECT_EQ(errors[1].place, "/a~1b");
    EXPECT_EQ(Line("m.json", errors[2]),
              "m.json:1:62: the member 'a/b' stands more than once, expected names that differ (/a~1b)");
    ASSERT_EQ(root.Size(), 2u);
    EXPECT_EQ(root.Find("a/b")->Items()[1].Find("x~y")->Int(), 1);
    EXPECT_EQ(root.Find("c")->Int(), 5);
}

TEST(ModelFileErrors, Members_RepeatedAmongMany_AreReportedAndTheOthersFound) {
    std::string text = "{";
    for (int i = 0; i < 100; ++i) text += "\"n" + std::to_string(i) + "\": " + std::to_string(i) + ", ";
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    EXPECT_FALSE(mdf_Parse(text + "\"n50\": 0, \"last\": 1}", root, errors));
    ASSERT_EQ(errors.size(), 1u);
    EXPECT_EQ(errors[0].place, "/n50");
    EXPECT_EQ(root.Find("n50")->Int(), 50);
    EXPECT_EQ(root.Find("n99")->Int(), 99);
    EXPECT_EQ(root.Find("last")->Int(), 1);
}

TEST(ModelFileErrors, Members_RepeatedVeryOften_AreReportedUpToTheLimit) {
    std::string text = "[";
    for (int i = 0; i < 80; ++i) text += "{\"a\": 1, \"a\": 2},";
    EXPECT_EQ(ErrorsOf(text + "{}]").size(), mdf_maxErrors);
}

TEST(ModelFileErrors, Places_AreLookedUpInTheText) {
    const std::string text = "\xEF\xBB\xBF{ \"a\": 1, // \"b\": {\r\n"
                             "  \"b\": [[1, 2], [3, /* ] */ 4],\n"
                             "\t{\"x/y\": \"}\\\"\", \"\\u00e9~\": {}}]\n}";
    const struct {
        const char* place;
        long line;
        long column;
    } cases[] = {
        {"", 1, 1},
        {"/a", 1, 3},
        {"/b", 2, 3},
        {"/b/0", 2, 9},
        {"/b/1/1", 2, 29},
        {"/b/2", 3, 2},
        {"/b/2/x~1y", 3, 3},
        {"/b/2/\xC3\xA9~0", 3, 17},
        // Nearest to what isn't there: what is around it.
        {"/c", 1, 1},
        {"/a/0", 1, 3},
        {"/b/2/z/0", 3, 2},
        {"/b/7", 2, 3},
        {"/b/x", 2, 3},
    };
    std::vector<fnd_Finding> findings;
    for (const auto& c : cases) findings.push_back(fnd_Make("unknown-member", c.place, "x"));
    mdf_Locate(text, findings);
    for (std::size_t i = 0; i < findings.size(); ++i) {
        EXPECT_EQ(findings[i].line, cases[i].line) << cases[i].place;
        EXPECT_EQ(findings[i].column, cases[i].column) << cases[i].place;
    }
}

TEST(ModelFileErrors, Places_OfAFileThatHasChanged_AreNotTold) {
    const TestFolder folder;
    const std::string path = folder.Path("model.json");
    const std::string text = R"({"format": "qrx-model/1", "models": {"Default Model": {}}})";
    std::ofstream(path, std::ios::binary) << text;
    mdf_Report report;
    ASSERT_NE(mdf_ReadModelFile(path, report), nullptr);
    std::vector<fnd_Finding> findings{fnd_Make("unknown-member", "/models", "x")};
    report.Locate(findings);
    EXPECT_EQ(findings[0].column, 27);
    findings[0].line = 0;
    std::ofstream(path, std::ios::binary) << "\n" << text;
    report.Locate(findings);
    EXPECT_EQ(findings[0].line, 0);
}

TEST(ModelFileErrors, AppendPointer_WithTildeAndSlash_Escapes) {
    std::string pointer = "/a";
    fnd_AppendPointer(pointer, "m~n/o");
    fnd_AppendPointer(pointer, "12");
    fnd_AppendPointer(pointer, "");
    EXPECT_EQ(pointer, "/a/m~0n~1o/12/");
}

TEST(ModelFileReadFile, Text_WithAnyBytes_ComesUnchanged) {
    const TestFolder folder;
    const std::string path = folder.Path("model.json");
    const std::string written("a\r\n\0\xFF\x1A z", 9);
    std::ofstream(path, std::ios::binary) << written;
    std::string text = "old";
    fnd_Finding error;
    EXPECT_TRUE(mdf_ReadFile(path, text, error));
    EXPECT_EQ(text, written);
    std::ofstream(path, std::ios::binary | std::ios::trunc).flush();
    EXPECT_TRUE(mdf_ReadFile(path, text, error));
    EXPECT_EQ(text, "");
}

TEST(ModelFileReadFile, Path_OfNoFile_IsAnErrorInTheSystemsWords) {
    std::string text;
    fnd_Finding error;
    EXPECT_FALSE(mdf_ReadFile(TestFolder().Path("no such file.json"), text, error));
    EXPECT_EQ(error.Text(), "the file can't be read: No such file or directory");
}

TEST(ModelFileReadFile, Path_OfAFolder_IsAnErrorInTheSystemsWords) {
    std::string text;
    fnd_Finding error;
    EXPECT_FALSE(mdf_ReadFile(TestFolder().Path(), text, error));
    EXPECT_EQ(error.Text(), "the file can't be read: Is a directory");
    EXPECT_EQ(Line("x", error), "x: the file can't be read: Is a directory");
}
