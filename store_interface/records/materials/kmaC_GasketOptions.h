#ifndef QRX_STORE_KMAC_GASKETOPTIONS_H
#define QRX_STORE_KMAC_GASKETOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_ContactArea final : public cls_RecordOf<kmaC_ContactArea, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ContactArea",
                                         "Gasket: contact area or width; sub-option of thicknessBehavior."};

    static constexpr int dependenciesDef() { return 0; }
    int dependencies = dependenciesDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_ThicknessBehavior final : public cls_RecordOf<kmaC_ThicknessBehavior, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ThicknessBehavior",
                                         "Gasket: pressure against closure through the thickness."};

    enum class TypeEnm : int { ELASTIC_PLASTIC = 0, DAMAGE = 1 };
    enum class VariableUnitsEnm : int { STRESS = 0, FORCE = 1 };
    enum class YieldOnsetMethodEnm : int { RELATIVE_SLOPE_DROP = 0, CLOSURE_VALUE = 1 };

    static constexpr int dependenciesDef() { return 0; }
    static constexpr double tensileStiffnessFactorDef() { return 0.001; }
    static constexpr TypeEnm typeDef() { return TypeEnm::ELASTIC_PLASTIC; }
    static constexpr VariableUnitsEnm variableUnitsDef() { return VariableUnitsEnm::STRESS; }
    static constexpr double yieldOnsetDef() { return 0.1; }
    static constexpr YieldOnsetMethodEnm yieldOnsetMethodDef() {
        return YieldOnsetMethodEnm::RELATIVE_SLOPE_DROP;
    }
    int dependencies = dependenciesDef();
    double tensileStiffnessFactor = tensileStiffnessFactorDef();
    TypeEnm type = typeDef();
    int unloadingDependencies = 0;
    VariableUnitsEnm variableUnits = variableUnitsDef();
    double yieldOnset = yieldOnsetDef();
    YieldOnsetMethodEnm yieldOnsetMethod = yieldOnsetMethodDef();
    kmaC_MaterialTable table;
    kmaC_MaterialTable unloadingTable;
    mdl_ObjCow<kmaC_ContactArea> contactArea;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::TypeEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::VariableUnitsEnm);
const omu_EnumTable& omu_EnumTableOf(kmaC_ThicknessBehavior::YieldOnsetMethodEnm);

class kmaC_MembraneElastic final : public cls_RecordOf<kmaC_MembraneElastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MembraneElastic",
                                         "Gasket: linear elastic membrane behaviour."};

    static constexpr int dependenciesDef() { return 0; }
    int dependencies = dependenciesDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};

class kmaC_TransShearElastic final : public cls_RecordOf<kmaC_TransShearElastic, kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_TransShearElastic",
                                         "Gasket: linear elastic transverse shear behaviour."};

    enum class VariableUnitsEnm : int { STRESS = 0, FORCE = 1 };

    static constexpr int dependenciesDef() { return 0; }
    VariableUnitsEnm variableUnits = VariableUnitsEnm::STRESS;
    int dependencies = dependenciesDef();
    kmaC_MaterialTable table;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_TransShearElastic::VariableUnitsEnm);

void cls_RegisterGasketOptionRecords(cls_ClassRegistrar& registrar);

#endif
