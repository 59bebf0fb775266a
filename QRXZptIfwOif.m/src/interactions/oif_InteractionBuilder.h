#ifndef QRX_OIF_INTERACTIONBUILDER_H
#define QRX_OIF_INTERACTIONBUILDER_H

#include "deck/oif_Component.h"

/// Interactions and their properties.
class oif_InteractionBuilder final : public oif_ComponentOf<oif_InteractionBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
