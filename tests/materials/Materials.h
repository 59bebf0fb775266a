#ifndef QRX_TESTS_MATERIALS_MATERIALS_H
#define QRX_TESTS_MATERIALS_MATERIALS_H

#include "materials/oif_MaterialOption.h"
#include "support/DeckTest.h"

#include <initializer_list>

inline cow_2DArray<double> Table(std::initializer_list<std::initializer_list<double>> rows) {
    cow_2DArray<double> table(static_cast<int>(rows.size()),
                              rows.size() == 0 ? 0 : static_cast<int>(rows.begin()->size()));
    int row = 0;
    for (const auto& values : rows) {
        int column = 0;
        for (const double value : values) table.Put(row, column++, value);
        ++row;
    }
    return table;
}

/// A record of class R as `set` leaves it.
template <class R, class Set>
R With(const Set& set) {
    R record;
    set(record);
    return record;
}

/// Gives an enumeration a number, in its list or not.
template <class E>
void Number(E& value, int number) {
    value = static_cast<E>(number);
}

/// What the keyword K of a record that `set` leaves writes.
template <class K, class R, class Set>
std::string WrittenWith(const Set& set) {
    return Written(K(With<R>(set)));
}

/// One record and the text that it must give.
struct TextCase {
    const char* name;
    std::string (*write)();
    const char* expected;
};

inline void PrintTo(const TextCase& c, std::ostream* out) {
    *out << c.name;
}

inline std::string TextCaseName(const testing::TestParamInfo<TextCase>& info) {
    return info.param.name;
}

/// `KEYWORD(Density, o.dependencies = 1)`: what oif_Density writes of a kmaC_Density changed so.
#define KEYWORD(name, ...) ([] { return WrittenWith<oif_##name, kmaC_##name>([](auto& o) { __VA_ARGS__; }); })

#endif
