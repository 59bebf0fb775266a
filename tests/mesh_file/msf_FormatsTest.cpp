#include "foundation/mq_MeshQuality.h"
#include "mesh_file/MeshTexts.h"

#include <algorithm>
#include <cmath>
#include <set>

// Files of real meshers, from geometry of our own (make_meshes.py, make_vtu.py, make_med.py): two blocks of 2
// x 1 x 1 and 1 x 1 x 1 side by side, a sheared prism of 2 x 1 x 1, a plate of 4 x 2 with a hole.

namespace {

std::string PathOf(const std::string& name) {
    return std::string(QRX_MESHES) + "/" + name;
}

/// MED files need HDF5.
bool CanRead(const std::string& name) {
    return QRX_READS_MED != 0 || !name.ends_with(".med");
}

msf_Mesh Read(const std::string& name, const msf_Options& options = {}) {
    msf_Mesh mesh;
    msf_Problem problem;
    EXPECT_TRUE(msf_ReadMeshFile(PathOf(name), options, mesh, problem)) << name << ": " << problem.Text();
    return mesh;
}

double SizeOf(const msf_Mesh& mesh, const std::vector<msf_Run>& runs) {
    double size = 0.0;
    for (const msf_Run& run : runs) {
        const msf_Block& block = mesh.blocks[static_cast<std::size_t>(run.block)];
        for (int cell = run.begin; cell < run.end; ++cell)
            size += mq_SizeOf(block.kind, block.Row(cell), mesh.coordinates);
    }
    return size;
}

double SizeOfDimension(const msf_Mesh& mesh, int dimension) {
    std::vector<msf_Run> runs;
    for (std::size_t i = 0; i < mesh.blocks.size(); ++i) {
        if (cel_CellOf(mesh.blocks[i].kind).dimension == dimension)
            runs.push_back({static_cast<int>(i), 0, mesh.blocks[i].NumCells()});
    }
    return SizeOf(mesh, runs);
}

double SizeOfGroup(const msf_Mesh& mesh, const std::string& name, int dimension) {
    const msf_Group* group = FindGroup(mesh, name, dimension);
    EXPECT_NE(group, nullptr) << name;
    return group == nullptr ? 0.0 : SizeOf(mesh, group->cells);
}

mq_Quality QualityOf(const msf_Mesh& mesh) {
    mq_Mesh arrays{mesh.nodeLabels, mesh.coordinates, {}};
    for (const msf_Block& block : mesh.blocks)
        arrays.blocks.push_back({block.kind, block.labels, block.nodes, block.Width(), false, true});
    return mq_QualityOf(arrays);
}

void ExpectGoodShapes(const msf_Mesh& mesh) {
    const mq_Quality quality = QualityOf(mesh);
    EXPECT_EQ(quality.inverted.count, 0);
    EXPECT_EQ(quality.farMidSides.count, 0);
    EXPECT_EQ(quality.repeatedNodes.count, 0);
    EXPECT_EQ(quality.repeatedElements.count, 0);
    EXPECT_EQ(quality.sharedFaces.count, 0);
}

/// The mesh in a form that knows no labels: nodes of solids in their order, solids, groups of them by name.
std::string SolidsOf(const msf_Mesh& mesh) {
    std::string text;
    for (const float value : mesh.coordinates) text += std::to_string(value) + " ";
    for (std::size_t i = 0; i < mesh.blocks.size(); ++i) {
        const msf_Block& block = mesh.blocks[i];
        if (cel_CellOf(block.kind).dimension != 3) continue;
        text += "\n" + std::string(cel_CellOf(block.kind).name);
        for (const int node : block.nodes) text += " " + std::to_string(node);
    }
    return text;
}

std::string MembersOf(const msf_Mesh& mesh, const std::string& name, int dimension) {
    const msf_Group* group = FindGroup(mesh, name, dimension);
    if (group == nullptr) return "no group " + name;
    std::set<std::string> rows;
    for (const msf_Run& run : group->cells) {
        const msf_Block& block = mesh.blocks[static_cast<std::size_t>(run.block)];
        for (int cell = run.begin; cell < run.end; ++cell) {
            std::vector<int> nodes(block.Row(cell), block.Row(cell) + block.Width());
            std::sort(nodes.begin(), nodes.end());
            std::string row;
            for (const int node : nodes) row += std::to_string(node) + " ";
            rows.insert(row);
        }
    }
    std::string text;
    for (const std::string& row : rows) text += "\n" + row;
    return text;
}

} // namespace

class BoxOfEveryFormat : public testing::TestWithParam<const char*> {};

TEST_P(BoxOfEveryFormat, VolumeBoxAndShapes_AreThoseOfTheGeometry) {
    if (!CanRead(GetParam())) GTEST_SKIP() << "built without HDF5";
    const msf_Mesh mesh = Read(GetParam());
    EXPECT_NEAR(SizeOfDimension(mesh, 3), 3.0, 1e-5);
    float box[2][3] = {{9, 9, 9}, {-9, -9, -9}};
    for (std::size_t i = 0; i < mesh.coordinates.size(); ++i) {
        box[0][i % 3] = std::min(box[0][i % 3], mesh.coordinates[i]);
        box[1][i % 3] = std::max(box[1][i % 3], mesh.coordinates[i]);
    }
    const float expected[2][3] = {{0, 0, 0}, {3, 1, 1}};
    for (int i = 0; i < 6; ++i) EXPECT_NEAR(box[i / 3][i % 3], expected[i / 3][i % 3], 1e-6F);
    ExpectGoodShapes(mesh);
}

INSTANTIATE_TEST_SUITE_P(Files, BoxOfEveryFormat,
                         testing::Values("tets_41.msh", "tets_41b.msh", "tets_22.msh", "tets_22b.msh",
                                         "tets1_22.msh", "tets.unv", "tets_nodes.unv", "tets_a.vtk",
                                         "tets_b.vtk", "tets_51a.vtk", "tets_51b.vtk", "tets_ascii.vtu",
                                         "tets_base64.vtu", "tets_base64z.vtu", "tets_raw.vtu",
                                         "tets_raw64.vtu", "tets_rawz.vtu", "tets_appended.vtu",
                                         "tets_appendedz.vtu", "bricks_41.msh", "bricks_41b.msh",
                                         "bricks_22.msh", "bricks_22b.msh", "bricks27.msh", "bricks.unv",
                                         "bricks_nodes.unv", "bricks_a.vtk", "bricks_b.vtk", "bricks_raw.vtu",
                                         "tets.med", "bricks.med", "tets_smesh.unv"),
                         [](const auto& file) {
                             std::string name(file.param);
                             std::replace(name.begin(), name.end(), '.', '_');
                             return name;
                         });

class PrismsOfEveryFormat : public testing::TestWithParam<const char*> {};

TEST_P(PrismsOfEveryFormat, Wedges_HaveTheVolumeOfTheGeometry) {
    if (!CanRead(GetParam())) GTEST_SKIP() << "built without HDF5";
    const msf_Mesh mesh = Read(GetParam());
    EXPECT_NEAR(SizeOfDimension(mesh, 3), 2.0, 1e-5);
    EXPECT_EQ(mesh.format.empty(), false);
    ExpectGoodShapes(mesh);
}

INSTANTIATE_TEST_SUITE_P(Files, PrismsOfEveryFormat,
                         testing::Values("prisms_41.msh", "prisms_41b.msh", "prisms_22.msh", "prisms_22b.msh",
                                         "prisms.unv", "prisms_a.vtk", "prisms_b.vtk", "prisms_base64z.vtu",
                                         "prisms.med"),
                         [](const auto& file) {
                             std::string name(file.param);
                             std::replace(name.begin(), name.end(), '.', '_');
                             return name;
                         });

TEST(Formats, OneMesh_ThroughEveryFormat_HasTheSameNodesAndSolids) {
    const std::string tets = SolidsOf(Read("tets_41.msh"));
    for (const char* name :
         {"tets_41b.msh", "tets_22.msh", "tets_22b.msh", "tets.unv", "tets_nodes.unv", "tets_a.vtk",
          "tets_b.vtk", "tets_51a.vtk", "tets_51b.vtk", "tets_ascii.vtu", "tets_base64.vtu",
          "tets_base64z.vtu", "tets_raw.vtu", "tets_raw64.vtu", "tets_rawz.vtu", "tets_appended.vtu",
          "tets_appendedz.vtu", "tets.med", "tets_smesh.unv"}) {
        if (!CanRead(name)) continue;
        EXPECT_EQ(SolidsOf(Read(name)), tets) << name;
    }
    const std::string bricks = SolidsOf(Read("bricks_41.msh"));
    for (const char* name : {"bricks_41b.msh", "bricks_22.msh", "bricks_22b.msh", "bricks.unv",
                             "bricks_a.vtk", "bricks_b.vtk", "bricks_raw.vtu"})
        EXPECT_EQ(SolidsOf(Read(name)), bricks) << name;
}

TEST(Formats, OverlappingGroups_ThroughEveryFormatThatKeepsThem_HaveTheSameMembers) {
    const std::pair<const char*, int> groups[] = {{"left block", 3}, {"both", 3},       {"Bloc à droite", 3},
                                                  {"fix holes", 2},  {"Oberfläche", 2}, {"edge", 1}};
    const msf_Mesh first = Read("tets_41.msh");
    for (const char* name : {"tets_41b.msh", "tets_22.msh", "tets_22b.msh", "tets.unv", "tets_nodes.unv",
                             "tets_smesh.unv", "tets.med"}) {
        if (!CanRead(name)) continue;
        const msf_Mesh mesh = Read(name);
        for (const auto& [group, dimension] : groups) {
            // The mesher puts underscores for blanks into universal files, of which the others were made.
            std::string there = group;
            if (mesh.format == "UNV" || mesh.format == "MED 4.1")
                std::replace(there.begin(), there.end(), ' ', '_');
            EXPECT_EQ(MembersOf(mesh, there, dimension), MembersOf(first, group, dimension)) << name;
        }
    }
}

TEST(Formats, GroupsOfSurfacesEdgesAndVolumes_HaveTheSizesOfTheGeometry) {
    const msf_Mesh mesh = Read("bricks_41b.msh");
    EXPECT_NEAR(SizeOfGroup(mesh, "left block", 3), 2.0, 1e-6);
    EXPECT_NEAR(SizeOfGroup(mesh, "Bloc à droite", 3), 1.0, 1e-6);
    EXPECT_NEAR(SizeOfGroup(mesh, "both", 3), 3.0, 1e-6);
    EXPECT_NEAR(SizeOfGroup(mesh, "fix holes", 2), 1.0, 1e-6);
    EXPECT_NEAR(SizeOfGroup(mesh, "Oberfläche", 2), 3.0, 1e-6);
    EXPECT_NEAR(SizeOfGroup(mesh, "edge", 1), 3.0, 1e-6);
    ASSERT_NE(FindGroup(mesh, "corner", 0), nullptr);
    EXPECT_EQ(FindGroup(mesh, "corner", 0)->nodes.size(), 1u);
    const msf_Mesh plate = Read("plate_41.msh");
    // A regular octagon of radius a half stands for the hole.
    EXPECT_NEAR(SizeOfGroup(plate, "plate", 2), 8.0 - 2.0 * std::sqrt(2.0) * 0.25, 1e-5);
    EXPECT_NEAR(SizeOfGroup(plate, "hole", 1), 8.0 * std::sin(std::acos(-1.0) / 8.0), 1e-5);
}

TEST(Formats, ElementsOfTwoGroups_ThatOldMshStoresTwice_AreMergedAndTold) {
    const msf_Mesh mesh = Read("tets_22.msh");
    ASSERT_EQ(mesh.notes.size(), 1u);
    EXPECT_EQ(mesh.notes[0],
              "68 repeated cells of kind tetra10 were merged, each stored once for every group it is in");
}

TEST(Formats, GroupArrays_OfVtk_GiveAGroupForEachValueAndDimension) {
    msf_Options options;
    options.groupArrays = {"CellEntityIds"};
    for (const char* name : {"tets_a.vtk", "tets_b.vtk", "tets_51b.vtk", "tets_rawz.vtu", "tets_ascii.vtu"}) {
        const msf_Mesh mesh = Read(name, options);
        EXPECT_NEAR(SizeOfGroup(mesh, "CellEntityIds_1", 3), 2.0, 1e-5) << name;
        EXPECT_NEAR(SizeOfGroup(mesh, "CellEntityIds_2", 3), 1.0, 1e-5) << name;
    }
    EXPECT_EQ(Read("tets_a.vtk").notes,
              (std::vector<std::string>{
                  "the file has arrays of cells that group arrays may name: 'CellEntityIds'"}));
    options.groupArrays = {"Materials"};
    msf_Mesh mesh;
    msf_Problem problem;
    EXPECT_FALSE(msf_ReadMeshFile(PathOf("tets_raw.vtu"), options, mesh, problem));
    EXPECT_EQ(problem.Text(),
              "found no array 'Materials' with one integer for each cell, expected one of 'CellEntityIds'");
}

TEST(Formats, WedgesInsideOut_OfVtk_AreTurnedByTheirVolume) {
    const std::string head = "# vtk DataFile Version 2.0\nw\nASCII\nDATASET UNSTRUCTURED_GRID\n"
                             "POINTS 6 double\n0 0 0 1 0 0 0 1 0 0 0 1 1 0 1 0 1 1\nCELLS 1 7\n6 ";
    const std::string tail = "\nCELL_TYPES 1\n13\n";
    const msf_Mesh right = MeshOf(head + "0 1 2 3 4 5" + tail);
    EXPECT_TRUE(right.notes.empty());
    const msf_Mesh turned = MeshOf(head + "0 2 1 3 5 4" + tail);
    EXPECT_EQ(turned.blocks[0].nodes, right.blocks[0].nodes);
    EXPECT_EQ(turned.notes, (std::vector<std::string>{"1 wedge stood inside out and were turned"}));
}

TEST(Formats, CornersOfStl_ThatAreEqual_BecomeOneNode) {
    for (const char* name : {"box_a.stl", "box_b.stl"}) {
        const msf_Mesh mesh = Read(name);
        EXPECT_EQ(mesh.NumNodes(), 31) << name;
        ASSERT_EQ(mesh.NumCells(), 60) << name;
        // Outside of both blocks, and the face between them.
        EXPECT_NEAR(SizeOfDimension(mesh, 2), 14.0 + 1.0, 1e-5) << name;
        EXPECT_EQ(QualityOf(mesh).repeatedNodes.count, 0) << name;
    }
}

TEST(Formats, Scale_IsAppliedBeforeRounding) {
    msf_Options options;
    options.scale = 1000.0;
    const msf_Mesh mesh =
        MeshOf(Replaced(TwoTetrahedra(), "1 0 0\n0 1 0\n", "1.00000001 0 0\n0 0.1234567891 0\n"), options);
    EXPECT_EQ(mesh.coordinates[3], static_cast<float>(1000.00001));
    EXPECT_EQ(mesh.coordinates[7], static_cast<float>(123.4567891));
}

TEST(Formats, GroupsWithoutNames_GetOneByKindAndNumber) {
    const msf_Mesh mesh = MeshOf(Replaced(
        TwoTetrahedra(), "$PhysicalNames\n2\n2 5 \"fix holes\"\n3 1 \"solid\"\n$EndPhysicalNames\n", ""));
    EXPECT_NE(FindGroup(mesh, "SURFACE_5", 2), nullptr);
    EXPECT_NE(FindGroup(mesh, "VOLUME_1", 3), nullptr);
    EXPECT_EQ(mesh.notes, (std::vector<std::string>{
                              "2 groups without a name got one by kind and number, such as SURFACE_5"}));
}

TEST(Formats, NamesWithQuotesBlanksAndLatinLetters_ComeThrough) {
    const msf_Mesh mesh = MeshOf(Replaced(TwoTetrahedra(), "\"fix holes\"", "\"a \"b\" \xe4 c\""));
    EXPECT_NE(FindGroup(mesh, "a \"b\" ä c", 2), nullptr);
}

TEST(Formats, Beams_OfUniversalFiles_HaveALineOfOrientationNodes) {
    const std::string text =
        "    -1\n  2411\n         1         1         1        11\n   0.0D+00   0.0D+00   0.0D+00\n"
        "         2         1         1        11\n   1.5D+02   0.0D+00   0.0D+00\n    -1\n"
        "    -1\n  2412\n         7        21         2         1         7         2\n         0         1  "
        "       1\n"
        "         1         2\n    -1\n"
        "    -1\n  2467\n         1         0         0         0         0         0         0         "
        "3\nmixed\n"
        "         8         7         0         0         7         2         0         0\n"
        "         7         1         0         0\n    -1\n";
    const msf_Mesh mesh = MeshOf(text);
    EXPECT_EQ(mesh.coordinates[3], 150.0F);
    ASSERT_NE(FindGroup(mesh, "mixed", 1), nullptr);
    ASSERT_NE(FindGroup(mesh, "mixed", 0), nullptr);
    EXPECT_EQ(FindGroup(mesh, "mixed", 0)->nodes, (std::vector<int>{0, 1}));
}

TEST(Formats, OlderDatasets_OfUniversalFiles_AreReadToo) {
    const std::string text =
        "    -1\n    15\n         1         0         0         1   0.0  0.0  0.0\n"
        "         2         0         0         1   1.0  0.0  0.0\n         3         0         0         1  "
        " 0.0  1.0  0.0\n    -1\n"
        "    -1\n   780\n         4        91         1         1         1         1         7         3\n"
        "         1         2         3\n    -1\n"
        "    -1\n  2417\n         1         0         0         0         0         0         0         "
        "1\nskin\n"
        "         8         4\n    -1\n";
    const msf_Mesh mesh = MeshOf(text);
    ASSERT_EQ(mesh.blocks.size(), 1u);
    EXPECT_EQ(mesh.blocks[0].labels, (std::vector<int>{4}));
    ASSERT_NE(FindGroup(mesh, "skin", 2), nullptr);
}
