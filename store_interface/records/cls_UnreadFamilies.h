#ifndef QRX_STORE_CLS_UNREADFAMILIES_H
#define QRX_STORE_CLS_UNREADFAMILIES_H

#include "store_interface/records/cls_FieldTable.h"

// Families that a store can hold and that decks carry nothing of. The model view always shows none of them.

class kflC_Filter : public cls_AbstractRecordOf<kflC_Filter> {
public:
    static constexpr cls_ClassInfo Class{"kflC_Filter", "a filter of output"};
};

class kfdC_AnalyticalField : public cls_AbstractRecordOf<kfdC_AnalyticalField> {
public:
    static constexpr cls_ClassInfo Class{"kfdC_AnalyticalField", "a field given by a formula"};
};

class kfdC_DiscreteField : public cls_AbstractRecordOf<kfdC_DiscreteField> {
public:
    static constexpr cls_ClassInfo Class{"kfdC_DiscreteField",
                                         "a field given node by node or element by element"};
};

class kopC_Task : public cls_AbstractRecordOf<kopC_Task> {
public:
    static constexpr cls_ClassInfo Class{"kopC_Task", "an optimisation task"};
};

#endif
