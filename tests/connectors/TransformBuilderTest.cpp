#include "connectors/ConnectorTesting.h"
#include "sections/oif_TransformBuilder.h"
#include "store_interface/records/conditions/kloC_Loads.h"

namespace {

/// A condition in any system, and one that counts also without.
class Fixed final : public cls_RecordOf<Fixed, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"TestFixed", "a condition"};
    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};
class Symmetry final : public cls_RecordOf<Symmetry, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"TestSymmetry", "a symmetry condition", 0x298000E};
    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};

class Transforms : public testing::Test {
protected:
    Transforms() {
        odiK_Part& part = store.AddPart("P", {1, 2});
        part.mesh->AddNodeSet("A", {1});
        part.mesh->AddNodeSet("B 1", {2});
        store.model.AddInstance("I", "P");
    }
    template <class Condition = Fixed>
    void Add(const char* name, const char* set, const dtmC_DatumRef& datum, bool suppressed = false) {
        Condition condition;
        if (set != nullptr) condition.region = store.model.Region("I", set);
        condition.datum = datum;
        condition.suppressed = suppressed;
        store.model.boundaryConditions.Insert(name, condition);
    }
    template <class Load>
    void AddLoad(const char* name, const char* set, const dtmC_DatumRef& datum, bool suppressed = false) {
        Load load;
        if (set != nullptr) load.region = store.model.Region("I", set);
        load.datum = datum;
        load.suppressed = suppressed;
        store.model.loads.Insert(name, load);
    }
    void Orient(const dtmC_DatumRef& first, double angle1, const dtmC_DatumRef& second, double angle2) {
        ptoC_ConnectorOrientation ends;
        ends.csys1 = first;
        ends.angle1 = angle1;
        ends.csys2 = second;
        ends.angle2 = angle2;
        ends.axis2 = ptoC_MaterialOrientation::axisEnm::AXIS_3;
        Append(ends);
    }
    void Append(const ptoC_ConnectorOrientation& ends) {
        store.model.AssemblyObject().AppendConnectorOrientation(ends);
    }
    std::string Text() {
        oif_TransformBuilder builder(store.Info());
        builder.Build();
        return WrittenAll(builder.AssemblyDefinition());
    }

    CsysStore store;
};

} // namespace

TEST_F(Transforms, EmptyModel_GivesNone) {
    EXPECT_EQ(Text(), "");
}

TEST_F(Transforms, RegionsOfOneSystem_BecomeMembersOfOneSet) {
    const dtmC_DatumRef datum = store.Add("D");
    Add("b2", "A", datum);
    Add("b1", "B 1", datum);
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\nI.\"B 1\", \nI.A, \n*Transform, nset=_T-D\n" + kUnitAxes);
}

TEST_F(Transforms, OneRegionTwice_IsOneMember) {
    const dtmC_DatumRef datum = store.Add("D");
    Add("b1", "A", datum);
    Add("b2", "A", datum);
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\nI.A, \n*Transform, nset=_T-D\n" + kUnitAxes);
}

TEST_F(Transforms, Systems_StandInTheOrderOfTheirFirstRegion) {
    const dtmC_DatumRef first = store.Add("one");
    const dtmC_DatumRef second = store.Add("two 2");
    Add("b1", "A", second);
    Add("b2", "A", first);
    Add("b3", "B 1", second);
    EXPECT_EQ(Text(), "*Nset, nset=\"_T-two 2\"\nI.A, \nI.\"B 1\", \n*Transform, nset=\"_T-two 2\"\n" +
                          kUnitAxes + "*Nset, nset=_T-one\nI.A, \n*Transform, nset=_T-one\n" + kUnitAxes);
}

TEST_F(Transforms, ReferenceByTheNumberAlone_IsTheSameSystem) {
    Add("b1", "A", store.Add("D"));
    Add("b2", "B 1", dtmC_DatumRef(1, 0, ""));
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\nI.A, \nI.\"B 1\", \n*Transform, nset=_T-D\n" + kUnitAxes);
}

TEST_F(Transforms, SuppressedAndWithoutASystem_AreLeftOut) {
    Add("b1", "A", store.Add("D"), true);
    Add("b2", "A", dtmC_DatumRef());
    Add<Symmetry>("b3", "A", store.Add("E"), true);
    EXPECT_EQ(Text(), "");
}

TEST_F(Transforms, SymmetryWithoutASystem_HasASetButNoTransformOnPurpose) {
    Add<Symmetry>("b1", "A", dtmC_DatumRef());
    Add<Symmetry>("b2", "B 1", dtmC_DatumRef());
    EXPECT_EQ(Text(), "*Nset, nset=_T-\nI.A, \nI.\"B 1\", \n");
}

TEST_F(Transforms, NullRegion_IsTheEmptyMember) {
    Add("b1", nullptr, store.Add("D"));
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\n, \n*Transform, nset=_T-D\n" + kUnitAxes);
}

TEST_F(Transforms, DatumOfAnotherKind_Raises) {
    Add("b1", "A", store.AddPoint("P"));
    EXPECT_EQ(Raised([&] { Text(); }), "Wrong datum type during input generation");
}

TEST_F(Transforms, ConnectorWithoutAngles_HasTheSystemsNamesAlone) {
    Orient(store.Add("D"), 0, store.Add("E 2"), 0);
    EXPECT_EQ(Text(), "*Orientation, name=D\n" + kUnitAxes + "1, 0.\n*Orientation, name=\"E 2\"\n" +
                          kUnitAxes + "3, 0.\n");
}

TEST_F(Transforms, ConnectorWithAngles_NamesEachSide) {
    const dtmC_DatumRef datum = store.Add("D");
    Orient(datum, 30, datum, -1e-300);
    Orient(datum, 30, {}, 0);
    EXPECT_EQ(Text(), "*Orientation, name=D_ConnOri-0-1_\n" + kUnitAxes +
                          "1, 30.\n*Orientation, name=D_ConnOri-0-2_\n" + kUnitAxes +
                          "3, -1e-300\n*Orientation, name=D_ConnOri-1-1_\n" + kUnitAxes + "1, 30.\n");
}

TEST_F(Transforms, SystemOfManyConnectors_IsWrittenOnceAsItsFirstUseHasIt) {
    const dtmC_DatumRef datum = store.Add("D");
    Orient({}, 0, datum, 0);
    Orient(datum, 0, datum, 0);
    EXPECT_EQ(Text(), "*Orientation, name=D\n" + kUnitAxes + "3, 0.\n");
}

TEST_F(Transforms, SharedOrientation_StillDefinesTheSecondSystem) {
    ptoC_ConnectorOrientation ends;
    ends.csys1 = store.Add("D");
    ends.csys2 = store.Add("E");
    ends.orient2sameAs1 = true;
    Append(ends);
    EXPECT_EQ(Text(),
              "*Orientation, name=D\n" + kUnitAxes + "1, 0.\n*Orientation, name=E\n" + kUnitAxes + "1, 0.\n");
}

TEST_F(Transforms, OwnNameOfAConnectorOrientation_DoesNotCountHereOnPurpose) {
    ptoC_ConnectorOrientation ends;
    ends.name = "mine";
    ends.csys1 = store.Add("D");
    ends.angle1 = 30;
    Append(ends);
    EXPECT_EQ(Text(), "*Orientation, name=D_ConnOri-0-1_\n" + kUnitAxes + "1, 30.\n");
}

TEST_F(Transforms, Transforms_StandAheadOfOrientations) {
    const dtmC_DatumRef datum = store.Add("D");
    Orient(datum, 0, {}, 0);
    Add("b1", "A", datum);
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\nI.A, \n*Transform, nset=_T-D\n" + kUnitAxes +
                          "*Orientation, name=D\n" + kUnitAxes + "1, 0.\n");
}

TEST_F(Transforms, ForcesAndMoments_StandBehindTheConditionsOfTheirSystem) {
    const dtmC_DatumRef datum = store.Add("D");
    AddLoad<kloC_Moment>("a", "A", datum);
    AddLoad<kloC_ConcentratedForce>("b", "A", datum);
    AddLoad<kloC_ConcentratedForce>("c", nullptr, store.Add("E"));
    Add("z", "B 1", datum);
    EXPECT_EQ(Text(), "*Nset, nset=_T-D\nI.\"B 1\", \nI.A, \n*Transform, nset=_T-D\n" + kUnitAxes +
                          "*Nset, nset=_T-E\n, \n*Transform, nset=_T-E\n" + kUnitAxes);
}

TEST_F(Transforms, OtherLoadsAndThoseWithoutASystem_HaveNoTransform) {
    AddLoad<kloC_SurfaceTraction>("a", "A", store.Add("D"));
    AddLoad<kloC_ConcentratedForce>("b", "A", {});
    AddLoad<kloC_Moment>("c", "A", store.Add("E"), true);
    EXPECT_EQ(Text(), "");
}

TEST_F(Transforms, InertiaRelief_HasAnOrientationBehindThoseOfConnectors) {
    const dtmC_DatumRef datum = store.Add("D");
    AddLoad<kloC_InertiaRelief>("a", nullptr, datum);
    AddLoad<kloC_InertiaRelief>("b", "A", datum);
    AddLoad<kloC_InertiaRelief>("c", "A", {});
    AddLoad<kloC_InertiaRelief>("d", "A", store.Add("F"), true);
    Orient(store.Add("E"), 0, {}, 0);
    EXPECT_EQ(Text(),
              "*Orientation, name=E\n" + kUnitAxes + "1, 0.\n*Orientation, name=D\n" + kUnitAxes + "1, 0.\n");
}

TEST_F(Transforms, InertiaReliefInTheSystemOfAConnector_UsesItsOrientation) {
    const dtmC_DatumRef datum = store.Add("D");
    Orient({}, 0, datum, 0);
    AddLoad<kloC_InertiaRelief>("a", nullptr, datum);
    EXPECT_EQ(Text(), "*Orientation, name=D\n" + kUnitAxes + "3, 0.\n");
}

TEST_F(Transforms, ConnectorOrientationOfAnotherClass_Raises) {
    store.model.AssemblyObject().connectorOrientations.Append(ptoC_SectionAssignment());
    EXPECT_NE(Raised([&] { Text(); }), "nothing raised");
}
