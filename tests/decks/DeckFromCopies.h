#ifndef QRX_TESTS_DECKS_DECKFROMCOPIES_H
#define QRX_TESTS_DECKS_DECKFROMCOPIES_H

#include <string>

class odb_Odb;

/// The deck of the store's "Default Model", put together by a driver of its own: each component is replaced
/// by its Copy(), each keyword by its Copy(), and the components are gone before the first keyword is
/// written.
std::string DeckFromCopies(const odb_Odb& odb);

#endif
