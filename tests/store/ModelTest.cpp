#include "store_interface/model/odb_Odb.h"

#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

namespace {

/// Two nodes and a truss, with a set of each kind.
odiK_Mesh* SmallMesh(int firstLabel) {
    auto* mesh = new odiK_Mesh();
    mesh->SetNodes({firstLabel, firstLabel + 1}, std::vector<float>(6));
    mesh->AddElements("T3D2", {firstLabel}, 2, {firstLabel, firstLabel + 1});
    mesh->AddNodeSet("N", {firstLabel + 1});
    mesh->AddElementSet("E", {firstLabel});
    mesh->AddSurface("S", {{firstLabel, -1, "END1"}});
    return mesh;
}

odiK_AttributeInput Assignment(const char* setName, const char* sectionName) {
    ptoC_SectionAssignment assignment;
    assignment.sectionName = sectionName;
    return {setName, mdl_ObjCow<ptoC_PartAttribute>(assignment)};
}

const cow_String& SectionOf(const ptoC_PartAttributeList& list, int index) {
    return static_cast<const ptoC_SectionAssignment&>(list.ConstGet(index)).sectionName;
}

TEST(Model, NamesThatAreTaken_Raise) {
    odiK_Model model("M");
    model.AddPart("P");
    model.AddInstance("I", "P");
    EXPECT_EQ(Raised([&] { model.AddPart("P"); }), "a part named 'P' is there already");
    EXPECT_EQ(Raised([&] { model.AddInstance("I", "P"); }), "an instance named 'I' is there already");
    EXPECT_EQ(Raised([&] { model.AddOtherEntry("I", ""); }), "an instance named 'I' is there already");
    EXPECT_EQ(Raised([&] { model.AddInstance("J", "Q"); }), "instance 'J': there is no part named 'Q'");
    EXPECT_EQ(Raised([&] { model.AddOtherEntry("J", "Q"); }), "instance 'J': there is no part named 'Q'");
    EXPECT_EQ(model.FindInstance("J"), nullptr);
}

TEST(Model, PartsAndInstances_StandInByteOrder) {
    odiK_Model model("M");
    for (const char* name : {"b", "B", "a"}) model.AddPart(name);
    Strings names;
    for (const auto& [name, part] : model.Parts()) {
        EXPECT_EQ(part->name, name);
        names.emplace_back(name.View());
    }
    EXPECT_EQ(names, (Strings{"B", "a", "b"}));
}

TEST(Model, MeshIndices_CountPartInstancesInNameOrder) {
    odiK_Model model("M");
    model.AddPart("P");
    for (const char* name : {"c", "a", "B"}) model.AddInstance(name, "P");
    model.AddOtherEntry("b", "");
    model.AddOtherEntry("A", "P");
    model.SealInstances();
    EXPECT_TRUE(model.InstancesAreSealed());
    EXPECT_EQ(model.FindInstance("B")->meshIndex, 1);
    EXPECT_EQ(model.FindInstance("a")->meshIndex, 2);
    EXPECT_EQ(model.FindInstance("c")->meshIndex, 3);
    EXPECT_LT(model.FindInstance("A")->meshIndex, 0);
    EXPECT_LT(model.FindInstance("b")->meshIndex, 0);
    EXPECT_NE(model.FindInstance("A")->meshIndex, model.FindInstance("b")->meshIndex);
    EXPECT_EQ(model.InstanceOfMesh(2)->name, "a");
    for (const int index : {-1, 0, 4}) EXPECT_TRUE(model.InstanceOfMesh(index).IsNull());
    EXPECT_TRUE(model.FindInstance("a")->isPartInstance);
    EXPECT_FALSE(model.FindInstance("A")->isPartInstance);
}

TEST(Model, FirstSetOrRegion_SealsTheInstances) {
    const std::string text = "instance 'J': instances must be added before the first set or region";
    odiK_Model bySet("M");
    bySet.AddPart("P");
    bySet.AddAssemblySet("S", res_SetTypeEnm::NODES, {});
    EXPECT_EQ(Raised([&] { bySet.AddInstance("J", "P"); }), text);
    EXPECT_EQ(Raised([&] { bySet.AddOtherEntry("J", ""); }), text);

    odiK_Model byRegion("M");
    byRegion.AddPart("P");
    EXPECT_FALSE(byRegion.FindRegion("", "S").HasValue());
    EXPECT_EQ(Raised([&] { byRegion.AddInstance("J", "P"); }), text);
}

TEST(Model, InstanceWithoutAMesh_TakesThatOfItsPart) {
    odiK_Model model("M");
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(SmallMesh(1));
    model.AddInstance("A", "P");
    model.AddInstance("B", "P").ownMesh.Reset(SmallMesh(100));
    EXPECT_EQ(&*model.FindInstance("A")->Mesh(), &*part.mesh);
    EXPECT_NE(&*model.FindInstance("B")->Mesh(), &*part.mesh);
    EXPECT_TRUE(model.AddOtherEntry("C", "").Mesh().IsNull());
    EXPECT_EQ(&*model.AddOtherEntry("D", "P").Mesh(), &*part.mesh);
}

TEST(Model, Attributes_AreThePartsUntilTheInstanceHasItsOwn) {
    odiK_Model model("M");
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(SmallMesh(1));
    part.attributes.sectionAssignments = {Assignment("E", "Steel"), Assignment("E", "Copper")};
    part.attributes.materialOrientations = {
        {"E", mdl_ObjCow<ptoC_PartAttribute>(ptoC_MaterialOrientation())}};
    part.attributes.beamOrientations = {{"E", mdl_ObjCow<ptoC_PartAttribute>(ptoC_BeamOrientation())}};
    model.AddInstance("A", "P");
    odiK_Instance& own = model.AddInstance("B", "P");
    own.ownSectionAssignments.emplace();
    own.ownSectionAssignments->push_back(Assignment("E", "Wood"));
    own.ownMaterialOrientations.emplace();
    model.Complete();

    const odiK_PartInstance& a = model.FindInstance("A")->attributes;
    ASSERT_EQ(a.sectionAssignments.Size(), 2);
    EXPECT_EQ(SectionOf(a.sectionAssignments, 0), "Steel");
    EXPECT_EQ(SectionOf(a.sectionAssignments, 1), "Copper");
    EXPECT_EQ(a.sectionAssignments.ConstGet(0).region.Shortcut().Path(), "rootAssembly.mesh[1].setData[1]");
    EXPECT_EQ(a.materialOrientations.Size(), 1);
    const odiK_PartInstance& b = model.FindInstance("B")->attributes;
    ASSERT_EQ(b.sectionAssignments.Size(), 1);
    EXPECT_EQ(SectionOf(b.sectionAssignments, 0), "Wood");
    EXPECT_EQ(b.sectionAssignments.ConstGet(0).region.Shortcut().Path(), "rootAssembly.mesh[2].setData[1]");
    EXPECT_EQ(b.materialOrientations.Size(), 0);
    EXPECT_EQ(b.beamOrientations.Size(), 1);

    model.Complete();
    EXPECT_EQ(model.FindInstance("A")->attributes.sectionAssignments.Size(), 2);
}

TEST(Model, AttributeOnASetThatIsNotThere_IsAProblemOfTheInstance) {
    odiK_Model model("M");
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(SmallMesh(1));
    part.attributes.sectionAssignments = {Assignment("E", "Steel"), Assignment("X", "Copper")};
    model.AddInstance("A", "P");
    CollectedProblems problems;
    model.CompleteTree(problems);
    EXPECT_EQ(problems.all,
              Strings{"/assembly/instances/A/sectionAssignments/1/region: found 'X', expected the "
                      "name of a set of the instance's mesh"});
    EXPECT_EQ(Raised([&] { model.Complete(); }), problems.all[0]);
}

TEST(Model, ElementLabelsThatStandTwice_RaiseWhenTheModelIsCompleted) {
    odiK_Model model("M");
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(SmallMesh(1));
    part.mesh->AddElements("T3D2", {1}, 2, {1, 2});
    EXPECT_EQ(
        Raised([&] { model.Complete(); }),
        "/elements/1/labels/0: element label 1 stands twice, expected labels that are unique in the mesh");
}

TEST(Model, Regions_NameTheirOwnerAndPlace) {
    odiK_Model model("M");
    model.AddPart("P").mesh.Reset(SmallMesh(1));
    model.AddInstance("A", "P");
    model.AddInstance("B", "P");
    const int node[] = {1};
    const odiK_MemberInput member[] = {{"B", node, {}}};
    model.AddAssemblySet("T", res_SetTypeEnm::NODES, member);

    const rgnC_Region ofInstance = model.Region("B", "E");
    EXPECT_TRUE(ofInstance.HasValue());
    EXPECT_EQ(ofInstance.Shortcut().Path(), "rootAssembly.mesh[2].setData[1]");
    EXPECT_EQ(ofInstance.SetName(), "E");
    EXPECT_EQ(ofInstance.InstanceName(), "B");
    EXPECT_EQ(ofInstance.ConstSet().Id(), 1);
    EXPECT_EQ(ofInstance.FlagWord(), 2);
    EXPECT_EQ(model.Region("A", "N").FlagWord(), 1);
    EXPECT_EQ(model.Region("A", "S").FlagWord(), 8);
    EXPECT_EQ(rgnC_Region().FlagWord(), 0);

    const rgnC_Region ofAssembly = model.Region("", "T");
    EXPECT_EQ(ofAssembly.Shortcut().Path(), "rootAssembly.setData[0]");
    EXPECT_TRUE(ofAssembly.InstanceName().IsEmpty());

    EXPECT_TRUE(model.Region("B", "E") == ofInstance);
    EXPECT_FALSE(model.Region("A", "E") == ofInstance);
    EXPECT_FALSE(rgnC_Region() == ofInstance);
}

TEST(Model, RegionOfASetThatIsNotThere_Raises) {
    odiK_Model model("M");
    model.AddPart("P").mesh.Reset(SmallMesh(1));
    model.AddInstance("A", "P");
    model.AddOtherEntry("C", "");
    for (const auto& [instance, set] :
         {std::pair{"A", "n"}, std::pair{"B", "N"}, std::pair{"C", "N"}, std::pair{"", "N"}}) {
        EXPECT_FALSE(model.FindRegion(instance, set).HasValue());
    }
    EXPECT_EQ(Raised([&] { model.Region("A", "X"); }), "there is no set named 'X' in instance 'A'");
    EXPECT_EQ(Raised([&] { model.Region("", "X"); }), "there is no set named 'X' in the assembly");
}

TEST(Model, AssemblySet_HasSubsetsInSeveralMeshes) {
    odiK_Model model("M");
    model.AddPart("P").mesh.Reset(SmallMesh(1));
    model.AddInstance("A", "P");
    model.AddInstance("B", "P");
    model.AssemblyMesh().SetNodes({50}, std::vector<float>(3));
    const int second[] = {2, 1};
    const int own[] = {50};
    const odiK_MemberInput members[] = {{"B", second, {}}, {"", own, {}}, {"A", second, {}}};
    model.AddAssemblySet("T", res_SetTypeEnm::NODES, members, true);
    ASSERT_EQ(model.AssemblySets().size(), 1U);
    const odiK_Set& set = *model.AssemblySets()[0];
    EXPECT_TRUE(set.internal);
    ASSERT_EQ(set.subsets.size(), 3U);
    EXPECT_EQ(set.subsets[0].meshIndex, 2);
    EXPECT_EQ(Items(set.subsets[0].subset), (Ints{1, 0}));
    EXPECT_EQ(set.subsets[1].meshIndex, 0);
    EXPECT_EQ(Items(set.subsets[1].subset), (Ints{0}));
    EXPECT_EQ(set.subsets[2].meshIndex, 1);
    EXPECT_EQ(model.FindAssemblySet("T"), 0);
    EXPECT_EQ(model.FindAssemblySet("U"), -1);
}

TEST(Model, BadAssemblySets_AreNamedWithTheirMember) {
    odiK_Model model("M");
    model.AddPart("P").mesh.Reset(SmallMesh(1));
    model.AddInstance("A", "P");
    CollectedProblems problems;
    const int labels[] = {1, 9};
    const odiK_FacetInput facets[] = {{1, -1, "S1"}};
    const odiK_MemberInput members[] = {{"A", labels, {}}, {"B", labels, {}}, {"", labels, {}}};
    model.AddAssemblySet("T", res_SetTypeEnm::NODES, false, members, problems);
    const odiK_MemberInput surface[] = {{"A", {}, facets}};
    model.AddAssemblySet("F", res_SetTypeEnm::FACETS, false, surface, problems);
    model.AddAssemblySet("T", res_SetTypeEnm::NODES, false, {}, problems);
    EXPECT_EQ(
        problems.all,
        (Strings{"/members/0/labels/1: found 9, expected the label of a node of the mesh",
                 "/members/1/instance: found 'B', expected the name of an instance",
                 "/members/2/labels/0: found 1, expected the label of a node of the mesh",
                 "/members/2/labels/1: found 9, expected the label of a node of the mesh",
                 "/members/0/facets/0/1: found 'S1', expected a face of an element of type T3D2",
                 "/name: found a second set named 'T', expected names that are unique in the assembly"}));
}

TEST(Model, ConnectorOrientations_AreNamedByTheirPlace) {
    odiK_Assembly assembly;
    ptoC_ConnectorOrientation orientation;
    assembly.AppendConnectorOrientation(orientation);
    orientation.name = "mine";
    assembly.AppendConnectorOrientation(orientation);
    orientation.name = "";
    assembly.AppendConnectorOrientation(orientation);
    const auto name = [&](int index) {
        return static_cast<const ptoC_ConnectorOrientation&>(
                   assembly.ConstGetConnectorOrientation().ConstGet(index))
            .Name();
    };
    EXPECT_EQ(name(0), "ConnOri-0");
    EXPECT_EQ(name(1), "mine");
    EXPECT_EQ(name(2), "ConnOri-2");
    EXPECT_EQ(Raised([&] { name(3); }), "cow_List: index 3 is out of range, expected 0 to 2");
}

odiK_Datum NamedDatum(const char* name, dtu_DatumType type = dtu_DatumType::CSYS) {
    odiK_Datum datum;
    datum.name = name;
    datum.type = type;
    return datum;
}

TEST(Datum, Ids_CountFromOneInTheOrderAdded) {
    odiK_Model model("M");
    EXPECT_EQ(model.AddDatum(NamedDatum("b")).Id(), 1);
    EXPECT_EQ(model.AddDatum(NamedDatum("a")).Id(), 2);
    EXPECT_EQ(model.FindDatum("a").Id(), 2);
    EXPECT_TRUE(model.FindDatum("c").IsNullRef());
    EXPECT_TRUE(dtmC_DatumRef() == model.FindDatum("c"));
    EXPECT_EQ(Raised([&] { model.AddDatum(NamedDatum("a")); }), "a datum named 'a' is there already");
}

TEST(Datum, AxesOfACsys_AreNormalisedAndTheThirdIsMade) {
    odiK_Model model("M");
    odiK_Datum datum = NamedDatum("c");
    datum.xAxis = gsl_Vector(0.0, 2.0, 0.0);
    datum.yAxis = gsl_Vector(0.0, 0.0, 4.0);
    datum.zAxis = gsl_Vector();
    model.AddDatum(datum);
    EXPECT_EQ(model.Datums()[0].xAxis, gsl_Vector(0, 1, 0));
    EXPECT_EQ(model.Datums()[0].yAxis, gsl_Vector(0, 0, 1));
    EXPECT_EQ(model.Datums()[0].zAxis, gsl_Vector(1, 0, 0));
    datum.name = "d";
    datum.zAxis = gsl_Vector(0.0, 0.0, -5.0);
    model.AddDatum(datum);
    EXPECT_EQ(model.Datums()[1].zAxis, gsl_Vector(0, 0, -1));
}

TEST(Datum, OtherKinds_NormaliseTheOneAxisThatTheyHave) {
    odiK_Model model("M");
    odiK_Datum axis = NamedDatum("axis", dtu_DatumType::AXIS);
    axis.xAxis = gsl_Vector(3, 0, 4);
    axis.yAxis = gsl_Vector();
    model.AddDatum(axis);
    EXPECT_EQ(model.Datums()[0].xAxis, gsl_Vector(0.6, 0, 0.8));
    odiK_Datum plane = NamedDatum("plane", dtu_DatumType::PLANE);
    plane.xAxis = gsl_Vector();
    plane.zAxis = gsl_Vector(0, 8, 0);
    model.AddDatum(plane);
    EXPECT_EQ(model.Datums()[1].zAxis, gsl_Vector(0, 1, 0));
    odiK_Datum point = NamedDatum("point", dtu_DatumType::POINT);
    point.xAxis = point.yAxis = point.zAxis = gsl_Vector();
    EXPECT_EQ(model.AddDatum(point).Id(), 3);
}

TEST(Datum, AxesThatGiveNoFrame_AreRefused) {
    odiK_Model model("M");
    odiK_Datum datum = NamedDatum("d");
    datum.xAxis = gsl_Vector();
    EXPECT_EQ(Raised([&] { model.AddDatum(datum); }), "datum 'd': xAxis has no length");
    datum.xAxis = gsl_Vector(1, 0, 0);
    datum.yAxis = gsl_Vector();
    EXPECT_EQ(Raised([&] { model.AddDatum(datum); }), "datum 'd': yAxis has no length");
    datum.yAxis = gsl_Vector(-3, 0, 0);
    EXPECT_EQ(Raised([&] { model.AddDatum(datum); }), "datum 'd': xAxis and yAxis are parallel");
    datum.zAxis = gsl_Vector();
    EXPECT_EQ(Raised([&] { model.AddDatum(datum); }), "datum 'd': xAxis and yAxis are parallel");
    odiK_Datum axis = NamedDatum("a", dtu_DatumType::AXIS);
    axis.xAxis = gsl_Vector();
    EXPECT_EQ(Raised([&] { model.AddDatum(axis); }), "datum 'a': xAxis has no length");
    odiK_Datum plane = NamedDatum("p", dtu_DatumType::PLANE);
    plane.zAxis = gsl_Vector();
    EXPECT_EQ(Raised([&] { model.AddDatum(plane); }), "datum 'p': zAxis has no length");
    EXPECT_TRUE(model.Datums().empty());
}

TEST(Model, Completing_PropagatesEveryContainer) {
    odiK_Model model("M");
    model.steps = sample::StepsOf("IGP");
    const auto create = [](auto object) {
        object.Give("S1");
        return object;
    };
    model.boundaryConditions.Insert("X", create(sample::Condition()));
    model.loads.Insert("X", create(sample::Force()));
    model.fields.Insert("X", create(sample::Temperature()));
    model.interactions.Insert("X", create(sample::Contact()));
    model.fieldOutputRequests.Insert("X", create(sample::Request()));
    model.adaptiveMeshConstraints.Insert("X", create(kprC_AdptMeshCons()));
    model.Complete();
    using sample::Statuses;
    EXPECT_EQ(Statuses(model.boundaryConditions.ConstGet("X"), model.steps), (Ints{0, 1, 9}));
    EXPECT_EQ(Statuses(model.loads.ConstGet("X"), model.steps), (Ints{0, 1, 8}));
    EXPECT_EQ(Statuses(model.fields.ConstGet("X"), model.steps), (Ints{0, 1, 8}));
    EXPECT_EQ(Statuses(model.interactions.ConstGet("X"), model.steps), (Ints{0, 1, 8}));
    EXPECT_EQ(Statuses(model.fieldOutputRequests.ConstGet("X"), model.steps), (Ints{0, 1, 6}));
    EXPECT_EQ(Statuses(model.adaptiveMeshConstraints.ConstGet("X"), model.steps), (Ints{0, 1, 8}));
}

TEST(Store, Models_AreFoundByName) {
    odb_Odb store;
    odiK_Model& model = store.AddModel(odb_Odb::DefaultModelName());
    EXPECT_EQ(store.FindModel("Default Model"), &model);
    EXPECT_EQ(store.FindModel("other"), nullptr);
    EXPECT_EQ(Raised([&] { store.AddModel("Default Model"); }),
              "a model named 'Default Model' is there already");
    EXPECT_EQ(Raised([&] { store.ddb().model("other"); }), "ddb_Ddb: no entry named 'other'");
    EXPECT_EQ(store.Models().size(), 1U);
}

TEST(Store, ModelThatCannotBeCompleted_RaisesWhenItIsAskedFor) {
    odb_Odb store;
    odiK_Model& model = store.AddModel("M");
    model.steps = sample::StepsOf("I");
    sample::Force force;
    force.Give("S0").deactivated = true;
    model.loads.Insert("L", force);
    EXPECT_EQ(Raised([&] { store.ddb().model("M"); }),
              "object 'L', /states/S0: found deactivated, but it is not active there");
}

} // namespace
