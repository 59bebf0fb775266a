#include "assembly/oif_InstanceBuilder.h"
#include "connectors/ConnectorTesting.h"
#include "connectors/oif_ConnectorSection.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

using Assembled = kseC_ConnectorSection::AssembledTypeEnm;
using Translational = kseC_ConnectorSection::TranslationalTypeEnm;
using Rotational = kseC_ConnectorSection::RotationalTypeEnm;

kseC_ConnectorSection Section(Assembled assembled, Translational translational = Translational::NONE,
                              Rotational rotational = Rotational::NONE) {
    kseC_ConnectorSection section;
    section.assembledType = assembled;
    section.translationalType = translational;
    section.rotationalType = rotational;
    return section;
}

kseC_ConnectorSection Basic(Translational translational, Rotational rotational) {
    return Section(Assembled::NONE, translational, rotational);
}

/// The text behind the keyword line.
std::string Data(const kseC_ConnectorSection& section, const ptoC_ConnectorOrientation& ends = {},
                 CsysStore* with = nullptr) {
    CsysStore empty;
    CsysStore& store = with == nullptr ? empty : *with;
    const std::string text = Written(oif_NewConnectorSection("B", "S", section, ends, store.Info()));
    const std::string head = "*Connector Section, elset=S\n";
    EXPECT_EQ(text.substr(0, head.size()), head);
    return text.substr(head.size());
}

struct Ends : CsysStore {
    Ends() {
        record.name = "ConnOri-4";
        first = Add("D 1");
        second = Add("E");
    }
    std::string Line() { return Data(Basic(Translational::JOIN, Rotational::NONE), record, this); }
    ptoC_ConnectorOrientation record;
    dtmC_DatumRef first;
    dtmC_DatumRef second;
};

kbeC_ConnectorStop Stop(double least) {
    kbeC_ConnectorStop stop;
    stop.minMotion = least;
    stop.components = List({1});
    return stop;
}

/// Connectors of the assembly, and of an instance.
class Connectors : public testing::Test {
protected:
    Connectors() {
        odiK_Part& part = store.AddPart("P", {1, 2});
        part.mesh->AddElements("CONN3D2", {5}, 2, {1, 2});
        part.mesh->AddElementSet("OWN", {5});
        store.model.AddInstance("I", "P");
        odiK_Mesh& mesh = store.model.AssemblyMesh();
        fnd_Raise problems;
        const int one = mesh.AddForeignNode("I", 1);
        const int two = mesh.AddForeignNode("I", 2);
        mesh.AddElementsByIndex("CONN3D2", {7, 8}, 2, {one, two, two, one}, {}, problems);
        AddSet("W", 7);
        AddSet("X 1", 8);
    }
    void AddSet(const char* name, int label) {
        const int labels[] = {label};
        const odiK_MemberInput members[] = {{"", labels, {}}};
        store.model.AddAssemblySet(name, res_SetTypeEnm::ELEMENTS, members);
    }
    void Assign(const char* instance, const char* set, const char* section) {
        ptoC_SectionAssignment assignment;
        assignment.region = store.model.Region(instance, set);
        assignment.sectionName = section;
        store.model.AssemblyObject().sectionAssignments.Append(assignment);
    }
    void Build() {
        oif_InstanceBuilder builder(store.Info());
        builder.Build();
        assembly = WrittenAll(builder.AssemblyDefinition());
        model = WrittenAll(builder.ModelDefinition());
    }

    CsysStore store;
    std::string assembly;
    std::string model;
};

const std::string kElement7 = "*Element, type=CONN3D2\n7, I.1, I.2\n";
const std::string kElement8 = "*Element, type=CONN3D2\n8, I.2, I.1\n";

} // namespace

TEST(ConnectorSection, OfNoBehaviour_NamesNone) {
    CsysStore store;
    kseC_ConnectorSection section = Section(Assembled::BEAM);
    section.integrationExplicit = true; // flags alone are no behaviour
    EXPECT_EQ(Written(oif_NewConnectorSection("B", "I.\"S 1\"", section, {}, store.Info())),
              "*Connector Section, elset=I.\"S 1\"\nBeam,\n");
}

TEST(ConnectorSection, OfABehaviour_NamesIt) {
    CsysStore store;
    kseC_ConnectorSection section = Section(Assembled::BEAM);
    section.options.Append(mdl_ObjCow<kbeC_ConnectorBehaviorOption>(Stop(1)));
    EXPECT_EQ(Written(oif_NewConnectorSection("my b", "S", section, {}, store.Info())),
              "*Connector Section, elset=S, behavior=\"my b\"\nBeam,\n");
    kseC_ConnectorSection reference = Section(Assembled::BEAM);
    reference.constitutiveReference.Get(5) = 0.0;
    EXPECT_EQ(Written(oif_NewConnectorSection("B", "S", reference, {}, store.Info())),
              "*Connector Section, elset=S, behavior=B\nBeam,\n");
}

TEST(ConnectorSection, AssembledTypes_AreTheSolversWords) {
    const char* words[] = {"",       "Beam",      "Bushing",  "CVJoint",    "Cylindrical", "Hinge",
                           "Planar", "Retractor", "SlipRing", "Translator", "UJoint",      "Weld"};
    for (int type = 0; type <= 11; ++type) {
        const std::string line = Data(Section(static_cast<Assembled>(type)));
        EXPECT_EQ(line.substr(0, line.find('\n')), std::string(words[type]) + ",");
    }
}

TEST(ConnectorSection, BasicTypes_StandAloneWithACommaOrTogether) {
    EXPECT_EQ(Data(Basic(Translational::JOIN, Rotational::NONE)), "Join,\n");
    EXPECT_EQ(Data(Basic(Translational::NONE, Rotational::CARDAN)), "Cardan,\n");
    EXPECT_EQ(Data(Basic(Translational::RADIAL_THRUST, Rotational::CONSTANT_VELOCITY)),
              "Radial-Thrust, Constant Velocity\n");
}

TEST(ConnectorSection, ProjectionTypes_AreSpelledOut) {
    EXPECT_EQ(Data(Basic(Translational::PROJECTION_CARTESIAN, Rotational::NONE)), "Projection Cartesian,\n");
    EXPECT_EQ(Data(Basic(Translational::NONE, Rotational::PROJECTION_FLEXION_TORSION)),
              "Projection Flexion-Torsion,\n");
    EXPECT_EQ(Data(Basic(Translational::PROJECTION_CARTESIAN, Rotational::PROJECTION_FLEXION_TORSION)),
              "Projection Cartesian, Projection Flexion-Torsion\n");
}

TEST(ConnectorSection, AssembledBesideBasicTypes_IsWrittenAlone) {
    EXPECT_EQ(Data(Section(Assembled::WELD, Translational::JOIN, Rotational::ALIGN)), "Weld,\n");
}

TEST(ConnectorSection, OrientationOfTheFirstEnd_HasACommaBehindIt) {
    Ends ends;
    ends.record.csys1 = ends.first;
    EXPECT_EQ(ends.Line(), "Join,\n\"D 1\",\n");
    ends.record.angle1 = 30;
    EXPECT_EQ(ends.Line(), "Join,\n\"D 1_ConnOri-4-1_\",\n");
}

TEST(ConnectorSection, OrientationOfTheSecondEnd_HasACommaAheadOfIt) {
    Ends ends;
    ends.record.csys2 = ends.second;
    ends.record.angle1 = 30; // of an end without a system
    EXPECT_EQ(ends.Line(), "Join,\n, E\n");
    ends.record.angle2 = 1e-300;
    EXPECT_EQ(ends.Line(), "Join,\n, E_ConnOri-4-2_\n");
    ends.record.orient2sameAs1 = true;
    EXPECT_EQ(ends.Line(), "Join,\n, E_ConnOri-4-2_\n");
}

TEST(ConnectorSection, TwoOrientations_StandSideBySideUnlessShared) {
    Ends ends;
    ends.record.csys1 = ends.first;
    ends.record.csys2 = ends.second;
    ends.record.angle2 = 5;
    EXPECT_EQ(ends.Line(), "Join,\n\"D 1\", E_ConnOri-4-2_\n");
    ends.record.orient2sameAs1 = true;
    EXPECT_EQ(ends.Line(), "Join,\n\"D 1\",\n");
}

TEST(ConnectorSection, OwnNameOfTheOrientation_GoesIntoTheReference) {
    Ends ends;
    ends.record.name = "mine";
    ends.record.csys1 = ends.second;
    ends.record.angle1 = 5;
    EXPECT_EQ(ends.Line(), "Join,\nE_mine-1_,\n");
}

TEST(ConnectorSection, Slipring_HasItsDataBehindABlankLineOfOrientations) {
    kseC_ConnectorSection section = Section(Assembled::SLIPRING);
    EXPECT_EQ(Data(section), "SlipRing,\n\n0., \n");
    section.massPerLength = 2.5;
    section.contactAngle = 90;
    section.materialFlowFactor = 3; // of other types
    EXPECT_EQ(Data(section), "SlipRing,\n\n2.5, 90.\n");
}

TEST(ConnectorSection, SlipringWithOrientations_HasNoBlankLine) {
    Ends ends;
    ends.record.csys1 = ends.second;
    EXPECT_EQ(Data(Section(Assembled::SLIPRING), ends.record, &ends), "SlipRing,\nE,\n0., \n");
}

TEST(ConnectorSection, FlowFactor_IsOfRetractors) {
    kseC_ConnectorSection section = Section(Assembled::RETRACTOR);
    EXPECT_EQ(Data(section), "Retractor,\n");
    section.materialFlowFactor = 0.5;
    EXPECT_EQ(Data(section), "Retractor,\n\n0.5\n");
    Ends ends;
    ends.record.csys2 = ends.second;
    EXPECT_EQ(Data(section, ends.record, &ends), "Retractor,\n, E\n0.5\n");
}

TEST(ConnectorSection, FlowFactor_IsOfProjectionCartesianAndNotOfFlowConvertersOnPurpose) {
    kseC_ConnectorSection section = Basic(Translational::PROJECTION_CARTESIAN, Rotational::NONE);
    section.materialFlowFactor = 0.5;
    EXPECT_EQ(Data(section), "Projection Cartesian,\n\n0.5\n");
    section = Basic(Translational::NONE, Rotational::FLOW_CONVERTER);
    section.materialFlowFactor = 0.5;
    EXPECT_EQ(Data(section), "Flow-Converter,\n");
}

TEST(ConnectorBehavior, Defaults_WriteTheNameAlone) {
    EXPECT_EQ(Written(oif_ConnectorBehavior("a b", true, false, 0.03, false, false)),
              "*Connector Behavior, name=\"a b\"\n");
}

TEST(ConnectorBehavior, EveryParameter_StandsInItsPlace) {
    EXPECT_EQ(Written(oif_ConnectorBehavior("B", true, false, 0.1, true, true)),
              "*Connector Behavior, name=B, integration=EXPLICIT, rtol=0.1, extrapolation=LINEAR\n");
    EXPECT_EQ(Written(oif_ConnectorBehavior("B", false, false, 0.1, true, false)),
              "*Connector Behavior, name=B, regularize=OFF, extrapolation=LINEAR\n");
    EXPECT_EQ(Written(oif_ConnectorBehavior("B", true, true, 0.1, false, false)),
              "*Connector Behavior, name=B\n");
}

TEST(ConnectorBehavior, LongLine_BreaksAheadOfARegularizationButNotOfTheIntegration) {
    const std::string name(110, 'n'); // with 26 characters ahead of it
    EXPECT_EQ(Written(oif_ConnectorBehavior(name, false, false, 0.03, false, true)),
              "*Connector Behavior, name=" + name + ", integration=EXPLICIT, \nregularize=OFF\n");
}

TEST(ConnectorConstitutiveReference, UnsetValues_LeaveTheirPlacesEmpty) {
    kseC_ConnectorSection section;
    EXPECT_EQ(Written(oif_ConnectorConstitutiveReference(section)), "");
    section.constitutiveReference.Get(1) = 2.5;
    section.constitutiveReference.Get(3) = 90;
    EXPECT_EQ(Written(oif_ConnectorConstitutiveReference(section)),
              "*Connector Constitutive Reference\n, 2.5, , 90., , \n");
    section.constitutiveReference = List({1.0, 2.0, 3.0, 4.0, 5.0, 6.0});
    EXPECT_EQ(Written(oif_ConnectorConstitutiveReference(section)),
              "*Connector Constitutive Reference\n1., 2., 3., 4., 5., 6.\n");
}

TEST_F(Connectors, SectionOfManyAssignments_HasOneBehaviourBlock) {
    kseC_ConnectorSection section = Section(Assembled::BEAM);
    section.options.Append(mdl_ObjCow<kbeC_ConnectorBehaviorOption>(Stop(1)));
    store.model.sections.Insert("C", section);
    Assign("", "W", "C");
    Assign("", "X 1", "C");
    Assign("", "W", "C");
    Build();
    const std::string first = kElement7 + "*Connector Section, elset=W, behavior=C\nBeam,\n";
    EXPECT_EQ(assembly, first + kElement8 + "*Connector Section, elset=\"X 1\", behavior=C\nBeam,\n" + first);
    EXPECT_EQ(model, "*Connector Behavior, name=C\n*Connector Stop, component=1\n1., \n");
}

TEST_F(Connectors, SectionWithoutBehaviour_HasNoBlock) {
    store.model.sections.Insert("C", Section(Assembled::BEAM));
    Assign("", "W", "C");
    Build();
    EXPECT_EQ(assembly, kElement7 + "*Connector Section, elset=W\nBeam,\n");
    EXPECT_EQ(model, "");
}

TEST_F(Connectors, RegionOfAnInstance_GetsItsSectionButNoElements) {
    store.model.sections.Insert("C", Section(Assembled::BEAM));
    Assign("I", "OWN", "C");
    Build();
    EXPECT_EQ(assembly, "*Connector Section, elset=I.OWN\nBeam,\n");
}

TEST_F(Connectors, OtherAndUnknownSections_AreLeftOut) {
    store.model.sections.Insert("SOLID", kseC_HomogenousSolidSection());
    Assign("", "W", "SOLID");
    Assign("", "W", "gone");
    Build();
    EXPECT_EQ(assembly + model, "");
}

TEST_F(Connectors, FirstOrientationOfTheRegion_IsTaken) {
    store.model.sections.Insert("C", Section(Assembled::BEAM));
    const dtmC_DatumRef first = store.Add("D");
    const dtmC_DatumRef second = store.Add("E");
    const auto orient = [&](const char* set, const dtmC_DatumRef& datum) {
        ptoC_ConnectorOrientation ends;
        ends.region = store.model.Region("", set);
        ends.csys1 = datum;
        ends.angle1 = 1;
        store.model.AssemblyObject().AppendConnectorOrientation(ends);
    };
    orient("X 1", first);
    orient("W", second);
    orient("W", first);
    Assign("", "W", "C");
    Build();
    EXPECT_EQ(assembly, kElement7 + "*Connector Section, elset=W\nBeam,\nE_ConnOri-1-1_,\n");
}

TEST_F(Connectors, OrientationOfAnotherClass_Raises) {
    store.model.sections.Insert("C", Section(Assembled::BEAM));
    Assign("", "W", "C");
    ptoC_SectionAssignment wrong;
    wrong.region = store.model.Region("", "W");
    store.model.AssemblyObject().connectorOrientations.Append(wrong);
    EXPECT_NE(Raised([&] { Build(); }), "nothing raised");
}

TEST_F(Connectors, Behaviour_HasItsOptionsInOrderAndDerivedComponentsBehindAll) {
    kbeC_CDCTerm term;
    term.components = List({1, 2});
    term.table = Table({{3, 4}});
    kbeC_DerivedComponent derived;
    derived.terms = List({term});
    kbeC_ConnectorFriction friction;
    friction.formulation = kbeC_ConnectorFriction::FormulationEnm::USER_DEFINED;
    friction.contactForceType = kbeC_ConnectorFriction::ContactForceTypeEnm::DERIVED_COMPONENT;
    friction.contactForceDerived = mdl_ObjCow<kbeC_DerivedComponent>(derived);
    kbeC_ConnectorElasticity elasticity;
    elasticity.behavior = kbeC_ConnectorElasticity::BehaviorEnm::RIGID;
    elasticity.components = List({6});
    kbeC_ConnectorDamping damping;
    damping.components = List({1});
    kbeC_ConnectorLock lock;
    lock.components = List({2});
    lock.minForce = -1;
    kbeC_ConnectorFailure failure;
    failure.components = List({3});
    failure.maxForce = 1;
    kseC_ConnectorSection section = Section(Assembled::BEAM);
    section.constitutiveReference.Get(0) = 1.0;
    const auto add = [&](const auto& option) {
        section.options.Append(mdl_ObjCow<kbeC_ConnectorBehaviorOption>(option));
    };
    add(friction);
    add(Stop(0.5));
    add(elasticity);
    add(damping);
    add(lock);
    add(failure);
    add(kbeC_ConnectorPlasticity());
    add(kbeC_ConnectorDamage());
    store.model.sections.Insert("C", section);
    Assign("", "W", "C");
    Build();
    EXPECT_EQ(model, "*Connector Behavior, name=C\n"
                     "*Connector Constitutive Reference\n"
                     "1., , , , , \n"
                     "*Connector Friction, contact force=BO-0-DC\n"
                     "*Connector Stop, component=1\n"
                     "0.5, \n"
                     "*Connector Elasticity, rigid\n"
                     "6\n"
                     "*Connector Damping, component=1\n"
                     "*Connector Lock, component=2\n"
                     ", , -1., \n"
                     "*Connector Failure, component=3\n"
                     ", , , 1.\n"
                     "*Connector Plasticity\n"
                     "*Connector Damage Initiation\n"
                     "*Connector Derived Component, name=BO-0-DC\n"
                     "1, 2\n"
                     "3.,4.\n");
}
