/// @file
/// Least-squares fits to points: one cubic, two cubics that join smoothly, and a parabola y(x).
///
/// A cubic is fitted to an ordered run of points by turns: for given parameters, one for each point, the best curve is
/// the solution of a linear system; for a given curve, the best parameter of a point is that of its closest point on the
/// curve (Plass and Stone, 1983). A *pass* is one such pair of steps. The first parameters are by chord length.
///
/// The *error* of a fit is a squared distance in drawing units: the largest one from a point to the curve, or by which
/// the curve leaves the points' box, whichever is larger. So a curve is charged for a bulge that passes between the
/// points. Points for which no closest point is found within the curve do not count.
///
/// The curve of the least error is kept. The first pass always counts; a later one counts where it needed no repair and
/// its error is smaller. A pass that does not count is not undone, and the next one starts from its parameters; one whose
/// error is more than twice the least ends the fit.
///
/// Two tangents fix the ends: `t1` leaves the first point into the curve, `t2` is the direction of travel at the last
/// point, so that the last handle is P3 - s*t2 with s > 0. Neither needs to be of unit length.
///
/// Points are not made unique. Where all of them coincide the parameters are NaN, and so are the results. Vectors made
/// inside are released on every path, also when an exception of theirs passes through. All functions are in the
/// arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

#include <vector>

namespace ZarnMath {

/// Parameters by chord length: from 0.0 at the first point to 1.0 at the last, in proportion to the length of the polyline
/// up to each point.
///
/// @param points the points
/// @param count  their number. One point has the parameter 1.0; of points that all coincide the inner ones have NaN
/// @param[out] u resized to count
/// @throws std::length_error for a count below 1
/// @arithmetic
ZARNMATH_API void Calculate_u(const point2d* points, int count, std::vector<double>& u);

/// @name One cubic with given ends and tangents
/// The ends of the curve are the first and the last point. What is fitted are the lengths of the two handles.
/// @{

/// From parameters of the caller.
///
/// - Two points give handles of a third of their distance, times the length of each tangent, and the error 0.0.
/// - A handle that comes out on the wrong side of its end is repaired: 0.333 times the tangent, and no longer than 0.333
///   times the chord as far as `t1` is longer than the chord. A repaired pass counts only as the first.
/// - Where the system is singular the handles are `t1` and `t2` themselves.
///
/// @param points       the points
/// @param[in,out] u    a parameter for each point. They are shifted and scaled to run from 0.0 to 1.0 before each pass,
///                     and are those of the last pass afterwards, whether or not it counted. Two points leave them alone
/// @param count        the number of points
/// @param t1, t2       the tangents
/// @param[out] bezier  four control points
/// @param iterations   the number of passes, at least 1
/// @param[out] worst_u the parameter of the point with the largest distance, of the last pass that had a point with
///                     any; may be null
/// @param threshold    a pass that counts and has an error below it is the last one
/// @return the error of the curve, a squared distance; the largest double, with nothing written, for fewer than two points
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, double* u, int count, const vector2d& t1, const vector2d& t2,
                                 point2d* bezier, int iterations, double* worst_u, double threshold) noexcept;

/// From parameters by chord length, without a threshold.
///
/// @param points      the points
/// @param count       the number of points
/// @param t1, t2      the tangents
/// @param[out] bezier four control points
/// @param iterations  the number of passes, at least 1
/// @return the error of the curve, a squared distance; the largest double, with nothing written, for one point
/// @throws std::length_error for a count below 1
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, int count, const vector2d& t1, const vector2d& t2,
                                 point2d* bezier, int iterations);

/// @}
/// @name One cubic with free ends
/// All four control points are fitted: the ends of the curve are near the first and the last point and not on them.
/// @{

/// From parameters of the caller.
///
/// Two points give the straight cubic between them, and the error 0.0.
///
/// @param points         the points
/// @param[in,out] u      a parameter for each point. They are shifted and scaled to run from 0.0 to 1.0 before the first
///                       pass and after each one, and are those of the last pass afterwards, whether or not it counted.
///                       Two points leave them alone
/// @param count          the number of points
/// @param[in,out] bezier four control points. What they hold before is the curve of the first pass where its system is
///                       singular, and stays where there is no pass
/// @param iterations     the number of passes
/// @param[out] worst_u   the parameter of the point with the largest distance, of the last pass that had a point with
///                       any; may be null
/// @return the error of the curve, a squared distance; the largest double, with nothing written, for fewer than two
///         points, and where there is no pass
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, double* u, int count, point2d* bezier, int iterations,
                                 double* worst_u) noexcept;

/// From parameters by chord length.
///
/// @param points         the points
/// @param count          the number of points
/// @param[in,out] bezier four control points, as in the form with parameters
/// @param iterations     the number of passes
/// @return the error of the curve, a squared distance; the largest double, with nothing written, for one point, and where
///         there is no pass
/// @throws std::length_error for a count below 1
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, int count, point2d* bezier, int iterations);

/// @}
/// @name Two cubics with a smooth join
/// The outer ends are the first and the last point, and the outer tangents are given. What is fitted are the lengths of
/// the two outer handles, the join point and the handle there, which both curves share: it points in opposite directions
/// from the join, with lengths in the ratio of the spans of the parameters of the two halves.
///
/// The join point and its handle are those of the least squares. The outer handles are not, quite: they make the
/// residuals of each half sum to zero along its tangent. Neither is repaired where it comes out on the wrong side.
/// @{

/// From parameters of the caller.
///
/// @param points     the points, at least five
/// @param[in,out] u  a parameter for each point, shifted and scaled to run from 0.0 to 1.0
/// @param n          the number of points
/// @param split      the number of points of the first curve, from 1 to n-1
/// @param t1, t2     the tangents at the first and at the last point
/// @param[in,out] a  four control points of the first curve
/// @param[in,out] b  four control points of the second curve. What the two hold before are the curves of the first pass
///                   where its system is singular, and stays where there is no pass
/// @param iterations the number of passes
/// @return the larger error of the two curves, both measured against the box of all points; the largest double, with
///         nothing written, for fewer than five points, and where there is no pass
/// @throws std::length_error where split is negative or above n
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, double* u, int n, int split, const vector2d& t1,
                                 const vector2d& t2, point2d* a, point2d* b, int iterations);

/// From parameters by chord length.
///
/// @param points     the points, at least five
/// @param n          the number of points
/// @param split      the number of points of the first curve, from 1 to n-1
/// @param t1, t2     the tangents at the first and at the last point
/// @param[in,out] a  four control points of the first curve
/// @param[in,out] b  four control points of the second curve, both as in the form with parameters
/// @param iterations the number of passes
/// @return the larger error of the two curves; the largest double, with nothing written, for fewer than five points, and
///         where there is no pass
/// @throws std::length_error for n below 1, and where split is negative or above n
/// @arithmetic
ZARNMATH_API double LeastSquares(const point2d* points, int n, int split, const vector2d& t1, const vector2d& t2,
                                 point2d* a, point2d* b, int iterations);

/// @}

/// Fits the parabola y = c0 + c1*x + c2*x^2 to points, by the squares of the vertical distances.
///
/// @param points               the points, in drawing units and in any order
/// @param count                their number
/// @param[in,out] coefficients c0, c1 and c2 are appended, in this order
/// @return false, with nothing appended, for fewer than three points, and where the normal equations come out as exactly
///         singular, as for fewer than three different x
/// @arithmetic
ZARNMATH_API bool LeastSquares(const point2d* points, unsigned long count, std::vector<double>& coefficients);

} // namespace ZarnMath
