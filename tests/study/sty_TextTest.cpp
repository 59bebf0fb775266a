#include "model_file/mdf_Parameters.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Pointer.h"

#include <gtest/gtest.h>

namespace {

mdf_Value Parsed(std::string_view text) {
    mdf_Value value;
    std::vector<fnd_Finding> errors;
    EXPECT_TRUE(mdf_Parse(text, value, errors)) << text;
    return value;
}

bool Allows(std::string_view limits, double value) {
    const auto range = mdf_Limits::Of(limits);
    EXPECT_TRUE(range) << limits;
    return range && range->Allow(value);
}

/// The document with a value put at the pointer, as text.
std::string With(std::string_view document, std::string_view pointer, std::string_view value) {
    mdf_Value root = Parsed(document);
    mdf_PutAt(root, *mdf_PointerTokens(pointer), Parsed(value));
    return mdf_JsonText(root);
}

} // namespace

TEST(mdf_Limits, Comparisons_AreTakenWithAndWithoutTheirEnds) {
    EXPECT_TRUE(Allows("> 0", 1e-300));
    EXPECT_FALSE(Allows("> 0", 0));
    EXPECT_TRUE(Allows(">=0", 0));
    EXPECT_TRUE(Allows("> 0, <= 20", 20));
    EXPECT_FALSE(Allows("> 0, < 20", 20));
    EXPECT_FALSE(Allows("<= -1e3 , >= -2e3", -2001));
    EXPECT_TRUE(Allows("0.5 .. 20", 0.5));
    EXPECT_FALSE(Allows("0.5..20", 20.001));
    EXPECT_TRUE(Allows(".. 3", -1e9));
    EXPECT_FALSE(Allows("3 ..", 2));
}

TEST(mdf_Limits, TextsThatAreNone_AreTold) {
    for (const char* text :
         {"", "positive", "> ", "> 0,", "> 0, > 1", "5 .. 1", "..", "1 .. x", "> inf", "= 3", "0 < 3"})
        EXPECT_FALSE(mdf_Limits::Of(text)) << text;
}

TEST(mdf_PointerTokens, Escapes_StandForSlashAndTilde) {
    EXPECT_EQ(*mdf_PointerTokens("/a~1b/~01/c d"), (std::vector<std::string>{"a/b", "~1", "c d"}));
    EXPECT_EQ(*mdf_PointerTokens(""), std::vector<std::string>());
    EXPECT_EQ(*mdf_PointerTokens("/"), std::vector<std::string>{""});
    for (const char* text : {"a", "/a~", "/a~2"}) EXPECT_FALSE(mdf_PointerTokens(text)) << text;
}

TEST(fnd_IsBelow, OnlyWholeTokensCount) {
    EXPECT_TRUE(fnd_IsBelow("/a/b", "/a"));
    EXPECT_TRUE(fnd_IsBelow("/a", "/a"));
    EXPECT_FALSE(fnd_IsBelow("/ab", "/a"));
    EXPECT_FALSE(fnd_IsBelow("/a", "/a/b"));
}

TEST(mdf_HasPlace, InArraysOfAnyForm_FindsItems) {
    const mdf_Value root =
        Parsed(R"({"i": [1, 2], "r": [1.5, 2], "m": [[1, 2], [3, 4]], "f": [[1, "S1"]], "o": [{"a": 1}]})");
    const auto has = [&](const char* pointer) { return mdf_HasPlace(root, *mdf_PointerTokens(pointer)); };
    for (const char* pointer : {"", "/i/1", "/r/0", "/m/1/0", "/f/0/1", "/o/0/a"})
        EXPECT_TRUE(has(pointer)) << pointer;
    for (const char* pointer : {"/x", "/i/2", "/i/01", "/i/-", "/i/-1", "/i/1/0", "/m/1/2", "/o/0/b", "/o/a"})
        EXPECT_FALSE(has(pointer)) << pointer;
}

TEST(mdf_PutAt, InArrays_GivesTheFormThatTheirItemsHave) {
    EXPECT_EQ(With(R"({"a": [1, 2, 3]})", "/a/1", "5"), R"({"a": [1, 5, 3]})");
    EXPECT_EQ(With(R"({"a": [[1, 2], [3, 4]]})", "/a/1/0", "2.5"), R"({"a": [[1, 2], [2.5, 4]]})");
    EXPECT_EQ(With(R"({"a": [[1, "S1"], [2, "S2"]]})", "/a/1/1", "\"S6\""),
              R"({"a": [[1, "S1"], [2, "S6"]]})");
    EXPECT_EQ(With(R"({"a": [{"b": [1]}]})", "/a/0/b/0", "[2, 3]"), R"({"a": [{"b": [[2, 3]]}]})");

    mdf_Value root = Parsed(R"({"a": [1, "x"], "m": [[1, 2], [3, 4]]})");
    mdf_PutAt(root, *mdf_PointerTokens("/a/1"), Parsed("2"));
    EXPECT_EQ(root.Find("a")->Kind(), mdf_Kind::IntArray);
    mdf_PutAt(root, *mdf_PointerTokens("/m/0/0"), Parsed("9"));
    EXPECT_EQ(root.Find("m")->Kind(), mdf_Kind::Matrix);
    EXPECT_TRUE(root.Find("m")->AllInts());
}
