#ifndef QRX_STORE_KPRC_THERMALSTEPS_H
#define QRX_STORE_KPRC_THERMALSTEPS_H

#include "store_interface/records/steps/kprC_Step.h"

class cls_ClassRegistrar;

class kprC_CoupledTempDisplacementStep final : public kprC_ProcedureOf<kprC_CoupledTempDisplacementStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CoupledTempDisplacementStep",
                                         "Implicit fully coupled thermal-stress analysis.", 0x23C0067,
                                         "CoupledTempDisplacement CoupledTemperatureDisplacement"};

    enum class CreepEnm : int { AUTOMATIC = 0, EXPLICIT = 1, NONE = 2 };
    enum class StabilizationMethodEnm : int { NONE = 0, DISSIPATED_ENERGY_FRACTION = 1, DAMPING_FACTOR = 2 };

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    ResponseEnm response = ResponseEnm::TRANSIENT;
    double timePeriod = 1.0;
    StabilizationMethodEnm stabilizationMethod = StabilizationMethodEnm::NONE;
    double stabilizationMagnitude = 0.0002;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    double deltmx = 0.0;
    double cetol = 0.0;
    CreepEnm creep = CreepEnm::AUTOMATIC;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::CreepEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::StabilizationMethodEnm);

class kprC_CoupledThermalElectricStep final : public kprC_ProcedureOf<kprC_CoupledThermalElectricStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CoupledThermalElectricStep",
                                         "Coupled thermal-electrical conduction.", 0x23C0068,
                                         "CoupledThermalElectric"};

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr double endDef() { return cls_UnsetDouble; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }
    static constexpr double mxdemDef() { return 0.1; }

    ResponseEnm response = ResponseEnm::TRANSIENT;
    double end = endDef();
    double timePeriod = 1.0;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    double deltmx = 0.0;
    double mxdem = mxdemDef();
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};

class kprC_HeatTransferStep final : public kprC_ProcedureOf<kprC_HeatTransferStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_HeatTransferStep", "Uncoupled heat transfer.", 0x23C006C,
                                         "HeatTransfer"};

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr double endDef() { return cls_UnsetDouble; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }
    static constexpr double mxdemDef() { return 0.1; }

    ResponseEnm response = ResponseEnm::TRANSIENT;
    double end = endDef();
    double timePeriod = 1.0;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    double deltmx = 0.0;
    double mxdem = mxdemDef();
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();

    static const cls_FieldTable& Fields();
};

class kprC_MassDiffusionStep final : public kprC_ProcedureOf<kprC_MassDiffusionStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_MassDiffusionStep", "Mass diffusion.", 0x23C006E,
                                         "MassDiffusion"};

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr double endDef() { return 0.0; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }

    ResponseEnm response = ResponseEnm::TRANSIENT;
    double end = endDef();
    double timePeriod = 1.0;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    double dcmax = 0.0;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();

    static const cls_FieldTable& Fields();
};

void cls_RegisterThermalStepRecords(cls_ClassRegistrar& registrar);

#endif
