#ifndef QRX_STORE_KSEC_POINTSECTION_H
#define QRX_STORE_KSEC_POINTSECTION_H

#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

/// Mass and rotary inertia at a point.
class kseC_PointInertia {
public:
    static constexpr double i11Def() { return 0.0; }
    static constexpr double i12Def() { return 0.0; }
    static constexpr double i13Def() { return 0.0; }
    static constexpr double i22Def() { return 0.0; }
    static constexpr double i23Def() { return 0.0; }
    static constexpr double i33Def() { return 0.0; }
    static constexpr double massAlphaDampingDef() { return 0.0; }
    static constexpr double massCompositeDampingDef() { return 0.0; }
    static constexpr double rotaryAlphaDampingDef() { return 0.0; }
    static constexpr double rotaryCompositeDampingDef() { return 0.0; }

    double mass = 0.0;
    double i11 = i11Def();
    double i12 = i12Def();
    double i13 = i13Def();
    double i22 = i22Def();
    double i23 = i23Def();
    double i33 = i33Def();
    double massAlphaDamping = massAlphaDampingDef();
    double massCompositeDamping = massCompositeDampingDef();
    double rotaryAlphaDamping = rotaryAlphaDampingDef();
    double rotaryCompositeDamping = rotaryCompositeDampingDef();
};

class kseC_PointSection final : public cls_RecordOf<kseC_PointSection, kseC_Section>,
                                public kseC_PointInertia {
public:
    static constexpr cls_ClassInfo Class{"kseC_PointSection", "point mass and rotary inertia elements"};

    static const cls_FieldTable& Fields();
};

/// An inertia of the model itself; for programs, as no model holds one.
class kefC_PointMassInertia final : public cls_RecordOf<kefC_PointMassInertia>, public kseC_PointInertia {
public:
    static constexpr cls_ClassInfo Class{"kefC_PointMassInertia", "point mass and rotary inertia at a place"};

    static const cls_FieldTable& Fields();
};

void cls_RegisterPointSectionRecords(cls_ClassRegistrar& registrar);

#endif
