#include "hostile/Findings.h"

#include "model_file/mdf_ModelFile.h"

#include <cmath>

namespace {

using Lines = std::vector<std::string>;

/// The store of a model file that is right.
std::unique_ptr<odb_Odb> Store(const std::string& text) {
    mdf_Report report;
    auto odb = mdf_ReadModelText(text, "m.json", report);
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) ADD_FAILURE() << report.Line(finding);
    }
    if (odb == nullptr) throw std::runtime_error("no store");
    return odb;
}

const odiK_Model& TheModel(const std::unique_ptr<odb_Odb>& odb) {
    return *odb->FindModel(odb_Odb::DefaultModelName());
}

std::vector<int> NodeLabels(const odiK_Mesh& mesh) {
    std::vector<int> labels;
    for (int i = 0; i < mesh.Nodes().NumNodes(); ++i) labels.push_back(mesh.Nodes().Label(i));
    return labels;
}

const odiK_Mesh& MeshOfP(const std::unique_ptr<odb_Odb>& odb) {
    return *TheModel(odb).Parts().at("P")->mesh;
}

int AssembledType(const std::string& value) {
    const auto odb =
        Store(Model(R"("sections": {"S": {"class": "ConnectorSection", "assembledType": )" + value + "}}"));
    const auto& section = static_cast<const kseC_ConnectorSection&>(TheModel(odb).sections.ConstGet("S"));
    return static_cast<int>(section.assembledType);
}

} // namespace

TEST(AcceptedForms, SmallestModel_IsRead) {
    EXPECT_EQ(Findings(R"({"format": "qrx-model/1", "models": {"Default Model": {}}})"), Lines{});
}

TEST(AcceptedForms, CommentsAndByteOrderMark_ArePassedOver) {
    EXPECT_EQ(Findings("\xEF\xBB\xBF// head\n{/* a */ \"format\": \"qrx-model/1\", // tail\n"
                       "\"models\": {\"Default Model\": {}}} // end"),
              Lines{});
}

TEST(AcceptedForms, OtherModels_StandBesideTheDefaultOne) {
    const auto odb = Store(R"({"format": "qrx-model/1", "models": {"B": {}, "Default Model": {}, "A": {}}})");
    EXPECT_EQ(odb->Models().size(), 3u);
}

TEST(AcceptedForms, WholeExampleModel_HasNothingToTell) {
    EXPECT_EQ(Findings(Whole("")), Lines{});
}

TEST(AcceptedForms, Range_WithBy_StopsNotAboveItsEnd) {
    const auto odb = Store(Mesh(R"("nodes": {"labels": {"from": 10, "to": 19, "by": 4},
                                             "coordinates": [[0, 0, 0], [1, 0, 0], [2, 0, 0]]},
                                   "sets": [{"name": "A", "kind": "node", "labels": {"from": 10, "to": 10}}])"));
    EXPECT_EQ(NodeLabels(MeshOfP(odb)), (std::vector<int>{10, 14, 18}));
    EXPECT_EQ(MeshOfP(odb).Sets()[0]->subsets[0].subset.Length(), 1);
}

TEST(AcceptedForms, Range_ToTheLargestLabel_DoesNotOverflow) {
    const auto odb = Store(Mesh(
        R"("nodes": {"labels": {"from": 2147483646, "to": 2147483647}, "coordinates": [[0, 0, 0], [1, 0, 0]]})"));
    EXPECT_EQ(NodeLabels(MeshOfP(odb)), (std::vector<int>{2147483646, 2147483647}));
}

TEST(AcceptedForms, Texts_AsLines_AreEndedEach) {
    const auto odb = Store(Model(R"("solverInput": ["*A", "", "b"], "topLevelSolverInput": "as it stands",
                                    "assembly": {"solverInput": []},
                                    "steps": [{"name": "S", "class": "InitialStep", "solverInput": ["x"]}])"));
    EXPECT_EQ(TheModel(odb).solverInput, "*A\n\nb\n");
    EXPECT_EQ(TheModel(odb).topLevelSolverInput, "as it stands");
    EXPECT_EQ(TheModel(odb).AssemblyObject().solverInput, "");
    EXPECT_EQ(TheModel(odb).steps.ConstGet("S").solverInput, "x\n");
}

TEST(AcceptedForms, Enumeration_ByNameTextOrNumberInAnyCapitals_IsOne) {
    EXPECT_EQ(AssembledType(R"("CVJOINT")"), 3);
    EXPECT_EQ(AssembledType(R"("cvJoint")"), 3);
    EXPECT_EQ(AssembledType(R"("CVJ Joint")"), 3);
    EXPECT_EQ(AssembledType(R"("cvj joint")"), 3);
    EXPECT_EQ(AssembledType("3"), 3);
    EXPECT_EQ(AssembledType("0"), 0);
}

TEST(AcceptedForms, WaveFormulationAndProduct_InAnyCapitals_AreTaken) {
    const auto odb = Store(Model(R"("waveFormulation": "scattered", "analysisProduct": "Explicit")"));
    EXPECT_EQ(TheModel(odb).waveFormulation, "SCATTERED");
    const auto implicit = Store(Model(R"("analysisProduct": "IMPLICIT")"));
    const auto standard = Store(Model(R"("analysisProduct": "standard")"));
    EXPECT_EQ(TheModel(implicit).analysisProduct, TheModel(standard).analysisProduct);
    EXPECT_NE(TheModel(implicit).analysisProduct, TheModel(odb).analysisProduct);
    EXPECT_EQ(TheModel(Store(Model(R"("analysisProduct": 7)"))).analysisProduct, 7);
}

TEST(AcceptedForms, RealFields_AsIntegersAndNegativeZero_KeepTheirSign) {
    const auto real = Store(Model(R"("absoluteZero": -0.0)"));
    EXPECT_TRUE(std::signbit(TheModel(real).absoluteZero));
    const auto integer = Store(Model(R"("absoluteZero": -0)"));
    EXPECT_FALSE(std::signbit(TheModel(integer).absoluteZero));
    EXPECT_EQ(TheModel(Store(Model(R"("absoluteZero": -273)"))).absoluteZero, -273.0);
    EXPECT_EQ(TheModel(Store(Model(R"("absoluteZero": 4294967296)"))).absoluteZero, 4294967296.0);
}

TEST(AcceptedForms, NegativeZeroLabel_IsTheIntegerZeroAndThusNoLabel) {
    EXPECT_EQ(Findings(Mesh(R"("nodes": {"labels": [-0], "coordinates": [[0, 0, 0]]})")),
              Lines{"@/parts/P/mesh/nodes/labels/0: found 0, expected a positive label"});
}

TEST(AcceptedForms, Coordinates_MixedIntegersAndReals_AreRoundedToSingle) {
    const auto odb =
        Store(Mesh(R"("nodes": {"labels": [1, 2], "coordinates": [[1, 0.1, -0.0], [2, 3, 4]]})"));
    EXPECT_EQ(MeshOfP(odb).Nodes().coordinates, (std::vector<float>{1.0F, 0.1F, -0.0F, 2.0F, 3.0F, 4.0F}));
}

TEST(AcceptedForms, Regions_OfEveryForm_FindTheirSet) {
    const auto odb = Store(
        Whole(R"("sets": [{"name": "S", "kind": "element", "members": [{"instance": "I", "labels": [1]}]},
                                             {"name": "A.B", "kind": "element", "members": [{"instance": "J", "labels": [1]}]}],
                                    "connectorOrientations": [{"region": "S"}, {"region": "I.ALL"}, {"region": {"set": "A.B"}},
                                                              {"region": {"instance": "J", "set": "ALL"}}])"));
    const ptoC_PartAttributeList& list = TheModel(odb).AssemblyObject().connectorOrientations;
    ASSERT_EQ(list.Size(), 4);
    Lines regions;
    for (int i = 0; i < 4; ++i) {
        const rgnC_Region& region = list.ConstGet(i).region;
        regions.push_back(std::string(region.InstanceName().View()) + "|" +
                          std::string(region.SetName().View()));
    }
    EXPECT_EQ(regions, (Lines{"|S", "I|ALL", "|A.B", "J|ALL"}));
}

TEST(AcceptedForms, RegionOfAnEntryThatIsNoInstance_IsTaken) {
    EXPECT_EQ(Findings(Whole(R"("connectorOrientations": [{"region": "E.ALL"}])")), Lines{});
}

TEST(AcceptedForms, PartAttribute_OnASetNameWithDots_TakesTheWholeString) {
    EXPECT_EQ(Findings(Model(R"("parts": {"P": {"mesh": {
                  "nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
                  "elements": [{"type": "MASS", "labels": [1], "connectivity": [[1]]}],
                  "sets": [{"name": "A.B.C", "kind": "element", "labels": [1]}]},
                  "beamOrientations": [{"region": "A.B.C"}], "materialOrientations": [{"region": "A.B.C", "datum": null}]}})")),
              Lines{});
}

TEST(AcceptedForms, Facets_ByNameOrNumberAsTheShapeAllows_AreTaken) {
    const auto odb = Store(Whole(
        R"("sets": [{"name": "S", "kind": "surface", "members": [{"instance": "I", "facets": [
            [1, "S1"], [2, "S6"], [1, 5], [3, "SPOS"], [3, "SNEG"], [3, 6], [4, "END2"], [4, 0], [5, 0]]}]}])"));
    std::vector<int> ids;
    for (const rgnC_SubsetData& subset : TheModel(odb).AssemblySets()[0]->subsets) {
        for (int i = 0; i < subset.facetIds.Length(); ++i) ids.push_back(subset.facetIds[i]);
    }
    EXPECT_EQ(ids, (std::vector<int>{0, 5, 5, 0, 1, 6, 1, 0, 0}));
}

TEST(AcceptedForms, RepeatedLabelsInASet_Survive) {
    const auto odb = Store(Mesh(R"("nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
                                   "sets": [{"name": "A", "kind": "node", "labels": [2, 1, 2]}])"));
    EXPECT_EQ(MeshOfP(odb).Sets()[0]->subsets[0].subset.Length(), 3);
}

TEST(AcceptedForms, AssemblyMesh_MayEndInInstancesWhoseNamesHaveDots) {
    EXPECT_EQ(
        Findings(Model(R"("parts": {"P": {"mesh": {"nodes": {"labels": [1], "coordinates": [[0, 0, 0]]}}}},
                  "assembly": {"instances": {"a.1": {"part": "P"}},
                               "mesh": {"elements": [{"type": "CONN3D2", "labels": [1], "connectivity": [["a.1.1", "a.1.1"]]}]},
                               "sets": [{"name": "C", "kind": "element", "members": [{"labels": [1]}]}]})")),
        Lines{});
}

TEST(AcceptedForms, EmptySets_AreWarnedOf) {
    EXPECT_EQ(
        Findings(Mesh(
            R"("sets": [{"name": "A", "kind": "node", "labels": []}, {"name": "B", "kind": "surface", "facets": []}])")),
        (Lines{"warning @/parts/P/mesh/sets/0: the set is empty, and will not stand in the deck",
               "warning @/parts/P/mesh/sets/1: the set is empty, and will not stand in the deck"}));
    EXPECT_EQ(Findings(Model(R"("assembly": {"sets": [{"name": "A", "kind": "node", "members": []}]})")),
              Lines{"warning @/assembly/sets/0: the set is empty, and will not stand in the deck"});
}

TEST(AcceptedForms, NamesThatDifferOnlyInCapitals_AreWarnedOf) {
    EXPECT_EQ(
        Findings(Model(R"("datums": [{"name": "D"}, {"name": "d"}], "parts": {"P": {}, "p": {}},
                                "assembly": {"instances": {"i": {"part": "P"}, "I": {"part": "p"}}},
                                "timePoints": {"T": {}, "t": {}})")),
        (Lines{
            "warning @/datums/1/name: this datum and 'D' differ only in capitals, which solvers take for "
            "one name",
            "warning @/parts/p: this part and 'P' differ only in capitals, which solvers take for one name",
            "warning @/assembly/instances/I: this instance and 'i' differ only in capitals, which solvers "
            "take for one name",
            "warning @/timePoints/t: this name and 'T' differ only in capitals, which solvers take for one "
            "name"}));
}

TEST(AcceptedForms, UnknownElementType_IsWarnedOf) {
    EXPECT_EQ(
        Findings(Mesh(R"("nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
                               "elements": [{"type": "XYZ", "labels": [1], "connectivity": [[1]]},
                                            {"type": "U1", "labels": [2], "connectivity": [[1]]},
                                            {"type": "c3d8", "labels": [3], "connectivity": [[1]]}])")),
        Lines{
            "warning @/parts/P/mesh/elements/0/type: 'XYZ' is no known element type; it is taken for a point "
            "element"});
}

TEST(AcceptedForms, IdleSector_IsWarnedOfAndNullIsNone) {
    EXPECT_EQ(Findings(Model(R"("cyclicSymmetry": {"numberOfSectors": 4})")),
              Lines{"warning @/cyclicSymmetry: the sector definition is idle, since symmetryType is NONE"});
    const auto odb = Store(Model(R"("cyclicSymmetry": null)"));
    EXPECT_TRUE(TheModel(odb).cyclicSymmetry.IsNull());
}

TEST(AcceptedForms, Datums_OfEveryType_AreNormalised) {
    const auto odb = Store(Model(R"("datums": [
        {"name": "C", "system": "cylindrical", "xAxis": [0, 2, 0], "yAxis": [0, 0, 3]},
        {"name": "P", "type": "point", "origin": [1, 2, 3], "xAxis": [0, 0, 0]},
        {"name": "A", "type": "axis", "xAxis": [0, 0, -5]},
        {"name": "N", "type": "plane"}])"));
    const auto& datums = TheModel(odb).Datums();
    ASSERT_EQ(datums.size(), 4u);
    EXPECT_EQ(datums[0].zAxis, gsl_Vector(1.0, 0.0, 0.0));
    EXPECT_EQ(datums[2].xAxis, gsl_Vector(0.0, 0.0, -1.0));
    EXPECT_EQ(datums[3].zAxis, gsl_Vector(0.0, 0.0, 1.0));
}

TEST(AcceptedForms, State_WithAStatusByNameTextOrNumber_IsTaken) {
    for (const char* status : {R"("CREATED")", R"("created")", "1"}) {
        EXPECT_EQ(Findings(Model(R"("steps": [{"name": "Initial", "class": "InitialStep"}],
                                    "adaptiveMeshConstraints": {"C": {"states": {"Initial": {"status": )" +
                                 std::string(status) + "}}}}")),
                  Lines{})
            << status;
    }
}

TEST(AcceptedForms, LongestName_IsTaken) {
    EXPECT_EQ(Findings(Model(R"("parts": {")" + std::string(80, 'n') +
                             R"(": {}, "with blank, comma = *": {}, "ä": {}})")),
              Lines{});
}
