// What is searched for on a cubic, or between two: closest points, implicit form, crossings.
#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using namespace CubicBezier;
using Point = const point2d&;
using Numbers = std::vector<double>&;
using Points = std::vector<point2d>&;

void AddClosestPoint(Family& family)
{
    family.Add<bool(Point, Point, Point, Point, Point, double&, point2d&, double&)>(
        "CubicBezier::FindClosestPointOnBezier", FindClosestPointOnBezier, powerA, powerB, powerC, powerD, point<>,
        written<double>, written<point2d>, written<double>);
    family.Add<bool(const point2d*, Point, double&, point2d&, double&)>(
        "CubicBezier::FindClosestPointOnBezier", FindClosestPointOnBezier, cubic<>, point<>, written<double>,
        written<point2d>, written<double>);
    family.Add<bool(const POINT*, const POINT&, double&, POINT&, double&)>(
        "CubicBezier::FindClosestPointOnBezier", FindClosestPointOnBezier, cubic<POINT>, point<POINT>, written<double>,
        written<POINT>, written<double>);
    family.Add<double(const POINT*, const POINT&)>("CubicBezier::FindClosestPointOnBezier", FindClosestPointOnBezier,
                                                   cubic<POINT>, point<POINT>);
    family.Add<bool(const point2d*, Point, Numbers, Points, Numbers)>(
        "CubicBezier::FindClosestPointsOnBezier", FindClosestPointsOnBezier, cubic<>, point<>, appended<double>,
        appended<point2d>, appended<double>);
    family.Add<bool(const POINT*, const POINT&, Numbers, std::vector<POINT>&, Numbers)>(
        "CubicBezier::FindClosestPointsOnBezier", FindClosestPointsOnBezier, cubic<POINT>, point<POINT>,
        appended<double>, appended<POINT>, appended<double>);
    family.Add<bool(Point, Point, Point, Point, Point, double&, point2d&, double&, Side&)>(
        "CubicBezier::GetSide", GetSide, powerA, powerB, powerC, powerD, point<>, written<double>, written<point2d>,
        written<double>, written<Side>);
    family.Add<Side(Point, Point, Point, Point, Point)>("CubicBezier::GetSide", GetSide, powerA, powerB, powerC, powerD,
                                                        point<>);
    family.Add<bool(Point, Point, Point, Point, Point, Numbers)>("CubicBezier::Invert", Invert, powerA, powerB, powerC,
                                                                 powerD, point<>, appended<double>);
    family.Add<int(Point, Point, Point, Point, Point, double*)>("CubicBezier::FindTangentsToPoint", FindTangentsToPoint,
                                                                powerA, powerB, powerC, powerD, point<>,
                                                                writtenArray<double, 5>);
}

void AddIntersection(Family& family)
{
    using K = double&;
    family.Add<void(Point, Point, Point, Point, K, K, K, K, K, K, K, K, K, K)>(
        "CubicBezier::ConvertBezierToImplicit", ConvertBezierToImplicit, powerA, powerB, powerC, powerD,
        written<double>, written<double>, written<double>, written<double>, written<double>, written<double>,
        written<double>, written<double>, written<double>, written<double>);
    family.Add<void(const point2d*, const point2d*, Numbers, Numbers, Points)>(
        "CubicBezier::FindBezierIntersections", FindBezierIntersections, cubic<>, cubic<>, appended<double>,
        appended<double>, appended<point2d>);
    family.Add<void(const POINT*, const POINT*, Numbers, Numbers, Points)>(
        "CubicBezier::FindBezierIntersections", FindBezierIntersections, cubic<POINT>, cubic<POINT>, appended<double>,
        appended<double>, appended<point2d>);
}

void AddLines(Family& family)
{
    family.Add<bool(const point2d*, const point2d*, Numbers, Numbers, bool)>(
        "CubicBezier::FindBezierLineIntersection", FindBezierLineIntersection, cubic<>, line<>, appended<double>,
        appended<double>, flag);
    family.Add<bool(const POINT*, const POINT*, Numbers, Numbers, bool)>(
        "CubicBezier::FindBezierLineIntersection", FindBezierLineIntersection, cubic<POINT>, line<POINT>,
        appended<double>, appended<double>, flag);
    family.Add<bool(const point2d*, double, Numbers, bool)>("CubicBezier::FindBezierIntersectionsAtX",
                                                            FindBezierIntersectionsAtX, cubic<>, coordinate,
                                                            appended<double>, flag);
    family.Add<bool(const point2d*, const point2d*)>("CubicBezier::DoesBezierIntersectLineSegment",
                                                     DoesBezierIntersectLineSegment, cubic<>, line<>);
    family.Add<bool(const POINT*, const POINT*)>("CubicBezier::DoesBezierIntersectLineSegment",
                                                 DoesBezierIntersectLineSegment, cubic<POINT>, line<POINT>);
}

template <typename P>
void AddPredicates(Family& family)
{
    family.Add<bool(const P*, double&, double&, double&, double&, bool)>(
        "CubicBezier::DoesBezierSelfIntersect", DoesBezierSelfIntersect, cubic<P>, written<double>, written<double>,
        written<double>, written<double>, flag);
    family.Add<bool(const P*, double&, double&, point2d&)>("CubicBezier::FindBezierSelfIntersection",
                                                           FindBezierSelfIntersection, cubic<P>, written<double>,
                                                           written<double>, written<point2d>);
    family.Add<bool(const P*, const P*)>("CubicBezier::DoBeziersIntersect", DoBeziersIntersect, cubic<P>, cubic<P>);
}

} // namespace

void AddBezierSearches(std::vector<Function>& list)
{
    Family family(list, "Bezier");
    AddClosestPoint(family);
    AddIntersection(family);
    AddLines(family);
    AddPredicates<point2d>(family);
    AddPredicates<POINT>(family);
    family.Add<bool(const point2d*, Point, Point, double)>(
        "CubicBezier::DoesFatlineIntersectBezier", DoesFatlineIntersectBezier, cubic<>, point<>, point<>, distance);
}

} // namespace ZarnMath::Catalogue
