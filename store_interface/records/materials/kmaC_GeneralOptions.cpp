#include "store_interface/records/materials/kmaC_GeneralOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_Density::Fields() {
    using R = kmaC_Density;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: mass density (mass/volume)"));
    return fields;
}

const cls_FieldTable& kmaC_Damping::Fields() {
    using R = kmaC_Damping;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::alpha>("alpha", "mass-proportional factor (1/time); written when not 0.0")
            .Field<&R::beta>("beta", "stiffness-proportional factor (time); written when not 0.0")
            .Field<&R::composite>(
                "composite",
                "fraction of critical damping for composite modal damping; written when not 0.0");
    return fields;
}

const cls_FieldTable& kmaC_Depvar::Fields() {
    using R = kmaC_Depvar;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::deleteVar>("deleteVar", "number of the variable that controls the deletion of "
                                               "elements; written as 'delete=' when not 0")
            .Field<&R::numVariables>("numVariables", "count of state variables; the data line");
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
            .Field<&R::type>("type", "0 mechanical, 1 thermal, 2 both")
            .Field<&R::unsymm>(
                "unsymm",
                "true: the mechanical or thermal Jacobian isn't symmetric; the word 'unsymm' in each block")
            .Field<&R::mechanicalConstants>("mechanicalConstants",
                                            "constants of the mechanical model, in the subroutine's order")
            .Field<&R::thermalConstants>("thermalConstants",
                                         "constants of the thermal model, in the subroutine's order");
    return fields;
}

const cls_FieldTable& kmaC_UserOutputVariables::Fields() {
    using R = kmaC_UserOutputVariables;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::numVariables>("numVariables", "count of variables; the data line");
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
            .Field<&R::rtol>("rtol", "tolerance, fraction; written as 'rtol=' when it differs from 0.03")
            .Field<&R::strainRateRegularization>("strainRateRegularization",
                                                 "spacing of the strain rate intervals; written when not 0");
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
