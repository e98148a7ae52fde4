// Fits to 100 to 1,000,000 points, in as many passes as the name says. The points lie along an arch 300 units wide, at random
// parameters in order, moved by up to a unit in each coordinate, and the tangents are those of the arch. "point" is the
// time of one point; "largest" and "rms" are the true distances of the points from the curve, by a search without the
// library, of at most 2000 of them.
//
// Beside them, where it is installed, lib2geom's fit of one cubic to the same points. The question is not quite the same. Its
// `bezier_fit_cubic` takes the tangents from the points; `bezier_fit_cubic_full` is told them, as ours is. Both stop at a
// tolerance, or at once where the first curve is off by more than three times as much; in between they make up to four
// more passes of one Newton step for each point. The tolerance is half of what the first curve is off by, so that these are
// made. Ours makes its passes with a search for the closest point, keeps the best, and watches that the curve stays in the
// box of the points. Theirs copies the points first to leave out coincident ones.

#include "ZarnMath/FitBezier.h"
#include "benchmarks/Measure.h"
#include "tests/FitBezier/Runs.h"

#include <algorithm>

#ifdef ZARNMATH_BENCH_LIB2GEOM
#include <2geom/bezier-utils.h>
#endif

namespace ZarnMath {
namespace {

using benchmark::State;

constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
constexpr vector2d archStart{0.31622776601683794, 0.9486832980505138};
constexpr vector2d archEnd{0.31622776601683794, -0.9486832980505138};

const PointRun& NoisyArch(std::int64_t n)
{
    static PointRun run;
    if (std::ssize(run.points) != n) {
        RandomSource random(static_cast<std::uint64_t>(n));
        run = NoisyRun(random, arch, static_cast<std::size_t>(n), 1.0);
        run.points.front() = arch.front();
        run.points.back() = arch.back();
    }
    return run;
}

/// The distance of a point from a curve: the best of 1024 samples, and on by Newton's method.
double TrueDistance(const Cubic& curve, const point2d& p)
{
    constexpr int samples = 1024;
    double best = largestDouble;
    double t = 0.0;
    for (int i = 0; i <= samples; ++i)
        if (const double d = LengthSquared(p - BernsteinPoint(curve.data(), i / double{samples})); d < best) {
            best = d;
            t = i / double{samples};
        }
    const CubicBezier::PowerForm f = CubicBezier::ToPowerForm(curve.data());
    for (int i = 0; i < 4; ++i) {
        const vector2d speed = CubicBezier::Derivative(f.a, f.b, f.c, t);
        const vector2d bend{6.0 * f.a.x * t + 2.0 * f.b.x, 6.0 * f.a.y * t + 2.0 * f.b.y};
        const vector2d away = BernsteinPoint(curve.data(), t) - p;
        t = std::clamp(t - Dot(away, speed) / (Dot(speed, speed) + Dot(away, bend)), 0.0, 1.0);
        best = std::min(best, LengthSquared(p - BernsteinPoint(curve.data(), t)));
    }
    return std::sqrt(best);
}

void ShowTimeOfAPoint(State& state)
{
    const auto points = static_cast<double>(state.iterations() * state.range(0));
    state.counters["point"] = benchmark::Counter(points, benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

/// @param nearest gives the distance of a point from what was fitted
template <typename Nearest>
void ShowErrors(State& state, const PointRun& run, Nearest nearest)
{
    const std::size_t step = std::max<std::size_t>(1, run.points.size() / 2000);
    double largest = 0.0;
    double squares = 0.0;
    double count = 0.0;
    for (std::size_t i = 0; i < run.points.size(); i += step) {
        const double distance = nearest(run.points[i]);
        largest = std::max(largest, distance);
        squares += distance * distance;
        ++count;
    }
    state.counters["largest"] = largest;
    state.counters["rms"] = std::sqrt(squares / count);
}

void ShowErrors(State& state, const PointRun& run, const Cubic& curve)
{
    ShowErrors(state, run, [&](const point2d& p) { return TrueDistance(curve, p); });
}

/// Times fit(run, parameters), to which the parameters of the points are new each time.
template <typename Fit>
void MeasureFit(State& state, const PointRun& run, Fit fit)
{
    std::vector<double> u;
    const auto call = [&] {
        u = run.u;
        benchmark::DoNotOptimize(fit(run.points.data(), u.data(), run.Count()));
    };
    for (auto _ : state)
        call();
    ShowTimeOfAPoint(state);
    if (Benchmarks::CountSteps != nullptr)
        Benchmarks::CountSteps(state, 1, call);
}

void ChordLengths(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    std::vector<double> u;
    for (auto _ : state) {
        Calculate_u(run.points.data(), run.Count(), u);
        benchmark::DoNotOptimize(u.data());
    }
    ShowTimeOfAPoint(state);
}

template <int passes>
void TangentFitOfParameters(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    Cubic curve{};
    MeasureFit(state, run, [&](const point2d* points, double* u, int n) {
        return LeastSquares(points, u, n, archStart, archEnd, curve.data(), passes, nullptr, -1.0);
    });
    ShowErrors(state, run, curve);
}

template <int passes>
void TangentFit(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    Cubic curve{};
    MeasureFit(state, run, [&](const point2d* points, double*, int n) {
        return LeastSquares(points, n, archStart, archEnd, curve.data(), passes);
    });
    ShowErrors(state, run, curve);
}

template <int passes>
void FreeFitOfParameters(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    Cubic curve{};
    MeasureFit(state, run, [&](const point2d* points, double* u, int n) {
        return LeastSquares(points, u, n, curve.data(), passes, nullptr);
    });
    ShowErrors(state, run, curve);
}

template <int passes>
void FreeFit(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    Cubic curve{};
    MeasureFit(state, run,
               [&](const point2d* points, double*, int n) { return LeastSquares(points, n, curve.data(), passes); });
    ShowErrors(state, run, curve);
}

template <bool fromParameters, int passes>
void FitJointly(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    Cubic a{};
    Cubic b{};
    MeasureFit(state, run, [&](const point2d* points, double* u, int n) {
        return fromParameters ? LeastSquares(points, u, n, n / 2, archStart, archEnd, a.data(), b.data(), passes)
                              : LeastSquares(points, n, n / 2, archStart, archEnd, a.data(), b.data(), passes);
    });
    ShowErrors(state, run, [&](const point2d& p) { return std::min(TrueDistance(a, p), TrueDistance(b, p)); });
}

template <int passes>
void JointFit(State& state)
{
    FitJointly<false, passes>(state);
}

template <int passes>
void JointFitOfParameters(State& state)
{
    FitJointly<true, passes>(state);
}

void ParabolaFit(State& state)
{
    const PointRun& run = NoisyArch(state.range(0));
    std::vector<double> coefficients;
    MeasureFit(state, run, [&](const point2d* points, double*, int n) {
        coefficients.clear();
        return LeastSquares(points, static_cast<unsigned long>(n), coefficients);
    });
    ShowErrors(state, run, [&](const point2d& p) { // the arch is a parabola; along y, as it is fitted
        return std::fabs(coefficients[0] + (coefficients[1] + coefficients[2] * p.x) * p.x - p.y);
    });
}

#ifdef ZARNMATH_BENCH_LIB2GEOM
/// @param fit takes the square of a tolerance
template <typename Fit>
void MeasurePeer(State& state, Fit fit)
{
    const PointRun& run = NoisyArch(state.range(0));
    std::vector<Geom::Point> points;
    for (const point2d& p : run.points)
        points.emplace_back(p.x, p.y);
    Geom::Point bezier[4];
    const auto largest = [&] {
        const Cubic curve{{{bezier[0].x(), bezier[0].y()},
                           {bezier[1].x(), bezier[1].y()},
                           {bezier[2].x(), bezier[2].y()},
                           {bezier[3].x(), bezier[3].y()}}};
        ShowErrors(state, run, curve);
        return state.counters["largest"].value;
    };
    fit(bezier, points.data(), run.Count(), 0.0);
    const double tolerance = 0.5 * largest();
    for (auto _ : state)
        benchmark::DoNotOptimize(fit(bezier, points.data(), run.Count(), tolerance * tolerance));
    ShowTimeOfAPoint(state);
    largest();
}

void Lib2geomFit(State& state)
{
    MeasurePeer(state, [](Geom::Point* bezier, const Geom::Point* points, int n, double tolerance) {
        return Geom::bezier_fit_cubic(bezier, points, n, tolerance);
    });
}

void Lib2geomTangentFit(State& state)
{
    MeasurePeer(state, [](Geom::Point* bezier, const Geom::Point* points, int n, double tolerance) {
        const Geom::Point start(archStart.x, archStart.y);
        const Geom::Point back(-archEnd.x, -archEnd.y);
        return Geom::bezier_fit_cubic_full(bezier, nullptr, points, n, start, back, tolerance, 1);
    });
}
#endif

void Sizes(benchmark::internal::Benchmark* benchmark)
{
    benchmark->RangeMultiplier(10)->Range(100, 1000000);
}

BENCHMARK(ChordLengths)->Apply(Sizes);
BENCHMARK_TEMPLATE(TangentFit, 1)->Apply(Sizes);
BENCHMARK_TEMPLATE(TangentFit, 4)->Apply(Sizes);
#ifdef ZARNMATH_BENCH_LIB2GEOM
BENCHMARK(Lib2geomTangentFit)->Apply(Sizes);
BENCHMARK(Lib2geomFit)->Apply(Sizes);
#endif
BENCHMARK_TEMPLATE(FreeFit, 1)->Apply(Sizes);
BENCHMARK_TEMPLATE(FreeFit, 4)->Apply(Sizes);
BENCHMARK_TEMPLATE(TangentFitOfParameters, 4)->Apply(Sizes);
BENCHMARK_TEMPLATE(FreeFitOfParameters, 4)->Apply(Sizes);
BENCHMARK_TEMPLATE(JointFit, 1)->Apply(Sizes);
BENCHMARK_TEMPLATE(JointFit, 4)->Apply(Sizes);
BENCHMARK_TEMPLATE(JointFitOfParameters, 4)->Apply(Sizes);
BENCHMARK(ParabolaFit)->Apply(Sizes);

} // namespace
} // namespace ZarnMath
