#include "store_interface/regions/rgnC_Region.h"

int rgnC_Region::FlagWord() const {
    if (!HasValue() || set_.Data().IsNull()) return 0;
    static constexpr int flags[] = {1, 2, 8};
    return flags[set_.Data().Kind()];
}

cow_List<rgnC_Region> rgnC_NodeSetsAmong(std::initializer_list<rgnC_Region> regions) {
    constexpr int nodeSet = 1;
    cow_List<rgnC_Region> nodeSets;
    for (const rgnC_Region& region : regions) {
        if (region.FlagWord() == nodeSet) nodeSets.Append(region);
    }
    return nodeSets;
}
