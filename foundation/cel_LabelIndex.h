#ifndef QRX_FOUNDATION_CEL_LABELINDEX_H
#define QRX_FOUNDATION_CEL_LABELINDEX_H

#include <cstdint>
#include <span>
#include <utility>
#include <vector>

/// Finds the place of the label of a node or of an element; costs nothing for labels that run without a gap.
class cel_LabelIndex {
public:
    /// Places of labels that stand at an earlier place too, in ascending order; such labels keep the first.
    using Repetitions = std::vector<int>;

    /// Indexes labels in the order given. The labels must not be negative.
    Repetitions Build(std::span<const int> labels);
    /// The place of the label, whatever it may be, or -1.
    int Find(long long label) const {
        const std::uint64_t offset = static_cast<std::uint64_t>(label) - first_;
        if (offset >= span_) return -1;
        if (form_ == Form::RUN) return static_cast<int>(offset);
        if (form_ == Form::TABLE) return table_[offset];
        return FindSorted(label);
    }

    /// Whether the labels run without a gap, the one at place i being `first` + i.
    bool IsRun(int& first) const {
        first = static_cast<int>(first_);
        return form_ == Form::RUN;
    }

private:
    enum class Form { RUN, TABLE, SORTED };

    int FindSorted(long long label) const;

    Form form_ = Form::RUN;
    std::uint64_t first_ = 0;
    std::uint64_t span_ = 0;
    std::vector<int> table_;
    std::vector<std::pair<int, int>> sorted_;
};

#endif
