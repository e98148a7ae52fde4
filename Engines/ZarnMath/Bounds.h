/// @file
/// Integer rectangles and double bounds, and how each operation treats emptiness.
///
/// A box is `left`, `top`, `right`, `bottom` with y growing upward, so that `top` is the larger y. The empty box is
/// inside out, at the limits of the 32-bit integers in both types, so that the first point merged into it sets all four
/// fields. The operations do not agree on what counts as empty, and each keeps its own rule:
///
/// | notion             | test                              | asked by                                              |
/// |--------------------|-----------------------------------|-------------------------------------------------------|
/// | strictly non-empty | left < right and bottom < top     | `UnionRect`; the results of it and of `IntersectRect` |
/// | valid              | left <= right and bottom <= top   | `TranslateValidRect`                                  |
/// | vertically ordered | bottom <= top                     | the entry of `IntersectRect`                          |
///
/// Integer arithmetic wraps in 32 bits. A null pointer or a count below 1 is accepted only where stated. All functions
/// but `GetTransformedCircleBBox` are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/WMath.h"

namespace ZarnMath {

/// @name Empty and normal form
/// @{

/// The empty rectangle: left 2147483647, top -2147483648, right -2147483648, bottom 2147483647.
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetEmptyRect() noexcept;

/// Makes a box empty.
///
/// @param[out] box the empty rectangle, or the empty bounds: the same integer limits, as doubles
/// @arithmetic
ZARNMATH_API void InitializeEmpty(RECT& box) noexcept;
ZARNMATH_API void InitializeEmpty(BoundsT<double>& box) noexcept;

/// Swaps left and right, and top and bottom, where they are out of order.
///
/// @param[in,out] rect the rectangle; the empty one becomes the largest possible one
/// @arithmetic
ZARNMATH_API void NormalizeRect(RECT& rect) noexcept;

/// @}
/// @name Boxes of points
/// @{

/// The smallest box that holds all points.
///
/// The first point sets all four fields and the others widen them by strict comparisons. A NaN coordinate therefore
/// stays if it comes first and is passed over later.
///
/// @param points the points; null gives the empty box
/// @param count  their number; below 1 gives the empty box
/// @return the box
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetPointsBBox(const POINT* points, int count) noexcept;
[[nodiscard]] ZARNMATH_API BoundsT<double> GetPointsBBox(const point2d* points, int count) noexcept;

/// The smallest rectangle that holds all points.
///
/// @param points   the points; null gives the empty rectangle
/// @param count    their number; below 1 gives the empty rectangle
/// @param[out] out the rectangle
/// @arithmetic
ZARNMATH_API void GetPointsBBox(const POINT* points, int count, RECT& out) noexcept;

/// Widens a rectangle so that it holds a point.
///
/// @param[in,out] rect the rectangle; if it is empty, it becomes the point
/// @param p            the point
/// @arithmetic
ZARNMATH_API void UnionPointWithRect(RECT& rect, const POINT& p) noexcept;

/// Widens a rectangle so that it encloses a point between whole units.
///
/// Each field that the point exceeds takes the coordinate rounded outward, ceil for `right` and `top` and floor for
/// `left` and `bottom`; the others stay as they are.
///
/// @param[in,out] rect the rectangle
/// @param p            the point; a NaN coordinate sets nothing
/// @arithmetic
ZARNMATH_API void UnionPointWithRect(RECT& rect, const point2d& p) noexcept;

/// Widens a rectangle so that it holds all points.
///
/// @param[in,out] rect the rectangle
/// @param points       the points; null is accepted only with a count below 1
/// @param count        their number; below 1 changes nothing
/// @arithmetic
ZARNMATH_API void UnionPointsWithRect(RECT& rect, const POINT* points, int count) noexcept;

/// @}
/// @name Two rectangles
/// @{

/// Widens a rectangle so that it holds another one.
///
/// A rectangle of zero width or height counts as empty: as `a` it is overwritten by `b`, whatever that is, and as `b` it
/// is ignored.
///
/// @param[in,out] a the union
/// @param b         the other rectangle
/// @return whether the union is strictly non-empty
/// @arithmetic
ZARNMATH_API bool UnionRect(RECT& a, const RECT& b) noexcept;

/// Narrows a rectangle to what it shares with another one.
///
/// @param[in,out] a the intersection; unchanged if either rectangle has top < bottom. If the two do not overlap, or
///                  share no more than an edge, it is left as it comes out, inside out or of zero size
/// @param b         the other rectangle
/// @return whether the intersection is strictly non-empty
/// @arithmetic
ZARNMATH_API bool IntersectRect(RECT& a, const RECT& b) noexcept;

/// @}
/// @name Moving and growing
/// @{

/// Moves a rectangle, whatever it holds: the empty one does not survive.
///
/// @param[in,out] rect the rectangle
/// @param dx, dy       the displacement
/// @arithmetic
ZARNMATH_API void TranslateRect(RECT& rect, int dx, int dy) noexcept;

/// Moves a rectangle with left <= right and bottom <= top, one of zero size included, and leaves every other one as it
/// is, so that an empty rectangle stays empty.
///
/// @param[in,out] rect the rectangle
/// @param dx, dy       the displacement
/// @arithmetic
ZARNMATH_API void TranslateValidRect(RECT& rect, int dx, int dy) noexcept;

/// Moves each edge outward.
///
/// @param[in,out] rect the rectangle; negative amounts may turn it inside out
/// @param dx           the amount at left and at right
/// @param dy           the amount at top and at bottom
/// @arithmetic
ZARNMATH_API void InflateRect(RECT& rect, int dx, int dy) noexcept;

/// @}
/// @name Measures
/// @{

/// The corners, clockwise from the left top: (left, top), (right, top), (right, bottom), (left, bottom).
///
/// @param box      the box, of any kind
/// @param[out] out four points
/// @arithmetic
ZARNMATH_API void GetRectCorners(const BoundsT<double>& box, point2d* out) noexcept;
ZARNMATH_API void GetRectCorners(const RECT& box, POINT* out) noexcept;

/// The centre of `rect` in whole units, each coordinate truncated toward zero. A sum of two fields wraps in 32 bits.
/// @arithmetic
[[nodiscard]] ZARNMATH_API POINT GetRectCenter(const RECT& rect) noexcept;

/// Height times width of `rect` in drawing units squared, made positive: inside out counts as well. Heights and widths
/// wrap in 32 bits.
/// @arithmetic
[[nodiscard]] ZARNMATH_API double GetRectArea(const RECT& rect) noexcept;

/// @}
/// @name Points in rectangles
/// @{

/// Whether a point lies in a rectangle, its edges included.
///
/// The two axes differ: left <= x <= right is asked as it stands, so that nothing lies in a rectangle with left > right,
/// but y may lie between `bottom` and `top` in either order.
///
/// @param p    the point; NaN lies nowhere
/// @param rect the rectangle; nothing lies in the empty one
/// @return whether it does
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsPointInRect(const POINT& p, const RECT& rect) noexcept;
[[nodiscard]] ZARNMATH_API bool IsPointInRect(const point2d& p, const RECT& rect) noexcept;

/// Whether any of the points lies in a rectangle, by the rule of `IsPointInRect`.
///
/// @param points the points; null is accepted only with a count of 0
/// @param count  their number; 0 gives false
/// @param rect   the rectangle
/// @return whether one does
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsAnyPointInRect(const POINT* points, unsigned long count, const RECT& rect) noexcept;

/// The rectangle about a point. Its sides wrap in 32 bits, and a negative half extent turns it inside out.
///
/// @param p      the centre
/// @param r      half the width and half the height, in drawing units
/// @return left p.x - r, top p.y + r, right p.x + r, bottom p.y - r
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetPointRect(const POINT& p, int r) noexcept;

/// The rectangle about a point, with half extents of its own for each axis.
///
/// @param p      the centre
/// @param rx, ry half the width, half the height, in drawing units
/// @return left p.x - rx, top p.y + ry, right p.x + rx, bottom p.y - ry
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetPointRect(const POINT& p, int rx, int ry) noexcept;

/// The unit square: left 0, top 1, right 1, bottom 0. The reference stays valid, and may be asked for from any thread.
/// @arithmetic
[[nodiscard]] ZARNMATH_API const BoundsT<double>& IdentityBounds() noexcept;

/// @}
/// @name Boxes through a transform
/// Three ways of measuring, which do not replace each other: a `RECT` is the box of its corners, each rounded to the
/// nearest unit; integer points are enclosed, by rounding outward; and double points are measured as they are, from the
/// empty bounds on, so that the limits of the 32-bit integers show where all of them lie beyond.
/// @{

/// The box of the images of the four corners.
///
/// @param box the box; an empty one is transformed like any other, and is not marked as empty afterwards
/// @param m   the transform
/// @return the box. As a `RECT` it may fall short of the exact one by half a unit
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetTransformedBBox(const RECT& box, const MATRIX& m) noexcept;
[[nodiscard]] ZARNMATH_API BoundsT<double> GetTransformedBBox(const BoundsT<double>& box, const MATRIX& m) noexcept;

/// The box of what the transform takes to the four corners: `GetTransformedBBox` by the inverse.
///
/// @param box the box
/// @param m   the transform, which stays as it is
/// @return the box; all zeros where the determinant is at most DBL_EPSILON in magnitude, or NaN
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetUntransformedBBox(const RECT& box, const MATRIX& m) noexcept;
[[nodiscard]] ZARNMATH_API BoundsT<double> GetUntransformedBBox(const BoundsT<double>& box, const MATRIX& m) noexcept;

/// The smallest rectangle that encloses the exact images of points.
///
/// @param points the points; null is accepted only with a count of 0
/// @param count  their number; 0 gives the empty rectangle
/// @param m      the transform
/// @return the rectangle, each side rounded outward
/// @arithmetic
[[nodiscard]] ZARNMATH_API RECT GetTransformedPointsBBox(const POINT* points, unsigned long count,
                                                         const MATRIX& m) noexcept;

/// The smallest bounds that hold the images of points and the empty bounds: `left` and `bottom` never exceed
/// 2147483647.0, `right` and `top` never fall below -2147483648.0. Unlike `GetPointsBBox`, no point comes first.
///
/// @param points the points; null is accepted only with a count of 0
/// @param count  their number; 0 gives the empty bounds
/// @param m      the transform
/// @return the bounds; an image with NaN widens nothing
/// @arithmetic
[[nodiscard]] ZARNMATH_API BoundsT<double> GetTransformedPointsBBox(const point2d* points, unsigned long count,
                                                                    const MATRIX& m) noexcept;

/// Where a point of one box lies in another one, with each axis stretched by itself.
///
/// @param p    the point
/// @param from its box; a side of 0 gives infinities or NaN
/// @param to   the other box
/// @return the image of p under `ConstructRectTransformMatrix(from, to, MapStretch)`
/// @arithmetic
[[nodiscard]] ZARNMATH_API point2d GetRemappedPoint(const point2d& p, const BoundsT<double>& from,
                                                    const BoundsT<double>& to) noexcept;

/// The box of the ellipse that a transform makes of a circle. The last bits are those of the machine's atan, sin and cos.
///
/// @param m      the transform; its translation is not used, and a singular one gives the right flat box
/// @param radius the radius of the circle, in drawing units
/// @param centre the centre of the *ellipse*: it is not transformed
/// @return the box, right beyond the limits of the 32-bit integers too
/// @platform
[[nodiscard]] ZARNMATH_API BoundsT<double> GetTransformedCircleBBox(const MATRIX& m, double radius,
                                                                    point2d centre) noexcept;

/// @}

} // namespace ZarnMath
