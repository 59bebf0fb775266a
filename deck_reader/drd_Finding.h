#ifndef QRX_DECK_READER_DRD_FINDING_H
#define QRX_DECK_READER_DRD_FINDING_H

#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

enum class drd_SeverityEnm { ERROR, WARNING, NOTE };

/// A kind of finding of decks under its short name, which never changes.
struct drd_Code {
    std::string_view name;
    drd_SeverityEnm severity;
    const char* meaning;
};

/// All kinds of findings of decks.
inline constexpr drd_Code drd_Codes[] = {
#include "deck_reader/drd_Codes.inl"
};

/// The name of a code, looked up while compiling.
class drd_CodeName {
public:
    // NOLINTNEXTLINE(google-explicit-constructor): a literal in a call is the name
    consteval drd_CodeName(const char* name) : row_(&Find(name)) {}
    constexpr const drd_Code& Row() const { return *row_; }

private:
    static consteval const drd_Code& Find(std::string_view name) {
        for (const drd_Code& code : drd_Codes) {
            if (code.name == name) return code;
        }
        throw "no such code";
    }

    const drd_Code* row_;
};

/// Where something stands: a file of the deck, and its line from 1.
struct drd_Place {
    int file = 0;
    long line = 0;
};
inline constexpr drd_Place drd_Nowhere{-1, 0};

struct drd_Finding {
    const drd_Code* code = nullptr;
    drd_Place place = {};
    std::string found = {};
    std::string expected = {};
    std::string hint = {};
};

/// Takes findings, and of each kind no more than a screen can show: a deck of a million wrong lines says so
/// once.
class drd_Findings {
public:
    static constexpr std::size_t kShownOfOneKind = 100;

    void Add(drd_CodeName code, drd_Place place, std::string found, std::string expected = {},
             std::string hint = {}) {
        const drd_Code& row = code.Row();
        if (row.severity == drd_SeverityEnm::ERROR) hasErrors_ = true;
        if (++counts_[row.name] > kShownOfOneKind) return;
        list_.push_back({&row, place, std::move(found), std::move(expected), std::move(hint)});
    }
    /// Whether one more of the kind would be kept; spares making its text.
    bool Wants(drd_CodeName code) {
        const auto count = counts_.find(code.Row().name);
        return count == counts_.end() || count->second < kShownOfOneKind;
    }

    const std::vector<drd_Finding>& List() const { return list_; }
    bool HasErrors() const { return hasErrors_; }
    /// How many there were of each kind, those not kept included.
    const std::map<std::string_view, std::size_t>& Counts() const { return counts_; }

private:
    std::vector<drd_Finding> list_;
    std::map<std::string_view, std::size_t> counts_;
    bool hasErrors_ = false;
};

#endif
