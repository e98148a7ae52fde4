#include "ZarnMath/Bounds.h"

#include "ZarnMath/Bezier/Pair.h"
#include "ZarnMath/ValueTypesInternal.h"
#include "ZarnMath/WMath/WideRegisters.h"
#include "ZarnMath/WMathInternal.h"

#include <algorithm>
#include <utility>

namespace ZarnMath {

namespace {

constexpr std::int32_t smallestInt = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t largestInt = std::numeric_limits<std::int32_t>::max();

constexpr RECT emptyRect{largestInt, smallestInt, smallestInt, largestInt};
constexpr BoundsT<double> emptyBounds{largestInt, smallestInt, smallestInt, largestInt};

/// Strict comparisons: a NaN widens nothing.
template <typename Box, typename P>
void Widen(Box& box, const P& p) noexcept
{
    if (p.x > box.right)
        box.right = p.x;
    if (p.y > box.top)
        box.top = p.y;
    if (p.x < box.left)
        box.left = p.x;
    if (p.y < box.bottom)
        box.bottom = p.y;
}

/// Four integer points in one vector, which becomes two or four where registers are narrow.
using FourPoints = std::int32_t __attribute__((vector_size(32)));

/// Widens by four integer points at a time, which do not mind in which order they are compared. Nor do those near the end
/// mind being compared twice.
///
/// @param count at least 4
[[gnu::always_inline]] inline RECT WidenedByFours(const RECT& box, const POINT* points, std::uint64_t count) noexcept
{
    const auto [left, top, right, bottom] = box;
    FourPoints low{left, bottom, left, bottom, left, bottom, left, bottom};
    FourPoints high{right, top, right, top, right, top, right, top};
    const auto widen = [&](const FourPoints& p, const FourPoints& q) __attribute__((always_inline))
    {
        low = p < low ? p : low;
        high = q > high ? q : high;
    };
    const auto widenByFour = [&](const POINT* four) __attribute__((always_inline))
    {
        FourPoints p;
        std::memcpy(&p, four, sizeof p);
        widen(p, p);
    };
    for (std::uint64_t i = 0; i + 4 <= count; i += 4)
        widenByFour(points + i);
    widenByFour(points + count - 4);
    widen(__builtin_shufflevector(low, low, 4, 5, 6, 7, 0, 1, 2, 3),
          __builtin_shufflevector(high, high, 4, 5, 6, 7, 0, 1, 2, 3));
    widen(__builtin_shufflevector(low, low, 2, 3, 0, 1, 6, 7, 4, 5),
          __builtin_shufflevector(high, high, 2, 3, 0, 1, 6, 7, 4, 5));
    return {low[0], high[1], high[0], low[1]};
}

/// The box widened by integer points.
[[nodiscard, gnu::always_inline]] inline RECT Widened(RECT box, const POINT* points, std::uint64_t count) noexcept
{
    constexpr std::uint64_t manyPoints = 8;
    if (count >= manyPoints)
        return OnWidestRegisters([=]() __attribute__((always_inline)) { return WidenedByFours(box, points, count); });
    for (std::uint64_t i = 0; i < count; ++i)
        Widen(box, points[i]);
    return box;
}

/// A box on its way along the points, both coordinates at once. Of two zeros it keeps the earlier one, and of a NaN
/// nothing, as `Widen` does.
class PairedBox
{
public:
    explicit PairedBox(const BoundsT<double>& box) noexcept : low{box.left, box.bottom}, high{box.right, box.top} {}

    void Widen(const Pair& p) noexcept
    {
        low = p < low ? p : low;
        high = p > high ? p : high;
    }

    [[nodiscard]] BoundsT<double> Box() const noexcept
    {
        return {low[0], high[1], high[0], low[1]};
    }

private:
    Pair low;
    Pair high;
};

[[nodiscard]] BoundsT<double> Widened(const BoundsT<double>& box, const point2d* points, std::uint64_t count) noexcept
{
    PairedBox widened(box);
    for (std::uint64_t i = 0; i < count; ++i)
        widened.Widen(LoadPair(points[i]));
    return widened.Box();
}

/// Seeded by the first point, not by the empty box, so that it is right beyond the integer limits too.
template <typename Box, typename P>
Box BoxOf(const P* points, int count, const Box& empty) noexcept
{
    if (points == nullptr || count < 1)
        return empty;
    const Box first{points[0].x, points[0].y, points[0].x, points[0].y};
    return Widened(first, points + 1, static_cast<std::uint64_t>(count) - 1);
}

/// A matrix by its columns, for both coordinates of an image at once.
class PairedMatrix
{
public:
    explicit PairedMatrix(const MATRIX& m) noexcept : x{m.m11, m.m21}, y{m.m12, m.m22}, translation{m.dx, m.dy} {}

    [[nodiscard]] Pair Image(const point2d& p) const noexcept
    {
        return translation + (x * Both(p.x) + y * Both(p.y));
    }

private:
    Pair x;
    Pair y;
    Pair translation;
};

/// Around the images of points, on top of the empty box.
template <typename P>
BoundsT<double> BoxOfImages(const P* points, std::uint64_t count, const MATRIX& m) noexcept
{
    const PairedMatrix paired(m);
    PairedBox box(emptyBounds);
    for (std::uint64_t i = 0; i < count; ++i)
        box.Widen(paired.Image(ToPoint2d(points[i])));
    return box.Box();
}

bool IsStrictlyNonEmpty(const RECT& rect) noexcept
{
    return rect.left < rect.right && rect.bottom < rect.top;
}

template <typename Box, typename P>
void StoreCorners(const Box& box, P* out) noexcept
{
    out[0] = {box.left, box.top};
    out[1] = {box.right, box.top};
    out[2] = {box.right, box.bottom};
    out[3] = {box.left, box.bottom};
}

template <typename P>
bool Contains(const RECT& rect, const P& p) noexcept
{
    if (!(rect.left <= p.x && p.x <= rect.right))
        return false;
    return (rect.bottom <= p.y && p.y <= rect.top) || (rect.top <= p.y && p.y <= rect.bottom);
}

template <typename P, typename Box>
Box BoxOfTransformedCorners(const Box& box, const MATRIX& m) noexcept
{
    P corners[4];
    StoreCorners(box, corners);
    m.TransformPoints(corners, 4);
    return GetPointsBBox(corners, 4);
}

/// All zeros if there is none, which takes every corner to the origin.
MATRIX InverseOf(const MATRIX& m) noexcept
{
    MATRIX inverse = m;
    inverse.Invert(DBL_EPSILON);
    return inverse;
}

/// Where on the circle the coordinate x*cos(t) + y*sin(t) is extreme, from the tangent of half the angle.
double ExtremeAngle(const vector2d& row) noexcept
{
    if (IsNearZero(row.y))
        return 0.0;
    if (IsNearZero(row.x))
        return halfPi;
    return 2.0 * std::atan((std::sqrt(LengthSquared(row)) - row.x) / row.y);
}

/// The box of the first of several points: fmin and fmax pass over a NaN, so that the others can still set the field.
BoundsT<double> SeedWith(const point2d& p) noexcept
{
    constexpr double largest = std::numeric_limits<double>::max();
    return {std::fmin(largest, p.x), std::fmax(-largest, p.y), std::fmax(-largest, p.x), std::fmin(largest, p.y)};
}

} // namespace

RECT GetEmptyRect() noexcept
{
    return emptyRect;
}

void InitializeEmpty(RECT& box) noexcept
{
    box = emptyRect;
}

void InitializeEmpty(BoundsT<double>& box) noexcept
{
    box = emptyBounds;
}

void NormalizeRect(RECT& rect) noexcept
{
    if (rect.right < rect.left)
        std::swap(rect.left, rect.right);
    if (rect.top < rect.bottom)
        std::swap(rect.top, rect.bottom);
}

RECT GetPointsBBox(const POINT* points, int count) noexcept
{
    return BoxOf(points, count, emptyRect);
}

BoundsT<double> GetPointsBBox(const point2d* points, int count) noexcept
{
    return BoxOf(points, count, emptyBounds);
}

void GetPointsBBox(const POINT* points, int count, RECT& out) noexcept
{
    out = BoxOf(points, count, emptyRect);
}

void UnionPointWithRect(RECT& rect, const POINT& p) noexcept
{
    Widen(rect, p);
}

void UnionPointWithRect(RECT& rect, const point2d& p) noexcept
{
    if (p.x > rect.right)
        rect.right = CeilToInt(p.x);
    if (p.y > rect.top)
        rect.top = CeilToInt(p.y);
    if (p.x < rect.left)
        rect.left = FloorToInt(p.x);
    if (p.y < rect.bottom)
        rect.bottom = FloorToInt(p.y);
}

void UnionPointsWithRect(RECT& rect, const POINT* points, int count) noexcept
{
    if (count > 0)
        rect = Widened(rect, points, static_cast<std::uint64_t>(count));
}

bool UnionRect(RECT& a, const RECT& b) noexcept
{
    if (!IsStrictlyNonEmpty(a))
        a = b;
    else if (IsStrictlyNonEmpty(b))
        a = {std::min(a.left, b.left), std::max(a.top, b.top), std::max(a.right, b.right),
             std::min(a.bottom, b.bottom)};
    return IsStrictlyNonEmpty(a);
}

bool IntersectRect(RECT& a, const RECT& b) noexcept
{
    if (b.top < b.bottom || a.top < a.bottom)
        return false;
    a = {std::max(a.left, b.left), std::min(a.top, b.top), std::min(a.right, b.right), std::max(a.bottom, b.bottom)};
    return IsStrictlyNonEmpty(a);
}

void TranslateRect(RECT& rect, int dx, int dy) noexcept
{
    rect = {WrappingAdd(rect.left, dx), WrappingAdd(rect.top, dy), WrappingAdd(rect.right, dx),
            WrappingAdd(rect.bottom, dy)};
}

void TranslateValidRect(RECT& rect, int dx, int dy) noexcept
{
    if (rect.left <= rect.right && rect.bottom <= rect.top)
        TranslateRect(rect, dx, dy);
}

void InflateRect(RECT& rect, int dx, int dy) noexcept
{
    rect = {WrappingSubtract(rect.left, dx), WrappingAdd(rect.top, dy), WrappingAdd(rect.right, dx),
            WrappingSubtract(rect.bottom, dy)};
}

void GetRectCorners(const BoundsT<double>& box, point2d* out) noexcept
{
    StoreCorners(box, out);
}

void GetRectCorners(const RECT& box, POINT* out) noexcept
{
    StoreCorners(box, out);
}

POINT GetRectCenter(const RECT& rect) noexcept
{
    return {WrappingAdd(rect.left, rect.right) / 2, WrappingAdd(rect.top, rect.bottom) / 2};
}

double GetRectArea(const RECT& rect) noexcept
{
    const double height = WrappingSubtract(rect.top, rect.bottom);
    const double width = WrappingSubtract(rect.right, rect.left);
    return std::fabs(height * width);
}

bool IsPointInRect(const POINT& p, const RECT& rect) noexcept
{
    return Contains(rect, p);
}

bool IsPointInRect(const point2d& p, const RECT& rect) noexcept
{
    return Contains(rect, p);
}

bool IsAnyPointInRect(const POINT* points, unsigned long count, const RECT& rect) noexcept
{
    return std::any_of(points, points + count, [&rect](const POINT& p) { return Contains(rect, p); });
}

RECT GetPointRect(const POINT& p, int r) noexcept
{
    return GetPointRect(p, r, r);
}

RECT GetPointRect(const POINT& p, int rx, int ry) noexcept
{
    RECT rect{p.x, p.y, p.x, p.y};
    InflateRect(rect, rx, ry);
    return rect;
}

const BoundsT<double>& IdentityBounds() noexcept
{
    static const BoundsT<double> identity{0.0, 1.0, 1.0, 0.0};
    return identity;
}

RECT GetTransformedBBox(const RECT& box, const MATRIX& m) noexcept
{
    return BoxOfTransformedCorners<POINT>(box, m);
}

BoundsT<double> GetTransformedBBox(const BoundsT<double>& box, const MATRIX& m) noexcept
{
    return BoxOfTransformedCorners<point2d>(box, m);
}

RECT GetUntransformedBBox(const RECT& box, const MATRIX& m) noexcept
{
    return GetTransformedBBox(box, InverseOf(m));
}

BoundsT<double> GetUntransformedBBox(const BoundsT<double>& box, const MATRIX& m) noexcept
{
    return GetTransformedBBox(box, InverseOf(m));
}

RECT GetTransformedPointsBBox(const POINT* points, unsigned long count, const MATRIX& m) noexcept
{
    // Rounding keeps the order of numbers and leaves whole ones alone: the extremes alone need it.
    return RoundOutward(BoxOfImages(points, count, m));
}

BoundsT<double> GetTransformedPointsBBox(const point2d* points, unsigned long count, const MATRIX& m) noexcept
{
    return BoxOfImages(points, count, m);
}

point2d GetRemappedPoint(const point2d& p, const BoundsT<double>& from, const BoundsT<double>& to) noexcept
{
    return Image(ConstructRectTransformMatrix(from, to, MapStretch), p);
}

BoundsT<double> GetTransformedCircleBBox(const MATRIX& m, double radius, point2d centre) noexcept
{
    const vector2d a = Image(m, Radians::AngleToVector(ExtremeAngle(XRow(m)), radius));
    const vector2d b = Image(m, Radians::AngleToVector(ExtremeAngle(YRow(m)), radius));
    BoundsT<double> box = SeedWith(centre + a);
    for (const point2d& p : {centre - a, centre + b, centre - b})
        Widen(box, p);
    return box;
}

} // namespace ZarnMath
