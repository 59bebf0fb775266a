#ifndef QRX_MESH_FILE_MSF_NODEORDER_H
#define QRX_MESH_FILE_MSF_NODEORDER_H

#include "foundation/cel_Cells.h"

#include <cstdint>
#include <span>

enum class msf_FormatEnm { MSH, VTK, UNV, MED };

/// How many nodes a cell has in files of a format, and where each node of the cells' table stands there.
/// Nodes beyond the table's, at the middles of faces, are passed over.
struct msf_NodeOrder {
    msf_FormatEnm format;
    cel_KindEnm kind;
    /// The format's own number of the kind; the number of nodes where the format has names.
    int code;
    int nodes;
    /// node[i] of the cell = node[order[i]] of the file.
    std::array<std::int8_t, cel_kMaxNodes> order;

    std::span<const std::int8_t> Order() const {
        return {order.data(), static_cast<std::size_t>(cel_CellOf(kind).nodes)};
    }
};

/// All rows.
std::span<const msf_NodeOrder> msf_NodeOrders();
/// The row of a format's code, or null. Of several rows the one with that number of nodes, or else the first.
const msf_NodeOrder* msf_FindNodeOrder(msf_FormatEnm format, long long code, long long nodes = 0);

#endif
