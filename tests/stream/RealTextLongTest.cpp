#include "stream/RealTextReference.h"

#include <gtest/gtest.h>

#include <bit>
#include <cstdint>
#include <cstring>

namespace {

// The normal form on the printed text itself: quicker than the one that the other tests use.
bool AgreesInField(double value, int precision) {
    char expected[64];
    auto length =
        static_cast<std::size_t>(std::snprintf(expected, sizeof expected, "%12.*lg", precision, value));
    if (std::strpbrk(expected, ".eni") == nullptr) {
        const bool blank = expected[0] == ' ';
        if (blank) std::memmove(expected, expected + 1, length);
        length -= blank;
        expected[length++] = '.';
    }
    char text[64];
    const char* end = num_WriteReal(text, value, 12, precision);
    return static_cast<std::size_t>(end - text) == length && std::memcmp(text, expected, length) == 0;
}

// An odd step visits every pattern once before it repeats.
TEST(RealTextLong, HundredMillionFloatPatternsInTheCoordinateField_AgreeWithTheCLibrary) {
    std::uint32_t pattern = 12345;
    for (int i = 0; i < 100000000; ++i, pattern += 2654435769u) {
        const auto value = static_cast<double>(std::bit_cast<float>(pattern));
        ASSERT_TRUE(AgreesInField(value, 7)) << std::hexfloat << value;
    }
}

TEST(RealTextLong, TenMillionDoublePatternsAtSixAndFifteenDigits_AgreeWithTheCLibrary) {
    std::uint64_t pattern = 12345;
    for (int i = 0; i < 10000000; ++i, pattern += 11400714819323198485u) {
        const auto value = std::bit_cast<double>(pattern);
        ASSERT_TRUE(AgreesInField(value, 6)) << std::hexfloat << value;
        ASSERT_TRUE(AgreesInField(value, 15)) << std::hexfloat << value;
    }
}

} // namespace
