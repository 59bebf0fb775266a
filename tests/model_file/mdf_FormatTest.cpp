#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

/// The canonical form of a model with these members, without the frame around them.
std::string Formatted(const std::string& members) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(
        R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}", "m.json", report);
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) ADD_FAILURE() << report.Line(finding);
    }
    if (odb == nullptr) return {};
    std::ostringstream out;
    EXPECT_TRUE(mdf_WriteModelFile(*odb, out));
    const std::string text = out.str();
    const std::string head = "{\n  \"format\": \"qrx-model/1\",\n  \"models\": {\n    \"Default Model\": {\n";
    const std::string tail = "\n    }\n  }\n}\n";
    EXPECT_TRUE(text.starts_with(head) && text.ends_with(tail)) << text;
    return text.substr(head.size(), text.size() - head.size() - tail.size());
}

} // namespace

TEST(ModelFileFormat, SmallestModel_IsItsAssembly) {
    EXPECT_EQ(Formatted(""), "      \"assembly\": {}");
}

TEST(ModelFileFormat, DefaultsOfTheFrame_AreLeftOut) {
    EXPECT_EQ(
        Formatted(
            R"("description": "", "absoluteZero": 0, "waveFormulation": "not_set", "shellToSolid": false,
                           "cyclicSymmetry": null, "restartIncrement": 0, "parts": {},
                           "assembly": {"name": "Assembly", "solverInput": [], "instances": {}})"),
        "      \"assembly\": {}");
}

TEST(ModelFileFormat, NegativeZero_IsNoDefault) {
    EXPECT_EQ(Formatted(R"("absoluteZero": -0.0, "datums": [{"name": "D", "origin": [0, -0.0, 0]}])"),
              R"(      "absoluteZero": -0.0,
      "datums": [
        {
          "name": "D",
          "origin": [0.0, -0.0, 0.0]
        }
      ],
      "assembly": {})");
}

TEST(ModelFileFormat, DeckText_StandsLineByLineWhereEachLineIsEnded) {
    EXPECT_EQ(Formatted(R"("topLevelSolverInput": "*Heading\nx\n", "solverInput": "no end",
                           "assembly": {"solverInput": "one\n"})"),
              R"(      "topLevelSolverInput": [
        "*Heading",
        "x"
      ],
      "solverInput": "no end",
      "assembly": {
        "solverInput": ["one"]
      })");
}

TEST(ModelFileFormat, NumbersWithMeanings_AreWords) {
    EXPECT_EQ(Formatted(R"("analysisProduct": 1)"),
              "      \"analysisProduct\": \"EXPLICIT\",\n      \"assembly\": {}");
    EXPECT_EQ(Formatted(R"("analysisProduct": 7)"), "      \"analysisProduct\": 7,\n      \"assembly\": {}");
}

TEST(ModelFileFormat, ThirdAxis_StandsWhereItWasGiven) {
    EXPECT_EQ(Formatted(R"("datums": [{"name": "A", "zAxis": [0, 0, 1]}, {"name": "B"},
                                      {"name": "C", "type": "plane", "zAxis": [0, 0, 1]}])"),
              R"(      "datums": [
        {
          "name": "A",
          "zAxis": [0.0, 0.0, 1.0]
        },
        {
          "name": "B"
        },
        {
          "name": "C",
          "type": "plane"
        }
      ],
      "assembly": {})");
}

TEST(ModelFileFormat, SinglePrecision_HasItsShortestText) {
    EXPECT_EQ(Formatted(R"("parts": {"P": {"mesh": {"nodes": {"labels": {"from": 1, "to": 2},
                               "coordinates": [[0.1, 16777217, 1e-30], [3.4e38, -0.0, 0.30000001192]]}}}},
                           "assembly": {"instances": {"I": {"part": "P", "translation": [0.1, 0, 0]}}})"),
              R"(      "parts": {
        "P": {
          "mesh": {
            "nodes": {
              "labels": [1, 2],
              "coordinates": [
                [0.1, 16777216.0, 1e-30],
                [3.4e+38, -0.0, 0.3]
              ]
            }
          }
        }
      },
      "assembly": {
        "instances": {
          "I": {
            "part": "P",
            "translation": [0.1, 0.0, 0.0]
          }
        }
      })");
}

TEST(ModelFileFormat, ShortListsAndTablesOfOneRow_StandOnTheirLine) {
    EXPECT_EQ(Formatted(R"("timePoints": {"T": {"points": [[1]]}, "U": {"points": [[1], [2]]}})"),
              R"(      "assembly": {},
      "timePoints": {
        "T": {
          "points": [[1.0]]
        },
        "U": {
          "points": [
            [1.0],
            [2.0]
          ]
        }
      })");
}
