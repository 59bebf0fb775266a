#ifndef QRX_TESTS_DECKS_SHUFFLEDMODEL_H
#define QRX_TESTS_DECKS_SHUFFLEDMODEL_H

#include <string>
#include <string_view>

/// The text of a model file with the members of every object, named containers among them, in another order;
/// arrays keep theirs. The seed decides.
std::string ShuffledModel(std::string_view modelText, unsigned seed);

#endif
