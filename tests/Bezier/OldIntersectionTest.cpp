#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"

#include "tests/Bits.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <random>

namespace ZarnMath::CubicBezier {

namespace {

constexpr double untouched = -77.0;

struct Range
{
    double start = 0.0;
    double end = 1.0;
};

/// The arrays of a call, filled with a sentinel before.
struct Found
{
    double parameters[BezierOld::maxIntersections];
    double xs[BezierOld::maxIntersections];
    double ys[BezierOld::maxIntersections];
    int count;

    Found(const point2d* first, const point2d* second, int depth, int before = 0, Range range = {}) : count(before)
    {
        for (double* array : {parameters, xs, ys})
            std::fill_n(array, BezierOld::maxIntersections, untouched);
        const int result = BezierOld::BezierIntersectionEx(first, range.start, range.end, second, 0.0, 1.0, parameters,
                                                           xs, ys, count, depth);
        EXPECT_EQ(result, count);
        for (int i = 0; i < before; ++i)
            EXPECT_EQ(parameters[i], untouched);
        for (int i = count; i < BezierOld::maxIntersections; ++i)
            EXPECT_EQ(parameters[i], untouched);
    }
};

/// A segment as a cubic that runs along it at constant speed.
struct Segment
{
    point2d points[4];

    Segment(point2d from, point2d to)
        : points{from,
                 {(2.0 * from.x + to.x) / 3.0, (2.0 * from.y + to.y) / 3.0},
                 {(from.x + 2.0 * to.x) / 3.0, (from.y + 2.0 * to.y) / 3.0},
                 to}
    {}
};

Found Cross(const Segment& first, const Segment& second, int depth)
{
    return {first.points, second.points, depth};
}

/// A cubic through y = 0 at t = 1/4, 1/2 and 3/4 exactly, with x = 12288*t.
constexpr point2d wave[4] = {{0.0, -9216.0}, {4096.0, 13312.0}, {8192.0, -13312.0}, {12288.0, 9216.0}};
/// Along the x axis, at the same x for every t.
constexpr point2d axis[4] = {{0.0, 0.0}, {4096.0, 0.0}, {8192.0, 0.0}, {12288.0, 0.0}};

TEST(OldIntersection, DoesNothingWithNineResults)
{
    const Found f(wave, axis, 0, 9);
    EXPECT_EQ(f.count, 9);
    const Found leaf(wave, axis, 8, 9);
    EXPECT_EQ(leaf.count, 9);
}

TEST(OldIntersection, TakesTheChordsAtDepthEight)
{
    // Of the three crossings only that of the chord (0, -9216)-(12288, 9216) shows.
    const Found f(wave, axis, 8);
    EXPECT_EQ(f.count, 1);
    EXPECT_EQ(f.parameters[0], 0.5);
    EXPECT_EQ(f.xs[0], 6144.0);
    EXPECT_EQ(f.ys[0], 0.0);
    EXPECT_EQ(Found(wave, axis, 11).count, 1);
}

TEST(OldIntersection, TakesThePositionFromTheCurveAndNotFromItsChord)
{
    // The chord is met at u = 1/4, where the curve is at height 64*3*u*(1 - u) = 36.
    constexpr point2d bow[4] = {{0.0, 0.0}, {64.0, 64.0}, {128.0, 64.0}, {192.0, 0.0}};
    constexpr point2d post[4] = {{48.0, -64.0}, {48.0, -32.0}, {48.0, 32.0}, {48.0, 64.0}};
    const Found f(bow, post, 8);
    ASSERT_EQ(f.count, 1);
    EXPECT_EQ(f.parameters[0], 0.25);
    EXPECT_EQ(f.xs[0], 48.0);
    EXPECT_EQ(f.ys[0], 36.0);
}

TEST(OldIntersection, MapsToTheRangeOfTheFirstCurve)
{
    constexpr point2d bow[4] = {{0.0, 0.0}, {64.0, 64.0}, {128.0, 64.0}, {192.0, 0.0}};
    constexpr point2d post[4] = {{48.0, -64.0}, {48.0, -32.0}, {48.0, 32.0}, {48.0, 64.0}};
    EXPECT_EQ(Found(bow, post, 8, 0, {2.0, 6.0}).parameters[0], 3.0);
    EXPECT_EQ(Found(bow, post, 8, 0, {1.0, 0.0}).parameters[0], 0.75);
}

TEST(OldIntersection, AppendsFromTheCountOn)
{
    const Found f(wave, axis, 8, 3);
    EXPECT_EQ(f.count, 4);
    EXPECT_EQ(f.parameters[3], 0.5);
}

TEST(OldIntersection, OfParallelChordsFindsNothing)
{
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {300.0, 300.0}), Segment({0.0, 0.0}, {300.0, 300.0}), 8).count, 0);
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {300.0, 0.0}), Segment({100.0, 0.0}, {100.0, 0.0}), 8).count, 0);
}

TEST(OldIntersection, IncludesTheEndsOfBothChords)
{
    const Segment across({0.0, 0.0}, {256.0, 0.0});
    const auto count = [&](point2d from, point2d to) { return Cross(across, Segment(from, to), 8).count; };
    EXPECT_EQ(count({0.0, -64.0}, {0.0, 64.0}), 1);
    EXPECT_EQ(count({256.0, -64.0}, {256.0, 64.0}), 1);
    EXPECT_EQ(count({128.0, 0.0}, {128.0, 64.0}), 1);
    EXPECT_EQ(count({128.0, -64.0}, {128.0, 0.0}), 1);
    EXPECT_EQ(count({-0x1p-30, -64.0}, {-0x1p-30, 64.0}), 0);
    EXPECT_EQ(count({256.0 + 0x1p-30, -64.0}, {256.0 + 0x1p-30, 64.0}), 0);
    EXPECT_EQ(count({128.0, 0x1p-30}, {128.0, 64.0}), 0);
    EXPECT_EQ(count({128.0, -64.0}, {128.0, -0x1p-30}), 0);
}

TEST(OldIntersection, ReadsTheParameterFromTheDominantAxisOfTheChord)
{
    const point2d from{0.1, 1000.3};
    const auto expect = [&](vector2d along, bool byX) {
        const Segment first(from, from + along);
        const Segment second({20.0, 900.0}, {70.0, 1190.0});
        const point2d* p = first.points;
        const point2d* q = second.points;
        const vector2d d = p[3] - p[0];
        const vector2d e = p[0] - q[0];
        const double u = ZarnMath::Cross(q[3] - q[0], e) / ZarnMath::Cross(d, q[3] - q[0]);
        const point2d crossing{p[0].x + d.x * u, p[0].y + d.y * u};
        const double byItsX = (crossing.x - p[0].x) / d.x;
        const double byItsY = (crossing.y - p[0].y) / d.y;
        ASSERT_NE(byItsX, byItsY);
        const Found f = Cross(first, second, 8);
        ASSERT_EQ(f.count, 1);
        EXPECT_EQ(f.parameters[0], byX ? byItsX : byItsY);
    };
    expect({100.0, 90.0}, true);
    expect({90.0, 100.0}, false);
}

TEST(OldIntersection, ReadsTheParameterFromYOnATie)
{
    const point2d from{0.125, 1000.5};
    const Segment first(from, {100.125, 1100.5});
    const Segment second({20.0, 1130.0}, {71.0, 1010.0});
    const vector2d d = first.points[3] - first.points[0];
    ASSERT_EQ(d.x, d.y);
    const vector2d e = first.points[0] - second.points[0];
    const vector2d across = second.points[3] - second.points[0];
    const double u = ZarnMath::Cross(across, e) / ZarnMath::Cross(d, across);
    const double byX = (from.x + d.x * u - from.x) / d.x;
    const double byY = (from.y + d.y * u - from.y) / d.y;
    ASSERT_NE(byX, byY);
    const Found f = Cross(first, second, 8);
    ASSERT_EQ(f.count, 1);
    EXPECT_EQ(f.parameters[0], byY);
}

TEST(OldIntersection, GivesUpBelowOneUnitInBothDirections)
{
    const double limit = 1.00000001;
    const double below = std::nextafter(limit, 0.0);
    const Segment large({-8.0, 8.6}, {8.0, -7.4});
    const auto expect = [&](double width, double height, int count) {
        const Segment small({0.0, 0.0}, {width, height});
        EXPECT_EQ(Cross(small, large, 7).count, count);
        EXPECT_EQ(Cross(large, small, 7).count, count);
    };
    expect(limit, limit, 1);
    expect(limit, below, 1);
    expect(below, limit, 1);
    expect(below, below, 0);
}

TEST(OldIntersection, DoesNotGiveUpAtTheLeaf)
{
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {0.5, 0.0}), Segment({0.25, -0.25}, {0.25, 0.25}), 8).count, 1);
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {0.5, 0.0}), Segment({0.25, -0.25}, {0.25, 0.25}), 7).count, 0);
}

TEST(OldIntersection, SearchesToTheEndAboutTwoToTheSeventhUnits)
{
    // Pieces of a segment of 2^7 units are one unit wide after seven halvings, and the last test asks for more.
    const auto count = [](double size) {
        return Cross(Segment({0.0, 0.0}, {size, 0.0}), Segment({size * 0.3, -size}, {size * 0.3, size * 1.1}), 0).count;
    };
    EXPECT_EQ(count(127.0), 0);
    EXPECT_EQ(count(129.0), 1);
}

TEST(OldIntersection, GoesOnWhereBoxesOnlyTouch)
{
    // The end of the first lies in the middle of the second, whose two halves both hold it.
    const Found f = Cross(Segment({0.0, 0.0}, {96.0, 0.0}), Segment({96.0, -48.0}, {96.0, 48.0}), 7);
    ASSERT_EQ(f.count, 2);
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(f.parameters[i], 1.0);
        EXPECT_EQ(f.xs[i], 96.0);
        EXPECT_EQ(f.ys[i], 0.0);
    }
    const double beyond = 96.0 + 0x1p-40;
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {96.0, 0.0}), Segment({beyond, -48.0}, {beyond, 48.0}), 7).count, 0);
}

TEST(OldIntersection, ListsTheLeftHalvesFirstAndStopsAtNine)
{
    // Each crossing is an end of a stretch on both curves and so is found four times.
    const Found f(wave, axis, 0);
    ASSERT_EQ(f.count, 9);
    for (int i = 0; i < 9; ++i) {
        const double t = (i / 4 + 1) * 0.25;
        EXPECT_EQ(f.parameters[i], t);
        EXPECT_EQ(f.xs[i], 12288.0 * t);
        EXPECT_EQ(f.ys[i], 0.0);
    }
}

TEST(OldIntersection, TakesNotMoreThanThereIsRoomFor)
{
    const Found f(wave, axis, 0, 7);
    EXPECT_EQ(f.count, 9);
    EXPECT_EQ(f.parameters[7], 0.25);
    EXPECT_EQ(f.parameters[8], 0.25);
}

TEST(OldIntersection, OfDistantCurvesFindsNothing)
{
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {1000.0, 0.0}), Segment({0.0, 1.0}, {1000.0, 1.0}), 0).count, 0);
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {1000.0, 9.0}), Segment({2000.0, 0.0}, {3000.0, 9.0}), 0).count, 0);
}

TEST(OldIntersection, OfNaNFindsNothing)
{
    const Segment nowhere({nan, nan}, {100.0, 100.0});
    EXPECT_EQ(Cross(nowhere, Segment({0.0, 0.0}, {1000.0, 0.0}), 0).count, 0);
    EXPECT_EQ(Cross(Segment({0.0, 0.0}, {1000.0, 0.0}), nowhere, 0).count, 0);
}

TEST(OldIntersection, LiesOnBothCurvesAndDoesNotDependOnTheirOrder)
{
    std::mt19937 engine(20261120);
    std::uniform_real_distribution<double> coordinate(-20000.0, 20000.0);
    int crossings = 0;
    for (int i = 0; i < 2000; ++i) {
        point2d first[4];
        point2d second[4];
        for (point2d* curve : {first, second})
            for (int k = 0; k < 4; ++k)
                curve[k] = {coordinate(engine), coordinate(engine)};
        const Found ahead(first, second, 0);
        const Found back(second, first, 0);
        ASSERT_EQ(ahead.count, back.count);
        for (int k = 0; k < ahead.count; ++k, ++crossings) {
            // A chord of 2^-8 of the range is off by less than an eighth of the second difference, 2^-16 of it.
            const point2d p{ahead.xs[k], ahead.ys[k]};
            const point2d onFirst = Evaluate(ToPowerForm(first), ahead.parameters[k]);
            EXPECT_LT(std::sqrt(LengthSquared(onFirst - p)), 1e-6);
            double nearest = std::numeric_limits<double>::max();
            for (int n = 0; n < back.count; ++n)
                nearest = std::min(nearest, LengthSquared(point2d{back.xs[n], back.ys[n]} - p));
            EXPECT_LT(std::sqrt(nearest), 200.0);
        }
    }
    EXPECT_GT(crossings, 1000);
    RecordProperty("crossings", crossings);
}

} // namespace

} // namespace ZarnMath::CubicBezier
