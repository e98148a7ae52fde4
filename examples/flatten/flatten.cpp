// A curve as a polyline that stays within a tolerance of it: the finer, the more points.
#include "picture/Svg.h"

#include <algorithm>
#include <cmath>
#include <limits>

using namespace ZarnMath;

namespace {

constexpr point2d curve[4] = {{20.0, 30.0}, {120.0, 460.0}, {240.0, -300.0}, {460.0, 170.0}};

/// The largest distance from the curve, at many places, to the polyline.
double FindDeviation(const std::vector<point2d>& polyline)
{
    constexpr int places = 2000;
    std::vector<point2d> samples(places + 1);
    BezierToLines(curve, samples.data(), places);
    double worst = 0.0;
    for (const point2d& p : samples) {
        double nearest = std::numeric_limits<double>::infinity();
        for (std::size_t i = 1; i < polyline.size(); ++i)
            nearest = std::min(nearest, DistanceToLineSegmentSqrd(polyline[i - 1], polyline[i], p));
        worst = std::max(worst, nearest);
    }
    return std::sqrt(worst);
}

} // namespace

void Draw(const std::string& path)
{
    struct Row
    {
        double tolerance; ///< in drawing units; the library takes its square
        const char* label;
        const char* colour;
        double up;
    };

    Svg picture(path, {0.0, 460.0, 480.0, 0.0});
    for (const auto& [tolerance, label, colour, up] : {Row{16.0, "within 16", "#a33b20", 270.0},
                                                       {4.0, "within 4", "#d08a3a", 185.0},
                                                       {1.0, "within 1", "#4c7a34", 100.0},
                                                       {0.25, "within 1/4", "#1f4e79", 15.0}}) {
        constexpr int most = 256;
        std::vector<point2d> polyline(most + 1);
        const int lines = AdaptiveBezierToLines(curve, polyline.data(), tolerance * tolerance, most);
        polyline.resize(static_cast<std::size_t>(lines) + 1);
        std::printf("tolerance %4g: %3d lines, off by %.6f\n", tolerance, lines, FindDeviation(polyline));
        for (point2d& p : polyline)
            p = p + vector2d{0.0, up};
        const std::string paint = std::string("fill='") + colour + "'";
        picture.Polyline(polyline, std::string("stroke-width='1.2' stroke='") + colour + "'");
        for (const point2d& p : polyline)
            picture.Circle(p, 2.4, paint);
        picture.Text({68.0, up + 92.0}, label, "font-size='11' " + paint);
    }
}
