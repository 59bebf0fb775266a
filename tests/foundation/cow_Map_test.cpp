#include "foundation/cow_Map.h"

#include "tests/foundation/RaisedText.h"

#include <gtest/gtest.h>

#include <pthread.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using Map = cow_Map<cow_String, int>;

std::vector<std::string> Walk(const Map& map) {
    std::vector<std::string> keys;
    for (cow_ConstMapIterator<cow_String, int> iter(map); !iter.IsDone(); iter.Next()) {
        keys.emplace_back(iter.CurrentKey().View());
    }
    return keys;
}

/// The numbers of the values are the places in which the keys were inserted.
Map MapOf(const std::vector<std::string>& keys) {
    Map map;
    for (std::size_t i = 0; i < keys.size(); ++i) map.Insert(cow_String(keys[i]), static_cast<int>(i));
    return map;
}

std::vector<std::string> WalkOf(const std::vector<std::string>& keys) {
    return Walk(MapOf(keys));
}

using Keys = std::vector<std::string>;

/// The directions at depth 0, 1, ... as "L" and "R".
std::string Path(const cow_String& key, int depths) {
    std::string path;
    for (int depth = 0; depth < depths; ++depth) path += cow_MapGoesRight(key, depth) ? 'R' : 'L';
    return path;
}

// "1" is an odd byte, "0" an even one: each key shows at which depths its one odd byte counts.
TEST(cow_MapPath, KeyOfFour_AlternatesHeadAndTail) {
    EXPECT_EQ(Path("1000", 7), "RLLLLLL");
    EXPECT_EQ(Path("0001", 7), "LRLLLLL");
    EXPECT_EQ(Path("0100", 7), "LLRLLLL");
    EXPECT_EQ(Path("0010", 7), "LLLRRLL");
}

TEST(cow_MapPath, KeyOfFive_ReadsMiddleByteTwice) {
    EXPECT_EQ(Path("10000", 8), "RLLLLLLL");
    EXPECT_EQ(Path("00001", 8), "LRLLLLLL");
    EXPECT_EQ(Path("01000", 8), "LLRLLLLL");
    EXPECT_EQ(Path("00010", 8), "LLLRLLLL");
    EXPECT_EQ(Path("00100", 8), "LLLLRRLL");
}

TEST(cow_MapPath, ShortKeys_GoLeftBeyondTheirLength) {
    EXPECT_EQ(Path("1", 4), "RRLL");
    EXPECT_EQ(Path("11", 5), "RRRLL");
    EXPECT_EQ(Path("01", 5), "LRRLL");
    EXPECT_EQ(Path("10", 5), "RLLLL");
}

TEST(cow_MapPath, EmptyKey_ReadsItsTerminatingZero) {
    EXPECT_EQ(Path("", 3), "LLL");
}

TEST(cow_MapPath, BytesAbove127_CountByTheirLowestBit) {
    EXPECT_EQ(Path("\xff", 1), "R");
    EXPECT_EQ(Path("\x80", 1), "L");
}

TEST(cow_Map, S2InsertedBeforeS1_IsWalkedFirst) {
    EXPECT_EQ(WalkOf({"S2", "S1"}), (Keys{"S2", "S1"}));
    EXPECT_EQ(WalkOf({"S1", "S2"}), (Keys{"S1", "S2"}));
}

TEST(cow_Map, BThenA_IsNotSorted) {
    EXPECT_EQ(WalkOf({"b", "a"}), (Keys{"b", "a"}));
}

TEST(cow_Map, LeftSubtree_IsWalkedBeforeRight) {
    // b is even and goes left, a is odd and goes right.
    EXPECT_EQ(WalkOf({"m", "a", "b"}), (Keys{"m", "b", "a"}));
    EXPECT_EQ(WalkOf({"m", "b", "a"}), (Keys{"m", "b", "a"}));
}

TEST(cow_Map, KeysOfTwo_AreWalkedByHeadAndTailBits) {
    //                 xx
    //          bb            ab        depth 0: first byte
    //                     cb    aa     depth 1: last byte
    //                   eb        cc   depth 2: second byte
    //                 gd        ee     depth 3: beyond the key, left
    EXPECT_EQ(WalkOf({"xx", "ab", "aa", "cb", "cc", "ee", "eb", "gd", "bb"}),
              (Keys{"xx", "bb", "ab", "cb", "eb", "gd", "aa", "cc", "ee"}));
}

TEST(cow_Map, ShortKeysBelowEachOther_GoLeftBeyondTheirLength) {
    //            z
    //       b         a       depth 0
    //    ""             c     depth 1
    //   d             e       depth 2: beyond the keys, left
    EXPECT_EQ(WalkOf({"z", "a", "b", "", "d", "c", "e"}), (Keys{"z", "b", "", "d", "a", "c", "e"}));
}

TEST(cow_Map, KeysOfDifferentLength_ReadTheirOwnEnds) {
    //         Set-1
    //    Beam         Seam            depth 0: S is odd, B even
    //     Block   Set-2  Set-11       depth 1: "k" and "1" are odd, "2" even
    EXPECT_EQ(WalkOf({"Set-1", "Seam", "Set-11", "Set-2", "Beam", "Block"}),
              (Keys{"Set-1", "Beam", "Block", "Seam", "Set-2", "Set-11"}));
}

TEST(cow_Map, KeyThatBeginsAnother_IsAnotherKey) {
    Map map = MapOf({"ab", "a", "abc"});
    EXPECT_EQ(map.Count(), 3);
    EXPECT_EQ(map.ConstGet("ab"), 0);
    EXPECT_EQ(map.ConstGet("a"), 1);
    EXPECT_EQ(map.ConstGet("abc"), 2);
}

TEST(cow_Map, ExistingKeyInserted_KeepsPlaceAndTakesValue) {
    Map map = MapOf({"S1", "S2", "S3", "S4"});
    const Keys before = Walk(map);
    EXPECT_TRUE(map.Insert("S1", 100));
    EXPECT_TRUE(map.Insert("S3", 300));
    EXPECT_EQ(Walk(map), before);
    EXPECT_EQ(map.Count(), 4);
    EXPECT_EQ(map.ConstGet("S1"), 100);
    EXPECT_EQ(map.ConstGet("S2"), 1);
    EXPECT_EQ(map.ConstGet("S3"), 300);
}

TEST(cow_Map, NewKeyInserted_ReturnsTrueAndCounts) {
    Map map;
    EXPECT_EQ(map.Count(), 0);
    EXPECT_TRUE(map.Insert("a", 1));
    EXPECT_EQ(map.Count(), 1);
    EXPECT_TRUE(map.IsMember("a"));
    EXPECT_FALSE(map.IsMember("b"));
    EXPECT_FALSE(Map().IsMember(""));
}

TEST(cow_Map, AbsentKey_RaisesWithItsName) {
    Map map = MapOf({"a"});
    EXPECT_EQ(RaisedText([&] { static_cast<void>(map.ConstGet("Set 9")); }),
              "cow_Map: no entry named 'Set 9'");
    EXPECT_EQ(RaisedText([&] { static_cast<void>(map.Get("b")); }), "cow_Map: no entry named 'b'");
    EXPECT_EQ(map.Count(), 1);
    EXPECT_EQ(map.Find("b"), nullptr);
    ASSERT_NE(map.Find("a"), nullptr);
    EXPECT_EQ(*map.Find("a"), 0);
}

TEST(cow_Map, ValueWrittenThroughGet_IsKept) {
    Map map = MapOf({"a", "b"});
    map.Get("b") = 50;
    EXPECT_EQ(map.ConstGet("b"), 50);
    map.GetOrInsert("b") += 1;
    map.GetOrInsert("c") += 1;
    EXPECT_EQ(map.ConstGet("b"), 51);
    EXPECT_EQ(map.ConstGet("c"), 1);
    EXPECT_EQ(map.Count(), 3);
}

TEST(cow_Map, CopyWritten_LeavesOriginalAndSharesOffThePath) {
    // m has b on its left and a on its right; c hangs below a.
    const Map map = MapOf({"m", "a", "b", "c"});
    Map copy(map);
    EXPECT_EQ(&copy.ConstGet("m"), &map.ConstGet("m"));
    copy.Insert("c", 30);
    EXPECT_EQ(map.ConstGet("c"), 3);
    EXPECT_EQ(copy.ConstGet("c"), 30);
    EXPECT_EQ(&copy.ConstGet("b"), &map.ConstGet("b"));
    EXPECT_NE(&copy.ConstGet("m"), &map.ConstGet("m"));
    EXPECT_NE(&copy.ConstGet("a"), &map.ConstGet("a"));
}

TEST(cow_Map, CopyGrown_LeavesOriginalsWalk) {
    const Map map = MapOf({"S1", "S2"});
    Map copy(map);
    copy.Insert("S4", 4);
    copy.Remove("S1");
    EXPECT_EQ(Walk(map), (Keys{"S1", "S2"}));
    EXPECT_EQ(map.Count(), 2);
    EXPECT_EQ(copy.Count(), 2);
    EXPECT_TRUE(copy.IsMember("S4"));
}

TEST(cow_Map, AnyKeyRemoved_LeavesAllOthersReachable) {
    const Keys keys = {"xx", "ab", "aa", "cb", "cc", "ee", "eb", "gd", "bb", "", "x", "longer key"};
    for (const std::string& gone : keys) {
        const Map map = MapOf(keys);
        Map copy(map);
        EXPECT_TRUE(copy.Remove(cow_String(gone)));
        EXPECT_EQ(copy.Count(), static_cast<int>(keys.size()) - 1);
        EXPECT_EQ(Walk(copy).size(), keys.size() - 1);
        for (std::size_t i = 0; i < keys.size(); ++i) {
            const cow_String key(keys[i]);
            EXPECT_EQ(copy.IsMember(key), keys[i] != gone);
            if (keys[i] != gone) {
                EXPECT_EQ(copy.ConstGet(key), static_cast<int>(i));
            }
            EXPECT_EQ(map.ConstGet(key), static_cast<int>(i));
        }
    }
}

TEST(cow_Map, AllKeysRemovedFromTheRoot_LeavesEmptyMap) {
    Map map = MapOf({"xx", "ab", "aa", "cb", "bb"});
    while (map.Count() > 0) {
        cow_ConstMapIterator<cow_String, int> iter(map);
        const cow_String key = iter.CurrentKey();
        EXPECT_TRUE(map.Remove(key));
        EXPECT_FALSE(map.IsMember(key));
    }
    EXPECT_TRUE(Walk(map).empty());
    EXPECT_FALSE(map.Remove("xx"));
}

TEST(cow_Map, Moved_LeavesMapThatCountsRight) {
    Map map = MapOf({"a", "b"});
    const Map taken(std::move(map));
    EXPECT_EQ(taken.Count(), 2);
    EXPECT_EQ(map.Count(), static_cast<int>(Walk(map).size())); // NOLINT(bugprone-use-after-move)
}

TEST(cow_Map, IntegerKeys_AreAllReachable) {
    cow_Map<int, int> map;
    for (int key = -100; key <= 100; key += 5) map.Insert(key, key * 2);
    EXPECT_EQ(map.Count(), 41);
    for (int key = -100; key <= 100; ++key) {
        EXPECT_EQ(map.IsMember(key), key % 5 == 0);
        if (key % 5 == 0) {
            EXPECT_EQ(map.ConstGet(key), key * 2);
        }
    }
    EXPECT_EQ(RaisedText([&] { static_cast<void>(map.ConstGet(3)); }), "cow_Map: no entry named '3'");
}

/// A chain: all bytes are even, so every key goes left.
Map Chain(int length) {
    Map map;
    for (int i = 0; i < length; ++i) {
        std::string key;
        for (int bits = i; bits > 0; bits >>= 1) key += (bits & 1) != 0 ? 'b' : 'd';
        map.Insert(cow_String(key), i);
    }
    return map;
}

void* DropChain(void* result) {
    {
        Map map = Chain(4000);
        Map copy(map);
        copy.Insert("bbbb", 0);
        copy.Remove("");
        *static_cast<int*>(result) = copy.Count();
    }
    return nullptr;
}

TEST(cow_Map, LongChainOfKeys_IsDroppedOnASmallStack) {
    pthread_attr_t attributes;
    ASSERT_EQ(pthread_attr_init(&attributes), 0);
    ASSERT_EQ(pthread_attr_setstacksize(&attributes, 128 * 1024), 0);
    pthread_t thread;
    int count = 0;
    ASSERT_EQ(pthread_create(&thread, &attributes, DropChain, &count), 0);
    pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
    EXPECT_EQ(count, 3999);
}

TEST(cow_Map, RangeLoop_WalksAsTheIteratorDoes) {
    for (const Keys& keys : {Keys{}, Keys{"a"}, Keys{"s2", "s1", "", "abc", "b", "ab", "z9", "aa"}}) {
        const Map map = MapOf(keys);
        Keys walked;
        for (const auto& [key, place] : map) {
            walked.emplace_back(key.View());
            EXPECT_EQ(keys[static_cast<std::size_t>(place)], walked.back());
        }
        EXPECT_EQ(walked, Walk(map));
    }
}

TEST(cow_ConstMapIterator, EmptyMap_IsDoneAtOnce) {
    const Map map;
    const cow_ConstMapIterator<cow_String, int> iter(map);
    EXPECT_TRUE(iter.IsDone());
}

TEST(cow_ConstMapIterator, FirstCalledAgain_StartsOver) {
    const Map map = MapOf({"S2", "S1"});
    cow_ConstMapIterator<cow_String, int> iter(map);
    iter.Next();
    EXPECT_EQ(iter.CurrentKey(), "S1");
    EXPECT_EQ(iter.CurrentValue(), 1);
    iter.First();
    EXPECT_EQ(iter.CurrentKey(), "S2");
    EXPECT_EQ(iter.CurrentValue(), 0);
}

} // namespace
