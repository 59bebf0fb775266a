#ifndef QRX_OIF_DATALINES_H
#define QRX_OIF_DATALINES_H

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

#endif
