#include "store_interface/records/materials/kmaC_HyperelasticOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_BiaxialTestData::Fields() {
    using R = kmaC_BiaxialTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>("smoothing",
                                  "order of the smoothing polynomial of the test data; unset: no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"))
            .Example(R"({"table": [[0.1, 0.02], [0.5, 0.15], [1.2, 0.6]]})");
    return fields;
}

const cls_FieldTable& kmaC_PlanarTestData::Fields() {
    using R = kmaC_PlanarTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>("smoothing",
                                  "order of the smoothing polynomial of the test data; unset: no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"))
            .Example(R"({"table": [[0.1, 0.05], [0.4, 0.3], [0.9, 1.2]]})");
    return fields;
}

const cls_FieldTable& kmaC_SimpleShearTestData::Fields() {
    using R = kmaC_SimpleShearTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: nominal shear stress (stress), nominal shear strain, "
                                       "nominal transverse stress (stress, may be left out)")
            .Example(R"({"table": [[0.1, 0.08, 0], [0.5, 0.4, 0.05]]})");
    return fields;
}

const cls_FieldTable& kmaC_UniaxialTestData::Fields() {
    using R = kmaC_UniaxialTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::smoothing>("smoothing",
                                  "order of the smoothing polynomial of the test data; unset: no 'smooth='")
            .Field<&R::lateralStrainGiven>("lateralStrainGiven",
                                           "true: the third column is the lateral strain. False with a "
                                           "temperature or field column: the deck gets a blank third column")
            .With(kmaC_DependentTable("columns: nominal stress (stress), nominal strain, nominal lateral "
                                      "strain if lateralStrainGiven"))
            .Example(R"({"table": [[0.1, 0.06], [0.5, 0.5], [1, 1.6]]})");
    return fields;
}

const cls_FieldTable& kmaC_VolumetricTestData::Fields() {
    using R = kmaC_VolumetricTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::volinf>("volinf",
                               "long-term normalized volumetric modulus or compliance; unset: no 'volinf='")
            .Unit("no unit")
            .Field<&R::smoothing>("smoothing",
                                  "order of the smoothing polynomial of the test data; unset: no 'smooth='")
            .With(kmaC_DependentTable("columns: hyperelastic and hyperfoam: pressure (stress), volume ratio; "
                                      "viscoelastic: normalized volumetric modulus or compliance, time"))
            .Example(R"({"table": [[50, 0.98], [120, 0.95]]})");
    return fields;
}

const cls_FieldTable& kmaC_Hysteresis::Fields() {
    using R = kmaC_Hysteresis;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: stress scaling factor, creep parameter, effective stress exponent, "
                              "creep strain exponent; further columns (temperature, field variables) may "
                              "follow and go out as they stand, the keyword has no parameter for them")
            .Example(R"({"table": [[1.6, 0.56, 4, -1]]})");
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
            .Field<&R::type>("type", "strain energy potential; POLYNOMIAL gets no word in the deck")
            .Field<&R::moduliTimeScale>("moduliTimeScale",
                                        "with viscoelastic or hysteresis: whether the constants are "
                                        "long-term ('moduli=LONG TERM') or instantaneous")
            .Field<&R::n>(
                "n",
                "order of the potential, of OGDEN, POLYNOMIAL and REDUCED_POLYNOMIAL; written when not 1")
            .Field<&R::beta>("beta",
                             "invariant mixture parameter of VAN_DER_WAALS with test data; unset: no 'beta='")
            .Unit("no unit")
            .Field<&R::testData>(
                "testData",
                "true: the constants come from the test data and the table isn't written; MARLOW needs it")
            .Field<&R::compressible>(
                "compressible",
                "with USER: whether the subroutine's material is compressible; then always written")
            .Field<&R::properties>("properties",
                                   "with USER: number of properties of the subroutine; written when not 0")
            .Field<&R::marlowDeviatoricData>("marlowDeviatoricData",
                                             "with MARLOW: which test gives the deviatoric behaviour")
            .Field<&R::volumetricResponse>("volumetricResponse",
                                           "with test data: what gives the volumetric behaviour; MARLOW "
                                           "writes volumetric test data only with VOLUMETRIC_DATA")
            .Field<&R::poisson>("poisson", "Poisson's ratio; written with testData and the volumetric "
                                           "response POISSON_RATIO, whatever its value")
            .Unit("no unit")
            .Field<&R::table>(
                "table",
                "columns: ARRUDA_BOYCE: mu (stress), locking stretch, D (1/stress); MOONEY_RIVLIN: C10, C01, "
                "D1; NEO_HOOKE: C10, D1; OGDEN: mu1, "
                "alpha1, ... mun, alphan, D1 ... Dn; POLYNOMIAL: the Cij in rising order of i + j, i first, "
                "then D1 ... Dn; REDUCED_POLYNOMIAL: C10 ... Cn0, D1 ... Dn; USER: the properties in one "
                "row; VAN_DER_WAALS: mu, locking stretch, a, beta, D; YEOH: C10, C20, C30, D1, D2, D3; a "
                "column of "
                "temperatures may stand behind them")
            .Field<&R::biaxialTestData>("biaxialTestData", "equibiaxial test")
            .Field<&R::planarTestData>("planarTestData", "planar test")
            .Field<&R::uniaxialTestData>("uniaxialTestData", "uniaxial test")
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test")
            .Field<&R::hysteresis>("hysteresis", "hysteresis")
            .Example(R"({"type": "MOONEY_RIVLIN", "table": [[0.4, 0.1, 0.05]]})");
    return fields;
}

const cls_FieldTable& kmaC_Hyperfoam::Fields() {
    using R = kmaC_Hyperfoam;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::testData>("testData",
                                 "true: the constants come from the test data and the table isn't written")
            .Field<&R::poisson>("poisson",
                                "one effective Poisson's ratio for all terms; unset: no 'poisson='")
            .Unit("no unit")
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
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test")
            .Example(R"({"n": 1, "table": [[0.2, 4.5, 0]]})");
    return fields;
}

const cls_FieldTable& kmaC_CombinedTestData::Fields() {
    using R = kmaC_CombinedTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shrinf>("shrinf",
                               "long-term normalized shear modulus or compliance; unset: no 'shrinf='")
            .Unit("no unit")
            .Field<&R::volinf>("volinf",
                               "long-term normalized volumetric modulus or compliance; unset: no 'volinf='")
            .Unit("no unit")
            .Field<&R::table>("table", "columns: normalized shear modulus or compliance, normalized "
                                       "volumetric modulus or compliance, time")
            .Example(R"({"table": [[0.9, 0.95, 1], [0.6, 0.8, 100]]})");
    return fields;
}

const cls_FieldTable& kmaC_ShearTestData::Fields() {
    using R = kmaC_ShearTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shrinf>("shrinf",
                               "long-term normalized shear modulus or compliance; unset: no 'shrinf='")
            .Unit("no unit")
            .Field<&R::table>("table", "columns: normalized shear modulus or compliance, time")
            .Example(R"({"table": [[0.9, 1], [0.6, 100]]})");
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
            .Field<&R::definition>("definition", "form of the shift function; WLF is not written")
            .Field<&R::table>("table", "columns: WLF: reference temperature, C1, C2 (temperature); "
                                       "ARRHENIUS: activation energy, reference temperature; USER: none")
            .Example(R"({"table": [[20, 17.4, 51.6]]})");
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
            .Field<&R::errtol>("errtol",
                               "allowed error of the fit; where a fit is asked for, written when not 0.01")
            .Unit("no unit")
            .Field<&R::nmax>(
                "nmax", "largest number of terms of the fit; where a fit is asked for, written when not 13")
            .Field<&R::table>(
                "table", "columns: PRONY: g (fraction), k (fraction), relaxation time (time); FORMULA: real "
                         "g, imaginary g, exponent a, real k, imaginary k, exponent b; TABULAR and "
                         "FREQUENCY_DATA: omega times real g, omega times imaginary g, omega times real k, "
                         "omega times imaginary k, frequency (cycles/time); empty for the test data forms")
            .Field<&R::combinedTestData>("combinedTestData", "combined test")
            .Field<&R::shearTestData>("shearTestData", "shear test")
            .Field<&R::trs>("trs", "temperature-time shift")
            .Field<&R::volumetricTestData>("volumetricTestData", "volumetric test")
            .Example(R"({"time": "PRONY", "table": [[0.3, 0, 0.5], [0.2, 0, 10]]})");
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
