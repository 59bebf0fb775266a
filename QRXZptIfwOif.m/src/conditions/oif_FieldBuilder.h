#ifndef QRX_OIF_FIELDBUILDER_H
#define QRX_OIF_FIELDBUILDER_H

#include "deck/oif_Component.h"

/// Initial conditions and predefined fields of the steps.
class oif_FieldBuilder final : public oif_ComponentOf<oif_FieldBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
