#include "foundation/num_Truncated.h"

#include <gtest/gtest.h>

#include <limits>

TEST(NumTruncated, Fractions_AreCutTowardZero) {
    EXPECT_EQ(num_Truncated(4.9), 4);
    EXPECT_EQ(num_Truncated(-4.9), -4);
    EXPECT_EQ(num_Truncated(-0.5), 0);
    EXPECT_EQ(num_Truncated(2147483646.9), 2147483646);
}

TEST(NumTruncated, BeyondInt_IsTheNearestInt) {
    EXPECT_EQ(num_Truncated(1e300), std::numeric_limits<int>::max());
    EXPECT_EQ(num_Truncated(-1e300), std::numeric_limits<int>::min());
    EXPECT_EQ(num_Truncated(std::numeric_limits<double>::infinity()), std::numeric_limits<int>::max());
    EXPECT_EQ(num_Truncated(std::numeric_limits<double>::quiet_NaN()), 0);
}
