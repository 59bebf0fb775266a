#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

namespace {

class Info : public oif_ModelInfo {
public:
    using oif_ModelInfo::oif_ModelInfo;
    using oif_ModelInfo::SetV6Format;
};

} // namespace

TEST(Model, OneStep_HasNoAnalysisStepNames) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    EXPECT_EQ(store.Info().Model().InitialStepName(), "Initial");
    EXPECT_EQ(store.Info().Model().FirstAnalysisStepName(), "");
    EXPECT_EQ(store.Info().Model().FirstGeneralAnalysisStepName(), "");
}

TEST(Model, NoSteps_HaveNoNames) {
    TestStore store;
    EXPECT_EQ(store.Info().Model().InitialStepName(), "");
    EXPECT_FALSE(store.Info().ExplicitJob());
}

TEST(Model, PerturbationThenGeneral_NamesBoth) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    store.model.steps.Append("Freq", kprC_FrequencyStep());
    store.model.steps.Append("Load", kprC_StaticStep());
    EXPECT_EQ(store.Info().Model().FirstAnalysisStepName(), "Freq");
    EXPECT_EQ(store.Info().Model().FirstGeneralAnalysisStepName(), "Load");
}

TEST(Model, SecondInitialStep_RaisesBeforeAnyFileIsTouched) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    store.model.steps.Append("Again", kprC_InitialStep());
    try {
        store.Info();
        FAIL() << "nothing raised";
    } catch (const QRXBasException& failure) {
        EXPECT_EQ(std::string(failure.what())
                      .rfind("class check failed: found kprC_InitialStep, "
                             "expected kprC_AnalysisStep (oif_Model.cpp:",
                             0),
                  0U)
            << failure.what();
        EXPECT_STREQ(failure.Context(), "step 'Again'");
    }
}

TEST(Model, ViewOverTheStore_GivesWhatTheModelHolds) {
    TestStore store;
    odiK_Model& model = store.model;
    model.absoluteZero = -273.15;
    model.stefanBoltzmann = 5.67e-8;
    model.waveFormulation = "TOTAL";
    model.restartJob = "old";
    model.restartStep = "S";
    model.restartIncrement = 3;
    model.endRestartStep = true;
    model.globalJob = "global";
    model.shellToSolid = true;
    model.description = "for people";
    model.materials.Insert("Steel", kmaC_Material());
    model.sections.Insert("C", kseC_ConnectorSection());
    model.timePoints.Insert("T", kprC_TimePoint());
    model.adaptiveMeshControls.Insert("A", kadC_AdptMeshCtrl());
    model.adaptiveMeshConstraints.Insert("M", kprC_AdptMeshCons());
    model.contactInitializations.Insert("I", kinC_ContactInitialization());
    const qkw_Model& view = store.Info().Model();
    EXPECT_EQ(view.AbsoluteZero(), -273.15);
    EXPECT_EQ(view.StefanBoltzmann(), 5.67e-8);
    EXPECT_EQ(view.WaveFormulation(), mdl_Model::FormulationEnm::TOTAL);
    EXPECT_EQ(view.RestartJob(), "old");
    EXPECT_EQ(view.RestartStep(), "S");
    EXPECT_EQ(view.RestartIncrement(), 3);
    EXPECT_TRUE(view.EndRestartStep());
    EXPECT_EQ(view.GlobalJob(), "global");
    EXPECT_TRUE(view.ShellToSolid());
    EXPECT_TRUE(view.Materials().IsMember("Steel"));
    EXPECT_TRUE(view.Sections().IsMember("C"));
    EXPECT_TRUE(view.SurfaceProperties().IsMember("C"));
    EXPECT_TRUE(view.TimePoints().IsMember("T"));
    EXPECT_TRUE(view.AdaptiveMeshControls().IsMember("A"));
    EXPECT_TRUE(view.AdaptiveMeshConstraints().IsMember("M"));
    EXPECT_TRUE(view.Initializations().IsMember("I"));
    EXPECT_EQ(view.Steps().Size(), 0);
    const std::unique_ptr<qkw_Model> copy(view.Copy());
    EXPECT_TRUE(copy->Materials().IsMember("Steel"));
}

TEST(Model, WhatIsNotReadFromTheStore_IsAlwaysEmptyOrZero) {
    TestStore store;
    store.model.description = "for people";
    const qkw_Model& view = store.Info().Model();
    EXPECT_TRUE(view.Amplitudes().IsEmpty());
    EXPECT_TRUE(view.BCs().IsEmpty());
    EXPECT_TRUE(view.BeamProfiles().IsEmpty());
    EXPECT_TRUE(view.Constraints().IsEmpty());
    EXPECT_TRUE(view.Filters().IsEmpty());
    EXPECT_TRUE(view.ContactControls().IsEmpty());
    EXPECT_TRUE(view.Stabilizations().IsEmpty());
    EXPECT_TRUE(view.InteractionProperties().IsEmpty());
    EXPECT_TRUE(view.Interactions().IsEmpty());
    EXPECT_TRUE(view.Loads().IsEmpty());
    EXPECT_TRUE(view.FieldOutputs().IsEmpty());
    EXPECT_TRUE(view.HistoryOutputs().IsEmpty());
    EXPECT_TRUE(view.IntegratedOutputSections().IsEmpty());
    EXPECT_TRUE(view.Fields().IsEmpty());
    EXPECT_TRUE(view.RemeshingRules().IsEmpty());
    EXPECT_TRUE(view.AnalyticalFields().IsEmpty());
    EXPECT_TRUE(view.DiscreteFields().IsEmpty());
    EXPECT_TRUE(view.Tasks().IsEmpty());
    EXPECT_EQ(view.UniversalGasConstant(), 0.0);
    EXPECT_EQ(view.ModelType(), 1);
    EXPECT_EQ(view.WaveFormulation(), mdl_Model::FormulationEnm::NOT_SET);
    EXPECT_EQ(view.Description(), "");
    EXPECT_FALSE(view.aquaAnalysis());
    EXPECT_EQ(view.seabedElevation(), 0.0);
    EXPECT_EQ(view.stillFluidSurfaceElevation(), 0.0);
    EXPECT_EQ(view.gravitationalConstant(), 0.0);
    EXPECT_EQ(view.fluidMassDensity(), 0.0);
    EXPECT_TRUE(view.steadyCurrentData().IsEmpty());
    EXPECT_EQ(view.Name(), "");
}

TEST(ModelInfo, InstanceOfTenNodes_HandsOutEleven) {
    TestStore store;
    store.AddPart("P", {1, 2, 3, 4, 5, 6, 7, 8, 9, 10});
    store.model.AddInstance("I", "P");
    oif_ModelInfo& info = store.Info();
    EXPECT_EQ(info.GetNewNodeIndex("I", false), 11);
    EXPECT_EQ(info.GetNewNodeIndex("I", false), 11);
    EXPECT_EQ(info.GetNewNodeIndex("I", true), 11);
    EXPECT_EQ(info.GetNewNodeIndex("I", true), 12);
}

TEST(ModelInfo, IncrementByThree_EndsAtThirteen) {
    TestStore store;
    store.AddPart("P", {1, 2, 3, 4, 5, 6, 7, 8, 9, 10});
    store.model.AddInstance("I", "P");
    EXPECT_EQ(store.Info().IncrementNodeIndex("I", 3), 13);
    EXPECT_EQ(store.Info().GetNewNodeIndex("I", true), 14);
}

TEST(ModelInfo, Elements_CountLikeNodes) {
    TestStore store;
    store.AddPart("P", {1, 2}).mesh->AddElements("T3D2", {5, 6}, 2, {1, 2, 2, 1});
    store.model.AddInstance("I", "P");
    EXPECT_EQ(store.Info().GetNewElementIndex("I", true), 3);
    EXPECT_EQ(store.Info().IncrementElementIndex("I", 2), 5);
    EXPECT_EQ(store.Info().GetNewElementIndex("I", false), 6);
}

TEST(ModelInfo, AssemblyWithoutMesh_BeginsAtOne) {
    TestStore store;
    EXPECT_EQ(store.Info().GetNewNodeIndex("", true), 1);
    EXPECT_EQ(store.Info().GetNewElementIndex("", true), 1);
    EXPECT_EQ(store.Info().TeachingNodes(), 0);
}

TEST(ModelInfo, UnknownInstance_Raises) {
    TestStore store;
    EXPECT_EQ(Raised([&] { store.Info().GetNewNodeIndex("I", false); }), "cow_Map: no entry named 'I'");
    EXPECT_EQ(Raised([&] { store.Info().AssyNodeOffsets("I"); }), "cow_Map: no entry named 'I'");
}

TEST(ModelInfo, MeshNames_FollowTheMeshIndices) {
    TestStore store;
    store.AddPart("P", {1, 2, 3});
    store.model.AddInstance("b", "P");
    store.model.AddInstance("a", "P");
    store.model.AssemblyMesh().SetNodes({7}, {0.0F, 0.0F, 0.0F});
    oif_ModelInfo& info = store.Info();
    EXPECT_EQ(info.InstanceName(0), "");
    EXPECT_EQ(info.InstanceName(1), "a");
    EXPECT_EQ(info.InstanceName(2), "b");
    EXPECT_EQ(info.AssyElementOffsetsID(1), 0);
    EXPECT_EQ(info.AssyNodeOffsetsID(2), 0);
    EXPECT_EQ(info.TeachingNodes(), 7);
    EXPECT_EQ(info.GetNewNodeIndex("", false), 2);
}

TEST(ModelInfo, EntryThatIsNoPartInstance_IsPassedOver) {
    TestStore store;
    store.AddPart("P", {1, 2, 3});
    store.model.AddOtherEntry("I", "P");
    EXPECT_EQ(store.Info().TeachingNodes(), 0);
    EXPECT_EQ(Raised([&] { store.Info().GetNewNodeIndex("I", false); }), "cow_Map: no entry named 'I'");
}

TEST(ModelInfo, OtherFormat_NumbersThroughTheWholeModel) {
    TestStore store;
    store.AddPart("P", {1, 2, 3});
    store.model.AddInstance("a", "P");
    store.model.AddInstance("b", "P");
    Info info(store.View());
    EXPECT_TRUE(info.V6Format());
    info.SetV6Format(false);
    EXPECT_EQ(info.GetNewNodeIndex("a", false), 7);
    EXPECT_EQ(info.GetNewNodeIndex("a", true), 7);
    EXPECT_EQ(info.GetNewNodeIndex("b", true), 8);
    EXPECT_EQ(info.IncrementNodeIndex("b", 3), 11);
    EXPECT_EQ(info.GetNewNodeIndex("a", false), 12);
}

TEST(ModelInfo, ExplicitStepInLastPlace_MakesTheJobExplicit) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    store.model.steps.Append("A", kprC_StaticStep());
    store.model.steps.Append("B", kprC_ExplicitDynamicsStep());
    EXPECT_TRUE(store.Info().ExplicitJob());
    EXPECT_EQ(store.Info().AnalysisProduct(), kprC_AnalysisProductEnm::EXPLICIT);
}

TEST(ModelInfo, ExplicitStepInFirstPlace_DoesNot) {
    TestStore store;
    store.model.steps.Append("A", kprC_ExplicitDynamicsStep());
    EXPECT_FALSE(store.Info().ExplicitJob());
    EXPECT_EQ(store.Info().AnalysisProduct(), kprC_AnalysisProductEnm::IMPLICIT);
}

TEST(ModelInfo, GetOrientationName_AddsTheSuffixOnlyWithAnAngle) {
    TestStore store;
    odiK_Datum datum;
    datum.name = "Csys-1";
    const dtmC_DatumRef ref = store.model.AddDatum(datum);
    datum.name = "my csys";
    const dtmC_DatumRef blank = store.model.AddDatum(datum);
    EXPECT_EQ(store.Info().GetOrientationName(ref, 0.0, "S"), "Csys-1");
    EXPECT_EQ(store.Info().GetOrientationName(ref, 1e-300, "S"), "Csys-1_S_");
    EXPECT_EQ(store.Info().GetOrientationName(ref, 30.0, ""), "Csys-1");
    EXPECT_EQ(store.Info().GetOrientationName(blank, 30.0, "S"), "\"my csys_S_\"");
}

TEST(ModelInfo, NullDatum_HasTheEmptyName) {
    TestStore store;
    EXPECT_EQ(store.Info().GetOrientationName(dtmC_DatumRef(), 0.0, ""), "");
}

TEST(ModelInfo, WhatHasNoSourceHere_AnswersNoOrNothing) {
    TestStore store;
    oif_ModelInfo& info = store.Info();
    EXPECT_EQ(info.Job(), nullptr);
    EXPECT_EQ(info.Assy(), nullptr);
    EXPECT_TRUE(info.UseNodeLabels("I"));
    EXPECT_TRUE(info.UseElemLabels("I"));
    EXPECT_FALSE(info.AttachmentDataFromInstance(1));
    EXPECT_FALSE(info.VertexSurfacePairsFromInstance(1));
    EXPECT_EQ(info.SubstructureElems(), nullptr);
    EXPECT_FALSE(info.IsSubstructureInstance(1));
    EXPECT_STREQ(qkw_ModelInfo::RefPtSuffix(), "-RefPt_");
    EXPECT_STREQ(qkw_ModelInfo::AttachmentPtSuffix(), "-AttPt_");
}
