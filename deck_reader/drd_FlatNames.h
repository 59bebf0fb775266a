#ifndef QRX_DECK_READER_DRD_FLATNAMES_H
#define QRX_DECK_READER_DRD_FLATNAMES_H

#include "deck_reader/drd_Names.h"

#include <unordered_map>
#include <unordered_set>

/// What labels and names become in a flat deck.
class drd_FlatNames {
public:
    /// The longest name that the language takes.
    static constexpr std::size_t kLongestName = 80;

    struct Renamed {
        int instance;
        std::string from; ///< INSTANCE.NAME, without quotes
        std::string to;   ///< without quotes
        friend bool operator==(const Renamed&, const Renamed&) = default;
    };

    drd_FlatNames(const drd_Deck& deck, const drd_Names& names);

    /// False when the labels of all instances are more than there are numbers.
    bool HasRoom() const { return hasRoom_; }
    /// What is added to the labels of an instance; to those of the assembly for its block; 0 for the model.
    int NodeOffset(int block) const { return nodeOffsets_[static_cast<std::size_t>(block)]; }
    int ElementOffset(int block) const { return elementOffsets_[static_cast<std::size_t>(block)]; }
    /// The flat name of what an instance calls `name`, as a deck can read it.
    std::string NameIn(int instance, std::string_view name);
    const std::vector<Renamed>& Table() const { return table_; }

private:
    void Offsets();
    void TakeNames();

    const drd_Deck& deck_;
    const drd_Names& names_;
    bool hasRoom_ = true;
    std::vector<int> nodeOffsets_; // by block
    std::vector<int> elementOffsets_;
    std::unordered_set<std::string> taken_; // folded
    std::unordered_map<std::string, std::string> known_;
    std::unordered_map<std::string, int> shortened_;
    std::vector<Renamed> table_;
};

#endif
