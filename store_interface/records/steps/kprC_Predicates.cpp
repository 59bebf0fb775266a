#include "store_interface/records/steps/kprC_Predicates.h"

#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

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
    kContinued = 1U << 8,
};

struct Procedure {
    unsigned id;
    unsigned traits;
};

constexpr Procedure kProcedures[] = {
    {kprC_AnnealStep::Class.Id(), kExplicit},
    {kprC_BuckleStep::Class.Id(), kPerturbation | kEigenvalues},
    {kprC_CoupledTempDisplacementStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_CoupledThermalElectricStep::Class.Id(), kNonmechanical | kIntervals},
    {kprC_ExplicitDynamicsStep::Class.Id(), kExplicit | kMeshDomains | kIntervals},
    {kprC_FrequencyStep::Class.Id(), kPerturbation | kEigenvalues},
    {kprC_GeostaticStep::Class.Id(), 0},
    {kprC_HeatTransferStep::Class.Id(), kNonmechanical | kIntervals},
    {kprC_ImplicitDynamicsStep::Class.Id(), kImplicitModal | kIntervals},
    {kprC_MassDiffusionStep::Class.Id(), kNonmechanical | kIntervals},
    {kprC_ModalDynamicsStep::Class.Id(), kPerturbation | kLoadCases | kImplicitModal | kContinued},
    {kprC_RandomResponseStep::Class.Id(), kPerturbation},
    {kprC_ResponseSpectrumStep::Class.Id(), kPerturbation},
    {kprC_SoilsStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_StaticStep::Class.Id(), kMeshDomains | kIntervals},
    {kprC_StaticRiksStep::Class.Id(), 0},
    {kprC_StaticLinearPerturbationStep::Class.Id(), kPerturbation | kLoadCases | kContinued},
    {kprC_SteadyStateDirectStep::Class.Id(), kPerturbation | kLoadCases},
    {kprC_SteadyStateModalStep::Class.Id(), kPerturbation | kLoadCases},
    {kprC_SubspaceDynamicsStep::Class.Id(), kImplicitModal},
    {kprC_ViscoStep::Class.Id(), kIntervals},
    {kprC_TempDisplacementDynamicsStep::Class.Id(), kExplicit | kMeshDomains | kIntervals},
    {kprC_ComplexFrequencyStep::Class.Id(), kPerturbation | kEigenvalues},
    {kprC_SteadyStateSubspaceStep::Class.Id(), kPerturbation},
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

bool kprC_CanBeContinued(unsigned stepType) {
    return Has(stepType, kContinued);
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
