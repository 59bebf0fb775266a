#ifndef QRX_OIF_MATERIALBUILDER_H
#define QRX_OIF_MATERIALBUILDER_H

#include "base/oif_Component.h"

/// The materials of the model in the order of their names, below one banner.
class oif_MaterialBuilder final : public oif_ComponentOf<oif_MaterialBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
