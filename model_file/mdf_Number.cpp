#include "model_file/mdf_Number.h"

#include "foundation/num_ReadReal.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <system_error>

namespace {

/// The parts of a number, and its end or where it breaks.
struct NumberParts {
    const char* firstDigit = nullptr;
    const char* point = nullptr;    ///< or where it would stand
    const char* exponent = nullptr; ///< the "e", or the end of the digits
    const char* end = nullptr;
    bool isWhole = false;
    bool isGood = false;
};

NumberParts PartsOf(const char* at, const char* end) {
    NumberParts parts;
    const auto digits = [&] {
        const char* const begin = at;
        while (at != end && mdf_IsDigit(*at)) ++at;
        return at != begin;
    };
    const auto stop = [&](bool good) {
        parts.end = at;
        parts.isGood = good;
        return parts;
    };
    if (*at == '-') ++at;
    parts.firstDigit = at;
    if (at != end && *at == '0') {
        ++at;
    } else if (!digits()) {
        return stop(false);
    }
    parts.point = at;
    parts.isWhole = true;
    if (at != end && *at == '.') {
        parts.isWhole = false;
        ++at;
        if (!digits()) return stop(false);
    }
    parts.exponent = at;
    if (at != end && (*at == 'e' || *at == 'E')) {
        parts.isWhole = false;
        ++at;
        if (at != end && (*at == '+' || *at == '-')) ++at;
        if (!digits()) return stop(false);
    }
    return stop(true);
}

/// The power of ten that the first digit other than zero counts, or one that is far enough out.
long long PowerOf(const NumberParts& parts) {
    const char* const first =
        std::find_if(parts.firstDigit, parts.exponent, [](char c) { return c != '0' && c != '.'; });
    long long power = first < parts.point ? parts.point - first - 1 : parts.point - first;
    if (parts.exponent == parts.end) return power;
    const char* at = parts.exponent + 1;
    const bool negative = *at == '-';
    if (*at == '-' || *at == '+') ++at;
    constexpr long long farOut = 1LL << 60;
    long long exponent = 0;
    for (; at != parts.end; ++at) exponent = std::min(exponent * 10 + (*at - '0'), farOut / 10);
    return power + (negative ? -exponent : exponent);
}

mdf_Number Whole(long long value, const char* end) {
    mdf_Number number;
    number.end = end;
    number.value = static_cast<double>(value);
    number.kind = mdf_Number::Kind::LARGE;
    if (value >= std::numeric_limits<int>::min() && value <= std::numeric_limits<int>::max()) {
        number.kind = mdf_Number::Kind::INT;
        number.whole = static_cast<int>(value);
    }
    return number;
}

} // namespace

mdf_Number mdf_ReadAnyNumber(const char* at, const char* end) {
    const NumberParts parts = PartsOf(at, end);
    mdf_Number number;
    number.end = parts.end;
    if (!parts.isGood) return number;
    if (parts.isWhole) {
        long long value = 0;
        if (std::from_chars(at, parts.end, value).ec == std::errc()) return Whole(value, parts.end);
    }
    number.kind = parts.isWhole ? mdf_Number::Kind::LARGE : mdf_Number::Kind::REAL;
    const bool isInRange = num_ReadReal(at, parts.end, number.value).ec == std::errc();
    if (isInRange && !std::isinf(number.value)) return number;
    if (PowerOf(parts) > 0) {
        number.kind = mdf_Number::Kind::BEYOND;
    } else {
        number.value = *at == '-' ? -0.0 : 0.0;
    }
    return number;
}
