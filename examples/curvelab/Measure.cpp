#include "Measure.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace curvelab {

using ZarnMath::vector2d;

double Distance(const point2d& p, const point2d& q)
{
    return std::sqrt(ZarnMath::LengthSquared(p - q));
}

ZarnMath::vector2d DerivativeAt(const PowerForm& p, double t)
{
    return {(p.a.x * 3.0 * t + 2.0 * p.b.x) * t + p.c.x, (p.a.y * 3.0 * t + 2.0 * p.b.y) * t + p.c.y};
}

std::vector<point2d> Sampled(const Cubic& curve, int chords)
{
    const PowerForm p = ToPowerForm(curve);
    std::vector<point2d> points{curve[0]};
    points.reserve(static_cast<std::size_t>(chords) + 1);
    for (int i = 1; i < chords; ++i)
        points.push_back(Evaluate(p, static_cast<double>(i) / chords));
    points.push_back(curve[3]);
    return points;
}

double LengthOf(const std::vector<point2d>& polyline)
{
    double length = 0.0;
    for (std::size_t i = 1; i < polyline.size(); ++i)
        length += Distance(polyline[i - 1], polyline[i]);
    return length;
}

double AreaOf(const std::vector<point2d>& polygon)
{
    // Triangles from the first corner: products of coordinates far from it would cancel.
    double twice = 0.0;
    for (std::size_t i = 2; i < polygon.size(); ++i)
        twice += ZarnMath::Cross(polygon[i] - polygon[0], polygon[i - 1] - polygon[0]);
    return 0.5 * twice;
}

namespace {

vector2d Unit(const vector2d& v)
{
    const double length = std::hypot(v.x, v.y);
    return length > 0.0 ? v / length : vector2d{0.0, 0.0};
}

/// The unit vector along a curve. Where the speed vanishes it is that of a short chord.
vector2d DirectionAt(const PowerForm& p, double t)
{
    constexpr double step = 1e-5;
    const vector2d speed = DerivativeAt(p, t);
    const vector2d chord = Evaluate(p, std::min(t + step, 1.0)) - Evaluate(p, std::max(t - step, 0.0));
    return Unit(std::hypot(speed.x, speed.y) * step < 1e-3 * std::hypot(chord.x, chord.y) ? chord : speed);
}

} // namespace

bool IsPoint(const Cubic& curve)
{
    return curve[0] == curve[1] && curve[0] == curve[2] && curve[0] == curve[3];
}

vector2d StartDirection(const Cubic& curve)
{
    for (std::size_t i = 1; i < 4; ++i)
        if (curve[i] != curve[0])
            return Unit(curve[i] - curve[0]);
    return {0.0, 0.0};
}

vector2d EndDirection(const Cubic& curve)
{
    return StartDirection({{curve[3], curve[2], curve[1], curve[0]}}) * -1.0;
}

double TurnBetween(const Cubic& before, const Cubic& after)
{
    const vector2d from = EndDirection(before);
    const vector2d to = StartDirection(after);
    return std::fabs(std::atan2(ZarnMath::Cross(from, to), ZarnMath::Dot(from, to))) * 180.0 / std::numbers::pi;
}

Track::Track(const Cubic& curve, double distance) : p_(ToPowerForm(curve)), distance_(distance), samples_(Stretch(128))
{}

point2d Track::PointAt(double t) const
{
    return Evaluate(p_, t) + ZarnMath::Perpendicular(DirectionAt(p_, t)) * distance_;
}

std::vector<point2d> Track::Stretch(int chords) const
{
    std::vector<point2d> points;
    for (int i = 0; i <= chords; ++i)
        points.push_back(PointAt(static_cast<double>(i) / chords));
    return points;
}

double Track::Distance(const point2d& q) const
{
    const auto nearest = std::min_element(samples_.begin(), samples_.end(), [&](const point2d& a, const point2d& b) {
        return ZarnMath::LengthSquared(q - a) < ZarnMath::LengthSquared(q - b);
    });
    const double step = 1.0 / static_cast<double>(samples_.size() - 1);
    const double t = static_cast<double>(nearest - samples_.begin()) * step;
    const double foot = Foot(q, std::max(t - step, 0.0), std::min(t + step, 1.0));
    return std::min(curvelab::Distance(q, *nearest), curvelab::Distance(q, PointAt(foot)));
}

/// The normals of the cubic are those of the curve at a distance from it.
double Track::Foot(const point2d& q, double from, double to) const
{
    double t = 0.5 * (from + to);
    for (int pass = 0; pass < 8; ++pass) {
        const vector2d away = q - Evaluate(p_, t);
        const vector2d speed = DerivativeAt(p_, t);
        const vector2d bend{6.0 * p_.a.x * t + 2.0 * p_.b.x, 6.0 * p_.a.y * t + 2.0 * p_.b.y};
        const double slope = ZarnMath::Dot(away, bend) - ZarnMath::LengthSquared(speed);
        if (slope == 0.0)
            break;
        t = std::clamp(t - ZarnMath::Dot(away, speed) / slope, from, to);
    }
    return t;
}

double LargerSide(const Bounds& box)
{
    return std::max(box.right - box.left, box.top - box.bottom);
}

std::vector<point2d> Outline(const Bounds& box)
{
    const point2d start{box.left, box.bottom};
    return {start, {box.right, box.bottom}, {box.right, box.top}, {box.left, box.top}, start};
}

} // namespace curvelab
