#ifndef QRX_OIF_UTILS_H
#define QRX_OIF_UTILS_H

#include "foundation/cow_String.h"
#include "store_interface/propagation/mdl_PropAttr.h"

/// Small rules that keyword classes of several families share.
class oif_Utils {
public:
    /// Whether a value is to be written: it was set in this step, or it is carried over and `flag` is false.
    static bool CheckDataState(const mdl_PropAttributeStateEnm& state, const bool& flag);
    /// Status 4 or 11: `first` becomes true (the operation ends here) and `second` false. Any other status:
    /// `first` becomes false, and `second` stays as it is.
    static void SetDeactivateOpFlags(const mdl_PropagationStatusEnm& status, bool& first, bool& second);
    /// The name as one word of the deck.
    static cow_String GetConnectorSetName(cow_String name);
};

#endif
