#include "ZarnMath/Bezier.h"
#include "ZarnMath/ValueTypesInternal.h"

#include "tests/Bits.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace ZarnMath::CubicBezier {

namespace {

/// Crosses y = 0 at t = 0, 0.5 and 1, with x = 300*t.
constexpr point2d sCurve[4] = {{0.0, 0.0}, {100.0, 300.0}, {200.0, -300.0}, {300.0, 0.0}};
constexpr POINT sCurveInteger[4] = {{0, 0}, {100, 300}, {200, -300}, {300, 0}};

/// What a call gave, from vectors that held something before.
struct Crossings
{
    bool found;
    std::vector<double> bezierParameters{-1.0, -2.0, -3.0};
    std::vector<double> lineParameters{-4.0};
};

template <typename P>
Crossings Intersect(const P* bezier, P from, P to, bool includeEndpoints)
{
    const P line[2] = {from, to};
    Crossings c;
    c.found = FindBezierLineIntersection(bezier, line, c.bezierParameters, c.lineParameters, includeEndpoints);
    EXPECT_EQ(c.bezierParameters.size(), c.lineParameters.size());
    EXPECT_EQ(c.found, !c.bezierParameters.empty());
    return c;
}

bool CrossesSegment(const point2d* bezier, point2d from, point2d to)
{
    const point2d line[2] = {from, to};
    return DoesBezierIntersectLineSegment(bezier, line);
}

using Parameters = std::vector<double>;

TEST(LineIntersection, OfALineWithoutLengthEmptiesBothVectors)
{
    const Crossings c = Intersect(sCurve, {150.0, 0.0}, {150.0, 0.0}, true);
    EXPECT_FALSE(c.found);
    EXPECT_TRUE(c.bezierParameters.empty());
    EXPECT_TRUE(c.lineParameters.empty());
}

TEST(LineIntersection, RejectsNothingButExactlyEqualPoints)
{
    // 1800*t^3 - 2700*t^2 + 900*t = 10 has two roots in (0, 1), which the length of the line does not move.
    const double tiny = 0x1p-60;
    ASSERT_LT(tiny, DBL_EPSILON);
    const Crossings far = Intersect(sCurve, {0.0, 10.0}, {1.0, 10.0}, false);
    const Crossings near = Intersect(sCurve, {0.0, 10.0}, {tiny, 10.0}, false);
    ASSERT_EQ(near.bezierParameters.size(), 2U);
    ASSERT_EQ(far.bezierParameters.size(), 2U);
    for (std::size_t i = 0; i < 2; ++i) {
        const double t = near.bezierParameters[i];
        EXPECT_NEAR(((1800.0 * t - 2700.0) * t + 900.0) * t, 10.0, 1e-9);
        EXPECT_NEAR(near.lineParameters[i] * tiny, 300.0 * t, 1e-9);
        EXPECT_GT(near.lineParameters[i], 1e17);
        EXPECT_NEAR(far.bezierParameters[i], t, 1e-12);
    }
}

TEST(LineIntersection, ReadsTheLineParameterFromTheDominantAxis)
{
    // A point of the curve is only near the line, so that the two coordinates give different parameters.
    const auto expect = [](point2d from, point2d to, bool byX) {
        const Crossings c = Intersect(sCurve, from, to, false);
        ASSERT_TRUE(c.found);
        bool differ = false;
        for (std::size_t i = 0; i < c.bezierParameters.size(); ++i) {
            const double t = c.bezierParameters[i];
            const double ux = 1.0 / (to.x - from.x) * (300.0 * t - from.x);
            const double uy = 1.0 / (to.y - from.y) * (((1800.0 * t - 2700.0) * t + 900.0) * t - from.y);
            EXPECT_EQ(c.lineParameters[i], byX ? ux : uy);
            differ = differ || ux != uy;
        }
        EXPECT_TRUE(differ);
    };
    expect({7.25, -31.5}, {110.25, 70.0}, true);
    expect({7.25, -31.5}, {110.25, 71.5}, false);
    expect({7.25, 131.0}, {110.25, 28.0}, false);
    expect({7.25, -31.5}, {110.25, 73.0}, false);
}

TEST(LineIntersection, OfACurveAlongTheLineFindsNothing)
{
    constexpr point2d straight[4] = {{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}};
    EXPECT_FALSE(Intersect(straight, {0.0, 0.0}, {10.0, 0.0}, true).found);
    EXPECT_FALSE(Intersect(straight, {0.0, 5.0}, {10.0, 5.0}, true).found);
}

TEST(LineIntersection, CountsTheStartOfTheCurveOnlyOnRequest)
{
    EXPECT_FALSE(Intersect(sCurve, {0.0, -10.0}, {0.0, 10.0}, false).found);
    const Crossings c = Intersect(sCurve, {0.0, -10.0}, {0.0, 10.0}, true);
    EXPECT_EQ(c.bezierParameters, Parameters{0.0});
    EXPECT_EQ(c.lineParameters, Parameters{0.5});
}

TEST(LineIntersection, DropsTheStartWhereTheCurveCrossesTwiceBesides)
{
    const Crossings open = Intersect(sCurve, {0.0, 0.0}, {300.0, 0.0}, false);
    EXPECT_EQ(open.bezierParameters, Parameters{0.5});
    EXPECT_EQ(open.lineParameters, Parameters{0.5});
    const Crossings closed = Intersect(sCurve, {0.0, 0.0}, {300.0, 0.0}, true);
    EXPECT_EQ(closed.bezierParameters, (Parameters{0.5, 1.0}));
    EXPECT_EQ(closed.lineParameters, (Parameters{0.5, 1.0}));
}

TEST(LineIntersection, LosesARootOnACutOfTheSubdivision)
{
    // The heights -100, 300, -300, 100 change sign three times, and the first cut meets the middle crossing.
    constexpr point2d curve[4] = {{0.0, -100.0}, {100.0, 300.0}, {200.0, -300.0}, {300.0, 100.0}};
    const Crossings c = Intersect(curve, {0.0, 0.0}, {300.0, 0.0}, false);
    ASSERT_EQ(c.bezierParameters.size(), 2U);
    // 100*(20*t^3 - 30*t^2 + 12*t - 1): without t = 0.5, 20*t^2 - 20*t + 2 = 0.
    EXPECT_NEAR(c.bezierParameters[0], 0.5 - std::sqrt(0.15), 1e-12);
    EXPECT_NEAR(c.bezierParameters[1], 0.5 + std::sqrt(0.15), 1e-12);
}

TEST(LineIntersection, ReportsAnyRealLineParameter)
{
    const Crossings c = Intersect(sCurve, {150.0, 1000.0}, {150.0, 1500.0}, false);
    EXPECT_EQ(c.bezierParameters, Parameters{0.5});
    EXPECT_EQ(c.lineParameters, Parameters{-2.0});
}

TEST(LineIntersection, OfIntegersConvertsThemExactly)
{
    const Crossings c = Intersect(sCurveInteger, POINT{0, 0}, POINT{300, 0}, true);
    EXPECT_EQ(c.bezierParameters, (Parameters{0.5, 1.0}));
    EXPECT_EQ(c.lineParameters, (Parameters{0.5, 1.0}));
    EXPECT_FALSE(Intersect(sCurveInteger, POINT{7, 7}, POINT{7, 7}, true).found);

    // Differences of control points and of the line's ends go beyond 32 bits.
    constexpr POINT wide[4] = {{-2000000000, 0}, {2000000000, 3}, {-2000000000, 6}, {2000000000, 9}};
    const Crossings w = Intersect(wide, POINT{1500000000, -2000000000}, POINT{1500000000, 2000000000}, false);
    ASSERT_EQ(w.bezierParameters.size(), 1U);
    const double t = w.bezierParameters[0];
    EXPECT_NEAR(((16e9 * t - 24e9) * t + 12e9) * t - 2e9, 1.5e9, 1.0);
    EXPECT_NEAR(w.lineParameters[0], 0.5 + 9.0 * t / 4e9, 1e-15);
}

TEST(LineIntersection, OfNaNFindsNothing)
{
    EXPECT_FALSE(Intersect(sCurve, {0.0, 0.0}, {nan, 1.0}, true).found);
    EXPECT_FALSE(CrossesSegment(sCurve, {0.0, 0.0}, {nan, 1.0}));
    EXPECT_FALSE(Intersect(sCurve, {0.0, -infinity}, {0.0, infinity}, true).found);
}

TEST(IntersectionsAtX, FindsNothingBeyondTheCurve)
{
    Parameters parameters;
    EXPECT_FALSE(FindBezierIntersectionsAtX(sCurve, 301.0, parameters, true));
    EXPECT_FALSE(FindBezierIntersectionsAtX(sCurve, -1.0, parameters, true));
    EXPECT_TRUE(parameters.empty());
}

TEST(IntersectionsAtX, Appends)
{
    Parameters parameters;
    EXPECT_TRUE(FindBezierIntersectionsAtX(sCurve, 75.0, parameters, false));
    EXPECT_TRUE(FindBezierIntersectionsAtX(sCurve, 225.0, parameters, false));
    EXPECT_EQ(parameters, (Parameters{0.25, 0.75}));
    EXPECT_TRUE(FindBezierIntersectionsAtX(sCurve, 301.0, parameters, false));
    EXPECT_EQ(parameters, (Parameters{0.25, 0.75}));
}

TEST(IntersectionsAtX, CountsTheEndsOnRequest)
{
    Parameters parameters;
    EXPECT_FALSE(FindBezierIntersectionsAtX(sCurve, 0.0, parameters, false));
    EXPECT_FALSE(FindBezierIntersectionsAtX(sCurve, 300.0, parameters, false));
    EXPECT_TRUE(FindBezierIntersectionsAtX(sCurve, 0.0, parameters, true));
    EXPECT_TRUE(FindBezierIntersectionsAtX(sCurve, 300.0, parameters, true));
    EXPECT_EQ(parameters, (Parameters{0.0, 1.0}));
}

TEST(IntersectionsAtX, ListsThemInAscendingOrder)
{
    // x = 0, 300, -200, 100 crosses x = 50 three times; the middle one is on a cut, x = 40 moves it off.
    constexpr point2d curve[4] = {{0.0, 0.0}, {300.0, 10.0}, {-200.0, 20.0}, {100.0, 30.0}};
    Parameters parameters;
    ASSERT_TRUE(FindBezierIntersectionsAtX(curve, 40.0, parameters, false));
    ASSERT_EQ(parameters.size(), 3U);
    EXPECT_LT(parameters[0], parameters[1]);
    EXPECT_LT(parameters[1], parameters[2]);
    for (const double t : parameters)
        EXPECT_NEAR(((1600.0 * t - 2400.0) * t + 900.0) * t, 40.0, 1e-9);
}

TEST(SegmentIntersection, IsClosedAtTheEndsOfTheSegment)
{
    // The curve passes (150, 0) at t = 0.5 exactly.
    EXPECT_TRUE(CrossesSegment(sCurve, {150.0, 0.0}, {150.0, 128.0}));
    EXPECT_TRUE(CrossesSegment(sCurve, {150.0, -128.0}, {150.0, 0.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {150.0, 0x1p-40}, {150.0, 128.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {150.0, -128.0}, {150.0, -0x1p-40}));
    EXPECT_TRUE(CrossesSegment(sCurve, {150.0, -1.0}, {150.0, 1.0}));
}

TEST(SegmentIntersection, IsOpenAtTheEndsOfTheCurve)
{
    EXPECT_FALSE(CrossesSegment(sCurve, {300.0, 0.0}, {400.0, 100.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {300.0, -50.0}, {300.0, 50.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {0.0, -50.0}, {0.0, 50.0}));
}

TEST(SegmentIntersection, DoesNotGoBeyondTheSegment)
{
    EXPECT_FALSE(CrossesSegment(sCurve, {150.0, 200.0}, {150.0, 100.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {150.0, 100.0}, {150.0, 200.0}));
}

TEST(SegmentIntersection, LooksAtEachCrossing)
{
    // The line y = 10 crosses at about x = 3.5 and x = 146.6; the segment holds the second only.
    EXPECT_TRUE(CrossesSegment(sCurve, {100.0, 10.0}, {200.0, 10.0}));
    EXPECT_TRUE(CrossesSegment(sCurve, {0.0, 10.0}, {100.0, 10.0}));
    EXPECT_FALSE(CrossesSegment(sCurve, {10.0, 10.0}, {140.0, 10.0}));
}

TEST(SegmentIntersection, OfASegmentWithoutLengthIsFalse)
{
    EXPECT_FALSE(CrossesSegment(sCurve, {150.0, 0.0}, {150.0, 0.0}));
}

TEST(SegmentIntersection, OfIntegersIsTheSame)
{
    constexpr POINT through[2] = {{150, -1}, {150, 1}};
    constexpr POINT touching[2] = {{150, 0}, {150, 128}};
    constexpr POINT beyond[2] = {{150, 1}, {150, 128}};
    EXPECT_TRUE(DoesBezierIntersectLineSegment(sCurveInteger, through));
    EXPECT_TRUE(DoesBezierIntersectLineSegment(sCurveInteger, touching));
    EXPECT_FALSE(DoesBezierIntersectLineSegment(sCurveInteger, beyond));

    constexpr POINT wide[4] = {{-2000000000, 0}, {2000000000, 3}, {-2000000000, 6}, {2000000000, 9}};
    constexpr POINT across[2] = {{1500000000, -2000000000}, {1500000000, 2000000000}};
    EXPECT_TRUE(DoesBezierIntersectLineSegment(wide, across));
}

} // namespace

} // namespace ZarnMath::CubicBezier
