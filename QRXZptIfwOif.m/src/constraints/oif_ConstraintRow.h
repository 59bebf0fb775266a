#ifndef QRX_OIF_CONSTRAINTROW_H
#define QRX_OIF_CONSTRAINTROW_H

#include "base/oif_ModelInfo.h"
#include "base/oif_RegionRule.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"

#include <span>

// What is raised for constraints that no deck can tell of.
inline constexpr char oif_kCyclicModelError[] = "Cyclic symmetry is not valid for Explicit.";
inline constexpr char oif_kCyclicTieError[] = "Cyclic symmetry - invalid parameter for *Tie for /Explicit.";
inline constexpr char oif_kConstraintError[] = "Unimplemented constraint type.";

/// Whether the model is a sector of a cyclic one.
bool oif_IsCyclicModel(const oif_Model& model);

/// What the writer knows of a class of constraints.
struct oif_ConstraintRow {
    unsigned typeId;
    std::span<const oif_RegionRule<kcoC_Constraint>> regions;
    /// Its keywords, in order.
    qkw_KeywordList (*make)(const oif_ModelInfo& modelInfo, const cow_String& name,
                            const kcoC_Constraint& constraint);
};

/// A row for each class of constraints.
std::span<const oif_ConstraintRow> oif_ConstraintRows();
/// Null for a class that decks don't know.
const oif_ConstraintRow* oif_FindConstraintRow(unsigned typeId);

#endif
