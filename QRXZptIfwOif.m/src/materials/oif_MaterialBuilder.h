#ifndef QRX_OIF_MATERIALBUILDER_H
#define QRX_OIF_MATERIALBUILDER_H

#include "deck/oif_Component.h"

/// Materials of the model.
class oif_MaterialBuilder final : public oif_ComponentOf<oif_MaterialBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
