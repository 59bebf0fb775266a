#include "deck_reader/drd_TextMap.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <type_traits>
#include <vector>

TEST(TextMap, NumberedNames_AreAllFoundAndNoOthers) {
    drd_TextMap map;
    constexpr int count = 5000;
    for (int i = 0; i < count; ++i) EXPECT_TRUE(map.TryEmplace("SET-" + std::to_string(i), i).second);
    for (int i = 0; i < count; ++i) {
        const std::string name = "SET-" + std::to_string(i);
        EXPECT_EQ(map.NumberOr(name, -1), i);
        const auto [number, isNew] = map.TryEmplace(name, -5);
        EXPECT_EQ(number, i);
        EXPECT_FALSE(isNew);
    }
    EXPECT_EQ(map.Find("SET-5000"), nullptr);
    EXPECT_EQ(map.Find("SET-"), nullptr);
    EXPECT_EQ(map.Find(""), nullptr);
}

TEST(TextMap, Scopes_HaveNamesOfTheirOwn) {
    drd_TextMap map;
    map.Reserve(3);
    map.TryEmplace("A", 1, 7);
    map.TryEmplace("A", 2, 8);
    map.TryEmplace("", 3, 8);
    EXPECT_EQ(*map.Find("A", 7), 1);
    EXPECT_EQ(*map.Find("A", 8), 2);
    EXPECT_EQ(*map.Find("", 8), 3);
    EXPECT_EQ(map.Find("A"), nullptr);
    EXPECT_EQ(map.Find("", 7), nullptr);
}

TEST(Texts, WhatIsKept_StaysWhereItIs) {
    drd_Texts texts;
    std::vector<drd_Word> words;
    for (int i = 0; i < 3000; ++i) words.push_back(texts.Keep(std::to_string(i)));
    const drd_Word large = texts.Keep(std::string(3'000'000, 'x'));
    drd_Texts moved = std::move(texts);
    words.push_back(moved.Keep("last"));
    for (int i = 0; i < 3000; ++i) EXPECT_EQ(words[static_cast<std::size_t>(i)], std::to_string(i));
    EXPECT_EQ(words.back(), "last");
    EXPECT_EQ(large, std::string(3'000'000, 'x'));
    EXPECT_EQ(moved.Keep(""), "");
}

TEST(Texts, Rows_AreKeptAsTheyAre) {
    drd_Texts texts;
    texts.Keep("odd");
    const std::vector<double> row = {1.0, 2.0, 3.0};
    const std::span<const double> kept = texts.Keep(row);
    EXPECT_EQ(std::vector<double>(kept.begin(), kept.end()), row);
    EXPECT_EQ(reinterpret_cast<std::uintptr_t>(kept.data()) % alignof(double), 0U);
    EXPECT_TRUE(texts.Keep(std::vector<double>()).empty());
}

TEST(Word, IsJoinedLikeAString) {
    const drd_Word word = std::string_view("BAR");
    EXPECT_EQ("a " + word, "a BAR");
    EXPECT_EQ(word + ".TIP", "BAR.TIP");
    EXPECT_EQ(std::string("a ") + word + word, "a BARBAR");
    EXPECT_EQ(word + word, "BARBAR");
    // A word of a text that is gone can't be made by mistake.
    EXPECT_FALSE((std::is_convertible_v<std::string, drd_Word>));
}
