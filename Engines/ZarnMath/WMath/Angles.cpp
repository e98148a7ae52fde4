#include "ZarnMath/ValueTypesInternal.h"
#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

double Normalize(double angle, double fullTurn) noexcept
{
    const double remainder = std::fmod(angle, fullTurn);
    return remainder < 0.0 ? remainder + fullTurn : remainder;
}

/// NaN stays.
double ClampCosine(double c) noexcept
{
    if (c < -1.0)
        return -1.0;
    return c > 1.0 ? 1.0 : c;
}

std::int32_t RoundUp(double v) noexcept
{
    return TruncateToInt(std::ceil(std::fabs(v)));
}

int ToUnits(double degrees) noexcept
{
    return RoundToInt(degrees * unitsPerDegree);
}

} // namespace

double Radians::NormalizeAngle(double angle) noexcept
{
    return Normalize(angle, twoPi);
}

double Radians::NormalizeFineAngle(double angle) noexcept
{
    if (angle < -pi) {
        const double remainder = std::fmod(angle, twoPi);
        return remainder < -pi ? remainder + twoPi : remainder;
    }
    if (angle > pi) {
        const double remainder = std::fmod(angle, twoPi);
        return remainder > pi ? remainder - twoPi : remainder;
    }
    return angle;
}

vector2d Radians::AngleToVector(double angle) noexcept
{
    const auto [s, c] = GetSineCosine(angle);
    return {c, s};
}

vector2d Radians::AngleToVector(double angle, double length) noexcept
{
    return AngleToVector(angle) * length;
}

double Radians::VectorToAngle(const vector2d& v) noexcept
{
    return NormalizeAngle(std::atan2(v.y, v.x));
}

double Radians::GetAngle(const vector2d& a, const vector2d& b) noexcept
{
    const double lengths = std::sqrt(LengthSquared(a) * LengthSquared(b));
    if (!(lengths > 0.0))
        return 0.0;
    const double turn = std::acos(ClampCosine(Dot(a, b) / lengths));
    return Cross(a, b) < 0.0 ? twoPi - turn : turn;
}

double Radians::GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept
{
    return GetAngle(a - vertex, b - vertex);
}

double Radians::GetFineAngle(const vector2d& a, const vector2d& b) noexcept
{
    const double turn = GetAngle(a, b);
    return turn > pi ? turn - twoPi : turn;
}

point2d Radians::RotatePoint(const point2d& p, double angle, const point2d& centre) noexcept
{
    return centre + Turned(p - centre, GetSineCosine(angle));
}

double Radians::Constrain(double angle, int steps, double origin) noexcept
{
    if (steps == 0)
        return angle;
    const int step = RoundToInt((angle - origin) / twoPi * steps);
    return static_cast<double>(step) / steps * twoPi + origin;
}

int Radians::GetQuadrant(double angle) noexcept
{
    const double normalized = NormalizeAngle(angle);
    if (normalized < halfPi)
        return 0;
    if (normalized < pi)
        return 1;
    return normalized < threeHalvesPi ? 2 : 3;
}

double Degrees::NormalizeAngle(double angle) noexcept
{
    return Normalize(angle, 360.0);
}

vector2d Degrees::AngleToVector(double angle) noexcept
{
    return Radians::AngleToVector(angle * degreesToRadians);
}

vector2d Degrees::AngleToVector(double angle, double length) noexcept
{
    return Radians::AngleToVector(angle * degreesToRadians, length);
}

double Degrees::VectorToAngle(const vector2d& v) noexcept
{
    return Radians::VectorToAngle(v) * radiansToDegrees;
}

double Degrees::GetAngle(const vector2d& a, const vector2d& b) noexcept
{
    return Radians::GetAngle(a, b) * radiansToDegrees;
}

double Degrees::GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept
{
    return Radians::GetAngle(vertex, a, b) * radiansToDegrees;
}

double Degrees::GetFineAngle(const vector2d& a, const vector2d& b) noexcept
{
    return Radians::GetFineAngle(a, b) * radiansToDegrees;
}

point2d Degrees::RotatePoint(const point2d& p, double angle, const point2d& centre) noexcept
{
    return Radians::RotatePoint(p, angle * degreesToRadians, centre);
}

SIZE Degrees::GetRotatedSize(const SIZE& size, double angle) noexcept
{
    const auto [s, c] = GetSineCosine(angle * degreesToRadians);
    return {WrappingAdd(RoundUp(c * size.cy), RoundUp(s * size.cx)),
            WrappingAdd(RoundUp(s * size.cy), RoundUp(c * size.cx))};
}

int KELDANGLE::NormalizeAngle(int angle) noexcept
{
    return ToUnits(Degrees::NormalizeAngle(angle / unitsPerDegree));
}

int KELDANGLE::VectorToAngle(const vector2d& v) noexcept
{
    return ToUnits(Degrees::VectorToAngle(v));
}

int KELDANGLE::GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept
{
    return ToUnits(Degrees::GetAngle(vertex, a, b));
}

int KELDANGLE::GetFineAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept
{
    return ToUnits(Degrees::GetFineAngle(a - vertex, b - vertex));
}

} // namespace ZarnMath

using namespace ZarnMath;

double MATRIX::GetTransformedRadians(double radians) const noexcept
{
    return Radians::VectorToAngle(Image(*this, Radians::AngleToVector(radians)));
}

double MATRIX::GetUntransformedRadians(double radians) const noexcept
{
    return Radians::VectorToAngle(GetUntransformedVector(Radians::AngleToVector(radians)));
}

vector2d MATRIX::GetUntransformedVector(const vector2d& v) const noexcept
{
    const double det = Determinant(*this);
    if (IsNearZero(det))
        return v;
    return {(m22 * v.x - m12 * v.y) / det, (m11 * v.y - m21 * v.x) / det};
}
