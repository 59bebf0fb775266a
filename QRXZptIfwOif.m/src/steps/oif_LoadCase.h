#ifndef QRX_OIF_LOADCASE_H
#define QRX_OIF_LOADCASE_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"

/// The head of a load case, `*Load Case, name=NAME`.
class oif_LoadCase final : public qkw_KeywordOf<oif_LoadCase> {
public:
    explicit oif_LoadCase(const cow_String& name) : name_(name) {}
    void Write(utl_Stream& stream) const override {
        oif_KeywordLine(stream, "*Load Case").Fixed(", name=", qkw_QuorixName(name_, false)).End();
    }

private:
    cow_String name_;
};

#endif
