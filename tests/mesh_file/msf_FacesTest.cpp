#include "mesh_file/msf_Faces.h"

#include <gtest/gtest.h>

namespace {

/// Two bricks side by side on the x axis with nodes 0 to 11, and boundary quadrangles.
msf_Mesh TwoBricks(std::vector<int> quads) {
    msf_Mesh mesh;
    mesh.nodeLabels.resize(12);
    msf_Block bricks{cel_KindEnm::HEXAHEDRON8, {20, 10}, {0, 1, 4, 3, 6, 7, 10, 9, 1, 2, 5, 4, 7, 8, 11, 10}};
    msf_Block boundary{cel_KindEnm::QUAD4, std::vector<int>(quads.size() / 4), std::move(quads)};
    mesh.blocks = {bricks, boundary};
    return mesh;
}

std::vector<msf_Face> Faces(const msf_Mesh& mesh) {
    const msf_Run run{1, 0, mesh.blocks[1].NumCells()};
    return msf_MatchFaces(mesh, 3, {true, false}, {&run, 1});
}

} // namespace

TEST(Faces, BoundaryCells_InAnyOrderOfTheirCorners_FindTheElementAndTheFaceBehind) {
    const std::vector<msf_Face> faces = Faces(TwoBricks({0, 1, 4, 3, 3, 9, 6, 0, 8, 2, 5, 11}));
    ASSERT_EQ(faces.size(), 3u);
    EXPECT_EQ(faces[0].cell, 0);
    EXPECT_EQ(faces[0].side, 0);
    EXPECT_EQ(faces[1].cell, 0);
    EXPECT_EQ(faces[1].side, 5);
    EXPECT_EQ(faces[2].cell, 1);
    EXPECT_EQ(faces[2].side, 3);
    for (const msf_Face& face : faces) EXPECT_EQ(face.behind, 1);
}

TEST(Faces, InnerCell_BetweenTwoElements_TakesTheOneWithTheLowerLabel) {
    const std::vector<msf_Face> faces = Faces(TwoBricks({1, 4, 10, 7}));
    EXPECT_EQ(faces[0].behind, 2);
    EXPECT_EQ(faces[0].cell, 1);
    EXPECT_EQ(faces[0].side, 5);
}

TEST(Faces, CellWithNothingBehind_AndEqualCells_AreToldApart) {
    const std::vector<msf_Face> faces = Faces(TwoBricks({0, 2, 5, 3, 0, 1, 4, 3, 4, 3, 0, 1}));
    EXPECT_EQ(faces[0].behind, 0);
    EXPECT_EQ(faces[1].behind, 1);
    EXPECT_EQ(faces[2].behind, 1);
    EXPECT_EQ(faces[2].side, 0);
}

TEST(Faces, ManyCells_AboutOneNode_AreFoundAll) {
    // A fan of tetrahedra about the edge from node 0 to node 1.
    msf_Mesh mesh;
    const int count = 200;
    mesh.nodeLabels.resize(static_cast<std::size_t>(count) + 2);
    msf_Block tetrahedra{cel_KindEnm::TETRA4, {}, {}};
    msf_Block triangles{cel_KindEnm::TRIANGLE3, {}, {}};
    for (int i = 0; i + 1 < count; ++i) {
        tetrahedra.labels.push_back(i + 1);
        tetrahedra.nodes.insert(tetrahedra.nodes.end(), {0, 1, i + 2, i + 3});
        triangles.labels.push_back(1000 + i);
        triangles.nodes.insert(triangles.nodes.end(), {i + 3, 0, i + 2});
    }
    mesh.blocks = {tetrahedra, triangles};
    const msf_Run run{1, 0, count - 1};
    const std::vector<msf_Face> faces = msf_MatchFaces(mesh, 3, {true, false}, {&run, 1});
    for (int i = 0; i + 1 < count; ++i) {
        EXPECT_EQ(faces[static_cast<std::size_t>(i)].cell, i);
        EXPECT_EQ(faces[static_cast<std::size_t>(i)].side, 3);
    }
}
