#ifndef QRX_OIF_BCTABLE_H
#define QRX_OIF_BCTABLE_H

#include "conditions/oif_Card.h"
#include "conditions/oif_ClassRow.h"

class oif_ConditionKeyword;

/// The families of boundary conditions: what ", op=NEW" wipes out together.
enum class oif_BCFamily : int { BOUNDARY, CONNECTOR_MOTION };

/// What the writer knows of a class of boundary conditions.
struct oif_BCRow {
    unsigned typeId;
    /// What comments of decks call it.
    const char* label;
    /// Tells the keyword too: oif_Boundary or oif_ConnectorMotion.
    oif_BCFamily family;
    oif_RegionKind region;
    /// Writes cards and data of a condition that goes on; the keyword is of the family's class.
    void (*write)(const oif_ConditionKeyword& keyword, utl_Stream& stream);
};

/// Every class of boundary conditions.
std::span<const oif_BCRow> oif_BCRows();
/// Null for a class without a row.
inline const oif_BCRow* oif_FindBCRow(unsigned typeId) {
    return oif_FindRow(oif_BCRows(), typeId);
}

#endif
