#include "mesh_file/msf_NodeOrder.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <string>
#include <vector>

namespace {

using Point = std::array<double, 3>;
using Kind = cel_KindEnm;
using Format = msf_FormatEnm;

Point Middle(const std::vector<Point>& points) {
    Point middle{};
    for (const Point& p : points) {
        for (std::size_t k = 0; k < 3; ++k) middle[k] += p[k] / static_cast<double>(points.size());
    }
    return middle;
}

/// Corners of a distorted cell, in the order in which most formats go round: the base seen from above runs
/// counter-clockwise, then the top.
std::vector<Point> Corners(Kind kind) {
    const Point a{0.1, -0.1, 0.05};
    const Point b{2.2, 0.1, -0.1};
    const Point c{2.5, 1.9, 0.2};
    const Point d{-0.2, 1.4, 0.1};
    const auto up = [](const Point& p) { return Point{p[0] + 0.4, p[1] - 0.2, p[2] + 1.3 + 0.1 * p[0]}; };
    switch (cel_LinearKindOf(kind)) {
    case Kind::POINT1: return {a};
    case Kind::LINE2: return {a, b};
    case Kind::TRIANGLE3: return {a, b, c};
    case Kind::QUAD4: return {a, b, c, d};
    case Kind::TETRA4: return {a, b, c, up(a)};
    case Kind::PYRAMID5: return {a, b, c, d, up(a)};
    case Kind::WEDGE6: return {a, b, c, up(a), up(b), up(c)};
    default: return {a, b, c, d, up(a), up(b), up(c), up(d)};
    }
}

/// The other nodes of a format, each as the corners that it lies between, by the format's own numbers of
/// them.
std::vector<std::string> OthersOf(Format format, int code) {
    const bool msh = format == Format::MSH;
    const bool med = format == Format::MED;
    const bool unv = format == Format::UNV;
    if (unv) return {};
    switch (100 * static_cast<int>(format) + (med ? 0 : code)) {
    case 100 * static_cast<int>(Format::MSH) + 8:
    case 100 * static_cast<int>(Format::VTK) + 21: return {"01"};
    case 100 * static_cast<int>(Format::MSH) + 9:
    case 100 * static_cast<int>(Format::VTK) + 22: return {"01", "12", "20"};
    case 100 * static_cast<int>(Format::VTK) + 34: return {"01", "12", "20", "012"};
    case 100 * static_cast<int>(Format::MSH) + 16:
    case 100 * static_cast<int>(Format::VTK) + 23: return {"01", "12", "23", "30"};
    case 100 * static_cast<int>(Format::MSH) + 10:
    case 100 * static_cast<int>(Format::VTK) + 28: return {"01", "12", "23", "30", "0123"};
    case 100 * static_cast<int>(Format::VTK) + 24: return {"01", "12", "20", "03", "13", "23"};
    case 100 * static_cast<int>(Format::VTK) + 27: return {"01", "12", "23", "30", "04", "14", "24", "34"};
    case 100 * static_cast<int>(Format::VTK) + 26:
        return {"01", "12", "20", "34", "45", "53", "03", "14", "25"};
    case 100 * static_cast<int>(Format::VTK) + 32:
        return {"01", "12", "20", "34", "45", "53", "03", "14", "25", "0143", "1254", "2035"};
    case 100 * static_cast<int>(Format::VTK) + 25:
        return {"01", "12", "23", "30", "45", "56", "67", "74", "04", "15", "26", "37"};
    case 100 * static_cast<int>(Format::VTK) + 29:
        return {"01", "12", "23",   "30",   "45",   "56",   "67",   "74",   "04",      "15",
                "26", "37", "0473", "1562", "0154", "3267", "0321", "4567", "01234567"};
    default: break;
    }
    if (msh) {
        // Its edges run by their lower corner, except for the last two of a tetrahedron.
        switch (code) {
        case 11: return {"01", "12", "20", "03", "23", "13"};
        case 19: return {"01", "03", "04", "12", "14", "23", "24", "34"};
        case 14: return {"01", "03", "04", "12", "14", "23", "24", "34", "0123"};
        case 18: return {"01", "02", "03", "12", "14", "25", "34", "35", "45"};
        case 13: return {"01", "02", "03", "12", "14", "25", "34", "35", "45", "0143", "0253", "1254"};
        case 17: return {"01", "03", "04", "12", "15", "23", "26", "37", "45", "47", "56", "67"};
        case 12:
            return {"01", "03", "04",   "12",   "15",   "23",   "26",   "37",   "45",      "47",
                    "56", "67", "0321", "0154", "0473", "1265", "2376", "4567", "01234567"};
        default: return {};
        }
    }
    switch (code) {
    case 103: return {"01"};
    case 206: return {"01", "12", "20"};
    case 207: return {"01", "12", "20", "012"};
    case 208: return {"01", "12", "23", "30"};
    case 209: return {"01", "12", "23", "30", "0123"};
    case 310: return {"01", "12", "20", "03", "13", "23"};
    case 313: return {"01", "12", "23", "30", "04", "14", "24", "34"};
    case 315: return {"01", "12", "20", "34", "45", "53", "03", "14", "25"};
    case 318: return {"01", "12", "20", "34", "45", "53", "03", "14", "25", "0143", "1254", "2035"};
    case 320: return {"01", "12", "23", "30", "45", "56", "67", "74", "04", "15", "26", "37"};
    case 327:
        return {"01", "12", "23",   "30",   "45",   "56",   "67",   "74",   "04",      "15",
                "26", "37", "0123", "0154", "1265", "2376", "0374", "4567", "01234567"};
    default: return {};
    }
}

/// Universal files go along the edges, corner by middle; then the middles of the upright edges and so on.
std::vector<std::string> UnvNodes(Kind kind) {
    switch (kind) {
    case Kind::LINE3: return {"0", "01", "1"};
    case Kind::TRIANGLE6: return {"0", "01", "1", "12", "2", "20"};
    case Kind::QUAD8: return {"0", "01", "1", "12", "2", "23", "3", "30"};
    case Kind::TETRA10: return {"0", "01", "1", "12", "2", "20", "03", "13", "23", "3"};
    case Kind::WEDGE15:
        return {"0", "01", "1", "12", "2", "20", "03", "14", "25", "3", "34", "4", "45", "5", "53"};
    case Kind::HEXAHEDRON20:
        return {"0",  "01", "1", "12", "2", "23", "3", "30", "04", "15",
                "26", "37", "4", "45", "5", "56", "6", "67", "7",  "74"};
    default: return {};
    }
}

/// Where a file of the format has the nodes of the distorted cell. MED goes round the other way.
std::vector<Point> FileNodes(const msf_NodeOrder& row) {
    std::vector<Point> corners = Corners(row.kind);
    if (row.format == Format::MED && cel_CellOf(row.kind).dimension == 3) {
        const std::vector<Point> right = corners;
        const std::vector<std::size_t> round =
            cel_LinearKindOf(row.kind) == Kind::TETRA4     ? std::vector<std::size_t>{0, 2, 1, 3}
            : cel_LinearKindOf(row.kind) == Kind::PYRAMID5 ? std::vector<std::size_t>{0, 3, 2, 1, 4}
            : cel_LinearKindOf(row.kind) == Kind::WEDGE6   ? std::vector<std::size_t>{0, 2, 1, 3, 5, 4}
                                                           : std::vector<std::size_t>{0, 3, 2, 1, 4, 7, 6, 5};
        for (std::size_t i = 0; i < round.size(); ++i) corners[i] = right[round[i]];
    }
    const auto at = [&](const std::string& digits) {
        std::vector<Point> points;
        for (const char c : digits) points.push_back(corners[static_cast<std::size_t>(c - '0')]);
        return Middle(points);
    };
    std::vector<Point> nodes;
    const bool unv = row.format == Format::UNV && cel_IsQuadratic(cel_CellOf(row.kind));
    if (unv) {
        for (const std::string& node : UnvNodes(row.kind)) nodes.push_back(at(node));
        return nodes;
    }
    nodes = corners;
    // Pixels and voxels run along the axes.
    if (row.format == Format::VTK && (row.code == 8 || row.code == 11)) {
        for (std::size_t i = 2; i < nodes.size(); i += 4) std::swap(nodes[i], nodes[i + 1]);
    }
    for (const std::string& node : OthersOf(row.format, row.code)) nodes.push_back(at(node));
    return nodes;
}

double Distance(const Point& a, const Point& b) {
    return std::hypot(a[0] - b[0], a[1] - b[1], a[2] - b[2]);
}

/// Over the faces, as they look outward: each gives its triangles about its middle.
double Volume(Kind kind, const std::vector<Point>& p) {
    double volume = 0.0;
    for (const cel_Side& side : cel_CellOf(kind).sides) {
        const auto corners = static_cast<std::size_t>(cel_CellOf(side.kind).corners);
        std::vector<Point> face;
        for (std::size_t i = 0; i < corners; ++i) face.push_back(p[static_cast<std::size_t>(side.nodes[i])]);
        const Point m = Middle(face);
        for (std::size_t i = 0; i < corners; ++i) {
            const Point& a = face[i];
            const Point& b = face[(i + 1) % corners];
            volume += (m[0] * (a[1] * b[2] - a[2] * b[1]) + m[1] * (a[2] * b[0] - a[0] * b[2]) +
                       m[2] * (a[0] * b[1] - a[1] * b[0])) /
                      6.0;
        }
    }
    return volume;
}

std::string RowText(const msf_NodeOrder& row) {
    return std::string(cel_CellOf(row.kind).name) + " of format " +
           std::to_string(static_cast<int>(row.format)) + ", code " + std::to_string(row.code);
}

} // namespace

TEST(NodeOrder, MidSideNodes_OfADistortedCellOfEveryFormat_ComeToTheMiddlesOfTheirEdges) {
    for (const msf_NodeOrder& row : msf_NodeOrders()) {
        SCOPED_TRACE(RowText(row));
        const cel_Cell& cell = cel_CellOf(row.kind);
        const std::vector<Point> file = FileNodes(row);
        ASSERT_EQ(file.size(), static_cast<std::size_t>(row.nodes));
        std::vector<Point> nodes;
        for (const std::int8_t place : row.Order()) nodes.push_back(file[static_cast<std::size_t>(place)]);
        const auto corners = static_cast<std::size_t>(cell.corners);
        for (std::size_t i = 0; cel_IsQuadratic(cell) && i < cell.edges.size(); ++i) {
            const Point middle = Middle({nodes[static_cast<std::size_t>(cell.edges[i][0])],
                                         nodes[static_cast<std::size_t>(cell.edges[i][1])]});
            EXPECT_LT(Distance(nodes[corners + i], middle), 1e-12) << "edge " << i;
        }
        EXPECT_TRUE(cell.dimension != 3 || Volume(row.kind, nodes) > 0.5);
    }
}

TEST(NodeOrder, NodesOfFacesAndCentre_OfABrickOf27_AreCentreThenFacesInTheDecksOrder) {
    for (const msf_NodeOrder& row : msf_NodeOrders()) {
        if (row.kind != Kind::HEXAHEDRON27) continue;
        SCOPED_TRACE(RowText(row));
        const std::vector<Point> file = FileNodes(row);
        std::vector<Point> nodes;
        for (const std::int8_t place : row.Order()) nodes.push_back(file[static_cast<std::size_t>(place)]);
        EXPECT_LT(Distance(nodes[20], Middle({nodes.begin(), nodes.begin() + 8})), 1e-12);
        const auto sides = cel_CellOf(row.kind).sides;
        for (std::size_t side = 0; side < 6; ++side) {
            std::vector<Point> face;
            for (std::size_t i = 0; i < 4; ++i)
                face.push_back(nodes[static_cast<std::size_t>(sides[side].nodes[i])]);
            EXPECT_LT(Distance(nodes[21 + side], Middle(face)), 1e-12) << "S" << side + 1;
        }
    }
}

TEST(NodeOrder, CodesAndNumbersOfNodes_OfOneFormat_StandOnce) {
    for (const msf_NodeOrder& row : msf_NodeOrders())
        EXPECT_EQ(msf_FindNodeOrder(row.format, row.code, row.nodes), &row) << RowText(row);
    EXPECT_EQ(msf_FindNodeOrder(Format::MSH, 21), nullptr);
}
