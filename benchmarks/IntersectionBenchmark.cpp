// The implicit form, crossings of two cubics, loops, and the fast predicates.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

void ConvertBezierToImplicit(State& state)
{
    const auto convert = [](const PowerForm& f) {
        std::array<double, 10> k;
        CubicBezier::ConvertBezierToImplicit(f.a, f.b, f.c, f.d, k[0], k[1], k[2], k[3], k[4], k[5], k[6], k[7], k[8],
                                             k[9]);
        return k;
    };
    Measure(state, convert, SharedCorpus().forms);
}

BENCHMARK(ConvertBezierToImplicit);

template <typename P>
void FindBezierIntersections(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    std::vector<double> firstParameters;
    std::vector<double> secondParameters;
    std::vector<point2d> points;
    const auto find = [&](const CubicOf<P>& first, const CubicOf<P>& second) {
        firstParameters.clear();
        secondParameters.clear();
        points.clear();
        CubicBezier::FindBezierIntersections(first.data(), second.data(), firstParameters, secondParameters, points);
        return std::ssize(points);
    };
    MeasureWork(state, "crossings", find, drawing.curves, drawing.others);
}

BENCHMARK_TEMPLATE(FindBezierIntersections, point2d);
BENCHMARK_TEMPLATE(FindBezierIntersections, POINT);

template <typename P>
void DoBeziersIntersect(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    const auto find = [](const CubicOf<P>& one, const CubicOf<P>& other) {
        return CubicBezier::DoBeziersIntersect(one.data(), other.data());
    };
    MeasureWork(state, "crossing", find, drawing.curves, drawing.others);
}

BENCHMARK_TEMPLATE(DoBeziersIntersect, point2d);
BENCHMARK_TEMPLATE(DoBeziersIntersect, POINT);

template <typename P>
void DoesBezierSelfIntersect(State& state)
{
    const auto find = [](const CubicOf<P>& curve) {
        double lateStart, lateEnd, earlyStart, earlyEnd;
        return CubicBezier::DoesBezierSelfIntersect(curve.data(), lateStart, lateEnd, earlyStart, earlyEnd, true);
    };
    MeasureWork(state, "loops", find, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(DoesBezierSelfIntersect, point2d);
BENCHMARK_TEMPLATE(DoesBezierSelfIntersect, POINT);

template <typename P>
void FindBezierSelfIntersection(State& state)
{
    const auto find = [](const CubicOf<P>& curve) {
        double first, second;
        point2d point;
        return CubicBezier::FindBezierSelfIntersection(curve.data(), first, second, point);
    };
    MeasureWork(state, "crossings", find, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(FindBezierSelfIntersection, point2d);
BENCHMARK_TEMPLATE(FindBezierSelfIntersection, POINT);

void DoesFatlineIntersectBezier(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [](const Cubic& curve, const Line& line, double distance) {
        return CubicBezier::DoesFatlineIntersectBezier(curve.data(), line[0], line[1], distance * 0.1);
    };
    MeasureWork(state, "touching", find, corpus.real.curves, corpus.real.lines, corpus.distances);
}

BENCHMARK(DoesFatlineIntersectBezier);

} // namespace
} // namespace ZarnMath::Benchmarks
