/// @file
/// Slow and plain searches that share nothing with the library but the evaluation of a curve.
#pragma once

#include "tests/Random.h"

#include <functional>
#include <optional>
#include <vector>

namespace ZarnMath::Census {

/// A point at which two curves meet.
struct Contact
{
    double s; ///< on the first curve
    double t; ///< on the second
    point2d point;
};

/// All contacts of two curves, their ends included.
///
/// Both curves are halved where the boxes of their control points overlap, down to 2^-12 of the whole, and Newton's
/// method takes each pair that is left to its contact.
///
/// @return nothing where the curves run together along a stretch
std::optional<std::vector<Contact>> FindContacts(const Cubic& first, const Cubic& second);

/// The zeros of a function on [0, 1]: changes of sign between many samples, each narrowed by bisection, and the two
/// ends where it is below the tolerance.
std::vector<double> FindZeros(const std::function<double(double)>& f, double tolerance);

/// The parameter in [0, 1] of the nearest point of a curve: the best of many samples, narrowed by ternary search;
/// exactly 0 or 1 where that end is as near.
double FindNearest(const Cubic& curve, const point2d& q);

} // namespace ZarnMath::Census
