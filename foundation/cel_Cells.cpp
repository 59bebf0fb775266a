#include "foundation/cel_Cells.h"

namespace {

using Kind = cel_KindEnm;
using Edge = std::array<std::int8_t, 2>;

constexpr Edge kLineEdges[] = {{0, 1}};
constexpr Edge kTriangleEdges[] = {{0, 1}, {1, 2}, {2, 0}};
constexpr Edge kQuadEdges[] = {{0, 1}, {1, 2}, {2, 3}, {3, 0}};
constexpr Edge kTetraEdges[] = {{0, 1}, {1, 2}, {2, 0}, {0, 3}, {1, 3}, {2, 3}};
constexpr Edge kPyramidEdges[] = {{0, 1}, {1, 2}, {2, 3}, {3, 0}, {0, 4}, {1, 4}, {2, 4}, {3, 4}};
constexpr Edge kWedgeEdges[] = {{0, 1}, {1, 2}, {2, 0}, {3, 4}, {4, 5}, {5, 3}, {0, 3}, {1, 4}, {2, 5}};
constexpr Edge kHexahedronEdges[] = {{0, 1}, {1, 2}, {2, 3}, {3, 0}, {4, 5}, {5, 6},
                                     {6, 7}, {7, 4}, {0, 4}, {1, 5}, {2, 6}, {3, 7}};

constexpr cel_Side kLine2Sides[] = {{Kind::POINT1, {0}}, {Kind::POINT1, {1}}};
constexpr cel_Side kTriangle3Sides[] = {{Kind::LINE2, {0, 1}}, {Kind::LINE2, {1, 2}}, {Kind::LINE2, {2, 0}}};
constexpr cel_Side kTriangle6Sides[] = {
    {Kind::LINE3, {0, 1, 3}}, {Kind::LINE3, {1, 2, 4}}, {Kind::LINE3, {2, 0, 5}}};
constexpr cel_Side kQuad4Sides[] = {
    {Kind::LINE2, {0, 1}}, {Kind::LINE2, {1, 2}}, {Kind::LINE2, {2, 3}}, {Kind::LINE2, {3, 0}}};
constexpr cel_Side kQuad8Sides[] = {
    {Kind::LINE3, {0, 1, 4}}, {Kind::LINE3, {1, 2, 5}}, {Kind::LINE3, {2, 3, 6}}, {Kind::LINE3, {3, 0, 7}}};
// The deck's lists of face nodes go round as the solid's interior sees some of them; here all look outward.
constexpr cel_Side kTetra4Sides[] = {{Kind::TRIANGLE3, {0, 2, 1}},
                                     {Kind::TRIANGLE3, {0, 1, 3}},
                                     {Kind::TRIANGLE3, {1, 2, 3}},
                                     {Kind::TRIANGLE3, {2, 0, 3}}};
constexpr cel_Side kTetra10Sides[] = {{Kind::TRIANGLE6, {0, 2, 1, 6, 5, 4}},
                                      {Kind::TRIANGLE6, {0, 1, 3, 4, 8, 7}},
                                      {Kind::TRIANGLE6, {1, 2, 3, 5, 9, 8}},
                                      {Kind::TRIANGLE6, {2, 0, 3, 6, 7, 9}}};
constexpr cel_Side kPyramid5Sides[] = {{Kind::QUAD4, {0, 3, 2, 1}},
                                       {Kind::TRIANGLE3, {0, 1, 4}},
                                       {Kind::TRIANGLE3, {1, 2, 4}},
                                       {Kind::TRIANGLE3, {2, 3, 4}},
                                       {Kind::TRIANGLE3, {3, 0, 4}}};
constexpr cel_Side kPyramid13Sides[] = {{Kind::QUAD8, {0, 3, 2, 1, 8, 7, 6, 5}},
                                        {Kind::TRIANGLE6, {0, 1, 4, 5, 10, 9}},
                                        {Kind::TRIANGLE6, {1, 2, 4, 6, 11, 10}},
                                        {Kind::TRIANGLE6, {2, 3, 4, 7, 12, 11}},
                                        {Kind::TRIANGLE6, {3, 0, 4, 8, 9, 12}}};
constexpr cel_Side kWedge6Sides[] = {{Kind::TRIANGLE3, {0, 2, 1}},
                                     {Kind::TRIANGLE3, {3, 4, 5}},
                                     {Kind::QUAD4, {0, 1, 4, 3}},
                                     {Kind::QUAD4, {1, 2, 5, 4}},
                                     {Kind::QUAD4, {2, 0, 3, 5}}};
constexpr cel_Side kWedge15Sides[] = {{Kind::TRIANGLE6, {0, 2, 1, 8, 7, 6}},
                                      {Kind::TRIANGLE6, {3, 4, 5, 9, 10, 11}},
                                      {Kind::QUAD8, {0, 1, 4, 3, 6, 13, 9, 12}},
                                      {Kind::QUAD8, {1, 2, 5, 4, 7, 14, 10, 13}},
                                      {Kind::QUAD8, {2, 0, 3, 5, 8, 12, 11, 14}}};
constexpr cel_Side kHexahedron8Sides[] = {{Kind::QUAD4, {0, 3, 2, 1}}, {Kind::QUAD4, {4, 5, 6, 7}},
                                          {Kind::QUAD4, {0, 1, 5, 4}}, {Kind::QUAD4, {1, 2, 6, 5}},
                                          {Kind::QUAD4, {2, 3, 7, 6}}, {Kind::QUAD4, {3, 0, 4, 7}}};
constexpr cel_Side kHexahedron20Sides[] = {
    {Kind::QUAD8, {0, 3, 2, 1, 11, 10, 9, 8}},   {Kind::QUAD8, {4, 5, 6, 7, 12, 13, 14, 15}},
    {Kind::QUAD8, {0, 1, 5, 4, 8, 17, 12, 16}},  {Kind::QUAD8, {1, 2, 6, 5, 9, 18, 13, 17}},
    {Kind::QUAD8, {2, 3, 7, 6, 10, 19, 14, 18}}, {Kind::QUAD8, {3, 0, 4, 7, 11, 16, 15, 19}}};

constexpr cel_Cell kCells[cel_kKinds] = {
    {Kind::POINT1, "vertex", 0, 1, 1, {}, {}},
    {Kind::LINE2, "line2", 1, 2, 2, kLine2Sides, kLineEdges},
    {Kind::LINE3, "line3", 1, 3, 2, kLine2Sides, kLineEdges},
    {Kind::TRIANGLE3, "triangle3", 2, 3, 3, kTriangle3Sides, kTriangleEdges},
    {Kind::TRIANGLE6, "triangle6", 2, 6, 3, kTriangle6Sides, kTriangleEdges},
    {Kind::QUAD4, "quad4", 2, 4, 4, kQuad4Sides, kQuadEdges},
    {Kind::QUAD8, "quad8", 2, 8, 4, kQuad8Sides, kQuadEdges},
    {Kind::QUAD9, "quad9", 2, 9, 4, kQuad8Sides, kQuadEdges},
    {Kind::TETRA4, "tetra4", 3, 4, 4, kTetra4Sides, kTetraEdges},
    {Kind::TETRA10, "tetra10", 3, 10, 4, kTetra10Sides, kTetraEdges},
    {Kind::PYRAMID5, "pyramid5", 3, 5, 5, kPyramid5Sides, kPyramidEdges},
    {Kind::PYRAMID13, "pyramid13", 3, 13, 5, kPyramid13Sides, kPyramidEdges},
    {Kind::WEDGE6, "wedge6", 3, 6, 6, kWedge6Sides, kWedgeEdges},
    {Kind::WEDGE15, "wedge15", 3, 15, 6, kWedge15Sides, kWedgeEdges},
    {Kind::HEXAHEDRON8, "hexahedron8", 3, 8, 8, kHexahedron8Sides, kHexahedronEdges},
    {Kind::HEXAHEDRON20, "hexahedron20", 3, 20, 8, kHexahedron20Sides, kHexahedronEdges},
    {Kind::HEXAHEDRON27, "hexahedron27", 3, 27, 8, kHexahedron20Sides, kHexahedronEdges},
};

constexpr bool InOrder() {
    for (int i = 0; i < cel_kKinds; ++i) {
        if (static_cast<int>(kCells[i].kind) != i) return false;
    }
    return true;
}
static_assert(InOrder());

} // namespace

const cel_Cell& cel_CellOf(cel_KindEnm kind) {
    return kCells[static_cast<int>(kind)];
}

std::optional<cel_KindEnm> cel_KindOfName(std::string_view name) {
    for (const cel_Cell& cell : kCells) {
        if (cell.name == name) return cell.kind;
    }
    return std::nullopt;
}

cel_KindEnm cel_LinearKindOf(cel_KindEnm kind) {
    const cel_Cell& cell = cel_CellOf(kind);
    for (const cel_Cell& linear : kCells) {
        if (linear.dimension == cell.dimension && linear.nodes == cell.corners) return linear.kind;
    }
    return kind;
}
