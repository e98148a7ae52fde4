#include "ZarnMath/BezierToLinesInternal.h"

#include "ZarnMath/Bezier/Pair.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include <algorithm>

namespace ZarnMath {

namespace {

using CubicBezier::PowerForm;
using CubicBezier::ToPowerForm;

/// The shares of the budget by size: large curves take all of it.
int ShareOfBudget(double width, double height, int maxLines) noexcept
{
    const double size = std::max(std::fabs(height), width);
    if (size > 649.0)
        return maxLines;
    if (size >= 160.0)
        return maxLines / 2;
    if (size >= 30.0)
        return maxLines / 4;
    return maxLines / 8;
}

/// floor(log2(n)), and -1 for n < 1.
int FloorLog2(int n) noexcept
{
    int halvings = -1;
    for (; n > 0; n >>= 1)
        ++halvings;
    return halvings;
}

/// The lengths of the control polygon along each axis; integer differences are taken in 32 bits.
template <typename P>
vector2d PolygonLengths(const P* p) noexcept
{
    const vector2d first = Difference(p[1], p[0]);
    const vector2d second = Difference(p[2], p[1]);
    const vector2d third = Difference(p[3], p[2]);
    return {std::fabs(first.x) + std::fabs(second.x) + std::fabs(third.x),
            std::fabs(first.y) + std::fabs(second.y) + std::fabs(third.y)};
}

/// The levels needed before the midpoint test can be trusted: 700, 150 and 30 allowed deviations, squared.
int LeastDepth(double polygonLength, double tolerance) noexcept
{
    if (tolerance == 0.0)
        return 0;
    const double extent = polygonLength * polygonLength / tolerance;
    if (IsAtLeast(extent, 490000.0))
        return 3;
    if (IsAtLeast(extent, 22500.0))
        return 2;
    return IsAtLeast(extent, 900.0) ? 1 : 0;
}

/// More would need deeper stacks.
constexpr int mostLines = 2047;
/// The walk holds one pending end a level, from the top level 0 to floor(log2(mostLines)) - 1.
constexpr int mostPending = 12;

/// The right end of a stretch that is still to be walked.
struct PendingEnd
{
    double t;
    point2d point;
    int level;
};

/// Whether the chord from L to R may stand for the curve between them, whose parameter midpoint is M.
bool IsFlat(const point2d& l, const point2d& m, const point2d& r, double tolerance) noexcept
{
    const vector2d chord = l - r;
    if (chord.x == 0.0 && chord.y == 0.0)
        return true;
    const double x = Cross(chord, m - r);
    return x * x < LengthSquared(chord) * tolerance;
}

/// A closed curve's end, moved off its start so that the top chord is no zero vector.
point2d EndForChords(const point2d& start, const point2d& end) noexcept
{
    return start == end ? end - vector2d{1.0, 1.0} : end;
}

/// Walks the curve depth first, left before right, and stores two points a leaf from index 1 on.
///
/// @return the number of segments
template <typename C>
int WalkAdaptively(const PowerForm& f, const point2d& start, const point2d& end, double tolerance, int minDepth,
                   int maxDepth, C& output) noexcept
{
    PendingEnd pending[mostPending];
    int pendingCount = 0;
    pending[pendingCount++] = {1.0, EndForChords(start, end), 0};
    double t = 0.0;
    point2d point = start;
    int n = 0;
    while (pendingCount > 0) {
        PendingEnd& right = pending[pendingCount - 1];
        const double middleT = (t + right.t) * 0.5;
        const point2d middle = Evaluate(f, middleT);
        const bool isLeaf =
            right.level >= minDepth && (right.level == maxDepth || IsFlat(point, middle, right.point, tolerance));
        if (isLeaf) {
            output.Store(n + 1, middle);
            output.Store(n + 2, right.point);
            n += 2;
            t = right.t;
            point = right.point;
            --pendingCount;
        } else {
            ++right.level;
            pending[pendingCount++] = {middleT, middle, right.level};
        }
    }
    return n;
}

} // namespace

template <typename P, typename C>
void BezierToLines(const P* curve, int lines, C& output) noexcept
{
    output.Store(0, ToPoint2d(curve[0]));
    const PowerForm f = ToPowerForm(curve);
    for (int i = 1; i < lines; ++i)
        output.Store(i, Evaluate(f, static_cast<double>(i) / static_cast<double>(lines)));
    output.Store(lines, ToPoint2d(curve[3]));
}

template <typename P>
void CalculateRecursionDepth(const P* curve, double tolerance, int maxLines, int& minDepth, int& maxDepth) noexcept
{
    const vector2d lengths = PolygonLengths(curve);
    const int levels = FloorLog2(maxLines);
    maxDepth = levels - 1;
    minDepth = LeastDepth(std::max(lengths.x, lengths.y), tolerance);
    if (minDepth >= levels)
        minDepth = maxDepth;
}

template <typename P, typename C>
int AdaptiveBezierToLines(const P* curve, double tolerance, int maxLines, C& output) noexcept
{
    if (maxLines < 1)
        return 0;
    const point2d start = ToPoint2d(curve[0]);
    const point2d end = ToPoint2d(curve[3]);
    int n = 1;
    if (maxLines > 1) {
        int minDepth;
        int maxDepth;
        CalculateRecursionDepth(curve, tolerance, std::min(maxLines, mostLines), minDepth, maxDepth);
        n = WalkAdaptively(ToPowerForm(curve), start, end, tolerance, minDepth, maxDepth, output);
    }
    output.Store(0, start);
    output.Store(n, end);
    return n;
}

template void BezierToLines<POINT, FastConvert>(const POINT*, int, FastConvert&) noexcept;
template void BezierToLines<point2d, DirectConvert>(const point2d*, int, DirectConvert&) noexcept;
template int AdaptiveBezierToLines<POINT, FastConvert>(const POINT*, double, int, FastConvert&) noexcept;
template int AdaptiveBezierToLines<point2d, DirectConvert>(const point2d*, double, int, DirectConvert&) noexcept;
template void CalculateRecursionDepth<POINT>(const POINT*, double, int, int&, int&) noexcept;
template void CalculateRecursionDepth<point2d>(const point2d*, double, int, int&, int&) noexcept;

int CalculateNumBezierLines(const RECT& bounds, int maxLines) noexcept
{
    const double width = WrappingSubtract(bounds.right, bounds.left);
    const double height = WrappingSubtract(bounds.top, bounds.bottom);
    return ShareOfBudget(width, height, maxLines);
}

int CalculateNumBezierLines(const POINT* curve, int maxLines) noexcept
{
    const auto [minX, maxX] = std::minmax({curve[0].x, curve[1].x, curve[2].x, curve[3].x});
    const auto [minY, maxY] = std::minmax({curve[0].y, curve[1].y, curve[2].y, curve[3].y});
    return CalculateNumBezierLines(RECT{minX, maxY, maxX, minY}, maxLines);
}

int CalculateNumBezierLines(const point2d* curve, int maxLines) noexcept
{
    RECT box;
    CubicBezier::GetLooseBounds(curve, box.left, box.bottom, box.right, box.top);
    return CalculateNumBezierLines(box, maxLines);
}

void BezierToLines(const POINT* curve, POINT* out, int lines) noexcept
{
    FastConvert output{out};
    BezierToLines(curve, lines, output);
}

void BezierToLines(const point2d* curve, point2d* out, int lines) noexcept
{
    DirectConvert output{out};
    BezierToLines(curve, lines, output);
}

int AdaptiveBezierToLines(const POINT* curve, POINT* out, double tolerance, int maxLines) noexcept
{
    FastConvert output{out};
    return AdaptiveBezierToLines(curve, tolerance, maxLines, output);
}

int AdaptiveBezierToLines(const point2d* curve, point2d* out, double tolerance, int maxLines) noexcept
{
    DirectConvert output{out};
    return AdaptiveBezierToLines(curve, tolerance, maxLines, output);
}

} // namespace ZarnMath

namespace ZarnMath::CubicBezier {

template <typename P, typename I>
void GetLooseBounds(const P* curve, I& minX, I& minY, I& maxX, I& maxY) noexcept
{
    // Rounding keeps the order of numbers, so that the extremes alone need it. A NaN at the start rounds to 0, with which
    // the other points are compared.
    const auto orZero = [](double v) { return v == v ? v : 0.0; };
    const Pair start{orZero(curve[0].x), orZero(curve[0].y)};
    Pair low = start;
    Pair high = start;
    for (int i = 1; i < 4; ++i) {
        const Pair p = LoadPair(curve[i]);
        low = p < low ? p : low;
        high = p > high ? p : high;
    }
    minX = FloorToInt(low[0]);
    minY = FloorToInt(low[1]);
    maxX = CeilToInt(high[0]);
    maxY = CeilToInt(high[1]);
}

template void GetLooseBounds<point2d, int>(const point2d*, int&, int&, int&, int&) noexcept;

} // namespace ZarnMath::CubicBezier
