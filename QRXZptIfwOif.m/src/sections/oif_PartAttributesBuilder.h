#ifndef QRX_OIF_PARTATTRIBUTESBUILDER_H
#define QRX_OIF_PARTATTRIBUTESBUILDER_H

#include "deck/oif_Component.h"

/// Sections and orientations of the instances' elements.
class oif_PartAttributesBuilder final : public oif_ComponentOf<oif_PartAttributesBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
