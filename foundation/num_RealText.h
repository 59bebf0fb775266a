#ifndef QRX_FOUNDATION_NUM_REALTEXT_H
#define QRX_FOUNDATION_NUM_REALTEXT_H

#include <algorithm>
#include <cstddef>

/// The text of numbers in a deck. Nothing here looks at the locale or allocates.

/// Bytes that must stand free behind `out` for num_WriteReal. The text itself is often shorter; what lies
/// behind its end within this room may be overwritten too.
constexpr std::size_t num_RealRoom(int width, int precision) {
    return static_cast<std::size_t>(std::max({width, precision, 16})) + 32;
}

/// The same for num_WriteInt.
constexpr std::size_t num_IntRoom(int width) {
    return static_cast<std::size_t>(std::max(width, 16)) + 16;
}

/// Writes `value` as C's "%*.*lg" does in the "C" locale, in the deck's normal form: a text that would read
/// as an integer gets a point behind it (10 is "10."), and the whole is right-aligned in `width`; a longer
/// text is not cut. Correctly rounded, ties to even. A width of 0 means no field. A precision of 0 is one
/// significant digit with a field and six digits without ("%*.lg" and "%lg"); negative values count as 0.
/// Returns the end of the text, which has no zero byte behind it.
/// The caller provides num_RealRoom(width, precision) bytes.
char* num_WriteReal(char* out, double value, int width, int precision);
inline char* num_WriteReal(char* out, float value, int width, int precision) {
    return num_WriteReal(out, static_cast<double>(value), width, precision);
}

/// The same as num_WriteReal(out, value, 12, 7): coordinates, quickly.
char* num_WriteFloat(char* out, float value);

/// Writes the decimal digits right-aligned in `width` blanks; a longer number is not cut. Returns the end.
/// The caller provides num_IntRoom(width) bytes.
char* num_WriteInt(char* out, int value, int width);

/// Brings a printed real into the deck's normal form, in place: leading blanks go, a text with none of
/// . e E n i (nor N, I) gets a point, and the result is right-aligned in `width` again. A text as wide as the
/// field grows by the point. An empty or blank text becomes empty, a null one is left alone.
/// The memory must hold max(width, length + 1) characters and the zero byte.
void num_FixNumericString(char* text, int width);

#endif
