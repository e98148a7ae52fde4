#include "ZarnMath/WMathInternal.h"

#include <cstring>

namespace ZarnMath {

bool IsEqual(const MATRIX& a, const MATRIX& b, double tolerance) noexcept
{
    const auto isNear = [tolerance](double f, double g) { return std::fabs(f - g) <= tolerance; };
    return isNear(a.m11, b.m11) && isNear(a.m12, b.m12) && isNear(a.dx, b.dx) && isNear(a.m21, b.m21) &&
           isNear(a.m22, b.m22) && isNear(a.dy, b.dy);
}

bool IsZero(const MATRIX& m, double tolerance) noexcept
{
    return IsEqual(m, MATRIX{}, tolerance);
}

} // namespace ZarnMath

using namespace ZarnMath;

point2d MATRIX::operator()(const point2d& p) const noexcept
{
    return Image(*this, p);
}

vector2d MATRIX::operator()(const vector2d& v) const noexcept
{
    return Image(*this, v);
}

MATRIX MATRIX::operator*(const MATRIX& other) const noexcept
{
    return FromColumns(Image(*this, XColumn(other)), Image(*this, YColumn(other)), Image(*this, Translation(other)));
}

void MATRIX::Rotate(double radians) noexcept
{
    Turn(*this, GetSineCosine(radians));
}

void MATRIX::RotateAroundPoint(double radians, const point2d& centre) noexcept
{
    const point2d fixed = centre;
    dx -= fixed.x;
    dy -= fixed.y;
    Turn(*this, GetSineCosine(radians));
    dx += fixed.x;
    dy += fixed.y;
}

void MATRIX::TransformAroundPoint(const MATRIX& t, const point2d& centre) noexcept
{
    const point2d image = Image(t, point2d{dx - centre.x, dy - centre.y});
    *this = FromColumns(Image(t, XColumn(*this)), Image(t, YColumn(*this)), image + AsVector(centre));
}

void MATRIX::ScaleMatrix(const vector2d& scale) noexcept
{
    *this = {m11 * scale.x, m12 * scale.x, dx * scale.x, m21 * scale.y, m22 * scale.y, dy * scale.y};
}

void MATRIX::ScaleMatrix(const vector2d& scale, const point2d& centre) noexcept
{
    *this = {m11 * scale.x, m12 * scale.x, centre.x + (dx - centre.x) * scale.x,
             m21 * scale.y, m22 * scale.y, centre.y + (dy - centre.y) * scale.y};
}

void MATRIX::RemoveScaling() noexcept
{
    const vector2d x = Normalize(XRow(*this));
    const vector2d y = Normalize(YRow(*this));
    *this = {x.x, x.y, dx, y.x, y.y, dy};
}

bool MATRIX::Invert(double tolerance) noexcept
{
    const double det = Determinant(*this);
    if (!(std::fabs(det) > tolerance)) {
        *this = {};
        return false;
    }
    *this = {m22 / det, -m12 / det, (m12 * dy - m22 * dx) / det, -m21 / det, m11 / det, -(m11 * dy - m21 * dx) / det};
    return true;
}

bool MATRIX::IsIdentity(bool useTolerance, double tolerance) const noexcept
{
    if (useTolerance)
        return IsEqual(*this, gmIdentityMatrix, tolerance);
    return std::memcmp(this, &gmIdentityMatrix, sizeof gmIdentityMatrix) == 0;
}
