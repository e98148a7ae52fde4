#include "tests/vectors/Table.h"

#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

void AddTangents(Table& table, const std::string& name,
                 void (*find)(const point2d&, const point2d&, const point2d&, std::vector<double>&))
{
    table.Add(name, [find](Input& in, Output& out) {
        const auto [a, b, c] = in.GetArray<point2d, 3>();
        auto parameters = in.GetVector<double>();
        find(a, b, c, parameters);
        out.AddVector(parameters);
    });
}

void Parallels(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    const vector2d direction = in.Get<vector2d>();
    auto parameters = in.GetVector<double>();
    bool allParallel = in.Get<bool>();
    GetParallels(a, b, c, direction, parameters, allParallel);
    out.AddVector(parameters);
    out.Add(allParallel);
}

void Area(Input& in, Output& out)
{
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    out.Add(GetAreaUnderBezier(a, b, c, d));
}

void TightBounds(Input& in, Output& out)
{
    const auto [a, b, c, d] = in.GetArray<point2d, 4>();
    std::array<double, 4> box{};
    GetTightBounds(a, b, c, d, box[0], box[1], box[2], box[3]);
    out.AddArray(box);
}

void Map(Input& in, Output& out)
{
    const auto curve = in.GetArray<point2d, 4>();
    const auto [t, offset, scale] = in.GetArray<double, 3>();
    out.Add(MapToBezier(curve.data(), t, offset, scale));
}

void AllCusps(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    std::array<double, 13> parameters{};
    const int count = FindAllOffsetCusp(a, b, c, in.Get<double>(), parameters.data());
    out.Add(count);
    out.AddRun(parameters.data(), static_cast<std::size_t>(count));
}

void Cusps(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    const double distance = in.Get<double>();
    auto parameters = in.GetVector<double>();
    out.Add(FindOffsetCusps(a, b, c, distance, parameters));
    out.AddVector(parameters);
}

} // namespace

void AddExtentsAdapters(Table& table)
{
    AddTangents(table, "GetVerticalTangents", GetVerticalTangents);
    AddTangents(table, "GetHorizontalTangents", GetHorizontalTangents);
    table.Add("GetParallels", Parallels);
    table.Add("GetAreaUnderBezier", Area);
    table.Add("GetTightBounds<double>", TightBounds);
    table.Add("MapToBezier", Map);
    table.Add("FindAllOffsetCusp", AllCusps);
    table.Add("FindOffsetCusps", Cusps);
}

} // namespace ZarnMath::Vectors
