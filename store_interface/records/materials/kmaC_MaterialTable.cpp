#include "store_interface/records/materials/kmaC_MaterialTable.h"

#include <algorithm>
#include <compare>
#include <numeric>
#include <utility>
#include <vector>

void kmaC_MaterialTable::Sort(int n) {
    const int rows = NumRows();
    const int columns = NumColumns();
    if (n <= 0 || n > columns || rows == 0) return;
    std::vector<int> order(static_cast<std::size_t>(rows));
    std::iota(order.begin(), order.end(), 0);
    const auto key = [&](int row) { return values_.ConstRow(row) + (columns - n); };
    // Stable by the row numbers, since std::stable_sort would try to get memory behind our back. A weak order
    // takes NaN too, which a program may have put there.
    std::sort(order.begin(), order.end(), [&](int a, int b) {
        for (int i = 0; i < n; ++i) {
            const std::weak_ordering compared = std::weak_order(key(a)[i], key(b)[i]);
            if (compared != 0) return compared < 0;
        }
        return a < b;
    });
    cow_2DArray<double> sorted(rows, columns);
    for (int row = 0; row < rows; ++row) {
        const double* from = values_.ConstRow(order[static_cast<std::size_t>(row)]);
        for (int column = 0; column < columns; ++column) sorted.Put(row, column, from[column]);
    }
    values_ = sorted;
}

void kmaC_MaterialTable::SwapColumns(int a, int b) {
    if (a == b) return;
    for (int row = 0; row < NumRows(); ++row) {
        const double kept = ConstGet(row, a);
        Put(row, a, ConstGet(row, b));
        Put(row, b, kept);
    }
}
