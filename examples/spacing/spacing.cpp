// Marks at equal distances along a curve, and for comparison at equal steps of the parameter, which crowd where the curve
// is slow.
#include "picture/PowerForm.h"
#include "picture/Svg.h"

using namespace ZarnMath;

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr Curve curve{{{30.0, 40.0}, {240.0, 390.0}, {420.0, 330.0}, {450.0, 40.0}}};
constexpr int marks = 30;

/// A mark across the curve, longer at every fifth place.
void DrawMark(Svg& picture, const Curve& along, int number, double t, const std::string& colour)
{
    const double length = number % 5 == 0 ? 11.0 : 5.0;
    picture.Polyline({CubicBezier::MapToBezier(along.points, t, -length, 1.0),
                      CubicBezier::MapToBezier(along.points, t, length, 1.0)},
                     "stroke='" + colour + "' stroke-width='1.5'");
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {0.0, 300.0, 480.0, 20.0});
    picture.Text({100.0, 265.0}, "equal distances", "font-size='13' fill='#1f4e79'");
    picture.Text({160.0, 80.0}, "equal steps of the parameter", "font-size='13' fill='#5b6673'");
    picture.Cubics({curve}, "fill='none' stroke='#1f4e79' stroke-width='1.5'");
    Curve below = curve;
    const MATRIX shrink = ConstructScaleAroundMatrix(0.7, 0.7, {250.0, 40.0});
    shrink.TransformPoints(below.points, 4);
    picture.Cubics({below}, "fill='none' stroke='#9aa7b4' stroke-width='1.5'");

    const PowerForm form(curve);
    const double length = CubicBezier::Length(curve.points, LengthAccuracy::Order16);
    std::printf("length %.6f\n", length);
    for (int i = 0; i <= marks; ++i) {
        const double fraction = static_cast<double>(i) / marks;
        const double t = CubicBezier::GetCurveRelativeLengthParameter(fraction, form.a, form.b, form.c, 1e-6,
                                                                      LengthAccuracy::Order16);
        DrawMark(picture, curve, i, t, "#1f4e79");
        DrawMark(picture, below, i, fraction, "#9aa7b4");
        std::printf("mark %2d at t = %.9f, %.6f along\n", i, t,
                    CubicBezier::Length(form.a, form.b, form.c, 16, 0.0, t));
    }
}
