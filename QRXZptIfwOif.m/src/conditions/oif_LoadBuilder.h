#ifndef QRX_OIF_LOADBUILDER_H
#define QRX_OIF_LOADBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_OpStatus.h"

#include <unordered_map>

class kinC_CyclicSymmetry;

/// Loads of the steps: in each step those that begin, change or end there, and under op=NEW those that go
/// on; in the step's own section, or in the load cases that take them.
class oif_LoadBuilder final : public oif_ComponentOf<oif_LoadBuilder> {
public:
    explicit oif_LoadBuilder(oif_ModelInfo& modelInfo)
        : oif_ComponentOf(modelInfo), blockHeader_(cow_String("LOADS")) {}
    void Build() override;

private:
    void BuildLoadsHistory();
    void ConfigureOpStatus();
    void FindCyclicInteraction();
    void CreateLoadCard(const cow_String& name, const kloC_Load& load, const cow_String& stepName);
    void LoadCardDetails(const cow_String& name, const kloC_Load& load, const cow_String& stepName,
                         const cow_String& loadCaseName, bool cyclicApplies, int cyclicMode,
                         const float& scale);
    /// Whether no other inertia relief load begins, changes or ends in the step.
    bool CheckForUniqueIRLoad(const cow_String& name, const cow_String& stepName) const;

    /// What is the same in all steps; their keywords share it.
    struct Texts {
        cow_String setName;
        cow_String label;
        qkw_KeywordHandle comment;
    };
    const Texts& TextsOf(const cow_String& name, const kloC_Load& load);

    oif_LoadOpStatus opStatus_;
    std::unordered_map<const kloC_Load*, Texts> texts_; // while it builds
    oif_BlockHeader blockHeader_;
    bool cyclicSymmetry_ = false;
    const kinC_CyclicSymmetry* cyclicInteraction_ = nullptr; // of the model
};

#endif
