#ifndef QRX_STORE_KMAC_THERMALOPTIONS_H
#define QRX_STORE_KMAC_THERMALOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_Conductivity final : public kmaC_DependentOption<kmaC_Conductivity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Conductivity", "Thermal conductivity."};

    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Conductivity::TypeEnm);

class kmaC_Expansion final : public kmaC_DependentOption<kmaC_Expansion> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Expansion", "Thermal expansion."};

    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    static constexpr double zeroDef() { return 0.0; }
    TypeEnm type = typeDef();
    bool user = false;
    double zero = zeroDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Expansion::TypeEnm);

class kmaC_SpecificHeat final : public kmaC_DependentOption<kmaC_SpecificHeat> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_SpecificHeat", "Specific heat."};

    static const cls_FieldTable& Fields();
};

class kmaC_LatentHeat final : public cls_RecordOf<kmaC_LatentHeat, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_LatentHeat", "Latent heat of phase changes."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_HeatGeneration final : public cls_RecordOf<kmaC_HeatGeneration, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_HeatGeneration",
                                         "Volumetric heat from a user subroutine: the keyword line alone."};
};

class kmaC_InelasticHeatFraction final
    : public cls_RecordOf<kmaC_InelasticHeatFraction, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_InelasticHeatFraction",
                                         "Part of the inelastic work that becomes heat."};

    double fraction = 0.9;

    static const cls_FieldTable& Fields();
};

class kmaC_JouleHeatFraction final : public cls_RecordOf<kmaC_JouleHeatFraction, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_JouleHeatFraction",
                                         "Part of the electrical energy that becomes heat."};

    double fraction = 1.0;

    static const cls_FieldTable& Fields();
};

class kmaC_ElectricalConductivity final : public kmaC_DependentOption<kmaC_ElectricalConductivity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ElectricalConductivity", "Electrical conductivity."};

    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_ElectricalConductivity::TypeEnm);

class kmaC_Dielectric final : public kmaC_DependentOption<kmaC_Dielectric> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Dielectric", "Dielectric constants."};

    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Dielectric::TypeEnm);

class kmaC_Piezoelectric final : public kmaC_DependentOption<kmaC_Piezoelectric> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Piezoelectric", "Piezoelectric coupling."};

    enum class TypeEnm : int { STRAIN = 0, STRESS = 1 };

    static constexpr TypeEnm typeDef() { return TypeEnm::STRESS; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Piezoelectric::TypeEnm);

void cls_RegisterThermalOptionRecords(cls_ClassRegistrar& registrar);

#endif
