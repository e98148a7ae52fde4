/// @file
/// The functions of the unit FitBezier that tests reach: the linear solves, and the step between them. Internal.
#pragma once

#include "ZarnMath/FitBezier.h"

namespace ZarnMath {

/// Moves each point's parameter to that of its closest point on a cubic, and measures the error of the cubic.
///
/// A first parameter of exactly 0.0 and a last one of exactly 1.0 are pinned: these points are passed over. A point with
/// no stationary distance within the curve keeps its parameter and does not count.
///
/// @param points       the points
/// @param bezier       four control points
/// @param[in,out] u    a parameter for each point
/// @param count        the number of points, at least 1
/// @param[out] worst_u the parameter of the point with the largest distance, untouched where there is none above 0; may
///                     be null
/// @param bounds       the box of the points
/// @return the largest squared distance from a point, or by which the curve exceeds `bounds` on one side
double Reparameterize_u(const point2d* points, const point2d* bezier, double* u, int count, double* worst_u,
                        const BoundsT<double>& bounds) noexcept;

/// The cubic with given ends and tangents for given parameters: the lengths of the handles of the least squares.
///
/// @param points      the points, of which the first and the last are the ends
/// @param u           a parameter for each point
/// @param count       the number of points, at least 1
/// @param t1, t2      the tangents
/// @param[out] bezier four control points
/// @return false where the system was singular or a handle had to be repaired
bool LeastSquaresSingleIteration(const point2d* points, const double* u, int count, const vector2d& t1,
                                 const vector2d& t2, point2d* bezier) noexcept;

/// The cubic of the least squares for given parameters.
///
/// @param points      the points
/// @param u           a parameter for each point
/// @param count       the number of points
/// @param[out] bezier four control points; untouched on failure
/// @return false where the system is singular
bool LeastSquaresSingleIteration(const point2d* points, const double* u, int count, point2d* bezier) noexcept;

/// The two cubics with a smooth join for given parameters.
///
/// @param points  the points
/// @param t1, t2  the tangents at the first and at the last point
/// @param n       the number of points
/// @param split   the number of points of the first cubic
/// @param u1      split parameters
/// @param u2      n - split parameters
/// @param[out] a  four control points of the first cubic; untouched on failure
/// @param[out] b  four control points of the second cubic; untouched on failure
/// @return false where the system is singular
bool LeastSquaresSingleIteration_2Cubics(const point2d* points, const vector2d& t1, const vector2d& t2, int n,
                                         int split, const double* u1, const double* u2, point2d* a,
                                         point2d* b) noexcept;

} // namespace ZarnMath
