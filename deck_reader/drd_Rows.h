#ifndef QRX_DECK_READER_DRD_ROWS_H
#define QRX_DECK_READER_DRD_ROWS_H

#include "deck_reader/drd_Flat.h"

/// The part of a std::vector that rows of plain values need, over memory that grows as that of drd_Flat.
template <class T>
class drd_Rows {
public:
    std::size_t size() const { return rows_.Size(); }
    bool empty() const { return rows_.IsEmpty(); }
    const T* data() const { return rows_.Data(); }
    T* begin() { return rows_.Data(); }
    T* end() { return rows_.Data() + rows_.Size(); }
    const T* begin() const { return rows_.begin(); }
    const T* end() const { return rows_.end(); }
    T& operator[](std::size_t index) { return rows_[index]; }
    const T& operator[](std::size_t index) const { return rows_[index]; }
    T& back() { return rows_[rows_.Size() - 1]; }
    const T& front() const { return rows_[0]; }
    void push_back(const T& row) { rows_.Add(row); }
    /// Gives back what was taken ahead.
    void shrink_to_fit() { rows_.Trim(); }

private:
    drd_Flat<T> rows_;
};

#endif
