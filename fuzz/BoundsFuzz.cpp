/// @file
/// Rectangles, bounds, boxes through transforms, and circles through transforms.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/Circle.h"
#include "ZarnMath/CircleInternal.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

bool IsNonEmpty(const RECT& r) noexcept
{
    return r.left < r.right && r.bottom < r.top;
}

bool Holds(const RECT& outer, const RECT& inner) noexcept
{
    return outer.left <= inner.left && inner.right <= outer.right && outer.bottom <= inner.bottom &&
           inner.top <= outer.top;
}

bool Holds(const RECT& r, const POINT& p) noexcept
{
    return r.left <= p.x && p.x <= r.right && r.bottom <= p.y && p.y <= r.top;
}

void CheckIntegerPoints(const std::vector<POINT>& points, const RECT& rect, const MATRIX& m)
{
    const int count = static_cast<int>(points.size());
    const RECT box = Bounded(
        "GetPointsBBox", [&] { return GetPointsBBox(points.data(), count); }, count + 1);
    RECT same{};
    GetPointsBBox(points.data(), count, same);
    Require(same == box, "both forms agree");
    Require(count > 0 || box == GetEmptyRect(), "no points have the empty box");
    RECT grown = rect;
    UnionPointsWithRect(grown, points.data(), count);
    RECT oneByOne = rect;
    bool isAnyIn = false;
    for (const POINT& p : points) {
        Require(Holds(box, p) && Holds(grown, p), "the box holds every point");
        UnionPointWithRect(oneByOne, p);
        isAnyIn |= IsPointInRect(p, rect);
    }
    Require(grown == oneByOne, "points are united one by one");
    Require(IsAnyPointInRect(points.data(), points.size(), rect) == isAnyIn, "any point is one of them");

    const RECT image = Bounded(
        "GetTransformedPointsBBox", [&] { return GetTransformedPointsBBox(points.data(), points.size(), m); },
        count + 1);
    Require(count > 0 || image == GetEmptyRect(), "no points have the empty box");
}

void CheckDoublePoints(const std::vector<point2d>& points, const MATRIX& m)
{
    const int count = static_cast<int>(points.size());
    const BoundsT<double> box = GetPointsBBox(points.data(), count);
    if (AreOrdinary(points.data(), count))
        for (const point2d& p : points)
            Require(box.left <= p.x && p.x <= box.right && box.bottom <= p.y && p.y <= box.top,
                    "the box holds every point");
    const BoundsT<double> image = GetTransformedPointsBBox(points.data(), points.size(), m);
    Require(image.left <= 2147483647.0 && image.bottom <= 2147483647.0 && image.right >= -2147483648.0 &&
                image.top >= -2147483648.0,
            "no side passes the empty bounds");
    for (const point2d& p : points) {
        const point2d q = m(p);
        Require(!(q.x < image.left) && !(q.x > image.right) && !(q.y < image.bottom) && !(q.y > image.top),
                "the bounds hold every image");
        RECT rect = GetEmptyRect();
        UnionPointWithRect(rect, p);
        (void)IsPointInRect(p, rect);
    }
}

void CheckTwoRects(const RECT& a, const RECT& b)
{
    RECT united = a;
    const bool isUnion = UnionRect(united, b);
    Require(isUnion == IsNonEmpty(united), "it says whether the union is empty");
    if (IsNonEmpty(a) && IsNonEmpty(b))
        Require(isUnion && Holds(united, a) && Holds(united, b), "the union holds both");
    RECT shared = a;
    const bool isShared = IntersectRect(shared, b);
    if (isShared)
        Require(IsNonEmpty(shared) && Holds(a, shared) && Holds(b, shared), "both hold what they share");
    RECT self = a;
    UnionRect(self, self);
    Require(self == a, "the union of a rectangle with itself is itself");
}

void CheckOneRect(const RECT& rect, int dx, int dy)
{
    RECT normal = rect;
    NormalizeRect(normal);
    Require(normal.left <= normal.right && normal.bottom <= normal.top, "a normal rectangle is not inside out");
    RECT moved = rect;
    TranslateRect(moved, dx, dy);
    TranslateRect(moved, static_cast<int>(0U - static_cast<unsigned>(dx)),
                  static_cast<int>(0U - static_cast<unsigned>(dy)));
    Require(moved == rect, "a move there and back changes nothing");
    RECT valid = rect;
    TranslateValidRect(valid, dx, dy);
    Require((rect.left <= rect.right && rect.bottom <= rect.top) || valid == rect,
            "only a valid rectangle is moved as one");
    RECT inflated = rect;
    InflateRect(inflated, dx, dy);
    Guarded<POINT, 4> corners;
    GetRectCorners(rect, corners.data());
    Require(corners.IsIntact() && corners[0] == POINT{rect.left, rect.top} &&
                corners[2] == POINT{rect.right, rect.bottom},
            "four corners");
    Require(GetRectArea(rect) >= 0.0, "no area is negative");
    (void)GetRectCenter(rect);
    (void)GetPointRect({dx, dy}, rect.left);
    (void)GetPointRect({dx, dy}, rect.left, rect.top);
}

void CheckImages(const RECT& rect, const BoundsT<double>& bounds, const BoundsT<double>& other, const MATRIX& m)
{
    const RECT image = Bounded("GetTransformedBBox", [&] { return GetTransformedBBox(rect, m); });
    Require(image.left <= image.right && image.bottom <= image.top, "the box of four points");
    (void)Bounded("GetUntransformedBBox", [&] { return GetUntransformedBBox(rect, m); });
    (void)GetTransformedBBox(bounds, m);
    (void)GetUntransformedBBox(bounds, m);
    (void)GetRemappedPoint({bounds.left, bounds.top}, bounds, other);
    Guarded<point2d, 4> corners;
    GetRectCorners(bounds, corners.data());
    Require(corners.IsIntact(), "four corners");
}

void CheckCircles(const MATRIX& m, double radius, const point2d& p)
{
    double major = guard<double>;
    double minor = guard<double>;
    Bounded("GetTransformedCircleAxisLengths", [&] { GetTransformedCircleAxisLengths(m, major, minor); });
    Require(!(major < 0.0) && !(minor < 0.0), "no length is negative");
    double sameMajor = guard<double>;
    double sameMinor = guard<double>;
    double angle = guard<double>;
    GetTransformedCircleParams(m, sameMajor, sameMinor, &angle);
    Require(IsSame(major, sameMajor) && IsSame(minor, sameMinor), "the lengths do not depend on who asks");
    Require(angle != angle || (-0.8 <= angle && angle <= 2.4), "a direction from -pi/4 to 3*pi/4");
    vector2d majorAxis = guard<vector2d>;
    vector2d minorAxis = guard<vector2d>;
    Bounded("GetTransformedCircleAxes", [&] { GetTransformedCircleAxes(m, majorAxis, minorAxis); });
    (void)GetNormalOnTransformedCircle(m, p);
    (void)FindPointOnEllipseThatHasNormal(AsVector(p), major, minor);
    const BoundsT<double> box =
        Bounded("GetTransformedCircleBBox", [&] { return GetTransformedCircleBBox(m, radius, p); });
    const double linear[4] = {m.m11, m.m12, m.m21, m.m22};
    if (AreOrdinary(linear, 4) && IsOrdinary(radius) && IsOrdinary(p))
        Require(box.left <= box.right && box.bottom <= box.top, "an ordinary circle has a box");
}

} // namespace

void FuzzBounds(Input& input)
{
    constexpr int mostPoints = 20;
    const RECT a = input.Rect();
    const RECT b = input.Rect();
    const MATRIX m = input.Matrix();
    const BoundsT<double> bounds = input.Bounds();
    const BoundsT<double> other = input.Bounds();
    CheckTwoRects(a, b);
    CheckOneRect(a, b.left, b.right);
    CheckImages(a, bounds, other, m);
    CheckCircles(m, bounds.left, {other.left, other.top});
    const int count = input.Choice(mostPoints + 1);
    CheckIntegerPoints(input.IntegerPoints(count), a, m);
    CheckDoublePoints(input.Points(count), m);
}

} // namespace ZarnMath::Fuzzing
