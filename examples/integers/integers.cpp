// A curve in whole units. Flattening computes in double and rounds once; halving in whole units truncates at every step,
// so that the pieces meet exactly, but drift away from the curve.
#include "picture/Svg.h"

#include <algorithm>
#include <cmath>

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<POINT>;

constexpr Curve curve{{{2, 3}, {13, 43}, {25, -25}, {46, 22}}};

/// Halves the curve so many times over.
void Halve(const Curve& piece, int times, std::vector<Curve>& pieces)
{
    if (times == 0) {
        pieces.push_back(piece);
        return;
    }
    Curve left{};
    Curve right{};
    CubicBezier::Split(piece.points, left.points, right.points);
    Halve(left, times - 1, pieces);
    Halve(right, times - 1, pieces);
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {0.0, 25.0, 48.0, 0.0});
    for (int i = 0; i <= 48; ++i) {
        picture.Polyline({{double(i), 0.0}, {double(i), 25.0}}, "stroke='#dfe4ea' stroke-width='.05'");
        picture.Polyline({{0.0, double(i)}, {48.0, double(i)}}, "stroke='#dfe4ea' stroke-width='.05'");
    }
    CubicBezier::bezier2dT<point2d> exact{};
    std::transform(curve.points, curve.points + 4, exact.points, [](const POINT& p) { return ToPoint2d(p); });
    picture.Cubics({exact}, "fill='none' stroke='#9aa7b4' stroke-width='.2'");

    picture.Text({19.0, 21.5}, "filled: rounded once", "font-size='1.4' fill='#1f4e79'");
    picture.Text({19.0, 19.5}, "rings: halved again and again", "font-size='1.4' fill='#a33b20'");

    constexpr int lines = 16;
    POINT rounded[lines + 1];
    BezierToLines(curve.points, rounded, lines);
    point2d places[lines + 1];
    BezierToLines(exact.points, places, lines);
    std::vector<Curve> pieces;
    Halve(curve, 4, pieces);
    for (int i = 0; i <= lines; ++i) {
        const POINT end = i < lines ? pieces[static_cast<std::size_t>(i)][0] : pieces.back()[3];
        picture.Circle(ToPoint2d(rounded[i]), 0.45, "fill='#1f4e79'");
        picture.Circle(ToPoint2d(end), 0.4, "fill='none' stroke='#a33b20' stroke-width='.2'");
        std::printf("t = %.4f: (%9.6f, %9.6f), rounded once (%2d, %2d), halved (%2d, %2d)\n", i / double(lines),
                    places[i].x, places[i].y, rounded[i].x, rounded[i].y, end.x, end.y);
    }
    const bool meet = std::adjacent_find(pieces.begin(), pieces.end(), [](const Curve& one, const Curve& next) {
                          return one[3] != next[0];
                      }) == pieces.end();
    std::printf("the pieces %s\n", meet ? "meet" : "do not meet");
}
