#include "deck_reader/drd_Differ.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>

namespace {

bool HasName(const drd_Keyword& keyword) {
    return keyword.Row() != nullptr && keyword.Row()->defines != drd_KindEnm::NONE &&
           keyword.Find(drd_NameParameter(*keyword.Row())) != nullptr;
}

std::string Shortened(std::string_view text) {
    constexpr std::size_t kShown = 60;
    text = drd_Trim(text);
    return text.size() <= kShown ? std::string(text) : std::string(text.substr(0, kShown)) + "...";
}

} // namespace

std::vector<int> drd_Without(std::span<const int> items, std::vector<int>& taken) {
    std::sort(taken.begin(), taken.end());
    std::vector<int> left;
    for (const int item : items) {
        if (!std::binary_search(taken.begin(), taken.end(), item)) left.push_back(item);
    }
    return left;
}

bool drd_Differ::IsIgnored(const drd_Keyword& keyword) const {
    return (options_.ignoreOutput && keyword.Row() != nullptr &&
            (keyword.Row()->owns == drd_GroupEnm::OUTPUT || keyword.Row()->IsOptionOf(drd_GroupEnm::OUTPUT) ||
             keyword.Key() == "restart" || keyword.Key() == "print" || keyword.Key() == "monitor")) ||
           (options_.ignoreTitles && keyword.Key() == "heading");
}

std::string drd_Differ::NameOfItem(const drd_Keyword& keyword) const {
    std::string text;
    if (HasName(keyword)) {
        return std::string(drd_WordOf(keyword.Row()->defines)) + " " +
               drd_NameOf(keyword.Value(drd_NameParameter(*keyword.Row())));
    }
    text = "*" + keyword.Name();
    for (const std::string_view parameter : {"elset", "nset", "surface", "master", "refnode", "interaction",
                                             "cavity", "constraintname", "component", "type"}) {
        if (keyword.Find(parameter) == nullptr) continue;
        return text + " " + drd_NameOf(keyword.Value(parameter));
    }
    return text;
}

/// Compares lists of keywords: kind by kind, since keywords of different kinds have no order among each
/// other.
void drd_Differ::CompareItems(ItemView first, ItemView second, const Context& context) {
    const auto isSame = [this](int a, int b) { return first_.Signature(a) == second_.Signature(b); };
    if (std::equal(first.begin(), first.end(), second.begin(), second.end(), isSame)) return;
    struct Alike {
        Items first;
        Items second;
    };
    std::vector<Alike> kinds;
    drd_TextMap index;
    const auto listsOf = [&](const drd_Keyword& keyword) -> Alike& {
        const auto [place, isNew] = index.TryEmplace(keyword.Key(), static_cast<int>(kinds.size()));
        if (isNew) kinds.emplace_back();
        return kinds[static_cast<std::size_t>(place)];
    };
    for (const int item : first) {
        if (!IsIgnored(FirstKeyword(item))) listsOf(FirstKeyword(item)).first.push_back(item);
    }
    for (const int item : second) {
        if (!IsIgnored(SecondKeyword(item))) listsOf(SecondKeyword(item)).second.push_back(item);
    }
    for (const Alike& alike : kinds) CompareAlike(alike.first, alike.second, context);
}

void drd_Differ::CompareAlike(const Items& first, const Items& second, const Context& context) {
    const drd_Keyword& sample = !first.empty() ? FirstKeyword(first[0]) : SecondKeyword(second[0]);
    Match match;
    if (HasName(sample)) {
        match = MatchByName(first, second);
        if (!match.onlyFirst.empty() && !match.onlySecond.empty()) MatchRenamed(match, context);
    } else {
        match = MatchBySignature(first, second);
        TellMoved(match.pairs, context);
        match.pairs.clear();
        if (const drd_ConditionWord* word = drd_FindCondition(sample.Key())) {
            CompareConditions(match.onlyFirst, match.onlySecond, *word, context);
            return;
        }
        // What has no partner that is equal: one by one in their order.
        const std::size_t alike = std::min(match.onlyFirst.size(), match.onlySecond.size());
        for (std::size_t i = 0; i < alike; ++i)
            match.pairs.push_back({match.onlyFirst[i], match.onlySecond[i]});
        match.onlyFirst.erase(match.onlyFirst.begin(),
                              match.onlyFirst.begin() + static_cast<std::ptrdiff_t>(alike));
        match.onlySecond.erase(match.onlySecond.begin(),
                               match.onlySecond.begin() + static_cast<std::ptrdiff_t>(alike));
    }
    for (const Pair& pair : match.pairs) CompareKeyword(pair, context);
    TellLonely(match, context);
}

drd_Differ::Match drd_Differ::MatchByName(const Items& first, const Items& second) const {
    return MatchByKey(first, second, [](const drd_Canonical& deck, int item) {
        const drd_Keyword& keyword = deck.Keyword(item);
        return keyword.Key() + "/" + deck.Name(keyword.Value(drd_NameParameter(*keyword.Row())));
    });
}

drd_Differ::Match drd_Differ::MatchBySignature(const Items& first, const Items& second) const {
    return MatchByKey(first, second,
                      [](const drd_Canonical& deck, int item) { return deck.Signature(item); });
}

/// Of the things without partner those that differ in their name alone.
void drd_Differ::MatchRenamed(Match& match, const Context& context) {
    drd_Waiting bySignature;
    for (const int item : match.onlySecond) bySignature.Put(second_.NamelessSignature(item), item);
    std::vector<int> taken;
    Items left;
    for (const int item : match.onlyFirst) {
        const int partner = bySignature.Take(first_.NamelessSignature(item));
        if (partner < 0) {
            left.push_back(item);
            continue;
        }
        taken.push_back(partner);
        const drd_Keyword& after = SecondKeyword(partner);
        Tell(drd_ChangeEnm::RENAMED, std::string(drd_WordOf(after.Row()->defines)),
             context + NameOfItem(FirstKeyword(item)) + " is now called " +
                 drd_NameOf(after.Value(drd_NameParameter(*after.Row()))),
             FirstKeyword(item).Place(), after.Place());
    }
    match.onlyFirst = std::move(left);
    match.onlySecond = drd_Without(match.onlySecond, taken);
}

void drd_Differ::TellMoved(std::vector<Pair> pairs, const Context& context) {
    if (options_.ignoreOrder || pairs.size() < 2) return;
    std::vector<int> places;
    places.reserve(pairs.size());
    for (const Pair& pair : pairs) places.push_back(pair.second);
    const std::vector<char> stays = drd_LongestGrowing(places);
    for (std::size_t i = 0; i < stays.size(); ++i) {
        if (stays[i] != 0) continue;
        const drd_Keyword& keyword = FirstKeyword(pairs[i].first);
        const drd_ConditionWord* word = drd_FindCondition(keyword.Key());
        std::string what = NameOfItem(keyword);
        if (word != nullptr && keyword.lines > 0) {
            what = std::string(word->word) + " on " + drd_NameOf(drd_Field(First().DataLine(keyword, 0), 0));
        }
        Tell(drd_ChangeEnm::MOVED, word != nullptr ? std::string(word->word) : "*" + keyword.Name(),
             context + what + " stands in another place", keyword.Place(),
             SecondKeyword(pairs[i].second).Place());
    }
}

void drd_Differ::TellLonely(const Match& match, const Context& context) {
    const auto kindOf = [](const drd_Keyword& keyword) {
        return HasName(keyword) ? std::string(drd_WordOf(keyword.Row()->defines)) : "*" + keyword.Name();
    };
    for (const int item : match.onlyFirst) {
        const drd_Keyword& keyword = FirstKeyword(item);
        Tell(drd_ChangeEnm::REMOVED, kindOf(keyword), context + NameOfItem(keyword) + " removed",
             keyword.Place(), drd_Nowhere);
    }
    for (const int item : match.onlySecond) {
        const drd_Keyword& keyword = SecondKeyword(item);
        Tell(drd_ChangeEnm::ADDED, kindOf(keyword), context + NameOfItem(keyword) + " added", drd_Nowhere,
             keyword.Place());
    }
}

void drd_Differ::CompareKeyword(Pair keywords, const Context& context) {
    if (first_.Signature(keywords.first) == second_.Signature(keywords.second)) return;
    const drd_Keyword& keyword = FirstKeyword(keywords.first);
    const bool isBlock = First().blocks[static_cast<std::size_t>(keyword.block)].begin == keywords.first;
    const Context inner = isBlock ? context : context + NameOfItem(keyword) + ": ";
    CompareParameters(keywords, inner);
    CompareLines(keywords, inner);
    const Items first = first_.OptionsOf(keywords.first);
    const Items second = second_.OptionsOf(keywords.second);
    if (!first.empty() || !second.empty()) CompareItems(first, second, inner);
}

bool drd_Differ::AreNear(std::string_view first, std::string_view second) const {
    double a = 0.0;
    double b = 0.0;
    if (drd_ReadReal(first, a) && drd_ReadReal(second, b)) return drd_IsNear(a, b, options_.tolerance);
    return first_.Name(first) == second_.Name(second);
}

void drd_Differ::CompareParameters(Pair keywords, const Context& context) {
    const drd_Keyword& first = FirstKeyword(keywords.first);
    const drd_Keyword& second = SecondKeyword(keywords.second);
    const auto shown = [](const drd_Parameter& p) {
        return p.HasValue() ? p.Key() + "=" + p.value : p.Key();
    };
    const std::string kind = "*" + first.Name();
    for (const drd_Parameter& before : first.Parameters()) {
        const drd_Parameter* after = second.Find(before.Key());
        if (after == nullptr) {
            Tell(drd_ChangeEnm::REMOVED, kind, context + shown(before) + " is gone", first.Place(),
                 second.Place());
        } else if (before.HasValue() != after->HasValue() || !AreNear(before.value, after->value)) {
            // What the assembly or a step is called is told by its block.
            Tell(drd_ChangeEnm::CHANGED, kind, context + shown(before) + " became " + shown(*after),
                 first.Place(), second.Place());
        }
    }
    for (const drd_Parameter& after : second.Parameters()) {
        if (first.Find(after.Key()) != nullptr) continue;
        Tell(drd_ChangeEnm::ADDED, kind, context + shown(after) + " is new", first.Place(), second.Place());
    }
}

void drd_Differ::CompareFields(std::string_view first, std::string_view second, std::uint64_t line,
                               Pair keywords, const Context& context) {
    const auto before = first_.Fields(first);
    const auto after = second_.Fields(second);
    std::size_t changed = 0;
    std::size_t at = 0;
    for (std::size_t i = 0; i < std::max(before.size(), after.size()); ++i) {
        const drd_Canonical::Field a = i < before.size() ? before[i] : drd_Canonical::Field();
        const drd_Canonical::Field b = i < after.size() ? after[i] : drd_Canonical::Field();
        const bool same = a.isNumber && b.isNumber ? drd_IsNear(a.number, b.number, options_.tolerance)
                                                   : a.isNumber == b.isNumber && a.text == b.text;
        if (same) continue;
        ++changed;
        at = i;
    }
    if (changed == 0) return;
    const drd_Keyword& keyword = FirstKeyword(keywords.first);
    const drd_Keyword& other = SecondKeyword(keywords.second);
    std::string text;
    if (changed == 1) {
        const std::string_view a = drd_Field(first, at);
        const std::string_view b = drd_Field(second, at);
        text = (a.empty() ? std::string("nothing") : std::string(a)) + " became " +
               (b.empty() ? std::string("nothing") : std::string(b));
        if (before.size() > 1 || first_.LineCount(keyword) > 1) {
            text += " (line " + std::to_string(line + 1) + ", value " + std::to_string(at + 1) + ")";
        }
    } else {
        text = "\"" + Shortened(first) + "\" became \"" + Shortened(second) + "\"";
    }
    Tell(drd_ChangeEnm::CHANGED,
         HasName(keyword) ? std::string(drd_WordOf(keyword.Row()->defines)) : "*" + keyword.Name(),
         context + text, First().DataPlace(keyword, line), Second().DataPlace(other, line));
}

void drd_Differ::CompareLines(Pair keywords, const Context& context) {
    const drd_Keyword& first = FirstKeyword(keywords.first);
    const drd_Keyword& second = SecondKeyword(keywords.second);
    if (first.HasText() && options_.ignoreTitles) return;
    const std::uint64_t before = first_.LineCount(first);
    const std::uint64_t after = second_.LineCount(second);
    if (before == after && !first.HasText() && first.Key() != "surface") {
        for (std::uint64_t i = 0; i < before; ++i) {
            CompareFields(First().DataLine(first, i), Second().DataLine(second, i), i, keywords, context);
        }
        return;
    }
    // By lines as texts: what is gone and what is new.
    const auto linesOf = [](const drd_Deck& deck, const drd_Keyword& keyword, std::uint64_t count) {
        std::vector<std::string> lines;
        for (std::uint64_t i = 0; i < count; ++i) {
            std::string line(drd_Trim(deck.DataLine(keyword, i)));
            lines.push_back(keyword.HasText() ? line : drd_FoldName(line));
        }
        return lines;
    };
    const std::vector<std::string> a = linesOf(First(), first, before);
    const std::vector<std::string> b = linesOf(Second(), second, after);
    std::uint64_t ahead = 0;
    while (ahead < std::min(before, after) && a[ahead] == b[ahead]) ++ahead;
    std::uint64_t behind = 0;
    while (behind < std::min(before, after) - ahead && a[before - 1 - behind] == b[after - 1 - behind])
        ++behind;
    const auto said = [](const drd_Deck& deck, const drd_Keyword& keyword, std::uint64_t from,
                         std::uint64_t count) {
        if (count == 0) return std::string("nothing");
        if (count > 1)
            return drd_Counted(count, "line") + " from \"" + Shortened(deck.DataLine(keyword, from)) + "\"";
        return "\"" + Shortened(deck.DataLine(keyword, from)) + "\"";
    };
    if (before == ahead + behind && after == ahead + behind) return;
    Tell(drd_ChangeEnm::CHANGED,
         HasName(first) ? std::string(drd_WordOf(first.Row()->defines)) : "*" + first.Name(),
         context + said(First(), first, ahead, before - ahead - behind) + " became " +
             said(Second(), second, ahead, after - ahead - behind),
         ahead < before ? First().DataPlace(first, ahead) : first.Place(),
         ahead < after ? Second().DataPlace(second, ahead) : second.Place());
}
