#include "mesh_file/msf_NodeOrder.h"

namespace {

using Format = msf_FormatEnm;
using Kind = cel_KindEnm;

// clang-format off
constexpr msf_NodeOrder kOrders[] = {
    {Format::MSH, Kind::POINT1, 15, 1, {0}},
    {Format::MSH, Kind::LINE2, 1, 2, {0, 1}},
    {Format::MSH, Kind::LINE3, 8, 3, {0, 1, 2}},
    {Format::MSH, Kind::TRIANGLE3, 2, 3, {0, 1, 2}},
    {Format::MSH, Kind::TRIANGLE6, 9, 6, {0, 1, 2, 3, 4, 5}},
    {Format::MSH, Kind::QUAD4, 3, 4, {0, 1, 2, 3}},
    {Format::MSH, Kind::QUAD8, 16, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::MSH, Kind::QUAD9, 10, 9, {0, 1, 2, 3, 4, 5, 6, 7, 8}},
    {Format::MSH, Kind::TETRA4, 4, 4, {0, 1, 2, 3}},
    {Format::MSH, Kind::TETRA10, 11, 10, {0, 1, 2, 3, 4, 5, 6, 7, 9, 8}},
    {Format::MSH, Kind::PYRAMID5, 7, 5, {0, 1, 2, 3, 4}},
    {Format::MSH, Kind::PYRAMID13, 19, 13, {0, 1, 2, 3, 4, 5, 8, 10, 6, 7, 9, 11, 12}},
    {Format::MSH, Kind::PYRAMID13, 14, 14, {0, 1, 2, 3, 4, 5, 8, 10, 6, 7, 9, 11, 12}},
    {Format::MSH, Kind::WEDGE6, 6, 6, {0, 1, 2, 3, 4, 5}},
    {Format::MSH, Kind::WEDGE15, 18, 15, {0, 1, 2, 3, 4, 5, 6, 9, 7, 12, 14, 13, 8, 10, 11}},
    {Format::MSH, Kind::WEDGE15, 13, 18, {0, 1, 2, 3, 4, 5, 6, 9, 7, 12, 14, 13, 8, 10, 11}},
    {Format::MSH, Kind::HEXAHEDRON8, 5, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::MSH, Kind::HEXAHEDRON20, 17, 20,
     {0, 1, 2, 3, 4, 5, 6, 7, 8, 11, 13, 9, 16, 18, 19, 17, 10, 12, 14, 15}},
    {Format::MSH, Kind::HEXAHEDRON27, 12, 27,
     {0, 1, 2, 3, 4, 5, 6, 7, 8, 11, 13, 9, 16, 18, 19, 17, 10, 12, 14, 15, 26, 20, 25, 21, 23, 24, 22}},

    {Format::VTK, Kind::POINT1, 1, 1, {0}},
    {Format::VTK, Kind::LINE2, 3, 2, {0, 1}},
    {Format::VTK, Kind::LINE3, 21, 3, {0, 1, 2}},
    {Format::VTK, Kind::TRIANGLE3, 5, 3, {0, 1, 2}},
    {Format::VTK, Kind::TRIANGLE6, 22, 6, {0, 1, 2, 3, 4, 5}},
    {Format::VTK, Kind::TRIANGLE6, 34, 7, {0, 1, 2, 3, 4, 5}},
    {Format::VTK, Kind::QUAD4, 9, 4, {0, 1, 2, 3}},
    {Format::VTK, Kind::QUAD4, 8, 4, {0, 1, 3, 2}}, // a pixel
    {Format::VTK, Kind::QUAD8, 23, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::VTK, Kind::QUAD9, 28, 9, {0, 1, 2, 3, 4, 5, 6, 7, 8}},
    {Format::VTK, Kind::TETRA4, 10, 4, {0, 1, 2, 3}},
    {Format::VTK, Kind::TETRA10, 24, 10, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9}},
    {Format::VTK, Kind::PYRAMID5, 14, 5, {0, 1, 2, 3, 4}},
    {Format::VTK, Kind::PYRAMID13, 27, 13, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12}},
    {Format::VTK, Kind::WEDGE6, 13, 6, {0, 1, 2, 3, 4, 5}},
    {Format::VTK, Kind::WEDGE15, 26, 15, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14}},
    {Format::VTK, Kind::WEDGE15, 32, 18, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14}},
    {Format::VTK, Kind::HEXAHEDRON8, 12, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::VTK, Kind::HEXAHEDRON8, 11, 8, {0, 1, 3, 2, 4, 5, 7, 6}}, // a voxel
    {Format::VTK, Kind::HEXAHEDRON20, 25, 20,
     {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19}},
    {Format::VTK, Kind::HEXAHEDRON27, 29, 27,
     {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19, 26, 24, 25, 22, 21, 23, 20}},

    {Format::UNV, Kind::POINT1, 161, 1, {0}},
    {Format::UNV, Kind::LINE2, 11, 2, {0, 1}},
    {Format::UNV, Kind::LINE2, 21, 2, {0, 1}},
    {Format::UNV, Kind::LINE2, 22, 2, {0, 1}},
    {Format::UNV, Kind::LINE3, 22, 3, {0, 2, 1}},
    {Format::UNV, Kind::LINE3, 24, 3, {0, 2, 1}},
    {Format::UNV, Kind::TRIANGLE3, 41, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE3, 51, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE3, 61, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE3, 74, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE3, 81, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE3, 91, 3, {0, 1, 2}},
    {Format::UNV, Kind::TRIANGLE6, 42, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::TRIANGLE6, 52, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::TRIANGLE6, 62, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::TRIANGLE6, 72, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::TRIANGLE6, 82, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::TRIANGLE6, 92, 6, {0, 2, 4, 1, 3, 5}},
    {Format::UNV, Kind::QUAD4, 44, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD4, 54, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD4, 64, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD4, 71, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD4, 84, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD4, 94, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::QUAD8, 45, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::QUAD8, 55, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::QUAD8, 65, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::QUAD8, 75, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::QUAD8, 85, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::QUAD8, 95, 8, {0, 2, 4, 6, 1, 3, 5, 7}},
    {Format::UNV, Kind::TETRA4, 111, 4, {0, 1, 2, 3}},
    {Format::UNV, Kind::TETRA10, 118, 10, {0, 2, 4, 9, 1, 3, 5, 6, 7, 8}},
    {Format::UNV, Kind::WEDGE6, 112, 6, {0, 1, 2, 3, 4, 5}},
    {Format::UNV, Kind::WEDGE15, 113, 15, {0, 2, 4, 9, 11, 13, 1, 3, 5, 10, 12, 14, 6, 7, 8}},
    {Format::UNV, Kind::HEXAHEDRON8, 115, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::UNV, Kind::HEXAHEDRON20, 116, 20,
     {0, 2, 4, 6, 12, 14, 16, 18, 1, 3, 5, 7, 13, 15, 17, 19, 8, 9, 10, 11}},

    {Format::MED, Kind::POINT1, 1, 1, {0}},
    {Format::MED, Kind::LINE2, 102, 2, {0, 1}},
    {Format::MED, Kind::LINE3, 103, 3, {0, 1, 2}},
    {Format::MED, Kind::TRIANGLE3, 203, 3, {0, 1, 2}},
    {Format::MED, Kind::TRIANGLE6, 206, 6, {0, 1, 2, 3, 4, 5}},
    {Format::MED, Kind::TRIANGLE6, 207, 7, {0, 1, 2, 3, 4, 5}},
    {Format::MED, Kind::QUAD4, 204, 4, {0, 1, 2, 3}},
    {Format::MED, Kind::QUAD8, 208, 8, {0, 1, 2, 3, 4, 5, 6, 7}},
    {Format::MED, Kind::QUAD9, 209, 9, {0, 1, 2, 3, 4, 5, 6, 7, 8}},
    {Format::MED, Kind::TETRA4, 304, 4, {0, 2, 1, 3}},
    {Format::MED, Kind::TETRA10, 310, 10, {0, 2, 1, 3, 6, 5, 4, 7, 9, 8}},
    {Format::MED, Kind::PYRAMID5, 305, 5, {0, 3, 2, 1, 4}},
    {Format::MED, Kind::PYRAMID13, 313, 13, {0, 3, 2, 1, 4, 8, 7, 6, 5, 9, 12, 11, 10}},
    {Format::MED, Kind::WEDGE6, 306, 6, {0, 2, 1, 3, 5, 4}},
    {Format::MED, Kind::WEDGE15, 315, 15, {0, 2, 1, 3, 5, 4, 8, 7, 6, 11, 10, 9, 12, 14, 13}},
    {Format::MED, Kind::WEDGE15, 318, 18, {0, 2, 1, 3, 5, 4, 8, 7, 6, 11, 10, 9, 12, 14, 13}},
    {Format::MED, Kind::HEXAHEDRON8, 308, 8, {0, 3, 2, 1, 4, 7, 6, 5}},
    {Format::MED, Kind::HEXAHEDRON20, 320, 20,
     {0, 3, 2, 1, 4, 7, 6, 5, 11, 10, 9, 8, 15, 14, 13, 12, 16, 19, 18, 17}},
    {Format::MED, Kind::HEXAHEDRON27, 327, 27,
     {0, 3, 2, 1, 4, 7, 6, 5, 11, 10, 9, 8, 15, 14, 13, 12, 16, 19, 18, 17, 26, 20, 25, 24, 23, 22, 21}},
};
// clang-format on

} // namespace

std::span<const msf_NodeOrder> msf_NodeOrders() {
    return kOrders;
}

const msf_NodeOrder* msf_FindNodeOrder(msf_FormatEnm format, long long code, long long nodes) {
    const msf_NodeOrder* first = nullptr;
    for (const msf_NodeOrder& row : kOrders) {
        if (row.format != format || row.code != code) continue;
        if (row.nodes == nodes) return &row;
        if (first == nullptr) first = &row;
    }
    return first;
}
