#ifndef QRX_DECK_READER_DRD_TEXT_H
#define QRX_DECK_READER_DRD_TEXT_H

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

// The small change of the deck language: blanks, capitals, fields, names, numbers.

/// Whether only blanks stand between `place` and a comma or the end of the line; `at` is then behind the
/// comma, or null.
bool drd_EndOfField(const char* place, const char*& at);

inline bool drd_IsBlank(char c) {
    return c == ' ' || c == '\t';
}
inline bool drd_IsDigit(char c) {
    return static_cast<unsigned char>(c - '0') <= 9;
}
inline bool drd_IsLetter(char c) {
    return static_cast<unsigned char>((c | 0x20) - 'a') <= 25;
}
inline char drd_LowerCase(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c;
}

std::string_view drd_Trim(std::string_view text);
/// A keyword or the name of a parameter as it is compared: in small letters, without blanks.
std::string drd_FoldKey(std::string_view text);
/// A name without its quotes, those of the parts of a dotted name included: `"two words".TIP` is
/// `two words.TIP`. Blanks count inside quotes only.
std::string drd_NameOf(std::string_view value);
/// Whether a name is left of a value without its quotes.
bool drd_HasName(std::string_view value);
/// A name without quotes in small letters, as names are compared.
std::string drd_FoldCase(std::string_view name);
/// Both.
std::string drd_FoldName(std::string_view value);
/// The name as a deck can read it: bare, or in double quotes where it needs them.
std::string drd_QuotedName(std::string_view name);

/// Cuts a line at the commas outside quotes; fields come trimmed. A line that ends with a comma has no empty
/// field behind it. False when a quote is left open.
bool drd_SplitFields(std::string_view line, std::vector<std::string_view>& fields);
/// The place of the first `character` outside quotes, or npos.
std::size_t drd_FindOutsideQuotes(std::string_view text, char character);
/// A field of a line by its place from 0; empty beyond the last.
std::string_view drd_Field(std::string_view line, std::size_t place);

/// True when the whole field, but for blanks, is a number of the kind. Reals take an exponent with d too;
/// words such as nan are no numbers.
bool drd_ReadInt(std::string_view field, int& value);
bool drd_ReadReal(std::string_view field, double& value);

/// Reads the number that begins at `at`, behind blanks, up to the comma or the end of the line; `at` is then
/// behind the comma, or null when the line has ended. The line must have a byte behind its end that is '\n',
/// '\r' or zero. False when there is no such number; `at` is unchanged then.
bool drd_ScanInt(const char*& at, int& value);
bool drd_ScanReal(const char*& at, double& value);

/// The shortest text that reads back as the number.
std::string drd_Shown(double value);
/// In single quotes, control characters as \xNN.
std::string drd_Shown(std::string_view text);
/// "1 node", "2 nodes".
std::string drd_Counted(std::uint64_t count, std::string_view singular);

/// Finds the known name that is nearest to another.
class drd_Nearest {
public:
    explicit drd_Nearest(std::string_view name);
    /// `shown` is what the hint calls it.
    void Try(std::string_view known, std::string_view shown);
    void Try(std::string_view known) { Try(known, known); }
    /// "did you mean 'x'?", or nothing when none is near.
    std::string Hint() const;

private:
    std::string name_;
    std::string best_;
    std::size_t distance_;
    std::vector<std::size_t> row_;
};

#endif
