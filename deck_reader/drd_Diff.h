#ifndef QRX_DECK_READER_DRD_DIFF_H
#define QRX_DECK_READER_DRD_DIFF_H

#include "deck_reader/drd_Deck.h"

#include <map>
#include <string>
#include <vector>

enum class drd_ChangeEnm { ADDED, REMOVED, CHANGED, MOVED, RENAMED };
/// "added", "removed", ...
std::string_view drd_WordOf(drd_ChangeEnm change);

/// One difference between two decks, as a person would say it. The place in a deck where a thing isn't has no
/// file (-1).
struct drd_Difference {
    drd_ChangeEnm change = drd_ChangeEnm::CHANGED;
    std::string kind; ///< "load", "step", "mesh", ...
    std::string text;
    drd_Place first{-1, 0};
    drd_Place second{-1, 0};
};

struct drd_DiffOptions {
    /// Numbers count as equal when they differ by no more than this part of the greater.
    double tolerance = 0.0;
    bool ignoreComments = false; ///< doesn't tell them
    bool ignoreNames = false;    ///< a thing under another name is the same
    bool ignoreOrder = false;    ///< moved is no difference
    bool ignoreTitles = false;   ///< headings and descriptions of steps
    bool ignoreOutput = false;   ///< output requests
};

struct drd_DiffResult {
    std::vector<drd_Difference> differences;
    /// By kind and change.
    std::map<std::string, std::map<drd_ChangeEnm, int>> summary;
    /// Comments, which make no difference.
    std::vector<std::string> commentsRemoved;
    std::vector<std::string> commentsAdded;

    bool IsEqual() const { return differences.empty(); }
};

/// Compares two decks by what they mean: how a keyword or a number is spelled, the order of parameters and of
/// things that are found by name, and whether a set lists its labels or generates them make no difference.
drd_DiffResult drd_Diff(const drd_Deck& first, const drd_Deck& second, const drd_DiffOptions& options);

#endif
