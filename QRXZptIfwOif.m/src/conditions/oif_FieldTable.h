#ifndef QRX_OIF_FIELDTABLE_H
#define QRX_OIF_FIELDTABLE_H

#include "conditions/oif_Card.h"
#include "conditions/oif_ClassRow.h"

/// The families of field keywords, one a class: what ", op=NEW" wipes out together.
enum class oif_FieldFamily : int {
    TEMPERATURE,
    PRESSURE_STRESS,
    MASS_FLOW_RATE,
    FIELD,
    VELOCITY,
    STRESS,
    HARDENING
};

/// What field keywords ask of the model: the most values that a field of the initial step has at a node; 0
/// without one.
struct oif_FieldSetting {
    int maxTemperatureSize = 0;
    int maxGeneralFieldSize = 0;
};

/// What the writer knows of a class of predefined fields.
struct oif_FieldRow {
    using Maker = qkw_KeywordHandle (*)(const oif_FieldCard& card, const oif_FieldSetting& setting);

    unsigned typeId;
    /// What comments of decks call it.
    const char* label;
    oif_FieldFamily family;
    oif_RegionKind region;
    /// Written also in each step that only carries it on.
    bool inEveryStep;
    Maker makeInitial; ///< in the initial step
    Maker make;        ///< in all others

    /// What the region has to be. A field from a file is that of the whole model.
    oif_RegionKind RegionOf(const kpfC_Field& field) const;
};

/// Every class of predefined fields.
std::span<const oif_FieldRow> oif_FieldRows();
/// Null for a class without a row.
inline const oif_FieldRow* oif_FindFieldRow(unsigned typeId) {
    return oif_FindRow(oif_FieldRows(), typeId);
}

#endif
