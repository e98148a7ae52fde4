// The tight box of a curve: of its ends and of the places where the tangent is horizontal or vertical. The box of the
// control points is larger.
#include "picture/PowerForm.h"
#include "picture/Svg.h"

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr Curve curve{{{140.0, 110.0}, {20.0, 420.0}, {470.0, 380.0}, {330.0, 60.0}}};

} // namespace

void Draw(const std::string& path)
{
    const PowerForm form(curve);
    std::vector<double> ts{0.0, 1.0};
    CubicBezier::GetVerticalTangents(form.a, form.b, form.c, ts); // appends
    CubicBezier::GetHorizontalTangents(form.a, form.b, form.c, ts);
    std::vector<point2d> extremes;
    for (const double t : ts)
        extremes.push_back(form(t));
    const BoundsT<double> tight = GetPointsBBox(extremes.data(), static_cast<int>(extremes.size()));
    const BoundsT<double> loose = GetPointsBBox(curve.points, 4);

    Svg picture(path, {0.0, 440.0, 490.0, 40.0});
    picture.Rectangle(loose, "fill='none' stroke='#9aa7b4' stroke-dasharray='5 4'");
    picture.Polyline({curve[0], curve[1], curve[2], curve[3]}, "stroke='#9aa7b4'");
    picture.Rectangle(tight, "fill='#d08a3a' fill-opacity='.12' stroke='#d08a3a' stroke-width='1.5'");
    picture.Cubics({curve}, "fill='none' stroke='#1f4e79' stroke-width='2.5'");
    for (std::size_t i = 0; i < ts.size(); ++i) {
        picture.Circle(extremes[i], 4.0, "fill='#a33b20'");
        std::printf("t = %.9f: (%.6f, %.6f)\n", ts[i], extremes[i].x, extremes[i].y);
    }
    std::printf("tight: left %.6f, top %.6f, right %.6f, bottom %.6f\n", tight.left, tight.top, tight.right,
                tight.bottom);
    std::printf("loose: left %g, top %g, right %g, bottom %g\n", loose.left, loose.top, loose.right, loose.bottom);
}
