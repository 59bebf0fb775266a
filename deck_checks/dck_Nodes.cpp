#include "deck_checks/dck_Nodes.h"

#include "store_interface/model/ddb_ElementTypes.h"

#include <algorithm>

namespace {

dck_Nodes::Key KeyOf(int meshIndex, int node) {
    return (static_cast<dck_Nodes::Key>(static_cast<std::uint32_t>(meshIndex)) << 32U) |
           static_cast<std::uint32_t>(node);
}

/// The places in an element's row of the nodes that a face takes; none for shells and lines, whose facets are
/// not told apart.
std::span<const std::int8_t> NodesOfFacet(const cel_Cell& cell, const ddb_ElementShape& shape, int facet) {
    const bool isNumbered =
        ddb_FaceRuleOf(shape).rule == ddb_FaceRuleEnm::NUMBERED && shape.topologicalDimension > 1;
    if (!isNumbered || facet < 0 || static_cast<std::size_t>(facet) >= cell.sides.size()) return {};
    const cel_Side& side = cell.sides[static_cast<std::size_t>(facet)];
    return {side.nodes.data(), static_cast<std::size_t>(cel_CellOf(side.kind).nodes)};
}

} // namespace

dck_Nodes::dck_Nodes(const odiK_Model& model) {
    meshes_.push_back({cow_String(), model.ConstAssemblyMesh()});
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->meshIndex <= 0) continue;
        const auto index = static_cast<std::size_t>(instance->meshIndex);
        if (meshes_.size() <= index) meshes_.resize(index + 1);
        meshes_[index] = {name, instance->Mesh()};
    }
}

const odiK_Mesh* dck_Nodes::MeshOf(int meshIndex) const {
    const auto index = static_cast<std::size_t>(meshIndex);
    return meshIndex < 0 || index >= meshes_.size() ? nullptr : meshes_[index].mesh.Referent();
}

void dck_Nodes::Append(const rgnC_SubsetData& subset, int kind, std::vector<Key>& nodes) const {
    const odiK_Mesh* mesh = MeshOf(subset.meshIndex);
    if (mesh == nullptr) return;
    if (kind == static_cast<int>(res_SetTypeEnm::NODES)) {
        for (int i = 0; i < subset.subset.Length(); ++i) {
            nodes.push_back(KeyOf(subset.meshIndex, subset.subset[i]));
        }
        return;
    }
    if (subset.classIndex < 0) return;
    const odiK_ElementClass& elements = mesh->Classes()[static_cast<std::size_t>(subset.classIndex)];
    const auto type = ddb_FindElementType(elements.type.View());
    const cel_Cell* cell = type && type->cell ? &cel_CellOf(*type->cell) : nullptr;
    const bool ofFacets = kind == static_cast<int>(res_SetTypeEnm::FACETS);
    if (ofFacets && cell == nullptr) return;
    const auto width = static_cast<std::size_t>(elements.nodesPerElement);
    const std::size_t known = mesh->Nodes().NumWithForeign();
    const auto add = [&](int node) {
        if (node >= 0 && static_cast<std::size_t>(node) < known)
            nodes.push_back(KeyOf(subset.meshIndex, node));
    };
    for (int i = 0; i < subset.subset.Length(); ++i) {
        const std::size_t first = static_cast<std::size_t>(subset.subset[i]) * width;
        std::span<const std::int8_t> places;
        if (ofFacets) places = NodesOfFacet(*cell, elements.shape, subset.facetIds[i]);
        if (places.empty()) {
            for (std::size_t k = 0; k < width; ++k) add(elements.connectivity[first + k]);
        }
        for (const std::int8_t place : places) {
            if (static_cast<std::size_t>(place) >= width) continue;
            add(elements.connectivity[first + static_cast<std::size_t>(place)]);
        }
    }
}

std::vector<dck_Nodes::Key> dck_Nodes::Of(const rgnC_Region& region) const {
    std::vector<Key> nodes;
    if (!region.HasValue()) return nodes;
    const rgnC_SetData& data = region.ConstSet().Data();
    if (data.IsNull()) return nodes;
    for (int i = 0; i < data.NumSubSets(); ++i) Append(data.SubSet(i), data.Kind(), nodes);
    if (!std::ranges::is_sorted(nodes)) std::ranges::sort(nodes);
    nodes.erase(std::unique(nodes.begin(), nodes.end()), nodes.end());
    return nodes;
}

dck_Nodes::Numbers::Numbers(const dck_Nodes& nodes) {
    std::size_t all = 0;
    for (const Entry& entry : nodes.meshes_) {
        begins_.push_back(all);
        if (!entry.mesh.IsNull()) all += entry.mesh->Nodes().NumWithForeign();
    }
    numbers_.resize(all);
}

std::string dck_Nodes::NameOf(Key node) const {
    const Entry& entry = meshes_[static_cast<std::size_t>(node >> 32U)];
    const auto place = static_cast<int>(node & 0xffffffffU);
    const std::string label = std::to_string(entry.mesh->Nodes().Label(place));
    return entry.name.IsEmpty() ? label : std::string(entry.name.View()) + "." + label;
}
