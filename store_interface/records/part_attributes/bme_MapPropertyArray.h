#ifndef QRX_STORE_BME_MAPPROPERTYARRAY_H
#define QRX_STORE_BME_MAPPROPERTYARRAY_H

#include "foundation/cow_List.h"
#include "foundation/cow_Map.h"

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

/// Groups of elements with equal properties, by group number.
class bme_MapPropertyArray : public cow_Map<int, cow_List<bme_Property>> {
public:
    /// The labels of the group's elements, in their order.
    cow_List<int> ElementIds(int key) const;
    int SectionIndex(int key) const { return ConstGet(key)[0].SectionIndex; }
    int ElemCtrlIndex(int key) const { return ConstGet(key)[0].ElemCtrlIndex; }
    int BeamOriIndex(int key) const { return ConstGet(key)[0].BeamOriIndex; }
    int MatOriIndex(int key) const { return ConstGet(key)[0].MatOriIndex; }
};

#endif
