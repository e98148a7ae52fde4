/// @file
/// Points and straight segments: collinearity, distance, thick segments that touch, and reflection.
///
/// All functions are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// Whether points lie on one straight line, within a band about the line that `GetLeastSquaresLines` fits to them.
///
/// @param points    the points
/// @param count     their number; up to two points are always collinear
/// @param tolerance the largest *squared* distance from the line that passes, itself included. A negative one fails even
///                  points on the line. The `POINT` overload compares in double
/// @return whether no point is farther away. Horizontal points can fail where a sum is rounded: the fit then has a mixed
///         moment that is not quite zero, and so a huge direction
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool AreCollinear(const point2d* points, unsigned long count, double tolerance) noexcept;
[[nodiscard]] ZARNMATH_API bool AreCollinear(const POINT* points, unsigned long count, double tolerance);

/// The squared distance from a point to a segment, its ends included.
///
/// @param start, end the segment; of zero length it counts as a point
/// @param p          the point
/// @return the squared distance
/// @arithmetic
[[nodiscard]] ZARNMATH_API double DistanceToLineSegmentSqrd(const point2d& start, const point2d& end,
                                                            const point2d& p) noexcept;

/// Whether two segments cross, or come closer than a width.
///
/// The crossing test is not symmetric: a and b may lie on the line cd, but c and d have to lie strictly on opposite sides
/// of ab. Segments that touch in a T with c or d on ab, and collinear segments, meet only through a width above 0, and so
/// does a segment that is a point.
///
/// @param a, b  the first segment
/// @param c, d  the second segment
/// @param width the distance in drawing units; to be exactly at it is not closer
/// @return whether they do
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool DoesFatlineIntersectLine(const point2d& a, const point2d& b, const point2d& c,
                                                         const point2d& d, double width) noexcept;

/// Mirrors points across a line, in place, each coordinate rounded by itself.
///
/// The squared length of the direction and the differences from the origin are taken in 32 bits, where they wrap.
///
/// @param direction      the direction of the line, of any length but zero
/// @param origin         a point of the line
/// @param[in,out] points the points; null is left alone
/// @param count          their number
/// @arithmetic
ZARNMATH_API void ReflectAcross(POINT direction, POINT origin, POINT* points, unsigned long count) noexcept;

} // namespace ZarnMath
