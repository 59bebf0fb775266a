#ifndef QRX_OIF_OPTIONLINE_H
#define QRX_OIF_OPTIONLINE_H

#include "foundation/omu_PrimEnum.h"
#include "foundation/utl_Stream.h"

#include <type_traits>

/// The keyword line of a material option while it is written. The line may break behind the comma ahead of a
/// parameter, once it is past its limit.
class oif_OptionLine {
public:
    oif_OptionLine(utl_Stream& stream, const char* keyword) : stream_(stream) { stream_ << keyword; }

    /// The comma that a parameter stands behind.
    oif_OptionLine& Separator() {
        stream_ << ", ";
        stream_.OptionalLineBreak();
        return *this;
    }
    oif_OptionLine& Word(const char* word) {
        Separator();
        stream_ << word;
        return *this;
    }
    template <class E>
    oif_OptionLine& EnumText(E value) {
        stream_ << omu_PrimEnum<E, 1>(value).GetString();
        return *this;
    }
    /// Text that brings its own comma, or none.
    oif_OptionLine& Text(const char* text) {
        stream_ << text;
        return *this;
    }
    oif_OptionLine& WordIf(bool condition, const char* word) { return condition ? Word(word) : *this; }
    /// A parameter with a number, or with the text of an enumeration's value.
    template <class V>
    oif_OptionLine& Value(const char* name, V value) {
        Word(name);
        if constexpr (std::is_enum_v<V>) {
            EnumText(value);
        } else {
            stream_ << value;
        }
        return *this;
    }
    template <class V>
    oif_OptionLine& ValueUnless(const char* name, V value, V theDefault) {
        return value == theDefault ? *this : Value(name, value);
    }
    oif_OptionLine& Dependencies(int count) { return count > 0 ? Value("dependencies=", count) : *this; }
    /// 1 is orthotropic, 2 anisotropic.
    template <class E>
    oif_OptionLine& Direction(E type) {
        return WordIf(static_cast<int>(type) == 1, "type=ORTHO")
            .WordIf(static_cast<int>(type) == 2, "type=ANISO");
    }
    oif_OptionLine& Moduli(bool longTerm) {
        return Word(longTerm ? "moduli=LONG TERM" : "moduli=INSTANTANEOUS");
    }
    void End() { stream_.LineBreak(); }

private:
    utl_Stream& stream_;
};

#endif
