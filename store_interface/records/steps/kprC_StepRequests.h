#ifndef QRX_STORE_KPRC_STEPREQUESTS_H
#define QRX_STORE_KPRC_STEPREQUESTS_H

#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

class kprC_Restart : public cls_AbstractRecordOf<kprC_Restart> {
public:
    static constexpr cls_ClassInfo Class{"kprC_Restart", "base of the requests to write restart data."};

    bool overlay = false;

    static const cls_FieldTable& Fields();
};

class kprC_StandardRestart final : public cls_RecordOf<kprC_StandardRestart, kprC_Restart> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StandardRestart", "Restart data of an implicit step."};

    int frequency = 1;
    int numberInterval = 0;
    bool timeMarks = true;

    static const cls_FieldTable& Fields();
};

class kprC_ExplicitRestart final : public cls_RecordOf<kprC_ExplicitRestart, kprC_Restart> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ExplicitRestart", "Restart data of an explicit step."};

    int numberInterval = 1;
    bool timeMarks = false;

    static const cls_FieldTable& Fields();
};

class kprC_Monitor : public cls_RecordOf<kprC_Monitor> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_Monitor",
        "One degree of freedom watched while the job runs. This class itself serves explicit steps."};

    rgnC_Region region;
    int dof = 1;

    static const cls_FieldTable& Fields();
};

class kprC_StandardMonitor final : public cls_RecordOf<kprC_StandardMonitor, kprC_Monitor> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StandardMonitor", "Monitor of an implicit step."};

    int frequency = 1;

    static const cls_FieldTable& Fields();
};

class kprC_DiagnosticPrint : public cls_AbstractRecordOf<kprC_DiagnosticPrint> {
public:
    static constexpr cls_ClassInfo Class{"kprC_DiagnosticPrint",
                                         "base of the requests for diagnostic text of the running job."};
};

class kprC_ExplicitDiagnosticPrint final
    : public cls_RecordOf<kprC_ExplicitDiagnosticPrint, kprC_DiagnosticPrint> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ExplicitDiagnosticPrint",
                                         "Diagnostic text of an explicit step. Defaults are the solver's."};

    bool allke = true;
    bool criticalElement = true;
    bool etotal = true;
    bool dmass = true;

    static const cls_FieldTable& Fields();
};

class kprC_PerturbationDiagnosticPrint final
    : public cls_RecordOf<kprC_PerturbationDiagnosticPrint, kprC_DiagnosticPrint> {
public:
    static constexpr cls_ClassInfo Class{"kprC_PerturbationDiagnosticPrint",
                                         "Diagnostic text of a linear perturbation step."};

    int frequency = 1;
    bool solve = false;

    static const cls_FieldTable& Fields();
};

class kprC_StandardDiagnosticPrint final
    : public cls_RecordOf<kprC_StandardDiagnosticPrint, kprC_DiagnosticPrint> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_StandardDiagnosticPrint",
        "Diagnostic text of a general implicit step. Defaults are the solver's."};

    bool contact = false;
    int frequency = 1;
    bool modelChange = false;
    bool solve = false;

    static const cls_FieldTable& Fields();
};

void cls_RegisterStepRequestRecords(cls_ClassRegistrar& registrar);

#endif
