#include "conditions/oif_LoadBuilder.h"

#include "conditions/oif_FluxLoads.h"
#include "conditions/oif_MechanicalLoads.h"
#include "foundation/omi_Singleton.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/conditions/uti_TranslationMap.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"

using Status = mdl_PropagationStatusEnm;

namespace {

constexpr int kThreeDimensional = 1;

/// The keyword classes of these bring their comment themselves; an inertia relief load may have none.
bool AddsCommentItself(unsigned typeId) {
    switch (typeId) {
    case kloC_Moment::Class.Id():
    case kloC_PEGLoad::Class.Id():
    case kloC_BoltLoad::Class.Id():
    case kloC_ConcentratedPoreFluid::Class.Id():
    case kloC_InwardVolAccel::Class.Id():
    case kloC_ConcentratedForce::Class.Id():
    case kloC_InertiaRelief::Class.Id(): return true;
    default: return false;
    }
}

} // namespace

void oif_LoadBuilder::Build() {
    BuildLoadsHistory();
}

void oif_LoadBuilder::BuildLoadsHistory() {
    ConfigureOpStatus();
    FindCyclicInteraction();
    const kprC_StepContainer& steps = Model().Steps();
    const oif_ObjectsOfSteps<kloC_Load> written(
        "load", Model().Loads(), steps,
        [this](const kloC_Load& load, const cow_String& step) { return opStatus_.Writes(load, step); });
    // Loads of the initial step are written from the first analysis step on, if at all.
    for (int i = 1; i < steps.Size(); ++i) {
        const nex_Context stepContext("step", steps.NameAt(i));
        for (const auto& [name, load] : written.In(i)) {
            const nex_Context context("load", *name);
            CreateLoadCard(*name, *load, steps.NameAt(i));
        }
    }
    texts_.clear();
}

void oif_LoadBuilder::ConfigureOpStatus() {
    opStatus_.Configure(Model().Loads(), Model().Steps().Keys(), ModelInfo());
}

void oif_LoadBuilder::FindCyclicInteraction() {
    for (kprC_PropagatingContainerIT<kinC_Interaction> it(Model().Interactions()); !it.IsDone(); it.Next()) {
        if (it.CurrentValue().suppressed) continue;
        cyclicInteraction_ = nex_canDynamicCastPtr<kinC_CyclicSymmetry>(&it.CurrentValue());
        if (cyclicInteraction_ != nullptr) break;
    }
    cyclicSymmetry_ = cyclicInteraction_ != nullptr;
}

void oif_LoadBuilder::CreateLoadCard(const cow_String& name, const kloC_Load& load,
                                     const cow_String& stepName) {
    if (load.suppressed) return;
    const kprC_Step& step = Model().Steps().ConstGet(stepName);
    const bool cyclicApplies = cyclicSymmetry_ && step.DynTypeId() == kprC_SteadyStateModalStep::TypeId();
    const int cyclicMode =
        cyclicApplies ? cyclicInteraction_->ConstGetState(stepName).cyclicMode.ConstGet() : 0;
    for (const oif_ConditionPlace& place : oif_LoadOpStatus::Places(step, name)) {
        LoadCardDetails(name, load, stepName, place.loadCase, cyclicApplies, cyclicMode, place.scale);
    }
}

void oif_LoadBuilder::LoadCardDetails(const cow_String& name, const kloC_Load& load,
                                      const cow_String& stepName, const cow_String& loadCaseName,
                                      bool cyclicApplies, int cyclicMode, const float& scale) {
    if (load.suppressed) return;
    const unsigned typeId = load.DynTypeId();
    const auto add = [&](const qkw_Keyword& keyword) { AddStepDefinition(stepName, keyword, loadCaseName); };
    const bool opMod = !opStatus_.OpNew(typeId, stepName);
    if (loadCaseName.IsEmpty()) AddStepDefinition(stepName, blockHeader_.StepHeader(stepName));
    const Texts& texts = TextsOf(name, load);
    const cow_String& setName = texts.setName;
    const auto addComment = [&] {
        if (loadCaseName.IsEmpty()) return AddStepDefinition(stepName, texts.comment);
        add(oif_Comment(texts.label + "   Scale factor: " + cow_String(scale)));
    };
    if (!AddsCommentItself(typeId)) addComment();

    const auto addDsload = [&](const cow_String& refNode) {
        cow_String fieldName;
        // Nothing but the comment tells of a load that a field gives.
        if (load.UsesField(fieldName)) return;
        add(oif_Dsload(load, stepName, opMod, setName, ModelInfo(), cyclicApplies, cyclicMode,
                       static_cast<double>(scale), refNode, name));
    };
    switch (typeId) {
    case kloC_Pressure::Class.Id():
        return addDsload(
            oif_RegionName(static_cast<const kloC_Pressure&>(load).distributionRegion, ModelInfo()));
    case kloC_SurfaceTraction::Class.Id():
    case kloC_ShellEdgeLoad::Class.Id(): return addDsload({});
    case kloC_RotationalBodyForce::Class.Id():
    case kloC_LineLoad::Class.Id():
    case kloC_PipePressure::Class.Id():
    case kloC_BodyForce::Class.Id():
    case kloC_Gravity::Class.Id():
        return add(oif_Dload(load, stepName, opMod, setName, kThreeDimensional, ModelInfo(), cyclicApplies,
                             cyclicMode, static_cast<double>(scale), {}));
    case kloC_ConnectorForce::Class.Id():
    case kloC_ConnectorMoment::Class.Id():
        return add(oif_ConnectorLoad(load, setName, stepName, opMod, static_cast<double>(scale)));
    case kloC_Moment::Class.Id():
    case kloC_PEGLoad::Class.Id():
    case kloC_BoltLoad::Class.Id():
    case kloC_ConcentratedPoreFluid::Class.Id():
    case kloC_InwardVolAccel::Class.Id():
    case kloC_ConcentratedForce::Class.Id():
        addComment();
        return add(oif_Cload(load, stepName, opMod, setName, static_cast<double>(scale)));
    case kloC_ConcentratedHeatFlux::Class.Id():
    case kloC_ConcentratedConcentrationFlux::Class.Id():
        return add(oif_Cflux(load, stepName, opMod, setName));
    case kloC_BodyHeatFlux::Class.Id():
    case kloC_BodyConcentrationFlux::Class.Id(): return add(oif_Dflux(load, stepName, opMod, setName));
    case kloC_SurfaceHeatFlux::Class.Id():
    case kloC_SurfaceConcentrationFlux::Class.Id(): return add(oif_Dsflux(load, stepName, opMod, setName));
    case kloC_SurfacePoreFluid::Class.Id(): return add(oif_Dsflow(load, stepName, opMod, setName));
    case kloC_HydroFluidFlow::Class.Id(): return add(oif_FluidFlux(load, stepName, opMod, setName));
    case kloC_ConcentratedCharge::Class.Id(): return add(oif_Cecharge(load, stepName, opMod, setName));
    case kloC_ConcentratedCurrent::Class.Id(): return add(oif_Cecurrent(load, stepName, opMod, setName));
    case kloC_SurfaceCharge::Class.Id(): return add(oif_Dsecharge(load, stepName, opMod, setName));
    case kloC_SurfaceCurrent::Class.Id(): return add(oif_Dsecurrent(load, stepName, opMod, setName));
    case kloC_BodyCharge::Class.Id(): return add(oif_Decharge(load, stepName, opMod, setName));
    case kloC_BodyCurrent::Class.Id(): return add(oif_Decurrent(load, stepName, opMod, setName));
    case kloC_InertiaRelief::Class.Id():
        // It is a comment only. The end of one of several isn't told; the banner stands all the same.
        if (load.Status(stepName) == Status::DEACTIVATED && !CheckForUniqueIRLoad(name, stepName)) return;
        return addComment();
    default: QRXBasException::Throw(nex_PrimException<atr_String, 1>("Unimplemented load type conversion"));
    }
}

const oif_LoadBuilder::Texts& oif_LoadBuilder::TextsOf(const cow_String& name, const kloC_Load& load) {
    const auto [place, isNew] = texts_.try_emplace(&load);
    Texts& texts = place->second;
    if (isNew) {
        texts.setName = oif_RegionName(load.region, ModelInfo());
        texts.label = cow_String("Name: ") + name + "   Type: " +
                      omi_Singleton<kloC_LoadTypeLabelMap>::Instance().LabelString(load.DynTypeId(), 1);
        texts.comment = oif_Comment(texts.label);
    }
    return texts;
}

bool oif_LoadBuilder::CheckForUniqueIRLoad(const cow_String& name, const cow_String& stepName) const {
    for (kprC_PropagatingContainerIT<kloC_Load> it(Model().Loads()); !it.IsDone(); it.Next()) {
        const kloC_Load& load = it.CurrentValue();
        if (load.suppressed || load.DynTypeId() != kloC_InertiaRelief::TypeId() || it.CurrentKey() == name)
            continue;
        switch (load.Status(stepName)) {
        case Status::CREATED:
        case Status::MODIFIED:
        case Status::DEACTIVATED: return false;
        default: break;
        }
    }
    return true;
}
