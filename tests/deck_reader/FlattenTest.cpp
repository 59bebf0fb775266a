#include "DeckTesting.h"

namespace {

constexpr const char* kParts = R"(*Heading
two rods
*Part, name=Rod
*Node
1, 0., 0., 0.
2, 1., 0., 0.
*Element, type=T3D2
5, 1, 2
*Nset, nset=END
2,
*Elset, elset=ALL, generate
5, 5, 1
*Surface, type=ELEMENT, name=TIP
ALL, END2
*Orientation, name=Ori
1., 0., 0., 0., 1., 0.
1, 0.
*Solid Section, elset=ALL, material=Steel, orientation=Ori
1.,
*End Part
*Assembly, name=A
*Instance, name=R-1, part=Rod
*End Instance
*Instance, name="R 2", part=Rod
10., 0., 0.
10., 0., 0., 10., 0., 1., 90.
*End Instance
*Nset, nset=BOTH, instance=R-1
1,
*Nset, nset=BOTH, instance="R 2"
1, 2
*Element, type=CONN3D2
1, R-1.2, "R 2".1
*Tie, name=T
"R 2".TIP, R-1.TIP
*End Assembly
*Material, name=Steel
*Elastic
1., 0.3
*Step, name=S
*Static
*Cload
R-1.END, 1, 5.
"R 2".2, 1, 5.
BOTH, 2, 1.
*End Step
)";

} // namespace

TEST(Flatten, PlacesNodes_ShiftsLabels_JoinsNames_TurnsSystems) {
    ReadDeckText read(kParts);
    EXPECT_EQ(Flattened(read.deck, read.findings), R"(** Instance R-1: labels of nodes + 0, of elements + 0
** Instance R 2: labels of nodes + 10, of elements + 10
** R-1.END became R-1_END
** R-1.ALL became R-1_ALL
** R-1.TIP became R-1_TIP
** R-1.Ori became R-1_Ori
** R 2.END became R 2_END
** R 2.ALL became R 2_ALL
** R 2.TIP became R 2_TIP
** R 2.Ori became R 2_Ori
*Heading
two rods
** Instance R-1
*Node
1, 0., 0., 0.
2, 1., 0., 0.
*Element, type=T3D2
5, 1, 2
*Nset, nset=R-1_END
2,
*Elset, elset=R-1_ALL, generate
5, 5, 1
*Surface, type=ELEMENT, name=R-1_TIP
R-1_ALL, END2
*Orientation, name=R-1_Ori
1., 0., 0., 0., 1., 0.
1, 0.
*Solid Section, elset=R-1_ALL, material=Steel, orientation=R-1_Ori
1.,
** Instance R 2
*Node
11, 10., 0., 0.
12, 10., 1., 0.
*Element, type=T3D2
15, 11, 12
*Nset, nset="R 2_END"
12,
*Elset, elset="R 2_ALL", generate
15, 15, 1
*Surface, type=ELEMENT, name="R 2_TIP"
"R 2_ALL", END2
*Orientation, name="R 2_Ori"
6.12323399573677e-17, 1., 0., -1., 6.12323399573677e-17, 0.
1, 0.
*Solid Section, elset="R 2_ALL", material=Steel, orientation="R 2_Ori"
1.,
*Nset, nset=BOTH
1,
*Nset, nset=BOTH
11, 12
*Element, type=CONN3D2
21, 2, 11
*Tie, name=T
"R 2_TIP", R-1_TIP
*Material, name=Steel
*Elastic
1., 0.3
*Step, name=S
*Static
*Cload
R-1_END, 1, 5.
12, 1, 5.
BOTH, 2, 1.
*End Step
)");
    EXPECT_EQ(read.Codes(), Strings());
}

TEST(Flatten, TheFlatDeck_IsRight) {
    ReadDeckText read(kParts);
    ReadDeckText flat(Flattened(read.deck, read.findings));
    EXPECT_EQ(flat.Checked().Codes(), Strings());
    EXPECT_EQ(flat.deck.blocks.size(), 2U);
}

TEST(Flatten, AFlatDeck_StaysAsItStands) {
    const std::string text =
        "** a comment\n*Heading\nx\n*Node\n1, 0., 0.5, 0.\n*Nset, nset=A\n1,\n*Boundary\nA, 1,  3\n";
    ReadDeckText read(text);
    EXPECT_EQ(Flattened(read.deck, read.findings), text);
}

TEST(Flatten, CoordinatesHaveTheDigitsOfSinglePrecision) {
    ReadDeckText read("*Part, name=P\n*Node\n1, 0.123456789, 1e-30, 0.\n*End Part\n*Assembly, name=A\n"
                      "*Instance, name=I, part=P\n1., 0., 0.\n*End Instance\n*End Assembly\n");
    EXPECT_NE(Flattened(read.deck, read.findings).find("\n1, 1.12345679, 1e-30, 0.\n"), std::string::npos);
}

TEST(Flatten, NamesTooLongOrTaken_GetNumbers) {
    const std::string name(60, 'N');
    ReadDeckText read(
        "*Part, name=P\n*Node\n1, 0., 0., 0.\n*Nset, nset=" + name + "A\n1\n*Nset, nset=" + name +
        "B\n1\n*Nset, nset=X\n1\n*End Part\n*Assembly, name=A\n*Instance, name=" + std::string(30, 'I') +
        ", part=P\n*End Instance\n*Nset, nset=" + std::string(30, 'I') +
        "_X, instance=" + std::string(30, 'I') + "\n1\n*End Assembly\n");
    ReadDeckText flat(Flattened(read.deck, read.findings));
    EXPECT_EQ(flat.Checked().Codes(), Strings());
    ASSERT_EQ(flat.deck.setParts.size(), 4U);
    const std::string beginning = std::string(30, 'I') + "_" + std::string(37, 'N');
    EXPECT_EQ(flat.deck.setParts[0].name, beginning + "_1");
    EXPECT_EQ(flat.deck.setParts[1].name, beginning + "_2");
    EXPECT_EQ(flat.deck.setParts[2].name, std::string(30, 'I') + "_X_1");
    EXPECT_EQ(flat.deck.setParts[3].name, std::string(30, 'I') + "_X");
}

TEST(Flatten, RoundSystemsAreGivenByPoints_BeamsByDirections) {
    ReadDeckText read(
        "*Part, name=P\n*Node\n1, 0., 0., 0.\n*Nset, nset=N\n1\n*Elset, elset=E\n1\n"
        "*Transform, nset=N, type=C\n0., 0., 0., 0., 0., 1.\n"
        "*Beam Section, elset=E, material=M, section=RECT\n2., 3.\n0., 0., -1.\n*End Part\n"
        "*Assembly, name=A\n*Instance, name=I, part=P\n0., 0., 0.\n0., 0., 0., 1., 0., 0., 180.\n"
        "*End Instance\n*Instance, name=J, part=P\n5., 0., 0.\n*End Instance\n*End Assembly\n");
    const std::string flat = Flattened(read.deck, read.findings);
    EXPECT_NE(flat.find("*Transform, nset=I_N, type=C\n0., 0., 0., 0., -1.22464679914735e-16, -1.\n"),
              std::string::npos)
        << flat;
    EXPECT_NE(flat.find("2., 3.\n0., 1.22464679914735e-16, 1.\n"), std::string::npos) << flat;
    EXPECT_NE(flat.find("*Transform, nset=J_N, type=C\n5., 0., 0., 5., 0., 1.\n"), std::string::npos) << flat;
}

TEST(Flatten, WhatAFlatDeckCantSay_IsListed) {
    ReadDeckText read(
        "*Part, name=P\n*Node, system=C\n1, 0., 0., 0.\n*Odd Thing\n*End Part\n*Part, name=Q\n*End Part\n"
        "*Assembly, name=A\n*Instance, name=I, part=P\n*End Instance\n*End Assembly\n");
    Flattened(read.deck, read.findings);
    EXPECT_EQ(read.Codes(), Strings({"flat-left-out:2", "flat-as-it-stands:4", "flat-left-out:6"}));
}

TEST(Flatten, LabelsThatRunOut_AreAnError) {
    std::string text = "*Part, name=P\n*Node\n2147483647, 0., 0., 0.\n*End Part\n*Assembly, name=A\n";
    for (const char* name : {"I", "J"})
        text += "*Instance, name=" + std::string(name) + ", part=P\n*End Instance\n";
    ReadDeckText read(text + "*End Assembly\n");
    EXPECT_EQ(Flattened(read.deck, read.findings), "");
    EXPECT_EQ(read.Codes(), Strings({"flat-labels-run-out:0"}));
}
