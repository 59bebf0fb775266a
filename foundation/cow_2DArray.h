#ifndef QRX_FOUNDATION_COW_2DARRAY_H
#define QRX_FOUNDATION_COW_2DARRAY_H

#include "foundation/cow_COW.h"
#include "foundation/cow_List.h"

#include <vector>

/// A rectangular array of rows x columns, shared by its copies until one is written.
/// Access outside it raises "cow_2DArray: row ... is out of range ...", a negative size "... is negative".
template <class T>
class cow_2DArray {
public:
    cow_2DArray() = default;
    // Moving would leave the sizes behind without items; a copy costs no more.
    cow_2DArray(const cow_2DArray&) = default;
    cow_2DArray& operator=(const cow_2DArray&) = default;
    ~cow_2DArray() = default;
    /// All items are T().
    cow_2DArray(int rows, int columns) : rows_(rows), columns_(columns) {
        if (rows < 0) cow_RaiseNegative(rows, "cow_2DArray: row count");
        if (columns < 0) cow_RaiseNegative(columns, "cow_2DArray: column count");
        if (rows > 0 && columns > 0) {
            items_.Reset(new Items(static_cast<std::size_t>(rows) * static_cast<std::size_t>(columns)));
        }
    }

    int NumRows() const { return rows_; }
    int NumColumns() const { return columns_; }
    bool IsEmpty() const { return rows_ == 0 || columns_ == 0; }

    const T& ConstGet(int row, int column) const {
        const std::size_t place = Place(row, column);
        return items_.ConstGet()[place];
    }
    void Put(int row, int column, const T& item) {
        const std::size_t place = Place(row, column);
        items_.Get()[place] = item;
    }
    /// The items of one row, in one piece; the array must not be empty.
    const T* ConstRow(int row) const { return &ConstGet(row, 0); }

    friend bool operator==(const cow_2DArray& a, const cow_2DArray& b) {
        return a.rows_ == b.rows_ && a.columns_ == b.columns_ &&
               (a.IsEmpty() || a.items_.ConstGet() == b.items_.ConstGet());
    }

private:
    using Items = std::vector<T>;

    std::size_t Place(int row, int column) const {
        if (row < 0 || row >= rows_) cow_RaiseOutOfRange(row, rows_, "cow_2DArray: row");
        if (column < 0 || column >= columns_) cow_RaiseOutOfRange(column, columns_, "cow_2DArray: column");
        return static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
               static_cast<std::size_t>(column);
    }

    int rows_ = 0;
    int columns_ = 0;
    cow_COW<Items, cow_Direct<Items>> items_;
};

#endif
