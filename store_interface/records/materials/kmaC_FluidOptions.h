#ifndef QRX_STORE_KMAC_FLUIDOPTIONS_H
#define QRX_STORE_KMAC_FLUIDOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_AcousticMedium final : public kmaC_DependentOption<kmaC_AcousticMedium> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_AcousticMedium", "Acoustic fluid."};

    bool volumetricDrag = false;
    bool volumetricDragTemperatureDependency = false;
    int volumetricDragDependencies = 0;
    kmaC_MaterialTable volumetricDragTable;

    static const cls_FieldTable& Fields();
};

class kmaC_AcousticBulkModulus final : public kmaC_DependentOption<kmaC_AcousticBulkModulus> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_AcousticBulkModulus",
        "Bulk modulus of an acoustic medium; a keyword of its own, not reached through kmaC_Material."};

    static const cls_FieldTable& Fields();
};

class kmaC_AcousticVolumetricDrag final : public kmaC_DependentOption<kmaC_AcousticVolumetricDrag> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_AcousticVolumetricDrag",
        "Volumetric drag of an acoustic medium; a keyword of its own, not reached through kmaC_Material."};

    static const cls_FieldTable& Fields();
};

class kmaC_FluidDensity final : public cls_RecordOf<kmaC_FluidDensity, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_FluidDensity",
                                         "State at which the density of a fluid is given; a keyword of its "
                                         "own, not reached through kmaC_Material. Keyword line only."};

    static constexpr double temperatureDef() { return 0.0; }
    static constexpr double pressureDef() { return 0.0; }
    double temperature = temperatureDef();
    double pressure = pressureDef();

    static const cls_FieldTable& Fields();
};

class kmaC_FluidBulkModulus final : public kmaC_DependentOption<kmaC_FluidBulkModulus> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_FluidBulkModulus",
        "Bulk modulus of a hydraulic fluid; a keyword of its own, not reached through kmaC_Material."};

    static const cls_FieldTable& Fields();
};

class kmaC_FluidExpansion final : public kmaC_DependentOption<kmaC_FluidExpansion> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_FluidExpansion",
        "Thermal expansion of a hydraulic fluid; a keyword of its own, not reached through kmaC_Material."};

    static constexpr double zeroDef() { return 0.0; }
    double zero = zeroDef();

    static const cls_FieldTable& Fields();
};

class kmaC_DetonationPoint final : public cls_RecordOf<kmaC_DetonationPoint, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_DetonationPoint",
                                         "Points where the detonation starts; sub-option of eos."};

    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_Eos final : public cls_RecordOf<kmaC_Eos, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Eos", "Equation of state."};

    enum class TypeEnm : int { USUP = 0, JWL = 1, IDEAL_GAS = 2, TABULAR = 3 };

    TypeEnm type = TypeEnm::USUP;
    kmaC_MaterialTable table;
    mdl_ObjCow<kmaC_DetonationPoint> detonationPoint;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Eos::TypeEnm);

void cls_RegisterFluidOptionRecords(cls_ClassRegistrar& registrar);

#endif
