#ifndef QRX_TOOLS_TEXTTABLE_H
#define QRX_TOOLS_TEXTTABLE_H

#include <algorithm>
#include <string>
#include <vector>

/// Columns of text, all but the last as wide as their widest cell. Widths count characters, not bytes.
class TextTable {
public:
    void Row(std::vector<std::string> cells) { rows_.push_back(std::move(cells)); }
    std::string Text(const std::string& indent) const {
        std::vector<std::size_t> widths;
        for (const auto& row : rows_) {
            widths.resize(std::max(widths.size(), row.size()));
            for (std::size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], Width(row[i]));
        }
        std::string text;
        for (const auto& row : rows_) {
            text += indent;
            for (std::size_t i = 0; i < row.size(); ++i) {
                text += row[i];
                if (i + 1 < row.size()) text.append(widths[i] - Width(row[i]) + 2, ' ');
            }
            text += "\n";
        }
        return text;
    }

private:
    static std::size_t Width(const std::string& cell) {
        return static_cast<std::size_t>(std::count_if(
            cell.begin(), cell.end(), [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }));
    }

    std::vector<std::vector<std::string>> rows_;
};

#endif
