#ifndef QRX_OIF_INTERACTIONPROPERTY_H
#define QRX_OIF_INTERACTIONPROPERTY_H

#include "store_interface/records/interactions/kinC_Interaction.h"

#include <span>

class oif_InteractionBuilder;

/// What the writer knows of a class of interaction properties.
struct oif_InteractionPropertyRow {
    unsigned typeId;
    /// Files its keywords; null for a class that no deck tells of.
    void (*add)(oif_InteractionBuilder& builder, const cow_String& name,
                const kinC_InteractionProperty& property);
};

/// A row for each class of properties.
std::span<const oif_InteractionPropertyRow> oif_InteractionPropertyRows();
/// Null for a class that is none.
const oif_InteractionPropertyRow* oif_FindInteractionPropertyRow(unsigned typeId);

#endif
