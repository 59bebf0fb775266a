#include "foundation/omi_IntTable.h"

#include "foundation/cow_String.h"
#include "foundation/omi_Singleton.h"

#include <gtest/gtest.h>

namespace {

TEST(omi_IntTable, KeyNeverEntered_GivesDefault) {
    const omi_IntTable<cow_String> table;
    EXPECT_EQ(table.ConstGet(0), "");
    EXPECT_EQ(table.ConstGet(-1), "");
    EXPECT_EQ(table.ConstGet(1000000), "");
}

TEST(omi_IntTable, KeyBetweenEntered_GivesDefault) {
    omi_IntTable<int> table;
    table.Insert(5, 50);
    EXPECT_EQ(table.ConstGet(4), 0);
    EXPECT_EQ(table.ConstGet(5), 50);
    EXPECT_EQ(table.ConstGet(6), 0);
}

TEST(omi_IntTable, SameMagnitudeOfBothSigns_AreTwoEntries) {
    omi_IntTable<cow_String> table;
    table.Insert(3, "plus");
    table.Insert(-3, "minus");
    table.Insert(0, "zero");
    EXPECT_EQ(table.ConstGet(3), "plus");
    EXPECT_EQ(table.ConstGet(-3), "minus");
    EXPECT_EQ(table.ConstGet(0), "zero");
}

TEST(omi_IntTable, KeyEnteredTwice_KeepsTheLast) {
    omi_IntTable<int> table;
    table.Insert(2, 1);
    table.Insert(2, 9);
    EXPECT_EQ(table.ConstGet(2), 9);
}

TEST(omi_Singleton, AskedTwice_GivesTheSame) {
    struct Counter {
        int value = 0;
    };
    omi_Singleton<Counter>::Instance().value = 3;
    EXPECT_EQ(omi_Singleton<Counter>::Instance().value, 3);
}

} // namespace
