#include "foundation/mq_MeshQuality.h"

#include <gtest/gtest.h>

#include <cmath>
#include <map>
#include <random>
#include <set>

namespace {

/// The corners of a unit cube, bottom then top, each going round; then a point above it.
const std::vector<float> kCube = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1,    0,    0, 0,
                                  1, 1, 0, 1, 1, 1, 1, 0, 1, 1, 0.5F, 0.5F, 2};

mq_Quality QualityOf(cel_KindEnm kind, const std::vector<int>& labels, const std::vector<int>& nodes,
                     bool plane = false, const std::vector<float>& coordinates = kCube) {
    std::vector<int> nodeLabels(coordinates.size() / 3);
    for (std::size_t i = 0; i < nodeLabels.size(); ++i) nodeLabels[i] = static_cast<int>(i) + 10;
    const mq_Mesh mesh{nodeLabels, coordinates, {{kind, labels, nodes, cel_CellOf(kind).nodes, plane, true}}};
    return mq_QualityOf(mesh);
}

} // namespace

TEST(MeshQuality, Brick_TheRightWayRound_HasNothingToTellButItsUnusedNode) {
    const mq_Quality quality = QualityOf(cel_KindEnm::HEXAHEDRON8, {1}, {0, 1, 2, 3, 4, 5, 6, 7});
    EXPECT_EQ(quality.inverted.count, 0);
    EXPECT_EQ(quality.unusedNodes.count, 1);
    EXPECT_EQ(quality.unusedNodes.first, (std::vector<int>{18}));
    EXPECT_EQ(quality.repeatedNodes.count, 0);
    EXPECT_EQ(quality.repeatedElements.count, 0);
    EXPECT_EQ(quality.sharedFaces.count, 0);
}

TEST(MeshQuality, Solids_InsideOutOrFlat_AreInverted) {
    const mq_Quality bricks =
        QualityOf(cel_KindEnm::HEXAHEDRON8, {1, 2}, {4, 5, 6, 7, 0, 1, 2, 3, 0, 1, 2, 3, 0, 1, 2, 3});
    EXPECT_EQ(bricks.inverted.first, (std::vector<int>{1, 2}));
    EXPECT_EQ(QualityOf(cel_KindEnm::TETRA4, {7}, {0, 2, 1, 4}).inverted.count, 1);
    EXPECT_EQ(QualityOf(cel_KindEnm::TETRA4, {7}, {0, 1, 2, 4}).inverted.count, 0);
    EXPECT_EQ(QualityOf(cel_KindEnm::TETRA4, {7}, {0, 1, 2, 3}).inverted.count, 1);
    EXPECT_EQ(QualityOf(cel_KindEnm::PYRAMID5, {7}, {0, 1, 2, 3, 8}).inverted.count, 0);
    EXPECT_EQ(QualityOf(cel_KindEnm::WEDGE6, {7}, {0, 1, 2, 4, 5, 6}).inverted.count, 0);
}

TEST(MeshQuality, PlaneCells_ClockwiseRound_AreInvertedAndShellsAreNot) {
    EXPECT_EQ(QualityOf(cel_KindEnm::QUAD4, {1}, {0, 3, 2, 1}, true).inverted.count, 1);
    EXPECT_EQ(QualityOf(cel_KindEnm::QUAD4, {1}, {0, 1, 2, 3}, true).inverted.count, 0);
    EXPECT_EQ(QualityOf(cel_KindEnm::QUAD4, {1}, {0, 3, 2, 1}, false).inverted.count, 0);
    EXPECT_EQ(QualityOf(cel_KindEnm::TRIANGLE3, {1}, {0, 1, 1}, false).inverted.count, 1);
    EXPECT_EQ(QualityOf(cel_KindEnm::LINE2, {1}, {3, 3}).inverted.count, 1);
}

TEST(MeshQuality, MidSideNodes_SwappedOrFarOut_AreToldAndBentOrQuarteredOnesAreNot) {
    std::vector<float> points = {0, 0, 0, 2, 0, 0, 0, 2, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0};
    const auto far = [&](const std::vector<int>& row) {
        return QualityOf(cel_KindEnm::TRIANGLE6, {5}, row, false, points).farMidSides.count;
    };
    EXPECT_EQ(far({0, 1, 2, 3, 4, 5}), 0);
    EXPECT_EQ(far({0, 1, 2, 4, 3, 5}), 1);
    points[9] = 0.5F; // a quarter of the edge
    EXPECT_EQ(far({0, 1, 2, 3, 4, 5}), 0);
    points[9] = 1.0F;
    points[10] = -0.41F; // the arrow of a quarter of a circle
    EXPECT_EQ(far({0, 1, 2, 3, 4, 5}), 0);
    points[10] = -0.7F;
    EXPECT_EQ(far({0, 1, 2, 3, 4, 5}), 1);
}

TEST(MeshQuality, NodesAndElements_ThatStandTwice_AreTold) {
    const std::vector<float> points = {0, 0, 0, 1, 0, 0, 0, 1, 0, 0, 0, 1, -0.0F, 0, 0};
    const mq_Quality quality =
        QualityOf(cel_KindEnm::TETRA4, {3, 4, 5}, {0, 1, 2, 3, 1, 2, 0, 3, 4, 1, 2, 3}, false, points);
    EXPECT_EQ(quality.repeatedNodes.first, (std::vector<int>{14}));
    EXPECT_EQ(quality.repeatedElements.first, (std::vector<int>{4}));
}

TEST(MeshQuality, Face_OfThreeSolids_IsToldOfAllThree) {
    const mq_Quality quality =
        QualityOf(cel_KindEnm::TETRA4, {3, 4, 5}, {0, 1, 2, 4, 0, 1, 2, 5, 0, 1, 2, 6});
    EXPECT_EQ(quality.sharedFaces.count, 3);
    EXPECT_EQ(quality.sharedFaces.first, (std::vector<int>{3, 4, 5}));
}

TEST(MeshQuality, ManyFindings_AreCountedAndTheFirstNamed) {
    std::vector<int> labels;
    std::vector<int> nodes;
    for (int i = 0; i < 20; ++i) {
        labels.push_back(100 + i);
        nodes.insert(nodes.end(), {0, 2, 1, 4});
    }
    const mq_Quality quality = QualityOf(cel_KindEnm::TETRA4, labels, nodes);
    EXPECT_EQ(quality.inverted.count, 20);
    EXPECT_EQ(quality.inverted.first, (std::vector<int>{100, 101, 102, 103, 104}));
    EXPECT_EQ(quality.repeatedElements.count, 19);
}

TEST(MeshQuality, Sizes_AreLengthAreaAndVolume) {
    const int row[] = {0, 1, 2, 3, 4, 5, 6, 7};
    EXPECT_DOUBLE_EQ(mq_SizeOf(cel_KindEnm::LINE2, row, kCube), 1.0);
    EXPECT_DOUBLE_EQ(mq_SizeOf(cel_KindEnm::TRIANGLE3, row, kCube), 0.5);
    EXPECT_DOUBLE_EQ(mq_SizeOf(cel_KindEnm::QUAD4, row, kCube), 1.0);
    EXPECT_DOUBLE_EQ(mq_SizeOf(cel_KindEnm::HEXAHEDRON8, row, kCube), 1.0);
    EXPECT_DOUBLE_EQ(mq_SizeOf(cel_KindEnm::POINT1, row, kCube), 0.0);
}

TEST(MeshQuality, WarpedBrick_HasTheVolumeOfItsTrilinearMap) {
    std::mt19937 random(7);
    std::uniform_real_distribution<float> shift(-0.3F, 0.3F);
    const int row[] = {0, 1, 2, 3, 4, 5, 6, 7};
    for (int turn = 0; turn < 20; ++turn) {
        std::vector<float> points(kCube.begin(), kCube.begin() + 24);
        for (float& x : points) x += 5.0F + shift(random);
        // Two points a direction integrate the determinant exactly: it is quadratic in each.
        double volume = 0.0;
        for (int point = 0; point < 8; ++point) {
            const double at[] = {(point & 1 ? 1 : -1) / std::sqrt(3.0), (point & 2 ? 1 : -1) / std::sqrt(3.0),
                                 (point & 4 ? 1 : -1) / std::sqrt(3.0)};
            double jacobian[3][3] = {};
            for (std::size_t corner = 0; corner < 8; ++corner) {
                double sign[3];
                for (std::size_t i = 0; i < 3; ++i) sign[i] = kCube[3 * corner + i] > 0.5F ? 1.0 : -1.0;
                for (std::size_t i = 0; i < 3; ++i) {
                    const double slope = sign[i] * (1 + sign[(i + 1) % 3] * at[(i + 1) % 3]) *
                                         (1 + sign[(i + 2) % 3] * at[(i + 2) % 3]) / 8;
                    for (std::size_t j = 0; j < 3; ++j)
                        jacobian[i][j] += slope * static_cast<double>(points[3 * corner + j]);
                }
            }
            const auto& m = jacobian;
            volume += m[0][0] * (m[1][1] * m[2][2] - m[1][2] * m[2][1]) -
                      m[0][1] * (m[1][0] * m[2][2] - m[1][2] * m[2][0]) +
                      m[0][2] * (m[1][0] * m[2][1] - m[1][1] * m[2][0]);
        }
        EXPECT_NEAR(mq_SizeOf(cel_KindEnm::HEXAHEDRON8, row, points), volume, 1e-9);
    }
}

TEST(MeshQuality, WhatIsThereTwice_IsFoundAsByComparingAllWithAll) {
    std::mt19937 random(11);
    for (const int numNodes : {6, 40, 4000}) {
        std::uniform_int_distribution<int> anyNode(0, numNodes - 1);
        std::uniform_int_distribution<int> anyPlace(0, numNodes / 2);
        std::vector<float> points;
        std::map<int, int> placed;
        long long repeatedNodes = 0;
        for (int node = 0; node < numNodes; ++node) {
            const int place = anyPlace(random);
            points.insert(points.end(), {static_cast<float>(place), 1.0F, -2.0F});
            if (placed[place]++ > 0) ++repeatedNodes;
        }
        std::vector<int> labels;
        std::vector<int> nodes;
        std::map<std::multiset<int>, int> rows;
        std::map<std::multiset<int>, std::vector<int>> faces;
        std::vector<int> repeatedElements;
        for (int label = 1; label <= 3000; ++label) {
            std::vector<int> row = {anyNode(random), anyNode(random), anyNode(random), anyNode(random)};
            if (label > 2000) row.assign(nodes.end() - 6000, nodes.end() - 5996);
            labels.push_back(label);
            nodes.insert(nodes.end(), row.begin(), row.end());
            if (rows[{row.begin(), row.end()}]++ > 0) repeatedElements.push_back(label);
            for (std::size_t without = 0; without < 4; ++without) {
                std::multiset<int> face(row.begin(), row.end());
                face.erase(face.find(row[without]));
                faces[face].push_back(label);
            }
        }
        std::set<int> sharing;
        for (const auto& [face, users] : faces) {
            if (users.size() > 2) sharing.insert(users.begin(), users.end());
        }
        const auto firstOf = [](const auto& all) {
            std::vector<int> first(all.begin(), all.end());
            first.resize(std::min(first.size(), mq_Count::kShown));
            return first;
        };
        const mq_Quality quality = QualityOf(cel_KindEnm::TETRA4, labels, nodes, false, points);
        EXPECT_EQ(quality.repeatedNodes.count, repeatedNodes);
        EXPECT_EQ(quality.repeatedElements.count, static_cast<long long>(repeatedElements.size()));
        EXPECT_EQ(quality.repeatedElements.first, firstOf(repeatedElements));
        EXPECT_EQ(quality.sharedFaces.count, static_cast<long long>(sharing.size()));
        EXPECT_EQ(quality.sharedFaces.first, firstOf(sharing));
    }
}
