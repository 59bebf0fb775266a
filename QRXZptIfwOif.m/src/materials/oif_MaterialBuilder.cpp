#include "materials/oif_MaterialBuilder.h"

#include "base/oif_Comment.h"
#include "materials/oif_Material.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

bool HasGasketOptions(const kmaC_Material& material) {
    return !material.thicknessBehavior.IsNull() || !material.transShearElastic.IsNull() ||
           !material.membraneElastic.IsNull();
}

} // namespace

void oif_MaterialBuilder::Build() {
    const mdl_MapString2ObjCow<kmaC_Material>& materials = Model().Materials();
    if (!materials.IsEmpty()) AddModelDefinition(oif_Comment("\nMATERIALS\n"));
    for (mdl_MapString2ObjCowIT<kmaC_Material> it(materials); !it.IsDone(); it.Next()) {
        const kmaC_Material& material = it.CurrentValue();
        // Gasket options that no gasket section refers to are left out of the deck without a word.
        if (HasGasketOptions(material) && IsOfGasketSection(it.CurrentKey())) {
            AddModelDefinition(oif_GasketBehavior(it.CurrentKey(), material));
        } else {
            AddModelDefinition(oif_Material(it.CurrentKey(), material));
        }
    }
}

bool oif_MaterialBuilder::IsOfGasketSection(const cow_String& materialName) const {
    for (mdl_MapString2ObjCowIT<kseC_Section> it(Model().Sections()); !it.IsDone(); it.Next()) {
        if (it.CurrentValue().DynTypeId() != kseC_GasketSection::TypeId()) continue;
        const auto& section = nex_canDynamicCastRef<kseC_GasketSection>(it.CurrentValue(), NEX_HERE);
        if (section.materialName == materialName) return true;
    }
    return false;
}
