#include "faults/Store.h"
#include "foundation/qio_Device.h"
#include "support/TestFolder.h"
#include "tools/Commands.h"

#include <gtest/gtest.h>

#include <cerrno>

namespace {

using testing::internal::CaptureStderr;
using testing::internal::CaptureStdout;
using testing::internal::GetCapturedStderr;
using testing::internal::GetCapturedStdout;

struct Outcome {
    ExitCode code;
    std::string output;
    std::string errors;
};

Outcome Write(const odb_Odb& odb, const std::string& target, bool asJson = false) {
    CaptureStdout();
    CaptureStderr();
    RunReport report(asJson);
    const ExitCode code = report.Finish(WriteDeck(odb, "model.json", target, report));
    return {code, GetCapturedStdout(), GetCapturedStderr()};
}

// A second initial step is no step of an analysis; a program can put one into a store.
void FillStoreThatNoDeckCanTell(odb_Odb& odb) {
    FillStore(odb, 4);
    odb.FindModel(odb_Odb::DefaultModelName())->steps.Append("Step-1", kprC_InitialStep());
}

TEST(WriteDeck, ModelThatNoDeckCanTell_IsCodeFourWithTheTextOnALineOfItsOwn) {
    odb_Odb odb;
    FillStoreThatNoDeckCanTell(odb);
    const TestFolder folder;
    folder.Put("job.inp", "** the old deck\n");
    const Outcome outcome = Write(odb, folder.Path("job.inp"));
    EXPECT_EQ(outcome.code, ExitCode::CANNOT_BE_EXPRESSED);
    EXPECT_NE(outcome.errors.find("kprC_AnalysisStep"), std::string::npos) << outcome.errors;
    EXPECT_EQ(outcome.errors.find("error:"), std::string::npos) << outcome.errors;
    EXPECT_TRUE(outcome.errors.ends_with("\n"));
    EXPECT_EQ(outcome.output, "");
    EXPECT_EQ(folder.Text("job.inp"), "** the old deck\n");
    EXPECT_EQ(folder.Entries(), std::vector<std::string>({"job.inp"}));
}

TEST(WriteDeck, ModelThatNoDeckCanTell_HasTextAndContextInJson) {
    odb_Odb odb;
    FillStoreThatNoDeckCanTell(odb);
    const TestFolder folder;
    const Outcome outcome = Write(odb, folder.Path("job.inp"), true);
    EXPECT_EQ(outcome.errors, "");
    const auto root = nlohmann::json::parse(outcome.output);
    EXPECT_EQ(root["exitCode"], 4);
    ASSERT_EQ(root["messages"].size(), 1U);
    EXPECT_TRUE(root["messages"][0].contains("context"));
    EXPECT_NE(root["messages"][0]["text"].get<std::string>().find("kprC_AnalysisStep"), std::string::npos);
    EXPECT_FALSE(root.contains("written"));
}

TEST(RunReport, TextOfTheWriter_ComesOutExactlyAndItsContextOnTheNextLine) {
    CaptureStderr();
    RunReport report(false);
    report.WriterError("\"Wrong\" == 0, 100%", "step 'S', load 'P1'");
    report.WriterError("no context", "");
    EXPECT_EQ(GetCapturedStderr(), "\"Wrong\" == 0, 100%\nstep 'S', load 'P1'\nno context\n");
}

TEST(WriteDeck, StoreWithoutTheDefaultModel_IsCodeOne) {
    odb_Odb odb;
    odb.AddModel("Other");
    const TestFolder folder;
    const Outcome outcome = Write(odb, folder.Path("job.inp"));
    EXPECT_EQ(outcome.code, ExitCode::MODEL_IS_WRONG);
    EXPECT_EQ(outcome.errors,
              "model.json: error: there is no model named 'Default Model' to write a deck from\n");
    EXPECT_TRUE(folder.Entries().empty());
}

TEST(WriteDeck, DiskThatIsFull_IsCodeThree) {
    odb_Odb odb;
    FillStore(odb, 4);
    const TestFolder folder;
    static qio_System real = qio_CurrentSystem();
    qio_System full = real;
    full.write = [](const char*, std::size_t, std::FILE*) {
        errno = ENOSPC;
        return std::size_t{0};
    };
    const qio_SystemSwap swap(full);
    const Outcome outcome = Write(odb, folder.Path("job.inp"));
    EXPECT_EQ(outcome.code, ExitCode::FILE_SYSTEM_REFUSED);
    EXPECT_EQ(outcome.errors,
              folder.Path("job.inp") + ": error: cannot write the deck: No space left on device\n");
    EXPECT_TRUE(folder.Entries().empty());
}

TEST(WriteDeck, Summary_CountsInstancesAndNamesWhatIsLeftOut) {
    odb_Odb odb;
    FillStore(odb, 4);
    odiK_Model& model = *odb.FindModel(odb_Odb::DefaultModelName());
    odiK_Part& idle = model.AddPart("IDLE");
    idle.mesh = cow_CountedHld<odiK_Mesh>(new odiK_Mesh());
    idle.mesh->SetNodes({1}, {0, 0, 0});
    const auto& part = model.Parts().at("P");
    part->mesh->AddElements("SFMSURF1", {9, 10}, 2, {1, 2, 2, 3});
    model.AssemblyMesh().SetNodes({1, 2, 3}, std::vector<float>(9, 0.0F));
    model.adaptiveMeshControls.Insert("Ada-1", kadC_AdptMeshCtrl());
    model.timePoints.Insert("Times", kprC_TimePoint());
    odb.AddModel("Study");

    const TestFolder folder;
    const Outcome outcome = Write(odb, folder.Path("job.inp"), true);
    ASSERT_EQ(outcome.code, ExitCode::DONE);
    const auto written = nlohmann::json::parse(outcome.output)["written"];
    EXPECT_EQ(written["target"], folder.Path("job.inp"));
    EXPECT_EQ(written["bytes"], folder.Text("job.inp").size());
    // Two instances of 4 nodes, 3 trusses and 2 surface elements.
    EXPECT_EQ(written["counts"], nlohmann::json::parse(R"({"parts": 1, "instances": 2, "nodes": 8,
        "elements": 6, "nodeSets": 3, "elementSets": 2, "surfaces": 2, "steps": 1,
        "materials": 1})"));
    std::string leftOut;
    for (const auto& entry : written["leftOut"]) {
        leftOut +=
            entry["what"].get<std::string>() + " " + entry["count"].dump() + entry["names"].dump() + "\n";
    }
    EXPECT_EQ(leftOut, "other models 1[\"Study\"]\n"
                       "parts without an instance 1[\"IDLE\"]\n"
                       "nodes of the assembly 3[]\n"
                       "surface elements 4[]\n"
                       "time points 1[\"Times\"]\n"
                       "adaptive mesh controls 1[\"Ada-1\"]\n");
}

TEST(WriteDeck, SummaryForPeople_ListsTheSame) {
    odb_Odb odb;
    FillStore(odb, 1200);
    odb.AddModel("Study");
    const TestFolder folder;
    const Outcome outcome = Write(odb, folder.Path("job.inp"));
    ASSERT_EQ(outcome.code, ExitCode::DONE);
    EXPECT_EQ(outcome.output.rfind(folder.Path("job.inp") + ": ", 0), 0U);
    EXPECT_EQ(outcome.output.substr(outcome.output.find('\n') + 1),
              "written:\n"
              "      1  parts\n"
              "      2  instances\n"
              "  2 400  nodes\n"
              "  2 398  elements\n"
              "      3  node sets\n"
              "      2  element sets\n"
              "      2  surfaces\n"
              "      1  steps\n"
              "      1  materials\n"
              "left out, since a deck can't carry it:\n"
              "      1  other models (a deck is written from one of them): Study\n");
}

} // namespace
