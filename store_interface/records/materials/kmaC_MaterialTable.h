#ifndef QRX_STORE_KMAC_MATERIALTABLE_H
#define QRX_STORE_KMAC_MATERIALTABLE_H

#include "store_interface/records/cls_FieldTable.h"

/// The table of numbers of a material option. Copies share the numbers until one is written; access outside
/// the table raises as in cow_2DArray.
class kmaC_MaterialTable : public mem_AllocationOperators {
public:
    kmaC_MaterialTable() = default;
    /// All numbers are zero.
    kmaC_MaterialTable(int rows, int columns) : values_(rows, columns) {}
    kmaC_MaterialTable(const cow_2DArray<double>& values) : values_(values) {}

    int NumRows() const { return values_.NumRows(); }
    int NumColumns() const { return values_.NumColumns(); }
    double ConstGet(int row, int column) const { return values_.ConstGet(row, column); }
    void Put(int row, int column, double value) { values_.Put(row, column, value); }
    const cow_2DArray<double>& Values() const { return values_; }

    /// Puts the rows in ascending order of their last `n` columns, the first of these counting first. Rows
    /// that are equal in them keep their order. Nothing happens for an `n` that the table doesn't have.
    void Sort(int n);
    void SwapColumns(int a, int b);

    friend bool operator==(const kmaC_MaterialTable& a, const kmaC_MaterialTable& b) {
        return a.values_ == b.values_;
    }

private:
    cow_2DArray<double> values_;
};

template <>
struct cls_TypeOf<kmaC_MaterialTable> {
    class Type : public cls_TypedField<kmaC_MaterialTable, cls_TableType> {
    public:
        const cow_2DArray<double>& Get(const void* value) const override { return At(value).Values(); }
        void Set(void* value, const cow_2DArray<double>& cells) const override { At(value) = cells; }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

#endif
