#include "tests/vectors/Table.h"

#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

/// A cubic in power form and a query point.
struct PowerQuery
{
    point2d a;
    point2d b;
    point2d c;
    point2d d;
    point2d q;
};

void Read(Input& in, PowerQuery& query)
{
    in.Into(query.a, query.b, query.c, query.d, query.q);
}

/// The results that a search may leave untouched.
template <typename P>
struct Nearest
{
    double t;
    P point;
    double distanceSquared;
};

template <typename P>
void Read(Input& in, Nearest<P>& nearest)
{
    in.Into(nearest.t, nearest.point, nearest.distanceSquared);
}

template <typename P>
void Write(Output& out, const Nearest<P>& nearest)
{
    out.Add(nearest.t, nearest.point, nearest.distanceSquared);
}

using PowerSearch = bool (*)(const point2d&, const point2d&, const point2d&, const point2d&, const point2d&, double&,
                             point2d&, double&) noexcept;

Adapter SearchPowerForm(PowerSearch search)
{
    return [search](Input& in, Output& out) {
        const auto [a, b, c, d, q] = in.Get<PowerQuery>();
        auto nearest = in.Get<Nearest<point2d>>();
        const bool found = search(a, b, c, d, q, nearest.t, nearest.point, nearest.distanceSquared);
        out.Add(found, nearest);
    };
}

template <typename P>
void SearchControlPoints(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const P q = in.Get<P>();
    auto nearest = in.Get<Nearest<P>>();
    const bool found = FindClosestPointOnBezier(curve.data(), q, nearest.t, nearest.point, nearest.distanceSquared);
    out.Add(found, nearest);
}

void FindParameter(Input& in, Output& out)
{
    const auto curve = in.GetArray<POINT, 4>();
    const POINT q = in.Get<POINT>();
    out.Add(FindClosestPointOnBezier(curve.data(), q));
}

template <typename P>
using SearchForAll = bool (*)(const P*, const P&, std::vector<double>&, std::vector<P>&, std::vector<double>&);

template <typename P>
void AddSearchForAll(Table& table, const std::string& name, SearchForAll<P> search)
{
    table.Add(name, [search](Input& in, Output& out) {
        const auto curve = in.GetArray<P, 4>();
        const P q = in.Get<P>();
        auto ts = in.GetVector<double>();
        auto points = in.GetVector<P>();
        auto squaredDistances = in.GetVector<double>();
        out.Add(search(curve.data(), q, ts, points, squaredDistances));
        out.AddVector(ts);
        out.AddVector(points);
        out.AddVector(squaredDistances);
    });
}

void FindSideWithResults(Input& in, Output& out)
{
    const auto [a, b, c, d, q] = in.Get<PowerQuery>();
    auto nearest = in.Get<Nearest<point2d>>();
    Side side = in.Get<Side>();
    const bool found = GetSide(a, b, c, d, q, nearest.t, nearest.point, nearest.distanceSquared, side);
    out.Add(found, nearest, side);
}

void FindSide(Input& in, Output& out)
{
    const auto [a, b, c, d, q] = in.Get<PowerQuery>();
    out.Add(GetSide(a, b, c, d, q));
}

void InvertPoint(Input& in, Output& out)
{
    const auto [a, b, c, d, q] = in.Get<PowerQuery>();
    auto parameters = in.GetVector<double>();
    out.Add(Invert(a, b, c, d, q, parameters));
    out.AddVector(parameters);
}

/// The array of the record is longer than the function may use: its last three elements stay as they were.
void FindTangents(Input& in, Output& out)
{
    const auto [a, b, c, d, q] = in.Get<PowerQuery>();
    std::array<double, 8> parameters = {-50.0, -51.0, -52.0, -53.0, -54.0, -55.0, -56.0, -57.0};
    const int count = FindTangentsToPoint(a, b, c, d, q, parameters.data());
    out.Add(count);
    out.AddRun(parameters.data(), static_cast<std::size_t>(count));
    out.AddRun(parameters.data() + 5, 3);
}

} // namespace

void AddClosestPointAdapters(Table& table)
{
    table.Add("FindClosestPointOnBezier(power)", SearchPowerForm(FindClosestPointOnBezier));
    table.Add("FindClosestPointOnBezierExtendedRange", SearchPowerForm(FindClosestPointOnBezierExtendedRange));
    table.Add("FindClosestPointOnBezier(point2d)", SearchControlPoints<point2d>);
    table.Add("FindClosestPointOnBezier(POINT)", SearchControlPoints<POINT>);
    table.Add("FindClosestPointOnBezier(POINT, parameter)", FindParameter);
    AddSearchForAll<point2d>(table, "FindClosestPointsOnBezier(point2d)", FindClosestPointsOnBezier);
    AddSearchForAll<POINT>(table, "FindClosestPointsOnBezier(POINT)", FindClosestPointsOnBezier);
    AddSearchForAll<point2d>(table, "FindClosestPointsOnBezierT<point2d>", FindClosestPointsOnBezierT<point2d>);
    AddSearchForAll<POINT>(table, "FindClosestPointsOnBezierT<POINT>", FindClosestPointsOnBezierT<POINT>);
    table.Add("GetSide(results)", FindSideWithResults);
    table.Add("GetSide", FindSide);
    table.Add("Invert", InvertPoint);
    table.Add("FindTangentsToPoint", FindTangents);
}

} // namespace ZarnMath::Vectors
