// Two cubics cross in up to nine points. These do: y = T(x) and x = T(y), with T the Chebyshev polynomial 4x^3 - 3x.
#include "picture/Svg.h"

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr double unit = 100.0;

/// T with one argument for each factor (its polar form): the control points of T over a stretch are its values with the
/// ends of the stretch as arguments.
constexpr double T(double u, double v, double w)
{
    return 4.0 * u * v * w - (u + v + w);
}

/// The graph of T from `from` to `to`.
constexpr Curve Graph(double from, double to)
{
    const double step = (to - from) / 3.0;
    return {{{unit * from, unit * T(from, from, from)},
             {unit * (from + step), unit * T(from, from, to)},
             {unit * (to - step), unit * T(from, to, to)},
             {unit * to, unit * T(to, to, to)}}};
}

constexpr Curve SwapAxes(const Curve& curve)
{
    Curve swapped{};
    for (std::size_t i = 0; i < 4; ++i)
        swapped[i] = {curve[i].y, curve[i].x};
    return swapped;
}

} // namespace

void Draw(const std::string& path)
{
    constexpr Curve first = Graph(-1.05, 1.08); // a little beyond 1, as a crossing at an end does not count
    constexpr Curve second = SwapAxes(Graph(-1.07, 1.06));
    std::vector<double> onFirst;
    std::vector<double> onSecond;
    std::vector<point2d> points;
    CubicBezier::FindBezierIntersections(first.points, second.points, onFirst, onSecond, points);

    Svg picture(path, {-160.0, 160.0, 160.0, -160.0});
    picture.Cubics({first}, "fill='none' stroke='#1f4e79' stroke-width='2'");
    picture.Cubics({second}, "fill='none' stroke='#d08a3a' stroke-width='2'");
    std::printf("%zu crossings\n", points.size());
    for (std::size_t i = 0; i < points.size(); ++i) {
        picture.Circle(points[i], 3.5, "fill='#a33b20'");
        std::printf("(%11.6f, %11.6f) at t = %.6f and %.6f\n", points[i].x, points[i].y, onFirst[i], onSecond[i]);
    }
}
