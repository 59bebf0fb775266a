#ifndef QRX_TESTS_CONNECTORS_CONNECTORTESTING_H
#define QRX_TESTS_CONNECTORS_CONNECTORTESTING_H

#include "support/DeckTest.h"

#include <initializer_list>

inline cow_2DArray<double> Table(std::initializer_list<std::initializer_list<double>> rows) {
    cow_2DArray<double> table(static_cast<int>(rows.size()), static_cast<int>(rows.begin()->size()));
    int row = 0;
    for (const auto& values : rows) {
        int column = 0;
        for (const double value : values) table.Put(row, column++, value);
        ++row;
    }
    return table;
}

template <class T>
cow_List<T> List(std::initializer_list<T> items) {
    cow_List<T> list;
    for (const T& item : items) list.Append(item);
    return list;
}

/// A store with a datum system by name.
class CsysStore : public TestStore {
public:
    dtmC_DatumRef Add(const char* name, dtu_DatumCsysType type = dtu_DatumCsysType::RECTANGULAR,
                      const gsl_Point& origin = {}) {
        odiK_Datum datum;
        datum.name = name;
        datum.csysType = type;
        datum.origin = origin;
        return model.AddDatum(datum);
    }
    dtmC_DatumRef AddPoint(const char* name) {
        odiK_Datum datum;
        datum.name = name;
        datum.type = dtu_DatumType::POINT;
        return model.AddDatum(datum);
    }
};

inline const std::string kUnitAxes =
    "          1.,           0.,           0.,           0.,           1.,           0.\n";

#endif
