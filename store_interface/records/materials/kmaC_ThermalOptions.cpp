#include "store_interface/records/materials/kmaC_ThermalOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kmaC_Conductivity::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_Conductivity::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_Conductivity::Fields() {
    using R = kmaC_Conductivity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type",
                             "directionality: 0 isotropic (nothing written), 1 orthotropic, 2 anisotropic")
            .With(kmaC_DependentTable("columns: conductivity (energy/time/length/temperature); type 0: k; "
                                      "type 1: k11, k22, k33; type 2: k11, k12, k22, k13, k23, k33"));
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Expansion::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_Expansion::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_Expansion::Fields() {
    using R = kmaC_Expansion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type",
                             "directionality: 0 isotropic (nothing written), 1 orthotropic, 2 anisotropic")
            .Field<&R::user>("user", "true: strains come from a user subroutine, ', user' is written")
            .Field<&R::zero>("zero", "reference temperature; written when not 0.0")
            .With(
                kmaC_DependentTable("columns: expansion coefficient (1/temperature); type 0: a; type 1: a11, "
                                    "a22, a33; type 2: a11, a22, a33, a12, a13, a23; empty with user"));
    return fields;
}

const cls_FieldTable& kmaC_SpecificHeat::Fields() {
    using R = kmaC_SpecificHeat;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: specific heat (energy/mass/temperature)"));
    return fields;
}

const cls_FieldTable& kmaC_LatentHeat::Fields() {
    using R = kmaC_LatentHeat;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>(
                "table", "columns: latent heat (energy/mass), solidus temperature, liquidus temperature");
    return fields;
}

const cls_FieldTable& kmaC_InelasticHeatFraction::Fields() {
    using R = kmaC_InelasticHeatFraction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::fraction>("fraction", "fraction 0 to 1; always written, as the data line");
    return fields;
}

const cls_FieldTable& kmaC_JouleHeatFraction::Fields() {
    using R = kmaC_JouleHeatFraction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::fraction>("fraction", "fraction 0 to 1; always written, as the data line");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ElectricalConductivity::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_ElectricalConductivity::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_ElectricalConductivity::Fields() {
    using R = kmaC_ElectricalConductivity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type",
                             "directionality: 0 isotropic (nothing written), 1 orthotropic, 2 anisotropic")
            .With(kmaC_DependentTable("columns: electrical conductivity (current/potential/length); type 0: "
                                      "s; type 1: s11, s22, s33; type 2: s11, s12, s22, s13, s23, s33"));
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Dielectric::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_Dielectric::TypeEnm", kmaC_DirectionRows};
    return table;
}

const cls_FieldTable& kmaC_Dielectric::Fields() {
    using R = kmaC_Dielectric;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type",
                             "directionality: 0 isotropic (nothing written), 1 orthotropic, 2 anisotropic")
            .With(kmaC_DependentTable("columns: dielectric constant (charge/potential/length); type 0: D; "
                                      "type 1: D11, D22, D33; type 2: D11, D12, D22, D13, D23, D33"));
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Piezoelectric::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STRAIN", "STRAIN"}, {1, "STRESS", "STRESS"}};
    static constexpr omu_EnumTable table{"kmaC_Piezoelectric::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Piezoelectric::Fields() {
    using R = kmaC_Piezoelectric;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "kind of the coefficients: 1 nothing is written, 0 'type=E'; any other "
                                     "number 'type=' without a word")
            .With(kmaC_DependentTable(
                "columns: 18 coefficients: for each electric direction 1, 2, 3 the components 11, 22, 33, "
                "12, 13, 23 (type 1: charge/area, type 0: length/potential)"));
    return fields;
}

void cls_RegisterThermalOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_Conductivity>();
    registrar.Add<kmaC_Expansion>();
    registrar.Add<kmaC_SpecificHeat>();
    registrar.Add<kmaC_LatentHeat>();
    registrar.Add<kmaC_HeatGeneration>();
    registrar.Add<kmaC_InelasticHeatFraction>();
    registrar.Add<kmaC_JouleHeatFraction>();
    registrar.Add<kmaC_ElectricalConductivity>();
    registrar.Add<kmaC_Dielectric>();
    registrar.Add<kmaC_Piezoelectric>();
}
