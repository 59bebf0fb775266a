#ifndef QRX_STORE_KSEC_SECTION_H
#define QRX_STORE_KSEC_SECTION_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

/// What an element set is made of; held by name in the model's section map.
class kseC_Section : public cls_AbstractRecordOf<kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_Section", "what an element set is made of"};

    /// The material, of sections that name one for the whole set; else empty.
    virtual cow_String MaterialName() const { return {}; }
    /// Shells with rebar layers.
    virtual bool HasRebar() const { return false; }
    /// Some rebar layer has no orientation of its own.
    virtual bool UsesRebarOrientation() const { return false; }
    /// Appends the names of orientations in layers that the list doesn't hold yet.
    virtual void AddUserOrientations(cow_List<cow_String>&) const {}
    /// The number of temperature points through the thickness; 0 for a gradient. The argument is ignored.
    virtual int NumTempPoints(bool) const { return 0; }
};

void cls_RegisterSectionRecords(cls_ClassRegistrar& registrar);

#endif
