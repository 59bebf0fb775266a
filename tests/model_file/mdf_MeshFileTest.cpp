#include "mesh_file/MeshTexts.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Model.h"
#include "support/TestFolder.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <sstream>

namespace {

/// A model file beside mesh files in a folder of its own.
class MeshFiles : public testing::Test {
protected:
    std::unique_ptr<odb_Odb> Read(const std::string& mesh) {
        report_ = mdf_Report();
        return mdf_ReadModelText(
            R"({"format": "qrx-model/1", "models": {"Default Model": {"parts": {"P": {"mesh": )" + mesh +
                "}}}}}",
            folder_.Path("model.json"), report_);
    }
    /// The mesh; what was found is in report_.
    const odiK_Mesh& Mesh(const std::string& mesh) {
        store_ = Read(mesh);
        if (store_ == nullptr) throw std::runtime_error(Said());
        return *store_->FindModel(odb_Odb::DefaultModelName())->Parts().begin()->second->mesh;
    }
    /// What was found, the folder left out.
    std::string Said() const {
        std::string text;
        for (const fnd_Finding& finding : report_.findings) {
            std::string line = std::string(fnd_SeverityWord(finding.code->severity)) + " " + finding.place +
                               ": " + finding.Text() + "\n";
            const std::size_t at = line.find(folder_.Path() + "/");
            if (at != std::string::npos) line.erase(at, folder_.Path().size() + 1);
            text += line;
        }
        return text;
    }
    std::string Refused(const std::string& mesh) {
        EXPECT_EQ(Read(mesh), nullptr);
        return Said();
    }
    void PutTwo(const std::string& from = "$MeshFormat", const std::string& to = "$MeshFormat") {
        folder_.Put("two.msh", Replaced(TwoTetrahedra(), from, to));
    }

    TestFolder folder_;
    mdf_Report report_;
    std::unique_ptr<odb_Odb> store_;
};

/// "element solid: 1 2".
std::vector<std::string> SetsOf(const odiK_Mesh& mesh) {
    std::vector<std::string> sets;
    for (const auto& set : mesh.Sets()) {
        const bool nodes = set->type == res_SetTypeEnm::NODES;
        std::string text = nodes ? "node " : set->type == res_SetTypeEnm::ELEMENTS ? "element " : "surface ";
        text += std::string(set->name.View()) + ":";
        for (const rgnC_SubsetData& subset : set->subsets) {
            for (int i = 0; i < subset.subset.Length(); ++i) {
                const int entry = subset.subset[i];
                text +=
                    " " + std::to_string(nodes ? mesh.Nodes().Label(entry)
                                               : mesh.Classes()[static_cast<std::size_t>(subset.classIndex)]
                                                     .labels[static_cast<std::size_t>(entry)]);
                if (set->type == res_SetTypeEnm::FACETS) text += "/" + std::to_string(subset.facetIds[i]);
            }
        }
        sets.push_back(text);
    }
    return sets;
}

using Texts = std::vector<std::string>;

constexpr const char* kPlate =
    "$MeshFormat\n2.2 0 8\n$EndMeshFormat\n$PhysicalNames\n3\n0 3 \"tip\"\n1 2 \"rim\"\n2 1 "
    "\"sheet\"\n$EndPhysicalNames\n"
    "$Nodes\n6\n1 0 0 0\n2 1 0 0\n3 1 1 0\n4 0 1 0\n8 5 5 5\n9 7 7 7\n$EndNodes\n"
    "$Elements\n4\n1 15 2 3 1 8\n2 1 2 2 1 1 2\n3 1 2 2 1 2 3\n4 3 2 1 1 1 2 3 4\n$EndElements\n";

} // namespace

TEST_F(MeshFiles, SolidsAndBoundaries_BecomeElementsSurfacesAndNodeSets) {
    // The triangle that the two have in common.
    PutTwo("3 5 1 2\n", "3 1 2 3\n");
    const odiK_Mesh& mesh = Mesh(R"({"file": "two.msh"})");
    EXPECT_EQ(Said(), "warning /models/Default Model/parts/P/mesh/file: 1 cell of group 'fix holes' lie "
                      "between two elements, the first with label 3; of these the one with "
                      "the lower label gives the face\n");
    ASSERT_EQ(mesh.Classes().size(), 1u);
    EXPECT_EQ(mesh.Classes()[0].type, "C3D4");
    EXPECT_EQ(mesh.Classes()[0].labels, (std::vector<int>{1, 2}));
    EXPECT_EQ(mesh.Classes()[0].connectivity, (std::vector<int>{0, 1, 2, 3, 0, 2, 1, 4}));
    EXPECT_EQ(SetsOf(mesh),
              (Texts{"element solid: 1 2", "surface fix holes: 1/0", "node fix holes_NODES: 1 2 3"}));
}

TEST_F(MeshFiles, Groups_AreRenamedAndDropped) {
    PutTwo();
    EXPECT_EQ(SetsOf(Mesh(R"({"file": "two.msh", "groups": {"fix holes": "HOLES", "solid@3": null}})")),
              (Texts{"element ALL: 1 2", "surface HOLES: 2/3", "node HOLES_NODES: 1 2 5"}));
    EXPECT_EQ(report_.meshOrigins.front().notes,
              (Texts{"group 'solid' of dimension 3 was left out, as \"groups\" says"}));
    EXPECT_EQ(Refused(R"({"file": "two.msh", "groups": {"holes": "H"}})"),
              "error /models/Default Model/parts/P/mesh/groups/holes: found 'holes', expected the name of a "
              "group of the file\n");
}

TEST_F(MeshFiles, TwoGroupsForOneName_AreRefusedWithTheWayOut) {
    PutTwo("\"solid\"", "\"fix holes\"");
    EXPECT_EQ(Refused(R"({"file": "two.msh"})"),
              "error /models/Default Model/parts/P/mesh/file: groups 'fix holes' of dimension 3 and 'fix "
              "holes' of dimension 2 would both give a set "
              "'fix holes', expected names that differ; rename one of them: \"groups\": {\"fix holes@2\": "
              "\"ANOTHER NAME\"}\n");
    EXPECT_EQ(SetsOf(Mesh(R"({"file": "two.msh", "groups": {"fix holes@2": "H"}})")),
              (Texts{"element fix holes: 1 2", "surface H: 2/3", "node H_NODES: 1 2 5"}));
}

TEST_F(MeshFiles, BoundaryCellWithNothingBehind_IsRefusedWithCountAndLabel) {
    PutTwo("3 5 1 2\n", "3 1 4 5\n");
    EXPECT_EQ(Refused(R"({"file": "two.msh"})"),
              "error /models/Default Model/parts/P/mesh/file: 1 cell of group 'fix holes' without an element "
              "behind, the first with label 3, expected boundary "
              "cells on faces of elements; \"groups\": {\"fix holes\": null} leaves the group out\n");
}

TEST_F(MeshFiles, Shells_TakeEdgesAsNodeSetsAndTheirPositiveSide) {
    folder_.Put("plate.msh", kPlate);
    const odiK_Mesh& mesh = Mesh(R"({"file": "plate.msh", "scale": 10})");
    EXPECT_EQ(mesh.Classes()[0].type, "S4");
    EXPECT_EQ(mesh.Nodes().coordinates[3], 10.0F);
    EXPECT_EQ(mesh.Nodes().NumNodes(), 5);
    EXPECT_EQ(SetsOf(mesh),
              (Texts{"element sheet: 4", "surface sheet_SPOS: 4/0", "node rim: 1 2 3", "node tip: 8"}));
    EXPECT_EQ(report_.meshOrigins.front().notes,
              (Texts{"1 node of no element and no group of points were left out"}));
}

TEST_F(MeshFiles, PlaneElements_TakeEdgesAsSurfaces) {
    folder_.Put("plate.msh", kPlate);
    const odiK_Mesh& mesh = Mesh(R"({"file": "plate.msh", "surfaceElements": "plane stress"})");
    EXPECT_EQ(mesh.Classes()[0].type, "CPS4");
    EXPECT_EQ(SetsOf(mesh),
              (Texts{"element sheet: 4", "surface rim: 4/0 4/1", "node rim_NODES: 1 2 3", "node tip: 8"}));
}

TEST_F(MeshFiles, ElementTypes_ChooseDropAndAskForLinesAndPoints) {
    folder_.Put("plate.msh", kPlate);
    const odiK_Mesh& mesh =
        Mesh(R"({"file": "plate.msh", "elementTypes": {"quad4": "S4R", "line2": "B31", "vertex": "MASS"}})");
    ASSERT_EQ(mesh.Classes().size(), 3u);
    EXPECT_EQ(mesh.Classes()[0].type, "S4R");
    EXPECT_EQ(mesh.Classes()[1].type, "B31");
    EXPECT_EQ(mesh.Classes()[2].type, "MASS");
    EXPECT_EQ(SetsOf(mesh), (Texts{"element sheet: 4", "surface sheet_SPOS: 4/0", "element rim: 2 3",
                                   "element tip: 1", "node tip_NODES: 8"}));
    EXPECT_EQ(Refused(R"({"file": "plate.msh", "elementTypes": {"quad4": null}})"),
              "error /models/Default Model/parts/P/mesh/file: found no cells that make elements, expected "
              "solids or surfaces, or \"elementTypes\" for what there is; "
              "a mesh of lines takes \"elementTypes\": {\"line2\": \"B31\"}\n");
    EXPECT_EQ(Refused(R"({"file": "plate.msh", "elementTypes": {"quad4": "C3D8"}})"),
              "error /models/Default Model/parts/P/mesh/file: found type 'C3D8' for cells of kind quad4, "
              "expected a type of 4 nodes; elements of type C3D8 are of kind "
              "hexahedron8\n");
}

TEST_F(MeshFiles, LinesOfThreeNodes_HaveTheMiddleOneInTheMiddle) {
    folder_.Put("beam.msh",
                "$MeshFormat\n2.2 0 8\n$EndMeshFormat\n$Nodes\n3\n1 0 0 0\n2 2 0 0\n3 1 0 0\n$EndNodes\n"
                "$Elements\n1\n1 8 2 0 1 1 2 3\n$EndElements\n");
    EXPECT_EQ(Mesh(R"({"file": "beam.msh", "elementTypes": {"line3": "B32"}})").Classes()[0].connectivity,
              (std::vector<int>{0, 2, 1}));
}

TEST_F(MeshFiles, SetsByLabelAndControls_StandBesideTheFile) {
    PutTwo();
    const odiK_Mesh& mesh =
        Mesh(R"({"file": "two.msh", "sets": [{"name": "ONE", "kind": "node", "labels": [5]}],
                                     "controls": {"C3D4": {"secondOrderAccuracy": "YES"}}})");
    EXPECT_EQ(SetsOf(mesh).back(), "node ONE: 5");
    EXPECT_NE(mesh.Classes()[0].controls, bme_ElemCtrlParams());
}

TEST_F(MeshFiles, NamesThatCantStandInADeck_AreRefusedWithTheWayOut) {
    PutTwo("fix holes", "a \"b\" c");
    EXPECT_EQ(Refused(R"({"file": "two.msh"})"),
              "error /models/Default Model/parts/P/mesh/file: found a name with a double quote of group 'a "
              "\"b\" c', expected a name that can stand in a deck; "
              "give it another name in \"groups\"\n");
    PutTwo("fix holes", std::string(200, 'x'));
    EXPECT_NE(Refused(R"({"file": "two.msh"})").find("found a name of 200 bytes of group"),
              std::string::npos);
    PutTwo("fix holes", "Loch \xc3\xa4");
    EXPECT_EQ(SetsOf(Mesh(R"({"file": "two.msh"})"))[1], "surface Loch \xc3\xa4: 2/3");
}

TEST_F(MeshFiles, FileThatIsWrong_IsTheOneError) {
    folder_.Put("bad.msh", "$MeshFormat\n4.1 0 8\n");
    EXPECT_EQ(
        Refused(
            R"({"file": "bad.msh", "sets": [{"name": "X", "kind": "node", "labels": [1]}]}, "sectionAssignments": [{"region": "ALL", "sectionName": "S"}])"),
        "error /models/Default Model/parts/P/mesh/file: bad.msh: line 2: found the end of the file, expected "
        "$EndMeshFormat\n");
    EXPECT_FALSE(report_.unreadable);
    EXPECT_EQ(Refused(R"({"file": "none.msh"})"), "error /models/Default Model/parts/P/mesh/file: none.msh: "
                                                  "the file can't be read: No such file or directory\n");
    EXPECT_TRUE(report_.unreadable);
}

TEST_F(MeshFiles, Members_OfTheWrongKind_AreTold) {
    PutTwo();
    EXPECT_NE(Refused(R"({"file": 7})").find("/mesh/file: found 7, expected the path of a mesher's file"),
              std::string::npos);
    EXPECT_NE(
        Refused(R"({"file": "two.msh", "scale": 0})").find("/scale: found 0, expected a positive number"),
        std::string::npos);
    EXPECT_NE(Refused(R"({"file": "two.msh", "surfaceElements": "cloth"})")
                  .find("/surfaceElements: found 'cloth', expected one of shell, membrane"),
              std::string::npos);
    EXPECT_NE(Refused(R"({"file": "two.msh", "elementTypes": {"tetra11": "C3D10"}})")
                  .find("/elementTypes/tetra11: found 'tetra11'; did you mean 'tetra10'? Expected one of "),
              std::string::npos);
    EXPECT_NE(Refused(R"({"file": "two.msh", "nodes": {}})").find("/nodes: found an unknown member 'nodes'"),
              std::string::npos);
    EXPECT_NE(Refused(R"({"file": "two.msh", "groupArrays": [1]})")
                  .find("/groupArrays/0: found 1, expected the name of an array of cells"),
              std::string::npos);
}

TEST_F(MeshFiles, ModelWrittenBack_StillNamesTheFile) {
    PutTwo();
    const auto store = Read(R"({"file": "two.msh", "groups": {"solid": "S"}})");
    ASSERT_NE(store, nullptr);
    std::ostringstream same;
    ASSERT_TRUE(mdf_WriteModelFile(*store, same, report_.meshOrigins, folder_.Path()));
    EXPECT_NE(same.str().find("\"file\": \"two.msh\""), std::string::npos);
    EXPECT_EQ(same.str().find("\"nodes\""), std::string::npos);
    std::ostringstream elsewhere;
    ASSERT_TRUE(mdf_WriteModelFile(*store, elsewhere, report_.meshOrigins, folder_.Path("deeper")));
    EXPECT_NE(elsewhere.str().find("\"file\": \"../two.msh\""), std::string::npos);
    std::ostringstream whole;
    ASSERT_TRUE(mdf_WriteModelFile(*store, whole));
    EXPECT_NE(whole.str().find("\"nodes\""), std::string::npos);
}

TEST_F(MeshFiles, BehindLinksToFolders_TheModelWrittenBackStillFindsTheFile) {
    namespace fs = std::filesystem;
    fs::create_directories(folder_.Path("store/deep"));
    folder_.Put("store/two.msh", TwoTetrahedra());
    fs::create_directory_symlink("store/deep", folder_.Path("link"));
    const auto written = [&](const std::string& from, const std::string& file, const std::string& to) {
        mdf_Report report;
        const auto model = [](const std::string& mesh) {
            return R"({"format": "qrx-model/1", "models": {"M": {"parts": {"P": {"mesh": {"file": ")" + mesh +
                   R"("}}}}}})";
        };
        const auto store = mdf_ReadModelText(model(file), folder_.Path(from + "m.json"), report);
        if (store == nullptr) return std::string("not read");
        std::ostringstream text;
        mdf_WriteModelFile(*store, text, report.meshOrigins,
                           fs::path(folder_.Path(to + "m.json")).parent_path().string());
        mdf_Report again;
        EXPECT_NE(mdf_ReadModelText(text.str(), folder_.Path(to + "m.json"), again), nullptr) << text.str();
        const std::string begin = "\"file\": \"";
        const std::size_t at = text.str().find(begin) + begin.size();
        return text.str().substr(at, text.str().find('"', at) - at);
    };
    // What leads there is kept; "link/.." is "store", not the folder of the link.
    EXPECT_EQ(written("", "link/../two.msh", ""), "link/../two.msh");
    EXPECT_EQ(written("", "./store/two.msh", ""), "store/two.msh");
    EXPECT_EQ(written("link/", "../two.msh", "link/"), "../two.msh");
    EXPECT_EQ(written("link/", "../two.msh", ""), "store/two.msh");
    EXPECT_EQ(written("", "store/two.msh", "link/"), "../two.msh");
    EXPECT_EQ(written("", "link/../two.msh", "store/deep/"), "../two.msh");
}

TEST_F(MeshFiles, OneMeshInEveryFormat_GivesTheSameSetsAndElements) {
    // The mesher's universal files have underscores for blanks, and old MSH numbers elements anew.
    const auto read = [&](const std::string& file) {
        const odiK_Mesh& mesh = Mesh("{\"file\": \"" QRX_MESHES "/" + file + "\"}");
        std::string text;
        for (const odiK_ElementClass& elements : mesh.Classes()) {
            text += std::string(elements.type.View());
            for (const int node : elements.connectivity) text += " " + std::to_string(node);
        }
        for (const float value : mesh.Nodes().coordinates) text += " " + std::to_string(value);
        for (const auto& set : mesh.Sets()) {
            std::string name(set->name.View());
            std::replace(name.begin(), name.end(), ' ', '_');
            if (name == "corner") continue; // which universal files don't have
            text += "\n" + name + ":";
            for (const rgnC_SubsetData& subset : set->subsets) {
                for (int i = 0; i < subset.subset.Length(); ++i) {
                    text += " " + std::to_string(subset.subset[i]);
                    if (subset.facetIds.Length() > 0) text += "/" + std::to_string(subset.facetIds[i]);
                }
            }
        }
        return text;
    };
    for (const char* stem : {"tets", "bricks"}) {
        const std::string first = read(std::string(stem) + "_41.msh");
        EXPECT_NE(first.find("\nfix_holes:"), std::string::npos);
        for (const char* end : {"_41b.msh", "_22.msh", "_22b.msh", ".unv"})
            EXPECT_EQ(read(stem + std::string(end)), first) << stem << end;
        EXPECT_EQ(read(std::string(stem) + (QRX_READS_MED != 0 ? ".med" : ".unv")), first) << stem;
    }
    EXPECT_EQ(read("tets_smesh.unv"), read("tets_41.msh"));
}
