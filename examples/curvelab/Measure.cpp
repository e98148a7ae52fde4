#include "Measure.h"

#include <algorithm>
#include <cmath>

namespace curvelab {

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
