#ifndef QRX_OIF_POINTINERTIA_H
#define QRX_OIF_POINTINERTIA_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/sections/kseC_PointSection.h"

/// Point masses of a set, whose name is given in the form that the deck has it in; empty without mass:
///     *Mass, elset=SET, alpha=0.1
///     5.,
class oif_Mass final : public qkw_KeywordOf<oif_Mass> {
public:
    /// Of a kseC_PointSection or a kefC_PointMassInertia.
    oif_Mass(const cow_String& setName, const kseC_PointInertia& inertia)
        : setName_(setName), mass_(inertia.mass), alpha_(inertia.massAlphaDamping),
          composite_(inertia.massCompositeDamping) {}
    bool IsEmpty() const override { return mass_ == 0.0; }
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
    double mass_;
    double alpha_;
    double composite_;
};

/// Rotary inertias of a set; i11, i22, i33, i12, i13, i23 on the line. Empty when all are zero.
///     *RotaryI, elset=SET, orientation=Ori-1
///     1., 2., 3., 0., 0., 0.
class oif_RotaryI final : public qkw_KeywordOf<oif_RotaryI> {
public:
    /// Of a kseC_PointSection or a kefC_PointMassInertia.
    oif_RotaryI(const cow_String& setName, const kseC_PointInertia& inertia,
                const cow_String& orientationName)
        : setName_(setName), inertia_(inertia), orientationName_(orientationName) {}
    bool IsEmpty() const override;
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
    kseC_PointInertia inertia_;
    cow_String orientationName_;
};

#endif
