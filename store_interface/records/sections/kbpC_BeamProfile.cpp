#include "store_interface/records/sections/kbpC_BeamProfile.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kbpC_GeneralizedProfile::Fields() {
    using R = kbpC_GeneralizedProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::area>("area", "area")
            .Unit("length^2")
            .Field<&R::i11>("i11", "moment of inertia about the 1-axis")
            .Unit("length^4")
            .Field<&R::i12>("i12", "product of inertia")
            .Unit("length^4")
            .Field<&R::i22>("i22", "moment of inertia about the 2-axis")
            .Unit("length^4")
            .Field<&R::j>("j", "torsional constant")
            .Unit("length^4")
            .Field<&R::gammaO>("gammaO", "sectorial moment; written with gammaW unless both are 0.0")
            .Unit("length^4")
            .Field<&R::gammaW>("gammaW", "warping constant")
            .Unit("length^6")
            .Example(R"({"area": 100, "i11": 833, "i22": 833, "j": 1400})");
    return fields;
}

const cls_FieldTable& kbpC_CircularProfile::Fields() {
    using R = kbpC_CircularProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::r>("r", "radius")
                                             .Unit("length")
                                             .Example(R"({"r": 10})");
    return fields;
}

const cls_FieldTable& kbpC_HexagonalProfile::Fields() {
    using R = kbpC_HexagonalProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::r>("r", "circumscribing radius")
                                             .Unit("length")
                                             .Field<&R::t>("t", "wall thickness")
                                             .Unit("length")
                                             .Example(R"({"r": 10, "t": 1})");
    return fields;
}

const cls_FieldTable& kbpC_PipeProfile::Fields() {
    using R = kbpC_PipeProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::r>("r", "outside radius")
            .Unit("length")
            .Field<&R::t>("t", "wall thickness")
            .Unit("length")
            .Field<&R::formulation>("formulation", "whether the wall counts as thin or thick; not written")
            .Example(R"({"r": 10, "t": 1})");
    return fields;
}

const cls_FieldTable& kbpC_IbeamProfile::Fields() {
    using R = kbpC_IbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::l>("l", "distance of the local origin from the bottom edge")
            .Unit("length")
            .Field<&R::h>("h", "height")
            .Unit("length")
            .Field<&R::b1>("b1", "width of the bottom flange")
            .Unit("length")
            .Field<&R::b2>("b2", "width of the top flange")
            .Unit("length")
            .Field<&R::t1>("t1", "thickness of the bottom flange")
            .Unit("length")
            .Field<&R::t2>("t2", "thickness of the top flange")
            .Unit("length")
            .Field<&R::t3>("t3", "thickness of the web")
            .Unit("length")
            .Example(R"({"l": 50, "h": 100, "b1": 55, "b2": 55, "t1": 5.7, "t2": 5.7, "t3": 4.1})");
    return fields;
}

const cls_FieldTable& kbpC_BoxProfile::Fields() {
    using R = kbpC_BoxProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "width along the 1-axis")
            .Unit("length")
            .Field<&R::b>("b", "height along the 2-axis")
            .Unit("length")
            .Field<&R::uniformThickness>("uniformThickness", "true: t1 is written four times")
            .Field<&R::t1>("t1", "first thickness")
            .Unit("length")
            .Field<&R::t2>("t2", "second thickness, not read with uniformThickness")
            .Unit("length")
            .Field<&R::t3>("t3", "third thickness, not read with uniformThickness")
            .Unit("length")
            .Field<&R::t4>("t4", "fourth thickness, not read with uniformThickness")
            .Unit("length")
            .Example(R"({"a": 40, "b": 60, "uniformThickness": true, "t1": 3})");
    return fields;
}

const cls_FieldTable& kbpC_ArbitraryProfile::Fields() {
    using R = kbpC_ArbitraryProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::table>("table",
                              "rows (x, y, t), lengths: a corner and the thickness of the segment that ends "
                              "in it; t of the first row isn't written; at least two rows")
            .Example(R"({"table": [[0, 0, 0], [40, 0, 2], [40, 30, 2]]})");
    return fields;
}

const cls_FieldTable& kbpC_RectangularProfile::Fields() {
    using R = kbpC_RectangularProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::a>("a", "extent along the 1-axis")
                                             .Unit("length")
                                             .Field<&R::b>("b", "extent along the 2-axis")
                                             .Unit("length")
                                             .Example(R"({"a": 10, "b": 20})");
    return fields;
}

const cls_FieldTable& kbpC_LbeamProfile::Fields() {
    using R = kbpC_LbeamProfile;
    static const cls_FieldTable fields = cls_Describe<R>(kbpC_BeamProfile::Fields())
                                             .Field<&R::a>("a", "length of the leg along the 1-axis")
                                             .Unit("length")
                                             .Field<&R::b>("b", "length of the leg along the 2-axis")
                                             .Unit("length")
                                             .Field<&R::t1>("t1", "thickness of the first leg")
                                             .Unit("length")
                                             .Field<&R::t2>("t2", "thickness of the second leg")
                                             .Unit("length")
                                             .Example(R"({"a": 50, "b": 50, "t1": 5, "t2": 5})");
    return fields;
}

const cls_FieldTable& kbpC_TbeamProfile::Fields() {
    using R = kbpC_TbeamProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::b>("b", "width of the flange")
            .Unit("length")
            .Field<&R::h>("h", "height")
            .Unit("length")
            .Field<&R::l>("l", "distance of the local origin from the bottom edge")
            .Unit("length")
            .Field<&R::tf>("tf", "thickness of the flange")
            .Unit("length")
            .Field<&R::tw>("tw", "thickness of the web")
            .Unit("length")
            .Example(R"({"b": 50, "h": 50, "l": 25, "tf": 5, "tw": 5})");
    return fields;
}

const cls_FieldTable& kbpC_TrapezoidalProfile::Fields() {
    using R = kbpC_TrapezoidalProfile;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbpC_BeamProfile::Fields())
            .Field<&R::a>("a", "bottom width")
            .Unit("length")
            .Field<&R::b>("b", "height")
            .Unit("length")
            .Field<&R::c>("c", "top width")
            .Unit("length")
            .Field<&R::d>("d", "distance of the local origin from the bottom edge")
            .Unit("length")
            .Example(R"({"a": 20, "b": 10, "c": 12, "d": 5})");
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
