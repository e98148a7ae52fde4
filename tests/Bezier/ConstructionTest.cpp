#include "ZarnMath/Bezier.h"

#include "tests/Bits.h"
#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

namespace ZarnMath::CubicBezier {

namespace {

IntegerCubic Construct(const point2d& start, const point2d& through, const point2d& end, bool simple)
{
    IntegerCubic out{};
    From3Points(out.data(), start, through, end, simple);
    return out;
}

/// The point at t = 0.5.
point2d Middle(const IntegerCubic& p)
{
    return {(p[0].x + 3.0 * p[1].x + 3.0 * p[2].x + p[3].x) / 8.0,
            (p[0].y + 3.0 * p[1].y + 3.0 * p[2].y + p[3].y) / 8.0};
}

TEST(From3Points, SimpleArcInterpolates)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {1.0, 1.0}, {2.0, 0.0}, true), (IntegerCubic{{{0, 0}, {1, 1}, {1, 1}, {2, 0}}}));
    EXPECT_EQ(Construct({0.0, 0.0}, {30.0, 40.0}, {60.0, 0.0}, true),
              (IntegerCubic{{{0, 0}, {20, 53}, {40, 53}, {60, 0}}}));
}

TEST(From3Points, BisectingArcIsTheSameInASymmetricCorner)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {1.0, 1.0}, {2.0, 0.0}, false), (IntegerCubic{{{0, 0}, {1, 1}, {1, 1}, {2, 0}}}));
    EXPECT_EQ(Construct({0.0, 0.0}, {30.0, 40.0}, {60.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {20, 53}, {40, 53}, {60, 0}}}));
}

TEST(From3Points, BisectingArcOfALopsidedRightAngle)
{
    // The distances from the line square to the bisector are 100/sqrt(2) and 400/sqrt(2); their geometric mean is
    // sqrt(20000), which puts the control point at (100, 100).
    EXPECT_EQ(Construct({-100.0, 0.0}, {0.0, 0.0}, {0.0, -400.0}, false),
              (IntegerCubic{{{-100, 0}, {33, 67}, {67, -67}, {0, -400}}}));
    // The simple arc has it at (50, 200).
    EXPECT_EQ(Construct({-100.0, 0.0}, {0.0, 0.0}, {0.0, -400.0}, true),
              (IntegerCubic{{{-100, 0}, {0, 133}, {33, 0}, {0, -400}}}));
}

TEST(From3Points, MidwayOnTheChordGivesAStraightCurve)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {15.0, 0.0}, {30.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {10, 0}, {20, 0}, {30, 0}}}));
}

TEST(From3Points, TinyBisectorIsNotNormalised)
{
    // The bisector is (0, 1e-8), too short to be normalised, and too short to move the point: the distances are those from
    // the point itself, 1e9, and the control point comes to lie 1e-8*1e9 above it.
    EXPECT_EQ(Construct({0.0, 0.0}, {1e9, 5.0}, {2e9, 0.0}, false),
              (IntegerCubic{{{0, 0}, {666666667, 10}, {1333333333, 10}, {2000000000, 0}}}));
    // Around x = 0 it does move the point: the distances are those from the horizontal through it, and so is the lift of
    // the control point, 5e-8.
    EXPECT_EQ(Construct({-1e9, 0.0}, {0.0, 5.0}, {1e9, 0.0}, false),
              (IntegerCubic{{{-1000000000, 0}, {-333333333, 3}, {333333333, 3}, {1000000000, 0}}}));
}

TEST(From3Points, CoincidentEndsForceTheSimpleArc)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {10.0, 20.0}, {0.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {13, 27}, {13, 27}, {0, 0}}}));
}

TEST(From3Points, PassingThroughTheStartForcesTheSimpleArc)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {0.0, 0.0}, {40.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {-13, 0}, {0, 0}, {40, 0}}}));
    EXPECT_EQ(Construct({0.0, 0.0}, {DBL_EPSILON, -DBL_EPSILON}, {40.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {-13, 0}, {0, 0}, {40, 0}}}));
}

TEST(From3Points, PassingBesideTheStartDoesNot)
{
    // A distance above the tolerance of coincidence, but a vector too short to be normalised: the bisector is the
    // direction from the end, and the control point comes to lie at the start.
    EXPECT_EQ(Construct({0.0, 0.0}, {Above(DBL_EPSILON), 0.0}, {40.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {0, 0}, {13, 0}, {40, 0}}}));
}

TEST(From3Points, PassingThroughTheEndIsNoReasonForTheSimpleArc)
{
    EXPECT_EQ(Construct({0.0, 0.0}, {30.0, 0.0}, {30.0, 0.0}, false),
              (IntegerCubic{{{0, 0}, {20, 0}, {30, 0}, {30, 0}}}));
    EXPECT_EQ(Construct({0.0, 0.0}, {30.0, 0.0}, {30.0, 0.0}, true),
              (IntegerCubic{{{0, 0}, {30, 0}, {40, 0}, {30, 0}}}));
}

TEST(From3Points, EndsAreRoundedAndNothingElseIsWritten)
{
    Guarded<POINT, 4> out;
    From3Points(out.data(), {0.5, -0.5}, {7.0, 7.0}, {20.49, -20.5}, true);
    EXPECT_EQ(out[0], (POINT{1, -1}));
    EXPECT_EQ(out[3], (POINT{20, -21}));
    EXPECT_TRUE(out.IsIntact());
}

TEST(From3PointsWithTangents, SolvesForTheLengths)
{
    IntegerCubic out{};
    EXPECT_TRUE(From3Points(out.data(), {0.0, 0.0}, {1.0, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, 1.0}));
    EXPECT_EQ(out, (IntegerCubic{{{0, 0}, {40, 0}, {30, 40}, {30, 0}}}));
}

TEST(From3PointsWithTangents, ATangentIsALineAndNoDirection)
{
    IntegerCubic out{};
    EXPECT_TRUE(From3Points(out.data(), {0.0, 0.0}, {-2.0, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, -0.5}));
    EXPECT_EQ(out, (IntegerCubic{{{0, 0}, {40, 0}, {30, 40}, {30, 0}}}));
}

TEST(From3PointsWithTangents, ParallelTangentsFail)
{
    Guarded<POINT, 4> out;
    EXPECT_FALSE(From3Points(out.data(), {0.0, 0.0}, {1.0, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {2.0, 0.0}));
    EXPECT_FALSE(From3Points(out.data(), {0.0, 0.0}, {1.0, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, 0.0}));
    EXPECT_FALSE(From3Points(out.data(), {0.0, 0.0}, {0.0, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {1.0, 1.0}));
    EXPECT_TRUE(out.IsUntouchedFrom(0));
}

TEST(From3PointsWithTangents, TinyTangentsFailLikeParallelOnes)
{
    const double edge = 0x1p-26; // whose square is the tolerance
    Guarded<POINT, 4> out;
    EXPECT_FALSE(From3Points(out.data(), {0.0, 0.0}, {edge, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, edge}));
    EXPECT_FALSE(From3Points(out.data(), {0.0, 0.0}, {edge, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, -edge}));
    EXPECT_TRUE(out.IsUntouchedFrom(0));
    EXPECT_TRUE(From3Points(out.data(), {0.0, 0.0}, {edge, 0.0}, {30.0, 15.0}, {30.0, 0.0}, {0.0, Above(edge)}));
    EXPECT_EQ(out[1], (POINT{40, 0}));
    EXPECT_EQ(out[2], (POINT{30, 40}));
    EXPECT_TRUE(out.IsIntact());
}

TEST(From3PointsProperties, SimpleArcRunsThroughItsPoint)
{
    RandomSource random(1);
    for (int n = 0; n < 2000; ++n) {
        const point2d through = random.Point(10000.0);
        const point2d start = random.Point(10000.0);
        const point2d middle = Middle(Construct(start, through, random.Point(10000.0), true));
        EXPECT_NEAR(middle.x, through.x, 0.51); // four roundings by a half, of which eight make a whole
        EXPECT_NEAR(middle.y, through.y, 0.51);
    }
}

TEST(From3PointsProperties, GivenTangentsRunThroughTheirPoint)
{
    RandomSource random(2);
    for (int n = 0; n < 2000; ++n) {
        const point2d start = random.Point(10000.0);
        const point2d through = random.Point(10000.0);
        const point2d end = random.Point(10000.0);
        const vector2d first = AsVector(random.Point(1.0));
        const vector2d second = AsVector(random.Point(1.0));
        IntegerCubic out{};
        if (std::fabs(Cross(first, second)) < 1e-3)
            continue;
        ASSERT_TRUE(From3Points(out.data(), start, first, through, end, second));
        const point2d middle = Middle(out);
        EXPECT_NEAR(middle.x, through.x, 0.51);
        EXPECT_NEAR(middle.y, through.y, 0.51);
        const double alongFirst = Cross(Normalize(first), ToPoint2d(out[1]) - start);
        const double alongSecond = Cross(Normalize(second), ToPoint2d(out[2]) - end);
        EXPECT_NEAR(alongFirst, 0.0, 0.72); // the rounded control points stay on the tangents
        EXPECT_NEAR(alongSecond, 0.0, 0.72);
    }
}

TEST(From3PointsProperties, BisectingArcKeepsItsControlPointOnTheBisector)
{
    RandomSource random(3);
    for (int n = 0; n < 2000; ++n) {
        const point2d start = random.Point(10000.0);
        const point2d through = random.Point(10000.0);
        const point2d end = random.Point(10000.0);
        const vector2d bisector = Normalize(Normalize(through - start) + Normalize(through - end));
        const IntegerCubic out = Construct(start, through, end, false);
        // P1 = start + (Q - start)*2/3, solved for Q.
        const point2d q = start + (ToPoint2d(out[1]) - start) * 1.5;
        EXPECT_NEAR(Cross(bisector, q - through), 0.0, 1.1) << n;
        EXPECT_GE(Dot(bisector, q - through), -1.1) << n;
    }
}

} // namespace

} // namespace ZarnMath::CubicBezier
