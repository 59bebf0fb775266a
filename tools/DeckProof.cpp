#include "tools/DeckProof.h"

#include "deck_checks/dck_Text.h"
#include "deck_reader/drd_Names.h"
#include "deck_reader/drd_Text.h"
#include "foundation/num_RealText.h"
#include "store_interface/model/ddb_ElementShape.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "store_interface/model/odiK_Model.h"

#include <algorithm>
#include <array>
#include <map>
#include <set>
#include <unordered_map>

namespace {

/// A member of a set: an element's face, or a node or element with no face.
struct Member {
    int instance; // block of the deck, -1 for the assembly
    int label;
    std::string face;
    friend auto operator<=>(const Member&, const Member&) = default;
};
using Members = std::set<Member>;

/// The number that a coordinate's text in a deck is.
double AsWritten(float value) {
    constexpr int kWidth = 12;
    constexpr int kDigits = 7;
    std::array<char, num_RealRoom(kWidth, kDigits)> text{};
    const char* end = num_WriteReal(text.data(), value, kWidth, kDigits);
    double number = 0.0;
    drd_ReadReal(std::string_view(text.data(), static_cast<std::size_t>(end - text.data())), number);
    return number;
}

std::string FaceOf(const ddb_ElementShape& shape, int facet) {
    const ddb_FaceRule rule = ddb_FaceRuleOf(shape);
    if (rule.rule == ddb_FaceRuleEnm::SHELL) return facet == 0 ? "spos" : facet == 1 ? "sneg" : "";
    return drd_FoldCase(rule.prefix) + std::to_string(facet + 1);
}

class Proof {
public:
    Proof(const odiK_Model& model, const drd_Deck& deck) : model_(model), deck_(deck), names_(deck) {}
    std::vector<std::string> Run();

private:
    struct Wanted {
        std::string name;
        Members members;
    };
    using WantedSets = std::map<std::string, Wanted>; // by folded name

    void Instance(const odiK_Instance& instance, int block);
    void Nodes(const odiK_NodeData& nodes, const drd_Mesh* mesh, const std::string& where);
    void Elements(const odiK_Mesh& own, const drd_Mesh* mesh, int block, const std::string& where);
    void Collect(const odiK_Set& set, std::map<res_SetTypeEnm, WantedSets>& wanted, int onlyMesh, int block);
    void Compare(const std::map<res_SetTypeEnm, WantedSets>& wanted, int block, const std::string& where);
    Members MembersOf(int set) const;
    Members FacesOf(int surface, int block) const;
    const odiK_Mesh* MeshOfIndex(int meshIndex) const;
    void Steps();
    template <class Map>
    void Defined(std::initializer_list<drd_KindEnm> kinds, const Map& records);
    void Tell(std::string text) { problems_.push_back(std::move(text)); }

    const odiK_Model& model_;
    const drd_Deck& deck_;
    drd_Names names_;
    std::unordered_map<int, int> blockOfMesh_;
    std::vector<std::string> problems_;
};

std::vector<std::string> Proof::Run() {
    std::size_t instances = 0;
    for (const auto& [name, instance] : model_.Instances()) {
        if (!instance->isPartInstance) continue;
        ++instances;
        const int block = names_.FindInstance(Text(name));
        if (block < 0) {
            Tell("the instance " + Text(name) + " is not in the deck");
            continue;
        }
        blockOfMesh_[instance->meshIndex] = block;
        Instance(*instance, block);
    }
    const auto blocks = static_cast<std::size_t>(
        std::count_if(deck_.blocks.begin(), deck_.blocks.end(),
                      [](const drd_Block& block) { return block.kind == drd_BlockEnm::INSTANCE; }));
    if (blocks != instances) {
        Tell("the deck has " + drd_Counted(blocks, "instance") + ", the store " + std::to_string(instances));
    }
    std::map<res_SetTypeEnm, WantedSets> wanted;
    for (const auto& set : model_.AssemblySets()) Collect(*set, wanted, rgnC_SetData::kOwnMeshIndex, -1);
    int assembly = 0;
    for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
        if (deck_.blocks[i].kind == drd_BlockEnm::ASSEMBLY) assembly = static_cast<int>(i);
    }
    Compare(wanted, assembly, "the assembly");
    Steps();
    Defined({drd_KindEnm::MATERIAL}, model_.materials);
    // Amplitudes over frequency are keywords of their own.
    Defined({drd_KindEnm::AMPLITUDE, drd_KindEnm::PSD, drd_KindEnm::SPECTRUM}, model_.amplitudes);
    return std::move(problems_);
}

void Proof::Instance(const odiK_Instance& instance, int block) {
    const std::string where = "instance " + Text(instance.name);
    const cow_CountedHld<odiK_Mesh> mesh = instance.Mesh();
    const drd_Mesh* read = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
    if (mesh.IsNull()) {
        if (read != nullptr) Tell(where + " has a mesh in the deck alone");
        return;
    }
    Nodes(mesh->Nodes(), read, where);
    Elements(*mesh, read, block, where);
    std::map<res_SetTypeEnm, WantedSets> wanted;
    for (const auto& set : mesh->Sets()) Collect(*set, wanted, instance.meshIndex, -1);
    Compare(wanted, block, where);
}

void Proof::Nodes(const odiK_NodeData& nodes, const drd_Mesh* mesh, const std::string& where) {
    const auto count = static_cast<std::size_t>(nodes.NumNodes());
    const std::size_t read = mesh == nullptr ? 0 : mesh->nodes.Size();
    if (count != read) {
        Tell(where + ": " + drd_Counted(read, "node") + " in the deck, " + std::to_string(count) +
             " in the store");
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        const int label = nodes.labels[static_cast<int>(i)];
        bool same = mesh->nodes[i] == label;
        for (std::size_t k = 0; same && k < 3; ++k) {
            same = mesh->coordinates[3 * i + k] == AsWritten(nodes.coordinates[3 * i + k]);
        }
        if (same) continue;
        Tell(where + ": node " + std::to_string(label) + " is another in the deck");
        return;
    }
}

void Proof::Elements(const odiK_Mesh& own, const drd_Mesh* mesh, int block, const std::string& where) {
    // Elements whose type has "SURF" in it are not written.
    std::size_t count = 0;
    const drd_LabelIndex* index = names_.Elements(block);
    std::vector<const drd_ElementRun*> runOf;
    if (mesh != nullptr) {
        runOf.resize(mesh->elements.Size());
        for (const drd_ElementRun& run : mesh->elementRuns) {
            std::fill_n(runOf.begin() + static_cast<std::ptrdiff_t>(run.first), run.count, &run);
        }
    }
    for (const odiK_ElementClass& elements : own.Classes()) {
        if (elements.type.View().find("SURF") != std::string_view::npos) continue;
        count += elements.labels.size();
        const auto nodes = static_cast<std::size_t>(elements.nodesPerElement);
        for (std::size_t i = 0; i < elements.labels.size(); ++i) {
            const std::int64_t place = index == nullptr ? -1 : index->Find(elements.labels[i]);
            bool same = place >= 0;
            if (same) {
                const drd_ElementRun& run = *runOf[static_cast<std::size_t>(place)];
                same = static_cast<std::size_t>(run.nodes) == nodes &&
                       deck_.types[static_cast<std::size_t>(run.type)] == Text(elements.type);
                const std::uint64_t first =
                    run.firstNode + (static_cast<std::uint64_t>(place) - run.first) * nodes;
                for (std::size_t n = 0; same && n < nodes; ++n) {
                    same = mesh->connectivity[first + n] ==
                           own.Nodes().Label(elements.connectivity[i * nodes + n]);
                }
            }
            if (same) continue;
            Tell(where + ": element " + std::to_string(elements.labels[i]) + " is another in the deck");
            return;
        }
    }
    const std::size_t read = mesh == nullptr ? 0 : mesh->elements.Size();
    if (read != count) {
        Tell(where + ": " + drd_Counted(read, "element") + " in the deck, " + std::to_string(count) +
             " in the store");
    }
}

const odiK_Mesh* Proof::MeshOfIndex(int meshIndex) const {
    if (meshIndex == 0) return model_.ConstAssemblyMesh().IsNull() ? nullptr : &*model_.ConstAssemblyMesh();
    const cow_CountedHld<odiK_Instance> instance = model_.InstanceOfMesh(meshIndex);
    if (instance.IsNull()) return nullptr;
    const cow_CountedHld<odiK_Mesh> mesh = instance->Mesh();
    return mesh.IsNull() ? nullptr : &*mesh;
}

/// Adds what a set should have in the deck; names that differ in capitals alone are one there.
void Proof::Collect(const odiK_Set& set, std::map<res_SetTypeEnm, WantedSets>& wanted, int onlyMesh,
                    int block) {
    const bool isOfMesh = onlyMesh != rgnC_SetData::kOwnMeshIndex;
    Members members;
    for (const rgnC_SubsetData& subset : set.subsets) {
        const int meshIndex = isOfMesh ? onlyMesh : subset.meshIndex;
        const odiK_Mesh* mesh = MeshOfIndex(meshIndex);
        const auto known = blockOfMesh_.find(meshIndex);
        // The faces of the assembly's own elements reach no deck.
        if (mesh == nullptr || (meshIndex == 0 && set.type == res_SetTypeEnm::FACETS)) continue;
        const int owner = isOfMesh ? block : (known == blockOfMesh_.end() ? -1 : known->second);
        for (int i = 0; i < subset.subset.Length(); ++i) {
            if (set.type == res_SetTypeEnm::NODES) {
                members.insert({owner, mesh->Nodes().labels[subset.subset[i]], {}});
                continue;
            }
            const odiK_ElementClass& elements = mesh->Classes()[static_cast<std::size_t>(subset.classIndex)];
            const int label = elements.labels[static_cast<std::size_t>(subset.subset[i])];
            members.insert({owner, label,
                            set.type == res_SetTypeEnm::FACETS ? FaceOf(elements.shape, subset.facetIds[i])
                                                               : std::string()});
        }
    }
    if (members.empty()) return;
    Wanted& of = wanted[set.type][drd_FoldCase(set.name.View())];
    of.name = Text(set.name);
    of.members.merge(members);
}

Members Proof::MembersOf(int set) const {
    Members members;
    std::vector<drd_Member> expanded;
    names_.Expand(set, expanded);
    for (const drd_Member& member : expanded) members.insert({member.instance, member.label, {}});
    return members;
}

Members Proof::FacesOf(int surface, int block) const {
    Members members;
    const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(surface)];
    for (std::uint64_t line = 0; line < keyword.lines; ++line) {
        const std::string_view text = deck_.DataLine(keyword, line);
        const drd_Target set = names_.Find(drd_KindEnm::ELEMENT_SET, drd_Field(text, 0), block);
        if (set.set < 0) continue;
        const std::string face = drd_FoldName(drd_Field(text, 1));
        for (const Member& member : MembersOf(set.set)) {
            members.insert({member.instance, member.label, face});
        }
    }
    return members;
}

void Proof::Compare(const std::map<res_SetTypeEnm, WantedSets>& wanted, int block, const std::string& where) {
    for (const auto& [type, sets] : wanted) {
        const drd_KindEnm kind = type == res_SetTypeEnm::NODES      ? drd_KindEnm::NODE_SET
                                 : type == res_SetTypeEnm::ELEMENTS ? drd_KindEnm::ELEMENT_SET
                                                                    : drd_KindEnm::SURFACE;
        for (const auto& [folded, set] : sets) {
            const drd_Target target = names_.Find(kind, "\"" + set.name + "\"", block);
            Members read;
            if (target.set >= 0) read = MembersOf(target.set);
            if (target.keyword >= 0) read = FacesOf(target.keyword, block);
            if (read == set.members) continue;
            Tell(where + ": the " + std::string(drd_WordOf(kind)) + " " + set.name + " has " +
                 std::to_string(read.size()) + " members in the deck, " + std::to_string(set.members.size()) +
                 " in the store" + (read.size() == set.members.size() ? ", others" : ""));
        }
    }
}

void Proof::Steps() {
    std::vector<std::string> wanted;
    for (int i = 1; i < model_.steps.Size(); ++i) wanted.push_back(Text(model_.steps.NameAt(i)));
    std::vector<std::string> read;
    for (const drd_Block& block : deck_.blocks) {
        if (block.kind == drd_BlockEnm::STEP) read.push_back(block.name);
    }
    if (read != wanted) {
        Tell("the deck has " + drd_Counted(read.size(), "step") + ", the store " +
             std::to_string(wanted.size()) + (read.size() == wanted.size() ? ", under other names" : ""));
    }
}

/// Each record has a keyword of one of the kinds.
template <class Map>
void Proof::Defined(std::initializer_list<drd_KindEnm> kinds, const Map& records) {
    for (const auto& [name, record] : records) {
        // Names of gaskets stand bare, so that blanks around them get lost.
        const std::string trimmed = "\"" + std::string(drd_Trim(name.View())) + "\"";
        const std::string whole = "\"" + Text(name) + "\"";
        const bool isThere = std::any_of(kinds.begin(), kinds.end(), [&](drd_KindEnm kind) {
            return names_.Find(kind, whole, 0) || names_.Find(kind, trimmed, 0);
        });
        if (isThere) continue;
        Tell("the " + std::string(drd_WordOf(*kinds.begin())) + " " + Text(name) + " is not in the deck");
    }
}

} // namespace

std::vector<std::string> ProveDeck(const odiK_Model& model, const drd_Deck& deck) {
    return Proof(model, deck).Run();
}
