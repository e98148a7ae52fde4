#include "tests/Sentinels.h"
#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

constexpr AFF_TRANSFORM untouched{-11.0, -12.0, -13.0, -14.0, {-15.0, -16.0}};

struct Parts
{
    bool isWhole;
    AFF_TRANSFORM a;
};

Parts Decompose(const vector2d& x, const vector2d& y, const point2d& origin = {7.0, 8.0})
{
    Parts parts{false, untouched};
    parts.isWhole = DecomposeAffineTransformFromVectors(parts.a, origin, x, y);
    return parts;
}

MATRIX FromVectors(const vector2d& x, const vector2d& y)
{
    return {x.x, y.x, 7.0, x.y, y.y, 8.0};
}

testing::AssertionResult ComposesBack(const MATRIX& m, double tolerance = 1e-12)
{
    AFF_TRANSFORM a = untouched;
    if (!DecomposeAffineTransform(a, m))
        return testing::AssertionFailure() << "cannot be taken apart: " << testing::PrintToString(m);
    MATRIX back{nan, nan, nan, nan, nan, nan};
    if (!ComposeAffineTransform(back, a))
        return testing::AssertionFailure() << "has a scale of 0";
    return IsNearMatrix(back, m, tolerance);
}

static_assert(std::is_aggregate_v<AFF_TRANSFORM>);
static_assert(offsetof(AFF_TRANSFORM, scaleX) == 0 && offsetof(AFF_TRANSFORM, scaleY) == 8);
static_assert(offsetof(AFF_TRANSFORM, skew) == 16 && offsetof(AFF_TRANSFORM, rotation) == 24);
static_assert(offsetof(AFF_TRANSFORM, translation) == 32 && sizeof(AFF_TRANSFORM) == 48);

TEST(Decomposition, Identity)
{
    const Parts parts = Decompose({1.0, 0.0}, {0.0, 1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_EQ(parts.a, (AFF_TRANSFORM{1.0, 1.0, 0.0, 0.0, {7.0, 8.0}}));
    EXPECT_TRUE(ComposesBack(identity, 0.0));
}

TEST(Decomposition, MirrorInTheYAxisFlipsTheFirstVector)
{
    const Parts parts = Decompose({-1.0, 0.0}, {0.0, 1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_EQ(parts.a.scaleX, -1.0);
    EXPECT_TRUE(SameBits(parts.a.rotation, -0.0)); // the flip negates the zero
    EXPECT_EQ(parts.a.scaleY, 1.0);
    EXPECT_TRUE(ComposesBack(FromVectors({-1.0, 0.0}, {0.0, 1.0}), 1e-15));
}

TEST(Decomposition, MirrorInTheXAxisNegatesTheSecondScale)
{
    const Parts parts = Decompose({1.0, 0.0}, {0.0, -1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_EQ(parts.a.scaleX, 1.0);
    EXPECT_EQ(parts.a.scaleY, -1.0);
    EXPECT_EQ(parts.a.rotation, 0.0);
    EXPECT_TRUE(ComposesBack(FromVectors({1.0, 0.0}, {0.0, -1.0}), 1e-15));
}

TEST(Decomposition, HalfTurnIsNoFlip)
{
    const Parts parts = Decompose({-1.0, 0.0}, {0.0, -1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_EQ(parts.a.rotation, pi);
    EXPECT_EQ(parts.a.scaleX, 1.0);
    EXPECT_EQ(parts.a.scaleY, 1.0);
}

TEST(Decomposition, OnlyALeftHandedPairThatPointsLeftwardFlips)
{
    // Left-handed, upward: the first x is not below 0.
    const Parts upward = Decompose({0.0, 1.0}, {1.0, 0.0});
    EXPECT_TRUE(upward.isWhole);
    EXPECT_EQ(upward.a.scaleX, 1.0);
    EXPECT_EQ(upward.a.scaleY, -1.0);
    EXPECT_EQ(upward.a.rotation, halfPi);
    // Left-handed, just leftward of upward.
    const Parts leftward = Decompose({-1e-300, 1.0}, {1.0, 0.0});
    EXPECT_TRUE(leftward.isWhole);
    EXPECT_EQ(leftward.a.scaleX, -1.0);
    EXPECT_EQ(leftward.a.scaleY, 1.0);
    EXPECT_EQ(leftward.a.rotation, -halfPi);
    // Right-handed and leftward.
    EXPECT_EQ(Decompose({-1.0, 1.0}, {-1.0, -1.0}).a.scaleX, std::sqrt(2.0));
}

TEST(Decomposition, RotationIsNotNormalized)
{
    EXPECT_EQ(Decompose({0.0, -2.0}, {3.0, 0.0}).a.rotation, -halfPi);
    EXPECT_EQ(Decompose({0.0, -2.0}, {3.0, 0.0}).a.scaleX, 2.0);
    EXPECT_EQ(Decompose({0.0, -2.0}, {3.0, 0.0}).a.scaleY, 3.0);
}

TEST(Decomposition, SkewIsATangent)
{
    const Parts parts = Decompose({1.0, 0.0}, {1.0, 1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_NEAR(parts.a.skew, 1.0, 1e-15);
    EXPECT_NEAR(parts.a.scaleY, 1.0, 1e-15);
    const Parts clockwise = Decompose({1.0, 0.0}, {1.0, -1.0});
    EXPECT_NEAR(clockwise.a.skew, -1.0, 1e-15);
    EXPECT_NEAR(clockwise.a.scaleY, -1.0, 1e-15);
}

TEST(Decomposition, ParallelColumnsStopAfterTheSecondScale)
{
    const Parts parts = Decompose({1.0, 0.0}, {2.0, 0.0});
    EXPECT_FALSE(parts.isWhole);
    EXPECT_EQ(parts.a, (AFF_TRANSFORM{1.0, 0.0, untouched.skew, 0.0, {7.0, 8.0}}));
}

TEST(Decomposition, AntiparallelColumnsAreRefusedAsSkewed)
{
    const Parts parts = Decompose({1.0, 0.0}, {-2.0, 0.0});
    EXPECT_FALSE(parts.isWhole);
    EXPECT_GT(parts.a.scaleY, 0.0);
    EXPECT_LT(parts.a.scaleY, 1e-15);
    EXPECT_EQ(parts.a.skew, untouched.skew);
}

TEST(Decomposition, SecondVectorAlongTheTurnedAxis)
{
    const Parts parts = Decompose({3.0, 4.0}, {6.0, 8.0});
    EXPECT_FALSE(parts.isWhole);
    EXPECT_EQ(parts.a.scaleY, 0.0);
    EXPECT_EQ(parts.a.skew, untouched.skew);
}

TEST(Decomposition, ParallelColumnsWhoseCosineRoundsAboveOne)
{
    // The root of 26 and that of 104 have a product below 52.
    const Parts parts = Decompose({1.0, 5.0}, {2.0, 10.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_TRUE(std::isnan(parts.a.scaleY));
    EXPECT_TRUE(std::isnan(parts.a.skew));
}

TEST(Decomposition, ZeroSecondColumn)
{
    const Parts parts = Decompose({3.0, 4.0}, {0.0, 0.0});
    EXPECT_FALSE(parts.isWhole);
    EXPECT_EQ(parts.a.scaleX, 5.0);
    EXPECT_EQ(parts.a.scaleY, untouched.scaleY);
    EXPECT_EQ(parts.a.skew, untouched.skew);
    EXPECT_EQ(parts.a.rotation, std::atan2(4.0, 3.0));
    EXPECT_EQ(parts.a.translation, (point2d{7.0, 8.0}));
}

TEST(Decomposition, ZeroFirstColumnGivesNaN)
{
    const Parts parts = Decompose({0.0, 0.0}, {0.0, 1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_EQ(parts.a.scaleX, 0.0);
    EXPECT_TRUE(std::isnan(parts.a.scaleY));
    EXPECT_TRUE(std::isnan(parts.a.skew));
}

TEST(Decomposition, RefusesBeyondTheLargestSkew)
{
    EXPECT_EQ(BitsOf(largestSkewAngle), 0x3FF8E1A455FBD07CU);
    EXPECT_FALSE(Decompose({1.0, 0.0}, {100.0, 1.0}).isWhole);
    EXPECT_FALSE(Decompose({1.0, 0.0}, {-100.0, 1.0}).isWhole);
    const Parts parts = Decompose({1.0, 0.0}, {50.0, 1.0});
    EXPECT_TRUE(parts.isWhole);
    EXPECT_NEAR(parts.a.skew, 50.0, 1e-9);
    EXPECT_NEAR(parts.a.scaleY, 1.0, 1e-10);
}

/// A vector of length 1 whose x is exactly c.
vector2d UnitVectorAt(double c)
{
    double s = std::sqrt(1.0 - c * c);
    while (std::sqrt(c * c + s * s) < 1.0)
        s = Above(s);
    while (std::sqrt(c * c + s * s) > 1.0)
        s = Below(s);
    return {c, s};
}

TEST(Decomposition, AtTheLargestSkewTheNextCosineIsRefused)
{
    for (const double sign : {1.0, -1.0}) {
        double c = sign * std::cos(halfPi - largestSkewAngle);
        while (std::fabs(halfPi - std::acos(c)) < largestSkewAngle)
            c = std::nextafter(c, sign * 2.0);
        while (std::fabs(halfPi - std::acos(c)) >= largestSkewAngle)
            c = std::nextafter(c, 0.0);
        const double refused = std::nextafter(c, sign * 2.0);
        EXPECT_TRUE(Decompose({1.0, 0.0}, UnitVectorAt(c)).isWhole);
        EXPECT_FALSE(Decompose({1.0, 0.0}, UnitVectorAt(refused)).isWhole);
        EXPECT_NEAR(std::fabs(Decompose({1.0, 0.0}, UnitVectorAt(c)).a.skew), 63.6567, 1e-3);
    }
}

TEST(Decomposition, OfAMatrixTakesItsColumns)
{
    ForEachMatrixClass(1, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        AFF_TRANSFORM a = untouched;
        AFF_TRANSFORM b = untouched;
        EXPECT_EQ(DecomposeAffineTransform(a, m),
                  DecomposeAffineTransformFromVectors(b, {m.dx, m.dy}, {m.m11, m.m21}, {m.m12, m.m22}));
        EXPECT_EQ(a, b);
    });
}

TEST(Decomposition, OutputMayHoldTheOrigin)
{
    AFF_TRANSFORM a = untouched;
    EXPECT_TRUE(DecomposeAffineTransformFromVectors(a, a.translation, {1.0, 0.0}, {0.0, 1.0}));
    EXPECT_EQ(a.translation, untouched.translation);
}

TEST(Decomposition, ComposesBackForEveryClass)
{
    ForEachMatrixClass(2, [](RandomSource& random, MatrixClass kind) {
        EXPECT_TRUE(ComposesBack(RandomMatrix(random, kind)));
        EXPECT_TRUE(ComposesBack(LinearProduct(RandomLinear(random, kind), LinearScale(-1.0, 1.0))));
        EXPECT_TRUE(ComposesBack(LinearProduct(RandomLinear(random, kind), LinearScale(1.0, -1.0))));
        EXPECT_TRUE(ComposesBack(LinearProduct(RandomLinear(random, kind), LinearScale(-1.0, -1.0))));
    });
}

TEST(Composition, ByItsFormula)
{
    RandomSource random(3);
    for (int i = 0; i < 1000; ++i) {
        const AFF_TRANSFORM a{random.Uniform(-3.0, 3.0), random.Uniform(-3.0, 3.0), random.Uniform(-3.0, 3.0),
                              random.Uniform(-4.0, 4.0), random.Point(10.0)};
        const double k = a.scaleY * a.skew;
        const double s = std::sin(a.rotation);
        const double c = std::cos(a.rotation);
        MATRIX m{nan, nan, nan, nan, nan, nan};
        EXPECT_TRUE(ComposeAffineTransform(m, a));
        EXPECT_TRUE(SameBits(m, MATRIX{a.scaleX * c - s * 0.0, k * c - a.scaleY * s, a.translation.x,
                                       a.scaleX * s + c * 0.0, k * s + a.scaleY * c, a.translation.y}));
    }
}

TEST(Composition, ProductsWithZeroDecideSignsAndSpreadNaN)
{
    // scaleX*s is -0, to which the +0 of c*0 is added.
    MATRIX m{};
    EXPECT_TRUE(ComposeAffineTransform(m, {-1.0, 1.0, 0.0, 0.0, {0.0, 0.0}}));
    EXPECT_TRUE(SameBits(m.m21, 0.0));
    EXPECT_TRUE(ComposeAffineTransform(m, {1.0, 1.0, 0.0, nan, {1.0, 2.0}}));
    EXPECT_TRUE(SameBits(m, MATRIX{nan, nan, 1.0, nan, nan, 2.0}));
}

TEST(Composition, TellsWhetherBothScalesAreThere)
{
    MATRIX m{nan, nan, nan, nan, nan, nan};
    EXPECT_FALSE(ComposeAffineTransform(m, {0.0, 2.0, 0.0, 0.0, {5.0, 6.0}}));
    EXPECT_EQ(m, (MATRIX{0.0, 0.0, 5.0, 0.0, 2.0, 6.0}));
    EXPECT_FALSE(ComposeAffineTransform(m, {2.0, -0.0, 0.0, 0.0, {5.0, 6.0}}));
    EXPECT_EQ(m, (MATRIX{2.0, 0.0, 5.0, 0.0, 0.0, 6.0}));
    EXPECT_TRUE(ComposeAffineTransform(m, {nan, nan, 0.0, 0.0, {5.0, 6.0}}));
    EXPECT_TRUE(ComposeAffineTransform(m, {0x1p-1074, 1.0, 0.0, 0.0, {5.0, 6.0}}));
}

TEST(SeparateScale, HoldsTheChangeOfScaleApart)
{
    const MATRIX first{2.0, 0.0, 1.0, 0.0, 3.0, 2.0};
    const MATRIX then{10.0, 0.0, 5.0, 0.0, 100.0, 6.0};
    vector2d scale = sentinel<vector2d>;
    const MATRIX m = TransformMatrixAndSeparateScale(first, then, scale);
    EXPECT_TRUE(IsNearVector(scale, {10.0, 100.0}, 1e-12));
    EXPECT_TRUE(IsNearMatrix(m, {2.0, 0.0, 15.0, 0.0, 3.0, 206.0}, 1e-12));
}

TEST(SeparateScale, HasPositionTurnAndSkewOfTheProduct)
{
    ForEachMatrixClass(4, [](RandomSource& random, MatrixClass kind) {
        const MATRIX first = RandomMatrix(random, MatrixClass::Generic);
        const MATRIX then = RandomMatrix(random, kind);
        AFF_TRANSFORM a{};
        AFF_TRANSFORM p{};
        ASSERT_TRUE(DecomposeAffineTransform(a, first));
        if (!DecomposeAffineTransform(p, then * first))
            return; // two shears may add up to one that is refused
        vector2d scale{};
        MATRIX expected{};
        ComposeAffineTransform(expected, {a.scaleX, a.scaleY, p.skew, p.rotation, p.translation});
        EXPECT_TRUE(SameBits(TransformMatrixAndSeparateScale(first, then, scale), expected));
        EXPECT_TRUE(SameBits(scale, vector2d{p.scaleX / a.scaleX, p.scaleY / a.scaleY}));
    });
}

TEST(SeparateScale, RefusedDecompositionsLeaveNeutralValues)
{
    // No second column: scaleY stays 1 and the skew 0 in both.
    vector2d scale{};
    const MATRIX flat{2.0, 0.0, 1.0, 0.0, 0.0, 2.0};
    const MATRIX m = TransformMatrixAndSeparateScale(flat, {3.0, 0.0, 0.0, 0.0, 3.0, 0.0}, scale);
    EXPECT_TRUE(IsNearVector(scale, {3.0, 1.0}, 1e-15));
    EXPECT_EQ(m, (MATRIX{2.0, 0.0, 3.0, 0.0, 1.0, 6.0}));
    // Parallel columns: scaleY is written as 0 before the refusal.
    const MATRIX parallel = TransformMatrixAndSeparateScale({1.0, 2.0, 0.0, 0.0, 0.0, 0.0}, identity, scale);
    EXPECT_TRUE(SameBits(scale, vector2d{1.0, nan}));
    EXPECT_EQ(parallel, (MATRIX{1.0, 0.0, 0.0, 0.0, 0.0, 0.0}));
}

TEST(SeparateScale, OfAZeroScaleIsNaN)
{
    vector2d scale{};
    EXPECT_FALSE(std::isfinite(
        TransformMatrixAndSeparateScale({0.0, 0.0, 1.0, 0.0, 1.0, 2.0}, {1.0, 1.0, 0.0, 0.0, 1.0, 0.0}, scale).m12));
    EXPECT_TRUE(std::isnan(scale.x));
}

} // namespace

} // namespace ZarnMath
