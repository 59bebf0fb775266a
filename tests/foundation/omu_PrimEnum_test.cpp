#include "foundation/omu_PrimEnum.h"

#include <gtest/gtest.h>

namespace paint {

enum class ColourEnm { RED = 0, DARK_GREEN = 3, BLUE = 7 };

const omu_EnumTable& omu_EnumTableOf(ColourEnm) {
    static const omu_EnumRow rows[] = {
        {0, "RED", "Red"},
        {3, "DARK_GREEN", "Dark green", "DARKGREEN"},
        {7, "BLUE", "Blue"},
    };
    static const omu_EnumTable table{"ColourEnm", rows};
    return table;
}

} // namespace paint

namespace {

using paint::ColourEnm;
using Colour = omu_PrimEnum<ColourEnm, 1>;

TEST(omu_PrimEnum, MadeFromEnumerator_GivesValueAndText) {
    const Colour colour(ColourEnm::DARK_GREEN);
    EXPECT_EQ(colour.Value(), ColourEnm::DARK_GREEN);
    EXPECT_EQ(colour.GetString(), "Dark green");
    EXPECT_EQ(colour.TypeString(), "ColourEnm");
}

TEST(omu_PrimEnum, DefaultConstructed_IsTheEnumeratorOfZero) {
    EXPECT_EQ(Colour().Value(), ColourEnm::RED);
}

TEST(omu_PrimEnum, SetByTextNameOrDeckWord_TakesAnyCapitals) {
    for (const char* word :
         {"Dark green", "DARK GREEN", "dark_green", "DARK_GREEN", "darkgreen", "DarkGreen"}) {
        Colour colour;
        EXPECT_TRUE(colour.SetValue(word)) << word;
        EXPECT_EQ(colour.Value(), ColourEnm::DARK_GREEN) << word;
    }
}

TEST(omu_PrimEnum, SetByUnknownWord_StaysAndTellsSo) {
    Colour colour(ColourEnm::BLUE);
    for (const char* word : {"", "Blu", "Blue ", "3", "Dark-green"}) {
        EXPECT_FALSE(colour.SetValue(word)) << word;
        EXPECT_EQ(colour.Value(), ColourEnm::BLUE);
    }
}

TEST(omu_PrimEnum, NumberOutsideTheList_HasEmptyText) {
    EXPECT_EQ(Colour(static_cast<ColourEnm>(5)).GetString(), "");
    EXPECT_EQ(Colour().AsString(7), "Blue");
    EXPECT_EQ(Colour().AsString(-1), "");
}

TEST(omu_PrimEnum, PermissibleValues_AreTheTextsInOrder) {
    EXPECT_EQ(Colour().PermissibleValues(), (cow_List<cow_String>("Red", "Dark green", "Blue")));
}

TEST(omu_EnumTable, Rows_AreFoundByNumberAndWord) {
    const omu_EnumTable& table = omu_EnumTableOf(ColourEnm::RED);
    ASSERT_NE(table.Row(3), nullptr);
    EXPECT_STREQ(table.Row(3)->name, "DARK_GREEN");
    EXPECT_EQ(table.Row(4), nullptr);
    ASSERT_NE(table.RowOfWord("blue"), nullptr);
    EXPECT_EQ(table.RowOfWord("blue")->value, 7);
    EXPECT_EQ(table.RowOfWord("yellow"), nullptr);
}

TEST(omu_EqualInAnyCapitals, AsciiLettersOnly_AreFolded) {
    EXPECT_TRUE(omu_EqualInAnyCapitals("aBz-1", "AbZ-1"));
    EXPECT_FALSE(omu_EqualInAnyCapitals("a", "ab"));
    EXPECT_FALSE(omu_EqualInAnyCapitals("@", "`"));
    EXPECT_FALSE(omu_EqualInAnyCapitals("[", "{"));
    EXPECT_FALSE(omu_EqualInAnyCapitals("\xc3\xa9", "\xc3\x89"));
    EXPECT_TRUE(omu_EqualInAnyCapitals("", ""));
}

} // namespace
