#include "interactions/oif_InteractionBuilder.h"

#include "interactions/oif_Contact.h"
#include "interactions/oif_ContactControls.h"
#include "interactions/oif_ContactPair.h"
#include "interactions/oif_ContactProperty.h"
#include "interactions/oif_FilmAndRadiation.h"
#include "interactions/oif_WaveInteractions.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <set>
#include <vector>

using Status = mdl_PropagationStatusEnm;
using AttributeState = mdl_PropAttributeStateEnm;

template <class Visitor>
void oif_InteractionBuilder::ForEachAnalysisStep(const Visitor& visit) const {
    kprC_StepContainerIT it(Model().Steps());
    it.First();
    for (it.Next(); !it.IsDone(); it.Next()) {
        const nex_Context context("step", it.CurrentKey());
        visit(it.CurrentKey());
    }
}

void oif_InteractionBuilder::Build() {
    CreateInteractionProperties();
    CreateInteractionHistory();
    CreateOpInteractions();
}

void oif_InteractionBuilder::CreateInteractionProperties() {
    Properties properties = Model().InteractionProperties();
    ChangeFrictionInteractionProperties(properties);
    for (mdl_MapString2ObjCowIT<kinC_InteractionProperty> it(properties); !it.IsDone(); it.Next()) {
        const cow_String& name = it.CurrentKey();
        const kinC_InteractionProperty& property = it.CurrentValue();
        const nex_Context context("interaction property", name);
        const auto add = [&](const qkw_Keyword& keyword) {
            AddModelDefinition(propertyBlockHeader.ModelHeader().ConstGet());
            AddModelDefinition(keyword);
        };
        // Properties of incident waves and of control elements are not written.
        switch (property.DynTypeId()) {
        case kinC_FilmConditionProp::Class.Id(): add(oif_FilmProperty(name, property)); break;
        case kinC_AcousticImpedanceProp::Class.Id(): add(oif_AcousticImpedanceProp(name, property)); break;
        case kinC_ContactProperty::Class.Id(): CreateContactProperty(name, property); break;
        default: break;
        }
    }
}

void oif_InteractionBuilder::CreateContactProperty(const cow_String& name,
                                                   const kinC_InteractionProperty& property) {
    const auto& contact = nex_canDynamicCastRef<kinC_ContactProperty>(property, NEX_HERE);
    const mdl_ObjCow<kinC_InteractionProperty> held(property);
    const auto add = [&](const auto& behavior, const qkw_Keyword& keyword) {
        if (!behavior.IsNull()) AddModelDefinition(keyword);
    };
    kinC_GeometricProperties geometry;
    if (!contact.geometricProperties.IsNull()) geometry = contact.geometricProperties.ConstGet();
    AddModelDefinition(propertyBlockHeader.ModelHeader().ConstGet());
    AddModelDefinition(
        oif_SurfaceInteraction(name, ModelInfo(), geometry.contactArea, geometry.padThickness));
    add(contact.tangentialBehavior, oif_Friction(held, ModelInfo(), false));
    add(contact.normalBehavior, oif_SurfaceBehavior(held, ModelInfo()));
    add(contact.damping, oif_ContactDamping(held, ModelInfo()));
    add(contact.thermalConductance, oif_GapConductance(held, ModelInfo()));
    add(contact.heatGeneration, oif_GapHeatGeneration(held, ModelInfo()));
    add(contact.radiation, oif_GapRadiation(held, ModelInfo()));
}

void oif_InteractionBuilder::ChangeFrictionInteractionProperties(Properties& properties) const {
    if (ModelInfo().AnalysisProduct() != kprC_AnalysisProductEnm::IMPLICIT) return;
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(Model().Interactions()); !it.IsDone(); it.Next()) {
        const nex_Context context("interaction", it.CurrentKey());
        const cow_List<cow_String> changes = PropertyChanges(it.CurrentValue());
        if (changes.Length() < 2) continue;
        // Takes the place of a property that happens to have the name.
        properties.Insert(ChangeablePropertyName(it.CurrentKey()), properties.ConstGet(changes[0]));
    }
}

cow_List<cow_String> oif_InteractionBuilder::PropertyChanges(const kinC_Interaction& interaction) const {
    cow_List<cow_String> names;
    const auto* contact = nex_canDynamicCastPtr<kinC_ContactPair>(&interaction);
    if (contact == nullptr || interaction.suppressed) return names;
    for (kprC_StepContainerIT it(Model().Steps()); !it.IsDone(); it.Next()) {
        const Status status = contact->GetPropStatus(it.CurrentKey());
        if (!kinC_Interaction::IsActive(status) || kinC_Interaction::IsBuiltIn(status)) continue;
        const auto& property = contact->ConstGetState(it.CurrentKey()).InteractionProperty;
        if (property.IsModified()) names.Append(property.ConstGet());
    }
    return names;
}

void oif_InteractionBuilder::CreateInteractionHistory() {
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(Model().Interactions()); !it.IsDone(); it.Next()) {
        const cow_String& name = it.CurrentKey();
        const kinC_Interaction& interaction = it.CurrentValue();
        if (interaction.suppressed) continue;
        const nex_Context context("interaction", name);
        const oif_Comment comment(cow_String("Interaction: ") + name);
        switch (interaction.DynTypeId()) {
        case kinC_SurfaceToSurfaceContactStd::Class.Id():
            SurfaceToSurfaceContactStdHistory(name, interaction, comment);
            break;
        case kinC_SurfaceToSurfaceContactXpl::Class.Id():
            SurfaceToSurfaceContactXplHistory(name, interaction, comment);
            break;
        case kinC_SelfContactStd::Class.Id(): SelfContactStdHistory(name, interaction, comment); break;
        case kinC_SelfContactXpl::Class.Id(): SelfContactXplHistory(name, interaction, comment); break;
        case kinC_CavityRadiation::Class.Id(): CavityRadiationHistory(name, interaction); break;
        case kinC_ContactExp::Class.Id(): ContactExpHistory(name, interaction, comment); break;
        // Elastic foundations have no keyword; films, radiation and waves come step by step.
        default: break;
        }
    }
}

void oif_InteractionBuilder::SurfaceToSurfaceContactStdHistory(const cow_String& name,
                                                               const kinC_Interaction& interaction,
                                                               const qkw_Keyword& comment) {
    const Held held = WithChangeableProperty(name, interaction);
    const auto& contact = nex_canDynamicCastRef<kinC_SurfaceToSurfaceContactStd>(held.ConstGet(), NEX_HERE);
    AddStandardPair(name, held, comment);
    if (contact.ClearanceType() != kinC_ClearanceTypeEnm::NONE) {
        AddModelDefinition(oif_Clearance(contact, GetSetName(contact.clearanceRegion),
                                         GetSurfaceName(contact.master), GetSurfaceName(contact.slave)));
    }
    ForEachAnalysisStep([&](const cow_String& step) {
        const bool isFirst = step == Model().FirstGeneralAnalysisStepName();
        const Status status = contact.GetPropStatus(step);
        bool commentWritten = false;
        switch (status) {
        case Status::NOT_YET_ACTIVE:
            if (isFirst) AddModelChange(name, held, step, true, comment);
            break;
        case Status::CREATED: {
            if (!isFirst) AddModelChange(name, held, step, false, comment);
            const oif_ContactInterference interference(held, step, ModelInfo());
            if (interference.IsEmpty()) break;
            // Here, and only here, the comment stands ahead of the banner.
            if (isFirst) AddStepDefinition(step, comment);
            AddBlock(step, interference);
            break;
        }
        case Status::MODIFIED: {
            if (contact.ConstGetState(step).InteractionProperty.IsModified()) {
                AddBlock(step, comment);
                AddChangedFriction(name, held, step);
                commentWritten = true;
            }
            const oif_ContactInterference interference(held, step, ModelInfo());
            if (interference.IsEmpty()) break;
            AddBlock(step);
            if (!commentWritten) AddStepDefinition(step, comment);
            AddStepDefinition(step, interference);
            break;
        }
        case Status::DEACTIVATED: AddModelChange(name, held, step, true, comment); break;
        default: break;
        }
        AddStandardControls(name, held, step, status == Status::CREATED);
    });
}

void oif_InteractionBuilder::SelfContactStdHistory(const cow_String& name,
                                                   const kinC_Interaction& interaction,
                                                   const qkw_Keyword& comment) {
    const Held held = WithChangeableProperty(name, interaction);
    const auto& contact = nex_canDynamicCastRef<kinC_SelfContactStd>(held.ConstGet(), NEX_HERE);
    AddStandardPair(name, held, comment);
    ForEachAnalysisStep([&](const cow_String& step) {
        const bool isFirst = step == Model().FirstGeneralAnalysisStepName();
        const Status status = contact.GetPropStatus(step);
        switch (status) {
        case Status::NOT_YET_ACTIVE:
            if (isFirst) AddModelChange(name, held, step, true, comment);
            break;
        case Status::CREATED:
            if (!isFirst) AddModelChange(name, held, step, false, comment);
            break;
        case Status::MODIFIED:
            // Unlike that of two surfaces, with neither banner nor comment.
            if (contact.ConstGetState(step).InteractionProperty.IsModified()) {
                AddChangedFriction(name, held, step);
            }
            break;
        case Status::DEACTIVATED: AddModelChange(name, held, step, true, comment); break;
        default: break;
        }
        AddStandardControls(name, held, step, status == Status::CREATED);
    });
}

oif_InteractionBuilder::Held
oif_InteractionBuilder::WithChangeableProperty(const cow_String& name,
                                               const kinC_Interaction& interaction) const {
    Held held(interaction);
    // In an explicit job too, where no property of that name is written.
    if (PropertyChanges(interaction).Length() < 2) return held;
    auto& contact = static_cast<kinC_ContactPair&>(held.Get());
    const cow_String createStep = contact.CreateStepName();
    mdl_ObjCow<kinC_ContactPairState> state(contact.ConstGetState(createStep));
    state.Get().InteractionProperty.WritableValue() = ChangeablePropertyName(name);
    contact.Insert(createStep, state.ConstGet());
    return held;
}

// Whatever step begins the contact, the pair itself stands in the initial step.
void oif_InteractionBuilder::AddStandardPair(const cow_String& name, const Held& contact,
                                             const qkw_Keyword& comment) {
    AddBlock(Model().InitialStepName(), comment,
             oif_ContactPair(name, contact, contact.ConstGet().CreateStepName(), ModelInfo(), false));
}

void oif_InteractionBuilder::AddModelChange(const cow_String& name, const Held& contact,
                                            const cow_String& step, bool remove, const qkw_Keyword& comment) {
    AddBlock(step, comment, oif_ModelChange(name, contact, step, ModelInfo(), remove));
}

void oif_InteractionBuilder::AddChangedFriction(const cow_String& name, const Held& contact,
                                                const cow_String& step) {
    const auto& state = static_cast<const kinC_ContactPair&>(contact.ConstGet()).ConstGetState(step);
    const kinC_InteractionProperty& property =
        Model().InteractionProperties().ConstGet(state.InteractionProperty.ConstGet());
    AddStepDefinition(step, oif_ChangeFriction(ChangeablePropertyName(name)));
    AddStepDefinition(step, oif_Friction(property, ModelInfo(), true));
}

void oif_InteractionBuilder::AddStandardControls(const cow_String& name, const Held& held,
                                                 const cow_String& step, bool isNew) {
    const auto& contact = static_cast<const kinC_ContactPair&>(held.ConstGet());
    if (!contact.HasStep(step)) return;
    const bool isFirst = step == Model().FirstGeneralAnalysisStepName();
    const auto& attribute = contact.ConstGetState(step).ContactControls;
    const cow_String& controlsName = attribute.ConstGet();
    const auto add = [&](const kinC_StdContactControls& controls, bool reset) {
        AddBlock(step, ControlsComment(name).ConstGet(),
                 oif_ContactControls(controls, GetSurfaceName(contact.MasterSurface()),
                                     GetSurfaceName(contact.SlaveSurface()), isNew, reset));
    };
    if (controlsName.IsEmpty()) {
        if (attribute.State() == AttributeState::CLEARED && !isNew) add(kinC_StdContactControls(), true);
        return;
    }
    // Controls from the initial step are carried into the first general step. Behind it, controls that are
    // cleared but still have their name are written.
    const AttributeState written = isFirst ? AttributeState::CARRIED : AttributeState::CLEARED;
    if (attribute.State() != AttributeState::SET && attribute.State() != written) return;
    const auto& controls = ConstGetControls<kinC_StdContactControls>(controlsName);
    if (!controls.IsDefault() || !isNew) add(controls, false);
}

template <class Controls>
const Controls& oif_InteractionBuilder::ConstGetControls(const cow_String& name) const {
    return nex_canDynamicCastRef<Controls>(Model().ContactControls().ConstGet(name), NEX_HERE);
}

qkw_KeywordHandle oif_InteractionBuilder::ControlsComment(const cow_String& name) {
    return qkw_KeywordHandle(oif_Comment(cow_String("Contact Controls for Interaction: ") + name));
}

void oif_InteractionBuilder::SurfaceToSurfaceContactXplHistory(const cow_String& name,
                                                               const kinC_Interaction& interaction,
                                                               const qkw_Keyword& comment) {
    ExplicitHistory(name, interaction, comment, true);
}

void oif_InteractionBuilder::SelfContactXplHistory(const cow_String& name,
                                                   const kinC_Interaction& interaction,
                                                   const qkw_Keyword& comment) {
    ExplicitHistory(name, interaction, comment, false);
}

void oif_InteractionBuilder::ExplicitHistory(const cow_String& name, const kinC_Interaction& interaction,
                                             const qkw_Keyword& comment, bool hasClearance) {
    const Held held(interaction);
    for (kprC_StepContainerIT it(Model().Steps()); !it.IsDone(); it.Next()) {
        const cow_String& step = it.CurrentKey();
        const nex_Context context("step", step);
        if (hasClearance && held.ConstGet().GetPropStatus(step) == Status::CREATED) {
            const auto& contact =
                nex_canDynamicCastRef<kinC_SurfaceToSurfaceContact>(held.ConstGet(), NEX_HERE);
            // In the first analysis step, with neither banner nor comment.
            if (contact.ClearanceType() != kinC_ClearanceTypeEnm::NONE) {
                AddStepDefinition(Model().FirstAnalysisStepName(),
                                  oif_Clearance(contact, GetSetName(contact.clearanceRegion), name));
            }
        }
        if (held.ConstGet().IsModified(step)) ExplicitStep(name, held, step, comment);
    }
}

void oif_InteractionBuilder::ExplicitStep(const cow_String& name, const Held& held,
                                          const cow_String& givenStep, const qkw_Keyword& comment) {
    const auto& contact = static_cast<const kinC_ContactPair&>(held.ConstGet());
    const kinC_ContactPairState& state = contact.ConstGetState(givenStep);
    const cow_String initial = Model().InitialStepName();
    const oif_ContactPair pair(name, held, givenStep, ModelInfo(), true);
    cow_String step = givenStep;
    bool isNew = false;
    if (step != initial) {
        const bool changed = state.InteractionProperty.IsModified();
        if (changed || !contact.HasStep(step)) {
            AddBlock(step, comment);
            // Another property means a pair that is deleted and declared again.
            if (changed && contact.GetPropStatus(step) != Status::CREATED) {
                Held deleted(held);
                mdl_ObjCow<kinC_ContactPairState> deletion(state);
                deletion.Get().opDelete = true;
                deleted.Get().Insert(step, deletion.ConstGet());
                AddStepDefinition(step, oif_ContactPair(name, deleted, step, ModelInfo(), true));
            }
            AddStepDefinition(step, pair);
        }
    } else if (!Model().FirstAnalysisStepName().IsEmpty()) {
        step = Model().FirstAnalysisStepName();
        AddBlock(step, comment, pair);
        isNew = true;
    }

    if (!contact.HasStep(step)) return;
    if (step != initial && !state.ContactControls.IsModified()) return;
    AddExplicitControls(name, state, step, isNew || contact.GetPropStatus(step) == Status::CREATED);
}

void oif_InteractionBuilder::AddExplicitControls(const cow_String& name, const kinC_ContactPairState& state,
                                                 const cow_String& step, bool isNew) {
    const auto add = [&](const kinC_ExpContactControls& controls, bool reset) {
        if (controls.IsDefault() && isNew) return;
        AddBlock(step, ControlsComment(name).ConstGet(), oif_ContactControls(controls, name, isNew, reset));
    };
    const cow_String& controlsName = state.ContactControls.ConstGet();
    const bool cleared = state.ContactControls.State() == AttributeState::CLEARED;
    // Unlike those of the implicit solver, controls that are cleared but still have their name are not
    // written.
    if (!controlsName.IsEmpty() && !cleared)
        add(ConstGetControls<kinC_ExpContactControls>(controlsName), false);
    if (controlsName.IsEmpty() && cleared) add(kinC_ExpContactControls(), true);
}

void oif_InteractionBuilder::ContactExpHistory(const cow_String& name, const kinC_Interaction& interaction,
                                               const qkw_Keyword& comment) {
    const Held held(interaction);
    for (kprC_StepContainerIT it(Model().Steps()); !it.IsDone(); it.Next()) {
        const cow_String& step = it.CurrentKey();
        const Status status = interaction.GetPropStatus(step);
        if (status != Status::CREATED && status != Status::MODIFIED) continue;
        AddBlock(step, comment, oif_Contact(name, held, step, ModelInfo()));
        generalContactSteps.Append(step);
    }
}

void oif_InteractionBuilder::CavityRadiationHistory(const cow_String& name,
                                                    const kinC_Interaction& interaction) {
    const auto& cavity = nex_canDynamicCastRef<kinC_CavityRadiation>(interaction, NEX_HERE);
    // No banner and no comment, here and in the steps.
    AddStepDefinition(Model().InitialStepName(), oif_CavityDefinition(name, cavity, ModelInfo()));
    ForEachAnalysisStep([&](const cow_String& step) {
        oif_RadiationViewfactor viewfactor(name, cavity, step, ModelInfo());
        switch (cavity.GetPropStatus(step)) {
        case Status::NOT_YET_ACTIVE:
        case Status::DEACTIVATED:
        case Status::NO_LONGER_ACTIVE:
        case Status::TYPE_NOT_APPLICABLE:
        case Status::INSTANCE_NOT_APPLICABLE:
            viewfactor.SwitchOff();
            AddStepDefinition(step, viewfactor);
            break;
        case Status::CREATED:
        case Status::MODIFIED: AddStepDefinition(step, viewfactor); break;
        case Status::PROPAGATED:
            if (step == Model().FirstAnalysisStepName()) AddStepDefinition(step, viewfactor);
            break;
        default: nex_Raise("Error in cavity radiation history status.");
        }
    });
}

namespace {

/// A keyword on one region of the interaction.
template <class Keyword, class Record>
qkw_KeywordHandle MakeOnSurface(const qkw_ModelInfo& modelInfo, const mdl_ObjCow<kinC_Interaction>& held,
                                const cow_String& step, bool notNew) {
    const auto& record = nex_canDynamicCastRef<Record>(held.ConstGet(), NEX_HERE);
    return qkw_KeywordHandle(Keyword(held, step, notNew, oif_RegionName(record.surface, modelInfo)));
}

qkw_KeywordHandle MakeIncidentWave(const qkw_ModelInfo& modelInfo, const mdl_ObjCow<kinC_Interaction>& held,
                                   const cow_String& step, bool) {
    const auto& wave = nex_canDynamicCastRef<kinC_IncidentWave>(held.ConstGet(), NEX_HERE);
    return qkw_KeywordHandle(oif_IncidentWave(wave, step, oif_RegionName(wave.source, modelInfo),
                                              oif_RegionName(wave.standoff, modelInfo),
                                              oif_RegionName(wave.surface, modelInfo)));
}

} // namespace

struct oif_InteractionBuilder::StepInteraction {
    struct Kind {
        unsigned typeId;
        qkw_KeywordHandle (*make)(const qkw_ModelInfo& modelInfo, const Held& held, const cow_String& step,
                                  bool notNew);
    };
    /// Null for a class that isn't one of them.
    static const Kind* FindKind(unsigned typeId) {
        static constexpr Kind kinds[] = {
            {kinC_FilmCondition::Class.Id(), MakeOnSurface<oif_Sfilm, kinC_FilmCondition>},
            {kinC_RadiationToAmbient::Class.Id(), MakeOnSurface<oif_Sradiate, kinC_RadiationToAmbient>},
            {kinC_ConcFilmCondition::Class.Id(), MakeOnSurface<oif_Cfilm, kinC_ConcFilmCondition>},
            {kinC_ConcRadiationToAmbient::Class.Id(),
             MakeOnSurface<oif_Cradiate, kinC_ConcRadiationToAmbient>},
            {kinC_AcousticImpedance::Class.Id(),
             MakeOnSurface<oif_AcousticImpedance, kinC_AcousticImpedance>},
            {kinC_IncidentWave::Class.Id(), MakeIncidentWave},
        };
        for (const Kind& kind : kinds) {
            if (kind.typeId == typeId) return &kind;
        }
        return nullptr;
    }

    cow_String name;
    Held record;
    const Kind* kind;
    /// It has been in force in a general step.
    bool activated = false;
};

void oif_InteractionBuilder::CreateOpInteractions() {
    ConfigureOpStatus();
    std::vector<StepInteraction> interactions;
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(Model().Interactions()); !it.IsDone(); it.Next()) {
        const kinC_Interaction& record = it.CurrentValue();
        const auto* kind = StepInteraction::FindKind(record.DynTypeId());
        if (kind != nullptr && !record.suppressed) interactions.push_back({it.CurrentKey(), record, kind});
    }
    std::set<cow_String> withGeneralContact;
    for (int i = 0; i < generalContactSteps.Length(); ++i) withGeneralContact.insert(generalContactSteps[i]);

    ForEachAnalysisStep([&](const cow_String& step) {
        if (!withGeneralContact.empty() && withGeneralContact.count(step) == 0 &&
            opStatus.OpNew(kinC_ContactExp::TypeId(), step)) {
            AddBlock(step, oif_Contact(ModelInfo()));
        }
        const bool isGeneral = !Model().Steps().ConstGet(step).Perturbation();
        for (StepInteraction& interaction : interactions) {
            const nex_Context context("interaction", interaction.name);
            // Three of the classes have no family to ask for, and raise here.
            const bool opNew = opStatus.OpNew(interaction.kind->typeId, step);
            bool useInitial = false;
            if (IsSaid(interaction, step, opNew, useInitial)) {
                CreateInteraction(interaction, step, !opNew, useInitial);
            }
            switch (interaction.record.ConstGet().GetPropStatus(step)) {
            case Status::CREATED:
            case Status::PROPAGATED:
            case Status::MODIFIED: interaction.activated = interaction.activated || isGeneral; break;
            default: break;
            }
        }
    });
}

bool oif_InteractionBuilder::IsSaid(const StepInteraction& interaction, const cow_String& step, bool opNew,
                                    bool& useInitial) {
    const Status status = interaction.record.ConstGet().GetPropStatus(step);
    const bool isImpedance = interaction.kind->typeId == kinC_AcousticImpedance::TypeId();
    if (status == Status::CREATED) return true;
    if (interaction.kind->typeId == kinC_IncidentWave::TypeId()) return false;
    switch (status) {
    case Status::MODIFIED:
    case Status::DEACTIVATED: return true;
    case Status::PROPAGATED: return opNew || (isImpedance && !interaction.activated);
    case Status::BUILT_INTO_BASE_STATE: useInitial = isImpedance && !interaction.activated; return useInitial;
    default: return false;
    }
}

void oif_InteractionBuilder::CreateInteraction(const StepInteraction& interaction, const cow_String& step,
                                               bool notNew, bool useInitial) {
    AddBlock(
        step, oif_Comment(cow_String("Interaction: ") + interaction.name),
        interaction.kind
            ->make(ModelInfo(), interaction.record, useInitial ? Model().InitialStepName() : step, notNew)
            .ConstGet());
}

void oif_InteractionBuilder::ConfigureOpStatus() {
    opStatus.Configure(Model().Interactions(), Model().Steps().Keys());
}

cow_String oif_InteractionBuilder::GetSurfaceName(const rgnC_Region& region) const {
    return oif_SurfaceName(region, ModelInfo());
}

cow_String oif_InteractionBuilder::GetSetName(const rgnC_Region& region) const {
    return oif_RegionName(region, ModelInfo());
}
