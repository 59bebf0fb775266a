#include "store_interface/records/materials/kmaC_FluidOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_AcousticMedium::Fields() {
    using R = kmaC_AcousticMedium;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: bulk modulus (stress)"))
            .Field<&R::volumetricDrag>("volumetricDrag", "true: the volumetric drag block is written")
            .Field<&R::volumetricDragTemperatureDependency>(
                "volumetricDragTemperatureDependency",
                "true: volumetricDragTable has a temperature column. False with volumetricDragDependencies "
                "positive: the deck gets a blank column in its place")
            .Field<&R::volumetricDragDependencies>(
                "volumetricDragDependencies",
                "number of field variables of volumetricDragTable; written when positive")
            .Field<&R::volumetricDragTable>(
                "volumetricDragTable", "columns: volumetric drag (mass/volume/time), frequency (cycles/time)")
            .Example(R"({"table": [[2140]]})");
    return fields;
}

const cls_FieldTable& kmaC_AcousticBulkModulus::Fields() {
    using R = kmaC_AcousticBulkModulus;
    static const cls_FieldTable fields = cls_Describe<R>(kmaC_MaterialOption::Fields())
                                             .With(kmaC_DependentTable("columns: bulk modulus (stress)"))
                                             .Example(R"({"table": [[2140]]})");
    return fields;
}

const cls_FieldTable& kmaC_AcousticVolumetricDrag::Fields() {
    using R = kmaC_AcousticVolumetricDrag;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: volumetric drag (mass/volume/time), frequency (cycles/time)"))
            .Example(R"({"table": [[1e-9, 0]]})");
    return fields;
}

const cls_FieldTable& kmaC_FluidDensity::Fields() {
    using R = kmaC_FluidDensity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::temperature>("temperature", "reference temperature; written when not 0.0")
            .Unit("temperature")
            .Field<&R::pressure>("pressure", "reference pressure; written when not 0.0")
            .Unit("stress")
            .Example(R"({"temperature": 20})");
    return fields;
}

const cls_FieldTable& kmaC_FluidBulkModulus::Fields() {
    using R = kmaC_FluidBulkModulus;
    static const cls_FieldTable fields = cls_Describe<R>(kmaC_MaterialOption::Fields())
                                             .With(kmaC_DependentTable("columns: bulk modulus (stress)"))
                                             .Example(R"({"table": [[2000]]})");
    return fields;
}

const cls_FieldTable& kmaC_FluidExpansion::Fields() {
    using R = kmaC_FluidExpansion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::zero>("zero", "reference temperature; written when not 0.0")
            .Unit("temperature")
            .With(kmaC_DependentTable("columns: expansion coefficient (1/temperature)"))
            .Example(R"({"table": [[2e-4]]})");
    return fields;
}

const cls_FieldTable& kmaC_DetonationPoint::Fields() {
    using R = kmaC_DetonationPoint;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table", "columns: x, y, z (length), delay time (time)")
            .Example(R"({"table": [[0, 0, 0, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Eos::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "USUP", "USUP"}, {1, "JWL", "JWL"}, {2, "IDEAL_GAS", "IDEAL GAS"}, {3, "TABULAR", "TABULAR"}};
    static constexpr omu_EnumTable table{"kmaC_Eos::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Eos::Fields() {
    using R = kmaC_Eos;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "kind of the equation; always written")
            .Field<&R::table>(
                "table",
                "columns: USUP: reference sound speed, slope of the shock line, material constant gamma; "
                "JWL: detonation wave speed, A, B (stress), omega, R1, R2, and last the pre-detonation bulk "
                "modulus (stress), ahead of which the deck gets a blank column; IDEAL_GAS: gas constant, "
                "ambient pressure (stress); TABULAR: f1 (stress), f2, logarithmic volumetric strain")
            .Field<&R::detonationPoint>("detonationPoint", "start of the detonation")
            .Example(R"({"type": "USUP", "table": [[3.94e6, 1.49, 1.96]]})");
    return fields;
}

void cls_RegisterFluidOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_AcousticMedium>();
    registrar.Add<kmaC_AcousticBulkModulus>();
    registrar.Add<kmaC_AcousticVolumetricDrag>();
    registrar.Add<kmaC_FluidDensity>();
    registrar.Add<kmaC_FluidBulkModulus>();
    registrar.Add<kmaC_FluidExpansion>();
    registrar.Add<kmaC_DetonationPoint>();
    registrar.Add<kmaC_Eos>();
}
