#ifndef QRX_OIF_INTERACTIONBUILDER_H
#define QRX_OIF_INTERACTIONBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "store_interface/records/interactions/kinC_Interaction.h"

#include <map>

/// Interactions and their properties: how each is begun, changed and ended over the steps.
///  - Properties go to the model. Where a standard contact changes its property, a copy of the first one is
///    written under a name of its own, for *Change Friction to address.
///  - Contact, general contact and cavities have a history each: oif_StandardContactHistory.h,
///    oif_ExplicitContactHistory.h, oif_CavityHistory.h.
///  - Films, radiation and waves are said again in each step that changes them: oif_StepInteractions.h.
/// What there is to know of a class stands in its row, oif_InteractionRow.h.
class oif_InteractionBuilder final : public oif_ComponentOf<oif_InteractionBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

    // What the histories of the interactions see of the builder.
    using oif_ComponentOf::AddModelDefinition;
    using oif_ComponentOf::AddStepDefinition;
    using oif_ComponentOf::Making;
    using oif_ComponentOf::Model;
    using oif_ComponentOf::ModelInfo;
    /// The banner of the step, then these.
    template <class... Keywords>
    void AddBlock(const cow_String& step, const Keywords&... keywords) {
        AddStepBanner(step, stepBlockHeader_.StepHeader(step));
        (AddStepDefinition(step, keywords), ...);
    }
    /// The friction of one of the model's properties; all changes to it share the keyword.
    const qkw_KeywordHandle& ChangedFriction(const cow_String& property);
    /// The banner of properties, then the keyword.
    void AddProperty(const qkw_Keyword& keyword);
    /// Calls `visit(name)` for each step but the initial one.
    template <class Visitor>
    void ForEachAnalysisStep(const Visitor& visit) const {
        for (const auto& [name, step] : Model().Steps()) {
            if (name == Model().InitialStepName()) continue;
            const nex_Context context("step", name);
            visit(name);
        }
    }

private:
    void CreateInteractionProperties();
    void CreateInteractionHistory();

    std::map<cow_String, qkw_KeywordHandle> frictions_; // by property
    oif_BlockHeader stepBlockHeader_{"INTERACTIONS"};
    oif_BlockHeader propertyBlockHeader_{"INTERACTION PROPERTIES"};
};

/// The comment ahead of the interaction's keywords in a step.
inline oif_Comment oif_InteractionComment(const cow_String& name) {
    return oif_Comment(cow_String("Interaction: ") + name);
}

#endif
