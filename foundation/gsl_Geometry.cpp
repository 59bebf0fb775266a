#include "foundation/gsl_Geometry.h"

#include <cmath>

double gsl_Vector::ComputeMagnitude() const {
    return std::sqrt(x_ * x_ + y_ * y_ + z_ * z_);
}

void gsl_Vector::Normalize() {
    const double length = ComputeMagnitude();
    if (length == 0.0) return;
    x_ /= length;
    y_ /= length;
    z_ /= length;
}

gsl_Vector gsl_Cross(const gsl_Vector& a, const gsl_Vector& b) {
    return {a.Y() * b.Z() - a.Z() * b.Y(), a.Z() * b.X() - a.X() * b.Z(), a.X() * b.Y() - a.Y() * b.X()};
}

void gsl_Matrix::FillIdentity() {
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) rotation_[row][column] = row == column ? 1.0 : 0.0;
    }
    translation_ = gsl_Vector();
    axis_ = gsl_Vector();
    angle_ = 0.0;
}

bool gsl_Matrix::IsIdentity() const {
    return angle_ == 0.0 && translation_ == gsl_Vector();
}

void gsl_Matrix::AxisRotation(const gsl_Point& point, const gsl_Vector& axis, double angle) {
    FillIdentity();
    if (axis == gsl_Vector()) return;
    axis_ = axis;
    angle_ = angle;
    const double c = std::cos(angle);
    const double s = std::sin(angle);
    const double t = 1.0 - c;
    const double x = axis.X();
    const double y = axis.Y();
    const double z = axis.Z();
    const double rotation[3][3] = {{t * x * x + c, t * x * y - s * z, t * x * z + s * y},
                                   {t * x * y + s * z, t * y * y + c, t * y * z - s * x},
                                   {t * x * z - s * y, t * y * z + s * x, t * z * z + c}};
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) rotation_[row][column] = rotation[row][column];
    }
    const gsl_Vector arm(point.X(), point.Y(), point.Z());
    const gsl_Vector turned = Apply(arm);
    translation_ = gsl_Vector(arm.X() - turned.X(), arm.Y() - turned.Y(), arm.Z() - turned.Z());
}

void gsl_Matrix::SetTranslation(const gsl_Vector& translation) {
    translation_ = translation;
}

void gsl_Matrix::GetAxisRotation(gsl_Point& point, gsl_Vector& axis, double& angle) const {
    point = gsl_Point(translation_.X(), translation_.Y(), translation_.Z());
    axis = axis_;
    angle = angle_;
}

gsl_Vector gsl_Matrix::Apply(const gsl_Vector& direction) const {
    const double v[3] = {direction.X(), direction.Y(), direction.Z()};
    double turned[3];
    for (int row = 0; row < 3; ++row) {
        turned[row] = rotation_[row][0] * v[0] + rotation_[row][1] * v[1] + rotation_[row][2] * v[2];
    }
    return {turned[0], turned[1], turned[2]};
}

gsl_Point gsl_Matrix::Apply(const gsl_Point& point) const {
    const gsl_Vector turned = Apply(gsl_Vector(point.X(), point.Y(), point.Z()));
    return gsl_Point(turned.X(), turned.Y(), turned.Z()) + translation_;
}

const gsl_Util& gsl_Util::Instance() {
    static const gsl_Util util;
    return util;
}
