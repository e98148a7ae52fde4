/// @file
/// The power form of a cubic, P(t) = a*t^3 + b*t^2 + c*t + d: the one conversion and the one evaluation that all of the
/// library shares, and those of its derivatives. Internal.
#pragma once

#include "ZarnMath/ValueTypesInternal.h"

namespace ZarnMath::CubicBezier {

/// The coefficients of P(t). They are carried as points, as in the signatures of the exported functions.
struct PowerForm
{
    point2d a;
    point2d b;
    point2d c;
    point2d d;
};

/// The power form of four control points.
///
/// @param p four control points; of integer points the differences P2 - P1 and P1 - P0 are taken in 32 bits
template <typename P>
[[nodiscard]] constexpr PowerForm ToPowerForm(const P* p) noexcept
{
    const vector2d p0 = AsVector(ToPoint2d(p[0]));
    const vector2d p1 = AsVector(ToPoint2d(p[1]));
    const vector2d p2 = AsVector(ToPoint2d(p[2]));
    const vector2d p3 = AsVector(ToPoint2d(p[3]));
    return {
        AsPoint(p3 - Difference(p[2], p[1]) * 3.0 - p0),
        AsPoint((p0 + (p2 - (p1 + p1))) * 3.0),
        AsPoint(Difference(p[1], p[0]) * 3.0),
        AsPoint(p0),
    };
}

/// P(t) by Horner's rule, ((a*t + b)*t + c)*t + d.
[[nodiscard]] constexpr point2d Evaluate(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                         double t) noexcept
{
    return {((a.x * t + b.x) * t + c.x) * t + d.x, ((a.y * t + b.y) * t + c.y) * t + d.y};
}

/// P(t) by Horner's rule.
[[nodiscard]] constexpr point2d Evaluate(const PowerForm& f, double t) noexcept
{
    return Evaluate(f.a, f.b, f.c, f.d, t);
}

/// The coefficients of P'(t) = u*t^2 + v*t + w.
struct DerivativeForm
{
    vector2d u;
    vector2d v;
    vector2d w;
};

/// u = 3a, v = b + b, w = c.
[[nodiscard]] constexpr DerivativeForm ToDerivativeForm(const point2d& a, const point2d& b, const point2d& c) noexcept
{
    return {AsVector(a) * 3.0, AsVector(b) + AsVector(b), AsVector(c)};
}

/// P'(t), as (3a*t + 2b)*t + c with 2b as b + b. Sums commute to the bit, so this is c + (3a*t + 2b)*t as well.
[[nodiscard]] constexpr vector2d Derivative(const point2d& a, const point2d& b, const point2d& c, double t) noexcept
{
    const auto [u, v, w] = ToDerivativeForm(a, b, c);
    return (u * t + v) * t + w;
}

/// P''(t), as 6a*t + 2b with 2b as b + b.
[[nodiscard]] constexpr vector2d SecondDerivative(const point2d& a, const point2d& b, double t) noexcept
{
    return AsVector(a) * 6.0 * t + (AsVector(b) + AsVector(b));
}

} // namespace ZarnMath::CubicBezier
