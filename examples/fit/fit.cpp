// One cubic through a run of points, whose ends and directions are known. Each pass moves the points' parameters to where
// they are nearest on the curve, and so brings it nearer. The points are from a cubic, which the fit approaches.
#include "picture/Svg.h"

#include <cmath>

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr Curve source{{{40.0, 50.0}, {70.0, 300.0}, {330.0, 320.0}, {440.0, 40.0}}};
constexpr int count = 25;

/// Unevenly along the source, as a hand would set them.
std::vector<point2d> SetPoints()
{
    std::vector<point2d> points;
    for (int i = 0; i < count; ++i) {
        const double x = static_cast<double>(i) / (count - 1);
        Curve left{};
        CubicBezier::LeftOf(Bias(x, 0.25), source.points, left.points);
        points.push_back(left[3]);
    }
    return points;
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {0.0, 350.0, 480.0, 10.0});
    const std::vector<point2d> points = SetPoints();
    const vector2d leaving = Normalize(source[1] - source[0]);
    const vector2d arriving = Normalize(source[3] - source[2]);
    for (const int passes : {1, 2, 4, 16, 64}) {
        Curve fit{};
        const double error = LeastSquares(points.data(), count, leaving, arriving, fit.points, passes);
        const double darkness = 0.25 + 0.125 * std::log2(passes);
        const std::string look = "stroke='#1f4e79' stroke-opacity='" + std::to_string(darkness) + "' ";
        picture.Polyline({fit[0], fit[1]}, look + "stroke-width='.8'");
        picture.Polyline({fit[2], fit[3]}, look + "stroke-width='.8'");
        picture.Circle(fit[1], 2.5, "fill='#1f4e79' fill-opacity='" + std::to_string(darkness) + "'");
        picture.Circle(fit[2], 2.5, "fill='#1f4e79' fill-opacity='" + std::to_string(darkness) + "'");
        picture.Cubics({fit}, "fill='none' stroke-width='1.5' " + look);
        std::printf("%3d passes: largest distance %.6f, handles to (%.4f, %.4f) and (%.4f, %.4f)\n", passes,
                    std::sqrt(error), fit[1].x, fit[1].y, fit[2].x, fit[2].y);
    }
    for (const point2d& p : points)
        picture.Circle(p, 3.0, "fill='#a33b20'");
}
