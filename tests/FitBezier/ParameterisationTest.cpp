#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include "tests/FitBezier/Runs.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
constexpr Cubic level = {{{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}}};
constexpr BoundsT<double> everywhere{-1e9, 1e9, 1e9, -1e9};

std::vector<double> ChordLengths(const std::vector<point2d>& points)
{
    std::vector<double> u;
    Calculate_u(points.data(), static_cast<int>(points.size()), u);
    return u;
}

/// What became of one point with one parameter.
struct Moved
{
    double u;
    double worst_u = sentinel<double>;
    double error;

    Moved(const Cubic& curve, const point2d& p, double start) : u(start)
    {
        error = Reparameterize_u(&p, curve.data(), &u, 1, &worst_u, everywhere);
    }
};

TEST(CalculateU, OnePoint)
{
    EXPECT_EQ(ChordLengths({{3.0, 4.0}}), std::vector<double>{1.0});
}

TEST(CalculateU, TwoPoints)
{
    EXPECT_EQ(ChordLengths({{3.0, 4.0}, {5.0, 6.0}}), (std::vector<double>{0.0, 1.0}));
    EXPECT_EQ(ChordLengths({{3.0, 4.0}, {3.0, 4.0}}), (std::vector<double>{0.0, 1.0}));
}

TEST(CalculateU, LengthsOfTheChords)
{
    const auto u = ChordLengths({{0.0, 0.0}, {3.0, 4.0}, {3.0, 4.0}, {3.0, 7.0}, {-5.0, 7.0}});
    EXPECT_EQ(u, (std::vector<double>{0.0, 0.3125, 0.3125, 0.5, 1.0}));
}

TEST(CalculateU, StepsAddUp)
{
    std::vector<point2d> points;
    for (int i = 0; i <= 10; ++i)
        points.push_back({static_cast<double>(i), 0.0});
    const auto u = ChordLengths(points);
    EXPECT_EQ(u[3], 0.1 + 0.1 + 0.1); // not 3/10
    EXPECT_EQ(u[10], 1.0);            // not the sum, which rounds below
}

TEST(CalculateU, CoincidentPointsGiveNanInside)
{
    const auto u = ChordLengths({{3.0, 4.0}, {3.0, 4.0}, {3.0, 4.0}});
    EXPECT_EQ(u[0], 0.0);
    EXPECT_TRUE(std::isnan(u[1]));
    EXPECT_EQ(u[2], 1.0);
}

TEST(CalculateU, WhatTheVectorHeldIsReplaced)
{
    const point2d points[3] = {{0.0, 0.0}, {1.0, 0.0}, {2.0, 0.0}};
    std::vector<double> u(7, sentinel<double>);
    Calculate_u(points, 3, u);
    EXPECT_EQ(u, (std::vector<double>{0.0, 0.5, 1.0}));
}

TEST(CalculateU, NoPointsAreALengthError)
{
    for (const int count : {0, -1, std::numeric_limits<int>::min()}) {
        std::vector<double> u{7.0};
        EXPECT_THROW(Calculate_u(nullptr, count, u), std::length_error) << count;
    }
}

TEST(ReparameterizeU, PinnedEndsStay)
{
    const point2d points[3] = {{90.0, 0.0}, {150.0, 5.0}, {210.0, 0.0}};
    for (const double zero : {0.0, -0.0}) {
        double u[3] = {zero, 0.499, 1.0};
        const double error = Reparameterize_u(points, level.data(), u, 3, nullptr, everywhere);
        EXPECT_TRUE(SameBits(u[0], zero));
        EXPECT_NEAR(u[1], 0.5, 1e-12);
        EXPECT_EQ(u[2], 1.0);
        EXPECT_NEAR(error, 25.0, 1e-12);
    }
}

TEST(ReparameterizeU, OtherEndsAreVisited)
{
    const point2d points[2] = {{90.0, 3.0}, {210.0, 4.0}};
    double u[2] = {0.1, 0.9};
    const double error = Reparameterize_u(points, level.data(), u, 2, nullptr, everywhere);
    EXPECT_NEAR(u[0], 0.3, 1e-12);
    EXPECT_NEAR(u[1], 0.7, 1e-12);
    EXPECT_NEAR(error, 16.0, 1e-12);
}

TEST(ReparameterizeU, OnlyTheEndsArePinned)
{
    const point2d points[4] = {{0.0, 0.0}, {90.0, 3.0}, {210.0, 4.0}, {300.0, 0.0}};
    double u[4] = {0.0, 0.0, 1.0, 1.0};
    Reparameterize_u(points, level.data(), u, 4, nullptr, everywhere);
    EXPECT_NEAR(u[1], 0.3, 1e-12);
    EXPECT_NEAR(u[2], 0.7, 1e-12);
    double exchanged[2] = {1.0, 0.0}; // pinned at the other end only
    const point2d inner[2] = {{90.0, 3.0}, {210.0, 4.0}};
    Reparameterize_u(inner, level.data(), exchanged, 2, nullptr, everywhere);
    EXPECT_NEAR(exchanged[0], 0.3, 1e-12);
    EXPECT_NEAR(exchanged[1], 0.7, 1e-12);
}

TEST(ReparameterizeU, BoxAloneWhereNothingIsVisited)
{
    constexpr Cubic bow = {{{0.0, 0.0}, {0.0, 100.0}, {100.0, 100.0}, {100.0, 0.0}}}; // 75 high
    const point2d points[2] = {bow[0], bow[3]};
    double u[2] = {0.0, 1.0};
    double worst_u = sentinel<double>;
    const BoundsT<double> box = GetPointsBBox(points, 2);
    EXPECT_EQ(Reparameterize_u(points, bow.data(), u, 2, &worst_u, box), 5625.0);
    EXPECT_EQ(worst_u, sentinel<double>);
    EXPECT_EQ(Reparameterize_u(points, bow.data(), u, 2, nullptr, everywhere), 0.0);
}

TEST(ReparameterizeU, EachSideOfTheBoxCounts)
{
    constexpr Cubic bow = {{{0.0, 0.0}, {0.0, 100.0}, {100.0, 100.0}, {100.0, 0.0}}}; // (0, 0) to (100, 75)
    const auto error = [&](const BoundsT<double>& box) {
        double u[2] = {0.0, 1.0};
        return Reparameterize_u(bow.data(), bow.data(), u, 2, nullptr, box);
    };
    EXPECT_EQ(error({0.0, 75.0, 100.0, 0.0}), 0.0); // left, top, right, bottom
    EXPECT_EQ(error({3.0, 75.0, 100.0, 0.0}), 9.0);
    EXPECT_EQ(error({0.0, 71.0, 100.0, 0.0}), 16.0);
    EXPECT_EQ(error({0.0, 75.0, 95.0, 0.0}), 25.0);
    EXPECT_EQ(error({0.0, 75.0, 100.0, 6.0}), 36.0);
    EXPECT_EQ(error({3.0, 71.0, 95.0, 6.0}), 36.0);
    EXPECT_EQ(error({7.0, 71.0, 95.0, 6.0}), 49.0);
}

TEST(ReparameterizeU, CurveThroughAllPointsIsChargedForItsBulge)
{
    constexpr Cubic bow = {{{0.0, 0.0}, {0.0, 100.0}, {100.0, 100.0}, {100.0, 0.0}}};
    const point2d points[4] = {bow[0], BernsteinPoint(bow.data(), 0.25), BernsteinPoint(bow.data(), 0.75), bow[3]};
    double u[4] = {0.0, 0.25, 0.75, 1.0};
    const double height = points[1].y; // 56.25
    EXPECT_EQ(Reparameterize_u(points, bow.data(), u, 4, nullptr, GetPointsBBox(points, 4)),
              (75.0 - height) * (75.0 - height));
}

TEST(ReparameterizeU, WorstParameterIsThatOfTheLargestDistance)
{
    const point2d points[4] = {{30.0, 1.0}, {90.0, -5.0}, {150.0, 5.0}, {210.0, 2.0}};
    double u[4] = {0.1, 0.3, 0.5, 0.7};
    double worst_u = sentinel<double>;
    EXPECT_EQ(Reparameterize_u(points, level.data(), u, 4, &worst_u, everywhere), 25.0);
    EXPECT_EQ(worst_u, u[1]); // the first of equals
}

TEST(ReparameterizeU, NewtonValueAtTheEnds)
{
    // On this curve the distance is stationary at t = x/300, and one step finds it.
    const Moved below(level, {-0.3, 5.0}, 0.005);
    EXPECT_EQ(below.u, 0.005); // -0.001: nothing else is found, and the point does not count
    EXPECT_EQ(below.error, 0.0);
    EXPECT_EQ(below.worst_u, sentinel<double>);
    const Moved above(level, {0.3, 5.0}, 0.005);
    EXPECT_NEAR(above.u, 0.001, 1e-15);
    EXPECT_NEAR(above.error, 25.0, 1e-12);
    EXPECT_EQ(above.worst_u, above.u);
    const Moved atStart(level, {0.0, 5.0}, 0.00390625);
    EXPECT_EQ(atStart.u, 0.0);
    EXPECT_EQ(atStart.error, 25.0);
    const Moved atEnd(level, {300.0, 5.0}, 0.99609375);
    EXPECT_EQ(atEnd.u, 1.0);
    EXPECT_EQ(atEnd.error, 25.0);
    const Moved beyond(level, {300.3, 5.0}, 0.995);
    EXPECT_EQ(beyond.u, 0.995);
    EXPECT_EQ(beyond.error, 0.0);
}

/// The parameter in an interval at which the distance of the arch from a point is stationary, by bisection.
double StationaryParameter(const point2d& p, double low, double high)
{
    const auto slope = [&](double t) {
        const point2d b = BernsteinPoint(arch.data(), t);
        return (b.x - p.x) * 300.0 + (b.y - p.y) * 900.0 * (1.0 - 2.0 * t);
    };
    EXPECT_LT(slope(low) * slope(high), 0.0);
    while (high - low > 1e-14) {
        const double middle = 0.5 * (low + high);
        (slope(low) * slope(middle) <= 0.0 ? high : low) = middle;
    }
    return low;
}

TEST(ReparameterizeU, NewtonIsTrustedForShortMovesOnly)
{
    const point2d p{160.0, 100.0}; // the right arm is nearer than the left
    const double left = StationaryParameter(p, 0.0, 0.4);
    const double right = StationaryParameter(p, 0.6, 1.0);
    for (const double sign : {-1.0, 1.0}) {
        EXPECT_NEAR(Moved(arch, p, left + sign * 0.0199).u, left, 1e-7);
        EXPECT_NEAR(Moved(arch, p, left + sign * 0.0201).u, right, 1e-7);
        EXPECT_NEAR(Moved(arch, p, right + sign * 0.0201).u, right, 1e-7); // found again by the search
    }
}

/// A point a little below the centre of the arch's osculating circle at its summit, (150, 175), and to the left of the
/// axis: with s = t - 1/2 its distance is stationary where 54000*s^3 - 5.4*s + 0.001 = 0. The root near s = -0.01 is the
/// nearest, that near 0.01 is hardly farther, and that between them is the farthest.
constexpr point2d belowTheCentre{150.0 - 1e-4, 175.0 - 0.09};

TEST(ReparameterizeU, NewtonEndsAtAStepThatDoesNotShrink)
{
    const double left = StationaryParameter(belowTheCentre, 0.47, 0.4942);
    const double right = StationaryParameter(belowTheCentre, 0.5058, 0.53);
    // From here the steps shrink, and the right root is as good as any.
    EXPECT_NEAR(Moved(arch, belowTheCentre, 0.515).u, right, 1e-7);
    // From here they are 0.0099 to the left and 0.026 to the right. They would go on to the right root, which is near enough
    // to the start to be trusted; but the search has the say, and takes the left one.
    EXPECT_NEAR(Moved(arch, belowTheCentre, 0.5046).u, left, 1e-7);
}

TEST(ReparameterizeU, FirstStepIsBelowOne)
{
    // Where the slope 162000*s^2 - 5.4 all but vanishes the first step leads far out to the right, 0.95 and 1.05 from these
    // two places. From there Newton's method would come back to the right root.
    const double left = StationaryParameter(belowTheCentre, 0.47, 0.4942);
    const double right = StationaryParameter(belowTheCentre, 0.5058, 0.53);
    EXPECT_NEAR(Moved(arch, belowTheCentre, 0.50578464).u, right, 1e-7);
    EXPECT_NEAR(Moved(arch, belowTheCentre, 0.50578358).u, left, 1e-7);
    EXPECT_NEAR(Moved(arch, belowTheCentre, 0.50578406949375843).u, left, 1e-7); // here it is 1 to the last bit
}

TEST(ReparameterizeU, SearchFindsTheNearestRoot)
{
    const point2d p{160.0, 100.0};
    const double right = StationaryParameter(p, 0.6, 1.0);
    for (const double start : {0.5, nan, infinity, -7.0}) {
        const Moved moved(arch, p, start);
        EXPECT_NEAR(moved.u, right, 1e-7) << start;
        EXPECT_EQ(moved.worst_u, moved.u);
        EXPECT_NEAR(moved.error, LengthSquared(p - BernsteinPoint(arch.data(), right)), 1e-6);
    }
}

TEST(ReparameterizeU, FirstOfEqualDistancesStands)
{
    // Points on the axis of the arch, below the centre of its curvature: as near to the left arm as to the right one, but
    // for rounding. Only those to which they are equal to the last bit count here.
    const CubicBezier::PowerForm f = CubicBezier::ToPowerForm(arch.data());
    int ties = 0;
    for (int y = -600; y < 175; ++y) {
        const point2d p{150.0, static_cast<double>(y)};
        const vector2d q = f.d - p;
        const double c[6] = {3.0 * Dot(f.a, f.a),
                             5.0 * Dot(f.b, f.a),
                             4.0 * Dot(f.c, f.a) + 2.0 * Dot(f.b, f.b),
                             3.0 * (Dot(f.b, f.c) + Dot(q, f.a)),
                             Dot(f.c, f.c) + 2.0 * Dot(q, f.b),
                             Dot(q, f.c)};
        double roots[6];
        const int count = RootFinder::FindRoots<5>(c, roots, false);
        const auto distance = [&](double t) { return LengthSquared(CubicBezier::Evaluate(f, t) - p); };
        if (count < 2 || distance(roots[0]) != distance(roots[count - 1]))
            continue;
        ++ties;
        EXPECT_LT(roots[0], 0.5);
        EXPECT_GT(roots[count - 1], 0.5);
        EXPECT_EQ(Moved(arch, p, nan).u, roots[0]) << y;
    }
    EXPECT_GT(ties, 20);
}

TEST(ReparameterizeU, PointCurveMovesNothing)
{
    constexpr Cubic point = {{{1.0, 2.0}, {1.0, 2.0}, {1.0, 2.0}, {1.0, 2.0}}};
    const Moved moved(point, {5.0, 5.0}, 0.3);
    EXPECT_EQ(moved.u, 0.3);
    EXPECT_EQ(moved.error, 0.0);
    EXPECT_EQ(moved.worst_u, sentinel<double>);
}

TEST(ReparameterizeUProperties, EachPointIsMovedAsIfItWereAlone)
{
    RandomSource random(2);
    int searched = 0;
    for (std::size_t n = 1; n < 4000; ++n) {
        const Cubic curve = random.Curve(Shape::Generic, 100.0);
        PointRun run = NoisyRun(random, curve, n % 13 + 3, 10.0);
        for (double& u : run.u)
            if (const double kind = random.Uniform(0.0, 1.0); kind < 0.1)
                u = nan; // goes to the search for all roots, as one far away does
            else
                u = 0.001 + 0.998 * (kind < 0.3 ? kind : u);
        std::vector<double> alone;
        double largest = 0.0;
        double largest_u = sentinel<double>;
        for (std::size_t i = 0; i < run.u.size(); ++i) {
            const Moved moved(curve, run.points[i], run.u[i]);
            alone.push_back(moved.u);
            searched += std::isnan(run.u[i]) ? 1 : 0;
            if (moved.error > largest) {
                largest = moved.error;
                largest_u = moved.worst_u;
            }
        }
        double worst_u = sentinel<double>;
        EXPECT_EQ(Reparameterize_u(run.points.data(), curve.data(), run.u.data(), run.Count(), &worst_u, everywhere),
                  largest);
        EXPECT_EQ(worst_u, largest_u);
        for (std::size_t i = 0; i < run.u.size(); ++i)
            EXPECT_TRUE(SameBits(run.u[i], alone[i])) << n << ", point " << i;
    }
    EXPECT_GT(searched, 2000);
}

TEST(ReparameterizeUProperties, ParametersAreStationaryOrStay)
{
    RandomSource random(1);
    int found = 0;
    for (int n = 0; n < 1000; ++n) {
        const Cubic curve = random.Curve(Shape::Generic, 100.0);
        const CubicBezier::PowerForm f = CubicBezier::ToPowerForm(curve.data());
        PointRun run = NoisyRun(random, curve, 12, 10.0);
        const std::vector<double> before = run.u;
        double worst_u = sentinel<double>;
        const double error = Reparameterize_u(run.points.data(), curve.data(), run.u.data(), 12, &worst_u, everywhere);
        double largest = 0.0;
        double largest_u = sentinel<double>;
        for (std::size_t i = 1; i < 11; ++i) {
            const vector2d residual = CubicBezier::Evaluate(f, run.u[i]) - run.points[i];
            if (run.u[i] == before[i])
                continue;
            ++found;
            EXPECT_GE(run.u[i], 0.0);
            EXPECT_LE(run.u[i], 1.0);
            EXPECT_NEAR(Dot(residual, CubicBezier::Derivative(f.a, f.b, f.c, run.u[i])), 0.0, 1.0) << n;
            if (LengthSquared(residual) > largest) {
                largest = LengthSquared(residual);
                largest_u = run.u[i];
            }
        }
        EXPECT_EQ(error, largest) << n;
        EXPECT_EQ(worst_u, largest_u) << n;
        EXPECT_EQ(run.u.front(), 0.0);
        EXPECT_EQ(run.u.back(), 1.0);
    }
    EXPECT_GT(found, 8000);
}

} // namespace
} // namespace ZarnMath
