#ifndef QRX_FOUNDATION_COW_2DARRAY_H
#define QRX_FOUNDATION_COW_2DARRAY_H

#include "foundation/cow_COW.h"
#include "foundation/cow_List.h"

#include <vector>

/// A rectangular array of rows x columns, shared by its copies until one is written.
/// Access outside it raises as a list index does.
template <class T>
class cow_2DArray {
public:
    cow_2DArray() = default;
    /// All items are T().
    cow_2DArray(int rows, int columns) : rows_(rows), columns_(columns) {
        if (rows > 0 && columns > 0) {
            items_.Reset(new Items(static_cast<std::size_t>(rows) * static_cast<std::size_t>(columns)));
        }
    }

    int NumRows() const { return rows_; }
    int NumColumns() const { return columns_; }
    bool IsEmpty() const { return rows_ == 0 || columns_ == 0; }

    const T& ConstGet(int row, int column) const { return items_.ConstGet()[Place(row, column)]; }
    void Put(int row, int column, const T& item) {
        const std::size_t place = Place(row, column);
        items_.Get()[place] = item;
    }
    /// The items of one row, in one piece; the array must not be empty.
    const T* ConstRow(int row) const { return items_.ConstGet().data() + Place(row, 0); }

    friend bool operator==(const cow_2DArray& a, const cow_2DArray& b) {
        return a.rows_ == b.rows_ && a.columns_ == b.columns_ &&
               (a.IsEmpty() || a.items_.ConstGet() == b.items_.ConstGet());
    }

private:
    using Items = std::vector<T>;

    std::size_t Place(int row, int column) const {
        if (row < 0 || row >= rows_) cow_RaiseOutOfRange(row, rows_);
        if (column < 0 || column >= columns_) cow_RaiseOutOfRange(column, columns_);
        return static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
               static_cast<std::size_t>(column);
    }

    int rows_ = 0;
    int columns_ = 0;
    cow_COW<Items, cow_Direct<Items>> items_;
};

#endif
