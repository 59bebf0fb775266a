#include "stream/RealTextReference.h"

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <random>

namespace {

std::mt19937_64 Generator() {
    return std::mt19937_64(20240229);
}

void ExpectAgreement(double value, int width, int precision) {
    if (!reference::Agrees(value, width, precision)) {
        ADD_FAILURE() << std::hexfloat << value << std::defaultfloat << " in (" << width << ", " << precision
                      << "): '" << reference::WrittenText(value, width, precision) << "', expected '"
                      << reference::RealText(value, width, precision) << "'";
    }
}

TEST(RealTextDifferential, RandomFloatPatternsInTheCoordinateField_AgreeWithTheCLibrary) {
    auto random = Generator();
    for (int i = 0; i < 1000000; ++i) {
        const auto pattern = static_cast<std::uint32_t>(random());
        ExpectAgreement(static_cast<double>(std::bit_cast<float>(pattern)), 12, 7);
    }
}

TEST(RealTextDifferential, CoordinatesAsSuch_AreTheTextOfTheirField) {
    auto random = Generator();
    const auto check = [](std::uint32_t pattern) {
        const auto value = std::bit_cast<float>(pattern);
        char text[128];
        char expected[128];
        const std::string_view written(text, static_cast<std::size_t>(num_WriteFloat(text, value) - text));
        const char* const end = num_WriteReal(expected, value, 12, 7);
        EXPECT_EQ(written, std::string_view(expected, static_cast<std::size_t>(end - expected))) << pattern;
    };
    for (int i = 0; i < 1000000; ++i) {
        check(static_cast<std::uint32_t>(random()));
        // Of everyday size, where the work is done another way, and at both ends of that.
        check(static_cast<std::uint32_t>((random() % 45 + 110) << 23 | (random() & 0x807fffff)));
    }
    for (int i = 0; i < 5000; ++i) {
        for (const double scale : {1e-4, 1e-3, 0.01, 0.1, 1.0, 10.0, 1e3, 1e5, 1e6})
            check(std::bit_cast<std::uint32_t>(static_cast<float>((i + 0.5) * scale)));
    }
}

TEST(RealTextDifferential, RandomDoublePatternsInTheFormsInUse_AgreeWithTheCLibrary) {
    auto random = Generator();
    for (int i = 0; i < 400000; ++i) {
        const double value = std::bit_cast<double>(random());
        ExpectAgreement(value, 0, 6);
        ExpectAgreement(value, 12, 6);
        ExpectAgreement(value, 12, 15);
    }
}

TEST(RealTextDifferential, ValuesOfEverydaySize_AgreeWithTheCLibraryInEveryForm) {
    auto random = Generator();
    std::uniform_real_distribution<double> exponent(-12.0, 18.0);
    std::uniform_real_distribution<double> mantissa(-10.0, 10.0);
    for (int width = 0; width <= 20; ++width) {
        for (int precision = 0; precision <= 18; ++precision) {
            for (int i = 0; i < 800; ++i) {
                ExpectAgreement(mantissa(random) * std::pow(10.0, exponent(random)), width, precision);
            }
        }
    }
}

TEST(RealTextDifferential, ShortDecimals_AgreeWithTheCLibrary) {
    auto random = Generator();
    for (int i = 0; i < 300000; ++i) {
        const double value = static_cast<double>(static_cast<std::int64_t>(random() % 20000001) - 10000000) /
                             std::pow(10.0, static_cast<double>(random() % 12));
        ExpectAgreement(value, 12, 6);
        ExpectAgreement(value, 12, 7);
        ExpectAgreement(value, 12, 15);
    }
}

TEST(RealTextDifferential, ExactTies_AgreeWithTheCLibrary) {
    auto random = Generator();
    for (int i = 0; i < 300000; ++i) {
        const double value =
            std::ldexp(static_cast<double>(random() % 20000000), static_cast<int>(random() % 24) - 12);
        for (const int precision : {1, 5, 6, 7, 15, 16}) ExpectAgreement(value, 12, precision);
    }
}

TEST(RealTextDifferential, NeighboursOfPowersOfTenAndTwo_AgreeWithTheCLibrary) {
    for (int exponent = -324; exponent <= 308; ++exponent) {
        double value = std::strtod(("1e" + std::to_string(exponent)).c_str(), nullptr);
        for (int i = 0; i < 4; ++i) value = std::nextafter(value, 0.0);
        for (int i = 0; i < 9; ++i, value = std::nextafter(value, HUGE_VAL)) {
            for (int precision = 1; precision <= 17; ++precision) ExpectAgreement(value, 12, precision);
        }
    }
    for (int exponent = -1074; exponent <= 1023; ++exponent) {
        const double value = std::ldexp(1.0, exponent);
        for (const double near : {std::nextafter(value, 0.0), value, std::nextafter(value, HUGE_VAL)}) {
            for (int precision = 1; precision <= 17; ++precision) ExpectAgreement(-near, 12, precision);
        }
    }
}

} // namespace
