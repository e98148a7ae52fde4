/// @file
/// The functions of the unit Bezier that other units and the tests reach. Internal.
#pragma once

#include "ZarnMath/Bezier.h"

namespace ZarnMath::CubicBezier {

/// The order of quadrature that serves a requested one: 2 to 8, 10 or 16.
[[nodiscard]] int NormalizeQuadratureOrder(int order) noexcept;

/// The rule of Gauss-Legendre quadrature on [-1, 1].
///
/// @param order          requested order
/// @param[out] weights   the weights of the order that serves it
/// @param[out] abscissae its nodes, in ascending order. Both point into constant tables that hold the orders one after
///                       the other
void GetGaussianQuadratureWeightsAndAbscissae(int order, const double*& weights, const double*& abscissae) noexcept;

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

/// The box of a cubic, exact up to rounding: of its ends and of the points with a vertical or horizontal tangent. For
/// `double`.
///
/// @param a, b, c, d                  power form
/// @param[out] minX, minY, maxX, maxY the box
template <typename T>
void GetTightBounds(const point2d& a, const point2d& b, const point2d& c, const point2d& d, T& minX, T& minY, T& maxX,
                    T& maxY) noexcept;

extern template void GetTightBounds<double>(const point2d&, const point2d&, const point2d&, const point2d&, double&,
                                            double&, double&, double&) noexcept;

/// The parameters in (0, 1) at which the radius of curvature equals a distance or its negative, as the roots of
/// |P'|^6 - distance^2*Cross(P', P'')^2.
///
/// @param a, b, c         power form
/// @param distance        of either sign
/// @param[out] parameters room for 13 values, of which the count is written, in the root finder's order
/// @return the number of parameters
int FindAllOffsetCusp(const point2d& a, const point2d& b, const point2d& c, double distance,
                      double* parameters) noexcept;

} // namespace ZarnMath::CubicBezier
