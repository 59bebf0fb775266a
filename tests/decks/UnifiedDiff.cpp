#include "decks/UnifiedDiff.h"

#include <algorithm>
#include <cstddef>
#include <vector>

namespace {

constexpr std::size_t kContext = 3;

// Lines keep their "\n", so that a missing last one is a difference too.
std::vector<std::string_view> Lines(std::string_view text) {
    std::vector<std::string_view> lines;
    while (!text.empty()) {
        const std::size_t end = std::min(text.find('\n'), text.size() - 1) + 1;
        lines.push_back(text.substr(0, end));
        text.remove_prefix(end);
    }
    return lines;
}

struct Edit {
    char mark;
    std::string_view line;
};

std::vector<Edit> Edits(const std::vector<std::string_view>& from, const std::vector<std::string_view>& to) {
    // common[i][j] is the length of the longest common subsequence of the lines from i and from j on.
    std::vector<std::vector<int>> common(from.size() + 1, std::vector<int>(to.size() + 1, 0));
    for (std::size_t i = from.size(); i-- > 0;) {
        for (std::size_t j = to.size(); j-- > 0;) {
            common[i][j] =
                from[i] == to[j] ? common[i + 1][j + 1] + 1 : std::max(common[i + 1][j], common[i][j + 1]);
        }
    }
    std::vector<Edit> edits;
    std::size_t i = 0;
    std::size_t j = 0;
    while (i < from.size() || j < to.size()) {
        if (i < from.size() && j < to.size() && from[i] == to[j]) {
            edits.push_back({' ', from[i]});
            ++i;
            ++j;
        } else if (j == to.size() || (i < from.size() && common[i + 1][j] >= common[i][j + 1])) {
            edits.push_back({'-', from[i++]});
        } else {
            edits.push_back({'+', to[j++]});
        }
    }
    return edits;
}

// "12,5"; an empty range is told by the line before it.
std::string Range(std::size_t first, std::size_t count) {
    return std::to_string(count == 0 ? first : first + 1) + ',' + std::to_string(count);
}

} // namespace

std::string UnifiedDiff(std::string_view expected, std::string_view actual, std::string_view expectedName,
                        std::string_view actualName) {
    if (expected == actual) return {};
    const std::vector<Edit> edits = Edits(Lines(expected), Lines(actual));
    std::string diff;
    diff.append("--- ").append(expectedName).append("\n+++ ").append(actualName).append("\n");

    std::size_t line = 0;
    std::size_t expectedLine = 0;
    std::size_t actualLine = 0;
    const auto pass = [&](const Edit& edit) {
        if (edit.mark != '+') ++expectedLine;
        if (edit.mark != '-') ++actualLine;
    };
    const auto changedBefore = [&](std::size_t begin, std::size_t end) {
        return std::any_of(edits.begin() + static_cast<std::ptrdiff_t>(begin),
                           edits.begin() + static_cast<std::ptrdiff_t>(std::min(end, edits.size())),
                           [](const Edit& edit) { return edit.mark != ' '; });
    };
    while (line < edits.size()) {
        if (!changedBefore(line, line + kContext + 1)) {
            pass(edits[line++]);
            continue;
        }
        const std::size_t expectedFirst = expectedLine;
        const std::size_t actualFirst = actualLine;
        std::string body;
        // The hunk ends where a change is neither close behind nor close ahead.
        std::size_t quiet = 0;
        bool changed = false;
        while (line < edits.size() &&
               (!changed || quiet < kContext || changedBefore(line, line + kContext + 1))) {
            const Edit& edit = edits[line++];
            quiet = edit.mark == ' ' ? quiet + 1 : 0;
            changed = changed || edit.mark != ' ';
            body.append(1, edit.mark).append(edit.line);
            if (edit.line.back() != '\n') body.append("\n\\ No newline at end of file\n");
            pass(edit);
        }
        diff += "@@ -" + Range(expectedFirst, expectedLine - expectedFirst) + " +" +
                Range(actualFirst, actualLine - actualFirst) + " @@\n" + body;
    }
    return diff;
}
