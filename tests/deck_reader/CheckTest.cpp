#include "DeckTesting.h"

namespace {

/// A deck in which nothing is wrong; tests put a line of their own into it.
constexpr const char* kRight = R"(*Heading
right
*Part, name=P
*Node
1, 0., 0., 0.
2, 1., 0., 0.
*Element, type=T3D2
1, 1, 2
*Elset, elset=ALL
1,
*Nset, nset=TIP
2,
*Surface, type=ELEMENT, name=END
ALL, END2
*Solid Section, elset=ALL, material=Steel
1.,
*End Part
*Assembly, name=A
*Instance, name=I-1, part=P
*End Instance
*End Assembly
*Material, name=Steel
*Elastic
210000., 0.3
*Amplitude, name=Ramp
0., 0., 1., 1.
*Step, name=Pull
*Static
1., 1.
*Cload, amplitude=ramp
I-1.TIP, 1, 5.
i-1.2, 2, 5.
*End Step
)";

Strings CodesWith(const std::string& from, const std::string& to) {
    std::string text = kRight;
    const std::size_t place = text.find(from);
    EXPECT_NE(place, std::string::npos) << from;
    text.replace(place, from.size(), to);
    return ReadDeckText(text).Checked().Codes();
}

Strings CodesBehind(const std::string& line, const std::string& added) {
    return CodesWith(line, line + added);
}

} // namespace

TEST(DeckCheck, ARightDeck_HasNoFindings) {
    EXPECT_EQ(ReadDeckText(kRight).Checked().Codes(), Strings());
}

TEST(DeckCheck, UnknownKeywords_HaveTheNearestKnownOne) {
    ReadDeckText read("*Bondary\n");
    read.Checked();
    ASSERT_EQ(read.findings.List().size(), 1U);
    EXPECT_EQ(read.findings.List()[0].code->name, "unknown-keyword");
    EXPECT_EQ(read.findings.List()[0].found, "'*Bondary'");
    EXPECT_EQ(read.findings.List()[0].hint, "did you mean 'Boundary'?");
}

TEST(DeckCheck, KeywordsOutOfPlace) {
    EXPECT_EQ(CodesBehind("*Amplitude, name=Ramp\n0., 0., 1., 1.\n", "*Static\n"),
              Strings({"keyword-out-of-place:27"}));
    EXPECT_EQ(CodesWith("*Heading\nright\n", "*Heading\nright\n*Elastic\n1., 0.3\n"),
              Strings({"option-without-owner:3"}));
    EXPECT_EQ(CodesBehind("right\n", "*Instance, name=X, part=P\n*End Instance\n"),
              Strings({"keyword-out-of-place:3"}));
}

TEST(DeckCheck, ReferencesThatLeadNowhere) {
    EXPECT_EQ(CodesWith("I-1.TIP", "I-1.TOP"), Strings({"undefined-set:31"}));
    EXPECT_EQ(CodesWith("I-1.TIP", "TIP"), Strings({"undefined-set:31"}));
    EXPECT_EQ(CodesWith("i-1.2", "i-1.3"), Strings({"undefined-set:32"}));
    EXPECT_EQ(CodesWith("i-1.2", "3"), Strings({"undefined-node:32"}));
    EXPECT_EQ(CodesWith("amplitude=ramp", "amplitude=rump"), Strings({"undefined-name:30"}));
    EXPECT_EQ(CodesWith("material=Steel", "material=Steal"), Strings({"undefined-name:15"}));
    EXPECT_EQ(CodesWith("material=Steel", "material=Steel, orientation=O"), Strings({"undefined-name:15"}));
    EXPECT_EQ(CodesWith("part=P", "part=Q"),
              Strings({"undefined-name:19", "undefined-set:31", "undefined-set:32"}));
    EXPECT_EQ(CodesBehind("*Static\n1., 1.\n", "*Sfilm\nI-1.FACE, F, 1., 2.\n"),
              Strings({"undefined-surface:31"}));
    EXPECT_EQ(CodesBehind("*Static\n1., 1.\n", "*Sfilm\nI-1.END, F, 1., Oil\n"),
              Strings({"undefined-name:31"}));
    EXPECT_EQ(CodesBehind("*Static\n1., 1.\n", "*Contact Pair, interaction=Dry\nI-1.END, I-1.END\n"),
              Strings({"undefined-name:30"}));
    EXPECT_EQ(CodesWith("ALL, END2", "NONE, END2"), Strings({"undefined-set:14"}));
    EXPECT_EQ(CodesWith("ALL, END2", "1, END2"), Strings());
    EXPECT_EQ(CodesWith("ALL, END2", "2, END2"), Strings({"undefined-element:14"}));
}

TEST(DeckCheck, HintsNameTheInstance) {
    ReadDeckText read(
        "*Assembly, name=A\n*Instance, name=I, part=P\n*Nset, nset=TIP\n*End Instance\n*End Assembly\n"
        "*Step\n*Cload\nTIP, 1, 1.\n*End Step\n");
    read.Checked();
    bool found = false;
    for (const drd_Finding& finding : read.findings.List()) {
        if (finding.code->name != "undefined-set") continue;
        found = true;
        EXPECT_EQ(finding.found, "the node set 'TIP' of '*Cload'");
        EXPECT_EQ(finding.hint, "did you mean 'I.TIP'?");
    }
    EXPECT_TRUE(found);
}

TEST(DeckCheck, Meshes) {
    EXPECT_EQ(CodesBehind("2, 1., 0., 0.\n", "1, 5., 5., 5.\n"), Strings({"repeated-node:7"}));
    EXPECT_EQ(CodesBehind("1, 1, 2\n", "1, 2, 1\n"), Strings({"repeated-element:9"}));
    EXPECT_EQ(CodesWith("1, 1, 2\n", "1, 1, 7\n"), Strings({"element-without-node:8"}));
    EXPECT_EQ(CodesWith("1, 1, 2\n", "1, 1, 2, 1\n"), Strings({"element-node-count:8"}));
    EXPECT_EQ(CodesBehind("1, 1, 2\n", "5, 2, 1\n"), Strings({"element-without-section:9"}));
    EXPECT_EQ(CodesBehind("1, 1, 2\n", "*Element, type=SPRINGA\n5, 2, 1\n"), Strings());
    EXPECT_EQ(CodesWith(", material=Steel", ""), Strings({"section-without-material:15"}));
    EXPECT_EQ(CodesBehind("2,\n", "*Nset, nset=EMPTY\n"), Strings({"empty-set-in-deck:13"}));
    EXPECT_EQ(CodesBehind("2,\n", "*Nset, nset=FAR\n2, 9\n"), Strings({"undefined-node:13"}));
    EXPECT_EQ(CodesBehind("2,\n", "*Nset, nset=OTHERS\nTIP, TOP\n"), Strings({"undefined-set:13"}));
}

TEST(DeckCheck, NamesTwiceAndNotAtAll) {
    EXPECT_EQ(CodesBehind("0., 0., 1., 1.\n", "*Material, name=STEEL\n"), Strings({"defined-twice:27"}));
    EXPECT_EQ(CodesBehind("0., 0., 1., 1.\n", "*Material\n"), Strings({"name-missing:27"}));
    EXPECT_EQ(CodesBehind("0., 0., 1., 1.\n", "*Step, name=pull\n*End Step\n"),
              Strings({"defined-twice:29"}));
}

TEST(DeckCheck, Placements) {
    EXPECT_EQ(CodesBehind("part=P\n", "1., 0., x\n"), Strings({"placement-wrong:19"}));
    EXPECT_EQ(CodesBehind("part=P\n", "1., 0., 0.\n1., 0., 0., 1., 0., 0., 90.\n"),
              Strings({"placement-wrong:19"}));
    EXPECT_EQ(CodesBehind("part=P\n", "1., 0., 0.\n"), Strings());
}

TEST(DeckCheck, Equations_CountTheirTerms) {
    EXPECT_EQ(
        CodesBehind("*End Instance\n", "*Equation\n2\nI-1.TIP, 1, 1.\nI-1.1, 1, -1.\n1\nI-1.TIP, 2, 1.\n"),
        Strings());
    EXPECT_EQ(CodesBehind("*End Instance\n", "*Equation\n1\nI-1.TOP, 1, 1.\n"),
              Strings({"undefined-set:23"}));
}

TEST(DeckNames, SetsOfSets_RangesAndNodesOfElements_Expand) {
    const ReadDeckText read(
        "*Node, nset=BOTH\n1, 0.,0.,0.\n2, 1.,0.,0.\n3, 2., 0., 0.\n"
        "*Element, type=T3D2, elset=BAR\n7, 1, 3\n"
        "*Nset, nset=A, generate\n1, 3, 2\n*Nset, nset=B\nA, 2\n*Nset, nset=C, elset=BAR\n"
        "*Nset, nset=D\nB, D\n");
    const drd_Names names(read.deck);
    const auto expanded = [&names](const char* name) {
        std::vector<drd_Member> members;
        names.Expand(names.Find(drd_KindEnm::NODE_SET, name, 0).set, members);
        std::vector<int> labels;
        for (const drd_Member& member : members) labels.push_back(member.label);
        return labels;
    };
    EXPECT_EQ(expanded("both"), (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(expanded("A"), (std::vector<int>{1, 3}));
    EXPECT_EQ(expanded("B"), (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(expanded("C"), (std::vector<int>{1, 3}));
    EXPECT_EQ(expanded("D"), (std::vector<int>{1, 2, 3}));
}

TEST(DeckNames, NamesWithDots_AreFoundInTheirInstance) {
    const ReadDeckText read(
        "*Assembly, name=A\n*Instance, name=\"p.1\", part=P\n*Nset, nset=\"a.b c\"\n1\n*End Instance\n"
        "*Nset, nset=top, instance=\"p.1\"\n1, 5\n*End Assembly\n");
    const drd_Names names(read.deck);
    EXPECT_GE(names.Find(drd_KindEnm::NODE_SET, "p.1.\"a.b c\"", 0).set, 0);
    EXPECT_GE(names.Find(drd_KindEnm::NODE_SET, "\"P.1\".\"A.B C\"", 0).set, 0);
    EXPECT_GE(names.Find(drd_KindEnm::NODE_SET, "TOP", 0).set, 0);
    EXPECT_LT(names.Find(drd_KindEnm::NODE_SET, "\"a.b c\"", 0).set, 0);
    std::vector<drd_Member> members;
    names.Expand(names.Find(drd_KindEnm::NODE_SET, "top", 0).set, members);
    ASSERT_EQ(members.size(), 2U);
    EXPECT_EQ(members[1].instance, 2);
    EXPECT_EQ(members[1].label, 5);
}

TEST(DeckNames, Labels_AreFoundHoweverTheyStand) {
    const auto indexOf = [](std::vector<int> labels, int label) {
        drd_Flat<int> flat;
        for (const int l : labels) flat.Add(l);
        return drd_LabelIndex(flat).Find(label);
    };
    EXPECT_EQ(indexOf({}, 1), -1);
    EXPECT_EQ(indexOf({5, 6, 7}, 6), 1);
    EXPECT_EQ(indexOf({5, 6, 7}, 8), -1);
    EXPECT_EQ(indexOf({5, 6, 7}, -2147483647), -1);
    EXPECT_EQ(indexOf({9, 2, 4}, 4), 2);
    EXPECT_EQ(indexOf({9, 2, 4}, 3), -1);
    EXPECT_EQ(indexOf({2147483647, 1, 1000000}, 1000000), 2);
    EXPECT_EQ(indexOf({2147483647, 1, 1000000}, 2), -1);
    EXPECT_EQ(indexOf({3, 1, 3}, 3), 0);
}
