// Tridiagonal solves of 10 to 1,000,000 rows, beside LAPACK's dgtsv where it is installed. Both solve the same diagonally
// dominant systems. dgtsv pivots, and overwrites its four arrays: filling them again is part of its time, as allocating the
// result is part of ours. For points it gets both coordinates as two right-hand sides. The time is that of one row.

#include "ZarnMath/TridiagonalMatrix.h"

#include <benchmark/benchmark.h>
#include <cmath>
#include <random>
#include <vector>

#ifdef ZARNMATH_BENCH_LAPACK
// Fortran: everything by address.
extern "C" void dgtsv_(const int* n, const int* rightSides, double* below, double* diagonal, double* above, double* b,
                       const int* stride, int* info);
#endif

namespace ZarnMath {
namespace {

struct System
{
    std::vector<double> below;
    std::vector<double> diagonal;
    std::vector<double> above;
    std::vector<double> rhs;
    std::vector<point2d> points;
    TridiagonalMatrix matrix;
};

System RandomSystem(std::int64_t n)
{
    std::mt19937 engine(3);
    std::uniform_real_distribution<double> number(-1.0, 1.0);
    System system;
    for (std::int64_t i = 0; i < n; ++i) {
        const double a = number(engine);
        const double c = number(engine);
        const double b = 0.5 + std::fabs(a) + std::fabs(c);
        system.matrix.AddRow(a, b, c);
        system.diagonal.push_back(b);
        if (i > 0)
            system.below.push_back(a);
        if (i + 1 < n)
            system.above.push_back(c);
        system.rhs.push_back(number(engine));
        system.points.push_back({number(engine), number(engine)});
    }
    return system;
}

void ShowTimeOfARow(benchmark::State& state)
{
    const auto rows = static_cast<double>(state.iterations() * state.range(0));
    state.counters["row"] = benchmark::Counter(rows, benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

void SolveNumbers(benchmark::State& state, bool cyclic)
{
    const System system = RandomSystem(state.range(0));
    for (auto _ : state)
        benchmark::DoNotOptimize(system.matrix.Solve(system.rhs, cyclic));
    ShowTimeOfARow(state);
}

void SolvePoints(benchmark::State& state, bool cyclic)
{
    const System system = RandomSystem(state.range(0));
    for (auto _ : state)
        benchmark::DoNotOptimize(system.matrix.Solve(system.points, cyclic));
    ShowTimeOfARow(state);
}

#ifdef ZARNMATH_BENCH_LAPACK
void SolveByLapack(benchmark::State& state, int rightSides)
{
    const System system = RandomSystem(state.range(0));
    const int n = static_cast<int>(state.range(0));
    std::vector<double> b;
    std::vector<double> below;
    std::vector<double> diagonal;
    std::vector<double> above;
    std::vector<double> sides;
    for (int i = 0; i < rightSides; ++i)
        sides.insert(sides.end(), system.rhs.begin(), system.rhs.end());
    for (auto _ : state) {
        below = system.below;
        diagonal = system.diagonal;
        above = system.above;
        b = sides;
        int info = 0;
        dgtsv_(&n, &rightSides, below.data(), diagonal.data(), above.data(), b.data(), &n, &info);
        benchmark::DoNotOptimize(b.data());
    }
    ShowTimeOfARow(state);
}

BENCHMARK_CAPTURE(SolveByLapack, numbers, 1)->RangeMultiplier(10)->Range(10, 1000000);
BENCHMARK_CAPTURE(SolveByLapack, points, 2)->RangeMultiplier(10)->Range(10, 1000000);
#endif

BENCHMARK_CAPTURE(SolveNumbers, plain, false)->RangeMultiplier(10)->Range(10, 1000000);
BENCHMARK_CAPTURE(SolvePoints, plain, false)->RangeMultiplier(10)->Range(10, 1000000);
BENCHMARK_CAPTURE(SolveNumbers, cyclic, true)->RangeMultiplier(10)->Range(10, 1000000);
BENCHMARK_CAPTURE(SolvePoints, cyclic, true)->RangeMultiplier(10)->Range(10, 1000000);

} // namespace
} // namespace ZarnMath
