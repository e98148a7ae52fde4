#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using Box = BoundsT<double>;

void AddBoxesOfPoints(Family& family)
{
    family.Add<RECT()>("GetEmptyRect", GetEmptyRect);
    family.Add<void(RECT&)>("InitializeEmpty", InitializeEmpty, written<RECT>);
    family.Add<void(Box&)>("InitializeEmpty", InitializeEmpty, written<Box>);
    family.Add<void(RECT&)>("NormalizeRect", NormalizeRect, changedRect);
    family.Add<RECT(const POINT*, int)>("GetPointsBBox", GetPointsBBox, points<POINT, -1>, countOfPoints<>);
    family.Add<Box(const point2d*, int)>("GetPointsBBox", GetPointsBBox, points<point2d, -1>, countOfPoints<>);
    family.Add<void(const POINT*, int, RECT&)>("GetPointsBBox", GetPointsBBox, points<POINT, -1>, countOfPoints<>,
                                               written<RECT>);
    family.Add<void(RECT&, const POINT&)>("UnionPointWithRect", UnionPointWithRect, changedRect, point<POINT>);
    family.Add<void(RECT&, const point2d&)>("UnionPointWithRect", UnionPointWithRect, changedRect, point<>);
    family.Add<void(RECT&, const POINT*, int)>("UnionPointsWithRect", UnionPointsWithRect, changedRect,
                                               points<POINT, -1>, countOfPoints<>);
}

void AddRectangles(Family& family)
{
    family.Add<bool(RECT&, const RECT&)>("UnionRect", UnionRect, changedRect, rect);
    family.Add<bool(RECT&, const RECT&)>("IntersectRect", IntersectRect, changedRect, rect);
    family.Add<void(RECT&, int, int)>("TranslateRect", TranslateRect, changedRect, integer, integer);
    family.Add<void(RECT&, int, int)>("TranslateValidRect", TranslateValidRect, changedRect, integer, integer);
    family.Add<void(RECT&, int, int)>("InflateRect", InflateRect, changedRect, integer, integer);
    family.Add<void(const Box&, point2d*)>("GetRectCorners", GetRectCorners, bounds, writtenArray<point2d, 4>);
    family.Add<void(const RECT&, POINT*)>("GetRectCorners", GetRectCorners, rect, writtenArray<POINT, 4>);
    family.Add<POINT(const RECT&)>("GetRectCenter", GetRectCenter, rect);
    family.Add<double(const RECT&)>("GetRectArea", GetRectArea, rect);
    family.Add<bool(const POINT&, const RECT&)>("IsPointInRect", IsPointInRect, point<POINT>, rect);
    family.Add<bool(const point2d&, const RECT&)>("IsPointInRect", IsPointInRect, point<>, rect);
    family.Add<bool(const POINT*, unsigned long, const RECT&)>("IsAnyPointInRect", IsAnyPointInRect, points<POINT>,
                                                               countOfPoints<unsigned long>, rect);
    family.Add<RECT(const POINT&, int)>("GetPointRect", GetPointRect, point<POINT>, integer);
    family.Add<RECT(const POINT&, int, int)>("GetPointRect", GetPointRect, point<POINT>, integer, integer);
    family.Add<const Box&()>("IdentityBounds", IdentityBounds);
}

void AddTransformedBoxes(Family& family)
{
    family.Add<RECT(const RECT&, const MATRIX&)>("GetTransformedBBox", GetTransformedBBox, rect, matrix);
    family.Add<Box(const Box&, const MATRIX&)>("GetTransformedBBox", GetTransformedBBox, bounds, matrix);
    family.Add<RECT(const RECT&, const MATRIX&)>("GetUntransformedBBox", GetUntransformedBBox, rect, matrix);
    family.Add<Box(const Box&, const MATRIX&)>("GetUntransformedBBox", GetUntransformedBBox, bounds, matrix);
    family.Add<RECT(const POINT*, unsigned long, const MATRIX&)>("GetTransformedPointsBBox", GetTransformedPointsBBox,
                                                                 points<POINT>, countOfPoints<unsigned long>, matrix);
    family.Add<Box(const point2d*, unsigned long, const MATRIX&)>(
        "GetTransformedPointsBBox", GetTransformedPointsBBox, points<point2d>, countOfPoints<unsigned long>, matrix);
    family.Add<point2d(const point2d&, const Box&, const Box&)>("GetRemappedPoint", GetRemappedPoint, point<>, bounds,
                                                                bounds);
    family.Set(NumberClass::Platform);
    family.Add<Box(const MATRIX&, double, point2d)>("GetTransformedCircleBBox", GetTransformedCircleBBox, matrix,
                                                    distance, point<>);
}

} // namespace

void AddBounds(std::vector<Function>& list)
{
    Family family(list, "Bounds");
    AddBoxesOfPoints(family);
    AddRectangles(family);
    AddTransformedBoxes(family);
}

} // namespace ZarnMath::Catalogue
