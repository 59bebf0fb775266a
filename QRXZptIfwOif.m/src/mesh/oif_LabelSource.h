#ifndef QRX_OIF_LABELSOURCE_H
#define QRX_OIF_LABELSOURCE_H

#include "foundation/cow_List.h"

#include <array>
#include <cstddef>
#include <functional>
#include <memory>
#include <span>

/// The labels of a large set, walked where they are written, so that they never stand in memory as a list.
class oif_LabelSource {
public:
    using Take = std::function<void(std::span<const int> labels)>;

    virtual ~oif_LabelSource() = default;
    /// Hands the labels on piece by piece, in order.
    virtual void ForEachPiece(const Take& take) const = 0;

protected:
    oif_LabelSource() = default;
    oif_LabelSource(const oif_LabelSource&) = default;
    oif_LabelSource& operator=(const oif_LabelSource&) = default;
};

cow_List<int> oif_ListOf(const oif_LabelSource& source, int expectedCount = 0);

/// The labels of a set: a list of few, a source of many.
class oif_SetLabels {
public:
    /// Of more labels than these there should be no list.
    static constexpr int kLongestList = 4096;

    oif_SetLabels() = default;
    explicit oif_SetLabels(const cow_List<int>& list) : list_(list) {}
    explicit oif_SetLabels(std::shared_ptr<const oif_LabelSource> source) : source_(std::move(source)) {}

    bool IsEmpty() const { return source_ == nullptr && list_.IsEmpty(); }
    /// Of a source, a list that is made for the caller.
    cow_List<int> List() const { return source_ == nullptr ? list_ : oif_ListOf(*source_); }
    void ForEachPiece(const oif_LabelSource::Take& take) const;

private:
    cow_List<int> list_;
    std::shared_ptr<const oif_LabelSource> source_;
};

/// Gathers single labels to pieces.
class oif_LabelPieces {
public:
    explicit oif_LabelPieces(const oif_LabelSource::Take& take) : take_(take) {}

    void Add(int label) {
        if (count_ == piece_.size()) HandOn();
        piece_[count_++] = label;
    }
    void Add(std::span<const int> labels) {
        if (labels.size() < piece_.size() / 4) {
            for (const int label : labels) Add(label);
            return;
        }
        HandOn();
        take_(labels);
    }
    /// To be called behind the last label.
    void HandOn() {
        if (count_ > 0) take_({piece_.data(), count_});
        count_ = 0;
    }

private:
    const oif_LabelSource::Take& take_;
    std::array<int, 1024> piece_;
    std::size_t count_ = 0;
};

#endif
