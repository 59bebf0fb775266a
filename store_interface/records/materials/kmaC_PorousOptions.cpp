#include "store_interface/records/materials/kmaC_PorousOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr omu_EnumRow kSorptionLawRows[] = {{0, "LOG", "LOG"}, {1, "TABULAR", "TABULAR"}};

} // namespace

const cls_FieldTable& kmaC_SaturationDependence::Fields() {
    using R = kmaC_SaturationDependence;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: permeability factor, saturation");
    return fields;
}

const cls_FieldTable& kmaC_VelocityDependence::Fields() {
    using R = kmaC_VelocityDependence;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: velocity coefficient (time/length), void ratio");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Permeability::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_Permeability::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_Permeability::Fields() {
    using R = kmaC_Permeability;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::specificWeight>(
                "specificWeight",
                "specific weight of the wetting liquid (force/volume); always written as 'specific='")
            .Field<&R::type>("type", "directionality; written when not 0")
            .Field<&R::table>(
                "table", "columns: permeability (length/time); type 0: k; type 1: k11, k22, k33; type 2: "
                         "k11, k12, k22, k13, k23, k33; then void ratio; a temperature column may follow")
            .Field<&R::saturationDependence>("saturationDependence", "dependence on the saturation")
            .Field<&R::velocityDependence>("velocityDependence", "dependence on the flow velocity");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Sorption::LawAbsorptionEnm) {
    static constexpr omu_EnumTable table{"kmaC_Sorption::LawAbsorptionEnm", kSorptionLawRows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Sorption::LawExsorptionEnm) {
    static constexpr omu_EnumTable table{"kmaC_Sorption::LawExsorptionEnm", kSorptionLawRows};
    return table;
}

const cls_FieldTable& kmaC_Sorption::Fields() {
    using R = kmaC_Sorption;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::lawAbsorption>("lawAbsorption", "form of absorptionTable; written when not 1")
            .Field<&R::exsorption>(
                "exsorption",
                "true: the exsorption block is written, and the scanning block if scanning isn't 0.0")
            .Field<&R::lawExsorption>("lawExsorption", "form of exsorptionTable; written when not 1")
            .Field<&R::scanning>("scanning", "slope of the scanning line (stress per saturation); written "
                                             "when not 0.0 and exsorption holds")
            .Field<&R::absorptionTable>(
                "absorptionTable", "columns: law 1: pore pressure (stress), saturation; law 0: A, B "
                                   "(stress), smallest saturation, saturation at the end of the log part")
            .Field<&R::exsorptionTable>("exsorptionTable", "columns: as absorptionTable, by lawExsorption");
    return fields;
}

const cls_FieldTable& kmaC_PorousBulkModuli::Fields() {
    using R = kmaC_PorousBulkModuli;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: bulk modulus of the solid grains (stress), bulk modulus of the pore "
                              "fluid (stress); further columns (temperature, field variables) may follow and "
                              "go out as they stand, the keyword has no parameter for them");
    return fields;
}

const cls_FieldTable& kmaC_PoreFluidExpansion::Fields() {
    using R = kmaC_PoreFluidExpansion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::zero>("zero", "reference temperature; written when not 0.0")
            .With(kmaC_DependentTable("columns: expansion coefficient (1/temperature)"));
    return fields;
}

const cls_FieldTable& kmaC_Gel::Fields() {
    using R = kmaC_Gel;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: radius of the dry gel particles (length), radius of the fully "
                              "swollen particles (length), particles per volume, relaxation time (time)");
    return fields;
}

const cls_FieldTable& kmaC_MoistureSwelling::Fields() {
    using R = kmaC_MoistureSwelling;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: volumetric swelling strain, saturation")
            .Field<&R::ratios>("ratios", "anisotropy");
    return fields;
}

const cls_FieldTable& kmaC_SoretEffect::Fields() {
    using R = kmaC_SoretEffect;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: Soret factor, concentration"));
    return fields;
}

const cls_FieldTable& kmaC_PressureEffect::Fields() {
    using R = kmaC_PressureEffect;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: pressure stress factor, concentration"));
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Diffusivity::LawEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "GENERAL", "GENERAL"}, {1, "FICK", "FICK"}};
    static constexpr omu_EnumTable table{"kmaC_Diffusivity::LawEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Diffusivity::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_Diffusivity::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_Diffusivity::Fields() {
    using R = kmaC_Diffusivity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "diffusion law; written when not 0")
            .Field<&R::type>("type",
                             "directionality: 0 isotropic (nothing written), 1 orthotropic, 2 anisotropic")
            .With(kmaC_DependentTable("columns: diffusivity (area/time); type 0: D; type 1: D11, D22, D33; "
                                      "type 2: D11, D12, D22, D13, D23, D33; then concentration"))
            .Field<&R::soretEffect>("soretEffect", "diffusion by temperature")
            .Field<&R::pressureEffect>("pressureEffect", "diffusion by pressure");
    return fields;
}

const cls_FieldTable& kmaC_Solubility::Fields() {
    using R = kmaC_Solubility;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: solubility (units of the concentration)"));
    return fields;
}

void cls_RegisterPorousOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_SaturationDependence>();
    registrar.Add<kmaC_VelocityDependence>();
    registrar.Add<kmaC_Permeability>();
    registrar.Add<kmaC_Sorption>();
    registrar.Add<kmaC_PorousBulkModuli>();
    registrar.Add<kmaC_PoreFluidExpansion>();
    registrar.Add<kmaC_Gel>();
    registrar.Add<kmaC_MoistureSwelling>();
    registrar.Add<kmaC_SoretEffect>();
    registrar.Add<kmaC_PressureEffect>();
    registrar.Add<kmaC_Diffusivity>();
    registrar.Add<kmaC_Solubility>();
}
