#include "store_interface/findings/fnd_Text.h"

#include <algorithm>
#include <charconv>

namespace {

constexpr std::size_t kLongestName = 80;

char Lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool IsControl(char c) {
    const auto byte = static_cast<unsigned char>(c);
    return byte < 0x20 || byte == 0x7f;
}

// Number of characters put in, left out, changed or swapped with the next, capitals not counted.
std::size_t Distance(std::string_view a, std::string_view b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::vector<std::size_t> above(b.size() + 1);
    std::vector<std::size_t> twoAbove(b.size() + 1);
    for (std::size_t j = 0; j <= b.size(); ++j) row[j] = j;
    const auto same = [&](std::size_t i, std::size_t j) { return Lower(a[i]) == Lower(b[j]); };
    for (std::size_t i = 0; i < a.size(); ++i) {
        twoAbove.swap(above);
        above.swap(row);
        row[0] = i + 1;
        for (std::size_t j = 0; j < b.size(); ++j) {
            row[j + 1] = std::min({row[j] + 1, above[j + 1] + 1, above[j] + (same(i, j) ? 0 : 1)});
            if (i > 0 && j > 0 && same(i, j - 1) && same(i - 1, j))
                row[j + 1] = std::min(row[j + 1], twoAbove[j - 1] + 1);
        }
    }
    return row[b.size()];
}

} // namespace

std::string fnd_LowerCase(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), Lower);
    return lower;
}

std::string fnd_Visible(std::string_view text) {
    constexpr const char* digits = "0123456789ABCDEF";
    std::string visible;
    for (const char c : text) {
        if (!IsControl(c)) {
            visible += c;
            continue;
        }
        const auto byte = static_cast<unsigned char>(c);
        visible.append("\\x").append({digits[byte >> 4], digits[byte & 15]});
    }
    return visible;
}

std::string fnd_Quoted(std::string_view text) {
    std::string quoted("'");
    return quoted.append(fnd_Visible(text)).append("'");
}

std::string fnd_Shown(double value) {
    char text[40];
    std::string shown(text, std::to_chars(text, text + sizeof text, value).ptr);
    if (shown.find_first_of(".e") == std::string::npos) shown += ".0";
    return shown;
}

std::string fnd_Counted(long long count, const char* singular) {
    return std::to_string(count) + " " + singular + (count == 1 ? "" : "s");
}

std::string fnd_OneOf(const std::vector<std::string>& words) {
    if (words.size() == 1) return words.front();
    std::string text("one of ");
    for (std::size_t i = 0; i < words.size(); ++i) text.append(i == 0 ? "" : ", ").append(words[i]);
    return text;
}

std::string fnd_DidYouMean(std::string_view name, const std::vector<std::string>& known) {
    constexpr std::size_t longest = 80;
    if (name.size() > longest) return {};
    const std::string* nearest = nullptr;
    // Something of the name must be left.
    std::size_t least = std::min(std::max<std::size_t>(1, name.size() / 3) + 1, name.size());
    for (const std::string& candidate : known) {
        const std::size_t gap =
            std::max(candidate.size(), name.size()) - std::min(candidate.size(), name.size());
        if (candidate.size() > longest || gap >= least) continue;
        const std::size_t distance = Distance(name, candidate);
        if (distance < least) {
            least = distance;
            nearest = &candidate;
        }
    }
    return nearest == nullptr ? std::string() : "did you mean " + fnd_Quoted(*nearest) + "?";
}

fnd_NameProblem fnd_ProblemOfName(std::string_view name) {
    constexpr const char* kGood = "a name that can stand in a deck";
    if (name.empty()) return {"an empty name", kGood};
    if (name.size() > kLongestName) {
        return {"a name of " + std::to_string(name.size()) + " bytes",
                "at most " + std::to_string(kLongestName)};
    }
    for (const char c : name) {
        if (c == '"') return {"a name with a double quote", kGood};
        if (IsControl(c)) return {"a name with a control character", kGood};
    }
    return {};
}
