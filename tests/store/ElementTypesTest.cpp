#include "store_interface/model/ddb_ElementTypes.h"

#include "store_interface/model/ddb_ElementShape.h"

#include <gtest/gtest.h>

namespace {

TEST(ElementTypes, KnownTypes_HaveTheirCellAndNodes) {
    struct Row {
        const char* label;
        cel_KindEnm cell;
        int nodes;
    };
    const Row rows[] = {
        {"C3D4", cel_KindEnm::TETRA4, 4},        {"C3D10M", cel_KindEnm::TETRA10, 10},
        {"C3D8R", cel_KindEnm::HEXAHEDRON8, 8},  {"c3d20rht", cel_KindEnm::HEXAHEDRON20, 20},
        {"C3D6", cel_KindEnm::WEDGE6, 6},        {"C3D15", cel_KindEnm::WEDGE15, 15},
        {"C3D5", cel_KindEnm::PYRAMID5, 5},      {"CPS4R", cel_KindEnm::QUAD4, 4},
        {"CAX8RP", cel_KindEnm::QUAD8, 8},       {"CPE6MH", cel_KindEnm::TRIANGLE6, 6},
        {"S4R5", cel_KindEnm::QUAD4, 4},         {"STRI65", cel_KindEnm::TRIANGLE6, 6},
        {"S8R", cel_KindEnm::QUAD8, 8},          {"SC8R", cel_KindEnm::HEXAHEDRON8, 8},
        {"M3D9R", cel_KindEnm::QUAD9, 9},        {"T3D2", cel_KindEnm::LINE2, 2},
        {"B22", cel_KindEnm::LINE3, 3},          {"DC3D10", cel_KindEnm::TETRA10, 10},
        {"GK3D8N", cel_KindEnm::HEXAHEDRON8, 8}, {"AC3D8R", cel_KindEnm::HEXAHEDRON8, 8},
        {"MASS", cel_KindEnm::POINT1, 1},        {"DCC3D8D", cel_KindEnm::HEXAHEDRON8, 8},
    };
    for (const Row& row : rows) {
        const auto type = ddb_FindElementType(row.label);
        ASSERT_TRUE(type.has_value()) << row.label;
        EXPECT_EQ(type->cell, row.cell) << row.label;
        EXPECT_EQ(type->minNodes, row.nodes) << row.label;
        EXPECT_EQ(type->maxNodes, row.nodes) << row.label;
    }
}

TEST(ElementTypes, BeamsInSpace_MayHaveANodeForTheirDirection) {
    for (const char* label : {"B31", "B33H", "PIPE31", "FRAME3D"}) {
        const auto type = ddb_FindElementType(label);
        ASSERT_TRUE(type.has_value()) << label;
        EXPECT_EQ(type->minNodes, 2) << label;
        EXPECT_EQ(type->maxNodes, 3) << label;
    }
}

TEST(ElementTypes, LabelsThatAreNoTypeOfTheirFamily_AreNone) {
    for (const char* label :
         {"CPS4Q", "C3D9", "C3D8X", "C3D", "S4RR", "B34", "T3D4", "CPS4H", "M3D5", "R3D5"}) {
        EXPECT_NE(ddb_FamilyOf(label), nullptr) << label;
        EXPECT_FALSE(ddb_FindElementType(label).has_value()) << label;
    }
    EXPECT_FALSE(ddb_FindElementType("XYZ").has_value());
}

TEST(ElementTypes, FamiliesWithoutAList_TakeAnyLabelAndCount) {
    for (const char* label : {"SPRINGA", "DASHPOT1", "GAPUNI", "U12", "JOINTC", "CAXA41", "Q3D8"}) {
        const auto type = ddb_FindElementType(label);
        ASSERT_TRUE(type.has_value()) << label;
        EXPECT_EQ(type->maxNodes, 0) << label;
    }
}

TEST(ElementTypes, DegreesOfFreedom_FollowFamilyAndLetters) {
    const auto is = [](const char* label, bool displacement, bool temperature) {
        const auto type = ddb_FindElementType(label);
        return type.has_value() && type->displacement == displacement && type->temperature == temperature;
    };
    EXPECT_TRUE(is("C3D8R", true, false));
    EXPECT_TRUE(is("C3D8RT", true, true));
    EXPECT_TRUE(is("DC3D8", false, true));
    EXPECT_TRUE(is("DS4", false, true));
    EXPECT_TRUE(is("AC3D8", false, false));
    EXPECT_TRUE(is("STRI3", true, false));
    EXPECT_TRUE(is("S4T", true, true));
}

TEST(ElementTypes, NumberedFaces_AreThoseOfTheCell) {
    EXPECT_EQ(ddb_NumberedFacesOf("C3D4"), 4);
    EXPECT_EQ(ddb_NumberedFacesOf("C3D6"), 5);
    EXPECT_EQ(ddb_NumberedFacesOf("C3D8R"), 6);
    EXPECT_EQ(ddb_NumberedFacesOf("CPS4"), 4);
    EXPECT_EQ(ddb_NumberedFacesOf("CPE3"), 3);
    EXPECT_EQ(ddb_NumberedFacesOf("S4R"), -1);
    EXPECT_EQ(ddb_NumberedFacesOf("MASS"), -1);
    EXPECT_EQ(ddb_NumberedFacesOf("C3D9"), -1);
}

TEST(ElementTypes, Hint_ListsTheTypesNextToTheLabel) {
    EXPECT_EQ(ddb_TypesLike("CPS4Q"), "CPS4, CPS4I, CPS4R, CPS4T, CPS4RT, CPS4E");
    EXPECT_EQ(ddb_TypesLike("M3D5", 2), "M3D3, M3D4");
    EXPECT_EQ(ddb_TypesLike("?"), "");
}

} // namespace
