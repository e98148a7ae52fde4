/// @file
/// The input of the tests that count allocations.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/CountingHeap.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

namespace ZarnMath {

inline constexpr std::uint64_t allocationSeed = 20261212;

/// What one round of calls is given.
struct Input
{
    Cubic curve;
    Cubic other;
    IntegerCubic integerCurve;
    IntegerCubic integerOther;
    std::array<point2d, 2> line;
    std::array<POINT, 2> integerLine;
    point2d point;
    POINT integerPoint;
    double t;
    double distance;

    bool operator==(const Input&) const = default;

    [[nodiscard]] CubicBezier::PowerForm Form() const
    {
        return CubicBezier::ToPowerForm(curve.data());
    }

    [[nodiscard]] point2d PointOnCurve() const
    {
        return Evaluate(Form(), t);
    }
};

inline Input RandomInput(RandomSource& random)
{
    constexpr double extent = 500.0;
    Input in;
    in.curve = random.Curve(random.AnyShape(), extent);
    in.other = random.Curve(random.AnyShape(), extent);
    in.integerCurve = random.IntegerCurve(500);
    in.integerOther = random.IntegerCurve(500);
    in.line = {random.Point(extent), random.Point(extent)};
    in.integerLine = {random.IntegerPoint(500), random.IntegerPoint(500)};
    in.point = random.Point(extent);
    in.integerPoint = random.IntegerPoint(500);
    in.t = random.Uniform(0.0, 1.0);
    in.distance = random.Uniform(-100.0, 100.0);
    return in;
}

/// Calls f(input) on many random inputs, until something fails.
template <typename F>
void ForManyInputs(F f)
{
    RandomSource random(allocationSeed);
    for (int i = 0; i < 1000 && !testing::Test::HasFailure(); ++i) {
        SCOPED_TRACE(i);
        f(RandomInput(random));
    }
}

} // namespace ZarnMath
