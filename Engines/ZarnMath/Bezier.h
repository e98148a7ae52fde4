/// @file
/// What can be asked of one cubic Bezier segment, or of two.
///
/// A cubic crosses this interface in one of two forms:
/// - *control points*: a pointer to four `point2d` or `POINT` of the caller, P0 to P3 in curve order;
/// - *power form*: the coefficients a, b, c, d of P(t) = ((a*t + b)*t + c)*t + d, carried as `point2d`, with
///   a = P3 - (P2 - P1)*3 - P0, b = (P0 + (P2 - (P1 + P1)))*3, c = (P1 - P0)*3, d = P0.
///
/// The segment is t in [0, 1]. No parameter is clamped: outside that range the polynomial goes on. Arrays belong to the
/// caller, hold as many elements as stated, and are not checked. `POINT` overloads compute in double and round once, at
/// the end, except where a function says otherwise. Nothing here fails but by its result; every degenerate curve has a
/// stated answer. All functions of this header are in the arithmetic class, the same bits on every machine, unless one
/// says otherwise.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

#include <vector>

namespace ZarnMath {

/// Where a point lies, seen along the direction of travel.
enum Side : std::int32_t
{
    SideNone = 0,     ///< on the tangent line, or nothing could be found
    SidePositive = 1, ///< to the left: Cross(tangent, q - closest) > 0
    SideNegative = 2, ///< to the right
};

} // namespace ZarnMath

namespace ZarnMath::CubicBezier {

/// @name Cutting
/// de Casteljau's construction (1959) with steps p + (q - p)*t. Both pieces receive the identical shared point, and the
/// ends of the curve are copied.
///
/// The array `left`, and `out` of `LeftOf` and `RightOf`, may be the input itself; `right`, and `out` of the seven- and
/// ten-point forms and of `Subsection`, must not overlap it.
/// @{

/// Cuts at t.
///
/// @param t          parameter of the cut; outside [0, 1] the pieces describe the extended polynomial
/// @param in         four control points
/// @param[out] left  four control points of the piece from 0 to t
/// @param[out] right four control points of the piece from t to 1
ZARNMATH_API void Split(double t, const point2d* in, point2d* left, point2d* right) noexcept;
ZARNMATH_API void Split(double t, const POINT* in, POINT* left, POINT* right) noexcept;

/// Cuts at one half, by midpoints (p + q)*0.5, which can differ in the last bit from the cut at t = 0.5.
///
/// @param in         four control points
/// @param[out] left  four control points of the first half
/// @param[out] right four control points of the second half
ZARNMATH_API void Split(const point2d* in, point2d* left, point2d* right) noexcept;

/// Cuts at one half in whole units: each of the six midpoints is (p + q)/2 in 32-bit integers, truncated toward zero.
///
/// The pieces meet exactly. The truncation adds up over the three levels, and a sum beyond 32 bits wraps.
///
/// @param in         four control points
/// @param[out] left  four control points of the first half
/// @param[out] right four control points of the second half
ZARNMATH_API void Split(const POINT* in, POINT* left, POINT* right) noexcept;

/// Cuts at t into one run of points.
///
/// @param t        parameter of the cut
/// @param in       four control points
/// @param[out] out seven points: the left piece in elements 0 to 3, the right piece in 3 to 6
ZARNMATH_API void Split(double t, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Split(double t, const POINT* in, POINT* out) noexcept;

/// Cuts at two parameters into one run of points.
///
/// Each piece is computed from the input curve, as `LeftOf`(t0), `Subsection`(t0, t1) and `RightOf`(t1) in this order, so
/// that element 3 is the start of the middle piece and element 6 the start of the last one. t0 <= 0 and t1 >= 1 take
/// their special meaning for the middle piece only.
///
/// @param t0, t1   parameters of the cuts, t0 <= t1 for pieces that follow each other
/// @param in       four control points
/// @param[out] out ten points: the pieces in elements 0 to 3, 3 to 6 and 6 to 9
ZARNMATH_API void Split(double t0, double t1, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Split(double t0, double t1, const POINT* in, POINT* out) noexcept;

/// The piece from 0 to t, bit for bit the left piece of `Split`.
///
/// @param t        parameter of the cut
/// @param in       four control points
/// @param[out] out four control points; may be `in`
ZARNMATH_API void LeftOf(double t, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void LeftOf(double t, const POINT* in, POINT* out) noexcept;

/// The piece from t to 1, bit for bit the right piece of `Split`.
///
/// @param t        parameter of the cut
/// @param in       four control points
/// @param[out] out four control points; may be `in`
ZARNMATH_API void RightOf(double t, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void RightOf(double t, const POINT* in, POINT* out) noexcept;

/// The piece from t0 to t1: cut at t1 first, then at t0/t1 of what is left.
///
/// - t0 <= 0 counts as 0, and t1 is then not looked at: t1 > 1 runs past the end of the curve.
/// - Otherwise t1 >= 1 counts as 1.
/// - t0 > t1 gives an extrapolated piece of unchanged direction, neither reversed nor empty.
/// - t1 = 0 after a positive t0 divides by zero: the first three points are not finite.
///
/// @param t0, t1   parameters of the piece
/// @param in       four control points
/// @param[out] out four control points
ZARNMATH_API void Subsection(double t0, double t1, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Subsection(double t0, double t1, const POINT* in, POINT* out) noexcept;

/// @}
/// @name Closest point and side
/// The nearest *stationary* point of the squared distance, by the real roots of a quintic in [0, 1]. The ends of the
/// curve are no candidates by right: an end takes part only if the quintic vanishes there. A root that falls exactly on
/// a cut of the root finder's subdivision is lost, as for the foot at t = 0.5 of a symmetric curve.
///
/// Distances are squared, in drawing units squared.
/// @{

/// The nearest stationary point of a cubic.
///
/// @param a, b, c, d           power form
/// @param q                    query point
/// @param[out] t               parameter of the nearest point, in [0, 1]
/// @param[out] point           the nearest point, by Horner's rule
/// @param[out] distanceSquared its squared distance from q
/// @return whether there is a stationary point. If not, the three results are untouched. Among equal distances the
///         candidate that the root finder lists first stays. A curve collapsed to a point has none.
ZARNMATH_API bool FindClosestPointOnBezier(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                           const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept;

/// The nearest stationary point of a cubic given by four control points.
/// @copydetails FindClosestPointOnBezier(const point2d&,const point2d&,const point2d&,const point2d&,const point2d&,double&,point2d&,double&)
ZARNMATH_API bool FindClosestPointOnBezier(const point2d* bezier, const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept;

/// The nearest stationary point of an integer cubic.
///
/// @param bezier               four control points
/// @param q                    query point
/// @param[out] t               parameter of the nearest point, in [0, 1]
/// @param[out] point           the nearest point, rounded
/// @param[out] distanceSquared the squared distance of the *unrounded* point from q
/// @return whether there is a stationary point; if not, the three results are untouched
ZARNMATH_API bool FindClosestPointOnBezier(const POINT* bezier, const POINT& q, double& t, POINT& point,
                                           double& distanceSquared) noexcept;

/// The parameter of the nearest stationary point, with the ends of the curve as the fallback.
///
/// @param bezier four control points
/// @param q      query point
/// @return the parameter; where there is no stationary point, 0.0 if P0 is strictly nearer to q than P3, otherwise 1.0
[[nodiscard]] ZARNMATH_API double FindClosestPointOnBezier(const POINT* bezier, const POINT& q) noexcept;

/// All stationary points of the squared distance, in the open interval (0, 1).
///
/// @param bezier                  four control points
/// @param q                       query point
/// @param[in,out] ts              parameters, at most five, in the root finder's order
/// @param[in,out] points          the points; those of the `POINT` overload are rounded
/// @param[in,out] squaredDistances squared distances from q to these points (to the rounded ones, for `POINT`)
/// @return whether anything was found. The three vectors are appended to, never cleared, and not sorted by distance.
ZARNMATH_API bool FindClosestPointsOnBezier(const point2d* bezier, const point2d& q, std::vector<double>& ts,
                                            std::vector<point2d>& points, std::vector<double>& squaredDistances);
ZARNMATH_API bool FindClosestPointsOnBezier(const POINT* bezier, const POINT& q, std::vector<double>& ts,
                                            std::vector<POINT>& points, std::vector<double>& squaredDistances);

/// On which side of a cubic a point lies, seen from the nearest stationary point.
///
/// @param a, b, c, d           power form
/// @param q                    query point
/// @param[out] t               parameter of the nearest point
/// @param[out] point           the nearest point
/// @param[out] distanceSquared its squared distance from q
/// @param[out] side            the side of q; `SideNone` where q lies on the tangent line, on the curve itself included
/// @return whether a nearest point was found with t in [0, 1]. If none was found, nothing is written; if t is out of
///         range, the first three are written and side is untouched.
ZARNMATH_API bool GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                          double& t, point2d& point, double& distanceSquared, Side& side) noexcept;

/// On which side of a cubic a point lies.
///
/// @param a, b, c, d power form
/// @param q          query point
/// @return the side, and `SideNone` too where there is no nearest point
[[nodiscard]] ZARNMATH_API Side GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                        const point2d& q) noexcept;

/// The parameter at which a cubic passes through a point, within 0.1 units.
///
/// The nearest stationary point is sought for t in (-1, 2), so that the ends of the curve are matched. If the best one
/// lies on the continuation of the curve, the point is not matched at all, even if the segment comes near it elsewhere.
///
/// @param a, b, c, d         power form
/// @param q                  the point
/// @param[in,out] parameters the parameter is appended if 0 <= t <= 1 and the squared distance is below 0.01
/// @return whether `parameters` is not empty afterwards: true as well where it was not empty before
ZARNMATH_API bool Invert(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                         std::vector<double>& parameters);

/// The parameters at which the tangent line of a cubic runs through a point, as the roots of a quartic in [0, 1].
///
/// @param a, b, c, d      power form
/// @param q               the point
/// @param[out] parameters room for five values, of which the count is written, in the root finder's order (where the
///                        quartic is really of degree 2 or less, element 0 may be written although the count is 0)
/// @return the number of parameters
ZARNMATH_API int FindTangentsToPoint(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                     const point2d& q, double* parameters) noexcept;

/// @}
/// @name Implicit form
/// @{

/// The cubic polynomial of x and y that vanishes on the curve, by the Bezout resultant with respect to t (Sederberg,
/// 1983):
///
/// f(x, y) = Kxxx*x^3 + Kyyy*y^3 + Kxxy*x^2*y + Kxyy*x*y^2 + Kxx*x^2 + Kyy*y^2 + Kxy*x*y + Kx*x + Ky*y + K1
///
/// f(P(t)) = 0 for all real t, outside [0, 1] too. f is the determinant itself, whose sign tells the two sides of the
/// curve apart. It is the zero polynomial where a = (0, 0), for a parabola therefore, and the negative cube of a line's
/// equation where a, b and c are parallel.
///
/// @param a, b, c, d power form
/// @param[out] Kxxx, Kyyy, Kxxy, Kxyy, Kxx, Kyy, Kxy, Kx, Ky, K1 the coefficients, both pure cubes first
ZARNMATH_API void ConvertBezierToImplicit(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                          double& Kxxx, double& Kyyy, double& Kxxy, double& Kxyy, double& Kxx,
                                          double& Kyy, double& Kxy, double& Kx, double& Ky, double& K1) noexcept;

/// @}
/// @name Lines
/// The curve substituted into the line's equation, a cubic in t. A curve that lies along the line crosses it nowhere.
/// @{

/// The points at which a cubic crosses the infinite line through two points.
///
/// @param bezier                four control points
/// @param line                  two points, at which the line's parameter is 0 and 1
/// @param[out] bezierParameters parameters on the curve, at most four, in the root finder's order
/// @param[out] lineParameters   parameters along the line, element for element; any real number
/// @param includeEndpoints      whether t = 0 and t = 1 of the curve count. Even then t = 0 is dropped where the curve
///                              crosses twice besides
/// @return whether anything was found. Both vectors are cleared first, and stay empty where the two points of the line are
///         exactly equal.
ZARNMATH_API bool FindBezierLineIntersection(const point2d* bezier, const point2d* line,
                                             std::vector<double>& bezierParameters, std::vector<double>& lineParameters,
                                             bool includeEndpoints);
ZARNMATH_API bool FindBezierLineIntersection(const POINT* bezier, const POINT* line,
                                             std::vector<double>& bezierParameters, std::vector<double>& lineParameters,
                                             bool includeEndpoints);

/// The parameters at which a cubic has a given x.
///
/// @param bezier             four control points
/// @param x                  where the vertical line stands
/// @param[in,out] parameters the parameters are appended, at most four, in the root finder's order
/// @param includeEndpoints   whether t = 0 and t = 1 count
/// @return whether `parameters` is not empty afterwards: true as well where it was not empty before
ZARNMATH_API bool FindBezierIntersectionsAtX(const point2d* bezier, double x, std::vector<double>& parameters,
                                             bool includeEndpoints);

/// Whether a cubic crosses a segment. An end of the segment on the curve counts, an end of the curve on the segment does
/// not.
///
/// @param bezier four control points
/// @param line   the two ends of the segment
/// @return whether there is a crossing with t in (0, 1) and u in [0, 1]; false for a segment without length
[[nodiscard]] ZARNMATH_API bool DoesBezierIntersectLineSegment(const point2d* bezier, const point2d* line) noexcept;
[[nodiscard]] ZARNMATH_API bool DoesBezierIntersectLineSegment(const POINT* bezier, const POINT* line) noexcept;

/// @}

} // namespace ZarnMath::CubicBezier
