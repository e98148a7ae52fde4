/// @file
/// Runs of points to fit to, and the residuals of what was fitted.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <vector>

namespace ZarnMath {

constexpr double largestDouble = std::numeric_limits<double>::max();

/// B(t) by the Bernstein polynomials, which no fit uses.
inline point2d BernsteinPoint(const point2d* p, double t)
{
    const double s = 1.0 - t;
    const double weights[4] = {s * s * s, 3.0 * s * s * t, 3.0 * s * t * t, t * t * t};
    point2d sum{0.0, 0.0};
    for (int i = 0; i < 4; ++i)
        sum = {sum.x + weights[i] * p[i].x, sum.y + weights[i] * p[i].y};
    return sum;
}

/// The sum of the squared distances of points from the points of a curve at their parameters.
inline double SumOfSquares(const point2d* points, const double* u, int from, int to, const point2d* bezier)
{
    double sum = 0.0;
    for (int i = from; i < to; ++i)
        sum += LengthSquared(points[i] - BernsteinPoint(bezier, u[i]));
    return sum;
}

/// Points with a parameter each.
struct PointRun
{
    std::vector<point2d> points;
    std::vector<double> u;

    [[nodiscard]] int Count() const
    {
        return static_cast<int>(points.size());
    }
};

/// Ascending parameters with the ends 0 and 1.
inline std::vector<double> RandomParameters(RandomSource& random, std::size_t n)
{
    std::vector<double> u{0.0};
    for (std::size_t i = 1; i < n; ++i)
        u.push_back(u.back() + random.Uniform(0.2, 1.0));
    const double last = u.back();
    for (double& v : u)
        v /= last;
    return u;
}

/// Points of a curve at random parameters.
inline PointRun SampledRun(RandomSource& random, const Cubic& curve, std::size_t n)
{
    PointRun run;
    run.u = RandomParameters(random, n);
    for (const double v : run.u)
        run.points.push_back(BernsteinPoint(curve.data(), v));
    return run;
}

/// An arch-like curve that bends one way, at a random place and turn.
inline Cubic RandomArch(RandomSource& random, double extent)
{
    const double angle = random.Uniform(0.0, 6.283185307179586);
    const vector2d along{std::cos(angle) * extent, std::sin(angle) * extent};
    const vector2d across = Perpendicular(along);
    const point2d start = random.Point(extent);
    const double left = random.Uniform(0.1, 0.4);
    const double right = random.Uniform(0.6, 0.9);
    const double rise = random.Uniform(0.2, 0.6);
    return {start, start + along * left + across * rise, start + along * right + across * rise, start + along};
}

/// Points near a curve.
inline PointRun NoisyRun(RandomSource& random, const Cubic& curve, std::size_t n, double noise)
{
    PointRun run = SampledRun(random, curve, n);
    for (point2d& p : run.points)
        p = {p.x + random.Uniform(-noise, noise), p.y + random.Uniform(-noise, noise)};
    return run;
}

/// Points near an arch, with any number from `fewest` to 40.
inline PointRun AnyRun(RandomSource& random, int fewest)
{
    const auto n = static_cast<std::size_t>(random.Integer(fewest, 40));
    const Cubic curve = RandomArch(random, 100.0);
    return NoisyRun(random, curve, n, random.Uniform(0.0, 20.0));
}

inline vector2d RandomTangent(RandomSource& random)
{
    const point2d p = random.Point(2.0);
    return {p.x, p.y};
}

} // namespace ZarnMath
