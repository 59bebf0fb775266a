#include "conditions/oif_BoundaryConditionBuilder.h"

#include "base/oif_Utils.h"
#include "foundation/omi_Singleton.h"
#include "mesh/oif_Set.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/uti_TranslationMap.h"

#include <algorithm>
#include <set>
#include <vector>

using Status = mdl_PropagationStatusEnm;

namespace {

constexpr unsigned kBuckling = 0x23C0066;
// Modal procedures: the supports are those of the modes.
constexpr unsigned kModalProcedures[] = {0x23C006F, 0x23C0077, 0x23C007C};

const kbcC_ConnectorBC* ConnectorCondition(const kbcC_BC& bc) {
    return nex_canDynamicCastPtr<kbcC_ConnectorBC>(&bc);
}

} // namespace

void oif_BoundaryConditionBuilder::Build() {
    ConfigureOpStatus();
    BuildElementSets();
    stepNames_ = Model().Steps().Keys();
    for (int i = 0; i < stepNames_.Length(); ++i) {
        const nex_Context context("step", stepNames_[i]);
        CreateAllBCs(stepNames_[i]);
        if (AnalysisStep(stepNames_[i]) == nullptr) continue;
        CreateEmptyBCs(stepNames_[i], CreateBoltLoadBCs(stepNames_[i]));
    }
    CreateSubmodelKwds();
    written_ = {};
    bolts_ = {};
    shared_.clear();
}

void oif_BoundaryConditionBuilder::ConfigureOpStatus() {
    const kprC_StepContainer& steps = Model().Steps();
    opStatus_ = OpStatusOf(Model().BCs(), Model().Loads(), steps);
    const auto inLoadCases = [this](const cow_String& stepName) {
        const kprC_AnalysisStep* step = AnalysisStep(stepName);
        return step != nullptr && !step->loadCases.IsEmpty();
    };
    written_ = {"boundary condition", Model().BCs(), steps,
                [&](const kbcC_BC& bc, const cow_String& stepName) {
                    // In the first step all are let in: a class without a family raises in any status.
                    if (stepName == steps.NameAt(0)) return !bc.suppressed;
                    return opStatus_.Writes(bc, stepName, inLoadCases(stepName));
                }};
    bolts_ = {"load", Model().Loads(), steps, [](const kloC_Load& load, const cow_String& stepName) {
                  return load.DynTypeId() == kloC_BoltLoad::TypeId() && !load.suppressed &&
                         load.Status(stepName) != Status::BUILT_INTO_BASE_STATE;
              }};
}

oif_BCOpStatus oif_BoundaryConditionBuilder::OpStatusOf(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                                                        const kprC_PropagatingContainer<kloC_Load>& loads,
                                                        const kprC_StepContainer& steps) {
    oif_BCOpStatus opStatus;
    opStatus.Configure(bcs, loads, steps.Keys());
    for (int i = 1; i < steps.Size(); ++i) {
        if (steps.StepAt(i).ProcedureType() == kBuckling) opStatus.ForceOpNew(i);
    }
    return opStatus;
}

void oif_BoundaryConditionBuilder::BuildElementSets() {
    for (kprC_PropagatingContainerIT<kbcC_BC> it(Model().BCs()); !it.IsDone(); it.Next()) {
        const kbcC_ConnectorBC* bc = ConnectorCondition(it.CurrentValue());
        if (bc == nullptr || bc->suppressed) continue;
        cow_List<cow_String> members;
        for (int i = 0; i < bc->connectors.Length(); ++i) {
            members.Append(oif_Utils::GetConnectorSetName(bc->connectors[i]));
        }
        AddAssemblyDefinition(oif_Elset(oif_Utils::GetConnectorSetName(it.CurrentKey()), members));
    }
}

void oif_BoundaryConditionBuilder::CreateAllBCs(const cow_String& stepName) {
    if (!Model().Steps().IsMember(stepName)) return;
    const kprC_Step& step = Model().Steps().ConstGet(stepName);
    for (const auto& [name, bc] : written_.In(Model().Steps().IndexOf(stepName))) {
        const nex_Context context("boundary condition", *name);
        for (const auto& [loadCase, scale] : oif_BCOpStatus::Places(step, *name, bc->Status(stepName))) {
            AllBCDetails(*bc, *name, stepName, loadCase, scale);
        }
    }
}

void oif_BoundaryConditionBuilder::AllBCDetails(const kbcC_BC& bc, const cow_String& name,
                                                const cow_String& stepName, const cow_String& loadCaseName,
                                                const float& scale) {
    const bool opNew = opStatus_.OpNew(bc.DynTypeId(), stepName);
    const bool inCase = !loadCaseName.IsEmpty();
    if (!opStatus_.Writes(bc, stepName, inCase)) return;
    AddHeader(stepName, loadCaseName);
    CreateBCCard(name, bc, stepName, !inCase && !opNew, loadCaseName, scale);
}

void oif_BoundaryConditionBuilder::CreateBCCard(const cow_String& name, const kbcC_BC& bc,
                                                const cow_String& stepName, bool opMod,
                                                const cow_String& loadCaseName, const float& scale) {
    if (bc.suppressed) return;
    const Shared& shared = SharedOf(name, bc);
    const qkw_KeywordHandle comment =
        loadCaseName.IsEmpty() ? shared.comment
                               : qkw_KeywordHandle(oif_Comment(Comment(oif_Boundary::FixBCNameHack(name),
                                                                       bc.DynTypeId(), loadCaseName, scale)));
    const cow_String& setName = shared.setName;
    const cow_String& initialStep = Model().InitialStepName();
    const double factor = scale;
    if (const kbcC_ConnectorBC* connectors = ConnectorCondition(bc)) {
        AddStepDefinition(stepName, comment, loadCaseName);
        AddStepDefinition(stepName,
                          oif_Comment(cow_String("Applies To: ") +
                                      oif_BoundarySubmodelList::Joined(connectors->connectors)),
                          loadCaseName);
        AddStepDefinition(stepName,
                          oif_ConnectorMotion(shared.record, setName, stepName, opMod, initialStep, factor),
                          loadCaseName);
        return;
    }
    // The classes with a label are those with a keyword.
    if (omi_Singleton<kbcC_BCTypeLabelMap>::Instance().LabelString(bc.DynTypeId(), 1).IsEmpty()) {
        QRXBasException::Throw(
            nex_PrimException<atr_String, 1>("Unimplemented keyword for boundary condition"));
    }
    const oif_Boundary boundary(shared.record, name, stepName, opMod, setName, Model().ShellToSolid(),
                                initialStep, factor);
    if (boundary.IsBCSubmodel()) {
        submodelList_.Append(stepName, oif_Boundary::FixBCNameHack(name), boundary);
        return;
    }
    AddStepDefinition(stepName, comment, loadCaseName);
    AddStepDefinition(stepName, boundary, loadCaseName);
}

cow_String oif_BoundaryConditionBuilder::Comment(const cow_String& name, unsigned typeId,
                                                 const cow_String& loadCaseName, float scale) {
    const cow_String label = typeId == kloC_BoltLoad::TypeId()
                                 ? omi_Singleton<kloC_LoadTypeLabelMap>::Instance().LabelString(typeId, 1)
                                 : omi_Singleton<kbcC_BCTypeLabelMap>::Instance().LabelString(typeId, 1);
    cow_String text = cow_String("Name: ") + name + " Type: " + label;
    if (!loadCaseName.IsEmpty()) text += cow_String("   Scale factor: ") + cow_String(scale);
    return text;
}

cow_List<cow_String> oif_BoundaryConditionBuilder::CreateBoltLoadBCs(const cow_String& stepName) {
    cow_List<cow_String> taken;
    const kprC_AnalysisStep* step = AnalysisStep(stepName);
    if (step == nullptr) return taken;
    for (const auto& [name, object] : bolts_.In(Model().Steps().IndexOf(stepName))) {
        const auto& load = static_cast<const kloC_BoltLoad&>(*object);
        const nex_Context context("load", *name);
        if (step->loadCases.IsEmpty()) {
            BoltLoadBCDetails(load, *name, stepName, cow_String(), 1.0F);
            taken.Append(cow_String());
            continue;
        }
        for (mdl_MapString2ObjCowIT<klcC_LoadCase> cases(step->loadCases); !cases.IsDone(); cases.Next()) {
            const float* scale = cases.CurrentValue().loads.Find(*name);
            if (scale != nullptr && BoltLoadBCDetails(load, *name, stepName, cases.CurrentKey(), *scale)) {
                taken.Append(cases.CurrentKey());
            }
        }
    }
    return taken;
}

bool oif_BoundaryConditionBuilder::BoltLoadBCDetails(const kloC_BoltLoad& load, const cow_String& name,
                                                     const cow_String& stepName,
                                                     const cow_String& loadCaseName, const float& scale) {
    const bool opMod = !opStatus_.OpNew(load.DynTypeId(), stepName) && loadCaseName.IsEmpty();
    if (!oif_BCOpStatus::WritesBolt(load, stepName, opMod)) return false;
    AddHeader(stepName, loadCaseName);
    CreateBCCard(name, load, stepName, opMod, loadCaseName, scale);
    return true;
}

// The comment alone: the force of a bolt is told among the concentrated loads.
void oif_BoundaryConditionBuilder::CreateBCCard(const cow_String& name, const kloC_BoltLoad& boltLoad,
                                                const cow_String& stepName, bool,
                                                const cow_String& loadCaseName, const float& scale) {
    const cow_String shownName = oif_Boundary::FixBCNameHack(name);
    AddStepDefinition(stepName, oif_Comment(Comment(shownName, boltLoad.DynTypeId(), loadCaseName, scale)),
                      loadCaseName);
}

void oif_BoundaryConditionBuilder::CreateEmptyBCs(const cow_String& stepName,
                                                  const cow_List<cow_String>& loadCasesWithBolts) {
    const kprC_AnalysisStep* step = AnalysisStep(stepName);
    if (step == nullptr || step->loadCases.IsEmpty() ||
        std::find(std::begin(kModalProcedures), std::end(kModalProcedures), step->DynTypeId()) !=
            std::end(kModalProcedures)) {
        return;
    }
    bool hasBaseState = false;
    for (kprC_PropagatingContainerIT<kbcC_BC> it(Model().BCs()); !it.IsDone() && !hasBaseState; it.Next()) {
        hasBaseState = !it.CurrentValue().suppressed &&
                       oif_BCOpStatus::IsOfBaseState(it.CurrentValue().Status(stepName));
    }
    std::set<cow_String> withBolts;
    for (int i = 0; i < loadCasesWithBolts.Length(); ++i) withBolts.insert(loadCasesWithBolts[i]);
    for (mdl_MapString2ObjCowIT<klcC_LoadCase> it(step->loadCases); !it.IsDone(); it.Next()) {
        const klcC_LoadCase& loadCase = it.CurrentValue();
        if (withBolts.count(it.CurrentKey()) != 0 || loadCase.BcCount() != 0) continue;
        if (hasBaseState && loadCase.baseStateBCs) continue;
        AddStepDefinition(stepName, oif_RawKeyword("*Boundary, op=NEW"), it.CurrentKey());
    }
}

void oif_BoundaryConditionBuilder::CreateSubmodelKwds() {
    std::vector<oif_Submodel> submodels;
    for (kprC_PropagatingContainerIT<kbcC_BC> it(Model().BCs()); !it.IsDone(); it.Next()) {
        if (it.CurrentValue().DynTypeId() != kbcC_SubmodelBC::TypeId() || it.CurrentValue().suppressed)
            continue;
        const auto& bc = static_cast<const kbcC_SubmodelBC&>(it.CurrentValue());
        const cow_String setName = RegionName(bc.region);
        const auto same = std::find_if(submodels.begin(), submodels.end(),
                                       [&bc](const oif_Submodel& submodel) { return submodel.IsEqual(bc); });
        if (same != submodels.end()) {
            same->AppendRegion(setName);
        } else {
            submodels.emplace_back(Model().ShellToSolid(), bc, setName);
        }
    }
    for (const oif_Submodel& submodel : submodels) AddAssemblyDefinition(submodel);
    for (int i = 0; i < stepNames_.Length(); ++i) {
        const qkw_KeywordList keywords = submodelList_.Keywords(stepNames_[i]);
        for (int k = 0; k < keywords.Length(); ++k) {
            AddStepDefinition(stepNames_[i], keywords[k].ConstGet());
        }
    }
}

const oif_BoundaryConditionBuilder::Shared& oif_BoundaryConditionBuilder::SharedOf(const cow_String& name,
                                                                                   const kbcC_BC& bc) {
    const auto [place, isNew] = shared_.try_emplace(&bc);
    Shared& shared = place->second;
    if (isNew) {
        const cow_String shownName = oif_Boundary::FixBCNameHack(name);
        shared.record = bc;
        shared.setName = RegionName(bc.region);
        shared.comment = oif_Comment(Comment(shownName, bc.DynTypeId(), cow_String(), 1.0F));
    }
    return shared;
}

void oif_BoundaryConditionBuilder::AddHeader(const cow_String& stepName, const cow_String& loadCaseName) {
    if (loadCaseName.IsEmpty()) AddStepDefinition(stepName, blockHeader_.StepHeader(stepName));
}

cow_String oif_BoundaryConditionBuilder::RegionName(const rgnC_Region& region) const {
    return oif_RegionName(region, ModelInfo());
}

const kprC_AnalysisStep* oif_BoundaryConditionBuilder::AnalysisStep(const cow_String& stepName) const {
    const int index = Model().Steps().IndexOf(stepName);
    return index < 0 ? nullptr : nex_canDynamicCastPtr<kprC_AnalysisStep>(&Model().Steps().StepAt(index));
}
