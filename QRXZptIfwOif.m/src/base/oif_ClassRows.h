#ifndef QRX_OIF_CLASSROWS_H
#define QRX_OIF_CLASSROWS_H

#include <cstddef>

/// The row of a class in a table that has one row a class, its number in the member `typeId`; null for a
/// class without a row.
template <class Row, std::size_t count>
constexpr const Row* oif_FindRow(const Row (&rows)[count], unsigned typeId) {
    for (const Row& row : rows) {
        if (row.typeId == typeId) return &row;
    }
    return nullptr;
}

#endif
