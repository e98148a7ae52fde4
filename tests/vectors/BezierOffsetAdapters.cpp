#include "tests/vectors/Table.h"

#include "ZarnMath/BezierOffsetInternal.h"

namespace ZarnMath::Vectors {

namespace {

void ValidPowerForm(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    out.Add(IsBezierValidForOffset(a, b, c, in.Get<double>()));
}

void ValidControlPoints(Input& in, Output& out)
{
    const auto bezier = in.GetArray<point2d, 4>();
    out.Add(IsBezierValidForOffset(bezier.data(), in.Get<double>()));
}

void OffsetPoint(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    const double distance = in.Get<double>();
    auto parameters = in.GetVector<double>();
    auto points = in.GetVector<point2d>();
    GetOffsetPoint(t, a, b, c, d, distance, parameters, points);
    out.AddVector(parameters);
    out.AddVector(points);
}

void OffsetFit(Input& in, Output& out)
{
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    auto offset = in.GetArray<point2d, 4>();
    const double ignored = in.Get<double>();
    const auto points = in.GetVector<point2d>();
    double error = in.Get<double>();
    double splitParameter = in.Get<double>();
    out.Add(FindBezierOffsetUsingLeastSquares(a, b, c, d, offset.data(), ignored, points.data(),
                                              static_cast<unsigned long>(points.size()), error, splitParameter));
    out.AddArray(offset);
    out.Add(error, splitParameter);
}

} // namespace

void AddBezierOffsetAdapters(Table& table)
{
    table.Add("IsBezierValidForOffset(a,b,c)", ValidPowerForm);
    table.Add("IsBezierValidForOffset(bezier)", ValidControlPoints);
    table.Add("GetOffsetPoint", OffsetPoint);
    table.Add("FindBezierOffsetUsingLeastSquares", OffsetFit);
}

} // namespace ZarnMath::Vectors
