// Lines beside a curve, at growing distances. The offset of a cubic is no cubic: where it does not fold it is fitted, and
// the curve is halved where one cubic does not come near enough.
#include "picture/Svg.h"

#include <algorithm>
#include <cmath>
#include <limits>

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr Curve curve{{{90.0, 60.0}, {200.0, 420.0}, {280.0, -160.0}, {400.0, 200.0}}};
constexpr double tolerance = 0.05;

void FitOffset(const Curve& piece, double distance, int depth, std::vector<Curve>& offsets)
{
    Curve fit{};
    double middle = 0.5;
    if (FindBezierOffsetCurve(piece.points, fit.points, distance, tolerance * tolerance, middle) || depth == 0) {
        offsets.push_back(fit);
        return;
    }
    Curve left{};
    Curve right{};
    CubicBezier::Split(middle, piece.points, left.points, right.points);
    FitOffset(left, distance, depth - 1, offsets);
    FitOffset(right, distance, depth - 1, offsets);
}

/// The largest distance from the true offset, at many places, to the fitted cubics.
double FindDeviation(const std::vector<Curve>& stretches, double distance, const std::vector<Curve>& offsets)
{
    constexpr int lines = 64;
    double worst = 0.0;
    for (const Curve& stretch : stretches)
        for (int i = 0; i <= 100; ++i) {
            const point2d place = CubicBezier::MapToBezier(stretch.points, i / 100.0, distance, 1.0);
            double nearest = std::numeric_limits<double>::infinity();
            for (const Curve& offset : offsets) {
                point2d places[lines + 1];
                BezierToLines(offset.points, places, lines);
                for (int j = 0; j < lines; ++j)
                    nearest = std::min(nearest, DistanceToLineSegmentSqrd(places[j], places[j + 1], place));
            }
            worst = std::max(worst, nearest);
        }
    return std::sqrt(worst);
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {0.0, 300.0, 480.0, -40.0});
    for (int i = -6; i <= 6; ++i) {
        if (i == 0)
            continue;
        const double distance = 12.0 * i; // positive to the left
        std::vector<Curve> stretches;
        GetSegmentsToOffset(curve, stretches, distance, nullptr);
        std::vector<Curve> offsets;
        for (const Curve& stretch : stretches)
            FitOffset(stretch, distance, 6, offsets);
        for (const Curve& offset : offsets)
            picture.Cubics({offset},
                           std::string("fill='none' stroke-width='1.5' stroke='") + (i > 0 ? "#1f4e79'" : "#a33b20'"));
        std::printf("distance %3g: %zu cubics in %zu stretches, off by no more than %.3f\n", distance, offsets.size(),
                    stretches.size(), FindDeviation(stretches, distance, offsets));
    }
    picture.Cubics({curve}, "fill='none' stroke='#1d2530' stroke-width='3'");
}
