#ifndef QRX_FOUNDATION_NUM_TRUNCATED_H
#define QRX_FOUNDATION_NUM_TRUNCATED_H

#include <limits>

/// The value cut to a whole number, toward zero. One beyond the range of int gives the nearest int, NaN 0.
inline int num_Truncated(double value) {
    constexpr int least = std::numeric_limits<int>::min();
    constexpr int most = std::numeric_limits<int>::max();
    if (value >= static_cast<double>(most)) return most;
    if (value <= static_cast<double>(least)) return least;
    return value == value ? static_cast<int>(value) : 0;
}

#endif
