#ifndef QRX_DECK_READER_DRD_FLATTEN_H
#define QRX_DECK_READER_DRD_FLATTEN_H

#include "deck_reader/drd_Deck.h"
#include "foundation/qio_Device.h"

/// Writes the deck without parts, instances and assembly: nodes placed, labels of each instance behind those
/// of the one before, names of instances joined with those of their sets, local systems turned along. What
/// became what stands in comments at the top. What a flat deck can't say is among the findings; nothing is
/// written where labels run out.
void drd_Flatten(const drd_Deck& deck, qio_ostream& device, drd_Findings& findings);

#endif
