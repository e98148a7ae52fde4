#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>

namespace ZarnMath::CubicBezier {

namespace {

constexpr double untouched = -77.0;

/// The stated decimals of a parameter.
constexpr double parameterDigits = 5e-6;

constexpr Cubic loop{{{0.0, 0.0}, {300.0, 300.0}, {-100.0, 300.0}, {200.0, 0.0}}};
constexpr Cubic closed{{{0.0, 0.0}, {300.0, 300.0}, {-300.0, 300.0}, {0.0, 0.0}}};
constexpr Cubic wave{{{0.0, 0.0}, {100.0, 300.0}, {200.0, -300.0}, {300.0, 0.0}}};
constexpr Cubic bend{{{0.0, 0.0}, {100.0, 0.0}, {200.0, 100.0}, {300.0, 100.0}}};
constexpr Cubic parabola{{{0.0, 0.0}, {200.0, 400.0}, {400.0, 400.0}, {600.0, 0.0}}};
/// Returns to its start at t = 1/2.
constexpr Cubic backToStart{{{0.0, 0.0}, {-3.0, -19.0}, {-2.0, 15.0}, {15.0, 12.0}}};
/// Passes its end at t = 1/4.
constexpr Cubic aheadOfEnd{{{0.0, 0.0}, {-19.0, -20.0}, {-20.0, -10.0}, {-11.0, -10.0}}};

Cubic Scaled(const Cubic& c, double s)
{
    Cubic scaled;
    for (std::size_t i = 0; i < 4; ++i)
        scaled[i] = {c[i].x * s, c[i].y * s};
    return scaled;
}

/// The four bounds of the predicate, filled with a sentinel before.
struct Bounds
{
    double lateStart = untouched;
    double lateEnd = untouched;
    double earlyStart = untouched;
    double earlyEnd = untouched;
    bool result;

    template <typename P>
    explicit Bounds(const CubicOf<P>& c, bool allowClosed = true)
        : result(DoesBezierSelfIntersect(c.data(), lateStart, lateEnd, earlyStart, earlyEnd, allowClosed))
    {}

    [[nodiscard]] bool AreUntouched() const
    {
        return lateStart == untouched && lateEnd == untouched && earlyStart == untouched && earlyEnd == untouched;
    }

    friend bool operator==(const Bounds&, const Bounds&) = default;
};

/// The crossing, filled with a sentinel before.
struct Crossing
{
    double first = untouched;
    double second = untouched;
    point2d point{untouched, untouched};
    bool found;

    template <typename P>
    explicit Crossing(const CubicOf<P>& c) : found(FindBezierSelfIntersection(c.data(), first, second, point))
    {}

    [[nodiscard]] bool IsUntouched() const
    {
        return first == untouched && second == untouched && point == point2d{untouched, untouched};
    }

    friend bool operator==(const Crossing&, const Crossing&) = default;
};

TEST(SelfIntersection, OfALoopIsBracketed)
{
    const Bounds b(loop, false);
    ASSERT_TRUE(b.result);
    EXPECT_NEAR(b.lateStart, 0.62204, parameterDigits);
    EXPECT_EQ(b.lateEnd, 1.0);
    EXPECT_EQ(b.earlyStart, 0.0);
    EXPECT_NEAR(b.earlyEnd, 0.37796, parameterDigits);
}

TEST(SelfIntersection, OfALoopIsFound)
{
    const Crossing c(loop);
    ASSERT_TRUE(c.found);
    EXPECT_NEAR(c.first, 0.82733, parameterDigits);
    EXPECT_NEAR(c.second, 0.17267, parameterDigits);
    EXPECT_NEAR(c.point.x, 100.0, 0.05);
    EXPECT_NEAR(c.point.y, 128.57, 0.005);
}

TEST(SelfIntersection, DoesNotDependOnTheScale)
{
    const Crossing c(Scaled(loop, 10.0));
    ASSERT_TRUE(c.found);
    EXPECT_NEAR(c.first, 0.82733, parameterDigits);
    EXPECT_NEAR(c.second, 0.17267, parameterDigits);
    EXPECT_NEAR(c.point.x, 1000.0, 0.05);
    EXPECT_NEAR(c.point.y, 1285.7, 0.05);
}

TEST(SelfIntersection, OfIntegersIsTheSameToTheBit)
{
    constexpr IntegerCubic integers{{{0, 0}, {300, 300}, {-100, 300}, {200, 0}}};
    EXPECT_EQ(Bounds(integers), Bounds(loop));
    EXPECT_EQ(Crossing(integers), Crossing(loop));
    // The differences of these control points go beyond 32 bits.
    constexpr IntegerCubic wide{
        {{-1000000000, 0}, {2000000000, 2000000000}, {-2000000000, 2000000000}, {1000000000, 0}}};
    constexpr Cubic same{{{-1e9, 0.0}, {2e9, 2e9}, {-2e9, 2e9}, {1e9, 0.0}}};
    EXPECT_TRUE(Bounds(wide).result);
    EXPECT_EQ(Bounds(wide), Bounds(same));
    EXPECT_EQ(Crossing(wide), Crossing(same));
}

TEST(SelfIntersection, OfAClosedCurveCountsOnRequest)
{
    const Bounds open(closed, false);
    EXPECT_FALSE(open.result);
    EXPECT_TRUE(open.AreUntouched());
    const Bounds b(closed, true);
    ASSERT_TRUE(b.result);
    EXPECT_EQ(b.lateStart, 1.0);
    EXPECT_EQ(b.lateEnd, 1.0);
    EXPECT_EQ(b.earlyStart, 0.0);
    EXPECT_EQ(b.earlyEnd, 0.0);
    const Crossing c(closed);
    ASSERT_TRUE(c.found);
    EXPECT_EQ(c.first, 0.0);
    EXPECT_EQ(c.second, 1.0);
    EXPECT_EQ(c.point, closed[0]);
}

TEST(SelfIntersection, TakesEndsThatAreNearEqualForClosed)
{
    Cubic near = closed;
    near[3].x = 0x1p-52;
    EXPECT_FALSE(Bounds(near, false).result);
    near[3].x = 0x1p-51;
    EXPECT_TRUE(Bounds(near, false).result);
}

TEST(SelfIntersection, AtTheStartIsAnEarlyExitWithTheSmallerParameterFirst)
{
    ASSERT_EQ(Evaluate(ToPowerForm(backToStart.data()), 0.5), backToStart[0]);
    const Bounds b(backToStart);
    ASSERT_TRUE(b.result);
    EXPECT_NEAR(b.lateStart, 0.5, 1e-15);
    EXPECT_TRUE(IsNearEqual(b.lateStart, b.lateEnd));
    EXPECT_FALSE(IsNearEqual(b.earlyStart, b.earlyEnd));
    const Crossing c(backToStart);
    ASSERT_TRUE(c.found);
    EXPECT_EQ(c.first, 0.0);
    EXPECT_EQ(c.second, b.lateStart);
    EXPECT_EQ(c.point, backToStart[0]);
}

TEST(SelfIntersection, AtTheEndIsAnEarlyExitWithTheSmallerParameterFirst)
{
    ASSERT_EQ(Evaluate(ToPowerForm(aheadOfEnd.data()), 0.25), aheadOfEnd[3]);
    const Bounds b(aheadOfEnd);
    ASSERT_TRUE(b.result);
    EXPECT_NEAR(b.earlyStart, 0.25, 1e-15);
    EXPECT_TRUE(IsNearEqual(b.earlyStart, b.earlyEnd));
    EXPECT_FALSE(IsNearEqual(b.lateStart, b.lateEnd));
    const Crossing c(aheadOfEnd);
    ASSERT_TRUE(c.found);
    EXPECT_EQ(c.first, b.earlyStart);
    EXPECT_EQ(c.second, 1.0);
    EXPECT_EQ(c.point, aheadOfEnd[3]);
}

TEST(SelfIntersection, DoesNotOccurWithInflections)
{
    const Bounds b(wave);
    EXPECT_FALSE(b.result);
    EXPECT_TRUE(b.AreUntouched());
    EXPECT_TRUE(Crossing(wave).IsUntouched());
    EXPECT_FALSE(Crossing(wave).found);
}

TEST(SelfIntersection, DoesNotOccurWithoutALoop)
{
    const Bounds b(bend);
    EXPECT_FALSE(b.result);
    EXPECT_TRUE(b.AreUntouched());
    EXPECT_FALSE(Crossing(bend).found);
    EXPECT_TRUE(Crossing(bend).IsUntouched());
}

TEST(SelfIntersection, DoesNotOccurOnDegenerateCurves)
{
    constexpr Cubic straight{{{0.0, 0.0}, {100.0, 100.0}, {-50.0, -50.0}, {80.0, 80.0}}};
    constexpr Cubic point{{{5.0, 5.0}, {5.0, 5.0}, {5.0, 5.0}, {5.0, 5.0}}};
    Cubic broken = loop;
    broken[2].y = nan;
    for (const Cubic& c : {parabola, straight, point, broken}) {
        const Bounds b(c);
        EXPECT_FALSE(b.result);
        EXPECT_TRUE(b.AreUntouched());
        EXPECT_FALSE(Crossing(c).found);
    }
}

TEST(SelfIntersection, IsRejectedWhereTheReversedCurveAloneRoundsToStraight)
{
    // All but straight, so that rounding makes the two cross products unlike: one is 0 and the other is not.
    constexpr Cubic flat{{{-0x1.57767d18d27b4p-2, 0x1.1c3171c8a9fp-8},
                          {-0x1.a5ed9033edafep-3, -0x1.5d467c5d4f918p-11},
                          {-0x1.d058bf0bafd6ep-3, 0x1.1a4208a4522ap-13},
                          {-0x1.42495561ef36p-3, -0x1.4ddeaed629732p-9}}};
    const PowerForm f = ToPowerForm(flat.data());
    const Cubic reversed = {flat[3], flat[2], flat[1], flat[0]};
    const PowerForm g = ToPowerForm(reversed.data());
    ASSERT_NE(Cross(f.a, f.b), 0.0);
    ASSERT_EQ(Cross(point2d{-f.a.x, -f.a.y}, g.b), 0.0);
    const Bounds b(flat);
    EXPECT_FALSE(b.result);
    EXPECT_TRUE(b.AreUntouched());
}

/// A piece of the loop, which crosses itself at about 0.17 and 0.83 of the whole.
Cubic PieceOfLoop(double t0, double t1)
{
    Cubic piece;
    Subsection(t0, t1, loop.data(), piece.data());
    return piece;
}

TEST(SelfIntersection, BeyondTheEndIsRejectedWithResultsWritten)
{
    // The first tenth lacks both passes. Its tangents from P0 are those of the whole, at ten times the parameter.
    const Bounds b(PieceOfLoop(0.0, 0.1));
    EXPECT_FALSE(b.result);
    EXPECT_NEAR(std::min(b.lateStart, b.lateEnd), 10.0 * 0.62204, 10.0 * parameterDigits);
    EXPECT_GT(std::min(b.earlyStart, b.earlyEnd), 1.0);
}

TEST(SelfIntersection, BeforeTheStartIsRejectedWithResultsWritten)
{
    const Bounds b(PieceOfLoop(0.9, 1.0));
    EXPECT_FALSE(b.result);
    EXPECT_LT(std::max(b.lateStart, b.lateEnd), 0.0);
    EXPECT_NEAR(std::max(b.earlyStart, b.earlyEnd), 1.0 - 10.0 * 0.62204, 10.0 * parameterDigits);
}

TEST(SelfIntersection, WithAnEndInsideTheLoopIsRejectedUntouched)
{
    // No tangent runs through a point that the loop encloses.
    EXPECT_FALSE(Bounds(PieceOfLoop(0.0, 0.5)).result);
    EXPECT_TRUE(Bounds(PieceOfLoop(0.0, 0.5)).AreUntouched());
    EXPECT_FALSE(Bounds(PieceOfLoop(0.5, 1.0)).result);
    EXPECT_TRUE(Bounds(PieceOfLoop(0.5, 1.0)).AreUntouched());
}

TEST(SelfIntersection, LeavesRejectedCurvesUnfound)
{
    for (const Cubic& piece : {PieceOfLoop(0.0, 0.1), PieceOfLoop(0.9, 1.0), PieceOfLoop(0.0, 0.5)}) {
        EXPECT_FALSE(Crossing(piece).found);
        EXPECT_TRUE(Crossing(piece).IsUntouched());
    }
}

TEST(SelfIntersection, OfACuspIsNone)
{
    // AB = 27, AC = -18 and BC = 9 times 100^2: 9*AC^2 equals 12*AB*BC, and the cusp is at t = 1/3.
    constexpr Cubic cusp{{{0.0, 0.0}, {-100.0, -200.0}, {-100.0, -100.0}, {300.0, 300.0}}};
    const Bounds b(cusp);
    EXPECT_FALSE(b.result);
    EXPECT_TRUE(b.AreUntouched());
}

/// 12*AB*BC - 9*AC^2 in whole numbers.
std::int64_t LoopDiscriminant(const std::int64_t (&x)[4], const std::int64_t (&y)[4])
{
    const std::int64_t ax = x[3] - 3 * (x[2] - x[1]) - x[0];
    const std::int64_t ay = y[3] - 3 * (y[2] - y[1]) - y[0];
    const std::int64_t bx = 3 * (x[0] + x[2] - 2 * x[1]);
    const std::int64_t by = 3 * (y[0] + y[2] - 2 * y[1]);
    const std::int64_t cx = 3 * (x[1] - x[0]);
    const std::int64_t cy = 3 * (y[1] - y[0]);
    const std::int64_t ab = ax * by - ay * bx;
    const std::int64_t ac = ax * cy - ay * cx;
    const std::int64_t bc = bx * cy - by * cx;
    return 12 * ab * bc - 9 * ac * ac;
}

TEST(SelfIntersection, BeginsRightBesideTheCusp)
{
    int loops = 0;
    int waves = 0;
    for (std::int64_t dx = -3; dx <= 3; ++dx)
        for (std::int64_t dy = -3; dy <= 3; ++dy) {
            const std::int64_t x[4] = {0, -100, -100 + dx, 300};
            const std::int64_t y[4] = {0, -200, -100 + dy, 300};
            Cubic c;
            for (std::size_t i = 0; i < 4; ++i)
                c[i] = {static_cast<double>(x[i]), static_cast<double>(y[i])};
            const std::int64_t discriminant = LoopDiscriminant(x, y);
            EXPECT_EQ(Bounds(c).result, discriminant > 0) << dx << ' ' << dy;
            loops += discriminant > 0 ? 1 : 0;
            waves += discriminant < 0 ? 1 : 0;
        }
    EXPECT_GT(loops, 10);
    EXPECT_GT(waves, 10);
}

TEST(SelfIntersection, OfASmallLoopIsDetectedAndNotFound)
{
    constexpr Cubic small{{{0.0, 0.0}, {30.0, 30.0}, {-10.0, 30.0}, {20.0, 0.0}}};
    EXPECT_TRUE(Bounds(small).result);
    const Crossing c(small);
    EXPECT_FALSE(c.found);
    EXPECT_TRUE(c.IsUntouched());
}

TEST(BeziersIntersect, WhereTheyShareAnEnd)
{
    const point2d shared = wave[0];
    const Cubic away{{shared, {-100.0, 300.0}, {-200.0, 300.0}, {-300.0, 0.0}}};
    const auto reversed = [](const Cubic& c) { return Cubic{{c[3], c[2], c[1], c[0]}}; };
    EXPECT_TRUE(DoBeziersIntersect(wave.data(), away.data()));
    EXPECT_TRUE(DoBeziersIntersect(reversed(wave).data(), away.data()));
    EXPECT_TRUE(DoBeziersIntersect(wave.data(), reversed(away).data()));
    EXPECT_TRUE(DoBeziersIntersect(reversed(wave).data(), reversed(away).data()));
    std::vector<double> first;
    std::vector<double> second;
    std::vector<point2d> points;
    FindBezierIntersections(wave.data(), away.data(), first, second, points);
    EXPECT_TRUE(points.empty());
}

TEST(BeziersIntersect, WithEndsThatAreExactlyEqualOnly)
{
    Cubic away{{{0.0, 0x1p-60}, {-100.0, 300.0}, {-200.0, 300.0}, {-300.0, 0.0}}};
    EXPECT_FALSE(DoBeziersIntersect(wave.data(), away.data()));
    away[0] = {-0.0, 0.0};
    EXPECT_TRUE(DoBeziersIntersect(wave.data(), away.data()));
    away[0] = {nan, nan};
    away[3] = {nan, nan};
    EXPECT_FALSE(DoBeziersIntersect(away.data(), away.data()));
}

TEST(BeziersIntersect, WhereTheyCross)
{
    constexpr Cubic arch{{{0.0, -50.0}, {100.0, 200.0}, {200.0, 100.0}, {300.0, -40.0}}};
    constexpr Cubic distant{{{0.0, 950.0}, {100.0, 1200.0}, {200.0, 1100.0}, {300.0, 960.0}}};
    EXPECT_TRUE(DoBeziersIntersect(wave.data(), arch.data()));
    EXPECT_FALSE(DoBeziersIntersect(wave.data(), distant.data()));
}

TEST(BeziersIntersect, OfIntegersIsTheSame)
{
    constexpr POINT one[4] = {{0, 0}, {100, 300}, {200, -300}, {300, 0}};
    constexpr POINT crossing[4] = {{0, -50}, {100, 200}, {200, 100}, {300, -40}};
    constexpr POINT distant[4] = {{0, 950}, {100, 1200}, {200, 1100}, {300, 960}};
    constexpr POINT next[4] = {{300, 0}, {400, 0}, {500, 100}, {600, 0}};
    EXPECT_TRUE(DoBeziersIntersect(one, crossing));
    EXPECT_FALSE(DoBeziersIntersect(one, distant));
    EXPECT_TRUE(DoBeziersIntersect(one, next));
}

} // namespace

} // namespace ZarnMath::CubicBezier
