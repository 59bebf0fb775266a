#include "foundation/num_RealText.h"

#include "foundation/num_Digits.h"

#include <array>
#include <bit>
#include <charconv>
#include <cstdint>
#include <cstring>
#include <string_view>

constexpr std::array<std::uint32_t, 10000> num_fourDigits = [] {
    std::array<std::uint32_t, 10000> texts{};
    for (std::uint32_t n = 0; n < texts.size(); ++n) {
        const std::uint32_t digits[] = {n / 1000, n / 100 % 10, n / 10 % 10, n % 10};
        for (int i = 0; i < 4; ++i) texts[n] |= ('0' + digits[i]) << (8 * i);
    }
    return texts;
}();

namespace {

constexpr int kLeastPower = -324;
constexpr int kGreatestPower = 340;
constexpr int kMostFastDigits = 16;

using PowerTable = std::array<std::uint64_t, kGreatestPower - kLeastPower + 1>;

/// The leading bits of powers of ten, in 128 bits while the table is made.
struct WideSignificand {
    std::array<std::uint32_t, 4> limbs; // least first; the top bit is set

    constexpr std::uint64_t Top() const { return std::uint64_t{limbs[3]} << 32 | limbs[2]; }

    constexpr void TimesFive() {
        std::array<std::uint32_t, 5> product{};
        std::uint64_t carry = 0;
        for (std::size_t i = 0; i < 4; ++i) {
            carry += std::uint64_t{limbs[i]} * 5;
            product[i] = static_cast<std::uint32_t>(carry);
            carry >>= 32;
        }
        product[4] = static_cast<std::uint32_t>(carry);
        const int shift = 32 - std::countl_zero(product[4]);
        for (std::size_t i = 0; i < 4; ++i) {
            const std::uint64_t pair = std::uint64_t{product[i + 1]} << 32 | product[i];
            limbs[i] = static_cast<std::uint32_t>(pair >> shift);
        }
    }

    constexpr void OverFive() {
        WideSignificand quotient = ShiftedOverFive(2);
        if (quotient.limbs[3] >> 31 == 0) quotient = ShiftedOverFive(3);
        *this = quotient;
    }

private:
    constexpr WideSignificand ShiftedOverFive(int shift) const {
        WideSignificand quotient{};
        std::uint64_t rest = limbs[3] >> (32 - shift);
        for (std::size_t i = 4; i-- > 0;) {
            const std::uint32_t below = i == 0 ? 0 : limbs[i - 1] >> (32 - shift);
            rest = rest << 32 | static_cast<std::uint32_t>(limbs[i] << shift | below);
            quotient.limbs[i] = static_cast<std::uint32_t>(rest / 5);
            rest %= 5;
        }
        return quotient;
    }
};

// The 64 leading bits of 10^k, cut off: less than two units below the true value, and exact for k from 0 to
// 27. (665 cut-offs at 128 bits stay far below one unit here.)
constexpr PowerTable MakePowers() {
    PowerTable powers{};
    WideSignificand up{{0, 0, 0, 0x80000000}};
    for (int k = 0; k <= kGreatestPower; ++k, up.TimesFive()) {
        powers[static_cast<std::size_t>(k - kLeastPower)] = up.Top();
    }
    WideSignificand down{{0, 0, 0, 0x80000000}};
    for (int k = -1; k >= kLeastPower; --k) {
        down.OverFive();
        powers[static_cast<std::size_t>(k - kLeastPower)] = down.Top();
    }
    return powers;
}

constexpr PowerTable kPowers = MakePowers();

constexpr std::array<std::uint64_t, kMostFastDigits + 1> kTens = [] {
    std::array<std::uint64_t, kMostFastDigits + 1> tens{1};
    for (std::size_t i = 1; i < tens.size(); ++i) tens[i] = tens[i - 1] * 10;
    return tens;
}();

inline std::uint64_t Power(int k) {
    return kPowers[static_cast<std::size_t>(k - kLeastPower)];
}

/// floor(log2(10^k)), for every k in the table.
constexpr int BinaryExponent(int k) {
    return (k * 217706) >> 16;
}
/// The greatest c with 10^c < 2^b, for every exponent b of a double.
constexpr int DecimalExponentBelow(int b) {
    return (b * 78913 - 1) >> 18;
}

struct Product {
    std::uint64_t high;
    std::uint64_t low;
};

inline Product Multiply(std::uint64_t a, std::uint64_t b) {
#if defined(__SIZEOF_INT128__)
    __extension__ using Wide = unsigned __int128;
    const Wide product = static_cast<Wide>(a) * b;
    return {static_cast<std::uint64_t>(product >> 64), static_cast<std::uint64_t>(product)};
#else
    const std::uint64_t aHigh = a >> 32, aLow = a & 0xffffffff;
    const std::uint64_t bHigh = b >> 32, bLow = b & 0xffffffff;
    const std::uint64_t low = aLow * bLow;
    const std::uint64_t middle = aHigh * bLow + (low >> 32);
    const std::uint64_t other = aLow * bHigh + (middle & 0xffffffff);
    return {aHigh * bHigh + (middle >> 32) + (other >> 32), other << 32 | (low & 0xffffffff)};
#endif
}

/// A decimal number of a fixed count of digits: the first digit counts 10^exponent.
struct Decimal {
    std::uint64_t digits;
    int exponent;
};

/// Rounds a finite magnitude other than zero to `precision` digits (1 to 16), ties to even. False when the
/// table's cut-off leaves the rounding open.
inline bool Round(std::uint64_t bits, int precision, Decimal& decimal) {
    std::uint64_t significand = (bits & 0xfffffffffffff) << 11;
    int b = static_cast<int>(bits >> 52) - 1023;
    if (b != -1023) [[likely]] {
        significand |= std::uint64_t{1} << 63;
    } else {
        const int shift = std::countl_zero(significand);
        significand <<= shift;
        b -= shift - 1;
    }
    // significand / 2^63 lies in [1, 2) and counts 2^b. The greatest power of ten that can be in it is tried.
    int exponent = DecimalExponentBelow(b + 1);
    exponent -=
        static_cast<int>(BinaryExponent(exponent) == b) & static_cast<int>(significand < Power(exponent));

    const int k = precision - 1 - exponent;
    const Product product = Multiply(significand, Power(k));
    const int shift =
        62 - b - BinaryExponent(k); // 9 to 63: where the units of the result stand in the high half
    const std::uint64_t half = std::uint64_t{1} << (shift - 1);
    const std::uint64_t rest = product.high & (2 * half - 1);
    std::uint64_t digits = (product.high >> shift) + (rest >> (shift - 1));
    // The true product is less than 2^65 above this one: only a rest that close below one half is open.
    if (rest - (half - 2) <= 2) [[unlikely]] {
        if (k < 0 || k > 27) return false;
        if (rest == half && product.low == 0) digits &= ~std::uint64_t{1};
    }
    if (digits == kTens[static_cast<std::size_t>(precision)]) [[unlikely]] {
        digits /= 10;
        ++exponent;
    }
    decimal = {digits, exponent};
    return true;
}

constexpr std::uint64_t kZeroPoint = 0x3030303030302e30; // "0.000000"

/// The eight digits of n < 10^8 as byte values, the first in the lowest byte.
inline std::uint64_t EightDigits(std::uint32_t n) {
    return num_EightDigits(n) ^ num_zeros;
}

/// Blanks that right-align a text of `length` in `width`; returns where the text begins.
inline char* Pad(char* out, int width, int length) {
    num_Store(out, num_blanks);
    num_Store(out + 8, num_blanks);
    if (width <= length) return out;
    const int blanks = width - length;
    if (blanks > 16) [[unlikely]]
        std::memset(out, ' ', static_cast<std::size_t>(blanks));
    return out + blanks;
}

/// Moves the text [out, out + length) to the right end of the field.
char* Align(char* out, int width, int length) {
    if (length >= width) return out + length;
    const auto blanks = static_cast<std::size_t>(width - length);
    std::memmove(out + blanks, out, static_cast<std::size_t>(length));
    std::memset(out, ' ', blanks);
    return out + width;
}

bool NeedsPoint(const char* text, std::size_t length) {
    return std::string_view(text, length).find_first_of(".eEnNiI") == std::string_view::npos;
}

/// Every value at any precision, by the standard library.
char* WriteAnyReal(char* out, double value, int width, int precision) {
    const std::size_t room = num_RealRoom(width, precision);
    char* end = std::to_chars(out, out + room, value, std::chars_format::general, precision).ptr;
    if (NeedsPoint(out, static_cast<std::size_t>(end - out))) *end++ = '.';
    return Align(out, width, static_cast<int>(end - out));
}

/// "e+05" or "e-123".
inline char* WriteExponent(char* out, int exponent) {
    *out++ = 'e';
    *out++ = exponent < 0 ? '-' : '+';
    int magnitude = exponent < 0 ? -exponent : exponent;
    if (magnitude >= 100) {
        *out++ = static_cast<char>('0' + magnitude / 100);
        magnitude %= 100;
    }
    *out++ = static_cast<char>('0' + magnitude / 10);
    *out++ = static_cast<char>('0' + magnitude % 10);
    return out;
}

/// Lays out at most eight digits whose last can only be zero (precision 1 to 7).
inline char* WriteShort(char* out, int negative, const Decimal& decimal, int width, int precision) {
    const auto scaled =
        static_cast<std::uint32_t>(decimal.digits * kTens[static_cast<std::size_t>(8 - precision)]);
    const std::uint64_t values = EightDigits(scaled);
    const int count = 8 - std::countl_zero(values) / 8;
    const std::uint64_t digits = values | num_zeros;
    const int exponent = decimal.exponent;

    if (static_cast<unsigned>(exponent) < static_cast<unsigned>(precision)) [[likely]] {
        const int whole = exponent + 1;
        const int length = negative + 1 + (count > whole ? count : whole);
        const std::uint64_t mask = (std::uint64_t{1} << (8 * whole)) - 1;
        const std::uint64_t text =
            (digits & mask) | std::uint64_t{'.'} << (8 * whole) | (digits & ~mask) << 8;
        char* begin = Pad(out, width, length);
        *begin = '-';
        num_Store(begin + negative, text);
        return length > width ? begin + length : out + width;
    }
    if (exponent < 0 && exponent >= -4) {
        const int length = negative + 1 - exponent + count;
        char* begin = Pad(out, width, length);
        *begin = '-';
        num_Store(begin + negative, kZeroPoint);
        num_Store(begin + negative + 1 - exponent, digits);
        return begin + length;
    }
    const int length = negative + count + (count > 1) + 4 + (exponent > 99 || exponent < -99);
    char* begin = Pad(out, width, length);
    *begin = '-';
    char* text = begin + negative;
    num_Store(text + 1, digits >> 8 << 8 | '.');
    text[0] = static_cast<char>(digits);
    WriteExponent(text + count + (count > 1), exponent);
    return begin + length;
}

/// Lays out 8 to 16 digits.
inline char* WriteLong(char* out, bool negative, const Decimal& decimal, int width, int precision) {
    const std::uint64_t scaled = decimal.digits * kTens[static_cast<std::size_t>(16 - precision)];
    const std::uint64_t first = EightDigits(static_cast<std::uint32_t>(scaled / 100000000));
    const std::uint64_t second = EightDigits(static_cast<std::uint32_t>(scaled % 100000000));
    const int count = second != 0 ? 16 - std::countl_zero(second) / 8 : 8 - std::countl_zero(first) / 8;
    char digits[16];
    num_Store(digits, first | num_zeros);
    num_Store(digits + 8, second | num_zeros);

    char* text = out;
    *text = '-';
    text += negative;
    const int exponent = decimal.exponent;
    if (static_cast<unsigned>(exponent) < static_cast<unsigned>(precision)) {
        const int whole = exponent + 1;
        std::memcpy(text + 1, digits, 16);
        std::memmove(text, text + 1, static_cast<std::size_t>(whole));
        text[whole] = '.';
        text += 1 + (count > whole ? count : whole);
    } else if (exponent < 0 && exponent >= -4) {
        num_Store(text, kZeroPoint);
        text += 1 - exponent;
        std::memcpy(text, digits, 16);
        text += count;
    } else {
        std::memcpy(text + 1, digits, 16);
        text[0] = text[1];
        text[1] = '.';
        text += count > 1 ? count + 1 : 1;
        text = WriteExponent(text, exponent);
    }
    return Align(out, width, static_cast<int>(text - out));
}

char* WriteAnyInt(char* out, int value, int width) {
    char* end = std::to_chars(out, out + num_IntRoom(width), value).ptr;
    return Align(out, width, static_cast<int>(end - out));
}

} // namespace

char* num_WriteReal(char* out, double value, int width, int precision) {
    if (precision <= 0) precision = width > 0 ? 1 : 6;
    const auto pattern = std::bit_cast<std::uint64_t>(value);
    const int negative = static_cast<int>(pattern >> 63);
    const std::uint64_t magnitude = pattern << 1 >> 1;
    if (magnitude == 0) {
        char* begin = Pad(out, width, negative + 2);
        *begin = '-';
        begin[negative] = '0';
        begin[negative + 1] = '.';
        return begin + negative + 2;
    }
    Decimal decimal;
    if (magnitude >= 0x7ff0000000000000 || precision > kMostFastDigits ||
        !Round(magnitude, precision, decimal)) [[unlikely]] {
        return WriteAnyReal(out, value, width, precision);
    }
    if (precision <= 7) return WriteShort(out, negative, decimal, width, precision);
    return WriteLong(out, negative != 0, decimal, width, precision);
}

char* num_WriteFloat(char* out, float value) {
    constexpr int width = 12;
    constexpr int precision = 7;
    const auto pattern = std::bit_cast<std::uint32_t>(value);
    const std::uint32_t magnitude = pattern & 0x7fffffff;
    // From 2^-13 to below 2^23, where all that follows is exact.
    constexpr std::uint32_t least = (127 - 13) << 23;
    constexpr std::uint32_t greatest = (127 + 23) << 23;
    if (magnitude - least >= greatest - least) return num_WriteReal(out, value, width, precision);
    constexpr double tens[] = {1e0, 1e1, 1e2, 1e3, 1e4, 1e5, 1e6};
    const double size = std::bit_cast<float>(magnitude);
    const int b = static_cast<int>(magnitude >> 23) - 127;
    // The greatest power of ten that can be in it is tried.
    int exponent = DecimalExponentBelow(b + 1);
    exponent -= exponent >= 0 ? static_cast<int>(size < tens[exponent])
                              : static_cast<int>(size * tens[-exponent] < 1.0);
    const std::uint64_t significand = (magnitude & 0x7fffff) | 0x800000;
    const std::uint64_t product = significand * kTens[static_cast<std::size_t>(precision - 1 - exponent)];
    const int shift = 23 - b;
    const std::uint64_t below = (std::uint64_t{1} << (shift - 1)) - 1;
    std::uint64_t digits = (product + below + (product >> shift & 1)) >> shift;
    if (digits == kTens[precision]) [[unlikely]] {
        digits /= 10;
        ++exponent;
    }
    return WriteShort(out, static_cast<int>(pattern >> 31), {digits, exponent}, width, precision);
}

char* num_WriteInt(char* out, int value, int width) {
    if (static_cast<unsigned>(value) >= 100000000) [[unlikely]]
        return WriteAnyInt(out, value, width);
    const std::uint64_t values = EightDigits(static_cast<std::uint32_t>(value));
    // A lone zero still is one digit.
    const int leading = std::countr_zero(values | std::uint64_t{1} << 56) / 8;
    const std::uint64_t blanked =
        (values | num_zeros) ^ (((std::uint64_t{1} << (8 * leading)) - 1) & (num_zeros ^ num_blanks));
    const int length = 8 - leading;
    const int field = width > length ? width : length;
    if (field <= 8) [[likely]] {
        num_Store(out, blanked >> (8 * (8 - field)));
        return out + field;
    }
    std::memset(out, ' ', static_cast<std::size_t>(field - 8));
    num_Store(out + field - 8, blanked);
    return out + field;
}

void num_FixNumericString(char* text, int width) {
    if (text == nullptr) return;
    const char* begin = text;
    while (*begin == ' ') ++begin;
    std::size_t length = std::strlen(begin);
    std::memmove(text, begin, length);
    if (length > 0) {
        if (NeedsPoint(text, length)) text[length++] = '.';
        length = static_cast<std::size_t>(Align(text, width, static_cast<int>(length)) - text);
    }
    text[length] = '\0';
}
