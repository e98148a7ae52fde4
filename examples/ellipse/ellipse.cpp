// What a matrix makes of a circle: an ellipse, with its axes, its lengths and its box.
#include "picture/Svg.h"

using namespace ZarnMath;

namespace {

constexpr MATRIX matrix{1.2, 0.9, 0.0, -0.3, 0.8, 0.0};
constexpr double radius = 100.0;

/// The end of a spoke.
point2d OnCircle(int degrees)
{
    return AsPoint(Degrees::AngleToVector(degrees, radius));
}

} // namespace

void Draw(const std::string& path)
{
    constexpr point2d centre{0.0, 0.0};
    Svg picture(path, {-180.0, 120.0, 180.0, -120.0});
    std::vector<point2d> circle;
    for (int degrees = 0; degrees < 360; degrees += 3)
        circle.push_back(OnCircle(degrees));
    picture.Polygon(circle, "fill='none' stroke='#9aa7b4' stroke-width='1'");
    std::vector<point2d> ellipse = circle;
    matrix.TransformPoints(ellipse.data(), static_cast<unsigned long>(ellipse.size()));
    picture.Polygon(ellipse, "fill='#1f4e79' fill-opacity='.12' stroke='#1f4e79' stroke-width='2'");
    for (int degrees = 0; degrees < 360; degrees += 15) {
        picture.Polyline({centre, OnCircle(degrees)}, "stroke='#9aa7b4' stroke-width='.4'");
        picture.Polyline({centre, matrix(OnCircle(degrees))}, "stroke='#1f4e79' stroke-width='.4'");
    }

    const BoundsT<double> box = GetTransformedCircleBBox(matrix, radius, centre);
    picture.Rectangle(box, "fill='none' stroke='#d08a3a' stroke-width='1.5'");
    vector2d major{};
    vector2d minor{};
    GetTransformedCircleAxes(matrix, major, minor);
    for (const vector2d& axis : {major, minor})
        picture.Polyline({centre - axis * radius, centre + axis * radius}, "stroke='#a33b20' stroke-width='1.5'");
    double longer = 0.0;
    double shorter = 0.0;
    GetTransformedCircleAxisLengths(matrix, longer, shorter);
    std::printf("half axes %.9f and %.9f, along (%.9f, %.9f) and (%.9f, %.9f)\n", longer * radius, shorter * radius,
                major.x * radius, major.y * radius, minor.x * radius, minor.y * radius);
    std::printf("box: left %.6f, top %.6f, right %.6f, bottom %.6f\n", box.left, box.top, box.right, box.bottom);
}
