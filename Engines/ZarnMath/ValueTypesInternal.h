/// @file
/// Integer arithmetic that wraps, rounding outward, and the difference of points as control polygons need it. Internal.
#pragma once

#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// a + b modulo 2^32: signed overflow would be undefined.
[[nodiscard]] constexpr std::int32_t WrappingAdd(std::int32_t a, std::int32_t b) noexcept
{
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) + static_cast<std::uint32_t>(b));
}

/// a - b modulo 2^32.
[[nodiscard]] constexpr std::int32_t WrappingSubtract(std::int32_t a, std::int32_t b) noexcept
{
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) - static_cast<std::uint32_t>(b));
}

/// a * b modulo 2^32.
[[nodiscard]] constexpr std::int32_t WrappingMultiply(std::int32_t a, std::int32_t b) noexcept
{
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) * static_cast<std::uint32_t>(b));
}

/// The least integer that is not below v, by `RoundToInt`, which saturates: that of std::ceil(v), without a call.
[[nodiscard]] constexpr std::int32_t CeilToInt(double v) noexcept
{
    const std::int32_t whole = TruncateToInt(v);
    return whole < v && whole != std::numeric_limits<std::int32_t>::max() ? whole + 1 : whole;
}

/// The greatest integer that is not above v, in the same way.
[[nodiscard]] constexpr std::int32_t FloorToInt(double v) noexcept
{
    const std::int32_t whole = TruncateToInt(v);
    return whole > v && whole != std::numeric_limits<std::int32_t>::min() ? whole - 1 : whole;
}

/// The integer box that encloses another one: maxima go up, minima down.
[[nodiscard]] constexpr RECT RoundOutward(const BoundsT<double>& box) noexcept
{
    return {FloorToInt(box.left), CeilToInt(box.top), CeilToInt(box.right), FloorToInt(box.bottom)};
}

/// a - b in double.
[[nodiscard]] constexpr vector2d Difference(const point2d& a, const point2d& b) noexcept
{
    return a - b;
}

/// a - b, taken in 32 bits, where it wraps, and converted afterwards.
[[nodiscard]] constexpr vector2d Difference(const POINT& a, const POINT& b) noexcept
{
    return {static_cast<double>(WrappingSubtract(a.x, b.x)), static_cast<double>(WrappingSubtract(a.y, b.y))};
}

/// An integer cubic in double precision, exactly.
[[nodiscard]] constexpr CubicBezier::bezier2dT<point2d> ToDoubleCubic(const POINT* p) noexcept
{
    return {{ToPoint2d(p[0]), ToPoint2d(p[1]), ToPoint2d(p[2]), ToPoint2d(p[3])}};
}

} // namespace ZarnMath
