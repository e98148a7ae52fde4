// Where a cubic runs in a given direction, its box, the area under it, and points square to it.

#include "ZarnMath/BezierInternal.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

using FindTangents = void(const point2d&, const point2d&, const point2d&, std::vector<double>&);

template <FindTangents* get>
void TangentsAlongAxis(State& state)
{
    std::vector<double> parameters;
    const auto find = [&parameters](const PowerForm& f) {
        parameters.clear();
        get(f.a, f.b, f.c, parameters);
        return std::ssize(parameters);
    };
    MeasureWork(state, "roots", find, SharedCorpus().forms);
}

BENCHMARK_TEMPLATE(TangentsAlongAxis, CubicBezier::GetVerticalTangents);
BENCHMARK_TEMPLATE(TangentsAlongAxis, CubicBezier::GetHorizontalTangents);

void GetParallels(State& state)
{
    const Corpus& corpus = SharedCorpus();
    std::vector<double> parameters;
    const auto find = [&parameters](const PowerForm& f, const Line& line) {
        parameters.clear();
        bool allParallel;
        CubicBezier::GetParallels(f.a, f.b, f.c, line[1] - line[0], parameters, allParallel);
        return std::ssize(parameters);
    };
    MeasureWork(state, "roots", find, corpus.forms, corpus.real.lines);
}

BENCHMARK(GetParallels);

/// Internal, but what the box of every curve comes from.
void GetTightBounds(State& state)
{
    const auto bound = [](const PowerForm& f) {
        BoundsT<double> box;
        CubicBezier::GetTightBounds(f.a, f.b, f.c, f.d, box.left, box.bottom, box.right, box.top);
        return box;
    };
    Measure(state, bound, SharedCorpus().forms);
}

BENCHMARK(GetTightBounds);

void GetAreaUnderBezier(State& state)
{
    const auto area = [](const PowerForm& f) { return CubicBezier::GetAreaUnderBezier(f.a, f.b, f.c, f.d); };
    Measure(state, area, SharedCorpus().forms);
}

BENCHMARK(GetAreaUnderBezier);

void MapToBezier(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto map = [](const Cubic& curve, double t, double offset) {
        return CubicBezier::MapToBezier(curve.data(), t, offset, 1.0);
    };
    Measure(state, map, corpus.real.curves, corpus.parameters, corpus.distances);
}

BENCHMARK(MapToBezier);

} // namespace
} // namespace ZarnMath::Benchmarks
