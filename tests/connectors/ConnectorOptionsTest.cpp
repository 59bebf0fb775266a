#include "connectors/ConnectorTesting.h"
#include "connectors/oif_ConnectorOptions.h"

namespace {

using Elasticity = kbeC_ConnectorElasticity;
using Damping = kbeC_ConnectorDamping;
using Friction = kbeC_ConnectorFriction;
using Tangential = kbeC_TangentialBehavior;
using Plasticity = kbeC_ConnectorPlasticity;
using Damage = kbeC_ConnectorDamage;
using Potential = kbeC_ConnectorPotential;

/// A group that asks for something of everything.
kbeC_ConnectorOptions Group() {
    kbeC_ConnectorOptions group;
    group.useBehaviorRegularization = false;
    group.regularization = 0.05;
    group.useBehaviorExtrapolation = false;
    group.extrapolation = kbeC_ConnectorOptions::ExtrapolationEnm::LINEAR;
    group.useBehaviorRateFactor = false;
    group.rateFactor = 0.5;
    group.interpolation = kbeC_ConnectorOptions::InterpolationEnm::LOGARITHMIC;
    return group;
}
const std::string kGroup = ", regularize=ON, rtol=0.05, extrapolation=LINEAR, rate filter factor=0.5, rate "
                           "interpolation=LOGARITHMIC";

template <class R>
R Spring(std::initializer_list<int> components, const cow_2DArray<double>& table) {
    R option;
    option.components = List(components);
    option.table = table;
    return option;
}
template <class R>
R Coupled(std::initializer_list<int> components, const cow_2DArray<double>& table) {
    R option = Spring<R>(components, table);
    option.coupling = R::CouplingEnm::COUPLED;
    return option;
}
template <class R>
R Nonlinear(R option) {
    option.behavior = R::BehaviorEnm::NONLINEAR;
    return option;
}

std::string Text(const Elasticity& option) {
    return Written(oif_ConnectorElasticity(option));
}
std::string Text(const Damping& option) {
    return Written(oif_ConnectorDamping(option));
}
std::string Text(const Friction& option, int index = 0, int product = 0) {
    TestStore store;
    store.model.analysisProduct = product;
    return Written(oif_ConnectorFriction(option, store.Info(), index));
}
std::string Text(const Plasticity& option, int index = 0) {
    return Written(oif_ConnectorPlasticity(option, index));
}
std::string Text(const Damage& option, int index = 0) {
    return Written(oif_ConnectorDamage(option, index));
}

/// With the options on a keyword line of their own kind.
std::string GroupLine(const kbeC_ConnectorOptions& group) {
    Elasticity option = Spring<Elasticity>({1}, {});
    option.options = group;
    const std::string text = Text(option);
    const std::string head = "*Connector Elasticity, component=1";
    EXPECT_EQ(text.substr(0, head.size()), head);
    return text.substr(head.size());
}

Friction UserDefined(const cow_2DArray<double>& table = {}) {
    Friction option;
    option.formulation = Friction::FormulationEnm::USER_DEFINED;
    option.table = table;
    return option;
}

/// What stands behind the keyword line of friction.
std::string Coefficient(const Tangential& tangential, int product = 0) {
    Friction option;
    option.tangentialBehavior = tangential;
    const std::string text = Text(option, 0, product);
    const std::string head = "*Connector Friction, predefined\n";
    EXPECT_EQ(text.substr(0, head.size()), head);
    return text.substr(head.size());
}

Tangential Decay(const cow_2DArray<double>& table, int testData) {
    Tangential tangential;
    tangential.formulation = Tangential::FormulationEnm::EXPONENTIAL_DECAY;
    tangential.table = table;
    tangential.testData = testData;
    return tangential;
}

Potential Derived() {
    Potential term;
    term.useDerived = 1;
    kbeC_DerivedComponent derived;
    derived.terms = List({kbeC_CDCTerm()});
    term.derivedComponent = derived;
    return term;
}

std::vector<std::string> Names(const auto& keyword) {
    oif_DerivedComponents components;
    keyword.GetDerivedComponents(components);
    std::vector<std::string> names;
    const cow_List<cow_String> keys = components.Keys();
    for (int i = 0; i < keys.Length(); ++i) names.emplace_back(keys[i].View());
    return names;
}

using Strings = std::vector<std::string>;

Damage Initiated(Damage::CriterionEnm criterion, const cow_2DArray<double>& table) {
    Damage option;
    option.criterion = criterion;
    option.initiationTable = table;
    return option;
}

/// The keyword of the evolution and its data.
std::string Evolution(Damage option) {
    option.evolution = true;
    const std::string text = Text(option);
    const std::size_t place = text.find("*Connector Damage Evolution");
    return place == std::string::npos ? text : text.substr(place);
}

} // namespace

TEST(ConnectorOptions, DefaultsAndNone_WriteNothing) {
    EXPECT_EQ(GroupLine({}), "\n");
    EXPECT_EQ(Text(Spring<Elasticity>({1}, {})), "*Connector Elasticity, component=1\n");
}

TEST(ConnectorOptions, EveryParameter_StandsInItsPlace) {
    EXPECT_EQ(GroupLine(Group()), kGroup + "\n");
}

TEST(ConnectorOptions, Regularization_IsOffOrHasItsTolerance) {
    kbeC_ConnectorOptions group;
    group.useBehaviorRegularization = false;
    EXPECT_EQ(GroupLine(group), ", regularize=ON, rtol=0.03\n");
    group.regularization = 0.5;
    EXPECT_EQ(GroupLine(group), ", regularize=ON, rtol=0.5\n");
    group.useBehaviorRtol = true;
    EXPECT_EQ(GroupLine(group), ", regularize=ON, rtol=0.03\n");
    group.regularize = false;
    EXPECT_EQ(GroupLine(group), ", regularize=OFF\n");
}

TEST(ConnectorOptions, ExtrapolationAndRateFactor_HaveTheirDefaults) {
    kbeC_ConnectorOptions group;
    group.useBehaviorExtrapolation = false;
    group.useBehaviorRateFactor = false;
    EXPECT_EQ(GroupLine(group), ", extrapolation=CONSTANT\n");
    group.rateFactor = 1;
    EXPECT_EQ(GroupLine(group), ", extrapolation=CONSTANT, rate filter factor=1.\n");
}

TEST(ConnectorElasticity, Rigid_ListsItsComponents) {
    Elasticity option = Spring<Elasticity>({6, 1, 3}, Table({{1}}));
    option.behavior = Elasticity::BehaviorEnm::RIGID;
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Elasticity, rigid\n6, 1, 3\n");
}

TEST(ConnectorElasticity, LinearUncoupled_HasTheColumnOfEachComponent) {
    EXPECT_EQ(Text(Spring<Elasticity>({3, 1}, Table({{10, 20}, {11, 21}}))),
              "*Connector Elasticity, component=3\n10.,\n11.,\n"
              "*Connector Elasticity, component=1\n20.,\n21.,\n");
}

TEST(ConnectorElasticity, LinearWithTemperature_LeavesTheFrequencyBlank) {
    Elasticity option = Spring<Elasticity>({1, 3}, Table({{10, 20, 300}}));
    option.temperatureDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity, component=1\n10., ,300.\n"
                            "*Connector Elasticity, component=3\n 20., ,300.\n");
}

TEST(ConnectorElasticity, LinearWithFieldVariables_LeavesFrequencyAndTemperatureBlank) {
    Elasticity option = Spring<Elasticity>({1, 3}, Table({{10, 20, 7}}));
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Elasticity, component=1, dependencies=1\n10., , , 7.\n"
                            "*Connector Elasticity, component=3, dependencies=1\n20., , , 7.\n");
}

TEST(ConnectorElasticity, LinearWithBoth_LeavesTheFrequencyBlankAheadOfThem) {
    Elasticity option = Spring<Elasticity>({1}, Table({{10, 300, 7}}));
    option.dependencies = 1;
    option.temperatureDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity, component=1, dependencies=1\n10., ,300.,  7.\n");
}

TEST(ConnectorElasticity, LinearWithFrequency_HasNoBlank) {
    Elasticity option = Spring<Elasticity>({1, 3}, Table({{10, 20, 50}}));
    option.frequencyDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity, component=1\n10.,50.\n"
                            "*Connector Elasticity, component=3\n20.,50.\n");
    option.table = Table({{10, 20, 50, 300}});
    option.temperatureDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity, component=1\n10., 50.,300.\n"
                            "*Connector Elasticity, component=3\n 20., 50.,300.\n");
}

TEST(ConnectorElasticity, CoupledOnOneToThree_HasSixCellsAndTwoEmptyLines) {
    Elasticity option = Coupled<Elasticity>({1, 2, 3}, Table({{1, 2, 3, 4, 5, 6}}));
    option.options = Group();
    EXPECT_EQ(Text(option), "*Connector Elasticity" + kGroup + "\n1.,2.,3.,4.,5.,6.\n\n\n");
}

TEST(ConnectorElasticity, CoupledOnOneToThreeWithTemperature_FillsAllTwentyOnePlaces) {
    Elasticity option = Coupled<Elasticity>({1, 2, 3}, Table({{1, 2, 3, 4, 5, 6, 300}}));
    option.temperatureDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity\n"
                            "1.,  2.,  3.,  4.,  5.,  6., , \n"
                            " , , , , , , , \n"
                            " , , , , ,300.\n");
}

TEST(ConnectorElasticity, CoupledWithFieldVariable_HasABlankTemperatureToo) {
    Elasticity option = Coupled<Elasticity>({1, 2, 3}, Table({{1, 2, 3, 4, 5, 6, 7}}));
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Elasticity, dependencies=1\n"
                            "1.,2.,3.,4.,5.,6., , \n"
                            " , , , , , , , \n"
                            " , , , , , ,7.\n");
}

TEST(ConnectorElasticity, CoupledWithFrequencyAlone_HasTwentyTwoCellsAndTheEmptyLines) {
    Elasticity option = Coupled<Elasticity>({1, 2, 3}, Table({{1, 2, 3, 4, 5, 6, 50}}));
    option.frequencyDependency = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity\n"
                            "1., 2., 3., 4., 5., 6., , \n"
                            " , , , , , , , \n"
                            " , , , , ,50.\n\n\n");
}

TEST(ConnectorElasticity, CoupledUpToComponentFour_HasTenCellsAndOneEmptyLine) {
    EXPECT_EQ(Text(Coupled<Elasticity>({4, 1, 2}, Table({{1, 2, 3, 4, 5, 6}}))),
              "*Connector Elasticity\n1.,2.,3., , , ,4.,5.\n ,6.\n\n");
}

TEST(ConnectorElasticity, CoupledOnFourToSix_BeginsWithBlanks) {
    EXPECT_EQ(Text(Coupled<Elasticity>({4, 5, 6}, Table({{1, 2, 3, 4, 5, 6}}))), "*Connector Elasticity\n"
                                                                                 " , , , , , , , \n"
                                                                                 " ,1., , , ,2.,3., \n"
                                                                                 " , ,4.,5.,6.\n");
}

TEST(ConnectorElasticity, CoupledOnNone_CountsAsTheLeastComponent) {
    EXPECT_EQ(Text(Coupled<Elasticity>({}, {})), "*Connector Elasticity\n\n\n");
}

TEST(ConnectorElasticity, LinearCoupledOnPosition_WritesNothing) {
    Elasticity option = Spring<Elasticity>({1}, Table({{1}}));
    option.coupling = Elasticity::CouplingEnm::COUPLED_POSITION;
    EXPECT_EQ(Text(option), "");
}

TEST(ConnectorElasticity, NonlinearUncoupled_HasTheWholeTableForEachComponent) {
    Elasticity option = Nonlinear(Spring<Elasticity>({2, 5}, Table({{-1, -0.5}, {1, 0.5}})));
    option.options = Group();
    EXPECT_EQ(Text(option), "*Connector Elasticity, nonlinear, component=2" + kGroup +
                                "\n-1., -0.5\n 1.,  0.5\n"
                                "*Connector Elasticity, nonlinear, component=5" +
                                kGroup + "\n-1., -0.5\n 1.,  0.5\n");
}

TEST(ConnectorElasticity, NonlinearWithFieldVariable_LeavesOnlyTheTemperatureBlank) {
    Elasticity option = Nonlinear(Spring<Elasticity>({2}, Table({{1, 5, 7}})));
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Elasticity, nonlinear, component=2, dependencies=1\n1.,5., ,7.\n");
}

TEST(ConnectorElasticity, NonlinearCoupled_HasItsComponentAndTheIndependentOnes) {
    Elasticity option = Nonlinear(Coupled<Elasticity>({1, 2}, Table({{1, 2, 3, 4}})));
    option.independentComponents = List({4, 6});
    EXPECT_EQ(Text(option),
              "*Connector Elasticity, nonlinear, component=1, independent components=CONSTITUTIVE MOTION\n"
              "4, 6\n1.,3.,4.\n"
              "*Connector Elasticity, nonlinear, component=2, independent components=CONSTITUTIVE MOTION\n"
              "4, 6\n2.,3.,4.\n");
    option.coupling = Elasticity::CouplingEnm::COUPLED_POSITION;
    option.components = List({1});
    option.table = Table({{1, 3, 4, 7}});
    option.dependencies = 1;
    option.options = Group();
    option.options.Get().interpolation = kbeC_ConnectorOptions::InterpolationEnm::LINEAR;
    option.options.Get().useBehaviorRegularization = true;
    option.options.Get().useBehaviorRateFactor = true;
    EXPECT_EQ(Text(option), "*Connector Elasticity, nonlinear, component=1, dependencies=1, independent "
                            "components=POSITION, extrapolation=LINEAR\n4, 6\n1.,3.,4., ,7.\n");
}

TEST(ConnectorDamping, Linear_IsLikeElasticity) {
    Damping option = Spring<Damping>({1, 3}, Table({{10, 20, 7}}));
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Damping, component=1, dependencies=1\n10., , , 7.\n"
                            "*Connector Damping, component=3, dependencies=1\n20., , , 7.\n");
    EXPECT_EQ(Text(Coupled<Damping>({1, 2, 3}, Table({{1, 2, 3, 4, 5, 6}}))),
              "*Connector Damping\n1.,2.,3.,4.,5.,6.\n\n\n");
}

TEST(ConnectorDamping, NonlinearCoupled_SkipsTheMotionsOfOtherComponentsToo) {
    Damping option = Nonlinear(Coupled<Damping>({1, 2}, Table({{1, 2, 3, 4, 5}})));
    option.independentComponents = List({6});
    EXPECT_EQ(Text(option),
              "*Connector Damping, nonlinear, component=1, independent components=CONSTITUTIVE MOTION\n"
              "6\n1.,3.,5.\n"
              "*Connector Damping, nonlinear, component=2, independent components=CONSTITUTIVE MOTION\n"
              "6\n2.,4.,5.\n");
}

TEST(ConnectorDamping, NonlinearUncoupled_SkipsNothing) {
    EXPECT_EQ(Text(Nonlinear(Spring<Damping>({1, 2}, Table({{1, 2}})))),
              "*Connector Damping, nonlinear, component=1\n1.,2.\n"
              "*Connector Damping, nonlinear, component=2\n1.,2.\n");
}

TEST(ConnectorStop, UnsetBounds_AreBlank) {
    kbeC_ConnectorStop option;
    option.components = List({1, 4});
    EXPECT_EQ(Written(oif_ConnectorStop(option)), "");
    option.maxMotion = 2;
    EXPECT_EQ(Written(oif_ConnectorStop(option)),
              "*Connector Stop, component=1\n, 2.\n*Connector Stop, component=4\n, 2.\n");
    option.minMotion = -1.5;
    option.components = List({2});
    EXPECT_EQ(Written(oif_ConnectorStop(option)), "*Connector Stop, component=2\n-1.5, 2.\n");
}

TEST(ConnectorFailure, ReleasedComponent_IsNamed) {
    kbeC_ConnectorFailure option;
    option.components = List({1});
    option.releaseComponent = 3;
    EXPECT_EQ(Written(oif_ConnectorFailure(option)), "");
    option.maxForce = 1e6;
    EXPECT_EQ(Written(oif_ConnectorFailure(option)),
              "*Connector Failure, component=1, release=3\n, , , 1e+06\n");
    option.releaseComponent = kbeC_ConnectorFailure::releaseComponentDef();
    option.minMotion = -1;
    option.maxMotion = 1;
    option.minForce = -2;
    EXPECT_EQ(Written(oif_ConnectorFailure(option)),
              "*Connector Failure, component=1\n-1., 1., -2., 1e+06\n");
}

TEST(ConnectorLock, LockedComponent_IsNamed) {
    kbeC_ConnectorLock option;
    option.components = List({1, 2});
    option.minMotion = 0;
    EXPECT_EQ(Written(oif_ConnectorLock(option)),
              "*Connector Lock, component=1\n0., , , \n*Connector Lock, component=2\n0., , , \n");
    option.lockingComponent = 6;
    option.components = List({2});
    EXPECT_EQ(Written(oif_ConnectorLock(option)), "*Connector Lock, component=2, lock=6\n0., , , \n");
}

TEST(ConnectorFriction, Predefined_HasItsTableAsItIs) {
    Friction option;
    option.component = 2;
    option.contactForceComponent = 3;
    option.table = Table({{1, 7}});
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Friction, predefined, dependencies=1\n1.,7.\n");
}

TEST(ConnectorFriction, Predefined_NamesIndependentComponentsButDoesNotListThem) {
    Friction option;
    option.independentKind = Friction::IndependentKindEnm::CONSTITUTIVE_MOTION;
    option.independentComponents = List({1, 2});
    EXPECT_EQ(Text(option), "*Connector Friction, predefined, independent components=CONSTITUTIVE MOTION\n");
}

TEST(ConnectorFriction, UserDefined_NamesComponentAndContactForce) {
    Friction option = UserDefined(Table({{100}}));
    EXPECT_EQ(Text(option), "*Connector Friction\n100.,\n");
    option.component = 0;
    EXPECT_EQ(Text(option), "*Connector Friction\n100.,\n");
    option.component = -1;
    EXPECT_EQ(Text(option), "*Connector Friction\n100.,\n");
    option.component = 1;
    option.contactForceComponent = 2;
    EXPECT_EQ(Text(option), "*Connector Friction, component=1, contact force=2\n100.,\n");
    option.contactForceType = Friction::ContactForceTypeEnm::DERIVED_COMPONENT;
    EXPECT_EQ(Text(option, 12), "*Connector Friction, component=1, contact force=BO-12-DC\n100.,\n");
}

TEST(ConnectorFriction, LongLine_BreaksBehindTheCommaOfAParameter) {
    Friction option = UserDefined(Table({{1, 2, 3, 300, 7}}));
    option.contactForceType = Friction::ContactForceTypeEnm::DERIVED_COMPONENT;
    option.independentKind = Friction::IndependentKindEnm::POSITION;
    option.independentComponents = List({1, 2});
    option.dependencies = 1;
    option.temperatureDependency = true;
    option.stickStiffness = 1000;
    option.options = Group();
    option.options.Get().regularize = false;
    option.options.Get().extrapolation = kbeC_ConnectorOptions::ExtrapolationEnm::CONSTANT;
    // 130 characters up to "OFF"; the rates of the group play no part.
    EXPECT_EQ(Text(option, 4),
              "*Connector Friction, contact force=BO-4-DC, dependencies=1, independent components=POSITION, "
              "stick stiffness=1000., regularize=OFF, \nextrapolation=CONSTANT\n"
              "1, 2\n"
              "1.,  2.,  3., ,300.,  7.\n");
}

TEST(ConnectorFriction, UserDefined_KeepsThePlacesOfAreaAndTemperature) {
    Friction option = UserDefined(Table({{1, 7}}));
    option.dependencies = 1;
    EXPECT_EQ(Text(option), "*Connector Friction, dependencies=1\n1., , ,7.\n");
    option.contactArea = true;
    option.table = Table({{1, 5, 7}});
    EXPECT_EQ(Text(option), "*Connector Friction, dependencies=1\n1.,5., ,7.\n");
}

TEST(ConnectorFriction, Coefficient_OfATableKeepsItsPlaces) {
    Tangential tangential;
    tangential.table = Table({{0.3}});
    EXPECT_EQ(Coefficient(tangential), "*Friction\n 0.3,\n");
    tangential.temperatureDependency = true;
    tangential.table = Table({{0.3, 20}});
    EXPECT_EQ(Coefficient(tangential), "*Friction\n 0.3, , ,20.\n");
    tangential.temperatureDependency = false;
    tangential.dependencies = 1;
    tangential.table = Table({{0.3, 7}});
    EXPECT_EQ(Coefficient(tangential), "*Friction, dependencies=1\n 0.3, , , ,7.\n");
    tangential.slipRateDependency = true;
    tangential.pressureDependency = true;
    tangential.shearStressLimit = 50;
    tangential.table = Table({{0.3, 1, 2, 7}});
    EXPECT_EQ(Coefficient(tangential), "*Friction, dependencies=1, taumax=50.\n 0.3,1.,2., ,7.\n");
}

TEST(ConnectorFriction, ElasticSlip_IsOfImplicitAnalysesOnly) {
    Tangential tangential;
    tangential.fraction = 0.01;
    tangential.elasticSlip = 2;
    EXPECT_EQ(Coefficient(tangential), "*Friction, slip tolerance=0.01\n");
    EXPECT_EQ(Coefficient(tangential, 1), "*Friction\n");
    tangential.slipToleranceType = Tangential::SlipToleranceTypeEnm::ABSOLUTE;
    EXPECT_EQ(Coefficient(tangential), "*Friction, elastic slip=2.\n");
    EXPECT_EQ(Coefficient(tangential, 1), "*Friction\n");
    tangential = Decay({}, 0);
    tangential.elasticSlip = 2;
    tangential.slipToleranceType = Tangential::SlipToleranceTypeEnm::ABSOLUTE;
    EXPECT_EQ(Coefficient(tangential), "*Friction, elastic slip=2., exponential decay\n");
}

TEST(ConnectorFriction, ExponentialDecay_HasOneLineOrThree) {
    EXPECT_EQ(Coefficient(Decay(Table({{0.3, 0.2, 0.1}}), 0)),
              "*Friction, exponential decay\n0.3, 0.2, 0.1\n");
    EXPECT_EQ(Coefficient(Decay(Table({{0.3, 0.2}, {1, 0.1}}), 1)),
              "*Friction, exponential decay, test data\n0.3\n0.2, 1.\n0.1\n");
    EXPECT_EQ(Coefficient(Decay(Table({{0.3, 0.2, 0.1}}), 2)),
              "*Friction, exponential decay\n0.3, 0.2, 0.1\n");
}

TEST(ConnectorFriction, ExponentialDecayWithTooFewValues_EndsThere) {
    EXPECT_EQ(Coefficient(Decay(Table({{0.3, 0.2}}), 1)),
              "*Friction, exponential decay, test data\n0.3\n0.2\n");
    EXPECT_EQ(Coefficient(Decay(Table({{0.3}}), 0)), "*Friction, exponential decay\n0.3\n");
    EXPECT_EQ(Coefficient(Decay({}, 0)), "*Friction, exponential decay\n");
}

TEST(ConnectorPotential, Sum_HasItsExponentUnlessItIsTwo) {
    Friction option;
    Potential term;
    option.potentials = List({term});
    const std::string head = "*Connector Friction, predefined\n";
    EXPECT_EQ(Text(option), head + "*Connector Potential\n1, 1., 1., ABS, 2., 1.0\n");
    option.forcePotentialExponent = 3;
    EXPECT_EQ(Text(option), head + "*Connector Potential, exponent=3.\n1, 1., 1., ABS, 2., 1.0\n");
}

TEST(ConnectorPotential, Maximum_LeavesTheRadiusBlank) {
    Friction option;
    option.potentials = List({Potential()});
    option.potentialOperator = Friction::PotentialOperatorEnm::MAXIMUM;
    option.forcePotentialExponent = 3;
    EXPECT_EQ(Text(option),
              "*Connector Friction, predefined\n*Connector Potential, operator=MAX\n1, 1., , ABS, 2., 1.0\n");
}

TEST(ConnectorPotential, Terms_HaveComponentsOrGeneratedNames) {
    Plasticity option;
    Potential first;
    first.component = 6;
    first.sign = Potential::SignEnm::MACAULEY;
    first.negative = 1;
    first.scaleFactor = 0.5;
    Potential second = Derived();
    second.sign = Potential::SignEnm::NONE;
    second.radius = 2.5;
    second.exponentFactor = 1;
    option.potentials = List({first, second});
    EXPECT_EQ(Text(option, 3), "*Connector Plasticity\n"
                               "*Connector Potential\n"
                               "6, 0.5, 1., MACAULEY, 2., -1.0\n"
                               "BO-3-CP-1, 1., 2.5, NONE, 1., 1.0\n");
}

TEST(ConnectorPlasticity, Components_HaveAPassEach) {
    Plasticity option;
    EXPECT_EQ(Text(option), "*Connector Plasticity\n");
    option.components = List({1, 4});
    option.isotropicHardening = true;
    option.isotropicTable = Table({{100, 0}, {200, 1}});
    EXPECT_EQ(Text(option), "*Connector Plasticity, component=1\n"
                            "*Connector Hardening, definition=Tabular\n100.,0.\n200.,1.\n"
                            "*Connector Plasticity, component=4\n"
                            "*Connector Hardening, definition=Tabular\n100.,0.\n200.,1.\n");
}

TEST(ConnectorPlasticity, Hardenings_StandIsotropicFirst) {
    Plasticity option;
    option.isotropicHardening = true;
    option.isotropicType = Plasticity::IsotropicTypeEnm::EXPONENTIAL_LAW;
    option.isotropicTable = Table({{1, 2, 3, 7}});
    option.isotropicDependencies = 1;
    option.isotropicOptions = Group();
    option.isotropicOptions.Get().useBehaviorRegularization = true;
    option.isotropicOptions.Get().useBehaviorRateFactor = true;
    option.isotropicOptions.Get().interpolation = kbeC_ConnectorOptions::InterpolationEnm::LINEAR;
    option.kinematicHardening = true;
    option.kinematicTable = Table({{4, 5, 20}});
    option.kinematicTemperatureDependency = true;
    EXPECT_EQ(Text(option),
              "*Connector Plasticity\n"
              "*Connector Hardening, definition=Exponential Law, dependencies=1, extrapolation=LINEAR\n"
              "1.,2.,3., ,7.\n"
              "*Connector Hardening, type=Kinematic, definition=Half Cycle\n"
              "4., 5.,20.\n");
}

TEST(ConnectorPlasticity, KinematicHardening_HasThreeDefinitions) {
    Plasticity option;
    option.kinematicHardening = true;
    option.kinematicType = Plasticity::KinematicTypeEnm::STABILIZED;
    option.kinematicDependencies = 2;
    EXPECT_EQ(Text(option), "*Connector Plasticity\n"
                            "*Connector Hardening, type=Kinematic, definition=Stabilized, dependencies=2\n");
    option.kinematicType = Plasticity::KinematicTypeEnm::PARAMETERS;
    EXPECT_EQ(Text(option), "*Connector Plasticity\n"
                            "*Connector Hardening, type=Kinematic, definition=Parameters, dependencies=2\n");
}

TEST(ConnectorPlasticity, Potential_CouplesTheComponentsInOnePassAndStandsLast) {
    Plasticity option;
    option.components = List({1, 2});
    option.potentials = List({Potential()});
    option.isotropicHardening = true;
    option.isotropicTable = Table({{5, 0}});
    EXPECT_EQ(Text(option), "*Connector Plasticity\n*Connector Hardening, definition=Tabular\n5.,0.\n"
                            "*Connector Potential\n1, 1., 1., ABS, 2., 1.0\n");
}

TEST(ConnectorDamage, InfiniteBounds_AreTwoBlanks) {
    Damage option = Initiated(Damage::CriterionEnm::FORCE, Table({{-1e36, 1e36}}));
    EXPECT_EQ(Text(option), "*Connector Damage Initiation\n  ,  \n");
    // Each bound counts in its own column only.
    option.initiationTable = Table({{1e36, -1e36}});
    EXPECT_EQ(Text(option), "*Connector Damage Initiation\n 1e+36, -1e+36\n");
}

TEST(ConnectorDamage, Criteria_AreNamedUnlessForce) {
    Damage option = Initiated(Damage::CriterionEnm::MOTION, Table({{-5, 5, 7}}));
    option.components = List({2});
    option.initiationDependencies = 1;
    option.initiationOptions = Group();
    option.initiationOptions.Get().useBehaviorRegularization = true;
    EXPECT_EQ(Text(option), "*Connector Damage Initiation, component=2, criterion=Motion, dependencies=1, "
                            "extrapolation=LINEAR, rate filter factor=0.5, rate "
                            "interpolation=LOGARITHMIC\n-5.,5., ,7.\n");
}

TEST(ConnectorDamage, PlasticMotionWithoutModeMix_LeavesItBlank) {
    Damage option = Initiated(Damage::CriterionEnm::PLASTIC_MOTION, Table({{5}}));
    const std::string head = "*Connector Damage Initiation, criterion=Plastic Motion\n";
    EXPECT_EQ(Text(option), head + "5.,\n");
    option.initiationTable = Table({{5, 20}});
    option.initiationTemperatureDependency = true;
    EXPECT_EQ(Text(option), head + "5., ,20.\n");
    option.modeMixDependency = true;
    option.initiationTable = Table({{5, 1, 20}});
    EXPECT_EQ(Text(option), head + "5., 1.,20.\n");
}

TEST(ConnectorDamage, Evolution_ByMotionOrEnergy) {
    Damage option;
    option.evolutionTable = Table({{2}});
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Motion\n2.,\n");
    option.evolutionType = Damage::EvolutionTypeEnm::ENERGY;
    option.softening = Damage::SofteningEnm::TABULAR; // of motion only
    option.evolutionTable = Table({{2, 300}});
    option.evolutionTemperatureDependency = true;
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Energy\n2., ,300.\n");
}

TEST(ConnectorDamage, Softening_LeavesTheModeMixBlankBehindItsTwoColumns) {
    Damage option;
    option.softening = Damage::SofteningEnm::EXPONENTIAL;
    option.evolutionTable = Table({{2, 3, 300}});
    option.evolutionTemperatureDependency = true;
    EXPECT_EQ(Evolution(option),
              "*Connector Damage Evolution, type=Motion, softening=Exponential\n2.,  3., ,300.\n");
    option.softening = Damage::SofteningEnm::TABULAR;
    option.evolutionTemperatureDependency = false;
    option.evolutionDependencies = 1;
    option.evolutionTable = Table({{2, 3, 7}});
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Motion, softening=Tabular, "
                                 "dependencies=1\n2.,3., , ,7.\n");
    option.criterion = Damage::CriterionEnm::PLASTIC_MOTION;
    option.modeMixDependency = true;
    option.evolutionTable = Table({{2, 3, 1, 7}});
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Motion, softening=Tabular, "
                                 "dependencies=1\n2.,3.,1., ,7.\n");
}

TEST(ConnectorDamage, ModeMixOfAnotherCriterion_DoesNotCount) {
    Damage option;
    option.modeMixDependency = true;
    option.evolutionTable = Table({{2, 300}});
    option.evolutionTemperatureDependency = true;
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Motion\n2., ,300.\n");
}

TEST(ConnectorDamage, AffectedComponents_StandOnTheirLine) {
    Damage option;
    option.useAffected = true;
    option.affectedComponents = List({1, 3});
    option.degradation = Damage::DegradationEnm::MULTIPLICATIVE;
    option.evolutionOptions = Group();
    option.evolutionOptions.Get().useBehaviorExtrapolation = true;
    option.evolutionOptions.Get().useBehaviorRateFactor = true;
    option.evolutionOptions.Get().interpolation = kbeC_ConnectorOptions::InterpolationEnm::LINEAR;
    EXPECT_EQ(Evolution(option), "*Connector Damage Evolution, type=Motion, affected components, "
                                 "degradation=Multiplicative, regularize=ON, rtol=0.05\n1, 3\n");
}

TEST(ConnectorDamage, Passes_HaveInitiationAndEvolutionSideBySide) {
    Damage option = Initiated(Damage::CriterionEnm::FORCE, Table({{1, 2}}));
    option.components = List({1, 2});
    option.evolution = true;
    option.evolutionTable = Table({{3}});
    option.evolutionPotentials = List({Derived()});
    option.evolutionPotentialExponent = 1;
    const std::string behind = "1.,2.\n*Connector Damage Evolution, type=Motion\n3.,\n"
                               "*Connector Potential, exponent=1.\nBO-5-EP-0, 1., 1., ABS, 2., 1.0\n";
    EXPECT_EQ(Text(option, 5), "*Connector Damage Initiation, component=1\n" + behind +
                                   "*Connector Damage Initiation, component=2\n" + behind);
    option.initiationPotentials = List({Derived()});
    option.initiationPotentialOperator = Damage::PotentialOperatorEnm::MAXIMUM;
    option.evolutionPotentials = {};
    EXPECT_EQ(Text(option, 5), "*Connector Damage Initiation\n1.,2.\n"
                               "*Connector Potential, operator=MAX\nBO-5-IP-0, 1., , ABS, 2., 1.0\n"
                               "*Connector Damage Evolution, type=Motion\n3.,\n");
}

TEST(DerivedComponents, OfFriction_AreTheContactForceAndThePotentials) {
    TestStore store;
    Friction option = UserDefined();
    option.contactForceType = Friction::ContactForceTypeEnm::DERIVED_COMPONENT;
    option.contactForceDerived = kbeC_DerivedComponent();
    Potential nothing; // a component: its derived one doesn't count
    nothing.derivedComponent = kbeC_DerivedComponent();
    Potential absent;
    absent.useDerived = 1;
    option.potentials = List({Derived(), nothing, absent, Derived()});
    EXPECT_EQ(Names(oif_ConnectorFriction(option, store.Info(), 2)),
              (Strings{"BO-2-CP-0", "BO-2-CP-3", "BO-2-DC"}));
    option.contactForceType = Friction::ContactForceTypeEnm::COMPONENT_NUMBER;
    EXPECT_EQ(Names(oif_ConnectorFriction(option, store.Info(), 2)), (Strings{"BO-2-CP-0", "BO-2-CP-3"}));
    option.contactForceType = Friction::ContactForceTypeEnm::DERIVED_COMPONENT;
    option.formulation = Friction::FormulationEnm::PREDEFINED;
    EXPECT_EQ(Names(oif_ConnectorFriction(option, store.Info(), 2)), (Strings{"BO-2-CP-0", "BO-2-CP-3"}));
}

TEST(DerivedComponents, OfDamage_AreOfTheEvolutionOnlyIfThereIsOne) {
    Damage option;
    option.initiationPotentials = List({Derived()});
    option.evolutionPotentials = List({Derived()});
    EXPECT_EQ(Names(oif_ConnectorDamage(option, 1)), (Strings{"BO-1-IP-0"}));
    option.evolution = true;
    EXPECT_EQ(Names(oif_ConnectorDamage(option, 1)), (Strings{"BO-1-EP-0", "BO-1-IP-0"}));
}

TEST(DerivedComponents, OfPlasticity_AreThoseOfItsPotential) {
    Plasticity option;
    option.potentials = List({Derived()});
    EXPECT_EQ(Names(oif_ConnectorPlasticity(option, 10)), (Strings{"BO-10-CP-0"}));
}

TEST(DerivedComponents, KnownName_KeepsItsFirstComponent) {
    Plasticity first;
    first.potentials = List({Derived()});
    Plasticity second;
    Potential empty;
    empty.useDerived = 1;
    empty.derivedComponent = kbeC_DerivedComponent();
    second.potentials = List({empty});
    oif_DerivedComponents components;
    oif_ConnectorPlasticity(first, 0).GetDerivedComponents(components);
    oif_ConnectorPlasticity(second, 0).GetDerivedComponents(components);
    EXPECT_EQ(components.ConstGet("BO-0-CP-0").terms.Length(), 1);
}

TEST(DerivedComponent, EachTerm_IsAKeyword) {
    kbeC_CDCTerm plain;
    plain.components = List({1, 2});
    plain.table = Table({{1, 1}});
    kbeC_CDCTerm full;
    full.components = List({3});
    full.sign = kbeC_CDCTerm::SignEnm::NEGATIVE;
    full.operatorType = kbeC_CDCTerm::OperatorEnm::SUM;
    full.dependencies = 1;
    full.independentGiven = true;
    full.table = Table({{1, 5, 7}});
    full.options = Group();
    full.options.Get().useBehaviorRateFactor = true;
    full.options.Get().useBehaviorRegularization = true;
    full.options.Get().interpolation = kbeC_ConnectorOptions::InterpolationEnm::LINEAR;
    kbeC_DerivedComponent component;
    component.terms = List({plain, full});
    EXPECT_EQ(Written(oif_DerivedComponent("a b", component)),
              "*Connector Derived Component, name=\"a b\"\n1, 2\n1.,1.\n"
              "*Connector Derived Component, name=\"a b\", sign=NEGATIVE, operator=SUM, dependencies=1, "
              "independent components, extrapolation=LINEAR\n3\n1.,5., ,7.\n");
}

TEST(DerivedComponent, LongLine_BreaksBehindAParameterOnPurpose) {
    kbeC_CDCTerm term;
    term.components = List({3});
    term.sign = kbeC_CDCTerm::SignEnm::NEGATIVE;
    term.operatorType = kbeC_CDCTerm::OperatorEnm::MACAULEY_SUM;
    term.independentGiven = true;
    term.independentKind = kbeC_CDCTerm::IndependentKindEnm::CONSTITUTIVE_MOTION;
    kbeC_DerivedComponent component;
    component.terms = List({term});
    // 35 characters are ahead of the name, 38 are the sign and the operator.
    const std::string longer(67, 'n');
    const std::string head = "*Connector Derived Component, name=";
    EXPECT_EQ(Written(oif_DerivedComponent(longer, component)),
              head + longer +
                  ", sign=NEGATIVE, operator=MACAULEY SUM\n"
                  ", independent components=CONSTITUTIVE MOTION\n3\n");
    const std::string shorter(50, 'n');
    EXPECT_EQ(
        Written(oif_DerivedComponent(shorter, component)),
        head + shorter +
            ", sign=NEGATIVE, operator=MACAULEY SUM, independent components=CONSTITUTIVE MOTION\n\n3\n");
}
