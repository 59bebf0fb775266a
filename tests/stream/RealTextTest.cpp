#include "foundation/num_RealText.h"
#include "foundation/utl_Stream.h"

#include "stream/RealTextReference.h"

#include <gtest/gtest.h>

#include <cstring>
#include <limits>

namespace {

std::string Real(double value, int width, int precision) {
    return reference::WrittenText(value, width, precision);
}

std::string Int(int value, int width) {
    std::vector<char> memory(num_IntRoom(width));
    const char* end = num_WriteInt(memory.data(), value, width);
    return {static_cast<const char*>(memory.data()), end};
}

std::string Fixed(const char* text, int width) {
    char memory[64];
    std::strcpy(memory, text);
    utl_Stream::FixNumericString(memory, width);
    return memory;
}

TEST(FixNumericString, IntegerText_GetsAPoint) {
    EXPECT_EQ(Fixed("10", 0), "10.");
    EXPECT_EQ(Fixed("-0", 0), "-0.");
    EXPECT_EQ(Fixed("210000", 0), "210000.");
}

TEST(FixNumericString, RealText_Stays) {
    for (const char* text : {"0.5", "1e-05", "1e+20", "1E+20", "-3.25", "inf", "-inf", "INF", "nan", "NAN"}) {
        EXPECT_EQ(Fixed(text, 0), text);
    }
}

TEST(FixNumericString, LeadingBlank_MakesRoomForThePoint) {
    EXPECT_EQ(Fixed("          10", 12), "         10.");
    EXPECT_EQ(Fixed(" 1", 2), "1.");
}

TEST(FixNumericString, TextAsWideAsTheField_GrowsByOne) {
    EXPECT_EQ(Fixed("1234567", 7), "1234567.");
}

TEST(FixNumericString, WithoutField_LosesLeadingBlanks) {
    EXPECT_EQ(Fixed("   7", 0), "7.");
    EXPECT_EQ(Fixed("   7.5", 0), "7.5");
}

TEST(FixNumericString, EmptyText_StaysEmpty) {
    EXPECT_EQ(Fixed("", 12), "");
    EXPECT_EQ(Fixed("   ", 12), "");
    utl_Stream::FixNumericString(nullptr, 12);
}

TEST(RealText, SixDigitsWithoutField_ReadAsTheDeckWantsThem) {
    EXPECT_EQ(Real(0.0, 0, 6), "0.");
    EXPECT_EQ(Real(-0.0, 0, 6), "-0.");
    EXPECT_EQ(Real(1.0, 0, 6), "1.");
    EXPECT_EQ(Real(0.3, 0, 6), "0.3");
    EXPECT_EQ(Real(7.85e-9, 0, 6), "7.85e-09");
    EXPECT_EQ(Real(210000.0, 0, 6), "210000.");
    EXPECT_EQ(Real(999999.0, 0, 6), "999999.");
    EXPECT_EQ(Real(1000000.0, 0, 6), "1e+06");
    EXPECT_EQ(Real(1234567.0, 0, 6), "1.23457e+06");
    EXPECT_EQ(Real(-1e100, 0, 6), "-1e+100");
    EXPECT_EQ(Real(5e-324, 0, 6), "4.94066e-324");
    EXPECT_EQ(Real(std::numeric_limits<double>::max(), 0, 6), "1.79769e+308");
}

TEST(RealText, ExponentBelowMinusFour_TurnsToTheExponentForm) {
    EXPECT_EQ(Real(0.0001, 0, 6), "0.0001");
    EXPECT_EQ(Real(0.00012345, 0, 6), "0.00012345");
    EXPECT_EQ(Real(0.00001, 0, 6), "1e-05");
    EXPECT_EQ(Real(0.000099999999, 0, 6), "0.0001");
}

TEST(RealText, RoundingUpToThePowerOfTen_MovesTheExponent) {
    EXPECT_EQ(Real(999999.5, 0, 6), "1e+06");
    EXPECT_EQ(Real(9.9999996, 0, 6), "10.");
    EXPECT_EQ(Real(0.99999996, 0, 6), "1.");
}

TEST(RealText, ExactTie_GoesToTheEvenDigit) {
    EXPECT_EQ(Real(0.5, 12, 0), "         0.5");
    EXPECT_EQ(Real(2.5, 0, 1), "2.");
    EXPECT_EQ(Real(3.5, 0, 1), "4.");
    EXPECT_EQ(Real(1000000.5, 0, 7), "1000000.");
    EXPECT_EQ(Real(1000001.5, 0, 7), "1000002.");
    EXPECT_EQ(Real(1234565.0, 0, 6), "1.23456e+06");
    EXPECT_EQ(Real(1234575.0, 0, 6), "1.23458e+06");
}

TEST(RealText, PowersOfTwoAtARoundingEdge_DoNotOverflow) {
    EXPECT_EQ(Real(1.75, 0, 1), "2.");
    EXPECT_EQ(Real(15.75, 0, 2), "16.");
    EXPECT_EQ(Real(8388607.75, 0, 7), "8388608.");
}

TEST(RealText, CoordinateField_IsTwelveWide) {
    EXPECT_EQ(Real(0.0, 12, 7), "          0.");
    EXPECT_EQ(Real(-0.0, 12, 7), "         -0.");
    EXPECT_EQ(Real(1.5, 12, 7), "         1.5");
    EXPECT_EQ(Real(-123.4567, 12, 7), "   -123.4567");
    EXPECT_EQ(Real(1.2345674e-5f, 12, 7), "1.234567e-05");
    EXPECT_EQ(Real(1e10, 12, 7), "       1e+10");
}

TEST(RealText, NegativeExponentFormAtSevenDigits_RunsOverTheField) {
    EXPECT_EQ(Real(-1.234567e-05, 12, 7), "-1.234567e-05");
}

TEST(RealText, Float_IsTheTextOfItsExactValue) {
    char text[64];
    const char* end = num_WriteReal(text, 0.1f, 12, 7);
    EXPECT_EQ(std::string(static_cast<const char*>(text), end), "         0.1");
    end = num_WriteReal(text, 0.1f, 0, 15);
    EXPECT_EQ(std::string(static_cast<const char*>(text), end), "0.100000001490116");
}

TEST(RealText, FifteenDigits_RunOverAFieldOfTwelve) {
    EXPECT_EQ(Real(0.123456789012345, 12, 15), "0.123456789012345");
    EXPECT_EQ(Real(1.0, 12, 15), "          1.");
    EXPECT_EQ(Real(100000000000000.0, 12, 15), "100000000000000.");
    EXPECT_EQ(Real(1e15, 12, 15), "       1e+15");
    EXPECT_EQ(Real(0.1, 12, 15), "         0.1");
    EXPECT_EQ(Real(-2.0 / 3.0, 12, 15), "-0.666666666666667");
}

TEST(RealText, FieldWithoutPrecision_MeansOneDigit) {
    EXPECT_EQ(Real(123.0, 12, 0), "       1e+02");
    EXPECT_EQ(Real(7.3, 12, 0), "          7.");
}

TEST(RealText, NeitherFieldNorPrecision_MeansSixDigits) {
    EXPECT_EQ(Real(123.4567891, 0, 0), "123.457");
}

TEST(RealText, InfinityAndNan_GetNoPoint) {
    const double infinity = std::numeric_limits<double>::infinity();
    EXPECT_EQ(Real(infinity, 12, 6), "         inf");
    EXPECT_EQ(Real(-infinity, 0, 6), "-inf");
    EXPECT_EQ(Real(std::numeric_limits<double>::quiet_NaN(), 0, 6), "nan");
}

TEST(RealText, WideField_IsFilledWithBlanks) {
    EXPECT_EQ(Real(1.5, 60, 6), std::string(57, ' ') + "1.5");
    EXPECT_EQ(Real(0.0, 60, 6), std::string(58, ' ') + "0.");
    EXPECT_EQ(Real(1.5, 60, 15), std::string(57, ' ') + "1.5");
}

TEST(RealText, MorePrecisionThanADoubleHolds_GivesItsExactDigits) {
    EXPECT_EQ(Real(0.1, 0, 40), "0.1000000000000000055511151231257827021182");
}

TEST(IntText, Field_IsRightAligned) {
    EXPECT_EQ(Int(1, 7), "      1");
    EXPECT_EQ(Int(1234567, 7), "1234567");
    EXPECT_EQ(Int(0, 7), "      0");
    EXPECT_EQ(Int(-42, 7), "    -42");
    EXPECT_EQ(Int(12, 20), std::string(18, ' ') + "12");
}

TEST(IntText, WiderNumber_IsNotCut) {
    EXPECT_EQ(Int(12345678, 7), "12345678");
    EXPECT_EQ(Int(123456789, 7), "123456789");
    EXPECT_EQ(Int(-1234567, 7), "-1234567");
}

TEST(IntText, WithoutField_IsTheDigitsAlone) {
    EXPECT_EQ(Int(0, 0), "0");
    EXPECT_EQ(Int(99999999, 0), "99999999");
    EXPECT_EQ(Int(100000000, 0), "100000000");
    EXPECT_EQ(Int(std::numeric_limits<int>::min(), 0), "-2147483648");
    EXPECT_EQ(Int(std::numeric_limits<int>::max(), 0), "2147483647");
}

TEST(IntText, EveryDigitCountAndWidth_AgreesWithTheCLibrary) {
    for (int width = 0; width <= 24; ++width) {
        for (long long value = 1; value <= 2147483647; value *= 10) {
            for (const long long near : {value - 1, value, -value}) {
                char expected[64];
                std::snprintf(expected, sizeof expected, "%*d", width, static_cast<int>(near));
                EXPECT_EQ(Int(static_cast<int>(near), width), expected);
            }
        }
    }
}

} // namespace
