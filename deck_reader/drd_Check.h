#ifndef QRX_DECK_READER_DRD_CHECK_H
#define QRX_DECK_READER_DRD_CHECK_H

#include "deck_reader/drd_Names.h"
#include "deck_reader/drd_Reader.h"

/// Looks for what is wrong in a deck beyond its text: keywords that are not known or out of place, names that
/// lead nowhere, and meshes whose labels, elements, sets and sections don't fit each other.
void drd_CheckDeck(const drd_Deck& deck, const drd_ReadOptions& options, drd_Findings& findings);

#endif
