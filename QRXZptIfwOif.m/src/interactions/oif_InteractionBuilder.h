#ifndef QRX_OIF_INTERACTIONBUILDER_H
#define QRX_OIF_INTERACTIONBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_OpStatus.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactControls.h"

/// Interactions and their properties: how each is begun, changed and ended over the steps.
///  - Properties go to the model. Where a standard contact changes its property, a copy of the first one is
///    written under a name of its own, for *Change Friction to address.
///  - Contact of the implicit solver is declared in the initial step, whatever step begins it, and enters and
///    leaves by *Model Change; contact of the explicit solver is declared and deleted step by step.
///  - Films, radiation and waves are said again in each step that changes them, or all of a family where one
///    of it ends.
/// A cavity radiation in a step that builds on its base state raises "Error in cavity radiation history
/// status."; a concentrated film, an impedance or an incident wave raises as soon as there is an analysis
/// step, since their families can't be ended.
class oif_InteractionBuilder final : public oif_ComponentOf<oif_InteractionBuilder> {
public:
    explicit oif_InteractionBuilder(oif_ModelInfo& modelInfo)
        : oif_ComponentOf(modelInfo), stepBlockHeader("INTERACTIONS"),
          propertyBlockHeader("INTERACTION PROPERTIES") {}
    void Build() override;

private:
    using Held = mdl_ObjCow<kinC_Interaction>;
    using Properties = mdl_MapString2ObjCow<kinC_InteractionProperty>;
    /// An interaction that steps say anew, with what makes its keyword.
    struct StepInteraction;

    void CreateInteractionProperties();
    void CreateContactProperty(const cow_String& name, const kinC_InteractionProperty& property);
    void ChangeFrictionInteractionProperties(Properties& properties) const;
    /// The names of the properties that the interaction is given in its steps, in order; a name that comes
    /// back stands again. Empty for what is no contact pair.
    cow_List<cow_String> PropertyChanges(const kinC_Interaction& interaction) const;

    void CreateInteractionHistory();
    void SurfaceToSurfaceContactStdHistory(const cow_String& name, const kinC_Interaction& interaction,
                                           const qkw_Keyword& comment);
    void SelfContactStdHistory(const cow_String& name, const kinC_Interaction& interaction,
                               const qkw_Keyword& comment);
    void SurfaceToSurfaceContactXplHistory(const cow_String& name, const kinC_Interaction& interaction,
                                           const qkw_Keyword& comment);
    void SelfContactXplHistory(const cow_String& name, const kinC_Interaction& interaction,
                               const qkw_Keyword& comment);
    void CavityRadiationHistory(const cow_String& name, const kinC_Interaction& interaction);
    void ContactExpHistory(const cow_String& name, const kinC_Interaction& interaction,
                           const qkw_Keyword& comment);

    /// A copy of the contact, which from the start has the property that *Change Friction can address, if
    /// its property changes.
    Held WithChangeableProperty(const cow_String& name, const kinC_Interaction& interaction) const;
    /// What *Change Friction calls the property of the contact.
    static cow_String ChangeablePropertyName(const cow_String& name) { return "_" + name + "-Property"; }
    void AddStandardPair(const cow_String& name, const Held& contact, const qkw_Keyword& comment);
    void AddModelChange(const cow_String& name, const Held& contact, const cow_String& step, bool remove,
                        const qkw_Keyword& comment);
    void AddChangedFriction(const cow_String& name, const Held& contact, const cow_String& step);
    void AddStandardControls(const cow_String& name, const Held& contact, const cow_String& step, bool isNew);
    void ExplicitHistory(const cow_String& name, const kinC_Interaction& interaction,
                         const qkw_Keyword& comment, bool hasClearance);
    void ExplicitStep(const cow_String& name, const Held& contact, const cow_String& givenStep,
                      const qkw_Keyword& comment);
    void AddExplicitControls(const cow_String& name, const kinC_ContactPairState& state,
                             const cow_String& step, bool isNew);
    template <class Controls>
    const Controls& ConstGetControls(const cow_String& name) const;
    static qkw_KeywordHandle ControlsComment(const cow_String& name);

    void CreateOpInteractions();
    /// Whether it has a keyword in the step; `useInitial` becomes true if that tells the initial step's
    /// state.
    static bool IsSaid(const StepInteraction& interaction, const cow_String& step, bool opNew,
                       bool& useInitial);
    void CreateInteraction(const StepInteraction& interaction, const cow_String& step, bool notNew,
                           bool useInitial);
    void ConfigureOpStatus();

    cow_String GetSurfaceName(const rgnC_Region& region) const;
    cow_String GetSetName(const rgnC_Region& region) const;
    /// The banner of the step, then these.
    template <class... Keywords>
    void AddBlock(const cow_String& step, const Keywords&... keywords) {
        AddStepDefinition(step, stepBlockHeader.StepHeader(step));
        (AddStepDefinition(step, keywords), ...);
    }
    template <class Visitor>
    void ForEachAnalysisStep(const Visitor& visit) const;

    oif_BlockHeader stepBlockHeader;
    oif_BlockHeader propertyBlockHeader;
    oif_InteractionOpStatus opStatus;
    /// The steps with a *Contact that has content.
    cow_List<cow_String> generalContactSteps;
};

#endif
