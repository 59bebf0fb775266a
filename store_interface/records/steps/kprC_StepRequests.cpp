#include "store_interface/records/steps/kprC_StepRequests.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kprC_Restart::Fields() {
    using R = kprC_Restart;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields()).Field<&R::overlay>("overlay", "keep only the last state");
    return fields;
}

const cls_FieldTable& kprC_StandardRestart::Fields() {
    using R = kprC_StandardRestart;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_Restart::Fields())
            .Field<&R::frequency>("frequency",
                                  "increments between two states, written when numberInterval is below 1")
            .Field<&R::numberInterval>("numberInterval",
                                       "number of intervals of the step; below 1 = by frequency")
            .Field<&R::timeMarks>(
                "timeMarks", "states at the exact ends of the intervals; written with numberInterval only")
            .Example(R"({"frequency": 10})");
    return fields;
}

const cls_FieldTable& kprC_ExplicitRestart::Fields() {
    using R = kprC_ExplicitRestart;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_Restart::Fields())
            .Field<&R::numberInterval>("numberInterval", "number of intervals of the step")
            .Field<&R::timeMarks>("timeMarks", "states at the exact ends of the intervals")
            .Example(R"({"numberInterval": 5})");
    return fields;
}

const cls_FieldTable& kprC_Monitor::Fields() {
    using R = kprC_Monitor;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::region>("region", "node set of the watched node; null or empty name = no monitor")
            .Field<&R::dof>("dof", "degree of freedom")
            .Example(R"({"region": "PART-1.CENTRE", "dof": 3})");
    return fields;
}

const cls_FieldTable& kprC_StandardMonitor::Fields() {
    using R = kprC_StandardMonitor;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_Monitor::Fields())
            .Field<&R::frequency>("frequency", "increments between two values, always written")
            .Example(R"({"region": "PART-1.CENTRE", "dof": 3})");
    return fields;
}

const cls_FieldTable& kprC_ExplicitDiagnosticPrint::Fields() {
    using R = kprC_ExplicitDiagnosticPrint;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_DiagnosticPrint::Fields())
            .Field<&R::allke>("allke", "total kinetic energy")
            .Field<&R::criticalElement>("criticalElement", "element with the smallest stable increment")
            .Field<&R::etotal>("etotal", "energy balance")
            .Field<&R::dmass>("dmass", "change of mass by mass scaling")
            .Example(R"({"dmass": true})");
    return fields;
}

const cls_FieldTable& kprC_PerturbationDiagnosticPrint::Fields() {
    using R = kprC_PerturbationDiagnosticPrint;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_DiagnosticPrint::Fields())
            .Field<&R::frequency>("frequency", "increments between two prints")
            .Field<&R::solve>("solve", "data of the equation solver")
            .Example(R"({"solve": true})");
    return fields;
}

const cls_FieldTable& kprC_StandardDiagnosticPrint::Fields() {
    using R = kprC_StandardDiagnosticPrint;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_DiagnosticPrint::Fields())
            .Field<&R::contact>("contact", "points that open and close")
            .Field<&R::frequency>("frequency", "increments between two prints")
            .Field<&R::modelChange>("modelChange", "removed and reactivated elements")
            .Field<&R::solve>("solve", "never written from this record; takes the value of a perturbation "
                                       "record and is what the next one is compared with")
            .NotModelData()
            .Example(R"({"contact": true})");
    return fields;
}

void cls_RegisterStepRequestRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_Restart>();
    registrar.Add<kprC_StandardRestart>();
    registrar.Add<kprC_ExplicitRestart>();
    registrar.Add<kprC_Monitor>();
    registrar.Add<kprC_StandardMonitor>();
    registrar.Add<kprC_DiagnosticPrint>();
    registrar.Add<kprC_ExplicitDiagnosticPrint>();
    registrar.Add<kprC_PerturbationDiagnosticPrint>();
    registrar.Add<kprC_StandardDiagnosticPrint>();
}
