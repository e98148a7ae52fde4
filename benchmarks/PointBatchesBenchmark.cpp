// Transforms of point arrays, beside a copy of the same bytes and beside Eigen's affine product on the same points. What
// counts are the ratios within one run.

#include "benchmarks/PointBatches.h"
#include "benchmarks/WideKernels.h"

#include <benchmark/benchmark.h>
#include <cstring>

#ifdef ZARNMATH_BENCH_EIGEN
#include "benchmarks/EigenPoints.h"
#endif

namespace ZarnMath::Benchmarks {
namespace {

void Sizes(benchmark::internal::Benchmark* benchmark)
{
    benchmark->RangeMultiplier(10)->Range(100, 1000000);
}

/// Changes the same array again and again.
template <typename P, typename Change>
void Run(benchmark::State& state, Change change)
{
    auto points = MakePoints<P>(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        change(points.data(), points.size());
        benchmark::ClobberMemory();
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

template <typename P>
void Copy(benchmark::State& state)
{
    std::vector<P> target(static_cast<std::size_t>(state.range(0)));
    Run<P>(state, [&](P* points, std::size_t count) {
        std::memcpy(target.data(), points, count * sizeof(P));
        benchmark::DoNotOptimize(target.data());
    });
}

template <typename P>
void TransformPoints(benchmark::State& state)
{
    Run<P>(state, [m = TurnMatrix()](P* points, std::size_t count) { m.TransformPoints(points, count); });
}

void TransformPointsWithRangeCheck(benchmark::State& state)
{
    Run<POINT>(state, [m = TurnMatrix()](POINT* points, std::size_t count) {
        m.TransformPointsWithRangeCheck(points, count);
    });
}

void RotatePoints(benchmark::State& state)
{
    Run<POINT>(state, [](POINT* points, std::size_t count) { Radians::RotatePoints(points, count, 0.3, turnCentre); });
}

template <typename P>
void Translate(benchmark::State& state)
{
    Run<P>(state, [](P* points, std::size_t count) { TranslatePoints(points, count, P{3, -2}); });
}

/// What the transforms do, written as one would at the place of the call.
void TransformOneByOne(benchmark::State& state)
{
    Run<POINT>(state, [m = TurnMatrix()](POINT* points, std::size_t count) {
        for (std::size_t i = 0; i < count; ++i)
            points[i] = ToPOINT(m(ToPoint2d(points[i])));
    });
}

#if defined(__x86_64__)

template <typename P>
void TransformByHand(benchmark::State& state)
{
    if (HasWideKernels())
        Run<P>(state,
               [m = TurnMatrix()](P* points, std::size_t count) { Benchmarks::TransformByHand(m, points, count); });
    else
        state.SkipWithError("the processor has no registers of four doubles");
}

BENCHMARK_TEMPLATE(TransformByHand, point2d)->Apply(Sizes);
BENCHMARK_TEMPLATE(TransformByHand, POINT)->Apply(Sizes);

#endif

#ifdef ZARNMATH_BENCH_EIGEN

template <typename P>
void EigenTransform(benchmark::State& state)
{
    Run<P>(state,
           [affine = ToEigen(TurnMatrix())](P* points, std::size_t count) { TransformByEigen(affine, points, count); });
}

/// The array as a whole, which goes through a temporary.
void EigenTransformWhole(benchmark::State& state)
{
    Run<point2d>(state, [affine = ToEigen(TurnMatrix())](point2d* points, std::size_t count) {
        auto map = ToEigen(points, count);
        map = (affine.linear() * map).colwise() + affine.translation();
    });
}

#endif

BENCHMARK_TEMPLATE(Copy, point2d)->Apply(Sizes);
BENCHMARK_TEMPLATE(TransformPoints, point2d)->Apply(Sizes);
BENCHMARK_TEMPLATE(Translate, point2d)->Apply(Sizes);
#ifdef ZARNMATH_BENCH_EIGEN
BENCHMARK_TEMPLATE(EigenTransform, point2d)->Apply(Sizes);
BENCHMARK(EigenTransformWhole)->Apply(Sizes);
#endif
BENCHMARK_TEMPLATE(Copy, POINT)->Apply(Sizes);
BENCHMARK_TEMPLATE(TransformPoints, POINT)->Apply(Sizes);
BENCHMARK(TransformPointsWithRangeCheck)->Apply(Sizes);
BENCHMARK(RotatePoints)->Apply(Sizes);
BENCHMARK_TEMPLATE(Translate, POINT)->Apply(Sizes);
BENCHMARK(TransformOneByOne)->Apply(Sizes);
#ifdef ZARNMATH_BENCH_EIGEN
BENCHMARK_TEMPLATE(EigenTransform, POINT)->Apply(Sizes);
#endif

} // namespace
} // namespace ZarnMath::Benchmarks
