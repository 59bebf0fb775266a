#include "keyword_layer/qkw_ByName.h"

#include <gtest/gtest.h>

TEST(ByName, AName_HasADefaultValueUntilItIsWritten) {
    qkw_ByName<int> numbers;
    EXPECT_EQ(numbers.Find("A"), nullptr);
    EXPECT_EQ(numbers.GetOrInsert("A"), 0);
    numbers.GetOrInsert("A") = 7;
    numbers.GetOrInsert("B") = 8;
    ASSERT_NE(numbers.Find("A"), nullptr);
    EXPECT_EQ(*numbers.Find("A"), 7);
    EXPECT_EQ(numbers.Find("a"), nullptr);
}

TEST(ByName, Copies_GoTheirOwnWaysWhenOneIsWritten) {
    qkw_ByName<int> numbers;
    numbers.GetOrInsert("A") = 1;
    qkw_ByName<int> copy = numbers;
    EXPECT_EQ(copy.Find("A"), numbers.Find("A"));
    copy.GetOrInsert("A") = 2;
    copy.GetOrInsert("B") = 3;
    EXPECT_EQ(*numbers.Find("A"), 1);
    EXPECT_EQ(numbers.Find("B"), nullptr);
    EXPECT_EQ(*copy.Find("A"), 2);
}
