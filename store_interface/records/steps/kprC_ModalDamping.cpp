#include "store_interface/records/steps/kprC_ModalDamping.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kprC_CompositeDampingRow::Fields() {
    using R = kprC_CompositeDampingRow;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .Field<&R::firstMode>("firstMode", "first mode of the range")
                                             .Field<&R::lastMode>("lastMode", "last mode of the range")
                                             .Example(R"({"firstMode": 1, "lastMode": 10})");
    return fields;
}

const cls_FieldTable& kprC_ModeDampingRow::Fields() {
    using R = kprC_ModeDampingRow;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::firstMode>("firstMode", "first mode of the range")
            .Field<&R::lastMode>("lastMode", "last mode of the range")
            .Field<&R::value>("value",
                              "direct: fraction of critical damping; structural: structural damping factor")
            .Unit("no unit")
            .Example(R"({"firstMode": 1, "lastMode": 10, "value": 0.02})");
    return fields;
}

const cls_FieldTable& kprC_RayleighDampingRow::Fields() {
    using R = kprC_RayleighDampingRow;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::firstMode>("firstMode", "first mode of the range")
            .Field<&R::lastMode>("lastMode", "last mode of the range")
            .Field<&R::alpha>("alpha", "mass-proportional factor")
            .Unit("1/time")
            .Field<&R::beta>("beta", "stiffness-proportional factor")
            .Unit("time")
            .Example(R"({"firstMode": 1, "lastMode": 10, "alpha": 0.1, "beta": 1e-5})");
    return fields;
}

const cls_FieldTable& kprC_FrequencyDampingRow::Fields() {
    using R = kprC_FrequencyDampingRow;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::low>("low", "frequency from which the values hold")
            .Unit("cycles/time")
            .Field<&R::value>("value",
                              "direct: fraction of critical damping; structural: structural damping factor")
            .Unit("no unit")
            .Example(R"({"low": 1, "value": 0.02})");
    return fields;
}

const cls_FieldTable& kprC_RayleighFrequencyDampingRow::Fields() {
    using R = kprC_RayleighFrequencyDampingRow;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .Field<&R::low>("low", "frequency from which the values hold")
                                             .Unit("cycles/time")
                                             .Field<&R::alpha>("alpha", "mass-proportional factor")
                                             .Unit("1/time")
                                             .Field<&R::beta>("beta", "stiffness-proportional factor")
                                             .Unit("time")
                                             .Example(R"({"low": 1, "alpha": 0.1, "beta": 1e-5})");
    return fields;
}

const cls_FieldTable& kprC_DirectDamping::Fields() {
    using R = kprC_DirectDamping;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"firstMode": 1, "lastMode": 10, "value": 0.02}]})");
    return fields;
}

const cls_FieldTable& kprC_CompositeDamping::Fields() {
    using R = kprC_CompositeDamping;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"firstMode": 1, "lastMode": 10}]})");
    return fields;
}

const cls_FieldTable& kprC_RayleighDamping::Fields() {
    using R = kprC_RayleighDamping;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"firstMode": 1, "lastMode": 10, "alpha": 0.1}]})");
    return fields;
}

const cls_FieldTable& kprC_StructuralDamping::Fields() {
    using R = kprC_StructuralDamping;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"firstMode": 1, "lastMode": 10, "value": 0.02}]})");
    return fields;
}

const cls_FieldTable& kprC_DirectDampingByFrequency::Fields() {
    using R = kprC_DirectDampingByFrequency;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"low": 1, "value": 0.02}]})");
    return fields;
}

const cls_FieldTable& kprC_RayleighDampingByFrequency::Fields() {
    using R = kprC_RayleighDampingByFrequency;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"low": 1, "alpha": 0.1}]})");
    return fields;
}

const cls_FieldTable& kprC_StructuralDampingByFrequency::Fields() {
    using R = kprC_StructuralDampingByFrequency;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::rows>("rows", "one data line each; an empty list leaves the keyword line alone")
            .Example(R"({"rows": [{"low": 1, "value": 0.02}]})");
    return fields;
}

void cls_RegisterModalDampingRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_CompositeDampingRow>();
    registrar.Add<kprC_ModeDampingRow>();
    registrar.Add<kprC_RayleighDampingRow>();
    registrar.Add<kprC_FrequencyDampingRow>();
    registrar.Add<kprC_RayleighFrequencyDampingRow>();
    registrar.Add<kprC_DirectDamping>();
    registrar.Add<kprC_CompositeDamping>();
    registrar.Add<kprC_RayleighDamping>();
    registrar.Add<kprC_StructuralDamping>();
    registrar.Add<kprC_DirectDampingByFrequency>();
    registrar.Add<kprC_RayleighDampingByFrequency>();
    registrar.Add<kprC_StructuralDampingByFrequency>();
}
