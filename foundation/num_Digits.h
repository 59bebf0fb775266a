#ifndef QRX_FOUNDATION_NUM_DIGITS_H
#define QRX_FOUNDATION_NUM_DIGITS_H

#include <array>
#include <bit>
#include <cstdint>
#include <cstring>

// Digits by table, for writers of whole lines.

/// "0000" to "9999", the first character in the lowest byte.
extern const std::array<std::uint32_t, 10000> num_fourDigits;

/// Eight bytes in a word, the first in the lowest byte.
inline void num_Store(char* out, std::uint64_t bytes) {
    if constexpr (std::endian::native == std::endian::little) {
        std::memcpy(out, &bytes, sizeof bytes);
    } else {
        for (int i = 0; i < 8; ++i) out[i] = static_cast<char>(bytes >> (8 * i));
    }
}

/// The eight digits of n < 10^8 as characters.
inline std::uint64_t num_EightDigits(std::uint32_t n) {
    return num_fourDigits[n / 10000] | static_cast<std::uint64_t>(num_fourDigits[n % 10000]) << 32;
}

inline constexpr std::uint64_t num_zeros = 0x3030303030303030;
inline constexpr std::uint64_t num_blanks = 0x2020202020202020;

/// The greatest number that num_WriteField() can write.
inline constexpr int num_longestField = 7;
inline constexpr std::uint32_t num_mostInField = 9999999;

/// Writes a number of up to `width` digits, right-aligned in a field of 1 to 7 characters, and the character
/// behind it, in one store of eight bytes.
inline char* num_WriteField(char* out, std::uint32_t n, int width, char behind) {
    const std::uint64_t digits = num_EightDigits(n);
    // A lone zero still is one digit.
    const int leading = std::countr_zero((digits ^ num_zeros) | std::uint64_t{1} << 56) & ~7;
    const std::uint64_t blanked = digits ^ (((std::uint64_t{1} << leading) - 1) & (num_zeros ^ num_blanks));
    const auto end = static_cast<std::uint64_t>(static_cast<unsigned char>(behind)) << (8 * width);
    num_Store(out, blanked >> (8 * (8 - width)) | end);
    return out + width + 1;
}

#endif
