// Crossings of a cubic with lines and segments.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

template <typename P>
void FindBezierLineIntersection(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    std::vector<double> bezierParameters;
    std::vector<double> lineParameters;
    const auto find = [&](const CubicOf<P>& curve, const LineOf<P>& line) {
        CubicBezier::FindBezierLineIntersection(curve.data(), line.data(), bezierParameters, lineParameters, true);
        return std::ssize(bezierParameters);
    };
    MeasureWork(state, "crossings", find, drawing.curves, drawing.lines);
}

BENCHMARK_TEMPLATE(FindBezierLineIntersection, point2d);
BENCHMARK_TEMPLATE(FindBezierLineIntersection, POINT);

void FindBezierIntersectionsAtX(State& state)
{
    const Drawing<point2d>& drawing = SharedCorpus().real;
    std::vector<double> parameters;
    const auto find = [&parameters](const Cubic& curve, const point2d& p) {
        parameters.clear();
        CubicBezier::FindBezierIntersectionsAtX(curve.data(), p.x, parameters, true);
        return std::ssize(parameters);
    };
    MeasureWork(state, "crossings", find, drawing.curves, drawing.pointsOnCurves);
}

BENCHMARK(FindBezierIntersectionsAtX);

template <typename P>
void DoesBezierIntersectLineSegment(State& state)
{
    const Drawing<P>& drawing = SharedCorpus().In<P>();
    const auto find = [](const CubicOf<P>& curve, const LineOf<P>& line) {
        return CubicBezier::DoesBezierIntersectLineSegment(curve.data(), line.data());
    };
    MeasureWork(state, "crossing", find, drawing.curves, drawing.lines);
}

BENCHMARK_TEMPLATE(DoesBezierIntersectLineSegment, point2d);
BENCHMARK_TEMPLATE(DoesBezierIntersectLineSegment, POINT);

} // namespace
} // namespace ZarnMath::Benchmarks
