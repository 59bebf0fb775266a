#include "model_file/mdf_Token.h"

#include <gtest/gtest.h>

TEST(ModelFileToken, HasComments_OnlyOutsideOfStrings) {
    EXPECT_TRUE(mdf_HasComments("{} // end"));
    EXPECT_TRUE(mdf_HasComments("{\"a\": /* one */ 1}"));
    EXPECT_FALSE(mdf_HasComments("{\"a//b\": \"/* c */\"}"));
    EXPECT_FALSE(mdf_HasComments("{\"\\\"//\": 1}"));
    EXPECT_TRUE(mdf_HasComments("{\"\\\\\": 1} //"));
}

TEST(ModelFileToken, SkipBlanksAndComments_StopsAtTokensAndAtCommentsThatAreLeftOpen) {
    EXPECT_EQ(mdf_SkipBlanksAndComments(" \t\r\n[", 0), 4u);
    EXPECT_EQ(mdf_SkipBlanksAndComments("// a\n/* b */1", 0), 12u);
    EXPECT_EQ(mdf_SkipBlanksAndComments("// a", 0), 4u);
    EXPECT_EQ(mdf_SkipBlanksAndComments(" /* a", 0), 1u);
    EXPECT_EQ(mdf_SkipBlanksAndComments("/", 0), 0u);
}

TEST(ModelFileToken, ProblemOf_GoodTokens_IsNone) {
    for (const char* token :
         {"[", "}", ":", "true", "null,", "-1.5e+3", "0", "\"a\\u00e9\\n\"", "\"\\ud83d\\ude00\""}) {
        const std::string_view text(token);
        EXPECT_EQ(mdf_ProblemOf(text, 0, text.size()).reason, "") << token;
    }
}

TEST(ModelFileToken, ProblemOf_BrokenTokens_TellsWhereTheyBreak) {
    const auto reason = [](std::string_view text) { return mdf_ProblemOf(text, 0, text.size()).reason; };
    EXPECT_EQ(reason("-x"), "invalid number; expected a digit after '-'");
    EXPECT_EQ(reason("1."), "invalid number; expected a digit after '.'");
    EXPECT_EQ(reason("1e"), "invalid number; expected '+', '-' or a digit after 'e'");
    EXPECT_EQ(reason("1e-"), "invalid number; expected a digit after the sign of the exponent");
    EXPECT_EQ(reason("\"a"), "invalid string: missing closing quote");
    EXPECT_EQ(reason("\"\\"), "invalid string: missing closing quote");
    EXPECT_EQ(reason("\"\\u12"), "invalid string: four hexadecimal digits must follow \\u");
    EXPECT_EQ(reason("nil"), "invalid literal");
    EXPECT_EQ(reason("/*"), "invalid comment; missing closing '*/'");
    EXPECT_EQ(reason("/ 2"), "invalid comment; expected '/' or '*' after '/'");
}

TEST(ModelFileToken, Quoted_ShowsOddBytesAndCutsLongTexts) {
    EXPECT_EQ(mdf_QuotedToken("a\x01\xFF\xC3\xA9"), "'a\\x01\\xFF\xC3\xA9'");
    EXPECT_EQ(mdf_QuotedToken(std::string(50, 'x')), "'" + std::string(40, 'x') + "...'");
}
