#ifndef QRX_STORE_KMAC_CONCRETEOPTIONS_H
#define QRX_STORE_KMAC_CONCRETEOPTIONS_H

#include "store_interface/records/materials/kmaC_MaterialOption.h"

class cls_ClassRegistrar;

class kmaC_FailureRatios final : public kmaC_DependentOption<kmaC_FailureRatios> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_FailureRatios",
                                         "Shape of the failure surface of concrete; sub-option of concrete."};

    static const cls_FieldTable& Fields();
};

class kmaC_ShearRetention final : public kmaC_DependentOption<kmaC_ShearRetention> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ShearRetention",
                                         "Shear stiffness of cracked concrete; sub-option of concrete."};

    static const cls_FieldTable& Fields();
};

class kmaC_TensionStiffening final : public kmaC_DependentOption<kmaC_TensionStiffening> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_TensionStiffening",
        "Post-cracking behaviour of smeared crack concrete; sub-option of concrete."};

    enum class TypeEnm : int { DISPLACEMENT = 0, STRAIN = 1 };

    static constexpr TypeEnm typeDef() { return TypeEnm::STRAIN; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_TensionStiffening::TypeEnm);

class kmaC_Concrete final : public kmaC_DependentOption<kmaC_Concrete> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Concrete", "Smeared crack concrete."};

    mdl_ObjCow<kmaC_FailureRatios> failureRatios;
    mdl_ObjCow<kmaC_ShearRetention> shearRetention;
    mdl_ObjCow<kmaC_TensionStiffening> tensionStiffening;

    static const cls_FieldTable& Fields();
};

class kmaC_ConcreteCompressionHardening final
    : public kmaC_DependentOption<kmaC_ConcreteCompressionHardening> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_ConcreteCompressionHardening",
        "Hardening of concrete in compression; sub-option of concreteDamagedPlasticity."};

    bool rateGiven = false;

    static const cls_FieldTable& Fields();
};

class kmaC_ConcreteTensionStiffening final : public kmaC_DependentOption<kmaC_ConcreteTensionStiffening> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_ConcreteTensionStiffening",
        "Post-cracking behaviour of concrete in tension; sub-option of concreteDamagedPlasticity."};

    enum class TypeEnm : int { STRAIN = 0, DISPLACEMENT = 1, GFI = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::STRAIN; }
    TypeEnm type = typeDef();
    bool rateGiven = false;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_ConcreteTensionStiffening::TypeEnm);

class kmaC_ConcreteCompressionDamage final : public kmaC_DependentOption<kmaC_ConcreteCompressionDamage> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_ConcreteCompressionDamage",
        "Loss of stiffness of concrete in compression; sub-option of concreteDamagedPlasticity."};

    static constexpr double tensionRecoveryDef() { return 0.0; }
    double tensionRecovery = tensionRecoveryDef();

    static const cls_FieldTable& Fields();
};

class kmaC_ConcreteTensionDamage final : public kmaC_DependentOption<kmaC_ConcreteTensionDamage> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_ConcreteTensionDamage",
        "Loss of stiffness of concrete in tension; sub-option of concreteDamagedPlasticity."};

    enum class TypeEnm : int { STRAIN = 0, DISPLACEMENT = 1 };

    static constexpr TypeEnm typeDef() { return TypeEnm::STRAIN; }
    static constexpr double compressionRecoveryDef() { return 1.0; }
    TypeEnm type = typeDef();
    double compressionRecovery = compressionRecoveryDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_ConcreteTensionDamage::TypeEnm);

class kmaC_ConcreteDamagedPlasticity final : public kmaC_DependentOption<kmaC_ConcreteDamagedPlasticity> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_ConcreteDamagedPlasticity", "Damaged plasticity of concrete."};

    mdl_ObjCow<kmaC_ConcreteCompressionHardening> concreteCompressionHardening;
    mdl_ObjCow<kmaC_ConcreteTensionStiffening> concreteTensionStiffening;
    mdl_ObjCow<kmaC_ConcreteCompressionDamage> concreteCompressionDamage;
    mdl_ObjCow<kmaC_ConcreteTensionDamage> concreteTensionDamage;

    static const cls_FieldTable& Fields();
};

class kmaC_BrittleShear final : public kmaC_DependentOption<kmaC_BrittleShear> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_BrittleShear", "Shear stiffness of cracked brittle material; sub-option of brittleCracking."};

    enum class TypeEnm : int { RETENTION_FACTOR = 0, POWER_LAW = 1 };

    static constexpr TypeEnm typeDef() { return TypeEnm::RETENTION_FACTOR; }
    TypeEnm type = typeDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_BrittleShear::TypeEnm);

class kmaC_BrittleCracking final : public kmaC_DependentOption<kmaC_BrittleCracking> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_BrittleCracking",
        "Cracking of a brittle material; a keyword of its own, not reached through kmaC_Material."};

    enum class TypeEnm : int { STRAIN = 0, DISPLACEMENT = 1, GFI = 2 };

    static constexpr TypeEnm typeDef() { return TypeEnm::STRAIN; }
    TypeEnm type = typeDef();
    mdl_ObjCow<kmaC_BrittleShear> brittleShear;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kmaC_BrittleCracking::TypeEnm);

void cls_RegisterConcreteOptionRecords(cls_ClassRegistrar& registrar);

#endif
