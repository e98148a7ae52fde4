/// @file
/// The curves, lines and points that the census asks about.
#pragma once

#include "tests/Random.h"
#include "tests/census/Tally.h"

#include <cmath>

namespace ZarnMath::Census {

/// Cases of ordinary size, 16 to 16384 units.
class CaseSource
{
public:
    CaseSource(std::uint64_t seed, Placement where) : random(seed), placement(where) {}

    /// Starts a case: fixes the size of all that is drawn for it.
    void Next()
    {
        extent = std::exp2(random.Integer(4, 13)) * (placement == Placement::Free ? random.Uniform(1.0, 2.0) : 1.0);
    }

    [[nodiscard]] double Extent() const
    {
        return extent;
    }

    Cubic Curve()
    {
        if (placement == Placement::Free)
            return random.Curve(random.AnyShape(), extent);
        const int kind = random.Integer(0, 7);
        if (kind == 0)
            return Raised();
        return kind % 2 == 0 ? Symmetric() : random.Curve(Shape::Grid, extent);
    }

    /// A point in the curves' surroundings; on a grid of half their steps.
    point2d Point()
    {
        if (placement == Placement::Free)
            return random.Point(extent);
        return OnGrid(2.0);
    }

private:
    /// A point of a grid of 8*fineness steps to each side.
    point2d OnGrid(double fineness)
    {
        const int steps = static_cast<int>(8.0 * fineness);
        const double step = extent / 8.0 / fineness;
        const double x = random.Integer(-steps, steps);
        return {x * step, random.Integer(-steps, steps) * step};
    }

    /// A grid curve that a vertical line, or a turn by 180 degrees, carries to itself.
    Cubic Symmetric()
    {
        const point2d start = OnGrid(1.0);
        const point2d handle = OnGrid(1.0);
        const double axis = OnGrid(2.0).x;
        if (random.Integer(0, 1) == 0)
            return {start, handle, {2.0 * axis - handle.x, handle.y}, {2.0 * axis - start.x, start.y}};
        const double height = OnGrid(2.0).y;
        return {start,
                handle,
                {2.0 * axis - handle.x, 2.0 * height - handle.y},
                {2.0 * axis - start.x, 2.0 * height - start.y}};
    }

    /// A parabola raised to a cubic, exactly.
    Cubic Raised()
    {
        const auto third = [this] {
            const point2d p = OnGrid(1.0);
            return vector2d{p.x * 0.25, p.y * 0.25};
        };
        const vector2d start = third();
        const vector2d corner = third();
        const vector2d end = third();
        return {AsPoint(start * 3.0), AsPoint(start + corner * 2.0), AsPoint(corner * 2.0 + end), AsPoint(end * 3.0)};
    }

    RandomSource random;
    Placement placement;
    double extent = 0.0;
};

} // namespace ZarnMath::Census
