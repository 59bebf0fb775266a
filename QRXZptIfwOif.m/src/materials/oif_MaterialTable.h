#ifndef QRX_OIF_MATERIALTABLE_H
#define QRX_OIF_MATERIALTABLE_H

#include "foundation/utl_Stream.h"
#include "store_interface/records/materials/kmaC_MaterialTable.h"

/// The data lines of a table: six significant digits, columns padded to common widths, eight cells a line at
/// most. A row of more goes on in the next line; a cell that stands alone on its line has a comma behind it.
class oif_MaterialTable {
public:
    /// The last two are kept, but don't change what is printed.
    oif_MaterialTable(const cow_2DArray<double>& values, int dependencies, bool temperatureDependency);
    oif_MaterialTable(const kmaC_MaterialTable& values, int dependencies, bool temperatureDependency)
        : oif_MaterialTable(values.Values(), dependencies, temperatureDependency) {}

    const cow_2DArray<double>& Values() const { return values_; }
    int Dependencies() const { return dependencies_; }
    bool TemperatureDependency() const { return temperatureDependency_; }
    const cow_2DArray<cow_String>& Cells() const { return cells_; }

    /// Puts a column of single blanks ahead of column `index`. There must be such a column: behind the last
    /// one none is ever added.
    void InsertEmptyColumn(int index);
    /// Gives the text to each cell of the column that reads as the value. Nothing happens for a column that
    /// isn't there.
    void ReplaceColumnData(int column, double value, const cow_String& text);
    void SwapColumns(int a, int b);
    /// Leaves these columns out when printing.
    void SkipColumns(const cow_List<int>& columns) { skipColumns_ = columns; }
    void SetBlankLineAfterRow(bool blankLine) { blankLineAfterRow_ = blankLine; }

    void Print(utl_Stream& stream) const;

    /// The value in the deck's real form.
    static cow_String ConvertDouble(double value, int width, int precision);

private:
    void PopulateStringTable();

    cow_2DArray<double> values_;
    int dependencies_;
    bool temperatureDependency_;
    cow_2DArray<cow_String> cells_;
    cow_List<int> skipColumns_;
    bool blankLineAfterRow_ = false;
};

inline utl_Stream& operator<<(utl_Stream& stream, const oif_MaterialTable& table) {
    table.Print(stream);
    return stream;
}

/// Without temperatures, field variables keep their place: a blank column stands where the temperature
/// would be. `table` is of `columns` columns in the record.
inline void oif_KeepFieldColumns(oif_MaterialTable& table, int columns, bool temperatureDependency,
                                 int dependencies) {
    if (!temperatureDependency && dependencies > 0) table.InsertEmptyColumn(columns - dependencies);
}
template <class R>
void oif_KeepFieldColumns(oif_MaterialTable& table, const R& option) {
    oif_KeepFieldColumns(table, option.table.NumColumns(), option.temperatureDependency, option.dependencies);
}

/// A table that may depend on the temperature and on field variables, these in their places.
template <class Values>
oif_MaterialTable oif_DependentTable(const Values& values, int dependencies, bool temperatureDependency) {
    oif_MaterialTable table(values, dependencies, temperatureDependency);
    oif_KeepFieldColumns(table, values.NumColumns(), temperatureDependency, dependencies);
    return table;
}
template <class R>
oif_MaterialTable oif_DependentTable(const R& option) {
    return oif_DependentTable(option.table, option.dependencies, option.temperatureDependency);
}

/// A blank column for data that the record's table leaves out just ahead of temperature and field variables;
/// without those nothing has to keep its place.
template <class R>
void oif_KeepDependentColumns(oif_MaterialTable& table, const R& option) {
    if (!option.temperatureDependency && option.dependencies <= 0) return;
    table.InsertEmptyColumn(option.table.NumColumns() - option.dependencies -
                            (option.temperatureDependency ? 1 : 0));
}

#endif
