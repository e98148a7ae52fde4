// Crossings, offsets and fits.

#include "docs/figures/Figures.h"

#include <cmath>

namespace ZarnMath::Figures {

void Crossings(const std::string& path)
{
    Figure figure(path, {-20.0, 190.0, 340.0, -40.0});
    //! [crossings]
    const Cubic first = {{{0, 30}, {180, 260}, {140, -150}, {320, 110}}};
    const Cubic second = {{{10, 120}, {140, -170}, {170, 300}, {310, 10}}};
    std::vector<double> onFirst;
    std::vector<double> onSecond;
    std::vector<point2d> points;
    CubicBezier::FindBezierIntersections(first.points, second.points, onFirst, onSecond, points);
    //! [crossings]
    figure.Curve(first, "curve");
    figure.Curve(second, "other");
    for (const point2d& p : points)
        figure.Dot(p, "answer");
    figure.Label({160.0, 160.0}, Beside::On, std::to_string(points.size()) + " crossings", "answer");
}

void LineCrossings(const std::string& path)
{
    Figure figure(path, {-20.0, 150.0, 340.0, -50.0});
    const Cubic curve = {{{10, 30}, {140, 260}, {160, -200}, {310, 60}}};
    //! [line]
    const point2d line[2] = {{60, 60}, {240, 20}};
    std::vector<double> onCurve;
    std::vector<double> onLine;
    CubicBezier::FindBezierLineIntersection(curve.points, line, onCurve, onLine, true);
    //! [line]
    const vector2d along = line[1] - line[0];
    figure.Segment(line[0] - along * 0.4, line[1] + along * 0.5, "faint dashed");
    figure.Segment(line[0], line[1], "other");
    figure.Curve(curve, "curve");
    for (const double u : onLine)
        figure.Dot(line[0] + along * u, "answer");
    figure.Dot(line[0], "other");
    figure.Dot(line[1], "other");
    figure.Label(line[0], Beside::Below, "u = 0", "other");
    figure.Label(line[1], Beside::Above, "u = 1", "other");
}

void StraightBand(const std::string& path)
{
    Figure figure(path, {-3.0, 7.5, 33.0, -6.0});
    const Cubic flat = {{{0, 0}, {10, 1.9}, {20, -1.9}, {30, 0}}};
    figure.Polygon({{-2.0, 2.0}, {32.0, 2.0}, {32.0, -2.0}, {-2.0, -2.0}}, "faint filled");
    figure.Segment(flat[0], flat[3], "answer");
    figure.CurveWithHandles(flat, "curve");
    figure.Label({15.0, 2.0}, Beside::Above, "2 units to either side of the line");
    figure.Label({15.0, -2.0}, Beside::Below, "all control points inside: taken for its chord", "answer");
}

void OffsetCusps(const std::string& path)
{
    Figure figure(path, {-20.0, 200.0, 340.0, -40.0});
    const double distance = -90.0;
    const Cubic curve = {{{0, 0}, {150, 250}, {170, 250}, {320, 0}}};
    //! [cusps]
    std::vector<Cubic> segments;
    GetSegmentsToOffset(curve, segments, distance, nullptr);
    for (const Cubic& segment : segments) {
        Cubic offset{};
        double splitParameter = 0.0;
        FindBezierOffsetCurve(segment.points, offset.points, distance, 0.25, splitParameter);
        figure.Curve(offset, "answer");
    }
    //! [cusps]
    figure.Polyline(OffsetPoints(curve, distance), "faint");
    figure.Curve(curve, "curve");
    const PowerForm f = ToPowerForm(curve);
    std::vector<double> cusps;
    CubicBezier::FindOffsetCusps(f.a, f.b, f.c, distance, cusps);
    for (const double t : cusps) {
        const point2d p = CubicBezier::MapToBezier(curve.points, t, distance, 1.0);
        figure.Segment(PointAt(curve, t), p, "other dashed thin");
        figure.Dot(p, "other");
    }
    figure.Label({190.0, 100.0}, Beside::Right, "two cusps", "other");
}

void FittedCurve(const std::string& path)
{
    Figure figure(path, {-20.0, 170.0, 340.0, -30.0});
    std::vector<point2d> points;
    for (int i = 0; i <= 24; ++i) {
        const double x = i / 24.0 * 320.0;
        points.push_back({x, 90.0 * std::sin(x / 75.0) * (1.0 - x / 900.0) + 30.0 + 6.0 * std::sin(x * 1.7)});
    }
    //! [fit]
    const int count = static_cast<int>(points.size());
    const vector2d t1 = points[2] - points[0];
    const vector2d t2 = points[points.size() - 1] - points[points.size() - 3];
    Cubic fitted{};
    const double error = LeastSquares(points.data(), count, t1, t2, fitted.points, 20);
    //! [fit]
    for (const point2d& p : points)
        figure.Dot(p, "faint");
    figure.Curve(fitted, "answer");
    char words[64];
    std::snprintf(words, sizeof words, "largest distance %.1f", std::sqrt(error));
    figure.Label({215.0, 120.0}, Beside::On, words, "answer");
}

void JointFit(const std::string& path)
{
    Figure figure(path, {-20.0, 190.0, 340.0, -40.0});
    std::vector<point2d> points;
    for (int i = 0; i <= 40; ++i) {
        const double x = i / 40.0 * 320.0;
        points.push_back({x, 75.0 + 70.0 * std::sin(x / 52.0)});
    }
    //! [joint]
    const int count = static_cast<int>(points.size());
    const vector2d t1 = points[1] - points[0];
    const vector2d t2 = points[points.size() - 1] - points[points.size() - 2];
    Cubic a{};
    Cubic b{};
    LeastSquares(points.data(), count, count / 2, t1, t2, a.points, b.points, 20);
    //! [joint]
    for (const point2d& p : points)
        figure.Dot(p, "faint");
    figure.Curve(a, "curve");
    figure.Curve(b, "answer");
    const vector2d along = Normalize(b[1] - a[2]);
    figure.Segment(a[3] - along * 60.0, a[3] + along * 60.0, "other thin");
    figure.Dot(a[3], "other");
    figure.Label(a[3], Beside::Right, "one tangent at the join", "other");
}

void FittedLine(const std::string& path)
{
    Figure figure(path, {-20.0, 160.0, 340.0, -20.0}, 440.0);
    //! [line-fit]
    const std::vector<point2d> points = {{20, 10}, {60, 50}, {110, 45}, {150, 90}, {210, 80}, {260, 130}, {300, 120}};
    point2d point{};
    vector2d direction{};
    GetLeastSquaresLines(points.data(), static_cast<int>(points.size()), point, direction);
    //! [line-fit]
    const vector2d along = Normalize(direction);
    for (const point2d& p : points) {
        const point2d foot = point + along * Dot(p - point, along);
        figure.Segment(p, foot, "other thin");
        figure.Dot(p, "ink");
    }
    figure.Segment(point + along * Dot(point2d{-5, 0} - point, along),
                   point + along * Dot(point2d{325, 145} - point, along), "answer");
    figure.Label({190.0, 30.0}, Beside::On, "square to the line, not upright", "other");
}

} // namespace ZarnMath::Figures
