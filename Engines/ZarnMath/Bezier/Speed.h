/// @file
/// Powers of a cubic's speed |P'(t)| as polynomials in t. Internal.
#pragma once

#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/Bezier/PowerForm.h"

namespace ZarnMath::CubicBezier {

/// |P'(t)|^2
[[nodiscard]] constexpr Polynomial<4> SquaredSpeed(const DerivativeForm& f) noexcept
{
    return {{
        Dot(f.u, f.u),
        2.0 * Dot(f.u, f.v),
        Dot(f.v, f.v) + 2.0 * Dot(f.u, f.w),
        2.0 * Dot(f.v, f.w),
        Dot(f.w, f.w),
    }};
}

/// |P'(t)|^6, the square of the denominator of curvature.
[[nodiscard]] constexpr Polynomial<12> SpeedToTheSixth(const DerivativeForm& f) noexcept
{
    const Polynomial<4> s = SquaredSpeed(f);
    return s * Square(s);
}

} // namespace ZarnMath::CubicBezier
