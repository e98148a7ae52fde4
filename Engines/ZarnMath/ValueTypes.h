/// @file
/// The plain values that every entry point passes around, and the comparison and rounding rules that all of them share.
///
/// The plane has y growing upward; positive angles turn counter-clockwise.
///
/// @code
///        y
///        ^      top                 Cross(u, v) > 0:  v lies to the left of u
///        |   +-------+              Perpendicular(u): u turned a quarter to the left
///   left |   |       | right
///        |   +-------+
///        |     bottom
///        +------------------> x
/// @endcode
///
/// All arithmetic is IEEE 754, one rounding per operation: the grouping that a formula shows is the order in which it is
/// evaluated. Everything here is in the arithmetic class: the same bits on every machine.
#pragma once

#include "Framework/common_types/common_types.h"

#include <cfloat>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <type_traits>

#ifdef __FAST_MATH__
#error "Options that relax IEEE 754, such as -ffast-math, change results."
#endif

namespace ZarnMath {

static_assert(std::numeric_limits<double>::is_iec559 && std::numeric_limits<float>::is_iec559);
static_assert(FLT_EVAL_METHOD == 0, "A processor that computes with more digits rounds twice: 32-bit x86 needs "
                                    "-msse2 -mfpmath=sse.");

using Framework::common_types::POINT;
using Framework::common_types::RECT;
using Framework::common_types::SIZE;

/// A pair of coordinates; `IsPosition` separates positions from displacements and changes no field.
template <typename T, bool IsPosition>
struct vector2dT
{
    T x; ///< grows to the right
    T y; ///< grows upward

    friend constexpr bool operator==(const vector2dT&, const vector2dT&) noexcept = default;
};

/// A position on the drawing.
using point2d = vector2dT<double, true>;
/// A displacement between positions.
using vector2d = vector2dT<double, false>;

/// Three coordinates, without the distinction of position and displacement.
template <typename T>
struct vector3dT
{
    T x; ///< grows to the right
    T y; ///< grows upward
    T z; ///< the third coordinate

    friend constexpr bool operator==(const vector3dT&, const vector3dT&) noexcept = default;
};

/// A box in the field order of `RECT`. The empty box is inside out and holds the limits of the 32-bit integers, not
/// those of `T`, so that it converts to the empty `RECT` and back.
template <typename T>
struct BoundsT
{
    T left;   ///< smallest x
    T top;    ///< largest y
    T right;  ///< largest x
    T bottom; ///< smallest y

    friend constexpr bool operator==(const BoundsT&, const BoundsT&) noexcept = default;
};

namespace CubicBezier {

/// A cubic segment as a value: its four control points in curve order.
template <typename P>
struct bezier2dT
{
    P points[4]; ///< P0 to P3

    /// Control point i, 0 to 3.
    constexpr P& operator[](std::size_t i) noexcept
    {
        return points[i];
    }

    /// Control point i, 0 to 3.
    constexpr const P& operator[](std::size_t i) const noexcept
    {
        return points[i];
    }

    friend constexpr bool operator==(const bezier2dT&, const bezier2dT&) noexcept = default;
};

} // namespace CubicBezier

/// @name Arithmetic, component by component
/// @{

/// The displacement from b to a.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator-(const vector2dT<T, true>& a, const vector2dT<T, true>& b) noexcept
{
    return {a.x - b.x, a.y - b.y};
}

/// The position that v leads to from a.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, true> operator+(const vector2dT<T, true>& a, const vector2dT<T, false>& v) noexcept
{
    return {a.x + v.x, a.y + v.y};
}

/// The position from which v leads to a.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, true> operator-(const vector2dT<T, true>& a, const vector2dT<T, false>& v) noexcept
{
    return {a.x - v.x, a.y - v.y};
}

/// One displacement after the other.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator+(const vector2dT<T, false>& v,
                                                      const vector2dT<T, false>& w) noexcept
{
    return {v.x + w.x, v.y + w.y};
}

/// The displacement that, after w, makes v.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator-(const vector2dT<T, false>& v,
                                                      const vector2dT<T, false>& w) noexcept
{
    return {v.x - w.x, v.y - w.y};
}

/// v, s times as long.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator*(const vector2dT<T, false>& v, std::type_identity_t<T> s) noexcept
{
    return {v.x * s, v.y * s};
}

/// v, s times as long.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator*(std::type_identity_t<T> s, const vector2dT<T, false>& v) noexcept
{
    return {s * v.x, s * v.y};
}

/// Divides each component; a multiplication by the reciprocal would round twice.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> operator/(const vector2dT<T, false>& v, std::type_identity_t<T> s) noexcept
{
    return {v.x / s, v.y / s};
}

/// The displacement with the coordinates of a position: power-form coefficients are carried as points.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> AsVector(const vector2dT<T, true>& p) noexcept
{
    return {p.x, p.y};
}

/// The position with the coordinates of a displacement.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, true> AsPoint(const vector2dT<T, false>& v) noexcept
{
    return {v.x, v.y};
}

/// @}
/// @name Products
/// Points and vectors in any mixture.
/// @{

/// a.x*b.x + a.y*b.y
template <typename T, bool A, bool B>
[[nodiscard]] constexpr T Dot(const vector2dT<T, A>& a, const vector2dT<T, B>& b) noexcept
{
    return a.x * b.x + a.y * b.y;
}

/// a.x*b.y - a.y*b.x: twice the signed area of the triangle 0, a, b, positive where b lies to the left of a.
template <typename T, bool A, bool B>
[[nodiscard]] constexpr T Cross(const vector2dT<T, A>& a, const vector2dT<T, B>& b) noexcept
{
    return a.x * b.y - a.y * b.x;
}

/// a.x*a.x + a.y*a.y
template <typename T, bool A>
[[nodiscard]] constexpr T LengthSquared(const vector2dT<T, A>& a) noexcept
{
    return a.x * a.x + a.y * a.y;
}

/// A quarter turn counter-clockwise: (-a.y, a.x), with the sign of a zero as negation gives it.
template <typename T>
[[nodiscard]] constexpr vector2dT<T, false> Perpendicular(const vector2dT<T, false>& a) noexcept
{
    return {-a.y, a.x};
}

/// @}
/// @name Tolerant comparison
/// `DBL_EPSILON`, 2^-52, is the one tolerance of the library. It is absolute, in drawing units (or their square), never
/// scaled by the operands, and inclusive: a value equal to it counts as zero. NaN is near nothing.
/// @{

/// |x| <= DBL_EPSILON
[[nodiscard]] constexpr bool IsNearZero(double x) noexcept
{
    return (x < 0.0 ? -x : x) <= DBL_EPSILON;
}

/// |a - b| <= DBL_EPSILON. Two equal infinities are not near: their difference is NaN.
[[nodiscard]] constexpr bool IsNearEqual(double a, double b) noexcept
{
    return IsNearZero(a - b);
}

/// Near in each coordinate: a square about the point, not a circle. This is when two control points coincide.
[[nodiscard]] constexpr bool IsNearEqual(const point2d& p, const point2d& q) noexcept
{
    return IsNearEqual(p.x, q.x) && IsNearEqual(p.y, q.y);
}

/// a > b, or near enough.
[[nodiscard]] constexpr bool IsAtLeast(double a, double b) noexcept
{
    return a > b || IsNearEqual(a, b);
}

/// The unit vector along a.
///
/// @return a/|a|; a itself, unchanged and so no unit vector, where |a|^2 <= DBL_EPSILON (|a| below about 1.49e-8).
[[nodiscard]] inline vector2d Normalize(const vector2d& a) noexcept
{
    const double squared = LengthSquared(a);
    if (IsNearZero(squared))
        return a;
    return a / std::sqrt(squared);
}

/// @}
/// @name Between doubles and integers
/// @{

/// Drops the fraction. Outside the 32-bit range the result is the nearer limit, and 0 for NaN.
[[nodiscard]] constexpr std::int32_t TruncateToInt(double v) noexcept
{
    constexpr double smallest = std::numeric_limits<std::int32_t>::min();
    constexpr double largest = std::numeric_limits<std::int32_t>::max();
    const double number = v == v ? v : 0.0;
    const double raised = number < smallest ? smallest : number;
    return static_cast<std::int32_t>(raised > largest ? largest : raised);
}

/// The nearest integer, halves away from zero: adds 0.5 with the sign of v, then truncates.
///
/// The sum is rounded like any other, so that 0.49999999999999994 gives 1. Saturates at the limits of 32 bits; NaN
/// gives 0.
[[nodiscard]] constexpr std::int32_t RoundToInt(double v) noexcept
{
    return TruncateToInt(v + (v < 0.0 ? -0.5 : 0.5));
}

/// Exact.
[[nodiscard]] constexpr point2d ToPoint2d(const POINT& p) noexcept
{
    return {static_cast<double>(p.x), static_cast<double>(p.y)};
}

/// The same point, for code that serves both kinds.
[[nodiscard]] constexpr point2d ToPoint2d(const point2d& p) noexcept
{
    return p;
}

/// `RoundToInt` of each coordinate.
[[nodiscard]] constexpr POINT ToPOINT(const point2d& p) noexcept
{
    return {RoundToInt(p.x), RoundToInt(p.y)};
}

/// Rounds N points.
///
/// @param[out] out N points of the caller, each coordinate by `RoundToInt`
/// @param in       N points
template <int N>
constexpr void point2d2ZGIPOINT(POINT* out, const point2d* in) noexcept
{
    for (int i = 0; i < N; ++i)
        out[i] = ToPOINT(in[i]);
}

/// @}

} // namespace ZarnMath
