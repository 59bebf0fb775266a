#include "store_interface/records/sections/kbpC_BeamProfile.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kbpC_GeneralizedProfile::Fields() {
    using R = kbpC_GeneralizedProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::area>("area", "area (length squared)")
            .Field<&R::i11>("i11", "moment of inertia about the 1-axis (length to the 4th)")
            .Field<&R::i12>("i12", "product of inertia (length to the 4th)")
            .Field<&R::i22>("i22", "moment of inertia about the 2-axis (length to the 4th)")
            .Field<&R::j>("j", "torsional constant (length to the 4th)")
            .Field<&R::gammaO>("gammaO", "sectorial moment; written with gammaW unless both are 0.0")
            .Field<&R::gammaW>("gammaW", "warping constant");
    return fields;
}

const cls_FieldTable& kbpC_CircularProfile::Fields() {
    using R = kbpC_CircularProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields()).Field<&R::r>("r", "radius (length)");
    return fields;
}

const cls_FieldTable& kbpC_HexagonalProfile::Fields() {
    using R = kbpC_HexagonalProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::r>("r", "circumscribing radius (length)")
                                             .Field<&R::t>("t", "wall thickness (length)");
    return fields;
}

const cls_FieldTable& kbpC_PipeProfile::Fields() {
    using R = kbpC_PipeProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::r>("r", "outside radius (length)")
            .Field<&R::t>("t", "wall thickness (length)")
            .Field<&R::formulation>("formulation",
                                    "whether the wall counts as thin (0) or thick (1); not written");
    return fields;
}

const cls_FieldTable& kbpC_IbeamProfile::Fields() {
    using R = kbpC_IbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::l>("l", "distance of the local origin from the bottom edge (length)")
            .Field<&R::h>("h", "height (length)")
            .Field<&R::b1>("b1", "width of the bottom flange (length)")
            .Field<&R::b2>("b2", "width of the top flange (length)")
            .Field<&R::t1>("t1", "thickness of the bottom flange (length)")
            .Field<&R::t2>("t2", "thickness of the top flange (length)")
            .Field<&R::t3>("t3", "thickness of the web (length)");
    return fields;
}

const cls_FieldTable& kbpC_BoxProfile::Fields() {
    using R = kbpC_BoxProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "width along the 1-axis (length)")
            .Field<&R::b>("b", "height along the 2-axis (length)")
            .Field<&R::uniformThickness>("uniformThickness", "true: t1 is written four times")
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
                                             .Field<&R::a>("a", "length along the 1-axis")
                                             .Field<&R::b>("b", "length along the 2-axis");
    return fields;
}

const cls_FieldTable& kbpC_LbeamProfile::Fields() {
    using R = kbpC_LbeamProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::a>("a", "length of the leg along the 1-axis")
                                             .Field<&R::b>("b", "length of the leg along the 2-axis")
                                             .Field<&R::t1>("t1", "thickness of the first leg (length)")
                                             .Field<&R::t2>("t2", "thickness of the second leg (length)");
    return fields;
}

const cls_FieldTable& kbpC_TbeamProfile::Fields() {
    using R = kbpC_TbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::b>("b", "width of the flange (length)")
            .Field<&R::h>("h", "height (length)")
            .Field<&R::l>("l", "distance of the local origin from the bottom edge (length)")
            .Field<&R::tf>("tf", "thickness of the flange (length)")
            .Field<&R::tw>("tw", "thickness of the web (length)");
    return fields;
}

const cls_FieldTable& kbpC_TrapezoidalProfile::Fields() {
    using R = kbpC_TrapezoidalProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "bottom width (length)")
            .Field<&R::b>("b", "height (length)")
            .Field<&R::c>("c", "top width (length)")
            .Field<&R::d>("d", "distance of the local origin from the bottom edge (length)");
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
