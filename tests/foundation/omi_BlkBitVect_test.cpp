#include "foundation/omi_BlkBitVect.h"

#include "tests/foundation/RaisedText.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <vector>

namespace {

constexpr int kHighest = std::numeric_limits<int>::max();

std::vector<int> Walk(const omi_BlkBitVect& bits) {
    std::vector<int> walked;
    omi_BlkBitVectTrav trav(bits);
    for (int bit = trav.First(); bit >= 0; bit = trav.Next()) walked.push_back(bit);
    return walked;
}

TEST(omi_BlkBitVect, Empty_HoldsNothing) {
    const omi_BlkBitVect bits;
    EXPECT_EQ(bits.Recount(), 0);
    EXPECT_FALSE(bits.IsSet(0));
    EXPECT_FALSE(bits.IsSet(kHighest));
    EXPECT_TRUE(Walk(bits).empty());
}

TEST(omi_BlkBitVect, LabelsInAnyOrder_AreWalkedAscendingOnce) {
    omi_BlkBitVect bits;
    for (const int label : {30, 7, 30, 1000000, 1, 7}) bits.SetBit(label);
    EXPECT_EQ(Walk(bits), (std::vector<int>{1, 7, 30, 1000000}));
    EXPECT_EQ(bits.Recount(), 4);
}

TEST(omi_BlkBitVect, EdgesOfWordsBlocksAndPages_AreKeptApart) {
    const std::vector<int> edges = {0,       1,       63,     64,     127,          128,
                                    511,     512,     513,    262143, 262144,       262145,
                                    1048575, 1048576, 524287, 524288, kHighest - 1, kHighest};
    omi_BlkBitVect bits;
    for (const int edge : edges) bits.SetBit(edge);
    std::vector<int> sorted(edges);
    std::sort(sorted.begin(), sorted.end());
    EXPECT_EQ(Walk(bits), sorted);
    EXPECT_EQ(bits.Recount(), static_cast<int>(edges.size()));
    for (const int edge : edges) EXPECT_TRUE(bits.IsSet(edge)) << edge;
    for (const int hole : {2, 62, 65, 510, 514, 262142, 262146}) EXPECT_FALSE(bits.IsSet(hole)) << hole;
}

TEST(omi_BlkBitVect, DenseRun_IsWalkedWhole) {
    omi_BlkBitVect bits;
    for (int bit = 100; bit < 2100; ++bit) bits.SetBit(bit);
    const std::vector<int> walked = Walk(bits);
    ASSERT_EQ(walked.size(), 2000U);
    for (int i = 0; i < 2000; ++i) ASSERT_EQ(walked[static_cast<std::size_t>(i)], 100 + i);
}

TEST(omi_BlkBitVect, NegativeBit_RaisesAndIsNeverSet) {
    omi_BlkBitVect bits;
    EXPECT_EQ(RaisedText([&] { bits.SetBit(-1); }), "omi_BlkBitVect: bit -1 is negative");
    EXPECT_FALSE(bits.IsSet(-1));
    EXPECT_EQ(bits.Recount(), 0);
}

TEST(omi_BlkBitVectTrav, BehindTheLast_StaysDoneUntilFirst) {
    omi_BlkBitVect bits;
    bits.SetBit(kHighest);
    omi_BlkBitVectTrav trav(bits);
    EXPECT_EQ(trav.Next(), -1);
    EXPECT_EQ(trav.First(), kHighest);
    EXPECT_EQ(trav.Next(), -1);
    EXPECT_EQ(trav.Next(), -1);
    EXPECT_EQ(trav.First(), kHighest);
}

} // namespace
