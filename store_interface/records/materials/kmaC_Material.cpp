#include "store_interface/records/materials/kmaC_Material.h"

#include "store_interface/records/cls_ClassRegistrar.h"

void cls_RegisterMaterialRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_MaterialOption>();
    registrar.Add<kmaC_Material>();
}
