// Lines fitted to points, straight segments, and mirrored points.

#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

/// Of four points, as of a curve; of many, they are in the program on growth.
void ForRuns(benchmark::internal::Benchmark* registered)
{
    registered->ArgName("points")->Arg(4);
}

struct FittedLine
{
    point2d point;
    vector2d direction;
};

void GetLeastSquaresLines(State& state)
{
    const auto fit = [](const point2d* points, std::size_t count) {
        FittedLine line;
        ZarnMath::GetLeastSquaresLines(points, static_cast<int>(count), line.point, line.direction);
        return line;
    };
    MeasureRuns(state, fit, SharedCorpus().real.points);
}

BENCHMARK(GetLeastSquaresLines)->Apply(ForRuns);

/// A curve with the sums that the fit of a line to its control points begins with.
struct SummedCurve
{
    Cubic curve;
    double x = 0.0;
    double y = 0.0;
    double xy = 0.0;
    double xx = 0.0;
    double yy = 0.0;

    explicit SummedCurve(const Cubic& points) : curve(points)
    {
        for (const point2d& p : points) {
            x += p.x;
            y += p.y;
            xy += p.x * p.y;
            xx += p.x * p.x;
            yy += p.y * p.y;
        }
    }
};

void GetLeastSquaresLinesOfSums(State& state)
{
    const std::vector<Cubic>& curves = SharedCorpus().real.curves;
    const std::vector<SummedCurve> summed(curves.begin(), curves.end());
    const auto fit = [](const SummedCurve& s) {
        FittedLine line;
        ZarnMath::GetLeastSquaresLines(s.x, s.y, s.xy, s.xx, s.yy, s.curve.data(), 4, line.point, line.direction);
        return line;
    };
    Measure(state, fit, summed);
}

BENCHMARK(GetLeastSquaresLinesOfSums);

template <typename P>
void AreCollinear(State& state)
{
    const auto test = [](const CubicOf<P>& curve) { return ZarnMath::AreCollinear(curve.data(), curve.size(), 4.0); };
    MeasureWork(state, "collinear", test, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(AreCollinear, point2d);
BENCHMARK_TEMPLATE(AreCollinear, POINT);

void DistanceToLineSegmentSqrd(State& state)
{
    const Drawing<point2d>& drawing = SharedCorpus().real;
    const auto measure = [](const Line& line, const point2d& p) {
        return ZarnMath::DistanceToLineSegmentSqrd(line[0], line[1], p);
    };
    Measure(state, measure, drawing.lines, drawing.points);
}

BENCHMARK(DistanceToLineSegmentSqrd);

void DoesFatlineIntersectLine(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto test = [](const Cubic& curve, const Line& line, double width) {
        return ZarnMath::DoesFatlineIntersectLine(curve[0], curve[3], line[0], line[1], width * 0.1);
    };
    MeasureWork(state, "touching", test, corpus.real.curves, corpus.real.lines, corpus.distances);
}

BENCHMARK(DoesFatlineIntersectLine);

/// Of one line again and again: the points go to and fro.
void ReflectAcross(State& state)
{
    std::vector<POINT> points = SharedCorpus().integer.points;
    points.resize(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        ZarnMath::ReflectAcross({300, 400}, {10, 20}, points.data(), points.size());
        benchmark::ClobberMemory();
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

BENCHMARK(ReflectAcross)->Apply(ForRuns);

} // namespace
} // namespace ZarnMath::Benchmarks
