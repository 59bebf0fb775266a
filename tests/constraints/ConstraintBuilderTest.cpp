#include "constraints/oif_ConstraintBuilder.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "support/DeckTest.h"

namespace {

class Unknown final : public cls_RecordOf<Unknown, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"TestUnknownConstraint", "a constraint that no keyword tells"};
};

class ConstraintBuilder : public testing::Test {
protected:
    ConstraintBuilder() {
        odiK_Part& part = store.AddPart("P", {1, 2});
        part.mesh->AddNodeSet("N", {1, 2});
        store.model.AddInstance("I", "P");
        tie.master = tie.slave = store.model.Region("I", "N");
    }
    void MakeCyclic() {
        ddb_ModelSectorDefinition sector;
        sector.symmetryType = calC_SymmetryTypeEnm::CYCLIC;
        sector.numberOfSectors = 8;
        store.model.cyclicSymmetry = sector;
    }
    void Build() {
        oif_ConstraintBuilder builder(store.Info());
        builder.Build();
        model = WrittenAll(builder.ModelDefinition());
        assembly = WrittenAll(builder.AssemblyDefinition());
    }

    TestStore store;
    kcoC_Tie tie;
    std::string model;
    std::string assembly;
};

constexpr int kExplicit = 1;

} // namespace

TEST_F(ConstraintBuilder, NoConstraint_HasNoBannerEither) {
    Build();
    EXPECT_EQ(model, "");
    EXPECT_EQ(assembly, "");
}

TEST_F(ConstraintBuilder, Constraints_StandInTheOrderOfTheirNamesEachBehindItsComment) {
    kcoC_Coupling coupling;
    coupling.surface = coupling.refNode = store.model.Region("I", "N");
    store.model.constraints.Insert("d", coupling);
    coupling.distributing = true;
    odiK_Coupling other;
    static_cast<kcoC_Coupling&>(other) = coupling;
    store.model.constraints.Insert("c", other);
    store.model.constraints.Insert("a", tie);
    kcoC_RigidBody body;
    body.refNode = body.pinNodes = body.tieNodes = body.surface = store.model.Region("I", "N");
    body.isothermal = true;
    store.model.constraints.Insert("b", body);
    kcoC_EmbeddedRegion region;
    region.host = region.embedded = store.model.Region("I", "N");
    store.model.constraints.Insert("e", region);
    kcoC_ShellSolidCoupling edge;
    edge.shellEdge = edge.solidFace = store.model.Region("I", "N");
    store.model.constraints.Insert("f", edge);
    store.model.constraints.Insert("g", kcoC_Equation());
    Build();
    EXPECT_EQ(model, "");
    EXPECT_EQ(assembly,
              "** Constraint: a\n*Tie, name=a, adjust=yes\nI_N_CNS_, I_N_CNS_\n"
              "** Constraint: b\n*Rigid Body, ref node=I.N, pin nset=I.N, tie nset=I.N, analytical "
              "surface=I_N_CNS_, isothermal=YES\n"
              "** Constraint: c\n*Coupling, constraint name=c, ref node=I.N, surface=I_N_CNS_\n"
              "*Distributing, weighting method=UNIFORM\n"
              "** Constraint: d\n*Coupling, constraint name=d, ref node=I.N, surface=I_N_CNS_\n*Kinematic\n"
              "** Constraint: e\n*Embedded Element, host elset=I.N\nI.N\n"
              "** Constraint: f\n*Shell to Solid Coupling, constraint name=f\nI_N_CNS_, I_N_CNS_\n"
              "** Constraint: g\n*Equation\n0\n");
}

TEST_F(ConstraintBuilder, RigidBody_WithoutRegions_HasOnlyAnEmptyReferenceNode) {
    store.model.constraints.Insert("r", kcoC_RigidBody());
    Build();
    EXPECT_EQ(assembly, "** Constraint: r\n*Rigid Body, ref node=\n");
}

TEST_F(ConstraintBuilder, CyclicModel_IsToldInTheModelAndAtItsTies) {
    MakeCyclic();
    store.model.constraints.Insert("plain", tie);
    tie.cyclicSymmetry = true;
    store.model.constraints.Insert("sides", tie);
    Build();
    EXPECT_EQ(model, "*Cyclic Symmetry Model, n=8\n0., 0., 0., 0., 0., 1.\n");
    EXPECT_EQ(assembly, "** Constraint: plain\n*Tie, name=plain, adjust=yes\nI_N_CNS_, I_N_CNS_\n"
                        "** Constraint: sides\n*Tie, name=sides, adjust=yes, cyclic symmetry\n"
                        "I_N_CNS_, I_N_CNS_\n");
}

TEST_F(ConstraintBuilder, CyclicTieOfAModelThatIsNot_IsAPlainTie) {
    tie.cyclicSymmetry = true;
    store.model.constraints.Insert("t", tie);
    Build();
    EXPECT_EQ(model, "");
    EXPECT_EQ(assembly, "** Constraint: t\n*Tie, name=t, adjust=yes\nI_N_CNS_, I_N_CNS_\n");
}

TEST_F(ConstraintBuilder, CyclicModelInAnExplicitAnalysis_Raises) {
    MakeCyclic();
    store.model.analysisProduct = kExplicit;
    EXPECT_EQ(Raised([this] { Build(); }), "Cyclic symmetry is not valid for Explicit.");
}

TEST_F(ConstraintBuilder, UnknownConstraint_Raises) {
    store.model.constraints.Insert("u", Unknown());
    EXPECT_EQ(Raised([this] { Build(); }), "Unimplemented constraint type.");
}
