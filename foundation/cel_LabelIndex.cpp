#include "foundation/cel_LabelIndex.h"

#include <algorithm>

cel_LabelIndex::Repetitions cel_LabelIndex::Build(std::span<const int> labels) {
    Repetitions repetitions;
    table_.clear();
    sorted_.clear();
    form_ = Form::RUN;
    span_ = 0;
    if (labels.empty()) return repetitions;

    const auto run = [first = labels.front()](std::size_t i) { return first + static_cast<long long>(i); };
    std::size_t inRun = 0;
    while (inRun < labels.size() && labels[inRun] == run(inRun)) ++inRun;
    if (inRun == labels.size()) {
        first_ = static_cast<std::uint64_t>(labels.front());
        span_ = labels.size();
        return repetitions;
    }

    const auto [least, most] = std::minmax_element(labels.begin(), labels.end());
    const int lowest = *least;
    first_ = static_cast<std::uint64_t>(lowest);
    span_ = static_cast<std::uint64_t>(*most) - first_ + 1;
    // Gaps are cheaper than sorting as long as there are about as many labels as numbers.
    if (span_ <= 4 * labels.size() + 1024) {
        form_ = Form::TABLE;
        table_.assign(span_, -1);
        for (std::size_t i = 0; i < labels.size(); ++i) {
            int& place = table_[static_cast<std::size_t>(labels[i] - lowest)];
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

int cel_LabelIndex::FindSorted(long long label) const {
    const auto place =
        std::lower_bound(sorted_.begin(), sorted_.end(), std::pair<int, int>(static_cast<int>(label), 0));
    return place != sorted_.end() && place->first == label ? place->second : -1;
}
