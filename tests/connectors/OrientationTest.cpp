#include "connectors/ConnectorTesting.h"
#include "sections/oif_Orientation.h"

#include <numbers>

namespace {

using Csys = dtu_DatumCsysType;
using Axis = ptoC_MaterialOrientation::axisEnm;

const std::string kTwoPoints =
    "          1.,           2.,           3.,           1.,           2.,           4.\n";

std::string Rotated(double angle, Axis axis) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D");
    return Written(oif_Orientation(store.View(), datum, "O", true, angle, axis));
}

} // namespace

TEST(Transform, Rectangular_HasAxesAndNoParameter) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D", Csys::RECTANGULAR, {7, 8, 9});
    EXPECT_EQ(Written(oif_Transform(store.View(), datum, "S")), "*Transform, nset=S\n" + kUnitAxes);
}

TEST(Transform, CylindricalAndSpherical_HaveTwoPointsOfTheirAxis) {
    CsysStore store;
    const dtmC_DatumRef cylindrical = store.Add("C", Csys::CYLINDRICAL, {1, 2, 3});
    const dtmC_DatumRef spherical = store.Add("S", Csys::SPHERICAL, {1, 2, 3});
    EXPECT_EQ(Written(oif_Transform(store.View(), cylindrical, "a b")),
              "*Transform, nset=\"a b\", type=C\n" + kTwoPoints);
    EXPECT_EQ(Written(oif_Transform(store.View(), spherical, "S")),
              "*Transform, nset=S, type=S\n" + kTwoPoints);
}

TEST(Transform, WithoutASystem_WritesNothing) {
    CsysStore store;
    EXPECT_EQ(Written(oif_Transform(store.View(), dtmC_DatumRef(), "S")), "");
}

TEST(Transform, SystemOfAnUnknownType_LeavesItsHeadOnAnOpenLineOnPurpose) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D", static_cast<Csys>(4));
    EXPECT_EQ(Written(oif_Transform(store.View(), datum, "S")), "*Transform, nset=S");
    EXPECT_EQ(Written(oif_Orientation(store.View(), datum, "O", true, 1.0, Axis::AXIS_1)),
              "*Orientation, name=O");
}

TEST(Transform, LineOfMoreThanItsLimit_BreaksAheadOfTheType) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D", Csys::CYLINDRICAL, {1, 2, 3});
    // 17 characters are ahead of the name, comma and blank behind it.
    const std::string fits(112, 'n');
    EXPECT_EQ(Written(oif_Transform(store.View(), datum, fits)),
              "*Transform, nset=" + fits + ", type=C\n" + kTwoPoints);
    const std::string tooLong(113, 'n');
    EXPECT_EQ(Written(oif_Transform(store.View(), datum, tooLong)),
              "*Transform, nset=" + tooLong + ", \ntype=C\n" + kTwoPoints);
}

TEST(DatumCsys, DatumOfAnotherKind_Raises) {
    CsysStore store;
    const dtmC_DatumRef point = store.AddPoint("P");
    const ddb_Model model = store.View();
    EXPECT_EQ(Raised([&] { oif_DatumCsys(model, point, gsl_Matrix()); }),
              "Wrong datum type during input generation");
    EXPECT_EQ(Raised([&] { oif_Transform(model, point, "S"); }), "Wrong datum type during input generation");
}

TEST(DatumCsys, MagnitudesBelowTheSmallReal_AreZero) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D", Csys::CYLINDRICAL, {9.9e-16, -9.9e-16, 1e-15});
    EXPECT_EQ(Written(oif_Transform(store.View(), datum, "S")),
              "*Transform, nset=S, type=C\n"
              "          0.,           0.,        1e-15,           0.,           0.,           1.\n");
}

TEST(DatumCsys, Values_HaveFifteenDigits) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D", Csys::SPHERICAL, {1.0 / 3.0, 0, 0});
    EXPECT_EQ(
        Written(oif_Transform(store.View(), datum, "S")),
        "*Transform, nset=S, type=S\n"
        "0.333333333333333,           0.,           0., 0.333333333333333,           0.,           1.\n");
}

TEST(DatumCsys, Guard_EndsWithTheKeyword) {
    CsysStore store;
    const dtmC_DatumRef datum = store.Add("D");
    const oif_DatumCsys csys(store.View(), datum, gsl_Matrix());
    const std::string text = Streamed([&](utl_Stream& stream) {
        EXPECT_TRUE(csys.Write(stream, "*H", true));
        stream << 1e-20 << endl;
    });
    EXPECT_EQ(text, "*H\n" + kUnitAxes + "1e-20\n");
}

TEST(Orientation, OfANameAlone_IsTheUsers) {
    EXPECT_EQ(Written(oif_Orientation("a b")), "*Orientation, name=a b, system=user\n");
}

TEST(Orientation, Systems_AreNamedInWords) {
    CsysStore store;
    const dtmC_DatumRef cylindrical = store.Add("C", Csys::CYLINDRICAL, {1, 2, 3});
    const dtmC_DatumRef spherical = store.Add("S", Csys::SPHERICAL, {1, 2, 3});
    EXPECT_EQ(Written(oif_Orientation(store.View(), cylindrical, "O", false, 5.0, Axis::AXIS_1)),
              "*Orientation, name=O, system=CYLINDRICAL\n" + kTwoPoints);
    EXPECT_EQ(Written(oif_Orientation(store.View(), spherical, "O", false, 5.0, Axis::AXIS_1)),
              "*Orientation, name=O, system=SPHERICAL\n" + kTwoPoints);
}

TEST(Orientation, WithRotation_HasAxisAndAngle) {
    const std::string head = "*Orientation, name=O\n" + kUnitAxes;
    EXPECT_EQ(Rotated(30, Axis::AXIS_1), head + "1, 30.\n");
    EXPECT_EQ(Rotated(-45.5, Axis::AXIS_2), head + "2, -45.5\n");
    EXPECT_EQ(Rotated(1e-300, Axis::AXIS_3), head + "3, 1e-300\n");
}

TEST(Orientation, AngleOfZero_HasItsLineAllTheSameOnPurpose) {
    EXPECT_EQ(Rotated(0, Axis::AXIS_1), "*Orientation, name=O\n" + kUnitAxes + "1, 0.\n");
}

TEST(Orientation, UnknownAxis_LeavesTheAngleAlone) {
    EXPECT_EQ(Rotated(30, static_cast<Axis>(3)), "*Orientation, name=O\n" + kUnitAxes + "30.\n");
}

TEST(Orientation, WithoutASystem_WritesNothing) {
    CsysStore store;
    EXPECT_EQ(Written(oif_Orientation(store.View(), dtmC_DatumRef(), "O", true, 30, Axis::AXIS_1)), "");
}

TEST(Orientation, OfMaterial_MovesWithTheInstance) {
    CsysStore store;
    ptoC_MaterialOrientation record;
    record.datum = store.Add("C", Csys::CYLINDRICAL, {1, 0, 0});
    record.axis = Axis::AXIS_3;
    record.angle = 0.0;
    gsl_Matrix placement;
    placement.AxisRotation({}, {0, 0, 1}, std::numbers::pi / 2);
    placement.SetTranslation({1, 2, 3});
    // (1, 0, 0) turns to (0, 1, 0) and moves to (1, 3, 3).
    EXPECT_EQ(Written(oif_Orientation(store.View(), record, "Ori-1", placement)),
              "*Orientation, name=Ori-1, system=CYLINDRICAL\n"
              "          1.,           3.,           3.,           1.,           3.,           4.\n"
              "3, 0.\n");
    // The store's own datum stays where it is.
    EXPECT_EQ(Written(oif_Orientation(store.View(), record, "Ori-2", gsl_Matrix())),
              "*Orientation, name=Ori-2, system=CYLINDRICAL\n"
              "          1.,           0.,           0.,           1.,           0.,           1.\n"
              "3, 0.\n");
}
