#include "DeckTesting.h"
#include "deck_reader/drd_Text.h"
#include "support/TestFolder.h"

namespace {

std::vector<int> Ints(const drd_Flat<int>& flat) {
    return {flat.begin(), flat.end()};
}

} // namespace

TEST(Reader, KeywordLine_WithoutRegardToCapitalsAndBlanks) {
    const ReadDeckText read("* SOLID section , ELSET = \"Two, Words\", material=Steel,\n");
    ASSERT_EQ(read.deck.keywords.size(), 1U);
    const drd_Keyword& keyword = read.deck.keywords[0];
    EXPECT_EQ(keyword.Key(), "solidsection");
    ASSERT_NE(keyword.Row(), nullptr);
    EXPECT_EQ(keyword.Row()->name, "Solid Section");
    EXPECT_EQ(keyword.Value("elset"), "\"Two, Words\"");
    EXPECT_EQ(keyword.Value("material"), "Steel");
    EXPECT_EQ(keyword.Find("composite"), nullptr);
}

TEST(Reader, AParameterWithAnEmptyValue_IsNotOneWithoutAValue) {
    const ReadDeckText read("*Static, direct, stabilize=\n");
    const drd_Keyword& keyword = read.deck.keywords[0];
    ASSERT_EQ(keyword.Parameters().size(), 2U);
    EXPECT_FALSE(keyword.Parameters()[0].HasValue());
    EXPECT_TRUE(keyword.Parameters()[1].HasValue());
    EXPECT_EQ(keyword.Value("stabilize"), "");
}

TEST(Reader, EachSpelling_OfAKeywordIsKeptOnce) {
    const ReadDeckText read("*Nset, nset=A\n1\n*NSET, Nset=B\n1\n*Nset, nset=C\n1\n");
    ASSERT_EQ(read.deck.keywords.size(), 3U);
    const drd_Keyword& first = read.deck.keywords[0];
    EXPECT_EQ(first.word, read.deck.keywords[2].word);
    EXPECT_NE(first.word, read.deck.keywords[1].word);
    EXPECT_EQ(read.deck.keywords[1].Name(), "NSET");
    EXPECT_EQ(read.deck.keywords[1].Key(), first.Key());
    EXPECT_EQ(read.deck.keywords[1].Row(), first.Row());
    EXPECT_TRUE(first.IsBulk());
    EXPECT_FALSE(first.HasText());
}

TEST(Reader, KeywordLine_GoesOnBehindAComma_CommentsBetween) {
    const ReadDeckText read("*Shell Section, elset=A,\n** a comment\n  material=M,\noffset=0.5\n1., 5\n");
    ASSERT_EQ(read.deck.keywords.size(), 1U);
    EXPECT_EQ(read.deck.keywords[0].Value("material"), "M");
    EXPECT_EQ(read.deck.keywords[0].Value("offset"), "0.5");
    EXPECT_EQ(read.deck.keywords[0].lines, 1U);
    EXPECT_EQ(read.deck.comments.Size(), 1U);
    EXPECT_EQ(read.Codes(), Strings());
}

// The writer leaves such lines for profiles without a word of their own.
TEST(Reader, KeywordLine_ThatEndsWithACommaAheadOfNumbers_IsNotGoneOnWith) {
    const ReadDeckText read("*Beam Section, elset=E4, temperature=GRADIENTS, \n0.,0.,-1.\n");
    EXPECT_EQ(read.deck.keywords[0].Parameters().size(), 2U);
    EXPECT_EQ(read.deck.keywords[0].lines, 1U);
    EXPECT_EQ(read.Codes(), Strings({"keyword-left-open:1"}));
}

// Some parameters of the writer bring their comma, so that it stands at the head of the next line.
TEST(Reader, KeywordLine_BeyondTheBreak_MayGoOnWithTheCommaAhead) {
    const std::string name(130, 'N');
    const ReadDeckText read("*Amplitude, name=" + name + "\n, begin=1e+20\n0., 1.\n");
    ASSERT_EQ(read.deck.keywords.size(), 1U);
    EXPECT_EQ(read.deck.keywords[0].Value("begin"), "1e+20");
    EXPECT_EQ(read.deck.keywords[0].lines, 1U);
    EXPECT_EQ(read.Codes(), Strings({"comma-ahead:2"}));
    // A short line doesn't: there the comma stands ahead of data.
    const ReadDeckText data("*Cload\n, 1, 12000.\n");
    EXPECT_EQ(data.deck.keywords[0].lines, 1U);
}

TEST(Reader, Nodes_GoToFlatArrays) {
    const ReadDeckText read("*Node, nset=ALL\n 1, 0.5, 1e1\n** between\n20, -1., 2., 3.,\n3\n");
    ASSERT_EQ(read.deck.meshes.size(), 1U);
    const drd_Mesh& mesh = read.deck.meshes[0];
    EXPECT_EQ(Ints(mesh.nodes), (std::vector<int>{1, 20, 3}));
    EXPECT_EQ(std::vector<double>(mesh.coordinates.begin(), mesh.coordinates.end()),
              (std::vector<double>{0.5, 10., 0., -1., 2., 3., 0., 0., 0.}));
    EXPECT_EQ(drd_PlaceOf(mesh.nodePlaces, 0).line, 2);
    EXPECT_EQ(drd_PlaceOf(mesh.nodePlaces, 1).line, 4);
    EXPECT_EQ(drd_PlaceOf(mesh.nodePlaces, 2).line, 5);
    EXPECT_EQ(read.deck.lines.Size(), 0U);
    EXPECT_EQ(read.Codes(), Strings());
}

TEST(Reader, Elements_GoOnBehindAComma_AsTheirTypeAllows) {
    const ReadDeckText known(
        "*Element, type=T3D2\n1, 1, 2,\n2, 2, 3\n*Element, type=C3D8\n3, 1,2,3,4,\n5,6,\n7,8\n");
    const drd_Mesh& mesh = known.deck.meshes[0];
    EXPECT_EQ(Ints(mesh.elements), (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(Ints(mesh.connectivity), (std::vector<int>{1, 2, 2, 3, 1, 2, 3, 4, 5, 6, 7, 8}));
    ASSERT_EQ(mesh.elementRuns.size(), 2U);
    EXPECT_EQ(mesh.elementRuns[0].nodes, 2);
    EXPECT_EQ(mesh.elementRuns[0].count, 2U);
    EXPECT_EQ(mesh.elementRuns[1].nodes, 8);
    EXPECT_EQ(known.deck.types, Strings({"T3D2", "C3D8"}));
    EXPECT_EQ(drd_PlaceOf(mesh.elementPlaces, 2).line, 5);
    // Without a known type the comma alone decides.
    const ReadDeckText unknown("*Element, type=U7\n1, 1, 2,\n3\n4, 5\n");
    EXPECT_EQ(Ints(unknown.deck.meshes[0].connectivity), (std::vector<int>{1, 2, 3, 5}));
    EXPECT_EQ(unknown.deck.meshes[0].elementRuns.size(), 2U);
}

TEST(Reader, Elements_OfTheAssembly_NameNodesOfInstances) {
    const ReadDeckText read("*Element, type=CONN3D2\n1, Bar-1.5, \"two words\".7\n2, 9, Bar-1.6\n");
    const drd_Mesh& mesh = read.deck.meshes[0];
    EXPECT_EQ(Ints(mesh.connectivity), (std::vector<int>{5, 7, 9, 6}));
    EXPECT_EQ(Ints(mesh.owners), (std::vector<int>{0, 1, -1, 0}));
    EXPECT_EQ(read.deck.owners, Strings({"Bar-1", "two words"}));
}

TEST(Reader, Sets_KeepLabelsRangesAndNames) {
    const ReadDeckText read("*Nset, nset=A\n1, 2,3\n7,\n*Elset, elset=B, generate\n1, 9, 2\n3, 4\n"
                            "*Nset, nset=\"C d\", instance=I-1\nA, \"x, y\", I.5\n");
    ASSERT_EQ(read.deck.setParts.size(), 3U);
    const drd_SetPart& a = read.deck.setParts[0];
    const auto labels = read.deck.labels.Part(a.first, a.count);
    EXPECT_EQ(std::vector<int>(labels.begin(), labels.end()), (std::vector<int>{1, 2, 3, 7}));
    const drd_SetPart& b = read.deck.setParts[1];
    EXPECT_TRUE(b.isGenerated);
    const auto range = read.deck.labels.Part(b.first, b.count);
    EXPECT_EQ(std::vector<int>(range.begin(), range.end()), (std::vector<int>{1, 9, 2, 3, 4, 1}));
    const drd_SetPart& c = read.deck.setParts[2];
    EXPECT_EQ(c.name, "C d");
    EXPECT_EQ(c.instance, "I-1");
    EXPECT_EQ(Strings(c.members.begin(), c.members.end()), Strings({"A", "\"x, y\"", "I.5"}));
}

TEST(Reader, Blocks_NestAndEnd) {
    const ReadDeckText read(
        "*Heading\nhello\n*Part, name=P\n*Node\n1, 0., 0., 0.\n*End Part\n"
        "*Assembly, name=A\n*Instance, name=I, part=P\n1., 0., 0.\n*End Instance\n*End Assembly\n"
        "*Material, name=M\n*Elastic\n1., 0.3\n*Density\n2.,\n*Amplitude, name=T\n0., 1.\n"
        "*Step, name=S\n*Static\n*Load Case, name=L\n*End Load Case\n*End Step\n");
    const drd_Deck& deck = read.deck;
    ASSERT_EQ(deck.blocks.size(), 6U);
    EXPECT_EQ(deck.blocks[1].kind, drd_BlockEnm::PART);
    EXPECT_EQ(deck.blocks[1].name, "P");
    EXPECT_EQ(deck.blocks[3].kind, drd_BlockEnm::INSTANCE);
    EXPECT_EQ(deck.blocks[3].parent, 2);
    EXPECT_EQ(deck.blocks[5].kind, drd_BlockEnm::LOAD_CASE);
    EXPECT_EQ(deck.blocks[5].parent, 4);
    for (std::size_t i = 1; i < deck.blocks.size(); ++i) EXPECT_GE(deck.blocks[i].end, 0) << i;
    // Elastic and Density are the material's, the amplitude is no option of it.
    const drd_Keyword& material = deck.keywords[8];
    EXPECT_EQ(material.Key(), "material");
    EXPECT_EQ(material.end, 11);
    EXPECT_EQ(deck.keywords[9].parent, 8);
    EXPECT_EQ(deck.keywords[10].parent, 8);
    EXPECT_EQ(deck.keywords[11].parent, -1);
    EXPECT_EQ(read.Codes(), Strings());
}

TEST(Reader, BlocksWithoutEndOrBeginning_AreTold) {
    EXPECT_EQ(ReadDeckText("*Step\n*Static\n*Step\n*End Step\n").Codes(), Strings({"block-left-open:1"}));
    EXPECT_EQ(ReadDeckText("*Step\n*Static\n").Codes(), Strings({"block-left-open:1"}));
    EXPECT_EQ(ReadDeckText("*End Part\n").Codes(), Strings({"end-without-begin:1"}));
    EXPECT_EQ(ReadDeckText("*Assembly, name=A\n*Instance, name=I\n*End Assembly\n").Codes(),
              Strings({"block-left-open:2"}));
}

TEST(Reader, WrongText_IsTold) {
    EXPECT_EQ(ReadDeckText("1, 2\n*Node\n").Codes(), Strings({"data-before-keyword:1"}));
    EXPECT_EQ(ReadDeckText("*Node\n1, a, 2.\n").Codes(), Strings({"not-a-number:2"}));
    EXPECT_EQ(ReadDeckText("*Node\n1.5, 0., 2.\n").Codes(), Strings({"not-a-number:2"}));
    EXPECT_EQ(ReadDeckText("*Node\n0, 1., 2.\n").Codes(), Strings({"label-not-positive:2"}));
    EXPECT_EQ(ReadDeckText("*Node\n1, 1., 2., 3., 4.\n").Codes(), Strings({"node-columns:2"}));
    EXPECT_EQ(ReadDeckText("*Element, type=T3D2\n1, x, 2\n").Codes(), Strings({"not-a-number:2"}));
    EXPECT_EQ(ReadDeckText("*Element\n1, 1, 2\n").Codes(), Strings({"element-without-type:1"}));
    EXPECT_EQ(ReadDeckText("*Nset, nset=A, generate\n5, 1, 1\n").Codes(), Strings({"range-endless:2"}));
    EXPECT_EQ(ReadDeckText("*Nset, nset=A, generate\n1, x\n").Codes(), Strings({"not-a-number:2"}));
    EXPECT_EQ(ReadDeckText("*Nset, nset=\"A\n1\n").Codes(), Strings({"quote-left-open:1"}));
    EXPECT_EQ(ReadDeckText("*, a\n").Codes(), Strings({"keyword-without-name:1"}));
    EXPECT_EQ(ReadDeckText("*Heading\n" + std::string(257, 'x') + "\n").Codes(),
              Strings({"line-over-limit:2"}));
    EXPECT_EQ(ReadDeckText("*Heading\na\tb\n").Codes(), Strings({"tab-in-line:2"}));
    EXPECT_EQ(ReadDeckText(std::string("*Heading\nab\0c\n", 13)).Codes(), Strings({"not-a-deck:3"}));
}

TEST(Reader, ManyFindingsOfOneKind_AreCountedAndNotKept) {
    std::string text = "*Node\n";
    for (int i = 0; i < 1000; ++i) text += "x\n";
    const ReadDeckText read(text);
    EXPECT_EQ(read.findings.List().size(), drd_Findings::kShownOfOneKind);
    EXPECT_EQ(read.findings.Counts().at("not-a-number"), 1000U);
}

TEST(Reader, DataLinesAndComments_AreKeptAsTheyStand) {
    const ReadDeckText read("** first\n*Elastic\n 1.0 ,.3\n** inside\n\n2,\n");
    const drd_Deck& deck = read.deck;
    ASSERT_EQ(deck.keywords[0].lines, 3U);
    EXPECT_EQ(deck.DataLine(deck.keywords[0], 0), " 1.0 ,.3");
    EXPECT_EQ(deck.DataLine(deck.keywords[0], 1), "");
    EXPECT_EQ(deck.DataPlace(deck.keywords[0], 2).line, 6);
    ASSERT_EQ(deck.comments.Size(), 2U);
    EXPECT_EQ(deck.comments[0].keyword, -1);
    EXPECT_EQ(deck.Text(deck.comments[1].text), "** inside");
    EXPECT_EQ(deck.comments[1].keyword, 0);
    EXPECT_EQ(deck.comments[1].linesAhead, 1U);
}

TEST(Reader, Includes_AreReadInTheirPlace) {
    const TestFolder folder;
    std::filesystem::create_directory(folder.Path("sub"));
    folder.Put("job.inp",
               "*Node\n1, 0., 0., 0.\n*Include, INPUT=sub/more.inp\n4, 0., 0., 0.\n*Nset, nset=A\n1\n");
    folder.Put("sub/more.inp", "2, 0., 0., 0.\n*include, input=\"deep er.inp\"\n");
    folder.Put("sub/deep er.inp", "3, 1., 2., 3.\n");
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeck(folder.Path("job.inp"), {}, findings);
    EXPECT_TRUE(findings.List().empty());
    ASSERT_EQ(deck.files.size(), 3U);
    EXPECT_EQ(deck.files[2].includedAt.file, 1);
    EXPECT_EQ(deck.files[2].includedAt.line, 2);
    const drd_Mesh& mesh = deck.meshes[0];
    EXPECT_EQ(Ints(mesh.nodes), (std::vector<int>{1, 2, 3, 4}));
    EXPECT_EQ(drd_PlaceOf(mesh.nodePlaces, 2).file, 2);
    EXPECT_EQ(drd_PlaceOf(mesh.nodePlaces, 3).line, 4);
    EXPECT_EQ(deck.keywords.size(), 2U);
    // Kept shut, the include is a keyword like any other.
    drd_ReadOptions shut;
    shut.followIncludes = false;
    const drd_Deck outer = drd_ReadDeck(folder.Path("job.inp"), shut, findings);
    EXPECT_EQ(outer.files.size(), 1U);
    EXPECT_EQ(outer.keywords[1].Key(), "include");
}

TEST(Reader, IncludesInACircle_AndOfNothing_AreTold) {
    const TestFolder folder;
    folder.Put("a.inp", "*Include, input=b.inp\n*Include, input=none.inp\n*Include\n*Include, input=.\n");
    folder.Put("b.inp", "*Include, input=./a.inp\n");
    drd_Findings findings;
    drd_ReadDeck(folder.Path("a.inp"), {}, findings);
    Strings codes;
    for (const drd_Finding& finding : findings.List()) codes.emplace_back(finding.code->name);
    EXPECT_EQ(codes,
              Strings({"include-in-circle", "deck-unreadable", "include-without-file", "deck-unreadable"}));
}

TEST(Reader, FilesNestedWithoutEnd_AreTold) {
    const TestFolder folder;
    for (int i = 0; i < 100; ++i) {
        folder.Put(std::to_string(i), "*Include, input=" + std::to_string(i + 1) + "\n");
    }
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeck(folder.Path("0"), {}, findings);
    ASSERT_EQ(findings.List().size(), 1U);
    EXPECT_EQ(findings.List()[0].code->name, "include-in-circle");
    EXPECT_EQ(deck.files.size(), 64U);
}

TEST(Reader, AFileThatIsNotThere_IsTold) {
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeck("/nowhere/at/all.inp", {}, findings);
    ASSERT_EQ(findings.List().size(), 1U);
    EXPECT_EQ(findings.List()[0].code->name, "deck-unreadable");
    EXPECT_TRUE(deck.keywords.empty());
}

TEST(Reader, NamesInLatin1_AreNames) {
    const ReadDeckText read("*Nset, nset=\"Gr\xF6\xDF"
                            "e\"\n1\n");
    EXPECT_EQ(read.deck.setParts[0].name, "Gr\xF6\xDF"
                                          "e");
    EXPECT_EQ(read.Codes(), Strings());
}

TEST(Placement, IsTheTranslationThenTheTurn) {
    const ReadDeckText read(
        "*Instance, name=I, part=P\n10., 0., 0.\n10., 0., 0., 10., 0., 1., 90.\n*End Instance\n");
    drd_Placement placement;
    ASSERT_TRUE(drd_PlacementOf(read.deck, read.deck.blocks[1], placement));
    const double point[3] = {1., 2., 3.};
    double placed[3];
    placement.Place(point, placed);
    EXPECT_NEAR(placed[0], 8., 1e-14);
    EXPECT_NEAR(placed[1], 1., 1e-14);
    EXPECT_NEAR(placed[2], 3., 1e-14);
    placement.Turn(point, placed);
    EXPECT_NEAR(placed[0], -2., 1e-14);
    EXPECT_NEAR(placed[1], 1., 1e-14);
    EXPECT_FALSE(placement.IsNone());
}
