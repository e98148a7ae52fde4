/// @file
/// One cubic Bezier segment, and the segments that other kinds of curve become.
#pragma once

#include <ZarnMath/ZarnMath.h>

#include <array>
#include <vector>

namespace curvelab {

using ZarnMath::POINT;
using ZarnMath::point2d;
using Bounds = ZarnMath::BoundsT<double>;
using Cubic = ZarnMath::CubicBezier::bezier2dT<point2d>;
/// A cubic on whole drawing units, as the `POINT` overloads of the library take it.
using IntegerCubic = std::array<POINT, 4>;

/// The coefficients of P(t) = ((a*t + b)*t + c)*t + d.
struct PowerForm
{
    point2d a, b, c, d;
};

/// The straight segment from p to q, with the inner control points at its thirds: P(t) = p + (q - p)*t.
[[nodiscard]] Cubic LineAsCubic(const point2d& p, const point2d& q);

/// The quadratic p, control, q as a cubic; degree elevation, the same curve at every parameter.
[[nodiscard]] Cubic QuadraticAsCubic(const point2d& p, const point2d& control, const point2d& q);

/// An elliptical arc in the end-point form of SVG.
struct Arc
{
    double rx, ry;     ///< radii; negative ones count as positive, too small ones grow until the arc reaches
    double rotation;   ///< of the ellipse's x axis, in degrees
    bool large, sweep; ///< which of the four arcs through the ends
    point2d end;
};

/// The arc as cubics of at most a quarter turn each, which run up to 2.73e-4 of the radius outside a circle.
///
/// @return in order, the last one ending in `arc.end` exactly; a straight line if a radius is 0; nothing if the ends
///         coincide
[[nodiscard]] std::vector<Cubic> ArcAsCubics(const point2d& start, const Arc& arc);

/// The power form, in the grouping that the library documents.
[[nodiscard]] PowerForm ToPowerForm(const Cubic& curve);

/// P(t) by Horner's rule.
[[nodiscard]] point2d Evaluate(const PowerForm& p, double t);

/// Each control point rounded to whole units.
[[nodiscard]] IntegerCubic Rounded(const Cubic& curve);

/// The same curve in double; exact.
[[nodiscard]] Cubic ToDouble(const IntegerCubic& curve);

/// The bounds of nothing, inside out.
[[nodiscard]] Bounds NoBounds();

/// Grows bounds to take in a point.
void Include(Bounds& bounds, const point2d& p);

/// Grows bounds to take in a curve tightly: its ends and its extremes, not its control points.
void Include(Bounds& bounds, const Cubic& curve);

} // namespace curvelab
