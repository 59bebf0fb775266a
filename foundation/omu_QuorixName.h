#ifndef QRX_FOUNDATION_OMU_QUORIXNAME_H
#define QRX_FOUNDATION_OMU_QUORIXNAME_H

#include "foundation/cow_List.h"
#include "foundation/cow_String.h"

/// Splits a text at every occurrence of a character of the class `pattern` (such as "[\.]"). Empty tokens
/// are kept: "a." has the tokens "a" and "", an empty text has one empty token.
cow_List<cow_String> rgx_split(const cow_String& text, const char* pattern);

/// Names as one word of the deck's language.
class omu_QuorixName {
public:
    /// The name bare if the deck can read it as one word, else in double quotes.
    /// Bare are: the empty name; a name already in double quotes; and one whose dotted tokens are each
    /// quoted, or plain: letters, digits, "_" and "-", beginning with a letter or "_" (behind the first dot
    /// a digit may begin too). Letters are ASCII; every byte above 127 calls for quotes.
    static cow_String QuoteIfNeeded(const cow_String& name);
    /// Whether that name isn't bare.
    static bool NeedsQuotes(std::string_view name);
};

#endif
