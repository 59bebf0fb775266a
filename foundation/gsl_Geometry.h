#ifndef QRX_FOUNDATION_GSL_GEOMETRY_H
#define QRX_FOUNDATION_GSL_GEOMETRY_H

/// A direction or displacement in three dimensions. Lengths are sqrt(x*x + y*y + z*z), never fused.
class gsl_Vector {
public:
    constexpr gsl_Vector() = default;
    constexpr gsl_Vector(double x, double y, double z) : x_(x), y_(y), z_(z) {}

    constexpr double X() const { return x_; }
    constexpr double Y() const { return y_; }
    constexpr double Z() const { return z_; }
    double ComputeMagnitude() const;
    /// Divides each component by the length; a vector of zero length stays as it is.
    void Normalize();

    friend constexpr bool operator==(const gsl_Vector&, const gsl_Vector&) = default;

private:
    double x_ = 0.0;
    double y_ = 0.0;
    double z_ = 0.0;
};

/// A place in three dimensions.
class gsl_Point {
public:
    constexpr gsl_Point() = default;
    constexpr gsl_Point(double x, double y, double z) : x_(x), y_(y), z_(z) {}

    constexpr double X() const { return x_; }
    constexpr double Y() const { return y_; }
    constexpr double Z() const { return z_; }

    friend constexpr bool operator==(const gsl_Point&, const gsl_Point&) = default;

private:
    double x_ = 0.0;
    double y_ = 0.0;
    double z_ = 0.0;
};

constexpr gsl_Point operator+(const gsl_Point& p, const gsl_Vector& v) {
    return {p.X() + v.X(), p.Y() + v.Y(), p.Z() + v.Z()};
}
constexpr gsl_Vector operator-(const gsl_Point& a, const gsl_Point& b) {
    return {a.X() - b.X(), a.Y() - b.Y(), a.Z() - b.Z()};
}
constexpr double gsl_Dot(const gsl_Vector& a, const gsl_Vector& b) {
    return a.X() * b.X() + a.Y() * b.Y() + a.Z() * b.Z();
}
gsl_Vector gsl_Cross(const gsl_Vector& a, const gsl_Vector& b);

/// A straight piece between two points.
class gsl_ModelSegment {
public:
    gsl_ModelSegment() = default;
    gsl_ModelSegment(const gsl_Point& start, const gsl_Point& end) : start_(start), end_(end) {}
    const gsl_Point& Start() const { return start_; }
    const gsl_Point& End() const { return end_; }
    /// From start to end, not normalised.
    gsl_Vector Direction() const { return end_ - start_; }

    friend bool operator==(const gsl_ModelSegment&, const gsl_ModelSegment&) = default;

private:
    gsl_Point start_;
    gsl_Point end_;
};

/// A rigid placement: a rotation, then a translation. Starts as the identity.
class gsl_Matrix {
public:
    gsl_Matrix() { FillIdentity(); }

    void FillIdentity();
    /// No translation and no rotation, exactly.
    bool IsIdentity() const;
    /// Makes this the rotation about the axis through `point` by `angle` radians. `axis` is a unit vector; a
    /// zero vector makes no rotation.
    void AxisRotation(const gsl_Point& point, const gsl_Vector& axis, double angle);
    /// Replaces the translation; the rotation stays.
    void SetTranslation(const gsl_Vector& translation);
    gsl_Vector GetTranslation() const { return translation_; }
    /// The placement as the deck states it, after the translation: a turn about the axis through the
    /// translated origin. `axis` and `angle` are those that AxisRotation was given.
    void GetAxisRotation(gsl_Point& point, gsl_Vector& axis, double& angle) const;

    gsl_Vector Apply(const gsl_Vector& direction) const;
    gsl_Point Apply(const gsl_Point& point) const;

private:
    double rotation_[3][3];
    gsl_Vector translation_;
    gsl_Vector axis_;
    double angle_;
};

/// The tolerances of the geometry: the first for lengths, the third for angles (radians).
class gsl_Util {
public:
    static const gsl_Util& Instance();
    double LengthTolerance() const { return tolerances_[0]; }
    double AngleTolerance() const { return tolerances_[2]; }

private:
    double tolerances_[3] = {1e-12, 1e-12, 1e-12};
};

/// A triple as the store's geometry services give it.
struct g3d_Vector {
    double x = 0.0;
    double y = 0.0;
    double z = 0.0;

    friend bool operator==(const g3d_Vector&, const g3d_Vector&) = default;
};

#endif
