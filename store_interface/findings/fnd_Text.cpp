#include "store_interface/findings/fnd_Text.h"

#include "store_interface/findings/fnd_Nearest.h"

#include <algorithm>
#include <charconv>

namespace {

constexpr std::size_t kLongestName = 80;

bool IsControl(char c) {
    const auto byte = static_cast<unsigned char>(c);
    return byte < 0x20 || byte == 0x7f;
}

} // namespace

std::string fnd_LowerCase(std::string_view text) {
    std::string lower(text);
    for (char& c : lower) c = fnd_LowerCase(c);
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

std::string fnd_OneOf(const std::vector<std::string>& words, std::string_view given) {
    if (words.size() == 1) return words.front();
    std::string text("one of ");
    const char* separator = "";
    for (const std::size_t i : fnd_PlacesOfNearest(words, given)) {
        text.append(separator).append(words[i]);
        separator = ", ";
    }
    if (words.size() > fnd_kListed) text += ", ... (" + std::to_string(words.size() - fnd_kListed) + " more)";
    return text;
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

fnd_NameProblem fnd_ProblemOfText(std::string_view text) {
    if (std::none_of(text.begin(), text.end(), IsControl)) return {};
    return {"a text with a control character", "a text that can stand on one line of a deck"};
}
