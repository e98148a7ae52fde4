/// @file
/// The sums that the normal equations of all the cubic fits are made of. Internal.
#pragma once

#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// Sums over points with a parameter each, taken in one sweep. Those that a fit does not read cost it nothing: they are
/// local to it, and the compiler leaves them out.
struct Moments
{
    double s[7]{};   ///< s[k]: the sum of the parameters' k-th powers; s[0] is the number of points
    vector2d m[4]{}; ///< m[k]: the sum of the points times the k-th powers

    void Add(double v, const vector2d& p) noexcept
    {
        const double v2 = v * v;
        const double v3 = v2 * v;
        const double v4 = v3 * v;
        const double v5 = v4 * v;
        const double v6 = v5 * v;
        s[0] += 1.0;
        s[1] += v;
        s[2] += v2;
        s[3] += v3;
        s[4] += v4;
        s[5] += v5;
        s[6] += v6;
        m[0] = m[0] + p;
        m[1] = m[1] + p * v;
        m[2] = m[2] + p * v2;
        m[3] = m[3] + p * v3;
    }
};

} // namespace ZarnMath
