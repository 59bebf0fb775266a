#ifndef QRX_TOOLS_DECKCOMMANDS_H
#define QRX_TOOLS_DECKCOMMANDS_H

#include "deck_reader/drd_Reader.h"
#include "tools/RunReport.h"

#include <string>

/// How decks are read.
struct DeckRequest {
    /// Includes stay what they are.
    bool keepIncludesShut = false;
    /// Where the bytes are counted; null: nobody looks.
    thr_Progress* progress = nullptr;
};

struct DiffRequest {
    std::string first;
    std::string second;
    double tolerance = 0.0;
    /// Words for what makes no difference, with commas between.
    std::string ignore;
    DeckRequest deck;
};

struct FlattenRequest {
    /// A deck or a model file.
    std::string input;
    /// Empty: the standard output.
    std::string output;
    DeckRequest deck;
};

/// Whether the file is a deck and no model file: by its ending, else by its first character.
bool IsDeck(const std::string& path);
/// Reads a deck with what the store knows of element types.
drd_Deck ReadDeck(const std::string& path, const DeckRequest& request, drd_Findings& findings);
/// The same, and shows how far it is.
drd_Deck ReadDeckWatched(const std::string& path, const DeckRequest& request, drd_Findings& findings,
                         RunReport& report);
drd_ReadOptions DeckOptions(const DeckRequest& request = {});
/// Hands findings of a deck on to the report.
void AddFindings(const drd_Deck& deck, const drd_Findings& findings, RunReport& report);

/// Reads a deck, or the deck of a model; false when there is none, which the report then tells.
bool ReadDeckOrModel(const std::string& path, drd_Deck& deck, const DeckRequest& request, RunReport& report);

/// Looks for errors in a deck.
ExitCode RunCheckDeck(const std::string& path, const DeckRequest& request, RunReport& report);
/// Compares two decks or models by meaning. Ends with 0 when they are equal, 1 when they differ, 2 for an
/// error, as programs that compare do.
int RunDiff(const DiffRequest& request, RunReport& report);
/// Writes the deck in one form, for programs that compare lines; ends as RunDiff does.
int RunTextOfDeck(const std::string& input, const DeckRequest& request, RunReport& report);
/// Writes the deck without parts, instances and assembly.
ExitCode RunFlatten(const FlattenRequest& request, RunReport& report);
/// Reads a written deck back and holds it against the store; a deck that doesn't stand for the store is an
/// internal failure.
ExitCode VerifyDeck(const odb_Odb& odb, const std::string& target, RunReport& report);

#endif
