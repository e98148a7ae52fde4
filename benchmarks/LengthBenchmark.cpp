// Arc length, whole and in part, and its inverse. The argument is the number of samples of the speed.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

void AtEachAccuracy(benchmark::internal::Benchmark* registered)
{
    registered->ArgName("samples")->Arg(2)->Arg(4)->Arg(8)->Arg(10)->Arg(16);
}

LengthAccuracy AccuracyOf(const State& state)
{
    return static_cast<LengthAccuracy>(state.range(0));
}

void LengthOfStretch(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto length = [order = static_cast<int>(state.range(0))](const PowerForm& f, double t0, double t1) {
        return CubicBezier::Length(f.a, f.b, f.c, order, t0, t1);
    };
    Measure(state, length, corpus.forms, corpus.parameters, corpus.laterParameters);
}

BENCHMARK(LengthOfStretch)->Apply(AtEachAccuracy);

void LengthOfPowerForm(State& state)
{
    const auto length = [accuracy = AccuracyOf(state)](const PowerForm& f) {
        return CubicBezier::Length(f.a, f.b, f.c, accuracy);
    };
    Measure(state, length, SharedCorpus().forms);
}

BENCHMARK(LengthOfPowerForm)->Apply(AtEachAccuracy);

void LengthOfControlPoints(State& state)
{
    const auto length = [accuracy = AccuracyOf(state)](const Cubic& curve) {
        return CubicBezier::Length(curve.data(), accuracy);
    };
    Measure(state, length, SharedCorpus().real.curves);
}

BENCHMARK(LengthOfControlPoints)->Apply(AtEachAccuracy);

/// The length of the part before a parameter, or after it.
template <typename P, double (*length)(double, const P*) noexcept>
void LengthOfPart(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto call = [](double t, const CubicOf<P>& curve) { return length(t, curve.data()); };
    Measure(state, call, corpus.parameters, corpus.In<P>().curves);
}

BENCHMARK_TEMPLATE(LengthOfPart, point2d, CubicBezier::LengthTo);
BENCHMARK_TEMPLATE(LengthOfPart, POINT, CubicBezier::LengthTo);
BENCHMARK_TEMPLATE(LengthOfPart, point2d, CubicBezier::LengthFrom);
BENCHMARK_TEMPLATE(LengthOfPart, POINT, CubicBezier::LengthFrom);

/// To a hundredth of a unit. Each pass of the search takes the length from 0 anew.
void GetCurveRelativeLengthParameter(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto find = [accuracy = AccuracyOf(state)](double fraction, const PowerForm& f) {
        return CubicBezier::GetCurveRelativeLengthParameter(fraction, f.a, f.b, f.c, 0.01, accuracy);
    };
    Measure(state, find, corpus.parameters, corpus.forms);
}

BENCHMARK(GetCurveRelativeLengthParameter)->Apply(AtEachAccuracy);

} // namespace
} // namespace ZarnMath::Benchmarks
