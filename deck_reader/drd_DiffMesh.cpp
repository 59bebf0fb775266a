#include "deck_reader/drd_Differ.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace {

/// Labels to name a few of them.
class Few {
public:
    void Add(int label) {
        if (count_++ < kShown) text_ += (text_.empty() ? "" : ", ") + std::to_string(label);
    }
    std::uint64_t Count() const { return count_; }
    /// The verb for one or for many.
    std::string_view Verb(std::string_view one, std::string_view many) const {
        return count_ == 1 ? one : many;
    }
    /// "3 nodes (1, 2, 3)".
    std::string Words(std::string_view what) const {
        return drd_Counted(count_, what) + " (" + text_ + (count_ > kShown ? ", ..." : "") + ")";
    }

private:
    static constexpr std::uint64_t kShown = 5;
    std::uint64_t count_ = 0;
    std::string text_;
};

template <class T>
bool SameBytes(const drd_Flat<T>& first, const drd_Flat<T>& second) {
    return first.Size() == second.Size() &&
           (first.IsEmpty() || std::memcmp(first.Data(), second.Data(), first.Bytes()) == 0);
}

/// The type and the nodes of elements by their place.
class ElementRows {
public:
    ElementRows(const drd_Deck& deck, const drd_Mesh& mesh) : deck_(deck), mesh_(mesh) {}
    struct Row {
        const std::string* type;
        std::span<const int> nodes;
        const int* owners; // null: none
    };
    /// Fast when asked in ascending order.
    Row Of(std::uint64_t element) {
        const auto& runs = mesh_.elementRuns;
        if (element < runs[run_].first || element >= runs[run_].first + runs[run_].count) {
            const auto found =
                std::upper_bound(runs.begin(), runs.end(), element,
                                 [](std::uint64_t e, const drd_ElementRun& r) { return e < r.first; });
            run_ = static_cast<std::size_t>(found - runs.begin()) - 1;
        }
        const drd_ElementRun& run = runs[run_];
        const std::uint64_t first =
            run.firstNode + (element - run.first) * static_cast<std::uint64_t>(run.nodes);
        return {&deck_.types[static_cast<std::size_t>(run.type)],
                mesh_.connectivity.Part(first, static_cast<std::size_t>(run.nodes)),
                mesh_.owners.IsEmpty() ? nullptr : mesh_.owners.Data() + first};
    }
    std::string Owner(const Row& row, std::size_t node) const {
        const int owner = row.owners == nullptr ? -1 : row.owners[node];
        return owner < 0 ? std::string() : drd_FoldCase(deck_.owners[static_cast<std::size_t>(owner)]);
    }

private:
    const drd_Deck& deck_;
    const drd_Mesh& mesh_;
    std::size_t run_ = 0;
};

const drd_Mesh& MeshOr(const drd_Deck& deck, int block) {
    static const drd_Mesh kNone;
    const drd_Mesh* mesh = deck.MeshOf(deck.blocks[static_cast<std::size_t>(block)]);
    return mesh == nullptr ? kNone : *mesh;
}

drd_Place BeginOf(const std::vector<drd_PlaceRun>& runs) {
    return runs.empty() ? drd_Nowhere : drd_Place{runs[0].file, static_cast<long>(runs[0].line)};
}

} // namespace

void drd_Differ::CompareMeshes(Pair blocks, const Context& context) {
    const drd_Mesh& first = MeshOr(First(), blocks.first);
    const drd_Mesh& second = MeshOr(Second(), blocks.second);
    CompareNodes(first, second, blocks, context);
    if (!SameElements(first, second)) CompareElements(first, second, blocks, context);
}

void drd_Differ::CompareNodes(const drd_Mesh& first, const drd_Mesh& second, Pair blocks,
                              const Context& context) {
    const bool sameLabels = SameBytes(first.nodes, second.nodes);
    if (sameLabels && SameBytes(first.coordinates, second.coordinates)) return;
    const drd_LabelIndex* index = sameLabels ? nullptr : second_.Names().Nodes(blocks.second);
    Few moved;
    Few removed;
    double greatest = 0.0;
    drd_Place firstMoved = drd_Nowhere;
    drd_Place secondMoved = drd_Nowhere;
    std::uint64_t found = 0;
    for (std::uint64_t i = 0; i < first.nodes.Size(); ++i) {
        // What is equal byte by byte needs no look at each number.
        constexpr std::uint64_t kNodes = 512;
        if (sameLabels && i % kNodes == 0 && i + kNodes <= first.nodes.Size() &&
            // NOLINTNEXTLINE(bugprone-suspicious-memory-comparison)
            std::memcmp(first.coordinates.Data() + 3 * i, second.coordinates.Data() + 3 * i,
                        3 * kNodes * sizeof(double)) == 0) {
            found += kNodes;
            i += kNodes - 1;
            continue;
        }
        std::int64_t place = static_cast<std::int64_t>(i);
        if (!sameLabels) place = index == nullptr ? -1 : index->Find(first.nodes[i]);
        if (place < 0) {
            removed.Add(first.nodes[i]);
            continue;
        }
        ++found;
        const double* a = first.coordinates.Data() + 3 * i;
        const double* b = second.coordinates.Data() + 3 * place;
        if (drd_IsNear(a[0], b[0], options_.tolerance) && drd_IsNear(a[1], b[1], options_.tolerance) &&
            drd_IsNear(a[2], b[2], options_.tolerance)) {
            continue;
        }
        if (moved.Count() == 0) {
            firstMoved = drd_PlaceOf(first.nodePlaces, i);
            secondMoved = drd_PlaceOf(second.nodePlaces, static_cast<std::uint64_t>(place));
        }
        moved.Add(first.nodes[i]);
        greatest = std::max(greatest, std::hypot(a[0] - b[0], a[1] - b[1], a[2] - b[2]));
    }
    if (moved.Count() > 0) {
        Tell(drd_ChangeEnm::CHANGED, "mesh",
             context + moved.Words("node") + std::string(moved.Verb(" stands", " stand")) +
                 " elsewhere, at most " + drd_Shown(greatest) + " apart",
             firstMoved, secondMoved);
    }
    if (removed.Count() > 0) {
        Tell(drd_ChangeEnm::REMOVED, "mesh", context + removed.Words("node") + " removed",
             BeginOf(first.nodePlaces), BeginOf(second.nodePlaces));
    }
    if (found == second.nodes.Size()) return;
    const drd_LabelIndex* own = first_.Names().Nodes(blocks.first);
    Few added;
    for (const int label : second.nodes) {
        if (own == nullptr || own->Find(label) < 0) added.Add(label);
    }
    if (added.Count() == 0) return;
    Tell(drd_ChangeEnm::ADDED, "mesh", context + added.Words("node") + " added", BeginOf(first.nodePlaces),
         BeginOf(second.nodePlaces));
}

bool drd_Differ::SameOwners(const drd_Mesh& first, const drd_Mesh& second) const {
    if (first.owners.Size() != second.owners.Size()) return false;
    for (std::size_t i = 0; i < first.owners.Size(); ++i) {
        const int a = first.owners[i];
        const int b = second.owners[i];
        if ((a < 0) != (b < 0)) return false;
        if (a >= 0 && drd_FoldCase(First().owners[static_cast<std::size_t>(a)]) !=
                          drd_FoldCase(Second().owners[static_cast<std::size_t>(b)])) {
            return false;
        }
    }
    return true;
}

bool drd_Differ::SameElements(const drd_Mesh& first, const drd_Mesh& second) const {
    if (!SameBytes(first.elements, second.elements) || !SameBytes(first.connectivity, second.connectivity)) {
        return false;
    }
    if (!SameOwners(first, second)) return false;
    // Runs of equal types may be cut at different keywords.
    auto a = first.elementRuns.begin();
    auto b = second.elementRuns.begin();
    std::uint64_t endA = 0;
    std::uint64_t endB = 0;
    while (a != first.elementRuns.end() && b != second.elementRuns.end()) {
        if (a->nodes != b->nodes || drd_FoldCase(First().types[static_cast<std::size_t>(a->type)]) !=
                                        drd_FoldCase(Second().types[static_cast<std::size_t>(b->type)])) {
            return false;
        }
        endA = a->first + a->count;
        endB = b->first + b->count;
        if (endA <= endB) ++a;
        if (endB <= endA) ++b;
    }
    return true;
}

void drd_Differ::CompareElements(const drd_Mesh& first, const drd_Mesh& second, Pair blocks,
                                 const Context& context) {
    ElementRows rows(First(), first);
    ElementRows others(Second(), second);
    const drd_LabelIndex* index = second_.Names().Elements(blocks.second);
    Few retyped;
    Few rewired;
    Few removed;
    drd_Place firstPlace = drd_Nowhere;
    drd_Place secondPlace = drd_Nowhere;
    for (std::uint64_t i = 0; i < first.elements.Size(); ++i) {
        const std::int64_t place = index == nullptr ? -1 : index->Find(first.elements[i]);
        if (place < 0) {
            removed.Add(first.elements[i]);
            continue;
        }
        const ElementRows::Row a = rows.Of(i);
        const ElementRows::Row b = others.Of(static_cast<std::uint64_t>(place));
        const bool sameType = a.type == b.type || drd_FoldCase(*a.type) == drd_FoldCase(*b.type);
        bool sameNodes = std::equal(a.nodes.begin(), a.nodes.end(), b.nodes.begin(), b.nodes.end());
        for (std::size_t n = 0;
             sameNodes && (a.owners != nullptr || b.owners != nullptr) && n < a.nodes.size(); ++n) {
            sameNodes = rows.Owner(a, n) == others.Owner(b, n);
        }
        if (sameType && sameNodes) continue;
        if (retyped.Count() + rewired.Count() == 0) {
            firstPlace = drd_PlaceOf(first.elementPlaces, i);
            secondPlace = drd_PlaceOf(second.elementPlaces, static_cast<std::uint64_t>(place));
        }
        (sameType ? rewired : retyped).Add(first.elements[i]);
    }
    if (retyped.Count() > 0) {
        Tell(drd_ChangeEnm::CHANGED, "mesh",
             context + retyped.Words("element") + std::string(retyped.Verb(" has", " have")) +
                 " another type",
             firstPlace, secondPlace);
    }
    if (rewired.Count() > 0) {
        Tell(drd_ChangeEnm::CHANGED, "mesh",
             context + rewired.Words("element") + std::string(rewired.Verb(" has", " have")) + " other nodes",
             firstPlace, secondPlace);
    }
    if (removed.Count() > 0) {
        Tell(drd_ChangeEnm::REMOVED, "mesh", context + removed.Words("element") + " removed",
             BeginOf(first.elementPlaces), BeginOf(second.elementPlaces));
    }
    Few added;
    const drd_LabelIndex* own = first_.Names().Elements(blocks.first);
    for (const int label : second.elements) {
        if (own == nullptr || own->Find(label) < 0) added.Add(label);
    }
    if (added.Count() > 0) {
        Tell(drd_ChangeEnm::ADDED, "mesh", context + added.Words("element") + " added",
             BeginOf(first.elementPlaces), BeginOf(second.elementPlaces));
    }
}

namespace {

/// Sets by kind, block and folded name.
class SetIndex {
public:
    explicit SetIndex(const std::vector<drd_Set>& sets) {
        sets_.Reserve(sets.size());
        int place = 0;
        for (const drd_Set& set : sets)
            sets_.TryEmplace(drd_FoldCase(set.name), place++, drd_ScopeOf(set.kind, set.block));
    }
    /// -1 when there is none.
    int Find(drd_KindEnm kind, int block, std::string_view folded) const {
        const int* found = sets_.Find(folded, drd_ScopeOf(kind, block));
        return found == nullptr ? -1 : *found;
    }

private:
    drd_TextMap sets_;
};

drd_Place PlaceOfSet(const drd_Deck& deck, const drd_Set& set) {
    return deck
        .keywords[static_cast<std::size_t>(deck.setParts[static_cast<std::size_t>(set.parts[0])].keyword)]
        .Place();
}

} // namespace

std::string drd_Differ::BlockWords(const drd_Deck& deck, int block) const {
    const drd_Block& of = deck.blocks[static_cast<std::size_t>(block)];
    if (of.kind == drd_BlockEnm::INSTANCE) return of.name + ".";
    if (of.kind == drd_BlockEnm::PART) return "part " + of.name + ": ";
    return {};
}

std::string drd_Differ::SetWords(const drd_Deck& deck, const drd_Set& set) const {
    return std::string(drd_WordOf(set.kind)) + " " + BlockWords(deck, set.block) + set.name;
}

void drd_Differ::CompareSets() {
    const std::vector<drd_Set>& first = first_.Names().Sets();
    const std::vector<drd_Set>& second = second_.Names().Sets();
    std::vector<char> isTaken(second.size(), 0);
    std::optional<SetIndex> index;
    std::size_t next = 0; // in most decks the partner of the next set
    for (std::size_t i = 0; i < first.size(); ++i) {
        const std::optional<int> block = PartnerOf(first[i].block);
        if (!block) continue;
        const std::string name = first_.Name("\"" + first[i].name + "\"");
        const bool isNext = next < second.size() && second[next].kind == first[i].kind &&
                            second[next].block == *block && drd_FoldCase(second[next].name) == name;
        if (!isNext && !index) index.emplace(second);
        const int found = isNext ? static_cast<int>(next) : index->Find(first[i].kind, *block, name);
        if (found < 0) {
            Tell(drd_ChangeEnm::REMOVED, std::string(drd_WordOf(first[i].kind)),
                 SetWords(First(), first[i]) + " removed", PlaceOfSet(First(), first[i]), drd_Nowhere);
            continue;
        }
        isTaken[static_cast<std::size_t>(found)] = 1;
        next = static_cast<std::size_t>(found) + 1;
        CompareSet({static_cast<int>(i), found});
    }
    std::vector<char> hasPartner(Second().blocks.size(), 0);
    for (const int partner : partners_) {
        if (partner >= 0) hasPartner[static_cast<std::size_t>(partner)] = 1;
    }
    for (std::size_t i = 0; i < second.size(); ++i) {
        if (isTaken[i] != 0 || hasPartner[static_cast<std::size_t>(second[i].block)] == 0) continue;
        Tell(drd_ChangeEnm::ADDED, std::string(drd_WordOf(second[i].kind)),
             SetWords(Second(), second[i]) + " added", drd_Nowhere, PlaceOfSet(Second(), second[i]));
    }
}

/// Whether both list the same labels in the same way; false says nothing.
bool drd_Differ::SameLabels(const drd_Set& first, const drd_Set& second) const {
    if (first.parts.size() != 1 || second.parts.size() != 1) return false;
    const drd_SetPart& a = First().setParts[static_cast<std::size_t>(first.parts[0])];
    const drd_SetPart& b = Second().setParts[static_cast<std::size_t>(second.parts[0])];
    const bool isPlain =
        FirstKeyword(a.keyword).set >= 0 && SecondKeyword(b.keyword).set >= 0 && a.members.empty() &&
        b.members.empty() &&
        FirstKeyword(a.keyword).Find(a.kind == drd_KindEnm::NODE_SET ? "elset" : "nset") == nullptr &&
        SecondKeyword(b.keyword).Find(b.kind == drd_KindEnm::NODE_SET ? "elset" : "nset") == nullptr;
    const auto labelsA = First().labels.Part(a.first, a.count);
    const auto labelsB = Second().labels.Part(b.first, b.count);
    return isPlain && a.isGenerated == b.isGenerated &&
           drd_FoldCase(a.instance) == drd_FoldCase(b.instance) &&
           std::equal(labelsA.begin(), labelsA.end(), labelsB.begin(), labelsB.end());
}

/// The members of a set of the first deck, instances as blocks of the second.
std::vector<drd_Member> drd_Differ::MembersInSecond(int set) const {
    std::vector<drd_Member> members;
    first_.Names().Expand(set, members);
    for (drd_Member& member : members) {
        if (member.instance < 0) continue;
        // An instance without partner is one that no member of the other deck can be in.
        member.instance =
            PartnerOf(member.instance).value_or(static_cast<int>(Second().blocks.size()) + member.instance);
    }
    std::sort(members.begin(), members.end());
    return members;
}

std::vector<drd_Member> drd_Differ::MembersOfSecond(int set) const {
    std::vector<drd_Member> members;
    second_.Names().Expand(set, members);
    return members;
}

void drd_Differ::CompareSet(Pair sets) {
    const drd_Set& first = first_.Names().Sets()[static_cast<std::size_t>(sets.first)];
    const drd_Set& second = second_.Names().Sets()[static_cast<std::size_t>(sets.second)];
    if (SameLabels(first, second)) return;
    const std::vector<drd_Member> before = MembersInSecond(sets.first);
    const std::vector<drd_Member> after = MembersOfSecond(sets.second);
    if (before == after) return;
    const std::string_view what = first.kind == drd_KindEnm::NODE_SET ? "node" : "element";
    const auto only = [](const std::vector<drd_Member>& these, const std::vector<drd_Member>& those) {
        std::vector<drd_Member> members;
        std::set_difference(these.begin(), these.end(), those.begin(), those.end(),
                            std::back_inserter(members));
        Few few;
        for (const drd_Member& member : members) few.Add(member.label);
        return few;
    };
    const Few removed = only(before, after);
    const Few added = only(after, before);
    std::string text = SetWords(First(), first) + ": ";
    if (added.Count() > 0) text += added.Words(what) + " added";
    if (added.Count() > 0 && removed.Count() > 0) text += ", ";
    if (removed.Count() > 0) text += removed.Words(what) + " removed";
    Tell(drd_ChangeEnm::CHANGED, std::string(drd_WordOf(first.kind)), std::move(text),
         PlaceOfSet(First(), first), PlaceOfSet(Second(), second));
}

/// Sets of the first deck without partner whose members are those of a set of the second without partner.
void drd_Differ::RenamesOfSets() {
    const auto keyOf = [](drd_KindEnm kind, int block, const std::vector<drd_Member>& members) {
        std::string key = std::to_string(static_cast<int>(kind)) + "/" + std::to_string(block) + "/";
        for (const drd_Member& m : members)
            key += std::to_string(m.instance) + "." + std::to_string(m.label) + ",";
        return key;
    };
    const auto& second = second_.Names().Sets();
    const SetIndex names(second);
    drd_Waiting lonely;
    std::vector<char> isKnown(second.size(), 0);
    const auto& first = first_.Names().Sets();
    std::vector<int> without;
    for (std::size_t i = 0; i < first.size(); ++i) {
        const std::optional<int> block = PartnerOf(first[i].block);
        if (!block) continue;
        const int found = names.Find(first[i].kind, *block, drd_FoldCase(first[i].name));
        if (found < 0) {
            without.push_back(static_cast<int>(i));
        } else {
            isKnown[static_cast<std::size_t>(found)] = 1;
        }
    }
    if (without.empty()) return;
    for (std::size_t i = 0; i < second.size(); ++i) {
        if (isKnown[i] != 0) continue;
        lonely.Put(keyOf(second[i].kind, second[i].block, MembersOfSecond(static_cast<int>(i))),
                   static_cast<int>(i));
    }
    for (const int i : without) {
        const drd_Set& set = first[static_cast<std::size_t>(i)];
        const int partner = lonely.Take(keyOf(set.kind, *PartnerOf(set.block), MembersInSecond(i)));
        if (partner < 0) continue;
        const std::string before = drd_FoldCase(set.name);
        const std::string after = drd_FoldCase(second[static_cast<std::size_t>(partner)].name);
        const drd_Block& block = First().blocks[static_cast<std::size_t>(set.block)];
        if (block.kind == drd_BlockEnm::INSTANCE) {
            const std::string instance = drd_FoldCase(block.name) + ".";
            renames_.emplace(instance + before, instance + after);
        }
        renames_.emplace(before, after);
    }
}
