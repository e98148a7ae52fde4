// Offsets of the corpus by up to 100 units of either sign: the test of validity, the stretches that do not fold, and the fit
// of one cubic. "valid", "stretches" and "near" are the means of what they find; a fit is near within one unit.

#include "ZarnMath/BezierOffset.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

void IsBezierValidForOffset(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto test = [](const PowerForm& f, double distance) {
        return ZarnMath::IsBezierValidForOffset(f.a, f.b, f.c, distance);
    };
    MeasureWork(state, "valid", test, corpus.forms, corpus.distances);
}

BENCHMARK(IsBezierValidForOffset);

void IsBezierValidForOffsetOfControlPoints(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto test = [](const Cubic& curve, double distance) {
        return ZarnMath::IsBezierValidForOffset(curve.data(), distance);
    };
    MeasureWork(state, "valid", test, corpus.real.curves, corpus.distances);
}

BENCHMARK(IsBezierValidForOffsetOfControlPoints);

void GetSegmentsToOffset(State& state)
{
    const Corpus& corpus = SharedCorpus();
    std::vector<CubicBezier::bezier2dT<point2d>> stretches;
    const auto cut = [&stretches](const Cubic& curve, double distance) {
        stretches.clear();
        ZarnMath::GetSegmentsToOffset({{curve[0], curve[1], curve[2], curve[3]}}, stretches, distance, nullptr);
        return std::ssize(stretches);
    };
    MeasureWork(state, "stretches", cut, corpus.real.curves, corpus.distances);
}

BENCHMARK(GetSegmentsToOffset);

void FindBezierOffsetCurve(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto fit = [](const Cubic& curve, double distance) {
        Cubic offset;
        double splitParameter = 0.0;
        const bool isNear = ZarnMath::FindBezierOffsetCurve(curve.data(), offset.data(), distance, 1.0, splitParameter);
        benchmark::DoNotOptimize(offset);
        return isNear;
    };
    MeasureWork(state, "near", fit, corpus.real.curves, corpus.distances);
}

BENCHMARK(FindBezierOffsetCurve);

} // namespace
} // namespace ZarnMath::Benchmarks
