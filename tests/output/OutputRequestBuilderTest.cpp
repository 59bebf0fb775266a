#include "output/oif_OutputRequestBuilder.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

namespace {

/// A request that begins in the step, for the preselected variables.
template <class Base>
Base RequestFrom(const cow_String& stepName, const kprC_StepContainer& steps) {
    Base request;
    request.Give(stepName);
    request.Propagate(steps);
    return request;
}

class OtherControls final : public cls_RecordOf<OtherControls, kprC_TypicalControls> {
public:
    static constexpr cls_ClassInfo Class{"TestOtherControls", "controls that no keyword knows"};
};

class OutputRequests : public testing::Test {
protected:
    OutputRequests() {
        store.AddPart("P", {1, 2}).mesh->AddNodeSet("my set", {2});
        store.model.AddInstance("I", "P");
        store.model.steps.Append("Initial", kprC_InitialStep());
    }

    std::string BodyOf(const cow_String& stepName) {
        oif_OutputRequestBuilder builder(store.Info());
        builder.Build();
        const qkw_KeywordList keywords = builder.StepDefinition(stepName);
        return Streamed([&](utl_Stream& stream) {
            for (int i = 0; i < keywords.Length(); ++i) keywords[i].ConstGet().Write(stream);
        });
    }

    template <class Print>
    void AddStepWithPrint(const char* name, kprC_AnalysisStep& step, const Print& print) {
        step.diagnosticPrint = mdl_ObjCow<kprC_DiagnosticPrint>(print);
        store.model.steps.Append(name, step);
    }

    TestStore store;
};

const std::string kControls = "** \n** CONTROLS\n** \n";
const std::string kSolverControls = "** \n** SOLVER CONTROLS\n** \n";
const std::string kRequests = "** \n** OUTPUT REQUESTS\n** \n";

} // namespace

TEST_F(OutputRequests, NoSteps_BuildNothing) {
    TestStore empty;
    oif_OutputRequestBuilder builder(empty.Info());
    builder.Build();
    EXPECT_EQ(builder.StepDefinition("Initial").Length(), 0);
}

TEST_F(OutputRequests, PlainStep_HasNothingNotEvenABanner) {
    store.model.steps.Append("S", kprC_StaticStep());
    EXPECT_EQ(BodyOf("S"), "");
}

TEST_F(OutputRequests, Everything_StandsInOrder) {
    kprC_StaticStep step;
    step.controls = mdl_ObjCow<kprC_Controls>(kprC_TypicalControls());
    step.solverControls = mdl_ObjCow<kprC_LinearCtrl>(kprC_LinearCtrl());
    step.restart = mdl_ObjCow<kprC_Restart>(kprC_StandardRestart());
    kprC_StandardDiagnosticPrint print;
    print.contact = true;
    step.diagnosticPrint = mdl_ObjCow<kprC_DiagnosticPrint>(print);
    kprC_StandardMonitor monitor;
    monitor.region = store.model.Region("I", "my set");
    step.monitor = mdl_ObjCow<kprC_Monitor>(monitor);
    store.model.steps.Append("S", step);
    EXPECT_EQ(BodyOf("S"), kControls + "*Controls, reset\n" + kSolverControls +
                               "*Solver Controls, reset\n*Solver Controls\n, \n" + kRequests +
                               "*Restart, write, frequency=1\n"
                               "*Print, contact=YES\n"
                               "*Monitor, dof=1, node=I.\"my set\", frequency=1\n");
}

TEST_F(OutputRequests, DefaultControls_HaveNoBanner) {
    kprC_StaticStep step;
    kprC_TypicalControls controls;
    controls.useDefault = true;
    kprC_LinearCtrl solver;
    solver.useDefault = true;
    step.controls = mdl_ObjCow<kprC_Controls>(controls);
    step.solverControls = mdl_ObjCow<kprC_LinearCtrl>(solver);
    store.model.steps.Append("S", step);
    EXPECT_EQ(BodyOf("S"), "");
}

TEST_F(OutputRequests, ControlsOfEveryClass_GetTheirKeyword) {
    kprC_CTEControls cte;
    cte.electricalPotential.Put(0, 1.0);
    kprC_CTDControls ctd;
    ctd.temperature.Put(0, 1.0);
    kprC_MassDiffusionControls diffusion;
    diffusion.concentration.Put(0, 1.0);
    kprC_HeatTransferControls heat;
    heat.temperature.Put(0, 1.0);
    kprC_PoreControls pore;
    pore.poreFluidPressure.Put(0, 1.0);
    kprC_ElectricalControls electrical;
    electrical.electricalPotential.Put(0, 1.0);
    kprC_TypicalControls typical;
    typical.rotation.Put(0, 1.0);
    const std::pair<const kprC_Controls*, const char*> all[] = {
        {&cte, "electrical potential"}, {&ctd, "temperature"},          {&diffusion, "concentration"},
        {&heat, "temperature"},         {&pore, "pore fluid pressure"}, {&electrical, "electrical potential"},
        {&typical, "rotation"}};
    int count = 0;
    for (const auto& [controls, field] : all) {
        kprC_StaticStep step;
        step.controls = mdl_ObjCow<kprC_Controls>(*controls);
        store.model.steps.Append(cow_String("S") + cow_String(++count), step);
    }
    count = 0;
    for (const auto& [controls, field] : all) {
        EXPECT_EQ(BodyOf(cow_String("S") + cow_String(++count)),
                  kControls + "*Controls, reset\n*Controls, parameters=field, field=" + field +
                      "\n1., , , , , , , \n");
    }
}

TEST_F(OutputRequests, ControlsOfAnotherClass_HaveTheBannerAlone) {
    kprC_StaticStep step;
    step.controls = mdl_ObjCow<kprC_Controls>(OtherControls());
    store.model.steps.Append("S", step);
    EXPECT_EQ(BodyOf("S"), kControls);
}

TEST_F(OutputRequests, MonitorWithoutARegion_IsNone) {
    kprC_StaticStep step;
    step.monitor = mdl_ObjCow<kprC_Monitor>(kprC_StandardMonitor());
    store.model.steps.Append("S", step);
    EXPECT_EQ(BodyOf("S"), "");
}

TEST_F(OutputRequests, PrintThatSaysNothingNew_HasTheBannerAllTheSame) {
    kprC_StaticStep step;
    AddStepWithPrint("S", step, kprC_StandardDiagnosticPrint());
    EXPECT_EQ(BodyOf("S"), kRequests);
}

TEST_F(OutputRequests, Prints_AreComparedWithTheLastOne) {
    kprC_StandardDiagnosticPrint print;
    print.contact = true;
    kprC_StaticStep step;
    AddStepWithPrint("A", step, print);
    store.model.steps.Append("B", kprC_StaticStep());
    AddStepWithPrint("C", step, print);
    AddStepWithPrint("D", step, kprC_StandardDiagnosticPrint());
    EXPECT_EQ(BodyOf("A"), kRequests + "*Print, contact=YES\n");
    EXPECT_EQ(BodyOf("B"), "");
    EXPECT_EQ(BodyOf("C"), kRequests);
    EXPECT_EQ(BodyOf("D"), kRequests + "*Print, contact=NO\n");
}

TEST_F(OutputRequests, PerturbationPrint_LeavesItsTwoNumbersBehindAndTheRestAsItWas) {
    kprC_StandardDiagnosticPrint standard;
    standard.contact = true;
    kprC_PerturbationDiagnosticPrint perturbation;
    perturbation.frequency = 4;
    perturbation.solve = true;
    kprC_StaticStep general;
    kprC_StaticLinearPerturbationStep linear;
    AddStepWithPrint("A", general, standard);
    AddStepWithPrint("B", linear, perturbation);
    AddStepWithPrint("C", linear, perturbation);
    AddStepWithPrint("D", general, standard);
    AddStepWithPrint("E", linear, perturbation);
    EXPECT_EQ(BodyOf("A"), kRequests + "*Print, contact=YES\n");
    EXPECT_EQ(BodyOf("B"), kRequests + "*Print, frequency=4, solve=YES\n");
    EXPECT_EQ(BodyOf("C"), kRequests);
    EXPECT_EQ(BodyOf("D"), kRequests + "*Print, frequency=1\n");
    // The standard record of D took the place of what the perturbation had left.
    EXPECT_EQ(BodyOf("E"), kRequests + "*Print, frequency=4, solve=YES\n");
}

TEST_F(OutputRequests, PrintsOfMixedKinds_StartFromTheSolversDefaults) {
    kprC_ExplicitDiagnosticPrint explicitPrint;
    explicitPrint.dmass = false;
    kprC_PerturbationDiagnosticPrint perturbation;
    perturbation.solve = true;
    kprC_StandardDiagnosticPrint standard;
    standard.modelChange = true;
    kprC_ExplicitDynamicsStep explicitStep;
    kprC_StaticLinearPerturbationStep linear;
    kprC_StaticStep general;
    AddStepWithPrint("A", explicitStep, explicitPrint);
    AddStepWithPrint("B", linear, perturbation);
    AddStepWithPrint("C", linear, perturbation);
    AddStepWithPrint("D", general, standard);
    AddStepWithPrint("E", explicitStep, explicitPrint);
    EXPECT_EQ(BodyOf("A"), kRequests + "*Print, dmass=NO\n");
    EXPECT_EQ(BodyOf("B"), kRequests + "*Print, solve=YES\n");
    EXPECT_EQ(BodyOf("C"), kRequests);
    EXPECT_EQ(BodyOf("D"), kRequests + "*Print, model change=YES\n");
    EXPECT_EQ(BodyOf("E"), kRequests + "*Print, dmass=NO\n");
}

TEST_F(OutputRequests, FieldRequest_CallsForTheBannerAlsoWithLoadCases) {
    kprC_StaticLinearPerturbationStep step;
    step.loadCases.Insert("LC", klcC_LoadCase());
    store.model.steps.Append("A", kprC_StaticStep());
    store.model.steps.Append("B", step);
    store.model.fieldOutputRequests.Insert("F", RequestFrom<korC_FieldOutput>("B", store.model.steps));
    EXPECT_EQ(BodyOf("A"), "");
    EXPECT_EQ(BodyOf("B"), kRequests + "** \n** FIELD OUTPUT: F\n** \n*Output, field, variable=PRESELECT\n");
}

TEST_F(OutputRequests, HistoryRequest_CallsForNoBannerWithLoadCases) {
    kprC_StaticLinearPerturbationStep step;
    store.model.steps.Append("A", step);
    step.loadCases.Insert("LC", klcC_LoadCase());
    store.model.steps.Append("B", step);
    auto request = RequestFrom<korC_HistoryOutput>("A", store.model.steps);
    request.Give("B");
    request.Propagate(store.model.steps);
    store.model.historyOutputRequests.Insert("H", request);
    EXPECT_EQ(BodyOf("A"),
              kRequests + "** \n** HISTORY OUTPUT: H\n** \n*Output, history, variable=PRESELECT\n");
    EXPECT_EQ(BodyOf("B"), "");
}
