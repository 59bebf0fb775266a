#include "model_file/mdf_Utf8.h"

#include <gtest/gtest.h>

TEST(ModelFileUtf8, Length_OfCharactersOfEveryWidth_IsTheirNumberOfBytes) {
    EXPECT_EQ(mdf_Utf8Length("a"), 1u);
    EXPECT_EQ(mdf_Utf8Length(std::string_view("\0", 1)), 1u);
    EXPECT_EQ(mdf_Utf8Length("\xC3\xA9x"), 2u);
    EXPECT_EQ(mdf_Utf8Length("\xE2\x82\xAC"), 3u);
    EXPECT_EQ(mdf_Utf8Length("\xF0\x9F\x98\x80"), 4u);
    EXPECT_EQ(mdf_Utf8Length("\xF4\x8F\xBF\xBF"), 4u);
}

TEST(ModelFileUtf8, Length_OfWhatIsNoCharacter_IsZero) {
    EXPECT_EQ(mdf_Utf8Length(""), 0u);
    EXPECT_EQ(mdf_Utf8Length("\x80"), 0u) << "the middle of a character";
    EXPECT_EQ(mdf_Utf8Length("\xC3"), 0u) << "cut";
    EXPECT_EQ(mdf_Utf8Length("\xC3("), 0u) << "broken off";
    EXPECT_EQ(mdf_Utf8Length("\xC1\x81"), 0u) << "two bytes where one is enough";
    EXPECT_EQ(mdf_Utf8Length("\xE0\x9F\xBF"), 0u) << "three bytes where two are enough";
    EXPECT_EQ(mdf_Utf8Length("\xF0\x8F\xBF\xBF"), 0u) << "four bytes where three are enough";
    EXPECT_EQ(mdf_Utf8Length("\xED\xA0\x80"), 0u) << "half a surrogate pair";
    EXPECT_EQ(mdf_Utf8Length("\xF4\x90\x80\x80"), 0u) << "beyond the last character";
    EXPECT_EQ(mdf_Utf8Length("\xFF"), 0u);
}

TEST(ModelFileUtf8, Beginning_CutsNoCharacter) {
    EXPECT_EQ(mdf_Utf8Beginning("abc", 2), "ab");
    EXPECT_EQ(mdf_Utf8Beginning("abc", 3), "abc");
    EXPECT_EQ(mdf_Utf8Beginning("a\xC3\xA9", 2), "a");
    EXPECT_EQ(mdf_Utf8Beginning("\xE2\x82\xAC!", 2), "");
    EXPECT_EQ(mdf_Utf8Beginning("\xFF\xFF", 1), "\xFF");
}

TEST(ModelFileUtf8, End_BeginsWithAWholeCharacter) {
    EXPECT_EQ(mdf_Utf8End("abc", 2), "bc");
    EXPECT_EQ(mdf_Utf8End("abc", 9), "abc");
    EXPECT_EQ(mdf_Utf8End("\xC3\xA9x", 2), "x");
    EXPECT_EQ(mdf_Utf8End("\xE2\x82\xACxy", 3), "xy");
    EXPECT_EQ(mdf_Utf8End("", 3), "");
}

TEST(ModelFileUtf8, HexOf_HasTwoDigits) {
    EXPECT_EQ(mdf_HexOf(0x0A), "0A");
    EXPECT_EQ(mdf_HexOf(0xF3), "F3");
}
