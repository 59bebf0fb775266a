#ifndef QRX_STORE_KPRC_STATICSTEPS_H
#define QRX_STORE_KPRC_STATICSTEPS_H

#include "store_interface/records/steps/kprC_Step.h"
#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

class kprC_StaticStep final : public kprC_ProcedureOf<kprC_StaticStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StaticStep", "General static analysis.", 0x23C0073, "Static"};

    enum class StabilizationEnm : int { NONE = 0, DISSIPATED_ENERGY_FRACTION = 1, DAMPING_FACTOR = 2 };

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::RAMP; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    bool adiabatic = false;
    double timePeriod = 1.0;
    StabilizationEnm stabilizationMethod = StabilizationEnm::NONE;
    double stabilizationMagnitude = 0.0002;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    bool noStop = false;
    cow_String fullyPlastic;
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_StaticStep::StabilizationEnm);

class kprC_StaticRiksStep final : public kprC_ProcedureOf<kprC_StaticRiksStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StaticRiksStep",
                                         "Static analysis with arc length control, for unstable collapse.",
                                         0x23C0074, "StaticRiks Riks"};

    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr double maxArcIncDef() { return 1e+36; }
    static constexpr double maxLPFDef() { return cls_UnsetDouble; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    bool adiabatic = false;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialArcInc = 1.0;
    double totalArc = 1.0;
    double minArcInc = 1e-05;
    double maxArcInc = maxArcIncDef();
    double maxLPF = maxLPFDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    bool noStop = false;
    cow_String fullyPlastic;
    bool nodeMonitored = false;
    rgnC_Region region;
    int dof = 1;
    double dofValue = 0.0;
    bool longTerm = false;
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};

class kprC_StaticLinearPerturbationStep final : public kprC_ProcedureOf<kprC_StaticLinearPerturbationStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StaticLinearPerturbationStep",
                                         "Linear static perturbation about the base state.", 0x23C0075,
                                         "StaticLinearPerturbation StaticPerturbation"};
};

class kprC_GeostaticStep final : public kprC_ProcedureOf<kprC_GeostaticStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_GeostaticStep",
                                         "Geostatic equilibrium under initial stress and self weight.",
                                         0x23C006B, "Geostatic"};

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};

class kprC_SoilsStep final : public kprC_ProcedureOf<kprC_SoilsStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SoilsStep", "Coupled pore fluid flow and stress.", 0x23C0072,
                                         "Soils"};

    enum class ResponseEnm : int { TRANSIENT = 0, STEADY_STATE = 1 };
    enum class StabilizationMethodEnm : int { NONE = 0, DISSIPATED_ENERGY_FRACTION = 1, DAMPING_FACTOR = 2 };

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr double endDef() { return cls_UnsetDouble; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    ResponseEnm response = ResponseEnm::TRANSIENT;
    double end = endDef();
    double timePeriod = 1.0;
    StabilizationMethodEnm stabilizationMethod = StabilizationMethodEnm::NONE;
    double stabilizationMagnitude = 0.0002;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    bool creep = true;
    double cetol = 0.0;
    double utol = 0.0;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_SoilsStep::ResponseEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_SoilsStep::StabilizationMethodEnm);

class kprC_ViscoStep final : public kprC_ProcedureOf<kprC_ViscoStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ViscoStep",
                                         "Quasi-static response with creep, swelling or viscoelasticity.",
                                         0x23C007A, "Visco"};

    enum class CreepIntegrationEnm : int { AUTOMATIC = 0, EXPLICIT = 1 };
    enum class StabilizationMethodEnm : int { NONE = 0, DISSIPATED_ENERGY_FRACTION = 1, DAMPING_FACTOR = 2 };

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }
    static constexpr ExtrapolationEnm extrapolationDef() { return ExtrapolationEnm::LINEAR; }
    static constexpr int maxNumIncDef() { return 100; }

    NlgeomEnm nlgeom = NlgeomEnm::OFF;
    CreepIntegrationEnm creepIntegration = CreepIntegrationEnm::AUTOMATIC;
    double cetol = 0.0;
    double timePeriod = 1.0;
    StabilizationMethodEnm stabilizationMethod = StabilizationMethodEnm::NONE;
    double stabilizationMagnitude = 0.0002;
    TimeIncrementationEnm timeIncrementationMethod = TimeIncrementationEnm::AUTOMATIC;
    int maxNumInc = maxNumIncDef();
    double initialInc = 1.0;
    double minInc = 1e-05;
    double maxInc = 1.0;
    AmplitudeEnm amplitude = amplitudeDef();
    ExtrapolationEnm extrapolation = extrapolationDef();
    SolutionTechniqueEnm solutionTechnique = SolutionTechniqueEnm::FULL_NEWTON;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_ViscoStep::CreepIntegrationEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_ViscoStep::StabilizationMethodEnm);

class kprC_AnnealStep final : public kprC_ProcedureOf<kprC_AnnealStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_AnnealStep",
                                         "Annealing between explicit steps: all stresses and plastic strains "
                                         "are reset, at a given temperature.",
                                         0x23C0065, "Anneal"};

    static constexpr double refTempDef() { return cls_UnsetDouble; }

    double refTemp = refTempDef();
    NlgeomEnm nlgeom = NlgeomEnm::ON;

    static const cls_FieldTable& Fields();
};

class kprC_BuckleStep final : public kprC_ProcedureOf<kprC_BuckleStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_BuckleStep", "Eigenvalue buckling prediction.", 0x23C0066,
                                         "Buckle Buckling"};

    enum class EigensolverEnm : int { SUBSPACE = 0, LANCZOS = 1 };

    static constexpr int blockSizeDef() { return cls_UnsetInt; }
    static constexpr int maxBlocksDef() { return cls_UnsetInt; }
    static constexpr double maxEigenDef() { return cls_UnsetDouble; }
    static constexpr double minEigenDef() { return cls_UnsetDouble; }

    int numEigen = 10;
    double maxEigen = maxEigenDef();
    int vectors = 18;
    int maxIterations = 30;
    EigensolverEnm eigensolver = EigensolverEnm::SUBSPACE;
    double minEigen = minEigenDef();
    int blockSize = blockSizeDef();
    int maxBlocks = maxBlocksDef();

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_BuckleStep::EigensolverEnm);

void cls_RegisterStaticStepRecords(cls_ClassRegistrar& registrar);

#endif
