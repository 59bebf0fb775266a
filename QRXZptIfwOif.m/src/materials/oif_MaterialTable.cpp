#include "materials/oif_MaterialTable.h"

#include "foundation/num_ReadReal.h"

#include <charconv>
#include <cstring>
#include <vector>

namespace {

constexpr int kPrecision = 6;
constexpr int kCellsPerLine = 8;

/// A value in the real form, without a width.
struct Figures {
    explicit Figures(double value) {
        char room[num_RealRoom(0, kPrecision)];
        length = static_cast<unsigned char>(num_WriteReal(room, value, 0, kPrecision) - room);
        std::memcpy(text, room, length);
    }
    /// The length of cow_String(value): the real form differs from it by no more than a point at the end.
    int LengthOfString() const { return text[length - 1] == '.' ? length - 1 : length; }

    char text[15]; // "-1.23457e-308" is the longest
    unsigned char length;
};

cow_String RightAligned(const Figures& figures, int width) {
    char text[sizeof figures.text + 1];
    const int blanks = std::max(0, width - figures.length);
    std::memset(text, ' ', static_cast<std::size_t>(blanks));
    std::memcpy(text + blanks, figures.text, figures.length);
    return std::string_view(text, static_cast<std::size_t>(blanks + figures.length));
}

/// What C's atof gives in the "C" locale.
double NumberIn(const cow_String& cell) {
    std::string_view text = cell.View();
    text.remove_prefix(std::min(text.find_first_not_of(' '), text.size()));
    double number = 0.0;
    num_ReadReal(text.data(), text.data() + text.size(), number);
    return number;
}

} // namespace

oif_MaterialTable::oif_MaterialTable(const cow_2DArray<double>& values, int dependencies,
                                     bool temperatureDependency)
    : values_(values), dependencies_(dependencies), temperatureDependency_(temperatureDependency),
      cells_(values.NumRows(), values.NumColumns()) {
    PopulateStringTable();
}

void oif_MaterialTable::PopulateStringTable() {
    if (values_.IsEmpty()) return;
    const int rows = values_.NumRows();
    const int columns = values_.NumColumns();
    std::vector<Figures> figures;
    figures.reserve(static_cast<std::size_t>(rows) * static_cast<std::size_t>(columns));
    int firstWidth = 0;
    int otherWidth = 0;
    for (int row = 0; row < rows; ++row) {
        const double* values = values_.ConstRow(row);
        for (int column = 0; column < columns; ++column) {
            const Figures& cell = figures.emplace_back(values[column]);
            int& width = column == 0 ? firstWidth : otherWidth;
            width = std::max(width, cell.LengthOfString() + 1);
        }
    }
    const Figures* cell = figures.data();
    for (int row = 0; row < rows; ++row) {
        for (int column = 0; column < columns; ++column, ++cell) {
            cells_.Put(row, column, RightAligned(*cell, column == 0 ? firstWidth : otherWidth));
        }
    }
}

cow_String oif_MaterialTable::ConvertDouble(double value, int width, int precision) {
    std::vector<char> text(num_RealRoom(width, precision));
    const char* end = num_WriteReal(text.data(), value, width, precision);
    return std::string_view(text.data(), static_cast<std::size_t>(end - text.data()));
}

void oif_MaterialTable::InsertEmptyColumn(int index) {
    const int columns = cells_.NumColumns();
    if (index < 0 || index >= columns) return;
    cow_2DArray<cow_String> wider(cells_.NumRows(), columns + 1);
    const cow_String blank(" ");
    for (int row = 0; row < cells_.NumRows(); ++row) {
        for (int column = 0; column <= columns; ++column) {
            wider.Put(row, column,
                      column == index ? blank : cells_.ConstGet(row, column < index ? column : column - 1));
        }
    }
    cells_ = wider;
}

void oif_MaterialTable::ReplaceColumnData(int column, double value, const cow_String& text) {
    if (column < 0 || column >= cells_.NumColumns()) return;
    for (int row = 0; row < cells_.NumRows(); ++row) {
        if (NumberIn(cells_.ConstGet(row, column)) == value) cells_.Put(row, column, text);
    }
}

void oif_MaterialTable::SwapColumns(int a, int b) {
    if (a == b) return;
    for (int row = 0; row < cells_.NumRows(); ++row) {
        const cow_String kept = cells_.ConstGet(row, a);
        cells_.Put(row, a, cells_.ConstGet(row, b));
        cells_.Put(row, b, kept);
    }
}

void oif_MaterialTable::Print(utl_Stream& stream) const {
    const int columns = cells_.NumColumns();
    std::vector<bool> skipped(static_cast<std::size_t>(columns));
    for (int i = 0; i < skipColumns_.Length(); ++i) {
        const int column = skipColumns_[i];
        if (column >= 0 && column < columns) skipped[static_cast<std::size_t>(column)] = true;
    }
    const int printed = columns - skipColumns_.Length();
    for (int row = 0; row < cells_.NumRows(); ++row) {
        int count = 0;
        for (int column = 0; column < columns; ++column) {
            if (skipped[static_cast<std::size_t>(column)]) continue;
            if (count > 0 && count % kCellsPerLine == 0) stream.LineBreak();
            stream.Print(cells_.ConstGet(row, column));
            ++count;
            if (count < printed && count % kCellsPerLine != 0) stream.Print(",");
        }
        if (printed % kCellsPerLine == 1) stream.Print(",");
        stream.LineBreak();
        if (blankLineAfterRow_) stream.LineBreak();
    }
}
