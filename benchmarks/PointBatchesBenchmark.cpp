// Transforms of point arrays, beside a copy of the same bytes and beside Eigen's affine product on the same points. What
// counts are the ratios within one run; at 10^7 points all of them wait for memory.
//
// The matrix is a turn about a point, so that coordinates stay where they are however often it is applied.

#include "ZarnMath/WMath.h"

#include <benchmark/benchmark.h>
#include <cstring>
#include <vector>

#ifdef ZARNMATH_BENCH_EIGEN
#include <Eigen/Geometry>
#endif

namespace ZarnMath {
namespace {

constexpr point2d centre{512.25, -300.5};

MATRIX Matrix()
{
    return ConstructRotateAroundMatrix(0.3, centre);
}

template <typename P>
std::vector<P> MakePoints(std::size_t count)
{
    using Coordinate = decltype(P::x);
    std::vector<P> points(count);
    for (std::size_t i = 0; i < count; ++i)
        points[i] = {static_cast<Coordinate>(i * 37 % 20011) - 10000, static_cast<Coordinate>(i * 91 % 30011) - 15000};
    return points;
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
    Run<P>(state, [m = Matrix()](P* points, std::size_t count) { m.TransformPoints(points, count); });
}

void TransformPointsWithRangeCheck(benchmark::State& state)
{
    Run<POINT>(state,
               [m = Matrix()](POINT* points, std::size_t count) { m.TransformPointsWithRangeCheck(points, count); });
}

void RotatePoints(benchmark::State& state)
{
    Run<POINT>(state, [](POINT* points, std::size_t count) { Radians::RotatePoints(points, count, 0.3, centre); });
}

template <typename P>
void Translate(benchmark::State& state)
{
    Run<P>(state, [](P* points, std::size_t count) { TranslatePoints(points, count, P{3, -2}); });
}

/// What the transforms do, written as one would at the place of the call.
void TransformOneByOne(benchmark::State& state)
{
    Run<POINT>(state, [m = Matrix()](POINT* points, std::size_t count) {
        for (std::size_t i = 0; i < count; ++i)
            points[i] = ToPOINT(m(ToPoint2d(points[i])));
    });
}

#ifdef ZARNMATH_BENCH_EIGEN

Eigen::Affine2d EigenMatrix()
{
    const MATRIX m = Matrix();
    Eigen::Affine2d affine;
    affine.matrix() << m.m11, m.m12, m.dx, m.m21, m.m22, m.dy, 0.0, 0.0, 1.0;
    return affine;
}

template <typename P>
using EigenPoints = Eigen::Map<Eigen::Matrix<decltype(P::x), 2, Eigen::Dynamic>>;

/// A product of fixed size, which Eigen evaluates column by column without a temporary.
void EigenTransform(benchmark::State& state)
{
    const Eigen::Affine2d affine = EigenMatrix();
    Run<point2d>(state, [&](point2d* points, std::size_t count) {
        EigenPoints<point2d> map(&points->x, 2, static_cast<Eigen::Index>(count));
        for (Eigen::Index i = 0; i < map.cols(); ++i)
            map.col(i) = affine * Eigen::Vector2d(map.col(i));
    });
}

/// The array as a whole, which goes through a temporary.
void EigenTransformWhole(benchmark::State& state)
{
    const Eigen::Affine2d affine = EigenMatrix();
    Run<point2d>(state, [&](point2d* points, std::size_t count) {
        EigenPoints<point2d> map(&points->x, 2, static_cast<Eigen::Index>(count));
        map = (affine.linear() * map).colwise() + affine.translation();
    });
}

/// Integers as doubles and back; Eigen truncates, which is less work than to round and to saturate.
void EigenTransformIntegers(benchmark::State& state)
{
    const Eigen::Affine2d affine = EigenMatrix();
    Run<POINT>(state, [&](POINT* points, std::size_t count) {
        EigenPoints<POINT> map(&points->x, 2, static_cast<Eigen::Index>(count));
        for (Eigen::Index i = 0; i < map.cols(); ++i)
            map.col(i) = (affine * Eigen::Vector2d(map.col(i).cast<double>())).cast<std::int32_t>();
    });
}

#endif

void Sizes(benchmark::internal::Benchmark* benchmark)
{
    benchmark->Arg(100)->Arg(10000)->Arg(10000000);
}

BENCHMARK_TEMPLATE(Copy, point2d)->Apply(Sizes);
BENCHMARK_TEMPLATE(TransformPoints, point2d)->Apply(Sizes);
BENCHMARK_TEMPLATE(Translate, point2d)->Apply(Sizes);
#ifdef ZARNMATH_BENCH_EIGEN
BENCHMARK(EigenTransform)->Apply(Sizes);
BENCHMARK(EigenTransformWhole)->Apply(Sizes);
#endif
BENCHMARK_TEMPLATE(Copy, POINT)->Apply(Sizes);
BENCHMARK_TEMPLATE(TransformPoints, POINT)->Apply(Sizes);
BENCHMARK(TransformPointsWithRangeCheck)->Apply(Sizes);
BENCHMARK(RotatePoints)->Apply(Sizes);
BENCHMARK_TEMPLATE(Translate, POINT)->Apply(Sizes);
BENCHMARK(TransformOneByOne)->Apply(Sizes);
#ifdef ZARNMATH_BENCH_EIGEN
BENCHMARK(EigenTransformIntegers)->Apply(Sizes);
#endif

} // namespace
} // namespace ZarnMath
