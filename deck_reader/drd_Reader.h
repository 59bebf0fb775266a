#ifndef QRX_DECK_READER_DRD_READER_H
#define QRX_DECK_READER_DRD_READER_H

#include "deck_reader/drd_Deck.h"

#include <string>
#include <string_view>

struct thr_Progress;

/// What is known of an element type; all zero for an unknown one.
struct drd_TypeInfo {
    int minNodes = 0;
    int maxNodes = 0; ///< 0: any number
    bool needsSection = false;
};

struct drd_ReadOptions {
    /// Reads the files that includes name, relative to the file that names them. Off, an include stays a
    /// keyword of the deck.
    bool followIncludes = true;
    /// What is known of element types; null: of none. Tells a record that goes on behind a comma from one
    /// that merely ends with it.
    drd_TypeInfo (*typeInfo)(std::string_view type) = nullptr;
    /// Counts the bytes that are read; null: nobody looks.
    thr_Progress* progress = nullptr;
};

/// Lines above this many bytes are longer than the language allows.
inline constexpr std::size_t drd_LineLimit = 256;
/// A keyword line longer than this may go on with the comma at the head of the next line, as the deck writer
/// does it where the rules want it so.
inline constexpr std::size_t drd_BreakLimit = 131;

/// Reads a deck. What is wrong with its text is among the findings; the deck is all that could be read.
drd_Deck drd_ReadDeck(const std::string& path, const drd_ReadOptions& options, drd_Findings& findings);
/// The same from a text in memory; `name` is what findings call it. Includes are sought from the current
/// folder.
drd_Deck drd_ReadDeckText(std::string_view text, const std::string& name, const drd_ReadOptions& options,
                          drd_Findings& findings);

#endif
