/// @file
/// A cubic against itself, and the search by halving that it is made of.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

/// A parameter of a crossing is read off a chord, where rounding can carry it past an end.
bool IsAboutInUnit(double t) noexcept
{
    constexpr double rounding = 1e-6;
    return -rounding <= t && t <= 1.0 + rounding;
}

bool AreOrdinary(const point2d* curve) noexcept
{
    return Fuzzing::AreOrdinary(curve, 4);
}

bool AreOrdinary(const POINT*) noexcept
{
    return true;
}

template <typename P>
void CheckLoop(const P* curve, bool allowClosed)
{
    double lateStart = guard<double>;
    double lateEnd = guard<double>;
    double earlyStart = guard<double>;
    double earlyEnd = guard<double>;
    const bool crosses = Bounded("DoesBezierSelfIntersect", [&] {
        return DoesBezierSelfIntersect(curve, lateStart, lateEnd, earlyStart, earlyEnd, allowClosed);
    });
    if (crosses)
        Require(0.0 <= lateStart && lateStart <= lateEnd && lateEnd <= 1.0 && 0.0 <= earlyStart &&
                    earlyStart <= earlyEnd && earlyEnd <= 1.0,
                "both stretches ascend within the unit interval");

    double first = guard<double>;
    double second = guard<double>;
    point2d point = guard<point2d>;
    if (Bounded("FindBezierSelfIntersection",
                [&] { return FindBezierSelfIntersection(curve, first, second, point); })) {
        Require(DoesBezierSelfIntersect(curve, lateStart, lateEnd, earlyStart, earlyEnd, true),
                "a crossing is found only where there is one");
        if (AreOrdinary(curve))
            Require(IsAboutInUnit(first) && IsAboutInUnit(second), "both passes are on the curve");
    }
}

void CheckHalving(const Cubic& one, const Cubic& other, int initialCount, int depth)
{
    using namespace BezierOld;
    Guarded<double, maxIntersections> parameters;
    Guarded<double, maxIntersections> xs;
    Guarded<double, maxIntersections> ys;
    for (int i = 0; i < initialCount; ++i)
        parameters.data()[i] = xs.data()[i] = ys.data()[i] = i;
    int count = initialCount;
    const int returned = Bounded("BezierIntersectionEx", [&] {
        return BezierIntersectionEx(one.points, 0.0, 1.0, other.points, 0.0, 1.0, parameters.data(), xs.data(),
                                    ys.data(), count, depth);
    });
    Require(returned == count && initialCount <= count && count <= maxIntersections, "at most nine crossings");
    Require(parameters.IsUntouchedFrom(count) && xs.IsUntouchedFrom(count) && ys.IsUntouchedFrom(count),
            "no more is written than the count says");
    for (int i = 0; i < initialCount; ++i)
        Require(parameters[i] == i && xs[i] == i && ys[i] == i, "crossings are appended");
    if (AreOrdinary(one.points) && AreOrdinary(other.points))
        for (int i = initialCount; i < count; ++i)
            Require(IsAboutInUnit(parameters[i]) && IsFinite(xs[i]) && IsFinite(ys[i]), "on the first curve");
}

} // namespace

void FuzzSelfIntersection(Input& input)
{
    const bool allowClosed = input.Flag();
    const Cubic curve = input.Curve();
    CheckLoop(curve.points, allowClosed);
    CheckLoop(input.IntegerCurve().points, allowClosed);
    const int initialCount = input.Flag() ? 0 : input.Choice(BezierOld::maxIntersections + 1);
    const int depth = input.Flag() ? 0 : input.Choice(12);
    CheckHalving(curve, input.Curve(), initialCount, depth);
}

} // namespace ZarnMath::Fuzzing
