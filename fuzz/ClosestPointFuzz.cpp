/// @file
/// The closest point of a cubic, its side, inversion, and tangents through a point.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

/// The squares of the coordinates neither overflow nor vanish.
bool IsOrdinary(const Cubic& curve, const point2d& q) noexcept
{
    return AreOrdinary(curve.points, 4) && Fuzzing::IsOrdinary(q);
}

void CheckClosest(const Cubic& curve, const point2d& q)
{
    Result<double> t;
    Result<point2d> point;
    Result<double> distanceSquared;
    const bool found = Bounded("FindClosestPointOnBezier", [&] {
        return FindClosestPointOnBezier(curve.a, curve.b, curve.c, curve.d, q, t.value, point.value,
                                        distanceSquared.value);
    });
    if (!found)
        Require(t.IsUntouched() && point.IsUntouched() && distanceSquared.IsUntouched(),
                "without a stationary point nothing is written");
    else if (IsOrdinary(curve, q))
        Require(IsFinite(t.value) && IsFinite(point.value) && distanceSquared.value >= 0.0,
                "the closest point of an ordinary curve is finite");

    double sameT = guard<double>;
    point2d samePoint = guard<point2d>;
    double sameSquared = guard<double>;
    Require(FindClosestPointOnBezier(curve.points, q, sameT, samePoint, sameSquared) == found &&
                IsSame(sameT, t.value) && IsSame(samePoint, point.value) && IsSame(sameSquared, distanceSquared.value),
            "control points give what the power form gives");
}

void CheckSide(const Cubic& curve, const point2d& q)
{
    Result<double> t;
    Result<point2d> point;
    Result<double> distanceSquared;
    constexpr auto noSide = static_cast<Side>(77);
    Side side = noSide;
    const bool found = Bounded("GetSide", [&] {
        return GetSide(curve.a, curve.b, curve.c, curve.d, q, t.value, point.value, distanceSquared.value, side);
    });
    Require(found ? SideNone <= side && side <= SideNegative : side == noSide, "a side, or none is written");
    Require(!found || IsInUnit(t.value), "a side has its parameter in the unit interval");
    // Where every squared distance overflows, the parameter is still what it was before.
    if (distanceSquared.value != std::numeric_limits<double>::max())
        Require(GetSide(curve.a, curve.b, curve.c, curve.d, q) == (found ? side : SideNone), "both forms agree");
}

template <typename P>
void CheckAllClosest(const P* curve, const P& q)
{
    Appended<double> ts;
    Appended<P> points;
    Appended<double> squaredDistances;
    const bool found = Bounded("FindClosestPointsOnBezier", [&] {
        return FindClosestPointsOnBezier(curve, q, ts.Vector(), points.Vector(), squaredDistances.Vector());
    });
    Require(ts.IsAppended() && points.IsAppended() && squaredDistances.IsAppended(), "the vectors are appended to");
    Require(ts.Count() == points.Count() && ts.Count() == squaredDistances.Count(), "the vectors are parallel");
    Require(0 <= ts.Count() && ts.Count() <= 5 && found == (ts.Count() > 0), "at most five points");
}

void CheckIntegers(const POINT* curve, const POINT& q)
{
    Result<double> t;
    Result<POINT> point;
    Result<double> distanceSquared;
    const bool found = FindClosestPointOnBezier(curve, q, t.value, point.value, distanceSquared.value);
    if (!found)
        Require(t.IsUntouched() && point.IsUntouched() && distanceSquared.IsUntouched(),
                "without a stationary point nothing is written");
    const double parameter =
        Bounded("FindClosestPointOnBezier of integers", [&] { return FindClosestPointOnBezier(curve, q); });
    Require(found ? IsSame(parameter, t.value) : parameter == 0.0 || parameter == 1.0,
            "the parameter of the point, or an end");
    Require(IsFinite(parameter), "the parameter on an integer curve is finite");
}

void CheckInversion(const Cubic& curve, const point2d& q)
{
    Result<double> parameter;
    const bool matched =
        Bounded("Invert", [&] { return Invert(curve.a, curve.b, curve.c, curve.d, q, parameter.value); });
    Require(matched ? IsInUnit(parameter.value) : parameter.IsUntouched(), "in the unit interval, or untouched");

    std::vector<double> parameters;
    Require(Invert(curve.a, curve.b, curve.c, curve.d, q, parameters) == matched &&
                parameters.size() == (matched ? 1U : 0U) && (!matched || IsSame(parameters[0], parameter.value)),
            "the form with a vector gives the same");
    Require(Invert(curve.a, curve.b, curve.c, curve.d, q, parameters) == !parameters.empty(),
            "true where there was something before");

    Result<double> t;
    Result<point2d> point;
    Result<double> distanceSquared;
    if (!FindClosestPointOnBezierExtendedRange(curve.a, curve.b, curve.c, curve.d, q, t.value, point.value,
                                               distanceSquared.value))
        Require(t.IsUntouched() && point.IsUntouched() && distanceSquared.IsUntouched() && !matched,
                "without a stationary point nothing is written");
}

void CheckTangents(const Cubic& curve, const point2d& q)
{
    Guarded<double, 5> parameters;
    const int count = Bounded("FindTangentsToPoint", [&] {
        return FindTangentsToPoint(curve.a, curve.b, curve.c, curve.d, q, parameters.data());
    });
    Require(0 <= count && count <= 5, "at most five tangents");
    Require(parameters.IsUntouchedFrom(count > 0 ? count : 1), "no more is written than the count says");
}

} // namespace

void FuzzClosestPoint(Input& input)
{
    const Cubic curve = input.Curve();
    const bool onCurve = input.Flag();
    const point2d q = onCurve ? Evaluate(curve.a, curve.b, curve.c, curve.d, input.Parameter()) : input.Point();
    CheckClosest(curve, q);
    CheckSide(curve, q);
    CheckAllClosest(curve.points, q);
    CheckInversion(curve, q);
    CheckTangents(curve, q);
    const IntegerCubic integers = input.IntegerCurve();
    const POINT target = input.IntegerPoint();
    CheckIntegers(integers.points, target);
    CheckAllClosest(integers.points, target);
}

} // namespace ZarnMath::Fuzzing
