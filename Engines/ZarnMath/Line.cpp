#include "ZarnMath/Line.h"

#include "ZarnMath/FitLine.h"
#include "ZarnMath/ValueTypesInternal.h"

#include <algorithm>
#include <vector>

namespace ZarnMath {

namespace {

/// The foot of s on the line from p along e, whose squared length is q.
point2d FootOnLine(const point2d& p, const vector2d& e, double q, const point2d& s) noexcept
{
    return p + e * (Dot(s - p, e) / q);
}

bool IsAnyEndWithin(const point2d& a, const point2d& b, const point2d& c, const point2d& d, double w2) noexcept
{
    return DistanceToLineSegmentSqrd(a, b, c) < w2 || DistanceToLineSegmentSqrd(a, b, d) < w2 ||
           DistanceToLineSegmentSqrd(c, d, a) < w2 || DistanceToLineSegmentSqrd(c, d, b) < w2;
}

} // namespace

bool AreCollinear(const point2d* points, unsigned long count, double tolerance) noexcept
{
    if (count < 3)
        return true;
    point2d p{};
    vector2d d{};
    GetLeastSquaresLines(points, static_cast<int>(count), p, d);
    const vector2d e = (p + d) - p;
    const double q = LengthSquared(e);
    if (!(q > 0.0))
        return false;
    return std::none_of(points, points + count,
                        [&](const point2d& s) { return LengthSquared(FootOnLine(p, e, q, s) - s) > tolerance; });
}

bool AreCollinear(const POINT* points, unsigned long count, double tolerance)
{
    if (count == 0)
        return true;
    std::vector<point2d> converted(count);
    std::transform(points, points + count, converted.begin(), [](const POINT& p) { return ToPoint2d(p); });
    return AreCollinear(converted.data(), count, tolerance);
}

double DistanceToLineSegmentSqrd(const point2d& start, const point2d& end, const point2d& p) noexcept
{
    const vector2d d = end - start;
    const double q = LengthSquared(d);
    if (q > 0.0) {
        const double t = Dot(d, p - start) / q;
        if (t >= 0.0 && t <= 1.0)
            return LengthSquared(p - (start + d * t));
    }
    return std::min(LengthSquared(p - end), LengthSquared(p - start));
}

bool DoesFatlineIntersectLine(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                              double width) noexcept
{
    if (IsAnyEndWithin(a, b, c, d, width * width))
        return true;
    const vector2d e = d - c;
    if (Cross(e, b - c) * Cross(e, a - c) > 0.0)
        return false;
    const vector2d g = b - a;
    return Cross(g, d - a) * Cross(g, c - a) < 0.0;
}

void ReflectAcross(POINT direction, POINT origin, POINT* points, unsigned long count) noexcept
{
    if (points == nullptr)
        return;
    const double n =
        WrappingAdd(WrappingMultiply(direction.x, direction.x), WrappingMultiply(direction.y, direction.y));
    const vector2d v = AsVector(ToPoint2d(direction));
    const vector2d o = AsVector(ToPoint2d(origin));
    for (unsigned long i = 0; i < count; ++i) {
        const vector2d d = Difference(points[i], origin);
        const double projected = Dot(v, d);
        const double k = (projected + projected) / n;
        points[i] = ToPOINT(AsPoint(v * k - d + o));
    }
}

} // namespace ZarnMath
