#include "tools/DeckProof.h"

#include "DeckTesting.h"
#include "deck/oif_Writer.h"
#include "deck_reader/drd_Emitter.h"
#include "decks/DeckFolder.h"
#include "model_file/mdf_ModelFile.h"
#include "support/TestFolder.h"
#include "tools/DeckCommands.h"

#include <map>

namespace {

/// Findings that golden decks are to have, by code: names that their models refer to in regions of another
/// kind, nodes and elements of the assembly, which reach no deck, texts of the user's own, and lines that
/// break where the rules want it.
const std::map<std::string, std::map<std::string, std::size_t>> kWanted = {
#include "WantedFindings.inl"
};

std::vector<std::string> AllPairs() {
    std::vector<std::string> pairs = GoldenPairs();
    const std::vector<std::string> examples = ExamplePairs();
    pairs.insert(pairs.end(), examples.begin(), examples.end());
    return pairs;
}

class WrittenDeck : public testing::TestWithParam<std::string> {
protected:
    std::string DeckPath() const { return (ProjectFolder() / (GetParam() + ".inp")).string(); }
    std::unique_ptr<odb_Odb> Store() const {
        mdf_Report report;
        return mdf_ReadModelFile((ProjectFolder() / (GetParam() + ".json")).string(), report);
    }
};

} // namespace

TEST_P(WrittenDeck, StandsForItsStore) {
    const std::unique_ptr<odb_Odb> odb = Store();
    ASSERT_NE(odb, nullptr);
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(DeckPath(), {}, findings);
    EXPECT_FALSE(findings.HasErrors());
    EXPECT_EQ(ProveDeck(*odb->FindModel(odb_Odb::DefaultModelName()), deck), Strings());
}

TEST_P(WrittenDeck, HasTheFindingsThatItIsToHave) {
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(DeckPath(), {}, findings);
    drd_CheckDeck(deck, DeckOptions(), findings);
    std::map<std::string, std::size_t> counts;
    for (const auto& [code, count] : findings.Counts()) {
        // Models of tests seldom have sections for all elements.
        if (code != "element-without-section") counts[std::string(code)] = count;
    }
    const auto wanted = kWanted.find(TestNameOfPair(GetParam()));
    EXPECT_EQ(counts, wanted == kWanted.end() ? decltype(counts)() : wanted->second);
}

TEST_P(WrittenDeck, IsEqualToItselfInAnotherForm) {
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(DeckPath(), {}, findings);
    qio_StringDevice device;
    drd_Reformat(deck, device);
    const drd_Deck again = drd_ReadDeckText(device.Text(), "again", DeckOptions(), findings);
    for (const drd_Deck* other : {&deck, &again}) {
        for (const drd_Difference& difference : drd_Diff(deck, *other, {}).differences) {
            ADD_FAILURE() << difference.text;
        }
    }
}

TEST_P(WrittenDeck, Flattened_HasAllNodesAndElements_AndNoNewErrors) {
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(DeckPath(), {}, findings);
    const std::string text = Flattened(deck, findings);
    drd_Findings own;
    drd_CheckDeck(deck, DeckOptions(), own);
    drd_Findings ofFlat;
    const drd_Deck flat = drd_ReadDeckText(text, "flat", DeckOptions(), ofFlat);
    drd_CheckDeck(flat, DeckOptions(), ofFlat);
    EXPECT_EQ(own.HasErrors(), ofFlat.HasErrors());
    for (const drd_Block& block : flat.blocks) {
        EXPECT_NE(block.kind, drd_BlockEnm::PART);
        EXPECT_NE(block.kind, drd_BlockEnm::INSTANCE);
        EXPECT_NE(block.kind, drd_BlockEnm::ASSEMBLY);
    }
    const auto sizeOf = [](const drd_Deck& of, drd_Flat<int> drd_Mesh::*labels) {
        std::size_t size = 0;
        for (const drd_Mesh& mesh : of.meshes) size += (mesh.*labels).Size();
        return size;
    };
    EXPECT_EQ(sizeOf(deck, &drd_Mesh::nodes), sizeOf(flat, &drd_Mesh::nodes));
    EXPECT_EQ(sizeOf(deck, &drd_Mesh::elements), sizeOf(flat, &drd_Mesh::elements));
}

INSTANTIATE_TEST_SUITE_P(All, WrittenDeck, testing::ValuesIn(AllPairs()),
                         [](const auto& test) { return TestNameOfPair(test.param); });

TEST(DeckProof, SeesWhatADeckLacks) {
    mdf_Report report;
    const auto odb =
        mdf_ReadModelFile((ProjectFolder() / "examples/bolted_joint/bolted_joint.json").string(), report);
    ASSERT_NE(odb, nullptr);
    const odiK_Model& model = *odb->FindModel(odb_Odb::DefaultModelName());
    const std::string text = ReadBytes(ProjectFolder() / "examples/bolted_joint/bolted_joint.inp");
    const auto problemsWith = [&](const std::string& from, const std::string& to) {
        std::string changed = text;
        changed.replace(changed.find(from), from.size(), to);
        return ProveDeck(model, ReadDeckText(changed).deck);
    };
    EXPECT_EQ(problemsWith("      2,          20.,", "      2,     20.00001,"),
              Strings({"instance Lower: node 2 is another in the deck"}));
    EXPECT_EQ(problemsWith("      2,          20.,           0.,           0.\n", ""),
              Strings({"instance Lower: 11 nodes in the deck, 12 in the store"}));
    EXPECT_EQ(problemsWith("1,  1,  2,  5,", "1,  1,  2,  6,"),
              Strings({"instance Lower: element 1 is another in the deck"}));
    EXPECT_EQ(problemsWith("1, 10, 3", "1, 7, 3"),
              Strings({"instance Lower: the node set END has 3 members in the deck, 4 in the store"}));
    EXPECT_EQ(problemsWith("_TOP_S2, S2", "_TOP_S2, S1"),
              Strings({"instance Lower: the surface TOP has 2 members in the deck, 2 in the store, others"}));
    EXPECT_EQ(problemsWith("*Step, name=Cool", "*Step, name=Hot"),
              Strings({"the deck has 4 steps, the store 4, under other names"}));
    EXPECT_EQ(problemsWith("*Material, name=S355", "*Material, name=S235"),
              Strings({"the material S355 is not in the deck"}));
}

// The example without a deck of its own goes all the way.
TEST(DeckProof, TheBracket_SurvivesWritingFlatteningReadingAndComparing) {
    mdf_Report report;
    const auto odb = mdf_ReadModelFile((ProjectFolder() / "examples/bracket/bracket.json").string(), report);
    ASSERT_NE(odb, nullptr);
    const TestFolder folder;
    oif_Writer(*odb).WriteInputFile(folder.Path("bracket").c_str());
    drd_Findings findings;
    const drd_Deck deck = ReadDeck(folder.Path("bracket.inp"), {}, findings);
    EXPECT_EQ(ProveDeck(*odb->FindModel(odb_Odb::DefaultModelName()), deck), Strings());
    folder.Put("flat.inp", Flattened(deck, findings));
    const drd_Deck flat = ReadDeck(folder.Path("flat.inp"), {}, findings);
    drd_CheckDeck(flat, DeckOptions(), findings);
    EXPECT_TRUE(findings.List().empty()) << findings.List()[0].found;
    // A flat deck flattened is itself but for nothing.
    const drd_Deck twice = drd_ReadDeckText(Flattened(flat, findings), "twice", DeckOptions(), findings);
    EXPECT_TRUE(drd_Diff(flat, twice, {}).IsEqual());
    EXPECT_TRUE(drd_Diff(flat, twice, {}).commentsAdded.empty());
}
