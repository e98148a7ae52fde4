#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezierInternal.h"

#include "tests/FitBezier/Runs.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace ZarnMath {
namespace {

constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
constexpr vector2d archStart{100.0, 300.0};
constexpr vector2d archEnd{100.0, -300.0};
/// Chord lengths of the arch at the quarters are no multiples of each other; these parameters are.
constexpr double quarters[5] = {0.0, 0.25, 0.5, 0.75, 1.0};

using Bezier = Guarded<point2d, 4>;

std::vector<point2d> SampleArch(const double* u, int n)
{
    std::vector<point2d> points;
    for (int i = 0; i < n; ++i)
        points.push_back(BernsteinPoint(arch.data(), u[i]));
    return points;
}

void ExpectNear(const point2d& actual, const point2d& expected, double tolerance)
{
    EXPECT_NEAR(actual.x, expected.x, tolerance);
    EXPECT_NEAR(actual.y, expected.y, tolerance);
}

void ExpectCurve(const point2d* actual, const Cubic& expected, double tolerance)
{
    for (std::size_t i = 0; i < 4; ++i) {
        SCOPED_TRACE(i);
        ExpectNear(actual[i], expected[i], tolerance);
    }
}

// One pass, with tangents.

TEST(TangentPass, TwoPointsTakeTheTangentsAtFullLength)
{
    const point2d points[2] = {{0.0, 0.0}, {30.0, 0.0}};
    Bezier bezier;
    EXPECT_FALSE(LeastSquaresSingleIteration(points, quarters, 2, {1.0, 2.0}, {3.0, -4.0}, bezier.data()));
    EXPECT_EQ(bezier[0], points[0]);
    EXPECT_EQ(bezier[1], (point2d{1.0, 2.0}));
    EXPECT_EQ(bezier[2], (point2d{27.0, 4.0}));
    EXPECT_EQ(bezier[3], points[1]);
    EXPECT_TRUE(bezier.IsIntact());
}

TEST(TangentPass, ParallelTangentsWithOneInnerPointAreSingular)
{
    const point2d points[3] = {{0.0, 0.0}, {10.0, 5.0}, {30.0, 0.0}};
    const double u[3] = {0.0, 0.5, 1.0};
    Bezier bezier;
    EXPECT_FALSE(LeastSquaresSingleIteration(points, u, 3, {3.0, 1.0}, {6.0, 2.0}, bezier.data()));
    EXPECT_EQ(bezier[1], (point2d{3.0, 1.0}));
    EXPECT_EQ(bezier[2], (point2d{24.0, -2.0}));
}

TEST(TangentPass, TwoInnerPointsSolveParallelTangents)
{
    // An S whose ends run the same way.
    constexpr Cubic s = {{{0.0, 0.0}, {100.0, 0.0}, {50.0, 80.0}, {200.0, 80.0}}};
    std::vector<point2d> points;
    for (const double v : quarters)
        points.push_back(BernsteinPoint(s.data(), v));
    Bezier bezier;
    EXPECT_TRUE(LeastSquaresSingleIteration(points.data(), quarters, 5, {1.0, 0.0}, {1.0, 0.0}, bezier.data()));
    ExpectCurve(bezier.data(), s, 1e-10);
}

TEST(TangentPass, TangentsOfNoLengthLeaveTheHandlesAtTheEnds)
{
    const auto points = SampleArch(quarters, 5);
    Bezier bezier;
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, 0.0}, {0.0, 0.0}, bezier.data()));
    EXPECT_EQ(bezier[1], bezier[0]);
    EXPECT_EQ(bezier[2], bezier[3]);
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, 0.0}, archEnd, bezier.data()));
    EXPECT_EQ(bezier[1], bezier[0]);
    EXPECT_EQ(bezier[2], bezier[3] - archEnd);
}

TEST(TangentPass, FindsAKnownCubicAgain)
{
    const auto points = SampleArch(quarters, 5);
    for (const double length : {0.01, 1.0, 50.0}) {
        Bezier bezier;
        EXPECT_TRUE(LeastSquaresSingleIteration(points.data(), quarters, 5, archStart * length,
                                                archEnd * (1.0 / length), bezier.data()));
        EXPECT_EQ(bezier[0], arch[0]);
        EXPECT_EQ(bezier[3], arch[3]);
        ExpectCurve(bezier.data(), arch, 1e-9);
    }
}

TEST(TangentPass, HandleOnTheWrongSideIsRepaired)
{
    const auto points = SampleArch(quarters, 5); // its chord is 300 long
    Bezier bezier;
    // A short tangent gets 0.333 of its own length.
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, -3.0}, archEnd, bezier.data()));
    EXPECT_EQ(bezier[1], (point2d{0.0, -3.0 * 0.333}));
    // One that is longer than the chord gets 0.333 of the chord.
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, -1200.0}, archEnd, bezier.data()));
    EXPECT_EQ(bezier[1], (point2d{0.0, -1200.0 * (0.25 * 0.333)}));
    // One that is as long as the chord is not long.
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, -300.0}, archEnd, bezier.data()));
    EXPECT_EQ(bezier[1], (point2d{0.0, -300.0 * 0.333}));
}

TEST(TangentPass, LengthOfTheFirstTangentRulesBothRepairs)
{
    const auto points = SampleArch(quarters, 5);
    Bezier bezier;
    const vector2d back{0.0, 1200.0}; // four chords
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {1.0, 3.0}, back, bezier.data()));
    EXPECT_EQ(bezier[2], (point2d{300.0, 1200.0 * -0.333}));
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, {0.0, 1200.0}, {0.0, 3.0}, bezier.data()));
    EXPECT_EQ(bezier[2], (point2d{300.0, 3.0 * (0.25 * -0.333)}));
}

TEST(TangentPass, RepairOfOneHandleLeavesTheOther)
{
    const auto points = SampleArch(quarters, 5);
    const vector2d start{1.0, 3.0};
    Bezier straight;
    Bezier turned;
    EXPECT_TRUE(LeastSquaresSingleIteration(points.data(), quarters, 5, start, archEnd, straight.data()));
    EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), quarters, 5, start, archEnd * -1.0, turned.data()));
    ExpectNear(turned[1], straight[1], 1e-9);
    EXPECT_EQ(turned[2], (point2d{300.0 + 100.0 * 0.333, -300.0 * 0.333}));
}

TEST(TangentPass, CoincidentPointsGiveNan)
{
    const point2d points[3] = {{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}};
    const double u[3] = {0.0, nan, 1.0};
    Bezier bezier;
    LeastSquaresSingleIteration(points, u, 3, {1.0, 0.0}, {0.0, 1.0}, bezier.data());
    EXPECT_EQ(bezier[0], points[0]);
    EXPECT_TRUE(std::isnan(bezier[1].x));
    EXPECT_TRUE(std::isnan(bezier[2].y));
    EXPECT_EQ(bezier[3], points[0]);
}

TEST(TangentPassProperties, DeterminantOfOneInnerPoint)
{
    // -(v*(1-v))^6 * Cross(t1, t2)^2: singular for parallel tangents alone.
    RandomSource random(3);
    for (int n = 0; n < 500; ++n) {
        const Cubic curve = RandomArch(random, 100.0);
        const double v = random.Integer(1, 15) / 16.0;
        const double u[3] = {0.0, v, 1.0};
        const point2d points[3] = {curve[0], BernsteinPoint(curve.data(), v), curve[3]};
        Bezier bezier;
        EXPECT_TRUE(LeastSquaresSingleIteration(points, u, 3, curve[1] - curve[0], curve[3] - curve[2], bezier.data()));
        ExpectCurve(bezier.data(), curve, 1e-6);
    }
}

TEST(TangentPassProperties, NoOtherHandlesHaveSmallerSquares)
{
    RandomSource random(1);
    int sound = 0;
    for (int n = 0; n < 2000; ++n) {
        const Cubic curve = RandomArch(random, 100.0);
        const PointRun run = NoisyRun(random, curve, static_cast<std::size_t>(random.Integer(4, 30)), 10.0);
        const vector2d t1 = (curve[1] - curve[0]) * random.Uniform(0.1, 3.0);
        const vector2d t2 = (curve[3] - curve[2]) * random.Uniform(0.1, 3.0);
        Bezier bezier;
        if (!LeastSquaresSingleIteration(run.points.data(), run.u.data(), run.Count(), t1, t2, bezier.data()))
            continue;
        ++sound;
        const auto squares = [&](double alpha, double beta) {
            const point2d other[4] = {bezier[0], bezier[1] + t1 * alpha, bezier[2] + t2 * beta, bezier[3]};
            return SumOfSquares(run.points.data(), run.u.data(), 1, run.Count() - 1, other);
        };
        const double least = squares(0.0, 0.0);
        for (const double step : {1e-3, -1e-3, 0.1, -0.1}) {
            EXPECT_GT(squares(step, 0.0), least) << n;
            EXPECT_GT(squares(0.0, step), least) << n;
            EXPECT_GT(squares(step, step), least) << n;
            EXPECT_GT(squares(step, -step), least) << n;
        }
    }
    EXPECT_GT(sound, 1500);
}

// One pass, with free ends.

TEST(FreePass, FindsAKnownCubicAgain)
{
    const auto points = SampleArch(quarters, 5);
    Bezier bezier;
    EXPECT_TRUE(LeastSquaresSingleIteration(points.data(), quarters, 5, bezier.data()));
    ExpectCurve(bezier.data(), arch, 1e-8);
    EXPECT_TRUE(bezier.IsIntact());
}

TEST(FreePass, SingularSystemLeavesTheCurve)
{
    const auto points = SampleArch(quarters, 5);
    for (const double v : {0.0, 1.0}) {
        const double u[5] = {v, v, v, v, v};
        Bezier bezier;
        EXPECT_FALSE(LeastSquaresSingleIteration(points.data(), u, 5, bezier.data()));
        EXPECT_TRUE(bezier.IsUntouchedFrom(0));
    }
}

TEST(FreePass, EndsAreFittedLikeOtherPoints)
{
    auto points = SampleArch(quarters, 5);
    points[0].y += 10.0;
    Bezier bezier;
    EXPECT_TRUE(LeastSquaresSingleIteration(points.data(), quarters, 5, bezier.data()));
    EXPECT_GT(bezier[0].y, 9.0); // five points leave one degree of freedom to spread over
    EXPECT_LT(bezier[0].y, 10.0);
}

TEST(FreePass, ZeroHasNoSign)
{
    // The moments of x are the smallest numbers there are, of the sign that each product with the inverse's row for P(0)
    // underflows to a negative zero.
    constexpr double smallest = std::numeric_limits<double>::denorm_min();
    std::vector<point2d> points(1001, point2d{0.0, 1.0});
    std::vector<double> u;
    for (int i = 0; i <= 1000; ++i)
        u.push_back(i / 1000.0);
    points[990].x = smallest;                  // counts in all of them
    points[750].x = points[751].x = -smallest; // not in the cubic one
    points[700].x = points[701].x = smallest;  // not in the quadratic one either
    points[300].x = points[301].x = -smallest; // in the plain sum alone
    Bezier bezier;
    ASSERT_TRUE(LeastSquaresSingleIteration(points.data(), u.data(), 1001, bezier.data()));
    EXPECT_TRUE(SameBits(bezier[0].x, 0.0));
}

TEST(FreePassProperties, NoOtherCurveHasSmallerSquares)
{
    RandomSource random(2);
    for (int n = 0; n < 2000; ++n) {
        const Cubic curve = random.Curve(Shape::Generic, 100.0);
        const PointRun run = NoisyRun(random, curve, static_cast<std::size_t>(random.Integer(6, 30)), 10.0);
        Bezier bezier;
        ASSERT_TRUE(LeastSquaresSingleIteration(run.points.data(), run.u.data(), run.Count(), bezier.data()));
        const auto squares = [&](const Cubic& other) {
            return SumOfSquares(run.points.data(), run.u.data(), 0, run.Count(), other.data());
        };
        const Cubic fit{bezier[0], bezier[1], bezier[2], bezier[3]};
        const double least = squares(fit);
        for (std::size_t i = 0; i < 4; ++i)
            for (const double step : {0.1, -0.1, 3.0, -3.0}) {
                Cubic other = fit;
                other[i].x += step;
                EXPECT_GT(squares(other), least) << n;
                other = fit;
                other[i].y += step;
                EXPECT_GT(squares(other), least) << n;
            }
    }
}

// The iterations.

TEST(TangentFit, FewerThanTwoPointsWriteNothing)
{
    for (const int count : {1, 0, -1}) {
        const point2d point{1.0, 2.0};
        double u = sentinel<double>;
        double worst_u = sentinel<double>;
        Bezier bezier;
        EXPECT_EQ(LeastSquares(&point, &u, count, archStart, archEnd, bezier.data(), 5, &worst_u, 0.0), largestDouble);
        EXPECT_EQ(LeastSquares(&point, &u, count, bezier.data(), 5, &worst_u), largestDouble);
        EXPECT_TRUE(bezier.IsUntouchedFrom(0));
        EXPECT_EQ(u, sentinel<double>);
        EXPECT_EQ(worst_u, sentinel<double>);
    }
}

TEST(TangentFit, WrappersOfOnePointAndOfNone)
{
    const point2d point{1.0, 2.0};
    Bezier bezier;
    EXPECT_EQ(LeastSquares(&point, 1, archStart, archEnd, bezier.data(), 5), largestDouble);
    EXPECT_EQ(LeastSquares(&point, 1, bezier.data(), 5), largestDouble);
    for (const int count : {0, -1}) {
        EXPECT_THROW(LeastSquares(&point, count, archStart, archEnd, bezier.data(), 5), std::length_error);
        EXPECT_THROW(LeastSquares(&point, count, bezier.data(), 5), std::length_error);
    }
    EXPECT_TRUE(bezier.IsUntouchedFrom(0));
}

TEST(TangentFit, TwoPoints)
{
    const point2d points[2] = {{0.0, 0.0}, {30.0, 40.0}}; // 50 apart
    double u[2] = {sentinel<double>, sentinel<double>};
    double worst_u = sentinel<double>;
    Bezier bezier;
    EXPECT_EQ(LeastSquares(points, u, 2, {1.0, 0.0}, {0.0, 2.0}, bezier.data(), 5, &worst_u, 1.0), 0.0);
    EXPECT_EQ(bezier[0], points[0]);
    EXPECT_EQ(bezier[1], (point2d{50.0 / 3.0, 0.0}));
    EXPECT_EQ(bezier[2], (point2d{30.0, 40.0 - 2.0 * (50.0 / 3.0)})); // a tangent of length 2: two thirds
    EXPECT_EQ(bezier[3], points[1]);
    EXPECT_EQ(u[0], sentinel<double>);
    EXPECT_EQ(u[1], sentinel<double>);
    EXPECT_EQ(worst_u, sentinel<double>);
    Bezier wrapped;
    EXPECT_EQ(LeastSquares(points, 2, {1.0, 0.0}, {0.0, 2.0}, wrapped.data(), 5), 0.0);
    EXPECT_TRUE(SameBits(wrapped.data(), bezier.data(), 4));
}

TEST(TangentFit, ErrorEqualToTheThresholdGoesOn)
{
    RandomSource random(5);
    const Cubic curve = RandomArch(random, 100.0);
    const PointRun run = NoisyRun(random, curve, 20, 10.0);
    const vector2d t1 = curve[1] - curve[0];
    const vector2d t2 = curve[3] - curve[2];
    const auto parametersAfter = [&](int iterations, double threshold, double& error) {
        std::vector<double> u = run.u;
        Bezier bezier;
        error = LeastSquares(run.points.data(), u.data(), 20, t1, t2, bezier.data(), iterations, nullptr, threshold);
        return u;
    };
    double first = 0.0;
    double ignored = 0.0;
    const auto one = parametersAfter(1, -1.0, first);
    const auto two = parametersAfter(2, -1.0, ignored);
    ASSERT_NE(one, two);
    EXPECT_EQ(parametersAfter(2, Above(first), ignored), one);
    EXPECT_EQ(parametersAfter(2, first, ignored), two);
}

TEST(TangentFit, FirstErrorOfZeroStaysTheBest)
{
    // The inner points lie before and behind the curve, so that neither counts.
    const point2d points[4] = {{0.0, 0.0}, {-5.0, 0.0}, {305.0, 0.0}, {300.0, 0.0}};
    const vector2d along{1.0, 0.0};
    Bezier once;
    double u[4] = {0.0, 0.25, 0.75, 1.0};
    double worst_u = sentinel<double>;
    EXPECT_EQ(LeastSquares(points, u, 4, along, along, once.data(), 1, &worst_u, 1e-9), 0.0);
    for (const double threshold : {1e-9, -1.0}) {
        Bezier often;
        EXPECT_EQ(LeastSquares(points, u, 4, along, along, often.data(), 9, &worst_u, threshold), 0.0);
        EXPECT_TRUE(SameBits(often.data(), once.data(), 4));
    }
    EXPECT_EQ(worst_u, sentinel<double>);
}

TEST(TangentFit, ThreePointsMeasureAYardstickFirst)
{
    // Its curve is level, with handles of a third of the chord: x = 300*t, y = 0.
    const point2d points[3] = {{0.0, 0.0}, {120.0, 10.0}, {300.0, 0.0}};
    const vector2d along{1.0, 0.0};
    double u[3] = {0.0, 0.5, 1.0};
    double worst_u = sentinel<double>;
    Bezier bezier;
    EXPECT_EQ(LeastSquares(points, u, 3, along, along, bezier.data(), 0, &worst_u, -1.0), 100.0);
    EXPECT_NEAR(u[1], 0.4, 1e-9); // measuring has moved the parameter
    EXPECT_EQ(worst_u, u[1]);
    double others[3] = {2.0, 3.5, 5.0}; // normalised before they are measured
    EXPECT_EQ(LeastSquares(points, others, 3, along, along, bezier.data(), 0, &worst_u, -1.0), 100.0);
    EXPECT_EQ(others[0], 0.0);
    EXPECT_NEAR(others[1], 0.4, 1e-9);
    EXPECT_EQ(others[2], 1.0);
}

TEST(TangentFit, NoPassGivesTheLargestError)
{
    auto points = SampleArch(quarters, 5);
    std::vector<double> u(quarters, quarters + 5);
    Bezier bezier;
    EXPECT_EQ(LeastSquares(points.data(), u.data(), 5, archStart, archEnd, bezier.data(), 0, nullptr, -1.0),
              largestDouble);
    EXPECT_TRUE(bezier.IsIntact());
}

TEST(TangentFit, CoincidentPointsKeepTheEnds)
{
    const point2d points[4] = {{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}};
    Bezier bezier;
    LeastSquares(points, 4, {1.0, 0.0}, {1.0, 0.0}, bezier.data(), 5);
    EXPECT_EQ(bezier[0], points[0]);
    EXPECT_TRUE(std::isnan(bezier[1].x));
    EXPECT_TRUE(std::isnan(bezier[2].x));
    EXPECT_EQ(bezier[3], points[0]);
}

TEST(FreeFit, TwoPointsAreJoinedByThirds)
{
    const point2d points[2] = {{1.0, 2.0}, {4.0, 8.0}};
    double u[2] = {sentinel<double>, sentinel<double>};
    double worst_u = sentinel<double>;
    Bezier bezier;
    EXPECT_EQ(LeastSquares(points, u, 2, bezier.data(), 5, &worst_u), 0.0);
    EXPECT_EQ(bezier[0], points[0]);
    EXPECT_EQ(bezier[1], (point2d{1.0 + 3.0 * 0.3333333333333333, 2.0 + 6.0 * 0.3333333333333333}));
    EXPECT_EQ(bezier[2], (point2d{1.0 + 3.0 * 0.6666666666666666, 2.0 + 6.0 * 0.6666666666666666}));
    EXPECT_EQ(bezier[3], points[1]);
    EXPECT_EQ(u[0], sentinel<double>);
    EXPECT_EQ(worst_u, sentinel<double>);
    EXPECT_TRUE(bezier.IsIntact());
}

TEST(FreeFit, SingularFirstPassMeasuresTheCurveOfTheCaller)
{
    // Parameters 0, 0 and 1 leave exactly equal rows.
    const point2d points[3] = {{0.0, 0.0}, {150.0, 4.0}, {300.0, 0.0}};
    double u[3] = {2.0, 2.0, 5.0};
    double worst_u = sentinel<double>;
    point2d bezier[4] = {{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}};
    const Cubic before{bezier[0], bezier[1], bezier[2], bezier[3]};
    EXPECT_EQ(LeastSquares(points, u, 3, bezier, 1, &worst_u), 16.0);
    EXPECT_TRUE(SameBits(bezier, before.data(), 4));
    EXPECT_EQ(u[0], 0.0);
    EXPECT_EQ(u[1], 0.5);
    EXPECT_EQ(u[2], 1.0);
    EXPECT_EQ(worst_u, 0.5);
}

TEST(FreeFit, NoPassLeavesTheCurve)
{
    auto points = SampleArch(quarters, 5);
    std::vector<double> u(quarters, quarters + 5);
    for (const int iterations : {0, -3}) {
        Bezier bezier;
        EXPECT_EQ(LeastSquares(points.data(), u.data(), 5, bezier.data(), iterations, nullptr), largestDouble);
        EXPECT_TRUE(bezier.IsUntouchedFrom(0));
        EXPECT_EQ(LeastSquares(points.data(), 5, bezier.data(), iterations), largestDouble);
        EXPECT_TRUE(bezier.IsUntouchedFrom(0));
    }
}

TEST(FreeFit, ParametersAreNormalisedAfterEachPass)
{
    RandomSource random(6);
    PointRun run = AnyRun(random, 8);
    run.u.front() = -3.0;
    run.u.back() = 7.0;
    Bezier bezier;
    LeastSquares(run.points.data(), run.u.data(), run.Count(), bezier.data(), 3, nullptr);
    EXPECT_EQ(run.u.front(), 0.0);
    EXPECT_EQ(run.u.back(), 1.0);
}

// Both iterations against their plain form, and against curves that are known.

/// A fit as the plain form of its iteration makes it.
struct PlainFit
{
    Cubic curve{};
    std::vector<double> u;
    double worst_u = sentinel<double>;
    double error = largestDouble;
    int acceptedAfterRejection = 0;
    int endedEarly = 0;
};

void PlainNormalize(std::vector<double>& u)
{
    const double first = u.front();
    const double scale = 1.0 / (u.back() - first);
    for (double& v : u)
        v = scale * (v - first);
    u.front() = 0.0;
    u.back() = 1.0;
}

/// @param tangents the two tangents, or null for free ends
PlainFit FitPlainly(const PointRun& run, const vector2d* tangents, const Cubic& start, int iterations, double threshold)
{
    PlainFit fit;
    fit.curve = start;
    fit.u = run.u;
    const point2d* const points = run.points.data();
    const int n = run.Count();
    const BoundsT<double> box = GetPointsBBox(points, n);
    if (!tangents)
        PlainNormalize(fit.u);
    Cubic saved = start;
    bool wasRejected = false;
    for (int i = 0; i < iterations; ++i) {
        bool ok = false;
        if (tangents) {
            PlainNormalize(fit.u);
            ok = LeastSquaresSingleIteration(points, fit.u.data(), n, tangents[0], tangents[1], fit.curve.data());
        } else {
            ok = LeastSquaresSingleIteration(points, fit.u.data(), n, fit.curve.data());
        }
        const double error = Reparameterize_u(points, fit.curve.data(), fit.u.data(), n, &fit.worst_u, box);
        if (!tangents)
            PlainNormalize(fit.u);
        if (i == 0 || (ok && error < fit.error)) {
            fit.acceptedAfterRejection += wasRejected ? 1 : 0;
            saved = fit.curve;
            fit.error = error;
            if (tangents && error < threshold) {
                ++fit.endedEarly;
                break;
            }
        } else {
            wasRejected = true;
            if (error > fit.error + fit.error) {
                ++fit.endedEarly;
                break;
            }
        }
    }
    fit.curve = saved;
    return fit;
}

TEST(TangentFitProperties, IsThePlainIteration)
{
    RandomSource random(7);
    int acceptedAfterRejection = 0;
    int endedEarly = 0;
    for (int n = 0; n < 1500; ++n) {
        const PointRun run = AnyRun(random, 4);
        const vector2d tangents[2] = {RandomTangent(random), RandomTangent(random)};
        const int iterations = random.Integer(1, 12);
        const double threshold = random.Uniform(-10.0, 40.0);
        const PlainFit plain = FitPlainly(run, tangents, {}, iterations, threshold);
        acceptedAfterRejection += plain.acceptedAfterRejection;
        endedEarly += plain.endedEarly;
        Bezier bezier;
        std::vector<double> u = run.u;
        double worst_u = sentinel<double>;
        const double error = LeastSquares(run.points.data(), u.data(), run.Count(), tangents[0], tangents[1],
                                          bezier.data(), iterations, &worst_u, threshold);
        EXPECT_TRUE(SameBits(error, plain.error)) << n;
        EXPECT_TRUE(SameBits(bezier.data(), plain.curve.data(), 4)) << n;
        EXPECT_TRUE(SameBits(u.data(), plain.u.data(), run.Count())) << n;
        EXPECT_TRUE(SameBits(worst_u, plain.worst_u)) << n;
        EXPECT_TRUE(bezier.IsIntact());
    }
    EXPECT_GT(acceptedAfterRejection, 20);
    EXPECT_GT(endedEarly, 50);
}

TEST(FreeFitProperties, IsThePlainIteration)
{
    RandomSource random(8);
    int acceptedAfterRejection = 0;
    for (int n = 0; n < 1500; ++n) {
        const PointRun run = AnyRun(random, 3);
        const Cubic start = random.Curve(Shape::Generic, 100.0);
        const int iterations = random.Integer(0, 12);
        const PlainFit plain = FitPlainly(run, nullptr, start, iterations, 0.0);
        acceptedAfterRejection += plain.acceptedAfterRejection;
        Cubic bezier = start;
        std::vector<double> u = run.u;
        double worst_u = sentinel<double>;
        const double error =
            LeastSquares(run.points.data(), u.data(), run.Count(), bezier.data(), iterations, &worst_u);
        EXPECT_TRUE(SameBits(error, plain.error)) << n;
        EXPECT_TRUE(SameBits(bezier.data(), plain.curve.data(), 4)) << n;
        EXPECT_TRUE(SameBits(u.data(), plain.u.data(), run.Count())) << n;
        EXPECT_TRUE(SameBits(worst_u, plain.worst_u)) << n;
    }
    EXPECT_GT(acceptedAfterRejection, 20);
}

TEST(FitProperties, WrappersStartFromChordLengths)
{
    RandomSource random(9);
    for (int n = 0; n < 300; ++n) {
        const PointRun run = AnyRun(random, 2);
        const vector2d t1 = RandomTangent(random);
        const vector2d t2 = RandomTangent(random);
        std::vector<double> u;
        Calculate_u(run.points.data(), run.Count(), u);
        Bezier driven;
        Bezier wrapped;
        EXPECT_TRUE(
            SameBits(LeastSquares(run.points.data(), run.Count(), t1, t2, wrapped.data(), 6),
                     LeastSquares(run.points.data(), u.data(), run.Count(), t1, t2, driven.data(), 6, nullptr, -1.0)));
        EXPECT_TRUE(SameBits(wrapped.data(), driven.data(), 4));
        Calculate_u(run.points.data(), run.Count(), u);
        Cubic drivenFreely = RandomArch(random, 100.0);
        Cubic wrappedFreely = drivenFreely;
        EXPECT_TRUE(SameBits(LeastSquares(run.points.data(), run.Count(), wrappedFreely.data(), 6),
                             LeastSquares(run.points.data(), u.data(), run.Count(), drivenFreely.data(), 6, nullptr)));
        EXPECT_TRUE(SameBits(wrappedFreely.data(), drivenFreely.data(), 4));
    }
}

TEST(FitProperties, KnownCubicIsFoundFromItsParameters)
{
    RandomSource random(10);
    for (int n = 0; n < 500; ++n) {
        const Cubic curve = RandomArch(random, 100.0);
        const PointRun run = SampledRun(random, curve, 20);
        Bezier bezier;
        std::vector<double> u = run.u;
        LeastSquares(run.points.data(), u.data(), 20, curve[1] - curve[0], curve[3] - curve[2], bezier.data(), 1,
                     nullptr, -1.0);
        ExpectCurve(bezier.data(), curve, 1e-8);
        u = run.u;
        LeastSquares(run.points.data(), u.data(), 20, bezier.data(), 1, nullptr);
        ExpectCurve(bezier.data(), curve, 1e-7);
    }
}

TEST(FitProperties, KnownCubicIsApproachedFromChordLengths)
{
    RandomSource random(11);
    for (int n = 0; n < 200; ++n) {
        const Cubic curve = RandomArch(random, 100.0);
        const PointRun run = SampledRun(random, curve, 41);
        const BoundsT<double> box = GetPointsBBox(run.points.data(), 41);
        const double size = std::max(box.right - box.left, box.top - box.bottom);
        Bezier few;
        Bezier many;
        const vector2d t1 = curve[1] - curve[0];
        const vector2d t2 = curve[3] - curve[2];
        const double errorOfFew = LeastSquares(run.points.data(), 41, t1, t2, few.data(), 1);
        const double errorOfMany = LeastSquares(run.points.data(), 41, t1, t2, many.data(), 100);
        EXPECT_LE(errorOfMany, errorOfFew) << n;
        EXPECT_LT(std::sqrt(errorOfMany), 1e-2 * size) << n;
    }
}

} // namespace
} // namespace ZarnMath
