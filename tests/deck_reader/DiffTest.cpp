#include "DeckTesting.h"
#include "deck_reader/drd_Emitter.h"

namespace {

constexpr const char* kDeck = R"(** the first
*Heading
title
*Part, name=P
*Node
1, 0., 0., 0.
2, 1., 0., 0.
3, 2., 0., 0.
*Element, type=T3D2
1, 1, 2
2, 2, 3
*Nset, nset=ALL, generate
1, 3, 1
*Elset, elset=BARS
1, 2
*Surface, type=ELEMENT, name=ENDS
BARS, END1
BARS, END2
*Solid Section, elset=BARS, material=Steel
1.,
*End Part
*Assembly, name=A
*Instance, name=BEAM-1, part=P
*End Instance
*Nset, nset=TIP, instance=BEAM-1
3,
*End Assembly
*Material, name=Steel
*Density
7.85e-09,
*Elastic
210000., 0.3
*Amplitude, name=Ramp
0., 0., 1., 1.
*Step, name=Push, nlgeom=YES
push it
*Static
1., 1., 1e-05, 1.
*Boundary
BEAM-1.ALL, 1, 3
*Cload, amplitude=Ramp
TIP, 3, -4.
*End Step
*Step, name=Pull
*Static
1., 1., 1e-05, 1.
*Cload
TIP, 3, 4.
*Output, field
*Node Output
U, RF
*End Step
)";

std::string With(std::string text, const std::string& from, const std::string& to) {
    const std::size_t place = text.find(from);
    EXPECT_NE(place, std::string::npos) << from;
    return text.replace(place, from.size(), to);
}

Strings ChangedBy(const std::string& from, const std::string& to, const drd_DiffOptions& options = {}) {
    return DifferencesOf(kDeck, With(kDeck, from, to), options);
}

const Strings kNone;

} // namespace

TEST(DeckDiff, ADeckAndItself_AreEqual) {
    EXPECT_EQ(DifferencesOf(kDeck, kDeck), kNone);
}

TEST(DeckDiff, SpellingMakesNoDifference) {
    EXPECT_EQ(ChangedBy("*Solid Section, elset=BARS, material=Steel",
                        "*SOLIDSECTION, Material = \"STEEL\",\n elset=bars"),
              kNone);
    EXPECT_EQ(ChangedBy("210000., 0.3", " 2.1E5 ,3.0e-1,"), kNone);
    EXPECT_EQ(ChangedBy("1, 0., 0., 0.", "  1,0,0.0e0,"), kNone);
    EXPECT_EQ(ChangedBy("*Nset, nset=ALL, generate\n1, 3, 1", "*NSET, NSET=all\n3,2\n1"), kNone);
    EXPECT_EQ(
        ChangedBy("*Elset, elset=BARS\n1, 2", "*Elset, elset=BARS\n2\n*Elset, elset=BARS, generate\n1, 1"),
        kNone);
    EXPECT_EQ(ChangedBy("BARS, END1\nBARS, END2", "bars,END2\nBARS, end1"), kNone);
    EXPECT_EQ(ChangedBy("1, 1, 2\n2, 2, 3", "1,1,\n2\n*Element, type=t3d2\n2, 2, 3"), kNone);
}

TEST(DeckDiff, OrderThatMeansNothingMakesNoDifference) {
    EXPECT_EQ(ChangedBy("*Density\n7.85e-09,\n*Elastic\n210000., 0.3\n",
                        "*Elastic\n210000., 0.3\n*Density\n7.85e-09,\n"),
              kNone);
    EXPECT_EQ(
        ChangedBy(
            "*Material, name=Steel\n*Density\n7.85e-09,\n*Elastic\n210000., 0.3\n*Amplitude, name=Ramp\n0., "
            "0., 1., 1.\n",
            "*Amplitude, name=Ramp\n0., 0., 1., 1.\n*Material, name=Steel\n*Density\n7.85e-09,\n*Elastic\n"
            "210000., 0.3\n"),
        kNone);
    EXPECT_EQ(ChangedBy("1, 0., 0., 0.\n2, 1., 0., 0.", "2, 1., 0., 0.\n1, 0., 0., 0."), kNone);
}

TEST(DeckDiff, Comments_AreToldApart) {
    const ReadDeckText a(kDeck);
    const ReadDeckText b(With(kDeck, "** the first", "** another"));
    const drd_DiffResult result = drd_Diff(a.deck, b.deck, {});
    EXPECT_TRUE(result.IsEqual());
    EXPECT_EQ(result.commentsRemoved, Strings({"the first"}));
    EXPECT_EQ(result.commentsAdded, Strings({"another"}));
    drd_DiffOptions options;
    options.ignoreComments = true;
    EXPECT_TRUE(drd_Diff(a.deck, b.deck, options).commentsAdded.empty());
}

TEST(DeckDiff, Loads_AsAnEngineerWouldSayIt) {
    EXPECT_EQ(ChangedBy("TIP, 3, -4.", "TIP, 3, -8."),
              Strings({"step Push: load on TIP, dof 3: -4. became -8."}));
    EXPECT_EQ(ChangedBy("TIP, 3, -4.", "TIP, 3, -4.\nTIP, 1, 2."),
              Strings({"step Push: load on TIP, dof 1 added: TIP, 1, 2."}));
    EXPECT_EQ(ChangedBy("BEAM-1.ALL, 1, 3", "BEAM-1.ALL, 1, 2"),
              Strings({"step Push: boundary condition on BEAM-1.ALL, dof 1 to 3 removed",
                       "step Push: boundary condition on BEAM-1.ALL, dof 1 to 2 added: BEAM-1.ALL, 1, 2"}));
    EXPECT_EQ(ChangedBy("*Cload, amplitude=Ramp", "*Cload, op=NEW"),
              Strings({"step Push: load on TIP, dof 3: no longer amplitude=Ramp",
                       "step Push: load on TIP, dof 3: now with op=NEW"}));
    EXPECT_EQ(ChangedBy("*Cload\nTIP, 3, 4.", "*Cload, op=NEW"),
              Strings({"step Pull: load on TIP, dof 3 removed",
                       "step Pull: loads: all taken away (op=NEW without lines) added"}));
    // One keyword of two lines says what two of one line say.
    EXPECT_EQ(DifferencesOf("*Step\n*Cload\nA, 1, 1.\nB, 1, 1.\n*End Step\n",
                            "*Step\n*Cload\nA, 1, 1.\n*Cload\nB, 1, 1.\n*End Step\n"),
              kNone);
}

TEST(DeckDiff, BothPlacesAreTold) {
    const ReadDeckText a(kDeck);
    const ReadDeckText b(With(kDeck, "TIP, 3, -4.", "** x\nTIP, 3, -8."));
    const drd_DiffResult result = drd_Diff(a.deck, b.deck, {});
    ASSERT_EQ(result.differences.size(), 1U);
    EXPECT_EQ(result.differences[0].first.line, 42);
    EXPECT_EQ(result.differences[0].second.line, 43);
    EXPECT_EQ(result.summary.at("load").at(drd_ChangeEnm::CHANGED), 1);
}

TEST(DeckDiff, MaterialsStepsAndParameters) {
    EXPECT_EQ(ChangedBy("210000.", "200000."),
              Strings({"material Steel: *Elastic: 210000. became 200000. (line 1, value 1)"}));
    EXPECT_EQ(ChangedBy("*Density\n7.85e-09,\n", ""), Strings({"material Steel: *Density removed"}));
    EXPECT_EQ(ChangedBy("nlgeom=YES", "nlgeom=NO"), Strings({"step Push: nlgeom=YES became nlgeom=NO"}));
    EXPECT_EQ(ChangedBy(", nlgeom=YES", ", inc=5"),
              Strings({"step Push: nlgeom=YES is gone", "step Push: inc=5 is new"}));
    EXPECT_EQ(ChangedBy("push it", "push it hard"),
              Strings({"step Push: \"push it\" became \"push it hard\""}));
    EXPECT_EQ(ChangedBy("0., 0., 1., 1.", "0., 0., 1., 1.\n2., 0."),
              Strings({"amplitude Ramp: nothing became \"2., 0.\""}));
    EXPECT_EQ(ChangedBy("*Amplitude, name=Ramp\n0., 0., 1., 1.\n", ""), Strings({"amplitude Ramp removed"}));
    EXPECT_EQ(ChangedBy("*Step, name=Pull", "*Step, name=Tear"),
              Strings({"step Pull: removed", "step Tear: added"}));
}

TEST(DeckDiff, MovedStepsAndConditions_AreToldAsMoved) {
    const std::string a = "*Step, name=A\n*Static\n*End Step\n";
    const std::string b = "*Step, name=B\n*Static\n*End Step\n";
    const std::string c = "*Step, name=C\n*Static\n*End Step\n";
    EXPECT_EQ(DifferencesOf(a + b + c, b + c + a),
              Strings({"step A: stands in another place among the steps"}));
    const std::string first = "*Boundary\nX, 1\n";
    const std::string second = "*Boundary, op=NEW\nY, 1\n";
    EXPECT_EQ(DifferencesOf(first + second, second + first).size(), 1U);
    drd_DiffOptions options;
    options.ignoreOrder = true;
    EXPECT_EQ(DifferencesOf(a + b + c, b + c + a, options), kNone);
}

TEST(DeckDiff, TheOrderOfPlies_IsAMatter) {
    const std::string deck = "*Shell Section, elset=A, composite\n1., 3, M\n2., 3, N\n";
    EXPECT_EQ(DifferencesOf(deck, With(deck, "1., 3, M\n2., 3, N", "2., 3, N\n1., 3, M")).size(), 2U);
}

TEST(DeckDiff, Meshes_ByCountAndFirstLabels) {
    EXPECT_EQ(ChangedBy("3, 2., 0., 0.", "3, 2., 0.25, 0."),
              Strings({"part P: 1 node (3) stands elsewhere, at most 0.25 apart"}));
    EXPECT_EQ(ChangedBy("2, 1., 0., 0.\n3, 2., 0., 0.", "2, 1.5, 0., 0.\n4, 2., 0., 0."),
              Strings({"part P: 1 node (2) stands elsewhere, at most 0.5 apart", "part P: 1 node (3) removed",
                       "part P: 1 node (4) added"}));
    EXPECT_EQ(ChangedBy("2, 2, 3", "2, 3, 2"), Strings({"part P: 1 element (2) has other nodes"}));
    EXPECT_EQ(ChangedBy("*Element, type=T3D2\n1, 1, 2\n2, 2, 3", "*Element, type=B31\n1, 1, 2\n3, 2, 3"),
              Strings({"part P: 1 element (1) has another type", "part P: 1 element (2) removed",
                       "part P: 1 element (3) added"}));
    drd_DiffOptions options;
    options.tolerance = 1e-3;
    EXPECT_EQ(ChangedBy("3, 2., 0., 0.", "3, 2.0001, 0., 0.", options), kNone);
}

TEST(DeckDiff, SetsAndInstances) {
    EXPECT_EQ(ChangedBy("*Nset, nset=TIP, instance=BEAM-1\n3,", "*Nset, nset=TIP, instance=BEAM-1\n2, 1"),
              Strings({"node set TIP: 2 nodes (1, 2) added, 1 node (3) removed"}));
    EXPECT_EQ(ChangedBy("1, 3, 1", "1, 2, 1"), Strings({"node set part P: ALL: 1 node (3) removed"}));
    EXPECT_EQ(ChangedBy("part=P\n", "part=P\n0., 0., 5.\n"),
              Strings({"assembly: instance BEAM-1: nothing became \"0., 0., 5.\""}));
    EXPECT_EQ(ChangedBy("part=P\n", "part=P\n0., 0., 0.\n"), kNone);
    EXPECT_EQ(ChangedBy("*Nset, nset=TIP, instance=BEAM-1\n3,\n", ""), Strings({"node set TIP removed"}));
}

TEST(DeckDiff, Tolerance_IsAPartOfTheGreaterNumber) {
    drd_DiffOptions options;
    options.tolerance = 0.01;
    EXPECT_EQ(ChangedBy("210000.", "211000.", options), kNone);
    EXPECT_EQ(ChangedBy("TIP, 3, -4.", "TIP, 3, -4.01", options), kNone);
    EXPECT_EQ(ChangedBy("210000.", "220000.", options).size(), 1U);
}

TEST(DeckDiff, NamesTitlesAndOutput_CanBeIgnored) {
    drd_DiffOptions options;
    options.ignoreNames = true;
    std::string renamed = kDeck;
    for (const auto& [from, to] : {std::pair{"Ramp", "Slope"}, {"BARS", "RODS"}, {"Steel", "S355"}}) {
        for (std::size_t at = 0; (at = renamed.find(from, at)) != std::string::npos;) {
            renamed.replace(at, std::string(from).size(), to);
        }
    }
    EXPECT_EQ(DifferencesOf(kDeck, renamed, options), kNone);
    EXPECT_NE(DifferencesOf(kDeck, renamed), kNone);
    drd_DiffOptions titles;
    titles.ignoreTitles = true;
    EXPECT_EQ(ChangedBy("push it", "pull it", titles), kNone);
    EXPECT_EQ(ChangedBy("title", "another", titles), kNone);
    drd_DiffOptions output;
    output.ignoreOutput = true;
    EXPECT_EQ(ChangedBy("*Output, field\n*Node Output\nU, RF\n", "", output), kNone);
}

TEST(DeckDiff, ADeckAndItsOtherForm_AreEqual) {
    const ReadDeckText read(kDeck);
    qio_StringDevice device;
    drd_Reformat(read.deck, device);
    EXPECT_NE(device.Text(), kDeck);
    EXPECT_EQ(DifferencesOf(kDeck, device.Text()), kNone);
}

TEST(DeckDiff, NamesThatLookLikeNumbers_StayInTheOtherForm) {
    const std::string deck = "*Node\n1, 0., 0., 0.\n*Nset, nset=01\n1,\n*Nset, nset=1.50\n1,\n"
                             "*Amplitude, name=007, value=01\n00, 1.50\n"
                             "*Boundary, amplitude=007\n01, 02, 02, 0.250\n1.50, 3, 3\n";
    const ReadDeckText read(deck);
    qio_StringDevice device;
    drd_Reformat(read.deck, device);
    EXPECT_EQ(device.Text(), "*Node\n1, 0., 0., 0.\n*Nset, nset=01\n1,\n*Nset, nset=1.50\n1,\n"
                             "*Amplitude, name=007, value=1\n0, 1.5\n"
                             "*Boundary, amplitude=007\n01, 2, 2, 0.25\n1.50, 3, 3\n");
    EXPECT_EQ(DifferencesOf(deck, device.Text()), kNone);
}

TEST(DeckDiff, ALongKeywordLineWithAParameterOfNoLetter_AndItsOtherForm_AreEqual) {
    const std::string deck = "*Tie, name=tie, adjust=no, position tolerance=0.01, no rotation, no thickness, "
                             "type=NODE TO SURFACE, cyclic symmetry, \xe9tendue=0.5, 2d\nA, B\n";
    const ReadDeckText read(deck);
    qio_StringDevice device;
    drd_Reformat(read.deck, device);
    EXPECT_EQ(DifferencesOf(deck, device.Text()), kNone) << device.Text();
}
