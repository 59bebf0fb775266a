#include "store_interface/records/materials/kmaC_PorousOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr omu_EnumRow kSorptionLawRows[] = {{0, "LOG", "LOG"}, {1, "TABULAR", "TABULAR"}};

} // namespace

const cls_FieldTable& kmaC_SaturationDependence::Fields() {
    using R = kmaC_SaturationDependence;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: permeability factor, saturation")
            .Example(R"({"table": [[0.1, 0.2], [1, 1]]})");
    return fields;
}

const cls_FieldTable& kmaC_VelocityDependence::Fields() {
    using R = kmaC_VelocityDependence;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: velocity coefficient (time/length), void ratio")
            .Example(R"({"table": [[0.01, 1]]})");
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
            .Field<&R::specificWeight>("specificWeight",
                                       "specific weight of the wetting liquid; always written as 'specific='")
            .Unit("force/volume")
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .Field<&R::table>(
                "table",
                "columns: permeability (length/time), ISOTROPIC: k; ORTHOTROPIC: k11, k22, k33; ANISOTROPIC: "
                "k11, k12, k22, k13, k23, k33; then void ratio; a temperature column may follow")
            .Field<&R::saturationDependence>("saturationDependence", "dependence on the saturation")
            .Field<&R::velocityDependence>("velocityDependence", "dependence on the flow velocity")
            .Example(R"({"specificWeight": 1e-5, "table": [[1e-4, 1]]})");
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
            .Field<&R::lawAbsorption>("lawAbsorption", "form of absorptionTable; TABULAR is not written")
            .Field<&R::exsorption>(
                "exsorption",
                "true: the exsorption block is written, and the scanning block if scanning isn't 0.0")
            .Field<&R::lawExsorption>("lawExsorption", "form of exsorptionTable; TABULAR is not written")
            .Field<&R::scanning>("scanning",
                                 "slope of the scanning line; written when not 0.0 and exsorption holds")
            .Unit("stress")
            .Field<&R::absorptionTable>(
                "absorptionTable", "columns: TABULAR: pore pressure (stress), saturation; LOG: A, B "
                                   "(stress), smallest saturation, saturation at the end of the log part")
            .Field<&R::exsorptionTable>("exsorptionTable", "columns: as absorptionTable, by lawExsorption")
            .Example(R"({"absorptionTable": [[-0.1, 0.1], [0, 1]]})");
    return fields;
}

const cls_FieldTable& kmaC_PorousBulkModuli::Fields() {
    using R = kmaC_PorousBulkModuli;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: bulk modulus of the solid grains (stress), bulk modulus of the pore "
                              "fluid (stress); further columns (temperature, field variables) may follow and "
                              "go out as they stand, the keyword has no parameter for them")
            .Example(R"({"table": [[36000, 2100]]})");
    return fields;
}

const cls_FieldTable& kmaC_PoreFluidExpansion::Fields() {
    using R = kmaC_PoreFluidExpansion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::zero>("zero", "reference temperature; written when not 0.0")
            .Unit("temperature")
            .With(kmaC_DependentTable("columns: expansion coefficient (1/temperature)"))
            .Example(R"({"table": [[2e-4]]})");
    return fields;
}

const cls_FieldTable& kmaC_Gel::Fields() {
    using R = kmaC_Gel;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: radius of the dry gel particles (length), radius of the fully "
                              "swollen particles (length), particles per volume, relaxation time (time)")
            .Example(R"({"table": [[0.01, 0.02, 1000, 100]]})");
    return fields;
}

const cls_FieldTable& kmaC_MoistureSwelling::Fields() {
    using R = kmaC_MoistureSwelling;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: volumetric swelling strain, saturation")
            .Field<&R::ratios>("ratios", "anisotropy")
            .Example(R"({"table": [[0, 0], [0.05, 1]]})");
    return fields;
}

const cls_FieldTable& kmaC_SoretEffect::Fields() {
    using R = kmaC_SoretEffect;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: Soret factor, concentration"))
            .Example(R"({"table": [[0.1]]})");
    return fields;
}

const cls_FieldTable& kmaC_PressureEffect::Fields() {
    using R = kmaC_PressureEffect;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: pressure stress factor, concentration"))
            .Example(R"({"table": [[0.1]]})");
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
            .Field<&R::law>("law", "diffusion law; GENERAL is not written")
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .With(
                kmaC_DependentTable("columns: diffusivity (area/time); ISOTROPIC: D; ORTHOTROPIC: D11, D22, "
                                    "D33; ANISOTROPIC: D11, D12, D22, D13, D23, D33; then concentration"))
            .Field<&R::soretEffect>("soretEffect", "diffusion by temperature")
            .Field<&R::pressureEffect>("pressureEffect", "diffusion by pressure")
            .Example(R"({"table": [[0.1, 0]]})");
    return fields;
}

const cls_FieldTable& kmaC_Solubility::Fields() {
    using R = kmaC_Solubility;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: solubility (units of the concentration)"))
            .Example(R"({"table": [[0.03]]})");
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
