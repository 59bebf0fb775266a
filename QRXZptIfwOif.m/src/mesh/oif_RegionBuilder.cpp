#include "mesh/oif_RegionBuilder.h"

#include "mesh/oif_Set.h"
#include "mesh/oif_SetName.h"
#include "mesh/oif_Surface.h"

#include <set>

void oif_RegionBuilder::Build() {
    ForEachPartInstance(
        [&](const cow_String&, const ddb_PartInstance& instance) { CreateInstanceRegions(instance); });
    CreateAssemblyRegions();
    CreateContactNodeSets();
}

void oif_RegionBuilder::CreateInstanceRegions(const ddb_PartInstance& instance) {
    const cow_String& name = instance.name();
    for (const ddb_Set& set : instance.mesh().set()) {
        const rgnC_SetData setData = set.set();
        switch (static_cast<res_SetTypeEnm>(setData.Kind())) {
        case res_SetTypeEnm::NODES: AddInstanceDefinition(name, oif_Nset(setData, instance)); break;
        case res_SetTypeEnm::ELEMENTS: AddInstanceDefinition(name, oif_Elset(setData, instance)); break;
        case res_SetTypeEnm::FACETS: AddInstanceDefinition(name, oif_Surface(setData, instance)); break;
        }
    }
}

void oif_RegionBuilder::CreateAssemblyRegions() {
    const ddb_Assembly assembly = Model().RootAssembly();
    // Surfaces stand behind all node and element sets.
    for (const ddb_Set& set : assembly.set()) {
        const rgnC_SetData setData = set.set();
        const auto kind = static_cast<res_SetTypeEnm>(setData.Kind());
        if (kind == res_SetTypeEnm::FACETS) continue;
        std::set<int> meshesDone;
        for (int i = 0; i < setData.NumSubSets(); ++i) {
            const int meshIndex = setData.MeshIndexOfSubSet(i);
            if (!meshesDone.insert(meshIndex).second) continue;
            const auto instance = assembly.instance().FindByMeshIndex(meshIndex);
            if (instance && kind == res_SetTypeEnm::NODES) {
                AddAssemblyDefinition(oif_Nset(setData, *instance, instance->name()));
            } else if (instance) {
                AddAssemblyDefinition(oif_Elset(setData, *instance, instance->name()));
            } else if (assembly.mesh().meshIndex() == meshIndex && kind == res_SetTypeEnm::NODES) {
                AddAssemblyDefinition(oif_Nset(setData, assembly));
            } else if (assembly.mesh().meshIndex() == meshIndex) {
                AddAssemblyDefinition(oif_Elset(setData, assembly));
            }
        }
    }
    for (const ddb_Set& set : assembly.set()) {
        const rgnC_SetData setData = set.set();
        if (setData.Kind() == static_cast<int>(res_SetTypeEnm::FACETS)) {
            AddAssemblyDefinition(oif_Surface(setData, assembly));
        }
    }
}

void oif_RegionBuilder::CreateContactNodeSets() {
    cow_List<rgnC_Region> regions;
    for (const auto& [name, interaction] : Model().Interactions()) {
        regions.Concatenate(interaction.ConstGetContactNodeSets());
    }
    for (const auto& [key, constraint] : Model().Constraints()) {
        regions.Concatenate(constraint.ConstGetContactNodeSets());
    }
    std::set<cow_String> surfacesDone;
    for (const rgnC_Region& region : regions) {
        const oif_SetName name(region, ModelInfo());
        const cow_String surface = name.UniqueSurfaceName(oif_SetName::regionContext::ASSEMBLY);
        const cow_String nodeSet = name.UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
        if (surfacesDone.insert(surface).second)
            AddAssemblyDefinition(oif_Surface(ModelInfo(), surface, nodeSet));
    }
}
