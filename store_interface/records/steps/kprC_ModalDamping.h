#ifndef QRX_STORE_KPRC_MODALDAMPING_H
#define QRX_STORE_KPRC_MODALDAMPING_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

class kprC_CompositeDampingRow final : public cls_RecordOf<kprC_CompositeDampingRow> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CompositeDampingRow", "Mode range with composite damping."};

    int firstMode = 1;
    int lastMode = 1;

    static const cls_FieldTable& Fields();
};

class kprC_ModeDampingRow final : public cls_RecordOf<kprC_ModeDampingRow> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_ModeDampingRow",
        "Mode range with one damping value; used by direct and by structural damping."};

    int firstMode = 1;
    int lastMode = 1;
    double value = 0.0;

    static const cls_FieldTable& Fields();
};

class kprC_RayleighDampingRow final : public cls_RecordOf<kprC_RayleighDampingRow> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RayleighDampingRow", "Mode range with Rayleigh damping."};

    int firstMode = 1;
    int lastMode = 1;
    double alpha = 0.0;
    double beta = 0.0;

    static const cls_FieldTable& Fields();
};

class kprC_FrequencyDampingRow final : public cls_RecordOf<kprC_FrequencyDampingRow> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_FrequencyDampingRow",
        "Frequency with one damping value; used by direct and by structural damping by frequency."};

    double low = 0.0;
    double value = 0.0;

    static const cls_FieldTable& Fields();
};

class kprC_RayleighFrequencyDampingRow final : public cls_RecordOf<kprC_RayleighFrequencyDampingRow> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RayleighFrequencyDampingRow",
                                         "Frequency with Rayleigh damping."};

    double low = 0.0;
    double alpha = 0.0;
    double beta = 0.0;

    static const cls_FieldTable& Fields();
};

class kprC_DirectDamping final : public cls_RecordOf<kprC_DirectDamping> {
public:
    static constexpr cls_ClassInfo Class{"kprC_DirectDamping", "Direct modal damping by mode."};

    cow_List<kprC_ModeDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_CompositeDamping final : public cls_RecordOf<kprC_CompositeDamping> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CompositeDamping", "Composite modal damping by mode."};

    cow_List<kprC_CompositeDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_RayleighDamping final : public cls_RecordOf<kprC_RayleighDamping> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RayleighDamping", "Rayleigh damping by mode."};

    cow_List<kprC_RayleighDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_StructuralDamping final : public cls_RecordOf<kprC_StructuralDamping> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StructuralDamping", "Structural damping by mode."};

    cow_List<kprC_ModeDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_DirectDampingByFrequency final : public cls_RecordOf<kprC_DirectDampingByFrequency> {
public:
    static constexpr cls_ClassInfo Class{"kprC_DirectDampingByFrequency",
                                         "Direct modal damping by frequency."};

    cow_List<kprC_FrequencyDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_RayleighDampingByFrequency final : public cls_RecordOf<kprC_RayleighDampingByFrequency> {
public:
    static constexpr cls_ClassInfo Class{"kprC_RayleighDampingByFrequency", "Rayleigh damping by frequency."};

    cow_List<kprC_RayleighFrequencyDampingRow> rows;

    static const cls_FieldTable& Fields();
};

class kprC_StructuralDampingByFrequency final : public cls_RecordOf<kprC_StructuralDampingByFrequency> {
public:
    static constexpr cls_ClassInfo Class{"kprC_StructuralDampingByFrequency",
                                         "Structural damping by frequency."};

    cow_List<kprC_FrequencyDampingRow> rows;

    static const cls_FieldTable& Fields();
};

void cls_RegisterModalDampingRecords(cls_ClassRegistrar& registrar);

#endif
