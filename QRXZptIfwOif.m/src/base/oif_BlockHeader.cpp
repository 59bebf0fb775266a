#include "base/oif_BlockHeader.h"

const qkw_KeywordHandle& oif_BlockHeader::StepHeader(const cow_String& stepName) {
    return Once(stepHeadersGiven_.GetOrInsert(stepName));
}

const qkw_KeywordHandle& oif_BlockHeader::Once(bool& given) {
    if (given) return empty_;
    given = true;
    return banner_;
}
