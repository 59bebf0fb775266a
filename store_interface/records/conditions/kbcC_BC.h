#ifndef QRX_STORE_KBCC_BC_H
#define QRX_STORE_KBCC_BC_H

#include "store_interface/model/rgnC_Region.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"

/// State of a boundary condition in one step.
class kbcC_BCState : public cls_RecordOf<kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_BCState", "state of a boundary condition in one step"};

    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

/// A prescribed value on the degrees of freedom of a region, held by name.
class kbcC_BC : public kprC_PropagatingOf<kbcC_BC, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_BC", "a boundary condition"};

    enum class DistribTypeEnum : int { UNIFORM = 0, USER_DEFINED = 1, FIELD = 2 };

    rgnC_Region region;
    dtmC_DatumRef datum;
    DistribTypeEnum distributionType = DistribTypeEnum::UNIFORM;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::BOUNDARY_CONDITION; }
    /// Whether the change made in the step can't be told by adding to what is there. Asked for statuses 3
    /// and 10.
    virtual bool ModifiedNeedsOpNew(const cow_String& stepName) const;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kbcC_BC::DistribTypeEnum);

void cls_RegisterConditionRecords(cls_ClassRegistrar& registrar);

#endif
