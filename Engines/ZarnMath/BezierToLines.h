/// @file
/// Flattening: a cubic as a polyline, sampled at equal parameter steps or subdivided until it is flat enough.
///
/// Output arrays belong to the caller and hold one point more than the largest number of segments. The `POINT`
/// overloads round only what they store, so that neighbouring output points may be equal. All functions are in the
/// arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// A number of segments for a curve, from the size of its box in drawing units.
///
/// | size        | segments    |
/// |-------------|-------------|
/// | 650 and up  | maxLines    |
/// | 160 to 649  | maxLines/2  |
/// | 30 to 159   | maxLines/4  |
/// | below 30    | maxLines/8  |
///
/// The size is the larger of the width and the absolute height: a box that is inside out horizontally counts as small.
///
/// @param bounds   the box
/// @param maxLines the budget of segments
/// @return the share of the budget, truncated; it can be 0, which is no valid count for `BezierToLines`
/// @arithmetic
[[nodiscard]] ZARNMATH_API int CalculateNumBezierLines(const RECT& bounds, int maxLines) noexcept;

/// The same for the box of four control points, which for `point2d` is rounded outward.
///
/// @param curve    four control points
/// @param maxLines the budget of segments
/// @return the share of the budget, truncated; for a curve that is a point, the smallest share
/// @arithmetic
[[nodiscard]] ZARNMATH_API int CalculateNumBezierLines(const POINT* curve, int maxLines) noexcept;
[[nodiscard]] ZARNMATH_API int CalculateNumBezierLines(const point2d* curve, int maxLines) noexcept;

/// Samples a cubic at t = i/lines, each point anew, with the exact control points P0 and P3 at the ends. Nothing is made
/// unique: a curve that is a point gives that point every time.
///
/// @param curve    four control points
/// @param[out] out lines + 1 points
/// @param lines    number of segments, not negative. 1 stores the two ends; 0 stores P3 alone
/// @arithmetic
ZARNMATH_API void BezierToLines(const POINT* curve, POINT* out, int lines) noexcept;
ZARNMATH_API void BezierToLines(const point2d* curve, point2d* out, int lines) noexcept;

/// Subdivides a cubic in parameter space until the middle of each stretch lies near its chord.
///
/// A stretch is flat when its parameter midpoint is strictly nearer to the chord's line than sqrt(tolerance). Since an
/// S whose midpoint falls on its chord would pass that test, the size of the control polygon sets a least depth: 1, 2 or
/// 3 levels from 30, 150 or 700 times sqrt(tolerance). Of a closed curve (P0 equal to P3) the end is displaced by
/// (-1, -1) in these tests, and nowhere else.
///
/// @param curve     four control points
/// @param[out] out  n + 1 points, of at most maxLines + 1, from the exact P0 to the exact P3; a leaf of the subdivision
///                  gives two segments, so that every second point is a parameter midpoint
/// @param tolerance the *square* of a distance in drawing units. 0 subdivides to the depth that maxLines allows
/// @param maxLines  the most segments wanted; above 2047 it counts as 2047
/// @return n, the number of segments: 0 with nothing stored for maxLines < 1, 1 for maxLines = 1, otherwise even
/// @arithmetic
ZARNMATH_API int AdaptiveBezierToLines(const POINT* curve, POINT* out, double tolerance, int maxLines) noexcept;
ZARNMATH_API int AdaptiveBezierToLines(const point2d* curve, point2d* out, double tolerance, int maxLines) noexcept;

} // namespace ZarnMath
