#include "Cubic.h"

#include <svgpp/utility/arc_endpoint_to_center.hpp>

#include <algorithm>
#include <cmath>
#include <limits>
#include <numbers>

namespace curvelab {

using ZarnMath::vector2d;

Cubic LineAsCubic(const point2d& p, const point2d& q)
{
    const vector2d third = (q - p) / 3.0;
    return {{p, p + third, q - third, q}};
}

Cubic QuadraticAsCubic(const point2d& p, const point2d& control, const point2d& q)
{
    return {{p, p + (control - p) * 2.0 / 3.0, q + (control - q) * 2.0 / 3.0, q}};
}

namespace {

/// The centre form of an arc: the ellipse, and the eccentric anomalies of its two ends.
struct CentreForm
{
    point2d centre;
    double rx, ry, rotation, from, to;
};

CentreForm ToCentreForm(const point2d& start, const Arc& arc)
{
    CentreForm f{{}, std::fabs(arc.rx), std::fabs(arc.ry), arc.rotation * std::numbers::pi / 180.0, 0.0, 0.0};
    svgpp::arc_endpoint_to_center(start.x, start.y, arc.end.x, arc.end.y, f.rx, f.ry, f.rotation, arc.large, arc.sweep,
                                  f.centre.x, f.centre.y, f.from, f.to);
    if (arc.sweep && f.to < f.from)
        f.to += 2.0 * std::numbers::pi;
    if (!arc.sweep && f.to > f.from)
        f.to -= 2.0 * std::numbers::pi;
    return f;
}

point2d PointAt(const CentreForm& f, double angle)
{
    const double x = f.rx * std::cos(angle), y = f.ry * std::sin(angle);
    const double c = std::cos(f.rotation), s = std::sin(f.rotation);
    return {f.centre.x + (x * c - y * s), f.centre.y + (x * s + y * c)};
}

/// The derivative of the ellipse by the eccentric anomaly.
vector2d TangentAt(const CentreForm& f, double angle)
{
    const double x = -f.rx * std::sin(angle), y = f.ry * std::cos(angle);
    const double c = std::cos(f.rotation), s = std::sin(f.rotation);
    return {x * c - y * s, x * s + y * c};
}

} // namespace

std::vector<Cubic> ArcAsCubics(const point2d& start, const Arc& arc)
{
    if (start == arc.end)
        return {};
    if (arc.rx == 0.0 || arc.ry == 0.0)
        return {LineAsCubic(start, arc.end)};

    const CentreForm f = ToCentreForm(start, arc);
    // A quarter turn comes out of the arc tangents as pi/2 give or take a rounding, which must not cut it in two.
    constexpr double quarter = std::numbers::pi / 2.0 * (1.0 + 1e-12);
    const double count = std::max(1.0, std::ceil(std::fabs(f.to - f.from) / quarter));
    const double step = (f.to - f.from) / count;
    // With arms of 4/3*tan(step/4) the middle of each piece lies on the ellipse, too.
    const double arm = 4.0 / 3.0 * std::tan(step / 4.0);

    std::vector<Cubic> pieces;
    point2d at = start;
    for (double i = 0.0; i < count; ++i) {
        const double from = f.from + i * step, to = f.from + (i + 1.0) * step;
        const point2d next = i + 1.0 < count ? PointAt(f, to) : arc.end;
        pieces.push_back({{at, at + TangentAt(f, from) * arm, next - TangentAt(f, to) * arm, next}});
        at = next;
    }
    return pieces;
}

PowerForm ToPowerForm(const Cubic& curve)
{
    const auto& [p0, p1, p2, p3] = curve.points;
    return {{p3.x - (p2.x - p1.x) * 3.0 - p0.x, p3.y - (p2.y - p1.y) * 3.0 - p0.y},
            {(p0.x + (p2.x - (p1.x + p1.x))) * 3.0, (p0.y + (p2.y - (p1.y + p1.y))) * 3.0},
            {(p1.x - p0.x) * 3.0, (p1.y - p0.y) * 3.0},
            p0};
}

point2d Evaluate(const PowerForm& p, double t)
{
    return {((p.a.x * t + p.b.x) * t + p.c.x) * t + p.d.x, ((p.a.y * t + p.b.y) * t + p.c.y) * t + p.d.y};
}

IntegerCubic Rounded(const Cubic& curve)
{
    IntegerCubic rounded{};
    for (std::size_t i = 0; i < rounded.size(); ++i)
        rounded[i] = {ZarnMath::RoundToInt(curve[i].x), ZarnMath::RoundToInt(curve[i].y)};
    return rounded;
}

Cubic ToDouble(const IntegerCubic& curve)
{
    Cubic exact{};
    for (std::size_t i = 0; i < curve.size(); ++i)
        exact[i] = {static_cast<double>(curve[i].x), static_cast<double>(curve[i].y)};
    return exact;
}

Bounds NoBounds()
{
    constexpr double infinity = std::numeric_limits<double>::infinity();
    return {infinity, -infinity, -infinity, infinity};
}

void Include(Bounds& bounds, const point2d& p)
{
    bounds.left = std::min(bounds.left, p.x);
    bounds.right = std::max(bounds.right, p.x);
    bounds.bottom = std::min(bounds.bottom, p.y);
    bounds.top = std::max(bounds.top, p.y);
}

namespace {

/// Where the derivative of one coordinate vanishes: the roots of 3a*t^2 + 2b*t + c, by the form without cancellation
/// (one root from the larger sum, the other from the product of the roots).
std::array<double, 2> Extremes(double a, double b, double c)
{
    const double s = -(b + std::copysign(std::sqrt(std::max(b * b - 3.0 * a * c, 0.0)), b));
    return {s / (3.0 * a), c / s};
}

void IncludeExtremes(Bounds& bounds, const PowerForm& p, double a, double b, double c)
{
    for (const double t : Extremes(a, b, c))
        if (t > 0.0 && t < 1.0)
            Include(bounds, Evaluate(p, t));
}

/// Whether the inner control points lie between the ends, so that the coordinate has its extremes at the ends.
bool IsBetweenEnds(double p0, double p1, double p2, double p3)
{
    const auto [low, high] = std::minmax(p0, p3);
    return p1 >= low && p1 <= high && p2 >= low && p2 <= high;
}

} // namespace

void Include(Bounds& bounds, const Cubic& curve)
{
    const auto& [p0, p1, p2, p3] = curve.points;
    const PowerForm p = ToPowerForm(curve);
    Include(bounds, p0);
    Include(bounds, p3);
    if (!IsBetweenEnds(p0.x, p1.x, p2.x, p3.x))
        IncludeExtremes(bounds, p, p.a.x, p.b.x, p.c.x);
    if (!IsBetweenEnds(p0.y, p1.y, p2.y, p3.y))
        IncludeExtremes(bounds, p, p.a.y, p.b.y, p.c.y);
}

} // namespace curvelab
