#include "tests/vectors/WMathValues.h"

#include "ZarnMath/Bounds.h"

namespace ZarnMath::Vectors {

namespace {

RECT Settled(const RECT& box)
{
    return box;
}

/// The sign of a zero is not recorded.
BoundsT<double> Settled(const BoundsT<double>& box)
{
    return {box.left + 0.0, box.top + 0.0, box.right + 0.0, box.bottom + 0.0};
}

template <typename Box>
void AddBox(Table& table, const std::string& name, Box (*measure)(const Box&, const MATRIX&) noexcept)
{
    table.Add(name, [measure](Input& in, Output& out) {
        const Box box = in.Get<Box>();
        out.Add(Settled(measure(box, in.Get<MATRIX>())));
    });
}

template <typename P>
void BoxOfPoints(Input& in, Output& out)
{
    const auto points = in.GetVector<P>();
    const auto count = in.Get<unsigned long>();
    out.Add(GetTransformedPointsBBox(points.data(), count, in.Get<MATRIX>()));
}

void Remapped(Input& in, Output& out)
{
    const point2d p = in.Get<point2d>();
    const auto from = in.Get<BoundsT<double>>();
    out.Add(GetRemappedPoint(p, from, in.Get<BoundsT<double>>()));
}

} // namespace

void AddTransformedBoundsAdapters(Table& table)
{
    AddBox<RECT>(table, "GetTransformedBBox(RECT)", GetTransformedBBox);
    AddBox<BoundsT<double>>(table, "GetTransformedBBox(BoundsT)", GetTransformedBBox);
    AddBox<RECT>(table, "GetUntransformedBBox(RECT)", GetUntransformedBBox);
    AddBox<BoundsT<double>>(table, "GetUntransformedBBox(BoundsT)", GetUntransformedBBox);
    table.Add("GetTransformedPointsBBox(POINT)", BoxOfPoints<POINT>);
    table.Add("GetTransformedPointsBBox(point2d)", BoxOfPoints<point2d>);
    table.Add("GetRemappedPoint", Remapped);
}

} // namespace ZarnMath::Vectors
