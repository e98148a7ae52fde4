/// @file
/// Constants of the angle units, and what the sources of the affine transforms share. Internal.
#pragma once

#include "ZarnMath/WMath.h"

namespace ZarnMath {

/// @name Angle constants, to the last bit
/// @{

inline constexpr double twoPi = 6.283185307179586;               ///< 0x401921FB54442D18
inline constexpr double pi = 3.141592653589793;                  ///< 0x400921FB54442D18
inline constexpr double halfPi = 1.5707963267948966;             ///< 0x3FF921FB54442D18
inline constexpr double threeHalvesPi = 4.71238898038469;        ///< 0x4012D97C7F3321D2
inline constexpr double degreesToRadians = 0.017453292519943295; ///< 0x3F91DF46A2529D39: pi/180, correctly rounded
inline constexpr double radiansToDegrees = 57.29577951308232;    ///< 0x404CA5DC1A63C1F8
inline constexpr double unitsPerDegree = 1000000.0;              ///< 0x412E848000000000

/// 0x3F91DF46A2529CE4: pi/180 cut after 14 digits, which the plain-C family has always used. Its drawings depend on it.
inline constexpr double truncatedDegreesToRadians = 0.017453292519943;

/// 0x3FF8E1A455FBD07C: 89.1 degrees. A shear beyond it is refused by the decomposition.
inline constexpr double largestSkewAngle = 1.5550883635269477;

/// 0x3EB0C6F7A0B5ED8D: how far the two equations of a line of fixed points may differ.
inline constexpr double fixedLineTolerance = 1e-06;

/// @}

/// What every way of making an identity copies.
inline constexpr MATRIX gmIdentityMatrix{1.0, 0.0, 0.0, 0.0, 1.0, 0.0};

/// Sine and cosine of one angle.
struct SineCosine
{
    double sine;
    double cosine;
};

[[nodiscard]] inline SineCosine GetSineCosine(double radians) noexcept
{
    return {std::sin(radians), std::cos(radians)};
}

/// @name The parts of a matrix
/// @{

[[nodiscard]] constexpr vector2d XColumn(const MATRIX& m) noexcept
{
    return {m.m11, m.m21};
}

[[nodiscard]] constexpr vector2d YColumn(const MATRIX& m) noexcept
{
    return {m.m12, m.m22};
}

[[nodiscard]] constexpr vector2d XRow(const MATRIX& m) noexcept
{
    return {m.m11, m.m12};
}

[[nodiscard]] constexpr vector2d YRow(const MATRIX& m) noexcept
{
    return {m.m21, m.m22};
}

[[nodiscard]] constexpr point2d Translation(const MATRIX& m) noexcept
{
    return {m.dx, m.dy};
}

/// Of the linear part.
[[nodiscard]] constexpr double Determinant(const MATRIX& m) noexcept
{
    return m.m11 * m.m22 - m.m21 * m.m12;
}

/// @}

/// The matrix with these columns.
[[nodiscard]] constexpr MATRIX FromColumns(const vector2d& x, const vector2d& y, const point2d& translation) noexcept
{
    return {x.x, y.x, translation.x, x.y, y.y, translation.y};
}

/// m(v), for the inside of loops.
[[nodiscard]] constexpr vector2d Image(const MATRIX& m, const vector2d& v) noexcept
{
    return {m.m11 * v.x + m.m12 * v.y, m.m21 * v.x + m.m22 * v.y};
}

/// m(p), for the inside of loops.
[[nodiscard]] constexpr point2d Image(const MATRIX& m, const point2d& p) noexcept
{
    return {m.dx + (m.m11 * p.x + m.m12 * p.y), m.dy + (m.m21 * p.x + m.m22 * p.y)};
}

/// v turned: (c*x - s*y, s*x + c*y).
[[nodiscard]] constexpr vector2d Turned(const vector2d& v, const SineCosine& angle) noexcept
{
    return {angle.cosine * v.x - angle.sine * v.y, angle.sine * v.x + angle.cosine * v.y};
}

/// Turns everything that a matrix puts out, about the origin.
constexpr void Turn(MATRIX& m, const SineCosine& angle) noexcept
{
    m = FromColumns(Turned(XColumn(m), angle), Turned(YColumn(m), angle),
                    AsPoint(Turned(AsVector(Translation(m)), angle)));
}

} // namespace ZarnMath
