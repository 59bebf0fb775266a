#ifndef QRX_STORE_UTI_TRANSLATIONMAP_H
#define QRX_STORE_UTI_TRANSLATIONMAP_H

#include "foundation/cow_String.h"

#include <span>

/// What people call the classes of a family; comments of decks name objects by it.
class uti_TranslationMap {
public:
    struct Row {
        unsigned typeId;
        const char* label;
    };

    /// The text of the class; empty for a class that the map doesn't hold. All forms of a text are alike.
    cow_String LabelString(unsigned typeId, int form) const;

protected:
    explicit uti_TranslationMap(std::span<const Row> rows) : rows_(rows) {}

private:
    std::span<const Row> rows_;
};

// Reached through omi_Singleton.
class kbcC_BCTypeLabelMap final : public uti_TranslationMap {
public:
    kbcC_BCTypeLabelMap();
};

class kloC_LoadTypeLabelMap final : public uti_TranslationMap {
public:
    kloC_LoadTypeLabelMap();
};

class kpfC_FieldTypeLabelMap final : public uti_TranslationMap {
public:
    kpfC_FieldTypeLabelMap();
};

#endif
