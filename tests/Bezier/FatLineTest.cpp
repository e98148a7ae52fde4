#include "ZarnMath/Bezier.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

namespace ZarnMath::CubicBezier {

namespace {

constexpr Cubic wave{{{0.0, 0.0}, {100.0, 300.0}, {200.0, -300.0}, {300.0, 0.0}}};

bool Touches(const Cubic& c, point2d from, point2d to, double halfWidth)
{
    return DoesFatlineIntersectBezier(c.data(), from, to, halfWidth);
}

TEST(FatLine, AsksForAnEndInTheGrownBox)
{
    EXPECT_FALSE(Touches(wave, {-1000.0, 10.0}, {1000.0, 10.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {100.0, 10.0}, {1000.0, 10.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {1000.0, 10.0}, {100.0, 10.0}, 1.0));
}

TEST(FatLine, IncludesTheBordersOfTheBox)
{
    // The control points span 0 to 300 and -300 to 300.
    const double beyond = 301.0 + 0x1p-40;
    EXPECT_TRUE(Touches(wave, {301.0, 10.0}, {-1000.0, 10.0}, 1.0));
    EXPECT_FALSE(Touches(wave, {beyond, 10.0}, {-1000.0, 10.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {-1.0, 10.0}, {1000.0, 10.0}, 1.0));
    EXPECT_FALSE(Touches(wave, {-1.0 - 0x1p-40, 10.0}, {1000.0, 10.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {50.0, 301.0}, {50.0, -1000.0}, 1.0));
    EXPECT_FALSE(Touches(wave, {50.0, beyond}, {50.0, -1000.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {50.0, -301.0}, {50.0, 1000.0}, 1.0));
    EXPECT_FALSE(Touches(wave, {50.0, -beyond}, {50.0, 1000.0}, 1.0));
}

TEST(FatLine, OfNegativeWidthShrinksTheBoxWhoseHeightMayTurnOver)
{
    // The heights 0 to 5 become 10 to -5, and still hold 3; widths that turn over hold nothing.
    constexpr Cubic flat{{{0.0, 0.0}, {100.0, 5.0}, {200.0, 5.0}, {300.0, 0.0}}};
    constexpr Cubic upright{{{0.0, 0.0}, {5.0, 100.0}, {5.0, 200.0}, {0.0, 300.0}}};
    EXPECT_TRUE(Touches(flat, {140.0, 3.0}, {140.0, 3.0}, -10.0));
    EXPECT_FALSE(Touches(flat, {140.0, 11.0}, {140.0, 11.0}, -10.0));
    EXPECT_FALSE(Touches(flat, {9.0, 3.0}, {9.0, 3.0}, -10.0));
    EXPECT_FALSE(Touches(upright, {3.0, 140.0}, {3.0, 140.0}, -10.0));
}

TEST(FatLine, ComesNearTheEndsOfTheCurveStrictly)
{
    // (3, 4) off each end, on the side that the curve does not turn to.
    EXPECT_FALSE(Touches(wave, {-3.0, -4.0}, {-3.0, -4.0}, 5.0));
    EXPECT_TRUE(Touches(wave, {-3.0, -4.0}, {-3.0, -4.0}, 5.0 + 1e-9));
    EXPECT_FALSE(Touches(wave, {303.0, 4.0}, {303.0, 4.0}, 5.0));
    EXPECT_TRUE(Touches(wave, {303.0, 4.0}, {303.0, 4.0}, 5.0 + 1e-9));
    // Each of the four pairs of ends, with a far end that lies outside the box.
    EXPECT_TRUE(Touches(wave, {-3.0, -4.0}, {-999.0, -999.0}, 6.0));
    EXPECT_TRUE(Touches(wave, {-999.0, -999.0}, {-3.0, -4.0}, 6.0));
    EXPECT_TRUE(Touches(wave, {303.0, 4.0}, {999.0, 999.0}, 6.0));
    EXPECT_TRUE(Touches(wave, {999.0, 999.0}, {303.0, 4.0}, 6.0));
}

TEST(FatLine, ComesNearTheEndsOfTheCurveWithItsInterior)
{
    EXPECT_FALSE(Touches(wave, {303.0, -100.0}, {303.0, 100.0}, 3.0));
    EXPECT_TRUE(Touches(wave, {303.0, -100.0}, {303.0, 100.0}, 3.0 + 1e-9));
    EXPECT_FALSE(Touches(wave, {-3.0, -100.0}, {-3.0, 100.0}, 3.0));
    EXPECT_TRUE(Touches(wave, {-3.0, -100.0}, {-3.0, 100.0}, 3.0 + 1e-9));
    // The foot at s = 0 and s = 1 exactly, and off the segment.
    EXPECT_TRUE(Touches(wave, {303.0, 0.0}, {303.0, 100.0}, 3.5));
    EXPECT_TRUE(Touches(wave, {303.0, 100.0}, {303.0, 0.0}, 3.5));
    EXPECT_FALSE(Touches(wave, {303.0, 50.0}, {303.0, 100.0}, 3.5));
    EXPECT_FALSE(Touches(wave, {303.0, 100.0}, {303.0, 50.0}, 3.5));
}

TEST(FatLine, ComesNearTheCurveWithAnEnd)
{
    // The highest point of the curve is about (63.4, 86.6).
    EXPECT_TRUE(Touches(wave, {63.4, 87.2}, {63.4, 87.2}, 1.0));
    EXPECT_FALSE(Touches(wave, {63.4, 87.2}, {63.4, 87.2}, 0.1));
    EXPECT_TRUE(Touches(wave, {63.4, 87.2}, {63.4, 200.0}, 1.0));
    EXPECT_TRUE(Touches(wave, {63.4, 200.0}, {63.4, 87.2}, 1.0));
}

TEST(FatLine, DoesNotSeeACurveThatBulgesToItsMiddle)
{
    // The curve rises to y = 75 at its middle.
    constexpr Cubic arch{{{0.0, 0.0}, {100.0, 100.0}, {200.0, 100.0}, {300.0, 0.0}}};
    EXPECT_FALSE(Touches(arch, {0.0, 76.0}, {300.0, 76.0}, 2.0));
    EXPECT_TRUE(Touches(arch, {152.0, 76.0}, {300.0, 76.0}, 2.0));
    EXPECT_TRUE(Touches(arch, {0.0, 74.0}, {300.0, 74.0}, 2.0));
}

TEST(FatLine, WithoutWidthTouchesByCrossingOnly)
{
    EXPECT_TRUE(Touches(wave, {150.0, -50.0}, {150.0, 50.0}, 0.0));
    EXPECT_FALSE(Touches(wave, {0.0, 0.0}, {0.0, 0.0}, 0.0));
}

TEST(FatLine, OfNaNIsFalse)
{
    EXPECT_FALSE(Touches(wave, {150.0, -50.0}, {150.0, 50.0}, nan));
    EXPECT_FALSE(Touches(wave, {nan, -50.0}, {150.0, nan}, 1.0));
}

} // namespace

} // namespace ZarnMath::CubicBezier
