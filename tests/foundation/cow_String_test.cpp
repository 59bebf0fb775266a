#include "foundation/cow_String.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>
#include <utility>

namespace {

TEST(cow_String, DefaultConstructed_ReadsAsEmptyText) {
    const cow_String text;
    EXPECT_EQ(text.Length(), 0);
    EXPECT_TRUE(text.IsEmpty());
    EXPECT_STREQ(text.CStr(), "");
    EXPECT_EQ(text, "");
}

TEST(cow_String, MadeFromNullPointer_IsEmpty) {
    const char* null = nullptr;
    EXPECT_EQ(cow_String(null).Length(), 0);
    EXPECT_STREQ(cow_String(null).CStr(), "");
}

TEST(cow_String, MadeFromText_HoldsItAndEndsWithZero) {
    const cow_String text("Part-1");
    EXPECT_EQ(text.Length(), 6);
    EXPECT_STREQ(text.CStr(), "Part-1");
    EXPECT_EQ(cow_String(std::string("Part-1")), text);
    EXPECT_EQ(cow_String(std::string_view("Part-1!", 6)), text);
}

TEST(cow_String, MadeFromBytesWithZero_KeepsAll) {
    const cow_String text(std::string_view("a\0b", 3));
    EXPECT_EQ(text.Length(), 3);
    EXPECT_EQ(text.View(), std::string_view("a\0b", 3));
    EXPECT_FALSE(text == cow_String("a"));
}

TEST(cow_String, MadeFromInt_IsDecimal) {
    EXPECT_EQ(cow_String(0), "0");
    EXPECT_EQ(cow_String(-17), "-17");
    EXPECT_EQ(cow_String(std::numeric_limits<int>::min()), "-2147483648");
    EXPECT_EQ(cow_String(std::numeric_limits<int>::max()), "2147483647");
}

TEST(cow_String, MadeFromReal_HasSixDigitsAndNoForcedPoint) {
    EXPECT_EQ(cow_String(210000.0), "210000");
    EXPECT_EQ(cow_String(2100000.0), "2.1e+06");
    EXPECT_EQ(cow_String(0.3), "0.3");
    EXPECT_EQ(cow_String(1e-5), "1e-05");
    EXPECT_EQ(cow_String(1.0 / 3.0), "0.333333");
    EXPECT_EQ(cow_String(-0.0), "-0");
    EXPECT_EQ(cow_String(1e100), "1e+100");
    EXPECT_EQ(cow_String(0.1F), "0.1");
    EXPECT_EQ(cow_String(7850.0F), "7850");
}

TEST(cow_String, Copied_SharesCharacters) {
    const cow_String text("shared");
    const cow_String copy(text);
    EXPECT_EQ(copy.CStr(), text.CStr());
}

TEST(cow_String, CopyAppended_LeavesOriginal) {
    const cow_String text("Set");
    cow_String copy(text);
    copy.Append("-1");
    EXPECT_EQ(text, "Set");
    EXPECT_EQ(copy, "Set-1");
}

TEST(cow_String, MovedFrom_IsEmptyAndUsable) {
    cow_String text("gone");
    const cow_String taken(std::move(text));
    EXPECT_EQ(taken, "gone");
    EXPECT_EQ(text, ""); // NOLINT(bugprone-use-after-move)
    text.Append("back");
    EXPECT_EQ(text, "back");
}

TEST(cow_String, AssignedToItself_Stays) {
    cow_String text("same");
    const cow_String& alias = text;
    text = alias;
    EXPECT_EQ(text, "same");
}

TEST(cow_String, AppendForms_Join) {
    cow_String text;
    text.Append("a").Append(cow_String("bc")) += "d";
    text += cow_String("e");
    EXPECT_EQ(text, "abcde");
    EXPECT_EQ(cow_String("x") + cow_String("y"), "xy");
    EXPECT_EQ(cow_String("x") + "y", "xy");
}

TEST(cow_String, AppendEmptyOrNull_ChangesNothing) {
    cow_String text("a");
    const char* characters = text.CStr();
    text.Append("");
    text.Append(static_cast<const char*>(nullptr));
    text.Append(cow_String());
    EXPECT_EQ(text.CStr(), characters);
    EXPECT_EQ(text, "a");
}

TEST(cow_String, AppendedToItself_Doubles) {
    cow_String text("ab");
    text.Append(text);
    EXPECT_EQ(text, "abab");
    text.Append(text.CStr() + 3);
    EXPECT_EQ(text, "ababb");
}

TEST(cow_String, AppendWithOffsetAndLength_TakesThatPiece) {
    cow_String text("<");
    text.Append(cow_String("abcdef"), 2, 3);
    EXPECT_EQ(text, "<cde");
}

TEST(cow_String, AppendPieceOutsideText_TakesWhatIsThere) {
    const cow_String source("abc");
    EXPECT_EQ(cow_String().Append(source, 1, 99), "bc");
    EXPECT_EQ(cow_String().Append(source, 3, 1), "");
    EXPECT_EQ(cow_String().Append(source, 99, 1), "");
    EXPECT_EQ(cow_String().Append(source, -5, 2), "ab");
    EXPECT_EQ(cow_String().Append(source, 0, -1), "");
    EXPECT_EQ(cow_String().Append(source, std::numeric_limits<int>::max(), std::numeric_limits<int>::max()),
              "");
}

TEST(cow_String, Find_GivesFirstPlaceFromPosition) {
    const cow_String text("a.b.c");
    EXPECT_EQ(text.Find("."), 1);
    EXPECT_EQ(text.Find(".", 1), 1);
    EXPECT_EQ(text.Find(".", 2), 3);
    EXPECT_EQ(text.Find(".", 4), -1);
    EXPECT_EQ(text.Find("b.c", 0), 2);
    EXPECT_EQ(text.Find("x"), -1);
}

TEST(cow_String, FindFromOutside_FindsNothing) {
    const cow_String text("abc");
    EXPECT_EQ(text.Find("a", -1), -1);
    EXPECT_EQ(text.Find("a", 4), -1);
    EXPECT_EQ(text.Find("", 3), 3);
    EXPECT_EQ(cow_String().Find("a"), -1);
}

TEST(cow_String, Compared_MindsCapitalsAndLength) {
    EXPECT_TRUE(cow_String("a") == cow_String("a"));
    EXPECT_TRUE(cow_String("a") != cow_String("A"));
    EXPECT_TRUE(cow_String("a") != "ab");
    EXPECT_TRUE(cow_String() == cow_String(""));
}

TEST(cow_String, Ordered_ByUnsignedBytes) {
    EXPECT_LT(cow_String("a"), cow_String("b"));
    EXPECT_LT(cow_String("a"), cow_String("ab"));
    EXPECT_LT(cow_String("Z"), cow_String("a"));
    EXPECT_LT(cow_String("z"), cow_String("\xc3\xa9"));
    EXPECT_LT(cow_String(), cow_String("a"));
}

} // namespace
