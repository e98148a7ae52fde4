#include "ZarnMath/Quaternion.h"

namespace ZarnMath {

namespace {

/// What counts as 0 in x, y and z.
constexpr double axisZero = 1000.0 * DBL_EPSILON;

/// Where 1 - |cosine| is below this, the arc between two quaternions is too short to divide by its sine.
constexpr double shortestArc = 1e-08;

double ForceZero(double v, double tolerance) noexcept
{
    return std::fabs(v) <= tolerance ? 0.0 : v;
}

/// q * (v, 0)
Quaternion TimesVector(const Quaternion& q, const vector3dT<double>& v) noexcept
{
    return {(q.w * v.x + q.y * v.z) - q.z * v.y, //
            (q.z * v.x + q.w * v.y) - q.x * v.z, //
            (q.x * v.y + q.w * v.z) - q.y * v.x, //
            (-q.x * v.x - q.y * v.y) - q.z * v.z};
}

} // namespace

Quaternion Quaternion::operator*(const Quaternion& other) const noexcept
{
    const Quaternion& a = *this;
    const Quaternion& b = other;
    return {((b.w * a.x + a.w * b.x) + a.y * b.z) - b.y * a.z, //
            ((b.w * a.y + a.w * b.y) + b.x * a.z) - a.x * b.z, //
            (a.x * b.y + (b.w * a.z + a.w * b.z)) - b.x * a.y, //
            ((a.w * b.w - a.x * b.x) - a.y * b.y) - a.z * b.z};
}

void Quaternion::RotateQuick(vector3dT<double>& v) const noexcept
{
    const Quaternion t = TimesVector(*this, v);
    v = {t.x, t.y, t.z};
}

void Quaternion::Rotate(vector3dT<double>& v) const noexcept
{
    const Quaternion t = TimesVector(*this, v);
    v = {y * t.z + ((w * t.x - x * t.w) - z * t.y), //
         z * t.x + ((w * t.y - y * t.w) - x * t.z), //
         x * t.y + ((w * t.z - z * t.w) - y * t.x)};
}

void Quaternion::RotationCreate(const vector3dT<double>& a, const vector3dT<double>& b) noexcept
{
    x = a.y * b.z - a.z * b.y;
    y = a.z * b.x - b.z * a.x;
    z = b.y * a.x - a.y * b.x;
    w = (a.x * b.x + a.y * b.y) + a.z * b.z;
}

void Quaternion::ForceZeros() noexcept
{
    x = ForceZero(x, axisZero);
    y = ForceZero(y, axisZero);
    z = ForceZero(z, axisZero);
    w = ForceZero(w, DBL_EPSILON);
}

bool Quaternion::Interpolate(const Quaternion& a, const Quaternion& b, double t, Quaternion& out) noexcept
{
    const Quaternion to = b; // out may be b
    out = a;
    const double d = a.w * to.w + ((a.x * to.x + a.y * to.y) + a.z * to.z);
    if (1.0 - std::fabs(d) < shortestArc)
        return false;
    const double angle = std::acos(d);
    const double s = std::sin(angle);
    if (IsNearZero(s))
        return false;
    const double wa = std::sin((1.0 - t) * angle);
    const double wb = std::sin(angle * t);
    out = {(a.x * wa + to.x * wb) / s, (a.y * wa + to.y * wb) / s, (a.z * wa + to.z * wb) / s,
           (a.w * wa + to.w * wb) / s};
    return true;
}

} // namespace ZarnMath
