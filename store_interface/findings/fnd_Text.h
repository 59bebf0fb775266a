#ifndef QRX_STORE_FND_TEXT_H
#define QRX_STORE_FND_TEXT_H

#include <string>
#include <string_view>
#include <vector>

// Texts that findings are made of.

/// In single quotes; control characters as \xNN, so that no text of a file acts on the terminal that shows
/// it.
std::string fnd_Quoted(std::string_view text);
std::string fnd_Visible(std::string_view text);
/// The shortest text that reads back as the number, with a point or an exponent.
std::string fnd_Shown(double value);
/// "1 row", "2 rows".
std::string fnd_Counted(long long count, const char* singular);
/// "one of a, b, c"; of more than ten those nearest to what was given instead, and how many more there are.
std::string fnd_OneOf(const std::vector<std::string>& words, std::string_view given = {});
/// The text with A to Z as a to z.
std::string fnd_LowerCase(std::string_view text);
constexpr char fnd_LowerCase(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// Why the text can't stand in a deck as a name: what was found, and what is expected instead.
struct fnd_NameProblem {
    std::string found; ///< empty: the name is good
    std::string expected;
};
fnd_NameProblem fnd_ProblemOfName(std::string_view name);
/// The same of a text that stands on a line of the deck but is no name.
fnd_NameProblem fnd_ProblemOfText(std::string_view text);

#endif
