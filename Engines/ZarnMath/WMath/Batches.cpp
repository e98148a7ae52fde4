#include "ZarnMath/WMath/Batches.h"

#include "ZarnMath/ValueTypesInternal.h"

namespace ZarnMath {

namespace {

/// The rotation as a matrix whose translation holds what the centre contributes to every point.
MATRIX RotationWithHoistedCentre(double radians, const point2d& centre) noexcept
{
    const auto [s, c] = GetSineCosine(radians);
    return {c, -s, centre.x + (s * centre.y - c * centre.x), s, c, centre.y + (c * -centre.y - s * centre.x)};
}

} // namespace

void Radians::RotatePoints(POINT* points, unsigned long count, double angle, const point2d& centre) noexcept
{
    if (IsNearZero(angle) || static_cast<long>(count) < 1)
        return;
    TransformRounded(points, count, RotationWithHoistedCentre(angle, centre), wholeRange);
}

void Degrees::RotatePoints(POINT* points, unsigned long count, double angle, const point2d& centre) noexcept
{
    Radians::RotatePoints(points, count, angle * degreesToRadians, centre);
}

void TranslatePoints(point2d* points, unsigned long count, const point2d& offset) noexcept
{
    ForEachPoint(points, count, offset, [](const point2d& p, const point2d& v) { return v + AsVector(p); });
}

void TranslatePoints(POINT* points, unsigned long count, const POINT& offset) noexcept
{
    ForEachPoint(points, count, offset, [](const POINT& p, const POINT& v) {
        return POINT{WrappingAdd(v.x, p.x), WrappingAdd(v.y, p.y)};
    });
}

} // namespace ZarnMath

using namespace ZarnMath;

void MATRIX::TransformPoints(POINT* points, unsigned long count) const noexcept
{
    TransformRounded(points, count, *this, wholeRange);
}

void MATRIX::TransformPoints(point2d* points, unsigned long count) const noexcept
{
    ForEachPoint(points, count, *this, [](const point2d& p, const MATRIX& m) { return Image(m, p); });
}

void MATRIX::TransformPointsWithRangeCheck(POINT* points, unsigned long count) const noexcept
{
    TransformRounded(points, count, *this, checkedRange);
}
