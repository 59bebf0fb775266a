#include "foundation/cel_LabelIndex.h"

#include <gtest/gtest.h>

#include <limits>

namespace {

using Ints = std::vector<int>;

TEST(LabelIndex, LabelsThatRunWithoutAGap_AreFound) {
    cel_LabelIndex index;
    EXPECT_TRUE(index.Build(Ints{5, 6, 7, 8}).empty());
    EXPECT_EQ(index.Find(4), -1);
    EXPECT_EQ(index.Find(5), 0);
    EXPECT_EQ(index.Find(8), 3);
    EXPECT_EQ(index.Find(9), -1);
}

TEST(LabelIndex, DenseLabelsInAnyOrder_AreFound) {
    cel_LabelIndex index;
    EXPECT_TRUE(index.Build(Ints{30, 10, 20, 11}).empty());
    EXPECT_EQ(index.Find(30), 0);
    EXPECT_EQ(index.Find(10), 1);
    EXPECT_EQ(index.Find(20), 2);
    EXPECT_EQ(index.Find(11), 3);
    for (const int absent : {9, 12, 19, 29, 31, 0, -1}) EXPECT_EQ(index.Find(absent), -1) << absent;
}

TEST(LabelIndex, SparseLabels_AreFound) {
    cel_LabelIndex index;
    const int largest = std::numeric_limits<int>::max();
    EXPECT_TRUE(index.Build(Ints{largest, 1, 1000000}).empty());
    EXPECT_EQ(index.Find(largest), 0);
    EXPECT_EQ(index.Find(1), 1);
    EXPECT_EQ(index.Find(1000000), 2);
    for (const int absent : {0, 2, 999999, 1000001, largest - 1, -1})
        EXPECT_EQ(index.Find(absent), -1) << absent;
}

TEST(LabelIndex, RepeatedLabels_KeepTheFirstPlace) {
    cel_LabelIndex index;
    EXPECT_EQ(index.Build(Ints{7, 8, 7, 9, 8, 7}), (Ints{2, 4, 5}));
    EXPECT_EQ(index.Find(7), 0);
    EXPECT_EQ(index.Find(8), 1);
    EXPECT_EQ(index.Build(Ints{1000000, 1, 1000000, 50, 1}), (Ints{2, 4}));
    EXPECT_EQ(index.Find(1000000), 0);
    EXPECT_EQ(index.Find(1), 1);
    EXPECT_EQ(index.Find(50), 3);
}

TEST(LabelIndex, BuiltAgain_ForgetsTheOldLabels) {
    cel_LabelIndex index;
    EXPECT_EQ(index.Find(0), -1);
    index.Build(Ints{1, 1000000});
    index.Build(Ints{3, 4});
    EXPECT_EQ(index.Find(1), -1);
    EXPECT_EQ(index.Find(4), 1);
    index.Build(Ints{});
    EXPECT_EQ(index.Find(3), -1);
}

TEST(LabelIndex, NumbersBeyondAnyLabel_AreNotFound) {
    const Ints forms[] = {{5, 6, 7}, {9, 5, 7}, {5, 2000000000, 9}};
    for (const Ints& labels : forms) {
        cel_LabelIndex index;
        index.Build(labels);
        for (const long long beyond :
             {std::numeric_limits<long long>::min(), std::numeric_limits<long long>::max(), (1LL << 32) + 5})
            EXPECT_EQ(index.Find(beyond), -1) << beyond;
    }
}

} // namespace
