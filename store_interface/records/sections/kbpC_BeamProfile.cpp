#include "store_interface/records/sections/kbpC_BeamProfile.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kbpC_GeneralizedProfile::Fields() {
    using R = kbpC_GeneralizedProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::area>("area", "first of the seven doubles: area (length squared)")
            .Field<&R::i11>("i11", "second: moment of inertia about the 1-axis (length to the 4th)")
            .Field<&R::i12>("i12", "third: product of inertia (length to the 4th)")
            .Field<&R::i22>("i22", "fourth: moment of inertia about the 2-axis (length to the 4th)")
            .Field<&R::j>("j", "fifth: torsional constant (length to the 4th)")
            .Field<&R::gammaO>("gammaO",
                               "sixth: sectorial moment; written with gammaW if one of the two isn't 0.0")
            .Field<&R::gammaW>("gammaW", "seventh: warping constant");
    return fields;
}

const cls_FieldTable& kbpC_CircularProfile::Fields() {
    using R = kbpC_CircularProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::r>("r", "radius (length; called radius in the rule)");
    return fields;
}

const cls_FieldTable& kbpC_HexagonalProfile::Fields() {
    using R = kbpC_HexagonalProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::r>("r", "first: circumscribing radius (length)")
                                             .Field<&R::t>("t", "second: wall thickness (length)");
    return fields;
}

const cls_FieldTable& kbpC_PipeProfile::Fields() {
    using R = kbpC_PipeProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::r>("r", "first: outside radius (length)")
            .Field<&R::t>("t", "second: wall thickness (length)")
            .Field<&R::formulation>("formulation",
                                    "the int that isn't read (wall treated as thin 0 or thick 1)");
    return fields;
}

const cls_FieldTable& kbpC_IbeamProfile::Fields() {
    using R = kbpC_IbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::l>("l", "first: distance of the local origin from the bottom edge (length)")
            .Field<&R::h>("h", "second: height (length)")
            .Field<&R::b1>("b1", "third: width of the bottom flange (length)")
            .Field<&R::b2>("b2", "fourth: width of the top flange (length)")
            .Field<&R::t1>("t1", "fifth: thickness of the bottom flange (length)")
            .Field<&R::t2>("t2", "sixth: thickness of the top flange (length)")
            .Field<&R::t3>("t3", "seventh: thickness of the web (length)");
    return fields;
}

const cls_FieldTable& kbpC_BoxProfile::Fields() {
    using R = kbpC_BoxProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "first: width along the 1-axis (length)")
            .Field<&R::b>("b", "second: height along the 2-axis (length)")
            .Field<&R::uniformThickness>("uniformThickness", "true: t1 is written four times.")
            .Field<&R::t1>("t1", "first thickness (length)")
            .Field<&R::t2>("t2", "second thickness (length), not read with uniformThickness")
            .Field<&R::t3>("t3", "third thickness (length), not read with uniformThickness")
            .Field<&R::t4>("t4", "fourth thickness (length), not read with uniformThickness");
    return fields;
}

const cls_FieldTable& kbpC_ArbitraryProfile::Fields() {
    using R = kbpC_ArbitraryProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::table>("table",
                              "rows (x, y, t), lengths: a corner and the thickness of the segment that ends "
                              "in it; t of the first row isn't written; at least two rows");
    return fields;
}

const cls_FieldTable& kbpC_RectangularProfile::Fields() {
    using R = kbpC_RectangularProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::a>("a", "first: length along the 1-axis")
                                             .Field<&R::b>("b", "second: length along the 2-axis");
    return fields;
}

const cls_FieldTable& kbpC_LbeamProfile::Fields() {
    using R = kbpC_LbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "first: length of the leg along the 1-axis")
            .Field<&R::b>("b", "second: length of the leg along the 2-axis")
            .Field<&R::t1>("t1", "third: thickness of the first leg (length)")
            .Field<&R::t2>("t2", "fourth: thickness of the second leg (length)");
    return fields;
}

const cls_FieldTable& kbpC_TbeamProfile::Fields() {
    using R = kbpC_TbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::b>("b", "first: width of the flange (length)")
            .Field<&R::h>("h", "second: height (length)")
            .Field<&R::l>("l", "third: distance of the local origin from the bottom edge (length)")
            .Field<&R::tf>("tf", "fourth: thickness of the flange (length)")
            .Field<&R::tw>("tw", "fifth: thickness of the web (length)");
    return fields;
}

const cls_FieldTable& kbpC_TrapezoidalProfile::Fields() {
    using R = kbpC_TrapezoidalProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "first: bottom width (length)")
            .Field<&R::b>("b", "second: height (length)")
            .Field<&R::c>("c", "third: top width (length)")
            .Field<&R::d>("d", "fourth: distance of the local origin from the bottom edge (length)");
    return fields;
}

void cls_RegisterBeamProfileRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbpC_BeamProfile>();
    registrar.Add<kbpC_GeneralizedProfile>();
    registrar.Add<kbpC_CircularProfile>();
    registrar.Add<kbpC_HexagonalProfile>();
    registrar.Add<kbpC_PipeProfile>();
    registrar.Add<kbpC_IbeamProfile>();
    registrar.Add<kbpC_BoxProfile>();
    registrar.Add<kbpC_ArbitraryProfile>();
    registrar.Add<kbpC_RectangularProfile>();
    registrar.Add<kbpC_LbeamProfile>();
    registrar.Add<kbpC_TbeamProfile>();
    registrar.Add<kbpC_TrapezoidalProfile>();
}
