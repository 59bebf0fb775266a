#include "store_interface/records/materials/kmaC_HyperelasticOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_BiaxialTestData::Fields() {
    using R = kmaC_BiaxialTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>(
                "smoothing",
                "order of the smoothing polynomial of the test data; unset (2147483647): no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"));
    return fields;
}

const cls_FieldTable& kmaC_PlanarTestData::Fields() {
    using R = kmaC_PlanarTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>(
                "smoothing",
                "order of the smoothing polynomial of the test data; unset (2147483647): no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"));
    return fields;
}

const cls_FieldTable& kmaC_SimpleShearTestData::Fields() {
    using R = kmaC_SimpleShearTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: nominal shear stress (stress), nominal shear strain, "
                                       "nominal transverse stress (stress, may be left out)");
    return fields;
}

const cls_FieldTable& kmaC_UniaxialTestData::Fields() {
    using R = kmaC_UniaxialTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>(
                "smoothing",
                "order of the smoothing polynomial of the test data; unset (2147483647): no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"));
    return fields;
}

const cls_FieldTable& kmaC_VolumetricTestData::Fields() {
    using R = kmaC_VolumetricTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::volinf>("volinf",
                               "long-term normalized volumetric modulus or compliance; unset: no 'volinf='")
            .Field<&R::smoothing>(
                "smoothing",
                "order of the smoothing polynomial of the test data; unset (2147483647): no 'smooth='")
            .With(kmaC_DependentTable("columns: hyperelastic and hyperfoam: pressure (stress), volume ratio; "
                                      "viscoelastic: normalized volumetric modulus or compliance, time"));
    return fields;
}

const cls_FieldTable& kmaC_Hysteresis::Fields() {
    using R = kmaC_Hysteresis;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: stress scaling factor, creep parameter, effective stress exponent, "
                              "creep strain exponent; further columns (temperature, field variables) may "
                              "follow and go out as they stand, the keyword has no parameter for them");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "ARRUDA_BOYCE", "ARRUDA_BOYCE"},
                                           {1, "MARLOW", "MARLOW"},
                                           {2, "MOONEY_RIVLIN", "MOONEY_RIVLIN"},
                                           {3, "NEO_HOOKE", "NEO_HOOKE"},
                                           {4, "OGDEN", "OGDEN"},
                                           {5, "POLYNOMIAL", "POLYNOMIAL"},
                                           {6, "REDUCED_POLYNOMIAL", "REDUCED_POLYNOMIAL"},
                                           {7, "USER", "USER"},
                                           {8, "VAN_DER_WAALS", "VAN_DER_WAALS"},
                                           {9, "YEOH", "YEOH"},
                                           {10, "UNKNOWN", "UNKNOWN"}};
    static constexpr omu_EnumTable table{"kmaC_Hyperelastic::TypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::ModuliTimeScaleEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "INSTANTANEOUS", "INSTANTANEOUS"},
                                           {1, "LONG_TERM", "LONG_TERM"}};
    static constexpr omu_EnumTable table{"kmaC_Hyperelastic::ModuliTimeScaleEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::MarlowDeviatoricDataEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "UNIAXIAL", "UNIAXIAL"}, {1, "BIAXIAL", "BIAXIAL"}, {2, "PLANAR", "PLANAR"}};
    static constexpr omu_EnumTable table{"kmaC_Hyperelastic::MarlowDeviatoricDataEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::VolumetricResponseEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"},
                                           {1, "VOLUMETRIC_DATA", "VOLUMETRIC_DATA"},
                                           {2, "POISSON_RATIO", "POISSON_RATIO"},
                                           {3, "LATERAL_DATA", "LATERAL_DATA"}};
    static constexpr omu_EnumTable table{"kmaC_Hyperelastic::VolumetricResponseEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Hyperelastic::Fields() {
    using R = kmaC_Hyperelastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "strain energy potential; 5 gets no word in the deck")
            .Field<&R::moduliTimeScale>("moduliTimeScale",
                                        "With viscoelastic or hysteresis: 1 the constants are long-term "
                                        "('moduli=LONG TERM'), any other number instantaneous")
            .Field<&R::n>("n", "order of the potential; for type 4, 5, 6, written when not 1")
            .Field<&R::beta>("beta",
                             "invariant mixture parameter of type 8 with test data; unset: no 'beta='")
            .Field<&R::testData>("testData", "true: the constants come from the test data below and the "
                                             "table isn't written; a type 1 material needs it")
            .Field<&R::compressible>(
                "compressible",
                "type 7: whether the user subroutine's material is compressible; always written for type 7")
            .Field<&R::properties>("properties",
                                   "type 7: number of properties of the user subroutine; written when not 0")
            .Field<&R::marlowDeviatoricData>(
                "marlowDeviatoricData",
                "Type 1: which test gives the deviatoric behaviour: 0 uniaxial, 1 biaxial, 2 planar")
            .Field<&R::volumetricResponse>(
                "volumetricResponse",
                "With test data: 1 volumetric test data (type 1 writes them only then), 2 Poisson's ratio")
            .Field<&R::poisson>(
                "poisson",
                "Poisson's ratio; written with testData and volumetricResponse 2, whatever its value")
            .Field<&R::table>(
                "table", "columns: type 0: mu (stress), locking stretch, D (1/stress); type 2: C10, C01, D1; "
                         "type 3: C10, D1; type 4: mu1, alpha1, ... mun, alphan, D1 ... Dn; type 5: the Cij "
                         "in rising order of i + j, i first, then D1 ... Dn; type 6: C10 ... Cn0, D1 ... Dn; "
                         "type 7: the properties in one row; type 8: mu, locking stretch, a, beta, D; type "
                         "9: C10, C20, C30, D1, D2, D3; a temperature column may follow")
            .Field<&R::biaxialTestData>("biaxialTestData", "equibiaxial test")
            .Field<&R::planarTestData>("planarTestData", "planar test")
            .Field<&R::uniaxialTestData>("uniaxialTestData", "uniaxial test")
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test")
            .Field<&R::hysteresis>("hysteresis", "hysteresis");
    return fields;
}

const cls_FieldTable& kmaC_Hyperfoam::Fields() {
    using R = kmaC_Hyperfoam;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::testData>(
                "testData", "true: the constants come from the test data below and the table isn't written")
            .Field<&R::poisson>("poisson",
                                "one effective Poisson's ratio for all terms; unset: no 'poisson='")
            .Field<&R::n>("n", "order of the potential; written when not 1")
            .Field<&R::longTermModuli>("longTermModuli",
                                       "with viscoelastic: true: the constants are long-term ('moduli=LONG "
                                       "TERM'), false: instantaneous; ignored without viscoelastic")
            .Field<&R::table>("table", "columns: mu1 (stress), alpha1, ... mun, alphan, nu1 ... nun; a "
                                       "temperature column may follow")
            .Field<&R::biaxialTestData>("biaxialTestData", "equibiaxial test")
            .Field<&R::planarTestData>("planarTestData", "planar test")
            .Field<&R::simpleShearTestData>("simpleShearTestData", "simple shear test")
            .Field<&R::uniaxialTestData>("uniaxialTestData", "uniaxial test")
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test");
    return fields;
}

const cls_FieldTable& kmaC_CombinedTestData::Fields() {
    using R = kmaC_CombinedTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shrinf>("shrinf",
                               "long-term normalized shear modulus or compliance; unset: no 'shrinf='")
            .Field<&R::volinf>("volinf",
                               "long-term normalized volumetric modulus or compliance; unset: no 'volinf='")
            .Field<&R::table>("table", "columns: normalized shear modulus or compliance, normalized "
                                       "volumetric modulus or compliance, time");
    return fields;
}

const cls_FieldTable& kmaC_ShearTestData::Fields() {
    using R = kmaC_ShearTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shrinf>("shrinf",
                               "long-term normalized shear modulus or compliance; unset: no 'shrinf='")
            .Field<&R::table>("table", "columns: normalized shear modulus or compliance, time");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Trs::DefinitionEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "WLF", "WLF"}, {1, "ARRHENIUS", "ARRHENIUS"}, {2, "USER", "USER"}};
    static constexpr omu_EnumTable table{"kmaC_Trs::DefinitionEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Trs::Fields() {
    using R = kmaC_Trs;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::definition>("definition", "form of the shift function; written when not 0")
            .Field<&R::table>("table",
                              "columns: definition 0: reference temperature, C1, C2 (temperature); "
                              "definition 1: activation energy, reference temperature; definition 2: none");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Viscoelastic::FrequencyEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FORMULA", "FORMULA"},
                                           {1, "TABULAR", "TABULAR"},
                                           {2, "PRONY", "PRONY"},
                                           {3, "CREEP_TEST_DATA", "CREEP_TEST_DATA"},
                                           {4, "RELAXATION_TEST_DATA", "RELAXATION_TEST_DATA"}};
    static constexpr omu_EnumTable table{"kmaC_Viscoelastic::FrequencyEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Viscoelastic::TimeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "PRONY", "PRONY"},
                                           {1, "CREEP_TEST_DATA", "CREEP_TEST_DATA"},
                                           {2, "RELAXATION_TEST_DATA", "RELAXATION_TEST_DATA"},
                                           {3, "FREQUENCY_DATA", "FREQUENCY_DATA"}};
    static constexpr omu_EnumTable table{"kmaC_Viscoelastic::TimeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Viscoelastic::Fields() {
    using R = kmaC_Viscoelastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::timeDomain>(
                "timeDomain", "true: time domain, time counts; false: frequency domain, frequency counts")
            .Field<&R::frequency>("frequency", "how the frequency domain behaviour is given")
            .Field<&R::time>("time", "how the time domain behaviour is given")
            .Field<&R::errtol>(
                "errtol",
                "allowed error of the fit, fraction; where a fit is asked for, written when not 0.01")
            .Field<&R::nmax>(
                "nmax", "largest number of terms of the fit; where a fit is asked for, written when not 13")
            .Field<&R::table>(
                "table",
                "columns: time 0 and frequency 2: g (fraction), k (fraction), relaxation time (time); "
                "frequency 0: real g, imaginary g, exponent a, real k, imaginary k, exponent b; frequency 1 "
                "and time 3: omega times real g, omega times imaginary g, omega times real k, omega times "
                "imaginary k, frequency (cycles/time); empty for the test data forms")
            .Field<&R::combinedTestData>("combinedTestData", "combined test")
            .Field<&R::shearTestData>("shearTestData", "shear test")
            .Field<&R::trs>("trs", "temperature-time shift")
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test");
    return fields;
}

void cls_RegisterHyperelasticOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_BiaxialTestData>();
    registrar.Add<kmaC_PlanarTestData>();
    registrar.Add<kmaC_SimpleShearTestData>();
    registrar.Add<kmaC_UniaxialTestData>();
    registrar.Add<kmaC_VolumetricTestData>();
    registrar.Add<kmaC_Hysteresis>();
    registrar.Add<kmaC_Hyperelastic>();
    registrar.Add<kmaC_Hyperfoam>();
    registrar.Add<kmaC_CombinedTestData>();
    registrar.Add<kmaC_ShearTestData>();
    registrar.Add<kmaC_Trs>();
    registrar.Add<kmaC_Viscoelastic>();
}
