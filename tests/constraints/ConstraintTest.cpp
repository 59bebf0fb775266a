#include "constraints/oif_Constraints.h"
#include "support/DeckTest.h"

namespace {

/// An instance "I" with a node set, an element set and a surface.
class Constraints : public testing::Test {
protected:
    Constraints() {
        odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
        part.mesh->AddElements("S4R", {1}, 4, {1, 2, 3, 4});
        part.mesh->AddNodeSet("N", {1, 2});
        part.mesh->AddElementSet("E 1", {1});
        part.mesh->AddSurface("S", {{1, -1, "SPOS"}});
        part.mesh->AddSurface("T", {{1, -1, "SNEG"}});
        store.model.AddInstance("I", "P");
    }
    rgnC_Region Region(const char* set) { return store.model.Region("I", set); }

    TestStore store;
};

} // namespace

TEST_F(Constraints, Tie_AtItsDefaults_SaysOnlyThatItAdjusts) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("T");
    EXPECT_EQ(Written(oif_Tie("t", tie, store.Info(), false)), "*Tie, name=t, adjust=yes\nI.T, I.S\n");
}

TEST_F(Constraints, Tie_WithAllParameters_WritesThemInOrder) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("T");
    tie.adjust = false;
    tie.positionToleranceMethod = 1;
    tie.positionTolerance = 0.5;
    tie.tieRotations = false;
    tie.constraintRatioMethod = 1;
    tie.constraintRatio = 0.25;
    tie.type = 2;
    tie.thickness = false;
    EXPECT_EQ(Written(oif_Tie("t", tie, store.Info(), true)),
              "*Tie, name=t, adjust=no, position tolerance=0.5, no rotation, constraint ratio=0.25, "
              "cyclic symmetry, type=SURFACE TO SURFACE, no thickness\n"
              // The line may break behind its last parameter, ahead of its end.
              "\nI.T, I.S\n");
}

TEST_F(Constraints, Tie_PastTheLimit_BreaksBehindAParameterAndGoesOnWithTheNextComma) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("T");
    tie.tieRotations = false;
    tie.type = 1;
    const std::string name(100, 'x');
    EXPECT_EQ(Written(oif_Tie(cow_String(name), tie, store.Info(), false)),
              "*Tie, name=" + name + ", adjust=yes, no rotation\n, type=NODE TO SURFACE\nI.T, I.S\n");
}

TEST_F(Constraints, Tie_MethodsOfZero_LeaveTheirNumbersOut) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("T");
    tie.positionTolerance = 0.5;
    tie.constraintRatio = 0.25;
    tie.type = 1;
    EXPECT_EQ(Written(oif_Tie("t", tie, store.Info(), false)),
              "*Tie, name=t, adjust=yes, type=NODE TO SURFACE\nI.T, I.S\n");
}

TEST_F(Constraints, Tie_ToANodeSet_NamesItsNodeBasedSurface) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("N");
    EXPECT_EQ(Written(oif_Tie("t", tie, store.Info(), false)),
              "*Tie, name=t, adjust=yes\nI_N_CNS_, I.S\n");
}

TEST_F(Constraints, Tie_FromNames_HasOnlyATolerance) {
    EXPECT_EQ(Written(oif_Tie("t", "M", "S", 0.1, store.Info())),
              "*Tie, name=t, position tolerance=0.1\nS, M\n");
    EXPECT_EQ(Written(oif_Tie("t", "M", "S", 0.0, store.Info())), "*Tie, name=t\nS, M\n");
}

TEST_F(Constraints, Tie_AnswersWithTheStoresClass) {
    EXPECT_EQ(kcoC_Tie().DynTypeId(), odiK_Tie::TypeId());
    EXPECT_EQ(odiK_Tie().DynTypeId(), odiK_Tie::TypeId());
    EXPECT_EQ(kcoC_Coupling().DynTypeId(), kcoC_Coupling::TypeId());
    EXPECT_EQ(odiK_Coupling().DynTypeId(), odiK_Coupling::TypeId());
}

TEST_F(Constraints, Coupling_NamesItsNodeAndSurface) {
    kcoC_Coupling coupling;
    coupling.refNode = Region("N");
    coupling.surface = Region("S");
    EXPECT_EQ(Written(oif_Coupling("c", coupling, store.Info())),
              "*Coupling, constraint name=c, ref node=I.N, surface=I.S\n");
    coupling.influenceRadius = 2.0;
    EXPECT_EQ(Written(oif_Coupling("c", coupling, store.Info())),
              "*Coupling, constraint name=c, ref node=I.N, surface=I.S, influence radius=2.\n");
}

TEST_F(Constraints, Coupling_InASystem_NamesItsOrientation) {
    odiK_Datum datum;
    datum.name = "Sys 1";
    store.model.AddDatum(datum);
    kcoC_Coupling coupling;
    coupling.refNode = Region("N");
    coupling.surface = Region("S");
    coupling.orientation = dtmC_DatumRef(1);
    EXPECT_EQ(Written(oif_Coupling("c", coupling, store.Info())),
              "*Coupling, constraint name=c, ref node=I.N, surface=I.S, orientation=\"Sys 1\"\n");
}

TEST_F(Constraints, Coupling_FromNames_LeavesItsLineOpen) {
    EXPECT_EQ(Written(oif_Coupling("c 1", "R", "S", 1.0, store.Info())),
              "*Coupling, constraint name=\"c 1\"");
}

TEST_F(Constraints, Kinematic_OfAllDegreesOfFreedom_ListsNone) {
    EXPECT_EQ(Written(oif_Kinematic(kcoC_Coupling())), "*Kinematic\n");
}

TEST_F(Constraints, Kinematic_OfSome_ListsEach) {
    kcoC_Coupling coupling;
    coupling.u2 = coupling.u3 = coupling.ur1 = coupling.ur2 = coupling.ur3 = false;
    EXPECT_EQ(Written(oif_Kinematic(coupling)), "*Kinematic\n1, 1\n");
    coupling.u1 = false;
    EXPECT_EQ(Written(oif_Kinematic(coupling)), "*Kinematic\n");
    coupling.u2 = coupling.u3 = coupling.ur1 = coupling.ur2 = coupling.ur3 = true;
    EXPECT_EQ(Written(oif_Kinematic(coupling)), "*Kinematic\n2, 2\n3, 3\n4, 4\n5, 5\n6, 6\n");
}

TEST_F(Constraints, Distributing_TellsHowWeightsFall) {
    const char* const methods[] = {"UNIFORM", "LINEAR", "QUADRATIC", "CUBIC"};
    kcoC_Coupling coupling;
    for (int i = 0; i < 4; ++i) {
        coupling.weightingMethod = i;
        EXPECT_EQ(Written(oif_Distributing(coupling)),
                  std::string("*Distributing, weighting method=") + methods[i] + "\n");
    }
    coupling.ur3 = false;
    EXPECT_EQ(Written(oif_Distributing(coupling)),
              "*Distributing, weighting method=CUBIC\n1, 1\n2, 2\n3, 3\n4, 4\n5, 5\n");
}

TEST_F(Constraints, Distributing_OfAnUnknownMethod_EndsBehindTheEqualsSign) {
    kcoC_Coupling coupling;
    for (const int method : {-1, 4}) {
        coupling.weightingMethod = method;
        EXPECT_EQ(Written(oif_Distributing(coupling)), "*Distributing, weighting method=\n");
    }
}

TEST_F(Constraints, RigidBody_OfElementsAlone_IsOneLine) {
    EXPECT_EQ(Written(oif_RigidBody("R", "E", "", "", "", false, false)),
              "*Rigid Body, ref node=R, elset=E\n");
    EXPECT_EQ(Written(oif_RigidBody("R", "", "", false)), "*Rigid Body, ref node=R\n");
}

TEST_F(Constraints, RigidBody_WithEverything_WritesItInOrder) {
    EXPECT_EQ(Written(oif_RigidBody("R", "E", "P", "T", "A", true, true)),
              "*Rigid Body, ref node=R, elset=E, pin nset=P, tie nset=T, analytical surface=A, position=CENTER "
              "OF MASS, isothermal=YES\n");
    EXPECT_EQ(Written(oif_RigidBody("R", "E", "A", true)),
              "*Rigid Body, ref node=R, elset=E, analytical surface=A, isothermal=YES\n");
}

TEST_F(Constraints, EmbeddedRegion_AtItsDefaults_HasNoTolerance) {
    kcoC_EmbeddedRegion region;
    region.host = Region("E 1");
    region.embedded = Region("N");
    EXPECT_EQ(Written(oif_EmbeddedRegion("e", region, store.Info())),
              "*Embedded Element, host elset=I.\"E 1\"\nI.N\n");
}

TEST_F(Constraints, EmbeddedRegion_WritesTheLengthAheadOfTheFraction) {
    EXPECT_EQ(Written(oif_EmbeddedRegion("e", "H", "E", 0.1, 2.0, 0.0, store.Info())),
              "*Embedded Element, host elset=H, absolute exterior tolerance=2., exterior tolerance=0.1, "
              "roundoff tolerance=0.\nE\n");
}

TEST_F(Constraints, Equation_CountsItsTerms) {
    kcoC_Equation equation;
    EXPECT_EQ(Written(oif_Equation("q", equation)), "*Equation\n0\n");
    kcoC_EquationTerm term;
    term.setName = "I.N";
    term.dof = 2;
    term.coefficient = 1.0;
    equation.terms.Append(term);
    term.setName = "a b";
    term.dof = 6;
    term.coefficient = -0.5;
    equation.terms.Append(term);
    EXPECT_EQ(Written(oif_Equation("q", equation)), "*Equation\n2\nI.N, 2, 1.\n\"a b\", 6, -0.5\n");
}

TEST_F(Constraints, Equation_OfAnotherConstraint_Raises) {
    EXPECT_NE(Raised([] { oif_Equation("q", kcoC_RigidBody()); }).find("kcoC_Equation"), std::string::npos);
}

TEST_F(Constraints, ShellSolidCoupling_WritesItsDistancesOnlyWhenGiven) {
    kcoC_ShellSolidCoupling coupling;
    coupling.shellEdge = Region("S");
    coupling.solidFace = Region("N");
    coupling.positionTolerance = 0.1;
    coupling.influenceDistance = 3.0;
    EXPECT_EQ(Written(oif_ShellSolidCoupling("s", coupling, store.Info())),
              "*Shell to Solid Coupling, constraint name=s\nI.S, I_N_CNS_\n");
    coupling.positionToleranceMethod = 1;
    coupling.influenceDistanceMethod = 1;
    EXPECT_EQ(Written(oif_ShellSolidCoupling("s", coupling, store.Info())),
              "*Shell to Solid Coupling, constraint name=s, position tolerance=0.1, influence distance=3.\n"
              "I.S, I_N_CNS_\n");
}

TEST_F(Constraints, CyclicSymmetryModel_WritesItsAxisInSinglePrecision) {
    EXPECT_EQ(Written(oif_CyclicSymmetryModel({0.0, 0.0, 0.0}, {0.0, 0.1, 123456789.0}, 12)),
              "*Cyclic Symmetry Model, n=12\n0., 0., 0., 0., 0.1, 1.23457e+08\n");
}

TEST_F(Constraints, NodeSetsNamedAsSurfaces_AreTold) {
    kcoC_Tie tie;
    tie.master = Region("S");
    tie.slave = Region("N");
    EXPECT_EQ(tie.ConstGetContactNodeSets().Length(), 1);
    EXPECT_TRUE(tie.ConstGetContactNodeSets()[0] == tie.slave);
    kcoC_Coupling coupling;
    coupling.refNode = Region("N");
    EXPECT_TRUE(coupling.ConstGetContactNodeSets().IsEmpty());
    coupling.surface = Region("N");
    EXPECT_EQ(coupling.ConstGetContactNodeSets().Length(), 1);
    kcoC_RigidBody body;
    body.pinNodes = Region("N");
    EXPECT_TRUE(body.ConstGetContactNodeSets().IsEmpty());
    body.surface = Region("N");
    EXPECT_EQ(body.ConstGetContactNodeSets().Length(), 1);
    kcoC_ShellSolidCoupling edge;
    edge.shellEdge = Region("E 1");
    edge.solidFace = Region("N");
    EXPECT_EQ(edge.ConstGetContactNodeSets().Length(), 1);
    EXPECT_TRUE(kcoC_EmbeddedRegion().ConstGetContactNodeSets().IsEmpty());
}
