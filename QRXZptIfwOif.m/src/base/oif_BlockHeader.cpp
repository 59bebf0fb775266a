#include "base/oif_BlockHeader.h"

const qkw_KeywordHandle& oif_BlockHeader::StepHeader(const cow_String& stepName) {
    bool given = stepHeadersGiven_.IsMember(stepName);
    if (!given) stepHeadersGiven_.Insert(stepName, 1);
    return Once(given);
}

const qkw_KeywordHandle& oif_BlockHeader::Once(bool& given) {
    if (given) return empty_;
    given = true;
    return banner_;
}
