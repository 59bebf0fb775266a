#include "interactions/InteractionTesting.h"
#include "interactions/oif_ContactProperty.h"
#include "sections/SectionTesting.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"

namespace {

using Product = kprC_AnalysisProductEnm;

/// What the keyword writes for the property in a job for the solver.
template <class Keyword, class... Args>
std::string In(Product product, const kinC_InteractionProperty& property, const Args&... args) {
    TestStore store;
    store.model.analysisProduct = static_cast<int>(product);
    return Written(Keyword(property, store.Info(), args...));
}

template <auto Member, class Behavior>
kinC_ContactProperty With(const Behavior& behavior) {
    kinC_ContactProperty property;
    property.*Member = mdl_ObjCow<Behavior>(behavior);
    return property;
}

std::string Friction(const kinC_TangentialBehavior& friction, Product product = Product::IMPLICIT) {
    return In<oif_Friction>(product, With<&kinC_ContactProperty::tangentialBehavior>(friction), false);
}

std::string Surface(const kinC_NormalBehavior& behavior, Product product = Product::IMPLICIT) {
    return In<oif_SurfaceBehavior>(product, With<&kinC_ContactProperty::normalBehavior>(behavior));
}

std::string Damping(const kinC_Damping& damping, Product product = Product::IMPLICIT) {
    return In<oif_ContactDamping>(product, With<&kinC_ContactProperty::damping>(damping));
}

std::string Conductance(const kinC_ThermalConductance& conductance) {
    return In<oif_GapConductance>(Product::IMPLICIT,
                                  With<&kinC_ContactProperty::thermalConductance>(conductance));
}

kinC_TangentialBehavior Formulation(int formulation, const cow_2DArray<double>& table = {}) {
    kinC_TangentialBehavior friction;
    friction.formulation = formulation;
    friction.table = table;
    return friction;
}

std::string Interaction(Product product, double area, double pad) {
    TestStore store;
    store.model.analysisProduct = static_cast<int>(product);
    return Written(oif_SurfaceInteraction("P 1", store.Info(), area, pad));
}

const std::string kFrictionless = "*Friction\n0.,\n";

} // namespace

TEST(SurfaceInteraction, Implicit_HasItsAreaWithABareComma) {
    EXPECT_EQ(Interaction(Product::IMPLICIT, 2.5, 0.5), "*Surface Interaction, name=\"P 1\"\n2.5,\n");
}

TEST(SurfaceInteraction, Explicit_HasItsPadAndNoDataLine) {
    EXPECT_EQ(Interaction(Product::EXPLICIT, 2.5, 0.5),
              "*Surface Interaction, name=\"P 1\", pad thickness=0.5\n");
    EXPECT_EQ(Interaction(Product::EXPLICIT, 2.5, cls_UnsetDouble), "*Surface Interaction, name=\"P 1\"\n");
}

TEST(SurfaceInteraction, AnotherProduct_HasNeither) {
    EXPECT_EQ(Interaction(Product::OTHER, 2.5, 0.5), "*Surface Interaction, name=\"P 1\"\n");
}

TEST(Friction, Absent_IsZero) {
    EXPECT_EQ(In<oif_Friction>(Product::IMPLICIT, kinC_ContactProperty(), false), kFrictionless);
    EXPECT_EQ(In<oif_Friction>(Product::IMPLICIT, kinC_ContactProperty(), true), kFrictionless);
}

TEST(Friction, Frictionless_IsZeroInBothSolvers) {
    EXPECT_EQ(Friction(Formulation(0)), kFrictionless);
    EXPECT_EQ(Friction(Formulation(0), Product::EXPLICIT), kFrictionless);
}

TEST(Friction, OfAnotherProperty_Raises) {
    TestStore store;
    const oif_Friction friction(kinC_FilmConditionProp(), store.Info(), false);
    EXPECT_EQ(Raised([&] { Written(friction); }), "Unimplemented *Friction print");
}

TEST(Friction, Penalty_HasItsSlipInTheImplicitSolverOnly) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(1, {0.25}));
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005\n 0.25,\n");
    friction.maximumElasticSlip = 1;
    friction.elasticSlip = 0.125;
    EXPECT_EQ(Friction(friction), "*Friction, elastic slip=0.125\n 0.25,\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction\n 0.25,\n");
    friction.maximumElasticSlip = 0;
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction\n 0.25,\n");
}

TEST(Friction, ShearTractionSlope_IsTheExplicitSolvers) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(1, {0.25}));
    friction.elasticSlipStiffness = 1000.0;
    friction.shearStressLimit = 50.0;
    EXPECT_EQ(Friction(friction, Product::EXPLICIT),
              "*Friction, shear traction slope=1000., taumax=50.\n 0.25,\n");
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, taumax=50.\n 0.25,\n");
}

TEST(Friction, Anisotropic_IsTheImplicitSolvers) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(2, {0.25, 0.5}));
    friction.directionality = 2;
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, anisotropic\n 0.25, 0.5\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction\n 0.25, 0.5\n");
}

TEST(Friction, ColumnsThatAreNotFlagged_KeepTheOthersInPlace) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(3, {0.25, 10.0, 1.0}));
    friction.pressureDependency = true;
    friction.dependencies = 1;
    // coefficient, no temperature, pressure, no slip rate, field variable
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, dependencies=1\n 0.25, ,10., , 1.\n");
}

TEST(Friction, ColumnsOfTwoCoefficients_BeginBehindTheSecond) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(4, {0.25, 0.5, 7.0, 2.0}));
    friction.directionality = 2;
    friction.slipRateDependency = true;
    friction.dependencies = 1;
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, anisotropic, dependencies=1\n"
                                  " 0.25, 0.5, , ,  7.,  2.\n");
}

TEST(Friction, AllColumnsFlagged_StandAsTheyAre) {
    kinC_TangentialBehavior friction = Formulation(1, TableOf(4, {0.25, 1.0, 2.0, 3.0}));
    friction.temperatureDependency = friction.pressureDependency = friction.slipRateDependency = true;
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005\n 0.25,1.,2.,3.\n");
}

TEST(Friction, Lagrange_HasDataInTheImplicitSolverOnly) {
    kinC_TangentialBehavior friction = Formulation(4, TableOf(1, {0.25}));
    friction.shearStressLimit = 50.0;
    friction.dependencies = 1;
    EXPECT_EQ(Friction(friction), "*Friction, lagrange, dependencies=1, taumax=50.\n 0.25,\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction, taumax=50.\n");
}

TEST(Friction, Rough_HasNoData) {
    kinC_TangentialBehavior friction = Formulation(3, TableOf(1, {0.25}));
    friction.shearStressLimit = 50.0;
    EXPECT_EQ(Friction(friction), "*Friction, rough\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction, rough\n");
}

TEST(Friction, ExponentialDecay_HasItsCoefficientsOnOneLine) {
    const kinC_TangentialBehavior friction = Formulation(2, TableOf(3, {0.5, 0.25, 2.0}));
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, exponential decay\n0.5, 0.25, 2.\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction, exponential decay\n0.5, 0.25, 2.\n");
    // By rows, whatever the shape of the table.
    EXPECT_EQ(Friction(Formulation(2, TableOf(1, {0.5, 0.25, 2.0}))),
              "*Friction, slip tolerance=0.005, exponential decay\n0.5, 0.25, 2.\n");
}

TEST(Friction, TestData_StandOnThreeLines) {
    kinC_TangentialBehavior friction = Formulation(2, TableOf(2, {0.5, 0.25, 2.0, 0.125}));
    friction.exponentialDecayDefinition = 1;
    friction.elasticSlipStiffness = 8.0;
    EXPECT_EQ(Friction(friction),
              "*Friction, slip tolerance=0.005, exponential decay, test data\n0.5\n0.25, 2.\n0.125\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT),
              "*Friction, exponential decay, shear traction slope=8., test data\n0.5\n0.25, 2.\n0.125\n");
}

TEST(Friction, NumbersThatTheTableLacks_AreLeftOutWithTheirLines) {
    kinC_TangentialBehavior friction = Formulation(2, TableOf(2, {0.5, 0.25}));
    EXPECT_EQ(Friction(friction), "*Friction, slip tolerance=0.005, exponential decay\n0.5, 0.25\n");
    friction.exponentialDecayDefinition = 1;
    EXPECT_EQ(Friction(friction),
              "*Friction, slip tolerance=0.005, exponential decay, test data\n0.5\n0.25\n");
}

TEST(Friction, User_HasVariablesAndPropertiesFromTheFirstColumn) {
    kinC_TangentialBehavior friction = Formulation(5, TableOf(2, {1.0, 9.0, 2.0, 9.0}));
    friction.nStateDependentVars = 3;
    EXPECT_EQ(Friction(friction), "*Friction, user, depvar=3\n");
    friction.useProperties = true;
    EXPECT_EQ(Friction(friction), "*Friction, user, depvar=3, properties=2\n1.,2.\n");
    EXPECT_EQ(Friction(friction, Product::EXPLICIT), "*Friction, user, depvar=3, properties=2\n1.,2.\n");
    friction.table = {};
    EXPECT_EQ(Friction(friction), "*Friction, user, depvar=3, properties=0\n");
}

TEST(ChangeFriction, NamesTheProperty) {
    EXPECT_EQ(Written(oif_ChangeFriction("_C 1-Property")),
              "*Change Friction, interaction=\"_C 1-Property\"\n");
    EXPECT_EQ(Written(oif_ChangeFriction("_C-Property")), "*Change Friction, interaction=_C-Property\n");
}

TEST(SurfaceBehavior, Absent_WritesNothing) {
    EXPECT_EQ(In<oif_SurfaceBehavior>(Product::IMPLICIT, kinC_ContactProperty()), "");
    EXPECT_EQ(In<oif_SurfaceBehavior>(Product::IMPLICIT, kinC_FilmConditionProp()), "");
}

TEST(SurfaceBehavior, HardWithoutSeparation_SaysBoth) {
    kinC_NormalBehavior behavior;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=HARD\n");
    behavior.allowSeparation = 0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, no separation, pressure-overclosure=HARD\n");
    behavior.pressureOverclosure = 2;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=LINEAR\n0., \n");
}

TEST(SurfaceBehavior, Method_TakesThePlaceOfTheRelation) {
    kinC_NormalBehavior behavior;
    behavior.constraintEnforcementMethod = 1;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, augmented Lagrange\n");
    behavior.constraintEnforcementMethod = 2;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n");
    behavior.constraintEnforcementMethod = 3;
    behavior.contactStiffness = 5.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, direct\n");
    behavior.constraintEnforcementMethod = 9;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=HARD\n");
    behavior.pressureOverclosure = 9;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior\n");
}

TEST(SurfaceBehavior, StiffnessAlone_HasNoComma) {
    kinC_NormalBehavior behavior;
    behavior.constraintEnforcementMethod = 2;
    behavior.contactStiffness = 5.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n5.\n");
}

TEST(SurfaceBehavior, ClearanceAndScale_KeepTheirPlaces) {
    kinC_NormalBehavior behavior;
    behavior.constraintEnforcementMethod = 2;
    behavior.clearanceAtZeroContactPressure = 0.25;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n, 0.25\n");
    behavior.contactStiffnessScaleFactor = 2.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n, 0.25, 2.\n");
    behavior.clearanceAtZeroContactPressure = 0.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n, , 2.\n");
    behavior.contactStiffness = 5.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, penalty\n5., , 2.\n");
}

TEST(SurfaceBehavior, Exponential_HasClearanceThenPressure) {
    kinC_NormalBehavior behavior;
    behavior.pressureOverclosure = 1;
    behavior.table = TableOf(2, {100.0, 0.0, 0.0, 0.5});
    behavior.maxStiffness = 7.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=EXPONENTIAL\n0.5, 100.\n");
    EXPECT_EQ(Surface(behavior, Product::EXPLICIT),
              "*Surface Behavior, pressure-overclosure=EXPONENTIAL\n0.5, 100., 7.\n");
    behavior.maxStiffness = cls_UnsetDouble;
    EXPECT_EQ(Surface(behavior, Product::EXPLICIT),
              "*Surface Behavior, pressure-overclosure=EXPONENTIAL\n0.5, 100.\n");
}

TEST(SurfaceBehavior, DataOfMethodAndRelation_StandBoth_Wanted) {
    kinC_NormalBehavior behavior;
    behavior.pressureOverclosure = 2;
    behavior.constraintEnforcementMethod = 1;
    behavior.contactStiffness = 5.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, augmented Lagrange\n5.\n5., \n");
}

TEST(SurfaceBehavior, Tabular_HasItsTable) {
    kinC_NormalBehavior behavior;
    behavior.pressureOverclosure = 3;
    behavior.table = TableOf(2, {0.0, -0.5, 10.0, 0.25});
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=TABULAR\n 0., -0.5\n10., 0.25\n");
}

TEST(SurfaceBehavior, ScaleFactor_KeepsPlacesOfWhatIsNotAboveZero) {
    kinC_NormalBehavior behavior;
    behavior.pressureOverclosure = 4;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=SCALE FACTOR\n, , 1., \n");
    behavior.overclosureFactor = 0.1;
    behavior.overclosureMeasure = 0.2;
    behavior.contactStiffnessScaleFactor = 2.0;
    behavior.initialStiffnessScaleFactor = 3.0;
    EXPECT_EQ(Surface(behavior), "*Surface Behavior, pressure-overclosure=SCALE FACTOR\n0.1, 0.2, 2., 3.\n");
}

TEST(ContactDamping, AllZero_WritesNothing) {
    EXPECT_EQ(In<oif_ContactDamping>(Product::IMPLICIT, kinC_ContactProperty()), "");
    EXPECT_EQ(Damping({}), "");
    kinC_Damping damping;
    damping.table = TableOf(2, {0.0, 0.0, 0.0, 5.0});
    EXPECT_EQ(Damping(damping), "");
    damping.definition = 1;
    damping.table = TableOf(2, {0.0, 0.0, 0.0, 0.0});
    EXPECT_EQ(Damping(damping), "");
}

TEST(ContactDamping, Step_NeedsOneRow) {
    kinC_Damping damping;
    damping.table = TableOf(2, {0.5, 0.0});
    damping.tangentFraction = 0.25;
    EXPECT_EQ(Damping(damping), "*Contact Damping, definition=DAMPING COEFFICIENT\n0.5, \n");
    EXPECT_EQ(Damping(damping, Product::EXPLICIT),
              "*Contact Damping, definition=CRITICAL DAMPING, tangent fraction=0.25\n0.5, \n");
    EXPECT_EQ(Damping(damping, Product::OTHER), "*Contact Damping, definition=CRITICAL DAMPING\n0.5, \n");
}

TEST(ContactDamping, Linear_StartsAtZero) {
    kinC_Damping damping;
    damping.definition = 1;
    damping.table = TableOf(2, {0.5, 0.0, 0.0, 4.0});
    EXPECT_EQ(Damping(damping), "*Contact Damping, definition=DAMPING COEFFICIENT\n0.5, 4., 0.\n");
    EXPECT_EQ(Damping(damping, Product::EXPLICIT),
              "*Contact Damping, definition=CRITICAL DAMPING, tangent fraction=0.\n0.5, \n");
}

TEST(ContactDamping, Bilinear_HasTheFractionWhereItStarts) {
    kinC_Damping damping;
    damping.definition = 2;
    damping.table = TableOf(2, {0.5, 0.0, 0.5, 1.0, 0.0, 4.0});
    EXPECT_EQ(Damping(damping), "*Contact Damping, definition=DAMPING COEFFICIENT\n0.5, 4., 0.25\n");
    // A third row that is not there counts as zero.
    damping.table = TableOf(2, {0.5, 0.0, 0.5, 1.0});
    EXPECT_EQ(Damping(damping), "*Contact Damping, definition=DAMPING COEFFICIENT\n0.5, \n");
}

TEST(ContactDamping, ZeroDampingWithAClearance_IsWritten_Wanted) {
    kinC_Damping damping;
    damping.definition = 1;
    damping.table = TableOf(2, {0.0, 0.0, 0.0, 4.0});
    EXPECT_EQ(Damping(damping), "*Contact Damping, definition=DAMPING COEFFICIENT\n0., 4., 0.\n");
}

TEST(GapConductance, WithoutADependency_WritesNothing) {
    EXPECT_EQ(Conductance({}), "");
    EXPECT_EQ(In<oif_GapConductance>(Product::IMPLICIT, kinC_ContactProperty()), "");
}

TEST(GapConductance, User_HasNoTable) {
    kinC_ThermalConductance conductance;
    conductance.definition = 1;
    conductance.clearanceDependency = true;
    EXPECT_EQ(Conductance(conductance), "*Gap Conductance, user\n");
    conductance.definition = 2;
    EXPECT_EQ(Conductance(conductance), "");
}

TEST(GapConductance, BothDependencies_WriteAKeywordEach) {
    kinC_ThermalConductance conductance;
    conductance.clearanceDependency = true;
    conductance.clearanceTable = TableOf(2, {5.0, 0.0, 0.0, 1.0});
    conductance.pressureDependency = true;
    conductance.pressureTable = TableOf(4, {1.0, 2.0, 3.0, 4.0});
    conductance.pressureTableMassFlowRateDependency = true;
    conductance.pressureTableDependencies = 1;
    EXPECT_EQ(Conductance(conductance), "*Gap Conductance\n5.,0.\n0.,1.\n"
                                        "*Gap Conductance, pressure, dependencies=1\n1.,2., ,3.,4.\n");
}

TEST(GapConductance, MassFlowRateThatIsNotFlagged_KeepsTheFieldVariableInPlace) {
    kinC_ThermalConductance conductance;
    conductance.clearanceDependency = true;
    conductance.temperatureDependency = true;
    conductance.dependencies = 1;
    conductance.clearanceTable = TableOf(4, {1.0, 2.0, 3.0, 4.0});
    EXPECT_EQ(Conductance(conductance), "*Gap Conductance, dependencies=1\n1.,2.,3., ,4.\n");
}

TEST(GapHeatGeneration, HasBothFractions) {
    EXPECT_EQ(In<oif_GapHeatGeneration>(Product::IMPLICIT,
                                        With<&kinC_ContactProperty::heatGeneration>(kinC_HeatGeneration())),
              "*Gap Heat Generation\n1., 0.5\n");
    EXPECT_EQ(In<oif_GapHeatGeneration>(Product::IMPLICIT, kinC_ContactProperty()), "");
}

TEST(GapRadiation, HasTheSecondEmissivityFirst_Wanted) {
    kinC_Radiation radiation;
    radiation.firstEmissivity = 0.25;
    radiation.secondEmissivity = 0.75;
    radiation.table = TableOf(2, {1.0, 0.0, 0.0, 0.5});
    EXPECT_EQ(In<oif_GapRadiation>(Product::IMPLICIT, With<&kinC_ContactProperty::radiation>(radiation)),
              "*Gap Radiation\n0.75, 0.25\n1.,  0.\n0., 0.5\n");
    EXPECT_EQ(In<oif_GapRadiation>(Product::IMPLICIT, kinC_ContactProperty()), "");
}
