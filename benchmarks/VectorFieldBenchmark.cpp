// Sampling a sparse field beside a dense grid of the same vectors with the same interpolation, at random positions and
// along scanlines, where 1 % and 100 % of each row was written. Both run in turn on the same positions; what counts are
// the ratios. "bytes" is the memory that the field or the grid holds.

#include "benchmarks/FieldGrids.h"

#include <benchmark/benchmark.h>

namespace ZarnMath::Benchmarks {
namespace {

template <typename Grid>
void Sample(benchmark::State& state, const std::vector<Position>& positions)
{
    const int size = static_cast<int>(state.range(0));
    Grid grid(size);
    Paint(grid, size, static_cast<int>(state.range(1)));
    std::size_t next = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(grid.Get(positions[next]));
        next = (next + 1) % positionCount;
    }
    state.counters["bytes"] = benchmark::Counter(static_cast<double>(grid.Bytes()), benchmark::Counter::kDefaults,
                                                 benchmark::Counter::OneK::kIs1024);
}

template <typename Grid>
void AtRandom(benchmark::State& state)
{
    Sample<Grid>(state, RandomPositions(static_cast<int>(state.range(0))));
}

template <typename Grid>
void AlongScanlines(benchmark::State& state)
{
    Sample<Grid>(state, ScanlinePositions(static_cast<int>(state.range(0))));
}

void Sizes(benchmark::internal::Benchmark* benchmark)
{
    benchmark->ArgNames({"size", "percent"});
    for (const int size : {256, 8192})
        for (const int percent : {1, 100})
            benchmark->Args({size, percent});
}

BENCHMARK_TEMPLATE(AtRandom, SparseField)->Apply(Sizes);
BENCHMARK_TEMPLATE(AtRandom, DenseGrid)->Apply(Sizes);
BENCHMARK_TEMPLATE(AlongScanlines, SparseField)->Apply(Sizes);
BENCHMARK_TEMPLATE(AlongScanlines, DenseGrid)->Apply(Sizes);

} // namespace
} // namespace ZarnMath::Benchmarks
