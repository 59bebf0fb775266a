#ifndef QRX_STORE_KPRC_MODALSTEPS_H
#define QRX_STORE_KPRC_MODALSTEPS_H

#include "store_interface/records/steps/kprC_ModalDamping.h"
#include "store_interface/records/steps/kprC_Step.h"
#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

/// Base of the record class T: one range of frequencies of a step.
template <class T, int Bias>
class kprC_FrequencyRange : public cls_RecordOf<T> {
public:
    double upper = 0.0;
    double lower = 0.0;
    int points = 20;
    double bias = Bias;
};

class kprC_RandomResponseFrequency final : public kprC_FrequencyRange<kprC_RandomResponseFrequency, 1> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RandomResponseFrequency",
                                         "One frequency range of a random response step."};

    double upper = 0.0;
    double lower = 0.0;
    int points = 20;
    double bias = 1.0;

    static const cls_FieldTable& Fields();
};

class kprC_SteadyStateDirectFrequency final : public kprC_FrequencyRange<kprC_SteadyStateDirectFrequency, 1> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateDirectFrequency",
                                         "One frequency range of a direct steady-state dynamics step."};

    double upper = 0.0;
    double lower = 0.0;
    int points = 20;
    double bias = 1.0;

    static const cls_FieldTable& Fields();
};

class kprC_SteadyStateModalFrequency final : public kprC_FrequencyRange<kprC_SteadyStateModalFrequency, 3> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateModalFrequency",
                                         "One frequency range of a modal steady-state dynamics step."};

    double upper = 0.0;
    double lower = 0.0;
    int points = 20;
    double bias = 3.0;

    static const cls_FieldTable& Fields();
};

class kprC_SteadyStateSubspaceFrequency final
    : public kprC_FrequencyRange<kprC_SteadyStateSubspaceFrequency, 3> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateSubspaceFrequency",
                                         "One frequency range of a subspace steady-state dynamics step."};

    double upper = 0.0;
    double lower = 0.0;
    int points = 20;
    double bias = 3.0;

    static const cls_FieldTable& Fields();
};

class kprC_ResponseSpectrumComponent final : public cls_RecordOf<kprC_ResponseSpectrumComponent> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ResponseSpectrumComponent",
                                         "One direction of excitation of a response spectrum step."};

    cow_String spectrumName;
    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
    double scale = 1.0;

    static const cls_FieldTable& Fields();
};

class kprC_FrequencyStep final : public kprC_ProcedureOf<kprC_FrequencyStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_FrequencyStep", "Extraction of natural frequencies and modes.",
                                         0x23C006A, "Frequency"};

    enum class EigensolverEnm : int { SUBSPACE = 0, LANCZOS = 1, AMS = 2 };
    enum class NormalizationEnm : int { DISPLACEMENT = 0, MASS = 1 };
    enum class AcousticCouplingEnm : int { OFF = 0, ON = 1, PROJECTION = 2 };

    static constexpr double acousticRangeFactorDef() { return 1.0; }
    static constexpr int blockSizeDef() { return cls_UnsetInt; }
    static constexpr double firstCutoffMultiplierDef() { return 1.7; }
    static constexpr int maxBlocksDef() { return cls_UnsetInt; }
    static constexpr double maxEigenDef() { return cls_UnsetDouble; }
    static constexpr double minEigenDef() { return cls_UnsetDouble; }
    static constexpr int numEigenDef() { return cls_UnsetInt; }
    static constexpr double propertyEvaluationFrequencyDef() { return cls_UnsetDouble; }
    static constexpr double secondCutoffMultiplierDef() { return 1.1; }
    static constexpr double shiftDef() { return cls_UnsetDouble; }
    static constexpr double substructureCutoffMultiplierDef() { return 5.0; }

    int numEigen = numEigenDef();
    double maxEigen = maxEigenDef();
    double shift = shiftDef();
    int vectors = 18;
    int maxIterations = 30;
    EigensolverEnm eigensolver = EigensolverEnm::LANCZOS;
    bool dampingProjection = true;
    double minEigen = minEigenDef();
    int blockSize = blockSizeDef();
    int maxBlocks = maxBlocksDef();
    NormalizationEnm normalization = NormalizationEnm::DISPLACEMENT;
    double propertyEvaluationFrequency = propertyEvaluationFrequencyDef();
    AcousticCouplingEnm acousticCoupling = AcousticCouplingEnm::ON;
    bool residualModes = false;
    bool sim = false;
    double substructureCutoffMultiplier = substructureCutoffMultiplierDef();
    double firstCutoffMultiplier = firstCutoffMultiplierDef();
    double secondCutoffMultiplier = secondCutoffMultiplierDef();
    double acousticRangeFactor = acousticRangeFactorDef();
    cow_List<cow_String> residualModeSets;
    cow_List<int> residualModeValues;
    rgnC_Region nsetRegion;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::EigensolverEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::NormalizationEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::AcousticCouplingEnm);

class kprC_ComplexFrequencyStep final : public kprC_ProcedureOf<kprC_ComplexFrequencyStep> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_ComplexFrequencyStep",
        "Complex eigenvalue extraction. Of a model with such a step no deck can be written.", 0x23C007D,
        "ComplexFrequency"};

    static constexpr double maxEigenDef() { return 1e+18; }
    static constexpr double minEigenDef() { return cls_UnsetDouble; }
    static constexpr int numEigenDef() { return cls_UnsetInt; }
    static constexpr double shiftDef() { return 0.0; }

    int numEigen = numEigenDef();
    double shift = shiftDef();
    bool frictionDamping = false;
    double minEigen = minEigenDef();
    double maxEigen = maxEigenDef();

    static const cls_FieldTable& Fields();
};

class kprC_ModalDynamicsStep final : public kprC_ProcedureOf<kprC_ModalDynamicsStep> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_ModalDynamicsStep", "Transient dynamics by modal superposition.", 0x23C006F, "ModalDynamics"};

    static constexpr AmplitudeEnm amplitudeDef() { return AmplitudeEnm::STEP; }

    bool continueAnalysis = false;
    double timePeriod = 1.0;
    double timeIncrement = 1.0;
    AmplitudeEnm amplitude = amplitudeDef();
    mdl_ObjCow<kprC_CompositeDamping> compositeDamping;
    mdl_ObjCow<kprC_DirectDamping> directDamping;
    mdl_ObjCow<kprC_RayleighDamping> rayleighDamping;
    mdl_ObjCow<kprC_DirectDampingByFrequency> directDampingByFrequency;
    mdl_ObjCow<kprC_RayleighDampingByFrequency> rayleighDampingByFrequency;

    static const cls_FieldTable& Fields();
};

class kprC_RandomResponseStep final : public kprC_ProcedureOf<kprC_RandomResponseStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RandomResponseStep",
                                         "Response to random excitation on the modes of an earlier step.",
                                         0x23C0070, "RandomResponse"};

    cow_List<kprC_RandomResponseFrequency> frequencies;
    FrequencyScaleEnm frequencyScale = FrequencyScaleEnm::LOGARITHMIC;
    mdl_ObjCow<kprC_CompositeDamping> compositeDamping;
    mdl_ObjCow<kprC_DirectDamping> directDamping;
    mdl_ObjCow<kprC_RayleighDamping> rayleighDamping;
    mdl_ObjCow<kprC_StructuralDamping> structuralDamping;
    mdl_ObjCow<kprC_DirectDampingByFrequency> directDampingByFrequency;
    mdl_ObjCow<kprC_RayleighDampingByFrequency> rayleighDampingByFrequency;
    mdl_ObjCow<kprC_StructuralDampingByFrequency> structuralDampingByFrequency;

    static const cls_FieldTable& Fields();
};

class kprC_ResponseSpectrumStep final : public kprC_ProcedureOf<kprC_ResponseSpectrumStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ResponseSpectrumStep",
                                         "Peak response to a spectrum on the modes of an earlier step.",
                                         0x23C0071, "ResponseSpectrum"};

    enum class CompEnm : int { SINGLE_DIRECTION = 0, ALGEBRAIC = 1, SRSS = 2 };
    enum class SumEnm : int { ABS = 0, CQC = 1, NRL = 2, SRSS = 3, TENP = 4 };

    CompEnm comp = CompEnm::SINGLE_DIRECTION;
    SumEnm sum = SumEnm::ABS;
    cow_List<kprC_ResponseSpectrumComponent> components;
    mdl_ObjCow<kprC_CompositeDamping> compositeDamping;
    mdl_ObjCow<kprC_DirectDamping> directDamping;
    mdl_ObjCow<kprC_RayleighDamping> rayleighDamping;
    mdl_ObjCow<kprC_DirectDampingByFrequency> directDampingByFrequency;
    mdl_ObjCow<kprC_RayleighDampingByFrequency> rayleighDampingByFrequency;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_ResponseSpectrumStep::CompEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_ResponseSpectrumStep::SumEnm);

class kprC_SteadyStateDirectStep final : public kprC_ProcedureOf<kprC_SteadyStateDirectStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateDirectStep",
                                         "Harmonic response by direct solution.", 0x23C0076,
                                         "SteadyStateDirect"};

    static constexpr bool subdivideUsingEigenfrequenciesDef() { return false; }

    bool complex = true;
    cow_List<kprC_SteadyStateDirectFrequency> frequencies;
    FrequencyScaleEnm frequencyScale = FrequencyScaleEnm::LOGARITHMIC;
    bool subdivideUsingEigenfrequencies = subdivideUsingEigenfrequenciesDef();

    static const cls_FieldTable& Fields();
};

class kprC_SteadyStateModalStep final : public kprC_ProcedureOf<kprC_SteadyStateModalStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateModalStep",
                                         "Harmonic response on the modes of an earlier step.", 0x23C0077,
                                         "SteadyStateModal"};

    static constexpr bool subdivideUsingEigenfrequenciesDef() { return true; }

    cow_List<kprC_SteadyStateModalFrequency> frequencies;
    FrequencyScaleEnm frequencyScale = FrequencyScaleEnm::LOGARITHMIC;
    bool subdivideUsingEigenfrequencies = subdivideUsingEigenfrequenciesDef();
    mdl_ObjCow<kprC_CompositeDamping> compositeDamping;
    mdl_ObjCow<kprC_DirectDamping> directDamping;
    mdl_ObjCow<kprC_RayleighDamping> rayleighDamping;
    mdl_ObjCow<kprC_StructuralDamping> structuralDamping;
    mdl_ObjCow<kprC_DirectDampingByFrequency> directDampingByFrequency;
    mdl_ObjCow<kprC_RayleighDampingByFrequency> rayleighDampingByFrequency;
    mdl_ObjCow<kprC_StructuralDampingByFrequency> structuralDampingByFrequency;

    static const cls_FieldTable& Fields();
};

class kprC_SteadyStateSubspaceStep final : public kprC_ProcedureOf<kprC_SteadyStateSubspaceStep> {
public:
    static constexpr cls_ClassInfo Class{"kprC_SteadyStateSubspaceStep",
                                         "Harmonic response in the subspace of the modes of an earlier step.",
                                         0x23C007E, "SteadyStateSubspace"};

    enum class ProjectionEnm : int {
        NONE = 0,
        CONSTANT = 1,
        EIGENFREQUENCY = 2,
        PROPERTY_CHANGE = 3,
        RANGE = 4
    };

    static constexpr bool subdivideUsingEigenfrequenciesDef() { return true; }

    bool complex = true;
    cow_List<kprC_SteadyStateSubspaceFrequency> frequencies;
    FrequencyScaleEnm frequencyScale = FrequencyScaleEnm::LOGARITHMIC;
    bool frictionDamping = false;
    bool subdivideUsingEigenfrequencies = subdivideUsingEigenfrequenciesDef();
    ProjectionEnm projection = ProjectionEnm::NONE;
    double dampingChange = 0.1;
    double stiffnessChange = 0.1;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_SteadyStateSubspaceStep::ProjectionEnm);

void cls_RegisterModalStepRecords(cls_ClassRegistrar& registrar);

#endif
