/// @file
/// The functions of the unit Bezier that other units and the tests reach. Internal.
#pragma once

#include "ZarnMath/Bezier.h"

namespace ZarnMath::CubicBezier {

/// The nearest stationary point of the polynomial's stretch t in (-1, 2), which reaches beyond the ends of the curve.
/// Results and failure as `FindClosestPointOnBezier`.
bool FindClosestPointOnBezierExtendedRange(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                           const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept;

/// What the two overloads of `FindClosestPointsOnBezier` forward to; for `point2d` and `POINT`.
template <typename P>
bool FindClosestPointsOnBezierT(const P* bezier, const P& q, std::vector<double>& ts, std::vector<P>& points,
                                std::vector<double>& squaredDistances);

extern template bool FindClosestPointsOnBezierT<point2d>(const point2d*, const point2d&, std::vector<double>&,
                                                         std::vector<point2d>&, std::vector<double>&);
extern template bool FindClosestPointsOnBezierT<POINT>(const POINT*, const POINT&, std::vector<double>&,
                                                       std::vector<POINT>&, std::vector<double>&);

} // namespace ZarnMath::CubicBezier
