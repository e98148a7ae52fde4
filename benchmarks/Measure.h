/// @file
/// How a benchmark runs a call over the corpus.
#pragma once

#include "benchmarks/Corpus.h"

#include <benchmark/benchmark.h>

namespace ZarnMath::Benchmarks {

/// Calls f(inputs[i]...) for one i after the other, over and over. What f returns is kept from being optimised away.
///
/// @param inputs `corpusSize` elements each
template <typename F, typename... T>
void Measure(benchmark::State& state, F f, const std::vector<T>&... inputs)
{
    [[maybe_unused]] std::size_t i = 0;
    for (auto _ : state) {
        auto result = f(inputs[i]...);
        benchmark::DoNotOptimize(result);
        i = i + 1 < corpusSize ? i + 1 : 0;
    }
}

/// The same for a call that returns the work done, as a number or as whether there was any. Its mean is reported.
template <typename F, typename... T>
void MeasureWork(benchmark::State& state, const char* work, F f, const std::vector<T>&... inputs)
{
    std::int64_t done = 0;
    const auto counted = [&](const T&... input) {
        const std::int64_t found = f(input...);
        done += found;
        return found;
    };
    Measure(state, counted, inputs...);
    state.counters[work] = benchmark::Counter(static_cast<double>(done), benchmark::Counter::kAvgIterations);
}

/// Calls f(first, count) on one run of points after the other, each of as many points as the benchmark's argument says.
template <typename F, typename P>
void MeasureRuns(benchmark::State& state, F f, const std::vector<P>& points)
{
    const auto count = static_cast<std::size_t>(state.range(0));
    std::size_t first = 0;
    for (auto _ : state) {
        auto result = f(points.data() + first, count);
        benchmark::DoNotOptimize(result);
        first = first + 2 * count <= points.size() ? first + count : 0;
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

} // namespace ZarnMath::Benchmarks
