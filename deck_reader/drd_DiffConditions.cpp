#include "deck_reader/drd_Differ.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>

namespace {

constexpr drd_ConditionWord kConditions[] = {
    {"boundary", "boundary condition", 3},
    {"cload", "load", 2},
    {"dload", "distributed load", 2},
    {"dsload", "surface load", 2},
    {"connectorload", "connector load", 2},
    {"connectormotion", "connector motion", 2},
    {"temperature", "temperature", 1},
    {"field", "field", 1},
    {"pressurestress", "pressure stress", 1},
    {"massflowrate", "mass flow rate", 1},
    {"fluidflux", "fluid flux", 1},
    {"initialconditions", "initial condition", 1},
    {"cflux", "concentrated flux", 2},
    {"dflux", "body flux", 2},
    {"dsflux", "surface flux", 2},
    {"dsflow", "surface flow", 2},
    {"cfilm", "film of nodes", 1},
    {"sfilm", "film", 2},
    {"cradiate", "radiation of nodes", 1},
    {"sradiate", "radiation", 2},
    {"cecharge", "concentrated charge", 2},
    {"cecurrent", "concentrated current", 2},
    {"decharge", "body charge", 2},
    {"decurrent", "body current", 2},
    {"dsecharge", "surface charge", 2},
    {"dsecurrent", "surface current", 2},
};

} // namespace

const drd_ConditionWord* drd_FindCondition(std::string_view key) {
    const auto found = std::find_if(std::begin(kConditions), std::end(kConditions),
                                    [key](const auto& row) { return row.key == key; });
    return found == std::end(kConditions) ? nullptr : &*found;
}

std::vector<drd_Differ::Condition> drd_Differ::ConditionsOf(const drd_Canonical& deck, const Items& items,
                                                            std::size_t fields) const {
    std::vector<Condition> conditions;
    for (const int item : items) {
        const drd_Keyword& keyword = deck.Deck().keywords[static_cast<std::size_t>(item)];
        std::vector<std::string> texts;
        std::string variant; // what makes two lines on one target different things
        for (const drd_Parameter& parameter : keyword.Parameters()) {
            texts.push_back(parameter.Key() + "=" + drd_FoldName(parameter.value));
            if (parameter.Key() == "loadcase" || parameter.Key() == "type" || parameter.Key() == "variable") {
                variant += "/" + texts.back();
            }
        }
        std::sort(texts.begin(), texts.end());
        std::string parameters;
        for (const std::string& text : texts) parameters += text + ",";
        const std::uint64_t lines = deck.LineCount(keyword);
        if (lines == 0) conditions.push_back({item, -1, variant, parameters});
        for (std::uint64_t line = 0; line < lines; ++line) {
            const auto values = deck.Fields(deck.Deck().DataLine(keyword, line));
            std::string target = variant + "|";
            for (std::size_t i = 0; i < std::min(fields, values.size()); ++i) {
                target += (values[i].isNumber ? drd_Shown(values[i].number) : values[i].text) + "|";
            }
            conditions.push_back({item, static_cast<std::int64_t>(line), std::move(target), parameters});
        }
    }
    return conditions;
}

/// "load on BEAM-1.TIP, dof 3".
std::string drd_Differ::WordsOf(const drd_Deck& deck, const Condition& condition,
                                const drd_ConditionWord& word) const {
    const drd_Keyword& keyword = deck.keywords[static_cast<std::size_t>(condition.keyword)];
    std::string text(word.word);
    const std::string_view loadCase = keyword.Value("loadcase");
    if (condition.line < 0) {
        const bool isNew = drd_FoldKey(keyword.Value("op")) == "new";
        return text + (isNew ? "s: all taken away (op=NEW without lines)" : "s: a keyword without lines");
    }
    const std::string_view line = deck.DataLine(keyword, static_cast<std::uint64_t>(condition.line));
    const std::string target = drd_NameOf(drd_Field(line, 0));
    text += target.empty() ? " on no set" : " on " + target;
    const std::string_view second = word.fields > 1 ? drd_Field(line, 1) : std::string_view();
    const std::string_view third = word.fields > 2 ? drd_Field(line, 2) : std::string_view();
    int dof = 0;
    if (drd_ReadInt(second, dof)) {
        text += ", dof " + std::string(second);
        if (!third.empty() && third != second) text += " to " + std::string(third);
    } else if (!second.empty()) {
        text += ", " + std::string(second);
    }
    if (!loadCase.empty())
        text += loadCase == "2" ? ", imaginary part" : ", load case " + std::string(loadCase);
    return text;
}

void drd_Differ::CompareConditions(const Items& first, const Items& second, const drd_ConditionWord& word,
                                   const Context& context) {
    const std::vector<Condition> before = ConditionsOf(first_, first, word.fields);
    const std::vector<Condition> after = ConditionsOf(second_, second, word.fields);
    drd_Waiting byTarget;
    for (std::size_t i = 0; i < after.size(); ++i) byTarget.Put(after[i].target, static_cast<int>(i));
    std::vector<char> isTaken(after.size(), 0);
    for (const Condition& condition : before) {
        const int partner = byTarget.Take(condition.target);
        if (partner < 0) {
            Tell(drd_ChangeEnm::REMOVED, std::string(word.word),
                 context + WordsOf(First(), condition, word) + " removed",
                 condition.line < 0 ? FirstKeyword(condition.keyword).Place()
                                    : First().DataPlace(FirstKeyword(condition.keyword),
                                                        static_cast<std::uint64_t>(condition.line)),
                 drd_Nowhere);
            continue;
        }
        CompareCondition(condition, after[static_cast<std::size_t>(partner)], word, context);
        isTaken[static_cast<std::size_t>(partner)] = 1;
    }
    for (std::size_t i = 0; i < after.size(); ++i) {
        if (isTaken[i] != 0) continue;
        const drd_Keyword& keyword = SecondKeyword(after[i].keyword);
        std::string text = context + WordsOf(Second(), after[i], word) + " added";
        if (after[i].line >= 0) {
            text +=
                ": " +
                std::string(drd_Trim(Second().DataLine(keyword, static_cast<std::uint64_t>(after[i].line))));
        }
        Tell(drd_ChangeEnm::ADDED, std::string(word.word), std::move(text), drd_Nowhere,
             after[i].line < 0 ? keyword.Place()
                               : Second().DataPlace(keyword, static_cast<std::uint64_t>(after[i].line)));
    }
}

void drd_Differ::CompareCondition(const Condition& first, const Condition& second,
                                  const drd_ConditionWord& word, const Context& context) {
    const drd_Keyword& before = FirstKeyword(first.keyword);
    const drd_Keyword& after = SecondKeyword(second.keyword);
    const std::string what = context + WordsOf(First(), first, word) + ": ";
    const auto placeOf = [](const drd_Deck& deck, const drd_Keyword& keyword, std::int64_t line) {
        return line < 0 ? keyword.Place() : deck.DataPlace(keyword, static_cast<std::uint64_t>(line));
    };
    const drd_Place a = placeOf(First(), before, first.line);
    const drd_Place b = placeOf(Second(), after, second.line);
    if (first.parameters != second.parameters) {
        for (const drd_Parameter& parameter : before.Parameters()) {
            const drd_Parameter* now = after.Find(parameter.Key());
            if (now == nullptr) {
                Tell(drd_ChangeEnm::CHANGED, std::string(word.word),
                     what + "no longer " + parameter.Key() +
                         (parameter.HasValue() ? "=" + parameter.value : ""),
                     a, b);
            } else if (!AreNear(parameter.value, now->value)) {
                Tell(drd_ChangeEnm::CHANGED, std::string(word.word),
                     what + parameter.Key() + "=" + parameter.value + " became " + now->Key() + "=" +
                         now->value,
                     a, b);
            }
        }
        for (const drd_Parameter& parameter : after.Parameters()) {
            if (before.Find(parameter.Key()) != nullptr) continue;
            Tell(drd_ChangeEnm::CHANGED, std::string(word.word),
                 what + "now with " + parameter.Key() + (parameter.HasValue() ? "=" + parameter.value : ""),
                 a, b);
        }
    }
    if (first.line < 0 || second.line < 0) return;
    const std::string_view lineBefore = First().DataLine(before, static_cast<std::uint64_t>(first.line));
    const std::string_view lineAfter = Second().DataLine(after, static_cast<std::uint64_t>(second.line));
    const auto valuesOf = [&word](const drd_Canonical& deck, std::string_view line) {
        auto values = deck.Fields(line);
        values.erase(values.begin(),
                     values.begin() + static_cast<std::ptrdiff_t>(std::min(word.fields, values.size())));
        return values;
    };
    const auto valuesBefore = valuesOf(first_, lineBefore);
    const auto valuesAfter = valuesOf(second_, lineAfter);
    bool same = valuesBefore.size() == valuesAfter.size();
    for (std::size_t i = 0; same && i < valuesBefore.size(); ++i) {
        const auto& x = valuesBefore[i];
        const auto& y = valuesAfter[i];
        same = x.isNumber && y.isNumber ? drd_IsNear(x.number, y.number, options_.tolerance)
                                        : x.isNumber == y.isNumber && x.text == y.text;
    }
    if (same) return;
    const auto said = [&word](std::string_view line) {
        std::string text;
        std::vector<std::string_view> fields;
        drd_SplitFields(line, fields);
        for (std::size_t i = word.fields; i < fields.size(); ++i) {
            text += (text.empty() ? "" : ", ") + std::string(fields[i]);
        }
        return text.empty() ? std::string("no value") : text;
    };
    Tell(drd_ChangeEnm::CHANGED, std::string(word.word),
         what + said(lineBefore) + " became " + said(lineAfter), a, b);
}
