#ifndef QRX_TOOLS_DECKVIEW_H
#define QRX_TOOLS_DECKVIEW_H

#include "deck_reader/drd_Names.h"
#include "tools/RunReport.h"

#include <nlohmann/json.hpp>

#include <memory>

// A deck as the page of `view` shows it.

/// The store with the meshes of a deck: parts, instances where they stand, sets and surfaces, those of the
/// assembly too. Null when an error hinders it, which the report then tells.
std::unique_ptr<odb_Odb> StoreOfDeck(const drd_Deck& deck, const drd_Names& names, RunReport& report);

/// Gives the header of the page of that store the deck's steps and what they say: each condition, load,
/// field, interaction and constraint by its keyword and the set that it acts on, its status, and its lines.
void DescribeDeck(const drd_Deck& deck, nlohmann::ordered_json& header);

#endif
