// The nearest point of a cubic, the side and the parameter of a point, and tangents through it.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

/// What a search for the nearest point gives.
template <typename P>
struct Nearest
{
    double t;
    P point;
    double distanceSquared;
};

void FindClosestPointOnPowerForm(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [](const PowerForm& f, const point2d& q) {
        Nearest<point2d> nearest;
        return CubicBezier::FindClosestPointOnBezier(f.a, f.b, f.c, f.d, q, nearest.t, nearest.point,
                                                     nearest.distanceSquared);
    };
    MeasureWork(state, "found", find, corpus.forms, corpus.real.points);
}

BENCHMARK(FindClosestPointOnPowerForm);

template <typename P>
void FindClosestPointOnBezier(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    const auto find = [](const CubicOf<P>& curve, const P& q) {
        Nearest<P> nearest;
        return CubicBezier::FindClosestPointOnBezier(curve.data(), q, nearest.t, nearest.point,
                                                     nearest.distanceSquared);
    };
    MeasureWork(state, "found", find, drawing.curves, drawing.points);
}

BENCHMARK_TEMPLATE(FindClosestPointOnBezier, point2d);
BENCHMARK_TEMPLATE(FindClosestPointOnBezier, POINT);

void FindClosestParameter(State& state)
{
    const Drawing<POINT>& drawing = SharedCorpus().integer;
    const auto find = [](const IntegerCubic& curve, const POINT& q) {
        return CubicBezier::FindClosestPointOnBezier(curve.data(), q);
    };
    Measure(state, find, drawing.curves, drawing.points);
}

BENCHMARK(FindClosestParameter);

template <typename P>
void FindClosestPointsOnBezier(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    std::vector<double> parameters;
    std::vector<P> points;
    std::vector<double> squaredDistances;
    const auto find = [&](const CubicOf<P>& curve, const P& q) {
        parameters.clear();
        points.clear();
        squaredDistances.clear();
        CubicBezier::FindClosestPointsOnBezier(curve.data(), q, parameters, points, squaredDistances);
        return std::ssize(points);
    };
    MeasureWork(state, "points", find, drawing.curves, drawing.points);
}

BENCHMARK_TEMPLATE(FindClosestPointsOnBezier, point2d);
BENCHMARK_TEMPLATE(FindClosestPointsOnBezier, POINT);

void GetSideAndNearest(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [](const PowerForm& f, const point2d& q) {
        Nearest<point2d> nearest;
        Side side;
        return CubicBezier::GetSide(f.a, f.b, f.c, f.d, q, nearest.t, nearest.point, nearest.distanceSquared, side);
    };
    MeasureWork(state, "found", find, corpus.forms, corpus.real.points);
}

BENCHMARK(GetSideAndNearest);

void GetSide(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [](const PowerForm& f, const point2d& q) {
        return CubicBezier::GetSide(f.a, f.b, f.c, f.d, q) != SideNone;
    };
    MeasureWork(state, "found", find, corpus.forms, corpus.real.points);
}

BENCHMARK(GetSide);

void Invert(State& state)
{
    const Corpus& corpus = SharedCorpus();
    std::vector<double> parameters;
    const auto find = [&parameters](const PowerForm& f, const point2d& q) {
        parameters.clear();
        return CubicBezier::Invert(f.a, f.b, f.c, f.d, q, parameters);
    };
    MeasureWork(state, "matched", find, corpus.forms, corpus.real.pointsOnCurves);
}

BENCHMARK(Invert);

void FindTangentsToPoint(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [](const PowerForm& f, const point2d& q) {
        double parameters[5];
        return CubicBezier::FindTangentsToPoint(f.a, f.b, f.c, f.d, q, parameters);
    };
    MeasureWork(state, "roots", find, corpus.forms, corpus.real.points);
}

BENCHMARK(FindTangentsToPoint);

} // namespace
} // namespace ZarnMath::Benchmarks
