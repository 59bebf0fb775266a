#include "interactions/oif_ExplicitContactHistory.h"

#include "interactions/oif_Contact.h"
#include "interactions/oif_ContactControls.h"
#include "interactions/oif_ContactPair.h"
#include "interactions/oif_InteractionBuilder.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

using Status = mdl_PropagationStatusEnm;

namespace {

using Held = mdl_ObjCow<kinC_Interaction>;

/// The pair's keyword in the step, there to delete it.
oif_ContactPair DeletedPair(oif_InteractionBuilder& builder, const cow_String& name,
                            const kinC_ContactPair& contact, const cow_String& step) {
    Held deleted(static_cast<const kinC_Interaction&>(contact));
    mdl_ObjCow<kinC_ContactPairState> deletion(contact.ConstGetState(step));
    deletion.Get().opDelete = true;
    deleted.Get().Insert(step, deletion.ConstGet());
    return {name, deleted, step, builder.ModelInfo(), true};
}

void AddControls(oif_InteractionBuilder& builder, const cow_String& name, const kinC_ContactPairState& state,
                 const cow_String& step, bool isNew) {
    const auto add = [&](const kinC_ExpContactControls& controls, bool reset) {
        if (controls.IsDefault() && isNew) return;
        builder.AddBlock(step, oif_ContactControlsComment(name),
                         oif_ContactControls(controls, name, isNew, reset));
    };
    const cow_String& controlsName = state.ContactControls.ConstGet();
    const bool cleared = state.ContactControls.State() == mdl_PropAttributeStateEnm::CLEARED;
    // Unlike those of the implicit solver, controls that are cleared but still have their name are not
    // written.
    if (!controlsName.IsEmpty() && !cleared) {
        add(nex_canDynamicCastRef<kinC_ExpContactControls>(
                builder.Model().ContactControls().ConstGet(controlsName), NEX_HERE),
            false);
    }
    if (controlsName.IsEmpty() && cleared) add(kinC_ExpContactControls(), true);
}

/// The pair in a step that changes it. What the initial step gives goes to the first analysis step.
void AddStep(oif_InteractionBuilder& builder, const cow_String& name, const kinC_ContactPair& contact,
             const cow_String& givenStep) {
    const oif_Comment comment = oif_InteractionComment(name);
    const kinC_ContactPairState& state = contact.ConstGetState(givenStep);
    const cow_String initial = builder.Model().InitialStepName();
    const oif_ContactPair pair(name, Held(static_cast<const kinC_Interaction&>(contact)), givenStep,
                               builder.ModelInfo(), true);
    cow_String step = givenStep;
    bool isNew = false;
    if (step != initial) {
        const bool changed = state.InteractionProperty.IsModified();
        if (changed || !contact.HasStep(step)) {
            builder.AddBlock(step, comment);
            // Another property means a pair that is deleted and declared again.
            if (changed && contact.GetPropStatus(step) != Status::CREATED) {
                builder.AddStepDefinition(step, DeletedPair(builder, name, contact, step));
            }
            builder.AddStepDefinition(step, pair);
        }
    } else if (!builder.Model().FirstAnalysisStepName().IsEmpty()) {
        step = builder.Model().FirstAnalysisStepName();
        builder.AddBlock(step, comment, pair);
        isNew = true;
    }

    if (!contact.HasStep(step)) return;
    if (step != initial && !state.ContactControls.IsModified()) return;
    AddControls(builder, name, state, step, isNew || contact.GetPropStatus(step) == Status::CREATED);
}

/// Calls `visit(name)` for each step, the initial one among them.
template <class Visitor>
void ForEachStep(const oif_InteractionBuilder& builder, const Visitor& visit) {
    for (const auto& [stepName, step] : builder.Model().Steps()) {
        const nex_Context context("step", stepName);
        visit(stepName);
    }
}

} // namespace

void oif_SurfaceToSurfaceContactXplHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                           const kinC_SurfaceToSurfaceContactXpl& contact) {
    ForEachStep(builder, [&](const cow_String& step) {
        // In the first analysis step, with neither banner nor comment.
        if (contact.GetPropStatus(step) == Status::CREATED &&
            contact.ClearanceType() != kinC_ClearanceTypeEnm::NONE) {
            builder.AddStepDefinition(
                builder.Model().FirstAnalysisStepName(),
                oif_Clearance(contact, oif_RegionName(contact.clearanceRegion, builder.ModelInfo()), name));
        }
        if (contact.IsModified(step)) AddStep(builder, name, contact, step);
    });
}

void oif_SelfContactXplHistory(oif_InteractionBuilder& builder, const cow_String& name,
                               const kinC_SelfContactXpl& contact) {
    ForEachStep(builder, [&](const cow_String& step) {
        if (contact.IsModified(step)) AddStep(builder, name, contact, step);
    });
}

bool oif_SaysGeneralContact(const kinC_ContactExp& contact, const cow_String& step) {
    const Status status = contact.GetPropStatus(step);
    return status == Status::CREATED || status == Status::MODIFIED;
}

void oif_ContactExpHistory(oif_InteractionBuilder& builder, const cow_String& name,
                           const kinC_ContactExp& contact) {
    for (const auto& [stepName, step] : builder.Model().Steps()) {
        if (!oif_SaysGeneralContact(contact, stepName)) continue;
        builder.AddBlock(stepName, oif_InteractionComment(name),
                         oif_Contact(name, Held(static_cast<const kinC_Interaction&>(contact)), stepName,
                                     builder.ModelInfo()));
    }
}
