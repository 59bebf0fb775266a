#include "foundation/cel_Cells.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

namespace {

using Kind = cel_KindEnm;

std::vector<cel_KindEnm> AllKinds() {
    std::vector<cel_KindEnm> kinds;
    for (int i = 0; i < cel_kKinds; ++i) kinds.push_back(static_cast<cel_KindEnm>(i));
    return kinds;
}

/// A point of a reference cell.
struct Point {
    double x = 0;
    double y = 0;
    double z = 0;
};
Point operator-(const Point& a, const Point& b) {
    return {a.x - b.x, a.y - b.y, a.z - b.z};
}
Point Cross(const Point& a, const Point& b) {
    return {a.y * b.z - a.z * b.y, a.z * b.x - a.x * b.z, a.x * b.y - a.y * b.x};
}
double Dot(const Point& a, const Point& b) {
    return a.x * b.x + a.y * b.y + a.z * b.z;
}

/// The corners of a straight cell: bottom counter-clockwise seen from above, then the top above it.
std::vector<Point> CornersOf(Kind linear) {
    switch (linear) {
    case Kind::TETRA4: return {{0, 0, 0}, {1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
    case Kind::PYRAMID5: return {{0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 1, 0}, {0.5, 0.5, 1}};
    case Kind::WEDGE6: return {{0, 0, 0}, {1, 0, 0}, {0, 1, 0}, {0, 0, 1}, {1, 0, 1}, {0, 1, 1}};
    case Kind::HEXAHEDRON8:
        return {{0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 1, 0}, {0, 0, 1}, {1, 0, 1}, {1, 1, 1}, {0, 1, 1}};
    default: return {};
    }
}

std::set<int> CornersOf(const cel_Side& side) {
    const int corners = cel_CellOf(side.kind).corners;
    return {side.nodes.begin(), side.nodes.begin() + corners};
}

TEST(Cells, SidesHaveTheDecksNumbers) {
    // The corners of S1, S2, ... as the deck language lists them, counted from 1.
    const std::vector<std::pair<Kind, std::vector<std::set<int>>>> rows = {
        {Kind::TETRA4, {{1, 2, 3}, {1, 4, 2}, {2, 4, 3}, {3, 4, 1}}},
        {Kind::PYRAMID5, {{1, 2, 3, 4}, {1, 5, 2}, {2, 5, 3}, {3, 5, 4}, {4, 5, 1}}},
        {Kind::WEDGE6, {{1, 2, 3}, {4, 6, 5}, {1, 4, 5, 2}, {2, 5, 6, 3}, {3, 6, 4, 1}}},
        {Kind::HEXAHEDRON8,
         {{1, 2, 3, 4}, {5, 8, 7, 6}, {1, 5, 6, 2}, {2, 6, 7, 3}, {3, 7, 8, 4}, {4, 8, 5, 1}}},
        {Kind::TRIANGLE3, {{1, 2}, {2, 3}, {3, 1}}},
        {Kind::QUAD4, {{1, 2}, {2, 3}, {3, 4}, {4, 1}}},
        {Kind::LINE2, {{1}, {2}}},
    };
    for (const Kind kind : AllKinds()) {
        const cel_Cell& cell = cel_CellOf(kind);
        const auto row = std::find_if(rows.begin(), rows.end(),
                                      [&](const auto& each) { return each.first == cel_LinearKindOf(kind); });
        if (row == rows.end()) {
            EXPECT_EQ(kind, Kind::POINT1);
            continue;
        }
        ASSERT_EQ(cell.sides.size(), row->second.size()) << cell.name;
        for (std::size_t i = 0; i < cell.sides.size(); ++i) {
            std::set<int> fromOne;
            for (const int corner : CornersOf(cell.sides[i])) fromOne.insert(corner + 1);
            EXPECT_EQ(fromOne, row->second[i]) << cell.name << " S" << i + 1;
        }
    }
}

TEST(Cells, SidesOfSolidsLookOutward) {
    for (const Kind kind : AllKinds()) {
        const cel_Cell& cell = cel_CellOf(kind);
        if (cell.dimension != 3) continue;
        const std::vector<Point> corners = CornersOf(cel_LinearKindOf(kind));
        ASSERT_EQ(static_cast<int>(corners.size()), cell.corners) << cell.name;
        Point center;
        for (const Point& corner : corners) {
            center = {center.x + corner.x / cell.corners, center.y + corner.y / cell.corners,
                      center.z + corner.z / cell.corners};
        }
        for (const cel_Side& side : cell.sides) {
            const auto at = [&](int i) {
                return corners[static_cast<std::size_t>(side.nodes[static_cast<std::size_t>(i)])];
            };
            const Point normal = Cross(at(1) - at(0), at(2) - at(0));
            EXPECT_GT(Dot(normal, at(0) - center), 0) << cell.name;
            const int last = cel_CellOf(side.kind).corners - 1;
            EXPECT_GT(Dot(Cross(at(last) - at(0), at(1) - at(0)), center - at(0)), 0) << cell.name;
        }
    }
}

TEST(Cells, MidSideNodesOfSidesLieOnTheSidesEdges) {
    for (const Kind kind : AllKinds()) {
        const cel_Cell& cell = cel_CellOf(kind);
        for (const cel_Side& side : cell.sides) {
            const cel_Cell& shape = cel_CellOf(side.kind);
            EXPECT_EQ(shape.dimension, cell.dimension - 1) << cell.name;
            if (!cel_IsQuadratic(shape)) continue;
            for (std::size_t i = 0; i < shape.edges.size(); ++i) {
                const std::size_t node = static_cast<std::size_t>(shape.corners) + i;
                const auto edge = static_cast<std::size_t>(side.nodes[node] - cell.corners);
                ASSERT_LT(edge, cell.edges.size()) << cell.name;
                const std::set<int> expected = {side.nodes[static_cast<std::size_t>(shape.edges[i][0])],
                                                side.nodes[static_cast<std::size_t>(shape.edges[i][1])]};
                EXPECT_EQ((std::set<int>{cell.edges[edge][0], cell.edges[edge][1]}), expected) << cell.name;
            }
        }
    }
}

TEST(Cells, EveryEdgeOfASolidBelongsToTwoSides) {
    for (const Kind kind : AllKinds()) {
        const cel_Cell& cell = cel_CellOf(kind);
        if (cell.dimension != 3) continue;
        for (const auto& edge : cell.edges) {
            const auto sides = std::count_if(cell.sides.begin(), cell.sides.end(), [&](const cel_Side& side) {
                const std::set<int> corners = CornersOf(side);
                return corners.count(edge[0]) != 0 && corners.count(edge[1]) != 0;
            });
            EXPECT_EQ(sides, 2) << cell.name;
        }
    }
}

TEST(Cells, NamesAndLinearKinds) {
    std::set<std::string_view> names;
    for (const Kind kind : AllKinds()) {
        const cel_Cell& cell = cel_CellOf(kind);
        EXPECT_EQ(cell.kind, kind);
        EXPECT_TRUE(names.insert(cell.name).second) << cell.name;
        EXPECT_EQ(cel_KindOfName(cell.name), kind);
        EXPECT_EQ(cel_CellOf(cel_LinearKindOf(kind)).nodes, cell.corners) << cell.name;
        EXPECT_LE(cell.nodes, cel_kMaxNodes);
        if (cel_IsQuadratic(cell) && cell.dimension > 0) {
            EXPECT_GE(cell.nodes, cell.corners + static_cast<int>(cell.edges.size())) << cell.name;
        }
    }
    EXPECT_EQ(cel_KindOfName("tetra11"), std::nullopt);
    EXPECT_EQ(cel_LinearKindOf(Kind::HEXAHEDRON27), Kind::HEXAHEDRON8);
}

} // namespace
