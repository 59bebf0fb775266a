#include "materials/oif_MaterialBuilder.h"

#include "base/oif_Comment.h"
#include "materials/oif_Material.h"

void oif_MaterialBuilder::Build() {
    const mdl_MapString2ObjCow<kmaC_Material>& materials = Model().Materials();
    if (!materials.IsEmpty()) AddModelDefinition(oif_Comment("\nMATERIALS\n"));
    const std::set<cow_String> ofGaskets = oif_MaterialsOfGaskets(Model().Sections());
    for (const auto& [name, material] : materials) {
        if (ofGaskets.count(name) != 0 && oif_HasGasketOptions(material)) {
            AddModelDefinition(oif_GasketBehavior(name, material));
        } else {
            AddModelDefinition(oif_Material(name, material));
        }
    }
}
