#include "deck/oif_DeckLines.h"
#include "deck/oif_Writer.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Repositories.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>

namespace {

std::vector<std::string> ModelFiles() {
    std::vector<std::string> files;
    const std::filesystem::path project(QRX_PROJECT_FOLDER);
    for (const char* folder : {"tests/decks", "examples"}) {
        for (const auto& entry : std::filesystem::recursive_directory_iterator(project / folder)) {
            if (entry.path().extension() == ".json") files.push_back(entry.path().string());
        }
    }
    std::ranges::sort(files);
    return files;
}

std::string DeckOf(const odb_Odb& odb) {
    const TestFolder folder;
    oif_Writer(odb).WriteInputFile(folder.Path("deck").c_str());
    return folder.Text("deck.inp");
}

/// From the banner of the step to that of the next one; of the initial step all that stands ahead.
std::string SectionOf(const std::string& deck, const std::vector<std::string>& steps, std::size_t step) {
    const auto banner = [&](std::size_t i) {
        return i < steps.size() ? deck.find("** STEP: " + steps[i] + "\n") : std::string::npos;
    };
    const std::size_t begin = step == 0 ? 0 : banner(step);
    const std::size_t end = banner(step + 1);
    if (begin == std::string::npos) return {};
    return deck.substr(begin, end == std::string::npos ? end : end - begin);
}

std::vector<std::string> LinesOf(const std::string& text) {
    std::vector<std::string> lines;
    for (std::size_t begin = 0; begin < text.size();) {
        const std::size_t end = std::min(text.find('\n', begin), text.size());
        lines.push_back(text.substr(begin, end - begin));
        begin = end + 1;
    }
    return lines;
}

/// Whether the lines stand in the text in their order, others between them or not.
bool StandIn(const std::string& section, const std::string& text) {
    const std::vector<std::string> all = LinesOf(section);
    auto place = all.begin();
    for (const std::string& line : LinesOf(text)) {
        place = std::find(place, all.end(), line);
        if (place == all.end()) return false;
        ++place;
    }
    return true;
}

const char* const kCommentBeginnings[] = {"** Name: ", "** Constraint: ", "** Interaction: "};

std::size_t CommentsIn(const std::string& text) {
    std::size_t count = 0;
    for (const std::string& line : LinesOf(text)) {
        for (const char* beginning : kCommentBeginnings) count += line.starts_with(beginning) ? 1U : 0U;
    }
    return count;
}

} // namespace

TEST(DeckLines, OfAllObjectsOfAllModels_StandInTheirStepsSectionOfTheDeck) {
    std::size_t texts = 0;
    for (const std::string& file : ModelFiles()) {
        SCOPED_TRACE(file);
        mdf_Report report;
        const auto odb = mdf_ReadModelFile(file, report);
        if (odb == nullptr || odb->FindModel(odb_Odb::DefaultModelName()) == nullptr) continue;
        const std::string deck = DeckOf(*odb);
        const odiK_Model& model = *odb->FindModel(odb_Odb::DefaultModelName());
        if (model.steps.Size() == 0) continue;
        const oif_DeckLines lines(*odb);
        std::vector<std::string> steps;
        for (const auto& [step, record] : model.steps) steps.emplace_back(step.View());
        std::size_t commentsOfObjects = 0;
        std::size_t submodels = 0;
        for (const odiK_Repository& repository : odiK_Repositories()) {
            if (repository.IsInOrder() || !oif_DeckLines::Knows(repository.member)) continue;
            for (const auto& [name, object] : repository.In(model)) {
                for (std::size_t i = 0; i < steps.size(); ++i) {
                    const std::string section = SectionOf(deck, steps, i);
                    for (const oif_ObjectLines& each :
                         lines.Of(repository.member, name, model.steps.NameAt(static_cast<int>(i)))) {
                        ++texts;
                        const bool isSubmodel = each.text.find(" Type: Submodel\n") != std::string::npos;
                        submodels += isSubmodel ? 1U : 0U;
                        commentsOfObjects += isSubmodel ? 0U : CommentsIn(each.text);
                        EXPECT_TRUE(StandIn(section, each.text)) << name.CStr() << " in " << steps[i] << ":\n"
                                                                 << each.text;
                    }
                }
            }
        }
        // No object's lines are missing: each of these comments in the deck is one object's.
        if (submodels == 0) {
            EXPECT_EQ(commentsOfObjects, CommentsIn(deck));
        }
    }
    EXPECT_GT(texts, 300U);
}

TEST(DeckLines, OfASubmodelBoundary_AreTheSharedLineAndItsOwn) {
    mdf_Report report;
    const auto odb =
        mdf_ReadModelFile(QRX_PROJECT_FOLDER "/tests/decks/conditions_of_submodels.json", report);
    ASSERT_NE(odb, nullptr);
    const oif_DeckLines lines(*odb);
    const odiK_Model& model = *odb->FindModel(odb_Odb::DefaultModelName());
    std::size_t found = 0;
    for (const auto& [name, bc] : model.boundaryConditions) {
        for (const auto& [step, record] : model.steps) {
            for (const oif_ObjectLines& each : lines.Of("boundaryConditions", name, step)) {
                if (each.text.find("Type: Submodel\n*Boundary, submodel") == std::string::npos) continue;
                ++found;
                EXPECT_EQ(LinesOf(each.text)[0].substr(0, 9), "** Name: ");
                EXPECT_GE(LinesOf(each.text).size(), 3U);
            }
        }
    }
    EXPECT_GT(found, 0U);
}

TEST(DeckLines, OfSteps_AreThoseOfTheirProcedures) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(R"({"format": "qrx-model/1", "models": {"Default Model": {"steps": [
        {"name": "Initial", "class": "InitialStep"},
        {"name": "Bend", "class": "StaticStep", "nlgeom": "ON", "description": "Ten degrees"},
        {"name": "Hold", "class": "StaticStep"}]}}})",
                                       "m.json", report);
    ASSERT_NE(odb, nullptr);
    const oif_DeckLines lines(*odb);
    EXPECT_TRUE(lines.Of("steps", "Initial", "Initial").empty());
    ASSERT_EQ(lines.Of("steps", "Bend", "Bend").size(), 1U);
    EXPECT_EQ(lines.Of("steps", "Bend", "Bend")[0].text,
              "*Step, name=Bend, nlgeom=YES\nTen degrees\n*Static\n1., 1., 1e-05, 1.\n");
    // Large displacements stay on.
    ASSERT_EQ(lines.Of("steps", "Hold", "Hold").size(), 1U);
    EXPECT_EQ(lines.Of("steps", "Hold", "Hold")[0].text,
              "*Step, name=Hold, nlgeom=YES\n*Static\n1., 1., 1e-05, 1.\n");
}

TEST(DeckLines, OfWhatItDoesNotKnow_AreNone) {
    odb_Odb odb;
    odb.AddModel(odb_Odb::DefaultModelName());
    const oif_DeckLines lines(odb);
    EXPECT_TRUE(lines.Of("loads", "none", "Step-1").empty());
    EXPECT_TRUE(lines.Of("materials", "none", "Step-1").empty());
    EXPECT_FALSE(oif_DeckLines::Knows("materials"));
    EXPECT_TRUE(oif_DeckLines::Knows("loads"));
}
