#ifndef QRX_STORE_KMAC_PLASTICOPTIONS_H
#define QRX_STORE_KMAC_PLASTICOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_RateDependent final : public kmaC_DependentOption<kmaC_RateDependent> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_RateDependent",
        "Strain rate dependence of the yield stress; sub-option of plastic, foam and druckerPrager."};

    enum class TypeEnm : int { POWER_LAW = 0, YIELD_RATIO = 1, JOHNSON_COOK = 2 };

    TypeEnm type = TypeEnm::POWER_LAW;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_RateDependent::TypeEnm);

class kmaC_Potential final : public kmaC_DependentOption<kmaC_Potential> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Potential",
                                         "Anisotropic yield or creep; sub-option of plastic and creep."};

    static const cls_FieldTable& Fields();
};

class kmaC_Ornl final : public cls_RecordOf<kmaC_Ornl, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Ornl",
                                         "Model for cyclic loading and creep of stainless steel; sub-option "
                                         "of plastic and creep. No data lines."};

    static constexpr double aDef() { return 0.3; }
    static constexpr double hDef() { return cls_UnsetDouble; }
    static constexpr bool resetDef() { return false; }
    double a = aDef();
    double h = hDef();
    bool reset = resetDef();

    static const cls_FieldTable& Fields();
};

class kmaC_CyclicHardening final : public kmaC_DependentOption<kmaC_CyclicHardening> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_CyclicHardening", "Growth of the yield surface under cyclic loading; sub-option of plastic."};

    static constexpr bool parametersDef() { return false; }
    bool parameters = parametersDef();

    static const cls_FieldTable& Fields();
};

class kmaC_CycledPlastic final : public cls_RecordOf<kmaC_CycledPlastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CycledPlastic",
                                         "Yield surface after cyclic loading; sub-option of plastic."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_AnnealTemperature final : public cls_RecordOf<kmaC_AnnealTemperature, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_AnnealTemperature",
        "Temperature above which a metal loses its hardening; sub-option of plastic."};

    int dependencies = 0;
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Plastic final : public kmaC_DependentOption<kmaC_Plastic> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Plastic", "Metal plasticity."};

    enum class HardeningEnm : int {
        ISOTROPIC = 0,
        KINEMATIC = 1,
        MULTILINEAR_KINEMATIC = 2,
        COMBINED = 3,
        JOHNSON_COOK = 4,
        USER = 5
    };
    enum class DataTypeEnm : int { HALF_CYCLE = 0, PARAMETERS = 1, STABILIZED = 2 };

    static constexpr HardeningEnm hardeningDef() { return HardeningEnm::ISOTROPIC; }
    static constexpr DataTypeEnm dataTypeDef() { return DataTypeEnm::HALF_CYCLE; }
    HardeningEnm hardening = hardeningDef();
    bool rateDependentTable = false;
    DataTypeEnm dataType = dataTypeDef();
    bool strainRangeDependency = false;
    int numBackstresses = 1;
    mdl_ObjCow<kmaC_RateDependent> rateDependent;
    mdl_ObjCow<kmaC_Potential> potential;
    mdl_ObjCow<kmaC_CyclicHardening> cyclicHardening;
    mdl_ObjCow<kmaC_Ornl> ornl;
    mdl_ObjCow<kmaC_CycledPlastic> cycledPlastic;
    mdl_ObjCow<kmaC_AnnealTemperature> annealTemperature;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Plastic::HardeningEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Plastic::DataTypeEnm);

class kmaC_DeformationPlasticity final
    : public cls_RecordOf<kmaC_DeformationPlasticity, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_DeformationPlasticity", "Deformation theory plasticity."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Creep final : public kmaC_DependentOption<kmaC_Creep> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Creep", "Creep law."};

    enum class LawEnm : int { STRAIN = 0, TIME = 1, HYPERBOLIC_SINE = 2, USER = 3 };

    static constexpr LawEnm lawDef() { return LawEnm::STRAIN; }
    LawEnm law = lawDef();
    mdl_ObjCow<kmaC_Ornl> ornl;
    mdl_ObjCow<kmaC_Potential> potential;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Creep::LawEnm);

class kmaC_Viscous final : public kmaC_DependentOption<kmaC_Viscous> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Viscous", "Viscous part of a two-layer model."};

    enum class LawEnm : int { STRAIN = 0, TIME = 1, USER = 2 };

    static constexpr LawEnm lawDef() { return LawEnm::STRAIN; }
    LawEnm law = lawDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Viscous::LawEnm);

class kmaC_Ratios final : public kmaC_DependentOption<kmaC_Ratios> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_Ratios", "Anisotropic swelling; sub-option of moistureSwelling and swelling."};

    static const cls_FieldTable& Fields();
};

class kmaC_Swelling final : public kmaC_DependentOption<kmaC_Swelling> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Swelling", "Volumetric swelling."};

    enum class LawEnm : int { INPUT = 0, USER = 1 };

    static constexpr LawEnm lawDef() { return LawEnm::INPUT; }
    LawEnm law = lawDef();
    mdl_ObjCow<kmaC_Ratios> ratios;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Swelling::LawEnm);

class kmaC_CastIronCompHard final : public kmaC_DependentOption<kmaC_CastIronCompHard> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CastIronCompHard",
                                         "Hardening of cast iron in compression; sub-option of "
                                         "castIronPlasticity. The deck's third column stays blank."};

    static const cls_FieldTable& Fields();
};

class kmaC_CastIronTensHard final : public kmaC_DependentOption<kmaC_CastIronTensHard> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CastIronTensHard",
                                         "Hardening of cast iron in tension; sub-option of "
                                         "castIronPlasticity. The deck's third column stays blank."};

    static const cls_FieldTable& Fields();
};

class kmaC_CastIronPlasticity final : public kmaC_DependentOption<kmaC_CastIronPlasticity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_CastIronPlasticity", "Plasticity of gray cast iron."};

    mdl_ObjCow<kmaC_CastIronCompHard> castIronCompHard;
    mdl_ObjCow<kmaC_CastIronTensHard> castIronTensHard;

    static const cls_FieldTable& Fields();
};

class kmaC_PorousFailureCriteria final
    : public cls_RecordOf<kmaC_PorousFailureCriteria, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PorousFailureCriteria",
                                         "Void fractions at failure; sub-option of porousMetalPlasticity."};

    double failureFraction = 1.0;
    double criticalFraction = 1.0;

    static const cls_FieldTable& Fields();
};

class kmaC_VoidNucleation final : public kmaC_DependentOption<kmaC_VoidNucleation> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_VoidNucleation",
                                         "Nucleation of voids; sub-option of porousMetalPlasticity."};

    static const cls_FieldTable& Fields();
};

class kmaC_PorousMetalPlasticity final : public kmaC_DependentOption<kmaC_PorousMetalPlasticity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PorousMetalPlasticity", "Plasticity of metal with voids."};

    static constexpr double relativeDensityDef() { return cls_UnsetDouble; }
    double relativeDensity = relativeDensityDef();
    mdl_ObjCow<kmaC_PorousFailureCriteria> porousFailureCriteria;
    mdl_ObjCow<kmaC_VoidNucleation> voidNucleation;

    static const cls_FieldTable& Fields();
};

void cls_RegisterPlasticOptionRecords(cls_ClassRegistrar& registrar);

#endif
