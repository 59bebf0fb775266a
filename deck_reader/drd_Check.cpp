#include "deck_reader/drd_Check.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <map>

namespace {

class Check {
public:
    Check(const drd_Deck& deck, const drd_ReadOptions& options, drd_Findings& findings)
        : deck_(deck), options_(options), findings_(findings), names_(deck) {}
    void Run();

private:
    // Keywords.
    void Keyword(const drd_Keyword& keyword);
    void Place(const drd_Keyword& keyword);
    void Parameters(const drd_Keyword& keyword);
    void DataLines(const drd_Keyword& keyword);
    void Reference(drd_RefEnm ref, drd_KindEnm kind, std::string_view name, const drd_Keyword& keyword,
                   drd_Place place);
    void Section(const drd_Keyword& keyword);
    void Placement(const drd_Keyword& keyword);
    // Meshes.
    void Labels(int block);
    void ElementNodes(int block);
    void ElementRun(const drd_Mesh& mesh, const drd_ElementRun& run, int block);
    bool HasNode(const drd_Mesh& mesh, std::uint64_t place, int block) const;
    void Sections(int block);
    std::vector<char> CoveredElements(int block) const;
    void Sets();
    void SetPart(const drd_SetPart& part);

    drd_BlockEnm KindOf(int block) const { return deck_.blocks[static_cast<std::size_t>(block)].kind; }

    const drd_Deck& deck_;
    const drd_ReadOptions& options_;
    drd_Findings& findings_;
    drd_Names names_;
    std::vector<std::pair<int, int>> usersOf_; // the instances that show the mesh of a part, by its block
};

void Check::Run() {
    for (const drd_Keyword& keyword : deck_.keywords) Keyword(keyword);
    for (const int keyword : names_.DefinedTwice()) {
        const drd_Keyword& second = deck_.keywords[static_cast<std::size_t>(keyword)];
        findings_.Add("defined-twice", second.Place(),
                      "the " + std::string(drd_WordOf(second.Row()->defines)) + " " +
                          drd_Shown(second.Value(drd_NameParameter(*second.Row()))) + " again",
                      "a name of its own");
    }
    for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
        const int block = static_cast<int>(i);
        if (deck_.blocks[i].kind == drd_BlockEnm::INSTANCE)
            usersOf_.emplace_back(names_.MeshBlock(block), block);
    }
    std::sort(usersOf_.begin(), usersOf_.end());
    for (std::size_t block = 0; block < deck_.blocks.size(); ++block) {
        if (deck_.blocks[block].mesh < 0) continue;
        Labels(static_cast<int>(block));
        ElementNodes(static_cast<int>(block));
        Sections(static_cast<int>(block));
    }
    Sets();
}

void Check::Keyword(const drd_Keyword& keyword) {
    if (keyword.Row() == nullptr) {
        drd_Nearest nearest(keyword.Name());
        for (const drd_KeywordRow& row : drd_KeywordRows()) nearest.Try(row.name);
        findings_.Add("unknown-keyword", keyword.Place(), drd_Shown("*" + keyword.Name()), {},
                      nearest.Hint());
        return;
    }
    Place(keyword);
    if (keyword.Row()->defines != drd_KindEnm::NONE && keyword.Row()->defines != drd_KindEnm::CONSTRAINT &&
        keyword.Row()->defines != drd_KindEnm::CONTACT_PAIR &&
        !drd_HasName(keyword.Value(drd_NameParameter(*keyword.Row()))) && keyword.Key() != "step") {
        findings_.Add("name-missing", keyword.Place(), drd_Shown("*" + keyword.Name()) + " without a name",
                      std::string(drd_NameParameter(*keyword.Row())) + "=");
    }
    Parameters(keyword);
    DataLines(keyword);
    Section(keyword);
    Placement(keyword);
}

void Check::Place(const drd_Keyword& keyword) {
    const bool opens = deck_.blocks[static_cast<std::size_t>(keyword.block)].begin >= 0 &&
                       &deck_.keywords[static_cast<std::size_t>(
                           deck_.blocks[static_cast<std::size_t>(keyword.block)].begin)] == &keyword;
    const int block = opens ? deck_.blocks[static_cast<std::size_t>(keyword.block)].parent : keyword.block;
    const drd_BlockEnm kind = KindOf(block);
    if (!keyword.Row()->MayStandIn(kind) && !keyword.Key().starts_with("end")) {
        findings_.Add(
            "keyword-out-of-place", keyword.Place(),
            drd_Shown("*" + keyword.Name()) + " in " +
                (kind == drd_BlockEnm::MODEL ? "the model" : "a block *" + std::string(drd_WordOf(kind))));
    }
    const bool needsOwner = keyword.Row()->groups != 0 && keyword.parent < 0;
    if (needsOwner && keyword.Key() != "damping" && keyword.Key() != "rebarlayer") {
        findings_.Add("option-without-owner", keyword.Place(),
                      drd_Shown("*" + keyword.Name()) + " behind no keyword that has it as its option");
    }
}

void Check::Parameters(const drd_Keyword& keyword) {
    for (const drd_Parameter& parameter : keyword.Parameters()) {
        for (const drd_ParameterRef& ref : parameter.word->parameterRefs) {
            if (!drd_Applies(ref, keyword)) continue;
            // What gaskets are made of stands under the name of a material.
            const bool isGasket = keyword.Key() == "gasketsection" && parameter.Key() == "behavior";
            Reference(ref.ref, isGasket ? drd_KindEnm::MATERIAL : ref.kind, parameter.value, keyword,
                      keyword.Place());
        }
    }
}

void Check::DataLines(const drd_Keyword& keyword) {
    if (keyword.lines == 0) return;
    for (const drd_DataRef& ref : keyword.word->dataRefs) {
        if (!drd_Applies(ref, keyword)) continue;
        const auto first = static_cast<std::uint64_t>(ref.firstLine);
        const std::uint64_t last =
            ref.lineStep == 0 ? std::min<std::uint64_t>(keyword.lines, first + 1) : keyword.lines;
        for (std::uint64_t line = first; line < last; ++line) {
            const std::string_view text = deck_.DataLine(keyword, line);
            const drd_Place place = deck_.DataPlace(keyword, line);
            // The line of an equation that counts its terms.
            if (keyword.Key() == "equation" && drd_Field(text, 1).empty()) continue;
            if (ref.column >= 0) {
                Reference(ref.ref, ref.kind, drd_Field(text, static_cast<std::size_t>(ref.column)), keyword,
                          place);
                continue;
            }
            std::vector<std::string_view> fields;
            drd_SplitFields(text, fields);
            for (const std::string_view field : fields) Reference(ref.ref, ref.kind, field, keyword, place);
        }
    }
}

void Check::Reference(drd_RefEnm ref, drd_KindEnm kind, std::string_view name, const drd_Keyword& keyword,
                      drd_Place place) {
    if (!drd_HasName(name)) return;
    double number = 0.0;
    const bool isNumber = drd_ReadReal(name, number);
    if (isNumber && (ref == drd_RefEnm::NAME_UNLESS_NUMBER || ref == drd_RefEnm::NODES_UNLESS_NUMBER)) return;
    // A value of a record that goes on over lines.
    int label = 0;
    if (isNumber && !drd_ReadInt(name, label)) return;
    if (names_.Find(ref, kind, name, keyword.block)) return;
    if (isNumber && ref == drd_RefEnm::NODES) {
        findings_.Add("undefined-node", place,
                      "node " + std::string(name) + " of " + drd_Shown("*" + keyword.Name()));
        return;
    }
    if (isNumber && ref == drd_RefEnm::ELEMENTS) {
        findings_.Add("undefined-element", place,
                      "element " + std::string(name) + " of " + drd_Shown("*" + keyword.Name()));
        return;
    }
    const drd_CodeName code = kind == drd_KindEnm::NODE_SET || kind == drd_KindEnm::ELEMENT_SET
                                  ? drd_CodeName("undefined-set")
                              : kind == drd_KindEnm::SURFACE ? drd_CodeName("undefined-surface")
                                                             : drd_CodeName("undefined-name");
    // The nearest name is worth a search only where it will be shown.
    std::string hint = findings_.Wants(code) ? names_.Nearest(kind, name) : std::string();
    findings_.Add(code, place,
                  "the " + std::string(drd_WordOf(kind)) + " " + drd_Shown(name) + " of " +
                      drd_Shown("*" + keyword.Name()),
                  {}, std::move(hint));
}

void Check::Section(const drd_Keyword& keyword) {
    constexpr std::string_view kOfMaterial[] = {"solidsection", "shellsection", "beamsection",
                                                "membranesection", "gasketsection"};
    constexpr std::string_view kInstead[] = {"material", "composite", "behavior", "user"};
    if (std::find(std::begin(kOfMaterial), std::end(kOfMaterial), keyword.Key()) == std::end(kOfMaterial))
        return;
    for (const std::string_view parameter : kInstead) {
        if (keyword.Find(parameter) != nullptr) return;
    }
    findings_.Add("section-without-material", keyword.Place(),
                  drd_Shown("*" + keyword.Name()) + " without a material", "material=");
}

void Check::Placement(const drd_Keyword& keyword) {
    if (keyword.Key() != "instance") return;
    drd_Placement placement;
    if (!drd_PlacementOf(deck_, deck_.blocks[static_cast<std::size_t>(keyword.block)], placement)) {
        findings_.Add("placement-wrong", keyword.Place(),
                      "the lines of the instance " + drd_Shown(keyword.Value("name")),
                      "a translation, and two points of an axis with an angle");
    }
}

void Check::Labels(int block) {
    const drd_Mesh& mesh = *deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
    for (const std::uint64_t place : names_.Nodes(block)->Repeated()) {
        findings_.Add("repeated-node", drd_PlaceOf(mesh.nodePlaces, place),
                      "node " + std::to_string(mesh.nodes[place]) + " again");
    }
    for (const std::uint64_t place : names_.Elements(block)->Repeated()) {
        findings_.Add("repeated-element", drd_PlaceOf(mesh.elementPlaces, place),
                      "element " + std::to_string(mesh.elements[place]) + " again");
    }
}

void Check::ElementNodes(int block) {
    const drd_Mesh& mesh = *deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
    for (const drd_ElementRun& run : mesh.elementRuns) ElementRun(mesh, run, block);
}

bool Check::HasNode(const drd_Mesh& mesh, std::uint64_t place, int block) const {
    int owner = block;
    if (!mesh.owners.IsEmpty() && mesh.owners[place] >= 0) {
        owner = names_.FindInstance(deck_.owners[static_cast<std::size_t>(mesh.owners[place])]);
        if (owner < 0) return false;
        owner = names_.MeshBlock(owner);
    }
    // Elements of an instance may stand on the nodes of its part.
    const drd_LabelIndex* nodes = names_.Nodes(owner);
    if (nodes != nullptr && nodes->Find(mesh.connectivity[place]) >= 0) return true;
    const int part = names_.PartOf(owner);
    return part >= 0 && names_.Nodes(part) != nullptr &&
           names_.Nodes(part)->Find(mesh.connectivity[place]) >= 0;
}

void Check::ElementRun(const drd_Mesh& mesh, const drd_ElementRun& run, int block) {
    const auto nodes = static_cast<std::uint64_t>(run.nodes);
    const std::string& type = deck_.types[static_cast<std::size_t>(run.type)];
    const drd_TypeInfo info = options_.typeInfo == nullptr ? drd_TypeInfo() : options_.typeInfo(type);
    if (info.maxNodes > 0 && (run.nodes < info.minNodes || run.nodes > info.maxNodes)) {
        findings_.Add("element-node-count", drd_PlaceOf(mesh.elementPlaces, run.first),
                      drd_Counted(run.count, "element") + " of type " + type + " with " +
                          drd_Counted(nodes, "node") + ", the first is " +
                          std::to_string(mesh.elements[run.first]),
                      std::to_string(info.maxNodes));
    }
    for (std::uint64_t i = 0; i < run.count * nodes; ++i) {
        if (HasNode(mesh, run.firstNode + i, block)) [[likely]]
            continue;
        const std::uint64_t element = run.first + i / nodes;
        findings_.Add("element-without-node", drd_PlaceOf(mesh.elementPlaces, element),
                      "element " + std::to_string(mesh.elements[element]) + " has node " +
                          std::to_string(mesh.connectivity[run.firstNode + i]),
                      "a node of the mesh");
    }
}

/// One for each element of a mesh that a section is given to.
std::vector<char> Check::CoveredElements(int block) const {
    const drd_LabelIndex& index = *names_.Elements(block);
    std::vector<char> covered(deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)])->elements.Size(),
                              0);
    const auto cover = [&](int user) {
        const drd_Block& owner = deck_.blocks[static_cast<std::size_t>(user)];
        std::vector<drd_Member> members;
        const int last = user == 0 ? static_cast<int>(deck_.keywords.size()) : owner.last;
        for (int i = std::max(owner.begin, 0); i < last; ++i) {
            const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(i)];
            const bool isSection = keyword.Row() != nullptr &&
                                   (keyword.Row()->owns == drd_GroupEnm::SECTION || keyword.Key() == "mass" ||
                                    keyword.Key() == "rotaryi" || keyword.Key() == "uelproperty");
            if (!isSection || keyword.block != user) continue;
            const drd_Target set = names_.Find(drd_KindEnm::ELEMENT_SET, keyword.Value("elset"), user);
            if (set.set < 0) continue;
            names_.Expand(set.set, members);
            for (const drd_Member& member : members) {
                const std::int64_t place = index.Find(member.label);
                if (place >= 0) covered[static_cast<std::size_t>(place)] = 1;
            }
        }
    };
    cover(block);
    // An instance may give sections to the elements of its part.
    if (KindOf(block) == drd_BlockEnm::PART) {
        const auto first = std::lower_bound(usersOf_.begin(), usersOf_.end(), std::pair(block, 0));
        for (auto user = first; user != usersOf_.end() && user->first == block; ++user) cover(user->second);
    }
    // A set's label stands for all elements that have it.
    for (const std::uint64_t place : index.Repeated()) {
        covered[place] = covered[static_cast<std::size_t>(
            index.Find(deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)])->elements[place]))];
    }
    return covered;
}

void Check::Sections(int block) {
    if (options_.typeInfo == nullptr) return;
    const drd_Mesh& mesh = *deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
    const bool needed =
        std::any_of(mesh.elementRuns.begin(), mesh.elementRuns.end(), [this](const drd_ElementRun& r) {
            return options_.typeInfo(deck_.types[static_cast<std::size_t>(r.type)]).needsSection;
        });
    if (!needed) return;
    const std::vector<char> covered = CoveredElements(block);
    struct Bare {
        std::uint64_t count = 0;
        std::uint64_t first = 0;
    };
    std::map<int, Bare> bare; // by type
    for (const drd_ElementRun& run : mesh.elementRuns) {
        if (!options_.typeInfo(deck_.types[static_cast<std::size_t>(run.type)]).needsSection) continue;
        for (std::uint64_t i = run.first; i < run.first + run.count; ++i) {
            if (covered[i] != 0) continue;
            Bare& of = bare[run.type];
            if (of.count++ == 0) of.first = i;
        }
    }
    for (const auto& [type, of] : bare) {
        findings_.Add("element-without-section", drd_PlaceOf(mesh.elementPlaces, of.first),
                      drd_Counted(of.count, "element") + " of type " +
                          deck_.types[static_cast<std::size_t>(type)] + " without a section, the first is " +
                          std::to_string(mesh.elements[of.first]));
    }
}

void Check::Sets() {
    for (const drd_Set& set : names_.Sets()) {
        bool isEmpty = true;
        for (const int index : set.parts) {
            const drd_SetPart& part = deck_.setParts[static_cast<std::size_t>(index)];
            SetPart(part);
            const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(part.keyword)];
            isEmpty = isEmpty && part.count == 0 && part.members.empty() && keyword.Find("elset") == nullptr;
            isEmpty = isEmpty || (keyword.Key() == "elset" && part.count == 0 && part.members.empty());
        }
        if (!isEmpty) continue;
        const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(
            deck_.setParts[static_cast<std::size_t>(set.parts[0])].keyword)];
        if (keyword.Key() == "node" || keyword.Key() == "element") continue;
        findings_.Add("empty-set-in-deck", keyword.Place(),
                      "the " + std::string(drd_WordOf(set.kind)) + " " +
                          drd_Shown(std::string_view(set.name)) + " has no members");
    }
}

void Check::SetPart(const drd_SetPart& part) {
    const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(part.keyword)];
    const bool isNodes = part.kind == drd_KindEnm::NODE_SET;
    if (part.name.empty()) {
        findings_.Add("name-missing", keyword.Place(), drd_Shown("*" + keyword.Name()) + " without a name",
                      isNodes ? "nset=" : "elset=");
    }
    int owner = part.block;
    if (!part.instance.empty()) {
        owner = names_.FindInstance(part.instance);
        if (owner < 0) return;
    }
    for (const drd_Word member : part.members) {
        Reference(isNodes ? drd_RefEnm::NODES : drd_RefEnm::ELEMENTS, part.kind, member, keyword,
                  keyword.Place());
    }
    const int block = names_.MeshBlock(owner);
    const drd_LabelIndex* index = isNodes ? names_.Nodes(block) : names_.Elements(block);
    std::uint64_t missing = 0;
    int first = 0;
    const std::span<const int> labels = deck_.labels.Part(part.first, part.count);
    for (std::size_t i = 0; i < labels.size(); i += part.isGenerated ? 3 : 1) {
        // Of a range the ends are enough: the language lets it pass over labels that are not there.
        if (index != nullptr && index->Find(labels[i]) >= 0) continue;
        if (missing++ == 0) first = labels[i];
    }
    if (missing == 0) return;
    const std::string found = (isNodes ? "node " : "element ") + std::to_string(first) + " of the set " +
                              drd_Shown(std::string_view(part.name)) +
                              (missing > 1 ? " and " + std::to_string(missing - 1) + " more" : std::string());
    if (isNodes) {
        findings_.Add("undefined-node", keyword.Place(), found);
    } else {
        findings_.Add("undefined-element", keyword.Place(), found);
    }
}

} // namespace

void drd_CheckDeck(const drd_Deck& deck, const drd_ReadOptions& options, drd_Findings& findings) {
    Check(deck, options, findings).Run();
}
