#ifndef QRX_STORE_KMAC_SOILOPTIONS_H
#define QRX_STORE_KMAC_SOILOPTIONS_H

#include "store_interface/records/materials/kmaC_PlasticOptions.h"

class cls_ClassRegistrar;

class kmaC_CapCreepCohesion final : public kmaC_DependentOption<kmaC_CapCreepCohesion> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_CapCreepCohesion", "Cohesion creep of a cap plasticity material; sub-option of capPlasticity."};

    enum class LawEnm : int { STRAIN = 0, TIME = 1, SINGHM = 2, USER = 3 };

    static constexpr LawEnm lawDef() { return LawEnm::STRAIN; }
    LawEnm law = lawDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_CapCreepCohesion::LawEnm);

class kmaC_CapCreepConsolidation final : public kmaC_DependentOption<kmaC_CapCreepConsolidation> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_CapCreepConsolidation",
        "Consolidation creep of a cap plasticity material; sub-option of capPlasticity."};

    enum class LawEnm : int { STRAIN = 0, TIME = 1, SINGHM = 2, USER = 3 };

    static constexpr LawEnm lawDef() { return LawEnm::STRAIN; }
    LawEnm law = lawDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_CapCreepConsolidation::LawEnm);

class kmaC_CapHardening final : public kmaC_DependentOption<kmaC_CapHardening> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CapHardening",
                                         "Hardening of the cap; sub-option of capPlasticity."};

    static const cls_FieldTable& Fields();
};

class kmaC_CapPlasticity final : public kmaC_DependentOption<kmaC_CapPlasticity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CapPlasticity", "Modified cap plasticity of soils."};

    mdl_ObjCow<kmaC_CapCreepCohesion> capCreepCohesion;
    mdl_ObjCow<kmaC_CapCreepConsolidation> capCreepConsolidation;
    mdl_ObjCow<kmaC_CapHardening> capHardening;

    static const cls_FieldTable& Fields();
};

class kmaC_ClayHardening final : public kmaC_DependentOption<kmaC_ClayHardening> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ClayHardening",
                                         "Tabular hardening of clay; sub-option of clayPlasticity."};

    static const cls_FieldTable& Fields();
};

class kmaC_ClayPlasticity final : public kmaC_DependentOption<kmaC_ClayPlasticity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ClayPlasticity", "Critical state plasticity of clay."};

    enum class HardeningEnm : int { EXPONENTIAL = 0, TABULAR = 1 };

    static constexpr HardeningEnm hardeningDef() { return HardeningEnm::EXPONENTIAL; }
    static constexpr double interceptDef() { return cls_UnsetDouble; }
    HardeningEnm hardening = hardeningDef();
    double intercept = interceptDef();
    mdl_ObjCow<kmaC_ClayHardening> clayHardening;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_ClayPlasticity::HardeningEnm);

class kmaC_DruckerPragerCreep final : public kmaC_DependentOption<kmaC_DruckerPragerCreep> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_DruckerPragerCreep", "Creep of a pressure-dependent plasticity; sub-option of druckerPrager."};

    enum class LawEnm : int { STRAIN = 0, TIME = 1, SINGHM = 2, USER = 3 };

    static constexpr LawEnm lawDef() { return LawEnm::STRAIN; }
    LawEnm law = lawDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPragerCreep::LawEnm);

class kmaC_DruckerPragerHardening final : public kmaC_DependentOption<kmaC_DruckerPragerHardening> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_DruckerPragerHardening",
        "Hardening of a pressure-dependent plasticity; sub-option of druckerPrager."};

    enum class TypeEnm : int { COMPRESSION = 0, TENSION = 1, SHEAR = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::COMPRESSION; }
    TypeEnm type = typeDef();
    bool rateDependentTable = false;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPragerHardening::TypeEnm);

class kmaC_TriaxialTestData final : public cls_RecordOf<kmaC_TriaxialTestData, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_TriaxialTestData", "Triaxial test of a granular material; sub-option of druckerPrager."};

    static constexpr double aDef() { return cls_UnsetDouble; }
    static constexpr double bDef() { return cls_UnsetDouble; }
    static constexpr double ptDef() { return cls_UnsetDouble; }
    double a = aDef();
    double b = bDef();
    double pt = ptDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_DruckerPrager final : public kmaC_DependentOption<kmaC_DruckerPrager> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_DruckerPrager",
                                         "Pressure-dependent plasticity of granular materials."};

    enum class ShearCriterionEnm : int { LINEAR = 0, HYPERBOLIC = 1, EXPONENTIAL = 2 };

    static constexpr ShearCriterionEnm shearCriterionDef() { return ShearCriterionEnm::LINEAR; }
    static constexpr double eccentricityDef() { return 0.1; }
    static constexpr bool testDataDef() { return false; }
    ShearCriterionEnm shearCriterion = shearCriterionDef();
    double eccentricity = eccentricityDef();
    bool testData = testDataDef();
    mdl_ObjCow<kmaC_DruckerPragerCreep> druckerPragerCreep;
    mdl_ObjCow<kmaC_DruckerPragerHardening> druckerPragerHardening;
    mdl_ObjCow<kmaC_RateDependent> rateDependent;
    mdl_ObjCow<kmaC_TriaxialTestData> triaxialTestData;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPrager::ShearCriterionEnm);

class kmaC_MohrCoulombHardening final : public kmaC_DependentOption<kmaC_MohrCoulombHardening> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MohrCoulombHardening",
                                         "Cohesion as it hardens; sub-option of mohrCoulomb."};

    static const cls_FieldTable& Fields();
};

class kmaC_MohrCoulomb final : public kmaC_DependentOption<kmaC_MohrCoulomb> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MohrCoulomb",
                                         "Plasticity with a friction and a dilation angle."};

    static constexpr double deviatoricEccentricityDef() { return cls_UnsetDouble; }
    static constexpr double meridionalEccentricityDef() { return 0.1; }
    double deviatoricEccentricity = deviatoricEccentricityDef();
    double meridionalEccentricity = meridionalEccentricityDef();
    mdl_ObjCow<kmaC_MohrCoulombHardening> mohrCoulombHardening;

    static const cls_FieldTable& Fields();
};

class kmaC_FoamHardening final : public kmaC_DependentOption<kmaC_FoamHardening> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_FoamHardening",
                                         "Hardening of a crushable foam; sub-option of foam."};

    static const cls_FieldTable& Fields();
};

class kmaC_Foam final : public kmaC_DependentOption<kmaC_Foam> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Foam", "Crushable foam plasticity."};

    enum class HardeningEnm : int { VOLUMETRIC = 0, ISOTROPIC = 1 };

    static constexpr HardeningEnm hardeningDef() { return HardeningEnm::VOLUMETRIC; }
    HardeningEnm hardening = hardeningDef();
    mdl_ObjCow<kmaC_FoamHardening> foamHardening;
    mdl_ObjCow<kmaC_RateDependent> rateDependent;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Foam::HardeningEnm);

class kmaC_BulkFailure final : public kmaC_DependentOption<kmaC_BulkFailure> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_BulkFailure", "Failure of the bulk of a jointed material; sub-option of jointedMaterial."};

    static const cls_FieldTable& Fields();
};

class kmaC_FirstDirection final : public kmaC_DependentOption<kmaC_FirstDirection> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_FirstDirection", "First joint system of a jointed material; sub-option of jointedMaterial."};

    static const cls_FieldTable& Fields();
};

class kmaC_SecondDirection final : public kmaC_DependentOption<kmaC_SecondDirection> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_SecondDirection", "Second joint system of a jointed material; sub-option of jointedMaterial."};

    static const cls_FieldTable& Fields();
};

class kmaC_ThirdDirection final : public kmaC_DependentOption<kmaC_ThirdDirection> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_ThirdDirection", "Third joint system of a jointed material; sub-option of jointedMaterial."};

    static const cls_FieldTable& Fields();
};

class kmaC_JointShearRetention final : public kmaC_DependentOption<kmaC_JointShearRetention> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_JointShearRetention",
                                         "Shear stiffness of open joints; sub-option of jointedMaterial."};

    static const cls_FieldTable& Fields();
};

class kmaC_JointedMaterial final : public cls_RecordOf<kmaC_JointedMaterial, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_JointedMaterial",
                                         "Material with joints; a keyword of its own, not reached through "
                                         "kmaC_Material. The keyword line alone, then the sub-options."};

    mdl_ObjCow<kmaC_BulkFailure> bulkFailure;
    mdl_ObjCow<kmaC_FirstDirection> firstDirection;
    mdl_ObjCow<kmaC_SecondDirection> secondDirection;
    mdl_ObjCow<kmaC_ThirdDirection> thirdDirection;
    mdl_ObjCow<kmaC_JointShearRetention> jointShearRetention;

    static const cls_FieldTable& Fields();
};

void cls_RegisterSoilOptionRecords(cls_ClassRegistrar& registrar);

#endif
