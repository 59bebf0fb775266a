#ifndef QRX_MESH_FILE_MSF_LABELINDEX_H
#define QRX_MESH_FILE_MSF_LABELINDEX_H

#include <span>
#include <utility>
#include <vector>

/// Finds the place of a positive label; costs nothing for labels that run without a gap.
class msf_LabelIndex {
public:
    /// The place of a label that stands twice, or -1.
    int Build(std::span<const int> labels);
    /// The place of the label, or -1.
    int Find(long long label) const {
        const long long offset = label - first_;
        if (offset < 0 || offset >= span_) return -1;
        if (isRun_) return static_cast<int>(offset);
        return table_.empty() ? FindSorted(label) : table_[static_cast<std::size_t>(offset)];
    }

private:
    int FindSorted(long long label) const;

    bool isRun_ = true;
    long long first_ = 0;
    long long span_ = 0;
    std::vector<int> table_;
    std::vector<std::pair<int, int>> sorted_;
};

#endif
