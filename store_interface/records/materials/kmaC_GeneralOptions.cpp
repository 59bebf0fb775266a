#include "store_interface/records/materials/kmaC_GeneralOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_Density::Fields() {
    using R = kmaC_Density;
    static const cls_FieldTable fields = cls_Describe<R>(kmaC_MaterialOption::Fields())
                                             .With(kmaC_DependentTable("columns: mass density (mass/volume)"))
                                             .Example(R"({"table": [[7.85e-9]]})");
    return fields;
}

const cls_FieldTable& kmaC_Damping::Fields() {
    using R = kmaC_Damping;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::alpha>("alpha", "mass-proportional factor; written when not 0.0")
            .Unit("1/time")
            .Field<&R::beta>("beta", "stiffness-proportional factor; written when not 0.0")
            .Unit("time")
            .Field<&R::composite>(
                "composite", "fraction of critical damping for composite modal damping; written when not 0.0")
            .Unit("no unit")
            .Example(R"({"alpha": 0.1, "beta": 1e-5})");
    return fields;
}

const cls_FieldTable& kmaC_Depvar::Fields() {
    using R = kmaC_Depvar;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::deleteVar>("deleteVar", "number of the variable that controls the deletion of "
                                               "elements; written as 'delete=' when not 0")
            .Field<&R::numVariables>("numVariables", "count of state variables; the data line")
            .Example(R"({"numVariables": 3})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_UserMaterial::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "MECHANICAL", "MECHANICAL"},
                                           {1, "THERMAL", "THERMAL"},
                                           {2, "THERMOMECHANICAL", "THERMOMECHANICAL"}};
    static constexpr omu_EnumTable table{"kmaC_UserMaterial::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_UserMaterial::Fields() {
    using R = kmaC_UserMaterial;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "which models the subroutine has: MECHANICAL, THERMAL, or both")
            .Field<&R::unsymm>(
                "unsymm",
                "true: the mechanical or thermal Jacobian isn't symmetric; the word 'unsymm' in each block")
            .Field<&R::mechanicalConstants>("mechanicalConstants",
                                            "constants of the mechanical model, in the subroutine's order")
            .Unit("as the subroutine says")
            .Field<&R::thermalConstants>("thermalConstants",
                                         "constants of the thermal model, in the subroutine's order")
            .Unit("as the subroutine says")
            .Example(R"({"mechanicalConstants": [210000, 0.3]})");
    return fields;
}

const cls_FieldTable& kmaC_UserOutputVariables::Fields() {
    using R = kmaC_UserOutputVariables;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::numVariables>("numVariables", "count of variables; the data line")
            .Example(R"({"numVariables": 2})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Regularization::StrainRateRegularizationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LOGARITHMIC", "LOGARITHMIC"}, {1, "LINEAR", "LINEAR"}};
    static constexpr omu_EnumTable table{"kmaC_Regularization::StrainRateRegularizationEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Regularization::Fields() {
    using R = kmaC_Regularization;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::rtol>("rtol",
                             "tolerance of regularized tables; written as 'rtol=' when it differs from 0.03")
            .Unit("no unit")
            .Field<&R::strainRateRegularization>(
                "strainRateRegularization",
                "spacing of the strain rate intervals; LOGARITHMIC is not written")
            .Example(R"({"rtol": 0.01})");
    return fields;
}

void cls_RegisterGeneralOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_Density>();
    registrar.Add<kmaC_Damping>();
    registrar.Add<kmaC_Depvar>();
    registrar.Add<kmaC_UserMaterial>();
    registrar.Add<kmaC_UserDefinedField>();
    registrar.Add<kmaC_UserOutputVariables>();
    registrar.Add<kmaC_Regularization>();
}
