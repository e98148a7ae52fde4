#include "tests/vectors/Table.h"

#include "ZarnMath/Bounds.h"

namespace ZarnMath::Vectors {

namespace {

template <typename Box>
void Empty(Input& in, Output& out)
{
    Box box = in.Get<Box>();
    InitializeEmpty(box);
    out.Add(box);
}

template <typename P>
void BoxOfPoints(Input& in, Output& out)
{
    const auto points = in.GetVector<P>();
    const int count = in.Get<int>();
    out.Add(GetPointsBBox(points.data(), count));
}

void StoreBoxOfPoints(Input& in, Output& out)
{
    const auto points = in.GetVector<POINT>();
    const int count = in.Get<int>();
    RECT box = in.Get<RECT>();
    GetPointsBBox(points.data(), count, box);
    out.Add(box);
}

template <typename P>
void UnionPoint(Input& in, Output& out)
{
    RECT rect = in.Get<RECT>();
    UnionPointWithRect(rect, in.Get<P>());
    out.Add(rect);
}

void UnionPoints(Input& in, Output& out)
{
    RECT rect = in.Get<RECT>();
    const auto points = in.GetVector<POINT>();
    UnionPointsWithRect(rect, points.data(), in.Get<int>());
    out.Add(rect);
}

void AddCombination(Table& table, const std::string& name, bool (*combine)(RECT&, const RECT&) noexcept)
{
    table.Add(name, [combine](Input& in, Output& out) {
        RECT a = in.Get<RECT>();
        const bool result = combine(a, in.Get<RECT>());
        out.Add(result, a);
    });
}

void AddMotion(Table& table, const std::string& name, void (*move)(RECT&, int, int) noexcept)
{
    table.Add(name, [move](Input& in, Output& out) {
        RECT rect = in.Get<RECT>();
        const int dx = in.Get<int>();
        move(rect, dx, in.Get<int>());
        out.Add(rect);
    });
}

/// The corners go into the middle of a longer run, whose ends have to stay.
template <typename Box, typename P>
void Corners(Input& in, Output& out)
{
    const Box box = in.Get<Box>();
    auto run = in.GetArray<P, 6>();
    GetRectCorners(box, &run[1]);
    out.AddArray(run);
}

template <typename P>
void PointInRect(Input& in, Output& out)
{
    const P p = in.Get<P>();
    out.Add(IsPointInRect(p, in.Get<RECT>()));
}

void AnyPointInRect(Input& in, Output& out)
{
    const auto points = in.GetVector<POINT>();
    const auto count = in.Get<unsigned long>();
    out.Add(IsAnyPointInRect(points.data(), count, in.Get<RECT>()));
}

void RectAboutPoint(Input& in, Output& out)
{
    const POINT p = in.Get<POINT>();
    out.Add(GetPointRect(p, in.Get<int>()));
}

void RectAboutPointByAxis(Input& in, Output& out)
{
    const POINT p = in.Get<POINT>();
    const int rx = in.Get<int>();
    out.Add(GetPointRect(p, rx, in.Get<int>()));
}

} // namespace

void AddBoundsAdapters(Table& table)
{
    table.Add("GetEmptyRect", [](Input&, Output& out) { out.Add(GetEmptyRect()); });
    table.Add("InitializeEmpty(RECT)", Empty<RECT>);
    table.Add("InitializeEmpty(BoundsT)", Empty<BoundsT<double>>);
    table.Add("NormalizeRect", [](Input& in, Output& out) {
        RECT rect = in.Get<RECT>();
        NormalizeRect(rect);
        out.Add(rect);
    });
    table.Add("GetPointsBBox(POINT)", BoxOfPoints<POINT>);
    table.Add("GetPointsBBox(point2d)", BoxOfPoints<point2d>);
    table.Add("GetPointsBBox(POINT,out)", StoreBoxOfPoints);
    table.Add("UnionPointWithRect(POINT)", UnionPoint<POINT>);
    table.Add("UnionPointWithRect(point2d)", UnionPoint<point2d>);
    table.Add("UnionPointsWithRect", UnionPoints);
    AddCombination(table, "UnionRect", UnionRect);
    AddCombination(table, "IntersectRect", IntersectRect);
    AddMotion(table, "TranslateRect", TranslateRect);
    AddMotion(table, "TranslateValidRect", TranslateValidRect);
    AddMotion(table, "InflateRect", InflateRect);
    table.Add("GetRectCorners(RECT)", Corners<RECT, POINT>);
    table.Add("GetRectCorners(BoundsT)", Corners<BoundsT<double>, point2d>);
    table.Add("GetRectCenter", [](Input& in, Output& out) { out.Add(GetRectCenter(in.Get<RECT>())); });
    table.Add("GetRectArea", [](Input& in, Output& out) { out.Add(GetRectArea(in.Get<RECT>())); });
    table.Add("IsPointInRect(POINT)", PointInRect<POINT>);
    table.Add("IsPointInRect(point2d)", PointInRect<point2d>);
    table.Add("IsAnyPointInRect", AnyPointInRect);
    table.Add("GetPointRect(r)", RectAboutPoint);
    table.Add("GetPointRect(rx,ry)", RectAboutPointByAxis);
    table.Add("IdentityBounds", [](Input&, Output& out) { out.Add(IdentityBounds()); });
}

} // namespace ZarnMath::Vectors
