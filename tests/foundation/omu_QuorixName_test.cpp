#include "foundation/omu_QuorixName.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

void ExpectBare(const std::vector<std::string>& names) {
    for (const std::string& name : names) {
        EXPECT_EQ(omu_QuorixName::QuoteIfNeeded(cow_String(name)).View(), name);
    }
}

void ExpectQuoted(const std::vector<std::string>& names) {
    for (const std::string& name : names) {
        EXPECT_EQ(omu_QuorixName::QuoteIfNeeded(cow_String(name)).View(), "\"" + name + "\"");
    }
}

TEST(omu_QuorixName, EmptyName_StaysBare) {
    ExpectBare({""});
}

TEST(omu_QuorixName, PlainName_StaysBare) {
    ExpectBare({"a", "Z", "_", "Part-1", "_PickedSet12", "Set_A-2", "a1", "A-", "a--b"});
}

TEST(omu_QuorixName, NameThatBeginsWithDigitOrDash_IsQuoted) {
    ExpectQuoted({"1", "1a", "2024-Load", "-a", "-"});
}

TEST(omu_QuorixName, NameWithOtherCharacters_IsQuoted) {
    ExpectQuoted({"a b",  " ",    " a",   "a ",   "a,b", "a=b", "a*b", "a/b", "a(1)", "a:b",
                  "a;b",  "a'b",  "a\tb", "a\nb", "a+b", "a#1", "a$",  "a%",  "a&b",  "a@b",
                  "a\\b", "a[0]", "a|b",  "a~b",  "a!",  "a?",  "{a}", "<a>", "a^b",  "a`b"});
}

TEST(omu_QuorixName, BytesAbove127_AreQuoted) {
    ExpectQuoted({"\xc3\xa9", "caf\xc3\xa9", "a\x80", "a.\xff"});
}

TEST(omu_QuorixName, NameInDoubleQuotes_StaysAsItIs) {
    ExpectBare({"\"\"", "\"a b\"", "\"1\"", "\"a.b\"", "\"a,b\"", "\"a\".\"b\"", "\"a\"b\""});
}

TEST(omu_QuorixName, PrintedTwice_StaysTheSame) {
    for (const char* name : {"", "a", "a b", "1", "A.1", "A.b c", "\"", "\"a", "a\"", ".", "a."}) {
        const cow_String once = omu_QuorixName::QuoteIfNeeded(name);
        EXPECT_EQ(omu_QuorixName::QuoteIfNeeded(once), once) << name;
    }
}

TEST(omu_QuorixName, SingleDoubleQuote_IsQuoted) {
    ExpectQuoted({"\"", "\"a", "a\"", "a\"b"});
}

TEST(omu_QuorixName, DottedNameOfPlainTokens_StaysBare) {
    ExpectBare({"Part-1-1.Set-1", "A.B.C", "_A._B"});
}

TEST(omu_QuorixName, DigitBehindADot_MayBegin) {
    ExpectBare({"A.1", "A.1b.2-c"});
}

TEST(omu_QuorixName, DigitBeforeTheFirstDot_IsQuoted) {
    ExpectQuoted({"1.A", "1.1"});
}

TEST(omu_QuorixName, DashBehindADot_IsQuoted) {
    ExpectQuoted({"A.-1"});
}

TEST(omu_QuorixName, EmptyToken_IsQuoted) {
    ExpectQuoted({".", "a.", ".a", "a..b"});
}

TEST(omu_QuorixName, DottedNameWithQuotedTokens_StaysBare) {
    ExpectBare({"A.\"b c\"", "\"a b\".C", "A.\"\"", "A.\"b.c, d\".E"});
}

TEST(omu_QuorixName, DottedNameWithOneBadToken_IsQuotedAsAWhole) {
    ExpectQuoted({"A.b c", "a b.C", "\"a\".b c", "A.\"b", "A.b\"c.d\"", "\"a\"x.B"});
}

std::vector<std::string> Split(const cow_String& text) {
    std::vector<std::string> tokens;
    const cow_List<cow_String> list = rgx_split(text, "[\\.]");
    for (int i = 0; i < list.Length(); ++i) tokens.emplace_back(list[i].View());
    return tokens;
}

using Tokens = std::vector<std::string>;

TEST(rgx_split, DottedText_IsSplitAtEveryDot) {
    EXPECT_EQ(Split("A.B.C"), (Tokens{"A", "B", "C"}));
    EXPECT_EQ(Split("Part-1-1.Set-1"), (Tokens{"Part-1-1", "Set-1"}));
}

TEST(rgx_split, TextWithoutDot_IsOneToken) {
    EXPECT_EQ(Split("Set-1"), (Tokens{"Set-1"}));
}

TEST(rgx_split, EmptyTokens_AreKept) {
    EXPECT_EQ(Split("a."), (Tokens{"a", ""}));
    EXPECT_EQ(Split(".a"), (Tokens{"", "a"}));
    EXPECT_EQ(Split("a..b"), (Tokens{"a", "", "b"}));
    EXPECT_EQ(Split("."), (Tokens{"", ""}));
    EXPECT_EQ(Split(""), (Tokens{""}));
}

TEST(rgx_split, CharactersOfThePatternItself_DoNotSplit) {
    EXPECT_EQ(Split("a[0]\\b"), (Tokens{"a[0]\\b"}));
}

TEST(rgx_split, ClassOfSeveral_SplitsAtEach) {
    const cow_List<cow_String> tokens = rgx_split("a,b;c", "[,;]");
    EXPECT_EQ(tokens, (cow_List<cow_String>("a", "b", "c")));
}

} // namespace
