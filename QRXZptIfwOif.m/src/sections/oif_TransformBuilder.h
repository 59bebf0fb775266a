#ifndef QRX_OIF_TRANSFORMBUILDER_H
#define QRX_OIF_TRANSFORMBUILDER_H

#include "deck/oif_Component.h"

/// Transforms and orientations of the assembly.
class oif_TransformBuilder final : public oif_ComponentOf<oif_TransformBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
