#include "model_file/mdf_MeshImport.h"

#include "foundation/cel_LabelIndex.h"
#include "mesh_file/msf_Source.h"
#include "store_interface/model/ddb_ElementTypes.h"

#include <algorithm>
#include <numeric>
#include <set>

namespace {

constexpr const char* kNodesEnding = "_NODES";
constexpr const char* kSidesEnding = "_SPOS";

struct FamilyTypes {
    const char* word; // empty: solids
    cel_KindEnm kind;
    const char* type;
};
using Kind = cel_KindEnm;
constexpr FamilyTypes kDefaults[] = {
    {"", Kind::TETRA4, "C3D4"},
    {"", Kind::TETRA10, "C3D10"},
    {"", Kind::HEXAHEDRON8, "C3D8"},
    {"", Kind::HEXAHEDRON20, "C3D20"},
    {"", Kind::HEXAHEDRON27, "C3D20"},
    {"", Kind::WEDGE6, "C3D6"},
    {"", Kind::WEDGE15, "C3D15"},
    {"", Kind::PYRAMID5, "C3D5"},
    {"shell", Kind::TRIANGLE3, "S3"},
    {"shell", Kind::TRIANGLE6, "STRI65"},
    {"shell", Kind::QUAD4, "S4"},
    {"shell", Kind::QUAD8, "S8R"},
    {"shell", Kind::QUAD9, "S8R"},
    {"membrane", Kind::TRIANGLE3, "M3D3"},
    {"membrane", Kind::TRIANGLE6, "M3D6"},
    {"membrane", Kind::QUAD4, "M3D4"},
    {"membrane", Kind::QUAD8, "M3D8"},
    {"membrane", Kind::QUAD9, "M3D9"},
    {"plane stress", Kind::TRIANGLE3, "CPS3"},
    {"plane stress", Kind::TRIANGLE6, "CPS6"},
    {"plane stress", Kind::QUAD4, "CPS4"},
    {"plane stress", Kind::QUAD8, "CPS8"},
    {"plane stress", Kind::QUAD9, "CPS8"},
    {"plane strain", Kind::TRIANGLE3, "CPE3"},
    {"plane strain", Kind::TRIANGLE6, "CPE6"},
    {"plane strain", Kind::QUAD4, "CPE4"},
    {"plane strain", Kind::QUAD8, "CPE8"},
    {"plane strain", Kind::QUAD9, "CPE8"},
    {"axisymmetric", Kind::TRIANGLE3, "CAX3"},
    {"axisymmetric", Kind::TRIANGLE6, "CAX6"},
    {"axisymmetric", Kind::QUAD4, "CAX4"},
    {"axisymmetric", Kind::QUAD8, "CAX8"},
    {"axisymmetric", Kind::QUAD9, "CAX8"},
};

std::string NameOf(cel_KindEnm kind) {
    return std::string(cel_CellOf(kind).name);
}

bool IsShell(const ddb_ElementShape& shape) {
    return ddb_FaceRuleOf(shape).rule == ddb_FaceRuleEnm::SHELL;
}

bool HasNumberedFaces(const ddb_ElementShape& shape) {
    const ddb_FaceRule rule = ddb_FaceRuleOf(shape);
    return rule.rule == ddb_FaceRuleEnm::NUMBERED && std::string_view(rule.prefix) == "S";
}

std::string GroupText(const msf_Group& group) {
    return fnd_Quoted(group.name) + " of dimension " + std::to_string(group.dimension);
}

} // namespace

const std::vector<std::string>& mdf_SurfaceFamilies() {
    static const std::vector<std::string> words = [] {
        std::vector<std::string> found;
        for (const FamilyTypes& row : kDefaults) {
            if (*row.word != '\0' && (found.empty() || found.back() != row.word))
                found.emplace_back(row.word);
        }
        return found;
    }();
    return words;
}

bool mdf_MeshImport::Fill(odiK_Mesh& mesh) {
    Describe();
    if (!ChooseTypes()) return false;
    RenumberElements();
    if (!NameGroups() || !CheckNames() || !MatchFaces()) return false;
    for (const std::string& note : source_.notes) Note(note);
    MarkNodes();
    AddNodes(mesh);
    AddElements(mesh);
    AddSets(mesh);
    origin_.mesh = &mesh;
    return true;
}

void mdf_MeshImport::Describe() {
    origin_.format = source_.format;
    origin_.groups = static_cast<long long>(source_.groups.size());
    for (const msf_Block& block : source_.blocks) {
        if (block.NumCells() > 0) origin_.cells.emplace_back(NameOf(block.kind), block.NumCells());
    }
}

void mdf_MeshImport::Note(std::string text) {
    origin_.notes.push_back(text);
    problems_.Add("mesh-file-note", "/file", std::move(text));
}

bool mdf_MeshImport::Fail(std::string found, std::string expected, std::string hint) {
    problems_.Add("mesh-file", "/file", std::move(found), std::move(expected), std::move(hint));
    return false;
}

const char* mdf_MeshImport::DefaultType(cel_KindEnm kind) const {
    const int dimension = cel_CellOf(kind).dimension;
    const bool hasSolids = std::ranges::any_of(source_.blocks, [](const msf_Block& block) {
        return block.NumCells() > 0 && cel_CellOf(block.kind).dimension == 3;
    });
    std::string_view family;
    if (dimension == 2)
        family = request_.surfaceElements.empty() ? "shell" : std::string_view(request_.surfaceElements);
    // Beside solids, surfaces are boundaries unless elements of them are asked for.
    const bool wanted =
        dimension == 3 || (dimension == 2 && (!hasSolids || !request_.surfaceElements.empty()));
    if (!wanted) return "";
    for (const FamilyTypes& row : kDefaults) {
        if (row.kind == kind && row.word == family) return row.type;
    }
    return nullptr;
}

bool mdf_MeshImport::ChooseType(int block, std::string& type) {
    const cel_KindEnm kind = Block(block).kind;
    const auto asked = request_.elementTypes.find(kind);
    if (asked != request_.elementTypes.end()) {
        type = asked->second;
        return true;
    }
    const char* byDefault = DefaultType(kind);
    if (byDefault == nullptr) {
        return Fail("found " + msf_Counted(Block(block).NumCells(), "cell") + " of kind " + NameOf(kind) +
                        ", which no element type stands for",
                    "the type in \"elementTypes\": {\"" + NameOf(kind) + "\": ...}, or null for none");
    }
    type = byDefault;
    return true;
}

bool mdf_MeshImport::CheckType(cel_KindEnm kind, const std::string& type, Elements& elements) {
    const cel_Cell& cell = cel_CellOf(kind);
    elements.width = cell.nodes;
    elements.shape = ddb_ShapeOfLabel(type);
    const std::optional<ddb_ElementType> known = ddb_FindElementType(type);
    if (!known) {
        problems_.Add("unknown-element-type", "/elementTypes/" + NameOf(kind),
                      fnd_Quoted(type) + " is no known element type; it is taken for " +
                          (elements.shape.unknown ? "a point element" : "one of its family"));
        return true;
    }
    if (!known->cell) return true;
    const cel_Cell& wanted = cel_CellOf(*known->cell);
    if (wanted.dimension != cell.dimension || wanted.corners != cell.corners || wanted.nodes > cell.nodes) {
        return Fail("found type " + fnd_Quoted(type) + " for cells of kind " + NameOf(kind),
                    "a type of " + std::to_string(cell.nodes) + " nodes",
                    "elements of type " + type + " are of kind " + std::string(wanted.name));
    }
    elements.width = wanted.nodes;
    return true;
}

bool mdf_MeshImport::ChooseTypes() {
    orderOf_.assign(source_.blocks.size(), -1);
    for (const auto& [kind, type] : request_.elementTypes) {
        if (std::ranges::none_of(source_.blocks,
                                 [k = kind](const msf_Block& block) { return block.kind == k; }))
            Note("the file has no cells of kind " + NameOf(kind) + ", which \"elementTypes\" names");
    }
    for (std::size_t i = 0; i < source_.blocks.size(); ++i) {
        if (source_.blocks[i].NumCells() == 0) continue;
        Elements elements;
        elements.block = static_cast<int>(i);
        if (!ChooseType(elements.block, elements.type)) return false;
        if (elements.type.empty()) continue;
        if (!CheckType(source_.blocks[i].kind, elements.type, elements)) return false;
        elements_.push_back(std::move(elements));
    }
    std::sort(elements_.begin(), elements_.end(), [this](const Elements& a, const Elements& b) {
        const cel_Cell& left = cel_CellOf(Block(a.block).kind);
        const cel_Cell& right = cel_CellOf(Block(b.block).kind);
        return left.dimension != right.dimension ? left.dimension > right.dimension : left.kind < right.kind;
    });
    for (std::size_t i = 0; i < elements_.size(); ++i)
        orderOf_[static_cast<std::size_t>(elements_[i].block)] = static_cast<int>(i);
    if (elements_.empty()) {
        return Fail("found no cells that make elements",
                    "solids or surfaces, or \"elementTypes\" for what there is",
                    "a mesh of lines takes \"elementTypes\": {\"line2\": \"B31\"}");
    }
    return true;
}

int mdf_MeshImport::MostDimension() const {
    return cel_CellOf(Block(elements_.front().block).kind).dimension;
}

/// Formats that number each kind of cells anew can't keep these numbers.
void mdf_MeshImport::RenumberElements() {
    if (source_.oneNumbering) return;
    std::vector<int> labels;
    for (const Elements& elements : elements_) {
        const std::vector<int>& own = Block(elements.block).labels;
        labels.insert(labels.end(), own.begin(), own.end());
    }
    if (cel_LabelIndex().Build(labels).empty()) return;
    int next = 1;
    for (const Elements& elements : elements_) {
        std::vector<int>& own = source_.blocks[static_cast<std::size_t>(elements.block)].labels;
        std::iota(own.begin(), own.end(), next);
        next += static_cast<int>(own.size());
    }
    Note(msf_Counted(next - 1, "element") + " were numbered anew, since labels repeat from kind to kind");
}

bool mdf_MeshImport::NameGroup(std::size_t place, std::string& name) {
    const msf_Group& group = source_.groups[place];
    const std::string exact = group.name + "@" + std::to_string(group.dimension);
    name = group.name;
    bool renamed = false;
    for (const auto& [from, to] : request_.groups) {
        if (from != exact && (from != group.name || renamed)) continue;
        name = to;
        renamed = true;
        if (from == exact) break;
    }
    if (renamed && name.empty()) {
        Note("group " + GroupText(group) + " was left out, as \"groups\" says");
        return false;
    }
    return true;
}

bool mdf_MeshImport::NameGroups() {
    std::vector<std::size_t> order(source_.groups.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    std::sort(order.begin(), order.end(), [this](std::size_t a, std::size_t b) {
        const msf_Group& left = source_.groups[a];
        const msf_Group& right = source_.groups[b];
        return left.dimension != right.dimension ? left.dimension > right.dimension : left.name < right.name;
    });
    std::vector<std::string> known;
    for (const msf_Group& group : source_.groups) {
        known.push_back(group.name);
        known.push_back(group.name + "@" + std::to_string(group.dimension));
    }
    bool good = true;
    for (const auto& [from, to] : request_.groups) {
        if (std::find(known.begin(), known.end(), from) != known.end()) continue;
        std::string place = "/groups";
        fnd_AppendPointer(place, from);
        problems_.Add("no-such-name", place, "found " + fnd_Quoted(from), "the name of a group of the file",
                      fnd_DidYouMean(from, known));
        good = false;
    }
    for (const std::size_t group : order) {
        std::string name;
        if (!NameGroup(group, name)) continue;
        const fnd_NameProblem problem = fnd_ProblemOfName(name);
        if (!problem.found.empty()) {
            good = Fail("found " + problem.found + " of group " + msf_Shown(name), problem.expected,
                        "give it another name in \"groups\"");
            continue;
        }
        if (!JoinNodes(group, name)) PlanSets(group, name);
    }
    return good;
}

/// Some formats list the nodes of a group beside its cells: they go into the node set of these cells.
bool mdf_MeshImport::JoinNodes(std::size_t place, const std::string& name) {
    const msf_Group& group = source_.groups[place];
    if (group.dimension != 0 || !group.cells.empty()) return false;
    const auto sameGroup = [&](const SetPlan& plan) { return source_.groups[plan.group].name == group.name; };
    const auto cells = std::ranges::find_if(
        plans_, [&](const SetPlan& plan) { return plan.name == name && sameGroup(plan); });
    if (cells == plans_.end()) return false;
    const bool areNodes = cells->content == Content::NODES;
    const std::string nodesName = areNodes ? name : name + kNodesEnding;
    const auto nodes = std::ranges::find_if(
        plans_, [&](const SetPlan& plan) { return plan.name == nodesName && sameGroup(plan); });
    if (nodes != plans_.end()) {
        nodes->nodes = &group;
    } else {
        plans_.push_back({nodesName, Content::NODES, place, nullptr});
    }
    return true;
}

void mdf_MeshImport::PlanSets(std::size_t place, const std::string& name) {
    const msf_Group& group = source_.groups[place];
    long long elements = 0;
    bool shells = false;
    for (const msf_Run& run : group.cells) {
        if (!IsElementBlock(run.block)) continue;
        elements += run.end - run.begin;
        shells =
            shells ||
            IsShell(elements_[static_cast<std::size_t>(orderOf_[static_cast<std::size_t>(run.block)])].shape);
    }
    const long long others = group.NumCells() - elements;
    if (elements > 0) {
        plans_.push_back({name, Content::ELEMENTS, place, nullptr});
        if (shells) plans_.push_back({name + kSidesEnding, Content::SHELL_SIDES, place, nullptr});
        if (group.dimension == 0) plans_.push_back({name + kNodesEnding, Content::NODES, place, nullptr});
        if (others > 0)
            Note(msf_Counted(others, "cell") + " of group " + GroupText(group) +
                 " make no elements and were left out of its set");
        return;
    }
    if (group.dimension >= MostDimension() || (others == 0 && group.nodes.empty())) {
        Note("group " + GroupText(group) + " was left out: none of its cells make elements");
        return;
    }
    const bool onFaces = group.dimension == MostDimension() - 1 && group.dimension > 0 &&
                         std::ranges::any_of(elements_, [this](const Elements& each) {
                             return cel_CellOf(Block(each.block).kind).dimension == MostDimension() &&
                                    HasNumberedFaces(each.shape);
                         });
    if (onFaces) plans_.push_back({name, Content::FACES, place, nullptr});
    plans_.push_back(onFaces ? SetPlan{name + kNodesEnding, Content::NODES_OF_FACES, place, nullptr}
                             : SetPlan{name, Content::NODES, place, nullptr});
}

bool mdf_MeshImport::CheckNames() {
    std::map<std::string, std::size_t> byName;
    bool good = true;
    for (const SetPlan& plan : plans_) {
        const auto [entry, isNew] = byName.try_emplace(plan.name, plan.group);
        if (isNew) continue;
        const msf_Group& group = source_.groups[plan.group];
        good = Fail("groups " + GroupText(source_.groups[entry->second]) + " and " + GroupText(group) +
                        " would both give a set " + fnd_Quoted(plan.name),
                    "names that differ",
                    "rename one of them: \"groups\": {\"" + group.name + "@" +
                        std::to_string(group.dimension) + "\": \"ANOTHER NAME\"}");
    }
    return good;
}

bool mdf_MeshImport::MatchFaces() {
    std::vector<msf_Run> runs;
    std::vector<std::pair<std::size_t, std::size_t>> counts;
    for (const SetPlan& plan : plans_) {
        if (plan.content != Content::FACES) continue;
        const msf_Group& group = source_.groups[plan.group];
        runs.insert(runs.end(), group.cells.begin(), group.cells.end());
        counts.emplace_back(plan.group, static_cast<std::size_t>(group.NumCells()));
    }
    if (runs.empty()) return true;
    std::vector<bool> areElements(source_.blocks.size());
    for (const Elements& elements : elements_)
        areElements[static_cast<std::size_t>(elements.block)] = HasNumberedFaces(elements.shape);
    const std::vector<msf_Face> all = msf_MatchFaces(source_, MostDimension(), areElements, runs);
    bool good = true;
    auto face = all.begin();
    for (const auto& [group, count] : counts) {
        const auto end = face + static_cast<std::ptrdiff_t>(count);
        faces_[group].assign(face, end);
        face = end;
        good = ReportFaces(group, 0, count) && good;
    }
    return good;
}

bool mdf_MeshImport::ReportFaces(std::size_t place, std::size_t first, std::size_t count) {
    const msf_Group& group = source_.groups[place];
    const std::vector<msf_Face>& faces = faces_[place];
    long long missing = 0;
    long long inner = 0;
    int firstMissing = 0;
    int firstInner = 0;
    std::size_t at = first;
    for (const msf_Run& run : group.cells) {
        for (int cell = run.begin; cell < run.end && at < count; ++cell, ++at) {
            const int label = Block(run.block).labels[static_cast<std::size_t>(cell)];
            if (faces[at].behind == 0 && missing++ == 0) firstMissing = label;
            if (faces[at].behind > 1 && inner++ == 0) firstInner = label;
        }
    }
    if (inner > 0) {
        problems_.Add("inner-face", "/file",
                      msf_Counted(inner, "cell") + " of group " + fnd_Quoted(group.name) +
                          " lie between two elements, the first with label " + std::to_string(firstInner) +
                          "; of these the one with the lower label gives the face");
    }
    if (missing == 0) return true;
    return Fail(msf_Counted(missing, "cell") + " of group " + fnd_Quoted(group.name) +
                    " without an element behind, the first with label " + std::to_string(firstMissing),
                "boundary cells on faces of elements",
                "\"groups\": {\"" + group.name + "\": null} leaves the group out");
}
