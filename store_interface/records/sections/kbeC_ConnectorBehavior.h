#ifndef QRX_STORE_KBEC_CONNECTORBEHAVIOR_H
#define QRX_STORE_KBEC_CONNECTORBEHAVIOR_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

class kbeC_ConnectorBehaviorOption : public cls_AbstractRecordOf<kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorBehaviorOption",
                                         "Base of all options of a connector's behaviour."};
};

class kbeC_ConnectorOptions final : public cls_RecordOf<kbeC_ConnectorOptions> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorOptions",
                                         "How an option's tables are regularized, filtered and extrapolated; "
                                         "by default as the behaviour says."};

    enum class InterpolationEnm : int { LINEAR = 0, LOGARITHMIC = 1 };
    enum class ExtrapolationEnm : int { CONSTANT = 0, LINEAR = 1 };

    static constexpr double rateFactorDef() { return 0.9; }
    static constexpr double regularizationDef() { return 0.03; }

    bool useBehaviorRegularization = true;
    bool regularize = true;
    bool useBehaviorRtol = false;
    double regularization = regularizationDef();
    bool useBehaviorRateFactor = true;
    double rateFactor = rateFactorDef();
    InterpolationEnm interpolation = InterpolationEnm::LINEAR;
    bool useBehaviorExtrapolation = true;
    ExtrapolationEnm extrapolation = ExtrapolationEnm::CONSTANT;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorOptions::InterpolationEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorOptions::ExtrapolationEnm);

class kbeC_CDCTerm final : public cls_RecordOf<kbeC_CDCTerm> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_CDCTerm", "One term of a derived component."};

    enum class OperatorEnm : int { SQUARE_ROOT = 0, SUM = 1, MACAULEY_SUM = 2 };
    enum class SignEnm : int { POSITIVE = 0, NEGATIVE = 1 };
    enum class IndependentKindEnm : int { POSITION = 0, CONSTITUTIVE_MOTION = 1 };

    OperatorEnm operatorType = OperatorEnm::SQUARE_ROOT;
    SignEnm sign = SignEnm::POSITIVE;
    bool independentGiven = false;
    IndependentKindEnm independentKind = IndependentKindEnm::POSITION;
    int dependencies = 0;
    bool temperatureDependency = false;
    cow_List<int> components;
    cow_2DArray<double> table;
    mdl_ObjCow<kbeC_ConnectorOptions> options;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::OperatorEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::SignEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_CDCTerm::IndependentKindEnm);

class kbeC_DerivedComponent final : public cls_RecordOf<kbeC_DerivedComponent> {
public:
    static constexpr cls_ClassInfo Class{
        "kbeC_DerivedComponent", "A component derived from the intrinsic ones; its name is generated."};

    cow_List<kbeC_CDCTerm> terms;

    static const cls_FieldTable& Fields();
};

class kbeC_ConnectorPotential final : public cls_RecordOf<kbeC_ConnectorPotential> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorPotential", "One term of a potential."};

    enum class SignEnm : int { ABS = 0, MACAULEY = 1, NONE = 2 };

    int useDerived = 0;
    int component = 1;
    int negative = 0;
    double scaleFactor = 1.0;
    double radius = 1.0;
    double exponentFactor = 2.0;
    SignEnm sign = SignEnm::ABS;
    mdl_ObjCow<kbeC_DerivedComponent> derivedComponent;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPotential::SignEnm);

class kbeC_ConnectorElasticity final
    : public cls_RecordOf<kbeC_ConnectorElasticity, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorElasticity",
                                         "Spring-like or rigid behaviour of components.", 0, "Elasticity"};

    enum class BehaviorEnm : int { LINEAR = 0, NONLINEAR = 1, RIGID = 2 };
    enum class CouplingEnm : int { UNCOUPLED = 0, COUPLED = 1, COUPLED_POSITION = 2 };

    BehaviorEnm behavior = BehaviorEnm::LINEAR;
    CouplingEnm coupling = CouplingEnm::UNCOUPLED;
    int dependencies = 0;
    bool temperatureDependency = false;
    bool frequencyDependency = false;
    cow_2DArray<double> table;
    cow_List<int> independentComponents;
    cow_List<int> components;
    mdl_ObjCow<kbeC_ConnectorOptions> options;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorElasticity::BehaviorEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorElasticity::CouplingEnm);

class kbeC_ConnectorDamping final : public cls_RecordOf<kbeC_ConnectorDamping, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorDamping", "Dashpot-like behaviour of components.", 0,
                                         "Damping"};

    enum class BehaviorEnm : int { LINEAR = 0, NONLINEAR = 1 };
    enum class CouplingEnm : int { UNCOUPLED = 0, COUPLED = 1, COUPLED_POSITION = 2 };

    BehaviorEnm behavior = BehaviorEnm::LINEAR;
    CouplingEnm coupling = CouplingEnm::UNCOUPLED;
    int dependencies = 0;
    bool temperatureDependency = false;
    bool frequencyDependency = false;
    cow_2DArray<double> table;
    cow_List<int> independentComponents;
    cow_List<int> components;
    mdl_ObjCow<kbeC_ConnectorOptions> options;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamping::BehaviorEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamping::CouplingEnm);

class kbeC_ConnectorStop final : public cls_RecordOf<kbeC_ConnectorStop, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorStop", "Limits of the motion of components.", 0,
                                         "Stop"};

    static constexpr double maxMotionDef() { return cls_UnsetDouble; }
    static constexpr double minMotionDef() { return cls_UnsetDouble; }

    double minMotion = minMotionDef();
    double maxMotion = maxMotionDef();
    cow_List<int> components;

    static const cls_FieldTable& Fields();
};

class kbeC_ConnectorFailure final : public cls_RecordOf<kbeC_ConnectorFailure, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorFailure", "Motion or force at which components fail.",
                                         0, "Failure"};

    static constexpr double maxForceDef() { return cls_UnsetDouble; }
    static constexpr double maxMotionDef() { return cls_UnsetDouble; }
    static constexpr double minForceDef() { return cls_UnsetDouble; }
    static constexpr double minMotionDef() { return cls_UnsetDouble; }
    static constexpr int releaseComponentDef() { return cls_UnsetInt; }

    int releaseComponent = releaseComponentDef();
    double minMotion = minMotionDef();
    double maxMotion = maxMotionDef();
    double minForce = minForceDef();
    double maxForce = maxForceDef();
    cow_List<int> components;

    static const cls_FieldTable& Fields();
};

class kbeC_ConnectorLock final : public cls_RecordOf<kbeC_ConnectorLock, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorLock", "Motion or force at which components lock.", 0,
                                         "Lock"};

    static constexpr int lockingComponentDef() { return cls_UnsetInt; }
    static constexpr double maxForceDef() { return cls_UnsetDouble; }
    static constexpr double maxMotionDef() { return cls_UnsetDouble; }
    static constexpr double minForceDef() { return cls_UnsetDouble; }
    static constexpr double minMotionDef() { return cls_UnsetDouble; }

    int lockingComponent = lockingComponentDef();
    double minMotion = minMotionDef();
    double maxMotion = maxMotionDef();
    double minForce = minForceDef();
    double maxForce = maxForceDef();
    cow_List<int> components;

    static const cls_FieldTable& Fields();
};

class kbeC_TangentialBehavior final : public cls_RecordOf<kbeC_TangentialBehavior> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_TangentialBehavior",
                                         "Friction coefficient of a connector's friction."};

    enum class FormulationEnm : int { TABLE = 0, EXPONENTIAL_DECAY = 1 };
    enum class SlipToleranceTypeEnm : int { FRACTION = 0, ABSOLUTE = 1 };

    static constexpr double fractionDef() { return 0.0001; }
    static constexpr double shearStressLimitDef() { return cls_UnsetDouble; }

    FormulationEnm formulation = FormulationEnm::TABLE;
    bool slipRateDependency = false;
    bool pressureDependency = false;
    bool temperatureDependency = false;
    int dependencies = 0;
    int testData = 0;
    double shearStressLimit = shearStressLimitDef();
    SlipToleranceTypeEnm slipToleranceType = SlipToleranceTypeEnm::FRACTION;
    double fraction = fractionDef();
    double elasticSlip = 0.0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_TangentialBehavior::FormulationEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_TangentialBehavior::SlipToleranceTypeEnm);

class kbeC_ConnectorFriction final
    : public cls_RecordOf<kbeC_ConnectorFriction, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorFriction", "Friction of a connector.", 0, "Friction"};

    enum class FormulationEnm : int { PREDEFINED = 0, USER_DEFINED = 1 };
    enum class ContactForceTypeEnm : int { COMPONENT_NUMBER = 0, DERIVED_COMPONENT = 1 };
    enum class IndependentKindEnm : int { POSITION = 0, CONSTITUTIVE_MOTION = 1, NONE = 2 };
    enum class PotentialOperatorEnm : int { SUM = 0, MAXIMUM = 1 };

    static constexpr double forcePotentialExponentDef() { return 2.0; }
    static constexpr double stickStiffnessDef() { return cls_UnsetDouble; }

    FormulationEnm formulation = FormulationEnm::PREDEFINED;
    int component = cls_UnsetInt;
    ContactForceTypeEnm contactForceType = ContactForceTypeEnm::COMPONENT_NUMBER;
    int contactForceComponent = cls_UnsetInt;
    mdl_ObjCow<kbeC_DerivedComponent> contactForceDerived;
    int dependencies = 0;
    bool temperatureDependency = false;
    bool contactArea = false;
    IndependentKindEnm independentKind = IndependentKindEnm::NONE;
    cow_List<int> independentComponents;
    double stickStiffness = stickStiffnessDef();
    cow_2DArray<double> table;
    mdl_ObjCow<kbeC_TangentialBehavior> tangentialBehavior;
    cow_List<kbeC_ConnectorPotential> potentials;
    PotentialOperatorEnm potentialOperator = PotentialOperatorEnm::SUM;
    double forcePotentialExponent = forcePotentialExponentDef();
    mdl_ObjCow<kbeC_ConnectorOptions> options;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::FormulationEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::ContactForceTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::IndependentKindEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorFriction::PotentialOperatorEnm);

class kbeC_ConnectorPlasticity final
    : public cls_RecordOf<kbeC_ConnectorPlasticity, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{"kbeC_ConnectorPlasticity",
                                         "Plasticity of a connector's components.", 0, "Plasticity"};

    enum class PotentialOperatorEnm : int { SUM = 0, MAXIMUM = 1 };
    enum class IsotropicTypeEnm : int { TABULAR = 0, EXPONENTIAL_LAW = 1 };
    enum class KinematicTypeEnm : int { HALF_CYCLE = 0, STABILIZED = 1, PARAMETERS = 2 };

    static constexpr double forcePotentialExponentDef() { return 2.0; }

    cow_List<int> components;
    bool isotropicHardening = false;
    IsotropicTypeEnm isotropicType = IsotropicTypeEnm::TABULAR;
    int isotropicDependencies = 0;
    bool isotropicTemperatureDependency = false;
    cow_2DArray<double> isotropicTable;
    mdl_ObjCow<kbeC_ConnectorOptions> isotropicOptions;
    bool kinematicHardening = false;
    KinematicTypeEnm kinematicType = KinematicTypeEnm::HALF_CYCLE;
    int kinematicDependencies = 0;
    bool kinematicTemperatureDependency = false;
    cow_2DArray<double> kinematicTable;
    mdl_ObjCow<kbeC_ConnectorOptions> kinematicOptions;
    cow_List<kbeC_ConnectorPotential> potentials;
    PotentialOperatorEnm potentialOperator = PotentialOperatorEnm::SUM;
    double forcePotentialExponent = forcePotentialExponentDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::PotentialOperatorEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::IsotropicTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorPlasticity::KinematicTypeEnm);

class kbeC_ConnectorDamage final : public cls_RecordOf<kbeC_ConnectorDamage, kbeC_ConnectorBehaviorOption> {
public:
    static constexpr cls_ClassInfo Class{
        "kbeC_ConnectorDamage", "Damage initiation and evolution of a connector's components.", 0, "Damage"};

    enum class PotentialOperatorEnm : int { SUM = 0, MAXIMUM = 1 };
    enum class CriterionEnm : int { FORCE = 0, MOTION = 1, PLASTIC_MOTION = 2 };
    enum class EvolutionTypeEnm : int { MOTION = 0, ENERGY = 1 };
    enum class SofteningEnm : int { LINEAR = 0, EXPONENTIAL = 1, TABULAR = 2 };
    enum class DegradationEnm : int { MAXIMUM = 0, MULTIPLICATIVE = 1 };

    static constexpr double evolutionPotentialExponentDef() { return 2.0; }
    static constexpr double initiationPotentialExponentDef() { return 2.0; }

    bool modeMixDependency = false;
    cow_List<int> components;
    CriterionEnm criterion = CriterionEnm::FORCE;
    int initiationDependencies = 0;
    bool initiationTemperatureDependency = false;
    cow_2DArray<double> initiationTable;
    mdl_ObjCow<kbeC_ConnectorOptions> initiationOptions;
    cow_List<kbeC_ConnectorPotential> initiationPotentials;
    PotentialOperatorEnm initiationPotentialOperator = PotentialOperatorEnm::SUM;
    double initiationPotentialExponent = initiationPotentialExponentDef();
    bool evolution = false;
    EvolutionTypeEnm evolutionType = EvolutionTypeEnm::MOTION;
    SofteningEnm softening = SofteningEnm::LINEAR;
    bool useAffected = false;
    cow_List<int> affectedComponents;
    DegradationEnm degradation = DegradationEnm::MAXIMUM;
    int evolutionDependencies = 0;
    bool evolutionTemperatureDependency = false;
    cow_2DArray<double> evolutionTable;
    mdl_ObjCow<kbeC_ConnectorOptions> evolutionOptions;
    cow_List<kbeC_ConnectorPotential> evolutionPotentials;
    PotentialOperatorEnm evolutionPotentialOperator = PotentialOperatorEnm::SUM;
    double evolutionPotentialExponent = evolutionPotentialExponentDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::PotentialOperatorEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::CriterionEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::EvolutionTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::SofteningEnm);
const omu_EnumTable& omu_EnumTableOf(kbeC_ConnectorDamage::DegradationEnm);

void cls_RegisterConnectorBehaviorRecords(cls_ClassRegistrar& registrar);

#endif
