#include "ZarnMath/Numeric.h"

#include "tests/Bits.h"

#include <cmath>
#include <numeric>
#include <random>

namespace ZarnMath {
namespace {

constexpr int smallest = std::numeric_limits<int>::min();
constexpr int largest = std::numeric_limits<int>::max();
constexpr double epsilon = 2.220446049250313e-16;

TEST(Gaussian, PeakOfTheUnitNormal)
{
    EXPECT_EQ(Gaussian(0.0, 0.0, 1.0), 1.0 / std::sqrt(6.283185307179586));
    EXPECT_EQ(Gaussian(7.5, 7.5, 1.0), 1.0 / std::sqrt(6.283185307179586));
}

TEST(Gaussian, FallsOffOnBothSides)
{
    const double peak = Gaussian(2.0, 2.0, 3.0);
    EXPECT_NEAR(Gaussian(5.0, 2.0, 3.0), peak * std::exp(-0.5), 1e-16);
    EXPECT_EQ(Gaussian(5.0, 2.0, 3.0), Gaussian(-1.0, 2.0, 3.0));
    EXPECT_EQ(Gaussian(5.0, 2.0, 3.0), Gaussian(5.0, 2.0, -3.0));
    EXPECT_EQ(Gaussian(1e6, 2.0, 3.0), 0.0);
}

TEST(Gaussian, IntegratesToOne)
{
    double sum = 0.0;
    for (int i = -4000; i <= 4000; ++i)
        sum += Gaussian(1.0 + i * 0.005, 1.0, 2.0) * 0.005;
    EXPECT_NEAR(sum, 1.0, 1e-12);
}

TEST(Gaussian, SigmaZeroGivesWhatTheArithmeticGives)
{
    EXPECT_TRUE(std::isnan(Gaussian(1.0, 1.0, 0.0))); // 0 / 0 in the exponent
    EXPECT_TRUE(std::isnan(Gaussian(2.0, 1.0, 0.0))); // infinity times exp(-infinity)
}

TEST(CubeRoot, IsTheRealRoot)
{
    EXPECT_NEAR(CubeRoot(8.0), 2.0, 1e-15);
    EXPECT_NEAR(CubeRoot(-8.0), -2.0, 1e-15);
    EXPECT_EQ(CubeRoot(1.0), 1.0);
    EXPECT_EQ(CubeRoot(-27.0), -CubeRoot(27.0));
    EXPECT_EQ(CubeRoot(infinity), infinity);
    EXPECT_EQ(CubeRoot(-infinity), -infinity);
}

TEST(CubeRoot, GoesThroughThePowerOfAThirdRoundedDown)
{
    EXPECT_EQ(CubeRoot(1e300), std::pow(1e300, 0.3333333333333333));
    EXPECT_NE(CubeRoot(1e300), std::cbrt(1e300));
}

TEST(CubeRoot, IsAFlatZeroUpToItsThreshold)
{
    const double above = Above(1e-10);
    EXPECT_EQ(CubeRoot(1e-10), 0.0);
    EXPECT_EQ(CubeRoot(-1e-10), 0.0);
    EXPECT_FALSE(std::signbit(CubeRoot(-1e-10)));
    EXPECT_GT(CubeRoot(above), 4e-4);
    EXPECT_LT(CubeRoot(-above), -4e-4);
    EXPECT_GT(CubeRoot(2e-10), 5e-4);
    EXPECT_EQ(CubeRoot(nan), 0.0);
    EXPECT_FALSE(std::signbit(CubeRoot(-0.0)));
}

TEST(GCD, OfTheAbsoluteValues)
{
    EXPECT_EQ(GCD(-12, 18), 6);
    EXPECT_EQ(GCD(12, -18), 6);
    EXPECT_EQ(GCD(-12, -18), 6);
    EXPECT_EQ(GCD(7, 7), 7);
    EXPECT_EQ(GCD(-7, 7), 7);
    EXPECT_EQ(GCD(1, 1000), 1);
    EXPECT_EQ(GCD(1000, 1), 1);
    EXPECT_EQ(GCD(17, 5), 1);
}

TEST(GCD, WithZero)
{
    EXPECT_EQ(GCD(0, 0), 0);
    EXPECT_EQ(GCD(-5, 0), 5);
    EXPECT_EQ(GCD(0, -5), 5);
}

TEST(GCD, AtTheLimits)
{
    EXPECT_EQ(GCD(smallest, 6), 2);
    EXPECT_EQ(GCD(1 << 30, smallest), 1 << 30);
    EXPECT_EQ(GCD(smallest, largest), 1);
    EXPECT_EQ(GCD(largest, largest), largest);
    // 2^31 has no int, but asking for it must not trap.
    (void)GCD(smallest, smallest);
    (void)GCD(smallest, 0);
    (void)GCD(0, smallest);
}

TEST(GCD, OfMultiples)
{
    std::mt19937 engine(1);
    std::uniform_int_distribution<int> factor(-3000, 3000);
    for (int i = 0; i < 5000; ++i) {
        const int a = factor(engine) * 60;
        const int b = factor(engine) * 84;
        EXPECT_EQ(GCD(a, b), std::gcd(a, b));
    }
}

TEST(Bias, OfOneHalfIsTheIdentity)
{
    for (const double x : {-3.0, -0.0, 0.3, 1.0, 7.0, infinity})
        EXPECT_EQ(Bias(x, 0.5), x);
    EXPECT_EQ(Bias(0.3, 0.5 + epsilon), 0.3);
    EXPECT_EQ(Bias(0.3, 0.5 - epsilon), 0.3);
    EXPECT_TRUE(std::isnan(Bias(nan, 0.5)));
}

TEST(Bias, OfZeroOrLessIsZero)
{
    for (const double bias : {0.0, -0.0, -3.0, -infinity, epsilon})
        for (const double x : {-1.0, 0.0, 0.5, 1.0, nan})
            EXPECT_EQ(Bias(x, bias), 0.0);
    EXPECT_NE(Bias(0.5, 2.0 * epsilon), 0.0);
}

TEST(Bias, OfOneOrMoreIsOne)
{
    for (const double bias : {1.0, 3.0, infinity, nan}) {
        EXPECT_EQ(Bias(0.25, bias), 1.0);
        EXPECT_EQ(Bias(1.0, bias), 1.0);
        EXPECT_TRUE(std::isnan(Bias(0.0, bias))); // 0 / 0
    }
}

TEST(Bias, TakesTheMiddleToItself)
{
    for (int i = 1; i < 100; ++i)
        EXPECT_NEAR(Bias(0.5, i / 100.0), i / 100.0, 1e-15);
    EXPECT_EQ(Bias(0.5, 0.25), 0.25);
    EXPECT_EQ(Bias(0.5, 0.75), 0.75);
}

TEST(Bias, KeepsTheEnds)
{
    for (const double bias : {0.1, 0.25, 0.8}) {
        EXPECT_EQ(Bias(0.0, bias), 0.0);
        EXPECT_NEAR(Bias(1.0, bias), 1.0, 1e-15);
    }
    EXPECT_EQ(Bias(0.5, 0.25), 0.125 / 0.5);
    EXPECT_EQ(Bias(0.25, 0.25), 0.0625 / 0.625);
}

TEST(Gain, OfZeroIsTheIdentity)
{
    for (const double x : {-3.0, 0.0, 0.3, 1.0, 7.0}) {
        EXPECT_EQ(Gain(x, 0.0), x);
        EXPECT_EQ(Gain(x, epsilon), x);
        EXPECT_EQ(Gain(x, -epsilon), x);
    }
    EXPECT_TRUE(std::isnan(Gain(nan, 0.0)));
}

TEST(Gain, LeavesTheMiddle)
{
    for (const double gain : {-0.9, -0.5, -0.1, 0.1, 0.5, 0.9})
        EXPECT_NEAR(Gain(0.5, gain), 0.5, 1e-15);
    EXPECT_EQ(Gain(0.5, 0.5), 0.5);
}

TEST(Gain, LowerHalf)
{
    EXPECT_EQ(Gain(0.25, 1.0), 0.5);    // s 2, h -1, den 1
    EXPECT_EQ(Gain(0.25, 0.5), 0.375);  // s 1.5, h -0.5, den 1
    EXPECT_EQ(Gain(0.25, -0.5), 0.125); // s 0.5, h 0.5, den 1
    EXPECT_EQ(Gain(0.0, 0.5), 0.0);
}

TEST(Gain, UpperHalf)
{
    EXPECT_EQ(Gain(0.75, 0.5), 0.625); // s 1.5, h 0.5, n 1.125: -0.625 / -1
    EXPECT_EQ(Gain(0.75, 1.0), 0.5);   // s 2, h 1, n 1.5: -0.5 / -1
    EXPECT_EQ(Gain(1.0, 0.5), 1.0);
}

TEST(Gain, BeyondTheRangeIsThatOfTheLimit)
{
    for (const double x : {0.1, 0.25, 0.6, 0.75}) {
        EXPECT_EQ(Gain(x, 5.0), Gain(x, 1.0));
        EXPECT_EQ(Gain(x, -5.0), Gain(x, -1.0));
    }
}

/// At x = 0 the curve of gain 1 jumps from its limit 0.5 to 1.
TEST(Gain, IsOneWhereTheDenominatorVanishes)
{
    EXPECT_EQ(Gain(0.0, 1.0), 1.0);            // s 2, h -2
    EXPECT_EQ(Gain(epsilon / 16.0, 1.0), 1.0); // 1 - 2x rounds to 1
    EXPECT_EQ(Gain(0x1p-54, 1.0), 1.0);        // the denominator is 2^-52, which still counts as 0
    EXPECT_EQ(Gain(0x1p-53, 1.0), 0.5);        // 2^-51
    EXPECT_EQ(Gain(0x1p-30, 1.0), 0.5);
    EXPECT_EQ(Gain(1.0, -1.0), 1.0);  // s 0, h -2: the denominator is no 0, and h - n over h - s is 1
    EXPECT_EQ(Gain(0.5, -1.0), 1.0);  // s 0, h 0
    EXPECT_EQ(Gain(0.25, -1.0), 0.0); // s 0, h 1
    EXPECT_EQ(Gain(0.75, -1.0), 1.0);
}

TEST(Gain, OfOneAtTheEndIsNan)
{
    EXPECT_TRUE(std::isnan(Gain(1.0, 1.0))); // 0 / 0
}

TEST(Gain, NanDoesNotTrap)
{
    (void)Gain(0.25, nan);
    (void)Gain(0.75, nan);
    EXPECT_TRUE(std::isnan(Gain(nan, 0.5)));
}

TEST(LinearBlend, IsTheQuotient)
{
    EXPECT_EQ(GetLinearBlendFactor(3, 4), 0.75);
    EXPECT_EQ(GetLinearBlendFactor(0, 4), 0.0);
    EXPECT_EQ(GetLinearBlendFactor(1, 3), 1.0 / 3.0);
    EXPECT_EQ(GetLinearBlendFactor(6, 4), 1.5);
}

TEST(LinearBlend, OfNoStepsIsOne)
{
    EXPECT_EQ(GetLinearBlendFactor(3, 0), 1.0);
    EXPECT_EQ(GetLinearBlendFactor(0, 0), 1.0);
}

TEST(LinearBlend, ConvertsBeforeItDivides)
{
    constexpr unsigned long most = std::numeric_limits<unsigned long>::max();
    if (sizeof most == 8) {
        EXPECT_EQ(GetLinearBlendFactor(most - 1, most), 1.0); // both round to the same
    }
    EXPECT_EQ(GetLinearBlendFactor(most, 1), static_cast<double>(most));
}

TEST(LogarithmicBlend, OfBaseOneIsTheIdentity)
{
    for (const double x : {-3.0, 0.0, 0.3, 1.0})
        for (const double base : {1.0, 1.0 + epsilon, 1.0 - epsilon})
            EXPECT_EQ(GetLogarithmicBlendFactor(x, base), x);
}

TEST(LogarithmicBlend, KeepsTheEnds)
{
    for (const double base : {0.1, 0.5, 2.0, 10.0, 1000.0}) {
        EXPECT_EQ(GetLogarithmicBlendFactor(0.0, base), 0.0);
        EXPECT_NEAR(GetLogarithmicBlendFactor(1.0, base), 1.0, 1e-15);
    }
    EXPECT_NEAR(GetLogarithmicBlendFactor(1.0 / 3.0, 4.0), 0.5, 1e-15);
    EXPECT_GT(GetLogarithmicBlendFactor(0.5, 10.0), 0.5);
    EXPECT_LT(GetLogarithmicBlendFactor(0.5, 0.1), 0.5);
}

TEST(LogarithmicBlend, BaseOutsideTheDomain)
{
    EXPECT_TRUE(std::isnan(GetLogarithmicBlendFactor(0.5, -2.0)));
    EXPECT_EQ(GetLogarithmicBlendFactor(0.5, 0.0), 0.0); // log(1/2) over -infinity
    EXPECT_FALSE(std::isfinite(GetLogarithmicBlendFactor(1.0, 0.0)));
}

TEST(BiasGainBlend, IsGainOfBias)
{
    for (int i = 0; i <= 20; ++i)
        for (const double bias : {0.2, 0.5, 0.9})
            for (const double gain : {-0.5, 0.0, 0.7})
                EXPECT_EQ(GetBiasGainBlendFactor(i / 20.0, gain, bias), Gain(Bias(i / 20.0, bias), gain));
    EXPECT_EQ(GetBiasGainBlendFactor(0.5, 0.5, 0.25), 0.375); // bias to 0.25, gain to 0.375
}

} // namespace
} // namespace ZarnMath
