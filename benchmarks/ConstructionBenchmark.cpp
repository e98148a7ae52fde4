// Cubics through three points: a bending arc, the simple arc, and an arc of given end tangents.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

/// Three points in curve order: an end of a curve of the corpus, a point in between, and its other end.
template <bool simple>
void From3Points(State& state)
{
    const Drawing<point2d>& drawing = SharedCorpus().real;
    const auto construct = [](const Cubic& curve, const point2d& through) {
        IntegerCubic arc;
        CubicBezier::From3Points(arc.data(), curve[0], through, curve[3], simple);
        return arc;
    };
    Measure(state, construct, drawing.curves, drawing.pointsOnCurves);
}

BENCHMARK_TEMPLATE(From3Points, false);
BENCHMARK_TEMPLATE(From3Points, true);

void From3PointsAndTangents(State& state)
{
    const Drawing<point2d>& drawing = SharedCorpus().real;
    const auto construct = [](const Cubic& curve, const point2d& through) {
        IntegerCubic arc;
        return CubicBezier::From3Points(arc.data(), curve[0], curve[1] - curve[0], through, curve[3],
                                        curve[2] - curve[3]);
    };
    MeasureWork(state, "constructed", construct, drawing.curves, drawing.pointsOnCurves);
}

BENCHMARK(From3PointsAndTangents);

} // namespace
} // namespace ZarnMath::Benchmarks
