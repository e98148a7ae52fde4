#include "tests/vectors/Table.h"

#include "ZarnMath/Bezier.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

void ThroughPoints(Input& in, Output& out)
{
    const auto [start, through, end] = in.GetArray<point2d, 3>();
    std::array<POINT, 4> curve{};
    From3Points(curve.data(), start, through, end, in.Get<bool>());
    out.AddArray(curve);
}

void ThroughPointsWithTangents(Input& in, Output& out)
{
    const POINT untouched{77, -77};
    point2d start{};
    vector2d startTangent{};
    point2d through{};
    point2d end{};
    vector2d endTangent{};
    in.Into(start, startTangent, through, end, endTangent);
    std::array<POINT, 4> curve{untouched, untouched, untouched, untouched};
    out.Add(From3Points(curve.data(), start, startTangent, through, end, endTangent));
    out.AddArray(curve);
}

void CurvatureAt(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    double curvature = in.Get<double>();
    const bool result = GetCurvatureAt(t, a, b, c, curvature);
    out.Add(result, curvature);
}

void CurvatureRadiusAt(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    double radius = 0.0;
    const bool result = GetCurvatureRadiusAt(t, a, b, c, radius);
    out.Add(result, radius);
}

void SafeCurvature(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    out.Add(SafeBezierCurvature(t, a, b, c));
}

void Inflections(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    auto parameters = in.GetArray<double, 2>();
    out.Add(BezierInflectionPoints(a, b, c, parameters.data()));
    out.AddArray(parameters);
}

void MinMax(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    std::array<double, 11> parameters{};
    const int count = FindCurvatureMinMax(a, b, c, parameters.data());
    out.Add(count);
    out.AddRun(parameters.data(), static_cast<std::size_t>(count));
}

void SafeTangent(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    out.Add(SafeBezierTangent(t, a, b, c, d));
}

} // namespace

void AddCurvatureAdapters(Table& table)
{
    table.Add("From3Points", ThroughPoints);
    table.Add("From3Points(tangents)", ThroughPointsWithTangents);
    table.Add("GetCurvatureAt", CurvatureAt);
    table.Add("GetCurvatureRadiusAt", CurvatureRadiusAt);
    table.Add("SafeBezierCurvature", SafeCurvature);
    table.Add("BezierInflectionPoints", Inflections);
    table.Add("FindCurvatureMinMax", MinMax);
    table.Add("SafeBezierTangent", SafeTangent);
}

} // namespace ZarnMath::Vectors
