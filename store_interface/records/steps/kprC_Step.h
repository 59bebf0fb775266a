#ifndef QRX_STORE_KPRC_STEP_H
#define QRX_STORE_KPRC_STEP_H

#include "store_interface/records/mdl_Repository.h"
#include "store_interface/records/steps/klcC_LoadCase.h"
#include "store_interface/records/steps/kprC_Controls.h"
#include "store_interface/records/steps/kprC_Predicates.h"
#include "store_interface/records/steps/kprC_StepRequests.h"

/// Root of all steps.
class kprC_Step : public cls_AbstractRecordOf<kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_Step", "a step of the analysis", 0x23C002D};

    enum class MatrixStorageEnm : int { SOLVER_DEFAULT = 0, SYMMETRIC = 1, UNSYMMETRIC = 2 };
    enum class NlgeomEnm : int { OFF = 0, ON = 1 };
    enum class ResponseEnm : int { STEADY_STATE = 0, TRANSIENT = 1 };
    enum class SolutionTechniqueEnm : int { FULL_NEWTON = 0, SEPARATED = 1, QUASI_NEWTON = 2 };
    enum class AmplitudeEnm : int { STEP = 0, RAMP = 1 };
    /// Decks know PARABOLIC and NO only; which number goes without a word depends on the procedure.
    enum class ExtrapolationEnm : int {
        LINEAR = 0,
        PARABOLIC = 1,
        NONE = 2,
        RESERVED_3 = 3,
        PROCEDURE_DEFAULT = 4
    };
    enum class TimeIncrementationEnm : int { AUTOMATIC = 0, DIRECT = 1 };
    enum class FrequencyScaleEnm : int { LOGARITHMIC = 0, LINEAR = 1 };

    cow_String description;
    bool suppressed = false;
    cow_String solverInput;
    MatrixStorageEnm matrixStorage = MatrixStorageEnm::SOLVER_DEFAULT;

    /// The class number of an analysis step; 0 for the initial step.
    unsigned ProcedureType() const;
    bool Explicit() const { return kprC_IsExplicit(ProcedureType()); }
    bool Perturbation() const { return kprC_IsPerturbation(ProcedureType()); }
    bool Nonmechanical() const { return kprC_IsNonmechanical(ProcedureType()); }
    bool AllowLoadCases() const { return kprC_LoadCasesAreAllowed(ProcedureType()); }
    bool AllowAdaptiveMeshDomains() const { return kprC_AdaptiveMeshDomainsAreAllowed(ProcedureType()); }
    /// No procedure here is one of fluid flow.
    bool Flow() const { return false; }
    /// The eigenvalues come from the solver's own substructuring.
    virtual bool SimBased() const { return false; }
    /// The following give what the class's field of that name says; for a class without it: not adiabatic,
    /// transient, period 0, small displacements, full Newton.
    virtual bool IsAdiabatic() const { return false; }
    virtual ResponseEnm Response() const { return ResponseEnm::TRANSIENT; }
    virtual double TimePeriod() const { return 0.0; }
    virtual NlgeomEnm Nlgeom() const { return NlgeomEnm::OFF; }
    virtual SolutionTechniqueEnm SolutionTechnique() const { return SolutionTechniqueEnm::FULL_NEWTON; }
    void Suppress() { suppressed = true; }
    void Resume() { suppressed = false; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_Step::MatrixStorageEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::NlgeomEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::ResponseEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::SolutionTechniqueEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::AmplitudeEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::ExtrapolationEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::TimeIncrementationEnm);
const omu_EnumTable& omu_EnumTableOf(kprC_Step::FrequencyScaleEnm);

/// The state before the analysis; always the first step, and no other is one.
class kprC_InitialStep final : public cls_RecordOf<kprC_InitialStep, kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_InitialStep",
                                         "the state before the analysis: boundary conditions, initial "
                                         "conditions and interactions can begin here",
                                         0x23C0064, "Initial"};
};

/// Base of all steps that have a procedure.
class kprC_AnalysisStep : public cls_AbstractRecordOf<kprC_AnalysisStep, kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_AnalysisStep", "a step with a procedure", 0x23C002E};

    mdl_MapString2ObjCow<klcC_LoadCase> loadCases;
    mdl_ObjCow<kprC_Controls> controls;
    mdl_ObjCow<kprC_LinearCtrl> solverControls;
    mdl_ObjCow<kprC_Restart> restart;
    mdl_ObjCow<kprC_DiagnosticPrint> diagnosticPrint;
    mdl_ObjCow<kprC_Monitor> monitor;

    static const cls_FieldTable& Fields();
};

/// Base of the step class T of one procedure: answers the queries from the fields that T has.
template <class T>
class kprC_ProcedureOf : public cls_RecordOf<T, kprC_AnalysisStep> {
public:
    bool IsAdiabatic() const override {
        if constexpr (requires { Self().adiabatic; }) return Self().adiabatic;
        return false;
    }
    kprC_Step::ResponseEnm Response() const override {
        // 0 is the steady state, save for soils, whose own enumeration runs the other way round.
        if constexpr (requires {
                          T::ResponseEnm::TRANSIENT;
                          Self().response;
                      }) {
            return Self().response == T::ResponseEnm::STEADY_STATE ? kprC_Step::ResponseEnm::STEADY_STATE
                                                                   : kprC_Step::ResponseEnm::TRANSIENT;
        }
        return kprC_Step::ResponseEnm::TRANSIENT;
    }
    double TimePeriod() const override {
        if constexpr (requires { Self().timePeriod; }) return Self().timePeriod;
        return 0.0;
    }
    kprC_Step::NlgeomEnm Nlgeom() const override {
        if constexpr (requires { Self().nlgeom; }) {
            return Self().nlgeom == kprC_Step::NlgeomEnm::OFF ? kprC_Step::NlgeomEnm::OFF
                                                              : kprC_Step::NlgeomEnm::ON;
        }
        return kprC_Step::NlgeomEnm::OFF;
    }
    kprC_Step::SolutionTechniqueEnm SolutionTechnique() const override {
        if constexpr (requires { Self().solutionTechnique; }) return Self().solutionTechnique;
        return kprC_Step::SolutionTechniqueEnm::FULL_NEWTON;
    }

private:
    const T& Self() const { return static_cast<const T&>(*this); }
};

void cls_RegisterStepRecords(cls_ClassRegistrar& registrar);

#endif
