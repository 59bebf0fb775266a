#ifndef QRX_MODEL_FILE_MDF_TOKEN_H
#define QRX_MODEL_FILE_MDF_TOKEN_H

#include <string>
#include <string_view>

// What messages say of the text of a document that is no JSON.

inline bool mdf_IsBlank(char c) {
    return c == ' ' || c == '\n' || c == '\r' || c == '\t';
}
/// Where the next token begins, or the text ends. A comment that isn't closed is a token.
std::size_t mdf_SkipBlanksAndComments(std::string_view text, std::size_t at);
/// Whether a document without errors has comments.
bool mdf_HasComments(std::string_view text);

/// Behind the token, or behind the byte at which it breaks off; the end of the text for one that it cuts.
std::size_t mdf_EndOfToken(std::string_view text, std::size_t at);
/// Appends the character that an escape at the beginning of the text stands for; gives the length of the
/// escape, 0 when it is wrong.
std::size_t mdf_ReadEscape(std::string_view text, std::string& out);

/// The token as a person sees it: a bracket, a string up to `end`, else a run of other characters.
std::string_view mdf_TokenAt(std::string_view text, std::size_t at, std::size_t end);
/// The text in single quotes, cut when it is long, with bytes that can't be shown as \xNN.
std::string mdf_QuotedToken(std::string_view text);

/// Whether a token that the reader refused is of the kind but broken, and why.
struct mdf_TokenProblem {
    /// Empty when the token is good and only stands in the wrong place.
    std::string reason;
    /// The token breaks off in its middle: in a string, at a byte that can't stand there.
    bool insideString = false;
    /// Anything could stand here, so what was expected is worth saying.
    bool isOfAnyKind = true;
};
/// What is wrong with the token that begins at `at`, of which the reader has seen what stands before `end`.
mdf_TokenProblem mdf_ProblemOf(std::string_view text, std::size_t at, std::size_t end);

#endif
