// Rectangles and bounds. Most of these functions take a few instructions: what is measured is the call.

#include "ZarnMath/Bounds.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

/// Of four points, as of a curve; of many, they are in the program on growth.
void ForRuns(benchmark::internal::Benchmark* registered)
{
    registered->ArgName("points")->Arg(4);
}

/// The boxes of the control points.
template <typename P>
auto BoxesOf(const std::vector<CubicOf<P>>& curves)
{
    std::vector<decltype(ZarnMath::GetPointsBBox(curves[0].data(), 4))> boxes;
    for (const CubicOf<P>& curve : curves)
        boxes.push_back(ZarnMath::GetPointsBBox(curve.data(), 4));
    return boxes;
}

std::vector<RECT> Rectangles()
{
    return BoxesOf<POINT>(SharedCorpus().integer.curves);
}

std::vector<RECT> OtherRectangles()
{
    return BoxesOf<POINT>(SharedCorpus().integer.others);
}

void GetEmptyRect(State& state)
{
    Measure(state, ZarnMath::GetEmptyRect);
}

BENCHMARK(GetEmptyRect);

template <typename Box>
void InitializeEmpty(State& state)
{
    const auto make = [] {
        Box box;
        ZarnMath::InitializeEmpty(box);
        return box;
    };
    Measure(state, make);
}

BENCHMARK_TEMPLATE(InitializeEmpty, RECT);
BENCHMARK_TEMPLATE(InitializeEmpty, BoundsT<double>);

/// Of rectangles with any two opposite corners.
void NormalizeRect(State& state)
{
    const auto normalize = [](const POINT& corner, const LineOf<POINT>& line) {
        RECT rect{corner.x, corner.y, line[0].x, line[0].y};
        ZarnMath::NormalizeRect(rect);
        return rect;
    };
    const Drawing<POINT>& drawing = SharedCorpus().integer;
    Measure(state, normalize, drawing.points, drawing.lines);
}

BENCHMARK(NormalizeRect);

template <typename P>
void GetPointsBBox(State& state)
{
    const auto bound = [](const P* points, std::size_t count) {
        return ZarnMath::GetPointsBBox(points, static_cast<int>(count));
    };
    MeasureRuns(state, bound, SharedCorpus().In<P>().points);
}

BENCHMARK_TEMPLATE(GetPointsBBox, point2d)->Apply(ForRuns);
BENCHMARK_TEMPLATE(GetPointsBBox, POINT)->Apply(ForRuns);

void GetPointsBBoxInPlace(State& state)
{
    const auto bound = [](const POINT* points, std::size_t count) {
        RECT box;
        ZarnMath::GetPointsBBox(points, static_cast<int>(count), box);
        return box;
    };
    MeasureRuns(state, bound, SharedCorpus().integer.points);
}

BENCHMARK(GetPointsBBoxInPlace)->Apply(ForRuns);

template <typename P>
void UnionPointWithRect(State& state)
{
    const auto widen = [](RECT rect, const P& p) {
        ZarnMath::UnionPointWithRect(rect, p);
        return rect;
    };
    Measure(state, widen, Rectangles(), SharedCorpus().In<P>().points);
}

BENCHMARK_TEMPLATE(UnionPointWithRect, point2d);
BENCHMARK_TEMPLATE(UnionPointWithRect, POINT);

void UnionPointsWithRect(State& state)
{
    const auto widen = [](const POINT* points, std::size_t count) {
        RECT rect = ZarnMath::GetEmptyRect();
        ZarnMath::UnionPointsWithRect(rect, points, static_cast<int>(count));
        return rect;
    };
    MeasureRuns(state, widen, SharedCorpus().integer.points);
}

BENCHMARK(UnionPointsWithRect)->Apply(ForRuns);

template <bool (*combine)(RECT&, const RECT&) noexcept>
void CombineRects(State& state)
{
    const auto call = [](RECT a, const RECT& b) { return combine(a, b); };
    MeasureWork(state, "non-empty", call, Rectangles(), OtherRectangles());
}

BENCHMARK_TEMPLATE(CombineRects, UnionRect);
BENCHMARK_TEMPLATE(CombineRects, IntersectRect);

template <void (*move)(RECT&, int, int) noexcept>
void MoveRect(State& state)
{
    const auto call = [](RECT rect, const POINT& by) {
        move(rect, by.x, by.y);
        return rect;
    };
    Measure(state, call, Rectangles(), SharedCorpus().integer.points);
}

BENCHMARK_TEMPLATE(MoveRect, TranslateRect);
BENCHMARK_TEMPLATE(MoveRect, TranslateValidRect);
BENCHMARK_TEMPLATE(MoveRect, InflateRect);

template <typename P>
void GetRectCorners(State& state)
{
    const auto list = [](const auto& box) {
        std::array<P, 4> corners;
        ZarnMath::GetRectCorners(box, corners.data());
        return corners;
    };
    Measure(state, list, BoxesOf<P>(SharedCorpus().In<P>().curves));
}

BENCHMARK_TEMPLATE(GetRectCorners, point2d);
BENCHMARK_TEMPLATE(GetRectCorners, POINT);

void GetRectCenter(State& state)
{
    Measure(state, ZarnMath::GetRectCenter, Rectangles());
}

BENCHMARK(GetRectCenter);

void GetRectArea(State& state)
{
    Measure(state, ZarnMath::GetRectArea, Rectangles());
}

BENCHMARK(GetRectArea);

template <typename P>
void IsPointInRect(State& state)
{
    const auto test = [](const P& p, const RECT& rect) { return ZarnMath::IsPointInRect(p, rect); };
    MeasureWork(state, "inside", test, SharedCorpus().In<P>().points, Rectangles());
}

BENCHMARK_TEMPLATE(IsPointInRect, point2d);
BENCHMARK_TEMPLATE(IsPointInRect, POINT);

/// In a rectangle that none of them lies in, so that all are looked at.
void IsAnyPointInRect(State& state)
{
    const auto test = [](const POINT* points, std::size_t count) {
        return ZarnMath::IsAnyPointInRect(points, count, RECT{5000, 5000, 6000, -5000});
    };
    MeasureRuns(state, test, SharedCorpus().integer.points);
}

BENCHMARK(IsAnyPointInRect)->Apply(ForRuns);

void GetPointRect(State& state)
{
    const auto surround = [](const POINT& p) { return ZarnMath::GetPointRect(p, 5); };
    Measure(state, surround, SharedCorpus().integer.points);
}

BENCHMARK(GetPointRect);

void GetPointRectOfTwoExtents(State& state)
{
    const auto surround = [](const POINT& p) { return ZarnMath::GetPointRect(p, 5, 7); };
    Measure(state, surround, SharedCorpus().integer.points);
}

BENCHMARK(GetPointRectOfTwoExtents);

void IdentityBounds(State& state)
{
    Measure(state, ZarnMath::IdentityBounds);
}

BENCHMARK(IdentityBounds);

} // namespace
} // namespace ZarnMath::Benchmarks
