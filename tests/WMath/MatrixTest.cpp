#include "tests/WMath/Matrices.h"

#include <cstddef>

namespace ZarnMath {

namespace {

constexpr double halfPi = 1.5707963267948966;

static_assert(sizeof(MATRIX) == 48);
static_assert(offsetof(MATRIX, m11) == 0 && offsetof(MATRIX, m12) == 8 && offsetof(MATRIX, dx) == 16);
static_assert(offsetof(MATRIX, m21) == 24 && offsetof(MATRIX, m22) == 32 && offsetof(MATRIX, dy) == 40);
static_assert(std::is_aggregate_v<MATRIX> && std::is_trivially_copyable_v<MATRIX>);
static_assert(noexcept(std::declval<MATRIX&>().Invert(0.0)));
static_assert(noexcept(std::declval<const MATRIX&>()(point2d{})));
static_assert(noexcept(std::declval<const MATRIX&>()(vector2d{})));
static_assert(noexcept(std::declval<const MATRIX&>() * identity));
static_assert(noexcept(IsEqual(identity, identity, 0.0)));

/// A number that swallows 1 when added to it, and gives it back when taken away first.
constexpr double huge = 1e17;

TEST(Matrix, ImageOfAPointIsTheColumnVectorConvention)
{
    const MATRIX m{2.0, 3.0, 5.0, 7.0, 11.0, 13.0};
    EXPECT_TRUE(SameBits(m(point2d{17.0, 19.0}), point2d{96.0, 341.0}));
    EXPECT_TRUE(SameBits(m(vector2d{17.0, 19.0}), vector2d{91.0, 328.0}));
}

TEST(Matrix, ImageSumsTheLinearPartBeforeTheTranslation)
{
    // (1 - huge) is -huge, to which huge adds up to 0; the translation first would leave 1.
    const MATRIX m{-1.0, 1.0, huge, -1.0, 1.0, huge};
    EXPECT_TRUE(SameBits(m(point2d{huge, 1.0}), point2d{0.0, 0.0}));
}

TEST(Matrix, RightHandOperandActsFirst)
{
    const MATRIX scale{2.0, 0.0, 0.0, 0.0, 2.0, 0.0};
    const MATRIX move{1.0, 0.0, 3.0, 0.0, 1.0, 4.0};
    EXPECT_TRUE(SameBits(scale * move, MATRIX{2.0, 0.0, 6.0, 0.0, 2.0, 8.0}));
    EXPECT_TRUE(SameBits(move * scale, MATRIX{2.0, 0.0, 3.0, 0.0, 2.0, 4.0}));
    const MATRIX a{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    const MATRIX b{7.0, 8.0, 9.0, 10.0, 11.0, 12.0};
    EXPECT_TRUE(SameBits(a * b, MATRIX{27.0, 30.0, 36.0, 78.0, 87.0, 102.0}));
}

TEST(Matrix, ProductSumsTheLinearPartBeforeTheTranslation)
{
    const MATRIX a{-1.0, 1.0, huge, -1.0, 1.0, huge};
    const MATRIX b{1.0, 0.0, huge, 0.0, 1.0, 1.0};
    const MATRIX product = a * b;
    EXPECT_EQ(product.dx, 0.0);
    EXPECT_EQ(product.dy, 0.0);
}

TEST(Matrix, ProductOfImagesIsImageOfProduct)
{
    ForEachMatrixClass(1, [](RandomSource& random, MatrixClass kind) {
        const MATRIX a = RandomMatrix(random, kind);
        const MATRIX b = RandomMatrix(random, MatrixClass::Generic);
        const point2d p = random.Point(100.0);
        EXPECT_TRUE(IsNearPoint((a * b)(p), a(b(p)), 1e-8));
    });
}

TEST(Matrix, RotateTurnsCounterClockwise)
{
    MATRIX m{1.0, 0.0, 3.0, 0.0, 1.0, 0.0};
    m.Rotate(halfPi);
    EXPECT_TRUE(IsNearMatrix(m, {0.0, -1.0, 0.0, 1.0, 0.0, 3.0}, 1e-15));
}

TEST(Matrix, RotateHasNoExactQuarterTurn)
{
    MATRIX m = identity;
    m.Rotate(halfPi);
    EXPECT_EQ(m.m11, std::cos(halfPi));
    EXPECT_GT(m.m11, 6.1e-17);
    EXPECT_LT(m.m11, 6.2e-17);
}

TEST(Matrix, RotateByZeroIsNoSpecialCase)
{
    // 1*-0.0 - 0*-1.0 is -0.0 + 0.0: a field that was left alone would keep its sign.
    MATRIX m{-0.0, 1.0, 2.0, -1.0, 1.0, 3.0};
    m.Rotate(0.0);
    EXPECT_TRUE(SameBits(m, MATRIX{0.0, 1.0, 2.0, -1.0, 1.0, 3.0}));
}

TEST(Matrix, RotateUsesTheOldFields)
{
    RandomSource random(2);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX old = RandomFields(random);
        const double r = random.Uniform(-10.0, 10.0);
        const double s = std::sin(r);
        const double c = std::cos(r);
        MATRIX m = old;
        m.Rotate(r);
        EXPECT_TRUE(SameBits(m, MATRIX{c * old.m11 - s * old.m21, c * old.m12 - s * old.m22, c * old.dx - s * old.dy,
                                       s * old.m11 + c * old.m21, s * old.m12 + c * old.m22, s * old.dx + c * old.dy}));
    }
}

TEST(Matrix, RotateAroundPointShiftsEvenForZero)
{
    const point2d centre{1000000007.0, -3.0};
    MATRIX m{1.0, 0.0, 0.1, 0.0, 1.0, 0.1};
    m.RotateAroundPoint(0.0, centre);
    const double shiftedX = 0.1 - 1000000007.0;
    EXPECT_EQ(m.dx, shiftedX + 1000000007.0);
    EXPECT_NE(m.dx, 0.1);
}

TEST(Matrix, RotateAroundPointLeavesTheCentre)
{
    MATRIX m = identity;
    m.RotateAroundPoint(halfPi, {1.0, 1.0});
    EXPECT_TRUE(IsNearPoint(m(point2d{1.0, 1.0}), {1.0, 1.0}, 1e-15));
    EXPECT_TRUE(IsNearPoint(m(point2d{2.0, 1.0}), {1.0, 2.0}, 1e-15));
}

TEST(Matrix, RotateAroundPointGroupsAsShiftTurnShift)
{
    RandomSource random(3);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX old = RandomFields(random);
        const double r = random.Uniform(-10.0, 10.0);
        const point2d p = random.Point(1e6);
        const double s = std::sin(r);
        const double c = std::cos(r);
        const double tx = old.dx - p.x;
        const double ty = old.dy - p.y;
        MATRIX m = old;
        m.RotateAroundPoint(r, p);
        EXPECT_TRUE(SameBits(m, MATRIX{c * old.m11 - s * old.m21, c * old.m12 - s * old.m22, (c * tx - s * ty) + p.x,
                                       s * old.m11 + c * old.m21, s * old.m12 + c * old.m22, (s * tx + c * ty) + p.y}));
    }
}

TEST(Matrix, TransformAroundPoint)
{
    // A quarter turn about (1, 2), after a move by (5, 7).
    MATRIX m{1.0, 0.0, 5.0, 0.0, 1.0, 7.0};
    m.TransformAroundPoint({0.0, -1.0, 0.0, 1.0, 0.0, 0.0}, {1.0, 2.0});
    EXPECT_TRUE(SameBits(m, MATRIX{0.0, -1.0, -4.0, 1.0, 0.0, 6.0}));
}

TEST(Matrix, TransformAroundPointGroups)
{
    // (huge - huge) + 1 and then the centre; any other order loses the 1.
    MATRIX m{1.0, 0.0, huge, 0.0, 1.0, huge};
    m.TransformAroundPoint({1.0, -1.0, 1.0, -1.0, 1.0, 1.0}, {0.0, 0.0});
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, -1.0, 1.0, -1.0, 1.0, 1.0}));
}

TEST(Matrix, TransformAroundPointByItself)
{
    const MATRIX old{2.0, 3.0, 5.0, 7.0, 11.0, 13.0};
    MATRIX separate = old;
    separate.TransformAroundPoint(MATRIX{old}, {1.0, -1.0});
    MATRIX itself = old;
    itself.TransformAroundPoint(itself, {1.0, -1.0});
    EXPECT_TRUE(SameBits(itself, separate));
}

TEST(Matrix, ScaleMatrixScalesRowsWithTheirTranslation)
{
    MATRIX m{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    m.ScaleMatrix(vector2d{10.0, -1.0});
    EXPECT_TRUE(SameBits(m, MATRIX{10.0, 20.0, 30.0, -4.0, -5.0, -6.0}));
}

TEST(Matrix, ScaleMatrixAboutAPoint)
{
    MATRIX m{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    m.ScaleMatrix(vector2d{10.0, -1.0}, point2d{1.0, 2.0});
    EXPECT_TRUE(SameBits(m, MATRIX{10.0, 20.0, 21.0, -4.0, -5.0, -2.0}));
}

TEST(Matrix, StepsActAfterWhatTheMatrixDoes)
{
    ForEachMatrixClass(4, [](RandomSource& random, MatrixClass kind) {
        const MATRIX old = RandomMatrix(random, MatrixClass::Generic);
        const MATRIX t = RandomMatrix(random, kind);
        const point2d centre = random.Point(100.0);
        const point2d p = random.Point(100.0);
        const point2d before = old(p);
        const double angle = random.Uniform(-4.0, 4.0);
        const vector2d scale = random.Point(3.0) - point2d{};

        MATRIX m = old;
        m.Rotate(angle);
        EXPECT_TRUE(IsNearPoint(m(p), LinearTurn(angle)(before), 1e-8));
        m = old;
        m.RotateAroundPoint(angle, centre);
        EXPECT_TRUE(IsNearPoint(m(p), centre + LinearTurn(angle)(before - centre), 1e-8));
        m = old;
        m.TransformAroundPoint(t, centre);
        EXPECT_TRUE(IsNearPoint(m(p), t(AsPoint(before - centre)) + (centre - point2d{}), 1e-8));
        m = old;
        m.ScaleMatrix(scale);
        EXPECT_TRUE(IsNearPoint(m(p), {before.x * scale.x, before.y * scale.y}, 1e-8));
        m = old;
        m.ScaleMatrix(scale, centre);
        const vector2d offset = before - centre;
        EXPECT_TRUE(IsNearPoint(m(p), centre + vector2d{offset.x * scale.x, offset.y * scale.y}, 1e-8));
    });
}

TEST(Matrix, RemoveScalingNormalisesRowsNotColumns)
{
    const MATRIX turn{0.6, -0.8, 0.0, 0.8, 0.6, 0.0};
    // What turns first and scales afterwards comes out as the turn.
    MATRIX scaledAfter{1.2, -1.6, 5.0, 4.0, 3.0, 6.0};
    scaledAfter.RemoveScaling();
    EXPECT_TRUE(IsNearMatrix(scaledAfter, {0.6, -0.8, 5.0, 0.8, 0.6, 6.0}, 1e-15));
    // What scales unevenly first does not: the rows (1.2, -4) and (1.6, 3) are not perpendicular.
    MATRIX scaledBefore{1.2, -4.0, 5.0, 1.6, 3.0, 6.0};
    scaledBefore.RemoveScaling();
    EXPECT_FALSE(IsEqual(scaledBefore, turn, 0.1));
    EXPECT_NEAR(scaledBefore.m11, 1.2 / std::sqrt(17.44), 1e-15);
    EXPECT_NEAR(scaledBefore.m22, 3.0 / std::sqrt(11.56), 1e-15);
}

TEST(Matrix, RemoveScalingLeavesShortRows)
{
    const double shortest = 0x1p-26; // its square is DBL_EPSILON
    MATRIX m{shortest, 0.0, 5.0, 0.0, 4.0, 6.0};
    m.RemoveScaling();
    EXPECT_TRUE(SameBits(m, MATRIX{shortest, 0.0, 5.0, 0.0, 1.0, 6.0}));
    m = {3.0, 4.0, 5.0, 0.0, -shortest, 6.0};
    m.RemoveScaling();
    EXPECT_TRUE(SameBits(m, MATRIX{0.6, 0.8, 5.0, 0.0, -shortest, 6.0}));
    m = {Above(shortest), 0.0, 5.0, 0.0, Above(shortest), 6.0};
    m.RemoveScaling();
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, 0.0, 5.0, 0.0, 1.0, 6.0}));
}

TEST(Matrix, RemoveScalingKeepsNaNWithinItsRow)
{
    MATRIX m{nan, 1.0, 5.0, 0.0, 2.0, 6.0};
    m.RemoveScaling();
    EXPECT_TRUE(SameBits(m, MATRIX{nan, nan, 5.0, 0.0, 1.0, 6.0}));
}

TEST(Matrix, InvertByHand)
{
    MATRIX m{2.0, 1.0, 5.0, 1.0, 1.0, 7.0};
    EXPECT_TRUE(m.Invert(DBL_EPSILON));
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, -1.0, 2.0, -1.0, 2.0, -9.0}));
}

TEST(Matrix, InverseOfTheIdentityHasNegativeZeros)
{
    MATRIX m = identity;
    EXPECT_TRUE(m.Invert(DBL_EPSILON));
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, -0.0, 0.0, -0.0, 1.0, -0.0}));
}

TEST(Matrix, InvertRefusesADeterminantEqualToTheTolerance)
{
    for (const double sign : {1.0, -1.0}) {
        const MATRIX at{0x1p-26, 0.0, 5.0, 0.0, sign * 0x1p-26, 6.0};
        MATRIX m = at;
        EXPECT_FALSE(m.Invert(DBL_EPSILON));
        EXPECT_TRUE(SameBits(m, zeroMatrix));
        m = at;
        EXPECT_TRUE(m.Invert(Below(DBL_EPSILON)));
        m = With(at, &MATRIX::m11, Above(0x1p-26));
        EXPECT_TRUE(m.Invert(DBL_EPSILON));
        EXPECT_FALSE(HasSameBits(m, zeroMatrix));
    }
}

TEST(Matrix, InvertWithToleranceZero)
{
    MATRIX m{1.0, 2.0, 5.0, 2.0, 4.0, 6.0};
    EXPECT_FALSE(m.Invert(0.0));
    EXPECT_TRUE(SameBits(m, zeroMatrix));
    m = {0x1p-1074, 0.0, 0.0, 0.0, 1.0, 0.0};
    EXPECT_TRUE(m.Invert(0.0));
    m = With(identity, &MATRIX::m12, nan);
    EXPECT_FALSE(m.Invert(0.0));
    EXPECT_TRUE(SameBits(m, zeroMatrix));
}

TEST(Matrix, InvertWithANegativeToleranceDividesByZero)
{
    MATRIX m{1.0, 2.0, 5.0, 2.0, 4.0, 6.0};
    EXPECT_TRUE(m.Invert(-1.0));
    EXPECT_EQ(m.m11, infinity);
    EXPECT_EQ(m.m12, -infinity);
    EXPECT_EQ(m.dx, -infinity); // (2*6 - 4*5) / 0
}

TEST(Matrix, InvertWithToleranceNaNFails)
{
    MATRIX m = identity;
    EXPECT_FALSE(m.Invert(nan));
    EXPECT_TRUE(SameBits(m, zeroMatrix));
}

TEST(Matrix, InverseUndoesTheMatrix)
{
    ForEachMatrixClass(5, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        MATRIX inverse = m;
        ASSERT_TRUE(inverse.Invert(DBL_EPSILON));
        EXPECT_TRUE(IsNearMatrix(inverse * m, identity, 1e-10));
        EXPECT_TRUE(IsNearMatrix(m * inverse, identity, 1e-10));
        const MATRIX other = RandomMatrix(random, MatrixClass::Generic);
        EXPECT_TRUE(IsNearMatrix(inverse * (m * other), other, 1e-8));
    });
}

TEST(Matrix, IsIdentityComparesBits)
{
    EXPECT_TRUE(identity.IsIdentity(false, 0.0));
    EXPECT_TRUE(identity.IsIdentity(false, -1.0));
    EXPECT_TRUE(identity.IsIdentity(false, nan));
    for (const auto field : matrixFields) {
        const bool isUnit = identity.*field == 1.0;
        EXPECT_FALSE(With(identity, field, isUnit ? Above(1.0) : -0.0).IsIdentity(false, 1.0));
        EXPECT_FALSE(With(identity, field, isUnit ? Below(1.0) : 0x1p-1074).IsIdentity(false, 1.0));
        EXPECT_FALSE(With(identity, field, nan).IsIdentity(false, infinity));
    }
    EXPECT_TRUE(With(identity, &MATRIX::m12, -0.0).IsIdentity(true, 0.0));
}

TEST(Matrix, IsIdentityWithinATolerance)
{
    const double t = 0x1p-20;
    for (const auto field : matrixFields) {
        const double exact = identity.*field;
        for (const double sign : {1.0, -1.0}) {
            const double at = exact + sign * t;
            EXPECT_TRUE(With(identity, field, at).IsIdentity(true, t));
            EXPECT_FALSE(With(identity, field, sign > 0.0 ? Above(at) : Below(at)).IsIdentity(true, t));
        }
        EXPECT_FALSE(With(identity, field, nan).IsIdentity(true, infinity));
        EXPECT_TRUE(With(identity, field, infinity).IsIdentity(true, infinity));
    }
    EXPECT_FALSE(identity.IsIdentity(true, -t));
    EXPECT_FALSE(identity.IsIdentity(true, nan));
}

TEST(Matrix, IsEqualIsInclusiveInEveryField)
{
    const MATRIX m{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    const double t = 0.25;
    EXPECT_TRUE(IsEqual(m, m, 0.0));
    for (const auto field : matrixFields) {
        EXPECT_TRUE(IsEqual(m, With(m, field, m.*field + t), t));
        EXPECT_TRUE(IsEqual(With(m, field, m.*field + t), m, t));
        EXPECT_FALSE(IsEqual(m, With(m, field, Above(m.*field + t)), t));
        EXPECT_FALSE(IsEqual(m, With(m, field, Below(m.*field - t)), t));
        EXPECT_FALSE(IsEqual(m, With(m, field, nan), infinity));
        EXPECT_FALSE(IsEqual(With(m, field, nan), m, infinity));
        EXPECT_FALSE(IsEqual(With(m, field, infinity), With(m, field, infinity), infinity)); // inf - inf is NaN
    }
    EXPECT_FALSE(IsEqual(m, m, -0.25));
}

} // namespace

} // namespace ZarnMath
