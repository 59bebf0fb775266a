#include "conditions/oif_BoundaryConditionBuilder.h"

#include "base/oif_Utils.h"
#include "conditions/oif_BCTable.h"
#include "conditions/oif_LoadTable.h"
#include "mesh/oif_Set.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

#include <algorithm>

namespace {

constexpr char kKind[] = "boundary condition";

const kbcC_ConnectorBC* ConnectorCondition(const kbcC_BC& bc) {
    return nex_canDynamicCastPtr<kbcC_ConnectorBC>(&bc);
}

/// Modal procedures: the supports are those of the modes.
bool IsModal(const kprC_Step& step) {
    return step.DynTypeId() == kprC_ModalDynamicsStep::TypeId() ||
           step.DynTypeId() == kprC_SteadyStateModalStep::TypeId();
}

} // namespace

void oif_BoundaryConditionBuilder::Build() {
    const kprC_StepContainer& steps = Model().Steps();
    const oif_BCOpStatus opStatus = OpStatusOf(Model().BCs(), Model().Loads(), steps);
    const oif_ObjectsOfSteps<kbcC_BC> conditions(
        kKind, Model().BCs(), steps, opStatus,
        [&](const kbcC_BC& bc, const cow_String& step, bool inLoadCase) {
            return opStatus.Writes(bc, step, inLoadCase);
        });
    const oif_ObjectsOfSteps<kloC_Load> bolts(
        "load", Model().Loads(), steps, opStatus,
        [&](const kloC_Load& load, const cow_String& step, bool inLoadCase) {
            return opStatus.WritesBolt(static_cast<const kloC_BoltLoad&>(load), step, inLoadCase);
        },
        [](const kloC_Load& load) { return load.DynTypeId() == kloC_BoltLoad::TypeId(); });
    oif_BoundarySubmodelList submodels;
    BuildElementSets();
    for (int i = 0; i < steps.Size(); ++i) {
        CreateAllBCs(conditions, opStatus, i, submodels);
        if (nex_canDynamicCastPtr<kprC_AnalysisStep>(&steps.StepAt(i)) == nullptr) continue;
        CreateEmptyBCs(i, CreateBoltLoadBCs(bolts, opStatus, i));
    }
    CreateSubmodelKwds(submodels);
}

oif_BCOpStatus oif_BoundaryConditionBuilder::OpStatusOf(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                                                        const kprC_PropagatingContainer<kloC_Load>& loads,
                                                        const kprC_StepContainer& steps) {
    oif_BCOpStatus opStatus;
    opStatus.Configure(bcs, loads, steps.Keys());
    for (int i = 1; i < steps.Size(); ++i) {
        if (steps.StepAt(i).ProcedureType() == kprC_BuckleStep::TypeId()) opStatus.ForceOpNew(i);
    }
    return opStatus;
}

void oif_BoundaryConditionBuilder::BuildElementSets() {
    for (const auto& [name, bc] : Model().BCs()) {
        const kbcC_ConnectorBC* motion = ConnectorCondition(bc);
        if (motion == nullptr || bc.suppressed) continue;
        cow_List<cow_String> members;
        for (const cow_String& connector : motion->connectors) {
            members.Append(oif_Utils::GetConnectorSetName(connector));
        }
        AddAssemblyDefinition(oif_Elset(oif_Utils::GetConnectorSetName(name), members));
    }
}

void oif_BoundaryConditionBuilder::CreateAllBCs(const oif_ObjectsOfSteps<kbcC_BC>& written,
                                                const oif_BCOpStatus& opStatus, int step,
                                                oif_BoundarySubmodelList& submodels) {
    MakeCards(
        written, step, opStatus,
        [](const cow_String& name, const kbcC_BC& bc) {
            return Comment(name, oif_FindBCRow(bc.DynTypeId())->label);
        },
        [&](const oif_BCCard& card, auto& entry) { CreateBCCard(card, entry, submodels); });
}

void oif_BoundaryConditionBuilder::CreateBCCard(const oif_BCCard& card,
                                                oif_ObjectsOfSteps<kbcC_BC>::Entry& entry,
                                                oif_BoundarySubmodelList& submodels) {
    const cow_String& initialStep = Model().InitialStepName();
    if (const kbcC_ConnectorBC* motion = ConnectorCondition(card.Object())) {
        AddComment(card, entry);
        Add(card,
            oif_Comment(cow_String("Applies To: ") + oif_BoundarySubmodelList::Joined(motion->connectors)));
        return Add(card, oif_ConnectorMotion(card, initialStep));
    }
    const auto make = [&] {
        return oif_OwnKeyword(new oif_Boundary(card, Model().ShellToSolid(), initialStep));
    };
    if (card.Object().DynTypeId() == kbcC_SubmodelBC::TypeId()) {
        const oif_Boundary boundary(card, Model().ShellToSolid(), initialStep);
        if (boundary.IsBCSubmodel()) return submodels.Append(card.step, card.name, boundary);
    }
    AddComment(card, entry);
    AddShared(card, entry, make);
}

cow_String oif_BoundaryConditionBuilder::Comment(const cow_String& name, const char* label) {
    return cow_String("Name: ") + oif_Boundary::FixBCNameHack(name) + " Type: " + label;
}

std::set<cow_String>
oif_BoundaryConditionBuilder::CreateBoltLoadBCs(const oif_ObjectsOfSteps<kloC_Load>& bolts,
                                                const oif_BCOpStatus& opStatus, int step) {
    std::set<cow_String> taken;
    MakeCards(
        bolts, step,
        [](const kprC_Step& place, const cow_String& name, mdl_PropagationStatusEnm) {
            return oif_BCOpStatus::PlacesOfBolt(place, name);
        },
        [&](const kloC_Load& load, const cow_String& stepName, bool inLoadCase) {
            return opStatus.Op(load, stepName, inLoadCase);
        },
        [](const cow_String& name, const kloC_Load& load) {
            return Comment(name, oif_FindLoadRow(load.DynTypeId())->label);
        },
        [&](const oif_LoadCard& card, const auto& entry) {
            AddComment(card, entry);
            taken.insert(card.loadCase);
        });
    return taken;
}

void oif_BoundaryConditionBuilder::CreateEmptyBCs(int step, const std::set<cow_String>& loadCasesWithBolts) {
    const cow_String& stepName = Model().Steps().NameAt(step);
    const auto& analysis = nex_canDynamicCastRef<kprC_AnalysisStep>(Model().Steps().StepAt(step), NEX_HERE);
    if (analysis.loadCases.IsEmpty() || IsModal(analysis)) return;
    const nex_Context context("step", stepName);
    bool hasBaseState = false;
    for (const auto& [name, bc] : Model().BCs()) {
        hasBaseState = !bc.suppressed && oif_BCOpStatus::IsOfBaseState(bc.Status(stepName));
        if (hasBaseState) break;
    }
    for (const auto& [name, loadCase] : analysis.loadCases) {
        if (loadCasesWithBolts.count(name) != 0 || loadCase.BcCount() != 0) continue;
        if (hasBaseState && loadCase.baseStateBCs) continue;
        AddStepDefinition(stepName, oif_RawKeyword("*Boundary, op=NEW"), name);
    }
}

void oif_BoundaryConditionBuilder::CreateSubmodelKwds(const oif_BoundarySubmodelList& boundaries) {
    std::vector<oif_Submodel> submodels;
    for (const auto& [name, bc] : Model().BCs()) {
        if (bc.DynTypeId() != kbcC_SubmodelBC::TypeId() || bc.suppressed) continue;
        const auto& boundary = static_cast<const kbcC_SubmodelBC&>(bc);
        const cow_String setName = oif_RegionName(bc.region, ModelInfo());
        const auto same = std::ranges::find_if(
            submodels, [&boundary](const oif_Submodel& submodel) { return submodel.IsEqual(boundary); });
        if (same != submodels.end()) {
            same->AppendRegion(setName);
        } else {
            submodels.emplace_back(Model().ShellToSolid(), boundary, setName);
        }
    }
    for (const oif_Submodel& submodel : submodels) AddAssemblyDefinition(submodel);
    for (const auto& [stepName, step] : Model().Steps()) {
        const qkw_KeywordList keywords = boundaries.Keywords(stepName);
        for (const qkw_KeywordHandle& keyword : keywords) AddStepDefinition(stepName, keyword);
        const cow_List<cow_String> owners = boundaries.Owners(stepName);
        for (int i = 0; i < owners.Length(); ++i) {
            // The comment and the keyword line are all boundaries', then each has its own lines.
            for (const int place : {0, 1, i + 2}) LogAs(kKind, owners[i], stepName, keywords[place]);
        }
    }
}
