#ifndef QRX_STORE_KMAC_POROUSOPTIONS_H
#define QRX_STORE_KMAC_POROUSOPTIONS_H

#include "store_interface/records/materials/kmaC_PlasticOptions.h"

class cls_ClassRegistrar;

class kmaC_SaturationDependence final : public cls_RecordOf<kmaC_SaturationDependence, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_SaturationDependence",
                                         "Permeability as the medium dries; sub-option of permeability."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_VelocityDependence final : public cls_RecordOf<kmaC_VelocityDependence, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_VelocityDependence",
                                         "Permeability as the flow speeds up; sub-option of permeability."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Permeability final : public cls_RecordOf<kmaC_Permeability, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Permeability", "Permeability to a pore fluid."};

    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    double specificWeight = 0.0;
    TypeEnm type = typeDef();
    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_SaturationDependence> saturationDependence;
    mdl_ObjCow<kmaC_VelocityDependence> velocityDependence;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Permeability::TypeEnm);

class kmaC_Sorption final : public cls_RecordOf<kmaC_Sorption, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_Sorption", "Absorption and exsorption of a wetting liquid by a partly saturated medium."};

    enum class LawAbsorptionEnm : int { LOG = 0, TABULAR = 1 };
    enum class LawExsorptionEnm : int { LOG = 0, TABULAR = 1 };

    static constexpr LawAbsorptionEnm lawAbsorptionDef() { return LawAbsorptionEnm::TABULAR; }
    static constexpr LawExsorptionEnm lawExsorptionDef() { return LawExsorptionEnm::TABULAR; }
    static constexpr double scanningDef() { return 0.0; }
    LawAbsorptionEnm lawAbsorption = lawAbsorptionDef();
    bool exsorption = false;
    LawExsorptionEnm lawExsorption = lawExsorptionDef();
    double scanning = scanningDef();
    kmaC_MaterialTable absorptionTable;
    kmaC_MaterialTable exsorptionTable;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Sorption::LawAbsorptionEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Sorption::LawExsorptionEnm);

class kmaC_PorousBulkModuli final : public cls_RecordOf<kmaC_PorousBulkModuli, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PorousBulkModuli", "Bulk moduli in a porous medium."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_PoreFluidExpansion final : public kmaC_DependentOption<kmaC_PoreFluidExpansion> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PoreFluidExpansion", "Thermal expansion of the pore fluid."};

    static constexpr double zeroDef() { return 0.0; }
    double zero = zeroDef();

    static const cls_FieldTable& Fields();
};

class kmaC_Gel final : public cls_RecordOf<kmaC_Gel, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Gel", "Swelling gel in a porous medium."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_MoistureSwelling final : public cls_RecordOf<kmaC_MoistureSwelling, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MoistureSwelling", "Swelling by moisture."};

    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_Ratios> ratios;

    static const cls_FieldTable& Fields();
};

class kmaC_SoretEffect final : public kmaC_DependentOption<kmaC_SoretEffect> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_SoretEffect",
                                         "Diffusion driven by temperature; sub-option of diffusivity."};

    static const cls_FieldTable& Fields();
};

class kmaC_PressureEffect final : public kmaC_DependentOption<kmaC_PressureEffect> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_PressureEffect",
                                         "Diffusion driven by pressure; sub-option of diffusivity."};

    static const cls_FieldTable& Fields();
};

class kmaC_Diffusivity final : public kmaC_DependentOption<kmaC_Diffusivity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Diffusivity", "Mass diffusivity."};

    enum class LawEnm : int { GENERAL = 0, FICK = 1 };
    enum class TypeEnm : int { ISOTROPIC = 0, ORTHOTROPIC = 1, ANISOTROPIC = 2 };

    static constexpr LawEnm lawDef() { return LawEnm::GENERAL; }
    static constexpr TypeEnm typeDef() { return TypeEnm::ISOTROPIC; }
    LawEnm law = lawDef();
    TypeEnm type = typeDef();
    mdl_ObjCow<kmaC_SoretEffect> soretEffect;
    mdl_ObjCow<kmaC_PressureEffect> pressureEffect;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Diffusivity::LawEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_Diffusivity::TypeEnm);

class kmaC_Solubility final : public kmaC_DependentOption<kmaC_Solubility> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Solubility", "Solubility of a diffusing substance."};

    static const cls_FieldTable& Fields();
};

void cls_RegisterPorousOptionRecords(cls_ClassRegistrar& registrar);

#endif
