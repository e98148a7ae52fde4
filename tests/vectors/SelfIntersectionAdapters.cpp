#include "tests/vectors/Table.h"

#include "ZarnMath/Bezier.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

template <typename P>
void BracketCrossing(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    auto [lateStart, lateEnd, earlyStart, earlyEnd] = in.GetArray<double, 4>();
    const bool allowClosed = in.Get<bool>();
    out.Add(DoesBezierSelfIntersect(curve.data(), lateStart, lateEnd, earlyStart, earlyEnd, allowClosed));
    out.Add(lateStart, lateEnd, earlyStart, earlyEnd);
}

template <typename P>
void FindCrossing(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    auto [first, second] = in.GetArray<double, 2>();
    auto point = in.Get<point2d>();
    out.Add(FindBezierSelfIntersection(curve.data(), first, second, point));
    out.Add(first, second, point);
}

void TouchFatLine(Input& in, Output& out)
{
    const auto curve = in.GetArray<point2d, 4>();
    const auto [lineStart, lineEnd] = in.GetArray<point2d, 2>();
    const double halfWidth = in.Get<double>();
    out.Add(DoesFatlineIntersectBezier(curve.data(), lineStart, lineEnd, halfWidth));
}

} // namespace

void AddSelfIntersectionAdapters(Table& table)
{
    table.Add("DoesBezierSelfIntersect(point2d)", BracketCrossing<point2d>);
    table.Add("DoesBezierSelfIntersect(POINT)", BracketCrossing<POINT>);
    table.Add("FindBezierSelfIntersection(point2d)", FindCrossing<point2d>);
    table.Add("FindBezierSelfIntersection(POINT)", FindCrossing<POINT>);
    table.Add("DoesFatlineIntersectBezier", TouchFatLine);
}

} // namespace ZarnMath::Vectors
