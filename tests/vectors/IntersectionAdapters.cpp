#include "tests/vectors/Table.h"

#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

void MakeImplicit(Input& in, Output& out)
{
    const auto f = in.GetArray<point2d, 4>();
    auto k = in.GetArray<double, 10>();
    ConvertBezierToImplicit(f[0], f[1], f[2], f[3], k[0], k[1], k[2], k[3], k[4], k[5], k[6], k[7], k[8], k[9]);
    out.AddArray(k);
}

void SubstituteInImplicit(Input& in, Output& out)
{
    const auto f = in.GetArray<point2d, 8>();
    std::array<double, 10> polynomial{};
    GetBezierIntersectionPolynomial(f[0], f[1], f[2], f[3], f[4], f[5], f[6], f[7], polynomial.data());
    out.AddArray(polynomial);
}

template <typename P>
void IntersectLine(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const auto line = in.GetArray<P, 2>();
    auto bezierParameters = in.GetVector<double>();
    auto lineParameters = in.GetVector<double>();
    const bool includeEndpoints = in.Get<bool>();
    out.Add(FindBezierLineIntersection(curve.data(), line.data(), bezierParameters, lineParameters, includeEndpoints));
    out.AddVector(bezierParameters);
    out.AddVector(lineParameters);
}

void IntersectAtX(Input& in, Output& out)
{
    const auto curve = in.GetArray<point2d, 4>();
    const double x = in.Get<double>();
    auto parameters = in.GetVector<double>();
    const bool includeEndpoints = in.Get<bool>();
    out.Add(FindBezierIntersectionsAtX(curve.data(), x, parameters, includeEndpoints));
    out.AddVector(parameters);
}

template <typename P>
void IntersectSegment(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const auto line = in.GetArray<P, 2>();
    out.Add(DoesBezierIntersectLineSegment(curve.data(), line.data()));
}

void IntersectByHalving(Input& in, Output& out)
{
    const auto first = in.GetArray<point2d, 4>();
    const auto [firstStart, firstEnd] = in.GetArray<double, 2>();
    const auto second = in.GetArray<point2d, 4>();
    const auto [secondStart, secondEnd] = in.GetArray<double, 2>();
    auto parameters = in.GetArray<double, 9>();
    auto xs = in.GetArray<double, 9>();
    auto ys = in.GetArray<double, 9>();
    int count = in.Get<int>();
    const int depth = in.Get<int>();
    out.Add(BezierOld::BezierIntersectionEx(first.data(), firstStart, firstEnd, second.data(), secondStart, secondEnd,
                                            parameters.data(), xs.data(), ys.data(), count, depth));
    out.AddArray(parameters);
    out.AddArray(xs);
    out.AddArray(ys);
    out.Add(count);
}

} // namespace

void AddIntersectionAdapters(Table& table)
{
    table.Add("ConvertBezierToImplicit", MakeImplicit);
    table.Add("GetBezierIntersectionPolynomial", SubstituteInImplicit);
    table.Add("FindBezierLineIntersection(point2d)", IntersectLine<point2d>);
    table.Add("FindBezierLineIntersection(POINT)", IntersectLine<POINT>);
    table.Add("FindBezierIntersectionsAtX", IntersectAtX);
    table.Add("DoesBezierIntersectLineSegment(point2d)", IntersectSegment<point2d>);
    table.Add("DoesBezierIntersectLineSegment(POINT)", IntersectSegment<POINT>);
    table.Add("BezierIntersectionEx", IntersectByHalving);
}

} // namespace ZarnMath::Vectors
