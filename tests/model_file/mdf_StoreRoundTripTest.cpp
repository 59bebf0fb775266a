#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace {

std::string Written(const odb_Odb& odb) {
    std::ostringstream out;
    EXPECT_TRUE(mdf_WriteModelFile(odb, out));
    return out.str();
}

/// The store of a model file; a report of what was wrong fails the test.
std::unique_ptr<odb_Odb> Read(const std::string& text) {
    mdf_Report report;
    auto odb = mdf_ReadModelText(text, "m.json", report);
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) ADD_FAILURE() << report.Line(finding) << '\n' << text;
    }
    return odb;
}

/// Writes the model, reads that back, and writes it again: both texts must be the same. Returns the text.
std::string RoundTrip(const std::string& members) {
    const auto odb = Read(R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}");
    if (odb == nullptr) return {};
    const std::string first = Written(*odb);
    const auto copy = Read(first);
    if (copy == nullptr) return {};
    EXPECT_EQ(Written(*copy), first);
    return first;
}

bool Has(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

const std::string bricks = R"("nodes": {"labels": {"from": 10, "to": 80, "by": 10},
        "coordinates": [[0, 0, 0], [1, 0, 0], [1, 0.1, 0], [0, 1, -0.0], [0, 0, 1e-30], [1, 0, 3.4e38], [1, 1, 1], [0, 1, 1]]},
    "elements": [
        {"type": "C3D8R", "labels": [2, 1], "connectivity": [[10, 20, 30, 40, 50, 60, 70, 80], [80, 70, 60, 50, 40, 30, 20, 10]],
         "controls": {"hourglass": "RELAX STIFFNESS", "lengthRatio": 0.3}},
        {"type": "S4R", "labels": [3], "connectivity": [[10, 20, 30, 40]]},
        {"type": "C3D8R", "labels": [], "connectivity": []},
        {"type": "my type", "labels": [2147483647], "connectivity": [[10]]}],
    "sets": [{"name": "ALL", "kind": "element", "labels": [1, 3, 2, 2147483647, 1]},
             {"name": "nothing", "kind": "node", "labels": []},
             {"name": "Twice.", "kind": "node", "internal": true, "labels": [80, 10, 80]},
             {"name": "SKIN", "kind": "surface", "facets": [[1, "S1"], [3, "SNEG"], [3, 6], [2, 5], [2147483647, 3]]}])";

} // namespace

TEST(StoreRoundTrip, Scalars_AndTexts_StayTheSame) {
    const std::string text =
        RoundTrip(R"("description": "two \"lines\"\n\u00e9", "topLevelSolverInput": ["*Heading", "x"],
        "solverInput": "**\t no end", "absoluteZero": -273.15, "stefanBoltzmann": 5.67e-8, "waveFormulation": "total",
        "restartJob": "j", "restartStep": "s", "restartIncrement": -3, "endRestartStep": true, "globalJob": "g",
        "shellToSolid": true, "analysisProduct": "EXPLICIT")");
    EXPECT_TRUE(Has(text, "\"topLevelSolverInput\": [\n        \"*Heading\",\n        \"x\"\n      ]"));
    EXPECT_TRUE(Has(text, R"("waveFormulation": "TOTAL")"));
    EXPECT_TRUE(Has(text, R"("restartIncrement": -3)"));
    EXPECT_TRUE(Has(text, R"("stefanBoltzmann": 5.67e-08)"));
}

TEST(StoreRoundTrip, EmptyModel_StaysEmpty) {
    EXPECT_FALSE(Has(RoundTrip(""), "parts"));
}

TEST(StoreRoundTrip, Datums_OfAllTypes_KeepTheirAxesToTheBit) {
    const std::string text = RoundTrip(R"("datums": [
        {"name": "C", "system": "cylindrical", "origin": [1, -0.0, 3], "xAxis": [1, 2, 3], "yAxis": [0.3, 1, 0.7]},
        {"name": "own z", "system": "spherical", "zAxis": [0.1, 0.7, 0.3]},
        {"name": "P", "type": "point", "origin": [0.1, 0.2, 0.3]},
        {"name": "A", "type": "axis", "xAxis": [1, 1, 1]},
        {"name": "N", "type": "plane", "zAxis": [7, 1, 1]}])");
    EXPECT_TRUE(Has(text, R"("system": "spherical")"));
    EXPECT_TRUE(Has(text, R"("type": "plane")"));
}

TEST(StoreRoundTrip, Meshes_KeepLabelsOrderSetsAndControls) {
    const std::string text =
        RoundTrip(R"("parts": {"P": {"solverInput": ["*x"], "mesh": {)" + bricks + "}}}");
    EXPECT_TRUE(Has(text, R"("hourglass": "RELAX_STIFFNESS")"));
    EXPECT_TRUE(Has(text, "2147483647"));
    EXPECT_TRUE(Has(text, R"("name": "nothing")"));
    EXPECT_TRUE(Has(text, R"("internal": true)"));
}

TEST(StoreRoundTrip, PartAttributes_InheritedOwnAndEmptied_StayTheSame) {
    const std::string text = RoundTrip(R"("datums": [{"name": "D"}],
        "sections": {"S": {"class": "kseC_ConnectorSection", "translationalType": "Slide-Plane"}},
        "parts": {"P": {"mesh": {)" + bricks +
                                       R"(},
            "sectionAssignments": [{"region": "ALL", "sectionName": "S", "offset": -0.5}, {"region": "ALL", "sectionName": "S"}],
            "materialOrientations": [{"region": "ALL", "datum": "D", "axis": "3", "angle": 12.5}],
            "beamOrientations": [{"region": "ALL", "vector": [0, 1, 1e-300]}]}},
        "assembly": {"instances": {"a": {"part": "P", "sectionAssignments": [], "beamOrientations": [{"region": "ALL"}]},
                                   "b": {"part": "P"}}})");
    EXPECT_TRUE(Has(text, R"("sectionAssignments": [])"));
    EXPECT_TRUE(Has(text, R"("axis": "AXIS_3")"));
}

TEST(StoreRoundTrip, Instances_WithPlacementOwnMeshOrNone_StayTheSame) {
    const std::string text = RoundTrip(R"("parts": {"P": {"mesh": {)" + bricks + R"(}}, "none": {}},
        "assembly": {"name": "Whole", "solverInput": "a", "instances": {
            "moved": {"part": "P", "translation": [0.1, 0, 0], "rotation": [0, 0, 1.5707963]},
            "own": {"part": "P", "solverInput": "b", "mesh": {"nodes": {"labels": [1], "coordinates": [[0, 0, 0]]}}},
            "bare": {"part": "none"}, "other": {"partInstance": false}, "entry": {"part": "P", "partInstance": false}}})");
    EXPECT_TRUE(Has(text, R"("partInstance": false)"));
    EXPECT_TRUE(Has(text, R"("name": "Whole")"));
    EXPECT_TRUE(Has(text, R"("translation": [0.1, 0.0, 0.0])"));
}

TEST(StoreRoundTrip, Assembly_WithForeignEndsSetsAndOrientations_StaysTheSame) {
    const std::string text = RoundTrip(R"("datums": [{"name": "D"}],
        "sections": {"S": {"class": "kseC_ConnectorSection", "assembledType": "SlipRing"}},
        "parts": {"P": {"mesh": {)" + bricks +
                                       R"(}}},
        "assembly": {"instances": {"i.1": {"part": "P"}, "j": {"part": "P"}, "e": {"part": "P", "partInstance": false}},
            "mesh": {"nodes": {"labels": [5], "coordinates": [[1, 2, 3]]},
                     "elements": [{"type": "CONN3D2", "labels": [1, 2], "connectivity": [["i.1.10", "j.20"], [5, "j.80"]]}]},
            "sets": [{"name": "wires", "kind": "element", "members": [{"labels": [2, 1]}, {"instance": "j", "labels": [3, 1]}]},
                     {"name": "dot.ted", "kind": "element", "members": [{"labels": [1]}]},
                     {"name": "ends", "kind": "node", "internal": true, "members": [{"instance": "i.1", "labels": [10, 10]}, {"instance": "e", "labels": [20]}, {"instance": "i.1", "labels": [10]}]},
                     {"name": "skin", "kind": "surface", "members": [{"instance": "j", "facets": [[3, "SPOS"], [1, 0]]}]},
                     {"name": "nothing", "kind": "surface", "members": []}],
            "sectionAssignments": [{"region": "wires", "sectionName": "S"}, {"region": "j.ALL", "sectionName": "S"}],
            "connectorOrientations": [{"region": {"set": "dot.ted"}, "csys1": "D", "axis2": 1, "angle2": 3, "orient2sameAs1": true},
                                      {"region": {"instance": "i.1", "set": "ALL"}, "csys2": "D", "name": "mine"}]})");
    EXPECT_TRUE(Has(text, R"("i.1.10")"));
    EXPECT_TRUE(Has(text, R"({"set": "dot.ted"})"));
    EXPECT_TRUE(Has(text, R"({"instance": "i.1", "set": "ALL"})"));
    // Of orientations only a name that isn't that of their place.
    EXPECT_TRUE(Has(text, R"("name": "mine")"));
    EXPECT_FALSE(Has(text, "ConnOri-"));
}

TEST(StoreRoundTrip, RecordsStepsStatesAndSector_StayTheSame) {
    const std::string text = RoundTrip(
        R"("timePoints": {"T": {"generate": true, "points": [[0, 1, 0.1], [1, 2, 1e-5]]}, "empty": {}},
        "adaptiveMeshControls": {"A": {"description": "x"}},
        "steps": [{"name": "Initial", "class": "kprC_InitialStep", "description": "d", "suppressed": true, "solverInput": ["**"], "matrixStorage": "unsymmetric"}],
        "adaptiveMeshConstraints": {"C": {"suppressed": true, "states": {"Initial": {}}}, "D": {"states": {"Initial": {"status": "MODIFIED"}}}, "E": {}},
        "cyclicSymmetry": {"symmetryType": "CYCLIC", "numberOfSectors": 12, "startPoint": [0, 0, 0.1], "endPoint": [1, 0, 0]})");
    EXPECT_TRUE(Has(text, R"("matrixStorage": "UNSYMMETRIC")"));
    EXPECT_TRUE(Has(text, R"("status": "MODIFIED")"));
    EXPECT_TRUE(Has(text, R"("numberOfSectors": 12)"));
}

TEST(StoreRoundTrip, SeveralModels_AllComeBack) {
    const auto odb = Read(
        R"({"format": "qrx-model/1", "models": {"b": {"description": "B"}, "Default Model": {}, "a/~ \u00e9": {}}})");
    ASSERT_NE(odb, nullptr);
    const std::string first = Written(*odb);
    const auto copy = Read(first);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(copy->Models().size(), 3u);
    EXPECT_EQ(Written(*copy), first);
}
