// Cutting a cubic at a parameter, at one half, and at two parameters.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

template <typename P>
void SplitAt(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto split = [](double t, const CubicOf<P>& curve) {
        std::array<CubicOf<P>, 2> pieces;
        CubicBezier::Split(t, curve.data(), pieces[0].data(), pieces[1].data());
        return pieces;
    };
    Measure(state, split, corpus.parameters, corpus.In<P>().curves);
}

BENCHMARK_TEMPLATE(SplitAt, point2d);
BENCHMARK_TEMPLATE(SplitAt, POINT);

template <typename P>
void SplitAtHalf(State& state)
{
    const auto split = [](const CubicOf<P>& curve) {
        std::array<CubicOf<P>, 2> pieces;
        CubicBezier::Split(curve.data(), pieces[0].data(), pieces[1].data());
        return pieces;
    };
    Measure(state, split, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(SplitAtHalf, point2d);
BENCHMARK_TEMPLATE(SplitAtHalf, POINT);

/// One cut, into one array of points.
template <typename P, std::size_t points, void (*cut)(double, const P*, P*) noexcept>
void CutAt(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto call = [](double t, const CubicOf<P>& curve) {
        std::array<P, points> out;
        cut(t, curve.data(), out.data());
        return out;
    };
    Measure(state, call, corpus.parameters, corpus.In<P>().curves);
}

BENCHMARK_TEMPLATE(CutAt, point2d, 7, CubicBezier::Split);
BENCHMARK_TEMPLATE(CutAt, POINT, 7, CubicBezier::Split);
BENCHMARK_TEMPLATE(CutAt, point2d, 4, CubicBezier::LeftOf);
BENCHMARK_TEMPLATE(CutAt, POINT, 4, CubicBezier::LeftOf);
BENCHMARK_TEMPLATE(CutAt, point2d, 4, CubicBezier::RightOf);
BENCHMARK_TEMPLATE(CutAt, POINT, 4, CubicBezier::RightOf);

/// Two cuts, into one array of points.
template <typename P, std::size_t points, void (*cut)(double, double, const P*, P*) noexcept>
void CutAtTwo(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto call = [](double t0, double t1, const CubicOf<P>& curve) {
        std::array<P, points> out;
        cut(t0, t1, curve.data(), out.data());
        return out;
    };
    Measure(state, call, corpus.parameters, corpus.laterParameters, corpus.In<P>().curves);
}

BENCHMARK_TEMPLATE(CutAtTwo, point2d, 10, CubicBezier::Split);
BENCHMARK_TEMPLATE(CutAtTwo, POINT, 10, CubicBezier::Split);
BENCHMARK_TEMPLATE(CutAtTwo, point2d, 4, CubicBezier::Subsection);
BENCHMARK_TEMPLATE(CutAtTwo, POINT, 4, CubicBezier::Subsection);

} // namespace
} // namespace ZarnMath::Benchmarks
