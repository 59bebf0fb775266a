#ifndef QRX_OIF_DATALINES_H
#define QRX_OIF_DATALINES_H

#include "foundation/cow_2DArray.h"
#include "foundation/utl_Stream.h"

#include <initializer_list>

/// Geometry on a data line, with all its digits: ", " between the values, no line end.
inline void oif_PrintGeometry(utl_Stream& stream, std::initializer_list<double> values) {
    constexpr int width = 12;
    constexpr int precision = 15;
    const char* separator = "";
    for (const double value : values) {
        stream << separator;
        stream.Print(value, width, precision);
        separator = ", ";
    }
}

/// Further numbers of a line that has been begun: the separator before each.
inline void oif_AddNumbers(utl_Stream& stream, std::initializer_list<double> numbers,
                           const char* separator = ", ") {
    for (const double number : numbers) stream << separator << number;
}

/// Writes values in data lines of at most `perLine`: ", " between two of a line, and nothing but its end
/// behind the last.
class oif_DataLines {
public:
    oif_DataLines(utl_Stream& stream, int perLine) : stream_(stream), perLine_(perLine) {}

    template <class Value>
    oif_DataLines& Add(const Value& value) {
        if (onLine_ > 0) stream_ << ", ";
        stream_ << value;
        if (++onLine_ == perLine_) End();
        return *this;
    }
    /// Ends a line that has been begun; after a full line there is none.
    void End() {
        if (onLine_ > 0) stream_.LineBreak();
        onLine_ = 0;
    }

private:
    utl_Stream& stream_;
    int perLine_;
    int onLine_ = 0;
};

/// The table's numbers, row by row, `counts` of them on each line; what it doesn't have is left out.
inline void oif_PrintCells(utl_Stream& stream, const cow_2DArray<double>& table,
                           std::initializer_list<int> counts) {
    const int available = table.NumRows() * table.NumColumns();
    int next = 0;
    for (const int count : counts) {
        oif_DataLines line(stream, count);
        for (int i = 0; i < count && next < available; ++i, ++next) {
            line.Add(table.ConstGet(next / table.NumColumns(), next % table.NumColumns()));
        }
        line.End();
    }
}

#endif
