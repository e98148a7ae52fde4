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

/// Whether all control points are one.
[[nodiscard]] bool IsPoint(const Cubic& curve);

/// The unit vector along a curve's start, from its first control point that lies elsewhere; (0, 0) for a point.
[[nodiscard]] ZarnMath::vector2d StartDirection(const Cubic& curve);

/// The unit vector along a curve's end, in the direction of travel.
[[nodiscard]] ZarnMath::vector2d EndDirection(const Cubic& curve);

/// By how much the direction turns from the end of one curve to the start of the next.
///
/// @return degrees, from 0 to 180
[[nodiscard]] double TurnBetween(const Cubic& before, const Cubic& after);

/// The curve at a signed distance from a cubic, positive to the left, which is asked how far points are from it. With a
/// distance of 0 it is the cubic.
class Track
{
public:
    Track(const Cubic& curve, double distance);

    [[nodiscard]] point2d PointAt(double t) const;

    /// The points at equal steps of the parameter, one more than there are chords.
    [[nodiscard]] std::vector<point2d> Stretch(int chords) const;

    /// How far a point is away: from the nearest of 128 samples, and on by Newton's method to the foot of the normal.
    [[nodiscard]] double Distance(const point2d& q) const;

private:
    [[nodiscard]] double Foot(const point2d& q, double from, double to) const;

    PowerForm p_;
    double distance_;
    std::vector<point2d> samples_;
};

/// The larger side of a box.
[[nodiscard]] double LargerSide(const Bounds& box);

/// The corners of a box, the first one repeated.
[[nodiscard]] std::vector<point2d> Outline(const Bounds& box);

} // namespace curvelab
