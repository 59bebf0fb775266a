#ifndef QRX_TOOLS_DECKCOMMANDS_H
#define QRX_TOOLS_DECKCOMMANDS_H

#include "deck_reader/drd_Reader.h"
#include "tools/RunReport.h"

#include <string>

/// How decks are read.
struct DeckRequest {
    /// Includes stay what they are.
    bool keepIncludesShut = false;
};

/// Whether the file is a deck and no model file: by its ending, else by its first character.
bool IsDeck(const std::string& path);
/// Reads a deck with what the store knows of element types.
drd_Deck ReadDeck(const std::string& path, const DeckRequest& request, drd_Findings& findings);
drd_ReadOptions DeckOptions(const DeckRequest& request = {});
/// Hands findings of a deck on to the report.
void AddFindings(const drd_Deck& deck, const drd_Findings& findings, RunReport& report);

/// Looks for errors in a deck.
ExitCode RunCheckDeck(const std::string& path, const DeckRequest& request, RunReport& report);

#endif
