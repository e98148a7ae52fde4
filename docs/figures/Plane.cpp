// The first page: what is up, what turns which way, and what lies on which side.

#include "docs/figures/Figures.h"

namespace ZarnMath::Figures {

void Plane(const std::string& path)
{
    Figure figure(path, {-60.0, 250.0, 420.0, -50.0});
    figure.Axes({0.0, 0.0}, 400.0, 235.0);

    const BoundsT<double> box{150.0, 200.0, 300.0, 90.0};
    figure.Box(box, "curve filled");
    figure.Label({225.0, box.top}, Beside::Above, "top: the larger y");
    figure.Label({225.0, box.bottom}, Beside::Below, "bottom");
    figure.Label({box.left, 145.0}, Beside::Left, "left");
    figure.Label({box.right, 145.0}, Beside::Right, "right");

    figure.Turn({0.0, 0.0}, 75.0, 0.0, 55.0, "answer");
    figure.Label({72.0, 40.0}, Beside::Right, "positive angles", "answer");
    figure.Dot({0.0, 0.0}, "ink");
    figure.Label({0.0, 0.0}, Beside::Below, "(0, 0)");
}

void Neighbours(const std::string& path)
{
    Figure figure(path, {-40.0, 190.0, 340.0, -30.0}, 400.0);
    const vector2d u{220.0, 40.0};
    const vector2d v{90.0, 130.0};
    const point2d origin{70.0, 0.0};
    figure.Arrow(origin, origin + u, "curve");
    figure.Arrow(origin, origin + v, "other");
    figure.Arrow(origin, origin + Perpendicular(u) * 0.65, "answer");
    figure.Label(origin + u, Beside::Above, "u", "curve");
    figure.Label(origin + v, Beside::Right, "v, with Cross(u, v) > 0", "other");
    figure.Label(origin + Perpendicular(u) * 0.65, Beside::Above, "Perpendicular(u)", "answer");
}

void CurvatureSign(const std::string& path)
{
    Figure figure(path, {-20.0, 130.0, 340.0, -70.0});
    //! [sign]
    const Cubic curve = {{{0, 0}, {130, 190}, {190, -150}, {320, 60}}};
    const PowerForm f = ToPowerForm(curve);
    double inflections[2];
    const int count = CubicBezier::BezierInflectionPoints(f.a, f.b, f.c, inflections);
    //! [sign]
    figure.Curve(curve, "curve");
    for (int i = 0; i < count; ++i) {
        if (inflections[i] > 0.0 && inflections[i] < 1.0) {
            Cubic right{};
            CubicBezier::RightOf(inflections[i], curve.points, right.points);
            figure.Curve(right, "answer");
            figure.Dot(right[0], "ink");
            figure.Label(right[0], Beside::Right, "inflection");
        }
    }
    figure.Dot(curve[0], "curve");
    figure.Label(curve[0], Beside::Below, "t = 0");
    figure.Label(curve[3], Beside::Above, "t = 1");
    figure.Label({85.0, 72.0}, Beside::Above, "turns right: negative", "curve");
    figure.Label({225.0, -32.0}, Beside::Below, "turns left: positive", "answer");
}

void Sides(const std::string& path)
{
    Figure figure(path, {-40.0, 170.0, 360.0, -60.0});
    const Cubic curve = {{{0, 0}, {90, 120}, {210, -60}, {320, 60}}};
    const PowerForm f = ToPowerForm(curve);
    for (const double distance : {-34.0, -17.0, 17.0, 34.0}) {
        for (const double t : {0.15, 0.3, 0.45, 0.6, 0.75, 0.9}) {
            const point2d q = CubicBezier::MapToBezier(curve.points, t, distance, 1.0);
            //! [side]
            const Side side = CubicBezier::GetSide(f.a, f.b, f.c, f.d, q);
            figure.Dot(q, side == SidePositive ? "answer" : "other");
            //! [side]
        }
    }
    figure.Curve(curve, "curve");
    figure.Arrow(PointAt(curve, 0.98), curve[3], "curve");
    figure.Label(curve[0], Beside::Below, "t = 0");
    figure.Label({60.0, 105.0}, Beside::On, "SidePositive, positive offset", "answer");
    figure.Label({215.0, -38.0}, Beside::On, "SideNegative, negative offset", "other");
}

void OffsetSides(const std::string& path)
{
    Figure figure(path, {-50.0, 150.0, 370.0, -50.0});
    const Cubic curve = {{{0, 0}, {90, 130}, {230, 130}, {320, 0}}};
    figure.Polyline(OffsetPoints(curve, 25.0), "answer");
    figure.Polyline(OffsetPoints(curve, -25.0), "other");
    figure.Curve(curve, "curve");
    figure.Arrow(PointAt(curve, 0.98), curve[3], "curve");
    figure.Arrow(PointAt(curve, 0.5), OffsetPoints(curve, 25.0)[64], "answer");
    figure.Arrow(PointAt(curve, 0.5), OffsetPoints(curve, -25.0)[64], "other");
    figure.Label({160.0, 122.0}, Beside::Above, "+25: to the left of the way", "answer");
    figure.Label({160.0, 55.0}, Beside::Below, "-25: to the right", "other");
}

void AngleUnits(const std::string& path)
{
    Figure figure(path, {-160.0, 125.0, 330.0, -125.0});
    const point2d centre{0.0, 0.0};
    figure.Circle(centre, 90.0, "faint");
    for (const double degrees : {0.0, 90.0, 180.0, 270.0})
        figure.Dot(centre + Degrees::AngleToVector(degrees, 90.0), "ink");
    figure.Turn(centre, 60.0, 0.0, 90.0, "answer");
    figure.Arrow(centre, {118.0, 0.0}, "ink");
    figure.Label({118.0, 0.0}, Beside::Right, "0, and a full turn:");
    figure.Label({118.0, -22.0}, Beside::Right, "Radians: 2*pi");
    figure.Label({118.0, -44.0}, Beside::Right, "Degrees: 360");
    figure.Label({118.0, -66.0}, Beside::Right, "KELDANGLE: 360000000");
    figure.Label({0.0, 90.0}, Beside::Above, "a quarter turn");
    figure.Label({-90.0, 0.0}, Beside::Left, "a half");
    figure.Label({0.0, -90.0}, Beside::Below, "three quarters");
}

} // namespace ZarnMath::Figures
