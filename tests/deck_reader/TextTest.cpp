#include "deck_reader/drd_Text.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <random>

namespace {

double Scanned(const std::string& text, bool& isNumber) {
    const char* at = text.c_str();
    double value = -777.0;
    isNumber = drd_ScanReal(at, value);
    return value;
}

} // namespace

TEST(Numbers, Reals_AreTheNearestOnes) {
    for (const char* text :
         {"0.", "-0.", "1", "1.", "+1.5", ".5", "-.25", "1e5", "1E-05", "1.79769e+308", "4.94066e-324",
          "123456789012345678901234567890.", "0.1", "3.4028235e38", "9007199254740993",
          "1.7976931348623157e308", "12345.678901234567890", "2.2250738585072011e-308"}) {
        bool isNumber = false;
        EXPECT_EQ(Scanned(text, isNumber), std::strtod(text, nullptr)) << text;
        EXPECT_TRUE(isNumber) << text;
    }
}

TEST(Numbers, RandomReals_AreTheNearestOnes) {
    std::mt19937_64 random(7);
    char text[64];
    for (int i = 0; i < 100000; ++i) {
        const double value =
            std::ldexp(static_cast<double>(random() >> 11U), static_cast<int>(random() % 160) - 110);
        std::snprintf(text, sizeof text, "%.*g", static_cast<int>(random() % 17) + 1, value);
        bool isNumber = false;
        ASSERT_EQ(Scanned(text, isNumber), std::strtod(text, nullptr)) << text;
    }
}

TEST(Numbers, TheExponentMayBeginWithD) {
    double value = 0.0;
    EXPECT_TRUE(drd_ReadReal("1.5d3", value));
    EXPECT_EQ(value, 1500.0);
    EXPECT_TRUE(drd_ReadReal(" -1.D-2 ", value));
    EXPECT_EQ(value, -0.01);
}

TEST(Numbers, WordsAndRests_AreNoNumbers) {
    for (const char* text :
         {"", " ", ".", "-", "nan", "inf", "1x", "1e", "1e+", "0x10", "--1", "1 2", "1.2.3", "e5"}) {
        bool isNumber = true;
        Scanned(text, isNumber);
        EXPECT_FALSE(isNumber) << text;
        int label = 0;
        EXPECT_FALSE(drd_ReadInt(text, label)) << text;
    }
}

TEST(Numbers, WholeNumbers_HaveTheirRange) {
    int value = 0;
    EXPECT_TRUE(drd_ReadInt("2147483647", value));
    EXPECT_EQ(value, 2147483647);
    EXPECT_TRUE(drd_ReadInt("-2147483648", value));
    EXPECT_FALSE(drd_ReadInt("2147483648", value));
    EXPECT_FALSE(drd_ReadInt("99999999999999999999", value));
    EXPECT_FALSE(drd_ReadInt("1.", value));
    const std::string line = " 12 , +7,8";
    const char* at = line.c_str();
    EXPECT_TRUE(drd_ScanInt(at, value));
    EXPECT_EQ(value, 12);
    EXPECT_TRUE(drd_ScanInt(at, value));
    EXPECT_EQ(value, 7);
    EXPECT_TRUE(drd_ScanInt(at, value));
    EXPECT_EQ(value, 8);
    EXPECT_EQ(at, nullptr);
}

TEST(Fields, CommasInQuotes_DontCut) {
    std::vector<std::string_view> fields;
    EXPECT_TRUE(drd_SplitFields("a, \"b, c\" ,, d,", fields));
    EXPECT_EQ(fields, (std::vector<std::string_view>{"a", "\"b, c\"", "", "d"}));
    EXPECT_FALSE(drd_SplitFields("a, \"b", fields));
    EXPECT_EQ(drd_Field("x, \"y,z\", w", 1), "\"y,z\"");
    EXPECT_EQ(drd_Field("x, y", 5), "");
}

TEST(NamesOfDecks, AreComparedWithoutQuotesAndCapitals) {
    EXPECT_EQ(drd_FoldKey(" Solid  Section "), "solidsection");
    EXPECT_EQ(drd_NameOf(" \"Two words\".TIP "), "Two words.TIP");
    EXPECT_EQ(drd_FoldName("\" Lead\""), " lead");
    EXPECT_EQ(drd_QuotedName("plain-1"), "plain-1");
    EXPECT_EQ(drd_QuotedName("two words"), "\"two words\"");
    EXPECT_EQ(drd_QuotedName("1st"), "\"1st\"");
}

TEST(Hints, TheNearestName_IsNoFarOne) {
    drd_Nearest near("Bondary");
    near.Try("Cload");
    near.Try("Boundary");
    EXPECT_EQ(near.Hint(), "did you mean 'Boundary'?");
    drd_Nearest far("Preprint");
    far.Try("Material");
    EXPECT_EQ(far.Hint(), "");
}
