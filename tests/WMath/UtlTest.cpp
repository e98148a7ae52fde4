#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMathInternal.h"

#include <array>

namespace ZarnMath {

namespace {

constexpr int smallestInt = -2147483647 - 1;

/// Not even the sign of a zero may change in it unseen.
constexpr MATRIX odd{0.1, -0.0, 1e-300, -7.25, 3.0, -0.1};

double ToRadians(int angle)
{
    return angle / 1000000.0 * 0.017453292519943;
}

TEST(Utl, IdentityOverwritesEveryField)
{
    MATRIX m{nan, nan, nan, nan, nan, nan};
    UTLGetIdentityMatrix(&m);
    EXPECT_TRUE(SameBits(m, identity));
}

TEST(Utl, RotateByFullTurnsChangesNoBit)
{
    for (const int angle : {0, 360000000, -360000000, 720000000, -720000000, 1080000000, -1800000000}) {
        MATRIX m = odd;
        UTLRotateMatrix(&m, angle);
        EXPECT_TRUE(SameBits(m, odd)) << angle;
        UTLRotateMatrixAround(&m, angle, 1000000007, -5);
        EXPECT_TRUE(SameBits(m, odd)) << angle;
    }
}

TEST(Utl, RotateNextToAFullTurnIsARotation)
{
    for (const int angle : {1, -1, 360000001, 359999999}) {
        MATRIX m = odd;
        UTLRotateMatrix(&m, angle);
        EXPECT_FALSE(HasSameBits(m, odd)) << angle;
        m = odd;
        UTLRotateMatrixAround(&m, angle, 0, 0);
        EXPECT_FALSE(HasSameBits(m, odd)) << angle;
    }
}

TEST(Utl, RotateHasNoExactQuarterTurnAndRotateAroundHas)
{
    // The short constant falls 2.96e-16 below pi/180: 90 times that is what is left of the cosine.
    MATRIX m = identity;
    UTLRotateMatrix(&m, 90000000);
    EXPECT_GT(m.m11, 2.63e-14);
    EXPECT_LT(m.m11, 2.69e-14);
    EXPECT_EQ(m.m21, 1.0);
    m = identity;
    UTLRotateMatrixAround(&m, 90000000, 0, 0);
    EXPECT_EQ(m.m11, 0.0);
    EXPECT_EQ(m.m21, 1.0);
}

TEST(Utl, RotateTakesTheAngleAsGiven)
{
    // 450 degrees miss the quarter turn by five times as much as 90 do.
    MATRIX m = identity;
    UTLRotateMatrix(&m, 450000000);
    EXPECT_GT(m.m11, 1.30e-13);
    EXPECT_LT(m.m11, 1.36e-13);
    MATRIX around = identity;
    UTLRotateMatrixAround(&around, 450000000, 0, 0);
    EXPECT_EQ(around.m11, 0.0);
}

TEST(Utl, RotateDividesBeforeItMultiplies)
{
    RandomSource random(1);
    int differing = 0;
    for (int i = 0; i < 1000; ++i) {
        const int angle = random.Integer(1, 359999999);
        const double r = ToRadians(angle);
        differing += r != angle * (0.017453292519943 / 1000000.0) ? 1 : 0;
        MATRIX m = identity;
        UTLRotateMatrix(&m, angle);
        EXPECT_EQ(m.m11, std::cos(r));
        EXPECT_EQ(m.m21, std::sin(r));
    }
    EXPECT_GT(differing, 0);
}

TEST(Utl, TheShortConstantStaysApartFromTheExactOne)
{
    EXPECT_EQ(BitsOf(truncatedDegreesToRadians), 0x3F91DF46A2529CE4U);
    EXPECT_EQ(BitsOf(degreesToRadians), 0x3F91DF46A2529D39U);
    MATRIX m = identity;
    UTLRotateMatrix(&m, 90000000);
    EXPECT_NE(m.m11, Degrees::AngleToVector(90.0).x);
}

TEST(Utl, QuarterTurnsAboutAPointAreExact)
{
    struct Turn
    {
        int angle;
        MATRIX linear;
    };

    const Turn turns[] = {{90000000, {0.0, -1.0, 0.0, 1.0, 0.0, 0.0}},    {180000000, {-1.0, 0.0, 0.0, 0.0, -1.0, 0.0}},
                          {270000000, {0.0, 1.0, 0.0, -1.0, 0.0, 0.0}},   {-270000000, {0.0, -1.0, 0.0, 1.0, 0.0, 0.0}},
                          {-180000000, {-1.0, 0.0, 0.0, 0.0, -1.0, 0.0}}, {-90000000, {0.0, 1.0, 0.0, -1.0, 0.0, 0.0}},
                          {450000000, {0.0, -1.0, 0.0, 1.0, 0.0, 0.0}}};
    for (const Turn& turn : turns) {
        MATRIX m = identity;
        UTLRotateMatrixAround(&m, turn.angle, 0, 0);
        EXPECT_EQ(m, turn.linear) << turn.angle; // the signs of the zeros are those of the products
    }
    MATRIX m = identity;
    UTLRotateMatrixAround(&m, 90000000, 1, 2);
    EXPECT_EQ(m, (MATRIX{0.0, -1.0, 3.0, 1.0, 0.0, 1.0}));
}

TEST(Utl, RotateAroundReducesByTheMathematicalModulus)
{
    for (const auto& [angle, reduced] : {std::pair{smallestInt, 12516352}, {-1, 359999999}, {2147483647, 347483647}}) {
        MATRIX m = odd;
        MATRIX expected = odd;
        UTLRotateMatrixAround(&m, angle, 3, 4);
        UTLRotateMatrixAround(&expected, reduced, 3, 4);
        EXPECT_TRUE(SameBits(m, expected)) << angle;
        const double r = ToRadians(reduced);
        EXPECT_EQ(m.m11, std::cos(r) * odd.m11 - std::sin(r) * odd.m21);
    }
}

TEST(Utl, SmallestCentreIsItsOwnNegative)
{
    // The shift to the centre adds -2^31 and so does the shift back.
    MATRIX m = identity;
    UTLRotateMatrixAround(&m, 180000000, smallestInt, smallestInt);
    EXPECT_EQ(m.dx, 0.0);
    EXPECT_EQ(m.dy, 0.0);
    m = identity;
    UTLStretchMatrix(&m, smallestInt, smallestInt, 2.0, 3.0);
    EXPECT_EQ(m.dx, -3.0 * 2147483648.0);
    EXPECT_EQ(m.dy, -4.0 * 2147483648.0);
    m = identity;
    UTLSkewMatrix(&m, 0, 0, smallestInt, smallestInt);
    EXPECT_EQ(m.dx, -2.0 * 2147483648.0);
    EXPECT_EQ(m.dy, -2.0 * 2147483648.0);
    m = identity;
    UTLRotateMatrixAround(&m, 180000000, -2147483647, -2147483647);
    EXPECT_EQ(m.dx, -2.0 * 2147483647.0);
}

TEST(Utl, RotateAroundGroupsAsShiftTurnShift)
{
    RandomSource random(2);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX old = RandomFields(random);
        const int angle = random.Integer(1, 359999999);
        const int cx = random.Integer(-2147483647, 2147483647);
        const int cy = random.Integer(-2147483647, 2147483647);
        const double s = std::sin(ToRadians(angle));
        const double c = std::cos(ToRadians(angle));
        const double tx = old.dx + -static_cast<double>(cx);
        const double ty = old.dy + -static_cast<double>(cy);
        MATRIX m = old;
        UTLRotateMatrixAround(&m, angle, cx, cy);
        EXPECT_TRUE(SameBits(m, MATRIX{c * old.m11 - s * old.m21, c * old.m12 - s * old.m22, (c * tx - s * ty) + cx,
                                       s * old.m11 + c * old.m21, s * old.m12 + c * old.m22, (s * tx + c * ty) + cy}));
    }
}

TEST(Utl, Translate)
{
    MATRIX m{1.0, 2.0, 3.5, 4.0, 5.0, 6.5};
    UTLTranslateMatrix(&m, smallestInt, 2147483647);
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, 2.0, -2147483644.5, 4.0, 5.0, 2147483653.5}));
}

TEST(Utl, StretchScalesTheRowsAboutTheCentre)
{
    MATRIX m{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    UTLStretchMatrix(&m, 10, 20, 3.0, 2.0);
    EXPECT_TRUE(SameBits(m, MATRIX{3.0, 6.0, -11.0, 8.0, 10.0, -8.0}));
}

TEST(Utl, SkewShearsXNegativelyAndThenY)
{
    const double kx = std::tan(ToRadians(30000000));
    const double ky = std::tan(ToRadians(20000000));
    MATRIX m = identity;
    UTLSkewMatrix(&m, 30000000, 20000000, 0, 0);
    EXPECT_TRUE(SameBits(m, MATRIX{1.0, -kx, 0.0, ky, 1.0 - kx * ky, 0.0}));
    EXPECT_NEAR(m.m12, -0.5773502691896257, 2e-14);
    // It is the shear of x by -kx, and after it the shear of y by ky.
    const MATRIX shears = MATRIX{1.0, 0.0, 0.0, ky, 1.0, 0.0} * MATRIX{1.0, -kx, 0.0, 0.0, 1.0, 0.0};
    EXPECT_TRUE(IsNearMatrix(m, shears, 1e-15));
}

TEST(Utl, SkewGroupsAsStated)
{
    RandomSource random(3);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX old = RandomFields(random);
        const int angleX = random.Integer(-80000000, 80000000);
        const int angleY = random.Integer(-80000000, 80000000);
        const int cx = random.Integer(-1000000, 1000000);
        const int cy = random.Integer(-1000000, 1000000);
        const double kx = std::tan(ToRadians(angleX));
        const double ky = std::tan(ToRadians(angleY));
        const double q = 1.0 - kx * ky;
        const double tx = old.dx + -cx;
        const double ty = old.dy + -cy;
        MATRIX m = old;
        UTLSkewMatrix(&m, angleX, angleY, cx, cy);
        EXPECT_TRUE(
            SameBits(m, MATRIX{old.m11 - kx * old.m21, old.m12 - kx * old.m22, (tx - ty * kx) + cx,
                               old.m11 * ky + old.m21 * q, old.m12 * ky + old.m22 * q, (tx * ky + ty * q) + cy}));
    }
}

TEST(Utl, StepsLeaveTheirCentre)
{
    RandomSource random(4);
    for (int i = 0; i < 1000; ++i) {
        const POINT c = random.IntegerPoint(1000);
        MATRIX m = identity;
        UTLRotateMatrixAround(&m, random.Integer(-720000000, 720000000), c.x, c.y);
        EXPECT_TRUE(IsNearPoint(m(ToPoint2d(c)), ToPoint2d(c), 1e-9));
        m = identity;
        UTLStretchMatrix(&m, c.x, c.y, random.Uniform(-3.0, 3.0), random.Uniform(-3.0, 3.0));
        EXPECT_TRUE(IsNearPoint(m(ToPoint2d(c)), ToPoint2d(c), 1e-9));
        m = identity;
        UTLSkewMatrix(&m, random.Integer(-60000000, 60000000), random.Integer(-60000000, 60000000), c.x, c.y);
        EXPECT_TRUE(IsNearPoint(m(ToPoint2d(c)), ToPoint2d(c), 1e-9));
    }
}

TEST(Utl, TransformPointRoundsHalvesAwayFromZero)
{
    const MATRIX m{1.0, 0.0, 0.5, 0.0, 1.0, 0.5};
    POINT p{2, -3};
    UTLTransformPoint(&p, &m, 1);
    EXPECT_EQ(p, (POINT{3, -3}));
}

TEST(Utl, TransformPointUsesBothOldCoordinates)
{
    const MATRIX m{0.0, 1.0, 0.0, 1.0, 0.0, 0.0};
    std::array<POINT, 3> points = {{{1, 2}, {3, 4}, {5, 6}}};
    UTLTransformPoint(points.data(), &m, 2);
    EXPECT_EQ(points, (std::array<POINT, 3>{{{2, 1}, {4, 3}, {5, 6}}}));
}

TEST(Utl, TransformPointWithoutPoints)
{
    const MATRIX m{2.0, 0.0, 0.0, 0.0, 2.0, 0.0};
    POINT p{1, 1};
    for (const std::int64_t count : {std::int64_t{0}, std::int64_t{-1}, std::numeric_limits<std::int64_t>::min()}) {
        UTLTransformPoint(&p, &m, count);
        UTLTransformPoint(nullptr, &m, count);
    }
    EXPECT_EQ(p, (POINT{1, 1}));
}

} // namespace

} // namespace ZarnMath
