#ifndef QRX_OIF_CONSTRAINTBUILDER_H
#define QRX_OIF_CONSTRAINTBUILDER_H

#include "deck/oif_Component.h"

/// Constraints of the assembly and the model.
class oif_ConstraintBuilder final : public oif_ComponentOf<oif_ConstraintBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
