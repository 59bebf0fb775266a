#include "view_page/PageTesting.h"

#include "view_page/vpg_Arrays.h"
#include "view_page/vpg_GroupByNodes.h"
#include "view_page/vpg_Mesh.h"

#include <algorithm>
#include <map>
#include <random>
#include <set>

namespace {

int CellsOf(const PageOf& page, const std::string& role) {
    int count = 0;
    for (const auto& block : page.header["meshes"][0]["blocks"]) {
        if (block["role"] == role) count += block["count"].get<int>();
    }
    return count;
}

/// A block of n * n * n hexahedra.
odiK_Mesh Block(int n) {
    odiK_Mesh mesh;
    const int m = n + 1;
    Ints labels;
    Floats xyz;
    for (int k = 0; k < m; ++k) {
        for (int j = 0; j < m; ++j) {
            for (int i = 0; i < m; ++i) {
                labels.push_back(static_cast<int>(labels.size()) + 1);
                for (const int x : {i, j, k}) xyz.push_back(static_cast<float>(x));
            }
        }
    }
    mesh.SetNodes(labels, xyz);
    Ints elements;
    Ints nodes;
    const auto node = [&](int i, int j, int k) { return 1 + i + m * (j + m * k); };
    for (int k = 0; k < n; ++k) {
        for (int j = 0; j < n; ++j) {
            for (int i = 0; i < n; ++i) {
                elements.push_back(static_cast<int>(elements.size()) + 1);
                nodes.insert(nodes.end(), {node(i, j, k), node(i + 1, j, k), node(i + 1, j + 1, k),
                                           node(i, j + 1, k), node(i, j, k + 1), node(i + 1, j, k + 1),
                                           node(i + 1, j + 1, k + 1), node(i, j + 1, k + 1)});
            }
        }
    }
    mesh.AddElements("C3D8", elements, 8, nodes);
    return mesh;
}

} // namespace

TEST(Skin, OfTwoHexahedraThatShareAFace_HasTenFaces) {
    const PageOf page(MeshModel(kTwoCubes, 12, kTwoHexahedra));
    const auto& blocks = page.header["meshes"][0]["blocks"];
    ASSERT_EQ(blocks.size(), 1U);
    EXPECT_EQ(blocks[0]["cell"], "quad4");
    EXPECT_EQ(blocks[0]["type"], "C3D8");
    // The first has no S4, the second no S6: the faces at x = 1.
    EXPECT_EQ(page.IntsOf(blocks[0]["labels"]), (Ints{1, 1, 1, 1, 1, 2, 2, 2, 2, 2}));
    EXPECT_EQ(page.IntsOf(blocks[0]["sides"]), (Ints{0, 1, 2, 4, 5, 0, 1, 2, 3, 4}));
}

TEST(Skin, FacesOfSolids_LookOutward) {
    const PageOf page(MeshModel(kTwoCubes, 12, kTwoHexahedra));
    const auto& mesh = page.header["meshes"][0];
    const Floats xyz = page.FloatsOf(mesh["positions"]);
    const Ints nodes = page.IntsOf(mesh["blocks"][0]["connectivity"]);
    double volume = 0.0;
    // The divergence theorem, face by face as two triangles.
    for (std::size_t face = 0; face < nodes.size(); face += 4) {
        for (const auto& [b, c] : {std::pair(1U, 2U), std::pair(2U, 3U)}) {
            const auto at = [&](std::size_t corner, std::size_t k) {
                return static_cast<double>(xyz[3 * static_cast<std::size_t>(nodes[face + corner]) + k]);
            };
            volume += (at(0, 0) * (at(b, 1) * at(c, 2) - at(b, 2) * at(c, 1)) +
                       at(0, 1) * (at(b, 2) * at(c, 0) - at(b, 0) * at(c, 2)) +
                       at(0, 2) * (at(b, 0) * at(c, 1) - at(b, 1) * at(c, 0))) /
                      6.0;
        }
    }
    EXPECT_NEAR(volume, 2.0, 1e-12);
}

TEST(Skin, OfABlock_IsItsSixSides_AndInnerNodesStayAway) {
    const odiK_Mesh mesh = Block(7);
    const vpg_Mesh page(mesh);
    EXPECT_EQ(page.NumCells(), 6 * 49);
    std::set<int> nodes;
    for (const vpg_Block& block : page.Blocks()) nodes.insert(block.nodes.begin(), block.nodes.end());
    EXPECT_EQ(nodes.size(), 512U - 216U);
}

TEST(Skin, OfAWedgeOnAHexahedron_HasTrianglesAndQuadrilaterals) {
    // The wedge lies on the hexahedron's face x = 1.
    const PageOf page(
        MeshModel("[0,0,0],[1,0,0],[1,1,0],[0,1,0],[0,0,1],[1,0,1],[1,1,1],[0,1,1],[2,0,0],[2,0,1]", 10,
                  R"({"type": "C3D8", "labels": [1], "connectivity": [[1,2,3,4,5,6,7,8]]},
                                   {"type": "C3D6", "labels": [2], "connectivity": [[2,9,3,6,10,7]]})"));
    std::map<std::string, int> counts;
    for (const auto& block : page.header["meshes"][0]["blocks"]) {
        counts[block["type"].get<std::string>() + " " + block["cell"].get<std::string>()] +=
            block["count"].get<int>();
    }
    EXPECT_EQ(counts,
              (std::map<std::string, int>{{"C3D8 quad4", 5}, {"C3D6 triangle3", 2}, {"C3D6 quad4", 2}}));
}

TEST(Skin, OfAQuadraticTetrahedron_KeepsTheMidsideNodes) {
    const PageOf page(
        MeshModel("[0,0,0],[2,0,0],[0,2,0],[0,0,2],[1,0,0],[1,1,0],[0,1,0],[0,0,1],[1,0,1],[0,1,1]", 10,
                  R"({"type": "C3D10", "labels": [5], "connectivity": [[1,2,3,4,5,6,7,8,9,10]]})"));
    const auto& block = page.header["meshes"][0]["blocks"][0];
    EXPECT_EQ(block["cell"], "triangle6");
    EXPECT_EQ(block["corners"], 3);
    EXPECT_EQ(block["nodes"], 6);
    EXPECT_EQ(page.IntsOf(block["connectivity"]).size(), 24U);
}

TEST(Cells, OfAllRoles_AreToldApart) {
    const PageOf page(MeshModel("[0,0,0],[1,0,0],[1,1,0],[0,1,0]", 4,
                                R"({"type": "S4R", "labels": [1], "connectivity": [[1,2,3,4]]},
                                   {"type": "M3D4", "labels": [2], "connectivity": [[1,2,3,4]]},
                                   {"type": "B31", "labels": [3, 4], "connectivity": [[1,2], [2,3]]},
                                   {"type": "MASS", "labels": [5], "connectivity": [[1]]},
                                   {"type": "XYZ4", "labels": [6, 7], "connectivity": [[2,3,4,1], [1,2,3,4]]})"));
    EXPECT_EQ(CellsOf(page, "shell"), 1);
    EXPECT_EQ(CellsOf(page, "sheet"), 1);
    EXPECT_EQ(CellsOf(page, "line"), 2);
    EXPECT_EQ(CellsOf(page, "point"), 1);
    EXPECT_EQ(CellsOf(page, "unknown"), 2);
    EXPECT_EQ(page.header["meshes"][0]["unknown"], (nlohmann::json{{"XYZ4", 2}}));
}

TEST(Cells, OfConnectors_EndWhereTheirInstancesStand) {
    const PageOf page(R"("parts": {"P": {"mesh": {"nodes": {"labels": [7], "coordinates": [[1, 0, 0]]}}}},
        "assembly": {"instances": {"A": {"part": "P"},
                                   "B": {"part": "P", "translation": [10, 0, 0], "rotation": [0, 0, 1.5707963267948966]}},
            "mesh": {"elements": [{"type": "CONN3D2", "labels": [1], "connectivity": [["A.7", "B.7"]]}]}})");
    const auto& assembly = page.header["instances"][2];
    EXPECT_EQ(assembly["kind"], "assembly");
    const auto& mesh = page.header["meshes"][assembly["mesh"].get<std::size_t>()];
    EXPECT_EQ(mesh["blocks"][0]["role"], "connector");
    const Floats xyz = page.FloatsOf(mesh["positions"]);
    ASSERT_EQ(xyz.size(), 6U);
    const Floats expected{1, 0, 0, 10, 1, 0};
    for (std::size_t i = 0; i < 6; ++i) EXPECT_NEAR(xyz[i], expected[i], 1e-6) << i;
}

TEST(FeatureEdges, OfABox_AreItsTwelveEdges) {
    const odiK_Mesh mesh = Block(4);
    const Ints edges = vpg_FeatureEdges(vpg_Mesh(mesh));
    EXPECT_EQ(edges.size(), 2U * 12U * 4U);
}

TEST(FeatureEdges, OfAFlatShell_AreItsRim_EvenWhereANeighbourIsTurnedOver) {
    const std::string turned =
        MeshModel("[0,0,0],[1,0,0],[2,0,0],[0,1,0],[1,1,0],[2,1,0]", 6,
                  R"({"type": "S4", "labels": [1, 2], "connectivity": [[1,2,5,4], [2,5,6,3]]})");
    const PageOf page(turned);
    EXPECT_EQ(page.IntsOf(page.header["meshes"][0]["edges"]).size(), 2U * 6U);
}

TEST(FeatureEdges, OfQuadraticCells_PassTheMidsideNodes) {
    const PageOf page(MeshModel("[0,0,0],[2,0,0],[2,2,0],[0,2,0],[1,0,0],[2,1,0],[1,2,0],[0,1,0]", 8,
                                R"({"type": "S8R", "labels": [1], "connectivity": [[1,2,3,4,5,6,7,8]]})"));
    Ints edges = page.IntsOf(page.header["meshes"][0]["edges"]);
    EXPECT_EQ(edges.size(), 16U);
    EXPECT_EQ(std::ranges::count(edges, 4), 2);
}

TEST(Instances, OfOnePart_ShareTheMesh) {
    const PageOf page(
        R"("parts": {"P": {"mesh": {"nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
            "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}]}}},
        "assembly": {"instances": {"A": {"part": "P"}, "B": {"part": "P", "translation": [0, 5, 0]}}})");
    EXPECT_EQ(page.header["meshes"].size(), 1U);
    EXPECT_EQ(page.header["instances"][1]["placement"],
              (nlohmann::json{1.0, 0.0, 0.0, 0.0, 0.0, 1.0, 0.0, 5.0, 0.0, 0.0, 1.0, 0.0}));
}

TEST(Instances, OfAModelWithout_AreItsParts) {
    const PageOf page(R"("parts": {"P": {"mesh": {"nodes": {"labels": [1], "coordinates": [[0, 0, 0]]}}}})");
    ASSERT_EQ(page.header["instances"].size(), 1U);
    EXPECT_EQ(page.header["instances"][0]["kind"], "part");
}

TEST(Page, OfAModelWithoutMesh_IsEmpty) {
    const PageOf page(R"("description": "nothing")");
    EXPECT_TRUE(page.header["instances"].empty());
    EXPECT_TRUE(page.header["meshes"].empty());
    EXPECT_EQ(page.header["description"], "nothing");
}

TEST(GroupByNodes, OfRandomPairs_FindsWhatAMapFinds) {
    std::mt19937 random(4);
    for (int round = 0; round < 50; ++round) {
        std::vector<std::pair<int, int>> pairs;
        const std::size_t nodes = 1 + random() % 20;
        for (std::size_t i = random() % 200; i > 0; --i) {
            const int a = static_cast<int>(random() % nodes);
            const int b = static_cast<int>(random() % nodes);
            pairs.emplace_back(std::min(a, b), std::max(a, b));
        }
        std::map<std::pair<int, int>, std::set<std::uint32_t>> expected;
        for (std::uint32_t i = 0; i < pairs.size(); ++i) expected[pairs[i]].insert(i);
        std::map<std::pair<int, int>, std::set<std::uint32_t>> found;
        vpg_GroupByNodes(
            pairs.size(), nodes, [&](std::size_t item) { return pairs[item].first; },
            [&](std::size_t item) { return pairs[item].second; },
            [&](std::span<const std::uint32_t> same) {
                EXPECT_TRUE(
                    found.emplace(pairs[same[0]], std::set<std::uint32_t>(same.begin(), same.end())).second);
            });
        EXPECT_EQ(found, expected);
    }
}

TEST(Arrays, TakeTheShortestTypeThatHoldsAll) {
    vpg_Arrays arrays;
    const auto typeOf = [&](const Ints& values) {
        return arrays.Directory()[static_cast<std::size_t>(arrays.Add(values))]["type"].get<std::string>();
    };
    EXPECT_EQ(typeOf({}), "u8");
    EXPECT_EQ(typeOf({0, 255}), "u8");
    EXPECT_EQ(typeOf({256}), "u16");
    EXPECT_EQ(typeOf({65536}), "i32");
    EXPECT_EQ(typeOf({-1, 32767}), "i16");
    EXPECT_EQ(typeOf({-1, 32768}), "i32");
    EXPECT_EQ(typeOf({-40000}), "i32");
}

TEST(Arrays, BeginAtMultiplesOfFourBytes) {
    vpg_Arrays arrays;
    arrays.Add(Ints{1});
    arrays.Add(Floats{1.5F});
    EXPECT_EQ(arrays.Directory()[1]["offset"], 4);
    EXPECT_EQ(arrays.Bytes().size(), 8U);
}

TEST(Base64, OfTheStandardsExamples) {
    const std::pair<const char*, const char*> examples[] = {
        {"", ""},        {"f", "Zg=="},        {"fo", "Zm8="},
        {"foo", "Zm9v"}, {"foob", "Zm9vYg=="}, {"foobar", "Zm9vYmFy"}};
    for (const auto& [bytes, text] : examples) EXPECT_EQ(vpg_Base64(bytes), text);
    EXPECT_EQ(vpg_Base64("\xff\xfe\xfd"), "//79");
}
