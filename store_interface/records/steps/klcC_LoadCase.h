#ifndef QRX_STORE_KLCC_LOADCASE_H
#define QRX_STORE_KLCC_LOADCASE_H

#include "store_interface/records/cls_FieldTable.h"

/// One load case of a linear perturbation step: what acts in it, each with a scale factor. A step holds
/// its load cases in ascending byte order of their names.
class klcC_LoadCase final : public cls_RecordOf<klcC_LoadCase> {
public:
    static constexpr cls_ClassInfo Class{"klcC_LoadCase", "one load case of a step"};

    cow_Map<cow_String, float> bcs;
    cow_Map<cow_String, float> fields;
    cow_Map<cow_String, float> loads;
    bool baseStateBCs = true;
    bool loadsAreStepLoads = false;

    int BcCount() const { return bcs.Count(); }

    static const cls_FieldTable& Fields();
};

#endif
