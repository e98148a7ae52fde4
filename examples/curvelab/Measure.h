/// @file
/// Measurements that the library has no part in: what its answers are compared with.
#pragma once

#include "Cubic.h"

#include <vector>

namespace curvelab {

/// How many chords stand for a curve where it is measured by its polyline. Of a quarter circle they are too short by
/// 6.1e-9 of its length.
inline constexpr int fineChords = 4096;

[[nodiscard]] double Distance(const point2d& p, const point2d& q);

/// The derivative of P(t).
[[nodiscard]] ZarnMath::vector2d DerivativeAt(const PowerForm& p, double t);

/// The points of a curve at equal steps of the parameter; the first and the last are its ends exactly.
///
/// @param chords how many steps
/// @return one point more
[[nodiscard]] std::vector<point2d> Sampled(const Cubic& curve, int chords);

[[nodiscard]] double LengthOf(const std::vector<point2d>& polyline);

/// The area of a closed polygon, positive for a clockwise one as in the library.
///
/// @param polygon its corners, the first one not repeated, or repeated
[[nodiscard]] double AreaOf(const std::vector<point2d>& polygon);

/// The larger side of a box.
[[nodiscard]] double LargerSide(const Bounds& box);

/// The corners of a box, the first one repeated.
[[nodiscard]] std::vector<point2d> Outline(const Bounds& box);

} // namespace curvelab
