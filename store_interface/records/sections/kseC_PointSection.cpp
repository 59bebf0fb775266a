#include "store_interface/records/sections/kseC_PointSection.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

template <class R>
void DescribeInertia(cls_Describe<R>& fields) {
    fields.template Field<&R::mass>("mass", "the mass; at 0.0 no '*Mass' is written")
        .Unit("mass")
        .template Field<&R::i11>("i11", "rotary inertia")
        .Unit("mass*length^2")
        .template Field<&R::i12>("i12", "product of inertia")
        .Unit("mass*length^2")
        .template Field<&R::i13>("i13", "product of inertia")
        .Unit("mass*length^2")
        .template Field<&R::i22>("i22", "rotary inertia")
        .Unit("mass*length^2")
        .template Field<&R::i23>("i23", "product of inertia")
        .Unit("mass*length^2")
        .template Field<&R::i33>("i33", "rotary inertia")
        .Unit("mass*length^2")
        .template Field<&R::massAlphaDamping>("massAlphaDamping", "mass-proportional damping of the mass")
        .Unit("1/time")
        .template Field<&R::massCompositeDamping>("massCompositeDamping",
                                                  "fraction of critical damping of the mass")
        .Unit("no unit")
        .template Field<&R::rotaryAlphaDamping>("rotaryAlphaDamping",
                                                "mass-proportional damping of the rotary inertia")
        .Unit("1/time")
        .template Field<&R::rotaryCompositeDamping>("rotaryCompositeDamping",
                                                    "fraction of critical damping of the rotary inertia")
        .Unit("no unit");
}

} // namespace

const cls_FieldTable& kseC_PointSection::Fields() {
    static const cls_FieldTable fields = cls_Describe<kseC_PointSection>(kseC_Section::Fields())
                                             .With(DescribeInertia<kseC_PointSection>)
                                             .Example(R"({"mass": 0.001})");
    return fields;
}

const cls_FieldTable& kefC_PointMassInertia::Fields() {
    static const cls_FieldTable fields = cls_Describe<kefC_PointMassInertia>(cls_Record::Fields())
                                             .With(DescribeInertia<kefC_PointMassInertia>)
                                             .Example(R"({"mass": 0.001})");
    return fields;
}

void cls_RegisterPointSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_PointSection>();
    registrar.Add<kefC_PointMassInertia>();
}
