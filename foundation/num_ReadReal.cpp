#include "foundation/num_ReadReal.h"

#ifndef __cpp_lib_to_chars
#include "platform/plt_Real.h"

#include <cerrno>
#include <cmath>
#include <string>

namespace {

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

/// The end of the longest number from `at` on, as from_chars takes it but for words such as "nan"; null for
/// none.
const char* EndOf(const char* at, const char* last) {
    if (at != last && *at == '-') ++at;
    const auto passDigits = [&at, last] {
        const char* const begin = at;
        while (at != last && IsDigit(*at)) ++at;
        return at != begin;
    };
    bool hasDigits = passDigits();
    if (at != last && *at == '.') {
        ++at;
        hasDigits = passDigits() || hasDigits;
    }
    if (!hasDigits) return nullptr;
    const char* const mantissa = at;
    if (at == last || (*at != 'e' && *at != 'E')) return mantissa;
    ++at;
    if (at != last && (*at == '+' || *at == '-')) ++at;
    return passDigits() ? at : mantissa;
}

} // namespace

std::from_chars_result num_ReadReal(const char* first, const char* last, double& value) {
    const char* const end = EndOf(first, last);
    if (end == nullptr) return {first, std::errc::invalid_argument};
    const std::string text(first, end);
    errno = 0;
    const double read = plt_ReadPlainReal(text.c_str());
    // What lies between zero and the smallest normal number is told as a failure too, but is one that a
    // double holds.
    const bool isBeyond = errno == ERANGE && (std::isinf(read) || read == 0.0);
    if (isBeyond) return {end, std::errc::result_out_of_range};
    value = read;
    return {end, std::errc()};
}
#endif
