/// @file
/// The functions of the unit BezierOffset that tests reach. Internal.
#pragma once

#include "ZarnMath/BezierOffset.h"

namespace ZarnMath {

/// Inserts a sample of the offset into samples that are sorted by parameter.
///
/// A sample that is closer than 0.005 in the parameter to one before its place, or to the next, is left out. The ends,
/// 0.0 and 1.0, are not: they are inserted even where they are there already, behind the other.
///
/// @param t                  the parameter
/// @param a, b, c, d         power form
/// @param distance           positive to the left
/// @param[in,out] parameters the parameters, in ascending order
/// @param[in,out] points     the points, element for element
void GetOffsetPoint(double t, const point2d& a, const point2d& b, const point2d& c, const point2d& d, double distance,
                    std::vector<double>& parameters, std::vector<point2d>& points);

/// Fits a cubic with the end tangents of another one to points of its offset, in ten passes.
///
/// @param a, b, c, d          power form of the curve that is offset
/// @param[out] offsetBezier   four control points
/// @param ignored             not read
/// @param points              the points, in curve order
/// @param count               their number, at least 1
/// @param[out] error          the error of the fit
/// @param[out] splitParameter 0.5
/// @return true
bool FindBezierOffsetUsingLeastSquares(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                       point2d* offsetBezier, double ignored, const point2d* points,
                                       unsigned long count, double& error, double& splitParameter);

} // namespace ZarnMath
