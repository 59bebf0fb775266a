#include "store_interface/records/materials/kmaC_GasketOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr omu_EnumRow kUnitRows[] = {{0, "STRESS", "STRESS"}, {1, "FORCE", "FORCE"}};

} // namespace

const cls_FieldTable& kmaC_ContactArea::Fields() {
    using R = kmaC_ContactArea;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::dependencies>(
                "dependencies", "number of field variables: the last columns of the table; written as "
                                "'dependencies=' when not 0, in a line of its own behind the keyword line")
            .Field<&R::table>("table", "columns: contact area (area) or width (length), closure (length); "
                                       "then the temperature if given, and the field variables");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "ELASTIC_PLASTIC", "ELASTIC_PLASTIC"},
                                           {1, "DAMAGE", "DAMAGE"}};
    static constexpr omu_EnumTable table{"kmaC_ThicknessBehavior::TypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::VariableUnitsEnm) {
    static constexpr omu_EnumTable table{"kmaC_ThicknessBehavior::VariableUnitsEnm", kUnitRows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::YieldOnsetMethodEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "RELATIVE_SLOPE_DROP", "RELATIVE_SLOPE_DROP"},
                                           {1, "CLOSURE_VALUE", "CLOSURE_VALUE"}};
    static constexpr omu_EnumTable table{"kmaC_ThicknessBehavior::YieldOnsetMethodEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_ThicknessBehavior::Fields() {
    using R = kmaC_ThicknessBehavior;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::dependencies>("dependencies", "number of field variables: the last columns of the "
                                                     "table; written as 'dependencies=' when not 0")
            .Field<&R::tensileStiffnessFactor>("tensileStiffnessFactor",
                                               "tensile stiffness as a fraction of the initial compressive "
                                               "stiffness; written when not 0.001")
            .Field<&R::type>("type", "0 nothing is written, any other number 'type=DAMAGE'")
            .Field<&R::unloadingDependencies>("unloadingDependencies",
                                              "number of field variables of unloadingTable; written as "
                                              "'dependencies=' of the unloading block when not 0")
            .Field<&R::variableUnits>(
                "variableUnits", "whether the loading data are a pressure or a force; written when not 0")
            .Field<&R::yieldOnset>(
                "yieldOnset",
                "where yielding starts: a closure (length) if yieldOnsetMethod isn't 0, then always written "
                "as 'yield onset='; else a relative drop of the slope, written as 'slope drop=' when not 0.1")
            .Field<&R::yieldOnsetMethod>("yieldOnsetMethod", "which of the two yieldOnset is")
            .Field<&R::table>("table", "columns: loading curve: pressure (stress) or force, closure "
                                       "(length); then the temperature if given, and the field variables")
            .Field<&R::unloadingTable>(
                "unloadingTable",
                "columns: unloading curves; type 1: pressure or force, closure, largest closure before "
                "unloading; type 0: pressure or force, closure, plastic closure; then the temperature if "
                "given, and the field variables; empty: no unloading block")
            .Field<&R::contactArea>(
                "contactArea", "contact area or width against closure; written only with variableUnits 1");
    return fields;
}

const cls_FieldTable& kmaC_MembraneElastic::Fields() {
    using R = kmaC_MembraneElastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::dependencies>("dependencies", "number of field variables: the last columns of the "
                                                     "table; written as 'dependencies=' when not 0")
            .Field<&R::table>("table", "columns: Young's modulus (stress), Poisson's ratio; then the "
                                       "temperature if given, and the field variables");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_TransShearElastic::VariableUnitsEnm) {
    static constexpr omu_EnumTable table{"kmaC_TransShearElastic::VariableUnitsEnm", kUnitRows};
    return table;
}

const cls_FieldTable& kmaC_TransShearElastic::Fields() {
    using R = kmaC_TransShearElastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::variableUnits>("variableUnits", "1: 'variable=FORCE'; any other number nothing")
            .Field<&R::dependencies>("dependencies", "number of field variables: the last columns of the "
                                                     "table; written as 'dependencies=' when not 0")
            .Field<&R::table>("table",
                              "columns: shear stiffness (stress/length, or force/length with variableUnits "
                              "1); then the temperature if given, and the field variables");
    return fields;
}

void cls_RegisterGasketOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_ContactArea>();
    registrar.Add<kmaC_ThicknessBehavior>();
    registrar.Add<kmaC_MembraneElastic>();
    registrar.Add<kmaC_TransShearElastic>();
}
