#include "tests/vectors/Table.h"

#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"

namespace ZarnMath::Vectors {

namespace {

void FitPoints(Input& in, Output& out)
{
    const auto points = in.GetVector<point2d>();
    point2d point = in.Get<point2d>();
    vector2d direction = in.Get<vector2d>();
    GetLeastSquaresLines(points.data(), static_cast<int>(points.size()), point, direction);
    out.Add(point, direction);
}

void FitSums(Input& in, Output& out)
{
    const auto [x, y, xy, xx, yy] = in.GetArray<double, 5>();
    const auto points = in.GetVector<point2d>();
    point2d point{};
    vector2d direction{};
    GetLeastSquaresLines(x, y, xy, xx, yy, points.data(), in.Get<int>(), point, direction);
    out.Add(point, direction);
}

template <typename P>
void Collinear(Input& in, Output& out)
{
    const auto points = in.GetVector<P>();
    out.Add(AreCollinear(points.data(), static_cast<unsigned long>(points.size()), in.Get<double>()));
}

void DistanceToSegment(Input& in, Output& out)
{
    const auto [start, end, p] = in.GetArray<point2d, 3>();
    out.Add(DistanceToLineSegmentSqrd(start, end, p));
}

void FatlineAndLine(Input& in, Output& out)
{
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    out.Add(DoesFatlineIntersectLine(a, b, c, d, in.Get<double>()));
}

void Reflect(Input& in, Output& out)
{
    const POINT direction = in.Get<POINT>();
    const POINT origin = in.Get<POINT>();
    auto points = in.GetVector<POINT>();
    ReflectAcross(direction, origin, points.data(), static_cast<unsigned long>(points.size()));
    out.AddVector(points);
}

} // namespace

void AddLineAdapters(Table& table)
{
    table.Add("GetLeastSquaresLines(points)", FitPoints);
    table.Add("GetLeastSquaresLines(sums)", FitSums);
    table.Add("AreCollinear(point2d)", Collinear<point2d>);
    table.Add("AreCollinear(POINT)", Collinear<POINT>);
    table.Add("DistanceToLineSegmentSqrd", DistanceToSegment);
    table.Add("DoesFatlineIntersectLine", FatlineAndLine);
    table.Add("ReflectAcross", Reflect);
}

} // namespace ZarnMath::Vectors
