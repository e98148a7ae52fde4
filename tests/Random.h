/// @file
/// Random curves of every shape, the same on every machine: the engine is the standard's, the distributions are ours.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <array>
#include <cmath>
#include <random>

namespace ZarnMath {

template <typename P>
using CubicOf = std::array<P, 4>;
using Cubic = CubicOf<point2d>;
using IntegerCubic = CubicOf<POINT>;

/// What a curve may look like.
enum class Shape
{
    Generic,
    S,
    Loop,
    Cusp,
    Straight,
    Coincident,
    Grid,
    Arc
};

inline constexpr Shape allShapes[] = {Shape::Generic,  Shape::S,          Shape::Loop, Shape::Cusp,
                                      Shape::Straight, Shape::Coincident, Shape::Grid, Shape::Arc};

/// The 15 ways in which four control points can coincide, as the class of each point.
inline constexpr std::array<std::array<int, 4>, 15> partitions = {{
    {0, 0, 0, 0},
    {0, 0, 0, 1},
    {0, 0, 1, 0},
    {0, 0, 1, 1},
    {0, 0, 1, 2},
    {0, 1, 0, 0},
    {0, 1, 0, 1},
    {0, 1, 0, 2},
    {0, 1, 1, 0},
    {0, 1, 1, 1},
    {0, 1, 1, 2},
    {0, 1, 2, 0},
    {0, 1, 2, 1},
    {0, 1, 2, 2},
    {0, 1, 2, 3},
}};

class RandomSource
{
public:
    explicit RandomSource(std::uint64_t seed) : engine(seed) {}

    /// In [low, high).
    double Uniform(double low, double high)
    {
        const double unit = std::ldexp(static_cast<double>(engine() >> 11), -53);
        return low + (high - low) * unit;
    }

    /// From low to high, both included.
    int Integer(int low, int high)
    {
        const auto range = static_cast<std::uint64_t>(static_cast<std::int64_t>(high) - low + 1);
        return static_cast<int>(low + static_cast<std::int64_t>(engine() % range));
    }

    /// From 1e-6 to 1e8, each power of ten as likely as any other.
    double Magnitude()
    {
        return std::pow(10.0, Uniform(-6.0, 8.0));
    }

    point2d Point(double extent)
    {
        const double x = Uniform(-extent, extent);
        return {x, Uniform(-extent, extent)};
    }

    POINT IntegerPoint(int extent)
    {
        const int x = Integer(-extent, extent);
        return {x, Integer(-extent, extent)};
    }

    Shape AnyShape()
    {
        return allShapes[Integer(0, static_cast<int>(std::size(allShapes)) - 1)];
    }

    /// A curve of the given shape, within about `extent` units of the origin.
    Cubic Curve(Shape shape, double extent);

    /// A curve of any shape and size.
    Cubic Curve()
    {
        const Shape shape = AnyShape();
        return Curve(shape, Magnitude());
    }

    IntegerCubic IntegerCurve(int extent)
    {
        IntegerCubic curve;
        for (POINT& p : curve)
            p = IntegerPoint(extent);
        return curve;
    }

private:
    /// A similarity of the unit frame, in which the typical shapes are written down.
    Cubic Placed(const Cubic& unit, double extent);

    std::mt19937_64 engine;
};

inline Cubic RandomSource::Placed(const Cubic& unit, double extent)
{
    const double angle = Uniform(0.0, 6.283185307179586);
    const double scale = extent * Uniform(0.1, 0.5);
    const point2d origin = Point(extent * 0.5);
    const vector2d u = {std::cos(angle) * scale, std::sin(angle) * scale};
    const vector2d v = Perpendicular(u);
    Cubic curve;
    for (std::size_t i = 0; i < 4; ++i)
        curve[i] = origin + (u * unit[i].x + v * unit[i].y);
    return curve;
}

inline Cubic RandomSource::Curve(Shape shape, double extent)
{
    const double r = Uniform(0.2, 1.0);
    switch (shape) {
    case Shape::S:
        return Placed({{{0, 0}, {r, 1}, {1 - r, -1}, {1, 0}}}, extent);
    case Shape::Loop:
        return Placed({{{0, 0}, {1.5 + r, 1}, {-0.5 - r, 1}, {1, 0}}}, extent);
    case Shape::Cusp:
        return Placed({{{0, 0}, {1, r}, {0, r}, {1, 0}}}, extent);
    case Shape::Straight:
        return Placed({{{0, 0}, {r, 0}, {Uniform(-0.5, 1.5), 0}, {1, 0}}}, extent);
    case Shape::Arc:
        return Placed({{{1, 0}, {1, 0.5522847498307936}, {0.5522847498307936, 1}, {0, 1}}}, extent);
    case Shape::Coincident: {
        const auto& classes = partitions[static_cast<std::size_t>(Integer(0, 14))];
        const Cubic distinct = Curve(Shape::Generic, extent);
        Cubic curve;
        for (std::size_t i = 0; i < 4; ++i)
            curve[i] = distinct[static_cast<std::size_t>(classes[i])];
        return curve;
    }
    case Shape::Grid: {
        const double step = std::exp2(std::floor(std::log2(extent)) - 3.0);
        Cubic curve;
        for (point2d& p : curve) {
            const double x = Integer(-8, 8);
            p = {x * step, Integer(-8, 8) * step};
        }
        return curve;
    }
    case Shape::Generic:
        break;
    }
    Cubic curve;
    for (point2d& p : curve)
        p = Point(extent);
    return curve;
}

} // namespace ZarnMath
