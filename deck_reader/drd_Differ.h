#ifndef QRX_DECK_READER_DRD_DIFFER_H
#define QRX_DECK_READER_DRD_DIFFER_H

#include "deck_reader/drd_Canonical.h"
#include "deck_reader/drd_Diff.h"
#include "deck_reader/drd_TextMap.h"

#include <algorithm>
#include <optional>
#include <span>

/// What a line of a condition is called, and how many of its fields tell what it acts on.
struct drd_ConditionWord {
    std::string_view key;
    std::string_view word;
    std::size_t fields;
};
/// The row of keywords whose lines stand each for itself; null for all others.
const drd_ConditionWord* drd_FindCondition(std::string_view key);

/// The items that are not among those taken, which are sorted then.
std::vector<int> drd_Without(std::span<const int> items, std::vector<int>& taken);

/// The blocks of a deck by the block around them, in their order.
class drd_BlockTree {
public:
    explicit drd_BlockTree(const drd_Deck& deck);
    std::span<const int> In(int parent) const;

private:
    std::vector<int> blocks_; // parent by parent
    std::vector<std::size_t> ends_;
};

/// One comparison of two decks.
class drd_Differ {
public:
    drd_Differ(const drd_Deck& first, const drd_Deck& second, const drd_DiffOptions& options);
    drd_DiffResult Run();

private:
    using Items = std::vector<int>;
    using ItemView = std::span<const int>;
    struct Pair {
        int first;
        int second;
    };
    /// Things of both decks that belong together, and those that have no partner.
    struct Match {
        std::vector<Pair> pairs;
        Items onlyFirst;
        Items onlySecond;
    };
    /// Where in the deck a difference is: "step Pull: ".
    using Context = std::string;

    // Blocks and all (drd_Diff.cpp).
    void FindRenames(Pair blocks);
    void RenamesOfSets();
    void RenamesOfBlock(Pair blocks);
    Match MatchBlocks(drd_BlockEnm kind, Pair parents) const;
    static Items BlocksOfKind(const drd_Deck& deck, ItemView blocks, drd_BlockEnm kind);
    void Blocks(Pair parents, const Context& context);
    void Block(Pair blocks, const Context& context);
    void OpeningLine(Pair blocks, const Context& context);
    void StepOrder(const Match& steps, const Context& context);
    void Comments();
    std::optional<int> PartnerOf(int block) const;
    static Context ContextOf(const Context& outer, const drd_Block& block);

    // Keywords (drd_DiffItems.cpp).
    void CompareItems(ItemView first, ItemView second, const Context& context);
    void CompareAlike(const Items& first, const Items& second, const Context& context);
    /// The items of one key each, in their order.
    template <class KeyOf>
    Match MatchByKey(ItemView first, ItemView second, const KeyOf& keyOf) const;
    Match MatchByName(const Items& first, const Items& second) const;
    Match MatchBySignature(const Items& first, const Items& second) const;
    void MatchRenamed(Match& match, const Context& context);
    void TellMoved(std::vector<Pair> pairs, const Context& context);
    void TellLonely(const Match& match, const Context& context);
    void CompareKeyword(Pair keywords, const Context& context);
    void CompareParameters(Pair keywords, const Context& context);
    void CompareLines(Pair keywords, const Context& context);
    void CompareFields(std::string_view first, std::string_view second, std::uint64_t line, Pair keywords,
                       const Context& context);
    bool AreNear(std::string_view first, std::string_view second) const;
    bool IsIgnored(const drd_Keyword& keyword) const;
    std::string NameOfItem(const drd_Keyword& keyword) const;
    // Conditions, line by line (drd_DiffConditions.cpp).
    struct Condition {
        int keyword;
        std::int64_t line; // -1: the keyword has none
        std::string target;
        std::string parameters;
    };
    std::vector<Condition> ConditionsOf(const drd_Canonical& deck, const Items& items,
                                        std::size_t fields) const;
    void CompareConditions(const Items& first, const Items& second, const drd_ConditionWord& word,
                           const Context& context);
    void CompareCondition(const Condition& first, const Condition& second, const drd_ConditionWord& word,
                          const Context& context);
    std::string WordsOf(const drd_Deck& deck, const Condition& condition,
                        const drd_ConditionWord& word) const;

    // Meshes and sets (drd_DiffMesh.cpp).
    void CompareMeshes(Pair blocks, const Context& context);
    void CompareNodes(const drd_Mesh& first, const drd_Mesh& second, Pair blocks, const Context& context);
    void CompareElements(const drd_Mesh& first, const drd_Mesh& second, Pair blocks, const Context& context);
    bool SameOwners(const drd_Mesh& first, const drd_Mesh& second) const;
    bool SameElements(const drd_Mesh& first, const drd_Mesh& second) const;
    void CompareSets();
    void CompareSet(Pair sets);
    bool SameLabels(const drd_Set& first, const drd_Set& second) const;
    std::vector<drd_Member> MembersInSecond(int set) const;
    std::vector<drd_Member> MembersOfSecond(int set) const;
    std::string BlockWords(const drd_Deck& deck, int block) const;
    std::string SetWords(const drd_Deck& deck, const drd_Set& set) const;

    void Tell(drd_ChangeEnm change, std::string kind, std::string text, drd_Place first, drd_Place second);
    const drd_Deck& First() const { return first_.Deck(); }
    const drd_Deck& Second() const { return second_.Deck(); }
    const drd_Keyword& FirstKeyword(int index) const { return first_.Keyword(index); }
    const drd_Keyword& SecondKeyword(int index) const { return second_.Keyword(index); }

    drd_DiffOptions options_;
    drd_Canonical first_;
    drd_Canonical second_;
    drd_Canonical::Renames renames_;
    drd_BlockTree blocksOfFirst_;
    drd_BlockTree blocksOfSecond_;
    std::vector<int> partners_; // of the blocks of the first deck
    drd_DiffResult result_;
};

template <class KeyOf>
drd_Differ::Match drd_Differ::MatchByKey(ItemView first, ItemView second, const KeyOf& keyOf) const {
    Match match;
    // Most decks have the same things in the same order: as long as they do, who comes first goes with who
    // comes first.
    std::size_t same = 0;
    const std::size_t both = std::min(first.size(), second.size());
    match.pairs.reserve(both);
    for (; same < both && keyOf(first_, first[same]) == keyOf(second_, second[same]); ++same) {
        match.pairs.push_back({first[same], second[same]});
    }
    first = first.subspan(same);
    second = second.subspan(same);
    Items taken;
    drd_Waiting byKey;
    for (const int item : second) byKey.Put(keyOf(second_, item), item);
    for (const int item : first) {
        const int partner = byKey.Take(keyOf(first_, item));
        if (partner < 0) {
            match.onlyFirst.push_back(item);
            continue;
        }
        match.pairs.push_back({item, partner});
        taken.push_back(partner);
    }
    match.onlySecond = drd_Without(second, taken);
    return match;
}

/// The places of a longest run of values that grow; what is not in it has been moved.
std::vector<char> drd_LongestGrowing(const std::vector<int>& values);

#endif
