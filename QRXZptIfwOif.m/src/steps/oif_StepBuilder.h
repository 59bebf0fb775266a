#ifndef QRX_OIF_STEPBUILDER_H
#define QRX_OIF_STEPBUILDER_H

#include "deck/oif_Component.h"

/// The blocks of the steps and their procedures.
class oif_StepBuilder final : public oif_ComponentOf<oif_StepBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
