#ifndef QRX_STORE_BME_PROPERTYARRAY_H
#define QRX_STORE_BME_PROPERTYARRAY_H

#include <algorithm>
#include <cstdint>
#include <memory>
#include <unordered_map>
#include <vector>

/// One element's attributes while sections are formed: indices into the attribute lists, -1 for none.
struct bme_Property {
    int elementLabel = 0;
    int SectionIndex = -1;
    int ElemCtrlIndex = -1;
    int BeamOriIndex = -1;
    int MatOriIndex = -1;

    /// Compares the four indices, not the label.
    friend bool operator==(const bme_Property& a, const bme_Property& b) {
        return a.SectionIndex == b.SectionIndex && a.ElemCtrlIndex == b.ElemCtrlIndex &&
               a.BeamOriIndex == b.BeamOriIndex && a.MatOriIndex == b.MatOriIndex;
    }
};

struct bme_PropertyHash {
    std::size_t operator()(const bme_Property& property) const {
        std::size_t hash = 0;
        for (const int index :
             {property.SectionIndex, property.ElemCtrlIndex, property.BeamOriIndex, property.MatOriIndex}) {
            hash = (hash ^ static_cast<unsigned>(index)) * 0x9E3779B97F4A7C15ULL;
        }
        return hash;
    }
};

/// The attributes of all elements of a mesh, by their places in it. Each different combination is held once.
/// Nothing is held for the elements before something is set; a stretch of elements that agree is one entry,
/// and in a stretch that differs an element has one, two or four bytes, as many as tell the combinations
/// apart.
class bme_PropertyArray {
public:
    explicit bme_PropertyArray(int numElements) : numElements_(numElements) {}

    int NumElements() const { return numElements_; }
    /// Sets one of the indices for `count` elements from `first` on, all of which must be there.
    void Set(int first, int count, int bme_Property::*index, int value);
    /// The combinations that were set, the one without any attribute first.
    const std::vector<bme_Property>& Kinds() const { return kinds_; }
    /// Calls `take(first, count, kind)` for each longest run of elements with equal properties, in order;
    /// `kind` is a place in Kinds().
    template <class Take>
    void ForEachRun(const Take& take) const;

private:
    static constexpr int kBlockSize = 4096;
    struct Block {
        /// Of all elements, as long as there are no bytes.
        std::uint32_t common = 0;
        std::uint8_t width = 0; ///< bytes of an element
        std::unique_ptr<unsigned char[]> bytes;

        std::uint32_t At(int place) const;
        void Put(int place, std::uint32_t kind);
    };
    /// What a kind becomes by the change at hand; right if the number is that of the change.
    struct Changed {
        std::uint32_t change = 0;
        std::uint32_t kind = 0;
    };

    int SizeOf(std::size_t block) const {
        return std::min(kBlockSize, numElements_ - static_cast<int>(block) * kBlockSize);
    }
    std::uint32_t KindAfterChange(std::uint32_t kind);
    void SetIn(Block& block, int begin, int end, int size);
    static void Widen(Block& block, int size, std::uint8_t width);

    int numElements_;
    std::vector<Block> blocks_;
    std::vector<bme_Property> kinds_{bme_Property()};
    std::unordered_map<bme_Property, std::uint32_t, bme_PropertyHash> kindOf_{{bme_Property(), 0}};
    // The change at hand, and what it made of the kinds so far.
    int bme_Property::*index_ = nullptr;
    int value_ = 0;
    std::uint32_t change_ = 0;
    std::vector<Changed> changed_;
};

inline std::uint32_t bme_PropertyArray::Block::At(int place) const {
    const unsigned char* at = bytes.get() + static_cast<std::size_t>(place) * width;
    switch (width) {
    case 0: return common;
    case 1: return at[0];
    case 2: return static_cast<std::uint32_t>(at[0] | at[1] << 8);
    default:
        return at[0] | static_cast<std::uint32_t>(at[1]) << 8 | static_cast<std::uint32_t>(at[2]) << 16 |
               static_cast<std::uint32_t>(at[3]) << 24;
    }
}

template <class Take>
void bme_PropertyArray::ForEachRun(const Take& take) const {
    if (numElements_ == 0) return;
    int first = 0;
    std::uint32_t kind = blocks_.empty() ? 0 : blocks_[0].At(0);
    for (std::size_t b = 0; b < blocks_.size(); ++b) {
        const Block& block = blocks_[b];
        const int begin = static_cast<int>(b) * kBlockSize;
        const int places = block.width == 0 ? 1 : SizeOf(b);
        for (int i = 0; i < places; ++i) {
            const std::uint32_t next = block.At(i);
            if (next == kind) continue;
            take(first, begin + i - first, kind);
            first = begin + i;
            kind = next;
        }
    }
    take(first, numElements_ - first, kind);
}

#endif
