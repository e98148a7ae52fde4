// The point of a curve that is nearest to a given one. The library finds the nearest place where the distance is
// stationary, if there is one; the ends of the curve are for the caller to compare.
#include "picture/Svg.h"

#include <cmath>
#include <limits>

using namespace ZarnMath;

namespace {

constexpr CubicBezier::bezier2dT<point2d> curve{{{60.0, 60.0}, {140.0, 480.0}, {360.0, -220.0}, {420.0, 220.0}}};

struct Foot
{
    double t;
    point2d place;
    double distance;
};

Foot FindFoot(const point2d& q)
{
    Foot foot{};
    double squared = std::numeric_limits<double>::infinity(); // it stays where there is no stationary place
    CubicBezier::FindClosestPointOnBezier(curve.points, q, foot.t, foot.place, squared);
    for (const double end : {0.0, 1.0}) {
        const point2d place = end == 0.0 ? curve[0] : curve[3];
        if (const double toEnd = LengthSquared(place - q); toEnd < squared) {
            squared = toEnd;
            foot.t = end;
            foot.place = place;
        }
    }
    foot.distance = std::sqrt(squared);
    return foot;
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {0.0, 300.0, 480.0, -20.0});
    const auto show = [&](const point2d& q, const Foot& foot, const std::string& colour) {
        picture.Polyline({q, foot.place}, "stroke='" + colour + "' stroke-width='.8'");
        picture.Circle(q, 1.8, "fill='" + colour + "'");
    };
    for (int y = 0; y < 13; ++y)
        for (int x = 0; x < 20; ++x) {
            const point2d q{12.0 + 24.0 * x, -4.0 + 24.0 * y};
            const Foot foot = FindFoot(q);
            show(q, foot, foot.t == 0.0 || foot.t == 1.0 ? "#d08a3a" : "#7aa6c9");
        }
    for (const point2d q :
         {point2d{30.0, 190.0}, {130.0, 60.0}, {240.0, 250.0}, {345.0, 170.0}, {20.0, 20.0}, {462.0, 282.0}}) {
        const Foot foot = FindFoot(q);
        show(q, foot, "#a33b20");
        std::printf("from (%g, %g) to (%.6f, %.6f), t = %.6f, distance %.6f\n", q.x, q.y, foot.place.x, foot.place.y,
                    foot.t, foot.distance);
    }
    picture.Cubics({curve}, "fill='none' stroke='#1d2530' stroke-width='2.5'");
}
