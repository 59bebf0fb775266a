#include "deck_reader/drd_Text.h"

#include "foundation/num_ReadReal.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <limits>

std::string_view drd_Trim(std::string_view text) {
    while (!text.empty() && drd_IsBlank(text.front())) text.remove_prefix(1);
    while (!text.empty() && drd_IsBlank(text.back())) text.remove_suffix(1);
    return text;
}

std::string drd_FoldKey(std::string_view text) {
    std::string folded;
    folded.reserve(text.size());
    for (const char c : text) {
        if (!drd_IsBlank(c)) folded.push_back(drd_LowerCase(c));
    }
    return folded;
}

std::string drd_NameOf(std::string_view value) {
    std::string name;
    for (const char c : drd_Trim(value)) {
        if (c != '"') name.push_back(c);
    }
    return name;
}

bool drd_HasName(std::string_view value) {
    return drd_Trim(value).find_first_not_of('"') != std::string_view::npos;
}

std::string drd_FoldCase(std::string_view name) {
    std::string folded(name);
    for (char& c : folded) c = drd_LowerCase(c);
    return folded;
}

std::string drd_FoldName(std::string_view value) {
    std::string folded = drd_NameOf(value);
    for (char& c : folded) c = drd_LowerCase(c);
    return folded;
}

std::string drd_QuotedName(std::string_view name) {
    const auto isPlain = [](char c) { return drd_IsLetter(c) || drd_IsDigit(c) || c == '_' || c == '-'; };
    const bool plain = name.empty() || ((drd_IsLetter(name[0]) || name[0] == '_') &&
                                        std::all_of(name.begin(), name.end(), isPlain));
    return plain ? std::string(name) : "\"" + std::string(name) + "\"";
}

std::size_t drd_FindOutsideQuotes(std::string_view text, char character) {
    bool quoted = false;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '"') quoted = !quoted;
        if (!quoted && text[i] == character) return i;
    }
    return std::string_view::npos;
}

bool drd_SplitFields(std::string_view line, std::vector<std::string_view>& fields) {
    fields.clear();
    bool quoted = false;
    std::size_t begin = 0;
    for (std::size_t i = 0; i < line.size(); ++i) {
        if (line[i] == '"') quoted = !quoted;
        if (line[i] != ',' || quoted) continue;
        fields.push_back(drd_Trim(line.substr(begin, i - begin)));
        begin = i + 1;
    }
    const std::string_view last = drd_Trim(line.substr(begin));
    if (!last.empty()) fields.push_back(last);
    return !quoted;
}

std::string_view drd_Field(std::string_view line, std::size_t place) {
    for (;; --place) {
        const std::size_t comma = drd_FindOutsideQuotes(line, ',');
        if (place == 0) return drd_Trim(line.substr(0, comma));
        if (comma == std::string_view::npos) return {};
        line.remove_prefix(comma + 1);
    }
}

namespace {

constexpr std::array<double, 23> kPowersOfTen = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                                 1e8,  1e9,  1e10, 1e11, 1e12, 1e13, 1e14, 1e15,
                                                 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
constexpr std::uint64_t kExactMantissa = std::uint64_t{1} << 53;

} // namespace

bool drd_EndOfField(const char* place, const char*& at) {
    while (drd_IsBlank(*place)) ++place;
    if (*place == ',') {
        at = place + 1;
        return true;
    }
    if (*place != '\n' && *place != '\r' && *place != '\0') return false;
    at = nullptr;
    return true;
}

bool drd_ScanInt(const char*& at, int& value) {
    const char* place = at;
    while (drd_IsBlank(*place)) ++place;
    const bool negative = *place == '-';
    if (negative || *place == '+') ++place;
    const char* digits = place;
    std::int64_t number = 0;
    while (drd_IsDigit(*place) && number <= std::numeric_limits<std::int32_t>::max()) {
        number = number * 10 + (*place++ - '0');
    }
    if (negative) number = -number;
    if (place == digits || drd_IsDigit(*place) || number != static_cast<std::int32_t>(number)) return false;
    if (!drd_EndOfField(place, at)) return false;
    value = static_cast<int>(number);
    return true;
}

namespace {

/// Any real number, digit by digit as the standard library rounds it.
bool ScanAnyReal(const char*& at, double& value) {
    const char* end = at;
    while (*end != ',' && *end != '\n' && *end != '\r' && *end != '\0') ++end;
    if (!drd_ReadReal(std::string_view(at, static_cast<std::size_t>(end - at)), value)) return false;
    return drd_EndOfField(end, at);
}

} // namespace

bool drd_ScanReal(const char*& at, double& value) {
    const char* place = at;
    while (drd_IsBlank(*place)) ++place;
    const bool negative = *place == '-';
    if (negative || *place == '+') ++place;
    std::uint64_t mantissa = 0;
    int exponent = 0;
    const char* begin = place;
    while (drd_IsDigit(*place)) mantissa = mantissa * 10 + static_cast<unsigned>(*place++ - '0');
    std::ptrdiff_t digits = place - begin;
    if (*place == '.') {
        const char* fraction = ++place;
        while (drd_IsDigit(*place)) mantissa = mantissa * 10 + static_cast<unsigned>(*place++ - '0');
        exponent = static_cast<int>(fraction - place);
        digits += place - fraction;
    }
    if (digits == 0 || digits > 18) return ScanAnyReal(at, value);
    if ((*place | 0x20) == 'e') {
        const bool below = place[1] == '-';
        place += below || place[1] == '+' ? 2 : 1;
        int power = 0;
        const char* first = place;
        while (drd_IsDigit(*place) && power < 1000) power = power * 10 + (*place++ - '0');
        if (place == first) return ScanAnyReal(at, value);
        exponent += below ? -power : power;
    }
    if (mantissa > kExactMantissa || exponent < -22 || exponent > 22) return ScanAnyReal(at, value);
    // Both are exact, so that one rounding gives the nearest number.
    auto number = static_cast<double>(mantissa);
    if (exponent < 0) {
        number /= kPowersOfTen[static_cast<std::size_t>(-exponent)];
    } else {
        number *= kPowersOfTen[static_cast<std::size_t>(exponent)];
    }
    if (!drd_EndOfField(place, at)) return ScanAnyReal(at, value);
    value = negative ? -number : number;
    return true;
}

bool drd_ReadInt(std::string_view field, int& value) {
    field = drd_Trim(field);
    if (!field.empty() && field.front() == '+') field.remove_prefix(1);
    if (field.empty() || (!drd_IsDigit(field.front()) && field.front() != '-')) return false;
    const auto result = std::from_chars(field.data(), field.data() + field.size(), value);
    return result.ec == std::errc() && result.ptr == field.data() + field.size();
}

bool drd_ReadReal(std::string_view field, double& value) {
    field = drd_Trim(field);
    const bool negative = !field.empty() && field.front() == '-';
    if (negative || (!field.empty() && field.front() == '+')) field.remove_prefix(1);
    if (field.empty() || (!drd_IsDigit(field.front()) && field.front() != '.')) return false;
    const std::size_t exponent = field.find_first_of("dD");
    std::string withE;
    if (exponent != std::string_view::npos) {
        withE.assign(field);
        withE[exponent] = 'e';
        field = withE;
    }
    double number = 0.0;
    const auto result = num_ReadReal(field.data(), field.data() + field.size(), number);
    if (result.ptr != field.data() + field.size()) return false;
    if (result.ec == std::errc::result_out_of_range) {
        // Too small is zero, too large is as large as can be; which of them the exponent's sign tells.
        const bool small = field.find("e-") != std::string_view::npos ||
                           field.find("E-") != std::string_view::npos || field.front() == '.' ||
                           field.front() == '0';
        number = small ? 0.0 : std::numeric_limits<double>::max();
    } else if (result.ec != std::errc()) {
        return false;
    }
    value = negative ? -number : number;
    return true;
}

std::string drd_Shown(double value) {
    std::array<char, 40> text{};
    const auto result = std::to_chars(text.data(), text.data() + text.size(), value);
    std::string shown(text.data(), result.ptr);
    if (shown.find_first_of(".eEni") == std::string::npos) shown.push_back('.');
    return shown;
}

std::string drd_Shown(std::string_view text) {
    constexpr std::size_t kShown = 100;
    constexpr char kHex[] = "0123456789abcdef";
    std::string shown = "'";
    for (const char c : text.substr(0, kShown)) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte >= 0x20 && byte != 0x7F) {
            shown.push_back(c);
        } else {
            shown.append("\\x").append(1, kHex[byte >> 4U]).append(1, kHex[byte & 15U]);
        }
    }
    if (text.size() > kShown) shown.append("...");
    return shown + "'";
}

std::string drd_Counted(std::uint64_t count, std::string_view singular) {
    std::string text = std::to_string(count) + " ";
    text.append(singular);
    if (count != 1) text.append("s");
    return text;
}

drd_Nearest::drd_Nearest(std::string_view name)
    : name_(drd_FoldName(name)), distance_(std::min<std::size_t>(3, name_.size() / 3 + 1)) {}

void drd_Nearest::Try(std::string_view known, std::string_view shown) {
    const std::size_t gap =
        known.size() > name_.size() ? known.size() - name_.size() : name_.size() - known.size();
    if (gap >= distance_ + 1 || name_.size() > 200) return;
    row_.resize(name_.size() + 1);
    for (std::size_t i = 0; i < row_.size(); ++i) row_[i] = i;
    for (std::size_t k = 0; k < known.size(); ++k) {
        std::size_t diagonal = row_[0];
        row_[0] = k + 1;
        for (std::size_t i = 1; i < row_.size(); ++i) {
            const std::size_t change = diagonal + (name_[i - 1] == drd_LowerCase(known[k]) ? 0 : 1);
            diagonal = row_[i];
            row_[i] = std::min({row_[i] + 1, row_[i - 1] + 1, change});
        }
    }
    if (row_.back() > distance_ || (row_.back() == distance_ && !best_.empty())) return;
    distance_ = row_.back();
    best_.assign(shown);
}

std::string drd_Nearest::Hint() const {
    return best_.empty() ? std::string() : "did you mean " + drd_Shown(std::string_view(best_)) + "?";
}
