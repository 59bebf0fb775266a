#include "deck_reader/drd_Canonical.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <numeric>

namespace {

constexpr std::uint64_t kSeed = 0x9E3779B97F4A7C15U;

std::uint64_t Mixed(std::uint64_t hash, std::uint64_t value) {
    hash ^= value + kSeed + (hash << 12U) + (hash >> 4U);
    hash *= 0xFF51AFD7ED558CCDU;
    return hash ^ (hash >> 32U);
}

constexpr std::uint64_t kEmptyText = 0xCBF29CE484222325U;

std::uint64_t WithByte(std::uint64_t hash, char c) {
    return (hash ^ static_cast<unsigned char>(c)) * 0x100000001B3U;
}

std::uint64_t HashOf(std::string_view text) {
    std::uint64_t hash = kEmptyText;
    for (const char c : text) hash = WithByte(hash, c);
    return Mixed(hash, text.size());
}

/// That of drd_FoldName(value).
std::uint64_t HashOfName(std::string_view value) {
    std::uint64_t hash = kEmptyText;
    std::size_t size = 0;
    for (const char c : drd_Trim(value)) {
        if (c == '"') continue;
        hash = WithByte(hash, drd_LowerCase(c));
        ++size;
    }
    return Mixed(hash, size);
}

std::uint64_t HashOf(double number) {
    return Mixed(1, std::bit_cast<std::uint64_t>(number == 0.0 ? 0.0 : number));
}

} // namespace

bool drd_IsNear(double a, double b, double tolerance) {
    return a == b || std::fabs(a - b) <= tolerance * std::max(std::fabs(a), std::fabs(b));
}

drd_Canonical::drd_Canonical(const drd_Deck& deck, bool ignoreTitles)
    : deck_(deck), ignoreTitles_(ignoreTitles), names_(deck), endsOfItems_(deck.blocks.size() + 1, 0) {
    const auto isItem = [&deck](std::size_t index) {
        const drd_Keyword& keyword = deck.keywords[index];
        return keyword.parent < 0 && !keyword.IsBulk() &&
               deck.blocks[static_cast<std::size_t>(keyword.block)].begin != static_cast<int>(index) &&
               !(keyword.Key().starts_with("end") && keyword.Row() != nullptr);
    };
    std::vector<std::pair<int, int>> items; // block and keyword
    for (std::size_t i = 0; i < deck.keywords.size(); ++i) {
        if (!isItem(i)) continue;
        items.emplace_back(deck.keywords[i].block, static_cast<int>(i));
        ++endsOfItems_[static_cast<std::size_t>(deck.keywords[i].block) + 1];
    }
    // Each block's end begins as its first place and moves on with every item.
    std::partial_sum(endsOfItems_.begin(), endsOfItems_.end(), endsOfItems_.begin());
    items_.resize(items.size());
    for (const auto& [block, item] : items) items_[endsOfItems_[static_cast<std::size_t>(block)]++] = item;
}

void drd_Canonical::Sign(const Renames& renames) {
    renames_ = renames.empty() ? nullptr : &renames;
    signatures_.assign(deck_.keywords.size(), 0);
    // Options stand behind their owner.
    for (std::size_t i = deck_.keywords.size(); i-- > 0;) {
        if (deck_.keywords[i].IsBulk()) continue;
        signatures_[i] = Mixed(OwnHash(deck_.keywords[i], true), OptionsHash(static_cast<int>(i)));
    }
}

std::uint64_t drd_Canonical::NamelessSignature(int keyword) const {
    return Mixed(OwnHash(deck_.keywords[static_cast<std::size_t>(keyword)], false), OptionsHash(keyword));
}

std::span<const int> drd_Canonical::ItemsOf(int block) const {
    const auto place = static_cast<std::size_t>(block);
    const std::size_t begin = place == 0 ? 0 : endsOfItems_[place - 1];
    return std::span(items_).subspan(begin, endsOfItems_[place] - begin);
}

std::vector<int> drd_Canonical::OptionsOf(int keyword) const {
    std::vector<int> options;
    for (int i = keyword + 1; i < deck_.keywords[static_cast<std::size_t>(keyword)].end; ++i) {
        if (deck_.keywords[static_cast<std::size_t>(i)].parent == keyword) options.push_back(i);
    }
    return options;
}

std::string drd_Canonical::Name(std::string_view value) const {
    std::string name = drd_FoldName(value);
    if (renames_ != nullptr) {
        const auto found = renames_->find(name);
        if (found != renames_->end()) name = found->second;
    }
    return name;
}

std::vector<drd_Canonical::Field> drd_Canonical::Fields(std::string_view line) const {
    drd_SplitFields(line, fields_);
    while (!fields_.empty() && fields_.back().empty()) fields_.pop_back();
    std::vector<Field> canonical;
    canonical.reserve(fields_.size());
    for (const std::string_view field : fields_) {
        Field entry;
        entry.isNumber = drd_ReadReal(field, entry.number);
        if (!entry.isNumber) entry.text = Name(field);
        canonical.push_back(std::move(entry));
    }
    return canonical;
}

std::uint64_t drd_Canonical::LineCount(const drd_Keyword& keyword) const {
    std::uint64_t lines = keyword.lines;
    while (lines > 0 && drd_Trim(deck_.DataLine(keyword, lines - 1)).empty()) --lines;
    return lines;
}

std::uint64_t drd_Canonical::OwnHash(const drd_Keyword& keyword, bool withName) const {
    // Added up, so that the order of parameters is no matter.
    std::uint64_t parameters = 0;
    const bool isNamed = keyword.Row() != nullptr && keyword.Row()->defines != drd_KindEnm::NONE;
    for (const drd_Parameter& parameter : keyword.Parameters()) {
        if (!withName && isNamed && parameter.Key() == drd_NameParameter(*keyword.Row())) continue;
        parameters += Mixed(HashOf(parameter.Key()), FieldHash(parameter.value));
    }
    return Mixed(Mixed(HashOf(keyword.Key()), parameters), DataHash(keyword));
}

std::uint64_t drd_Canonical::DataHash(const drd_Keyword& keyword) const {
    std::uint64_t hash = 0;
    if (keyword.HasText() && ignoreTitles_) return hash;
    const std::uint64_t lines = LineCount(keyword);
    for (std::uint64_t i = 0; i < lines; ++i) {
        const std::string_view line = deck_.DataLine(keyword, i);
        if (keyword.HasText()) {
            hash = Mixed(hash, HashOf(drd_Trim(line)));
            continue;
        }
        std::uint64_t lineHash = 7;
        drd_SplitFields(line, fields_);
        while (!fields_.empty() && fields_.back().empty()) fields_.pop_back();
        for (const std::string_view field : fields_) lineHash = Mixed(lineHash, FieldHash(field));
        // The faces of a surface have no order.
        hash = keyword.Key() == "surface" ? hash + lineHash : Mixed(hash, lineHash);
    }
    return hash;
}

std::uint64_t drd_Canonical::FieldHash(std::string_view field) const {
    double number = 0.0;
    if (drd_ReadReal(field, number)) return HashOf(number);
    return renames_ != nullptr ? HashOf(std::string_view(Name(field))) : HashOfName(field);
}

std::uint64_t drd_Canonical::OptionsHash(int keyword) const {
    const int end = deck_.keywords[static_cast<std::size_t>(keyword)].end;
    if (end == keyword + 1) return 0;
    options_.clear();
    for (int i = keyword + 1; i < end; ++i) {
        const drd_Keyword& option = deck_.keywords[static_cast<std::size_t>(i)];
        if (option.parent == keyword)
            options_.emplace_back(option.Key(), signatures_[static_cast<std::size_t>(i)]);
    }
    // Options of different keywords have no order among each other; those of one keyword have.
    std::stable_sort(options_.begin(), options_.end(),
                     [](const auto& a, const auto& b) { return a.first < b.first; });
    std::uint64_t sum = 0;
    for (auto option = options_.begin(); option != options_.end();) {
        std::uint64_t hash = 1;
        const std::string_view key = option->first;
        for (; option != options_.end() && option->first == key; ++option) hash = Mixed(hash, option->second);
        sum += hash;
    }
    return sum;
}
