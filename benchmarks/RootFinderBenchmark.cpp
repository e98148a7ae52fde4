// The root finder on polynomials made from random Bernstein coefficients in [-1, 1], beside its plain form and beside a
// peer's Bernstein root finder on the same polynomials. The three run in turn on the same corpus; what counts are their
// ratios. "roots" is the mean number of roots that each of them finds.

#include "ZarnMath/RootFinder.h"
#include "benchmarks/Measure.h"
#include "benchmarks/RandomPolynomials.h"

#include <array>
#include <vector>

#ifdef ZARNMATH_BENCH_LIB2GEOM
#include <2geom/bezier.h>
#endif

namespace ZarnMath::Benchmarks {
namespace {

template <int N, int (*Find)(const double*, double*, bool)>
void RunOnCoefficients(benchmark::State& state)
{
    std::vector<std::array<double, N + 1>> polynomials;
    for (const auto& polygon : RandomPolygons<N>())
        polynomials.push_back(ToFallingPowers<N>(polygon));
    const auto find = [](const std::array<double, N + 1>& c) {
        double roots[N + 1];
        const int count = Find(c.data(), roots, false);
        benchmark::DoNotOptimize(roots);
        return count;
    };
    MeasureWork(state, "roots", find, polynomials);
}

template <int N>
int FindFast(const double* c, double* roots, bool includeEndpoints)
{
    return RootFinder::FindRoots<N>(c, roots, includeEndpoints);
}

template <int N>
void FindRoots(benchmark::State& state)
{
    RunOnCoefficients<N, FindFast<N>>(state);
}

template <int N>
void FindRootsPlainForm(benchmark::State& state)
{
    RunOnCoefficients<N, Literal::FindRoots<N>>(state);
}

BENCHMARK_TEMPLATE(FindRoots, 3);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 3);
BENCHMARK_TEMPLATE(FindRoots, 4);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 4);
BENCHMARK_TEMPLATE(FindRoots, 5);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 5);
BENCHMARK_TEMPLATE(FindRoots, 9);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 9);
BENCHMARK_TEMPLATE(FindRoots, 11);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 11);
BENCHMARK_TEMPLATE(FindRoots, 12);
BENCHMARK_TEMPLATE(FindRootsPlainForm, 12);

#ifdef ZARNMATH_BENCH_LIB2GEOM

/// The peer takes the Bernstein coefficients themselves, and so saves the conversion that `FindRoots` begins with.
template <int N>
void Lib2geomBezierRoots(benchmark::State& state)
{
    std::vector<Geom::Bezier> polynomials;
    for (const auto& polygon : RandomPolygons<N>())
        polynomials.emplace_back(std::vector<double>(polygon.begin(), polygon.end()));
    const auto find = [](const Geom::Bezier& polynomial) { return std::ssize(polynomial.roots()); };
    MeasureWork(state, "roots", find, polynomials);
}

BENCHMARK_TEMPLATE(Lib2geomBezierRoots, 3);
BENCHMARK_TEMPLATE(Lib2geomBezierRoots, 5);
BENCHMARK_TEMPLATE(Lib2geomBezierRoots, 9);
BENCHMARK_TEMPLATE(Lib2geomBezierRoots, 12);

#endif

} // namespace
} // namespace ZarnMath::Benchmarks
