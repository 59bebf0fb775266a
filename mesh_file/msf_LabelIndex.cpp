#include "mesh_file/msf_LabelIndex.h"

#include <algorithm>

int msf_LabelIndex::Build(std::span<const int> labels) {
    *this = msf_LabelIndex();
    if (labels.empty()) return -1;
    const auto count = static_cast<long long>(labels.size());
    const auto [least, most] = std::minmax_element(labels.begin(), labels.end());
    first_ = *least;
    span_ = static_cast<long long>(*most) - first_ + 1;
    for (std::size_t i = 0; i < labels.size() && isRun_; ++i)
        isRun_ = labels[i] - first_ == static_cast<long long>(i);
    if (isRun_) return -1;
    // Gaps are cheaper than sorting as long as there are about as many labels as numbers.
    if (span_ <= 4 * count + 1024) {
        table_.assign(static_cast<std::size_t>(span_), -1);
        for (std::size_t i = 0; i < labels.size(); ++i) {
            int& place = table_[static_cast<std::size_t>(labels[i] - first_)];
            if (place >= 0) return static_cast<int>(i);
            place = static_cast<int>(i);
        }
        return -1;
    }
    sorted_.reserve(labels.size());
    for (std::size_t i = 0; i < labels.size(); ++i) sorted_.emplace_back(labels[i], static_cast<int>(i));
    std::sort(sorted_.begin(), sorted_.end());
    const auto twice = std::adjacent_find(sorted_.begin(), sorted_.end(),
                                          [](const auto& a, const auto& b) { return a.first == b.first; });
    return twice == sorted_.end() ? -1 : (twice + 1)->second;
}

int msf_LabelIndex::FindSorted(long long label) const {
    const auto place = std::lower_bound(sorted_.begin(), sorted_.end(), label,
                                        [](const auto& entry, long long l) { return entry.first < l; });
    return place != sorted_.end() && place->first == label ? place->second : -1;
}
