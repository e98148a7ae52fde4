#include "tests/vectors/WMathValues.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/Circle.h"
#include "ZarnMath/CircleInternal.h"

namespace ZarnMath::Vectors {

namespace {

void Params(Input& in, Output& out)
{
    const MATRIX m = in.Get<MATRIX>();
    double major = in.Get<double>();
    double minor = in.Get<double>();
    const bool isAngleAsked = in.Get<bool>();
    double angle = in.Get<double>();
    GetTransformedCircleParams(m, major, minor, isAngleAsked ? &angle : nullptr);
    out.Add(major, minor, angle);
}

/// Lengths or vectors.
template <typename Axis>
void AddAxes(Table& table, const std::string& name, void (*getAxes)(const MATRIX&, Axis&, Axis&) noexcept,
             std::set<Platform> uses = {})
{
    const auto adapter = [getAxes](Input& in, Output& out) {
        const MATRIX m = in.Get<MATRIX>();
        Axis major = in.Get<Axis>();
        Axis minor = in.Get<Axis>();
        getAxes(m, major, minor);
        out.Add(major, minor);
    };
    table.Add(name, adapter, std::move(uses));
}

void Normal(Input& in, Output& out)
{
    const MATRIX m = in.Get<MATRIX>();
    out.Add(GetNormalOnTransformedCircle(m, in.Get<point2d>()));
}

void PointWithNormal(Input& in, Output& out)
{
    const vector2d normal = in.Get<vector2d>();
    const double a = in.Get<double>();
    out.Add(FindPointOnEllipseThatHasNormal(normal, a, in.Get<double>()));
}

void Box(Input& in, Output& out)
{
    const MATRIX m = in.Get<MATRIX>();
    const double radius = in.Get<double>();
    out.Add(GetTransformedCircleBBox(m, radius, in.Get<point2d>()));
}

} // namespace

void AddCircleAdapters(Table& table)
{
    table.Add("GetTransformedCircleParams", Params, {Platform::Atan});
    AddAxes(table, "GetTransformedCircleAxisLengths", GetTransformedCircleAxisLengths);
    AddAxes(table, "GetTransformedCircleAxes", GetTransformedCircleAxes,
            {Platform::Atan, Platform::Sin, Platform::Cos});
    table.Add("GetNormalOnTransformedCircle", Normal);
    table.Add("FindPointOnEllipseThatHasNormal", PointWithNormal);
    table.Add("GetTransformedCircleBBox", Box, {Platform::Atan, Platform::Sin, Platform::Cos});
}

} // namespace ZarnMath::Vectors
