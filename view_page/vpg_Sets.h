#ifndef QRX_VPG_SETS_H
#define QRX_VPG_SETS_H

#include "view_page/vpg_Mesh.h"

#include <limits>
#include <span>

/// A box around nodes; empty while `low` is above `high`.
struct vpg_Box {
    std::array<float, 3> low;
    std::array<float, 3> high;

    vpg_Box() {
        low.fill(std::numeric_limits<float>::max());
        high.fill(std::numeric_limits<float>::lowest());
    }
    bool IsEmpty() const { return low[0] > high[0]; }
    void Add(const std::array<float, 3>& place);
};

/// What of a set lies in one mesh, as the page shows it. Cells and nodes ascend.
struct vpg_SetPart {
    /// Of element sets the cells of the elements; of surfaces the cells that are facets, of shells by side.
    std::vector<int> cells;
    std::vector<int> negative;
    /// Of node sets, as the mesh counts them.
    std::vector<int> nodes;
    /// All members, whether a cell shows them or not.
    int count = 0;
    vpg_Box box;
};

/// Makes facets on no skin cells of the mesh.
vpg_SetPart vpg_PartOfSet(vpg_Mesh& mesh, res_SetTypeEnm type, std::span<const rgnC_SubsetData> subsets);

/// Calls `visit(element)`, counted through all classes of the mesh, for each element of the subsets.
template <class Visit>
void vpg_ForEachElement(const odiK_Mesh& mesh, std::span<const rgnC_SubsetData> subsets, const Visit& visit) {
    for (const rgnC_SubsetData& subset : subsets) {
        if (subset.classIndex < 0) continue;
        const int first = mesh.Classes()[static_cast<std::size_t>(subset.classIndex)].firstElementIndex;
        for (int i = 0; i < subset.subset.Length(); ++i) visit(first + subset.subset.UncheckedConstGet(i));
    }
}

#endif
