#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

namespace {

const std::string kModel = "/models/M";

/// The hints on the unknown members of a file of that text.
std::vector<std::string> HintsOf(const std::string& text) {
    mdf_Report report;
    EXPECT_EQ(mdf_ReadModelText(text, "m.json", report), nullptr);
    std::vector<std::string> hints;
    for (const fnd_Finding& finding : report.findings) {
        if (finding.code->name == "unknown-member") hints.push_back(finding.hint);
    }
    return hints;
}

/// The hint on the one unknown member of a model.
std::string HintOf(const std::string& members) {
    const auto hints = HintsOf(R"({"format": "qrx-model/1", "models": {"M": {)" + members + "}}}");
    EXPECT_EQ(hints.size(), 1U);
    return hints.empty() ? "none" : hints.front();
}

std::string MeantFor(const std::string& pointer) {
    return "is it meant for '" + kModel + pointer + "'?";
}

TEST(Placement, WhatBelongsIntoTheMesh_AndStandsBesideIt) {
    EXPECT_EQ(HintOf(R"("parts": {"P": {"mesh": {}, "sets": []}})"), MeantFor("/parts/P/mesh/sets"));
    EXPECT_EQ(HintOf(R"("parts": {"P": {"nodes": {}}})"), MeantFor("/parts/P/mesh/nodes"));
    EXPECT_EQ(HintOf(R"("parts": {"P": {"file": "plate.msh"}})"), MeantFor("/parts/P/mesh/file"));
    EXPECT_EQ(HintOf(R"("assembly": {"elements": []})"), MeantFor("/assembly/mesh/elements"));
    EXPECT_EQ(HintOf(R"("parts": {"P": {"mesh": {"coordinates": []}}})"),
              MeantFor("/parts/P/mesh/nodes/coordinates"));
}

TEST(Placement, WhatBelongsToAPartOrAModel_AndStandsFurtherIn) {
    EXPECT_EQ(HintOf(R"("parts": {"P": {"mesh": {"sectionAssignments": []}}})"),
              MeantFor("/parts/P/sectionAssignments"));
    EXPECT_EQ(HintOf(R"("parts": {"P": {"materials": {}}})"), MeantFor("/materials"));
    EXPECT_EQ(HintOf(R"("steps": [{"name": "S", "class": "InitialStep", "loads": {}}])"), MeantFor("/loads"));
}

TEST(Placement, WhatBelongsToAnInstance_AndStandsInThePart) {
    EXPECT_EQ(HintOf(R"("parts": {"P": {"translation": [1, 0, 0]}})"),
              MeantFor("/assembly/instances/.../translation"));
    EXPECT_EQ(HintOf(R"("instances": {})"), MeantFor("/assembly/instances"));
}

TEST(Placement, WhatBelongsIntoStates_AndStandsBesideThem_OrTheOtherWayRound) {
    const std::string steps = R"("steps": [{"name": "I", "class": "InitialStep"}], )";
    EXPECT_EQ(HintOf(steps + R"("loads": {"L": {"class": "Pressure", "magnitude": 1}})"),
              MeantFor("/loads/L/states/.../magnitude"));
    EXPECT_EQ(
        HintOf(steps +
               R"("loads": {"a/b": {"class": "Pressure", "states": {"I": {"distributionType": "FIELD"}}}})"),
        MeantFor("/loads/a~1b/distributionType"));
}

TEST(Placement, MembersOfAModel_AtTheTopOfTheFile) {
    EXPECT_EQ(HintsOf(R"({"format": "qrx-model/1", "parts": {}, "models": {"M": {}}})"),
              std::vector<std::string>{"is it meant for '/models/.../parts'?"});
}

TEST(Placement, WhereManyOrNoneHaveTheMember_NothingIsSaidOfPlaces) {
    EXPECT_EQ(HintOf(R"("materials": {"Steel": {"table": [[1]]}})"), "");
    EXPECT_EQ(HintOf(R"("materials": {"Steel": {"densitty": {}}})"), "did you mean 'density'?");
    EXPECT_EQ(HintOf(R"("materials": {"Steel": {"colour": {}}})"), "");
    EXPECT_EQ(HintOf(R"("datums": [{"name": "D", "kind": "node"}])"), "");
    // The mesh of a file may have no nodes of its own.
    EXPECT_EQ(HintOf(R"("parts": {"P": {"mesh": {"file": "none.msh", "nodes": {}}}})"), "");
}

TEST(Placement, AnOuterObjectThatHasTheMemberAlready_IsNotMeant) {
    EXPECT_EQ(HintOf(R"("materials": {"Steel": {"description": "S235"}})"), MeantFor("/description"));
    EXPECT_EQ(HintOf(R"("description": "A plate", "materials": {"Steel": {"description": "S235"}})"), "");
}

TEST(Placement, ABeginningOfAName_IsEnough) {
    EXPECT_EQ(HintOf(R"("sections": {"S": {"class": "SolidSection", "material": "Steel"}})"),
              "did you mean 'materialName'?");
    EXPECT_EQ(HintOf(R"("sections": {"S": {"class": "BeamSection", "profile": "Box"}})"),
              "did you mean 'profileName'?");
}

} // namespace
