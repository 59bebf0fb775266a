#include "interactions/oif_StandardContactHistory.h"

#include "interactions/oif_ContactControls.h"
#include "interactions/oif_ContactPair.h"
#include "interactions/oif_ContactProperty.h"
#include "interactions/oif_InteractionBuilder.h"
#include "interactions/oif_PropertyChanges.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

using Status = mdl_PropagationStatusEnm;
using AttributeState = mdl_PropAttributeStateEnm;

namespace {

/// One contact on its way through the steps.
template <class Contact>
class ContactSteps {
public:
    ContactSteps(oif_InteractionBuilder& builder, const cow_String& name, const Contact& contact)
        : builder_(builder), name_(name), held_(WithChangeableProperty(contact)),
          comment_(oif_InteractionComment(name)) {}

    const Contact& Record() const { return static_cast<const Contact&>(held_.ConstGet()); }
    bool IsFirstGeneral(const cow_String& step) const {
        return step == builder_.Model().FirstGeneralAnalysisStepName();
    }
    bool ChangesProperty(const cow_String& step) const {
        return Record().ConstGetState(step).InteractionProperty.IsModified();
    }

    // Whatever step begins the contact, the pair itself stands in the initial step.
    void AddPair() {
        builder_.AddBlock(
            builder_.Model().InitialStepName(), comment_,
            oif_ContactPair(name_, held_, Record().CreateStepName(), builder_.ModelInfo(), false));
    }
    void AddClearance() {
        if (Record().ClearanceType() == kinC_ClearanceTypeEnm::NONE) return;
        builder_.AddModelDefinition(
            oif_Clearance(Record(), oif_RegionName(Record().clearanceRegion, builder_.ModelInfo()),
                          MasterName(), SlaveName()));
    }
    void AddModelChange(const cow_String& step, bool remove) {
        builder_.AddBlock(step, comment_, oif_ModelChange(name_, held_, step, builder_.ModelInfo(), remove));
    }
    /// How the pair enters and leaves, alike for both classes.
    void AddEntranceOrExit(const cow_String& step) {
        switch (Record().GetPropStatus(step)) {
        case Status::NOT_YET_ACTIVE:
            if (IsFirstGeneral(step)) AddModelChange(step, true);
            break;
        case Status::CREATED:
            if (!IsFirstGeneral(step)) AddModelChange(step, false);
            break;
        case Status::DEACTIVATED: AddModelChange(step, true); break;
        default: break;
        }
    }
    void AddChangedFriction(const cow_String& step) {
        const qkw_KeywordHandle& friction =
            builder_.ChangedFriction(Record().ConstGetState(step).InteractionProperty.ConstGet());
        if (changeFriction_.IsNull()) {
            changeFriction_ = oif_ChangeFriction(oif_ChangeablePropertyName(name_));
        }
        builder_.AddStepDefinition(step, changeFriction_);
        builder_.AddStepDefinition(step, friction);
    }
    void AddInterference(const cow_String& step);
    void AddControls(const cow_String& step);

private:
    using Held = mdl_ObjCow<kinC_Interaction>;

    /// A copy of the contact, which from the start has the property that *Change Friction can address, if
    /// its property changes.
    Held WithChangeableProperty(const Contact& contact) const {
        Held held(static_cast<const kinC_Interaction&>(contact));
        // In an explicit job too, where no property of that name is written.
        if (!oif_ChangesProperty(contact, builder_.Model().Steps())) return held;
        const cow_String createStep = contact.CreateStepName();
        mdl_ObjCow<kinC_ContactPairState> state(contact.ConstGetState(createStep));
        state.Get().InteractionProperty.WritableValue() = oif_ChangeablePropertyName(name_);
        held.Get().Insert(createStep, state.ConstGet());
        return held;
    }
    cow_String MasterName() const { return oif_SurfaceName(Record().MasterSurface(), builder_.ModelInfo()); }
    cow_String SlaveName() const { return oif_SurfaceName(Record().SlaveSurface(), builder_.ModelInfo()); }

    oif_InteractionBuilder& builder_;
    const cow_String& name_;
    Held held_;
    // Shared by its steps.
    qkw_KeywordHandle comment_;
    qkw_KeywordHandle changeFriction_ = {};
};

template <class Contact>
void ContactSteps<Contact>::AddInterference(const cow_String& step) {
    const Status status = Record().GetPropStatus(step);
    if (status != Status::CREATED && status != Status::MODIFIED) return;
    const bool changesFriction = status == Status::MODIFIED && ChangesProperty(step);
    if (changesFriction) {
        builder_.AddBlock(step, comment_);
        AddChangedFriction(step);
    }
    if (oif_ContactInterference::HasNone(held_, step)) return;
    const oif_ContactInterference interference(held_, step, builder_.ModelInfo());
    // Where the pair is begun in the first general step, and only there, the comment stands ahead of the
    // banner.
    if (status == Status::CREATED) {
        if (IsFirstGeneral(step)) builder_.AddStepDefinition(step, comment_);
        builder_.AddBlock(step, interference);
    } else if (changesFriction) {
        builder_.AddBlock(step, interference);
    } else {
        builder_.AddBlock(step, comment_, interference);
    }
}

template <class Contact>
void ContactSteps<Contact>::AddControls(const cow_String& step) {
    const bool isNew = Record().GetPropStatus(step) == Status::CREATED;
    if (!Record().HasStep(step)) return;
    const auto& attribute = Record().ConstGetState(step).ContactControls;
    const cow_String& controlsName = attribute.ConstGet();
    const auto add = [&](const kinC_StdContactControls& controls, bool reset) {
        builder_.AddBlock(step, oif_ContactControlsComment(name_),
                          oif_ContactControls(controls, MasterName(), SlaveName(), isNew, reset));
    };
    if (controlsName.IsEmpty()) {
        if (attribute.State() == AttributeState::CLEARED && !isNew) add(kinC_StdContactControls(), true);
        return;
    }
    // Controls from the initial step are carried into the first general step. Behind it, controls that are
    // cleared but still have their name are written.
    const AttributeState written = IsFirstGeneral(step) ? AttributeState::CARRIED : AttributeState::CLEARED;
    if (attribute.State() != AttributeState::SET && attribute.State() != written) return;
    const auto& controls = nex_canDynamicCastRef<kinC_StdContactControls>(
        builder_.Model().ContactControls().ConstGet(controlsName), NEX_HERE);
    if (!controls.IsDefault() || !isNew) add(controls, false);
}

} // namespace

void oif_SurfaceToSurfaceContactStdHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                           const kinC_SurfaceToSurfaceContactStd& contact) {
    ContactSteps history(builder, name, contact);
    history.AddPair();
    history.AddClearance();
    builder.ForEachAnalysisStep([&](const cow_String& step) {
        history.AddEntranceOrExit(step);
        history.AddInterference(step);
        history.AddControls(step);
    });
}

void oif_SelfContactStdHistory(oif_InteractionBuilder& builder, const cow_String& name,
                               const kinC_SelfContactStd& contact) {
    ContactSteps history(builder, name, contact);
    history.AddPair();
    builder.ForEachAnalysisStep([&](const cow_String& step) {
        history.AddEntranceOrExit(step);
        // Unlike that of two surfaces, with neither banner nor comment.
        if (history.Record().GetPropStatus(step) == Status::MODIFIED && history.ChangesProperty(step)) {
            history.AddChangedFriction(step);
        }
        history.AddControls(step);
    });
}
