#include "deck/oif_Writer.h"
#include "decks/DeckFolder.h"
#include "decks/DeckFromCopies.h"
#include "decks/ShuffledModel.h"
#include "decks/UnifiedDiff.h"
#include "foundation/qio_Device.h"
#include "foundation/utl_Stream.h"
#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <memory>
#include <random>
#include <set>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;

DeckRewriting Rewriting() {
    return RewritingOfDecks(std::getenv("QRX_REWRITE_DECKS"), std::getenv("CI"));
}

std::string ErrorsOf(const mdf_Report& report) {
    std::string lines;
    for (const fnd_Finding& finding : report.findings) lines += report.Line(finding) + "\n";
    return lines;
}

// One golden deck, or one of an example. What the test wrote stays in its folder when it differs from what
// was expected.
class Deck : public testing::TestWithParam<std::string> {
protected:
    void SetUp() override {
        std::random_device random;
        folder_ = fs::temp_directory_path() /
                  ("qrx-deck-" + std::to_string(random()) + "-" + TestNameOfPair(GetParam()));
        fs::create_directories(folder_);
    }
    void TearDown() override {
        if (!HasFailure()) fs::remove_all(folder_);
    }

    fs::path ModelPath() const { return ProjectFolder() / (GetParam() + ".json"); }
    fs::path ExpectedPath() const { return ProjectFolder() / (GetParam() + ".inp"); }

    std::unique_ptr<odb_Odb> Store() const {
        mdf_Report report;
        auto odb = mdf_ReadModelFile(ModelPath().string(), report);
        if (odb == nullptr) throw std::runtime_error(ErrorsOf(report));
        return odb;
    }
    std::unique_ptr<odb_Odb> StoreOf(const std::string& text, const std::string& fileName) const {
        WriteBytes(folder_ / fileName, text);
        mdf_Report report;
        auto odb = mdf_ReadModelText(text, (folder_ / fileName).string(), report);
        if (odb == nullptr) throw std::runtime_error(ErrorsOf(report));
        return odb;
    }

    fs::path Written(const odb_Odb& odb, const std::string& job) const {
        oif_Writer(odb).WriteInputFile((folder_ / job).string().c_str());
        EXPECT_TRUE(qio_LastReport().opened);
        EXPECT_EQ(qio_LastReport().error, 0);
        return folder_ / (job + ".inp");
    }
    void ExpectDeck(const fs::path& actual) const {
        const std::string diff = UnifiedDiff(ReadBytes(ExpectedPath()), ReadBytes(actual),
                                             ExpectedPath().string(), actual.string());
        if (!diff.empty()) {
            ADD_FAILURE() << "expected: " << ExpectedPath().string() << "\nactual:   " << actual.string()
                          << '\n'
                          << diff;
        }
    }
    bool IsRewriting() const { return Rewriting() == DeckRewriting::yes; }

    fs::path folder_;
};

class StreamBufferSize {
public:
    explicit StreamBufferSize(std::size_t bytes) : former_(utl_Stream::SetDefaultBufferSize(bytes)) {}
    StreamBufferSize(const StreamBufferSize&) = delete;
    StreamBufferSize& operator=(const StreamBufferSize&) = delete;
    ~StreamBufferSize() { utl_Stream::SetDefaultBufferSize(former_); }

private:
    std::size_t former_;
};

} // namespace

TEST_P(Deck, Written_Plainly_HasTheExpectedBytes) {
    if (Rewriting() == DeckRewriting::refused) FAIL() << "expected decks are not rewritten where CI is true";
    const fs::path actual = Written(*Store(), "deck");
    if (IsRewriting()) {
        const std::string former = fs::exists(ExpectedPath()) ? ReadBytes(ExpectedPath()) : std::string();
        std::cout << UnifiedDiff(former, ReadBytes(actual), ExpectedPath().string(), "rewritten");
        WriteBytes(ExpectedPath(), ReadBytes(actual));
    }
    ExpectDeck(actual);
}

TEST_P(Deck, Written_ThroughABufferOfOneByte_HasTheExpectedBytes) {
    if (IsRewriting()) GTEST_SKIP() << "decks are being rewritten";
    const StreamBufferSize oneByte(1);
    ExpectDeck(Written(*Store(), "deck"));
}

TEST_P(Deck, Written_FromCopiesOfTheKeywords_HasTheExpectedBytes) {
    if (IsRewriting()) GTEST_SKIP() << "decks are being rewritten";
    const fs::path actual = folder_ / "copies.inp";
    WriteBytes(actual, DeckFromCopies(*Store()));
    ExpectDeck(actual);
}

TEST_P(Deck, Written_FromTheModelWrittenBack_HasTheExpectedBytes) {
    if (IsRewriting()) GTEST_SKIP() << "decks are being rewritten";
    std::ostringstream model;
    ASSERT_TRUE(mdf_WriteModelFile(*Store(), model));
    ExpectDeck(Written(*StoreOf(model.str(), "back.json"), "deck"));
}

TEST_P(Deck, Written_Twice_HasTheExpectedBytesBothTimes) {
    if (IsRewriting()) GTEST_SKIP() << "decks are being rewritten";
    const auto odb = Store();
    ExpectDeck(Written(*odb, "first"));
    ExpectDeck(Written(*odb, "second"));
}

TEST_P(Deck, Written_FromShuffledContainers_HasTheExpectedBytes) {
    if (IsRewriting()) GTEST_SKIP() << "decks are being rewritten";
    const std::string model = ReadBytes(ModelPath());
    for (const unsigned seed : {1u, 2u, 3u}) {
        const std::string job = "shuffled-" + std::to_string(seed);
        ExpectDeck(Written(*StoreOf(ShuffledModel(model, seed), job + ".json"), job));
    }
}

INSTANTIATE_TEST_SUITE_P(Golden, Deck, testing::ValuesIn(GoldenPairs()),
                         [](const auto& pair) { return TestNameOfPair(pair.param); });
INSTANTIATE_TEST_SUITE_P(Example, Deck, testing::ValuesIn(ExamplePairs()),
                         [](const auto& pair) { return TestNameOfPair(pair.param); });

TEST(DeckFolder, Files_OfModelsAndDecks_ArePairs) {
    const std::vector<std::string> models = DeckNames(".json");
    EXPECT_FALSE(models.empty());
    EXPECT_EQ(models, DeckNames(".inp"));
}

TEST(ExamplePairs, Examples_WithTheirDeck_AreTakenAndOthersAreNot) {
    const std::vector<std::string> pairs = ExamplePairs();
    const std::set<std::string> taken(pairs.begin(), pairs.end());
    EXPECT_TRUE(taken.contains("examples/assembly/assembly"));
    EXPECT_TRUE(taken.contains("examples/materials/materials"));
    EXPECT_FALSE(taken.contains("examples/bracket/bracket"));
}

TEST(ExamplePairs, Models_Read_RaiseNoMessage) {
    for (const std::string& pair : ExamplePairs()) {
        mdf_Report report;
        EXPECT_NE(mdf_ReadModelFile((ProjectFolder() / (pair + ".json")).string(), report), nullptr);
        EXPECT_TRUE(report.findings.empty()) << pair << '\n' << ErrorsOf(report);
    }
}

TEST(TestNameOfPair, Pairs_OfBothKinds_HaveNamesOfLettersDigitsAndUnderscores) {
    EXPECT_EQ(TestNameOfPair("tests/decks/label_widths"), "label_widths");
    EXPECT_EQ(TestNameOfPair("examples/assembly/assembly"), "examples_assembly_assembly");
    EXPECT_EQ(TestNameOfPair("examples/a-b/c d.2"), "examples_a_b_c_d_2");
}

TEST(RewritingOfDecks, Asked_WithTheFlag_IsRefusedInCiOnly) {
    EXPECT_EQ(RewritingOfDecks(nullptr, nullptr), DeckRewriting::no);
    EXPECT_EQ(RewritingOfDecks(nullptr, "true"), DeckRewriting::no);
    EXPECT_EQ(RewritingOfDecks("", nullptr), DeckRewriting::no);
    EXPECT_EQ(RewritingOfDecks("0", nullptr), DeckRewriting::no);
    EXPECT_EQ(RewritingOfDecks("1", nullptr), DeckRewriting::yes);
    EXPECT_EQ(RewritingOfDecks("1", "false"), DeckRewriting::yes);
    EXPECT_EQ(RewritingOfDecks("1", "true"), DeckRewriting::refused);
}

TEST(ShuffledModel, Members_OfAnObject_ChangeTheirOrderAndArraysDoNot) {
    const std::string model = R"({"m": {"a": [1, 2, 3], "b": -0.0, "c": {}, "d": "x"}} // end)";
    std::set<std::string> orders;
    for (unsigned seed = 0; seed < 20; ++seed) {
        const std::string shuffled = ShuffledModel(model, seed);
        EXPECT_LT(shuffled.find("1,"), shuffled.find("2,"));
        EXPECT_LT(shuffled.find("2,"), shuffled.find("3\n"));
        EXPECT_NE(shuffled.find("\"b\": -0.0"), std::string::npos);
        orders.insert(shuffled);
    }
    EXPECT_GT(orders.size(), 5u);
}

TEST(UnifiedDiff, EqualTexts_Always_GiveNothing) {
    EXPECT_EQ(UnifiedDiff("", "", "e", "a"), "");
    EXPECT_EQ(UnifiedDiff("1\n2", "1\n2", "e", "a"), "");
}

TEST(UnifiedDiff, ChangedLine_InTheMiddle_StandsBetweenThreeLinesEachSide) {
    EXPECT_EQ(UnifiedDiff("1\n2\n3\n4\n5\n6\n7\n8\n9\n", "1\n2\n3\n4\nfive\n6\n7\n8\n9\n", "e", "a"),
              "--- e\n+++ a\n@@ -2,7 +2,7 @@\n 2\n 3\n 4\n-5\n+five\n 6\n 7\n 8\n");
}

TEST(UnifiedDiff, ChangesFarApart_Always_StandInHunksOfTheirOwn) {
    EXPECT_EQ(UnifiedDiff("1\n2\n3\n4\n5\n6\n7\n8\n9\n", "2\n3\n4\n5\n6\n7\n8\n9\n10\n", "e", "a"),
              "--- e\n+++ a\n@@ -1,4 +1,3 @@\n-1\n 2\n 3\n 4\n@@ -7,3 +6,4 @@\n 7\n 8\n 9\n+10\n");
}

TEST(UnifiedDiff, ChangesCloseTogether_Always_ShareAHunk) {
    EXPECT_EQ(UnifiedDiff("1\n2\n3\n4\n5\n6\n7\n8\n", "2\n3\n4\n5\n6\n7\n", "e", "a"),
              "--- e\n+++ a\n@@ -1,8 +1,6 @@\n-1\n 2\n 3\n 4\n 5\n 6\n 7\n-8\n");
}

TEST(UnifiedDiff, TextAndNothing_Always_CountFromZero) {
    EXPECT_EQ(UnifiedDiff("", "1\n", "e", "a"), "--- e\n+++ a\n@@ -0,0 +1,1 @@\n+1\n");
    EXPECT_EQ(UnifiedDiff("1\n", "", "e", "a"), "--- e\n+++ a\n@@ -1,1 +0,0 @@\n-1\n");
}

TEST(UnifiedDiff, LastLineEnd_OnOneSideOnly_IsADifference) {
    EXPECT_EQ(UnifiedDiff("1\n", "1", "e", "a"),
              "--- e\n+++ a\n@@ -1,1 +1,1 @@\n-1\n+1\n\\ No newline at end of file\n");
}
