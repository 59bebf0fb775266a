#include "store_interface/records/steps/kprC_Predicates.h"

#include "store_interface/records/steps/kprC_Step.h"

#include <algorithm>
#include <iterator>

namespace {

enum Traits : unsigned {
    kExplicit = 1U << 0,
    kPerturbation = 1U << 1,
    kNonmechanical = 1U << 2,
    kLoadCases = 1U << 3,
    kMeshDomains = 1U << 4,
    kImplicitModal = 1U << 5,
    kEigenvalues = 1U << 6,
    kIntervals = 1U << 7,
};

struct Procedure {
    unsigned id;
    unsigned traits;
};

// 0x23C0079 and 0x23C007C belong to no procedure.
constexpr Procedure kProcedures[] = {
    {0x23C0065, kExplicit},                                   // kprC_AnnealStep
    {0x23C0066, kPerturbation | kEigenvalues},                // kprC_BuckleStep
    {0x23C0067, kMeshDomains | kIntervals},                   // kprC_CoupledTempDisplacementStep
    {0x23C0068, kNonmechanical | kIntervals},                 // kprC_CoupledThermalElectricStep
    {0x23C0069, kExplicit | kMeshDomains | kIntervals},       // kprC_ExplicitDynamicsStep
    {0x23C006A, kPerturbation | kEigenvalues},                // kprC_FrequencyStep
    {0x23C006B, 0},                                           // kprC_GeostaticStep
    {0x23C006C, kNonmechanical | kIntervals},                 // kprC_HeatTransferStep
    {0x23C006D, kImplicitModal | kIntervals},                 // kprC_ImplicitDynamicsStep
    {0x23C006E, kNonmechanical | kIntervals},                 // kprC_MassDiffusionStep
    {0x23C006F, kPerturbation | kLoadCases | kImplicitModal}, // kprC_ModalDynamicsStep
    {0x23C0070, kPerturbation},                               // kprC_RandomResponseStep
    {0x23C0071, kPerturbation},                               // kprC_ResponseSpectrumStep
    {0x23C0072, kMeshDomains | kIntervals},                   // kprC_SoilsStep
    {0x23C0073, kMeshDomains | kIntervals},                   // kprC_StaticStep
    {0x23C0074, 0},                                           // kprC_StaticRiksStep
    {0x23C0075, kPerturbation | kLoadCases},                  // kprC_StaticLinearPerturbationStep
    {0x23C0076, kPerturbation | kLoadCases},                  // kprC_SteadyStateDirectStep
    {0x23C0077, kPerturbation | kLoadCases},                  // kprC_SteadyStateModalStep
    {0x23C0078, kImplicitModal},                              // kprC_SubspaceDynamicsStep
    {0x23C007A, kIntervals},                                  // kprC_ViscoStep
    {0x23C007B, kExplicit | kMeshDomains | kIntervals},       // kprC_TempDisplacementDynamicsStep
    {0x23C007D, kPerturbation | kEigenvalues},                // kprC_ComplexFrequencyStep
    {0x23C007E, kPerturbation},                               // kprC_SteadyStateSubspaceStep
};

unsigned TraitsOf(unsigned stepType) {
    for (const Procedure& procedure : kProcedures) {
        if (procedure.id == stepType) return procedure.traits;
    }
    return 0;
}

bool Has(unsigned stepType, unsigned trait) {
    return (TraitsOf(stepType) & trait) != 0;
}

bool IsProcedure(unsigned stepType) {
    return std::any_of(std::begin(kProcedures), std::end(kProcedures),
                       [&](const Procedure& procedure) { return procedure.id == stepType; });
}

} // namespace

bool kprC_IsExplicit(unsigned stepType) {
    return Has(stepType, kExplicit);
}

bool kprC_IsPerturbation(unsigned stepType) {
    return Has(stepType, kPerturbation);
}

bool kprC_IsNonmechanical(unsigned stepType) {
    return Has(stepType, kNonmechanical);
}

bool kprC_LoadCasesAreAllowed(unsigned stepType) {
    return Has(stepType, kLoadCases);
}

bool kprC_AdaptiveMeshDomainsAreAllowed(unsigned stepType) {
    return Has(stepType, kMeshDomains);
}

bool kprC_IsImplicitModal(unsigned stepType) {
    return Has(stepType, kImplicitModal);
}

bool kprC_IsFrequencyBuckle(unsigned stepType) {
    return Has(stepType, kEigenvalues);
}

bool kprC_ModesIsAllowed(unsigned stepType) {
    return Has(stepType, kEigenvalues);
}

bool kprC_OutputFrequencyIsAllowed(unsigned stepType, bool isField) {
    return IsProcedure(stepType) && !Has(stepType, isField ? kExplicit | kEigenvalues : kEigenvalues);
}

bool kprC_NumberIntervalIsAllowed(const kprC_AnalysisStep& step) {
    return Has(step.DynTypeId(), kExplicit | kIntervals);
}

bool kprC_TimeIntervalIsAllowed(unsigned stepType) {
    return Has(stepType, kIntervals);
}

bool kprC_TimePointIsAllowed(unsigned stepType, bool isField) {
    return Has(stepType, kIntervals) && (isField || !Has(stepType, kExplicit));
}

bool kprC_TimeMarksIsAllowed(unsigned stepType, bool isField) {
    return kprC_TimePointIsAllowed(stepType, isField);
}
