#include "store_interface/records/sections/kseC_PointSection.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_PointSection::Fields() {
    using R = kseC_PointSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::mass>("mass", "mass; 0.0: no '*Mass'.")
            .Field<&R::i11>("i11", "rotary inertia (mass times length squared)")
            .Field<&R::i12>("i12", "product of inertia")
            .Field<&R::i13>("i13", "product of inertia")
            .Field<&R::i22>("i22", "rotary inertia")
            .Field<&R::i23>("i23", "product of inertia")
            .Field<&R::i33>("i33", "rotary inertia")
            .Field<&R::massAlphaDamping>("massAlphaDamping", "mass-proportional damping (1/time) of the mass")
            .Field<&R::massCompositeDamping>("massCompositeDamping",
                                             "fraction of critical damping of the mass")
            .Field<&R::rotaryAlphaDamping>("rotaryAlphaDamping",
                                           "mass-proportional damping (1/time) of the rotary inertia")
            .Field<&R::rotaryCompositeDamping>("rotaryCompositeDamping",
                                               "fraction of critical damping of the rotary inertia");
    return fields;
}

const cls_FieldTable& kefC_PointMassInertia::Fields() {
    using R = kefC_PointMassInertia;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::mass>("mass", "mass; 0.0: no '*Mass'.")
            .Field<&R::i11>("i11", "rotary inertia (mass times length squared)")
            .Field<&R::i12>("i12", "product of inertia")
            .Field<&R::i13>("i13", "product of inertia")
            .Field<&R::i22>("i22", "rotary inertia")
            .Field<&R::i23>("i23", "product of inertia")
            .Field<&R::i33>("i33", "rotary inertia")
            .Field<&R::massAlphaDamping>("massAlphaDamping", "mass-proportional damping (1/time) of the mass")
            .Field<&R::massCompositeDamping>("massCompositeDamping",
                                             "fraction of critical damping of the mass")
            .Field<&R::rotaryAlphaDamping>("rotaryAlphaDamping",
                                           "mass-proportional damping (1/time) of the rotary inertia")
            .Field<&R::rotaryCompositeDamping>("rotaryCompositeDamping",
                                               "fraction of critical damping of the rotary inertia");
    return fields;
}

void cls_RegisterPointSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_PointSection>();
    registrar.Add<kefC_PointMassInertia>();
}
