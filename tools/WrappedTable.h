#ifndef QRX_TOOLS_WRAPPEDTABLE_H
#define QRX_TOOLS_WRAPPEDTABLE_H

#include <string>
#include <vector>

/// The text as headings look where there are colours.
std::string Emphasis(const std::string& text, bool colours);
/// The text in lines that fit the output.
std::string Wrapped(const std::string& text);

/// Rows of text that fit the output: the last column takes the room that is left, in several lines.
class WrappedTable {
public:
    void Heading(std::vector<std::string> cells) { heading_ = std::move(cells); }
    void Row(std::vector<std::string> cells) { rows_.push_back(std::move(cells)); }
    std::string Text(bool colours) const;

private:
    std::vector<std::string> heading_;
    std::vector<std::vector<std::string>> rows_;
};

#endif
