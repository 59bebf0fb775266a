#ifndef QRX_OIF_LOADTABLE_H
#define QRX_OIF_LOADTABLE_H

#include "conditions/oif_Card.h"
#include "conditions/oif_ClassRow.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <optional>

/// The families of load keywords: what ", op=NEW" wipes out together.
enum class oif_LoadFamily : int {
    CLOAD,
    DLOAD,
    DSLOAD,
    CFLUX,
    DFLUX,
    DSFLUX,
    DSFLOW,
    FLUID_FLUX,
    UNWRITTEN,
    CECHARGE,
    DECHARGE,
    DSECHARGE,
    CECURRENT,
    DECURRENT,
    DSECURRENT,
    CONNECTOR_LOAD,
    INERTIA_RELIEF
};

/// What a deck has of a load besides its keyword: a comment ahead of it. Some have nothing but the comment:
/// always, or when a named field gives their values.
enum class oif_LoadComment { AHEAD, ALONE, ALONE_OF_A_FIELD };

/// What load keywords ask of the model and the run.
struct oif_LoadSetting {
    const qkw_ModelInfo& modelInfo;
    /// In a harmonic step on modes of a model with cyclic symmetry.
    std::optional<int> cyclicMode = {};
    /// 1 in three dimensions, 4 for an axisymmetric model.
    int space = 1;
};

/// What the writer knows of a class of loads.
struct oif_LoadRow {
    unsigned typeId;
    /// What comments of decks call it.
    const char* label;
    oif_LoadFamily family;
    oif_RegionKind region;
    oif_LoadComment comment;
    /// Null for a load that is a comment always, and for one that no deck can carry.
    qkw_KeywordHandle (*make)(const oif_LoadCard& card, const oif_LoadSetting& setting);

    /// Whether a deck has only a comment of the load.
    bool IsCommentAlone(const kloC_Load& load) const;
    /// Whether writing a load of the class raises oif_LoadWithoutKeyword.
    bool CannotBeWritten() const { return make == nullptr && comment == oif_LoadComment::AHEAD; }
};

inline constexpr const char* oif_LoadWithoutKeyword = "Unimplemented load type conversion";

/// Every class that decks have a family for. A stress-based submodel load has none.
std::span<const oif_LoadRow> oif_LoadRows();
/// Null for a class without a row.
inline const oif_LoadRow* oif_FindLoadRow(unsigned typeId) {
    return oif_FindRow(oif_LoadRows(), typeId);
}

#endif
