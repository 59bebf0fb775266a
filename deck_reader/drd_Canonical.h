#ifndef QRX_DECK_READER_DRD_CANONICAL_H
#define QRX_DECK_READER_DRD_CANONICAL_H

#include "deck_reader/drd_Names.h"

#include <cstdint>
#include <span>
#include <string>
#include <unordered_map>
#include <vector>

/// A deck with what its keywords come to, whatever their spelling: two keywords of the same meaning have the
/// same signature.
class drd_Canonical {
public:
    /// Names of another deck under the names that they have in this one, folded.
    using Renames = std::unordered_map<std::string, std::string>;

    drd_Canonical(const drd_Deck& deck, bool ignoreTitles);

    const drd_Deck& Deck() const { return deck_; }
    const drd_Keyword& Keyword(int index) const { return deck_.keywords[static_cast<std::size_t>(index)]; }
    const drd_Names& Names() const { return names_; }
    /// Works the signatures out, names replaced.
    void Sign(const Renames& renames);

    /// Of a keyword with its options.
    std::uint64_t Signature(int keyword) const { return signatures_[static_cast<std::size_t>(keyword)]; }
    /// The same without the keyword's own name.
    std::uint64_t NamelessSignature(int keyword) const;
    /// The fields of a data line: folded text, or a number; trailing empty ones left out.
    struct Field {
        std::string text;
        double number = 0.0;
        bool isNumber = false;
    };
    std::vector<Field> Fields(std::string_view line) const;
    std::string Name(std::string_view value) const;
    /// How many data lines there are ahead of blank ones at the end.
    std::uint64_t LineCount(const drd_Keyword& keyword) const;
    /// The keywords of a block that are no options, no data of meshes and sets, and no ends of blocks.
    std::span<const int> ItemsOf(int block) const;
    std::vector<int> OptionsOf(int keyword) const;

private:
    std::uint64_t OwnHash(const drd_Keyword& keyword, bool withName) const;
    std::uint64_t DataHash(const drd_Keyword& keyword) const;
    std::uint64_t FieldHash(std::string_view field) const;
    std::uint64_t OptionsHash(int keyword) const;

    const drd_Deck& deck_;
    bool ignoreTitles_;
    drd_Names names_;
    std::vector<std::uint64_t> signatures_;
    const Renames* renames_ = nullptr;
    std::vector<int> items_; // block by block
    std::vector<std::size_t> endsOfItems_;
    mutable std::vector<std::string_view> fields_;
    mutable std::vector<std::pair<std::string_view, std::uint64_t>> options_;
};

/// Whether two numbers are equal within the tolerance.
bool drd_IsNear(double a, double b, double tolerance);

#endif
