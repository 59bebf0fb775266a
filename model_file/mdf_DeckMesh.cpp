#include "model_file/mdf_DeckMesh.h"

#include "deck_reader/drd_Reader.h"
#include "deck_reader/drd_Text.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/ddb_ElementTypes.h"

#include <algorithm>
#include <filesystem>
#include <fstream>

namespace {

drd_TypeInfo InfoOf(std::string_view type) {
    drd_TypeInfo info;
    if (const auto found = ddb_FindElementType(type)) {
        info.minNodes = found->minNodes;
        info.maxNodes = found->maxNodes;
    }
    return info;
}

/// What a set is called whose name another kind of set has.
const char* EndingOf(drd_KindEnm kind) {
    return kind == drd_KindEnm::NODE_SET      ? "_NODES"
           : kind == drd_KindEnm::ELEMENT_SET ? "_ELEMENTS"
                                              : "_SURFACE";
}

} // namespace

bool mdf_DeckMesh::IsDeck(const std::string& path) {
    if (drd_FoldKey(plt_Path(path).extension().string()) == ".inp") return true;
    std::error_code error;
    if (!std::filesystem::is_regular_file(plt_Path(path), error)) return false;
    // The formats of meshers begin with other characters.
    std::ifstream file(plt_Path(path), std::ios::binary);
    char first = '\0';
    return static_cast<bool>(file.get(first)) && first == '*';
}

void mdf_DeckMesh::Note(std::string text) {
    origin_.notes.push_back(text);
    problems_.Add("mesh-file-note", "/file", std::move(text));
}

bool mdf_DeckMesh::Fail(std::string found, std::string expected, std::string hint) {
    problems_.Add("mesh-file", "/file", std::move(found), std::move(expected), std::move(hint));
    return false;
}

bool mdf_DeckMesh::Fill(odiK_Mesh& mesh) {
    return CheckRequest() && ReadDeck() && ChooseBlock() && FillMesh(mesh);
}

bool mdf_DeckMesh::FillFrom(const drd_Deck& deck, const drd_Names& names, int block, odiK_Mesh& mesh) {
    deck_ = &deck;
    names_ = &names;
    block_ = block;
    source_ = deck.MeshOf(deck.blocks[static_cast<std::size_t>(block)]);
    return FillMesh(mesh);
}

bool mdf_DeckMesh::FillMesh(odiK_Mesh& mesh) {
    AddNodes(mesh);
    if (!AddElements(mesh)) return false;
    AddSets(mesh);
    AddSurfaces(mesh);
    origin_.mesh = &mesh;
    return true;
}

/// Elements of a deck have their types, and sets their kinds.
bool mdf_DeckMesh::CheckRequest() {
    bool good = true;
    for (const auto& [member, isGiven] : {std::pair{"elementTypes", !request_.elementTypes.empty()},
                                          {"surfaceElements", !request_.surfaceElements.empty()},
                                          {"groupArrays", !request_.options.groupArrays.empty()}}) {
        if (!isGiven) continue;
        problems_.Add("mesh-file", std::string("/") + member,
                      std::string("found \"") + member + "\" for a deck",
                      "nothing: a deck tells the types of its elements and its sets");
        good = false;
    }
    return good;
}

bool mdf_DeckMesh::ReadDeck() {
    drd_ReadOptions options;
    options.typeInfo = &InfoOf;
    drd_Findings findings;
    ownDeck_ = drd_ReadDeck(request_.path, options, findings);
    deck_ = &ownDeck_;
    for (const drd_Finding& finding : findings.List()) {
        if (finding.code->severity != drd_SeverityEnm::ERROR) continue;
        return Fail(deck_->FileName(finding.place) + ":" + std::to_string(finding.place.line) + ": found " +
                        finding.found,
                    finding.expected);
    }
    ownNames_ = std::make_unique<drd_Names>(ownDeck_);
    names_ = ownNames_.get();
    return true;
}

bool mdf_DeckMesh::ChooseBlock() {
    std::vector<std::string> known;
    std::vector<int> blocks;
    for (std::size_t i = 0; i < deck_->blocks.size(); ++i) {
        const drd_Block& block = deck_->blocks[i];
        const drd_Mesh* mesh = deck_->MeshOf(block);
        if (mesh == nullptr || mesh->nodes.IsEmpty() || block.kind == drd_BlockEnm::ASSEMBLY) continue;
        blocks.push_back(static_cast<int>(i));
        known.push_back(block.name);
    }
    for (std::size_t i = 0; i < blocks.size(); ++i) {
        const bool isAsked = request_.options.part.empty()
                                 ? blocks.size() == 1
                                 : drd_FoldCase(known[i]) == drd_FoldCase(request_.options.part);
        if (isAsked && block_ < 0) block_ = blocks[i];
    }
    if (block_ < 0) {
        if (known.empty()) return Fail("found no nodes", "a deck with a mesh");
        return Fail(request_.options.part.empty() ? "found " + drd_Counted(known.size(), "mesh") + "es"
                                                  : "found no mesh " + fnd_Quoted(request_.options.part),
                    "\"part\": " + fnd_OneOf(known, request_.options.part));
    }
    source_ = deck_->MeshOf(deck_->blocks[static_cast<std::size_t>(block_)]);
    origin_.format = "deck";
    if (!source_->owners.IsEmpty())
        return Fail("found elements on nodes of instances", "elements on nodes of the part");
    return true;
}

void mdf_DeckMesh::AddNodes(odiK_Mesh& mesh) {
    std::vector<int> labels(source_->nodes.begin(), source_->nodes.end());
    std::vector<float> coordinates(source_->coordinates.Size());
    for (std::size_t i = 0; i < coordinates.size(); ++i) {
        coordinates[i] = static_cast<float>(source_->coordinates[i] * request_.options.scale);
    }
    mesh.SetNodes(std::move(labels), std::move(coordinates), problems_);
}

bool mdf_DeckMesh::AddElements(odiK_Mesh& mesh) {
    // A class for each type and number of nodes, in the order of the deck.
    struct Elements {
        std::string type;
        int nodes;
        std::vector<int> labels;
        std::vector<int> connectivity;
    };
    std::vector<Elements> classes;
    for (const drd_ElementRun& run : source_->elementRuns) {
        const std::string& type = deck_->types[static_cast<std::size_t>(run.type)];
        auto found = std::ranges::find_if(
            classes, [&](const Elements& each) { return each.type == type && each.nodes == run.nodes; });
        if (found == classes.end()) found = classes.insert(classes.end(), {type, run.nodes, {}, {}});
        const auto labels = source_->elements.Part(run.first, run.count);
        const auto nodes =
            source_->connectivity.Part(run.firstNode, run.count * static_cast<std::uint64_t>(run.nodes));
        found->labels.insert(found->labels.end(), labels.begin(), labels.end());
        found->connectivity.insert(found->connectivity.end(), nodes.begin(), nodes.end());
    }
    for (Elements& each : classes) {
        origin_.cells.emplace_back(each.type, static_cast<long long>(each.labels.size()));
        const auto controls = request_.controls.find(each.type);
        mesh.AddElements(cow_String(std::string_view(each.type)), std::move(each.labels), each.nodes,
                         std::move(each.connectivity),
                         controls == request_.controls.end() ? bme_ElemCtrlParams() : controls->second,
                         problems_);
    }
    mesh.FinishElements(problems_);
    for (const auto& [type, controls] : request_.controls) {
        const auto isType = [&t = type](const Elements& each) { return each.type == t; };
        if (std::ranges::none_of(classes, isType))
            return Fail("found no elements of type " + fnd_Quoted(type), "");
    }
    return true;
}

/// The name that a set gets; false when it is left out.
bool mdf_DeckMesh::NameOf(const std::string& group, drd_KindEnm kind, std::string& name) {
    name = group;
    const auto renamed = std::ranges::find_if(
        request_.groups, [&](const auto& entry) { return drd_FoldCase(entry.first) == drd_FoldCase(group); });
    if (renamed != request_.groups.end()) name = renamed->second;
    if (name.empty()) {
        Note("the " + std::string(drd_WordOf(kind)) + " " + fnd_Quoted(group) +
             " was left out, as \"groups\" says");
        return false;
    }
    const bool isTaken = std::ranges::any_of(origin_.sets, [&](const mdf_MeshOrigin::Set& set) {
        return drd_FoldCase(set.name) == drd_FoldCase(name);
    });
    if (isTaken) {
        name += EndingOf(kind);
        Note("the " + std::string(drd_WordOf(kind)) + " " + fnd_Quoted(group) + " is called " +
             fnd_Quoted(name) + ", since another set has its name");
    }
    return true;
}

/// The sets of faces that belong to a surface are made anew with it.
bool mdf_DeckMesh::IsSideOfSurface(const drd_Set& set) const {
    return std::ranges::all_of(set.parts, [this](int part) {
        const drd_SetPart& of = deck_->setParts[static_cast<std::size_t>(part)];
        return of.kind == drd_KindEnm::ELEMENT_SET && of.name.starts_with("_") &&
               deck_->keywords[static_cast<std::size_t>(of.keyword)].Find("internal") != nullptr;
    });
}

void mdf_DeckMesh::Remember(const std::string& name, const char* kind, std::size_t members) {
    origin_.sets.push_back({name, kind, static_cast<long long>(members), name, 0});
    ++origin_.groups;
}

void mdf_DeckMesh::AddSets(odiK_Mesh& mesh) {
    const auto& sets = names_->Sets();
    for (std::size_t i = 0; i < sets.size(); ++i) {
        const drd_Set& set = sets[i];
        if (set.block != block_ || set.name.empty() || IsSideOfSurface(set)) continue;
        std::string name;
        if (!NameOf(set.name, set.kind, name)) continue;
        std::vector<drd_Member> members;
        names_->Expand(static_cast<int>(i), members);
        const bool areNodes = set.kind == drd_KindEnm::NODE_SET;
        const drd_LabelIndex* index = areNodes ? names_->Nodes(block_) : names_->Elements(block_);
        std::vector<int> labels;
        for (const drd_Member& member : members) {
            if (index->Find(member.label) >= 0) labels.push_back(member.label);
        }
        if (labels.size() < members.size()) {
            Note(drd_Counted(members.size() - labels.size(), "member") + " of the set " +
                 fnd_Quoted(set.name) + " that the mesh doesn't have were left out");
        }
        const cow_String setName{std::string_view(name)};
        odiK_SetInput input;
        input.name = setName;
        input.type = areNodes ? res_SetTypeEnm::NODES : res_SetTypeEnm::ELEMENTS;
        input.labels = labels;
        mesh.AddSet(input, problems_);
        Remember(name, areNodes ? "node" : "element", labels.size());
    }
}

void mdf_DeckMesh::AddSurfaces(odiK_Mesh& mesh) {
    for (const drd_Keyword& keyword : deck_->keywords) {
        if (keyword.Key() == "surface" && keyword.block == block_) AddSurface(mesh, keyword);
    }
}

void mdf_DeckMesh::AddSurface(odiK_Mesh& mesh, const drd_Keyword& keyword) {
    const std::string group = drd_NameOf(keyword.Value("name"));
    if (drd_FoldKey(keyword.Value("type")) == "node") {
        Note("the surface " + fnd_Quoted(group) + " of nodes was left out; its node set is there");
        return;
    }
    std::string name;
    if (!NameOf(group, drd_KindEnm::SURFACE, name)) return;
    std::vector<odiK_FacetInput> facets;
    std::vector<std::string> faces(keyword.lines);
    std::size_t without = 0;
    for (std::uint64_t line = 0; line < keyword.lines; ++line) {
        const std::string_view text = deck_->DataLine(keyword, line);
        const drd_Target target =
            names_->Find(drd_RefEnm::ELEMENTS, drd_KindEnm::ELEMENT_SET, drd_Field(text, 0), block_);
        std::string& face = faces[line] = drd_NameOf(drd_Field(text, 1));
        for (char& c : face) c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
        std::vector<drd_Member> members;
        if (target.set >= 0) names_->Expand(target.set, members);
        if (target.label > 0) members.push_back({-1, target.label});
        if (face.empty()) without += members.size();
        for (const drd_Member& member : members) {
            if (!face.empty()) facets.push_back({member.label, -1, face});
        }
    }
    if (without > 0) {
        Note(drd_Counted(without, "element") + " of the surface " + fnd_Quoted(group) +
             " without a face were left out");
    }
    if (facets.empty()) return;
    const cow_String surfaceName{std::string_view(name)};
    odiK_SetInput input;
    input.name = surfaceName;
    input.type = res_SetTypeEnm::FACETS;
    input.facets = facets;
    mesh.AddSet(input, problems_);
    Remember(name, "surface", facets.size());
}
