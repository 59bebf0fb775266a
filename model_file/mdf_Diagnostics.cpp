#include "model_file/mdf_Diagnostics.h"

#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Utf8.h"

#include <algorithm>
#include <charconv>

namespace {

constexpr int kMaxMessages = 50;
constexpr std::size_t kLongestName = 80;

char Lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

std::string LowerCase(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), Lower);
    return lower;
}

bool IsControl(char c) {
    const auto byte = static_cast<unsigned char>(c);
    return byte < 0x20 || byte == 0x7f;
}

// Control characters as \xNN, so that no text of a file acts on the terminal that shows it.
std::string Visible(std::string_view text) {
    std::string visible;
    for (const char c : text) {
        if (!IsControl(c)) {
            visible += c;
            continue;
        }
        visible.append("\\x").append(mdf_HexOf(static_cast<unsigned char>(c)));
    }
    return visible;
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

std::string mdf_Path::Text() const {
    if (parent_ == nullptr) return {};
    std::string text = parent_->Text();
    if (isIndex_) {
        mdf_AppendPointer(text, index_);
    } else {
        mdf_AppendPointer(text, token_);
    }
    return text;
}

void mdf_Diagnostics::Add(bool isError, const std::string& pointer, const std::string& text) {
    int& count = isError ? numErrors_ : numWarnings_;
    if (count++ >= kMaxMessages) return;
    report_->messages.push_back({isError, pointer, 0, 0, text});
}

void mdf_Diagnostics::Expected(const mdf_Path& path, const mdf_Value& found, const std::string& expected) {
    Error(path, "found " + mdf_Shown(found) + ", expected " + expected);
}

std::string mdf_Quoted(std::string_view text) {
    std::string quoted("'");
    return quoted.append(Visible(text)).append("'");
}

std::string mdf_Shown(double value) {
    char text[40];
    std::string shown(text, std::to_chars(text, text + sizeof text, value).ptr);
    if (shown.find_first_of(".e") == std::string::npos) shown += ".0";
    return shown;
}

std::string mdf_Shown(const mdf_Value& value) {
    constexpr std::size_t longest = 60;
    if (value.IsNull()) return "null";
    if (value.IsBool()) return value.Bool() ? "true" : "false";
    if (value.IsInt()) return std::to_string(value.Int());
    if (value.IsLargeInteger()) {
        char text[400];
        return {text, std::to_chars(text, text + sizeof text, value.Real(), std::chars_format::fixed, 0).ptr};
    }
    if (value.IsNumber()) return mdf_Shown(value.Real());
    if (value.IsString()) {
        const std::string& text = value.String();
        return text.size() <= longest ? mdf_Quoted(text)
                                      : mdf_Quoted(mdf_Utf8Beginning(text, longest)) + "...";
    }
    if (value.IsObject()) return "an object";
    return "an array of " + std::to_string(value.Size()) + (value.Size() == 1 ? " item" : " items");
}

std::string mdf_DidYouMean(std::string_view name, const std::vector<std::string>& known) {
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
    return nearest == nullptr ? std::string() : "; did you mean " + mdf_Quoted(*nearest) + "?";
}

std::string mdf_OneOf(const std::vector<std::string>& words) {
    if (words.size() == 1) return words.front();
    std::string text("one of ");
    for (std::size_t i = 0; i < words.size(); ++i) text.append(i == 0 ? "" : ", ").append(words[i]);
    return text;
}

std::string mdf_NameProblem(std::string_view name) {
    if (name.empty()) return "an empty name, expected a name that can stand in a deck";
    if (name.size() > kLongestName) {
        return "a name of " + std::to_string(name.size()) + " bytes, expected at most " +
               std::to_string(kLongestName);
    }
    for (const char c : name) {
        if (c == '"') return "a name with a double quote, expected a name that can stand in a deck";
        if (IsControl(c)) {
            return "a name with a control character, expected a name that can stand in a deck";
        }
    }
    return {};
}

void mdf_CapitalsCheck::Enter(const std::string& name, const mdf_Path& path, const char* kind,
                              mdf_Diagnostics& diagnostics) {
    const auto [place, isNew] = byLowerCase_.emplace(LowerCase(name), name);
    if (isNew || place->second == name) return;
    diagnostics.Warning(path, std::string("this ") + kind + " and " + mdf_Quoted(place->second) +
                                  " differ only in capitals, which solvers take for one name");
}

bool mdf_Report::HasErrors() const {
    return std::any_of(messages.begin(), messages.end(),
                       [](const mdf_Message& message) { return message.isError; });
}

std::string mdf_Report::Line(const mdf_Message& message) const {
    std::string line = fileName + ":";
    if (message.line > 0) line += std::to_string(message.line) + ":" + std::to_string(message.column) + ":";
    line += message.isError ? " error: " : " warning: ";
    if (!message.pointer.empty()) line += Visible(message.pointer) + ": ";
    return line + message.text;
}
