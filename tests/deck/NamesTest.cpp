#include "base/oif_Utils.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "support/DeckTest.h"

namespace {

std::string Printed(const char* name, bool isFileName = false) {
    return Streamed([&](utl_Stream& stream) { stream << qkw_QuorixName(name, isFileName); });
}

} // namespace

TEST(QuorixName, PlainName_GoesOutBare) {
    EXPECT_EQ(Printed("Part-1_a"), "Part-1_a");
}

TEST(QuorixName, NameWithBlank_IsQuoted) {
    EXPECT_EQ(Printed("My part"), "\"My part\"");
}

TEST(QuorixName, NameThatBeginsWithDigit_IsQuoted) {
    EXPECT_EQ(Printed("2nd"), "\"2nd\"");
}

TEST(QuorixName, NameWithNonAsciiLetter_IsQuoted) {
    EXPECT_EQ(Printed("Träger"), "\"Träger\"");
}

TEST(QuorixName, QuotedAndDottedNames_AreLeftUnchanged) {
    EXPECT_EQ(Printed("\"My part\""), "\"My part\"");
    EXPECT_EQ(Printed("I-1.SET"), "I-1.SET");
    EXPECT_EQ(Printed("\"I 1\".SET"), "\"I 1\".SET");
}

TEST(QuorixName, FileNameWithBlank_IsQuoted) {
    EXPECT_EQ(Printed("my file.fil", true), "\"my file.fil\"");
}

TEST(QuorixName, FileNameWithCommaAndNoBlank_StaysBareOnPurpose) {
    EXPECT_EQ(Printed("a,b.fil", true), "a,b.fil");
}

TEST(QuorixName, EmptyNames_StayEmpty) {
    EXPECT_EQ(Printed(""), "");
    EXPECT_EQ(Printed("", true), "");
}

TEST(QuorixName, SplitName_KeepsThePrefixWithItsDots) {
    cow_String prefix;
    cow_String last;
    qkw_QuorixName::SplitName("A.B.C", prefix, last);
    EXPECT_EQ(prefix, "A.B.");
    EXPECT_EQ(last, "C");
}

TEST(SetName, SplitName_IsThatOfNames) {
    cow_String prefix;
    cow_String last;
    oif_SetName::SplitName("A.B.C", prefix, last);
    EXPECT_EQ(prefix, "A.B.");
    EXPECT_EQ(last, "C");
}

TEST(QuorixName, SplitNameWithoutDot_AddsNothingToThePrefix) {
    cow_String prefix("kept");
    cow_String last;
    qkw_QuorixName::SplitName("A", prefix, last);
    EXPECT_EQ(prefix, "kept");
    EXPECT_EQ(last, "A");
}

TEST(QuorixName, SplitNameOfEmptyName_TouchesNothing) {
    cow_String prefix("p");
    cow_String last("l");
    qkw_QuorixName::SplitName("", prefix, last);
    EXPECT_EQ(prefix, "p");
    EXPECT_EQ(last, "l");
}

TEST(QuorixName, SplitNameTwice_AppendsToThePrefixOnPurpose) {
    cow_String prefix;
    cow_String last;
    qkw_QuorixName::SplitName("A.B", prefix, last);
    qkw_QuorixName::SplitName("C.D", prefix, last);
    EXPECT_EQ(prefix, "A.C.");
    EXPECT_EQ(last, "D");
}

TEST(Utils, CheckDataState_TakesSetAlwaysAndCarriedWithoutTheFlag) {
    using State = mdl_PropAttributeStateEnm;
    EXPECT_TRUE(oif_Utils::CheckDataState(State::SET, true));
    EXPECT_TRUE(oif_Utils::CheckDataState(State::SET, false));
    EXPECT_FALSE(oif_Utils::CheckDataState(State::CARRIED, true));
    EXPECT_TRUE(oif_Utils::CheckDataState(State::CARRIED, false));
    for (const State state : {State::NEVER_SET, State::CLEARED}) {
        EXPECT_FALSE(oif_Utils::CheckDataState(state, true));
        EXPECT_FALSE(oif_Utils::CheckDataState(state, false));
    }
}

TEST(Utils, SetDeactivateOpFlags_TouchesTheSecondOnlyWhenItDeactivates) {
    for (int status = 0; status <= 15; ++status) {
        bool first = status % 2 == 0;
        bool second = true;
        oif_Utils::SetDeactivateOpFlags(static_cast<mdl_PropagationStatusEnm>(status), first, second);
        const bool ends = status == 4 || status == 11;
        EXPECT_EQ(first, ends) << status;
        EXPECT_EQ(second, !ends) << status;
        second = false;
        oif_Utils::SetDeactivateOpFlags(static_cast<mdl_PropagationStatusEnm>(status), first, second);
        EXPECT_FALSE(second) << status;
    }
}

TEST(Utils, GetConnectorSetName_IsThePrintableForm) {
    EXPECT_EQ(oif_Utils::GetConnectorSetName("a b"), "\"a b\"");
    EXPECT_EQ(oif_Utils::GetConnectorSetName("ab"), "ab");
}
