#include "tools/WrappedTable.h"

#include "tools/Terminal.h"

#include <algorithm>
#include <sstream>

namespace {

/// Characters, not bytes.
std::size_t WidthOf(const std::string& text) {
    return static_cast<std::size_t>(
        std::ranges::count_if(text, [](char c) { return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U; }));
}

std::vector<std::string> LinesOf(const std::string& text, std::size_t width) {
    std::vector<std::string> lines(1);
    std::istringstream words(text);
    for (std::string word; words >> word;) {
        if (!lines.back().empty() && WidthOf(lines.back()) + 1 + WidthOf(word) > width) lines.emplace_back();
        lines.back() += (lines.back().empty() ? "" : " ") + word;
    }
    return lines;
}

constexpr std::size_t kIndent = 2;
constexpr std::size_t kGap = 2;
/// The last column is no use with less.
constexpr std::size_t kLeastText = 24;

std::string SideBySide(const std::vector<std::string>& row, const std::vector<std::size_t>& widths) {
    std::vector<std::vector<std::string>> cells;
    std::size_t height = 1;
    for (std::size_t i = 0; i < row.size(); ++i) {
        cells.push_back(LinesOf(row[i], widths[i]));
        height = std::max(height, cells.back().size());
    }
    std::string text;
    for (std::size_t line = 0; line < height; ++line) {
        std::string shown(kIndent, ' ');
        for (std::size_t i = 0; i < cells.size(); ++i) {
            const std::string& cell = line < cells[i].size() ? cells[i][line] : std::string();
            const std::size_t used = WidthOf(cell);
            shown += cell;
            if (i + 1 < cells.size()) shown.append((used < widths[i] ? widths[i] - used : 0) + kGap, ' ');
        }
        shown.erase(shown.find_last_not_of(' ') + 1);
        text += shown + "\n";
    }
    return text;
}

/// For narrow terminals: the last cell below the others.
std::string Stacked(const std::vector<std::string>& row, std::size_t width) {
    std::string others;
    for (std::size_t i = 0; i + 1 < row.size(); ++i) others += (i == 0 ? "" : "  ") + row[i];
    std::string text;
    for (const std::string& line : LinesOf(others, width - kIndent))
        text += std::string(kIndent, ' ') + line + "\n";
    for (const std::string& line : LinesOf(row.back(), width - 3 * kIndent))
        text += std::string(3 * kIndent, ' ') + line + "\n";
    return text;
}

} // namespace

std::string Emphasis(const std::string& text, bool colours) {
    return colours ? "\033[1m" + text + "\033[0m" : text;
}

std::string Wrapped(const std::string& text) {
    std::string wrapped;
    for (const std::string& line : LinesOf(text, TextWidth()))
        wrapped += (wrapped.empty() ? "" : "\n") + line;
    return wrapped;
}

std::string WrappedTable::Text(bool colours) const {
    const std::size_t columns = rows_.empty() ? heading_.size() : rows_.front().size();
    if (columns == 0) return {};
    const std::size_t width = TextWidth();
    std::vector<std::size_t> widths(columns);
    const auto measure = [&widths](const std::vector<std::string>& row) {
        for (std::size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], WidthOf(row[i]));
    };
    measure(heading_);
    std::ranges::for_each(rows_, measure);
    // Names, in the first, stay in one piece; the columns between them and the last have half of the line.
    const std::size_t most = width / 2 / std::max<std::size_t>(1, columns - 1) - kGap;
    std::size_t before = kIndent;
    for (std::size_t i = 0; i + 1 < columns; ++i) {
        if (i > 0) widths[i] = std::min(widths[i], most);
        before += widths[i] + kGap;
    }
    const bool isNarrow = width < before + kLeastText;
    widths.back() = isNarrow ? width - 2 * kIndent : width - before;

    std::string text;
    const auto add = [&](const std::vector<std::string>& row, bool isHeading) {
        const std::string shown = isNarrow ? Stacked(row, width) : SideBySide(row, widths);
        text += isHeading ? Emphasis(shown, colours) : shown;
    };
    if (!heading_.empty()) add(heading_, true);
    for (const auto& row : rows_) add(row, false);
    return text;
}
