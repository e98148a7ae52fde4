/// @file
/// What the tests of crossings measure on curves and lines.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"
#include "tests/Random.h"

#include <algorithm>
#include <cmath>

namespace ZarnMath::CubicBezier {

inline double Distance(const point2d& p, const point2d& q)
{
    return std::sqrt(LengthSquared(p - q));
}

/// The largest coordinate.
inline double Size(const Cubic& c)
{
    double size = 0.0;
    for (const point2d& p : c)
        size = std::max({size, std::fabs(p.x), std::fabs(p.y)});
    return size;
}

inline point2d At(const Cubic& c, double t)
{
    return Evaluate(ToPowerForm(c.data()), t);
}

inline bool IsInUnit(double t)
{
    return 0.0 <= t && t <= 1.0;
}

/// A line through the curve's surroundings.
inline std::array<point2d, 2> AnyLine(RandomSource& random, double extent)
{
    const point2d from = random.Point(extent);
    return {from, random.Point(extent)};
}

/// Whether the crossings are those of a quadratic whose leading coefficient is within the root finder's absolute 1e-09,
/// which takes it for linear: a curve of less than about 1e-4 units without a cubic term across the line, or with its
/// start on it.
inline bool IsTakenForLinear(const Cubic& curve, const std::array<point2d, 2>& line)
{
    const PowerForm f = ToPowerForm(curve.data());
    const vector2d along = line[1] - line[0];
    const double cubic = Cross(f.a, along);
    if (cubic == 0.0)
        return std::fabs(Cross(f.b, along)) <= 1e-9;
    return Cross(f.d - line[0], along) == 0.0 && std::fabs(cubic) <= 1e-9;
}

} // namespace ZarnMath::CubicBezier
