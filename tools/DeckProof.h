#ifndef QRX_TOOLS_DECKPROOF_H
#define QRX_TOOLS_DECKPROOF_H

#include "deck_reader/drd_Deck.h"
#include "store_interface/model/odb_Odb.h"

#include <string>
#include <vector>

/// What a deck doesn't have as its store has it: nodes with all digits that are written, elements, sets and
/// surfaces of instances and of the assembly, materials, amplitudes and steps. Empty when the deck stands for
/// the store.
std::vector<std::string> ProveDeck(const odiK_Model& model, const drd_Deck& deck);

#endif
