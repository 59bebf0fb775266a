#ifndef QRX_OIF_BOUNDARYCONDITIONBUILDER_H
#define QRX_OIF_BOUNDARYCONDITIONBUILDER_H

#include "deck/oif_Component.h"

/// Boundary conditions of the steps.
class oif_BoundaryConditionBuilder final : public oif_ComponentOf<oif_BoundaryConditionBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
