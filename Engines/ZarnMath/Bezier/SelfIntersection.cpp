#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/Bounds.h"

#include <algorithm>
#include <utility>

namespace ZarnMath::CubicBezier {

namespace {

/// The parameters at which the tangent runs through the start of a cubic, the roots of AB*t^2 + 2*AC*t + BC.
struct StartTangents
{
    double ab;
    double ac;
    double bc;

    StartTangents(const point2d& a, const point2d& b, const point2d& c) noexcept
        : ab(Cross(a, b)), ac(Cross(a, c)), bc(Cross(b, c))
    {}

    [[nodiscard]] bool AreReal() const noexcept
    {
        return 2.0 * ac * (2.0 * ac) >= 4.0 * ab * bc;
    }

    /// The two roots, unordered.
    void Solve(double& minus, double& plus) const noexcept
    {
        const double h = 0.5 / ab;
        const double s = std::sqrt(2.0 * ac * (2.0 * ac) - 4.0 * ab * bc);
        minus = h * (-2.0 * ac - s);
        plus = h * (s - 2.0 * ac);
    }
};

/// Whether 3*AB*t^2 + 3*AC*t + BC has no real root.
bool HasNoInflections(const StartTangents& k) noexcept
{
    return 3.0 * k.ac * (3.0 * k.ac) < 12.0 * k.ab * k.bc;
}

StartTangents ReversedTangents(const point2d* bezier, const point2d& a) noexcept
{
    const point2d reversed[4] = {bezier[3], bezier[2], bezier[1], bezier[0]};
    const PowerForm f = ToPowerForm(reversed);
    return {{-a.x, -a.y}, f.b, f.c};
}

void ClampToUnit(double& t) noexcept
{
    if (t < 0.0)
        t = 0.0;
    else if (t > 1.0)
        t = 1.0;
}

/// Cuts a range to [0, 1] and puts its ends in ascending order.
void CutToUnit(double& start, double& end) noexcept
{
    ClampToUnit(start);
    ClampToUnit(end);
    if (start > end)
        std::swap(start, end);
}

/// The first crossing that halving two curves against each other finds.
///
/// @param[out] parameter on the first curve
/// @param[out] point     on the first curve
/// @return whether there is one; if not, the results are untouched
bool FindFirstCrossing(const point2d* first, const point2d* second, double& parameter, point2d& point) noexcept
{
    double parameters[BezierOld::maxIntersections];
    double xs[BezierOld::maxIntersections];
    double ys[BezierOld::maxIntersections];
    int count = 0;
    if (BezierOld::BezierIntersectionEx(first, 0.0, 1.0, second, 0.0, 1.0, parameters, xs, ys, count, 0) < 1)
        return false;
    parameter = parameters[0];
    point = {xs[0], ys[0]};
    return true;
}

double DistanceSquared(const point2d& p, const point2d& q) noexcept
{
    return LengthSquared(p - q);
}

/// Whether p lies in the box, ends included. The y limits may stand in either order, as a negative growth leaves them.
bool IsInBox(const point2d& p, const BoundsT<double>& box) noexcept
{
    const auto [low, high] = std::minmax(box.bottom, box.top);
    return box.left <= p.x && p.x <= box.right && low <= p.y && p.y <= high;
}

/// Whether the foot of p falls on the segment, less than the distance away.
bool IsFootWithin(const point2d& p, const point2d& start, const point2d& end, double distanceSquared) noexcept
{
    const vector2d along = end - start;
    const double lengthSquared = LengthSquared(along);
    if (!(lengthSquared > 0.0))
        return false;
    const double s = Dot(p - start, along) / lengthSquared;
    return 0.0 <= s && s <= 1.0 && DistanceSquared(start + along * s, p) < distanceSquared;
}

/// Whether the nearest stationary point of the curve is less than the distance away.
bool IsClosestPointWithin(const PowerForm& f, const point2d& q, double distanceSquared) noexcept
{
    double t = 0.0;
    point2d point{};
    double closestSquared = 0.0;
    return FindClosestPointOnBezier(f.a, f.b, f.c, f.d, q, t, point, closestSquared) &&
           closestSquared < distanceSquared;
}

} // namespace

bool DoesBezierSelfIntersect(const point2d* bezier, double& lateStart, double& lateEnd, double& earlyStart,
                             double& earlyEnd, bool allowClosed) noexcept
{
    if (!allowClosed && IsNearEqual(bezier[0], bezier[3]))
        return false;
    const PowerForm f = ToPowerForm(bezier);
    const StartTangents forward(f.a, f.b, f.c);
    const StartTangents backward = ReversedTangents(bezier, f.a);
    if (!HasNoInflections(forward))
        return false;
    if (forward.ab == 0.0 || backward.ab == 0.0)
        return false;
    if (!forward.AreReal() || !backward.AreReal())
        return false;
    forward.Solve(lateStart, lateEnd);
    backward.Solve(earlyStart, earlyEnd);
    earlyStart = 1.0 - earlyStart;
    earlyEnd = 1.0 - earlyEnd;
    if ((lateStart > 1.0 && lateEnd > 1.0) || (earlyStart > 1.0 && earlyEnd > 1.0))
        return false;
    if ((lateStart < 0.0 && lateEnd < 0.0) || (earlyStart < 0.0 && earlyEnd < 0.0))
        return false;
    CutToUnit(lateStart, lateEnd);
    CutToUnit(earlyStart, earlyEnd);
    return true;
}

bool DoesBezierSelfIntersect(const POINT* bezier, double& lateStart, double& lateEnd, double& earlyStart,
                             double& earlyEnd, bool allowClosed) noexcept
{
    return DoesBezierSelfIntersect(ToDoubleCubic(bezier).points, lateStart, lateEnd, earlyStart, earlyEnd, allowClosed);
}

bool FindBezierSelfIntersection(const point2d* bezier, double& first, double& second, point2d& point) noexcept
{
    double lateStart = 0.0;
    double lateEnd = 0.0;
    double earlyStart = 0.0;
    double earlyEnd = 0.0;
    if (!DoesBezierSelfIntersect(bezier, lateStart, lateEnd, earlyStart, earlyEnd, true))
        return false;
    if (IsNearEqual(lateStart, lateEnd)) {
        first = 0.0;
        second = IsNearEqual(earlyStart, earlyEnd) ? 1.0 : lateStart;
        point = bezier[0];
        return true;
    }
    if (IsNearEqual(earlyStart, earlyEnd)) {
        first = earlyStart;
        second = 1.0;
        point = bezier[3];
        return true;
    }
    point2d late[4];
    point2d early[4];
    Subsection(lateStart, lateEnd, bezier, late);
    Subsection(earlyStart, earlyEnd, bezier, early);
    double parameter = 0.0;
    if (!FindFirstCrossing(late, early, parameter, point))
        return false;
    first = lateStart + (lateEnd - lateStart) * parameter;
    point2d onEarly{};
    if (!FindFirstCrossing(early, late, parameter, onEarly))
        return false;
    second = earlyStart + (earlyEnd - earlyStart) * parameter;
    return true;
}

bool FindBezierSelfIntersection(const POINT* bezier, double& first, double& second, point2d& point) noexcept
{
    return FindBezierSelfIntersection(ToDoubleCubic(bezier).points, first, second, point);
}

bool DoBeziersIntersect(const point2d* one, const point2d* other)
{
    if (one[0] == other[0] || one[3] == other[0] || one[0] == other[3] || one[3] == other[3])
        return true;
    std::vector<double> oneParameters;
    std::vector<double> otherParameters;
    std::vector<point2d> points;
    FindBezierIntersections(one, other, oneParameters, otherParameters, points);
    return !oneParameters.empty();
}

bool DoBeziersIntersect(const POINT* one, const POINT* other)
{
    return DoBeziersIntersect(ToDoubleCubic(one).points, ToDoubleCubic(other).points);
}

bool DoesFatlineIntersectBezier(const point2d* bezier, const point2d& lineStart, const point2d& lineEnd,
                                double halfWidth) noexcept
{
    const double distanceSquared = halfWidth * halfWidth;
    BoundsT<double> box = GetPointsBBox(bezier, 4);
    box.left -= halfWidth;
    box.right += halfWidth;
    box.top += halfWidth;
    box.bottom -= halfWidth;
    if (!IsInBox(lineStart, box) && !IsInBox(lineEnd, box))
        return false;

    for (const point2d& lineTip : {lineStart, lineEnd})
        for (const point2d& curveTip : {bezier[0], bezier[3]})
            if (DistanceSquared(curveTip, lineTip) < distanceSquared)
                return true;
    for (const point2d& curveTip : {bezier[0], bezier[3]})
        if (IsFootWithin(curveTip, lineStart, lineEnd, distanceSquared))
            return true;
    const point2d line[2] = {lineStart, lineEnd};
    if (DoesBezierIntersectLineSegment(bezier, line))
        return true;
    const PowerForm f = ToPowerForm(bezier);
    return IsClosestPointWithin(f, lineStart, distanceSquared) || IsClosestPointWithin(f, lineEnd, distanceSquared);
}

} // namespace ZarnMath::CubicBezier
