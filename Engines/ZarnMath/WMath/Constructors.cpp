#include "ZarnMath/WMathInternal.h"

#include <algorithm>

namespace ZarnMath {

namespace {

/// Both factors get one magnitude and keep their signs, unless the mode stretches. On a tie, and where the magnitude of
/// y is NaN, that of x counts.
vector2d ChooseFactors(const vector2d& factors, MapMode mode) noexcept
{
    if (mode == MapStretch)
        return factors;
    const double x = std::fabs(factors.x);
    const double y = std::fabs(factors.y);
    const double magnitude = mode == MapFit ? std::min(x, y) : std::max(x, y);
    return {factors.x < 0.0 ? -magnitude : magnitude, factors.y < 0.0 ? -magnitude : magnitude};
}

point2d Centre(const BoundsT<double>& box) noexcept
{
    return {(box.left + box.right) * 0.5, (box.top + box.bottom) * 0.5};
}

vector2d Size(const BoundsT<double>& box) noexcept
{
    return {box.right - box.left, box.top - box.bottom};
}

} // namespace

MATRIX IdentityMatrix() noexcept
{
    return gmIdentityMatrix;
}

MATRIX SwapXYMatrix() noexcept
{
    return {0.0, 1.0, 0.0, 1.0, 0.0, 0.0};
}

MATRIX ConstructMatrix(const vector2d& xVector, const vector2d& yVector, const vector2d& translation) noexcept
{
    return FromColumns(xVector, yVector, AsPoint(translation));
}

MATRIX ConstructTranslationMatrix(const vector2d& v) noexcept
{
    return {1.0, 0.0, v.x, 0.0, 1.0, v.y};
}

MATRIX ConstructRotationMatrix(double radians) noexcept
{
    return ConstructRotateAroundMatrix(radians, {0.0, 0.0});
}

MATRIX ConstructScaledRotationMatrix(double sx, double sy, double radians) noexcept
{
    const auto [s, c] = GetSineCosine(radians);
    return {c * sx, -s * sy, 0.0, s * sx, c * sy, 0.0};
}

MATRIX ConstructRotateAroundMatrix(double radians, const point2d& centre) noexcept
{
    const auto [s, c] = GetSineCosine(radians);
    return {c, -s, (centre.x - c * centre.x) + s * centre.y, s, c, (centre.y - s * centre.x) - c * centre.y};
}

MATRIX ConstructScaleAroundMatrix(double sx, double sy, const point2d& centre) noexcept
{
    return {sx, 0.0, (1.0 - sx) * centre.x, 0.0, sy, (1.0 - sy) * centre.y};
}

MATRIX ConstructSkewAroundMatrix(double angleX, double angleY, const point2d& centre) noexcept
{
    const double kx = std::tan(angleX);
    const double ky = std::tan(angleY);
    const double q = 1.0 - kx * ky;
    return {1.0, -kx, kx * centre.y, ky, q, centre.y + (ky * -centre.x - q * centre.y)};
}

MATRIX ConstructTransformAroundMatrix(const MATRIX& t, const point2d& centre) noexcept
{
    // The products with 0 are those of the translation matrix; an infinite field makes its neighbour NaN.
    return {t.m11 + t.m12 * 0.0, t.m11 * 0.0 + t.m12, centre.x + ((t.m12 * -centre.y - centre.x * t.m11) + t.dx),
            t.m21 + t.m22 * 0.0, t.m21 * 0.0 + t.m22, centre.y + (t.dy + (t.m22 * -centre.y - centre.x * t.m21))};
}

MATRIX ConstructVectorTransformMatrix(const vector2d& from, const vector2d& to) noexcept
{
    const double length = std::sqrt(LengthSquared(from));
    const double k = length > DBL_EPSILON ? std::sqrt(LengthSquared(to)) / length : 1.0;
    const auto [s, c] = GetSineCosine(Radians::GetAngle(from, to));
    return {k * c, k * -s, 0.0, k * s, k * c, 0.0};
}

MATRIX ConstructLineSegmentTransformMatrix(const point2d& a0, const point2d& a1, const point2d& b0,
                                           const point2d& b1) noexcept
{
    MATRIX m = ConstructVectorTransformMatrix(a1 - a0, b1 - b0);
    m.dx = b0.x + (m.m12 * -a0.y - a0.x * m.m11);
    m.dy = b0.y + (m.m22 * -a0.y - a0.x * m.m21);
    return m;
}

MATRIX ConstructBBoxScaleMatrix(const BoundsT<double>& box, bool withOffset) noexcept
{
    const vector2d size = Size(box);
    const point2d offset = withOffset ? point2d{box.left, box.bottom} : point2d{0.0, 0.0};
    return {IsNearZero(size.x) ? 1.0 : size.x, 0.0, offset.x, 0.0, IsNearZero(size.y) ? 1.0 : size.y, offset.y};
}

MATRIX ConstructRectTransformMatrix(const BoundsT<double>& from, const BoundsT<double>& to, MapMode mode) noexcept
{
    const point2d target = Centre(to);
    const vector2d offset = target - Centre(from);
    const vector2d factor = GetScaleForSizeTransform(Size(from), Size(to), mode);
    return {factor.x,       factor.x * 0.0, target.x + (offset.x - target.x) * factor.x,
            factor.y * 0.0, factor.y,       target.y + (offset.y - target.y) * factor.y};
}

vector2d GetScaleForSizeTransform(const vector2d& from, const vector2d& to, MapMode mode) noexcept
{
    return ChooseFactors({to.x / from.x, to.y / from.y}, mode);
}

} // namespace ZarnMath
