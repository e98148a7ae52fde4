/// @file
/// Arrays of points, each of which has to come out as it does alone; and rounding.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

constexpr int mostPoints = 70;

/// A function of a point, in place, on an array and on one point after the other.
template <typename P, typename Batch>
Guarded<P, mostPoints> CheckOneByOne(std::string_view function, const std::vector<P>& points, Batch batch)
{
    const int count = static_cast<int>(points.size());
    Guarded<P, mostPoints> together;
    Guarded<P, mostPoints> single;
    std::copy(points.begin(), points.end(), together.data());
    std::copy(points.begin(), points.end(), single.data());
    Bounded(
        function, [&] { batch(together.data(), static_cast<unsigned long>(count)); }, count + 1);
    for (int i = 0; i < count; ++i)
        batch(single.data() + i, 1UL);
    Require(together.IsUntouchedFrom(count), "nothing beyond the array is written");
    Require(AreSame(&together[0], &single[0], count), "an array has the bits of one point at a time");
    return together;
}

void CheckIntegers(const std::vector<POINT>& points, const MATRIX& m, double angle, const point2d& centre)
{
    const int count = static_cast<int>(points.size());
    const auto images = CheckOneByOne("MATRIX::TransformPoints of integers", points,
                                      [&](POINT* p, unsigned long n) { m.TransformPoints(p, n); });
    const auto checked = CheckOneByOne("TransformPointsWithRangeCheck", points,
                                       [&](POINT* p, unsigned long n) { m.TransformPointsWithRangeCheck(p, n); });
    const auto plain = CheckOneByOne("UTLTransformPoint", points, [&](POINT* p, unsigned long n) {
        UTLTransformPoint(p, &m, static_cast<std::int64_t>(n));
    });
    constexpr int limit = 0x20000000;
    const auto clamp = [](int v) { return std::clamp(v, -limit, limit - 1); };
    for (int i = 0; i < count; ++i) {
        Require(images[i] == ToPOINT(m(ToPoint2d(points[static_cast<std::size_t>(i)]))), "each image is rounded");
        Require(checked[i] == POINT{clamp(images[i].x), clamp(images[i].y)}, "and cut off where that is asked for");
        Require(plain[i] == images[i], "plain C does the same");
    }
    CheckOneByOne("Radians::RotatePoints", points,
                  [&](POINT* p, unsigned long n) { Radians::RotatePoints(p, n, angle, centre); });
    CheckOneByOne("Degrees::RotatePoints", points,
                  [&](POINT* p, unsigned long n) { Degrees::RotatePoints(p, n, angle, centre); });
    const POINT offset = count > 0 ? points[0] : POINT{1, 2};
    CheckOneByOne("TranslatePoints of integers", points,
                  [&](POINT* p, unsigned long n) { TranslatePoints(p, n, offset); });
}

void CheckDoubles(const std::vector<point2d>& points, const MATRIX& m, const point2d& offset)
{
    const int count = static_cast<int>(points.size());
    const auto images =
        CheckOneByOne("MATRIX::TransformPoints", points, [&](point2d* p, unsigned long n) { m.TransformPoints(p, n); });
    for (int i = 0; i < count; ++i)
        Require(IsSame(images[i], m(points[static_cast<std::size_t>(i)])), "each point is transformed");
    CheckOneByOne("TranslatePoints", points, [&](point2d* p, unsigned long n) { TranslatePoints(p, n, offset); });
}

/// An offset that is one of the points is read anew for each of them.
template <typename P>
void CheckAlias(const std::vector<P>& points, int place)
{
    if (points.empty())
        return;
    const auto i = static_cast<std::size_t>(place) % points.size();
    std::vector<P> together = points;
    TranslatePoints(together.data(), together.size(), together[i]);
    std::vector<P> single = points;
    for (P& p : single) {
        const P offset = single[i];
        TranslatePoints(&p, 1, offset);
    }
    Require(AreSame(together, single), "an offset inside the array is read anew");
}

void CheckNothing(const MATRIX& m)
{
    m.TransformPoints(static_cast<POINT*>(nullptr), 0);
    m.TransformPoints(static_cast<point2d*>(nullptr), 0);
    m.TransformPointsWithRangeCheck(nullptr, 0);
    UTLTransformPoint(nullptr, &m, 0);
    UTLTransformPoint(nullptr, &m, -1);
    TranslatePoints(static_cast<POINT*>(nullptr), 0, POINT{1, 1});
    TranslatePoints(static_cast<point2d*>(nullptr), 0, point2d{1.0, 1.0});
    Radians::RotatePoints(nullptr, 0, 1.0, {0.0, 0.0});
}

void CheckRounding(const std::vector<point2d>& points)
{
    for (const point2d& p : points) {
        const int rounded = RoundToInt(p.x);
        const int truncated = TruncateToInt(p.x);
        constexpr double limit = 2147483647.0;
        if (p.x != p.x)
            Require(rounded == 0 && truncated == 0, "NaN gives 0");
        else if (p.x >= limit)
            Require(rounded == 2147483647 && truncated == 2147483647, "large numbers give the limit");
        else if (p.x <= -limit - 1.0)
            Require(rounded == -2147483647 - 1 && truncated == -2147483647 - 1, "and so do those far below 0");
        else
            Require(std::fabs(p.x - rounded) <= 0.5000000000000001 && truncated == std::trunc(p.x),
                    "the nearest integer, and the integer part");
    }
    if (points.size() < 4)
        return;
    Guarded<POINT, 4> out;
    point2d2ZGIPOINT<4>(out.data(), points.data());
    Require(out.IsIntact(), "four points");
    for (int i = 0; i < 4; ++i)
        Require(out[i] == ToPOINT(points[static_cast<std::size_t>(i)]), "each is rounded");
}

} // namespace

void FuzzBatches(Input& input)
{
    const int count = input.Choice(mostPoints + 1);
    const int place = input.Byte();
    const MATRIX m = input.Matrix();
    const double angle = input.Double();
    const point2d centre = input.Point();
    const std::vector<POINT> integers = input.IntegerPoints(count);
    CheckIntegers(integers, m, angle, centre);
    CheckAlias(integers, place);
    const std::vector<point2d> points = input.Points(count);
    CheckDoubles(points, m, centre);
    CheckAlias(points, place);
    CheckNothing(m);
    CheckRounding(points);
}

} // namespace ZarnMath::Fuzzing
