#ifndef QRX_OIF_LOADBUILDER_H
#define QRX_OIF_LOADBUILDER_H

#include "conditions/oif_ConditionBuilder.h"
#include "conditions/oif_LoadTable.h"

class kinC_CyclicSymmetry;

/// Loads of the steps: in each step those that begin, change or end there, and under op=NEW those that go
/// on; in the step's own section, or in the load cases that take them.
class oif_LoadBuilder final : public oif_ConditionBuilder<oif_LoadBuilder> {
public:
    explicit oif_LoadBuilder(oif_ModelInfo& modelInfo) : oif_ConditionBuilder(modelInfo, "LOADS") {}
    void Build() override;

private:
    void BuildLoadsHistory();
    /// That of the model, null without one.
    const kinC_CyclicSymmetry* FindCyclicInteraction() const;
    void LoadCardDetails(const oif_LoadCard& card, oif_ObjectsOfSteps<kloC_Load>::Entry& entry,
                         const oif_LoadSetting& setting);
    /// Whether no other inertia relief load begins, changes or ends in the step.
    bool CheckForUniqueIRLoad(const cow_String& name, const cow_String& stepName) const;
};

#endif
