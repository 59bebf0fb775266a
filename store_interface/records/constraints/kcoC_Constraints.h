#ifndef QRX_STORE_KCOC_CONSTRAINTS_H
#define QRX_STORE_KCOC_CONSTRAINTS_H

#include "store_interface/records/constraints/kcoC_Constraint.h"

class cls_ClassRegistrar;

class kcoC_Tie : public cls_RecordOf<kcoC_Tie, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_Tie", "two surfaces tied together", 0x2B00002,
                                         "TieConstraint"};

    rgnC_Region master;
    rgnC_Region slave;
    bool adjust = true;
    double positionTolerance = 0.0;
    bool tieRotations = true;
    int positionToleranceMethod = 0;
    int constraintRatioMethod = 0;
    double constraintRatio = 0.0;
    int type = 0;
    bool thickness = true;
    bool cyclicSymmetry = false;

    /// That of odiK_Tie, for both classes.
    unsigned DynTypeId() const override;
    bool IsCyclic() const override { return cyclicSymmetry; }
    cow_List<rgnC_Region> ConstGetContactNodeSets() const override;

    static const cls_FieldTable& Fields();
};

/// A tie under the class that it answers with.
class odiK_Tie final : public cls_RecordOf<odiK_Tie, kcoC_Tie> {
public:
    static constexpr cls_ClassInfo Class{
        "odiK_Tie", "a tie by the class that every tie answers with; take Tie", 0x2B00003};
};

class kcoC_Coupling : public cls_RecordOf<kcoC_Coupling, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_Coupling", "the nodes of a surface follow a reference node",
                                         0x2B00004, "CouplingConstraint"};

    static constexpr double influenceRadiusDef() { return cls_UnsetDouble; }

    rgnC_Region surface;
    rgnC_Region refNode;
    double influenceRadius = influenceRadiusDef();
    bool distributing = false;
    dtmC_DatumRef orientation;
    bool u1 = true;
    bool u2 = true;
    bool u3 = true;
    bool ur1 = true;
    bool ur2 = true;
    bool ur3 = true;
    int weightingMethod = 0;

    cow_List<rgnC_Region> ConstGetContactNodeSets() const override;

    static const cls_FieldTable& Fields();
};

class odiK_Coupling final : public cls_RecordOf<odiK_Coupling, kcoC_Coupling> {
public:
    static constexpr cls_ClassInfo Class{
        "odiK_Coupling",
        "a coupling by the other class that stores hold, with the same lines in a deck; take Coupling",
        0x2B00005};
};

class kcoC_RigidBody final : public cls_RecordOf<kcoC_RigidBody, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{
        "kcoC_RigidBody", "elements, nodes or an analytical surface that move as one rigid body", 0x2B00006,
        "Rigid"};

    rgnC_Region refNode;
    rgnC_Region elements;
    rgnC_Region tieNodes;
    rgnC_Region pinNodes;
    rgnC_Region surface;
    bool refPointAtCenterOfMass = false;
    bool isothermal = false;

    cow_List<rgnC_Region> ConstGetContactNodeSets() const override;

    static const cls_FieldTable& Fields();
};

class kcoC_EmbeddedRegion final : public cls_RecordOf<kcoC_EmbeddedRegion, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_EmbeddedRegion", "elements embedded in host elements",
                                         0x2B00007, "Embedded"};

    static constexpr double fractionalToleranceDef() { return 0.05; }
    static constexpr double weightFactorToleranceDef() { return 1e-06; }

    rgnC_Region host;
    rgnC_Region embedded;
    double fractionalTolerance = fractionalToleranceDef();
    double absoluteTolerance = 0.0;
    double weightFactorTolerance = weightFactorToleranceDef();

    static const cls_FieldTable& Fields();
};

class kcoC_EquationTerm final : public cls_RecordOf<kcoC_EquationTerm> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_EquationTerm", "one term of a linear equation"};

    double coefficient = 0.0;
    cow_String setName;
    int dof = 0;
    dtmC_DatumRef csys;

    static const cls_FieldTable& Fields();
};

class kcoC_Equation final : public cls_RecordOf<kcoC_Equation, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{
        "kcoC_Equation", "linear equation among degrees of freedom: the sum of its terms is zero", 0x2B00008,
        "LinearEquation"};

    cow_List<kcoC_EquationTerm> terms;

    static const cls_FieldTable& Fields();
};

class kcoC_ShellSolidCoupling final : public cls_RecordOf<kcoC_ShellSolidCoupling, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_ShellSolidCoupling", "a shell edge joined to a solid face",
                                         0x2B00009, "ShellToSolidCoupling"};

    rgnC_Region shellEdge;
    rgnC_Region solidFace;
    int positionToleranceMethod = 0;
    double positionTolerance = 0.0;
    int influenceDistanceMethod = 0;
    double influenceDistance = 0.0;

    cow_List<rgnC_Region> ConstGetContactNodeSets() const override;

    static const cls_FieldTable& Fields();
};

void cls_RegisterConstraintKindRecords(cls_ClassRegistrar& registrar);

#endif
