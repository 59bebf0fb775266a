#include "foundation/gsl_Geometry.h"

#include <gtest/gtest.h>

#include <numbers>

namespace {

constexpr double kPi = std::numbers::pi;

void ExpectNear(const gsl_Point& found, const gsl_Point& expected) {
    EXPECT_NEAR(found.X(), expected.X(), 1e-14);
    EXPECT_NEAR(found.Y(), expected.Y(), 1e-14);
    EXPECT_NEAR(found.Z(), expected.Z(), 1e-14);
}

TEST(gsl_Vector, DefaultConstructed_IsZero) {
    EXPECT_EQ(gsl_Vector(), gsl_Vector(0.0, 0.0, 0.0));
}

TEST(gsl_Vector, ComputeMagnitude_IsTheLength) {
    EXPECT_EQ(gsl_Vector(3.0, -4.0, 12.0).ComputeMagnitude(), 13.0);
    EXPECT_EQ(gsl_Vector().ComputeMagnitude(), 0.0);
}

TEST(gsl_Vector, Normalized_HasComponentsDividedByLength) {
    gsl_Vector v(3.0, 0.0, -4.0);
    v.Normalize();
    EXPECT_EQ(v, gsl_Vector(3.0 / 5.0, 0.0, -4.0 / 5.0));
}

TEST(gsl_Vector, ZeroNormalized_StaysZero) {
    gsl_Vector v;
    v.Normalize();
    EXPECT_EQ(v, gsl_Vector());
}

TEST(gsl_Vector, CrossOfAxes_IsTheThird) {
    const gsl_Vector x(1.0, 0.0, 0.0);
    const gsl_Vector y(0.0, 1.0, 0.0);
    const gsl_Vector z(0.0, 0.0, 1.0);
    EXPECT_EQ(gsl_Cross(x, y), z);
    EXPECT_EQ(gsl_Cross(y, z), x);
    EXPECT_EQ(gsl_Cross(z, x), y);
    EXPECT_EQ(gsl_Cross(y, x), gsl_Vector(0.0, 0.0, -1.0));
    EXPECT_EQ(gsl_Cross(gsl_Vector(1.0, 2.0, 3.0), gsl_Vector(4.0, 5.0, 6.0)), gsl_Vector(-3.0, 6.0, -3.0));
}

TEST(gsl_Vector, Dot_IsTheSumOfProducts) {
    EXPECT_EQ(gsl_Dot(gsl_Vector(1.0, 2.0, 3.0), gsl_Vector(4.0, -5.0, 6.0)), 12.0);
}

TEST(gsl_Point, PlusAndMinus_MoveAndMeasure) {
    const gsl_Point p(1.0, 2.0, 3.0);
    const gsl_Vector v(10.0, 20.0, 30.0);
    EXPECT_EQ(p + v, gsl_Point(11.0, 22.0, 33.0));
    EXPECT_EQ((p + v) - p, v);
}

TEST(gsl_ModelSegment, Direction_GoesFromStartToEnd) {
    const gsl_ModelSegment segment(gsl_Point(1.0, 1.0, 1.0), gsl_Point(1.0, 4.0, 5.0));
    EXPECT_EQ(segment.Direction(), gsl_Vector(0.0, 3.0, 4.0));
    EXPECT_EQ(segment.Start(), gsl_Point(1.0, 1.0, 1.0));
    EXPECT_EQ(segment.End(), gsl_Point(1.0, 4.0, 5.0));
}

TEST(gsl_Matrix, DefaultConstructed_IsIdentity) {
    const gsl_Matrix matrix;
    EXPECT_TRUE(matrix.IsIdentity());
    EXPECT_EQ(matrix.Apply(gsl_Point(1.0, 2.0, 3.0)), gsl_Point(1.0, 2.0, 3.0));
    EXPECT_EQ(matrix.GetTranslation(), gsl_Vector());
    gsl_Point point(9.0, 9.0, 9.0);
    gsl_Vector axis(9.0, 9.0, 9.0);
    double angle = 9.0;
    matrix.GetAxisRotation(point, axis, angle);
    EXPECT_EQ(point, gsl_Point());
    EXPECT_EQ(angle, 0.0);
}

TEST(gsl_Matrix, QuarterTurnAboutZ_TurnsXIntoY) {
    gsl_Matrix matrix;
    matrix.AxisRotation(gsl_Point(), gsl_Vector(0.0, 0.0, 1.0), kPi / 2.0);
    ExpectNear(matrix.Apply(gsl_Point(1.0, 0.0, 0.0)), gsl_Point(0.0, 1.0, 0.0));
    ExpectNear(matrix.Apply(gsl_Point(0.0, 1.0, 5.0)), gsl_Point(-1.0, 0.0, 5.0));
    EXPECT_FALSE(matrix.IsIdentity());
}

TEST(gsl_Matrix, ThirdOfATurnAboutTheDiagonal_PermutesAxes) {
    const double c = 1.0 / std::numbers::sqrt3;
    gsl_Matrix matrix;
    matrix.AxisRotation(gsl_Point(), gsl_Vector(c, c, c), 2.0 * kPi / 3.0);
    ExpectNear(matrix.Apply(gsl_Point(1.0, 2.0, 3.0)), gsl_Point(3.0, 1.0, 2.0));
}

TEST(gsl_Matrix, TurnAboutAnAxisElsewhere_LeavesItsPoints) {
    gsl_Matrix matrix;
    matrix.AxisRotation(gsl_Point(1.0, 0.0, 0.0), gsl_Vector(0.0, 0.0, 1.0), kPi / 2.0);
    ExpectNear(matrix.Apply(gsl_Point(1.0, 0.0, 7.0)), gsl_Point(1.0, 0.0, 7.0));
    ExpectNear(matrix.Apply(gsl_Point()), gsl_Point(1.0, -1.0, 0.0));
}

TEST(gsl_Matrix, ZeroAxis_MakesNoRotation) {
    gsl_Matrix matrix;
    matrix.AxisRotation(gsl_Point(), gsl_Vector(), 1.0);
    EXPECT_TRUE(matrix.IsIdentity());
}

TEST(gsl_Matrix, DirectionApplied_IsTurnedButNotMoved) {
    gsl_Matrix matrix;
    matrix.SetTranslation(gsl_Vector(5.0, 6.0, 7.0));
    EXPECT_EQ(matrix.Apply(gsl_Vector(1.0, 2.0, 3.0)), gsl_Vector(1.0, 2.0, 3.0));
    EXPECT_EQ(matrix.Apply(gsl_Point(1.0, 2.0, 3.0)), gsl_Point(6.0, 8.0, 10.0));
    EXPECT_FALSE(matrix.IsIdentity());
}

TEST(gsl_Matrix, Placement_IsTranslationThenTurnAboutTheTranslatedOrigin) {
    const gsl_Vector t(10.0, 20.0, 30.0);
    const gsl_Vector z(0.0, 0.0, 1.0);
    gsl_Matrix placement;
    placement.AxisRotation(gsl_Point(), z, kPi / 2.0);
    placement.SetTranslation(t);
    EXPECT_EQ(placement.GetTranslation(), t);
    gsl_Point point;
    gsl_Vector axis;
    double angle = 0.0;
    placement.GetAxisRotation(point, axis, angle);
    EXPECT_EQ(point, gsl_Point(10.0, 20.0, 30.0));
    EXPECT_EQ(axis, z);
    EXPECT_EQ(angle, kPi / 2.0);

    gsl_Matrix turn;
    turn.AxisRotation(point, axis, angle);
    const gsl_Point p(1.0, 2.0, 3.0);
    ExpectNear(placement.Apply(p), turn.Apply(p + t));
    ExpectNear(placement.Apply(p), gsl_Point(8.0, 21.0, 33.0));
}

TEST(gsl_Matrix, FillIdentity_ForgetsRotationAndTranslation) {
    gsl_Matrix matrix;
    matrix.AxisRotation(gsl_Point(1.0, 1.0, 1.0), gsl_Vector(1.0, 0.0, 0.0), 1.0);
    matrix.FillIdentity();
    EXPECT_TRUE(matrix.IsIdentity());
    EXPECT_EQ(matrix.Apply(gsl_Point(1.0, 2.0, 3.0)), gsl_Point(1.0, 2.0, 3.0));
}

TEST(gsl_Util, Tolerances_AreVerySmall) {
    EXPECT_EQ(gsl_Util::Instance().LengthTolerance(), 1e-12);
    EXPECT_EQ(gsl_Util::Instance().AngleTolerance(), 1e-12);
}

TEST(g3d_Vector, Compared_ByAllComponents) {
    EXPECT_EQ((g3d_Vector{1.0, 2.0, 3.0}), (g3d_Vector{1.0, 2.0, 3.0}));
    EXPECT_NE((g3d_Vector{1.0, 2.0, 3.0}), (g3d_Vector{1.0, 2.0, 4.0}));
    EXPECT_EQ(g3d_Vector(), (g3d_Vector{0.0, 0.0, 0.0}));
}

} // namespace
