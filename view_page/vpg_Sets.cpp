#include "view_page/vpg_Sets.h"

#include <algorithm>

namespace {

/// The facet of a shell that is its negative side.
constexpr int kNegativeSide = 1;

void AddBox(const vpg_Mesh& mesh, const int* nodes, int count, vpg_Box& box) {
    for (int i = 0; i < count; ++i) box.Add(mesh.Place(nodes[i]));
}

void AddNodes(const vpg_Mesh& mesh, const rgnC_SubsetData& subset, vpg_SetPart& part) {
    for (int i = 0; i < subset.subset.Length(); ++i) {
        part.nodes.push_back(subset.subset.UncheckedConstGet(i));
        part.box.Add(mesh.Place(part.nodes.back()));
    }
}

void AddElements(const vpg_Mesh& mesh, const rgnC_SubsetData& subset, std::vector<bool>& marked,
                 vpg_SetPart& part) {
    const odiK_ElementClass& elements = mesh.Mesh().Classes()[static_cast<std::size_t>(subset.classIndex)];
    for (int i = 0; i < subset.subset.Length(); ++i) {
        const int element = subset.subset.UncheckedConstGet(i);
        const auto row =
            static_cast<std::size_t>(element) * static_cast<std::size_t>(elements.nodesPerElement);
        AddBox(mesh, elements.connectivity.data() + row, elements.nodesPerElement, part.box);
        const int place = elements.firstElementIndex + element;
        if (marked.empty()) {
            mesh.AppendCellsOf(place, part.cells);
        } else {
            marked[static_cast<std::size_t>(place)] = true;
        }
    }
}

void AddFacets(vpg_Mesh& mesh, const rgnC_SubsetData& subset, vpg_SetPart& part) {
    const odiK_ElementClass& elements = mesh.Mesh().Classes()[static_cast<std::size_t>(subset.classIndex)];
    const bool hasTwoSides = ddb_FaceRuleOf(elements.shape).rule == ddb_FaceRuleEnm::SHELL;
    for (int i = 0; i < subset.subset.Length(); ++i) {
        const int side = subset.facetIds.UncheckedConstGet(i);
        const int element = subset.subset.UncheckedConstGet(i);
        const auto row =
            static_cast<std::size_t>(element) * static_cast<std::size_t>(elements.nodesPerElement);
        AddBox(mesh, elements.connectivity.data() + row, elements.nodesPerElement, part.box);
        const int cell = mesh.CellOfFacet(subset.classIndex, element, side);
        if (cell < 0) continue;
        (hasTwoSides && side == kNegativeSide ? part.negative : part.cells).push_back(cell);
    }
}

void MakeAscending(std::vector<int>& places) {
    std::ranges::sort(places);
    places.erase(std::unique(places.begin(), places.end()), places.end());
}

} // namespace

void vpg_Box::Add(const std::array<float, 3>& place) {
    for (std::size_t i = 0; i < 3; ++i) {
        low[i] = std::min(low[i], place[i]);
        high[i] = std::max(high[i], place[i]);
    }
}

vpg_SetPart vpg_PartOfSet(vpg_Mesh& mesh, res_SetTypeEnm type, std::span<const rgnC_SubsetData> subsets) {
    vpg_SetPart part;
    for (const rgnC_SubsetData& subset : subsets) part.count += subset.subset.Length();
    // The elements of a large set are marked, and the cells then asked; those of a small one are looked up.
    std::vector<bool> marked;
    if (type == res_SetTypeEnm::ELEMENTS && part.count > mesh.NumCells() / 16) {
        marked.resize(static_cast<std::size_t>(mesh.Mesh().NumElements()));
    }
    for (const rgnC_SubsetData& subset : subsets) {
        if (type == res_SetTypeEnm::NODES) AddNodes(mesh, subset, part);
        if (type == res_SetTypeEnm::ELEMENTS) AddElements(mesh, subset, marked, part);
        if (type == res_SetTypeEnm::FACETS) AddFacets(mesh, subset, part);
    }
    if (!marked.empty()) {
        for (const vpg_Block& block : mesh.Blocks()) {
            if (block.role == vpg_RoleEnm::FACET) continue;
            const int first = mesh.FirstElement(block.classIndex);
            for (int i = 0; i < block.NumCells(); ++i) {
                const int element = first + block.elements[static_cast<std::size_t>(i)];
                if (marked[static_cast<std::size_t>(element)]) part.cells.push_back(block.firstCell + i);
            }
        }
    }
    MakeAscending(part.cells);
    MakeAscending(part.negative);
    MakeAscending(part.nodes);
    return part;
}
