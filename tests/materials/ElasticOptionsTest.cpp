#include "materials/Materials.h"

namespace {

/// What an elasticity writes, beside viscoelasticity or without it.
template <class R, class Set>
std::string Elasticity(const Set& set, bool hasViscoelastic = false) {
    return Written(oif_ElasticityOption<R>(With<R>(set), hasViscoelastic));
}

#define ELASTIC(...) ([] { return Elasticity<kmaC_Elastic>([](auto& o) { __VA_ARGS__; }); })
#define HYPERELASTIC(...) ([] { return Elasticity<kmaC_Hyperelastic>([](auto& o) { __VA_ARGS__; }); })
#define HYPERFOAM(...) ([] { return Elasticity<kmaC_Hyperfoam>([](auto& o) { __VA_ARGS__; }); })

/// All tests, so that what is left out can be seen.
void AllTests(kmaC_Hyperelastic& o) {
    o.volumetricTestData = kmaC_VolumetricTestData();
    o.uniaxialTestData = kmaC_UniaxialTestData();
    o.planarTestData = kmaC_PlanarTestData();
    o.biaxialTestData = kmaC_BiaxialTestData();
}

const TextCase kCases[] = {
    {"Elastic_Type0_HasNoWord", ELASTIC(o.table = Table({{210000, 0.3}})), "*Elastic\n210000., 0.3\n"},
    {"Elastic_Type1_IsOrthotropic", ELASTIC(Number(o.type, 1)), "*Elastic, type=ORTHOTROPIC\n"},
    {"Elastic_Type2_IsAnisotropic", ELASTIC(Number(o.type, 2)), "*Elastic, type=ANISOTROPIC\n"},
    {"Elastic_Type3_IsEngineeringConstants", ELASTIC(Number(o.type, 3)),
     "*Elastic, type=ENGINEERING CONSTANTS\n"},
    {"Elastic_Type4_IsLamina", ELASTIC(Number(o.type, 4)), "*Elastic, type=LAMINA\n"},
    {"Elastic_Type5_IsTraction", ELASTIC(Number(o.type, 5)), "*Elastic, type=TRACTION\n"},
    {"Elastic_Type6_IsCoupledTraction", ELASTIC(Number(o.type, 6)), "*Elastic, type=COUPLED TRACTION\n"},
    {"Elastic_Type7_IsShear", ELASTIC(Number(o.type, 7)), "*Elastic, type=SHEAR\n"},
    {"Elastic_TypeWithoutAWord_LeavesTheNameAlone", ELASTIC(Number(o.type, 8)), "*Elastic, type=\n"},
    {"Elastic_FieldsWithoutTemperature_StandBehindABlank",
     ELASTIC(o.dependencies = 1; Number(o.type, 4); o.table = Table({{1, 2, 3}})),
     "*Elastic, dependencies=1, type=LAMINA\n1.,2., ,3.\n"},
    {"Elastic_WithoutViscoelasticity_IgnoresLongTermModuliOnPurpose", ELASTIC(o.longTermModuli = false),
     "*Elastic\n"},
    {"Elastic_SubOptionsAndFlags_StandInOrder",
     ELASTIC(o.noTension = true; o.noCompression = true; o.failStress = kmaC_FailStress();
             o.failStrain = kmaC_FailStrain()),
     "*Elastic\n*Fail Strain\n*Fail Stress\n*No Compression\n*No Tension\n"},
    {"Elastic_NoTensionAlone_Follows", ELASTIC(o.noTension = true), "*Elastic\n*No Tension\n"},

    {"Hyperelastic_Type0_IsArrudaBoyce", HYPERELASTIC(Number(o.type, 0)), "*Hyperelastic, arruda-boyce\n"},
    {"Hyperelastic_Type1_IsMarlow", HYPERELASTIC(Number(o.type, 1)), "*Hyperelastic, marlow\n"},
    {"Hyperelastic_Type2_IsMooneyRivlin", HYPERELASTIC(Number(o.type, 2)), "*Hyperelastic, mooney-rivlin\n"},
    {"Hyperelastic_Type3_IsNeoHooke", HYPERELASTIC(Number(o.type, 3)), "*Hyperelastic, neo hooke\n"},
    {"Hyperelastic_Type4_IsOgden", HYPERELASTIC(Number(o.type, 4)), "*Hyperelastic, ogden\n"},
    {"Hyperelastic_Type5_HasNoWord", HYPERELASTIC(Number(o.type, 5)), "*Hyperelastic\n"},
    {"Hyperelastic_Type6_IsReducedPolynomial", HYPERELASTIC(Number(o.type, 6)),
     "*Hyperelastic, reduced polynomial\n"},
    {"Hyperelastic_Type7_IsUserAndTellsOfCompression", HYPERELASTIC(Number(o.type, 7)),
     "*Hyperelastic, user, type=INCOMPRESSIBLE\n"},
    {"Hyperelastic_Type8_IsVanDerWaals", HYPERELASTIC(Number(o.type, 8)), "*Hyperelastic, van der waals\n"},
    {"Hyperelastic_Type9_IsYeoh", HYPERELASTIC(Number(o.type, 9)), "*Hyperelastic, yeoh\n"},
    {"Hyperelastic_Type10_IsUnknown", HYPERELASTIC(Number(o.type, 10)), "*Hyperelastic, unknown\n"},
    {"Hyperelastic_AnyOtherType_IsUnknownToo", HYPERELASTIC(Number(o.type, 11)), "*Hyperelastic, unknown\n"},
    {"Hyperelastic_OrderOfOgden_StandsAheadOfItsWord", HYPERELASTIC(Number(o.type, 4); o.n = 3),
     "*Hyperelastic, n=3, ogden\n"},
    {"Hyperelastic_OrderOfThePolynomial_StandsAlone", HYPERELASTIC(Number(o.type, 5); o.n = 2),
     "*Hyperelastic, n=2\n"},
    {"Hyperelastic_OrderOfTheReducedPolynomial_IsWritten", HYPERELASTIC(Number(o.type, 6); o.n = 4),
     "*Hyperelastic, n=4, reduced polynomial\n"},
    {"Hyperelastic_OrderOfOtherTypes_IsLeftOut", HYPERELASTIC(Number(o.type, 9); o.n = 3),
     "*Hyperelastic, yeoh\n"},
    {"Hyperelastic_User_HasItsPropertiesBehindTheType",
     HYPERELASTIC(Number(o.type, 7); o.compressible = true; o.properties = 2; o.table = Table({{1, 2}})),
     "*Hyperelastic, user, type=COMPRESSIBLE, properties=2\n1.,2.\n"},
    {"Hyperelastic_PropertiesOfOtherTypes_AreLeftOut",
     HYPERELASTIC(Number(o.type, 9); o.properties = 2; o.compressible = true), "*Hyperelastic, yeoh\n"},
    {"Hyperelastic_TestData_TakeThePlaceOfTheTable",
     HYPERELASTIC(Number(o.type, 2); o.testData = true; o.table = Table({{1, 2, 3}}); AllTests(o)),
     "*Hyperelastic, mooney-rivlin, test data input\n*Biaxial Test Data\n*Planar Test Data\n"
     "*Uniaxial Test Data\n*Volumetric Test Data\n"},
    {"Hyperelastic_TestsWithoutTestData_AreLeftOut",
     HYPERELASTIC(Number(o.type, 3); o.table = Table({{1, 2}}); AllTests(o)),
     "*Hyperelastic, neo hooke\n1.,2.\n"},
    {"Hyperelastic_UnknownTypeWithTestData_WritesThemAll",
     HYPERELASTIC(Number(o.type, 10); o.testData = true; AllTests(o); Number(o.volumetricResponse, 2)),
     "*Hyperelastic, unknown, test data input\n*Biaxial Test Data\n*Planar Test Data\n"
     "*Uniaxial Test Data\n*Volumetric Test Data\n"},
    {"Hyperelastic_Beta_NeedsTestData", HYPERELASTIC(Number(o.type, 8); o.beta = 0.5; o.testData = true),
     "*Hyperelastic, van der waals, test data input, beta=0.5\n"},
    {"Hyperelastic_BetaWithoutTestData_IsLeftOut", HYPERELASTIC(Number(o.type, 8); o.beta = 0.5),
     "*Hyperelastic, van der waals\n"},
    {"Hyperelastic_BetaOfOtherTypes_IsLeftOut",
     HYPERELASTIC(Number(o.type, 0); o.beta = 0.5; o.testData = true),
     "*Hyperelastic, arruda-boyce, test data input\n"},
    {"Hyperelastic_PoissonsRatio_NeedsTestDataAndItsResponse",
     HYPERELASTIC(Number(o.type, 4); o.testData = true; Number(o.volumetricResponse, 2); o.poisson = 0.475),
     "*Hyperelastic, ogden, test data input, poisson=0.475\n"},
    {"Hyperelastic_PoissonsRatioOfZero_IsWrittenToo",
     HYPERELASTIC(Number(o.type, 4); o.testData = true; Number(o.volumetricResponse, 2)),
     "*Hyperelastic, ogden, test data input, poisson=0.\n"},
    {"Hyperelastic_PoissonsRatioWithoutTestData_IsLeftOut",
     HYPERELASTIC(Number(o.type, 4); Number(o.volumetricResponse, 2); o.poisson = 0.475),
     "*Hyperelastic, ogden\n"},
    {"Hyperelastic_PoissonsRatioOfOtherResponses_IsLeftOut",
     HYPERELASTIC(Number(o.type, 4); o.testData = true; Number(o.volumetricResponse, 3); o.poisson = 0.475),
     "*Hyperelastic, ogden, test data input\n"},
    {"Hyperelastic_Hysteresis_AsksForTheModuliAndFollowsTheTable",
     HYPERELASTIC(Number(o.type, 9); o.table = Table({{1}}); o.hysteresis = kmaC_Hysteresis()),
     "*Hyperelastic, yeoh, moduli=LONG TERM\n1.,\n*Hysteresis\n"},
    {"Hyperelastic_HysteresisWithTestData_FollowsThem",
     HYPERELASTIC(Number(o.type, 9); o.testData = true; Number(o.moduliTimeScale, 0);
                  o.planarTestData = kmaC_PlanarTestData(); o.hysteresis = kmaC_Hysteresis()),
     "*Hyperelastic, yeoh, test data input, moduli=INSTANTANEOUS\n*Planar Test Data\n*Hysteresis\n"},
    {"Marlow_UniaxialData_AreItsOnlyOnes",
     HYPERELASTIC(Number(o.type, 1); o.testData = true; AllTests(o); Number(o.marlowDeviatoricData, 0)),
     "*Hyperelastic, marlow\n*Uniaxial Test Data\n"},
    {"Marlow_BiaxialData_AreItsOnlyOnes",
     HYPERELASTIC(Number(o.type, 1); o.testData = true; AllTests(o); Number(o.marlowDeviatoricData, 1)),
     "*Hyperelastic, marlow\n*Biaxial Test Data\n"},
    {"Marlow_PlanarData_AreItsOnlyOnes",
     HYPERELASTIC(Number(o.type, 1); o.testData = true; AllTests(o); Number(o.marlowDeviatoricData, 2)),
     "*Hyperelastic, marlow\n*Planar Test Data\n"},
    {"Marlow_VolumetricData_NeedTheirResponse",
     HYPERELASTIC(Number(o.type, 1); o.testData = true; AllTests(o); Number(o.volumetricResponse, 1)),
     "*Hyperelastic, marlow\n*Uniaxial Test Data\n*Volumetric Test Data\n"},
    {"Marlow_PoissonsRatio_IsWrittenToo",
     HYPERELASTIC(Number(o.type, 1); o.testData = true; Number(o.volumetricResponse, 2); o.poisson = 0.49),
     "*Hyperelastic, marlow, poisson=0.49\n"},
    {"Marlow_WithoutTestData_HasNoLawOnPurpose", HYPERELASTIC(Number(o.type, 1); AllTests(o)),
     "*Hyperelastic, marlow\n"},

    {"Hyperfoam_Defaults_AreLeftOut", HYPERFOAM(o.n = 1; o.table = Table({{1, 2, 3}})),
     "*Hyperfoam\n1.,2.,3.\n"},
    {"Hyperfoam_AllParameters_StandInOrder",
     HYPERFOAM(o.testData = true; o.poisson = 0; o.n = 2; o.table = Table({{1, 2, 3}})),
     "*Hyperfoam, n=2, poisson=0., testdata\n"},
    {"Hyperfoam_Tests_StandInOrder",
     HYPERFOAM(o.testData = true; o.volumetricTestData = kmaC_VolumetricTestData();
               o.uniaxialTestData = kmaC_UniaxialTestData();
               o.simpleShearTestData = kmaC_SimpleShearTestData(); o.planarTestData = kmaC_PlanarTestData();
               o.biaxialTestData = kmaC_BiaxialTestData()),
     "*Hyperfoam, testdata\n*Biaxial Test Data\n*Planar Test Data\n*Simple Shear Test Data\n"
     "*Uniaxial Test Data\n*Volumetric Test Data\n"},
    {"Hyperfoam_TestsWithoutTestData_AreLeftOut", HYPERFOAM(o.uniaxialTestData = kmaC_UniaxialTestData()),
     "*Hyperfoam\n"},

    {"Viscoelastic_Defaults_AreAPronySeriesInTime", KEYWORD(Viscoelastic, o.table = Table({{0.25, 0, 1}})),
     "*Viscoelastic, time=PRONY\n 0.25,0.,1.\n"},
    {"Viscoelastic_Time1_IsCreepTestData", KEYWORD(Viscoelastic, Number(o.time, 1)),
     "*Viscoelastic, time=CREEP TEST DATA\n"},
    {"Viscoelastic_Time2_IsRelaxationTestData", KEYWORD(Viscoelastic, Number(o.time, 2)),
     "*Viscoelastic, time=RELAXATION TEST DATA\n"},
    {"Viscoelastic_Time3_IsFrequencyData", KEYWORD(Viscoelastic, Number(o.time, 3)),
     "*Viscoelastic, time=FREQUENCY DATA\n"},
    {"Viscoelastic_Frequency0_IsFormula", KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 0)),
     "*Viscoelastic, frequency=FORMULA\n"},
    {"Viscoelastic_Frequency1_IsTabular", KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 1)),
     "*Viscoelastic, frequency=TABULAR\n"},
    {"Viscoelastic_Frequency2_IsProny", KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 2)),
     "*Viscoelastic, frequency=PRONY\n"},
    {"Viscoelastic_Frequency3_IsCreepTestData",
     KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 3)),
     "*Viscoelastic, frequency=CREEP TEST DATA\n"},
    {"Viscoelastic_Frequency4_IsRelaxationTestData",
     KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 4)),
     "*Viscoelastic, frequency=RELAXATION TEST DATA\n"},
    {"Viscoelastic_TimeWithoutAWord_LeavesTheSeparatorAlone", KEYWORD(Viscoelastic, Number(o.time, 4)),
     "*Viscoelastic, \n"},
    {"Viscoelastic_FrequencyWithoutAWord_LeavesTheSeparatorAlone",
     KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 5); o.nmax = 2), "*Viscoelastic, \n"},
    {"Viscoelastic_TolerancesOfAFitInTime_AreWritten",
     KEYWORD(Viscoelastic, Number(o.time, 1); o.nmax = 5; o.errtol = 0.001),
     "*Viscoelastic, time=CREEP TEST DATA, errtol=0.001, nmax=5\n"},
    {"Viscoelastic_TolerancesOfRelaxation_AreWritten", KEYWORD(Viscoelastic, Number(o.time, 2); o.nmax = 5),
     "*Viscoelastic, time=RELAXATION TEST DATA, nmax=5\n"},
    {"Viscoelastic_TolerancesOfFrequencyData_AreWritten",
     KEYWORD(Viscoelastic, Number(o.time, 3); o.errtol = 0.02),
     "*Viscoelastic, time=FREQUENCY DATA, errtol=0.02\n"},
    {"Viscoelastic_TolerancesOfAFitInFrequency_AreWritten",
     KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 4); o.nmax = 5; o.errtol = 0.001),
     "*Viscoelastic, frequency=RELAXATION TEST DATA, errtol=0.001, nmax=5\n"},
    {"Viscoelastic_TolerancesOfCreepInFrequency_AreWritten",
     KEYWORD(Viscoelastic, o.timeDomain = false; Number(o.frequency, 3); o.nmax = 4),
     "*Viscoelastic, frequency=CREEP TEST DATA, nmax=4\n"},
    {"Viscoelastic_TolerancesWithoutAFit_AreLeftOut", KEYWORD(Viscoelastic, o.nmax = 5; o.errtol = 0.001),
     "*Viscoelastic, time=PRONY\n"},
    {"Viscoelastic_TolerancesOfAFormula_AreLeftOut", KEYWORD(Viscoelastic, o.timeDomain = false; o.nmax = 5),
     "*Viscoelastic, frequency=FORMULA\n"},
    {"Viscoelastic_SubOptions_StandInOrderBehindTheTable",
     KEYWORD(Viscoelastic, Number(o.time, 2); o.volumetricTestData = kmaC_VolumetricTestData();
             o.trs = kmaC_Trs(); o.shearTestData = kmaC_ShearTestData();
             o.combinedTestData = kmaC_CombinedTestData(); o.table = Table({{1}})),
     "*Viscoelastic, time=RELAXATION TEST DATA\n1.,\n*Combined Test Data\n*Shear Test Data\n*Trs\n"
     "*Volumetric Test Data\n"},
};

class ElasticOptions : public testing::TestWithParam<TextCase> {};

} // namespace

TEST_P(ElasticOptions, Of) {
    EXPECT_EQ(GetParam().write(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Each, ElasticOptions, testing::ValuesIn(kCases), TextCaseName);

TEST(BesideViscoelasticity, Elastic_TellsOfItsModuliBehindTheType) {
    EXPECT_EQ(Elasticity<kmaC_Elastic>(
                  [](auto& o) {
                      o.dependencies = 1;
                      Number(o.type, 3);
                  },
                  true),
              "*Elastic, dependencies=1, type=ENGINEERING CONSTANTS, moduli=LONG TERM\n");
    EXPECT_EQ(Elasticity<kmaC_Elastic>([](auto& o) { o.longTermModuli = false; }, true),
              "*Elastic, moduli=INSTANTANEOUS\n");
}

TEST(BesideViscoelasticity, Hyperelastic_TellsOfItsModuliAheadOfPoissonsRatio) {
    EXPECT_EQ(Elasticity<kmaC_Hyperelastic>(
                  [](auto& o) {
                      Number(o.type, 8);
                      o.testData = true;
                      o.beta = 0.25;
                      Number(o.volumetricResponse, 2);
                      o.poisson = 0.45;
                  },
                  true),
              "*Hyperelastic, van der waals, test data input, beta=0.25, moduli=LONG TERM, poisson=0.45\n");
    EXPECT_EQ(Elasticity<kmaC_Hyperelastic>(
                  [](auto& o) {
                      Number(o.type, 7);
                      o.properties = 1;
                      Number(o.moduliTimeScale, 7);
                  },
                  true),
              "*Hyperelastic, user, type=INCOMPRESSIBLE, properties=1, moduli=INSTANTANEOUS\n");
}

TEST(BesideViscoelasticity, Hyperfoam_TellsOfItsModuliLast) {
    EXPECT_EQ(Elasticity<kmaC_Hyperfoam>([](auto& o) { o.testData = true; }, true),
              "*Hyperfoam, testdata, moduli=LONG TERM\n");
    EXPECT_EQ(Elasticity<kmaC_Hyperfoam>([](auto& o) { o.longTermModuli = false; }, true),
              "*Hyperfoam, moduli=INSTANTANEOUS\n");
}
