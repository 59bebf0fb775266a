#include "steps/oif_StepBuilder.h"

#include "base/oif_Comment.h"
#include "mesh/oif_SetName.h"
#include "steps/oif_DynamicProcedures.h"
#include "steps/oif_ModalProcedures.h"
#include "steps/oif_StaticProcedures.h"
#include "steps/oif_Step.h"
#include "steps/oif_StepControls.h"
#include "steps/oif_StepExtras.h"
#include "steps/oif_ThermalProcedures.h"

void oif_StepBuilder::Build() {
    // An explicit job starts with large displacements on.
    bool nlgeomInherited = ModelInfo().AnalysisProduct() == kprC_AnalysisProductEnm::EXPLICIT;
    unsigned previousProcedure = 0;
    const kprC_StepContainer& steps = Model().Steps();
    kprC_StepContainerIT it(steps);
    it.First();
    // The initial step has no block.
    for (it.Next(); !it.IsDone(); it.Next()) {
        const cow_String& stepName = it.CurrentKey();
        const nex_Context context("step", stepName);
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(it.CurrentValue(), NEX_HERE);
        AddStepDefinition(
            stepName,
            oif_Comment(
                cow_String("----------------------------------------------------------------\n\nSTEP: ") +
                stepName + "\n"));
        AddStepDefinition(stepName, oif_Step(step, nlgeomInherited, stepName));
        AddProcedure(stepName, step, previousProcedure);
        // What was once on stays on, for explicit steps that turn it off too.
        nlgeomInherited = nlgeomInherited || step.Nlgeom() == kprC_Step::NlgeomEnm::ON;
        AddLoadCases(stepName, step);
        previousProcedure = step.DynTypeId();
    }
}

void oif_StepBuilder::AddProcedure(const cow_String& stepName, const kprC_AnalysisStep& step,
                                   unsigned previousProcedure) {
    const auto add = [&](const auto&... keywords) { (AddStepDefinition(stepName, keywords), ...); };
    switch (step.DynTypeId()) {
    case kprC_AnnealStep::Class.Id(): add(oif_Anneal(step)); break;
    case kprC_BuckleStep::Class.Id(): add(oif_Buckle(step)); break;
    case kprC_CoupledTempDisplacementStep::Class.Id():
        add(oif_CoupledTempDisplacement(step, ModelInfo().V6Format()), oif_SolutionTechnique(step));
        break;
    case kprC_CoupledThermalElectricStep::Class.Id():
        add(oif_CoupledThermalElectric(step), oif_SolutionTechnique(step));
        break;
    case kprC_ExplicitDynamicsStep::Class.Id():
        add(oif_ExplicitDynamics(step), oif_BulkViscosity(step));
        AddMassScaling(stepName, nex_canDynamicCastRef<kprC_ExplicitDynamicsStep>(step, NEX_HERE));
        break;
    case kprC_FrequencyStep::Class.Id(): add(oif_Frequency(step, ModelInfo())); break;
    case kprC_GeostaticStep::Class.Id(): add(oif_Geostatic(step), oif_SolutionTechnique(step)); break;
    case kprC_HeatTransferStep::Class.Id(): add(oif_HeatTransfer(step)); break;
    case kprC_ImplicitDynamicsStep::Class.Id(): add(oif_ImplicitDynamics(step)); break;
    case kprC_MassDiffusionStep::Class.Id(): add(oif_MassDiffusion(step)); break;
    case kprC_ModalDynamicsStep::Class.Id():
        add(oif_ModalDynamics(step, previousProcedure));
        AddModalDamping(stepName, nex_canDynamicCastRef<kprC_ModalDynamicsStep>(step, NEX_HERE));
        break;
    case kprC_RandomResponseStep::Class.Id():
        add(oif_RandomResponse(step));
        AddModalDamping(stepName, nex_canDynamicCastRef<kprC_RandomResponseStep>(step, NEX_HERE));
        break;
    case kprC_ResponseSpectrumStep::Class.Id():
        add(oif_ResponseSpectrum(step));
        AddModalDamping(stepName, nex_canDynamicCastRef<kprC_ResponseSpectrumStep>(step, NEX_HERE));
        break;
    case kprC_SoilsStep::Class.Id(): add(oif_Soils(step), oif_SolutionTechnique(step)); break;
    case kprC_StaticStep::Class.Id(): add(oif_Static(step), oif_SolutionTechnique(step)); break;
    case kprC_StaticRiksStep::Class.Id():
        add(oif_StaticRiks(
                step, AssemblySetName(nex_canDynamicCastRef<kprC_StaticRiksStep>(step, NEX_HERE).region)),
            oif_SolutionTechnique(step));
        break;
    case kprC_StaticLinearPerturbationStep::Class.Id(): add(oif_StaticLinearPerturbation(step)); break;
    case kprC_SteadyStateDirectStep::Class.Id(): add(oif_SteadyStateDirect(step)); break;
    case kprC_SteadyStateModalStep::Class.Id():
        add(oif_SteadyStateModal(step));
        AddModalDamping(stepName, nex_canDynamicCastRef<kprC_SteadyStateModalStep>(step, NEX_HERE));
        break;
    case kprC_SubspaceDynamicsStep::Class.Id(): {
        add(oif_SubspaceDynamics(step));
        const int vectors = nex_canDynamicCastRef<kprC_SubspaceDynamicsStep>(step, NEX_HERE).vectors;
        if (vectors != 0) add(oif_SelectEigenmodes(vectors));
        break;
    }
    case kprC_ViscoStep::Class.Id():
        add(oif_Visco(step, ModelInfo().V6Format()), oif_SolutionTechnique(step));
        break;
    case kprC_TempDisplacementDynamicsStep::Class.Id():
        add(oif_DynamicTempDisplacement(step, ModelInfo()), oif_BulkViscosity(step));
        AddMassScaling(stepName, nex_canDynamicCastRef<kprC_TempDisplacementDynamicsStep>(step, NEX_HERE));
        break;
    case kprC_ComplexFrequencyStep::Class.Id(): add(oif_ComplexFrequency(step)); break;
    case kprC_SteadyStateSubspaceStep::Class.Id(): add(oif_SteadyStateSubspace(step)); break;
    default: nex_Raise("Unimplemented procedure print method");
    }
}

template <class Step>
void oif_StepBuilder::AddMassScaling(const cow_String& stepName, const Step& step) {
    for (int i = 0; i < step.massScaling.Length(); ++i) {
        const kprC_MassScaling& scaling = step.massScaling[i];
        const cow_String setName = AssemblySetName(scaling.region);
        if (scaling.IsVariable()) {
            AddStepDefinition(stepName, oif_VariableMassScaling(scaling, setName));
        } else {
            AddStepDefinition(stepName, oif_FixedMassScaling(scaling, setName));
        }
    }
}

template <class Step>
void oif_StepBuilder::AddModalDamping(const cow_String& stepName, const Step& step) {
    const auto add = [&](const auto& damping) {
        if (!damping.IsNull()) AddStepDefinition(stepName, oif_ModalDamping(damping));
    };
    // Transient and spectrum steps have no structural damping.
    constexpr bool hasStructural = requires {
        step.structuralDamping;
    };
    add(step.compositeDamping);
    add(step.directDamping);
    add(step.rayleighDamping);
    if constexpr (hasStructural) add(step.structuralDamping);
    add(step.directDampingByFrequency);
    add(step.rayleighDampingByFrequency);
    if constexpr (hasStructural) add(step.structuralDampingByFrequency);
}

void oif_StepBuilder::AddLoadCases(const cow_String& stepName, const kprC_AnalysisStep& step) {
    bool first = true;
    for (mdl_MapString2ObjCowIT<klcC_LoadCase> it(step.loadCases); !it.IsDone(); it.Next()) {
        const cow_String& name = it.CurrentKey();
        // The list of the empty key is the body.
        if (name.IsEmpty()) continue;
        if (first) AddStepDefinition(stepName, oif_Comment("\nLOAD CASES\n"), name);
        first = false;
        AddStepDefinition(stepName, oif_LoadCase(name), name);
    }
}

cow_String oif_StepBuilder::AssemblySetName(const rgnC_Region& region) const {
    return oif_RegionName(region, ModelInfo());
}
