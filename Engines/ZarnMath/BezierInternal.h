/// @file
/// The functions of the unit Bezier that other units and the tests reach. Internal.
#pragma once

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

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

/// The polynomial of degree 9 whose roots are the parameters at which a cubic meets the algebraic curve of another, on
/// and beyond its segment: f1(P2(t)), with f1 the implicit form of the first.
///
/// It vanishes identically where the first curve has no cubic term, and where both lie on one algebraic curve.
///
/// @param a1, b1, c1, d1  power form of the curve made implicit
/// @param a2, b2, c2, d2  power form of the curve substituted
/// @param[out] polynomial ten coefficients, highest power first; the last one is f1(d2)
void GetBezierIntersectionPolynomial(const point2d& a1, const point2d& b1, const point2d& c1, const point2d& d1,
                                     const point2d& a2, const point2d& b2, const point2d& c2, const point2d& d2,
                                     double* polynomial) noexcept;

/// The parameters at which a cubic crosses the infinite line through two points.
///
/// @param f                the cubic
/// @param line             two points; there is no crossing where they are exactly equal
/// @param[out] roots       room for four parameters, in the root finder's order
/// @param includeEndpoints whether t = 0 and t = 1 count
/// @return the number of parameters
[[nodiscard]] int FindRootsOnLine(const PowerForm& f, const point2d* line, double* roots,
                                  bool includeEndpoints) noexcept;

} // namespace ZarnMath::CubicBezier
