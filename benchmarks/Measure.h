/// @file
/// How a benchmark runs a call over the corpus.
#pragma once

#include "benchmarks/Corpus.h"

#include <benchmark/benchmark.h>

#include <functional>

namespace ZarnMath::Benchmarks {

/// Reports how often the library's functions are entered, on the mean of a number of calls. The program that counts has it,
/// and those that measure time have not.
///
/// @param calls how many `run` makes
[[gnu::weak]] void CountSteps(benchmark::State& state, std::size_t calls, const std::function<void()>& run);

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
    if (CountSteps != nullptr)
        CountSteps(state, corpusSize, [&] {
            for (i = 0; i < corpusSize; ++i)
                benchmark::DoNotOptimize(f(inputs[i]...));
        });
}

/// The same for a call that returns the work done, as a number or as whether there was any. Its mean over the corpus is
/// reported.
template <typename F, typename... T>
void MeasureWork(benchmark::State& state, const char* work, F f, const std::vector<T>&... inputs)
{
    Measure(state, f, inputs...);
    std::int64_t done = 0;
    for (std::size_t i = 0; i < corpusSize; ++i)
        done += static_cast<std::int64_t>(f(inputs[i]...));
    state.counters[work] = static_cast<double>(done) / static_cast<double>(corpusSize);
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
