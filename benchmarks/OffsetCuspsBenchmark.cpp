// Where the offset of a cubic turns back on itself.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

void FindOffsetCusps(State& state)
{
    const Corpus& corpus = SharedCorpus();
    std::vector<double> parameters;
    const auto find = [&parameters](const PowerForm& f, double distance) {
        CubicBezier::FindOffsetCusps(f.a, f.b, f.c, distance, parameters);
        return std::ssize(parameters);
    };
    MeasureWork(state, "cusps", find, corpus.forms, corpus.distances);
}

BENCHMARK(FindOffsetCusps);

} // namespace
} // namespace ZarnMath::Benchmarks
