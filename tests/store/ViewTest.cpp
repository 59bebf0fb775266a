#include "store_interface/model/odb_Odb.h"
#include "store_interface/records/part_attributes/bme_MapPropertyArray.h"

#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <cmath>
#include <map>

namespace {

/// A store with one part seen from two instances, an instance with a mesh of its own, an entry that is no
/// part instance, and an assembly with a reference point and a connector to an instance.
class StoreViews : public testing::Test {
protected:
    void SetUp() override {
        odiK_Model& m = store.AddModel("Default Model");
        model = &m;
        odiK_Part& part = m.AddPart("Part");
        part.solverInput = "part text\n";
        part.mesh.Reset(new odiK_Mesh());
        part.mesh->SetNodes({5, 7, 9}, {0, 0, 0, 1.5F, 0, 0, 1.5F, 2, 3});
        bme_ElemCtrlParams controls;
        controls.hourglass = bme_ElemCtrlParams::HourglassEnm::ENHANCED;
        part.mesh->AddElements("T3D2", {1, 2}, 2, {5, 7, 7, 9}, controls);
        part.mesh->AddElements("S3", {11}, 3, {9, 7, 5});
        part.mesh->AddNodeSet("Ends", {5, 9});
        part.mesh->AddElementSet("All", {1, 2, 11});
        part.mesh->AddSurface("Top", {{11, -1, "SPOS"}}, true);
        part.attributes.sectionAssignments = {{"All", Record(ptoC_SectionAssignment())}};
        part.attributes.materialOrientations = {{"All", Record(ptoC_MaterialOrientation())}};
        part.attributes.beamOrientations = {{"All", Record(ptoC_BeamOrientation())}};
        m.AddPart("Alone");
        odiK_Instance& second = m.AddInstance("I-2", "Part");
        second.solverInput = "instance text\n";
        second.translation[0] = 4.0F;
        second.rotation[2] = 0.5F;
        m.AddInstance("I-1", "Part");
        m.AddInstance("I-3", "Alone");
        m.AddOtherEntry("H", "Part");
        m.AssemblyObject().name = "Root";
        m.AssemblyObject().solverInput = "assembly text\n";
    }

    static mdl_ObjCow<ptoC_PartAttribute> Record(const ptoC_PartAttribute& record) {
        return mdl_ObjCow<ptoC_PartAttribute>(record);
    }

    void AddAssemblyMesh() {
        odiK_Mesh& mesh = model->AssemblyMesh();
        mesh.SetNodes({100}, {9, 9, 9});
        const int foreign = mesh.AddForeignNode("I-2", 7);
        CollectedProblems problems;
        mesh.AddElementsByIndex("CONN3D2", {1}, 2, {0, foreign}, {}, problems);
        const int own[] = {100};
        const int other[] = {9, 5};
        const odiK_MemberInput members[] = {{"", own, {}}, {"I-2", other, {}}};
        model->AddAssemblySet("RP", res_SetTypeEnm::NODES, members);
        const odiK_MemberInput elements[] = {{"", {}, {}}};
        model->AddAssemblySet("Wires", res_SetTypeEnm::ELEMENTS, elements);
    }

    ddb_Model View() const { return store.ddb().model("Default Model"); }
    ddb_PartInstance Instance(const char* name) const {
        auto it = View().rootAssembly().instance().createIterator();
        for (; !it.isDone(); it.next()) {
            if (it.currentKey() == name) return ddb_PartInstance(it.currentValue());
        }
        throw std::runtime_error("no such instance in the test");
    }

    odb_Odb store;
    odiK_Model* model = nullptr;
};

TEST_F(StoreViews, ModelData_ComeOutAsTheyStand) {
    model->solverInput = "closing\n";
    model->topLevelSolverInput = "opening\n";
    model->absoluteZero = -273.15;
    model->stefanBoltzmann = 5.67e-8;
    model->waveFormulation = "TOTAL";
    model->restartJob = "job";
    model->restartStep = "Step-1";
    model->restartIncrement = 3;
    model->endRestartStep = true;
    model->globalJob = "global";
    model->shellToSolid = true;
    const ddb_Model view = View();
    EXPECT_EQ(view.solverInput(), "closing\n");
    EXPECT_EQ(view.topLevelSolverInput(), "opening\n");
    EXPECT_EQ(view.absoluteZero(), -273.15);
    EXPECT_EQ(view.stefanBoltzmann(), 5.67e-8);
    EXPECT_EQ(view.waveFormulation(), "TOTAL");
    EXPECT_EQ(view.restartJob(), "job");
    EXPECT_EQ(view.restartStep(), "Step-1");
    EXPECT_EQ(view.restartIncrement(), 3);
    EXPECT_TRUE(view.endRestartStep());
    EXPECT_EQ(view.globalJob(), "global");
    EXPECT_TRUE(view.shellToSolid());
    EXPECT_EQ(odiK_Model("new").waveFormulation, "NOT_SET");
}

TEST_F(StoreViews, Parts_AreFoundByNameAndWalkedInOrder) {
    const ddb_PartContainer parts = View().part();
    EXPECT_EQ(parts.size(), 2);
    EXPECT_EQ(parts.get("Part").solverInput(), "part text\n");
    EXPECT_EQ(Raised([&] { parts.get("part"); }), "ddb_PartContainer: no entry named 'part'");
    auto it = parts.createIterator();
    for (int round = 0; round < 2; ++round) {
        Strings names;
        for (it.first(); !it.isDone(); it.next()) names.emplace_back(it.currentKey().View());
        EXPECT_EQ(names, (Strings{"Alone", "Part"}));
    }
    it.first();
    EXPECT_TRUE(it.currentValue().solverInput().IsEmpty());
}

TEST_F(StoreViews, Instances_AreWalkedInNameOrder) {
    const ddb_InstanceContainer instances = View().rootAssembly().instance();
    EXPECT_EQ(instances.size(), 4);
    Strings names;
    std::vector<bool> partInstances;
    for (auto it = instances.createIterator(); !it.isDone(); it.next()) {
        names.emplace_back(it.currentKey().View());
        partInstances.push_back(it.currentValue().IsPartInstance());
    }
    EXPECT_EQ(names, (Strings{"H", "I-1", "I-2", "I-3"}));
    EXPECT_EQ(partInstances, (std::vector<bool>{false, true, true, true}));
}

TEST_F(StoreViews, EntryThatIsNoPartInstance_CannotBeTurnedIntoOne) {
    const ddb_BaseInstance entry = View().rootAssembly().instance().createIterator().currentValue();
    EXPECT_EQ(entry.DynTypeId(), ddb_BaseInstance::TypeId());
    EXPECT_NE(ddb_PartInstance::TypeId(), ddb_BaseInstance::TypeId());
    const std::string text = Raised([&] { const ddb_PartInstance instance(entry); });
    EXPECT_EQ(text.find("class check failed: found ddb_BaseInstance, expected ddb_PartInstance ("), 0U)
        << text;
}

TEST_F(StoreViews, PartInstance_HasNamePlacementAndText) {
    const ddb_PartInstance instance = Instance("I-2");
    EXPECT_EQ(instance.DynTypeId(), ddb_PartInstance::TypeId());
    EXPECT_EQ(instance.name(), "I-2");
    EXPECT_EQ(instance.partName(), "Part");
    EXPECT_EQ(instance.solverInput(), "instance text\n");
    EXPECT_EQ(Items(instance.transform()), (std::vector<float>{4.0F, 0, 0, 0, 0, 0.5F}));
    EXPECT_EQ(Items(Instance("I-1").transform()), std::vector<float>(6));
}

TEST_F(StoreViews, SharedMesh_IsSeenFromEachInstanceUnderItsOwnIndex) {
    const ddb_Mesh first = Instance("I-1").mesh();
    const ddb_Mesh second = Instance("I-2").mesh();
    EXPECT_EQ(first.meshIndex(), 1);
    EXPECT_EQ(second.meshIndex(), 2);
    EXPECT_EQ(&first.mesh(), &second.mesh());
    EXPECT_EQ(&View().mesh(2).mesh(), &second.mesh());
    EXPECT_EQ(View().mesh(2).meshIndex(), 2);

    const ddb_Set inFirst = Instance("I-1").set(1);
    const ddb_Set inSecond = Instance("I-2").set(1);
    EXPECT_EQ(&inFirst.set().Object(), &inSecond.set().Object());
    EXPECT_EQ(inFirst.set().SubSet(0).MeshIndex(), 1);
    EXPECT_EQ(inSecond.set().SubSet(0).MeshIndex(), 2);
    EXPECT_EQ(inSecond.set().SubSet(1).MeshIndex(), 2);
    EXPECT_EQ(inSecond.Shortcut().Path(), "rootAssembly.mesh[2].setData[1]");
    EXPECT_TRUE(inSecond.set().LiesInOneMesh());
}

TEST_F(StoreViews, InstanceWithoutAnyMesh_ShowsAnEmptyOne) {
    const ddb_PartInstance instance = Instance("I-3");
    EXPECT_EQ(instance.mesh().meshIndex(), 3);
    EXPECT_EQ(instance.nodeData().NumNodes(), 0);
    EXPECT_EQ(instance.elementData().numClasses(), 0);
    EXPECT_EQ(instance.mesh().set().size(), 0);
    EXPECT_TRUE(instance.mesh().set().createIterator().isDone());
}

TEST_F(StoreViews, MeshIndexOfNothing_Raises) {
    EXPECT_EQ(Raised([&] { View().mesh(4); }), "ddb_Model::mesh: no entry named '4'");
    EXPECT_EQ(Raised([&] { View().mesh(-1); }), "ddb_Model::mesh: no entry named '-1'");
}

TEST_F(StoreViews, Nodes_GiveLabelsIndicesAndCoordinates) {
    const ddb_NodeData nodes = Instance("I-1").nodeData();
    EXPECT_EQ(nodes.NumNodes(), 3);
    EXPECT_EQ(nodes.GetUserNodeLabel(1), 7);
    EXPECT_EQ(nodes.GetMeshNodeIndex(9), 2);
    EXPECT_EQ(nodes.GetMeshNodeIndex(8), -1);
    cow_List<int> labels;
    nodes.GetUserNodeLabels(labels);
    EXPECT_EQ(Items(labels), (Ints{5, 7, 9}));
    EXPECT_EQ(Raised([&] { nodes.GetUserNodeLabel(3); }),
              "cow_List: index 3 is out of range, expected 0 to 2");
    EXPECT_NE(Raised([&] { nodes.GetUserNodeLabel(0xFFFFFFFFU); }), "nothing raised");
    EXPECT_EQ(nodes.CoordContainer().Length(), 3);
    const uti_Coord3D place = nodes.CoordContainer().ConstGet(2);
    EXPECT_EQ(place.x, 1.5F);
    EXPECT_EQ(place.y, 2.0F);
    EXPECT_EQ(place.z, 3.0F);
}

TEST_F(StoreViews, Elements_GiveTheirClasses) {
    const ddb_ElementData elements = Instance("I-1").elementData();
    EXPECT_EQ(elements.numClasses(), 2);
    EXPECT_EQ(elements.numElements(), 3);
    const ddb_ElementClass trusses = elements.elementClass(0);
    EXPECT_EQ(trusses.numElements(), 2);
    EXPECT_EQ(trusses.numNodesPerElement(), 2);
    EXPECT_EQ(trusses.elementTypeLabel(), "T3D2");
    EXPECT_EQ(trusses.elementConnectivity(), (Ints{0, 1, 1, 2}));
    EXPECT_EQ(trusses.userElementLabelsAsFlatArray(), (Ints{1, 2}));
    EXPECT_EQ(trusses.shape().topologicalDimension, 1);
    EXPECT_TRUE(elements.elementClass(1).shape().shell);
    EXPECT_EQ(Raised([&] { elements.elementClass(2); }),
              "cow_List: index 2 is out of range, expected 0 to 1");
    EXPECT_EQ(Raised([&] { elements.elementClass(-1); }),
              "cow_List: index -1 is out of range, expected 0 to 1");
}

TEST_F(StoreViews, ElementClassesOfTheSectionCode_GiveTheirControls) {
    const bme_ElementData elements(View().mesh(1).mesh());
    EXPECT_EQ(elements.NumClasses(), 2U);
    EXPECT_EQ(elements.GetClass(0).GetElemControlParams().hourglass,
              bme_ElemCtrlParams::HourglassEnm::ENHANCED);
    EXPECT_EQ(elements.GetClass(1).GetElemControlParams().hourglass,
              bme_ElemCtrlParams::HourglassEnm::DEFAULT);
    EXPECT_EQ(elements.GetClass(1).FirstElementIndex(), 2);
    EXPECT_EQ(elements.GetClass(1).NumElements(), 1);
    EXPECT_EQ(Raised([&] { elements.GetClass(2); }), "cow_List: index 2 is out of range, expected 0 to 1");
}

TEST_F(StoreViews, Sets_AreWalkedInTheOrderOfTheModel) {
    const ddb_SetList sets = Instance("I-2").mesh().set();
    EXPECT_EQ(sets.size(), 3);
    Strings names;
    Ints types;
    Ints ids;
    auto it = sets.createIterator();
    for (it.first(); !it.isDone(); it.next()) {
        names.emplace_back(it.currentItem().setLabel().View());
        types.push_back(static_cast<int>(it.currentItem().setType()));
        ids.push_back(it.currentItem().Id());
    }
    EXPECT_EQ(names, (Strings{"Ends", "All", "Top"}));
    EXPECT_EQ(types, (Ints{0, 1, 2}));
    EXPECT_EQ(ids, (Ints{0, 1, 2}));
    EXPECT_EQ(Raised([&] { sets.get(3); }), "cow_List: index 3 is out of range, expected 0 to 2");
    EXPECT_EQ(Raised([&] { Instance("I-2").set(-1); }),
              "cow_List: index -1 is out of range, expected 0 to 2");
}

TEST_F(StoreViews, SetData_GiveNameKindAndSubsets) {
    const rgnC_SetData all = Instance("I-1").set(1).set();
    EXPECT_EQ(all.Name(), "All");
    EXPECT_FALSE(all.Internal());
    EXPECT_EQ(all.Kind(), 1);
    ASSERT_EQ(all.NumSubSets(), 2);
    EXPECT_EQ(all.SubSet(0).ClassIndex(), 0);
    EXPECT_EQ(Items(all.SubSet(0).Subset()), (Ints{0, 1}));
    EXPECT_EQ(all.SubSet(1).ClassIndex(), 1);
    EXPECT_EQ(Raised([&] { all.SubSet(2); }), "cow_List: index 2 is out of range, expected 0 to 1");
    const rgnC_SetData top = Instance("I-1").set(2).set();
    EXPECT_TRUE(top.Internal());
    EXPECT_EQ(top.Kind(), 2);
    EXPECT_EQ(Items(top.SubSet(0).FacetIds()), (Ints{0}));
    EXPECT_TRUE(rgnC_SetData().IsNull());
}

TEST_F(StoreViews, AssemblyWithoutAMesh_ShowsAnEmptyOneOfIndexZero) {
    const ddb_Assembly assembly = View().rootAssembly();
    EXPECT_EQ(assembly.name(), "Root");
    EXPECT_EQ(assembly.solverInput(), "assembly text\n");
    EXPECT_FALSE(assembly.hasMesh());
    EXPECT_EQ(assembly.mesh().meshIndex(), 0);
    EXPECT_EQ(assembly.mesh().nodeData().NumNodes(), 0);
    EXPECT_EQ(assembly.set().size(), 0);
}

TEST_F(StoreViews, AssemblysMesh_KnowsWhomItsNodesBelongTo) {
    AddAssemblyMesh();
    const ddb_Assembly assembly = View().rootAssembly();
    EXPECT_TRUE(assembly.hasMesh());
    EXPECT_EQ(View().mesh(0).meshIndex(), 0);
    const ddb_ScopedNodeData nodes(assembly.mesh().nodeData());
    EXPECT_EQ(nodes.NumNodes(), 1);
    EXPECT_TRUE(nodes.isNativeNode(0));
    EXPECT_FALSE(nodes.isNativeNode(1));
    EXPECT_EQ(nodes.GetUserNodeLabel(0), 100);
    EXPECT_EQ(nodes.GetUserNodeLabel(1), 7);
    EXPECT_EQ(nodes.getPartInstance(1).name(), "I-2");
    EXPECT_EQ(nodes.GetMeshNodeIndex(100), 0);
    EXPECT_EQ(nodes.GetMeshNodeIndex(7), -1);
    EXPECT_EQ(Raised([&] { nodes.getPartInstance(0); }),
              "cow_List: index 0 is out of range, expected 0 to 1");
    EXPECT_EQ(Raised([&] { nodes.getPartInstance(2); }),
              "cow_List: index 2 is out of range, expected 0 to 1");
    cow_List<int> labels;
    nodes.GetUserNodeLabels(labels);
    EXPECT_EQ(Items(labels), (Ints{100}));
}

TEST_F(StoreViews, NodesOfAnInstancesMesh_BelongToTheInstance) {
    const ddb_ScopedNodeData nodes(Instance("I-2").mesh().nodeData());
    EXPECT_FALSE(nodes.isNativeNode(0));
    EXPECT_EQ(nodes.getPartInstance(0).name(), "I-2");
    EXPECT_NE(Raised([&] { nodes.getPartInstance(-1); }), "nothing raised");
}

TEST_F(StoreViews, NodeOfAnInstanceThatIsNotThere_Raises) {
    model->AssemblyMesh().AddForeignNode("gone", 1);
    model->AssemblyMesh().AddForeignNode("H", 1);
    const ddb_ScopedNodeData nodes(View().rootAssembly().mesh().nodeData());
    EXPECT_EQ(Raised([&] { nodes.getPartInstance(0); }), "ddb_InstanceContainer: no entry named 'gone'");
    EXPECT_NE(Raised([&] { nodes.getPartInstance(1); }), "nothing raised");
}

TEST_F(StoreViews, AssemblysSets_AreFoundByIdAndNodeSetsByName) {
    AddAssemblyMesh();
    const ddb_Assembly assembly = View().rootAssembly();
    EXPECT_EQ(assembly.set().size(), 2);
    EXPECT_EQ(assembly.set(0).setLabel(), "RP");
    EXPECT_EQ(assembly.set(0).Shortcut().Path(), "rootAssembly.setData[0]");
    EXPECT_EQ(assembly.set(0).set().SubSet(1).MeshIndex(), 2);
    EXPECT_FALSE(assembly.set(0).set().LiesInOneMesh());
    EXPECT_EQ(assembly.nset("RP").Id(), 0);
    EXPECT_EQ(assembly.mesh().set().size(), 2);
    EXPECT_EQ(Raised([&] { assembly.nset("Wires"); }), "ddb_Assembly::nset: no entry named 'Wires'");
    EXPECT_EQ(Raised([&] { assembly.nset("rp"); }), "ddb_Assembly::nset: no entry named 'rp'");
    EXPECT_EQ(Raised([&] { assembly.set(2); }), "cow_List: index 2 is out of range, expected 0 to 1");
}

TEST_F(StoreViews, OrientationsOfAnInstance_GiveTheirSets) {
    const ddb_PartInstance instance = Instance("I-2");
    const ddb_MaterialOrientationContainer materials = instance.materialOrientations();
    EXPECT_EQ(materials.size(), 1);
    EXPECT_EQ(materials.get(0).region().setLabel(), "All");
    EXPECT_EQ(materials.get(0).region().Shortcut().Path(), "rootAssembly.mesh[2].setData[1]");
    EXPECT_EQ(materials.materialOrientations().ConstGet(0).DynTypeId(), ptoC_MaterialOrientation::TypeId());
    EXPECT_EQ(Raised([&] { materials.get(1); }), "cow_List: index 1 is out of range, expected 0 to 0");
    const ddb_BeamOrientationContainer beams = instance.beamOrientations();
    EXPECT_EQ(beams.size(), 1);
    EXPECT_EQ(beams.get(0).region().Id(), 1);
    EXPECT_EQ(beams.beamOrientations().ConstGet(0).DynTypeId(), ptoC_BeamOrientation::TypeId());
    EXPECT_EQ(Instance("I-3").materialOrientations().size(), 0);
}

TEST_F(StoreViews, OrientationView_StaysGoodWhenTheModelIsAskedForAgain) {
    const ddb_MaterialOrientation orientation = Instance("I-2").materialOrientations().get(0);
    View();
    EXPECT_EQ(orientation.region().setLabel(), "All");
}

TEST_F(StoreViews, Shortcuts_LeadToTheirObjects) {
    const ddb_PartInstance instance = Instance("I-2");
    EXPECT_EQ(instance.Shortcut().Name(), "I-2");
    EXPECT_TRUE(instance.Shortcut().HasValue());
    EXPECT_EQ(instance.Shortcut().ConstGet().ConstGetSectionAssignment().Size(), 1);
    model->AssemblyObject().AppendConnectorOrientation(ptoC_ConnectorOrientation());
    const auto assembly = View().rootAssembly().Shortcut();
    EXPECT_EQ(assembly.Path(), "rootAssembly");
    EXPECT_EQ(assembly.ConstGet().ConstGetConnectorOrientation().Size(), 1);
    EXPECT_EQ(assembly.ConstGet().ConstGetSectionAssignment().Size(), 0);
    const ddb_Model view = View();
    EXPECT_EQ(&view.Object("rootAssembly"), &assembly.ConstGet());
    EXPECT_EQ(Raised([&] { view.Object("other"); }), "odiK_Model: no entry named 'other'");
    model->sections.Insert("C", kseC_ConnectorSection());
    EXPECT_TRUE(view.Shortcut().ConstGet().ConstGetSections().IsMember("C"));
    EXPECT_FALSE(ddr_Shortcut().HasValue());
    EXPECT_TRUE(ddr_Shortcut("a", "x") == ddr_Shortcut("a", "y"));
    EXPECT_FALSE(ddr_Shortcut("a", "x") == ddr_Shortcut("b", "x"));
}

TEST_F(StoreViews, Containers_ShowTheModelsRecords) {
    model->materials.Insert("Steel", kmaC_Material());
    model->contactInitializations.Insert("CI", kinC_ContactInitialization());
    model->timePoints.Insert("TP", kprC_TimePoint());
    model->adaptiveMeshControls.Insert("AC", kadC_AdptMeshCtrl());
    const ddb_Model view = View();
    EXPECT_TRUE(view.material().ConstGet().IsMember("Steel"));
    EXPECT_EQ(&view.amplitudes().ConstGet(), &model->amplitudes);
    EXPECT_EQ(&view.beamProfile().ConstGet(), &model->beamProfiles);
    EXPECT_EQ(&view.constraints().container(), &model->constraints);
    EXPECT_EQ(&view.contactControls().container(), &model->contactControls);
    EXPECT_TRUE(view.contactInitializations().container().IsMember("CI"));
    EXPECT_EQ(&view.interactionProperties().container(), &model->interactionProperties);
    EXPECT_TRUE(view.timePoints().container().IsMember("TP"));
    EXPECT_TRUE(view.adaptiveMeshControls().container().IsMember("AC"));
    EXPECT_EQ(&view.boundaryConditions().container(), &model->boundaryConditions);
    EXPECT_EQ(&view.loads().container(), &model->loads);
    EXPECT_EQ(&view.fields().container(), &model->fields);
    EXPECT_EQ(&view.interactions().container(), &model->interactions);
    EXPECT_EQ(&view.fieldOutputRequests().container(), &model->fieldOutputRequests);
    EXPECT_EQ(&view.historyOutputRequests().container(), &model->historyOutputRequests);
    EXPECT_EQ(&view.adaptiveMeshConstraints().container(), &model->adaptiveMeshConstraints);
}

TEST_F(StoreViews, Steps_AreWalkedInTheOrderOfTheAnalysis) {
    model->steps.Append("Z", kprC_InitialStep());
    model->steps.Append("A", sample::Step<0x23C0069>());
    const ddb_DdbStepContainer steps = View().step();
    EXPECT_EQ(steps.size(), 2);
    EXPECT_EQ(&steps.container(), &model->steps);
    auto it = steps.createIterator();
    for (int round = 0; round < 2; ++round) {
        it.first();
        EXPECT_EQ(it.currentKey(), "Z");
        EXPECT_FALSE(it.currentValue().isExplicit());
        it.next();
        EXPECT_EQ(it.currentKey(), "A");
        EXPECT_TRUE(it.currentValue().isExplicit());
        it.next();
        EXPECT_TRUE(it.isDone());
    }
}

TEST_F(StoreViews, AnalysisProduct_FollowsTheStepsUnlessItIsSet) {
    EXPECT_EQ(View().step().AnalysisProduct(), kprC_AnalysisProductEnm::IMPLICIT);
    model->steps.Append("Initial", kprC_InitialStep());
    model->steps.Append("A", sample::Step<sample::kStatic>());
    EXPECT_EQ(View().step().AnalysisProduct(), kprC_AnalysisProductEnm::IMPLICIT);
    model->steps.Append("B", sample::Step<0x23C0065>());
    EXPECT_EQ(View().step().AnalysisProduct(), kprC_AnalysisProductEnm::EXPLICIT);
    model->analysisProduct = 2;
    EXPECT_EQ(View().step().AnalysisProduct(), kprC_AnalysisProductEnm::OTHER);
}

TEST_F(StoreViews, Datums_AreFoundByIdAndMovedApartFromTheStore) {
    odiK_Datum datum;
    datum.name = "csys";
    datum.csysType = dtu_DatumCsysType::CYLINDRICAL;
    datum.origin = gsl_Point(1, 0, 0);
    model->AddDatum(datum);
    ddb_Datum view = View().datum(1);
    EXPECT_EQ(view.GetDatumType(), dtu_DatumType::CSYS);
    EXPECT_EQ(view.Shortcut().Path(), "datum[1]");
    EXPECT_EQ(view.Shortcut().Name(), "csys");
    EXPECT_EQ(Raised([&] { View().datum(0); }), "ddb_Model::datum: no entry named '0'");
    EXPECT_EQ(Raised([&] { View().datum(2); }), "ddb_Model::datum: no entry named '2'");

    gsl_Matrix placement;
    placement.AxisRotation(gsl_Point(), gsl_Vector(0, 0, 1), std::acos(-1.0) / 2.0);
    placement.SetTranslation(gsl_Vector(0, 0, 5));
    view.TransformData(placement);
    const ddb_DatumCsys moved = view.CvtDatumCsys();
    EXPECT_EQ(moved.GetCsysType(), dtu_DatumCsysType::CYLINDRICAL);
    EXPECT_NEAR(moved.GetOrigin().X(), 0.0, 1e-15);
    EXPECT_NEAR(moved.GetOrigin().Y(), 1.0, 1e-15);
    EXPECT_EQ(moved.GetOrigin().Z(), 5.0);
    EXPECT_NEAR(moved.GetXaxis().Y(), 1.0, 1e-15);
    EXPECT_NEAR(moved.GetYaxis().X(), -1.0, 1e-15);
    EXPECT_EQ(moved.GetZaxis(), gsl_Vector(0, 0, 1));
    EXPECT_EQ(View().datum(1).CvtDatumCsys().GetOrigin(), gsl_Point(1, 0, 0));
}

TEST_F(StoreViews, DatumOfAnotherKind_IsNoCoordinateSystem) {
    odiK_Datum datum;
    datum.name = "axis";
    datum.type = dtu_DatumType::AXIS;
    model->AddDatum(datum);
    EXPECT_EQ(View().datum(1).GetDatumType(), dtu_DatumType::AXIS);
    EXPECT_EQ(Raised([&] { View().datum(1).CvtDatumCsys(); }), "datum 'axis' is no coordinate system");
}

TEST_F(StoreViews, CyclicSector_GivesItsDefinition) {
    ddb_ModelSectorDefinition sector;
    sector.symmetryType = calC_SymmetryTypeEnm::CYCLIC;
    sector.numberOfSectors = 12;
    sector.startPoint = {1, 2, 3};
    sector.endPoint = {4, 5, 6};
    model->cyclicSymmetry = sector;
    const ddb_ModelSectorDefinition& found = View().modelSectorForCyclicSymmetry();
    EXPECT_EQ(found.GetSymmetryType(), calC_SymmetryTypeEnm::CYCLIC);
    EXPECT_EQ(found.GetNumberOfSectors(), 12);
    EXPECT_EQ(found.GetStartPoint(), (g3d_Vector{1, 2, 3}));
    EXPECT_EQ(found.GetEndPoint(), (g3d_Vector{4, 5, 6}));
}

TEST_F(StoreViews, ModelWithoutACyclicSector_HasOneWithoutSymmetry) {
    EXPECT_EQ(View().modelSectorForCyclicSymmetry().GetSymmetryType(), calC_SymmetryTypeEnm::NONE);
}

class PlainTie : public cls_RecordOf<PlainTie, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"sample_PlainTie", "a tie"};
};
class CyclicTie final : public PlainTie {
public:
    cls_Record* Copy() const override { return new CyclicTie(*this); }
    bool IsCyclic() const override { return true; }
};

TEST_F(StoreViews, CyclicSymmetry_IsAskedOfAConstraintByName) {
    model->constraints.Insert("Plain", PlainTie());
    model->constraints.Insert("Cyclic", CyclicTie());
    EXPECT_TRUE(View().hasCyclicSymmetry("Cyclic"));
    EXPECT_FALSE(View().hasCyclicSymmetry("Plain"));
    EXPECT_FALSE(View().hasCyclicSymmetry("Default Model"));
}

TEST(ElementControls, Library_DecidesWhatDefaultMeans) {
    using L = bme_ElemLibrary;
    bme_ElemCtrlParams params;
    for (const L library : {L::NONE, L::STANDARD, L::EXPLICIT}) EXPECT_TRUE(params.IsDefault(library));
    params.hourglassStiffness = 1e-9;
    EXPECT_TRUE(params.IsDefault(L::NONE));
    EXPECT_FALSE(params.IsDefault(L::STANDARD));
    EXPECT_TRUE(params.IsDefault(L::EXPLICIT));
    EXPECT_TRUE(params.HasDefaultSectionControls(L::EXPLICIT));
    EXPECT_FALSE(params.HasDefaultSectionControls(L::STANDARD));
    params = bme_ElemCtrlParams();
    params.weightFactor += 0.9e-6;
    EXPECT_TRUE(params.IsDefault(L::STANDARD));
    EXPECT_TRUE(params != bme_ElemCtrlParams());
    params.weightFactor += 0.2e-6;
    EXPECT_FALSE(params.IsDefault(L::EXPLICIT));
    params = bme_ElemCtrlParams();
    params.stressRate = bme_ElemCtrlParams::StressRateEnm::SPIN;
    EXPECT_FALSE(params.IsDefault(L::EXPLICIT));
    EXPECT_TRUE(params.IsDefault(L::NONE));
}

TEST(ElementControls, Equality_OverlooksTheLibrary) {
    bme_ElemCtrlParams a;
    const bme_ElemCtrlParams b;
    a.SetElemLibrary(bme_ElemLibrary::EXPLICIT);
    EXPECT_FALSE(a != b);
    EXPECT_EQ(a.ElemLibrary(), bme_ElemLibrary::EXPLICIT);
    a.lengthRatio = 0.2;
    EXPECT_TRUE(a != b);
}

using Runs = std::vector<std::pair<int, int>>;

Runs RunsOf(const bme_MapPropertyArray& groups, int key) {
    Runs runs;
    groups.ForEachRun(key, [&](int first, int count) { runs.emplace_back(first, count); });
    return runs;
}

TEST(ElementProperties, Equality_ComparesTheIndicesNotTheLabel) {
    bme_Property property;
    property.elementLabel = 8;
    property.MatOriIndex = 4;
    bme_Property second = property;
    second.elementLabel = 5;
    EXPECT_TRUE(property == second);
    second.MatOriIndex = -1;
    EXPECT_FALSE(property == second);
}

TEST(ElementProperties, Groups_AreNumberedByTheirFirstElementsAndKnowTheirIndices) {
    bme_PropertyArray properties(10);
    properties.Set(2, 5, &bme_Property::SectionIndex, 1);
    properties.Set(2, 2, &bme_Property::ElemCtrlIndex, 2);
    properties.Set(4, 1, &bme_Property::BeamOriIndex, 3);
    properties.Set(8, 1, &bme_Property::MatOriIndex, 4);
    properties.Set(6, 1, &bme_Property::SectionIndex, -1);
    bme_MapPropertyArray groups(properties);
    ASSERT_EQ(groups.Count(), 5);
    EXPECT_EQ(groups.SectionIndex(0), -1);
    EXPECT_EQ(groups.NumElements(0), 5);
    EXPECT_EQ(groups.SectionIndex(1), 1);
    EXPECT_EQ(groups.ElemCtrlIndex(1), 2);
    EXPECT_EQ(groups.BeamOriIndex(1), -1);
    EXPECT_EQ(groups.BeamOriIndex(2), 3);
    EXPECT_EQ(groups.SectionIndex(3), 1);
    EXPECT_EQ(groups.NumElements(3), 1);
    EXPECT_EQ(groups.MatOriIndex(4), 4);
    groups.KeepElements(properties, {true, true, true, true, false});
    EXPECT_EQ(RunsOf(groups, 0), (Runs{{0, 2}, {6, 2}, {9, 1}}));
    EXPECT_EQ(RunsOf(groups, 1), (Runs{{2, 2}}));
    EXPECT_EQ(RunsOf(groups, 2), (Runs{{4, 1}}));
    EXPECT_EQ(RunsOf(groups, 3), (Runs{{5, 1}}));
    EXPECT_EQ(RunsOf(groups, 4), Runs());
    EXPECT_EQ(Raised([&] { static_cast<void>(groups.NumElements(7)); }),
              "cow_List: index 7 is out of range, expected 0 to 4");
}

TEST(ElementProperties, Groups_WithoutAnythingSet_AreOneOfAllElements) {
    const bme_PropertyArray properties(3);
    const bme_MapPropertyArray groups(properties);
    ASSERT_EQ(groups.Count(), 1);
    EXPECT_EQ(groups.NumElements(0), 3);
    EXPECT_EQ(groups.SectionIndex(0), -1);
    EXPECT_EQ(bme_MapPropertyArray(bme_PropertyArray(0)).Count(), 0);
}

// Beyond one stretch of elements, and beyond as many combinations as one byte and two bytes tell apart.
TEST(ElementProperties, Groups_OfManyElements_AreThoseOfOneEntryForEachElement) {
    constexpr int count = 70000;
    constexpr int before = 5000;
    bme_PropertyArray properties(before + count);
    std::vector<std::pair<int, int>> expected(before + count, {-1, -1});
    const auto set = [&](int first, int number, int bme_Property::*index, int value) {
        properties.Set(first, number, index, value);
        for (int i = first; i < first + number; ++i) {
            auto& [section, orientation] = expected[static_cast<std::size_t>(i)];
            (index == &bme_Property::SectionIndex ? section : orientation) = value;
        }
    };
    set(100, before + 1000, &bme_Property::SectionIndex, 7);
    set(0, before + count, &bme_Property::MatOriIndex, 3);
    for (int i = 0; i < 300; ++i) set(before + 3 * i, 1, &bme_Property::SectionIndex, i);
    for (int i = 0; i < count; ++i) set(before + i, 1, &bme_Property::MatOriIndex, i);
    set(4096, 3 * 4096, &bme_Property::SectionIndex, 1);
    set(4096, 3 * 4096, &bme_Property::MatOriIndex, 0);

    std::map<std::pair<int, int>, int> keys;
    std::vector<Runs> runs;
    for (int i = 0; i < before + count; ++i) {
        const auto [place, isNew] =
            keys.emplace(expected[static_cast<std::size_t>(i)], static_cast<int>(keys.size()));
        if (isNew) runs.emplace_back();
        Runs& own = runs[static_cast<std::size_t>(place->second)];
        if (own.empty() || own.back().first + own.back().second != i) own.emplace_back(i, 0);
        ++own.back().second;
    }
    bme_MapPropertyArray groups(properties);
    ASSERT_EQ(groups.Count(), static_cast<int>(runs.size()));
    groups.KeepElements(properties, std::vector<bool>(runs.size(), true));
    for (const auto& [indices, key] : keys) {
        ASSERT_EQ(groups.SectionIndex(key), indices.first);
        ASSERT_EQ(groups.MatOriIndex(key), indices.second);
        ASSERT_EQ(RunsOf(groups, key), runs[static_cast<std::size_t>(key)]) << key;
    }
}

} // namespace
