#ifndef QRX_OIF_KEYWORDLINE_H
#define QRX_OIF_KEYWORDLINE_H

#include "foundation/omu_PrimEnum.h"
#include "foundation/utl_Stream.h"

#include <type_traits>

/// A keyword line while it is written. The line may break behind the comma ahead of a parameter, once it is
/// past its limit. `Line` is the class that derives from this one.
template <class Line>
class oif_KeywordLineOf {
public:
    oif_KeywordLineOf(utl_Stream& stream, const char* keyword) : stream_(stream) { stream_ << keyword; }

    /// The comma that a parameter stands behind.
    Line& Separator() {
        stream_ << ", ";
        stream_.OptionalLineBreak();
        return Self();
    }
    Line& Word(const char* word) {
        Separator();
        stream_ << word;
        return Self();
    }
    template <class E>
    Line& EnumText(E value) {
        stream_ << omu_PrimEnum<E, 1>(value).GetString();
        return Self();
    }
    /// Text, a number or a name that brings its own comma, or none.
    template <class V>
    Line& Text(const V& text) {
        stream_ << text;
        return Self();
    }
    Line& WordIf(bool condition, const char* word) { return condition ? Word(word) : Self(); }
    /// A parameter with a number, a name, or the text of an enumeration's value.
    template <class V>
    Line& Value(const char* name, const V& value) {
        Word(name);
        if constexpr (std::is_enum_v<V>) {
            EnumText(value);
        } else {
            stream_ << value;
        }
        return Self();
    }
    template <class V>
    Line& ValueUnless(const char* name, const V& value, const V& theDefault) {
        return value == theDefault ? Self() : Value(name, value);
    }
    template <class V>
    Line& ValueIf(bool condition, const char* name, const V& value) {
        return condition ? Value(name, value) : Self();
    }
    Line& Dependencies(int count) { return ValueIf(count > 0, "dependencies=", count); }
    void End() { stream_.LineBreak(); }

private:
    Line& Self() { return static_cast<Line&>(*this); }

    utl_Stream& stream_;
};

class oif_KeywordLine final : public oif_KeywordLineOf<oif_KeywordLine> {
public:
    using oif_KeywordLineOf::oif_KeywordLineOf;
};

#endif
