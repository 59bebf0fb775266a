#include "store_interface/records/steps/kprC_Predicates.h"

#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include <algorithm>
#include <iterator>

namespace {

enum Traits : unsigned {
    kIsExplicit = 1U << 0,
    kIsPerturbation = 1U << 1,
    kIsNonmechanical = 1U << 2,
    kLoadCases = 1U << 3,
    kMeshDomains = 1U << 4,
    kImplicitModal = 1U << 5,
    kEigenvalues = 1U << 6,
    kIntervals = 1U << 7,
    kContinued = 1U << 8,
};

struct Procedure {
    unsigned id;
    unsigned traits;
};

constexpr Procedure kProcedures[] = {
    {kprC_AnnealStep::Class.Id(), kIsExplicit},
    {kprC_BuckleStep::Class.Id(), kIsPerturbation | kEigenvalues},
    {kprC_CoupledTempDisplacementStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_CoupledThermalElectricStep::Class.Id(), kIsNonmechanical | kIntervals},
    {kprC_ExplicitDynamicsStep::Class.Id(), kIsExplicit | kMeshDomains | kIntervals},
    {kprC_FrequencyStep::Class.Id(), kIsPerturbation | kEigenvalues},
    {kprC_GeostaticStep::Class.Id(), 0},
    {kprC_HeatTransferStep::Class.Id(), kIsNonmechanical | kIntervals},
    {kprC_ImplicitDynamicsStep::Class.Id(), kImplicitModal | kIntervals},
    {kprC_MassDiffusionStep::Class.Id(), kIsNonmechanical | kIntervals},
    {kprC_ModalDynamicsStep::Class.Id(), kIsPerturbation | kLoadCases | kImplicitModal | kContinued},
    {kprC_RandomResponseStep::Class.Id(), kIsPerturbation},
    {kprC_ResponseSpectrumStep::Class.Id(), kIsPerturbation},
    {kprC_SoilsStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_StaticStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_StaticRiksStep::Class.Id(), 0},
    {kprC_StaticLinearPerturbationStep::Class.Id(), kIsPerturbation | kLoadCases | kContinued},
    {kprC_SteadyStateDirectStep::Class.Id(), kIsPerturbation | kLoadCases},
    {kprC_SteadyStateModalStep::Class.Id(), kIsPerturbation | kLoadCases},
    {kprC_SubspaceDynamicsStep::Class.Id(), kImplicitModal},
    {kprC_ViscoStep::Class.Id(), kIntervals},
    {kprC_TempDisplacementDynamicsStep::Class.Id(), kIsExplicit | kMeshDomains | kIntervals},
    {kprC_ComplexFrequencyStep::Class.Id(), kIsPerturbation | kEigenvalues},
    {kprC_SteadyStateSubspaceStep::Class.Id(), kIsPerturbation},
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
    return Has(stepType, kIsExplicit);
}

bool kprC_IsPerturbation(unsigned stepType) {
    return Has(stepType, kIsPerturbation);
}

bool kprC_IsNonmechanical(unsigned stepType) {
    return Has(stepType, kIsNonmechanical);
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

bool kprC_CanBeContinued(unsigned stepType) {
    return Has(stepType, kContinued);
}

bool kprC_ModesIsAllowed(unsigned stepType) {
    return Has(stepType, kEigenvalues);
}

bool kprC_OutputFrequencyIsAllowed(unsigned stepType, bool isField) {
    return IsProcedure(stepType) && !Has(stepType, isField ? kIsExplicit | kEigenvalues : kEigenvalues);
}

bool kprC_NumberIntervalIsAllowed(const kprC_AnalysisStep& step) {
    return Has(step.DynTypeId(), kIsExplicit | kIntervals);
}

bool kprC_TimeIntervalIsAllowed(unsigned stepType) {
    return Has(stepType, kIntervals);
}

bool kprC_TimePointIsAllowed(unsigned stepType, bool isField) {
    return Has(stepType, kIntervals) && (isField || !Has(stepType, kIsExplicit));
}

bool kprC_TimeMarksIsAllowed(unsigned stepType, bool isField) {
    return kprC_TimePointIsAllowed(stepType, isField);
}
