#include "materials/Materials.h"

namespace {

const TextCase kCases[] = {
    {"Plastic_Hardening0_HasNoWord", KEYWORD(Plastic, o.table = Table({{250, 0}})), "*Plastic\n250.,0.\n"},
    {"Plastic_Hardening1_IsKinematic", KEYWORD(Plastic, Number(o.hardening, 1); o.dependencies = 1),
     "*Plastic, dependencies=1, hardening=KINEMATIC\n"},
    {"Plastic_Hardening2_IsMultilinearKinematic", KEYWORD(Plastic, Number(o.hardening, 2)),
     "*Plastic, hardening=MULTILINEAR KINEMATIC\n"},
    {"Plastic_Hardening3_IsCombined", KEYWORD(Plastic, Number(o.hardening, 3)),
     "*Plastic, hardening=COMBINED\n"},
    {"Plastic_Hardening4_IsJohnsonCook", KEYWORD(Plastic, Number(o.hardening, 4)),
     "*Plastic, hardening=JOHNSON COOK\n"},
    {"Plastic_Hardening5_LaysTheFirstColumnOutAsARow",
     KEYWORD(Plastic, Number(o.hardening, 5);
             o.table = Table({{1, 10}, {2, 20}, {3, 0}, {4, 0}, {5, 0}, {6, 0}, {7, 0}, {8, 0}, {900, 0}})),
     "*Plastic, hardening=USER, properties=9\n1.,  2.,  3.,  4.,  5.,  6.,  7.,  8.\n900.,\n"},
    {"Plastic_Hardening5WithoutRows_HasNoProperties",
     KEYWORD(Plastic, Number(o.hardening, 5); o.dependencies = 1),
     "*Plastic, dependencies=1, hardening=USER, properties=0\n"},
    {"Plastic_Hardening5WithADataType_TellsAllOfIt",
     KEYWORD(Plastic, Number(o.hardening, 5); Number(o.dataType, 1); o.table = Table({{7}})),
     "*Plastic, hardening=USER, datatype=PARAMETERS, numbackstress=1, properties=1\n7.,\n"},
    {"Plastic_HardeningWithoutAWord_LeavesTheNameAlone", KEYWORD(Plastic, Number(o.hardening, 6)),
     "*Plastic, hardening=\n"},
    {"Plastic_DataType1_HasItsBackstresses",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 1); o.numBackstresses = 2),
     "*Plastic, hardening=COMBINED, datatype=PARAMETERS, numbackstress=2\n"},
    {"Plastic_DataType2_IsStabilized",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 2); o.numBackstresses = 2),
     "*Plastic, hardening=COMBINED, datatype=STABILIZED\n"},
    {"Plastic_DataTypeOfAnyHardening_IsWritten", KEYWORD(Plastic, Number(o.dataType, 2)),
     "*Plastic, datatype=STABILIZED\n"},
    {"Plastic_StabilizedWithTemperature_GetsABlankStrainRange",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 2); o.temperatureDependency = true;
             o.table = Table({{1, 2, 20}})),
     "*Plastic, hardening=COMBINED, datatype=STABILIZED\n1., 2., ,20.\n"},
    {"Plastic_StabilizedWithFields_GetsBothBlanks",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 2); o.dependencies = 1;
             o.table = Table({{1, 2, 7}})),
     "*Plastic, dependencies=1, hardening=COMBINED, datatype=STABILIZED\n1.,2., , ,7.\n"},
    {"Plastic_StabilizedWithStrainRanges_GetsNoBlank",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 2); o.temperatureDependency = true;
             o.strainRangeDependency = true; o.table = Table({{1, 2, 3, 20}})),
     "*Plastic, hardening=COMBINED, datatype=STABILIZED\n1., 2., 3.,20.\n"},
    {"Plastic_StabilizedWithoutDependence_GetsNoBlank",
     KEYWORD(Plastic, Number(o.hardening, 3); Number(o.dataType, 2); o.table = Table({{1, 2, 3}})),
     "*Plastic, hardening=COMBINED, datatype=STABILIZED\n1.,2.,3.\n"},
    {"Plastic_SubOptions_StandInOrder",
     KEYWORD(Plastic, o.annealTemperature = kmaC_AnnealTemperature(); o.cycledPlastic = kmaC_CycledPlastic();
             o.ornl = kmaC_Ornl(); o.cyclicHardening = kmaC_CyclicHardening(); o.potential = kmaC_Potential();
             o.rateDependent = kmaC_RateDependent()),
     "*Plastic\n*Rate Dependent\n*Potential\n*Cyclic Hardening\n*Ornl\n*Cycled Plastic\n"
     "*Anneal Temperature\n"},

    // The rate split: each row is a table of its own, so its widths are its own.
    {"PlasticByRate_OneRate_IsOneBlock",
     KEYWORD(Plastic, o.rateDependentTable = true; o.table = Table({{200, 0, 0}, {1250, 0.1, 0}})),
     "*Plastic, rate=0.\n200.,0.\n1250., 0.1\n"},
    {"PlasticByRate_InterleavedRows_AreSortedIntoTwoBlocks",
     KEYWORD(Plastic, o.rateDependentTable = true;
             o.table = Table({{3, 0, 10}, {1, 0, 0}, {4, 1, 10}, {2, 1, 0}})),
     "*Plastic, rate=0.\n1.,0.\n2.,1.\n*Plastic, rate=10.\n3.,0.\n4.,1.\n"},
    {"PlasticByRate_RowsOfOneRate_KeepTheirOrder",
     KEYWORD(Plastic, o.rateDependentTable = true; o.table = Table({{9, 0, 5}, {1, 1, 5}, {5, 2, 0}})),
     "*Plastic, rate=0.\n5.,2.\n*Plastic, rate=5.\n9.,0.\n1.,1.\n"},
    {"PlasticByRate_Hardening_IsLeftOutOnPurpose",
     KEYWORD(Plastic, o.rateDependentTable = true; Number(o.hardening, 5); Number(o.dataType, 1);
             o.table = Table({{1, 0, 5}})),
     "*Plastic, rate=5.\n1.,0.\n"},
    {"PlasticByRate_Dependencies_StandBehindTheRate",
     KEYWORD(Plastic, o.rateDependentTable = true; o.dependencies = 1; o.table = Table({{1, 0, 5, 7}})),
     "*Plastic, rate=5., dependencies=1\n1.,0., ,7.\n"},
    {"PlasticByRate_TemperatureAndFields_GetNoBlank",
     KEYWORD(Plastic, o.rateDependentTable = true; o.temperatureDependency = true; o.dependencies = 1;
             o.table = Table({{2, 1, 9, 20, 7}, {1, 0, 5, 10, 6}})),
     "*Plastic, rate=5., dependencies=1\n1., 0.,10., 6.\n*Plastic, rate=9., dependencies=1\n"
     "2., 1.,20., 7.\n"},
    {"PlasticByRate_SubOptions_FollowAllBlocks",
     KEYWORD(Plastic, o.rateDependentTable = true; o.table = Table({{1, 0, 5}, {1, 0, 6}});
             o.potential = kmaC_Potential()),
     "*Plastic, rate=5.\n1.,0.\n*Plastic, rate=6.\n1.,0.\n*Potential\n"},
    {"PlasticByRate_WithoutRows_WritesTheSubOptionsAlone",
     KEYWORD(Plastic, o.rateDependentTable = true; o.ornl = kmaC_Ornl()), "*Ornl\n"},
    {"PlasticByRate_WithoutARateColumn_WritesTheSubOptionsAlone",
     KEYWORD(Plastic, o.rateDependentTable = true; o.table = Table({{1, 2}}); o.ornl = kmaC_Ornl()),
     "*Ornl\n"},

    {"DruckerPragerHardening_Type1_IsTension",
     KEYWORD(DruckerPragerHardening, Number(o.type, 1); o.dependencies = 1),
     "*Drucker Prager Hardening, dependencies=1, type=TENSION\n"},
    {"DruckerPragerHardening_Type2_IsShear", KEYWORD(DruckerPragerHardening, Number(o.type, 2)),
     "*Drucker Prager Hardening, type=SHEAR\n"},
    {"DruckerPragerHardeningByRate_InterleavedRows_MakeABlockAtEachChangeOnPurpose",
     KEYWORD(DruckerPragerHardening, o.rateDependentTable = true;
             o.table = Table({{3, 0, 10}, {1, 0, 0}, {4, 1, 10}})),
     "*Drucker Prager Hardening, rate=10.\n3.,0.\n*Drucker Prager Hardening, rate=0.\n1.,0.\n"
     "*Drucker Prager Hardening, rate=10.\n4.,1.\n"},
    {"DruckerPragerHardeningByRate_Parameters_StandAroundTheRate",
     KEYWORD(DruckerPragerHardening, o.rateDependentTable = true; Number(o.type, 1); o.dependencies = 1;
             o.table = Table({{1, 0, 5, 7}})),
     "*Drucker Prager Hardening, dependencies=1, rate=5., type=TENSION\n1.,0., ,7.\n"},
    {"DruckerPragerHardeningByRate_WithoutRows_WritesNothing",
     KEYWORD(DruckerPragerHardening, o.rateDependentTable = true), ""},

    {"DruckerPrager_Linear_HasNoBlank", KEYWORD(DruckerPrager, o.table = Table({{40, 1, 20}})),
     "*Drucker Prager\n40., 1.,20.\n"},
    {"DruckerPrager_AllParameters_StandInOrder",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 2); o.testData = true; o.eccentricity = 0.2;
             o.dependencies = 1),
     "*Drucker Prager, dependencies=1, eccentricity=0.2, shearcriterion=EXPONENT FORM, testdata\n"},
    {"DruckerPrager_TestData_IsAWordWhateverTheCriterion", KEYWORD(DruckerPrager, o.testData = true),
     "*Drucker Prager, testdata\n"},
    {"DruckerPrager_Hyperbolic_HasABlankThirdColumn",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 1); o.table = Table({{40, 1, 20}})),
     "*Drucker Prager, shearcriterion=HYPERBOLIC\n40., 1., ,20.\n"},
    {"DruckerPrager_Exponential_HasABlankThirdColumn",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 2); o.table = Table({{1, 2, 3}})),
     "*Drucker Prager, shearcriterion=EXPONENT FORM\n1.,2., ,3.\n"},
    {"DruckerPrager_ExponentialByTests_HasThreeBlanksAheadOfTheDilation",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 2); o.testData = true; o.table = Table({{30}})),
     "*Drucker Prager, shearcriterion=EXPONENT FORM, testdata\n , , ,30.\n"},
    {"DruckerPrager_FieldsOfLinear_StandBehindABlankAt3",
     KEYWORD(DruckerPrager, o.dependencies = 1; o.table = Table({{1, 2, 3, 7}})),
     "*Drucker Prager, dependencies=1\n1.,2.,3., ,7.\n"},
    {"DruckerPrager_FieldsOfHyperbolic_StandBehindABlankAt4",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 1); o.dependencies = 1; o.table = Table({{1, 2, 3, 7}})),
     "*Drucker Prager, dependencies=1, shearcriterion=HYPERBOLIC\n1.,2., ,3., ,7.\n"},
    {"DruckerPrager_FieldsOfExponentialByTests_StandBehindABlankAt4",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 2); o.testData = true; o.dependencies = 1;
             o.table = Table({{3, 7}})),
     "*Drucker Prager, dependencies=1, shearcriterion=EXPONENT FORM, testdata\n , , ,3., ,7.\n"},
    {"DruckerPrager_FieldsWithTemperature_GetNoFurtherBlank",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 1); o.dependencies = 1; o.temperatureDependency = true;
             o.table = Table({{1, 2, 3, 4, 7}})),
     "*Drucker Prager, dependencies=1, shearcriterion=HYPERBOLIC\n1.,2., ,3.,4.,7.\n"},
    {"DruckerPrager_AnyOtherCriterion_CountsAsNotLinearForTheFieldsOnly",
     KEYWORD(DruckerPrager, Number(o.shearCriterion, 3); o.dependencies = 1;
             o.table = Table({{1, 2, 3, 4, 7}})),
     "*Drucker Prager, dependencies=1\n1.,2.,3.,4., ,7.\n"},
    {"DruckerPrager_SubOptions_StandInOrder",
     KEYWORD(DruckerPrager, o.triaxialTestData = kmaC_TriaxialTestData();
             o.rateDependent = kmaC_RateDependent(); o.druckerPragerHardening = kmaC_DruckerPragerHardening();
             o.druckerPragerCreep = kmaC_DruckerPragerCreep()),
     "*Drucker Prager\n*Drucker Prager Creep\n*Drucker Prager Hardening\n*Rate Dependent\n"
     "*Triaxial Test Data\n"},

    {"ClayPlasticity_TabularHardening_LeavesThePlaceOfTheFirstRowOnlyOnPurpose",
     KEYWORD(ClayPlasticity, Number(o.hardening, 1); o.table = Table({{1, 2}, {3, 4}})),
     "*Clay Plasticity, hardening=TABULAR\n, 1.,2.\n3.,4.\n"},
    {"ClayPlasticity_TabularHardeningWithoutRows_LeavesNoPlace",
     KEYWORD(ClayPlasticity, Number(o.hardening, 1)), "*Clay Plasticity, hardening=TABULAR\n"},
    {"ClayPlasticity_ExponentialHardening_StartsWithItsModulus",
     KEYWORD(ClayPlasticity, o.table = Table({{1, 2}})), "*Clay Plasticity\n1.,2.\n"},
};

class PlasticOptions : public testing::TestWithParam<TextCase> {};

} // namespace

TEST_P(PlasticOptions, Of) {
    EXPECT_EQ(GetParam().write(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Each, PlasticOptions, testing::ValuesIn(kCases), TextCaseName);
