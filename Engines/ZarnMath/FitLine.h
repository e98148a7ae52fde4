/// @file
/// A straight line fitted to points by orthogonal least squares.
///
/// The line is the principal axis of the points (Pearson, 1901), so that a vertical line is as good as any other. All
/// functions are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// Fits a line to points.
///
/// The result has one of two forms:
/// - where the mixed moment of the points comes out as exactly 0, `point` is the centroid and `direction` is (1, 0) or
///   (0, 1), along the longer side of their box, and (0, 1) for a square one. So it is for coincident points, and for
///   horizontal and vertical lines as far as no sum is rounded;
/// - otherwise the line is x = point.x + direction.x * y: `point` is its crossing with y = 0, not the centroid, and
///   `direction` is (direction.x, 1), not of unit length. A line that is nearly horizontal gives a huge direction.x.
///
/// @param points         the points
/// @param count          their number; below 2 leaves both results untouched
/// @param[out] point     a point of the line
/// @param[out] direction the direction of the line
/// @arithmetic
ZARNMATH_API void GetLeastSquaresLines(const point2d* points, int count, point2d& point, vector2d& direction) noexcept;

/// Fits a line to points whose sums are known.
///
/// @param sumX, sumY          the sums of the coordinates
/// @param sumXY, sumXX, sumYY the sums of their products
/// @param points              the points, looked at only where the mixed moment vanishes
/// @param count               their number; 0 gives NaN
/// @param[out] point          a point of the line
/// @param[out] direction      the direction of the line; both as in the form that takes the points alone
/// @arithmetic
ZARNMATH_API void GetLeastSquaresLines(double sumX, double sumY, double sumXY, double sumXX, double sumYY,
                                       const point2d* points, int count, point2d& point, vector2d& direction) noexcept;

} // namespace ZarnMath
