#ifndef QRX_STORE_KMAC_HYPERELASTICOPTIONS_H
#define QRX_STORE_KMAC_HYPERELASTICOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_BiaxialTestData final : public kmaC_DependentOption<kmaC_BiaxialTestData> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_BiaxialTestData",
        "Equibiaxial tension test of a rubber or foam; sub-option of hyperelastic and hyperfoam."};

    static constexpr int smoothingDef() { return cls_UnsetInt; }
    int smoothing = smoothingDef();
    bool lateralStrainGiven = false;

    static const cls_FieldTable& Fields();
};

class kmaC_PlanarTestData final : public kmaC_DependentOption<kmaC_PlanarTestData> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_PlanarTestData",
        "Planar tension (pure shear) test of a rubber or foam; sub-option of hyperelastic and hyperfoam."};

    static constexpr int smoothingDef() { return cls_UnsetInt; }
    int smoothing = smoothingDef();
    bool lateralStrainGiven = false;

    static const cls_FieldTable& Fields();
};

class kmaC_SimpleShearTestData final : public cls_RecordOf<kmaC_SimpleShearTestData, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_SimpleShearTestData",
                                         "Simple shear test of a foam; sub-option of hyperfoam."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_UniaxialTestData final : public kmaC_DependentOption<kmaC_UniaxialTestData> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_UniaxialTestData",
        "Uniaxial test of a rubber or foam; sub-option of hyperelastic and hyperfoam."};

    static constexpr int smoothingDef() { return cls_UnsetInt; }
    int smoothing = smoothingDef();
    bool lateralStrainGiven = false;

    static const cls_FieldTable& Fields();
};

class kmaC_VolumetricTestData final : public kmaC_DependentOption<kmaC_VolumetricTestData> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_VolumetricTestData",
        "Volumetric test: compression of a rubber or foam (sub-option of hyperelastic and hyperfoam), or "
        "volumetric relaxation or creep (sub-option of viscoelastic)."};

    static constexpr double volinfDef() { return cls_UnsetDouble; }
    static constexpr int smoothingDef() { return cls_UnsetInt; }
    double volinf = volinfDef();
    int smoothing = smoothingDef();

    static const cls_FieldTable& Fields();
};

class kmaC_Hysteresis final : public cls_RecordOf<kmaC_Hysteresis, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Hysteresis",
                                         "Hysteresis of a rubber; sub-option of hyperelastic."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Hyperelastic final : public cls_RecordOf<kmaC_Hyperelastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Hyperelastic",
                                         "Elasticity of rubber, by a strain energy potential."};

    enum class TypeEnm : int {
        ARRUDA_BOYCE = 0,
        MARLOW = 1,
        MOONEY_RIVLIN = 2,
        NEO_HOOKE = 3,
        OGDEN = 4,
        POLYNOMIAL = 5,
        REDUCED_POLYNOMIAL = 6,
        USER = 7,
        VAN_DER_WAALS = 8,
        YEOH = 9,
        UNKNOWN = 10
    };
    enum class ModuliTimeScaleEnm : int { INSTANTANEOUS = 0, LONG_TERM = 1 };
    enum class MarlowDeviatoricDataEnm : int { UNIAXIAL = 0, BIAXIAL = 1, PLANAR = 2 };
    enum class VolumetricResponseEnm : int {
        DEFAULT = 0,
        VOLUMETRIC_DATA = 1,
        POISSON_RATIO = 2,
        LATERAL_DATA = 3
    };

    static constexpr int nDef() { return 1; }
    static constexpr double betaDef() { return cls_UnsetDouble; }
    static constexpr int propertiesDef() { return 0; }
    TypeEnm type = TypeEnm::POLYNOMIAL;
    ModuliTimeScaleEnm moduliTimeScale = ModuliTimeScaleEnm::LONG_TERM;
    int n = nDef();
    double beta = betaDef();
    bool testData = false;
    bool compressible = false;
    int properties = propertiesDef();
    MarlowDeviatoricDataEnm marlowDeviatoricData = MarlowDeviatoricDataEnm::UNIAXIAL;
    VolumetricResponseEnm volumetricResponse = VolumetricResponseEnm::DEFAULT;
    double poisson = 0.0;
    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_BiaxialTestData> biaxialTestData;
    mdl_ObjCow<kmaC_PlanarTestData> planarTestData;
    mdl_ObjCow<kmaC_UniaxialTestData> uniaxialTestData;
    mdl_ObjCow<kmaC_VolumetricTestData> volumetricTestData;
    mdl_ObjCow<kmaC_Hysteresis> hysteresis;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::TypeEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::ModuliTimeScaleEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::MarlowDeviatoricDataEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Hyperelastic::VolumetricResponseEnm);

class kmaC_Hyperfoam final : public cls_RecordOf<kmaC_Hyperfoam, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Hyperfoam", "Elasticity of a highly compressible foam."};

    static constexpr bool testDataDef() { return false; }
    static constexpr double poissonDef() { return cls_UnsetDouble; }
    static constexpr int nDef() { return 1; }
    bool testData = testDataDef();
    double poisson = poissonDef();
    int n = nDef();
    bool longTermModuli = true;
    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_BiaxialTestData> biaxialTestData;
    mdl_ObjCow<kmaC_PlanarTestData> planarTestData;
    mdl_ObjCow<kmaC_SimpleShearTestData> simpleShearTestData;
    mdl_ObjCow<kmaC_UniaxialTestData> uniaxialTestData;
    mdl_ObjCow<kmaC_VolumetricTestData> volumetricTestData;

    static const cls_FieldTable& Fields();
};

class kmaC_CombinedTestData final : public cls_RecordOf<kmaC_CombinedTestData, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_CombinedTestData",
        "Shear and volumetric relaxation or creep in one test; sub-option of viscoelastic."};

    static constexpr double shrinfDef() { return cls_UnsetDouble; }
    static constexpr double volinfDef() { return cls_UnsetDouble; }
    double shrinf = shrinfDef();
    double volinf = volinfDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_ShearTestData final : public cls_RecordOf<kmaC_ShearTestData, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ShearTestData",
                                         "Shear relaxation or creep test; sub-option of viscoelastic."};

    static constexpr double shrinfDef() { return cls_UnsetDouble; }
    double shrinf = shrinfDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Trs final : public cls_RecordOf<kmaC_Trs, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Trs", "Temperature-time shift; sub-option of viscoelastic."};

    enum class DefinitionEnm : int { WLF = 0, ARRHENIUS = 1, USER = 2 };

    static constexpr DefinitionEnm definitionDef() { return DefinitionEnm::WLF; }
    DefinitionEnm definition = definitionDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Trs::DefinitionEnm);

class kmaC_Viscoelastic final : public cls_RecordOf<kmaC_Viscoelastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Viscoelastic", "Linear viscoelasticity."};

    enum class FrequencyEnm : int {
        FORMULA = 0,
        TABULAR = 1,
        PRONY = 2,
        CREEP_TEST_DATA = 3,
        RELAXATION_TEST_DATA = 4
    };
    enum class TimeEnm : int { PRONY = 0, CREEP_TEST_DATA = 1, RELAXATION_TEST_DATA = 2, FREQUENCY_DATA = 3 };

    static constexpr double errtolDef() { return 0.01; }
    static constexpr int nmaxDef() { return 13; }
    bool timeDomain = true;
    FrequencyEnm frequency = FrequencyEnm::FORMULA;
    TimeEnm time = TimeEnm::PRONY;
    double errtol = errtolDef();
    int nmax = nmaxDef();
    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_CombinedTestData> combinedTestData;
    mdl_ObjCow<kmaC_ShearTestData> shearTestData;
    mdl_ObjCow<kmaC_Trs> trs;
    mdl_ObjCow<kmaC_VolumetricTestData> volumetricTestData;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Viscoelastic::FrequencyEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Viscoelastic::TimeEnm);

void cls_RegisterHyperelasticOptionRecords(cls_ClassRegistrar& registrar);

#endif
