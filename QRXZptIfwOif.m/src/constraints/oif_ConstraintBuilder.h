#ifndef QRX_OIF_CONSTRAINTBUILDER_H
#define QRX_OIF_CONSTRAINTBUILDER_H

#include "base/oif_Component.h"

/// Constraints of the assembly, each below a comment instead of a banner for all, and the sector of a cyclic
/// model.
class oif_ConstraintBuilder final : public oif_ComponentOf<oif_ConstraintBuilder> {
public:
    explicit oif_ConstraintBuilder(oif_ModelInfo& modelInfo) : oif_ComponentOf(modelInfo) {}
    /// Raises for a cyclic model in an explicit analysis, and for a constraint of an unknown class.
    void Build() override;
};

#endif
