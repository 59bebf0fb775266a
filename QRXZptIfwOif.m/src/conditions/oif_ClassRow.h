#ifndef QRX_OIF_CLASSROW_H
#define QRX_OIF_CLASSROW_H

#include "base/oif_ClassRows.h"
#include "base/oif_RegionRule.h"
#include "keyword_layer/qkw_Keyword.h"

#include <algorithm>
#include <span>
#include <type_traits>

/// How many families the rows are of.
template <class Row>
constexpr int oif_NumberOfFamilies(std::span<const Row> rows) {
    int number = 0;
    for (const Row& row : rows) number = std::max(number, static_cast<int>(row.family) + 1);
    return number;
}

/// A handle on a keyword of its own.
inline qkw_KeywordHandle oif_OwnKeyword(qkw_Keyword* keyword) {
    qkw_KeywordHandle handle;
    handle.Reset(keyword);
    return handle;
}

/// The keyword K of a record of class R, made from its card and as much of the setting as K asks for.
template <class K, class R, class Card, class Setting>
qkw_KeywordHandle oif_MakeKeyword(const Card& card, const Setting& setting) {
    [[maybe_unused]] const R& record = static_cast<const R&>(card.Object());
    if constexpr (std::is_constructible_v<K, const Card&, const R&, const Setting&>) {
        return oif_OwnKeyword(new K(card, record, setting));
    } else if constexpr (std::is_constructible_v<K, const Card&, const R&>) {
        return oif_OwnKeyword(new K(card, record));
    } else {
        return oif_OwnKeyword(new K(card));
    }
}

#endif
