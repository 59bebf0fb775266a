#ifndef QRX_FOUNDATION_CEL_CELLS_H
#define QRX_FOUNDATION_CEL_CELLS_H

#include <array>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

/// The kinds of cells that meshes consist of, named by shape and number of nodes.
enum class cel_KindEnm : std::uint8_t {
    POINT1,
    LINE2,
    LINE3,
    TRIANGLE3,
    TRIANGLE6,
    QUAD4,
    QUAD8,
    QUAD9,
    TETRA4,
    TETRA10,
    PYRAMID5,
    PYRAMID13,
    WEDGE6,
    WEDGE15,
    HEXAHEDRON8,
    HEXAHEDRON20,
    HEXAHEDRON27,
};
constexpr int cel_kKinds = 17;
constexpr int cel_kMaxNodes = 27;

/// A side of a cell: of a solid its faces, of a plane cell its edges, of a line its ends, in the order in
/// which decks number them (S1, S2, ...). Nodes are places in the cell's row; the corners go round so that
/// the right-hand rule points out of the solid (in the plane: counter-clockwise), mid-side nodes follow.
struct cel_Side {
    cel_KindEnm kind = cel_KindEnm::POINT1;
    std::array<std::int8_t, 9> nodes{};
};

/// A cell's topology; the nodes stand in the deck's order, corners first. A line3 alone stands otherwise in decks:
/// end, middle, end.
struct cel_Cell {
    cel_KindEnm kind = cel_KindEnm::POINT1;
    /// As mesh people call it: "tetra10", "hexahedron20", "wedge15", "quad8", "triangle6", "line3", "vertex".
    std::string_view name;
    int dimension = 0;
    int nodes = 1;
    int corners = 1;
    std::span<const cel_Side> sides;
    /// All edges as pairs of corners. In quadratic cells the node at place `corners + i` lies on edge i.
    std::span<const std::array<std::int8_t, 2>> edges;
};

const cel_Cell& cel_CellOf(cel_KindEnm kind);
/// The kind of a name, in small letters; none when there is none.
std::optional<cel_KindEnm> cel_KindOfName(std::string_view name);
/// Whether the cell has nodes at the middles of its edges.
constexpr bool cel_IsQuadratic(const cel_Cell& cell) {
    return cell.nodes > cell.corners;
}
/// The cell with the corners alone: tetra4 for tetra10.
cel_KindEnm cel_LinearKindOf(cel_KindEnm kind);

#endif
