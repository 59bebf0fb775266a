#ifndef QRX_DECK_READER_DRD_NAMES_H
#define QRX_DECK_READER_DRD_NAMES_H

#include "deck_reader/drd_Deck.h"
#include "deck_reader/drd_TextMap.h"

#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

/// Finds the place of a label in a mesh.
class drd_LabelIndex {
public:
    explicit drd_LabelIndex(const drd_Flat<int>& labels);
    /// -1 when there is none; the first of repeated ones.
    std::int64_t Find(int label) const;
    /// The places of labels that stood before.
    const std::vector<std::uint64_t>& Repeated() const { return repeated_; }

private:
    void BuildTable(int greatest);
    void BuildOrder();

    const drd_Flat<int>& labels_;
    bool isRun_ = false;                 // labels count up by one
    std::vector<std::int32_t> table_;    // by label
    std::vector<std::uint32_t> ordered_; // places in the order of labels
    std::vector<std::uint64_t> repeated_;
};

/// A member of a set: a label in an instance, or in the mesh of the set's own block (-1).
struct drd_Member {
    int instance;
    int label;
    friend auto operator<=>(const drd_Member&, const drd_Member&) = default;
};

/// The scope of a drd_TextMap that has the names of one kind in one block.
inline std::uint64_t drd_ScopeOf(drd_KindEnm kind, int block) {
    return std::uint64_t{static_cast<std::uint8_t>(kind)} << 32U | static_cast<std::uint32_t>(block);
}

/// A set under its name, with all the keywords that say something of it.
struct drd_Set {
    drd_KindEnm kind = drd_KindEnm::NODE_SET;
    int block = 0;
    drd_Word name;
    std::span<const int> parts; ///< indices of drd_Deck::setParts
};

/// What a reference leads to.
struct drd_Target {
    int set = -1;      ///< index of Sets()
    int keyword = -1;  ///< that defines the name
    int instance = -1; ///< block of the instance whose label or set it is
    int label = 0;     ///< of a node or an element
    int block = -1;    ///< whose mesh has the label

    explicit operator bool() const { return set >= 0 || keyword >= 0 || label > 0; }
};

/// The names of a deck and what they lead to. The deck must outlive it and stay as it is.
class drd_Names {
public:
    explicit drd_Names(const drd_Deck& deck);

    const std::vector<drd_Set>& Sets() const { return SetNames().sets; }
    /// Keywords whose name stood before.
    const std::vector<int>& DefinedTwice() const { return Definitions().twice; }

    /// The part of a name as it stands, and the instance of one without quotes, as a block, or -1.
    int FindPart(std::string_view value) const;
    int FindInstance(std::string_view name) const;
    /// The part of an instance, or -1.
    int PartOf(int instance) const { return partOf_[static_cast<std::size_t>(instance)]; }
    /// What the name leads to, seen from a block: NAME, `INSTANCE.NAME`, and where the reference takes
    /// labels, LABEL and `INSTANCE.LABEL`.
    drd_Target Find(drd_KindEnm kind, std::string_view name, int block) const;
    drd_Target Find(drd_RefEnm ref, drd_KindEnm kind, std::string_view name, int block) const;
    /// The known name that is nearest, as a hint.
    std::string Nearest(drd_KindEnm kind, std::string_view name) const;

    /// The block whose mesh an instance shows: its own, or its part's; else the block itself.
    int MeshBlock(int block) const;
    /// The indices of the mesh of a block; null when it has none.
    const drd_LabelIndex* Nodes(int block) const;
    const drd_LabelIndex* Elements(int block) const;

    /// All members of a set, each once, in order. False when names lead nowhere.
    bool Expand(int set, std::vector<drd_Member>& members) const;

private:
    /// What has been taken of sets of sets.
    struct Seen {
        std::unordered_set<std::int64_t> sets;
        int depth = 0;
    };

    /// The names of sets, each kind in each block a scope.
    struct SetTable {
        std::vector<drd_Set> sets;
        std::vector<int> parts; // set by set
        drd_TextMap index;
    };
    /// The names that keywords define, each kind in each block (-1: any) a scope.
    struct DefinitionTable {
        std::vector<int> twice;
        drd_TextMap index;
    };

    // Made when they are first asked for: two decks that are alike are compared without most of them.
    const SetTable& SetNames() const;
    const DefinitionTable& Definitions() const;
    const drd_TextMap& Instances() const;
    const int* Indexed(drd_KindEnm kind, std::string_view folded, int block) const;
    int FindScoped(drd_KindEnm kind, std::string_view folded, int block) const;
    int FindAbove(drd_KindEnm kind, std::string_view folded) const;
    drd_Target FindInInstances(drd_KindEnm kind, std::string_view folded) const;
    drd_Target TargetOf(drd_KindEnm kind, int index) const;
    bool FindLabel(drd_KindEnm kind, std::string_view folded, int block, drd_Target& target) const;
    bool HasLabel(drd_KindEnm kind, int label, int block) const;
    bool Collect(int set, int instance, Seen& seen, std::vector<drd_Member>& members) const;
    bool CollectPart(const drd_SetPart& part, int instance, Seen& seen,
                     std::vector<drd_Member>& members) const;
    void CollectLabels(const drd_SetPart& part, int owner, std::vector<drd_Member>& members) const;
    bool CollectFromMesh(const drd_SetPart& part, int instance, Seen& seen,
                         std::vector<drd_Member>& members) const;
    bool CollectNodesOfElements(const drd_SetPart& part, int instance, Seen& seen,
                                std::vector<drd_Member>& members) const;

    const drd_Deck& deck_;
    mutable std::unique_ptr<SetTable> sets_;
    mutable std::unique_ptr<DefinitionTable> definitions_;
    mutable std::unique_ptr<drd_TextMap> instances_;
    drd_TextMap parts_;
    std::vector<int> partOf_; // by block
    int assembly_ = -1;
    // By mesh.
    mutable std::vector<std::unique_ptr<drd_LabelIndex>> nodes_;
    mutable std::vector<std::unique_ptr<drd_LabelIndex>> elements_;
};

/// Whether a column's rule holds for a keyword: it has the parameter that the rule asks for.
bool drd_Applies(const drd_DataRef& ref, const drd_Keyword& keyword);
/// Whether it does, and is about that field of that line, both from 0.
bool drd_Applies(const drd_DataRef& ref, const drd_Keyword& keyword, std::uint64_t line, int column);
/// Whether the row of a parameter is about the keyword.
inline bool drd_Applies(const drd_ParameterRef& ref, const drd_Keyword& keyword) {
    // The amplitude of a step is a word for how its loads come.
    return ref.keyword.empty() ? keyword.Key() != "step" : ref.keyword == keyword.Key();
}

#endif
