#include "model_file/mdf_Token.h"

#include "model_file/mdf_Number.h"
#include "model_file/mdf_Utf8.h"

#include <algorithm>
#include <optional>

namespace {

constexpr std::size_t kLongestQuote = 40;

/// The number of four hexadecimal digits.
std::optional<unsigned> Hex4(std::string_view text) {
    if (text.size() < 4) return std::nullopt;
    unsigned number = 0;
    for (const char c : text.substr(0, 4)) {
        const std::size_t digit =
            std::string_view("0123456789abcdef").find(mdf_IsDigit(c) ? c : static_cast<char>(c | 0x20));
        if (digit == std::string_view::npos) return std::nullopt;
        number = 16 * number + static_cast<unsigned>(digit);
    }
    return number;
}

/// What is wrong with the escape that `rest` begins with; its length when nothing is.
std::string EscapeProblem(std::string_view rest, std::size_t& length) {
    constexpr const char* surrogates = "surrogate U+DC00..U+DFFF must follow U+D800..U+DBFF";
    length = 2;
    if (rest.size() < 2) return "missing closing quote";
    if (std::string_view("\"\\/bfnrt").find(rest[1]) != std::string_view::npos) return {};
    if (rest[1] != 'u') return "forbidden character after backslash";
    const std::optional<unsigned> first = Hex4(rest.substr(2));
    if (!first) return "four hexadecimal digits must follow \\u";
    length = 6;
    if (*first >= 0xDC00 && *first <= 0xDFFF) return surrogates;
    if (*first < 0xD800 || *first > 0xDBFF) return {};
    if (!rest.substr(6).starts_with("\\u")) return surrogates;
    const std::optional<unsigned> second = Hex4(rest.substr(8));
    length = 12;
    return second && *second >= 0xDC00 && *second <= 0xDFFF ? "" : surrogates;
}

/// Behind the byte at which an escape breaks that is wrong.
std::size_t EndOfEscape(std::string_view text, std::size_t at) {
    const auto behind = [&](std::size_t place) { return std::min(place + 1, text.size()); };
    // The first of the four that is no hexadecimal digit, or npos.
    const auto firstOther = [&](std::size_t begin) {
        const std::size_t other = text.find_first_not_of("0123456789abcdefABCDEF", begin);
        return other == std::string_view::npos ? text.size() : other;
    };
    if (at + 1 >= text.size() || text[at + 1] != 'u') return behind(at + 1);
    if (const std::size_t other = firstOther(at + 2); other < at + 6) return behind(other);
    const unsigned code = *Hex4(text.substr(at + 2));
    if (code < 0xD800 || code > 0xDBFF) return at + 6;
    for (const std::size_t i : {std::size_t{6}, std::size_t{7}}) {
        if (at + i >= text.size() || text[at + i] != (i == 6 ? '\\' : 'u')) return behind(at + i);
    }
    const std::size_t other = firstOther(at + 8);
    return other < at + 12 ? behind(other) : at + 12;
}

/// Behind the byte at which a character that is no UTF-8 breaks.
std::size_t EndOfBadCharacter(std::string_view text, std::size_t at) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char lead = byte(at);
    const std::size_t following = lead < 0xC2 ? 0 : lead < 0xE0 ? 1 : lead < 0xF0 ? 2 : lead < 0xF5 ? 3 : 0;
    for (std::size_t i = 1; i <= following; ++i) {
        if (at + i >= text.size()) return text.size();
        unsigned char lowest = 0x80;
        unsigned char highest = 0xBF;
        if (i == 1 && lead == 0xE0) lowest = 0xA0;
        if (i == 1 && lead == 0xED) highest = 0x9F;
        if (i == 1 && lead == 0xF0) lowest = 0x90;
        if (i == 1 && lead == 0xF4) highest = 0x8F;
        if (byte(at + i) < lowest || byte(at + i) > highest) return at + i + 1;
    }
    return at + 1;
}

std::size_t EndOfString(std::string_view text, std::size_t at) {
    for (++at; at < text.size();) {
        const auto byte = static_cast<unsigned char>(text[at]);
        std::size_t length = 1;
        if (byte == '"' || byte < 0x20) return at + 1;
        if (byte == '\\') {
            if (!EscapeProblem(text.substr(at), length).empty()) return EndOfEscape(text, at);
        } else {
            length = mdf_Utf8Length(text.substr(at));
            if (length == 0) return EndOfBadCharacter(text, at);
        }
        at += length;
    }
    return text.size();
}

/// What is wrong with the string that begins with the quote at `at`.
std::string StringProblem(std::string_view text, std::size_t at) {
    for (++at; at < text.size();) {
        const auto byte = static_cast<unsigned char>(text[at]);
        std::size_t length = 1;
        if (byte == '"') return {};
        if (byte < 0x20) {
            const std::string code = "00" + mdf_HexOf(byte);
            return "control character U+" + code + " must be escaped as \\u" + code;
        }
        if (byte == '\\') {
            std::string problem = EscapeProblem(text.substr(at), length);
            if (!problem.empty()) return problem;
        } else {
            length = mdf_Utf8Length(text.substr(at));
            if (length == 0) return "ill-formed UTF-8 byte";
        }
        at += length;
    }
    return "missing closing quote";
}

/// What is wrong with the number at the beginning of the text.
std::string NumberProblem(std::string_view text) {
    std::size_t at = text.front() == '-' ? 1 : 0;
    const auto digits = [&] {
        const std::size_t begin = at;
        while (at < text.size() && mdf_IsDigit(text[at])) ++at;
        return at > begin;
    };
    const auto is = [&](std::string_view characters) {
        return at < text.size() && characters.find(text[at]) != std::string_view::npos;
    };
    if (!digits()) return "expected a digit after '-'";
    if (is(".")) {
        ++at;
        if (!digits()) return "expected a digit after '.'";
    }
    if (!is("eE")) return {};
    ++at;
    const bool hasSign = is("+-");
    if (hasSign) ++at;
    if (digits()) return {};
    return hasSign ? "expected a digit after the sign of the exponent"
                   : "expected '+', '-' or a digit after 'e'";
}

} // namespace

std::size_t mdf_SkipBlanksAndComments(std::string_view text, std::size_t at) {
    while (at < text.size()) {
        if (mdf_IsBlank(text[at])) {
            ++at;
            continue;
        }
        const std::string_view rest = text.substr(at);
        std::size_t end = std::string_view::npos;
        if (rest.starts_with("//")) {
            end = std::min(text.find_first_of("\r\n", at), text.size());
        } else if (rest.starts_with("/*")) {
            end = text.find("*/", at + 2);
            if (end != std::string_view::npos) end += 2;
        }
        if (end == std::string_view::npos) return at;
        at = end;
    }
    return at;
}

std::size_t mdf_EndOfToken(std::string_view text, std::size_t at) {
    if (at >= text.size()) return text.size();
    const char first = text[at];
    const auto behind = [&](std::size_t place) { return std::min(place + 1, text.size()); };
    if (first == '"') return EndOfString(text, at);
    if (mdf_BeginsNumber(first)) {
        const mdf_Number number = mdf_ReadAnyNumber(text.data() + at, text.data() + text.size());
        const auto end = static_cast<std::size_t>(number.end - text.data());
        return number.kind == mdf_Number::Kind::BROKEN ? behind(end) : end;
    }
    if (text.substr(at).starts_with("/*")) return behind(std::min(text.find('\0', at), text.size()));
    if (first == '/') return behind(at + 1);
    for (const std::string_view literal : {"true", "false", "null"}) {
        if (first != literal.front()) continue;
        std::size_t length = 1;
        while (length < literal.size() && at + length < text.size() && text[at + length] == literal[length])
            ++length;
        return length == literal.size() ? at + length : behind(at + length);
    }
    return at + 1;
}

std::size_t mdf_ReadEscape(std::string_view text, std::string& out) {
    std::size_t length = 0;
    if (!EscapeProblem(text, length).empty()) return 0;
    constexpr std::string_view letters = "\"\\/bfnrt";
    constexpr std::string_view meanings = "\"\\/\b\f\n\r\t";
    if (text[1] != 'u') {
        out += meanings[letters.find(text[1])];
        return length;
    }
    unsigned code = *Hex4(text.substr(2));
    if (length == 12) code = 0x10000 + ((code - 0xD800) << 10) + (*Hex4(text.substr(8)) - 0xDC00);
    const auto put = [&out](unsigned byte) { out += static_cast<char>(byte); };
    if (code < 0x80) {
        put(code);
        return length;
    }
    if (code < 0x800) {
        put(0xC0 | code >> 6);
    } else {
        if (code < 0x10000) {
            put(0xE0 | code >> 12);
        } else {
            put(0xF0 | code >> 18);
            put(0x80 | (code >> 12 & 0x3F));
        }
        put(0x80 | (code >> 6 & 0x3F));
    }
    put(0x80 | (code & 0x3F));
    return length;
}

bool mdf_HasComments(std::string_view text) {
    bool inString = false;
    for (std::size_t at = 0; at < text.size(); ++at) {
        if (inString && text[at] == '\\') {
            ++at;
        } else if (text[at] == '"') {
            inString = !inString;
        } else if (text[at] == '/' && !inString) {
            return true;
        }
    }
    return false;
}

std::string_view mdf_TokenAt(std::string_view text, std::size_t at, std::size_t end) {
    if (text[at] == '"') return text.substr(at, std::max<std::size_t>(end - at, 1));
    const std::size_t stop = text.find_first_of(" \t\r\n,:[]{}\"", at);
    return text.substr(at, std::max<std::size_t>(std::min(stop, text.size()) - at, 1));
}

std::string mdf_QuotedToken(std::string_view text) {
    const std::size_t whole = text.size();
    std::string quoted = "'";
    while (!text.empty()) {
        if (whole - text.size() >= kLongestQuote) return quoted + "...'";
        const std::size_t length = mdf_Utf8Length(text);
        const auto byte = static_cast<unsigned char>(text.front());
        if (length == 0 || byte < 0x20 || byte == 0x7F)
            quoted += "\\x" + mdf_HexOf(byte);
        else
            quoted += text.substr(0, length);
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return quoted + "'";
}

mdf_TokenProblem mdf_ProblemOf(std::string_view text, std::size_t at, std::size_t end) {
    if (at >= text.size()) return {};
    const char first = text[at];
    if (first == '"') {
        const std::string problem = StringProblem(text.substr(0, end), at);
        if (problem.empty()) return {};
        return {"invalid string: " + problem, problem != "missing closing quote", false};
    }
    const std::string_view token = mdf_TokenAt(text, at, end);
    if (first == '-' || mdf_IsDigit(first)) {
        const std::string problem = NumberProblem(token);
        return problem.empty() ? mdf_TokenProblem()
                               : mdf_TokenProblem{"invalid number; " + problem, false, false};
    }
    if (first == '/') {
        return {token.starts_with("/*") ? "invalid comment; missing closing '*/'"
                                        : "invalid comment; expected '/' or '*' after '/'"};
    }
    if (std::string_view(",:[]{}").find(first) != std::string_view::npos) return {};
    for (const std::string_view literal : {"true", "false", "null"}) {
        if (token.starts_with(literal)) return {};
    }
    return {"invalid literal"};
}
