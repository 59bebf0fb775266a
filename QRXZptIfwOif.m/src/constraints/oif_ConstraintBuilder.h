#ifndef QRX_OIF_CONSTRAINTBUILDER_H
#define QRX_OIF_CONSTRAINTBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"

/// Constraints of the assembly, and the sector of a cyclic model.
class oif_ConstraintBuilder final : public oif_ComponentOf<oif_ConstraintBuilder> {
public:
    explicit oif_ConstraintBuilder(oif_ModelInfo& modelInfo) : oif_ComponentOf(modelInfo) {}
    /// Raises for a cyclic model in an explicit analysis, and for a constraint of an unknown class.
    void Build() override;

private:
    /// The set's name as decks refer to it; empty without a value.
    cow_String RegionName(const rgnC_Region& region) const;
    void AddConstraint(const cow_String& name, const kcoC_Constraint& constraint, bool cyclicModel);

    // Decks have no banner of constraints: nobody asks for it, each constraint has a comment instead.
    oif_BlockHeader blockHeader_{"CONSTRAINTS"};
};

#endif
