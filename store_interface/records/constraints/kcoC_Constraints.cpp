#include "store_interface/records/constraints/kcoC_Constraints.h"

#include "store_interface/records/cls_ClassRegistrar.h"

unsigned kcoC_Tie::DynTypeId() const {
    return odiK_Tie::TypeId();
}

cow_List<rgnC_Region> kcoC_Tie::ConstGetContactNodeSets() const {
    return rgnC_NodeSetsAmong({master, slave});
}

cow_List<rgnC_Region> kcoC_Coupling::ConstGetContactNodeSets() const {
    return rgnC_NodeSetsAmong({surface});
}

cow_List<rgnC_Region> kcoC_RigidBody::ConstGetContactNodeSets() const {
    return rgnC_NodeSetsAmong({surface});
}

cow_List<rgnC_Region> kcoC_ShellSolidCoupling::ConstGetContactNodeSets() const {
    return rgnC_NodeSetsAmong({shellEdge, solidFace});
}

const cls_FieldTable& kcoC_Tie::Fields() {
    using R = kcoC_Tie;
    static constexpr cls_IntMeaning positionToleranceMethodMeanings[] = {{0, "computed"}, {1, "specified"}};
    static constexpr cls_IntMeaning constraintRatioMethodMeanings[] = {{0, "default"}, {1, "specified"}};
    static constexpr cls_IntMeaning typeMeanings[] = {
        {0, "unset, the solver's default"}, {1, "NODE TO SURFACE"}, {2, "SURFACE TO SURFACE"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::master>("master", "master surface")
            .Field<&R::slave>("slave", "slave surface; may be a node set")
            .Field<&R::adjust>("adjust", "slave nodes are moved onto the master surface")
            .Field<&R::positionTolerance>("positionTolerance", "distance within which slave nodes are tied")
            .Unit("length")
            .Field<&R::tieRotations>("tieRotations", "rotations are tied too; false writes 'no rotation'")
            .Field<&R::positionToleranceMethod>(
                "positionToleranceMethod",
                "whether the solver works out the tolerance or positionTolerance gives it")
            .Meanings(positionToleranceMethodMeanings)
            .Field<&R::constraintRatioMethod>("constraintRatioMethod",
                                              "whether the solver's ratio holds or constraintRatio")
            .Meanings(constraintRatioMethodMeanings)
            .Field<&R::constraintRatio>("constraintRatio",
                                        "where the constraint acts between the two surfaces, as a fraction")
            .Unit("no unit")
            .Field<&R::type>("type", "discretization")
            .Meanings(typeMeanings)
            .Field<&R::thickness>("thickness", "shell thickness counts; false writes 'no thickness'")
            .Field<&R::cyclicSymmetry>("cyclicSymmetry", "this tie joins the two sides of the cyclic sector")
            .Example(R"({"master": "PART-1.TOP", "slave": "PART-2.BOTTOM"})");
    return fields;
}

const cls_FieldTable& kcoC_Coupling::Fields() {
    using R = kcoC_Coupling;
    static constexpr cls_IntMeaning weightingMethodMeanings[] = {
        {0, "UNIFORM"}, {1, "LINEAR"}, {2, "QUADRATIC"}, {3, "CUBIC"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::surface>("surface", "the coupled surface; may be a node set")
            .Field<&R::refNode>("refNode", "set of the reference node")
            .Field<&R::influenceRadius>(
                "influenceRadius",
                "distance from the reference node within which nodes are coupled; unset: the whole surface")
            .Unit("length")
            .Field<&R::distributing>("distributing", "true: distributing coupling; false: kinematic coupling")
            .Field<&R::orientation>("orientation", "local system of the degrees of freedom; null: global")
            .Field<&R::u1>("u1", "translation 1 is coupled")
            .Field<&R::u2>("u2", "translation 2 is coupled")
            .Field<&R::u3>("u3", "translation 3 is coupled")
            .Field<&R::ur1>("ur1", "rotation 1 is coupled")
            .Field<&R::ur2>("ur2", "rotation 2 is coupled")
            .Field<&R::ur3>("ur3", "rotation 3 is coupled")
            .Field<&R::weightingMethod>("weightingMethod",
                                        "distributing coupling: how weights fall with distance")
            .Meanings(weightingMethodMeanings)
            .Example(R"({"surface": "PART-1.TOP", "refNode": "PART-1.CENTRE"})");
    return fields;
}

const cls_FieldTable& kcoC_RigidBody::Fields() {
    using R = kcoC_RigidBody;
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::refNode>("refNode", "set of the reference node")
            .Field<&R::elements>("elements", "element set of the body; not set: no 'elset='")
            .Field<&R::tieNodes>("tieNodes",
                                 "nodes whose translations and rotations follow; not set: no parameter")
            .Field<&R::pinNodes>("pinNodes", "nodes whose translations follow; not set: no parameter")
            .Field<&R::surface>("surface", "analytical surface; not set: no parameter")
            .Field<&R::refPointAtCenterOfMass>("refPointAtCenterOfMass",
                                               "the reference node is moved to the centre of mass")
            .Field<&R::isothermal>("isothermal", "the body has one temperature")
            .Example(R"({"refNode": "PART-1.CENTRE", "elements": "PART-1.ALL"})");
    return fields;
}

const cls_FieldTable& kcoC_EmbeddedRegion::Fields() {
    using R = kcoC_EmbeddedRegion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::host>("host", "host element set")
            .Field<&R::embedded>("embedded", "embedded element set")
            .Field<&R::fractionalTolerance>(
                "fractionalTolerance",
                "how far outside the host nodes may lie, as a fraction of the element size")
            .Unit("no unit")
            .Field<&R::absoluteTolerance>("absoluteTolerance", "how far outside the host nodes may lie")
            .Unit("length")
            .Field<&R::weightFactorTolerance>("weightFactorTolerance",
                                              "weight factors below this are set to zero")
            .Unit("no unit")
            .Example(R"({"host": "CONCRETE-1.ALL", "embedded": "BARS-1.ALL"})");
    return fields;
}

const cls_FieldTable& kcoC_EquationTerm::Fields() {
    using R = kcoC_EquationTerm;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::coefficient>("coefficient", "factor of the degree of freedom")
            .Unit("no unit")
            .Field<&R::setName>("setName", "name of a node set of the assembly")
            .RefersTo("set")
            .Field<&R::dof>("dof", "degree of freedom, from 1")
            .Field<&R::csys>("csys",
                             "coordinate system in which dof is counted, none for the global one; with it, "
                             "setName is a node set of the assembly")
            .Example(R"({"coefficient": 1, "setName": "LEFT", "dof": 1})");
    return fields;
}

const cls_FieldTable& kcoC_Equation::Fields() {
    using R = kcoC_Equation;
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::terms>("terms", "the terms in their order; their number is written ahead of them")
            .Example(
                R"({"terms": [{"coefficient": 1, "setName": "LEFT", "dof": 1}, {"coefficient": -1, "setName": "RIGHT", "dof": 1}]})");
    return fields;
}

const cls_FieldTable& kcoC_ShellSolidCoupling::Fields() {
    using R = kcoC_ShellSolidCoupling;
    static constexpr cls_IntMeaning positionToleranceMethodMeanings[] = {{0, "computed"}, {1, "specified"}};
    static constexpr cls_IntMeaning influenceDistanceMethodMeanings[] = {{0, "computed"}, {1, "specified"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kcoC_Constraint::Fields())
            .Field<&R::shellEdge>("shellEdge", "edge surface of the shell")
            .Field<&R::solidFace>("solidFace", "face surface of the solid")
            .Field<&R::positionToleranceMethod>(
                "positionToleranceMethod",
                "whether the solver works out the tolerance or positionTolerance gives it")
            .Meanings(positionToleranceMethodMeanings)
            .Field<&R::positionTolerance>("positionTolerance", "distance within which nodes are joined")
            .Unit("length")
            .Field<&R::influenceDistanceMethod>(
                "influenceDistanceMethod",
                "whether the solver works out the distance or influenceDistance gives it")
            .Meanings(influenceDistanceMethodMeanings)
            .Field<&R::influenceDistance>("influenceDistance",
                                          "distance from the edge within which nodes are joined")
            .Unit("length")
            .Example(R"({"shellEdge": "SHELL-1.EDGE", "solidFace": "SOLID-1.FACE"})");
    return fields;
}

void cls_RegisterConstraintKindRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kcoC_Tie>();
    registrar.Add<odiK_Tie>();
    registrar.Add<kcoC_Coupling>();
    registrar.Add<odiK_Coupling>();
    registrar.Add<kcoC_RigidBody>();
    registrar.Add<kcoC_EmbeddedRegion>();
    registrar.Add<kcoC_EquationTerm>();
    registrar.Add<kcoC_Equation>();
    registrar.Add<kcoC_ShellSolidCoupling>();
}
