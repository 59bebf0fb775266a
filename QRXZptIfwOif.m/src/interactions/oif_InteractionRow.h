#ifndef QRX_OIF_INTERACTIONROW_H
#define QRX_OIF_INTERACTIONROW_H

#include "base/oif_Op.h"
#include "base/oif_RegionRule.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/interactions/kinC_Interaction.h"

#include <span>

class oif_ContactPair;
class oif_InteractionBuilder;

/// The solver that a contact pair is for.
enum class oif_ContactSolver { NONE, IMPLICIT, EXPLICIT };

/// In which steps an interaction that steps say anew has a keyword.
enum class oif_Saying {
    NEVER,
    CHANGES,           ///< in those that begin, change or end it, and where its family begins anew
    CREATION,          ///< in the one that begins it
    UNTIL_IN_FORCE_TOO ///< as CHANGES, and in each that it stands in until a general step has had it
};

/// What the writer knows of a class of interactions. It has either a history, which files its keywords over
/// all steps, or a keyword that steps say anew; or neither, and is never written.
struct oif_InteractionRow {
    using Held = mdl_ObjCow<kinC_Interaction>;

    unsigned typeId;
    oif_ContactSolver solver = oif_ContactSolver::NONE;
    oif_Saying saying = oif_Saying::NEVER;
    std::span<const oif_RegionRule<kinC_Interaction>> regions = {};
    void (*history)(oif_InteractionBuilder& builder, const cow_String& name,
                    const kinC_Interaction& interaction) = nullptr;
    /// Writes *Contact Pair.
    void (*pair)(utl_Stream& stream, const oif_ContactPair& keyword,
                 const kinC_Interaction& interaction) = nullptr;
    qkw_KeywordHandle (*make)(const qkw_ModelInfo& modelInfo, const Held& interaction, const cow_String& step,
                              oif_Op op) = nullptr;
};

/// A row for each class of interactions.
std::span<const oif_InteractionRow> oif_InteractionRows();
/// Null for a class that is none.
const oif_InteractionRow* oif_FindInteractionRow(unsigned typeId);
/// NONE for what is no contact pair.
oif_ContactSolver oif_SolverOf(const kinC_Interaction& interaction);

#endif
