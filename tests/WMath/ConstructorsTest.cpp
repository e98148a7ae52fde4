#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

using Bounds = BoundsT<double>;

static_assert(MapStretch == 0 && MapFit == 1 && MapFill == 2);
static_assert(std::is_same_v<std::underlying_type_t<MapMode>, std::int32_t>);
static_assert(noexcept(ConstructRectTransformMatrix(Bounds{}, Bounds{}, MapFit)));

TEST(Constructors, IdentityAndSwap)
{
    EXPECT_TRUE(SameBits(IdentityMatrix(), MATRIX{1.0, 0.0, 0.0, 0.0, 1.0, 0.0}));
    EXPECT_TRUE(IdentityMatrix().IsIdentity(false, 0.0));
    EXPECT_TRUE(SameBits(SwapXYMatrix(), MATRIX{0.0, 1.0, 0.0, 1.0, 0.0, 0.0}));
}

TEST(Constructors, VectorsBecomeColumns)
{
    EXPECT_TRUE(SameBits(ConstructMatrix({1.0, 2.0}, {3.0, 4.0}, {5.0, 6.0}), MATRIX{1.0, 3.0, 5.0, 2.0, 4.0, 6.0}));
}

TEST(Constructors, Translation)
{
    EXPECT_TRUE(SameBits(ConstructTranslationMatrix({5.0, -0.0}), MATRIX{1.0, 0.0, 5.0, 0.0, 1.0, -0.0}));
}

TEST(Constructors, Rotation)
{
    const double s = std::sin(0.5);
    const double c = std::cos(0.5);
    EXPECT_TRUE(SameBits(ConstructRotationMatrix(0.5), MATRIX{c, -s, 0.0, s, c, 0.0}));
    // No angle is exact, and at 0 the negated sine is a negative zero.
    EXPECT_TRUE(SameBits(ConstructRotationMatrix(0.0), MATRIX{1.0, -0.0, 0.0, 0.0, 1.0, 0.0}));
    EXPECT_FALSE(ConstructRotationMatrix(0.0).IsIdentity(false, 0.0));
    EXPECT_EQ(ConstructRotationMatrix(halfPi).m11, std::cos(halfPi));
    EXPECT_GT(ConstructRotationMatrix(halfPi).m11, 0.0);
}

TEST(Constructors, RotationHasATranslationOfPositiveZeros)
{
    for (const double r : {-4.0, -3.0, -1.0, 1.0, 2.0, 3.0, 5.0}) {
        EXPECT_TRUE(SameBits(ConstructRotationMatrix(r).dx, 0.0)) << r;
        EXPECT_TRUE(SameBits(ConstructRotationMatrix(r).dy, 0.0)) << r;
    }
}

TEST(Constructors, ScaledRotationScalesFirst)
{
    const double s = std::sin(0.5);
    const double c = std::cos(0.5);
    EXPECT_TRUE(
        SameBits(ConstructScaledRotationMatrix(2.0, 3.0, 0.5), MATRIX{c * 2.0, -s * 3.0, 0.0, s * 2.0, c * 3.0, 0.0}));
    const MATRIX product = ConstructRotationMatrix(0.5) * ConstructScaleAroundMatrix(2.0, 3.0, {0.0, 0.0});
    EXPECT_TRUE(IsNearMatrix(ConstructScaledRotationMatrix(2.0, 3.0, 0.5), product, 1e-15));
}

TEST(Constructors, RotateAround)
{
    const double s = std::sin(0.5);
    const double c = std::cos(0.5);
    EXPECT_TRUE(SameBits(ConstructRotateAroundMatrix(0.5, {3.0, 7.0}),
                         MATRIX{c, -s, (3.0 - c * 3.0) + s * 7.0, s, c, (7.0 - s * 3.0) - c * 7.0}));
}

TEST(Constructors, ScaleAround)
{
    EXPECT_TRUE(SameBits(ConstructScaleAroundMatrix(2.0, 4.0, {3.0, 5.0}), MATRIX{2.0, 0.0, -3.0, 0.0, 4.0, -15.0}));
    EXPECT_TRUE(SameBits(ConstructScaleAroundMatrix(1.0, 1.0, {3.0, -5.0}), MATRIX{1.0, 0.0, 0.0, 0.0, 1.0, -0.0}));
}

TEST(Constructors, SkewAround)
{
    const double kx = std::tan(0.5);
    const double ky = std::tan(0.25);
    const double q = 1.0 - kx * ky;
    EXPECT_TRUE(SameBits(ConstructSkewAroundMatrix(0.5, 0.25, {3.0, 7.0}),
                         MATRIX{1.0, -kx, kx * 7.0, ky, q, 7.0 + (ky * -3.0 - q * 7.0)}));
    EXPECT_LT(ConstructSkewAroundMatrix(0.5, 0.0, {0.0, 0.0}).m12, 0.0); // the minus sign of the shear of x
}

TEST(Constructors, TransformAround)
{
    // A quarter turn about (1, 2).
    EXPECT_EQ(ConstructTransformAroundMatrix({0.0, -1.0, 0.0, 1.0, 0.0, 0.0}, {1.0, 2.0}),
              (MATRIX{0.0, -1.0, 3.0, 1.0, 0.0, 1.0}));
    RandomSource random(1);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX t = RandomFields(random);
        const point2d p = random.Point(1e3);
        EXPECT_TRUE(SameBits(ConstructTransformAroundMatrix(t, p),
                             MATRIX{t.m11, t.m12, p.x + ((t.m12 * (-p.y) - p.x * t.m11) + t.dx), t.m21, t.m22,
                                    p.y + (t.dy + (t.m22 * (-p.y) - p.x * t.m21))}));
    }
}

TEST(Constructors, TransformAroundFormsItsLinearPartAsProducts)
{
    // -0 + 0*0 is +0; an infinite neighbour makes NaN.
    EXPECT_TRUE(SameBits(ConstructTransformAroundMatrix({-0.0, 0.0, 0.0, 0.0, -0.0, 0.0}, {0.0, 0.0}).m11, 0.0));
    EXPECT_TRUE(SameBits(ConstructTransformAroundMatrix({-0.0, -1.0, 0.0, 0.0, 0.0, 0.0}, {0.0, 0.0}).m11, -0.0));
    EXPECT_TRUE(SameBits(ConstructTransformAroundMatrix({-1.0, -0.0, 0.0, 0.0, 0.0, 0.0}, {0.0, 0.0}).m12, -0.0));
    const MATRIX m = ConstructTransformAroundMatrix({1.0, infinity, 0.0, infinity, 1.0, 0.0}, {0.0, 0.0});
    EXPECT_TRUE(std::isnan(m.m11));
    EXPECT_EQ(m.m12, infinity);
    EXPECT_EQ(m.m21, infinity);
    EXPECT_TRUE(std::isnan(m.m22));
}

TEST(Constructors, AroundAPointLeavesIt)
{
    ForEachMatrixClass(2, [](RandomSource& random, MatrixClass kind) {
        const point2d p = random.Point(100.0);
        const double a = random.Uniform(-1.4, 1.4);
        const double b = random.Uniform(-1.4, 1.4);
        EXPECT_TRUE(IsNearPoint(ConstructRotateAroundMatrix(a * 5.0, p)(p), p, 1e-12));
        EXPECT_TRUE(IsNearPoint(ConstructScaleAroundMatrix(a, b, p)(p), p, 1e-12));
        EXPECT_TRUE(IsNearPoint(ConstructSkewAroundMatrix(a, b, p)(p), p, 1e-10));
        EXPECT_TRUE(IsNearPoint(ConstructTransformAroundMatrix(RandomLinear(random, kind), p)(p), p, 1e-11));
    });
}

TEST(Constructors, AgreeWithTheStepsOfAMatrix)
{
    ForEachMatrixClass(3, [](RandomSource& random, MatrixClass kind) {
        const point2d p = random.Point(100.0);
        const MATRIX t = RandomMatrix(random, kind);
        const double angle = random.Uniform(-4.0, 4.0);
        MATRIX m = identity;
        m.RotateAroundPoint(angle, p);
        EXPECT_TRUE(IsNearMatrix(ConstructRotateAroundMatrix(angle, p), m, 1e-12));
        m = identity;
        m.ScaleMatrix({t.m11, t.m22}, p);
        EXPECT_TRUE(IsNearMatrix(ConstructScaleAroundMatrix(t.m11, t.m22, p), m, 1e-11));
        m = identity;
        m.TransformAroundPoint(t, p);
        EXPECT_TRUE(IsNearMatrix(ConstructTransformAroundMatrix(t, p), m, 1e-11));
    });
}

TEST(Constructors, VectorTransform)
{
    const MATRIX m = ConstructVectorTransformMatrix({1.0, 0.0}, {0.0, 2.0});
    EXPECT_EQ(m.m12, -2.0);
    EXPECT_EQ(m.m21, 2.0);
    EXPECT_EQ(m.m11, 2.0 * std::cos(halfPi));
    EXPECT_EQ(m.dx, 0.0);
    EXPECT_EQ(m.dy, 0.0);
}

TEST(Constructors, VectorTransformFromZero)
{
    EXPECT_EQ(ConstructVectorTransformMatrix({0.0, 0.0}, {3.0, 4.0}), identity);
    EXPECT_EQ(ConstructVectorTransformMatrix({3.0, 4.0}, {0.0, 0.0}), zeroMatrix);
}

TEST(Constructors, VectorTransformFromAVeryShortVectorStillTurns)
{
    // Up to DBL_EPSILON the factor is 1, but the angle is measured.
    const MATRIX at = ConstructVectorTransformMatrix({0x1p-52, 0.0}, {0.0, 3.0});
    EXPECT_EQ(at.m21, 1.0);
    EXPECT_EQ(at.m12, -1.0);
    const MATRIX above = ConstructVectorTransformMatrix({0x1p-51, 0.0}, {0.0, 3.0});
    EXPECT_EQ(above.m21, 3.0 * 0x1p51);
}

TEST(Constructors, VectorTransformTakesOneToTheOther)
{
    RandomSource random(4);
    for (int i = 0; i < 2000; ++i) {
        const vector2d from = random.Point(10.0) - point2d{};
        const vector2d to = random.Point(10.0) - point2d{};
        const MATRIX m = ConstructVectorTransformMatrix(from, to);
        EXPECT_TRUE(IsNearVector(m(from), to, 1e-6));
        EXPECT_TRUE(m.IsOrthogonal(1e-9 * (1.0 + LengthSquared(XColumn(m)))));
        EXPECT_FALSE(m.IsMirrored());
    }
}

TEST(Constructors, LineSegmentTransform)
{
    RandomSource random(5);
    for (int i = 0; i < 2000; ++i) {
        const point2d a0 = random.Point(10.0);
        const point2d a1 = random.Point(10.0);
        const point2d b0 = random.Point(10.0);
        const point2d b1 = random.Point(10.0);
        const MATRIX m = ConstructLineSegmentTransformMatrix(a0, a1, b0, b1);
        EXPECT_TRUE(IsNearPoint(m(a0), b0, 1e-6));
        EXPECT_TRUE(IsNearPoint(m(a1), b1, 1e-6));
        EXPECT_FALSE(m.IsMirrored());
        EXPECT_EQ(m.dx, b0.x + (m.m12 * (-a0.y) - a0.x * m.m11));
        EXPECT_EQ(m.dy, b0.y + (m.m22 * (-a0.y) - a0.x * m.m21));
    }
}

TEST(Constructors, LineSegmentTransformOfAPointMoves)
{
    const MATRIX m = ConstructLineSegmentTransformMatrix({1.0, 2.0}, {1.0, 2.0}, {5.0, 7.0}, {50.0, 70.0});
    EXPECT_EQ(m, (MATRIX{1.0, 0.0, 4.0, 0.0, 1.0, 5.0}));
}

TEST(Constructors, BBoxScale)
{
    EXPECT_TRUE(SameBits(ConstructBBoxScaleMatrix({1.0, 5.0, 3.0, 2.0}, true), MATRIX{2.0, 0.0, 1.0, 0.0, 3.0, 2.0}));
    EXPECT_TRUE(SameBits(ConstructBBoxScaleMatrix({1.0, 5.0, 3.0, 2.0}, false), MATRIX{2.0, 0.0, 0.0, 0.0, 3.0, 0.0}));
    EXPECT_EQ(ConstructBBoxScaleMatrix({3.0, 2.0, 1.0, 5.0}, true), (MATRIX{-2.0, 0.0, 3.0, 0.0, -3.0, 5.0}));
}

TEST(Constructors, BBoxScaleOfAThinBox)
{
    EXPECT_EQ(ConstructBBoxScaleMatrix({1.0, 5.0, 1.0, 2.0}, true).m11, 1.0);
    EXPECT_EQ(ConstructBBoxScaleMatrix({1.0, 2.0, 3.0, 2.0}, true).m22, 1.0);
    EXPECT_EQ(ConstructBBoxScaleMatrix({0.0, 0x1p-52, 0x1p-52, 0.0}, true), identity);
    EXPECT_EQ(ConstructBBoxScaleMatrix({0x1p-52, 0.0, 0.0, 0x1p-52}, false), identity);
    const double above = Above(0x1p-52);
    EXPECT_EQ(ConstructBBoxScaleMatrix({0.0, above, above, 0.0}, true), (MATRIX{above, 0, 0, 0, above, 0}));
    EXPECT_TRUE(std::isnan(ConstructBBoxScaleMatrix({0.0, 1.0, nan, 0.0}, true).m11));
}

TEST(Constructors, RectTransformByMode)
{
    const Bounds from{0.0, 1.0, 2.0, 0.0};
    const Bounds to{10.0, 24.0, 14.0, 20.0};
    EXPECT_EQ(ConstructRectTransformMatrix(from, to, MapStretch), (MATRIX{2.0, 0.0, 10.0, 0.0, 4.0, 20.0}));
    EXPECT_EQ(ConstructRectTransformMatrix(from, to, MapFit), (MATRIX{2.0, 0.0, 10.0, 0.0, 2.0, 21.0}));
    EXPECT_EQ(ConstructRectTransformMatrix(from, to, MapFill), (MATRIX{4.0, 0.0, 8.0, 0.0, 4.0, 20.0}));
}

TEST(Constructors, AnyOtherModeFills)
{
    const Bounds from{0.0, 1.0, 2.0, 0.0};
    const Bounds to{10.0, 24.0, 14.0, 20.0};
    const MATRIX fill = ConstructRectTransformMatrix(from, to, MapFill);
    for (const int mode : {3, -1, 2147483647}) {
        EXPECT_TRUE(SameBits(ConstructRectTransformMatrix(from, to, static_cast<MapMode>(mode)), fill));
        EXPECT_EQ(GetScaleForSizeTransform({2.0, 1.0}, {4.0, 4.0}, static_cast<MapMode>(mode)), (vector2d{4.0, 4.0}));
    }
}

TEST(Constructors, RectTransformKeepsFlips)
{
    const Bounds from{0.0, 1.0, 2.0, 0.0};
    const Bounds flipped{14.0, 24.0, 10.0, 20.0};
    EXPECT_EQ(ConstructRectTransformMatrix(from, flipped, MapFit).m11, -2.0);
    EXPECT_EQ(ConstructRectTransformMatrix(from, flipped, MapFit).m22, 2.0);
    EXPECT_EQ(ConstructRectTransformMatrix(from, flipped, MapFill).m11, -4.0);
    EXPECT_EQ(ConstructRectTransformMatrix(from, flipped, MapFill).m22, 4.0);
}

TEST(Constructors, RectTransformWithNegativeFactorHasNegativeZeros)
{
    const Bounds unit{0.0, 1.0, 1.0, 0.0};
    const Bounds flippedX{1.0, 1.0, 0.0, 0.0};
    const MATRIX m = ConstructRectTransformMatrix(unit, flippedX, MapStretch);
    EXPECT_TRUE(SameBits(m.m12, -0.0));
    EXPECT_TRUE(SameBits(m.m21, 0.0));
    const MATRIX same = ConstructRectTransformMatrix(unit, unit, MapStretch);
    EXPECT_TRUE(same.IsIdentity(false, 0.0));
}

TEST(Constructors, RectTransformOfAFlatBoxIsUnguarded)
{
    const Bounds flat{1.0, 1.0, 1.0, 0.0};
    const Bounds unit{0.0, 1.0, 1.0, 0.0};
    EXPECT_EQ(ConstructRectTransformMatrix(flat, unit, MapStretch).m11, infinity);
    EXPECT_TRUE(std::isnan(ConstructRectTransformMatrix(flat, unit, MapStretch).m12));
    EXPECT_TRUE(std::isnan(ConstructRectTransformMatrix(flat, flat, MapStretch).m11));
    // NaN in x counts, NaN in y is passed over: the magnitude of x stands unless that of y is strictly better.
    EXPECT_TRUE(std::isnan(GetScaleForSizeTransform({0.0, 1.0}, {0.0, 3.0}, MapFit).y));
    EXPECT_EQ(GetScaleForSizeTransform({1.0, 0.0}, {3.0, 0.0}, MapFit), (vector2d{3.0, 3.0}));
    EXPECT_EQ(GetScaleForSizeTransform({1.0, 0.0}, {3.0, 0.0}, MapFill), (vector2d{3.0, 3.0}));
}

TEST(Constructors, RectTransformTakesCentreToCentre)
{
    RandomSource random(6);
    for (int i = 0; i < 2000; ++i) {
        const point2d a = random.Point(100.0);
        const point2d b = random.Point(100.0);
        const Bounds from{a.x, a.y, a.x + random.Uniform(1.0, 50.0), a.y - random.Uniform(1.0, 50.0)};
        const Bounds to{b.x, b.y, b.x + random.Uniform(-50.0, 50.0), b.y - random.Uniform(-50.0, 50.0)};
        const auto mode = static_cast<MapMode>(i % 3);
        const MATRIX m = ConstructRectTransformMatrix(from, to, mode);
        const point2d centre{(from.left + from.right) * 0.5, (from.top + from.bottom) * 0.5};
        const point2d target{(to.left + to.right) * 0.5, (to.top + to.bottom) * 0.5};
        EXPECT_TRUE(IsNearPoint(m(centre), target, 1e-9));
        if (mode == MapStretch) {
            EXPECT_TRUE(IsNearPoint(m(point2d{from.left, from.top}), {to.left, to.top}, 1e-9));
        } else {
            EXPECT_EQ(std::fabs(m.m11), std::fabs(m.m22));
        }
    }
}

TEST(Constructors, ScaleForSize)
{
    EXPECT_EQ(GetScaleForSizeTransform({2.0, 1.0}, {-4.0, 4.0}, MapStretch), (vector2d{-2.0, 4.0}));
    EXPECT_EQ(GetScaleForSizeTransform({2.0, 1.0}, {-4.0, 4.0}, MapFit), (vector2d{-2.0, 2.0}));
    EXPECT_EQ(GetScaleForSizeTransform({2.0, 1.0}, {-4.0, 4.0}, MapFill), (vector2d{-4.0, 4.0}));
    EXPECT_EQ(GetScaleForSizeTransform({1.0, 1.0}, {3.0, -3.0}, MapFit), (vector2d{3.0, -3.0}));
    // A factor of -0.0 is not below 0, and takes the positive magnitude.
    EXPECT_TRUE(SameBits(GetScaleForSizeTransform({1.0, 1.0}, {-0.0, 3.0}, MapFill), vector2d{3.0, 3.0}));
}

} // namespace

} // namespace ZarnMath
