#include "store_interface/records/sections/kbeC_ConnectorBehavior.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

// Fields that several behaviours have.
constexpr auto kDependenciesField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::dependencies>("dependencies", "number of field variables of the table");
};
constexpr auto kTemperatureDependencyField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::temperatureDependency>("temperatureDependency",
                                                     "the table has a temperature column");
};
constexpr auto kRegularizationField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::options>("options", "regularization group");
};
constexpr auto kBehaviorField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::behavior>("behavior", "how force depends on motion");
};
constexpr auto kFrequencyDependencyField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::frequencyDependency>(
        "frequencyDependency",
        "the table of a linear behaviour has a frequency column (cycles per time) behind its data");
};
constexpr auto kComponentsField = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::components>("components", "connector components 1 to 6, in the user's order");
};
constexpr auto kMotionLimitFields = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::minMotion>("minMotion", "least motion; unset: blank")
        .Unit("length or radians")
        .template Field<&R::maxMotion>("maxMotion", "greatest motion; unset: blank")
        .Unit("length or radians");
};
constexpr auto kForceLimitFields = []<class R>(cls_Describe<R>& fields) {
    fields.template Field<&R::minForce>("minForce", "least force or moment; unset: blank")
        .Unit("force or force*length")
        .template Field<&R::maxForce>("maxForce", "greatest force or moment; unset: blank")
        .Unit("force or force*length");
};

} // namespace

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorOptions::InterpolationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LINEAR", "LINEAR"}, {1, "LOGARITHMIC", "LOGARITHMIC"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorOptions::InterpolationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorOptions::ExtrapolationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "CONSTANT", "CONSTANT"}, {1, "LINEAR", "LINEAR"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorOptions::ExtrapolationEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorOptions::Fields() {
    using R = kbeC_ConnectorOptions;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::useBehaviorRegularization>(
                "useBehaviorRegularization",
                "tables are regularized as the behaviour says; nothing of regularization is written")
            .Field<&R::regularize>("regularize", "tables are regularized")
            .Field<&R::useBehaviorRtol>("useBehaviorRtol",
                                        "the usual tolerance 0.03 in place of regularization")
            .Field<&R::regularization>("regularization", "tolerance of regularized tables, as a fraction")
            .Unit("no unit")
            .Field<&R::useBehaviorRateFactor>("useBehaviorRateFactor",
                                              "the rate filter factor is the usual one")
            .Field<&R::rateFactor>("rateFactor", "factor that rates are filtered by")
            .Unit("no unit")
            .Field<&R::interpolation>("interpolation", "between rates")
            .Field<&R::useBehaviorExtrapolation>("useBehaviorExtrapolation",
                                                 "tables are extrapolated as the behaviour says")
            .Field<&R::extrapolation>("extrapolation", "beyond a table's ends")
            .Example(R"({"regularize": true})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::OperatorEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "SQUARE_ROOT", "SQUARE ROOT"}, {1, "SUM", "SUM"}, {2, "MACAULEY_SUM", "MACAULEY SUM"}};
    static constexpr omu_EnumTable table{"kbeC_CDCTerm::OperatorEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::SignEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "POSITIVE", "POSITIVE"}, {1, "NEGATIVE", "NEGATIVE"}};
    static constexpr omu_EnumTable table{"kbeC_CDCTerm::SignEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::IndependentKindEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "POSITION", "POSITION"},
                                           {1, "CONSTITUTIVE_MOTION", "CONSTITUTIVE MOTION"}};
    static constexpr omu_EnumTable table{"kbeC_CDCTerm::IndependentKindEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_CDCTerm::Fields() {
    using R = kbeC_CDCTerm;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::operatorType>(
                "operatorType", "how the components are added: by the square root of the sum of squares, "
                                "by their sum, or by the sum of their positive values")
            .Field<&R::sign>("sign", "the sign of the term")
            .Field<&R::independentGiven>("independentGiven", "the table depends on components")
            .Field<&R::independentKind>("independentKind", "on which values of components the table depends")
            .With(kDependenciesField)
            .With(kTemperatureDependencyField)
            .Field<&R::components>("components",
                                   "the components that the term is made of, 1 to 6, in the user's order")
            .Field<&R::table>("table",
                              "one scale factor per component, then the independent variable's columns if "
                              "given, temperature if temperatureDependency, field variables")
            .With(kRegularizationField)
            .Example(R"({"components": [1, 2]})");
    return fields;
}

const cls_FieldTable& kbeC_DerivedComponent::Fields() {
    using R = kbeC_DerivedComponent;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::terms>("terms", "the terms, each a keyword of its own under the one name")
            .Example(R"({"terms": [{"components": [1, 2]}]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPotential::SignEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "ABS", "ABS"}, {1, "MACAULEY", "MACAULEY"}, {2, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorPotential::SignEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorPotential::Fields() {
    using R = kbeC_ConnectorPotential;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::useDerived>("useDerived",
                                   "whether the term is a component (zero) or a derived component")
            .Field<&R::component>("component", "component, 1 to 6")
            .Field<&R::negative>("negative", "any number but zero: the term counts negative")
            .Field<&R::scaleFactor>("scaleFactor", "scaling factor")
            .Unit("no unit")
            .Field<&R::radius>("radius",
                               "effective radius, for moments; not asked for with a maximum operator")
            .Unit("length")
            .Field<&R::exponentFactor>("exponentFactor", "exponent of the term")
            .Unit("no unit")
            .Field<&R::sign>("sign", "which part of the component's value counts.")
            .Field<&R::derivedComponent>("derivedComponent",
                                         "the derived component of the term, with useDerived")
            .Example(R"({"component": 1})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorElasticity::BehaviorEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "LINEAR", "LINEAR"}, {1, "NONLINEAR", "NONLINEAR"}, {2, "RIGID", "RIGID"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorElasticity::BehaviorEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorElasticity::CouplingEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "UNCOUPLED", "UNCOUPLED"},
                                           {1, "COUPLED", "COUPLED"},
                                           {2, "COUPLED_POSITION", "COUPLED POSITION"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorElasticity::CouplingEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorElasticity::Fields() {
    using R = kbeC_ConnectorElasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .With(kBehaviorField)
            .Field<&R::coupling>(
                "coupling", "how components depend on each other; on positions only in a nonlinear behaviour")
            .With(kDependenciesField)
            .With(kTemperatureDependencyField)
            .With(kFrequencyDependencyField)
            .Field<&R::table>(
                "table",
                "linear uncoupled: one stiffness per entry of `components`, in that order; linear coupled: "
                "the entries of the symmetric matrix of the given components, row by row up to the diagonal, "
                "lower component number first; nonlinear uncoupled: force or moment, then motion; nonlinear "
                "coupled: one force per entry of `components`, then the independent components' motions. "
                "Then frequency, temperature, field variables as the flags say")
            .Field<&R::independentComponents>("independentComponents",
                                              "components on which a coupled nonlinear table depends")
            .With(kComponentsField)
            .With(kRegularizationField)
            .Example(R"({"components": [1], "table": [[1000]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamping::BehaviorEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LINEAR", "LINEAR"}, {1, "NONLINEAR", "NONLINEAR"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamping::BehaviorEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamping::CouplingEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "UNCOUPLED", "UNCOUPLED"},
                                           {1, "COUPLED", "COUPLED"},
                                           {2, "COUPLED_POSITION", "COUPLED POSITION"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamping::CouplingEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorDamping::Fields() {
    using R = kbeC_ConnectorDamping;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .With(kBehaviorField)
            .Field<&R::coupling>(
                "coupling", "how components depend on each other; on positions only in a nonlinear behaviour")
            .With(kDependenciesField)
            .With(kTemperatureDependencyField)
            .With(kFrequencyDependencyField)
            .Field<&R::table>(
                "table",
                "linear uncoupled: one damping coefficient per entry of `components`, in that order; linear "
                "coupled: the entries of the symmetric matrix of the given components, row by row up to the "
                "diagonal, lower component number first; nonlinear uncoupled: force or moment, then motion; "
                "nonlinear coupled: one force per entry of `components`, then the independent components' "
                "motions. Then frequency, temperature, field variables as the flags say")
            .Field<&R::independentComponents>("independentComponents",
                                              "components on which a coupled nonlinear table depends")
            .With(kComponentsField)
            .With(kRegularizationField)
            .Example(R"({"components": [1], "table": [[5]]})");
    return fields;
}

const cls_FieldTable& kbeC_ConnectorStop::Fields() {
    using R = kbeC_ConnectorStop;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .With(kMotionLimitFields)
            .With(kComponentsField)
            .Example(R"({"components": [1], "minMotion": -5, "maxMotion": 5})");
    return fields;
}

const cls_FieldTable& kbeC_ConnectorFailure::Fields() {
    using R = kbeC_ConnectorFailure;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .Field<&R::releaseComponent>(
                "releaseComponent", "component that is released; unset: no ', release=' (all components)")
            .With(kMotionLimitFields)
            .With(kForceLimitFields)
            .With(kComponentsField)
            .Example(R"({"components": [1], "maxForce": 10000})");
    return fields;
}

const cls_FieldTable& kbeC_ConnectorLock::Fields() {
    using R = kbeC_ConnectorLock;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .Field<&R::lockingComponent>("lockingComponent",
                                         "component that is locked; unset: no ', lock=' (all components)")
            .With(kMotionLimitFields)
            .With(kForceLimitFields)
            .With(kComponentsField)
            .Example(R"({"components": [1], "maxMotion": 10})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_TangentialBehavior::FormulationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "TABLE", "TABLE"},
                                           {1, "EXPONENTIAL_DECAY", "EXPONENTIAL DECAY"}};
    static constexpr omu_EnumTable table{"kbeC_TangentialBehavior::FormulationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_TangentialBehavior::SlipToleranceTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FRACTION", "FRACTION"}, {1, "ABSOLUTE", "ABSOLUTE"}};
    static constexpr omu_EnumTable table{"kbeC_TangentialBehavior::SlipToleranceTypeEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_TangentialBehavior::Fields() {
    using R = kbeC_TangentialBehavior;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::formulation>("formulation",
                                    "whether the coefficient is a table or decays exponentially")
            .Field<&R::slipRateDependency>("slipRateDependency", "the table has a slip rate column.")
            .Field<&R::pressureDependency>("pressureDependency", "the table has a contact force column.")
            .Field<&R::temperatureDependency>("temperatureDependency", "the table has a temperature column.")
            .With(kDependenciesField)
            .Field<&R::testData>("testData",
                                 "any number but zero: the exponential decay is given by test data")
            .Field<&R::shearStressLimit>("shearStressLimit",
                                         "limit of shear stress or force, with a table of coefficients")
            .Unit("stress or force")
            .Field<&R::slipToleranceType>("slipToleranceType",
                                          "how much slip sticking allows: a fraction or a length")
            .Field<&R::fraction>("fraction", "allowed elastic slip as a fraction")
            .Unit("no unit")
            .Field<&R::elasticSlip>("elasticSlip", "allowed elastic slip")
            .Unit("length")
            .Field<&R::table>(
                "table",
                "columns: TABLE: coefficient, slip rate, contact force, temperature, field variables, as the "
                "flags say; EXPONENTIAL_DECAY: one row, read value by value in row order: static "
                "coefficient, kinetic coefficient, decay coefficient; with test data: static coefficient, "
                "second coefficient, its slip rate, coefficient at infinity")
            .Example(R"({"table": [[0.15]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::FormulationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "PREDEFINED", "PREDEFINED"},
                                           {1, "USER_DEFINED", "USER DEFINED"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorFriction::FormulationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::ContactForceTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "COMPONENT_NUMBER", "COMPONENT NUMBER"},
                                           {1, "DERIVED_COMPONENT", "DERIVED COMPONENT"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorFriction::ContactForceTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::IndependentKindEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "POSITION", "POSITION"}, {1, "CONSTITUTIVE_MOTION", "CONSTITUTIVE MOTION"}, {2, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorFriction::IndependentKindEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::PotentialOperatorEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SUM", "SUM"}, {1, "MAXIMUM", "MAX"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorFriction::PotentialOperatorEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorFriction::Fields() {
    using R = kbeC_ConnectorFriction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .Field<&R::formulation>("formulation", "predefined by the connection type, or user-defined")
            .Field<&R::component>(
                "component", "user-defined: component of the slip direction; unset or not positive: none")
            .Field<&R::contactForceType>("contactForceType",
                                         "user-defined: where the contact force comes from")
            .Field<&R::contactForceComponent>("contactForceComponent",
                                              "user-defined: component of the contact force, 1 to 6")
            .Field<&R::contactForceDerived>("contactForceDerived",
                                            "user-defined: the derived component that is the contact force")
            .With(kDependenciesField)
            .With(kTemperatureDependencyField)
            .Field<&R::contactArea>(
                "contactArea",
                "the table of user-defined friction has a column of contact areas ahead of the temperature")
            .Field<&R::independentKind>("independentKind", "on what the internal contact force depends")
            .Field<&R::independentComponents>(
                "independentComponents", "user-defined: the components that the contact force depends on")
            .Field<&R::stickStiffness>("stickStiffness", "stiffness of sticking")
            .Unit("force/length or force*length")
            .Field<&R::table>(
                "table", "predefined: the geometric constants and internal contact forces that the "
                         "connection type asks for; user-defined: internal contact force, independent "
                         "components, the contact area column if contactArea, temperature, field variables")
            .Field<&R::tangentialBehavior>("tangentialBehavior", "friction coefficient; none: not given here")
            .Field<&R::potentials>("potentials", "terms of the friction potential")
            .Field<&R::potentialOperator>("potentialOperator", "how the terms of the potential are joined")
            .Field<&R::forcePotentialExponent>("forcePotentialExponent", "exponent of the potential")
            .Unit("no unit")
            .Field<&R::options>("options", "regularization group; rates play no part here")
            .Example(R"({"tangentialBehavior": {"table": [[0.15]]}})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::PotentialOperatorEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SUM", "SUM"}, {1, "MAXIMUM", "MAX"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorPlasticity::PotentialOperatorEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::IsotropicTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "TABULAR", "Tabular"},
                                           {1, "EXPONENTIAL_LAW", "Exponential Law"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorPlasticity::IsotropicTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::KinematicTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "HALF_CYCLE", "Half Cycle"}, {1, "STABILIZED", "Stabilized"}, {2, "PARAMETERS", "Parameters"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorPlasticity::KinematicTypeEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorPlasticity::Fields() {
    using R = kbeC_ConnectorPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .Field<&R::components>("components",
                                   "components, 1 to 6, in the user's order; not looked at with potentials")
            .Field<&R::isotropicHardening>("isotropicHardening", "isotropic hardening is present")
            .Field<&R::isotropicType>("isotropicType", "how isotropic hardening is defined")
            .Field<&R::isotropicDependencies>("isotropicDependencies",
                                              "number of field variables of isotropicTable")
            .Field<&R::isotropicTemperatureDependency>("isotropicTemperatureDependency",
                                                       "isotropicTable has a temperature column")
            .Field<&R::isotropicTable>(
                "isotropicTable", "tabular: yield force, plastic motion, plastic motion rate; exponential "
                                  "law: initial force, Q, b; then temperature, field variables")
            .Field<&R::isotropicOptions>("isotropicOptions", "regularization group of the isotropic part")
            .Field<&R::kinematicHardening>("kinematicHardening", "kinematic hardening is present")
            .Field<&R::kinematicType>("kinematicType", "how kinematic hardening is defined")
            .Field<&R::kinematicDependencies>("kinematicDependencies",
                                              "number of field variables of kinematicTable")
            .Field<&R::kinematicTemperatureDependency>("kinematicTemperatureDependency",
                                                       "kinematicTable has a temperature column")
            .Field<&R::kinematicTable>(
                "kinematicTable",
                "half cycle and stabilized: yield force, plastic motion (stabilized also motion range); "
                "parameters: yield force, C, gamma; then temperature, field variables")
            .Field<&R::kinematicOptions>("kinematicOptions", "regularization group of the kinematic part")
            .Field<&R::potentials>("potentials", "terms of the yield potential (coupled plasticity)")
            .Field<&R::potentialOperator>("potentialOperator", "how the terms of the potential are joined")
            .Field<&R::forcePotentialExponent>("forcePotentialExponent", "exponent of the potential")
            .Unit("no unit")
            .Example(
                R"({"components": [1], "isotropicHardening": true, "isotropicTable": [[100, 0], [150, 2]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::PotentialOperatorEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SUM", "SUM"}, {1, "MAXIMUM", "MAX"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamage::PotentialOperatorEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::CriterionEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "FORCE", "Force"}, {1, "MOTION", "Motion"}, {2, "PLASTIC_MOTION", "Plastic Motion"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamage::CriterionEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::EvolutionTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "MOTION", "Motion"}, {1, "ENERGY", "Energy"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamage::EvolutionTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::SofteningEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "LINEAR", "Linear"}, {1, "EXPONENTIAL", "Exponential"}, {2, "TABULAR", "Tabular"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamage::SofteningEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::DegradationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "MAXIMUM", "Maximum"},
                                           {1, "MULTIPLICATIVE", "Multiplicative"}};
    static constexpr omu_EnumTable table{"kbeC_ConnectorDamage::DegradationEnm", rows};
    return table;
}

const cls_FieldTable& kbeC_ConnectorDamage::Fields() {
    using R = kbeC_ConnectorDamage;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbeC_ConnectorBehaviorOption::Fields())
            .Field<&R::modeMixDependency>(
                "modeMixDependency", "with plastic motion as criterion, the tables have a mode-mix column")
            .Field<&R::components>(
                "components",
                "components, 1 to 6, in the user's order; not looked at with initiationPotentials")
            .Field<&R::criterion>("criterion", "what initiates damage")
            .Field<&R::initiationDependencies>("initiationDependencies",
                                               "number of field variables of initiationTable")
            .Field<&R::initiationTemperatureDependency>("initiationTemperatureDependency",
                                                        "initiationTable has a temperature column")
            .Field<&R::initiationTable>(
                "initiationTable", "columns: FORCE and MOTION: lower bound (-1e36 for none), upper bound "
                                   "(1e36 for none) of force or motion; PLASTIC_MOTION: plastic motion, "
                                   "mode-mix ratio if modeMixDependency; then temperature, field variables")
            .Field<&R::initiationOptions>("initiationOptions", "regularization group of the initiation")
            .Field<&R::initiationPotentials>("initiationPotentials", "terms of the initiation potential")
            .Field<&R::initiationPotentialOperator>("initiationPotentialOperator",
                                                    "how the terms of the initiation potential are joined")
            .Field<&R::initiationPotentialExponent>("initiationPotentialExponent",
                                                    "exponent of the initiation potential")
            .Unit("no unit")
            .Field<&R::evolution>("evolution", "damage evolution exists")
            .Field<&R::evolutionType>("evolutionType", "by motion or by energy")
            .Field<&R::softening>("softening", "how force falls, of an evolution by motion")
            .Field<&R::useAffected>(
                "useAffected",
                "the damage acts on affectedComponents, otherwise on the components that it is of")
            .Field<&R::affectedComponents>("affectedComponents", "components that the damage acts on")
            .Field<&R::degradation>("degradation", "how damages of several mechanisms are joined")
            .Field<&R::evolutionDependencies>("evolutionDependencies",
                                              "number of field variables of evolutionTable")
            .Field<&R::evolutionTemperatureDependency>("evolutionTemperatureDependency",
                                                       "evolutionTable has a temperature column")
            .Field<&R::evolutionTable>(
                "evolutionTable", "columns: by motion, linear softening: motion at failure; exponential: "
                                  "motion, law parameter; tabular: damage variable, motion; by energy: "
                                  "dissipated energy; then the mode-mix ratio if criterion PLASTIC_MOTION "
                                  "and modeMixDependency, temperature, field variables")
            .Field<&R::evolutionOptions>("evolutionOptions", "regularization group of the evolution")
            .Field<&R::evolutionPotentials>("evolutionPotentials", "terms of the evolution potential")
            .Field<&R::evolutionPotentialOperator>("evolutionPotentialOperator",
                                                   "how the terms of the evolution potential are joined")
            .Field<&R::evolutionPotentialExponent>("evolutionPotentialExponent",
                                                   "exponent of the evolution potential")
            .Unit("no unit")
            .Example(R"({"components": [1], "criterion": "MOTION", "initiationTable": [[-10, 10]]})");
    return fields;
}

void cls_RegisterConnectorBehaviorRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbeC_ConnectorBehaviorOption>();
    registrar.Add<kbeC_ConnectorOptions>();
    registrar.Add<kbeC_CDCTerm>();
    registrar.Add<kbeC_DerivedComponent>();
    registrar.Add<kbeC_ConnectorPotential>();
    registrar.Add<kbeC_ConnectorElasticity>();
    registrar.Add<kbeC_ConnectorDamping>();
    registrar.Add<kbeC_ConnectorStop>();
    registrar.Add<kbeC_ConnectorFailure>();
    registrar.Add<kbeC_ConnectorLock>();
    registrar.Add<kbeC_TangentialBehavior>();
    registrar.Add<kbeC_ConnectorFriction>();
    registrar.Add<kbeC_ConnectorPlasticity>();
    registrar.Add<kbeC_ConnectorDamage>();
}
