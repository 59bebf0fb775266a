// What an import puts into the mesh, once it is settled what becomes of cells and groups.

#include "mesh_file/msf_Source.h"
#include "model_file/mdf_MeshImport.h"

#include <algorithm>
#include <numeric>

namespace {

/// Where the nodes of an element stand in a cell's row.
std::vector<std::size_t> PlacesOf(cel_KindEnm kind, int width) {
    // Decks have the middle node of a line in the middle.
    if (kind == cel_KindEnm::LINE3 && width == 3) return {0, 2, 1};
    std::vector<std::size_t> places(static_cast<std::size_t>(width));
    std::iota(places.begin(), places.end(), std::size_t{0});
    return places;
}

} // namespace

void mdf_MeshImport::MarkNodesOf(const msf_Group& group) {
    for (const int node : group.nodes) {
        char& used = isUsed_[static_cast<std::size_t>(node)];
        if (used == 0) used = 2;
    }
}

/// Nodes of elements stay, and those that groups of points and nodes name.
void mdf_MeshImport::MarkNodes() {
    isUsed_.assign(static_cast<std::size_t>(source_.NumNodes()), 0);
    for (const Elements& elements : elements_) {
        const msf_Block& block = Block(elements.block);
        // Writing chars may change what a member says, as far as the compiler knows.
        char* const used = isUsed_.data();
        const int width = block.Width();
        const int* const end = block.nodes.data() + block.nodes.size();
        for (const int* row = block.nodes.data(); row != end; row += width) {
            for (int i = 0; i < elements.width; ++i) used[row[i]] = 1;
        }
    }
    for (const SetPlan& plan : plans_) {
        const msf_Group& group = source_.groups[plan.group];
        if (plan.content == Content::NODES && group.dimension == 0) MarkNodesOf(group);
        if (plan.nodes != nullptr) MarkNodesOf(*plan.nodes);
    }
    const long long unused = std::count(isUsed_.begin(), isUsed_.end(), 0);
    if (unused == 0) return;
    newPlaces_.resize(isUsed_.size());
    int next = 0;
    for (std::size_t i = 0; i < isUsed_.size(); ++i) newPlaces_[i] = isUsed_[i] != 0 ? next++ : -1;
    Note(msf_Counted(unused, "node") + " of no element and no group of points were left out");
}

void mdf_MeshImport::AddNodes(odiK_Mesh& mesh) {
    std::vector<int>& labels = source_.nodeLabels;
    std::vector<float>& coordinates = source_.coordinates;
    if (!newPlaces_.empty()) {
        std::size_t kept = 0;
        for (std::size_t i = 0; i < newPlaces_.size(); ++i) {
            if (newPlaces_[i] < 0) continue;
            labels[kept] = labels[i];
            std::copy_n(coordinates.begin() + static_cast<std::ptrdiff_t>(3 * i), 3,
                        coordinates.begin() + static_cast<std::ptrdiff_t>(3 * kept));
            ++kept;
        }
        labels.resize(kept);
        coordinates.resize(3 * kept);
    }
    mesh.SetNodes(std::move(labels), std::move(coordinates), problems_);
}

/// The block's own array, made over in place.
std::vector<int> mdf_MeshImport::Connectivity(const Elements& elements) {
    msf_Block& block = source_.blocks[static_cast<std::size_t>(elements.block)];
    const auto width = static_cast<std::size_t>(block.Width());
    const std::vector<std::size_t> places = PlacesOf(block.kind, elements.width);
    const bool inOrder = std::is_sorted(places.begin(), places.end());
    if (newPlaces_.empty() && inOrder && places.size() == width) return std::move(block.nodes);
    std::vector<int> nodes = std::move(block.nodes);
    int row[cel_kMaxNodes];
    std::size_t to = 0;
    for (std::size_t from = 0; from < nodes.size(); from += width) {
        std::copy_n(nodes.begin() + static_cast<std::ptrdiff_t>(from), width, row);
        for (const std::size_t place : places) {
            nodes[to++] = newPlaces_.empty() ? row[place] : newPlaces_[static_cast<std::size_t>(row[place])];
        }
    }
    nodes.resize(to);
    return nodes;
}

void mdf_MeshImport::AddElements(odiK_Mesh& mesh) {
    std::vector<char> inGroup;
    for (std::size_t i = 0; i < source_.blocks.size(); ++i) {
        const msf_Block& block = source_.blocks[i];
        if (IsElementBlock(static_cast<int>(i)) || block.NumCells() == 0) continue;
        inGroup.assign(static_cast<std::size_t>(block.NumCells()), 0);
        for (const SetPlan& plan : plans_) {
            for (const msf_Run& run : source_.groups[plan.group].cells) {
                if (run.block == static_cast<int>(i))
                    std::fill(inGroup.begin() + run.begin, inGroup.begin() + run.end, char{1});
            }
        }
        const long long dropped = std::count(inGroup.begin(), inGroup.end(), 0);
        if (dropped > 0)
            Note("left out: " + msf_Counted(dropped, "cell") + " of kind " +
                 std::string(cel_CellOf(block.kind).name) + ", of no element and in no group");
    }
    // Sets need the nodes of cells, which now move into the mesh.
    for (const SetPlan& plan : plans_) {
        if (plan.content == Content::NODES || plan.content == Content::NODES_OF_FACES)
            nodesOfPlans_[plan.name] = NewPlaces(NodesOf(plan));
    }
    for (const Elements& elements : elements_) {
        const auto controls = request_.controls.find(elements.type);
        std::vector<int>& labels = source_.blocks[static_cast<std::size_t>(elements.block)].labels;
        mesh.AddElementsByIndex(
            cow_String(elements.type), std::move(labels), elements.width, Connectivity(elements),
            controls == request_.controls.end() ? bme_ElemCtrlParams() : controls->second, problems_);
    }
    mesh.FinishElements(problems_);
    for (const auto& [type, controls] : request_.controls) {
        if (std::ranges::none_of(elements_,
                                 [&t = type](const Elements& elements) { return elements.type == t; }))
            Note("the mesh has no elements of type " + type + ", which \"controls\" names");
    }
}

std::vector<int> mdf_MeshImport::NodesOf(const SetPlan& plan) {
    std::vector<int> nodes =
        plan.content == Content::NODES ? NodesOfCells(plan.group) : NodesOfFaces(plan.group);
    if (plan.nodes != nullptr) nodes.insert(nodes.end(), plan.nodes->nodes.begin(), plan.nodes->nodes.end());
    return nodes;
}

std::vector<int> mdf_MeshImport::NodesOfCells(std::size_t place) {
    const msf_Group& group = source_.groups[place];
    if (group.dimension == 0) return group.nodes;
    std::vector<int> nodes;
    for (const msf_Run& run : group.cells) {
        const msf_Block& block = Block(run.block);
        for (const int* node = block.Row(run.begin); node != block.Row(run.end); ++node)
            nodes.push_back(*node);
    }
    std::sort(nodes.begin(), nodes.end());
    nodes.erase(std::unique(nodes.begin(), nodes.end()), nodes.end());
    const auto isUnused = [this](int node) { return isUsed_[static_cast<std::size_t>(node)] != 1; };
    const auto missing = std::erase_if(nodes, isUnused);
    if (missing > 0)
        Note(msf_Counted(static_cast<long long>(missing), "node") + " of group " + fnd_Quoted(group.name) +
             " belong to no element and were left out of its set");
    return nodes;
}

std::vector<int> mdf_MeshImport::NodesOfFaces(std::size_t group) const {
    std::vector<int> nodes;
    for (const msf_Face& face : faces_.at(group)) {
        const Elements& elements =
            elements_[static_cast<std::size_t>(orderOf_[static_cast<std::size_t>(face.block)])];
        const msf_Block& block = Block(face.block);
        const cel_Side& side = cel_CellOf(block.kind).sides[static_cast<std::size_t>(face.side)];
        for (int i = 0; i < cel_CellOf(side.kind).nodes; ++i) {
            const std::int8_t node = side.nodes[static_cast<std::size_t>(i)];
            if (node < elements.width) nodes.push_back(block.Row(face.cell)[node]);
        }
    }
    return nodes;
}

/// In the order of the mesh, each once.
std::vector<int> mdf_MeshImport::NewPlaces(std::vector<int> places) const {
    std::sort(places.begin(), places.end());
    places.erase(std::unique(places.begin(), places.end()), places.end());
    if (!newPlaces_.empty()) {
        for (int& place : places) place = newPlaces_[static_cast<std::size_t>(place)];
    }
    return places;
}

std::vector<msf_Run> mdf_MeshImport::ElementRuns(const msf_Group& group) const {
    std::vector<msf_Run> runs;
    for (msf_Run run : group.cells) {
        if (!IsElementBlock(run.block)) continue;
        run.block = orderOf_[static_cast<std::size_t>(run.block)];
        runs.push_back(run);
    }
    std::sort(runs.begin(), runs.end(), [](const msf_Run& a, const msf_Run& b) {
        return a.block != b.block ? a.block < b.block : a.begin < b.begin;
    });
    std::vector<msf_Run> united;
    for (const msf_Run& run : runs) {
        if (!united.empty() && united.back().block == run.block && run.begin <= united.back().end) {
            united.back().end = std::max(united.back().end, run.end);
        } else {
            united.push_back(run);
        }
    }
    return united;
}

std::vector<mdf_MeshImport::Facet> mdf_MeshImport::FacetsOf(std::size_t group) const {
    std::vector<Facet> facets;
    for (const msf_Face& face : faces_.at(group))
        facets.push_back({orderOf_[static_cast<std::size_t>(face.block)], face.cell, face.side});
    const auto key = [](const Facet& f) { return std::tuple(f.order, f.cell, f.side); };
    std::sort(facets.begin(), facets.end(), [&](const Facet& a, const Facet& b) { return key(a) < key(b); });
    facets.erase(std::unique(facets.begin(), facets.end(),
                             [&](const Facet& a, const Facet& b) { return key(a) == key(b); }),
                 facets.end());
    return facets;
}

void mdf_MeshImport::Remember(const SetPlan& plan, long long members) {
    const msf_Group& group = source_.groups[plan.group];
    const bool nodes = plan.content == Content::NODES || plan.content == Content::NODES_OF_FACES;
    const char* kind = plan.content == Content::ELEMENTS ? "element" : nodes ? "node" : "surface";
    origin_.sets.push_back({plan.name, kind, members, group.name, group.dimension});
}

void mdf_MeshImport::AddSet(odiK_Mesh& mesh, const SetPlan& plan) {
    const auto labelOf = [&](int order, int cell) {
        return mesh.Classes()[static_cast<std::size_t>(order)].labels[static_cast<std::size_t>(cell)];
    };
    std::vector<int> labels;
    std::vector<odiK_FacetInput> facets;
    std::vector<odiK_ElementRun> runs;
    std::size_t members = 0;
    res_SetTypeEnm type = res_SetTypeEnm::FACETS;
    switch (plan.content) {
    case Content::ELEMENTS:
        type = res_SetTypeEnm::ELEMENTS;
        for (const msf_Run& run : ElementRuns(source_.groups[plan.group])) {
            runs.push_back({run.block, run.begin, run.end});
            members += static_cast<std::size_t>(run.end - run.begin);
        }
        break;
    case Content::SHELL_SIDES:
        for (const msf_Run& run : ElementRuns(source_.groups[plan.group])) {
            if (ddb_FaceRuleOf(elements_[static_cast<std::size_t>(run.block)].shape).rule !=
                ddb_FaceRuleEnm::SHELL)
                continue;
            for (int cell = run.begin; cell < run.end; ++cell)
                facets.push_back({labelOf(run.block, cell), 0, {}});
        }
        break;
    case Content::FACES:
        for (const Facet& facet : FacetsOf(plan.group))
            facets.push_back({labelOf(facet.order, facet.cell), facet.side, {}});
        break;
    case Content::NODES_OF_FACES:
    case Content::NODES:
        type = res_SetTypeEnm::NODES;
        for (const int place : nodesOfPlans_[plan.name]) labels.push_back(mesh.Nodes().Label(place));
        break;
    }
    members += facets.size() + labels.size();
    if (members == 0) {
        Note("set " + fnd_Quoted(plan.name) + " would have no members and was left out");
        return;
    }
    mesh.AddSet({cow_String(plan.name), type, false, labels, facets, runs}, problems_);
    Remember(plan, static_cast<long long>(members));
}

/// Where some elements are in no group of elements or in several, sections need a set of all.
void mdf_MeshImport::AddAllElements(odiK_Mesh& mesh) {
    long long covered = 0;
    bool twice = false;
    std::vector<std::vector<char>> marks(elements_.size());
    for (std::size_t i = 0; i < marks.size(); ++i) marks[i].resize(mesh.Classes()[i].labels.size());
    for (const SetPlan& plan : plans_) {
        if (plan.name == kAllElements) return;
        if (plan.content != Content::ELEMENTS) continue;
        for (const msf_Run& run : ElementRuns(source_.groups[plan.group])) {
            std::vector<char>& mark = marks[static_cast<std::size_t>(run.block)];
            twice = twice || std::any_of(mark.begin() + run.begin, mark.begin() + run.end,
                                         [](char m) { return m != 0; });
            std::fill(mark.begin() + run.begin, mark.begin() + run.end, char{1});
            covered += run.end - run.begin;
        }
    }
    if (!twice && covered == mesh.NumElements()) return;
    std::vector<odiK_ElementRun> runs;
    for (const odiK_ElementClass& elements : mesh.Classes())
        runs.push_back({static_cast<int>(runs.size()), 0, elements.NumElements()});
    mesh.AddSet({cow_String(kAllElements), res_SetTypeEnm::ELEMENTS, false, {}, {}, runs}, problems_);
    origin_.sets.push_back({kAllElements, "element", mesh.NumElements(), "", MostDimension()});
}

void mdf_MeshImport::AddSets(odiK_Mesh& mesh) {
    AddAllElements(mesh);
    for (const SetPlan& plan : plans_) AddSet(mesh, plan);
}
