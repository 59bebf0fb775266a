#ifndef QRX_OIF_PARTBUILDER_H
#define QRX_OIF_PARTBUILDER_H

#include "base/oif_Component.h"

/// The opening line of a part:
///     *Part, name=NAME
class oif_Part final : public qkw_KeywordOf<oif_Part> {
public:
    explicit oif_Part(const cow_String& name) : name_(name) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
};

/// Opens the block of each part that an instance uses; a part without instances gets none.
class oif_PartBuilder final : public oif_ComponentOf<oif_PartBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    cow_List<cow_String> partsWritten_;
};

#endif
