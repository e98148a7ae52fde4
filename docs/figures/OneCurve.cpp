// What is asked of one cubic: cutting, nearest points, length, curvature, extents, loops.

#include "docs/figures/Figures.h"

#include <cmath>

namespace ZarnMath::Figures {

namespace {

constexpr Cubic arch = {{{0, 0}, {60, 190}, {230, 190}, {320, 0}}};

} // namespace

void Cutting(const std::string& path)
{
    Figure figure(path, {-20.0, 205.0, 340.0, -30.0});
    //! [split]
    Cubic left{};
    Cubic right{};
    CubicBezier::Split(0.4, arch.points, left.points, right.points);
    //! [split]
    figure.Polyline({arch.points, arch.points + 4}, "faint");
    figure.CurveWithHandles(left, "curve");
    figure.CurveWithHandles(right, "answer");
    figure.Dot(right[0], "ink");
    figure.Label({115.0, 95.0}, Beside::Right, "left[3] == right[0]");
    figure.Label(arch[0], Beside::Below, "P0");
    figure.Label(arch[1], Beside::Left, "P1");
    figure.Label(arch[2], Beside::Right, "P2");
    figure.Label(arch[3], Beside::Below, "P3");
}

void ThroughThreePoints(const std::string& path)
{
    Figure figure(path, {-20.0, 175.0, 340.0, -30.0});
    //! [through]
    const point2d start{0, 0};
    const point2d through{90, 130};
    const point2d end{320, 20};
    POINT simple[4];
    POINT smooth[4];
    CubicBezier::From3Points(simple, start, through, end, true);
    CubicBezier::From3Points(smooth, start, through, end, false);
    //! [through]
    const auto toCubic = [](const POINT* p) {
        return Cubic{{ToPoint2d(p[0]), ToPoint2d(p[1]), ToPoint2d(p[2]), ToPoint2d(p[3])}};
    };
    figure.Curve(toCubic(smooth), "other");
    figure.Curve(toCubic(simple), "curve");
    for (const point2d& p : {start, through, end})
        figure.Dot(p, "ink");
    figure.Label(through, Beside::Above, "through");
    figure.Label({195.0, 130.0}, Beside::Right, "simple", "curve");
    figure.Label({150.0, 75.0}, Beside::On, "by the bisector", "other");
}

void NearestPoint(const std::string& path)
{
    Figure figure(path, {-30.0, 205.0, 370.0, -40.0});
    const point2d q{150, 15};
    //! [nearest]
    std::vector<double> ts;
    std::vector<point2d> points;
    std::vector<double> squaredDistances;
    CubicBezier::FindClosestPointsOnBezier(arch.points, q, ts, points, squaredDistances);
    //! [nearest]
    double t = 0.0;
    point2d nearest{};
    double distanceSquared = 0.0;
    CubicBezier::FindClosestPointOnBezier(arch.points, q, t, nearest, distanceSquared);
    figure.Curve(arch, "curve");
    for (const point2d& p : points) {
        figure.Segment(q, p, "faint dashed");
        figure.Dot(p, "other");
    }
    figure.Segment(q, nearest, "answer");
    figure.Dot(nearest, "answer");
    figure.Dot(q, "ink");
    figure.Label(q, Beside::Below, "q");
    figure.Label(nearest, Beside::Left, "nearest", "answer");
    figure.Label(points.back(), Beside::Right, "stationary, too", "other");
}

void NearestIsAnEnd(const std::string& path)
{
    Figure figure(path, {-130.0, 180.0, 340.0, -50.0}, 440.0);
    const point2d q{-70, -10};
    double t = 0.0;
    point2d nearest{};
    double distanceSquared = 0.0;
    const Cubic curve = {{{0, 0}, {160, 30}, {-30, 170}, {320, 150}}};
    //! [end]
    if (!CubicBezier::FindClosestPointOnBezier(curve.points, q, t, nearest, distanceSquared)) {
        t = LengthSquared(curve[0] - q) < LengthSquared(curve[3] - q) ? 0.0 : 1.0;
        nearest = t == 0.0 ? curve[0] : curve[3];
    }
    //! [end]
    figure.Curve(curve, "curve");
    figure.Segment(q, nearest, "answer");
    figure.Dot(nearest, "answer");
    figure.Dot(q, "ink");
    figure.Label(q, Beside::Left, "q");
    figure.Label({0.0, -25.0}, Beside::Right, "no stationary point: an end", "answer");
}

void EqualSpacing(const std::string& path)
{
    Figure figure(path, {-20.0, 160.0, 340.0, -20.0});
    const Cubic curve = {{{0, 0}, {10, 240}, {60, 120}, {320, 30}}};
    //! [spacing]
    const PowerForm f = ToPowerForm(curve);
    std::vector<point2d> marks;
    for (int i = 0; i <= 12; ++i) {
        const double t =
            CubicBezier::GetCurveRelativeLengthParameter(i / 12.0, f.a, f.b, f.c, 0.01, LengthAccuracy::Order16);
        marks.push_back(PointAt(curve, t));
    }
    //! [spacing]
    figure.Curve(curve, "curve");
    for (const point2d& p : marks)
        figure.Dot(p, "answer");
    for (int i = 0; i <= 12; ++i) {
        const double t = i / 12.0;
        const point2d from = CubicBezier::MapToBezier(curve.points, t, -9.0, 1.0);
        const point2d to = CubicBezier::MapToBezier(curve.points, t, -17.0, 1.0);
        figure.Segment(from, to, "other");
    }
    figure.Label({150.0, 120.0}, Beside::Right, "equal lengths", "answer");
    figure.Label({60.0, 40.0}, Beside::Right, "equal steps of t", "other");
}

void CurvatureComb(const std::string& path)
{
    Figure figure(path, {-40.0, 170.0, 360.0, -90.0});
    const Cubic curve = {{{0, 0}, {130, 190}, {170, -130}, {320, 60}}};
    const PowerForm f = ToPowerForm(curve);
    std::vector<point2d> comb;
    for (int i = 0; i <= 80; ++i) {
        const double t = i / 80.0;
        //! [comb]
        const double curvature = CubicBezier::SafeBezierCurvature(t, f.a, f.b, f.c);
        const point2d tip = CubicBezier::MapToBezier(curve.points, t, -curvature, 2200.0);
        //! [comb]
        comb.push_back(tip);
        if (i % 2 == 0)
            figure.Segment(PointAt(curve, t), tip, "faint");
    }
    figure.Polyline(comb, "faint");
    figure.Curve(curve, "curve");
    double extremes[11];
    const int count = CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes);
    for (int i = 0; i < count; ++i)
        figure.Dot(PointAt(curve, extremes[i]), "answer");
    figure.Label({200.0, 130.0}, Beside::Right, "FindCurvatureMinMax", "answer");
    figure.Dot({200.0, 130.0}, "answer");
}

void Extents(const std::string& path)
{
    Figure figure(path, {-60.0, 190.0, 360.0, -60.0});
    const Cubic curve = {{{20, 0}, {-120, 190}, {420, 200}, {230, -40}}};
    //! [extents]
    const PowerForm f = ToPowerForm(curve);
    std::vector<double> parameters = {0.0, 1.0}; // the ends are never among the tangents
    CubicBezier::GetVerticalTangents(f.a, f.b, f.c, parameters);
    CubicBezier::GetHorizontalTangents(f.a, f.b, f.c, parameters);
    std::vector<point2d> places;
    for (const double t : parameters)
        places.push_back(PointAt(curve, t));
    const BoundsT<double> box = GetPointsBBox(places.data(), static_cast<int>(places.size()));
    //! [extents]
    figure.Box(box, "answer dashed");
    figure.Curve(curve, "curve");
    for (const point2d& p : places)
        figure.Dot(p, "answer");
}

void Loop(const std::string& path)
{
    Figure figure(path, {-20.0, 190.0, 340.0, -30.0}, 440.0);
    //! [loop]
    const Cubic curve = {{{0, 0}, {420, 230}, {-100, 230}, {320, 0}}};
    double late = 0.0;
    double early = 0.0;
    point2d crossing{};
    const bool isFound = CubicBezier::FindBezierSelfIntersection(curve.points, late, early, crossing);
    //! [loop]
    figure.Curve(curve, "curve");
    if (isFound) {
        Cubic loop{};
        CubicBezier::Subsection(early, late, curve.points, loop.points);
        figure.Curve(loop, "answer");
        figure.Dot(crossing, "answer");
        figure.Label({180.0, 150.0}, Beside::Right, "from early to late", "answer");
    }
}

void Flattening(const std::string& path)
{
    Figure figure(path, {-20.0, 180.0, 340.0, -30.0});
    const double distance = 15.0;
    //! [flattening]
    point2d points[65];
    const int lines = AdaptiveBezierToLines(arch.points, points, distance * distance, 64);
    //! [flattening]
    figure.Curve(arch, "curve");
    figure.Polyline({points, points + lines + 1}, "answer");
    for (int i = 0; i <= lines; ++i)
        figure.Dot(points[i], i % 2 == 0 ? "answer" : "other");
    figure.Label({160.0, 60.0}, Beside::On, std::to_string(lines) + " segments for a distance of 15", "answer");
    figure.Label({160.0, 36.0}, Beside::On, "every second point halves a step of t", "other");
}

void TangentsToPoint(const std::string& path)
{
    Figure figure(path, {-40.0, 225.0, 360.0, -30.0}, 440.0);
    const point2d q{170, 200};
    //! [tangents]
    const PowerForm f = ToPowerForm(arch);
    double parameters[5];
    const int count = CubicBezier::FindTangentsToPoint(f.a, f.b, f.c, f.d, q, parameters);
    //! [tangents]
    figure.Curve(arch, "curve");
    for (int i = 0; i < count; ++i) {
        const point2d touch = PointAt(arch, parameters[i]);
        figure.Segment(q, touch + (touch - q) * 0.25, "answer");
        figure.Dot(touch, "answer");
    }
    figure.Dot(q, "ink");
    figure.Label(q, Beside::Above, "q");
}

} // namespace ZarnMath::Figures
