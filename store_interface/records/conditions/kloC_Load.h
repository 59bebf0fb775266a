#ifndef QRX_STORE_KLOC_LOAD_H
#define QRX_STORE_KLOC_LOAD_H

#include "store_interface/model/rgnC_Region.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"

/// State of a load in one step.
class kloC_LoadState : public cls_RecordOf<kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_LoadState", "state of a load in one step"};

    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

/// A force-like quantity on a region, held by name.
class kloC_Load : public kprC_PropagatingOf<kloC_Load, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"kloC_Load", "a load"};

    rgnC_Region region;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::LOAD; }
    /// Whether the load refers to a named field; if so, its name.
    virtual bool UsesField(cow_String& fieldName) const;

    static const cls_FieldTable& Fields();
};

#endif
