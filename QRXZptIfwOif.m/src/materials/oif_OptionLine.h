#ifndef QRX_OIF_OPTIONLINE_H
#define QRX_OIF_OPTIONLINE_H

#include "foundation/omu_PrimEnum.h"
#include "foundation/utl_Stream.h"

#include <type_traits>

/// The keyword line of a material option while it is written. The line may break behind the comma ahead of a
/// parameter, once it is past its limit.
class oif_OptionLine {
public:
    oif_OptionLine(utl_Stream& stream, const char* keyword);

    /// The comma that a parameter stands behind.
    oif_OptionLine& Separator();
    /// Text that brings its own comma, or none.
    oif_OptionLine& Text(const char* text);
    oif_OptionLine& Text(const cow_String& text);
    oif_OptionLine& Word(const char* word);
    oif_OptionLine& WordIf(bool condition, const char* word);
    oif_OptionLine& Value(const char* name, int value);
    oif_OptionLine& Value(const char* name, double value);
    /// With the text of an enumeration's value.
    template <class E>
    requires std::is_enum_v<E> oif_OptionLine& Value(const char* name, E value) {
        return Word(name).Text(omu_PrimEnum<E, 1>(value).GetString());
    }
    template <class V>
    oif_OptionLine& ValueUnless(const char* name, V value, V theDefault) {
        return value == theDefault ? *this : Value(name, value);
    }
    /// Only a positive number.
    oif_OptionLine& Dependencies(int count);
    /// 1 is orthotropic, 2 anisotropic.
    oif_OptionLine& Direction(int type);
    template <class E>
    oif_OptionLine& Direction(E type) {
        return Direction(static_cast<int>(type));
    }
    oif_OptionLine& Moduli(bool longTerm);
    void End();

private:
    utl_Stream& stream_;
};

#endif
