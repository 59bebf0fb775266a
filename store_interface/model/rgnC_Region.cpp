#include "store_interface/model/rgnC_Region.h"

int rgnC_Region::FlagWord() const {
    if (!HasValue() || set_.Data().IsNull()) return 0;
    static constexpr int flags[] = {1, 2, 8};
    return flags[set_.Data().Kind()];
}
