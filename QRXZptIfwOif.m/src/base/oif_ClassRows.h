#ifndef QRX_OIF_CLASSROWS_H
#define QRX_OIF_CLASSROWS_H

#include <algorithm>
#include <ranges>

/// The row of a class in a table that has one row a class, its number in the member `typeId`; null for a
/// class without a row. The rows must outlive the answer.
template <std::ranges::contiguous_range Rows>
auto oif_FindRow(const Rows& rows, unsigned typeId) -> const std::ranges::range_value_t<Rows>* {
    const auto row = std::ranges::find(rows, typeId, &std::ranges::range_value_t<Rows>::typeId);
    return row == std::ranges::end(rows) ? nullptr : &*row;
}

#endif
