#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

namespace ZarnMath::CubicBezier {

namespace {

TEST(PowerForm, OfIntegerDoublesIsExact)
{
    const Cubic curve = {{{0, 0}, {100, 300}, {200, 300}, {300, 0}}};
    const PowerForm f = ToPowerForm(curve.data());
    EXPECT_EQ(f.a, (point2d{0, 0}));
    EXPECT_EQ(f.b, (point2d{0, -900}));
    EXPECT_EQ(f.c, (point2d{300, 900}));
    EXPECT_EQ(f.d, (point2d{0, 0}));
}

// Each grouping shows by a small number that its neighbours in the sum would swallow in another order.
TEST(PowerForm, KeepsItsGroupings)
{
    RandomSource random(31);
    for (int i = 0; i < 3000; ++i) {
        const Cubic p = random.Curve();
        const PowerForm f = ToPowerForm(p.data());
        EXPECT_TRUE(SameBits(f.a.x, p[3].x - (p[2].x - p[1].x) * 3.0 - p[0].x));
        EXPECT_TRUE(SameBits(f.a.y, p[3].y - (p[2].y - p[1].y) * 3.0 - p[0].y));
        EXPECT_TRUE(SameBits(f.b.x, (p[0].x + (p[2].x - (p[1].x + p[1].x))) * 3.0));
        EXPECT_TRUE(SameBits(f.b.y, (p[0].y + (p[2].y - (p[1].y + p[1].y))) * 3.0));
        EXPECT_TRUE(SameBits(f.c, AsPoint(vector2d{(p[1].x - p[0].x) * 3.0, (p[1].y - p[0].y) * 3.0})));
        EXPECT_TRUE(SameBits(f.d, p[0]));
    }
}

TEST(PowerForm, OfSmallIntegersIsThatOfDoubles)
{
    RandomSource random(32);
    for (int i = 0; i < 1000; ++i) {
        const IntegerCubic integers = random.IntegerCurve(1000000000);
        const Cubic doubles = {ToPoint2d(integers[0]), ToPoint2d(integers[1]), ToPoint2d(integers[2]),
                               ToPoint2d(integers[3])};
        const PowerForm f = ToPowerForm(integers.data());
        const PowerForm g = ToPowerForm(doubles.data());
        EXPECT_EQ(f.a, g.a);
        EXPECT_EQ(f.b, g.b);
        EXPECT_EQ(f.c, g.c);
        EXPECT_EQ(f.d, g.d);
    }
}

// P2 - P1 and P1 - P0 wrap in 32 bits; the other terms are converted first.
TEST(PowerForm, OfIntegersTakesTwoDifferencesInThirtyTwoBits)
{
    const IntegerCubic curve = {{{-2, 5}, {2147483647, 5}, {-2, 5}, {7, 5}}};
    const PowerForm f = ToPowerForm(curve.data());
    const double secondMinusFirst = 2147483647.0; // -2 - 2147483647 = -2147483649, wrapped
    const double firstMinusStart = -2147483647.0; // 2147483647 + 2 = 2147483649, wrapped
    EXPECT_EQ(f.a.x, 7.0 - secondMinusFirst * 3.0 + 2.0);
    EXPECT_EQ(f.b.x, (-2.0 - 4294967294.0 - 2.0) * 3.0);
    EXPECT_EQ(f.c.x, firstMinusStart * 3.0);
    EXPECT_EQ(f.d.x, -2.0);
    EXPECT_EQ(f.a.y, 0.0);
}

TEST(PowerForm, EvaluatesByHornersRule)
{
    const PowerForm f = {{1, -1}, {2, 0}, {3, 5}, {4, 7}};
    EXPECT_EQ(Evaluate(f, 2.0), (point2d{26, 9}));
    EXPECT_EQ(Derivative(f.a, f.b, f.c, 2.0), (vector2d{23, -7}));
    RandomSource random(33);
    for (int i = 0; i < 1000; ++i) {
        const point2d a = random.Point(1.0), b = random.Point(1.0), c = random.Point(1.0), d = random.Point(1.0);
        const double t = random.Uniform(-1.0, 2.0);
        const point2d expected = {((a.x * t + b.x) * t + c.x) * t + d.x, ((a.y * t + b.y) * t + c.y) * t + d.y};
        EXPECT_TRUE(SameBits(Evaluate({a, b, c, d}, t), expected));
    }
}

} // namespace

} // namespace ZarnMath::CubicBezier
