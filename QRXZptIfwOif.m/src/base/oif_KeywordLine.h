#ifndef QRX_OIF_KEYWORDLINE_H
#define QRX_OIF_KEYWORDLINE_H

#include "base/oif_Op.h"
#include "foundation/omu_PrimEnum.h"
#include "keyword_layer/qkw_QuorixName.h"

#include <type_traits>

/// A keyword line while it is written:
///     *Keyword, op=NEW, amplitude=NAME, load case=1,
///     fixed
/// A Breaking... parameter goes without its comma: the line may end behind the comma that is put ahead of it,
/// once it is past its limit. A Fixed... one brings its comma, and the line never ends there. ...If has a
/// condition, ...Unless leaves out what is the default, ...Name quotes a name and leaves out an empty one.
/// Values are numbers, texts, names, and enumerations with texts.
class oif_KeywordLine {
public:
    oif_KeywordLine(utl_Stream& stream, const char* keyword) : stream_(stream) { stream_ << keyword; }

    oif_KeywordLine& Breaking(const char* parameter) { return Separator().Text(parameter); }
    template <class V>
    oif_KeywordLine& Breaking(const char* parameter, const V& value) {
        return Breaking(parameter).Text(value);
    }
    oif_KeywordLine& BreakingIf(bool condition, const char* parameter) {
        return condition ? Breaking(parameter) : *this;
    }
    template <class V>
    oif_KeywordLine& BreakingIf(bool condition, const char* parameter, const V& value) {
        return condition ? Breaking(parameter, value) : *this;
    }
    template <class V>
    oif_KeywordLine& BreakingUnless(const char* parameter, const V& value, const V& theDefault) {
        return BreakingIf(!(value == theDefault), parameter, value);
    }
    oif_KeywordLine& BreakingName(const char* parameter, const cow_String& name) {
        return name.IsEmpty() ? *this : Breaking(parameter, qkw_QuorixName(name, false));
    }

    oif_KeywordLine& Fixed(const char* parameter) { return Text(parameter); }
    template <class V>
    oif_KeywordLine& Fixed(const char* parameter, const V& value) {
        return Fixed(parameter).Text(value);
    }
    oif_KeywordLine& FixedIf(bool condition, const char* parameter) {
        return condition ? Fixed(parameter) : *this;
    }
    template <class V>
    oif_KeywordLine& FixedIf(bool condition, const char* parameter, const V& value) {
        return condition ? Fixed(parameter, value) : *this;
    }
    template <class V>
    oif_KeywordLine& FixedUnless(const char* parameter, const V& value, const V& theDefault) {
        return FixedIf(!(value == theDefault), parameter, value);
    }
    oif_KeywordLine& FixedName(const char* parameter, const cow_String& name) {
        return name.IsEmpty() ? *this : Fixed(parameter, qkw_QuorixName(name, false));
    }

    oif_KeywordLine& Op(oif_Op op) { return FixedIf(op == oif_Op::NEW, ", op=NEW"); }
    oif_KeywordLine& Amplitude(const cow_String& name) { return FixedName(", amplitude=", name); }
    /// Only a positive number.
    oif_KeywordLine& Dependencies(int count) { return BreakingIf(count > 0, "dependencies=", count); }

    /// The line may end here, ahead of the comma of what follows, or where nothing does.
    oif_KeywordLine& MayBreak() {
        stream_.OptionalLineBreak();
        return *this;
    }
    /// The comma ahead of a breaking parameter.
    oif_KeywordLine& Separator() {
        stream_ << ", ";
        return MayBreak();
    }
    /// More of the parameter that was begun.
    template <class V>
    oif_KeywordLine& Text(const V& value) {
        if constexpr (std::is_enum_v<V>) {
            stream_ << omu_PrimEnum<V, 1>(value).GetString();
        } else {
            stream_ << value;
        }
        return *this;
    }
    void End() { stream_.LineBreak(); }

private:
    utl_Stream& stream_;
};

#endif
