#ifndef QRX_STORE_KPFC_FIELD_H
#define QRX_STORE_KPFC_FIELD_H

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/regions/rgnC_Region.h"

/// State of a predefined field in one step.
class kpfC_FieldState : public cls_RecordOf<kpfC_FieldState> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_FieldState", "state of a predefined field in one step"};
};

/// An initial condition in the initial step, a prescribed field in later ones; held by name.
class kpfC_Field : public kprC_PropagatingOf<kpfC_Field, kpfC_FieldState> {
public:
    static constexpr cls_ClassInfo Class{"kpfC_Field", "a predefined field"};

    enum class DistribTypeEnm : int {
        UNIFORM = 0,
        USER_DEFINED = 1,
        FIELD = 2,
        FROM_FILE = 3,
        FROM_FILE_AND_USER_DEFINED = 4,
        GEOSTATIC = 5
    };

    rgnC_Region region;
    DistribTypeEnm distributionType = DistribTypeEnm::UNIFORM;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::FIELD; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kpfC_Field::DistribTypeEnm);

#endif
