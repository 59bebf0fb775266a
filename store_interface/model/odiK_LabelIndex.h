#ifndef QRX_STORE_ODIK_LABELINDEX_H
#define QRX_STORE_ODIK_LABELINDEX_H

#include <utility>
#include <vector>

/// Finds the place of a label; costs nothing for labels that run without a gap.
class odiK_LabelIndex {
public:
    /// Places of labels that stand at an earlier place too, in ascending order; such labels keep the first.
    using Repetitions = std::vector<int>;

    /// Indexes labels in the order given. The labels must not be negative.
    Repetitions Build(const std::vector<int>& labels);
    /// The place of the label, or -1.
    int Find(int label) const {
        const auto offset = static_cast<long long>(label) - first_;
        if (offset < 0 || offset >= span_) return -1;
        if (form_ == Form::RUN) return static_cast<int>(offset);
        if (form_ == Form::TABLE) return table_[static_cast<std::size_t>(offset)];
        return FindSorted(label);
    }

    /// Whether the labels run without a gap, the one at place i being `first` + i.
    bool IsRun(int& first) const {
        first = static_cast<int>(first_);
        return form_ == Form::RUN;
    }

private:
    enum class Form { RUN, TABLE, SORTED };

    int FindSorted(int label) const;

    Form form_ = Form::RUN;
    long long first_ = 0;
    long long span_ = 0;
    std::vector<int> table_;
    std::vector<std::pair<int, int>> sorted_;
};

#endif
