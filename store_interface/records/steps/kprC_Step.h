#ifndef QRX_STORE_KPRC_STEP_H
#define QRX_STORE_KPRC_STEP_H

#include "store_interface/records/conditions/klcC_LoadCase.h"
#include "store_interface/records/mdl_Repository.h"

class cls_ClassRegistrar;

/// The number of a procedure is the class number of its step record; 0 stands for no procedure.
/// Annealing and the two explicit dynamics procedures.
bool kprC_IsExplicit(unsigned stepType);
/// The linear procedures, which leave the state of the model as it was.
bool kprC_IsPerturbation(unsigned stepType);

/// Root of all steps.
class kprC_Step : public cls_AbstractRecordOf<kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_Step", "a step of the analysis", 0x23C002D};

    enum class MatrixStorageEnm : int { SOLVER_DEFAULT = 0, SYMMETRIC = 1, UNSYMMETRIC = 2 };

    cow_String description;
    bool suppressed = false;
    cow_String solverInput;
    MatrixStorageEnm matrixStorage = MatrixStorageEnm::SOLVER_DEFAULT;

    /// The class number of an analysis step; 0 for the initial step.
    unsigned ProcedureType() const;
    bool Explicit() const { return kprC_IsExplicit(ProcedureType()); }
    bool Perturbation() const { return kprC_IsPerturbation(ProcedureType()); }
    void Suppress() { suppressed = true; }
    void Resume() { suppressed = false; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kprC_Step::MatrixStorageEnm);

/// The state before the analysis; always the first step, and no other is one.
class kprC_InitialStep final : public cls_RecordOf<kprC_InitialStep, kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_InitialStep",
                                         "the state before the analysis: boundary conditions, initial "
                                         "conditions and interactions can begin here",
                                         0x23C0064};
};

/// Base of all steps that have a procedure.
class kprC_AnalysisStep : public cls_AbstractRecordOf<kprC_AnalysisStep, kprC_Step> {
public:
    static constexpr cls_ClassInfo Class{"kprC_AnalysisStep", "a step with a procedure", 0x23C002E};

    mdl_MapString2ObjCow<klcC_LoadCase> loadCases;

    static const cls_FieldTable& Fields();
};

void cls_RegisterStepRecords(cls_ClassRegistrar& registrar);

#endif
