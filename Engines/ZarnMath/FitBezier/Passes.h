/// @file
/// What the iterating fits share: the range of the parameters, and which pass counts. Internal.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <limits>

namespace ZarnMath {

/// The error of a fit that could not be made.
inline constexpr double noFit = std::numeric_limits<double>::max();

/// No error is below it.
inline constexpr double noThreshold = -1.0;

/// Shifts and scales parameters to run from 0 to 1. The ends are set to these very values, which is what pins them when
/// the points are given new parameters.
inline void NormalizeParameters(double* u, int count) noexcept
{
    const double first = u[0];
    const double last = u[count - 1];
    u[0] = 0.0;
    if (count >= 3) {
        const double scale = 1.0 / (last - first);
        for (int i = 1; i < count - 1; ++i)
            u[i] = scale * (u[i] - first);
    }
    u[count - 1] = 1.0;
}

/// What a pass made of its curve.
struct PassResult
{
    bool isSound; ///< solved without a repair
    double error;
};

/// Makes passes and keeps the best curve.
///
/// @param iterations  the largest number of passes
/// @param best        an error known from before, which any first pass replaces
/// @param threshold   a pass that counts with an error below it ends the fit
/// @param[in,out] fit the curve that the first pass starts from, and the best one afterwards
/// @param pass        makes the next curve out of the last one, whether or not that counted: PassResult(Curve&)
/// @return the error of the best curve, or `best` where there was no pass
template <typename Curve, typename Pass>
double KeepBestPass(int iterations, double best, double threshold, Curve& fit, Pass pass)
{
    Curve trial = fit;
    for (int i = 0; i < iterations; ++i) {
        const auto [isSound, error] = pass(trial);
        if (i == 0 || (isSound && error < best)) {
            fit = trial;
            best = error;
            if (error < threshold)
                break;
        } else if (error > best + best) {
            break;
        }
    }
    return best;
}

} // namespace ZarnMath
