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
                                       "then the temperature if given, and the field variables")
            .Example(R"({"table": [[1, 0], [1.5, 0.1]]})");
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
            .Unit("no unit")
            .Field<&R::type>("type", "form of the loading and unloading curves, elastic-plastic or with "
                                     "damage, which writes 'type=DAMAGE'")
            .Field<&R::unloadingDependencies>("unloadingDependencies",
                                              "number of field variables of unloadingTable; written as "
                                              "'dependencies=' of the unloading block when not 0")
            .Field<&R::variableUnits>(
                "variableUnits", "whether the loading data are a pressure or a force; STRESS is not written")
            .Field<&R::yieldOnset>(
                "yieldOnset", "where yielding starts: a relative drop of the slope, written as 'slope drop=' "
                              "when not 0.1; with CLOSURE_VALUE a closure, always written as 'yield onset='")
            .Unit("no unit, or length")
            .Field<&R::yieldOnsetMethod>("yieldOnsetMethod", "which of the two yieldOnset is")
            .Field<&R::table>("table", "columns: loading curve: pressure (stress) or force, closure "
                                       "(length); then the temperature if given, and the field variables")
            .Field<&R::unloadingTable>("unloadingTable",
                                       "columns: pressure or force, closure, then the largest closure before "
                                       "unloading (damage) or the plastic closure; then the temperature if "
                                       "given, and the field variables; empty: no unloading block")
            .Field<&R::contactArea>(
                "contactArea", "contact area or width against closure; written only with variableUnits FORCE")
            .Example(R"({"table": [[0, 0], [20, 0.1], [60, 0.2]]})");
    return fields;
}

const cls_FieldTable& kmaC_MembraneElastic::Fields() {
    using R = kmaC_MembraneElastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::dependencies>("dependencies", "number of field variables: the last columns of the "
                                                     "table; written as 'dependencies=' when not 0")
            .Field<&R::table>("table", "columns: Young's modulus (stress), Poisson's ratio; then the "
                                       "temperature if given, and the field variables")
            .Example(R"({"table": [[100, 0.3]]})");
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
            .Field<&R::variableUnits>(
                "variableUnits",
                "whether the stiffness is of a stress or of a force; FORCE writes 'variable=FORCE'")
            .Field<&R::dependencies>("dependencies", "number of field variables: the last columns of the "
                                                     "table; written as 'dependencies=' when not 0")
            .Field<&R::table>("table",
                              "columns: shear stiffness (stress/length, or force/length with variableUnits "
                              "FORCE); then the temperature if given, and the field variables")
            .Example(R"({"table": [[40]]})");
    return fields;
}

void cls_RegisterGasketOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_ContactArea>();
    registrar.Add<kmaC_ThicknessBehavior>();
    registrar.Add<kmaC_MembraneElastic>();
    registrar.Add<kmaC_TransShearElastic>();
}
