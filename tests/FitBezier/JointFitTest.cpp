#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezierInternal.h"

#include "tests/FitBezier/Runs.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace ZarnMath {
namespace {

using Bezier = Guarded<point2d, 4>;

/// Two cubics with a smooth join, and points of both.
struct Joined
{
    Cubic a;
    Cubic b;
    double r; ///< the ratio of the handles at the join
    std::vector<point2d> points;
    std::vector<double> u1;
    std::vector<double> u2;

    /// @param split, rest the numbers of points of the two halves
    Joined(RandomSource& random, std::size_t split, std::size_t rest)
    {
        u1 = RandomParameters(random, split);
        u2 = RandomParameters(random, rest);
        const double end = random.Uniform(0.8, 0.95);
        for (double& v : u1)
            v *= end;
        const double start = random.Uniform(0.05, 0.2);
        for (double& v : u2)
            v = start + (1.0 - start) * v;
        r = (u1.back() - u1.front()) / (u2.back() - u2.front());
        a = RandomArch(random, 100.0);
        const vector2d handle = (a[3] - a[2]) * (1.0 / r);
        b[0] = a[3];
        b[1] = b[0] + handle;
        b[2] = b[1] + handle * 0.5 + Perpendicular(handle) * random.Uniform(-1.0, 1.0);
        b[3] = b[2] + handle + Perpendicular(handle) * random.Uniform(-1.0, 1.0);
        for (const double v : u1)
            points.push_back(BernsteinPoint(a.data(), v));
        for (const double v : u2)
            points.push_back(BernsteinPoint(b.data(), v));
    }

    [[nodiscard]] int Count() const
    {
        return static_cast<int>(points.size());
    }

    [[nodiscard]] int Split() const
    {
        return static_cast<int>(u1.size());
    }

    [[nodiscard]] vector2d Start() const
    {
        return a[1] - a[0];
    }

    [[nodiscard]] vector2d End() const
    {
        return b[3] - b[2];
    }

    void Disturb(RandomSource& random, double noise)
    {
        for (point2d& p : points)
            p = {p.x + random.Uniform(-noise, noise), p.y + random.Uniform(-noise, noise)};
    }

    bool Solve(point2d* first, point2d* second) const
    {
        return LeastSquaresSingleIteration_2Cubics(points.data(), Start(), End(), Count(), Split(), u1.data(),
                                                   u2.data(), first, second);
    }
};

Joined AnyJoined(RandomSource& random, double noise)
{
    const auto split = static_cast<std::size_t>(random.Integer(4, 15));
    Joined joined(random, split, static_cast<std::size_t>(random.Integer(4, 15)));
    joined.Disturb(random, noise);
    return joined;
}

/// Parameters of the whole run for a call of the driver.
std::vector<double> ChordLengths(const std::vector<point2d>& points)
{
    std::vector<double> u;
    Calculate_u(points.data(), static_cast<int>(points.size()), u);
    return u;
}

TEST(JointPass, OnePointInTheFirstHalfIsSingular)
{
    RandomSource random(1);
    const Joined joined(random, 1, 8);
    Bezier a;
    Bezier b;
    EXPECT_FALSE(joined.Solve(a.data(), b.data()));
    EXPECT_TRUE(a.IsUntouchedFrom(0));
    EXPECT_TRUE(b.IsUntouchedFrom(0));
}

TEST(JointPass, HandlesMayComeOutOnTheWrongSide)
{
    RandomSource random(2);
    const Joined joined(random, 8, 8);
    Bezier a;
    Bezier b;
    ASSERT_TRUE(LeastSquaresSingleIteration_2Cubics(joined.points.data(), joined.Start() * -1.0, joined.End() * -1.0,
                                                    16, 8, joined.u1.data(), joined.u2.data(), a.data(), b.data()));
    for (int i = 0; i < 4; ++i) { // two negative lengths make the same curves
        EXPECT_NEAR(a[i].x, joined.a[static_cast<std::size_t>(i)].x, 1e-6);
        EXPECT_NEAR(b[i].y, joined.b[static_cast<std::size_t>(i)].y, 1e-6);
    }
}

TEST(JointPassProperties, CurvesMeetSmoothly)
{
    RandomSource random(3);
    for (int n = 0; n < 1000; ++n) {
        const Joined joined = AnyJoined(random, 10.0);
        Bezier a;
        Bezier b;
        ASSERT_TRUE(joined.Solve(a.data(), b.data()));
        EXPECT_TRUE(a.IsIntact());
        EXPECT_TRUE(b.IsIntact());
        EXPECT_TRUE(SameBits(a[0], joined.points.front()));
        EXPECT_TRUE(SameBits(a[3], b[0]));
        EXPECT_TRUE(SameBits(b[3], joined.points.back()));
        const vector2d before = a[3] - a[2];
        const vector2d after = (b[1] - b[0]) * joined.r;
        EXPECT_NEAR(before.x, after.x, 1e-10) << n;
        EXPECT_NEAR(before.y, after.y, 1e-10) << n;
        EXPECT_NEAR(Cross(a[1] - a[0], joined.Start()), 0.0, 1e-8) << n;
        EXPECT_NEAR(Cross(b[3] - b[2], joined.End()), 0.0, 1e-8) << n;
    }
}

TEST(JointPassProperties, KnownCubicsAreFoundAgain)
{
    RandomSource random(4);
    for (int n = 0; n < 1000; ++n) {
        const Joined joined = AnyJoined(random, 0.0);
        Bezier a;
        Bezier b;
        ASSERT_TRUE(joined.Solve(a.data(), b.data()));
        for (int i = 0; i < 4; ++i) {
            const auto k = static_cast<std::size_t>(i);
            EXPECT_NEAR(a[i].x, joined.a[k].x, 1e-7) << n;
            EXPECT_NEAR(a[i].y, joined.a[k].y, 1e-7) << n;
            EXPECT_NEAR(b[i].x, joined.b[k].x, 1e-7) << n;
            EXPECT_NEAR(b[i].y, joined.b[k].y, 1e-7) << n;
        }
    }
}

TEST(JointPassProperties, JoinIsThatOfTheLeastSquares)
{
    RandomSource random(5);
    for (int n = 0; n < 1000; ++n) {
        const Joined joined = AnyJoined(random, 10.0);
        Bezier a;
        Bezier b;
        ASSERT_TRUE(joined.Solve(a.data(), b.data()));
        const auto squares = [&](const vector2d& join, const vector2d& handle) {
            const point2d first[4] = {a[0], a[1], a[2] + (join - handle * joined.r), a[3] + join};
            const point2d second[4] = {b[0] + join, b[1] + (join + handle), b[2], b[3]};
            return SumOfSquares(joined.points.data(), joined.u1.data(), 1, joined.Split(), first) +
                   SumOfSquares(joined.points.data() + joined.Split(), joined.u2.data(), 0,
                                joined.Count() - joined.Split() - 1, second);
        };
        const double least = squares({0.0, 0.0}, {0.0, 0.0});
        for (const double step : {0.03, -0.03, 2.0, -2.0}) {
            EXPECT_GT(squares({step, 0.0}, {0.0, 0.0}), least) << n;
            EXPECT_GT(squares({0.0, step}, {0.0, 0.0}), least) << n;
            EXPECT_GT(squares({0.0, 0.0}, {step, 0.0}), least) << n;
            EXPECT_GT(squares({0.0, 0.0}, {0.0, step}), least) << n;
        }
    }
}

TEST(JointPassProperties, ResidualsAlongTheOuterTangentsSumToZero)
{
    RandomSource random(6);
    int notLeast = 0;
    for (int n = 0; n < 1000; ++n) {
        const Joined joined = AnyJoined(random, 10.0);
        Bezier a;
        Bezier b;
        ASSERT_TRUE(joined.Solve(a.data(), b.data()));
        vector2d first{0.0, 0.0};
        double weighted = 0.0; // as the normal equation of that handle would have it
        for (std::size_t i = 1; i < joined.u1.size(); ++i) {
            const double v = joined.u1[i];
            const vector2d residual = BernsteinPoint(a.data(), v) - joined.points[i];
            first = first + residual;
            weighted += Dot(residual, joined.Start()) * 3.0 * v * (1.0 - v) * (1.0 - v);
        }
        vector2d second{0.0, 0.0};
        for (std::size_t i = 0; i + 1 < joined.u2.size(); ++i)
            second = second + (BernsteinPoint(b.data(), joined.u2[i]) - joined.points[joined.u1.size() + i]);
        EXPECT_NEAR(Dot(first, joined.Start()), 0.0, 1e-6) << n;
        EXPECT_NEAR(Dot(second, joined.End()), 0.0, 1e-6) << n;
        notLeast += std::fabs(weighted) > 1.0 ? 1 : 0;
    }
    EXPECT_GT(notLeast, 900);
}

TEST(JointFit, FewerThanFivePointsWriteNothing)
{
    const point2d points[4] = {{0.0, 0.0}, {1.0, 1.0}, {2.0, 1.0}, {3.0, 0.0}};
    double u[4] = {0.5, 0.6, 0.7, 0.8};
    Bezier a;
    Bezier b;
    EXPECT_EQ(LeastSquares(points, u, 4, 2, {1.0, 1.0}, {1.0, -1.0}, a.data(), b.data(), 5), largestDouble);
    EXPECT_EQ(LeastSquares(points, 4, 2, {1.0, 1.0}, {1.0, -1.0}, a.data(), b.data(), 5), largestDouble);
    EXPECT_TRUE(a.IsUntouchedFrom(0));
    EXPECT_TRUE(b.IsUntouchedFrom(0));
    EXPECT_EQ(u[0], 0.5);
    EXPECT_EQ(u[3], 0.8);
}

TEST(JointFit, NoPassLeavesTheCurves)
{
    RandomSource random(7);
    const Joined joined(random, 5, 5);
    for (const int iterations : {0, -1}) {
        Bezier a;
        Bezier b;
        std::vector<double> u = ChordLengths(joined.points);
        EXPECT_EQ(LeastSquares(joined.points.data(), u.data(), 10, 5, joined.Start(), joined.End(), a.data(), b.data(),
                               iterations),
                  largestDouble);
        EXPECT_TRUE(a.IsUntouchedFrom(0));
        EXPECT_TRUE(b.IsUntouchedFrom(0));
    }
}

TEST(JointFit, SingularFirstPassMeasuresTheCurvesOfTheCaller)
{
    // Both of the caller's curves are level; the points of the second half lie 3 above and 4 below.
    const point2d points[6] = {{0.0, 0.0}, {100.0, 3.0}, {140.0, -4.0}, {160.0, 0.0}, {180.0, 0.0}, {200.0, 0.0}};
    double u[6] = {0.0, 0.5, 0.625, 0.75, 0.875, 1.0};
    const Cubic level = {{{50.0, 0.0}, {100.0, 0.0}, {150.0, 0.0}, {200.0, 0.0}}};
    Cubic a = level;
    Cubic b = level;
    EXPECT_EQ(LeastSquares(points, u, 6, 1, {1.0, 0.0}, {1.0, 0.0}, a.data(), b.data(), 1), 16.0);
    EXPECT_EQ(a, level);
    EXPECT_EQ(b, level);
}

TEST(JointFit, NegativeHalvesAreALengthError)
{
    RandomSource random(8);
    const Joined joined(random, 5, 5);
    for (const int split : {-1, 11, std::numeric_limits<int>::min() + 10}) {
        Bezier a;
        Bezier b;
        std::vector<double> u = ChordLengths(joined.points);
        EXPECT_THROW(LeastSquares(joined.points.data(), u.data(), 10, split, joined.Start(), joined.End(), a.data(),
                                  b.data(), 5),
                     std::length_error);
        EXPECT_THROW(LeastSquares(joined.points.data(), 10, split, joined.Start(), joined.End(), a.data(), b.data(), 5),
                     std::length_error);
        EXPECT_TRUE(a.IsUntouchedFrom(0));
        EXPECT_TRUE(b.IsUntouchedFrom(0));
    }
    Bezier a;
    EXPECT_THROW(LeastSquares(joined.points.data(), 0, 0, joined.Start(), joined.End(), a.data(), a.data(), 5),
                 std::length_error);
}

TEST(JointFit, SecondHalfOfOnePoint)
{
    RandomSource random(9);
    const Joined joined(random, 9, 4);
    Bezier a;
    Bezier b;
    std::vector<double> u = ChordLengths(joined.points);
    LeastSquares(joined.points.data(), u.data(), 13, 12, joined.Start(), joined.End(), a.data(), b.data(), 3);
    EXPECT_TRUE(a.IsIntact());
    EXPECT_TRUE(b.IsIntact());
}

TEST(JointFit, ParametersOfTheCallerAreNormalisedOnly)
{
    RandomSource random(10);
    const Joined joined(random, 5, 4);
    std::vector<double> u{1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0, 9.0};
    Bezier a;
    Bezier b;
    LeastSquares(joined.points.data(), u.data(), 9, 5, joined.Start(), joined.End(), a.data(), b.data(), 4);
    EXPECT_EQ(u, (std::vector<double>{0.0, 0.125, 0.25, 0.375, 0.5, 0.625, 0.75, 0.875, 1.0}));
}

/// The iteration in its plain form, from normalised parameters.
struct PlainFit
{
    Cubic a;
    Cubic b;
    double error = largestDouble;
    int rejected = 0;

    PlainFit(const std::vector<point2d>& points, const std::vector<double>& u, int split, const vector2d& t1,
             const vector2d& t2, int iterations, const Cubic& start)
        : a(start), b(start)
    {
        const int n = static_cast<int>(points.size());
        const auto at = u.begin() + split;
        const double join = (at[-1] + at[0]) * 0.5;
        std::vector<double> u1(u.begin(), at);
        std::vector<double> u2(at, u.end());
        for (double& v : u1)
            v = v / join;
        for (double& v : u2)
            v = (v - join) / (1.0 - join);
        const BoundsT<double> box = GetPointsBBox(points.data(), n);
        Cubic nextA = start;
        Cubic nextB = start;
        for (int i = 0; i < iterations; ++i) {
            const bool ok = LeastSquaresSingleIteration_2Cubics(points.data(), t1, t2, n, split, u1.data(), u2.data(),
                                                                nextA.data(), nextB.data());
            const double e1 = Reparameterize_u(points.data(), nextA.data(), u1.data(), split, nullptr, box);
            const double e2 = Reparameterize_u(points.data() + split, nextB.data(), u2.data(), n - split, nullptr, box);
            const double larger = e1 > e2 ? e1 : e2;
            if (i == 0 || (ok && larger < error)) {
                a = nextA;
                b = nextB;
                error = larger;
            } else {
                ++rejected;
                if (larger > error + error)
                    break;
            }
        }
    }
};

TEST(JointFitProperties, IsThePlainIteration)
{
    RandomSource random(11);
    int rejected = 0;
    for (int n = 0; n < 600; ++n) {
        const Joined joined = AnyJoined(random, random.Uniform(0.0, 15.0));
        const int split = random.Integer(2, joined.Count() - 2);
        const int iterations = random.Integer(1, 10);
        const Cubic start = RandomArch(random, 50.0);
        std::vector<double> u = ChordLengths(joined.points);
        const PlainFit plain(joined.points, u, split, joined.Start(), joined.End(), iterations, start);
        rejected += plain.rejected;
        Cubic a = start;
        Cubic b = start;
        const double error = LeastSquares(joined.points.data(), joined.Count(), split, joined.Start(), joined.End(),
                                          a.data(), b.data(), iterations);
        EXPECT_TRUE(SameBits(error, plain.error)) << n;
        EXPECT_TRUE(SameBits(a.data(), plain.a.data(), 4)) << n;
        EXPECT_TRUE(SameBits(b.data(), plain.b.data(), 4)) << n;
        Cubic drivenA = start;
        Cubic drivenB = start;
        EXPECT_TRUE(SameBits(LeastSquares(joined.points.data(), u.data(), joined.Count(), split, joined.Start(),
                                          joined.End(), drivenA.data(), drivenB.data(), iterations),
                             error));
        EXPECT_TRUE(SameBits(drivenA.data(), a.data(), 4));
        EXPECT_TRUE(SameBits(drivenB.data(), b.data(), 4));
    }
    EXPECT_GT(rejected, 100);
}

TEST(JointFitProperties, KnownCubicsAreFoundFromTheirParameters)
{
    // The parameters of the halves end 1/16 before the join and begin 1/16 behind it, so that the join is where the driver
    // puts it, halfway between, and the handles there are equal.
    RandomSource random(13);
    for (int n = 0; n < 500; ++n) {
        Cubic a = RandomArch(random, 100.0);
        Cubic b = RandomArch(random, 100.0);
        const vector2d toJoin = a[3] - b[0];
        for (point2d& p : b)
            p = p + toJoin;
        b[1] = b[0] + (a[3] - a[2]);
        std::vector<point2d> points;
        std::vector<double> u;
        for (const double v : RandomParameters(random, 12)) {
            points.push_back(BernsteinPoint(a.data(), v * 0.9375));
            u.push_back(v * 0.9375 * 0.5);
        }
        for (const double v : RandomParameters(random, 12)) {
            points.push_back(BernsteinPoint(b.data(), 0.0625 + v * 0.9375));
            u.push_back(0.5 + (0.0625 + v * 0.9375) * 0.5);
        }
        Bezier first;
        Bezier second;
        LeastSquares(points.data(), u.data(), 24, 12, a[1] - a[0], b[3] - b[2], first.data(), second.data(), 1);
        for (int i = 0; i < 4; ++i) {
            const auto k = static_cast<std::size_t>(i);
            EXPECT_NEAR(first[i].x, a[k].x, 1e-7) << n;
            EXPECT_NEAR(first[i].y, a[k].y, 1e-7) << n;
            EXPECT_NEAR(second[i].x, b[k].x, 1e-7) << n;
            EXPECT_NEAR(second[i].y, b[k].y, 1e-7) << n;
        }
    }
}

TEST(JointFitProperties, MorePassesAreNeverWorse)
{
    RandomSource random(12);
    for (int n = 0; n < 200; ++n) {
        const Joined joined = AnyJoined(random, 3.0);
        double previous = largestDouble;
        for (const int iterations : {1, 2, 4, 8}) {
            Bezier a;
            Bezier b;
            const double error = LeastSquares(joined.points.data(), joined.Count(), joined.Split(), joined.Start(),
                                              joined.End(), a.data(), b.data(), iterations);
            EXPECT_LE(error, previous) << n;
            previous = error;
        }
    }
}

} // namespace
} // namespace ZarnMath
