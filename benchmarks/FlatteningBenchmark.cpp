// Cubics as polylines, at equal parameter steps and as flat as asked for.

#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/Bounds.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

/// The largest number of segments of any walk here.
constexpr int mostLines = 2047;

template <typename P>
using Polyline = std::array<P, mostLines + 1>;

template <typename P>
void CalculateNumBezierLines(State& state)
{
    const auto calculate = [](const CubicOf<P>& curve) {
        return ZarnMath::CalculateNumBezierLines(curve.data(), mostLines);
    };
    MeasureWork(state, "segments", calculate, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(CalculateNumBezierLines, point2d);
BENCHMARK_TEMPLATE(CalculateNumBezierLines, POINT);

void CalculateNumBezierLinesOfBox(State& state)
{
    std::vector<RECT> boxes;
    for (const IntegerCubic& curve : SharedCorpus().integer.curves)
        boxes.push_back(GetPointsBBox(curve.data(), 4));
    const auto calculate = [](const RECT& box) { return ZarnMath::CalculateNumBezierLines(box, mostLines); };
    MeasureWork(state, "segments", calculate, boxes);
}

BENCHMARK(CalculateNumBezierLinesOfBox);

template <typename P>
void BezierToLines(State& state)
{
    Polyline<P> out;
    const auto lines = static_cast<int>(state.range(0));
    const auto flatten = [&out, lines](const CubicOf<P>& curve) {
        ZarnMath::BezierToLines(curve.data(), out.data(), lines);
        return lines;
    };
    MeasureWork(state, "segments", flatten, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(BezierToLines, point2d)->ArgName("lines")->Arg(8)->Arg(64);
BENCHMARK_TEMPLATE(BezierToLines, POINT)->ArgName("lines")->Arg(8)->Arg(64);

/// The argument is the distance from the curve that is asked for, in hundredths of a unit.
template <typename P>
void AdaptiveBezierToLines(State& state)
{
    Polyline<P> out;
    const double distance = 0.01 * static_cast<double>(state.range(0));
    const auto flatten = [&out, tolerance = distance * distance](const CubicOf<P>& curve) {
        return ZarnMath::AdaptiveBezierToLines(curve.data(), out.data(), tolerance, mostLines);
    };
    MeasureWork(state, "segments", flatten, SharedCorpus().In<P>().curves);
}

BENCHMARK_TEMPLATE(AdaptiveBezierToLines, point2d)->ArgName("hundredths")->Arg(100)->Arg(10)->Arg(1);
BENCHMARK_TEMPLATE(AdaptiveBezierToLines, POINT)->ArgName("hundredths")->Arg(100)->Arg(10)->Arg(1);

} // namespace
} // namespace ZarnMath::Benchmarks
