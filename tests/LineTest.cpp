#include "ZarnMath/Line.h"

#include "tests/Bits.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <vector>

namespace ZarnMath {
namespace {

constexpr std::int32_t smallest = -2147483647 - 1;
constexpr std::int32_t largest = 2147483647;

TEST(AreCollinear, UpToTwoPointsAreWhateverTheTolerance)
{
    const point2d points[2] = {{0.0, 0.0}, {1.0, 7.0}};
    const POINT integers[2] = {{0, 0}, {1, 7}};
    for (unsigned long count = 0; count < 3; ++count)
        for (const double tolerance : {-1.0, 0.0, 1.0, nan}) {
            EXPECT_TRUE(AreCollinear(points, count, tolerance));
            EXPECT_TRUE(AreCollinear(integers, count, tolerance));
        }
    EXPECT_TRUE(AreCollinear(static_cast<const POINT*>(nullptr), 0, 0.0));
}

TEST(AreCollinear, CoincidentPoints)
{
    const point2d points[3] = {{3.5, 4.5}, {3.5, 4.5}, {3.5, 4.5}};
    EXPECT_TRUE(AreCollinear(points, 3, 0.0));
    EXPECT_FALSE(AreCollinear(points, 3, -1e-300));
    const POINT integers[3] = {{3, 4}, {3, 4}, {3, 4}};
    EXPECT_TRUE(AreCollinear(integers, 3, 0.0));
}

TEST(AreCollinear, ToleranceIsASquareAndBelongsToTheBand)
{
    // The fit is the horizontal through (2, 1): the third point lies 2 away from it.
    const point2d points[3] = {{0.0, 0.0}, {4.0, 0.0}, {2.0, 3.0}};
    EXPECT_TRUE(AreCollinear(points, 3, 4.0));
    EXPECT_FALSE(AreCollinear(points, 3, std::nextafter(4.0, 0.0)));
    EXPECT_FALSE(AreCollinear(points, 3, 2.0));
    const POINT integers[3] = {{0, 0}, {4, 0}, {2, 3}};
    EXPECT_TRUE(AreCollinear(integers, 3, 4.0));
    EXPECT_FALSE(AreCollinear(integers, 3, std::nextafter(4.0, 0.0)));
}

TEST(AreCollinear, NegativeToleranceFailsPointsOnTheLine)
{
    const point2d points[3] = {{0.0, 0.0}, {1.0, 0.0}, {2.0, 0.0}};
    EXPECT_TRUE(AreCollinear(points, 3, 0.0));
    EXPECT_FALSE(AreCollinear(points, 3, -1e-300));
}

TEST(AreCollinear, FractionalHorizontalPointsCanFail)
{
    // The mixed moment rounds to 2^-51, and the direction to 1e16: the crossing with y = 0 is too far to be exact.
    const point2d points[3] = {{0.0, 0.7}, {1.0, 0.7}, {3.0, 0.7}};
    EXPECT_FALSE(AreCollinear(points, 3, 1e-3));
    const point2d whole[3] = {{0.0, 7.0}, {2.0, 7.0}, {4.0, 7.0}};
    EXPECT_TRUE(AreCollinear(whole, 3, 0.0));
}

TEST(AreCollinear, DirectionCanBeLostAgainstAHugePoint)
{
    // (p + (0, 1)) - p is the zero vector there.
    const point2d points[4] = {{1e17, 1e17}, {1e17, 1e17}, {1e17, 1e17}, {1e17, 1e17}};
    EXPECT_FALSE(AreCollinear(points, 4, 1e300));
}

TEST(AreCollinear, NanFails)
{
    const point2d points[3] = {{0.0, 0.0}, {nan, 1.0}, {3.0, 2.0}};
    EXPECT_FALSE(AreCollinear(points, 3, 1e300));
}

TEST(DistanceToLineSegment, FootInside)
{
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 0.0}, {4.0, 3.0}), 9.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {0.0, 10.0}, {-2.0, 5.0}), 4.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 10.0}, {0.0, 10.0}), 50.0);
}

TEST(DistanceToLineSegment, FootAtTheEnds)
{
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 0.0}, {0.0, 3.0}), 9.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 0.0}, {10.0, 3.0}), 9.0);
}

TEST(DistanceToLineSegment, ParameterOneIsOnTheSegment)
{
    // start + (end - start) rounds to (0, 0): the distance is from there, not from the end itself.
    EXPECT_EQ(DistanceToLineSegmentSqrd({1e16, 0.0}, {0.25, 0.0}, {0.25, 0.0}), 0.0625);
}

TEST(DistanceToLineSegment, BeyondTheEnds)
{
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 0.0}, {13.0, 4.0}), 25.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {10.0, 0.0}, {-3.0, -4.0}), 25.0);
}

TEST(DistanceToLineSegment, SegmentOfNoLength)
{
    EXPECT_EQ(DistanceToLineSegmentSqrd({1.0, 1.0}, {1.0, 1.0}, {4.0, 5.0}), 25.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}), 0.0);
    EXPECT_EQ(DistanceToLineSegmentSqrd({0.0, 0.0}, {1e-200, 0.0}, {3.0, 4.0}), 25.0); // its square underflows
}

/// The four ends in their places; the width comes last.
bool Meet(const point2d (&p)[4], double width)
{
    return DoesFatlineIntersectLine(p[0], p[1], p[2], p[3], width);
}

TEST(FatlineAndLine, CrossingSegmentsMeetAtAnyWidth)
{
    const point2d cross[4] = {{0.0, 0.0}, {10.0, 10.0}, {0.0, 10.0}, {10.0, 0.0}};
    for (const double width : {0.0, 1e-9, 5.0, -5.0})
        EXPECT_TRUE(Meet(cross, width));
}

TEST(FatlineAndLine, SegmentsOnOneSideOfEachOther)
{
    EXPECT_FALSE(Meet({{0.0, 0.0}, {10.0, 0.0}, {5.0, 1.0}, {5.0, 9.0}}, 0.0)); // c, d on one side of ab
    EXPECT_FALSE(Meet({{5.0, 1.0}, {5.0, 9.0}, {0.0, 0.0}, {10.0, 0.0}}, 0.0)); // a, b on one side of cd
}

TEST(FatlineAndLine, EndsOfTheFirstMayLieOnTheSecond)
{
    EXPECT_TRUE(Meet({{5.0, 0.0}, {5.0, 9.0}, {0.0, 0.0}, {10.0, 0.0}}, 0.0)); // a on cd
    EXPECT_TRUE(Meet({{5.0, 9.0}, {5.0, 0.0}, {0.0, 0.0}, {10.0, 0.0}}, 0.0)); // b on cd
}

TEST(FatlineAndLine, EndsOfTheSecondMayNotLieOnTheFirst)
{
    const point2d withC[4] = {{0.0, 0.0}, {10.0, 0.0}, {5.0, 0.0}, {5.0, 9.0}};
    const point2d withD[4] = {{0.0, 0.0}, {10.0, 0.0}, {5.0, 9.0}, {5.0, 0.0}};
    EXPECT_FALSE(Meet(withC, 0.0));
    EXPECT_FALSE(Meet(withD, 0.0));
    EXPECT_TRUE(Meet(withC, 1e-6));
    EXPECT_TRUE(Meet(withD, 1e-6));
}

TEST(FatlineAndLine, CollinearSegmentsNeedAWidth)
{
    const point2d overlapping[4] = {{0.0, 0.0}, {10.0, 0.0}, {5.0, 0.0}, {15.0, 0.0}};
    EXPECT_FALSE(Meet(overlapping, 0.0));
    EXPECT_TRUE(Meet(overlapping, 1e-6));
    const point2d apart[4] = {{0.0, 0.0}, {10.0, 0.0}, {12.0, 0.0}, {15.0, 0.0}};
    EXPECT_FALSE(Meet(apart, 2.0));
    EXPECT_TRUE(Meet(apart, 2.0000001));
}

TEST(FatlineAndLine, EachEndCanBeTheNearOne)
{
    const point2d c[4] = {{0.0, 0.0}, {10.0, 0.0}, {5.0, 2.0}, {5.0, 9.0}};
    const point2d d[4] = {{0.0, 0.0}, {10.0, 0.0}, {5.0, 9.0}, {5.0, 2.0}};
    const point2d a[4] = {{5.0, 2.0}, {5.0, 9.0}, {0.0, 0.0}, {10.0, 0.0}};
    const point2d b[4] = {{5.0, 9.0}, {5.0, 2.0}, {0.0, 0.0}, {10.0, 0.0}};
    for (const auto* segments : {&c, &d, &a, &b}) {
        EXPECT_TRUE(Meet(*segments, 2.0000001));
        EXPECT_FALSE(Meet(*segments, 2.0)); // exactly the width away
        EXPECT_TRUE(Meet(*segments, -3.0)); // the width is squared
    }
}

TEST(ReflectAcross, AxesNegateOneCoordinate)
{
    POINT points[3] = {{3, 4}, {-5, -6}, {0, 0}};
    ReflectAcross({1, 0}, {0, 0}, points, 3);
    EXPECT_EQ(points[0], (POINT{3, -4}));
    EXPECT_EQ(points[1], (POINT{-5, 6}));
    ReflectAcross({0, 1}, {0, 0}, points, 2);
    EXPECT_EQ(points[0], (POINT{-3, -4}));
    EXPECT_EQ(points[1], (POINT{5, 6}));
    EXPECT_EQ(points[2], (POINT{0, 0}));
}

TEST(ReflectAcross, DirectionOfAnyLengthThroughAnyOrigin)
{
    POINT points[3] = {{10, 0}, {13, 3}, {14, 2}};
    ReflectAcross({7, 7}, {10, 0}, points, 3);
    EXPECT_EQ(points[0], (POINT{10, 0})); // on the line
    EXPECT_EQ(points[1], (POINT{13, 3})); // on the line
    EXPECT_EQ(points[2], (POINT{12, 4}));
}

TEST(ReflectAcross, EachCoordinateIsRounded)
{
    POINT point{1, 0}; // (-0.6, 0.8)
    ReflectAcross({1, 2}, {0, 0}, &point, 1);
    EXPECT_EQ(point, (POINT{-1, 1}));
}

TEST(ReflectAcross, NoPoints)
{
    ReflectAcross({1, 0}, {0, 0}, nullptr, 5);
    POINT point{3, 4};
    ReflectAcross({1, 0}, {0, 0}, &point, 0);
    EXPECT_EQ(point, (POINT{3, 4}));
}

TEST(ReflectAcross, SquaredLengthWraps)
{
    POINT point{1, 0};
    ReflectAcross({46341, 46341}, {0, 0}, &point, 1); // 2*46341^2 - 2^32 = 9266
    EXPECT_EQ(point, (POINT{463519, 463520}));
}

TEST(ReflectAcross, DifferencesWrapAndResultsSaturate)
{
    POINT point{largest, 5}; // -1 from the origin, modulo 2^32
    ReflectAcross({1, 0}, {smallest, 0}, &point, 1);
    EXPECT_EQ(point, (POINT{smallest, -5})); // one below the smallest
}

TEST(ReflectAcross, ZeroDirectionDoesNotTrap)
{
    POINT point{3, 4};
    ReflectAcross({0, 0}, {0, 0}, &point, 1); // 0/0
    EXPECT_EQ(point, (POINT{0, 0}));
}

point2d RandomPoint(std::mt19937& engine)
{
    std::uniform_real_distribution<double> coordinate(-100.0, 100.0);
    const double x = coordinate(engine);
    return {x, coordinate(engine)};
}

TEST(LineProperties, DistanceIsThatOfTheNearestSample)
{
    std::mt19937 engine(1);
    for (int n = 0; n < 1000; ++n) {
        const point2d start = RandomPoint(engine);
        const point2d end = RandomPoint(engine);
        const point2d p = RandomPoint(engine);
        double nearest = LengthSquared(start - p);
        for (int i = 1; i <= 1000; ++i)
            nearest = std::min(nearest, LengthSquared(start + (end - start) * (i / 1000.0) - p));
        const double squared = DistanceToLineSegmentSqrd(start, end, p);
        EXPECT_LE(squared, nearest + 1e-9);
        EXPECT_GE(std::sqrt(squared), std::sqrt(nearest) - std::sqrt(LengthSquared(end - start)) / 2000.0 - 1e-9);
    }
}

TEST(LineProperties, FatlineMeetsWhereTheDistanceIsBelowTheWidth)
{
    std::mt19937 engine(2);
    int met = 0;
    for (int n = 0; n < 1000; ++n) {
        const point2d a = RandomPoint(engine);
        const point2d b = RandomPoint(engine);
        const point2d c = RandomPoint(engine);
        const point2d d = RandomPoint(engine);
        double nearest = DistanceToLineSegmentSqrd(a, b, c);
        for (int i = 1; i <= 1000; ++i)
            nearest = std::min(nearest, DistanceToLineSegmentSqrd(a, b, c + (d - c) * (i / 1000.0)));
        const double sampling = std::sqrt(LengthSquared(d - c)) / 2000.0;
        if (std::fabs(std::sqrt(nearest) - 5.0) <= sampling)
            continue;
        const bool meets = DoesFatlineIntersectLine(a, b, c, d, 5.0);
        EXPECT_EQ(meets, std::sqrt(nearest) < 5.0) << n;
        met += meets ? 1 : 0;
    }
    EXPECT_GT(met, 100);
    EXPECT_LT(met, 900);
}

TEST(LineProperties, EachSegmentIsMeasuredFromItsFirstEnd)
{
    // The foot of a point differs in its last bits between the two directions. A width in between tells them apart.
    std::mt19937 engine(5);
    int toldApart = 0;
    for (int n = 0; n < 1000; ++n) {
        const point2d start = RandomPoint(engine);
        const point2d end = RandomPoint(engine);
        const vector2d up = Normalize(Perpendicular(end - start));
        const point2d p = start + (end - start) * 0.4 + up * 0.3;
        const point2d beyond = p + up * 5.0;
        const double forward = DistanceToLineSegmentSqrd(start, end, p);
        const double backward = DistanceToLineSegmentSqrd(end, start, p);
        const auto [less, more] = std::minmax(forward, backward);
        double width = std::sqrt(more);
        while (width * width > more)
            width = std::nextafter(width, 0.0);
        if (!(width * width > less) || LengthSquared(end - start) < 4.0)
            continue;
        const bool isNear = forward < backward;
        EXPECT_EQ(Meet({start, end, p, beyond}, width), isNear);
        EXPECT_EQ(Meet({start, end, beyond, p}, width), isNear);
        EXPECT_EQ(Meet({p, beyond, start, end}, width), isNear);
        EXPECT_EQ(Meet({beyond, p, start, end}, width), isNear);
        ++toldApart;
    }
    EXPECT_GT(toldApart, 100);
}

TEST(LineProperties, ReflectionKeepsDistancesFromTheLineAndUndoesItself)
{
    std::mt19937 engine(3);
    const auto draw = [&engine](int range) {
        return static_cast<std::int32_t>(engine() % static_cast<unsigned>(2 * range + 1)) - range;
    };
    for (int n = 0; n < 2000; ++n) {
        const POINT direction{draw(1000), draw(1000)};
        if (direction == POINT{0, 0})
            continue;
        const POINT origin{draw(10000), draw(10000)};
        const POINT before{draw(100000), draw(100000)};
        POINT p = before;
        ReflectAcross(direction, origin, &p, 1);
        const vector2d u = Normalize(ToPoint2d(direction) - point2d{0.0, 0.0});
        const double was = Cross(u, ToPoint2d(before) - ToPoint2d(origin));
        EXPECT_NEAR(Cross(u, ToPoint2d(p) - ToPoint2d(origin)), -was, 0.72);
        ReflectAcross(direction, origin, &p, 1);
        EXPECT_LE(std::max(std::abs(p.x - before.x), std::abs(p.y - before.y)), 1);
    }
}

TEST(LineProperties, PointsOfALineAreCollinearAndAStrayOneIsNot)
{
    std::mt19937 engine(4);
    for (int n = 0; n < 2000; ++n) {
        const point2d start = RandomPoint(engine);
        const vector2d along = Normalize(RandomPoint(engine) - point2d{0.0, 0.0});
        if (std::fabs(along.y) < 1e-3) // nearly horizontal: the crossing with y = 0 is too far to be exact
            continue;
        std::vector<point2d> points;
        for (int i = 0; i < 5; ++i)
            points.push_back(start + along * (i * 17.0));
        EXPECT_TRUE(AreCollinear(points.data(), points.size(), 1e-12)) << n;
        points[2] = points[2] + Perpendicular(along) * 3.0;
        EXPECT_FALSE(AreCollinear(points.data(), points.size(), 1.0)) << n;
    }
}

} // namespace
} // namespace ZarnMath
