#ifndef QRX_STORE_KSEC_POINTSECTION_H
#define QRX_STORE_KSEC_POINTSECTION_H

#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

class kseC_PointSection final : public cls_RecordOf<kseC_PointSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_PointSection", "Point mass and rotary inertia elements."};

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

    static const cls_FieldTable& Fields();
};

class kefC_PointMassInertia final : public cls_RecordOf<kefC_PointMassInertia> {
public:
    static constexpr cls_ClassInfo Class{
        "kefC_PointMassInertia", "Engineering-feature point inertia: the same values as kseC_PointSection. "
                                 "No container of the model view holds it and no builder makes its keywords; "
                                 "it exists for the constructors of oif_Mass and oif_RotaryI."};

    double mass = 0.0;
    double i11 = 0.0;
    double i12 = 0.0;
    double i13 = 0.0;
    double i22 = 0.0;
    double i23 = 0.0;
    double i33 = 0.0;
    double massAlphaDamping = 0.0;
    double massCompositeDamping = 0.0;
    double rotaryAlphaDamping = 0.0;
    double rotaryCompositeDamping = 0.0;

    static const cls_FieldTable& Fields();
};

void cls_RegisterPointSectionRecords(cls_ClassRegistrar& registrar);

#endif
