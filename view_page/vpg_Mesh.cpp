#include "view_page/vpg_Mesh.h"

#include "store_interface/model/ddb_ElementTypes.h"
#include "view_page/vpg_GroupByNodes.h"

#include <algorithm>
#include <map>

namespace {

constexpr std::int8_t kWhole[cel_kMaxNodes] = {0,  1,  2,  3,  4,  5,  6,  7,  8,  9,  10, 11, 12, 13,
                                               14, 15, 16, 17, 18, 19, 20, 21, 22, 23, 24, 25, 26};

/// All sides of a mesh's solids, counted through the classes.
class SolidSides {
public:
    struct Place {
        int classIndex;
        int element;
        int side;
    };
    using Corners = std::array<int, 4>;

    explicit SolidSides(const odiK_Mesh& mesh) {
        for (std::size_t i = 0; i < mesh.Classes().size(); ++i) {
            const odiK_ElementClass& elements = mesh.Classes()[i];
            const cel_Cell* cell = vpg_CellOf(elements);
            if (cell == nullptr || cell->dimension != 3) continue;
            runs_.push_back({size_, static_cast<int>(i), cell, &elements});
            size_ += cell->sides.size() * static_cast<std::size_t>(elements.NumElements());
        }
    }
    std::size_t Size() const { return size_; }
    Place PlaceOf(std::size_t item) const {
        const Run& run = RunOf(item);
        const std::size_t sides = run.cell->sides.size();
        const std::size_t place = item - run.first;
        return {run.classIndex, static_cast<int>(place / sides), static_cast<int>(place % sides)};
    }
    /// The corners in ascending order, behind a triangle's the largest number.
    Corners CornersOf(std::size_t item) const {
        const Run& run = RunOf(item);
        const std::size_t sides = run.cell->sides.size();
        const std::size_t place = item - run.first;
        const cel_Side& side = run.cell->sides[place % sides];
        const int* row = run.elements->connectivity.data() +
                         place / sides * static_cast<std::size_t>(run.elements->nodesPerElement);
        Corners corners{row[side.nodes[0]], row[side.nodes[1]], row[side.nodes[2]], INT32_MAX};
        if (cel_CellOf(side.kind).corners == 4) corners[3] = row[side.nodes[3]];
        std::ranges::sort(corners);
        return corners;
    }

private:
    struct Run {
        std::size_t first;
        int classIndex;
        const cel_Cell* cell;
        const odiK_ElementClass* elements;
    };

    const Run& RunOf(std::size_t item) const {
        std::size_t place = runs_.size() - 1;
        while (runs_[place].first > item) --place;
        return runs_[place];
    }

    std::vector<Run> runs_;
    std::size_t size_ = 0;
};

bool IsConnector(const odiK_ElementClass& elements) {
    const ddb_ElementFamily* family = ddb_FamilyOf(elements.type.View());
    return family != nullptr && family->beginning == "CONN";
}

} // namespace

const char* vpg_WordOf(vpg_RoleEnm role) {
    switch (role) {
    case vpg_RoleEnm::SOLID: return "solid";
    case vpg_RoleEnm::SHELL: return "shell";
    case vpg_RoleEnm::SHEET: return "sheet";
    case vpg_RoleEnm::LINE: return "line";
    case vpg_RoleEnm::CONNECTOR: return "connector";
    case vpg_RoleEnm::POINT: return "point";
    case vpg_RoleEnm::UNKNOWN: return "unknown";
    case vpg_RoleEnm::FACET: return "facet";
    }
    return "";
}

const cel_Cell* vpg_CellOf(const odiK_ElementClass& elements) {
    const std::optional<ddb_ElementType> type = ddb_FindElementType(elements.type.View());
    const auto has = [&](const cel_Cell& cell) { return cell.nodes == elements.nodesPerElement; };
    if (type && type->cell && has(cel_CellOf(*type->cell))) return &cel_CellOf(*type->cell);
    if (elements.shape.unknown) return nullptr;
    // Springs, masses and the like, which may have as many nodes as they please.
    const int dimension = elements.shape.topologicalDimension;
    if (dimension == 1 && elements.nodesPerElement >= 2) return &cel_CellOf(cel_KindEnm::LINE2);
    if (elements.nodesPerElement == 1) return &cel_CellOf(cel_KindEnm::POINT1);
    return nullptr;
}

vpg_Mesh::vpg_Mesh(const odiK_Mesh& mesh, std::vector<float> foreign)
    : mesh_(mesh), foreign_(std::move(foreign)),
      numNodes_(mesh.Nodes().NumNodes() + static_cast<int>(foreign_.size() / 3)) {
    AddSkin();
    for (int i = 0; i < static_cast<int>(mesh.Classes().size()); ++i) AddElements(i);
    Number();
}

std::array<float, 3> vpg_Mesh::Place(int node) const {
    const int own = mesh_.Nodes().NumNodes();
    const float* xyz = node < own ? mesh_.Nodes().coordinates.data() + 3 * vpg_Index(node)
                                  : foreign_.data() + 3 * vpg_Index(node - own);
    return {xyz[0], xyz[1], xyz[2]};
}

void vpg_Mesh::AddSkin() {
    const SolidSides sides(mesh_);
    std::vector<std::uint32_t> skin;
    vpg_GroupByNodes(
        sides.Size(), vpg_Index(numNodes_), [&](std::size_t item) { return sides.CornersOf(item)[0]; },
        [&](std::size_t item) { return sides.CornersOf(item); },
        [&](std::span<const std::uint32_t> same) {
            if (same.size() == 1) skin.push_back(same.front());
        });
    std::ranges::sort(skin);
    for (const std::uint32_t item : skin) {
        const SolidSides::Place place = sides.PlaceOf(item);
        const odiK_ElementClass& elements = mesh_.Classes()[vpg_Index(place.classIndex)];
        const cel_Side& side = vpg_CellOf(elements)->sides[vpg_Index(place.side)];
        AddCell(BlockFor(vpg_RoleEnm::SOLID, side.kind, place.classIndex), place.element, place.side,
                elements.connectivity.data() + vpg_Index(place.element) * vpg_Index(elements.nodesPerElement),
                side.nodes.data());
    }
}

void vpg_Mesh::AddElements(int classIndex) {
    const odiK_ElementClass& elements = mesh_.Classes()[vpg_Index(classIndex)];
    const cel_Cell* cell = vpg_CellOf(elements);
    if (elements.NumElements() == 0 || elements.nodesPerElement == 0) return;
    if (cell != nullptr && cell->dimension == 3) return;
    vpg_RoleEnm role = vpg_RoleEnm::UNKNOWN;
    if (cell != nullptr && cell->dimension == 0) role = vpg_RoleEnm::POINT;
    if (cell != nullptr && cell->dimension == 1) {
        role = IsConnector(elements) ? vpg_RoleEnm::CONNECTOR : vpg_RoleEnm::LINE;
    }
    if (cell != nullptr && cell->dimension == 2) {
        role = elements.shape.shell ? vpg_RoleEnm::SHELL : vpg_RoleEnm::SHEET;
    }
    vpg_Block& block = BlockFor(role, cell == nullptr ? cel_KindEnm::POINT1 : cell->kind, classIndex);
    const int* row = elements.connectivity.data();
    for (int i = 0; i < elements.NumElements(); ++i, row += elements.nodesPerElement) {
        AddCell(block, i, -1, row, kWhole);
    }
}

vpg_Block& vpg_Mesh::BlockFor(vpg_RoleEnm role, cel_KindEnm kind, int classIndex) {
    const auto fits = [&](const vpg_Block& block) {
        return block.role == role && block.kind == kind && block.classIndex == classIndex;
    };
    const auto known = std::find_if(blocks_.rbegin(), blocks_.rend(), fits);
    if (known != blocks_.rend()) return *known;
    blocks_.push_back({role, kind, classIndex, 0, {}, {}, {}});
    return blocks_.back();
}

int vpg_Mesh::AddCell(vpg_Block& block, int element, int side, const int* row, const std::int8_t* places) {
    for (int i = 0; i < cel_CellOf(block.kind).nodes; ++i) block.nodes.push_back(row[places[i]]);
    block.elements.push_back(element);
    if (side >= 0) block.sides.push_back(side);
    return block.NumCells() - 1;
}

void vpg_Mesh::Number() {
    for (vpg_Block& block : blocks_) {
        block.firstCell = numCells_;
        numCells_ += block.NumCells();
    }
    cellOf_.reserve(vpg_Index(numCells_));
    for (const vpg_Block& block : blocks_) {
        const int first = FirstElement(block.classIndex);
        for (int i = 0; i < block.NumCells(); ++i) {
            const int side = block.sides.empty() ? -1 : block.sides[vpg_Index(i)];
            cellOf_.emplace_back(KeyOf(first + block.elements[vpg_Index(i)], side), block.firstCell + i);
        }
    }
    std::ranges::sort(cellOf_);
}

int vpg_Mesh::FindCell(std::uint64_t key) const {
    const auto place = std::ranges::lower_bound(cellOf_, Entry(key, 0));
    if (place != cellOf_.end() && place->first == key) return place->second;
    const auto facet = facets_.find(key);
    return facet == facets_.end() ? -1 : facet->second;
}

int vpg_Mesh::CellOfFacet(int classIndex, int element, int side) {
    const odiK_ElementClass& elements = mesh_.Classes()[vpg_Index(classIndex)];
    const int place = FirstElement(classIndex) + element;
    if (ddb_FaceRuleOf(elements.shape).rule == ddb_FaceRuleEnm::SHELL) return FindCell(KeyOf(place, -1));
    const int known = FindCell(KeyOf(place, side));
    return known >= 0 ? known : AddFacet(classIndex, element, side);
}

int vpg_Mesh::AddFacet(int classIndex, int element, int side) {
    const odiK_ElementClass& elements = mesh_.Classes()[vpg_Index(classIndex)];
    const cel_Cell* cell = vpg_CellOf(elements);
    if (cell == nullptr || side < 0 || vpg_Index(side) >= cell->sides.size()) return -1;
    const cel_Side& facet = cell->sides[vpg_Index(side)];
    // A block of its own for each run of facets, since cells are numbered when they come.
    const bool goesOn = !blocks_.empty() && blocks_.back().role == vpg_RoleEnm::FACET &&
                        blocks_.back().kind == facet.kind && blocks_.back().classIndex == classIndex;
    if (!goesOn) blocks_.push_back({vpg_RoleEnm::FACET, facet.kind, classIndex, numCells_, {}, {}, {}});
    AddCell(blocks_.back(), element, side,
            elements.connectivity.data() + vpg_Index(element) * vpg_Index(elements.nodesPerElement),
            facet.nodes.data());
    facets_.emplace(KeyOf(FirstElement(classIndex) + element, side), numCells_);
    return numCells_++;
}

void vpg_Mesh::AppendCellsOf(int element, std::vector<int>& cells) const {
    auto place = std::ranges::lower_bound(cellOf_, Entry(KeyOf(element, -1), 0));
    for (; place != cellOf_.end() && place->first < KeyOf(element + 1, -1); ++place) {
        cells.push_back(place->second);
    }
}

std::vector<int> vpg_Mesh::ElementsOfCells() const {
    std::vector<int> elements;
    elements.reserve(vpg_Index(numCells_));
    for (const vpg_Block& block : blocks_) {
        for (const int element : block.elements) elements.push_back(FirstElement(block.classIndex) + element);
    }
    return elements;
}

std::vector<std::pair<std::string, int>> vpg_Mesh::UnknownTypes() const {
    std::map<std::string, int> counts;
    for (const vpg_Block& block : blocks_) {
        if (block.role != vpg_RoleEnm::UNKNOWN) continue;
        counts[std::string(mesh_.Classes()[vpg_Index(block.classIndex)].type.View())] += block.NumCells();
    }
    return {counts.begin(), counts.end()};
}
