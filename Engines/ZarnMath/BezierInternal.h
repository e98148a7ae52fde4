/// @file
/// The functions of the unit Bezier that other units and the tests reach. Internal.
#pragma once

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

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

/// The parameter at which a cubic passes through a point, as the exported `Invert`, without a vector.
///
/// @param a, b, c, d     power form
/// @param q              the point
/// @param[out] parameter the parameter, in [0, 1]; untouched where the point is not matched
/// @return whether the point is matched
[[nodiscard]] bool Invert(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                          double& parameter) noexcept;

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

/// The algebraic stage of the exported `FindBezierIntersections`, on power forms, of which neither is taken as
/// straight.
///
/// The three vectors are cleared. Where the first curve has no cubic term at all, the second is the one made implicit;
/// where neither has one, nothing is found.
void FindBezierIntersections(point2d a1, point2d b1, point2d c1, point2d d1, point2d a2, point2d b2, point2d c2,
                             point2d d2, std::vector<double>& firstParameters, std::vector<double>& secondParameters,
                             std::vector<point2d>& points);

/// Intersects a cubic with one that is all but straight, as with its chord.
///
/// The first counts as straight if its control points lie within 2 units of their least-squares line. A crossing of the
/// other curve with the line through its ends is accepted where the nearest point of the first curve is strictly within
/// the segment and less than 2 units away.
///
/// @param straight, other            four control points each
/// @param[in,out] straightParameters parameters of the nearest points on the first curve
/// @param[in,out] otherParameters    parameters of the crossings, at most three, in the root finder's order; in (0, 1) but
///                                   for a double root, whose search is not confined
/// @param[in,out] points             the crossings, on the other curve
/// @return whether anything was found. The three vectors are appended to, and untouched where nothing was found.
bool StraightBezierIntersectionTest(const point2d* straight, const point2d* other,
                                    std::vector<double>& straightParameters, std::vector<double>& otherParameters,
                                    std::vector<point2d>& points);

/// The parameters at which a cubic crosses the infinite line through two points.
///
/// @param f                the cubic
/// @param line             two points; there is no crossing where they are exactly equal
/// @param[out] roots       room for four parameters, in the root finder's order
/// @param includeEndpoints whether t = 0 and t = 1 count
/// @return the number of parameters
[[nodiscard]] int FindRootsOnLine(const PowerForm& f, const point2d* line, double* roots,
                                  bool includeEndpoints) noexcept;

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

namespace ZarnMath::CubicBezier::BezierOld {

/// The number of crossings at which `BezierIntersectionEx` stops, and the size of its arrays.
inline constexpr int maxIntersections = 9;

/// The crossings of two cubics by halving both down to a fixed depth, where their chords are taken for them (Lane and
/// Riesenfeld, 1980). It serves the search of a curve against itself. The recursion is nine levels deep at most.
///
/// A pair is given up where either half is below one unit in both directions, so that only curves of more than about
/// 2^7 units are searched to the end. Crossings come depth first, the left halves before the right ones, and are not
/// made unique.
///
/// @param first                   four control points
/// @param firstStart, firstEnd    the range of parameters that they stand for
/// @param second                  four control points
/// @param secondStart, secondEnd  their range, which no result depends on
/// @param[out] parameters         room for nine values: the parameters on the first curve, from element count on
/// @param[out] xs, ys             room for nine values each: the points, on the first curve
/// @param[in,out] count           the number of crossings in the arrays. At nine nothing is searched.
/// @param depth                   0; from 8 on the two curves are taken for their chords at once
/// @return count afterwards
int BezierIntersectionEx(const point2d* first, double firstStart, double firstEnd, const point2d* second,
                         double secondStart, double secondEnd, double* parameters, double* xs, double* ys, int& count,
                         int depth) noexcept;

} // namespace ZarnMath::CubicBezier::BezierOld
