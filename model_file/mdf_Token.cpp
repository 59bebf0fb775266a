#include "model_file/mdf_Token.h"

#include "model_file/mdf_Utf8.h"

#include <algorithm>
#include <optional>

namespace {

constexpr std::size_t kLongestQuote = 40;

bool IsBlank(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

/// The number of four hexadecimal digits.
std::optional<unsigned> Hex4(std::string_view text) {
    if (text.size() < 4) return std::nullopt;
    unsigned number = 0;
    for (const char c : text.substr(0, 4)) {
        const std::size_t digit =
            std::string_view("0123456789abcdef").find(IsDigit(c) ? c : static_cast<char>(c | 0x20));
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
        while (at < text.size() && IsDigit(text[at])) ++at;
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
        if (IsBlank(text[at])) {
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
    if (first == '-' || IsDigit(first)) {
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
