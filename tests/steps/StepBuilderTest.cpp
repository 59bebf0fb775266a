#include "ProcedureCases.h"
#include "deck/oif_Writer.h"
#include "steps/oif_StepBuilder.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"
#include "support/TestFolder.h"

namespace {

constexpr char kRule[] = "** ----------------------------------------------------------------\n** \n";

/// A step of a procedure that there is not.
class UnknownStep final : public cls_RecordOf<UnknownStep, kprC_AnalysisStep> {
public:
    static constexpr cls_ClassInfo Class{"UnknownStep", "a step of an unknown procedure", 0x23C0079};
};

/// A model with an initial step.
class StepModel : public TestStore {
public:
    StepModel() { model.steps.Append("Initial", kprC_InitialStep()); }

    template <class R>
    StepModel& Add(const char* name, const R& step) {
        model.steps.Append(name, step);
        return *this;
    }
    /// The keywords of a step, or of one of its load cases, after building.
    qkw_KeywordList Keywords(const char* step, const char* loadCase = "") {
        if (builder_ == nullptr) {
            builder_ = std::make_unique<oif_StepBuilder>(Info());
            builder_->Build();
        }
        return static_cast<qkw_BuilderComponent&>(*builder_).StepDefinition(step, loadCase);
    }
    std::string Text(const char* step, const char* loadCase = "") {
        const qkw_KeywordList keywords = Keywords(step, loadCase);
        std::string text;
        for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
        return text;
    }
    /// The step's text without its banner.
    std::string Body(const char* step) {
        const std::string banner = kRule + ("** STEP: " + std::string(step)) + "\n** \n";
        const std::string text = Text(step);
        EXPECT_EQ(text.substr(0, banner.size()), banner);
        return text.substr(banner.size());
    }
    /// The text of *Step.
    std::string Line(const char* step) {
        const std::string body = Body(step);
        return body.substr(0, body.find('\n'));
    }

private:
    std::unique_ptr<oif_StepBuilder> builder_;
};

/// What a step of default values adds behind *Step, and how many keywords.
template <class R>
void ExpectKeywords(int count, const std::string& expected, R step = R()) {
    SCOPED_TRACE(R::Class.name);
    StepModel store;
    store.model.analysisProduct = 0;
    store.Add("S", step);
    const qkw_KeywordList keywords = store.Keywords("S");
    // The banner and *Step are the first two.
    ASSERT_EQ(keywords.Length(), count + 2);
    std::string text;
    for (int i = 2; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    EXPECT_EQ(text, expected);
}

template <class R>
R WithNlgeom(bool on) {
    R step;
    step.nlgeom = on ? kprC_Step::NlgeomEnm::ON : kprC_Step::NlgeomEnm::OFF;
    return step;
}

/// A step with every damping definition that its class has.
template <class R>
R WithAllDamping() {
    R step;
    step.compositeDamping = kprC_CompositeDamping();
    step.directDamping = kprC_DirectDamping();
    step.rayleighDamping = kprC_RayleighDamping();
    step.directDampingByFrequency = kprC_DirectDampingByFrequency();
    step.rayleighDampingByFrequency = kprC_RayleighDampingByFrequency();
    if constexpr (requires { step.structuralDamping; }) {
        step.structuralDamping = kprC_StructuralDamping();
        step.structuralDampingByFrequency = kprC_StructuralDampingByFrequency();
    }
    return step;
}

constexpr char kDampingA[] = "*Modal Damping, modal=COMPOSITE\n"
                             "*Modal Damping\n"
                             "*Modal Damping, rayleigh\n"
                             "*Modal Damping, definition=FREQUENCY RANGE\n"
                             "*Modal Damping, rayleigh, definition=FREQUENCY RANGE\n";
constexpr char kDampingB[] = "*Modal Damping, modal=COMPOSITE\n"
                             "*Modal Damping\n"
                             "*Modal Damping, rayleigh\n"
                             "*Modal Damping, structural\n"
                             "*Modal Damping, definition=FREQUENCY RANGE\n"
                             "*Modal Damping, rayleigh, definition=FREQUENCY RANGE\n"
                             "*Modal Damping, structural, definition=FREQUENCY RANGE\n";

} // namespace

TEST(StepBuilder, NoStepsOrOnlyTheInitialOne_AddNothing) {
    TestStore empty;
    oif_StepBuilder builder(empty.Info());
    builder.Build();
    EXPECT_TRUE(static_cast<qkw_BuilderComponent&>(builder).StepDefinition("Initial").IsEmpty());
    StepModel store;
    EXPECT_TRUE(store.Keywords("Initial").IsEmpty());
}

TEST(StepBuilder, Step_OpensWithItsBanner) {
    StepModel store;
    store.Add("my step", kprC_StaticLinearPerturbationStep());
    EXPECT_EQ(store.Text("my step"), "** ----------------------------------------------------------------\n"
                                     "** \n"
                                     "** STEP: my step\n"
                                     "** \n"
                                     "*Step, name=\"my step\", perturbation\n"
                                     "*Static\n");
}

TEST(StepBuilder, EveryProcedure_AddsItsKeywords) {
    ExpectKeywords<kprC_AnnealStep>(1, "*Anneal\n");
    ExpectKeywords<kprC_BuckleStep>(1, "*Buckle\n10, , 18, 30\n");
    ExpectKeywords<kprC_CoupledTempDisplacementStep>(
        2, "*Coupled Temperature-Displacement\n1., 1., 1e-05, 1.\n");
    ExpectKeywords<kprC_CoupledThermalElectricStep>(
        2, "*Coupled Thermal-Electrical, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n");
    ExpectKeywords<kprC_ExplicitDynamicsStep>(2, "*Dynamic, Explicit\n, 1.\n*Bulk Viscosity\n0.06, 1.2\n");
    ExpectKeywords<kprC_FrequencyStep>(1, "*Frequency, eigensolver=Lanczos, sim=NO, acoustic coupling=on, "
                                          "normalization=displacement\n, , , , , \n");
    ExpectKeywords<kprC_GeostaticStep>(1, "*Geostatic\n");
    ExpectKeywords<kprC_HeatTransferStep>(1, "*Heat Transfer, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n");
    ExpectKeywords<kprC_ImplicitDynamicsStep>(1, "*Dynamic,haftol=0.\n1.,1.,1e-05,1.\n");
    ExpectKeywords<kprC_MassDiffusionStep>(1, "*Mass Diffusion, end=PERIOD, dcmax=0.\n1., 1., 1e-05, 1., \n");
    ExpectKeywords<kprC_ModalDynamicsStep>(1, "*Modal dynamic, continue=NO\n1., 1.\n");
    ExpectKeywords<kprC_RandomResponseStep>(1, "*Random Response\n");
    ExpectKeywords<kprC_ResponseSpectrumStep>(1, "*Response spectrum, sum=ABS\n");
    ExpectKeywords<kprC_SoilsStep>(1, "*Soils, consolidation, end=PERIOD, utol=1.0\n1., 1., 1e-05, 1., \n");
    ExpectKeywords<kprC_StaticStep>(1, "*Static\n1., 1., 1e-05, 1.\n");
    ExpectKeywords<kprC_StaticRiksStep>(1, "*Static, riks\n1., 1., 1e-05, , , \n");
    ExpectKeywords<kprC_StaticLinearPerturbationStep>(1, "*Static\n");
    ExpectKeywords<kprC_SteadyStateDirectStep>(1, "*Steady State Dynamics, direct\n");
    ExpectKeywords<kprC_SteadyStateModalStep>(1, "*Steady State Dynamics\n");
    ExpectKeywords<kprC_SubspaceDynamicsStep>(1, "*Dynamic, subspace\n1., 1., \n");
    ExpectKeywords<kprC_ViscoStep>(1, "*Visco, cetol=0.\n1., 1., 1e-05, 1.\n");
    ExpectKeywords<kprC_TempDisplacementDynamicsStep>(
        2, "*Dynamic Temperature-displacement, Explicit\n, 1.\n*Bulk Viscosity\n0.06, 1.2\n");
    ExpectKeywords<kprC_ComplexFrequencyStep>(1, "*Complex Frequency, friction damping=NO\n, , , \n");
    ExpectKeywords<kprC_SteadyStateSubspaceStep>(
        1, "*Steady State Dynamics, subspace projection, friction damping=NO\n");
}

TEST(StepBuilder, SeparatedTechnique_IsWrittenForCoupledStepsOnly) {
    constexpr auto separated = kprC_Step::SolutionTechniqueEnm::SEPARATED;
    kprC_CoupledTempDisplacementStep coupled;
    coupled.solutionTechnique = separated;
    ExpectKeywords(
        2, "*Coupled Temperature-Displacement\n1., 1., 1e-05, 1.\n*Solution Technique, type=SEPARATED\n",
        coupled);
    kprC_CoupledThermalElectricStep electric;
    electric.solutionTechnique = separated;
    ExpectKeywords(2,
                   "*Coupled Thermal-Electrical, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n"
                   "*Solution Technique, type=SEPARATED\n",
                   electric);
    kprC_StaticStep still;
    still.solutionTechnique = separated;
    ExpectKeywords(1, "*Static\n1., 1., 1e-05, 1.\n", still);
}

TEST(StepBuilder, SubspaceVectors_SelectTheModes) {
    kprC_SubspaceDynamicsStep step;
    step.vectors = 10;
    ExpectKeywords(2, "*Dynamic, subspace, vectors=10\n1., 1., \n*Select Eigenmodes, generate\n1, 10, 1\n",
                   step);
    // Any number but 0.
    step.vectors = -2;
    ExpectKeywords(2, "*Dynamic, subspace\n1., 1., \n*Select Eigenmodes, generate\n1, -2, 1\n", step);
}

TEST(StepBuilder, DampingOfTransientAndSpectrumSteps_HasNoStructuralForms) {
    ExpectKeywords(6, std::string("*Modal dynamic, continue=NO\n1., 1.\n") + kDampingA,
                   WithAllDamping<kprC_ModalDynamicsStep>());
    ExpectKeywords(6, std::string("*Response spectrum, sum=ABS\n") + kDampingA,
                   WithAllDamping<kprC_ResponseSpectrumStep>());
}

TEST(StepBuilder, DampingOfRandomAndHarmonicSteps_HasAllForms) {
    ExpectKeywords(8, std::string("*Random Response\n") + kDampingB,
                   WithAllDamping<kprC_RandomResponseStep>());
    ExpectKeywords(8, std::string("*Steady State Dynamics\n") + kDampingB,
                   WithAllDamping<kprC_SteadyStateModalStep>());
}

TEST(StepBuilder, MassScalingDefinitions_FollowBulkViscosityInTheirOrder) {
    StepModel store;
    store.AddPart("P", {1}).mesh->AddNodeSet("a b", {1});
    store.model.AddInstance("I", "P");
    kprC_MassScaling variable;
    variable.type = kprC_MassScaling::MassScalingTypeEnm::DISABLE_THROUGHOUT_STEP;
    kprC_MassScaling fixed;
    fixed.type = kprC_MassScaling::MassScalingTypeEnm::REINITIALIZE;
    fixed.region = store.model.Region("I", "a b");
    const std::string expected = "** Mass Scaling: Disable Throughout Step\n"
                                 "*Variable Mass Scaling\n"
                                 "** Mass Scaling: Reinitialize Mass\n"
                                 "**               I.\"a b\"\n"
                                 "*Fixed Mass Scaling, elset=I.\"a b\"\n"
                                 "** Mass Scaling: Disable Throughout Step\n"
                                 "*Variable Mass Scaling\n";
    const cow_List<kprC_MassScaling> definitions(variable, fixed, variable);
    kprC_ExplicitDynamicsStep step;
    step.massScaling = definitions;
    kprC_TempDisplacementDynamicsStep coupled;
    coupled.massScaling = definitions;
    store.Add("S", step).Add("T", coupled);
    EXPECT_EQ(store.Body("S"),
              "*Step, name=S\n*Dynamic, Explicit\n, 1.\n*Bulk Viscosity\n0.06, 1.2\n" + expected);
    EXPECT_EQ(store.Body("T"), "*Step, name=T\n*Dynamic Temperature-displacement, Explicit\n, 1.\n"
                               "*Bulk Viscosity\n0.06, 1.2\n" +
                                   expected);
}

TEST(StepBuilder, MonitoredNode_IsNamedFromTheAssembly) {
    StepModel store;
    store.AddPart("P", {1}).mesh->AddNodeSet("tip", {1});
    store.model.AddInstance("I 1", "P");
    kprC_StaticRiksStep step;
    step.nodeMonitored = true;
    step.dof = 2;
    step.dofValue = 0.5;
    step.region = store.model.Region("I 1", "tip");
    store.Add("S", step);
    EXPECT_EQ(store.Body("S"), "*Step, name=S\n*Static, riks\n1., 1., 1e-05, , , \"I 1\".tip, 2, 0.5\n");
}

TEST(StepBuilder, OtherFormat_WordsCreepDifferently) {
    class OtherFormatInfo : public oif_ModelInfo {
    public:
        explicit OtherFormatInfo(const ddb_Model& model) : oif_ModelInfo(model) { SetV6Format(false); }
    };
    StepModel store;
    kprC_ViscoStep visco;
    visco.creepIntegration = kprC_ViscoStep::CreepIntegrationEnm::EXPLICIT;
    kprC_CoupledTempDisplacementStep coupled;
    coupled.creep = kprC_CoupledTempDisplacementStep::CreepEnm::NONE;
    store.Add("V", visco).Add("C", coupled);
    const auto procedure = [&](qkw_BuilderComponent& builder, const char* step) {
        return Written(builder.StepDefinition(step)[2].ConstGet());
    };
    OtherFormatInfo info(store.View());
    oif_StepBuilder other(info);
    other.Build();
    EXPECT_EQ(procedure(other, "V"), "*Visco, cetol=0., explicit\n1., 1., 1e-05, 1.\n");
    EXPECT_EQ(procedure(other, "C"), "*Coupled Temperature-Displacement, no creep\n1., 1., 1e-05, 1.\n");
    oif_StepBuilder usual(store.Info());
    usual.Build();
    EXPECT_EQ(procedure(usual, "V"), "*Visco, cetol=0., creep=explicit\n1., 1., 1e-05, 1.\n");
    EXPECT_EQ(procedure(usual, "C"), "*Coupled Temperature-Displacement, creep=none\n1., 1., 1e-05, 1.\n");
}

TEST(StepBuilder, ExplicitJob_StartsWithLargeDisplacements) {
    StepModel store;
    store.Add("On", WithNlgeom<kprC_ExplicitDynamicsStep>(true))
        .Add("Off", WithNlgeom<kprC_ExplicitDynamicsStep>(false))
        .Add("On again", WithNlgeom<kprC_ExplicitDynamicsStep>(true));
    EXPECT_EQ(store.Line("On"), "*Step, name=On");
    EXPECT_EQ(store.Line("Off"), "*Step, name=Off, nlgeom=NO");
    // Turning it off does not end what was once in force.
    EXPECT_EQ(store.Line("On again"), "*Step, name=\"On again\"");
}

TEST(StepBuilder, OtherJob_StartsWithoutThem) {
    StepModel store;
    store.model.analysisProduct = 0;
    store.Add("Off", WithNlgeom<kprC_ExplicitDynamicsStep>(false))
        .Add("On", WithNlgeom<kprC_TempDisplacementDynamicsStep>(true))
        .Add("Off again", WithNlgeom<kprC_AnnealStep>(false));
    EXPECT_EQ(store.Line("Off"), "*Step, name=Off");
    EXPECT_EQ(store.Line("On"), "*Step, name=On, nlgeom=YES");
    EXPECT_EQ(store.Line("Off again"), "*Step, name=\"Off again\", nlgeom=NO");
}

TEST(StepBuilder, StaticStepsBehindOneWithLargeDisplacements_AllKeepThem) {
    StepModel store;
    store.Add("A", WithNlgeom<kprC_StaticStep>(false))
        .Add("B", WithNlgeom<kprC_StaticStep>(true))
        .Add("C", WithNlgeom<kprC_StaticStep>(false))
        .Add("D", kprC_BuckleStep())
        .Add("E", WithNlgeom<kprC_GeostaticStep>(false));
    EXPECT_EQ(store.Line("A"), "*Step, name=A");
    EXPECT_EQ(store.Line("B"), "*Step, name=B, nlgeom=YES");
    EXPECT_EQ(store.Line("C"), "*Step, name=C, nlgeom=YES");
    EXPECT_EQ(store.Line("D"), "*Step, name=D, perturbation");
    EXPECT_EQ(store.Line("E"), "*Step, name=E, nlgeom=YES");
}

TEST(StepBuilder, ModalDynamics_ContinuesTheStepBefore) {
    kprC_ModalDynamicsStep modal;
    modal.continueAnalysis = true;
    StepModel store;
    store.Add("First", modal)
        .Add("Modes", kprC_FrequencyStep())
        .Add("Behind modes", modal)
        .Add("Behind modal", modal)
        .Add("Linear", kprC_StaticLinearPerturbationStep())
        .Add("Behind linear", modal);
    const auto continues = [&](const char* step) {
        return store.Body(step).find("*Modal dynamic, continue=YES\n") != std::string::npos;
    };
    EXPECT_FALSE(continues("First"));
    EXPECT_FALSE(continues("Behind modes"));
    EXPECT_TRUE(continues("Behind modal"));
    EXPECT_TRUE(continues("Behind linear"));
}

TEST(StepBuilder, LoadCases_HaveTheirBannerBeforeTheFirst) {
    kprC_StaticLinearPerturbationStep step;
    step.loadCases.Insert("b", klcC_LoadCase());
    step.loadCases.Insert("a a", klcC_LoadCase());
    StepModel store;
    store.Add("S", step);
    EXPECT_EQ(store.Body("S"), "*Step, name=S, perturbation\n*Static\n");
    EXPECT_EQ(store.Text("S", "a a"), "** \n** LOAD CASES\n** \n*Load Case, name=\"a a\"\n");
    EXPECT_EQ(store.Text("S", "b"), "*Load Case, name=b\n");
}

TEST(StepBuilder, LoadCaseWithoutName_AddsNothingAndTakesNoBanner) {
    kprC_StaticLinearPerturbationStep step;
    step.loadCases.Insert("", klcC_LoadCase());
    StepModel store;
    store.Add("S", step);
    EXPECT_EQ(store.Body("S"), "*Step, name=S, perturbation\n*Static\n");
    StepModel both;
    step.loadCases.Insert("x", klcC_LoadCase());
    both.Add("S", step);
    EXPECT_EQ(both.Body("S"), "*Step, name=S, perturbation\n*Static\n");
    EXPECT_EQ(both.Text("S", "x"), "** \n** LOAD CASES\n** \n*Load Case, name=x\n");
}

TEST(StepBuilder, UnknownProcedure_Raises) {
    if (cls_Classes().Find(UnknownStep::TypeId()) == nullptr) cls_Classes().Add<UnknownStep>();
    StepModel store;
    store.Add("S", UnknownStep());
    oif_StepBuilder builder(store.Info());
    EXPECT_EQ(Raised([&] { builder.Build(); }), "Unimplemented procedure print method");
}

TEST(StepBuilder, StepsKeywords_OutliveTheBuilder) {
    StepModel store;
    store.Add("S", kprC_StaticStep());
    qkw_KeywordList keywords;
    {
        oif_StepBuilder builder(store.Info());
        builder.Build();
        keywords = static_cast<qkw_BuilderComponent&>(builder).StepDefinition("S");
    }
    EXPECT_EQ(Written(keywords[1].ConstGet()), "*Step, name=S\n");
}

TEST(StepDeck, ComplexFrequencyStep_FailsAtItsLineAndKeepsWhatStandsBefore) {
    StepModel store;
    store.Add("Modes", kprC_FrequencyStep()).Add("Complex", kprC_ComplexFrequencyStep());
    const TestFolder folder;
    EXPECT_EQ(Raised([&] { oif_Writer(store.odb).WriteInputFile(folder.Path("job").c_str()); }),
              "Unimplemented function to write out *Step card");
    const std::string deck = folder.Text("job.inp");
    const std::string end = "*End Step\n" + std::string(kRule) + "** STEP: Complex\n** \n*Step, name=Complex";
    ASSERT_GE(deck.size(), end.size());
    EXPECT_EQ(deck.substr(deck.size() - end.size()), end);
}
