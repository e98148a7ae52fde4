#include "Cubic.h"

#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

using namespace curvelab;

namespace {

/// By de Casteljau's construction, so that the check shares nothing with Horner's rule.
point2d At(const Cubic& curve, double t)
{
    std::vector<point2d> p(curve.points, curve.points + 4);
    for (std::size_t level = 3; level > 0; --level)
        for (std::size_t i = 0; i < level; ++i)
            p[i] = {p[i].x * (1.0 - t) + p[i + 1].x * t, p[i].y * (1.0 - t) + p[i + 1].y * t};
    return p[0];
}

void ExpectNear(const point2d& p, double x, double y, double tolerance)
{
    EXPECT_NEAR(p.x, x, tolerance);
    EXPECT_NEAR(p.y, y, tolerance);
}

/// The largest radial error of the classic cubic for a quarter circle: 2.7253e-4 of the radius.
constexpr double quarterError = 2.73e-4;

} // namespace

TEST(Cubic, LineHasItsInnerPointsAtThirds)
{
    const Cubic expected{{{0.0, 0.0}, {1.0, 2.0}, {2.0, 4.0}, {3.0, 6.0}}};
    EXPECT_EQ(LineAsCubic({0.0, 0.0}, {3.0, 6.0}), expected);
}

TEST(Cubic, QuadraticIsTheSameCurve)
{
    const point2d p{10.0, -20.0}, q{50.0, 90.0}, r{130.0, 4.0};
    const Cubic raised = QuadraticAsCubic(p, q, r);
    for (int i = 0; i <= 20; ++i) {
        const double t = i / 20.0;
        const double u = 1.0 - t;
        ExpectNear(At(raised, t), u * u * p.x + 2.0 * u * t * q.x + t * t * r.x,
                   u * u * p.y + 2.0 * u * t * q.y + t * t * r.y, 1e-12);
    }
    // Degree elevation leaves no cubic term: P3 - 3*P2 + 3*P1 - P0 = 0.
    const PowerForm form = ToPowerForm(raised);
    ExpectNear(form.a, 0.0, 0.0, 1e-12);
}

TEST(Cubic, HalfCircleIsTwoQuarters)
{
    const std::vector<Cubic> pieces = ArcAsCubics({100.0, 0.0}, {100.0, 100.0, 0.0, false, true, {-100.0, 0.0}});
    ASSERT_EQ(pieces.size(), 2u);
    EXPECT_EQ(pieces[0][0], (point2d{100.0, 0.0}));
    EXPECT_EQ(pieces[0][3], pieces[1][0]);
    EXPECT_EQ(pieces[1][3], (point2d{-100.0, 0.0}));
    ExpectNear(pieces[0][3], 0.0, 100.0, 1e-12);
    for (const Cubic& piece : pieces)
        for (int i = 0; i <= 50; ++i) {
            const point2d p = At(piece, i / 50.0);
            EXPECT_NEAR(std::hypot(p.x, p.y), 100.0, 100.0 * quarterError);
            EXPECT_GE(p.y, -1e-12) << "with the sweep flag, angles grow";
        }
}

TEST(Cubic, EachFlagChoosesItsArc)
{
    // Through (1, 0) and (0, 1) run two unit circles, about (0, 0) and (1, 1), each with a small and a large arc.
    const point2d start{1.0, 0.0}, end{0.0, 1.0};
    const double low = 1.0 - std::numbers::sqrt2 / 2.0;
    const double high = std::numbers::sqrt2 / 2.0;
    const auto middle = [&](bool large, bool sweep) {
        const std::vector<Cubic> pieces = ArcAsCubics(start, {1.0, 1.0, 0.0, large, sweep, end});
        EXPECT_EQ(pieces.size(), large ? 3u : 1u);
        return At(pieces[pieces.size() / 2], 0.5);
    };
    ExpectNear(middle(false, true), high, high, 3e-4);
    ExpectNear(middle(false, false), low, low, 3e-4);
    ExpectNear(middle(true, true), 1.0 + high, 1.0 + high, 3e-4);
    ExpectNear(middle(true, false), -high, -high, 3e-4);
}

TEST(Cubic, TurnedEllipseKeepsItsEquation)
{
    // Half of the ellipse with radii 30 and 10, turned by 30 degrees about the origin: between the ends of its major axis.
    const double c = std::cos(std::numbers::pi / 6.0), s = std::sin(std::numbers::pi / 6.0);
    const std::vector<Cubic> pieces =
        ArcAsCubics({30.0 * c, 30.0 * s}, {30.0, 10.0, 30.0, false, true, {-30.0 * c, -30.0 * s}});
    ASSERT_EQ(pieces.size(), 2u);
    for (const Cubic& piece : pieces)
        for (int i = 0; i <= 20; ++i) {
            const point2d p = At(piece, i / 20.0);
            const double u = (p.x * c + p.y * s) / 30.0, v = (p.y * c - p.x * s) / 10.0;
            EXPECT_NEAR(std::hypot(u, v), 1.0, quarterError);
        }
}

TEST(Cubic, ArcsOfNoSizeAreLinesOrNothing)
{
    const Arc flat{0.0, 5.0, 0.0, false, true, {3.0, 6.0}};
    EXPECT_EQ(ArcAsCubics({0.0, 0.0}, flat), std::vector<Cubic>{LineAsCubic({0.0, 0.0}, {3.0, 6.0})});
    EXPECT_TRUE(ArcAsCubics({3.0, 6.0}, {5.0, 5.0, 0.0, true, true, {3.0, 6.0}}).empty());
}

TEST(Cubic, RadiiThatDoNotReachGrow)
{
    // Ends 20 apart with radius 1: the half circle of radius 10.
    const std::vector<Cubic> pieces = ArcAsCubics({-10.0, 0.0}, {1.0, -1.0, 0.0, false, false, {10.0, 0.0}});
    ASSERT_EQ(pieces.size(), 2u);
    ExpectNear(pieces[0][3], 0.0, 10.0, 1e-9);
}

TEST(Cubic, BoundsAreTight)
{
    // y(t) = 3*t*(1 - t)*300 has its maximum 225 at 1/2; x(t) = 300*t.
    Bounds bounds = NoBounds();
    Include(bounds, Cubic{{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}});
    EXPECT_EQ(bounds, (Bounds{0.0, 225.0, 300.0, 0.0}));

    // x(t) of 0, 1, -1, 0 is 3t - 9t^2 + 6t^3 with extremes at t = (3 -+ sqrt(3))/6, of size sqrt(3)/6.
    bounds = NoBounds();
    Include(bounds, Cubic{{{0.0, 0.0}, {1.0, 1.0}, {-1.0, 2.0}, {0.0, 3.0}}});
    EXPECT_NEAR(bounds.right, std::numbers::sqrt3 / 6.0, 1e-15);
    EXPECT_NEAR(bounds.left, -std::numbers::sqrt3 / 6.0, 1e-15);

    // A point is its own bounds.
    bounds = NoBounds();
    Include(bounds, Cubic{{{4.0, 5.0}, {4.0, 5.0}, {4.0, 5.0}, {4.0, 5.0}}});
    EXPECT_EQ(bounds, (Bounds{4.0, 5.0, 4.0, 5.0}));
}

TEST(Cubic, BoundsHoldEverySampleAndAreTouched)
{
    std::uint32_t state = 1;
    const auto random = [&state] {
        state = state * 1664525u + 1013904223u;
        return static_cast<double>(state >> 8) / 65536.0;
    };
    for (int round = 0; round < 2000; ++round) {
        Cubic curve{};
        for (point2d& p : curve.points)
            p = {random(), random()};
        Bounds bounds = NoBounds();
        Include(bounds, curve);
        Bounds sampled = NoBounds();
        for (int i = 0; i <= 200; ++i)
            Include(sampled, At(curve, i / 200.0));
        EXPECT_GE(sampled.left, bounds.left - 1e-9);
        EXPECT_LE(sampled.right, bounds.right + 1e-9);
        // The speed is at most 3*256 units in x, so an extreme lies within h^2/2 times 6*512 of the nearest sample.
        EXPECT_NEAR(sampled.top, bounds.top, 0.01 + 1e-9);
        EXPECT_NEAR(sampled.bottom, bounds.bottom, 0.01 + 1e-9);
    }
}

TEST(Cubic, RoundingIsOncePerCoordinate)
{
    const IntegerCubic rounded = Rounded({{{0.5, -0.5}, {1.49, 2.5}, {-2.5, 99999.6}, {3.0, -4.0}}});
    EXPECT_EQ(rounded[0], (POINT{1, -1}));
    EXPECT_EQ(rounded[1], (POINT{1, 3}));
    EXPECT_EQ(rounded[2], (POINT{-3, 100000}));
    EXPECT_EQ(ToDouble(rounded)[3], (point2d{3.0, -4.0}));
}
