#include "store_interface/model/ddb_ElementShape.h"

#include "store_interface/model/odiK_Mesh.h"

#include <gtest/gtest.h>

namespace {

struct Shape {
    int dimension;
    int embedding;
    bool shell;
};

void ExpectShape(std::initializer_list<const char*> labels, const Shape& expected) {
    for (const char* label : labels) {
        SCOPED_TRACE(label);
        const ddb_ElementShape shape = ddb_ShapeOfLabel(label);
        EXPECT_EQ(shape.topologicalDimension, expected.dimension);
        EXPECT_EQ(shape.embeddingDimension, expected.embedding);
        EXPECT_EQ(shape.shell, expected.shell);
        EXPECT_FALSE(shape.unknown);
    }
}

TEST(ElementShape, LinesInThePlane_EmbedInTwoDimensions) {
    ExpectShape({"SAX1",    "DSAX2",   "MAX1",   "MGAX2",    "SFMAX1", "SFMGAX2", "RAX2",  "B21",
                 "PIPE21H", "FRAME2D", "T2D2",   "DC1D2",    "AC1D3",  "R2D2",    "RB2D2", "CONN2D2",
                 "SPRINGA", "SPRING1", "JOINTC", "DASHPOT1", "GAPUNI", "ITSUNI",  "TUBE1", "PIPE22",
                 "SPRING2", "GAPCYL",  "ITSCYL", "DASHPOTA", "B23H"},
                {1, 2, false});
}

TEST(ElementShape, LinesInSpace_EmbedInThreeDimensions) {
    ExpectShape(
        {"B31", "B33H", "PIPE31", "PIPE32H", "ELBOW31", "ELBOW32", "FRAME3D", "T3D2", "RB3D2", "CONN3D2"},
        {1, 3, false});
}

TEST(ElementShape, Solids_HaveThreeDimensions) {
    ExpectShape({"C3D8R", "C3D20", "CC3D8", "DC3D4", "DCC3D8D", "AC3D8", "Q3D20", "EC3D8R", "COH3D8", "CSS8",
                 "SC8R", "CCL12", "DCCX", "GK3D8"},
                {3, 3, false});
}

TEST(ElementShape, Shells_HaveTwoDimensionsInSpace) {
    ExpectShape({"S3R", "S4", "S4RSW", "S8R5", "S9R5", "STRI3", "STRI65", "DS4", "DS8"}, {2, 3, true});
}

TEST(ElementShape, Membranes_AreNoShells) {
    ExpectShape({"M3D4", "SFM3D4R", "R3D4", "CCF9", "ASI3D3", "F3D4"}, {2, 3, false});
}

TEST(ElementShape, PlaneAndAxisymmetricElements_EmbedInTheirPlane) {
    ExpectShape({"CPE4R",  "CPS4",   "CPEG4", "CAX4",   "CGAX8",  "DC2D4",  "DCAX4",
                 "DCC2D4", "DCCAX2", "AC2D4", "ACAX4",  "COH2D4", "COHAX4", "GKPS4",
                 "GKPE6",  "GKAX4",  "GK2D2", "CINPE4", "CINPS4", "CINAX4"},
                {2, 2, false});
}

TEST(ElementShape, PointElements_AreKnownWithoutAShape) {
    ExpectShape({"MASS", "ROTARYI", "HEATCAP", "U1", "U1001", "USER"}, {0, 3, false});
}

TEST(ElementShape, OtherLabels_AreUnknownPoints) {
    for (const char* label : {"", "X", "MASSES", "ROTARY", "S", "S5", "C", "CIN3D8", "FLINK"}) {
        SCOPED_TRACE(label);
        const ddb_ElementShape shape = ddb_ShapeOfLabel(label);
        EXPECT_TRUE(shape.unknown);
        EXPECT_EQ(shape.topologicalDimension, 0);
        EXPECT_EQ(shape.embeddingDimension, 3);
        EXPECT_FALSE(shape.shell);
    }
}

TEST(ElementShape, LongestBeginning_Wins) {
    ExpectShape({"DSAX1"}, {1, 2, false});  // not DS
    ExpectShape({"CSSX"}, {3, 3, false});   // not a plane stress element
    ExpectShape({"DCC2D8"}, {2, 2, false}); // not DCC
    ExpectShape({"DCCAX4"}, {2, 2, false}); // not DCC
    ExpectShape({"DCC3D8"}, {3, 3, false});
    ExpectShape({"CPEG3"}, {2, 2, false});
    ExpectShape({"PIPE3"}, {1, 3, false});
}

TEST(ElementShape, Capitals_DoNotMatter) {
    ExpectShape({"c3d8r", "C3d8R"}, {3, 3, false});
    ExpectShape({"s4r"}, {2, 3, true});
    ExpectShape({"t3d2", "b31"}, {1, 3, false});
    ExpectShape({"mass", "u12"}, {0, 3, false});
}

struct Faces {
    const char* label;
    std::vector<const char*> names; // by facet id
    std::vector<int> ids;           // all that fit
};

TEST(ElementFaces, NamesAndIds_FollowTheShape) {
    const std::vector<Faces> rows = {
        {"C3D8", {"S1", "S2", "S3", "S4", "S5", "S6"}, {0, 1, 2, 3, 4, 5}},
        {"CPE4", {"S1", "S2", "S3", "S4", "S5", "S6"}, {0, 1, 2, 3, 4, 5}},
        {"S4R", {"SPOS", "SNEG"}, {0, 1, 6}},
        {"M3D4", {"SPOS", "SNEG"}, {0, 1, 6}},
        {"R3D4", {"SPOS", "SNEG"}, {0, 1, 6}},
        {"B31", {"END1", "END2"}, {0, 1}},
        {"SAX1", {"END1", "END2"}, {0, 1}},
        {"MASS", {}, {0, 1, 2, 3, 4, 5}},
    };
    const char* const all[] = {"S1",   "S2",   "S3",   "S4",   "S5",   "S6", "S0",    "S7",   "S10", "SPOS",
                               "SNEG", "END1", "END2", "END3", "END0", "E1", "spos",  "s1",   "S",   "END",
                               "",     "1",    "S1 ",  "SP",   "S:",   "S/", "SPOS1", "END12"};
    for (const Faces& row : rows) {
        SCOPED_TRACE(row.label);
        const ddb_ElementShape shape = ddb_ShapeOfLabel(row.label);
        for (const char* name : all) {
            const auto place = std::find_if(row.names.begin(), row.names.end(), [&](const char* known) {
                return std::string_view(known) == name;
            });
            const int expected = place == row.names.end() ? -1 : static_cast<int>(place - row.names.begin());
            EXPECT_EQ(odiK_FacetOfFace(shape, name), expected) << name;
        }
        for (int id = -2; id < 9; ++id) {
            const bool fits = std::find(row.ids.begin(), row.ids.end(), id) != row.ids.end();
            EXPECT_EQ(odiK_FacetFits(shape, id), fits) << id;
        }
    }
}

TEST(ElementFaces, Rule_NamesThePrefixOrTheSidesOfAShell) {
    EXPECT_STREQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("C3D8")).prefix, "S");
    EXPECT_STREQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("CAX4")).prefix, "S");
    EXPECT_STREQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("T2D2")).prefix, "END");
    EXPECT_STREQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("MASS")).prefix, "");
    EXPECT_EQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("S4")).rule, ddb_FaceRuleEnm::SHELL);
    EXPECT_EQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("M3D4")).rule, ddb_FaceRuleEnm::SHELL);
    EXPECT_EQ(ddb_FaceRuleOf(ddb_ShapeOfLabel("C3D8")).rule, ddb_FaceRuleEnm::NUMBERED);
}

} // namespace
