#include "ZarnMath/FitBezier.h"

#include "tests/FitBezier/Runs.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

bool Fit(const std::vector<point2d>& points, std::vector<double>& coefficients)
{
    return LeastSquares(points.data(), static_cast<unsigned long>(points.size()), coefficients);
}

TEST(ParabolaFit, ThreePointsOfAParabola)
{
    std::vector<double> c;
    ASSERT_TRUE(Fit({{0.0, 1.0}, {1.0, 6.0}, {2.0, 17.0}}, c)); // 1 + 2*x + 3*x^2
    ASSERT_EQ(c.size(), 3U);
    EXPECT_NEAR(c[0], 1.0, 1e-12);
    EXPECT_NEAR(c[1], 2.0, 1e-12);
    EXPECT_NEAR(c[2], 3.0, 1e-12);
}

TEST(ParabolaFit, FewerThanThreePoints)
{
    std::vector<double> c{7.0};
    EXPECT_FALSE(Fit({}, c));
    EXPECT_FALSE(Fit({{0.0, 1.0}}, c));
    EXPECT_FALSE(Fit({{0.0, 1.0}, {1.0, 6.0}}, c));
    EXPECT_EQ(c, std::vector<double>{7.0});
}

TEST(ParabolaFit, OneAbscissaIsSingular)
{
    for (const double x : {0.0, 1.0, 2.0}) {
        std::vector<double> c{7.0};
        EXPECT_FALSE(Fit({{x, 1.0}, {x, 2.0}, {x, 5.0}}, c)) << x;
        EXPECT_EQ(c, std::vector<double>{7.0});
    }
}

TEST(ParabolaFit, CoefficientsAreAppended)
{
    std::vector<double> c{7.0};
    EXPECT_TRUE(Fit({{0.0, 1.0}, {1.0, 6.0}, {2.0, 17.0}}, c));
    ASSERT_EQ(c.size(), 4U);
    EXPECT_EQ(c[0], 7.0);
    EXPECT_NEAR(c[1], 1.0, 1e-12);
    EXPECT_TRUE(Fit({{0.0, 1.0}, {1.0, 6.0}, {2.0, 17.0}}, c));
    EXPECT_EQ(c.size(), 7U);
}

TEST(ParabolaFit, ZeroHasNoSign)
{
    std::vector<double> c;
    ASSERT_TRUE(Fit({{-1.0, -0.0}, {0.0, -0.0}, {1.0, -0.0}}, c));
    for (const double value : c)
        EXPECT_TRUE(SameBits(value, 0.0));
}

TEST(ParabolaFitProperties, ZeroHasNoSignWhereProductsUnderflow)
{
    RandomSource random(3);
    int zeros = 0;
    for (int n = 0; n < 2000; ++n) {
        std::vector<point2d> points(3);
        for (point2d& p : points)
            p = {random.Uniform(-1e12, 1e12), random.Uniform(-1e-318, 1e-318)};
        std::vector<double> c;
        ASSERT_TRUE(Fit(points, c));
        for (const double value : c)
            if (value == 0.0) {
                ++zeros;
                EXPECT_FALSE(std::signbit(value)) << n;
            }
    }
    EXPECT_GT(zeros, 1000);
}

TEST(ParabolaFitProperties, NoOtherParabolaHasSmallerSquares)
{
    RandomSource random(1);
    for (int n = 0; n < 2000; ++n) {
        std::vector<point2d> points(static_cast<std::size_t>(random.Integer(4, 30)));
        for (point2d& p : points)
            p = random.Point(5.0);
        std::vector<double> c;
        ASSERT_TRUE(Fit(points, c));
        const auto squares = [&](const std::vector<double>& k) {
            double sum = 0.0;
            for (const auto& [x, y] : points) {
                const double residual = k[0] + k[1] * x + k[2] * x * x - y;
                sum += residual * residual;
            }
            return sum;
        };
        const double least = squares(c);
        for (std::size_t i = 0; i < 3; ++i)
            for (const double step : {1e-3, -1e-3, 0.1, -0.1}) {
                std::vector<double> other = c;
                other[i] += step;
                EXPECT_GT(squares(other), least) << n;
            }
    }
}

TEST(ParabolaFitProperties, PointsOfAParabolaFindItAgain)
{
    RandomSource random(2);
    for (int n = 0; n < 1000; ++n) {
        const double k[3] = {random.Uniform(-9.0, 9.0), random.Uniform(-9.0, 9.0), random.Uniform(-9.0, 9.0)};
        std::vector<point2d> points;
        for (int i = 0; i < 12; ++i) {
            const double x = i - 6.0 + random.Uniform(0.0, 0.5);
            points.push_back({x, k[0] + k[1] * x + k[2] * x * x});
        }
        std::vector<double> c;
        ASSERT_TRUE(Fit(points, c));
        for (std::size_t i = 0; i < 3; ++i)
            EXPECT_NEAR(c[i], k[i], 1e-10) << n;
    }
}

} // namespace
} // namespace ZarnMath
