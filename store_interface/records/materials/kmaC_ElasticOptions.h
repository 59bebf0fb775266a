#ifndef QRX_STORE_KMAC_ELASTICOPTIONS_H
#define QRX_STORE_KMAC_ELASTICOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_FailStrain final : public kmaC_DependentOption<kmaC_FailStrain> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_FailStrain",
                                         "Strain limits of a lamina; sub-option of elastic."};

    static const cls_FieldTable& Fields();
};

class kmaC_FailStress final : public kmaC_DependentOption<kmaC_FailStress> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_FailStress",
                                         "Stress limits of a lamina; sub-option of elastic."};

    static const cls_FieldTable& Fields();
};

class kmaC_Elastic final : public kmaC_DependentOption<kmaC_Elastic> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Elastic", "Linear elasticity."};

    enum class TypeEnm : int {
        ISOTROPIC = 0,
        ORTHOTROPIC = 1,
        ANISOTROPIC = 2,
        ENGINEERING_CONSTANTS = 3,
        LAMINA = 4,
        TRACTION = 5,
        COUPLED_TRACTION = 6,
        SHEAR = 7
    };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    static constexpr bool noCompressionDef() { return false; }
    static constexpr bool noTensionDef() { return false; }
    TypeEnm type = typeDef();
    bool noCompression = noCompressionDef();
    bool noTension = noTensionDef();
    bool longTermModuli = true;
    mdl_ObjCow<kmaC_FailStrain> failStrain;
    mdl_ObjCow<kmaC_FailStress> failStress;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Elastic::TypeEnm);

class kmaC_Hypoelastic final : public cls_RecordOf<kmaC_Hypoelastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Hypoelastic", "Elasticity in rate form."};

    static constexpr bool userDef() { return false; }
    bool user = userDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_PorousElastic final : public kmaC_DependentOption<kmaC_PorousElastic> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PorousElastic", "Porous elasticity."};

    enum class ShearEnm : int { G = 0, POISSON = 1 };

    static constexpr ShearEnm shearDef() { return ShearEnm::POISSON; }
    ShearEnm shear = shearDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_PorousElastic::ShearEnm);

void cls_RegisterElasticOptionRecords(cls_ClassRegistrar& registrar);

#endif
