#ifndef QRX_STORE_KMAC_GENERALOPTIONS_H
#define QRX_STORE_KMAC_GENERALOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_Density final : public kmaC_DependentOption<kmaC_Density> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Density", "Mass density."};

    static const cls_FieldTable& Fields();
};

class kmaC_Damping final : public cls_RecordOf<kmaC_Damping, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Damping", "Material damping."};

    static constexpr double alphaDef() { return 0.0; }
    static constexpr double betaDef() { return 0.0; }
    static constexpr double compositeDef() { return 0.0; }
    double alpha = alphaDef();
    double beta = betaDef();
    double composite = compositeDef();

    static const cls_FieldTable& Fields();
};

class kmaC_Depvar final : public cls_RecordOf<kmaC_Depvar, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Depvar", "Solution-dependent state variables."};

    static constexpr int deleteVarDef() { return 0; }
    int deleteVar = deleteVarDef();
    int numVariables = 0;

    static const cls_FieldTable& Fields();
};

class kmaC_UserMaterial final : public cls_RecordOf<kmaC_UserMaterial, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_UserMaterial", "Constants of a user-written material model."};

    enum class TypeEnm : int { MECHANICAL = 0, THERMAL = 1, THERMOMECHANICAL = 2 };

    static constexpr bool unsymmDef() { return false; }
    TypeEnm type = TypeEnm::MECHANICAL;
    bool unsymm = unsymmDef();
    cow_List<double> mechanicalConstants;
    cow_List<double> thermalConstants;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_UserMaterial::TypeEnm);

class kmaC_UserDefinedField final : public cls_RecordOf<kmaC_UserDefinedField, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_UserDefinedField",
                                         "Field variables from a user subroutine: the keyword line alone."};
};

class kmaC_UserOutputVariables final : public cls_RecordOf<kmaC_UserOutputVariables, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_UserOutputVariables", "User-defined output variables."};

    int numVariables = 0;

    static const cls_FieldTable& Fields();
};

class kmaC_Regularization final : public cls_RecordOf<kmaC_Regularization, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Regularization",
                                         "How the solver may regularize tabular data of the material to even "
                                         "steps; two parameters of the material's own line."};

    enum class StrainRateRegularizationEnm : int { LOGARITHMIC = 0, LINEAR = 1 };

    static constexpr double rtolDef() { return 0.03; }
    static constexpr StrainRateRegularizationEnm strainRateRegularizationDef() {
        return StrainRateRegularizationEnm::LOGARITHMIC;
    }
    double rtol = rtolDef();
    StrainRateRegularizationEnm strainRateRegularization = strainRateRegularizationDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_Regularization::StrainRateRegularizationEnm);

void cls_RegisterGeneralOptionRecords(cls_ClassRegistrar& registrar);

#endif
