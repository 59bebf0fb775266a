#ifndef QRX_FOUNDATION_NUM_READREAL_H
#define QRX_FOUNDATION_NUM_READREAL_H

#include <charconv>

/// std::from_chars of a double, also where the standard library has it for integers alone.
#ifdef __cpp_lib_to_chars
inline std::from_chars_result num_ReadReal(const char* first, const char* last, double& value) {
    return std::from_chars(first, last, value);
}
#else
std::from_chars_result num_ReadReal(const char* first, const char* last, double& value);
#endif

#endif
