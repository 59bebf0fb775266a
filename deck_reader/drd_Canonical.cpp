#include "deck_reader/drd_Canonical.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <map>

namespace {

constexpr std::uint64_t kSeed = 0x9E3779B97F4A7C15U;

std::uint64_t Mixed(std::uint64_t hash, std::uint64_t value) {
    hash ^= value + kSeed + (hash << 12U) + (hash >> 4U);
    hash *= 0xFF51AFD7ED558CCDU;
    return hash ^ (hash >> 32U);
}

std::uint64_t HashOf(std::string_view text) {
    std::uint64_t hash = 0xCBF29CE484222325U;
    for (const char c : text) hash = (hash ^ static_cast<unsigned char>(c)) * 0x100000001B3U;
    return Mixed(hash, text.size());
}

std::uint64_t HashOf(double number) {
    return Mixed(1, std::bit_cast<std::uint64_t>(number == 0.0 ? 0.0 : number));
}

} // namespace

bool drd_IsNear(double a, double b, double tolerance) {
    return a == b || std::fabs(a - b) <= tolerance * std::max(std::fabs(a), std::fabs(b));
}

drd_Canonical::drd_Canonical(const drd_Deck& deck, bool ignoreTitles)
    : deck_(deck), ignoreTitles_(ignoreTitles), names_(deck), items_(deck.blocks.size()) {
    for (std::size_t i = 0; i < deck.keywords.size(); ++i) {
        const drd_Keyword& keyword = deck.keywords[i];
        const drd_Block& block = deck.blocks[static_cast<std::size_t>(keyword.block)];
        const int index = static_cast<int>(i);
        if (keyword.parent >= 0 || keyword.isBulk || block.begin == index) continue;
        if (keyword.key.starts_with("end") && keyword.row != nullptr) continue;
        items_[static_cast<std::size_t>(keyword.block)].push_back(index);
    }
}

void drd_Canonical::Sign(const Renames& renames) {
    renames_ = renames.empty() ? nullptr : &renames;
    signatures_.assign(deck_.keywords.size(), 0);
    // Options stand behind their owner.
    for (std::size_t i = deck_.keywords.size(); i-- > 0;) {
        if (deck_.keywords[i].isBulk) continue;
        signatures_[i] = Mixed(OwnHash(deck_.keywords[i], true), OptionsHash(static_cast<int>(i)));
    }
}

std::uint64_t drd_Canonical::NamelessSignature(int keyword) const {
    return Mixed(OwnHash(deck_.keywords[static_cast<std::size_t>(keyword)], false), OptionsHash(keyword));
}

std::vector<int> drd_Canonical::ItemsOf(int block) const {
    return items_[static_cast<std::size_t>(block)];
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
    const bool isNamed = keyword.row != nullptr && keyword.row->defines != drd_KindEnm::NONE;
    for (const drd_Parameter& parameter : keyword.parameters) {
        if (!withName && isNamed && parameter.key == drd_NameParameter(*keyword.row)) continue;
        double number = 0.0;
        const bool isNumber = drd_ReadReal(parameter.value, number);
        parameters += Mixed(HashOf(parameter.key), isNumber ? HashOf(number) : HashOf(Name(parameter.value)));
    }
    return Mixed(Mixed(HashOf(keyword.key), parameters), DataHash(keyword));
}

std::uint64_t drd_Canonical::DataHash(const drd_Keyword& keyword) const {
    std::uint64_t hash = 0;
    if (drd_HasText(keyword.key) && ignoreTitles_) return hash;
    const std::uint64_t lines = LineCount(keyword);
    for (std::uint64_t i = 0; i < lines; ++i) {
        const std::string_view line = deck_.DataLine(keyword, i);
        if (drd_HasText(keyword.key)) {
            hash = Mixed(hash, HashOf(drd_Trim(line)));
            continue;
        }
        std::uint64_t lineHash = 7;
        for (const Field& field : Fields(line)) {
            lineHash = Mixed(lineHash, field.isNumber ? HashOf(field.number) : HashOf(field.text));
        }
        // The faces of a surface have no order.
        hash = keyword.key == "surface" ? hash + lineHash : Mixed(hash, lineHash);
    }
    return hash;
}

std::uint64_t drd_Canonical::OptionsHash(int keyword) const {
    // Options of different keywords have no order among each other; those of one keyword have.
    std::map<std::string_view, std::uint64_t> byKey;
    for (int i = keyword + 1; i < deck_.keywords[static_cast<std::size_t>(keyword)].end; ++i) {
        const drd_Keyword& option = deck_.keywords[static_cast<std::size_t>(i)];
        if (option.parent != keyword) continue;
        std::uint64_t& hash = byKey.try_emplace(option.key, 1).first->second;
        hash = Mixed(hash, signatures_[static_cast<std::size_t>(i)]);
    }
    std::uint64_t sum = 0;
    for (const auto& [key, hash] : byKey) sum += hash;
    return sum;
}
