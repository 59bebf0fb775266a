#include "deck/oif_Writer.h"
#include "model_file/mdf_ModelFile.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

// The example of thirty materials and the deck that stands beside it, derived by hand.

namespace {

std::string TextOf(const std::string& path) {
    std::ostringstream text;
    text << std::ifstream(path, std::ios::binary).rdbuf();
    return text.str();
}

std::string DeckOf(const odb_Odb& odb) {
    const TestFolder folder;
    oif_Writer(odb).WriteInputFile(folder.Path("deck").c_str());
    return folder.Text("deck.inp");
}

const std::string kExample = QRX_MATERIAL_EXAMPLE;

} // namespace

TEST(MaterialExample, Deck_IsTheOneBesideIt) {
    mdf_Report report;
    const auto odb = mdf_ReadModelFile(kExample + "/materials.json", report);
    ASSERT_NE(odb, nullptr);
    EXPECT_TRUE(report.messages.empty());
    EXPECT_EQ(odb->FindModel(odb_Odb::DefaultModelName())->materials.Size(), 30);
    EXPECT_EQ(DeckOf(*odb), TextOf(kExample + "/materials.inp"));
}

TEST(MaterialExample, ModelWrittenBack_HasTheSameDeck) {
    mdf_Report report;
    const auto odb = mdf_ReadModelFile(kExample + "/materials.json", report);
    ASSERT_NE(odb, nullptr);
    std::ostringstream file;
    ASSERT_TRUE(mdf_WriteModelFile(*odb, file));
    const auto back = mdf_ReadModelText(file.str(), "back.json", report);
    ASSERT_NE(back, nullptr);
    EXPECT_EQ(DeckOf(*back), TextOf(kExample + "/materials.inp"));
}
