#ifndef QRX_OIF_LOADBUILDER_H
#define QRX_OIF_LOADBUILDER_H

#include "deck/oif_Component.h"

/// Loads of the steps.
class oif_LoadBuilder final : public oif_ComponentOf<oif_LoadBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
