#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

std::string Written(const odb_Odb& odb) {
    std::ostringstream out;
    EXPECT_TRUE(mdf_WriteModelFile(odb, out));
    return out.str();
}

std::unique_ptr<odb_Odb> Read(const std::string& text) {
    mdf_Report report;
    auto odb = mdf_ReadModelText(text, "m.json", report);
    for (const fnd_Finding& finding : report.findings) ADD_FAILURE() << report.Line(finding);
    return odb;
}

/// The controls that these members give; the same when the model was written back and read again.
kprC_TypicalControls ControlsOf(const std::string& members) {
    const auto odb = Read(R"({"format": "qrx-model/1", "models": {"Default Model": {"steps": [
        {"name": "Initial", "class": "kprC_InitialStep"},
        {"name": "S", "class": "kprC_StaticStep", "controls": {"class": "kprC_TypicalControls")" +
                          members + "}}]}}}");
    const auto controlsIn = [](const odb_Odb& store) {
        const auto& step = static_cast<const kprC_AnalysisStep&>(
            store.FindModel(odb_Odb::DefaultModelName())->steps.ConstGet("S"));
        return static_cast<const kprC_TypicalControls&>(step.controls.ConstGet());
    };
    const std::string text = Written(*odb);
    const auto copy = Read(text);
    EXPECT_TRUE(cls_RecordsEqual(controlsIn(*odb), controlsIn(*copy))) << text;
    EXPECT_EQ(Written(*copy), text);
    return controlsIn(*odb);
}

using Primary = kprC_PrimaryControls;

} // namespace

TEST(ControlsLists, Absent_AreTheDefaults) {
    EXPECT_TRUE(cls_RecordsEqual(ControlsOf(""), kprC_TypicalControls()));
}

TEST(ControlsLists, Empty_AreTheDefaults) {
    EXPECT_TRUE(cls_RecordsEqual(
        ControlsOf(R"(, "timeIncrementation": [], "constraints": [], "lineSearch": [], "displacement": [])"),
        kprC_TypicalControls()));
}

TEST(ControlsLists, NullEntries_AreTheDefaultsOfTheirPlaces) {
    EXPECT_TRUE(
        cls_RecordsEqual(ControlsOf(R"(, "lineSearch": [null, null, null, null, null], "rotation": [null])"),
                         kprC_TypicalControls()));
    cow_List<double> lineSearch = Primary::lineSearchDef();
    lineSearch.Put(2, 0.5);
    EXPECT_EQ(ControlsOf(R"(, "lineSearch": [null, null, 0.5, null])").lineSearch, lineSearch);
}

TEST(ControlsLists, ShortLists_GoOnWithTheDefaultsTail) {
    cow_List<double> displacement = Primary::fieldDef(true);
    displacement.Put(0, 0.01);
    displacement.Put(1, 0.02);
    EXPECT_EQ(ControlsOf(R"(, "displacement": [0.01, 0.02])").displacement, displacement);
}

TEST(ControlsLists, LongLists_KeepTheirExtraEntries) {
    cow_List<double> lineSearch = Primary::lineSearchDef();
    lineSearch.Append(7.0);
    EXPECT_EQ(ControlsOf(R"(, "lineSearch": [null, null, null, null, null, 7])").lineSearch, lineSearch);
}

TEST(ControlsLists, TimeIncrementation_TakesTheDefaultsOfADiscontinuousStepWhereverThatIsSaid) {
    EXPECT_EQ(ControlsOf(R"(, "discontinuous": true)").timeIncrementation,
              Primary::timeIncrementationDef(true));
    EXPECT_EQ(ControlsOf(R"(, "timeIncrementation": [], "discontinuous": true)").timeIncrementation,
              Primary::timeIncrementationDef(true));
    cow_List<double> time = Primary::timeIncrementationDef(true);
    time.Put(3, 20.0);
    EXPECT_EQ(ControlsOf(R"(, "timeIncrementation": [null, null, null, 20], "discontinuous": true)")
                  .timeIncrementation,
              time);
}

TEST(ControlsLists, DiscontinuousStepWithTheListOfAnother_KeepsIt) {
    EXPECT_EQ(ControlsOf(R"(, "timeIncrementation": [4, 8], "discontinuous": true)").timeIncrementation,
              Primary::timeIncrementationDef(false));
}
