#include "foundation/cow_List.h"

#include "foundation/cow_String.h"
#include "tests/foundation/RaisedText.h"
#include "tests/foundation/Tracked.h"

#include <gtest/gtest.h>

#include <functional>
#include <limits>
#include <string>
#include <utility>
#include <vector>

namespace {

cow_List<int> Counting(int count) {
    cow_List<int> list;
    for (int i = 0; i < count; ++i) list.Append(i);
    return list;
}

template <class T>
std::vector<T> Items(const cow_List<T>& list) {
    std::vector<T> items;
    for (int i = 0; i < list.Length(); ++i) items.push_back(list[i]);
    return items;
}

std::vector<int> Values(const cow_List<Tracked>& list) {
    std::vector<int> values;
    for (int i = 0; i < list.Length(); ++i) values.push_back(list[i].Value());
    return values;
}

/// Ordered by the first only.
struct Ranked {
    int rank;
    char tag;
    friend bool operator<(const Ranked& a, const Ranked& b) { return a.rank < b.rank; }
};

TEST(cow_ListSort, Numbers_ComeInAscendingOrder) {
    cow_List<int> list(3, 1, 2, 1, -5);
    const cow_List<int> copy(list);
    list.Sort();
    EXPECT_EQ(Items(list), (std::vector<int>{-5, 1, 1, 2, 3}));
    EXPECT_EQ(Items(copy), (std::vector<int>{3, 1, 2, 1, -5}));
}

TEST(cow_ListSort, EqualItems_KeepTheirOrder) {
    cow_List<Ranked> list(Ranked{2, 'a'}, Ranked{1, 'b'}, Ranked{2, 'c'}, Ranked{1, 'd'});
    list.Sort();
    std::string tags;
    for (int i = 0; i < list.Length(); ++i) tags += list[i].tag;
    EXPECT_EQ(tags, "bdac");
}

TEST(cow_ListSort, EmptyList_StaysEmpty) {
    cow_List<int> list;
    list.Sort();
    EXPECT_TRUE(list.IsEmpty());
}

TEST(getFloatMask, SomeNumbers_GiveTheBitsOfTheFloat) {
    EXPECT_EQ(getFloatMask(0), 0);
    EXPECT_EQ(getFloatMask(1), 0x3f800000);
    EXPECT_EQ(getFloatMask(2), 0x40000000);
    EXPECT_EQ(getFloatMask(3), 0x40400000);
    EXPECT_EQ(getFloatMask(1000), 0x447a0000);
    EXPECT_EQ(getFloatMask(1000000), 0x49742400);
}

TEST(getFloatMask, NumberOfMoreThan24Bits_IsRounded) {
    EXPECT_EQ(getFloatMask(16777217), getFloatMask(16777216));
    EXPECT_EQ(getFloatMask(std::numeric_limits<int>::max()), 0x4f000000);
}

TEST(getPower, EveryPowerOfTwo_GivesItsExponent) {
    for (int exponent = 0; exponent < 31; ++exponent) {
        EXPECT_EQ(getPower(getFloatMask(1 << exponent)), exponent);
    }
}

TEST(getPower, NumbersBetween_GiveWholePartOfLog2) {
    EXPECT_EQ(getPower(getFloatMask(3)), 1);
    EXPECT_EQ(getPower(getFloatMask(255)), 7);
    EXPECT_EQ(getPower(getFloatMask(257)), 8);
    EXPECT_EQ(getPower(getFloatMask(1000)), 9);
    EXPECT_EQ(getPower(getFloatMask(1000000)), 19);
}

struct BlockPlan {
    int size;
    int shift;
    int tableLength;
};

class cow_ListSizedTest : public ::testing::TestWithParam<BlockPlan> {};

TEST_P(cow_ListSizedTest, SizeGiven_PlansBlocks) {
    const cow_List<int> list{cow_ListConstruct(GetParam().size)};
    EXPECT_EQ(list.Shift(), GetParam().shift);
    EXPECT_EQ(list.TableLength(), GetParam().tableLength);
    EXPECT_EQ(list.First(), 0);
    EXPECT_EQ(list.Length(), 0);
    EXPECT_TRUE(list.HasTable());
}

// 257 = 1.00390625 * 2^8: blocks of 32, (0x008000 + 0x8fffff) >> 20 = 9 of them, and 16 free slots.
INSTANTIATE_TEST_SUITE_P(
    Sizes, cow_ListSizedTest,
    ::testing::Values(BlockPlan{1, 4, 16}, BlockPlan{15, 4, 16}, BlockPlan{16, 4, 16}, BlockPlan{17, 4, 16},
                      BlockPlan{255, 4, 16}, BlockPlan{256, 5, 24}, BlockPlan{257, 5, 25},
                      BlockPlan{288, 5, 25}, BlockPlan{289, 5, 26}, BlockPlan{511, 5, 32},
                      BlockPlan{512, 6, 24}, BlockPlan{1000, 6, 32}, BlockPlan{1024, 7, 24},
                      BlockPlan{1025, 7, 25}, BlockPlan{100000, 13, 29}, BlockPlan{1000000, 16, 32},
                      BlockPlan{1 << 20, 17, 24}, BlockPlan{std::numeric_limits<int>::max(), 28, 24}),
    [](const auto& test) { return "Size" + std::to_string(test.param.size); });

TEST(cow_List, SizedForZero_HasNoTableUntilFirstWrite) {
    cow_List<int> list{cow_ListConstruct(0)};
    EXPECT_FALSE(list.HasTable());
    EXPECT_EQ(list.Shift(), 4);
    EXPECT_EQ(list.TableLength(), 0);
    EXPECT_EQ(list.First(), 0);
    list.Append(7);
    EXPECT_TRUE(list.HasTable());
    EXPECT_EQ(list.TableLength(), 16);
    EXPECT_EQ(Items(list), std::vector<int>{7});
}

TEST(cow_List, EmptyWithoutTable_CanBeReadCopiedAndCompared) {
    const cow_List<int> list;
    const cow_List<int> copy(list);
    EXPECT_EQ(copy.Length(), 0);
    EXPECT_TRUE(copy.IsEmpty());
    EXPECT_TRUE(copy == list);
    EXPECT_TRUE((copy == cow_List<int>{cow_ListConstruct(100)}));
}

TEST(cow_List, MadeFromOneToFiveItems_HoldsThemInOrder) {
    EXPECT_EQ(Items(cow_List<int>(1)), (std::vector<int>{1}));
    EXPECT_EQ(Items(cow_List<int>(1, 2)), (std::vector<int>{1, 2}));
    EXPECT_EQ(Items(cow_List<int>(1, 2, 3)), (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(Items(cow_List<int>(1, 2, 3, 4)), (std::vector<int>{1, 2, 3, 4}));
    EXPECT_EQ(Items(cow_List<int>(1, 2, 3, 4, 5)), (std::vector<int>{1, 2, 3, 4, 5}));
}

TEST(cow_List, AppendedBeyondPlan_GrowsTable) {
    const cow_List<int> list = Counting(1000);
    EXPECT_EQ(list.Shift(), 4);
    EXPECT_GE(list.TableLength(), 63);
    for (int i = 0; i < 1000; ++i) ASSERT_EQ(list[i], i);
}

TEST(cow_List, Grown_MovesNoItem) {
    cow_List<int> list = Counting(16);
    const int* first = &list[0];
    const int* last = &list[15];
    for (int i = 0; i < 2000; ++i) list.Append(i);
    for (int i = 0; i < 2000; ++i) list.Prepend(i);
    EXPECT_EQ(&list[2000], first);
    EXPECT_EQ(&list[2015], last);
}

TEST(cow_List, Prepended_KeepsOrder) {
    cow_List<int> list(3, 4);
    list.Prepend(2);
    list.Prepend(1);
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2, 3, 4}));
}

TEST(cow_List, PrependedToShortList_StartsAtTopEndOfTable) {
    cow_List<int> list = Counting(20);
    list.Prepend(-1);
    // 2 of 16 blocks in use move to slots 14 and 15; the new item is the last one of slot 13.
    EXPECT_EQ(list.TableLength(), 16);
    EXPECT_EQ(list.First(), 14 * 16 - 1);
    EXPECT_EQ(list[0], -1);
    EXPECT_EQ(list[20], 19);
}

TEST(cow_List, PrependedOnFullTable_GrowsItAndKeepsOrder) {
    cow_List<int> list = Counting(16 * 16);
    ASSERT_EQ(list.TableLength(), 16);
    list.Prepend(-1);
    EXPECT_GT(list.TableLength(), 16);
    ASSERT_EQ(list.Length(), 257);
    for (int i = 0; i < 257; ++i) ASSERT_EQ(list[i], i - 1);
}

TEST(cow_List, PrependedOnFullTableOfCopy_LeavesOriginal) {
    const cow_List<int> list = Counting(16 * 16);
    cow_List<int> copy(list);
    copy.Prepend(-1);
    EXPECT_EQ(list.Length(), 256);
    EXPECT_EQ(list.First(), 0);
    EXPECT_EQ(list[0], 0);
    for (int i = 0; i < 256; ++i) ASSERT_TRUE(&copy[i + 1] == &list[i]);
}

TEST(cow_List, PrependedToEmpty_IsAppend) {
    cow_List<int> list;
    list.Prepend(1);
    EXPECT_EQ(Items(list), std::vector<int>{1});
    EXPECT_EQ(list.First(), 0);
}

TEST(cow_List, CopyWritten_LeavesOriginalAndSharesUntouchedBlocks) {
    const cow_List<int> list = Counting(48);
    cow_List<int> copy(list);
    EXPECT_EQ(&copy[20], &list[20]);
    copy.Put(20, -1);
    EXPECT_EQ(list[20], 20);
    EXPECT_EQ(copy[20], -1);
    EXPECT_TRUE(copy.SharesBlock(list, 0));
    EXPECT_TRUE(copy.SharesBlock(list, 15));
    EXPECT_FALSE(copy.SharesBlock(list, 16));
    EXPECT_FALSE(copy.SharesBlock(list, 31));
    EXPECT_TRUE(copy.SharesBlock(list, 32));
    EXPECT_EQ(&copy[0], &list[0]);
    EXPECT_EQ(&copy[47], &list[47]);
}

TEST(cow_List, CopyAppended_SharesAllFullBlocks) {
    const cow_List<int> list = Counting(40);
    cow_List<int> copy(list);
    copy.Append(40);
    EXPECT_EQ(list.Length(), 40);
    EXPECT_EQ(&copy[31], &list[31]);
    EXPECT_NE(&copy[32], &list[32]);
    EXPECT_EQ(copy[32], 32);
}

TEST(cow_List, OriginalWritten_LeavesCopy) {
    cow_List<int> list = Counting(3);
    const cow_List<int> copy(list);
    list.Get(1) = 100;
    list.Append(3);
    EXPECT_EQ(Items(copy), (std::vector<int>{0, 1, 2}));
    EXPECT_EQ(Items(list), (std::vector<int>{0, 100, 2, 3}));
}

TEST(cow_List, WrittenAlone_CopiesNoItem) {
    Tracked::Reset();
    cow_List<Tracked> list;
    for (int i = 0; i < 40; ++i) list.Append(Tracked(i));
    const Tracked* item = &list[20];
    Tracked::fuse = 0;
    EXPECT_EQ(&list.Get(20), item);
    Tracked::fuse = -1;
}

TEST(cow_List, ItemOfItselfAppended_IsSafe) {
    cow_List<cow_String> list;
    list.Append("first");
    for (int i = 0; i < 100; ++i) {
        list.Append(list[0]);
        list.Prepend(list[i]);
    }
    for (int i = 0; i < list.Length(); ++i) ASSERT_EQ(list[i], "first");
}

TEST(cow_List, InsertIndex_PutsBefore) {
    cow_List<int> list(1, 3);
    list.InsertIndex(1, 2);
    list.InsertIndex(0, 0);
    list.InsertIndex(4, 4);
    EXPECT_EQ(Items(list), (std::vector<int>{0, 1, 2, 3, 4}));
}

TEST(cow_List, InsertIndexAcrossSharedBlocks_LeavesOriginal) {
    const cow_List<int> list = Counting(40);
    cow_List<int> copy(list);
    copy.InsertIndex(10, -1);
    EXPECT_EQ(copy[9], 9);
    EXPECT_EQ(copy[10], -1);
    EXPECT_EQ(copy[11], 10);
    EXPECT_EQ(copy[40], 39);
    EXPECT_EQ(list, Counting(40));
}

TEST(cow_List, RemoveIndex_ClosesTheGap) {
    cow_List<int> list = Counting(20);
    list.RemoveIndex(19);
    list.RemoveIndex(0);
    list.RemoveIndex(15);
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 17, 18}));
}

TEST(cow_List, RemoveIndexOfLastOne_LeavesEmptyUsableList) {
    cow_List<int> list(1);
    list.RemoveIndex(0);
    EXPECT_TRUE(list.IsEmpty());
    list.Append(2);
    EXPECT_EQ(Items(list), std::vector<int>{2});
}

TEST(cow_List, ItemWithoutDefault_CanBeInsertedAndRemoved) {
    struct NoDefault {
        explicit NoDefault(int number) : value(number) {}
        int value;
    };
    cow_List<NoDefault> list;
    list.Append(NoDefault(1));
    list.InsertIndex(0, NoDefault(0));
    list.RemoveIndex(1);
    ASSERT_EQ(list.Length(), 1);
    EXPECT_EQ(list[0].value, 0);
    list.RemoveIndex(0);
    EXPECT_TRUE(list.IsEmpty());
}

TEST(cow_List, AppendedMany_IsAppendedOneByOne) {
    for (const int before : {0, 1, 7, 8, 9, 100}) {
        for (const int count : {0, 1, 7, 8, 9, 1000}) {
            cow_List<int> list = Counting(before);
            const cow_List<int> copy(list);
            list.AppendMany(count, [before](int i) { return before + i; });
            EXPECT_EQ(Items(list), Items(Counting(before + count))) << before << " and " << count;
            EXPECT_EQ(copy.Length(), before);
        }
    }
}

TEST(cow_List, ManyAppendedBehindPrependedOnes_KeepTheirOrder) {
    cow_List<int> list = Counting(3);
    list.Prepend(-1);
    list.AppendMany(40, [](int i) { return 3 + i; });
    list.Prepend(-2);
    for (int i = 0; i < list.Length(); ++i) EXPECT_EQ(list[i], i - 2);
    EXPECT_EQ(list.Length(), 45);
}

TEST(cow_List, Concatenated_JoinsAndLeavesTheOther) {
    cow_List<int> list(1, 2);
    const cow_List<int> tail(3, 4);
    list.Concatenate(tail);
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2, 3, 4}));
    EXPECT_EQ(Items(tail), (std::vector<int>{3, 4}));
}

TEST(cow_List, ConcatenatedToEmpty_SharesTheOther) {
    const cow_List<int> tail = Counting(20);
    cow_List<int> list;
    list.Concatenate(tail);
    EXPECT_EQ(&list[0], &tail[0]);
    list.Append(20);
    EXPECT_EQ(tail.Length(), 20);
}

TEST(cow_List, ConcatenatedToItself_Doubles) {
    cow_List<int> list(1, 2, 3);
    list.Concatenate(list);
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2, 3, 1, 2, 3}));
}

TEST(cow_List, Filled_HoldsCountCopies) {
    cow_List<int> list = Counting(5);
    list.Fill(3, 9);
    EXPECT_EQ(Items(list), (std::vector<int>{9, 9, 9}));
    list.Fill(2, list[0]);
    EXPECT_EQ(Items(list), (std::vector<int>{9, 9}));
    list.Fill(0, 1);
    EXPECT_TRUE(list.IsEmpty());
    list.Fill(300, 1);
    EXPECT_EQ(list.Length(), 300);
    EXPECT_EQ(list.Shift(), 5);
}

TEST(cow_List, Resized_CutsOrFillsWithDefaults) {
    cow_List<int> list = Counting(40);
    list.Resize(17);
    EXPECT_EQ(list, Counting(17));
    list.Resize(19);
    ASSERT_EQ(list.Length(), 19);
    EXPECT_EQ(list[16], 16);
    EXPECT_EQ(list[17], 0);
    EXPECT_EQ(list[18], 0);
    list.Resize(0);
    EXPECT_TRUE(list.IsEmpty());
    list.Append(1);
    EXPECT_EQ(Items(list), std::vector<int>{1});
}

TEST(cow_List, CopyResized_LeavesOriginal) {
    const cow_List<int> list = Counting(40);
    for (const int count : {0, 1, 15, 16, 17, 32, 39, 40, 50}) {
        cow_List<int> copy(list);
        copy.Resize(count);
        copy.Append(-1);
        EXPECT_EQ(copy.Length(), count + 1);
        EXPECT_EQ(list, Counting(40));
    }
}

TEST(cow_List, ResizedShorterAfterPrepend_KeepsTheFront) {
    cow_List<int> list = Counting(40);
    list.Prepend(-1);
    list.Resize(1);
    EXPECT_EQ(Items(list), std::vector<int>{-1});
    list.Append(5);
    EXPECT_EQ(Items(list), (std::vector<int>{-1, 5}));
}

TEST(cow_List, Resized_DestroysInReverseOrder) {
    Tracked::Reset();
    cow_List<Tracked> list;
    for (int i = 0; i < 20; ++i) list.Append(Tracked(i));
    Tracked::destroyed.clear();
    list.Resize(13);
    EXPECT_EQ(Tracked::destroyed, (std::vector<int>{19, 18, 17, 16, 15, 14, 13}));
}

TEST(cow_List, ResizedWhileShared_DestroysNothing) {
    Tracked::Reset();
    cow_List<Tracked> list;
    for (int i = 0; i < 20; ++i) list.Append(Tracked(i));
    cow_List<Tracked> copy(list);
    Tracked::destroyed.clear();
    copy.Resize(13);
    EXPECT_TRUE(Tracked::destroyed.empty());
    EXPECT_EQ(list.Length(), 20);
    EXPECT_EQ(list[19].Value(), 19);
}

TEST(cow_List, LastHolderGone_DestroysInReverseOrder) {
    Tracked::Reset();
    {
        cow_List<Tracked> list;
        for (int i = 0; i < 18; ++i) list.Append(Tracked(i));
        {
            const cow_List<Tracked> copy(list);
            Tracked::destroyed.clear();
        }
        EXPECT_TRUE(Tracked::destroyed.empty());
    }
    EXPECT_EQ(Tracked::destroyed,
              (std::vector<int>{17, 16, 15, 14, 13, 12, 11, 10, 9, 8, 7, 6, 5, 4, 3, 2, 1, 0}));
    EXPECT_EQ(Tracked::alive, 0);
}

TEST(cow_List, IndexOutside_Raises) {
    cow_List<int> list(1, 2);
    const std::string below = "cow_List: index -1 is out of range, expected 0 to 1";
    const std::string above = "cow_List: index 2 is out of range, expected 0 to 1";
    EXPECT_EQ(RaisedText([&] { list.CheckIndex(-1); }), below);
    EXPECT_EQ(RaisedText([&] { list.CheckIndex(2); }), above);
    EXPECT_EQ(RaisedText([&] { static_cast<void>(list[2]); }), above);
    EXPECT_EQ(RaisedText([&] { static_cast<void>(list.ConstGet(-1)); }), below);
    EXPECT_EQ(RaisedText([&] { list.Get(2) = 1; }), above);
    EXPECT_EQ(RaisedText([&] { list.Put(-1, 1); }), below);
    EXPECT_EQ(RaisedText([&] { list.RemoveIndex(2); }), above);
    EXPECT_EQ(RaisedText([&] { list.RaiseOutOfRange(2); }), above);
    EXPECT_EQ(RaisedText([&] { list.CheckIndex(0); }), "(nothing raised)");
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2}));
}

TEST(cow_List, IndexIntoEmptyList_RaisesThatItIsEmpty) {
    const cow_List<int> list;
    EXPECT_EQ(RaisedText([&] { static_cast<void>(list[0]); }),
              "cow_List: index 0 is out of range, there are no items");
    EXPECT_EQ(RaisedText([&] { static_cast<void>(list.Last()); }),
              "cow_List: index -1 is out of range, there are no items");
}

TEST(cow_List, InsertIndexBehindTheEnd_RaisesWithTheRoomThatThereIs) {
    cow_List<int> list(1, 2);
    EXPECT_EQ(RaisedText([&] { list.InsertIndex(3, 1); }),
              "cow_List: index 3 is out of range, expected 0 to 2");
    EXPECT_EQ(RaisedText([&] { list.InsertIndex(-1, 1); }),
              "cow_List: index -1 is out of range, expected 0 to 2");
}

TEST(cow_List, NegativeLength_Raises) {
    cow_List<int> list(1, 2);
    EXPECT_THROW(list.Resize(-1), QRXBasException);
    EXPECT_THROW(list.Fill(-1, 5), QRXBasException);
    EXPECT_EQ(Items(list), (std::vector<int>{1, 2}));
}

TEST(cow_List, Last_IsTheLastItem) {
    EXPECT_EQ(Counting(17).Last(), 16);
}

TEST(cow_List, ConstRun_GivesPiecesUpToTheBlockEnds) {
    cow_List<int> list = Counting(40);
    int length = 0;
    EXPECT_EQ(list.ConstRun(3, length), &list[3]);
    EXPECT_EQ(length, 13);
    EXPECT_EQ(list.ConstRun(32, length), &list[32]);
    EXPECT_EQ(length, 8);
    list.Prepend(-1);
    list.ConstRun(0, length);
    EXPECT_EQ(length, 1);
}

TEST(cow_List, Moved_LeavesEmptyUsableList) {
    cow_List<int> list = Counting(20);
    const cow_List<int> taken(std::move(list));
    EXPECT_EQ(taken, Counting(20));
    EXPECT_TRUE(list.IsEmpty()); // NOLINT(bugprone-use-after-move)
    list.Append(1);
    EXPECT_EQ(Items(list), std::vector<int>{1});
}

TEST(cow_List, SelfAssigned_Stays) {
    cow_List<int> list = Counting(20);
    const cow_List<int>& alias = list;
    list = alias;
    EXPECT_EQ(list, Counting(20));
}

TEST(cow_List, Compared_ByItemsNotByBlocks) {
    cow_List<int> shifted = Counting(20);
    shifted.Prepend(-1);
    shifted.RemoveIndex(0);
    EXPECT_TRUE(shifted == Counting(20));
    shifted.Put(19, 0);
    EXPECT_FALSE(shifted == Counting(20));
    EXPECT_FALSE(Counting(3) == Counting(4));
}

TEST(cow_ListIter, ListChangedMeanwhile_WalksTheOldItems) {
    cow_List<int> list(1, 2, 3);
    cow_ListIter<int> iter(list);
    std::vector<int> walked;
    for (iter.First(); !iter.IsDone(); iter.Next()) {
        walked.push_back(iter.CurrentItem());
        list.Put(2, 99);
        list.Append(4);
    }
    EXPECT_EQ(walked, (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(list.Length(), 6);
}

struct FailingOperation {
    const char* name;
    bool allOrNothing;
    std::function<void(cow_List<Tracked>&)> run;
};

class cow_ListFailingCopyTest : public ::testing::TestWithParam<FailingOperation> {
protected:
    void SetUp() override { Tracked::Reset(); }
};

// Every copy of an item fails in turn; the lists must stay whole and nothing may leak.
TEST_P(cow_ListFailingCopyTest, NthCopyFails_ListsStayWhole) {
    for (const int length : {1, 16, 40, 256}) {
        for (const bool prefixed : {false, true}) {
            for (const bool shared : {false, true}) {
                bool failed = true;
                for (int fuse = 0; failed; ++fuse) {
                    {
                        cow_List<Tracked> list;
                        for (int i = 0; i < length; ++i) list.Append(Tracked(i));
                        if (prefixed) list.Prepend(Tracked(-1));
                        const std::vector<int> before = Values(list);
                        const cow_List<Tracked> copy(shared ? list : cow_List<Tracked>());
                        Tracked::fuse = fuse;
                        try {
                            GetParam().run(list);
                            failed = false;
                        } catch (const std::runtime_error&) {
                            failed = true;
                        }
                        Tracked::fuse = -1;
                        const std::vector<int> after = Values(list);
                        if (failed && GetParam().allOrNothing) {
                            ASSERT_EQ(after, before);
                        }
                        if (shared) {
                            ASSERT_EQ(Values(copy), before);
                        }
                        list.Append(Tracked(500));
                        list.Prepend(Tracked(501));
                        ASSERT_EQ(list.Length(), static_cast<int>(after.size()) + 2);
                        ASSERT_EQ(list[0].Value(), 501);
                        ASSERT_EQ(list.Last().Value(), 500);
                    }
                    ASSERT_EQ(Tracked::alive, 0);
                }
            }
        }
    }
}

INSTANTIATE_TEST_SUITE_P(
    Operations, cow_ListFailingCopyTest,
    ::testing::Values(
        FailingOperation{"Append", true, [](auto& list) { list.Append(Tracked(7)); }},
        FailingOperation{"Prepend", true, [](auto& list) { list.Prepend(Tracked(7)); }},
        FailingOperation{"Get", true, [](auto& list) { list.Get(list.Length() / 2); }},
        FailingOperation{"Put", true, [](auto& list) { list.Put(list.Length() / 2, Tracked(7)); }},
        FailingOperation{"ResizeShorter", true, [](auto& list) { list.Resize(1 + list.Length() / 3); }},
        FailingOperation{"ResizeLonger", false, [](auto& list) { list.Resize(list.Length() + 5); }},
        FailingOperation{"InsertIndex", false,
                         [](auto& list) { list.InsertIndex(list.Length() / 2, Tracked(7)); }},
        FailingOperation{"RemoveIndex", false, [](auto& list) { list.RemoveIndex(list.Length() / 2); }},
        FailingOperation{"Concatenate", false, [](auto& list) { list.Concatenate(cow_List<Tracked>(list)); }},
        FailingOperation{"Fill", false, [](auto& list) { list.Fill(20, Tracked(7)); }}),
    [](const auto& test) { return std::string(test.param.name); });

TEST(cow_List, RangeLoop_RunsOverAllBlocks) {
    cow_List<int> list;
    for (int i = 0; i < 100; ++i) list.Append(i);
    list.Prepend(-1);
    int expected = -1;
    for (const int item : list) EXPECT_EQ(item, expected++);
    EXPECT_EQ(expected, 100);
    EXPECT_EQ(std::count(list.begin(), list.end(), 7), 1);
}

TEST(cow_List, AppendFailsAtNewBlockThenCutAndPrepended_LeaksNothing) {
    Tracked::Reset();
    cow_List<Tracked> list;
    for (int i = 0; i < 32; ++i) list.Append(Tracked(i));
    const Tracked item(7);
    // One copy makes the argument, the second would go into the new block.
    Tracked::fuse = 1;
    EXPECT_THROW(list.Append(item), std::runtime_error);
    Tracked::fuse = -1;
    list.Resize(3);
    list.Prepend(item);
    EXPECT_EQ(Values(list), (std::vector<int>{7, 0, 1, 2}));
}

} // namespace
