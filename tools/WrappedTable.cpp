#include "tools/WrappedTable.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <sstream>

#include <sys/ioctl.h>
#include <unistd.h>

namespace {

bool IsTerminal() {
    return ::isatty(STDOUT_FILENO) == 1;
}

bool TakesColours() {
    const char* no = std::getenv("NO_COLOR");
    const char* terminal = std::getenv("TERM");
    return IsTerminal() && (no == nullptr || *no == '\0') &&
           (terminal == nullptr || std::strcmp(terminal, "dumb") != 0);
}

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

} // namespace

std::size_t OutputWidth() {
    constexpr std::size_t kUsual = 100;
    constexpr std::size_t kLeast = 40;
    winsize size{};
    if (!IsTerminal() || ::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_col == 0) return kUsual;
    return std::max<std::size_t>(size.ws_col, kLeast);
}

std::string Emphasis(const std::string& text) {
    return TakesColours() ? "\033[1m" + text + "\033[0m" : text;
}

std::string Wrapped(const std::string& text) {
    std::string wrapped;
    for (const std::string& line : LinesOf(text, OutputWidth()))
        wrapped += (wrapped.empty() ? "" : "\n") + line;
    return wrapped;
}

std::string WrappedTable::Text() const {
    constexpr std::size_t kIndent = 2;
    constexpr std::size_t kGap = 2;
    const std::size_t columns = rows_.empty() ? heading_.size() : rows_.front().size();
    if (columns == 0) return {};
    const std::size_t width = OutputWidth();
    std::vector<std::size_t> widths(columns);
    const auto measure = [&widths](const std::vector<std::string>& row) {
        for (std::size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], WidthOf(row[i]));
    };
    measure(heading_);
    std::ranges::for_each(rows_, measure);
    // What is left for the last column is at least a third of the line; the others give way beyond that.
    const std::size_t most = (width * 2 / 3 - kIndent) / std::max<std::size_t>(1, columns - 1) - kGap;
    std::size_t before = kIndent;
    for (std::size_t i = 0; i + 1 < columns; ++i) {
        // Names, in the first, stay in one piece.
        if (i > 0) widths[i] = std::min(widths[i], most);
        before += widths[i] + kGap;
    }
    widths.back() = width > before + most ? width - before : most;

    std::string text;
    const auto add = [&](const std::vector<std::string>& row, bool isHeading) {
        std::vector<std::vector<std::string>> cells;
        std::size_t height = 1;
        for (std::size_t i = 0; i < row.size(); ++i) {
            cells.push_back(LinesOf(row[i], widths[i]));
            height = std::max(height, cells.back().size());
        }
        for (std::size_t line = 0; line < height; ++line) {
            std::string shown(kIndent, ' ');
            for (std::size_t i = 0; i < cells.size(); ++i) {
                const std::string& cell = line < cells[i].size() ? cells[i][line] : std::string();
                shown += cell;
                const std::size_t used = WidthOf(cell);
                if (i + 1 < cells.size()) shown.append((used < widths[i] ? widths[i] - used : 0) + kGap, ' ');
            }
            shown.erase(shown.find_last_not_of(' ') + 1);
            text += (isHeading ? Emphasis(shown) : shown) + "\n";
        }
    };
    if (!heading_.empty()) add(heading_, true);
    for (const auto& row : rows_) add(row, false);
    return text;
}
