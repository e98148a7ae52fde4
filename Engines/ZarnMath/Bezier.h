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
/// stated answer. Where a vector cannot grow its exception passes through, and vectors that are filled side by side may
/// then differ in length. All functions of this header are in the arithmetic class, the same bits on every machine,
/// unless one says otherwise.
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

/// How exactly a length is taken: the number of points at which the speed is sampled.
///
/// Any `int` can be cast to it: below 2 counts as 2, 9 as 10, and above 10 as 16.
enum class LengthAccuracy : int
{
    Order2 = 2,
    Order3 = 3,
    Order4 = 4,
    Order5 = 5,
    Order6 = 6,
    Order7 = 7,
    Order8 = 8,
    Order10 = 10,
    Order16 = 16,
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
/// @arithmetic
ZARNMATH_API void Split(double t, const point2d* in, point2d* left, point2d* right) noexcept;
ZARNMATH_API void Split(double t, const POINT* in, POINT* left, POINT* right) noexcept;

/// Cuts at one half, by midpoints (p + q)*0.5, which can differ in the last bit from the cut at t = 0.5. A curve of any
/// shape is cut: the halves of a point are that point.
///
/// @param in         four control points
/// @param[out] left  four control points of the first half
/// @param[out] right four control points of the second half
/// @arithmetic
ZARNMATH_API void Split(const point2d* in, point2d* left, point2d* right) noexcept;

/// Cuts at one half in whole units: each of the six midpoints is (p + q)/2 in 32-bit integers, truncated toward zero.
///
/// The pieces meet exactly. The truncation adds up over the three levels, and a sum beyond 32 bits wraps.
///
/// @param in         four control points
/// @param[out] left  four control points of the first half
/// @param[out] right four control points of the second half
/// @arithmetic
ZARNMATH_API void Split(const POINT* in, POINT* left, POINT* right) noexcept;

/// Cuts at t into one run of points.
///
/// @param t        parameter of the cut; outside [0, 1] the pieces describe the extended polynomial
/// @param in       four control points
/// @param[out] out seven points: the left piece in elements 0 to 3, the right piece in 3 to 6
/// @arithmetic
ZARNMATH_API void Split(double t, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Split(double t, const POINT* in, POINT* out) noexcept;

/// Cuts at two parameters into one run of points.
///
/// Each piece is computed from the input curve, as `LeftOf`(t0), `Subsection`(t0, t1) and `RightOf`(t1) in this order, so
/// that element 3 is the start of the middle piece and element 6 the start of the last one. t0 <= 0 and t1 >= 1 take
/// their special meaning for the middle piece only.
///
/// @param t0, t1   parameters of the cuts, t0 <= t1 for pieces that follow each other; outside [0, 1] the first and the
///                 last piece describe the extended polynomial
/// @param in       four control points
/// @param[out] out ten points: the pieces in elements 0 to 3, 3 to 6 and 6 to 9
/// @arithmetic
ZARNMATH_API void Split(double t0, double t1, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Split(double t0, double t1, const POINT* in, POINT* out) noexcept;

/// The piece from 0 to t, bit for bit the left piece of `Split`.
///
/// @param t        parameter of the cut; beyond 1 the piece goes on along the extended polynomial, below 0 it runs
///                 backward from P0, and at 0 it is the point P0 four times
/// @param in       four control points
/// @param[out] out four control points; may be `in`
/// @arithmetic
ZARNMATH_API void LeftOf(double t, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void LeftOf(double t, const POINT* in, POINT* out) noexcept;

/// The piece from t to 1, bit for bit the right piece of `Split`.
///
/// @param t        parameter of the cut; below 0 the piece begins on the extended polynomial, beyond 1 it runs backward
///                 to P3, and at 1 it is the point P3 four times
/// @param in       four control points
/// @param[out] out four control points; may be `in`
/// @arithmetic
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
/// @arithmetic
ZARNMATH_API void Subsection(double t0, double t1, const point2d* in, point2d* out) noexcept;
ZARNMATH_API void Subsection(double t0, double t1, const POINT* in, POINT* out) noexcept;

/// @}
/// @name Construction
/// Cubics through given points, rounded to whole units, as for a curve that is dragged by a point on it.
/// @{

/// A quadratic arc by three points, raised to a cubic.
///
/// Its control point Q is one of two:
/// - *simple*: through + (through - (start + end)/2), so that the arc runs through `through` at t = 0.5;
/// - otherwise on the outer bisector of the corner at `through`, as far from it as the geometric mean of the distances of
///   start and end from the line through it that is square to the bisector. This makes a pleasant arc near `through`,
///   and not in general through it. Where start, `through` and end follow each other on a straight line, so that there is
///   no bisector, Q is `through` itself.
///
/// @param[out] out            four control points: the rounded start, start + 2/3*(Q - start), Q + 1/3*(end - Q) and end
/// @param start, through, end the points, in curve order
/// @param simple              asks for the simple arc, which is taken anyway where `through` or end coincides with start
/// @arithmetic
ZARNMATH_API void From3Points(POINT* out, const point2d& start, const point2d& through, const point2d& end,
                              bool simple) noexcept;

/// The cubic with given end tangents that runs through a point at t = 0.5.
///
/// Its inner control points are start + startTangent*alpha and end + endTangent*beta. A tangent gives a line, not a
/// direction: alpha and beta may come out negative.
///
/// @param[out] out              four control points, rounded
/// @param start, through, end   the points, in curve order
/// @param startTangent          the line of the tangent at start, of any length
/// @param endTangent            the line of the tangent at end, of any length
/// @return false, with `out` untouched, where |Cross(startTangent, endTangent)| <= DBL_EPSILON: the tangents are parallel,
///         or too short
/// @arithmetic
ZARNMATH_API bool From3Points(POINT* out, const point2d& start, const vector2d& startTangent, const point2d& through,
                              const point2d& end, const vector2d& endTangent) noexcept;

/// @}
/// @name Curvature
/// Curvature is signed: Cross(P', P'')/|P'|^3, positive where the curve turns to the left, that is counter-clockwise. Its
/// radius, the reciprocal, has the same sign. Both are undefined at a cusp, where P' vanishes.
///
/// The `Safe` functions give a usable value at a cusp and at coincident control points too.
/// @{

/// The curvature at a parameter.
///
/// @param t              parameter; outside [0, 1] that of the extended polynomial
/// @param a, b, c        power form
/// @param[out] curvature in reciprocal drawing units
/// @return false, with `curvature` untouched, where |P'(t)|^3 is not above 0. There is no tolerance, but the cube of a
///         speed below about 1e-108 underflows to 0
/// @arithmetic
ZARNMATH_API bool GetCurvatureAt(double t, const point2d& a, const point2d& b, const point2d& c,
                                 double& curvature) noexcept;

/// The radius of curvature at a parameter.
///
/// @param t           parameter; outside [0, 1] that of the extended polynomial
/// @param a, b, c     power form
/// @param[out] radius in drawing units; the largest double where the curve is straight or has a cusp
/// @return false where Cross(P', P'') is exactly 0; `radius` is written all the same
/// @arithmetic
ZARNMATH_API bool GetCurvatureRadiusAt(double t, const point2d& a, const point2d& b, const point2d& c,
                                       double& radius) noexcept;

/// The curvature at a parameter, or near it.
///
/// @param t       parameter; outside [0, 1] that of the extended polynomial
/// @param a, b, c power form
/// @return the curvature at t, in reciprocal drawing units; where it is undefined, that at t + 1e-05 for t <= 0.5 and at
///         t - 1e-05 beyond, toward the middle of the curve; and 0.0 where that is undefined too
/// @arithmetic
[[nodiscard]] ZARNMATH_API double SafeBezierCurvature(double t, const point2d& a, const point2d& b,
                                                      const point2d& c) noexcept;

/// The two parameters at which Cross(P', P'') vanishes, where the curvature changes sign.
///
/// Nothing is filtered: the values are not sorted, may lie outside [0, 1], and are equal for a double root. Where the
/// quadratic has no quadratic term they are infinite or NaN.
///
/// @param a, b, c  power form
/// @param[out] out two values
/// @return 2; or 0, with `out` untouched, where the discriminant is negative
/// @arithmetic
ZARNMATH_API int BezierInflectionPoints(const point2d& a, const point2d& b, const point2d& c, double* out) noexcept;

/// The parameters in (0, 1) at which the derivative of |P'|^6 vanishes, where the speed is extreme.
///
/// On a curve as it is commonly drawn these lie near its sharpest and its flattest points; curvature itself does not
/// enter. A zero of the speed is a double root of that polynomial, of degree 11, and may be listed once, twice or not at
/// all.
///
/// @param a, b, c  power form
/// @param[out] out room for 11 values, of which the count is written, in the root finder's order
/// @return the number of parameters
/// @arithmetic
ZARNMATH_API int FindCurvatureMinMax(const point2d& a, const point2d& b, const point2d& c, double* out) noexcept;

/// The direction in which a cubic runs at a parameter.
///
/// The first of these that is long enough, its squared length at least DBL_EPSILON: the derivative; the chord over a step
/// of 1e-05 toward the middle of the curve; and, whatever its length, the chord from 1e-06 to 0.999999. At the start of a
/// curve with P1 = P0, the second step serves only control polygons of about 50 units or more; below that it is the
/// direction of the whole curve.
///
/// @param t          parameter; outside [0, 1] that of the extended polynomial
/// @param a, b, c, d power form
/// @return the direction, of no meaningful length; (1, 0) for a curve whose last chord is exactly zero
/// @arithmetic
[[nodiscard]] ZARNMATH_API vector2d SafeBezierTangent(double t, const point2d& a, const point2d& b, const point2d& c,
                                                      const point2d& d) noexcept;

/// @}
/// @name Length
/// Arc length, in drawing units, by one pass of Gauss-Legendre quadrature of the speed, without control of the error. The
/// nodes and weights are kept short, most of them at eight decimal places: at orders 5, 6 and 10 a straight unit segment
/// is off by 1e-08 already. A curve with a sharp turn between samples is off by far more.
///
/// The squared speed is evaluated as a quartic: where it all but vanishes, rounding can take it below zero, and the length
/// is then NaN.
/// @{

/// The length of a stretch.
///
/// @param a, b, c power form
/// @param order   number of samples: below 2 counts as 2, 9 as 10, above 10 as 16
/// @param t0, t1  the stretch; beyond [0, 1] that of the extended polynomial
/// @return the length, negative for t1 < t0
/// @arithmetic
[[nodiscard]] ZARNMATH_API double Length(const point2d& a, const point2d& b, const point2d& c, int order, double t0,
                                         double t1) noexcept;

/// The length from 0 to 1.
///
/// @param a, b, c  power form
/// @param accuracy number of samples
/// @return the length
/// @arithmetic
[[nodiscard]] ZARNMATH_API double Length(const point2d& a, const point2d& b, const point2d& c,
                                         LengthAccuracy accuracy) noexcept;

/// The length from 0 to 1; for `point2d`.
///
/// @param curve    four control points
/// @param accuracy number of samples
/// @return the length
/// @arithmetic
template <typename P>
[[nodiscard]] double Length(const P* curve, LengthAccuracy accuracy) noexcept;

extern template ZARNMATH_API double Length<point2d>(const point2d*, LengthAccuracy) noexcept;

/// The length from 0 to t, of the piece that `LeftOf` cuts, with ten samples.
///
/// @param t     parameter; outside [0, 1] the piece is extrapolated
/// @param curve four control points; the piece of an integer curve is not rounded
/// @return the length, exactly 0.0 for t = 0
/// @arithmetic
[[nodiscard]] ZARNMATH_API double LengthTo(double t, const point2d* curve) noexcept;
[[nodiscard]] ZARNMATH_API double LengthTo(double t, const POINT* curve) noexcept;

/// The length from t to 1, of the piece that `RightOf` cuts, with ten samples.
///
/// @param t     parameter; outside [0, 1] the piece is extrapolated
/// @param curve four control points; the piece of an integer curve is not rounded
/// @return the length, exactly 0.0 for t = 1
/// @arithmetic
[[nodiscard]] ZARNMATH_API double LengthFrom(double t, const point2d* curve) noexcept;
[[nodiscard]] ZARNMATH_API double LengthFrom(double t, const POINT* curve) noexcept;

/// The parameter up to which a cubic has a given fraction of its length.
///
/// A bracketed false position, whose first pass bisects and whose others move by at least 1e-04 of the bracket, from
/// either end of it. Each pass takes the length from 0 anew.
///
/// @param fraction  of the length from 0 to 1; at most 0 gives 0.0, at least 1 gives 1.0
/// @param a, b, c   power form
/// @param tolerance the search ends once the length is off by no more, in drawing units, or an end of the bracket is
///                  within DBL_EPSILON. After 200 passes it ends as well, and with a tolerance of 0 usually so
/// @param accuracy  number of samples
/// @return the parameter; 0.5 for a curve of no length
/// @arithmetic
[[nodiscard]] ZARNMATH_API double GetCurveRelativeLengthParameter(double fraction, point2d a, point2d b, point2d c,
                                                                  double tolerance, LengthAccuracy accuracy) noexcept;

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
/// @param[out] t               parameter of the nearest point, in [0, 1] but for a double root, whose search is not
///                             confined
/// @param[out] point           the nearest point, by Horner's rule
/// @param[out] distanceSquared its squared distance from q
/// @return whether there is a stationary point. If not, the three results are untouched. Among equal distances the
///         candidate that the root finder lists first stays. A curve collapsed to a point has none. Where every squared
///         distance overflows, distanceSquared is the largest double, and t and point are untouched
/// @arithmetic
ZARNMATH_API bool FindClosestPointOnBezier(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                           const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept;

/// The nearest stationary point of a cubic given by its control points.
///
/// @param bezier               four control points
/// @param q                    query point
/// @param[out] t               parameter of the nearest point, in [0, 1] but for a double root, whose search is not
///                             confined
/// @param[out] point           the nearest point, by Horner's rule
/// @param[out] distanceSquared its squared distance from q
/// @return whether there is a stationary point. If not, the three results are untouched. Among equal distances the
///         candidate that the root finder lists first stays. A curve collapsed to a point has none.
/// @arithmetic
ZARNMATH_API bool FindClosestPointOnBezier(const point2d* bezier, const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept;

/// The nearest stationary point of an integer cubic.
///
/// @param bezier               four control points
/// @param q                    query point
/// @param[out] t               parameter of the nearest point, in [0, 1] but for a double root, whose search is not
///                             confined
/// @param[out] point           the nearest point, rounded
/// @param[out] distanceSquared the squared distance of the *unrounded* point from q
/// @return whether there is a stationary point; if not, the three results are untouched
/// @arithmetic
ZARNMATH_API bool FindClosestPointOnBezier(const POINT* bezier, const POINT& q, double& t, POINT& point,
                                           double& distanceSquared) noexcept;

/// The parameter of the nearest stationary point, with the ends of the curve as the fallback.
///
/// @param bezier four control points
/// @param q      query point
/// @return the parameter; where there is no stationary point, 0.0 if P0 is strictly nearer to q than P3, otherwise 1.0
/// @arithmetic
[[nodiscard]] ZARNMATH_API double FindClosestPointOnBezier(const POINT* bezier, const POINT& q) noexcept;

/// All stationary points of the squared distance, in the open interval (0, 1).
///
/// @param bezier                  four control points
/// @param q                       query point
/// @param[in,out] ts              parameters, at most five, in the root finder's order
/// @param[in,out] points          the points; those of the `POINT` overload are rounded
/// @param[in,out] squaredDistances squared distances from q to these points (to the rounded ones, for `POINT`)
/// @return whether anything was found. The three vectors are appended to, never cleared, and not sorted by distance.
/// @arithmetic
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
/// @arithmetic
ZARNMATH_API bool GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                          double& t, point2d& point, double& distanceSquared, Side& side) noexcept;

/// On which side of a cubic a point lies.
///
/// @param a, b, c, d power form
/// @param q          query point
/// @return the side, and `SideNone` too where there is no nearest point
/// @arithmetic
[[nodiscard]] ZARNMATH_API Side GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                        const point2d& q) noexcept;

/// The parameter at which a cubic passes through a point, within 0.1 units.
///
/// The nearest stationary point is sought for t in (-1, 2), so that the ends of the curve are matched. If the best one
/// lies on the continuation of the curve, the point is not matched at all, even if the segment comes near it elsewhere.
///
/// @param a, b, c, d         power form
/// @param q                  the point
/// @param[in,out] parameters the parameter is appended if it lies in [0, 1] and the squared distance is below 0.01: at
///                           most one, so that there is no order to it
/// @return whether `parameters` is not empty afterwards: true as well where it was not empty before
/// @arithmetic
ZARNMATH_API bool Invert(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                         std::vector<double>& parameters);

/// The parameters at which the tangent line of a cubic runs through a point, as the roots of a quartic in [0, 1].
///
/// @param a, b, c, d      power form
/// @param q               the point
/// @param[out] parameters room for five values, of which the count is written, in the root finder's order (where the
///                        quartic is really of degree 2 or less, element 0 may be written although the count is 0)
/// @return the number of parameters
/// @arithmetic
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
/// @arithmetic
ZARNMATH_API void ConvertBezierToImplicit(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                          double& Kxxx, double& Kyyy, double& Kxxy, double& Kxyy, double& Kxx,
                                          double& Kyy, double& Kxy, double& Kx, double& Ky, double& K1) noexcept;

/// @}
/// @name Intersection
/// @{

/// The points at which two cubics cross.
///
/// One of the curves is made implicit and the other substituted, which leaves a polynomial of degree 9 in the parameter
/// of the second (Sederberg and Parry, 1986). Each root in (0, 1) is kept where the point lies within 0.1 units of the
/// first curve's segment. Before that, a curve whose control points lie within 2 units of a straight line is taken for
/// its chord, the first one before the second; crossings are then accepted within 2 units of the curve. These lengths
/// are absolute: a curve of a few units always counts as straight.
///
/// Nothing is found where the curves
/// - share an end point only, since the range of the parameters is open;
/// - touch without crossing;
/// - overlap, and lie on one algebraic curve or on one line;
/// - both have no cubic term (a = (0, 0)), as two parabolas.
///
/// @param first, second            four control points each
/// @param[in,out] firstParameters  parameters on the first curve, in [0, 1]
/// @param[in,out] secondParameters parameters on the second curve, in [0, 1]
/// @param[in,out] points           the points, on the curve that was substituted
///
/// The three vectors are parallel and hold at most nine crossings more than before, in the root finder's order, neither
/// sorted nor made unique. Pass empty ones: crossings with a straight curve are appended, all others replace what the
/// vectors held.
/// @arithmetic
ZARNMATH_API void FindBezierIntersections(const point2d* first, const point2d* second,
                                          std::vector<double>& firstParameters, std::vector<double>& secondParameters,
                                          std::vector<point2d>& points);
ZARNMATH_API void FindBezierIntersections(const POINT* first, const POINT* second, std::vector<double>& firstParameters,
                                          std::vector<double>& secondParameters, std::vector<point2d>& points);

/// @}
/// @name Lines
/// The curve substituted into the line's equation, a cubic in t. A curve that lies along the line crosses it nowhere.
/// @{

/// The points at which a cubic crosses the infinite line through two points.
///
/// @param bezier                four control points
/// @param line                  two points, at which the line's parameter is 0 and 1
/// @param[out] bezierParameters parameters on the curve, in (0, 1) or [0, 1], at most four, in the root finder's order
/// @param[out] lineParameters   parameters along the line, element for element; any real number
/// @param includeEndpoints      whether t = 0 and t = 1 of the curve count. Even then t = 0 is dropped where the curve
///                              crosses twice besides
/// @return whether anything was found. Both vectors are cleared first, and stay empty where the two points of the line
///         are exactly equal.
/// @arithmetic
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
/// @param includeEndpoints   whether the range is [0, 1] or (0, 1)
/// @return whether `parameters` is not empty afterwards: true as well where it was not empty before
/// @arithmetic
ZARNMATH_API bool FindBezierIntersectionsAtX(const point2d* bezier, double x, std::vector<double>& parameters,
                                             bool includeEndpoints);

/// Whether a cubic crosses a segment. An end of the segment on the curve counts, an end of the curve on the segment
/// does not.
///
/// @param bezier four control points
/// @param line   the two ends of the segment
/// @return whether there is a crossing with t in (0, 1) and u in [0, 1]; false for a segment without length
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool DoesBezierIntersectLineSegment(const point2d* bezier, const point2d* line) noexcept;
[[nodiscard]] ZARNMATH_API bool DoesBezierIntersectLineSegment(const POINT* bezier, const POINT* line) noexcept;

/// @}
/// @name Self-intersection and fast predicates
/// @{

/// Whether a cubic has a loop, in closed form, and about where it crosses itself.
///
/// A cubic without real inflections has a loop somewhere (Stone and DeRose, 1989). The two passes of the crossing are
/// bracketed by tangency: the later pass by the parameters at which the tangent runs through P0, the earlier one by
/// those of P3 on the reversed curve.
///
/// @param bezier                      four control points
/// @param[out] lateStart, lateEnd     the stretch of the later pass, ascending, within [0, 1]
/// @param[out] earlyStart, earlyEnd   the stretch of the earlier pass, likewise
/// @param allowClosed                 whether a curve whose ends coincide counts as crossing itself there
/// @return whether the curve crosses itself. If not, the four results may have been written, or not, and mean nothing.
/// @arithmetic
ZARNMATH_API bool DoesBezierSelfIntersect(const point2d* bezier, double& lateStart, double& lateEnd, double& earlyStart,
                                          double& earlyEnd, bool allowClosed) noexcept;
ZARNMATH_API bool DoesBezierSelfIntersect(const POINT* bezier, double& lateStart, double& lateEnd, double& earlyStart,
                                          double& earlyEnd, bool allowClosed) noexcept;

/// The point at which a cubic crosses itself.
///
/// The two stretches of `DoesBezierSelfIntersect` are halved against each other. Stretches below one unit are given up,
/// so that a small loop, such as (0, 0), (30, 30), (-10, 30), (20, 0), is not found.
///
/// @param bezier      four control points
/// @param[out] first  parameter of the later pass
/// @param[out] second parameter of the earlier pass
/// @param[out] point  the crossing
/// @return whether it was found. If not, the results may have been written, and mean nothing. Where one of the
///         stretches is a point, the crossing is at an end of the curve, and first is the smaller parameter: 0 and 1
///         for a closed curve.
/// @arithmetic
ZARNMATH_API bool FindBezierSelfIntersection(const point2d* bezier, double& first, double& second,
                                             point2d& point) noexcept;
ZARNMATH_API bool FindBezierSelfIntersection(const POINT* bezier, double& first, double& second,
                                             point2d& point) noexcept;

/// Whether two cubics meet: share an end point exactly, or cross as `FindBezierIntersections` sees it.
///
/// @param one, other four control points each
/// @return whether they do; of two points, whether they are exactly equal
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool DoBeziersIntersect(const point2d* one, const point2d* other);
[[nodiscard]] ZARNMATH_API bool DoBeziersIntersect(const POINT* one, const POINT* other);

/// Whether a cubic comes within a distance of a segment, strictly, by cheap tests first.
///
/// One end of the segment has to lie in the box of the control points grown by the distance: a segment that runs right
/// through the curve with both ends outside gets false. The closest approach to the interior of the segment is not
/// sought, only that of the two ends of the curve, and the crossing itself.
///
/// @param bezier             four control points
/// @param lineStart, lineEnd the segment, which may be without length
/// @param halfWidth          the distance, in drawing units
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool DoesFatlineIntersectBezier(const point2d* bezier, const point2d& lineStart,
                                                           const point2d& lineEnd, double halfWidth) noexcept;

/// @}
/// @name Directions and extents
/// Where the tangent has a given direction, as the roots of a quadratic: its leading coefficient counts as zero up to
/// 1e-9, so that a root far outside the segment, and on tiny curves one inside it, is lost.
/// @{

/// The parameters in (0, 1) at which the tangent is vertical, where x has an extreme.
///
/// @param a, b, c            power form
/// @param[in,out] parameters at most two are appended, in ascending order. The ends of the curve are never among them, and
///                           nothing is for a vertical straight curve
/// @arithmetic
ZARNMATH_API void GetVerticalTangents(const point2d& a, const point2d& b, const point2d& c,
                                      std::vector<double>& parameters);

/// The parameters in (0, 1) at which the tangent is horizontal, where y has an extreme.
///
/// @param a, b, c            power form
/// @param[in,out] parameters at most two are appended, in ascending order. The ends of the curve are never among them, and
///                           nothing is for a horizontal straight curve
/// @arithmetic
ZARNMATH_API void GetHorizontalTangents(const point2d& a, const point2d& b, const point2d& c,
                                        std::vector<double>& parameters);

/// The parameters in [0, 1] at which the tangent is parallel to a direction, either way along it.
///
/// @param a, b, c            power form
/// @param direction          the direction, of any length. The zero vector is parallel to everything
/// @param[in,out] parameters at most two are appended, in ascending order; a double root at 0 is appended twice
/// @param[out] allParallel   whether the tangent is parallel to the direction everywhere, each coefficient of the quadratic
///                           being at most DBL_EPSILON; nothing is appended then
/// @arithmetic
ZARNMATH_API void GetParallels(const point2d& a, const point2d& b, const point2d& c, const vector2d& direction,
                               std::vector<double>& parameters, bool& allParallel);

/// The signed area between a cubic and the x axis, the exact integral of y dx from t = 0 to t = 1.
///
/// Positive where the curve runs above the axis with x increasing. The sum over a closed outline is the area that it
/// encloses, positive for a clockwise one.
///
/// @param a, b, c, d power form
/// @return the area, in drawing units squared
/// @arithmetic
[[nodiscard]] ZARNMATH_API double GetAreaUnderBezier(const point2d& a, const point2d& b, const point2d& c,
                                                     const point2d& d) noexcept;

/// The point at a distance from a cubic, square to its direction.
///
/// @param bezier        four control points
/// @param t             parameter; outside [0, 1] the curve is extrapolated
/// @param offset, scale the product is the distance, positive to the left of the direction of travel
/// @return P(t) + offset*scale*Perpendicular(n), with n the normalised `SafeBezierTangent`. Where that is too short to be
///         normalised, the point lies nearer
/// @arithmetic
[[nodiscard]] ZARNMATH_API point2d MapToBezier(const point2d* bezier, double t, double offset, double scale) noexcept;

/// @}
/// @name Offset cusps
/// The offset of a cubic by a signed distance, P(t) + distance*n(t) with n the left normal, turns back on itself where the
/// radius of curvature equals the distance.
/// @{

/// The parameters in (0, 1) at which the offset of a cubic has a cusp.
///
/// @param a, b, c         power form
/// @param distance        in drawing units, positive to the left of the direction of travel; 0 has no cusps
/// @param[out] parameters cleared, then filled in the root finder's order, with at most 12 values
/// @return whether there is any. A double root, where the radius only touches the distance, may be listed once, twice or
///         not at all, and so may a zero of the speed, which counts for positive distances
/// @arithmetic
ZARNMATH_API bool FindOffsetCusps(const point2d& a, const point2d& b, const point2d& c, double distance,
                                  std::vector<double>& parameters);

/// @}

} // namespace ZarnMath::CubicBezier
