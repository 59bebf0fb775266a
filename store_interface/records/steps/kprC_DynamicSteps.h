#ifndef QRX_STORE_KPRC_DYNAMICSTEPS_H
#define QRX_STORE_KPRC_DYNAMICSTEPS_H

#include "store_interface/records/steps/kprC_Step.h"
#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

class kprC_MassScaling final : public cls_RecordOf<kprC_MassScaling> {
public:
    static constexpr cls_ClassInfo Class{"kprC_MassScaling",
                                         "One mass scaling definition of an explicit step."};

    enum class MassScalingTypeEnm : int {
        SEMI_AUTOMATIC = 0,
        AUTOMATIC = 1,
        REINITIALIZE = 2,
        DISABLE_THROUGHOUT_STEP = 3
    };
    enum class DtTypeEnm : int { UNIFORM = 0, BELOW_MIN = 1, SET_EQUAL_DT = 2, NONUNIFORM = 3 };
    enum class RollingDirectionEnm : int { X = 0, Y = 1, Z = 2, NONE = 3 };
    enum class FrequencyKindEnm : int { NONE = 0, NUMBER_INTERVAL = 1 };

    static constexpr double dtDef() { return 0.0; }
    static constexpr double factorDef() { return 0.0; }
    static constexpr int frequencyDef() { return 0; }

    MassScalingTypeEnm type = MassScalingTypeEnm::SEMI_AUTOMATIC;
    rgnC_Region region;
    int frequency = frequencyDef();
    double dt = dtDef();
    double factor = factorDef();
    int numberInterval = 1;
    FrequencyKindEnm frequencyKind = FrequencyKindEnm::NONE;
    double feedRate = 0.0;
    double extrudedLength = 0.0;
    double crossSection = 0.0;
    RollingDirectionEnm direction = RollingDirectionEnm::NONE;
    bool wholeModel = false;
    DtTypeEnm dtType = DtTypeEnm::BELOW_MIN;
    bool throughoutStep = false;

    /// Applied again and again during the step, not only at its start.
    bool IsVariable() const;
    /// It acts on a region, not on the whole model.
    bool HasRegion() const { return !wholeModel && !region.SetName().IsEmpty(); }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::MassScalingTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::DtTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::RollingDirectionEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_MassScaling::FrequencyKindEnm);

class kprC_ImplicitDynamicsStep final : public kprC_ProcedureOf<kprC_ImplicitDynamicsStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ImplicitDynamicsStep",
                                         "Dynamics by implicit direct integration.", 0x23C006D,
                                         "ImplicitDynamics DynamicImplicit"};

    enum class InitialConditionsEnm : int { DEFAULT = 0, COMPUTE = 1, NONE = 2 };

    static constexpr double alphaDef() { return cls_UnsetDouble; }
    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::PROCEDURE_DEFAULT; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    bool adiabatic = false;
    double timePeriod = 1.0;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    double haftol = 0.0;
    bool nohaf = false;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    double alpha = alphaDef();
    bool noStop = false;
    InitialConditionsEnm initialConditions = InitialConditionsEnm::DEFAULT;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_ImplicitDynamicsStep::InitialConditionsEnm);

class kprC_ExplicitDynamicsStep final : public kprC_ProcedureOf<kprC_ExplicitDynamicsStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ExplicitDynamicsStep", "Explicit dynamics.", 0x23C0069,
                                         "ExplicitDynamics DynamicExplicit"};

    enum class TimeIncrementationEnm : int {
        AUTOMATIC = 0,
        DIRECT_USER_CONTROL = 1,
        ELEMENT_BY_ELEMENT = 2,
        FIXED = 3
    };

    static constexpr double maxIncrementDef() { return cls_UnsetDouble; }
    static constexpr double scaleFactorDef() { return 1.0; }

    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    bool adiabatic = false;
    double timePeriod = 1.0;
    double initialInc = 0.0;
    double maxIncrement = maxIncrementDef();
    double scaleFactor = scaleFactorDef();
    double linearBulkViscosity = 0.06;
    double quadraticBulkViscosity = 1.2;
    cow_List<kprC_MassScaling> massScaling;
    NlgeomEnm nlgeom = NlgeomEnm::ON;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_ExplicitDynamicsStep::TimeIncrementationEnm);

class kprC_TempDisplacementDynamicsStep final : public kprC_ProcedureOf<kprC_TempDisplacementDynamicsStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_TempDisplacementDynamicsStep",
                                         "Explicit fully coupled thermal-stress analysis.", 0x23C007B,
                                         "TempDisplacementDynamics"};

    kprC_ExplicitDynamicsStep::TimeIncrementationEnm timeIncrementationMethod =
        kprC_ExplicitDynamicsStep::TimeIncrementationEnm::AUTOMATIC;
    static constexpr double maxIncrementDef() { return cls_UnsetDouble; }
    static constexpr double scaleFactorDef() { return 1.0; }

    double timePeriod = 1.0;
    double initialInc = 0.0;
    double maxIncrement = maxIncrementDef();
    double scaleFactor = scaleFactorDef();
    double linearBulkViscosity = 0.06;
    double quadraticBulkViscosity = 1.2;
    cow_List<kprC_MassScaling> massScaling;
    NlgeomEnm nlgeom = NlgeomEnm::ON;

    static const cls_FieldTable& Fields();
};

class kprC_SubspaceDynamicsStep final : public kprC_ProcedureOf<kprC_SubspaceDynamicsStep> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_SubspaceDynamicsStep",
        "Explicit integration of the equations projected on the modes of an earlier step.", 0x23C0078,
        "SubspaceDynamics"};

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr int maxNumIncDef() { return 100; }
    static constexpr int vectorsDef() { return 0; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    int vectors = vectorsDef();
    double timePeriod = 1.0;
    double initialInc = 1.0;
    int maxNumInc = maxNumIncDef();
    AmplitudeEnm amplitude = amplitudeDef();

    static const cls_FieldTable& Fields();
};

void cls_RegisterDynamicStepRecords(cls_ClassRegistrar& registrar);

#endif
