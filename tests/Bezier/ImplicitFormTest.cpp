#include "ZarnMath/BezierInternal.h"

#include <gtest/gtest.h>

#include <array>
#include <random>

namespace ZarnMath::CubicBezier {

namespace {

/// The coefficients in the order of the arguments.
struct Implicit
{
    double xxx = 9001.0;
    double yyy = 9002.0;
    double xxy = 9003.0;
    double xyy = 9004.0;
    double xx = 9005.0;
    double yy = 9006.0;
    double xy = 9007.0;
    double x = 9008.0;
    double y = 9009.0;
    double one = 9010.0;

    [[nodiscard]] std::array<double, 10> ToArray() const
    {
        return {xxx, yyy, xxy, xyy, xx, yy, xy, x, y, one};
    }

    [[nodiscard]] double operator()(double u, double v) const
    {
        return xxx * u * u * u + yyy * v * v * v + xxy * u * u * v + xyy * u * v * v + xx * u * u + yy * v * v +
               xy * u * v + x * u + y * v + one;
    }
};

Implicit MakeImplicit(const PowerForm& f)
{
    Implicit k;
    ConvertBezierToImplicit(f.a, f.b, f.c, f.d, k.xxx, k.yyy, k.xxy, k.xyy, k.xx, k.yy, k.xy, k.x, k.y, k.one);
    return k;
}

std::array<double, 10> Substitute(const PowerForm& first, const PowerForm& second)
{
    std::array<double, 10> p{};
    GetBezierIntersectionPolynomial(first.a, first.b, first.c, first.d, second.a, second.b, second.c, second.d,
                                    p.data());
    return p;
}

/// By Horner's rule.
double ValueAt(const std::array<double, 10>& p, double t)
{
    double value = 0.0;
    for (const double c : p)
        value = value * t + c;
    return value;
}

/// The determinant of the Bezout matrix at one point, straight from its definition; exact for small whole numbers.
double BezoutDeterminant(const PowerForm& f, double x, double y)
{
    const vector2d offset{f.d.x - x, f.d.y - y};
    const double m[3][3] = {
        {Cross(f.a, f.b), Cross(f.a, f.c), Cross(f.a, offset)},
        {Cross(f.a, f.c), Cross(f.a, offset) + Cross(f.b, f.c), Cross(f.b, offset)},
        {Cross(f.a, offset), Cross(f.b, offset), Cross(f.c, offset)},
    };
    return m[0][0] * (m[1][1] * m[2][2] - m[1][2] * m[2][1]) - m[0][1] * (m[1][0] * m[2][2] - m[1][2] * m[2][0]) +
           m[0][2] * (m[1][0] * m[2][1] - m[1][1] * m[2][0]);
}

/// A cubic with whole coefficients so small that everything about it is exact in double.
class SmallCubics
{
public:
    PowerForm operator()()
    {
        return {Point(), Point(), Point(), Point()};
    }

private:
    point2d Point()
    {
        const double x = coefficient(engine);
        const double y = coefficient(engine);
        return {x, y};
    }

    std::mt19937 engine{20261120};
    std::uniform_int_distribution<int> coefficient{-6, 6};
};

TEST(ImplicitForm, IsTheSemicubicalParabola)
{
    // x = t^3, y = t^2, so that y^3 = x^2.
    const Implicit f = MakeImplicit({{1.0, 0.0}, {0.0, 1.0}, {0.0, 0.0}, {0.0, 0.0}});
    EXPECT_EQ(f.ToArray(), (std::array<double, 10>{0.0, 1.0, 0.0, 0.0, -1.0, 0.0, 0.0, 0.0, 0.0, 0.0}));
    EXPECT_EQ(f(1.0, 1.0), 0.0);
    EXPECT_EQ(f(8.0, 4.0), 0.0);
    EXPECT_EQ(f(-1.0, 1.0), 0.0);
    EXPECT_EQ(f(2.0, 1.0), -3.0);
}

TEST(ImplicitForm, StandsInTheOrderOfTheArguments)
{
    // y^2 -> x and so on: each pure power of x and of y by the formulas of the two cubes and their neighbours.
    const Implicit f = MakeImplicit({{2.0, 3.0}, {0.0, 0.0}, {0.0, 0.0}, {0.0, 0.0}});
    EXPECT_EQ(f.xxx, -27.0);
    EXPECT_EQ(f.yyy, 8.0);
    EXPECT_EQ(f.xxy, 54.0);
    EXPECT_EQ(f.xyy, -36.0);
}

TEST(ImplicitForm, IsTheBezoutDeterminantWithItsSign)
{
    SmallCubics next;
    for (int i = 0; i < 2000; ++i) {
        const PowerForm curve = next();
        const Implicit f = MakeImplicit(curve);
        for (double x = -4.0; x <= 4.0; x += 2.0)
            for (double y = -3.0; y <= 3.0; y += 1.0)
                ASSERT_EQ(f(x, y), BezoutDeterminant(curve, x, y)) << i << " at " << x << ' ' << y;
    }
}

TEST(ImplicitForm, VanishesOnTheCurveAndItsContinuationExactlyForSmallWholeNumbers)
{
    SmallCubics next;
    for (int i = 0; i < 2000; ++i) {
        const PowerForm curve = next();
        const Implicit f = MakeImplicit(curve);
        for (double t = -3.0; t <= 3.0; t += 1.0) {
            const point2d p = Evaluate(curve, t);
            ASSERT_EQ(f(p.x, p.y), 0.0) << i << " at " << t;
        }
    }
}

TEST(ImplicitForm, IsZeroWithoutACubicTerm)
{
    const Implicit f = MakeImplicit({{0.0, 0.0}, {3.0, -7.0}, {11.0, 5.0}, {2.0, 13.0}});
    for (const double k : f.ToArray())
        EXPECT_EQ(k, 0.0);
}

TEST(ImplicitForm, OfAStraightCubicIsTheNegativeCubeOfItsLine)
{
    // All of it along (2, 1), through (3, 5); with a = (4, 2), U = Cross(a, d - p) = 2*x - 4*y + 14.
    const Implicit f = MakeImplicit({{4.0, 2.0}, {-2.0, -1.0}, {6.0, 3.0}, {3.0, 5.0}});
    for (double x = -5.0; x <= 5.0; x += 1.0)
        for (double y = -5.0; y <= 5.0; y += 1.0) {
            const double u = 2.0 * x - 4.0 * y + 14.0;
            EXPECT_EQ(f(x, y), -(u * u * u));
        }
}

TEST(ImplicitForm, MayOverwriteTheCurve)
{
    const PowerForm curve{{1.0, 2.0}, {-3.0, 4.0}, {5.0, -1.0}, {2.0, 6.0}};
    PowerForm g = curve;
    Implicit k;
    ConvertBezierToImplicit(g.a, g.b, g.c, g.d, g.a.x, g.a.y, g.b.x, g.b.y, g.c.x, g.c.y, g.d.x, g.d.y, k.y, k.one);
    const std::array<double, 10> inPlace = {g.a.x, g.a.y, g.b.x, g.b.y, g.c.x, g.c.y, g.d.x, g.d.y, k.y, k.one};
    EXPECT_EQ(inPlace, MakeImplicit(curve).ToArray());
}

TEST(IntersectionPolynomial, TakesTheValuesOfTheImplicitFormAlongTheOtherCurve)
{
    SmallCubics next;
    for (int i = 0; i < 2000; ++i) {
        const PowerForm first = next();
        const PowerForm second = next();
        const std::array<double, 10> p = Substitute(first, second);
        for (double t = -2.0; t <= 2.0; t += 1.0) {
            const point2d q = Evaluate(second, t);
            ASSERT_EQ(ValueAt(p, t), BezoutDeterminant(first, q.x, q.y)) << i << " at " << t;
        }
    }
}

TEST(IntersectionPolynomial, HasTheHighestPowerFirst)
{
    SmallCubics next;
    for (int i = 0; i < 500; ++i) {
        const PowerForm first = next();
        const PowerForm second = next();
        const std::array<double, 10> p = Substitute(first, second);
        const Implicit f = MakeImplicit(first);
        const auto& [x, y] = second.a;
        ASSERT_EQ(p[0], f.xxx * x * x * x + f.yyy * y * y * y + f.xxy * x * x * y + f.xyy * x * y * y);
        ASSERT_EQ(p[9], f(second.d.x, second.d.y));
    }
}

TEST(IntersectionPolynomial, WritesTenCoefficients)
{
    double p[12];
    for (double& c : p)
        c = -77.0;
    GetBezierIntersectionPolynomial({1.0, 2.0}, {3.0, 4.0}, {5.0, 7.0}, {0.0, 0.0}, {2.0, 1.0}, {1.0, 1.0}, {4.0, -3.0},
                                    {1.0, 2.0}, p + 1);
    EXPECT_EQ(p[0], -77.0);
    EXPECT_EQ(p[11], -77.0);
    for (int i = 1; i <= 10; ++i)
        EXPECT_NE(p[i], -77.0);
}

TEST(IntersectionPolynomial, OfAStraightCubicIsACube)
{
    // Along the x axis with a = (1, 0): U = Cross(a, d - p) = -y, and f = y^3.
    const PowerForm straight{{1.0, 0.0}, {2.0, 0.0}, {3.0, 0.0}, {0.0, 0.0}};
    // y = t - 1/2, times 2, so that t = 1/2 is a root three times.
    const PowerForm crossing{{0.0, 0.0}, {0.0, 0.0}, {0.0, 2.0}, {5.0, -1.0}};
    EXPECT_EQ(Substitute(straight, crossing),
              (std::array<double, 10>{0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 8.0, -12.0, 6.0, -1.0}));
}

TEST(IntersectionPolynomial, VanishesWithoutACubicTerm)
{
    const PowerForm parabola{{0.0, 0.0}, {3.0, -7.0}, {11.0, 5.0}, {2.0, 13.0}};
    const PowerForm cubic{{1.0, 2.0}, {-3.0, 4.0}, {5.0, -1.0}, {2.0, 6.0}};
    for (const double c : Substitute(parabola, cubic))
        EXPECT_EQ(c, 0.0);
    EXPECT_NE(Substitute(cubic, parabola)[9], 0.0);
}

TEST(IntersectionPolynomial, OfACurveWithItselfVanishes)
{
    SmallCubics next;
    for (int i = 0; i < 500; ++i) {
        const PowerForm curve = next();
        for (const double c : Substitute(curve, curve))
            ASSERT_EQ(c, 0.0);
    }
}

static_assert(noexcept(GetBezierIntersectionPolynomial({}, {}, {}, {}, {}, {}, {}, {}, nullptr)));

} // namespace

} // namespace ZarnMath::CubicBezier
