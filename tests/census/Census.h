/// @file
/// One census for each family: what a search by brute force finds and the library does not, by cause.
#pragma once

#include "tests/census/Tally.h"

#include <cmath>

namespace ZarnMath::Census {

/// Whether a parameter is where the root finder's subdivision may cut, a multiple of 1/1024, as well as brute force can
/// tell.
inline bool IsOnACut(double t)
{
    return std::fabs(t * 1024.0 - std::round(t * 1024.0)) < 1e-4;
}

Tally CountCurveCurve(std::uint64_t seed, int cases);
Tally CountCurveLine(std::uint64_t seed, int cases);
Tally CountSelfIntersection(std::uint64_t seed, int cases);
Tally CountClosestPoint(std::uint64_t seed, int cases);

} // namespace ZarnMath::Census
