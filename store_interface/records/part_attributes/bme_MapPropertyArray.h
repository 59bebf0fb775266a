#ifndef QRX_STORE_BME_MAPPROPERTYARRAY_H
#define QRX_STORE_BME_MAPPROPERTYARRAY_H

#include "foundation/cow_List.h"
#include "store_interface/records/part_attributes/bme_PropertyArray.h"

/// Groups of elements with equal properties, by group number: they are numbered from 0 in the order of their
/// first elements. The elements of a group are held only where they are asked for, as runs of neighbours;
/// one that has no neighbour in its group takes a byte or two.
class bme_MapPropertyArray {
public:
    explicit bme_MapPropertyArray(const bme_PropertyArray& properties);

    int Count() const { return groups_.Length(); }
    int NumElements(int key) const { return groups_[key].numElements; }
    int SectionIndex(int key) const { return groups_[key].property.SectionIndex; }
    int ElemCtrlIndex(int key) const { return groups_[key].property.ElemCtrlIndex; }
    int BeamOriIndex(int key) const { return groups_[key].property.BeamOriIndex; }
    int MatOriIndex(int key) const { return groups_[key].property.MatOriIndex; }

    /// Keeps the elements of the groups that are `wanted`, of the array that the groups were made of.
    void KeepElements(const bme_PropertyArray& properties, const std::vector<bool>& wanted);
    /// Calls `take(first, count)` for each run of elements of a group whose elements are kept, by their
    /// places in the mesh, in order.
    template <class Take>
    void ForEachRun(int key, const Take& take) const;

private:
    /// Each run is its distance from the end of the one before, doubled, and one more if its length follows;
    /// else it is of one element. Seven bits a byte, all bytes but the last of a number marked by the eighth.
    using Code = std::vector<unsigned char>;
    struct Group {
        bme_Property property;
        int numElements = 0;
        int end = 0; // of the last run seen
        std::size_t codeLength = 0;
        Code code;
    };

    static std::uint64_t Head(const Group& group, int first, int count) {
        return static_cast<std::uint64_t>(first - group.end) * 2 + (count > 1 ? 1 : 0);
    }

    cow_List<Group> groups_;
    std::vector<int> keyOfKind_;
};

template <class Take>
void bme_MapPropertyArray::ForEachRun(int key, const Take& take) const {
    const Code& code = groups_[key].code;
    const unsigned char* at = code.data();
    const unsigned char* const end = at + code.size();
    const auto next = [&at] {
        std::uint64_t number = 0;
        for (int shift = 0;; shift += 7) {
            const unsigned char byte = *at++;
            number |= static_cast<std::uint64_t>(byte & 0x7f) << shift;
            if (byte < 0x80) return number;
        }
    };
    int first = 0;
    while (at != end) {
        const std::uint64_t head = next();
        const int count = (head & 1) != 0 ? static_cast<int>(next()) : 1;
        first += static_cast<int>(head / 2);
        take(first, count);
        first += count;
    }
}

#endif
