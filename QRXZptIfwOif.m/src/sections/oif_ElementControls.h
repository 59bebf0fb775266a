#ifndef QRX_OIF_ELEMENTCONTROLS_H
#define QRX_OIF_ELEMENTCONTROLS_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"

/// Hourglass stiffness of the section above; nothing when all three values are zero:
///     *Hourglass Stiffness
///     0.005, , 0., 0.
class oif_HourglassStiffness final : public qkw_KeywordOf<oif_HourglassStiffness> {
public:
    explicit oif_HourglassStiffness(const bme_ElemCtrlParams& params) : params_(params) {}
    void Write(utl_Stream& stream) const override;

private:
    bme_ElemCtrlParams params_;
};

/// Element controls that sections refer to by name:
///     *Section Controls, name=EC-1, hourglass=STIFFNESS
///     1., 1., 1.
/// Empty when they are the defaults of the implicit or the explicit solver's elements.
class oif_SectionControls final : public qkw_KeywordOf<oif_SectionControls> {
public:
    oif_SectionControls(const bme_ElemCtrlParams& params, const cow_String& name, bool isStandard)
        : params_(params), name_(name), isStandard_(isStandard) {}
    bool IsEmpty() const override;
    void Write(utl_Stream& stream) const override;

private:
    bme_ElemCtrlParams params_;
    cow_String name_;
    bool isStandard_;
};

#endif
