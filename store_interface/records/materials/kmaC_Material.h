#ifndef QRX_STORE_KMAC_MATERIAL_H
#define QRX_STORE_KMAC_MATERIAL_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

/// One property or behaviour of a material.
class kmaC_MaterialOption : public cls_AbstractRecordOf<kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MaterialOption", "one property or behaviour of a material"};
};

/// One material of the model, held by name.
class kmaC_Material final : public cls_RecordOf<kmaC_Material> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_Material", "one material of the model"};
};

void cls_RegisterMaterialRecords(cls_ClassRegistrar& registrar);

#endif
