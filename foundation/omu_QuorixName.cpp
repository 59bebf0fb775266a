#include "foundation/omu_QuorixName.h"

#include <string>

namespace {

bool IsLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

bool IsWordToken(std::string_view token, bool digitMayBegin) {
    if (token.size() >= 2 && token.front() == '"' && token.back() == '"') {
        return token.substr(1, token.size() - 2).find('"') == std::string_view::npos;
    }
    if (token.empty()) return false;
    const char begin = token.front();
    if (!IsLetter(begin) && begin != '_' && !(digitMayBegin && IsDigit(begin))) return false;
    for (const char c : token) {
        if (!IsLetter(c) && !IsDigit(c) && c != '_' && c != '-') return false;
    }
    return true;
}

bool IsWord(std::string_view name) {
    if (name.empty()) return true;
    if (name.size() >= 2 && name.front() == '"' && name.back() == '"') return true;
    bool inQuotes = false;
    std::size_t begin = 0;
    for (std::size_t i = 0; i <= name.size(); ++i) {
        if (i < name.size() && name[i] == '"') inQuotes = !inQuotes;
        if (i == name.size() || (name[i] == '.' && !inQuotes)) {
            if (!IsWordToken(name.substr(begin, i - begin), begin > 0)) return false;
            begin = i + 1;
        }
    }
    return true;
}

} // namespace

cow_List<cow_String> rgx_split(const cow_String& text, const char* pattern) {
    const std::string_view set(pattern);
    cow_List<cow_String> tokens;
    const std::string_view whole = text.View();
    std::size_t begin = 0;
    for (std::size_t i = 0; i <= whole.size(); ++i) {
        // The class brackets and the escape are no characters that a name is split at.
        const bool splits = i < whole.size() && whole[i] != '[' && whole[i] != ']' && whole[i] != '\\' &&
                            set.find(whole[i]) != std::string_view::npos;
        if (i == whole.size() || splits) {
            tokens.Append(cow_String(whole.substr(begin, i - begin)));
            begin = i + 1;
        }
    }
    return tokens;
}

bool omu_QuorixName::NeedsQuotes(std::string_view name) {
    return !IsWord(name);
}

cow_String omu_QuorixName::QuoteIfNeeded(const cow_String& name) {
    if (!NeedsQuotes(name.View())) return name;
    std::string quoted("\"");
    quoted.append(name.View()).append("\"");
    return cow_String(std::string_view(quoted));
}
