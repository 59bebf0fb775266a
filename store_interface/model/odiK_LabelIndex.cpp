#include "store_interface/model/odiK_LabelIndex.h"

#include <algorithm>

odiK_LabelIndex::Repetitions odiK_LabelIndex::Build(const std::vector<int>& labels) {
    Repetitions repetitions;
    table_.clear();
    sorted_.clear();
    form_ = Form::RUN;
    span_ = 0;
    if (labels.empty()) return repetitions;

    const auto [lowest, highest] = std::minmax_element(labels.begin(), labels.end());
    first_ = *lowest;
    span_ = static_cast<long long>(*highest) - first_ + 1;
    const auto count = static_cast<long long>(labels.size());
    bool run = span_ == count;
    for (std::size_t i = 0; run && i < labels.size(); ++i)
        run = labels[i] == first_ + static_cast<long long>(i);
    if (run) return repetitions;

    if (span_ <= 4 * count + 1024) {
        form_ = Form::TABLE;
        table_.assign(static_cast<std::size_t>(span_), -1);
        for (std::size_t i = 0; i < labels.size(); ++i) {
            int& place = table_[static_cast<std::size_t>(labels[i] - first_)];
            if (place >= 0) {
                repetitions.push_back(static_cast<int>(i));
            } else {
                place = static_cast<int>(i);
            }
        }
        return repetitions;
    }

    form_ = Form::SORTED;
    sorted_.reserve(labels.size());
    for (std::size_t i = 0; i < labels.size(); ++i) sorted_.emplace_back(labels[i], static_cast<int>(i));
    std::sort(sorted_.begin(), sorted_.end());
    for (std::size_t i = 1; i < sorted_.size(); ++i) {
        if (sorted_[i].first == sorted_[i - 1].first) repetitions.push_back(sorted_[i].second);
    }
    std::sort(repetitions.begin(), repetitions.end());
    return repetitions;
}

int odiK_LabelIndex::FindSorted(int label) const {
    const auto place = std::lower_bound(sorted_.begin(), sorted_.end(), std::pair<int, int>(label, 0));
    return place != sorted_.end() && place->first == label ? place->second : -1;
}
