#include "mesh/oif_LabelSource.h"

cow_List<int> oif_ListOf(const oif_LabelSource& source, int expectedCount) {
    cow_List<int> list{cow_ListConstruct(expectedCount)};
    source.ForEachPiece([&list](std::span<const int> labels) {
        for (const int label : labels) list.Append(label);
    });
    return list;
}

void oif_SetLabels::ForEachPiece(const oif_LabelSource::Take& take) const {
    if (source_ != nullptr) {
        source_->ForEachPiece(take);
        return;
    }
    for (int i = 0; i < list_.Length();) {
        int length = 0;
        const int* run = list_.ConstRun(i, length);
        take({run, static_cast<std::size_t>(length)});
        i += length;
    }
}
