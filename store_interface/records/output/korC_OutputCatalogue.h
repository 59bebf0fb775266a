#ifndef QRX_STORE_KORC_OUTPUTCATALOGUE_H
#define QRX_STORE_KORC_OUTPUTCATALOGUE_H

#include "store_interface/records/output/korC_OdbRequestTable.h"

#include <span>

/// A variable as the catalogue spells it; lists of names are separated by blanks.
struct korC_CatalogueRow {
    enum Flags : unsigned {
        FIELD = 1U,
        HISTORY = 2U,
        COMPONENTS_IN_FIELD = 4U,
        COMPONENTS_SHARE_NAME = 8U, ///< decks know no single component of it, only the whole
    };
    const char* name;
    korC_OdbRequestSpec::PrintEnm print;
    korC_OdbRequestSpec::LocationEnm location;
    unsigned flags;
    unsigned domains;
    const char* components;
    const char* parent;
    unsigned procedures;
    unsigned preselectField;
    unsigned preselectHistory;
    const char* doc;
};

std::span<const korC_CatalogueRow> korC_OutputCatalogue();
/// Procedures that work on the modes of an earlier step.
bool korC_IsModeBased(unsigned stepType);

#endif
