// One cubic: cutting, construction, curvature, length, directions and extents.
#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using namespace CubicBezier;
using Point = const point2d&;
using Direction = const vector2d&;
using Numbers = std::vector<double>&;

template <typename P>
void AddCutting(Family& family)
{
    family.Add<void(double, const P*, P*, P*)>("CubicBezier::Split", Split, parameter, cubic<P>, writtenArray<P, 4>,
                                               writtenArray<P, 4>);
    family.Add<void(const P*, P*, P*)>("CubicBezier::Split", Split, cubic<P>, writtenArray<P, 4>, writtenArray<P, 4>);
    family.Add<void(double, const P*, P*)>("CubicBezier::Split", Split, parameter, cubic<P>, writtenArray<P, 7>);
    family.Add<void(double, double, const P*, P*)>("CubicBezier::Split", Split, parameter, parameter, cubic<P>,
                                                   writtenArray<P, 10>);
    family.Add<void(double, const P*, P*)>("CubicBezier::LeftOf", LeftOf, parameter, cubic<P>, writtenArray<P, 4>);
    family.Add<void(double, const P*, P*)>("CubicBezier::RightOf", RightOf, parameter, cubic<P>, writtenArray<P, 4>);
    family.Add<void(double, double, const P*, P*)>("CubicBezier::Subsection", Subsection, parameter, parameter,
                                                   cubic<P>, writtenArray<P, 4>);
}

void AddConstruction(Family& family)
{
    family.Add<void(POINT*, Point, Point, Point, bool)>("CubicBezier::From3Points", From3Points, writtenArray<POINT, 4>,
                                                        point<>, point<>, point<>, flag);
    family.Add<bool(POINT*, Point, Direction, Point, Point, Direction)>(
        "CubicBezier::From3Points", From3Points, writtenArray<POINT, 4>, point<>, vector, point<>, point<>, vector);
}

void AddCurvature(Family& family)
{
    family.Add<bool(double, Point, Point, Point, double&)>("CubicBezier::GetCurvatureAt", GetCurvatureAt, parameter,
                                                           powerA, powerB, powerC, written<double>);
    family.Add<bool(double, Point, Point, Point, double&)>("CubicBezier::GetCurvatureRadiusAt", GetCurvatureRadiusAt,
                                                           parameter, powerA, powerB, powerC, written<double>);
    family.Add<double(double, Point, Point, Point)>("CubicBezier::SafeBezierCurvature", SafeBezierCurvature, parameter,
                                                    powerA, powerB, powerC);
    family.Add<int(Point, Point, Point, double*)>("CubicBezier::BezierInflectionPoints", BezierInflectionPoints, powerA,
                                                  powerB, powerC, writtenArray<double, 2>);
    family.Add<int(Point, Point, Point, double*)>("CubicBezier::FindCurvatureMinMax", FindCurvatureMinMax, powerA,
                                                  powerB, powerC, writtenArray<double, 11>);
    family.Add<vector2d(double, Point, Point, Point, Point)>("CubicBezier::SafeBezierTangent", SafeBezierTangent,
                                                             parameter, powerA, powerB, powerC, powerD);
}

void AddLength(Family& family)
{
    constexpr auto order = count<-2, 20>;
    constexpr auto accuracy = count<-2, 20, LengthAccuracy>;
    family.Add<double(Point, Point, Point, int, double, double)>("CubicBezier::Length", Length, powerA, powerB, powerC,
                                                                 order, parameter, parameter);
    family.Add<double(Point, Point, Point, LengthAccuracy)>("CubicBezier::Length", Length, powerA, powerB, powerC,
                                                            accuracy);
    family.Add<double(const point2d*, LengthAccuracy)>("CubicBezier::Length<point2d>", Length<point2d>, cubic<>,
                                                       accuracy);
    family.Add<double(double, const point2d*)>("CubicBezier::LengthTo", LengthTo, parameter, cubic<>);
    family.Add<double(double, const POINT*)>("CubicBezier::LengthTo", LengthTo, parameter, cubic<POINT>);
    family.Add<double(double, const point2d*)>("CubicBezier::LengthFrom", LengthFrom, parameter, cubic<>);
    family.Add<double(double, const POINT*)>("CubicBezier::LengthFrom", LengthFrom, parameter, cubic<POINT>);
    family.AddWith<double(double, point2d, point2d, point2d, double, LengthAccuracy)>(
        "CubicBezier::GetCurveRelativeLengthParameter", GetCurveRelativeLengthParameter,
        [](auto call, Source& in, Sink& out) {
            const double fraction = in.Parameter();
            const Coefficients curve = in.PowerForm();
            const double precision = in.Tolerance();
            const auto samples = static_cast<LengthAccuracy>(in.Count(-2, 20));
            out.Put(call(fraction, curve.a, curve.b, curve.c, precision, samples));
        });
}

void AddExtents(Family& family)
{
    family.Add<void(Point, Point, Point, Numbers)>("CubicBezier::GetVerticalTangents", GetVerticalTangents, powerA,
                                                   powerB, powerC, appended<double>);
    family.Add<void(Point, Point, Point, Numbers)>("CubicBezier::GetHorizontalTangents", GetHorizontalTangents, powerA,
                                                   powerB, powerC, appended<double>);
    family.Add<void(Point, Point, Point, Direction, Numbers, bool&)>(
        "CubicBezier::GetParallels", GetParallels, powerA, powerB, powerC, vector, appended<double>, written<bool>);
    family.Add<double(Point, Point, Point, Point)>("CubicBezier::GetAreaUnderBezier", GetAreaUnderBezier, powerA,
                                                   powerB, powerC, powerD);
    family.Add<point2d(const point2d*, double, double, double)>("CubicBezier::MapToBezier", MapToBezier, cubic<>,
                                                                parameter, distance, number);
    family.Add<bool(Point, Point, Point, double, Numbers)>("CubicBezier::FindOffsetCusps", FindOffsetCusps, powerA,
                                                           powerB, powerC, distance, appended<double>);
}

} // namespace

void AddBezier(std::vector<Function>& list)
{
    Family family(list, "Bezier");
    AddCutting<point2d>(family);
    AddCutting<POINT>(family);
    AddConstruction(family);
    AddCurvature(family);
    AddLength(family);
    AddExtents(family);
}

} // namespace ZarnMath::Catalogue
