#include "deck_checks/dck_DeckCounts.h"

#include "store_interface/model/odiK_Repositories.h"

#include <algorithm>
#include <string_view>

namespace {

// As when elements are written, capitals count.
bool IsSurfaceElement(const odiK_ElementClass& elements) {
    return elements.type.View().find("SURF") != std::string_view::npos;
}

} // namespace

bool IsSuppressed(const cls_Record& record) {
    const auto* object = dynamic_cast<const kprC_PropagatingObject*>(&record);
    return object != nullptr && object->suppressed;
}

std::set<cow_String> UsedParts(const odiK_Model& model) {
    std::set<cow_String> used;
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->isPartInstance) used.insert(instance->partName);
    }
    return used;
}

void dck_MeshCounts::AddMesh(const odiK_Mesh& mesh) {
    nodes += mesh.Nodes().NumNodes();
    for (const odiK_ElementClass& elements_ : mesh.Classes()) {
        (IsSurfaceElement(elements_) ? surfaceElements : elements) += elements_.NumElements();
    }
    AddSets(mesh.Sets());
}

void dck_MeshCounts::AddSets(const std::vector<cow_CountedHld<odiK_Set>>& sets) {
    for (const auto& set : sets) {
        switch (set->type) {
        case res_SetTypeEnm::NODES: ++nodeSets; break;
        case res_SetTypeEnm::ELEMENTS: ++elementSets; break;
        case res_SetTypeEnm::FACETS: ++surfaces; break;
        }
    }
}

dck_MeshCounts dck_MeshCounts::Of(const odiK_Model& model) {
    dck_MeshCounts counts;
    for (const auto& [name, instance] : model.Instances()) {
        const auto mesh = instance->Mesh();
        if (instance->isPartInstance && !mesh.IsNull()) counts.AddMesh(*mesh);
    }
    counts.AddSets(model.AssemblySets());
    return counts;
}

std::vector<dck_KindCount> dck_CountsOfDeck(const odiK_Model& model) {
    const dck_MeshCounts mesh = dck_MeshCounts::Of(model);
    const auto instances = std::count_if(model.Instances().begin(), model.Instances().end(),
                                         [](const auto& entry) { return entry.second->isPartInstance; });
    std::vector<dck_KindCount> counts = {
        {"parts", "parts", static_cast<long long>(UsedParts(model).size())},
        {"instances", "instances", instances},
        {"nodes", "nodes", mesh.nodes},
        {"elements", "elements", mesh.elements},
        {"nodeSets", "node sets", mesh.nodeSets},
        {"elementSets", "element sets", mesh.elementSets},
        {"surfaces", "surfaces", mesh.surfaces},
        {"steps", "steps", model.steps.Size()},
    };
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!repository.ReachesDeck() || repository.IsInOrder()) continue;
        long long count = 0;
        for (const auto& [name, record] : repository.In(model)) {
            if (!IsSuppressed(record)) ++count;
        }
        counts.push_back({repository.member, repository.plural, count});
    }
    std::erase_if(counts, [](const dck_KindCount& count) { return count.count == 0; });
    return counts;
}
