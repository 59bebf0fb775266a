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
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .With(
                kmaC_DependentTable("columns: conductivity (energy/time/length/temperature); ISOTROPIC: k; "
                                    "ORTHOTROPIC: k11, k22, k33; ANISOTROPIC: k11, k12, k22, k13, k23, k33"))
            .Example(R"({"table": [[50]]})");
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
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .Field<&R::user>("user", "true: strains come from a user subroutine, ', user' is written")
            .Field<&R::zero>("zero", "reference temperature; written when not 0.0")
            .Unit("temperature")
            .With(kmaC_DependentTable(
                "columns: expansion coefficient (1/temperature); ISOTROPIC: a; ORTHOTROPIC: a11, a22, a33; "
                "ANISOTROPIC: a11, a22, a33, a12, a13, a23; empty with user"))
            .Example(R"({"table": [[1.2e-5]]})");
    return fields;
}

const cls_FieldTable& kmaC_SpecificHeat::Fields() {
    using R = kmaC_SpecificHeat;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: specific heat (energy/mass/temperature)"))
            .Example(R"({"table": [[4.6e8]]})");
    return fields;
}

const cls_FieldTable& kmaC_LatentHeat::Fields() {
    using R = kmaC_LatentHeat;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: latent heat (energy/mass), solidus temperature, liquidus temperature")
            .Example(R"({"table": [[2.7e11, 1450, 1500]]})");
    return fields;
}

const cls_FieldTable& kmaC_InelasticHeatFraction::Fields() {
    using R = kmaC_InelasticHeatFraction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::fraction>("fraction", "the part that becomes heat, from 0 to 1; always written")
            .Unit("no unit")
            .Example(R"({"fraction": 0.9})");
    return fields;
}

const cls_FieldTable& kmaC_JouleHeatFraction::Fields() {
    using R = kmaC_JouleHeatFraction;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::fraction>("fraction", "the part that becomes heat, from 0 to 1; always written")
            .Unit("no unit")
            .Example(R"({"fraction": 1})");
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
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .With(kmaC_DependentTable(
                "columns: electrical conductivity (current/potential/length); ISOTROPIC: s; ORTHOTROPIC: "
                "s11, s22, s33; ANISOTROPIC: s11, s12, s22, s13, s23, s33"))
            .Example(R"({"table": [[5800]]})");
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
            .Field<&R::type>("type", "directionality; ISOTROPIC is not written")
            .With(
                kmaC_DependentTable("columns: dielectric constant (charge/potential/length); ISOTROPIC: D; "
                                    "ORTHOTROPIC: D11, D22, D33; ANISOTROPIC: D11, D12, D22, D13, D23, D33"))
            .Example(R"({"table": [[8.85e-15]]})");
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
            .Field<&R::type>("type",
                             "kind of the coefficients; STRESS is not written, STRAIN writes 'type=E'")
            .With(kmaC_DependentTable(
                "columns: 18 coefficients: for each electric direction 1, 2, 3 the components 11, 22, 33, "
                "12, 13, 23 (STRESS: charge/area, STRAIN: length/potential)"))
            .Example(
                R"({"table": [[0, 0, 0, 0, 12.3e-6, 0, 0, 0, 0, 0, 0, 12.3e-6, -5.2e-6, -5.2e-6, 15.1e-6, 0, 0, 0]]})");
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
