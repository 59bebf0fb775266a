#ifndef QRX_FOUNDATION_COW_STRING_H
#define QRX_FOUNDATION_COW_STRING_H

#include "foundation/atr_String.h"

#include <compare>
#include <string>

/// A byte string that its copies share until one of them is written.
/// The text may hold any bytes; CStr() is always ended by a zero byte. Order and equality are those of the
/// bytes, read as unsigned.
class cow_String : public atr_StringBase {
public:
    cow_String() = default;
    cow_String(const char* text) : atr_StringBase(text == nullptr ? std::string_view() : text) {}
    cow_String(std::string_view text) : atr_StringBase(text) {}
    cow_String(const std::string& text) : atr_StringBase(std::string_view(text)) {}
    /// Decimal digits.
    explicit cow_String(int value);
    /// Six significant digits in C's %g form, without the deck's normal form: 210000, 0.3, 1e-05.
    explicit cow_String(double value);
    explicit cow_String(float value) : cow_String(static_cast<double>(value)) {}

    cow_String& Append(const char* text) { return AppendView(text == nullptr ? std::string_view() : text); }
    cow_String& Append(const cow_String& text) { return AppendView(text.View()); }
    /// Appends `length` characters of `text` from position `offset`; what lies outside the text is left out.
    cow_String& Append(const cow_String& text, int offset, int length);
    cow_String& operator+=(const char* text) { return Append(text); }
    cow_String& operator+=(const cow_String& text) { return Append(text); }

    /// Position of the first occurrence of `text` at or after `from`, or -1.
    int Find(const char* text, int from = 0) const;

    friend bool operator==(const cow_String& a, const cow_String& b) {
        return a.CStr() == b.CStr() || a.View() == b.View();
    }
    friend bool operator==(const cow_String& a, const char* b) { return a.View() == std::string_view(b); }
    friend std::strong_ordering operator<=>(const cow_String& a, const cow_String& b) {
        return a.View().compare(b.View()) <=> 0;
    }

private:
    cow_String& AppendView(std::string_view text);
};

cow_String operator+(const cow_String& a, const cow_String& b);

#endif
