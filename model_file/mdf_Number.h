#ifndef QRX_MODEL_FILE_MDF_NUMBER_H
#define QRX_MODEL_FILE_MDF_NUMBER_H

#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>

/// A number of a JSON document.
struct mdf_Number {
    enum class Kind : std::uint8_t {
        INT,    ///< fits 32 bits and is written without fraction and exponent
        LARGE,  ///< written so, and doesn't fit
        REAL,   ///< any other number
        BROKEN, ///< no number; `end` is where it breaks
        BEYOND  ///< beyond the range of double precision
    };
    Kind kind = Kind::BROKEN;
    int whole = 0;      ///< of an INT
    double value = 0.0; ///< of a LARGE or REAL, rounded as strtod does in the "C" locale
    const char* end = nullptr;
};

inline bool mdf_IsDigit(char c) {
    return c >= '0' && c <= '9';
}
inline bool mdf_BeginsNumber(char c) {
    return mdf_IsDigit(c) || c == '-';
}

/// Any number, digit by digit.
mdf_Number mdf_ReadAnyNumber(const char* at, const char* end);

/// Digits at the beginning of eight characters.
struct mdf_Digits {
    std::uint32_t value;
    unsigned count; ///< up to 8
};

inline mdf_Digits mdf_ReadDigits(const char* at) {
    std::uint64_t word;
    std::memcpy(&word, at, sizeof word);
    constexpr std::uint64_t every = 0x0101010101010101;
    const std::uint64_t values = word ^ (every * '0');
    const std::uint64_t others = (values | (values + every * (0x80 - 10))) & (every * 0x80);
    const auto count = static_cast<unsigned>(std::countr_zero(others)) / 8;
    if (count == 0) return {0, 0};
    // Shifted to the end, behind zeros; then pairs, fours and eights are put together.
    std::uint64_t digits = values << (8 * (8 - count));
    digits = (digits * 10 + (digits >> 8)) & 0x00ff00ff00ff00ff;
    digits = (digits * 100 + (digits >> 16)) & 0x0000ffff0000ffff;
    digits = digits * 10000 + (digits >> 32);
    return {static_cast<std::uint32_t>(digits), count};
}

/// The number that begins at `at`, with a digit or a minus sign. What meshes are full of, up to seven digits
/// and up to eight behind the point, takes no loop.
inline mdf_Number mdf_ReadNumber(const char* at, const char* end) {
    constexpr std::ptrdiff_t longest = 1 + 7 + 1 + 8 + 8;
    if (std::endian::native != std::endian::little || end - at < longest) return mdf_ReadAnyNumber(at, end);
    const bool negative = *at == '-';
    const char* const first = at + negative;
    const mdf_Digits whole = mdf_ReadDigits(first);
    if (whole.count - 1 >= 7 || (*first == '0' && whole.count > 1)) return mdf_ReadAnyNumber(at, end);
    const char* next = first + whole.count;
    mdf_Number number;
    if (*next != '.') {
        if ((*next | 0x20) == 'e') return mdf_ReadAnyNumber(at, end);
        number.kind = mdf_Number::Kind::INT;
        number.whole = negative ? -static_cast<int>(whole.value) : static_cast<int>(whole.value);
        number.end = next;
        return number;
    }
    const mdf_Digits fraction = mdf_ReadDigits(++next);
    next += fraction.count;
    if (fraction.count == 0 || mdf_IsDigit(*next) || (*next | 0x20) == 'e') return mdf_ReadAnyNumber(at, end);
    constexpr double tens[] = {1e0, 1e1, 1e2, 1e3, 1e4, 1e5, 1e6, 1e7, 1e8};
    constexpr std::uint64_t wholeTens[] = {1, 10, 100, 1000, 10000, 100000, 1000000, 10000000, 100000000};
    // Both are exact, so their quotient is the number rounded.
    const double value = static_cast<double>(static_cast<std::int64_t>(
                             whole.value * wholeTens[fraction.count] + fraction.value)) /
                         tens[fraction.count];
    number.kind = mdf_Number::Kind::REAL;
    number.value = negative ? -value : value;
    number.end = next;
    return number;
}

#endif
