#ifndef QRX_TESTS_SECTIONS_SECTIONTESTING_H
#define QRX_TESTS_SECTIONS_SECTIONTESTING_H

#include "support/DeckTest.h"

/// A failing write: what stands in the stream when the keyword raises, then "|" and what it raises.
inline std::string Failing(const qkw_Keyword& keyword) {
    qio_StringDevice device;
    std::string raised;
    {
        utl_Stream stream(device, 131, 6, 6);
        raised = Raised([&] { keyword.Write(stream); });
    }
    return device.Text() + "|" + raised;
}

template <class T>
cow_List<T> ListOf(std::initializer_list<T> items) {
    cow_List<T> list;
    for (const T& item : items) list.Append(item);
    return list;
}

inline cow_2DArray<double> TableOf(int columns, std::initializer_list<double> cells) {
    cow_2DArray<double> table(static_cast<int>(cells.size()) / columns, columns);
    int place = 0;
    for (const double cell : cells) {
        table.Put(place / columns, place % columns, cell);
        ++place;
    }
    return table;
}

#endif
