// A closed curve through points, with continuous curvature: the tangents D of neighbouring points satisfy
//     D[i-1] + 4 D[i] + D[i+1] = 3 (P[i+1] - P[i-1]),
// a cyclic tridiagonal system that is solved for both coordinates at once.
#include "picture/Svg.h"

#include <algorithm>
#include <cmath>

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

std::vector<Curve> SplineThrough(const std::vector<point2d>& points)
{
    const std::size_t n = points.size();
    TridiagonalMatrix matrix;
    std::vector<point2d> rhs;
    for (std::size_t i = 0; i < n; ++i) {
        matrix.AddRow(1.0, 4.0, 1.0);
        rhs.push_back(AsPoint(3.0 * (points[(i + 1) % n] - points[(i + n - 1) % n])));
    }
    const std::vector<point2d> tangents = matrix.Solve(rhs, true);
    std::vector<Curve> curves;
    for (std::size_t i = 0; i < n; ++i) {
        const std::size_t next = (i + 1) % n;
        curves.push_back({points[i], points[i] + AsVector(tangents[i]) / 3.0,
                          points[next] - AsVector(tangents[next]) / 3.0, points[next]});
    }
    return curves;
}

/// The curve and, beside it, how much it bends.
std::vector<point2d> Comb(const Curve& curve)
{
    const vector2d a = (curve[3] - curve[0]) - 3.0 * (curve[2] - curve[1]);
    const vector2d b = 3.0 * ((curve[2] - curve[1]) - (curve[1] - curve[0]));
    const vector2d c = 3.0 * (curve[1] - curve[0]);
    std::vector<point2d> comb;
    for (int i = 0; i <= 32; ++i) {
        const double t = i / 32.0;
        const point2d place = curve[0] + ((a * t + b) * t + c) * t;
        const vector2d left = Perpendicular(Normalize((3.0 * a * t + 2.0 * b) * t + c));
        const double curvature = CubicBezier::SafeBezierCurvature(t, AsPoint(a), AsPoint(b), AsPoint(c));
        comb.insert(comb.begin(), place);
        comb.push_back(place - left * (90.0 * curvature));
    }
    return comb;
}

} // namespace

void Draw(const std::string& path)
{
    std::vector<point2d> points; // five petals of different sizes
    for (int i = 0; i < 15; ++i)
        points.push_back(
            AsPoint(Degrees::AngleToVector(i * 24.0, i % 3 == 0 ? 38.0 : 78.0 + 12.0 * std::sin(2.0 * i))));
    const std::vector<Curve> curves = SplineThrough(points);

    Svg picture(path, {-115.0, 110.0, 115.0, -105.0});
    double length = 0.0;
    double jump = 0.0;
    for (std::size_t i = 0; i < curves.size(); ++i) {
        const Curve& curve = curves[i];
        const Curve& next = curves[(i + 1) % curves.size()];
        picture.Polygon(Comb(curve), "fill='#d08a3a' fill-opacity='.2' stroke='#d08a3a' stroke-width='.4'");
        length += CubicBezier::Length(curve.points, LengthAccuracy::Order16);
        const vector2d bend = (curve[3] - curve[2]) - (curve[2] - curve[1]); // a sixth of the second derivative
        const vector2d nextBend = (next[2] - next[1]) - (next[1] - next[0]);
        jump = std::max(jump, 6.0 * std::sqrt(LengthSquared(nextBend - bend)));
    }
    picture.Cubics(curves, "fill='#1f4e79' fill-opacity='.1' stroke='#1f4e79' stroke-width='1.5'");
    for (const point2d& p : points)
        picture.Circle(p, 2.0, "fill='#a33b20'");
    std::printf("%zu points, %zu cubics, %.6f long\n", points.size(), curves.size(), length);
    std::printf("the second derivative jumps by no more than %.2g\n", jump);
}
