#include "foundation/mq_MeshQuality.h"

#include <gtest/gtest.h>

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
