#include "store_interface/regions/rgnC_SetData.h"

rgnC_SubsetData rgnC_SetData::SubSet(int index) const {
    if (index < 0 || index >= NumSubSets()) cow_RaiseOutOfRange(index, NumSubSets());
    rgnC_SubsetData subset = set_->subsets[static_cast<std::size_t>(index)];
    if (LiesInOneMesh()) subset.meshIndex = meshIndex_;
    return subset;
}
