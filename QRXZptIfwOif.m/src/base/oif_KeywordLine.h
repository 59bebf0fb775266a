#ifndef QRX_OIF_KEYWORDLINE_H
#define QRX_OIF_KEYWORDLINE_H

#include "foundation/omu_PrimEnum.h"
#include "keyword_layer/qkw_QuorixName.h"

#include <type_traits>

/// A keyword line while it is written. The line may break behind the comma ahead of a parameter, once it is
/// past its limit.
class oif_KeywordLine {
public:
    oif_KeywordLine(utl_Stream& stream, const char* keyword);

    /// The comma that a parameter stands behind.
    oif_KeywordLine& Separator();
    /// Text that brings its own comma, or none.
    oif_KeywordLine& Text(const char* text);
    oif_KeywordLine& Text(const cow_String& text);
    oif_KeywordLine& Text(const qkw_QuorixName& name);
    oif_KeywordLine& Text(int value);
    oif_KeywordLine& Text(double value);
    template <class E>
    requires std::is_enum_v<E> oif_KeywordLine& Text(E value) {
        return Text(omu_PrimEnum<E, 1>(value).GetString());
    }

    oif_KeywordLine& Word(const char* word) { return Separator().Text(word); }
    oif_KeywordLine& WordIf(bool condition, const char* word) { return condition ? Word(word) : *this; }
    /// A parameter with a number, a name, or the text of an enumeration's value.
    template <class V>
    oif_KeywordLine& Value(const char* name, const V& value) {
        return Word(name).Text(value);
    }
    template <class V>
    oif_KeywordLine& ValueUnless(const char* name, const V& value, const V& theDefault) {
        return value == theDefault ? *this : Value(name, value);
    }
    template <class V>
    oif_KeywordLine& ValueIf(bool condition, const char* name, const V& value) {
        return condition ? Value(name, value) : *this;
    }
    /// Only a positive number.
    oif_KeywordLine& Dependencies(int count) { return ValueIf(count > 0, "dependencies=", count); }
    void End() { stream_.LineBreak(); }

private:
    utl_Stream& stream_;
};

#endif
