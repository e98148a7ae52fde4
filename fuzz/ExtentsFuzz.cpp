/// @file
/// Directions and extents of a cubic, and the cusps of its offset.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/BezierToLinesInternal.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

bool AscendsInside(const Appended<double>& parameters) noexcept
{
    for (int i = 0; i < parameters.Count(); ++i)
        if (!IsInside(parameters[i]) || (i > 0 && !(parameters[i - 1] <= parameters[i])))
            return false;
    return true;
}

void CheckDirections(const Cubic& curve, const vector2d& direction)
{
    Appended<double> vertical;
    Bounded("GetVerticalTangents", [&] { GetVerticalTangents(curve.a, curve.b, curve.c, vertical.Vector()); });
    Require(vertical.IsAppended() && vertical.Count() <= 2 && AscendsInside(vertical), "two ascending parameters");
    Appended<double> horizontal;
    GetHorizontalTangents(curve.a, curve.b, curve.c, horizontal.Vector());
    Require(horizontal.IsAppended() && horizontal.Count() <= 2 && AscendsInside(horizontal),
            "two ascending parameters");

    Appended<double> parallels;
    bool allParallel = false;
    Bounded("GetParallels",
            [&] { GetParallels(curve.a, curve.b, curve.c, direction, parallels.Vector(), allParallel); });
    Require(parallels.IsAppended() && parallels.Count() <= (allParallel ? 0 : 2), "two parameters, or everywhere");
    for (int i = 0; i < parallels.Count(); ++i)
        Require(IsInUnit(parallels[i]) && (i == 0 || parallels[i - 1] <= parallels[i]), "ascending, on the curve");
    GetParallels(curve.a, curve.b, curve.c, {0.0, 0.0}, parallels.Vector(), allParallel);
    if (AreOrdinary(curve.points, 4))
        Require(allParallel, "everything is parallel to the zero vector");
}

void CheckBoxes(const Cubic& curve)
{
    double minX = guard<double>;
    double minY = guard<double>;
    double maxX = guard<double>;
    double maxY = guard<double>;
    Bounded("GetTightBounds", [&] { GetTightBounds(curve.a, curve.b, curve.c, curve.d, minX, minY, maxX, maxY); });
    Require(!(minX > maxX) && !(minY > maxY), "a box is no less than a point");
    int left = guard<int>;
    int bottom = guard<int>;
    int right = guard<int>;
    int top = guard<int>;
    Bounded("GetLooseBounds", [&] { GetLooseBounds(curve.points, left, bottom, right, top); });
    if (!AreOrdinary(curve.points, 4))
        return;
    Require(left <= right && bottom <= top, "the loose box is no less than a point");
    for (const point2d& p : curve.points)
        Require(left <= p.x && p.x <= right && bottom <= p.y && p.y <= top, "it encloses the control points");
    constexpr double rounding = 1e-6; // of coordinates up to a million
    Require(left <= minX + rounding && maxX - rounding <= right && bottom <= minY + rounding && maxY - rounding <= top,
            "and the tight box");
}

void CheckCusps(const Cubic& curve, double distance)
{
    Guarded<double, 13> all;
    const int count = Bounded("FindAllOffsetCusp",
                              [&] { return FindAllOffsetCusp(curve.a, curve.b, curve.c, distance, all.data()); });
    Require(0 <= count && count <= 12, "at most twelve cusps");
    Require(all.IsUntouchedFrom(std::max(count, 1)), "no more is written than the count says");

    std::vector<double> cusps{7.0};
    const bool found =
        Bounded("FindOffsetCusps", [&] { return FindOffsetCusps(curve.a, curve.b, curve.c, distance, cusps); });
    Require(found == !cusps.empty() && cusps.size() <= static_cast<std::size_t>(count),
            "the vector is cleared, and holds some of all cusps");
    if (distance == 0.0)
        Require(!found, "the curve itself has no cusps as its own offset");
}

} // namespace

void FuzzExtents(Input& input)
{
    const Cubic curve = input.Curve();
    CheckDirections(curve, input.Vector());
    CheckBoxes(curve);
    CheckCusps(curve, input.Double());
    const double area =
        Bounded("GetAreaUnderBezier", [&] { return GetAreaUnderBezier(curve.a, curve.b, curve.c, curve.d); });
    const double t = input.Parameter();
    const double offset = input.Double();
    const double scale = input.Double();
    const point2d mapped = Bounded("MapToBezier", [&] { return MapToBezier(curve.points, t, offset, scale); });
    if (AreOrdinary(curve.points, 4) && IsInUnit(t) && IsOrdinary(offset) && IsOrdinary(scale))
        Require(IsFinite(area) && IsFinite(mapped), "an ordinary curve has a finite area and finite offsets");
}

} // namespace ZarnMath::Fuzzing
