#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

constexpr int smallestInt = -2147483647 - 1;

static_assert(noexcept(Radians::NormalizeAngle(0.0)));
static_assert(noexcept(Degrees::GetRotatedSize(SIZE{}, 0.0)));
static_assert(noexcept(KELDANGLE::NormalizeAngle(0)));

/// The angle from 0 to below a full turn, in whole units.
int Modulus(std::int64_t angle)
{
    return static_cast<int>((angle % 360000000 + 360000000) % 360000000);
}

TEST(Angles, ConstantsToTheLastBit)
{
    EXPECT_EQ(BitsOf(twoPi), 0x401921FB54442D18U);
    EXPECT_EQ(BitsOf(pi), 0x400921FB54442D18U);
    EXPECT_EQ(BitsOf(halfPi), 0x3FF921FB54442D18U);
    EXPECT_EQ(BitsOf(threeHalvesPi), 0x4012D97C7F3321D2U);
    EXPECT_EQ(BitsOf(degreesToRadians), 0x3F91DF46A2529D39U);
    EXPECT_EQ(BitsOf(radiansToDegrees), 0x404CA5DC1A63C1F8U);
    EXPECT_EQ(BitsOf(unitsPerDegree), 0x412E848000000000U);
}

TEST(Angles, DegreesUseTheExactConstant)
{
    EXPECT_EQ(Degrees::AngleToVector(90.0).x, std::cos(90.0 * 0.017453292519943295));
    EXPECT_LT(Degrees::AngleToVector(90.0).x, 1e-16); // the short constant would leave 2.7e-14
}

TEST(Radians, NormalizeAngle)
{
    EXPECT_TRUE(SameBits(Radians::NormalizeAngle(-twoPi), -0.0));
    EXPECT_TRUE(SameBits(Radians::NormalizeAngle(-0.0), -0.0));
    EXPECT_TRUE(SameBits(Radians::NormalizeAngle(0.0), 0.0));
    EXPECT_TRUE(SameBits(Radians::NormalizeAngle(twoPi), 0.0));
    EXPECT_TRUE(SameBits(Radians::NormalizeAngle(5.0 * twoPi), 0.0));
    EXPECT_EQ(Radians::NormalizeAngle(-1e-20), twoPi);
    EXPECT_EQ(Radians::NormalizeAngle(-1.0), -1.0 + twoPi);
    EXPECT_EQ(Radians::NormalizeAngle(3.0), 3.0);
    EXPECT_TRUE(std::isnan(Radians::NormalizeAngle(nan)));
    EXPECT_TRUE(std::isnan(Radians::NormalizeAngle(infinity)));
}

TEST(Radians, NormalizeFineAngleKeepsBothEnds)
{
    EXPECT_EQ(Radians::NormalizeFineAngle(pi), pi);
    EXPECT_EQ(Radians::NormalizeFineAngle(-pi), -pi);
    EXPECT_EQ(Radians::NormalizeFineAngle(3.0 * pi), pi); // 3*pi is exact, and so is its remainder
    EXPECT_EQ(Radians::NormalizeFineAngle(-3.0 * pi), -pi);
    EXPECT_NEAR(Radians::NormalizeFineAngle(Above(pi)), -pi, 1e-15);
    EXPECT_LT(Radians::NormalizeFineAngle(Above(pi)), 0.0);
    EXPECT_NEAR(Radians::NormalizeFineAngle(Below(-pi)), pi, 1e-15);
    EXPECT_GT(Radians::NormalizeFineAngle(Below(-pi)), 0.0);
}

TEST(Radians, NormalizeFineAngleReducesOnlyWhatIsOutside)
{
    EXPECT_NEAR(Radians::NormalizeFineAngle(threeHalvesPi), -halfPi, 1e-15);
    EXPECT_NEAR(Radians::NormalizeFineAngle(-threeHalvesPi), halfPi, 1e-15);
    EXPECT_EQ(Radians::NormalizeFineAngle(7.0), 7.0 - twoPi);
    EXPECT_EQ(Radians::NormalizeFineAngle(-7.0), -7.0 + twoPi);
    EXPECT_TRUE(SameBits(Radians::NormalizeFineAngle(-0.0), -0.0));
    EXPECT_EQ(Radians::NormalizeFineAngle(0x1p-1074), 0x1p-1074);
    EXPECT_TRUE(std::isnan(Radians::NormalizeFineAngle(nan)));
    EXPECT_TRUE(std::isnan(Radians::NormalizeFineAngle(-infinity)));
}

TEST(Radians, NormalizedAnglesPointTheSameWay)
{
    RandomSource random(1);
    for (int i = 0; i < 2000; ++i) {
        const double angle = random.Uniform(-100.0, 100.0);
        const double normalized = Radians::NormalizeAngle(angle);
        const double fine = Radians::NormalizeFineAngle(angle);
        EXPECT_TRUE(normalized >= 0.0 && normalized <= twoPi);
        EXPECT_TRUE(fine >= -pi && fine <= pi);
        EXPECT_TRUE(IsNearVector(Radians::AngleToVector(normalized), Radians::AngleToVector(angle), 1e-13));
        EXPECT_TRUE(IsNearVector(Radians::AngleToVector(fine), Radians::AngleToVector(angle), 1e-13));
    }
}

TEST(Degrees, NormalizeAngle)
{
    EXPECT_TRUE(SameBits(Degrees::NormalizeAngle(-360.0), -0.0));
    EXPECT_TRUE(SameBits(Degrees::NormalizeAngle(720.0), 0.0));
    EXPECT_EQ(Degrees::NormalizeAngle(-1e-20), 360.0);
    EXPECT_EQ(Degrees::NormalizeAngle(-90.0), 270.0);
    EXPECT_EQ(Degrees::NormalizeAngle(450.0), 90.0);
}

TEST(Keldangle, NormalizeAngle)
{
    EXPECT_EQ(KELDANGLE::NormalizeAngle(-1), 359999999);
    EXPECT_EQ(KELDANGLE::NormalizeAngle(360000000), 0);
    EXPECT_EQ(KELDANGLE::NormalizeAngle(360000001), 1);
    EXPECT_EQ(KELDANGLE::NormalizeAngle(-360000000), 0);
    EXPECT_EQ(KELDANGLE::NormalizeAngle(smallestInt), 12516352);
    EXPECT_EQ(KELDANGLE::NormalizeAngle(2147483647), 347483647);
}

TEST(Keldangle, NormalizeAngleIsTheModulusInSpiteOfFloatingPoint)
{
    RandomSource random(2);
    for (int i = 0; i < 20000; ++i) {
        const int angle = random.Integer(smallestInt, 2147483647);
        EXPECT_EQ(KELDANGLE::NormalizeAngle(angle), Modulus(angle)) << angle;
    }
    for (int turns = -5; turns <= 5; ++turns)
        for (int off = -3; off <= 3; ++off)
            EXPECT_EQ(KELDANGLE::NormalizeAngle(turns * 360000000 + off), Modulus(off));
}

TEST(Radians, AngleToVector)
{
    EXPECT_TRUE(SameBits(Radians::AngleToVector(0.0), vector2d{1.0, 0.0}));
    EXPECT_TRUE(SameBits(Radians::AngleToVector(-0.0), vector2d{1.0, -0.0}));
    EXPECT_TRUE(SameBits(Radians::AngleToVector(0.0, -3.0), vector2d{-3.0, -0.0}));
    for (const double angle : {0.3, 2.0, -4.5, 100.0}) {
        EXPECT_TRUE(SameBits(Radians::AngleToVector(angle), vector2d{std::cos(angle), std::sin(angle)}));
        EXPECT_TRUE(
            SameBits(Radians::AngleToVector(angle, 7.5), vector2d{std::cos(angle) * 7.5, std::sin(angle) * 7.5}));
        EXPECT_TRUE(SameBits(Degrees::AngleToVector(angle), Radians::AngleToVector(angle * 0.017453292519943295)));
        EXPECT_TRUE(
            SameBits(Degrees::AngleToVector(angle, 7.5), Radians::AngleToVector(angle * 0.017453292519943295, 7.5)));
    }
}

TEST(Angles, VectorToAngle)
{
    EXPECT_TRUE(SameBits(Radians::VectorToAngle({0.0, 0.0}), 0.0));
    EXPECT_EQ(Radians::VectorToAngle({0.0, 1.0}), halfPi);
    EXPECT_EQ(Radians::VectorToAngle({-1.0, 0.0}), pi);
    EXPECT_EQ(Radians::VectorToAngle({-1.0, -0.0}), pi); // -pi, and a full turn on top
    EXPECT_EQ(Radians::VectorToAngle({0.0, -1.0}), -halfPi + twoPi);
    EXPECT_EQ(Radians::VectorToAngle({1.0, -1e-20}), twoPi);
    EXPECT_EQ(Degrees::VectorToAngle({0.0, 0.0}), 0.0);
    EXPECT_EQ(Degrees::VectorToAngle({0.0, 1.0}), halfPi * 57.29577951308232);
    EXPECT_NEAR(Degrees::VectorToAngle({0.0, -1.0}), 270.0, 1e-13);
    EXPECT_EQ(Degrees::VectorToAngle({1.0, -1e-20}), twoPi * 57.29577951308232);
    EXPECT_EQ(KELDANGLE::VectorToAngle({0.0, 0.0}), 0);
    EXPECT_EQ(KELDANGLE::VectorToAngle({0.0, 1.0}), 90000000);
    EXPECT_EQ(KELDANGLE::VectorToAngle({-1.0, 0.0}), 180000000);
    EXPECT_EQ(KELDANGLE::VectorToAngle({1.0, 1.0}), 45000000);
}

TEST(Keldangle, JustBelowTheAxisIsAFullTurn)
{
    EXPECT_EQ(KELDANGLE::VectorToAngle({1.0, -1e-12}), 360000000);
    EXPECT_EQ(KELDANGLE::GetAngle({0.0, 0.0}, {1.0, 0.0}, {1.0, -1e-30}), 360000000);
}

TEST(Angles, GetAngleIsTheTurnCounterClockwise)
{
    const vector2d x{1.0, 0.0};
    const vector2d y{0.0, 1.0};
    EXPECT_EQ(Radians::GetAngle(x, y), halfPi);
    EXPECT_EQ(Radians::GetAngle(y, x), threeHalvesPi);
    EXPECT_EQ(Radians::GetFineAngle(x, y), halfPi);
    EXPECT_EQ(Radians::GetFineAngle(y, x), -halfPi);
    EXPECT_NEAR(Degrees::GetAngle(x, y), 90.0, 1e-13);
    EXPECT_NEAR(Degrees::GetAngle(y, x), 270.0, 1e-13);
    EXPECT_NEAR(Degrees::GetFineAngle(y, x), -90.0, 1e-13);
    EXPECT_EQ(Degrees::GetAngle(y, x), threeHalvesPi * 57.29577951308232);
    EXPECT_EQ(Degrees::GetFineAngle(y, x), -halfPi * 57.29577951308232);
}

TEST(Angles, OppositeVectorsAreHalfATurnEitherWay)
{
    for (const double zero : {0.0, -0.0}) {
        EXPECT_EQ(Radians::GetAngle({1.0, 0.0}, {-1.0, zero}), pi);
        EXPECT_EQ(Radians::GetFineAngle({1.0, 0.0}, {-1.0, zero}), pi);
        EXPECT_EQ(Radians::GetFineAngle({-1.0, zero}, {1.0, 0.0}), pi);
    }
}

TEST(Angles, ParallelVectorsMayBeAFullTurnApart)
{
    EXPECT_EQ(Radians::GetAngle({1.0, 0.0}, {1.0, -1e-30}), twoPi);
    EXPECT_EQ(Radians::GetFineAngle({1.0, 0.0}, {1.0, -1e-30}), 0.0);
    EXPECT_EQ(Radians::GetAngle({1.0, 0.0}, {1.0, 1e-30}), 0.0);
}

TEST(Angles, DegenerateVectorsGiveZeroInEveryUnit)
{
    const vector2d v{3.0, 4.0};
    const vector2d faint{1e-170, 0.0}; // its squared length underflows
    for (const vector2d& degenerate : {vector2d{0.0, 0.0}, vector2d{nan, 1.0}, vector2d{1.0, nan}, faint}) {
        EXPECT_TRUE(SameBits(Radians::GetAngle(degenerate, v), 0.0));
        EXPECT_TRUE(SameBits(Radians::GetAngle(v, degenerate), 0.0));
        EXPECT_TRUE(SameBits(Radians::GetFineAngle(degenerate, v), 0.0));
        EXPECT_TRUE(SameBits(Degrees::GetAngle(v, degenerate), 0.0));
        EXPECT_TRUE(SameBits(Degrees::GetFineAngle(v, degenerate), 0.0));
    }
    const point2d vertex{5.0, 6.0};
    EXPECT_EQ(Radians::GetAngle(vertex, vertex, {1.0, 1.0}), 0.0);
    EXPECT_EQ(Radians::GetAngle(vertex, {1.0, 1.0}, vertex), 0.0);
    EXPECT_EQ(Degrees::GetAngle(vertex, vertex, {1.0, 1.0}), 0.0);
    EXPECT_EQ(KELDANGLE::GetAngle(vertex, vertex, {1.0, 1.0}), 0);
    EXPECT_EQ(KELDANGLE::GetFineAngle(vertex, {1.0, 1.0}, vertex), 0);
    EXPECT_EQ(KELDANGLE::GetAngle(vertex, {nan, 1.0}, {1.0, 1.0}), 0);
}

TEST(Angles, GetAngleTakesOneRootOfTheProduct)
{
    // The product of the squared lengths overflows: the cosine becomes 0, though the vectors are parallel.
    EXPECT_EQ(Radians::GetAngle({1e100, 0.0}, {1e100, 0.0}), halfPi);
}

TEST(Angles, CosinesBeyondOneAreClamped)
{
    int beyond = 0;
    RandomSource random(3);
    for (int i = 0; i < 2000; ++i) {
        const vector2d a = random.Point(10.0) - point2d{};
        const vector2d b = a * random.Uniform(0.1, 10.0);
        beyond += Dot(a, b) / std::sqrt(LengthSquared(a) * LengthSquared(b)) > 1.0 ? 1 : 0;
        const double turn = Radians::GetAngle(a, b);
        EXPECT_LT(std::fmin(turn, twoPi - turn), 1e-7);
        EXPECT_NEAR(Radians::GetAngle(a, {-b.x, -b.y}), pi, 1e-7);
    }
    EXPECT_GT(beyond, 0);
}

TEST(Angles, ThreePointFormsMeasureAtTheFirst)
{
    const point2d vertex{5.0, 6.0};
    const point2d right{7.0, 6.0};
    const point2d above{5.0, 9.0};
    const point2d left{1.0, 6.0};
    EXPECT_EQ(Radians::GetAngle(vertex, right, above), halfPi);
    EXPECT_EQ(Radians::GetAngle(vertex, above, right), threeHalvesPi);
    EXPECT_NEAR(Degrees::GetAngle(vertex, right, above), 90.0, 1e-13);
    EXPECT_EQ(KELDANGLE::GetAngle(vertex, right, above), 90000000);
    EXPECT_EQ(KELDANGLE::GetAngle(vertex, above, right), 270000000);
    EXPECT_EQ(KELDANGLE::GetFineAngle(vertex, above, right), -90000000);
    EXPECT_EQ(KELDANGLE::GetFineAngle(vertex, right, left), 180000000);
    EXPECT_EQ(KELDANGLE::GetFineAngle(vertex, left, right), 180000000);
}

TEST(Angles, TurnByTheAngleLeadsToTheOtherVector)
{
    RandomSource random(4);
    for (int i = 0; i < 2000; ++i) {
        const vector2d a = random.Point(10.0) - point2d{};
        const vector2d b = random.Point(10.0) - point2d{};
        const double lengths = std::sqrt(LengthSquared(b) / LengthSquared(a));
        const vector2d turned = Turned(a, GetSineCosine(Radians::GetAngle(a, b))) * lengths;
        EXPECT_TRUE(IsNearVector(turned, b, 1e-5));
        const double sum = Radians::GetAngle(a, b) + Radians::GetAngle(b, a);
        EXPECT_NEAR(sum, twoPi, 1e-14);
    }
}

TEST(Angles, RotatePointGoesByTheDifferenceFromTheCentre)
{
    RandomSource random(5);
    for (int i = 0; i < 1000; ++i) {
        const point2d p = random.Point(1e3);
        const point2d c = random.Point(1e3);
        const double r = random.Uniform(-7.0, 7.0);
        const double u = p.x - c.x;
        const double v = p.y - c.y;
        // Through memory, so that each is rounded: GCC 12 fuses this sum where the processor can, at -O3.
        const volatile double cu = std::cos(r) * u;
        const volatile double sv = std::sin(r) * v;
        const volatile double su = std::sin(r) * u;
        const volatile double cv = std::cos(r) * v;
        const point2d expected{c.x + (cu - sv), c.y + (su + cv)};
        EXPECT_TRUE(SameBits(Radians::RotatePoint(p, r, c), expected));
        EXPECT_TRUE(SameBits(Degrees::RotatePoint(p, r, c), Radians::RotatePoint(p, r * 0.017453292519943295, c)));
    }
}

TEST(Angles, RotatePointByZeroIsNoSpecialCase)
{
    const double c = 1000000007.0;
    EXPECT_EQ(Radians::RotatePoint({0.1, 0.1}, 0.0, {c, c}).x, c + (0.1 - c));
    EXPECT_NE(Radians::RotatePoint({0.1, 0.1}, 0.0, {c, c}).x, 0.1);
}

TEST(Radians, ConstrainSnapsToTheNearestDivision)
{
    EXPECT_NEAR(Radians::Constrain(0.4, 8, 0.0), 0.7853981633974483, 1e-15);
    EXPECT_EQ(Radians::Constrain(0.3, 8, 0.0), 0.0);
    EXPECT_NEAR(Radians::Constrain(-0.4, 8, 0.0), -0.7853981633974483, 1e-15);
    EXPECT_EQ(Radians::Constrain(0.3, 8, 0.25), 0.25);
    EXPECT_NEAR(Radians::Constrain(0.4, -8, 0.0), 0.7853981633974483, 1e-15);
}

TEST(Radians, ConstrainInZeroStepsChangesNothing)
{
    EXPECT_TRUE(SameBits(Radians::Constrain(0.4, 0, 1.0), 0.4));
    EXPECT_TRUE(SameBits(Radians::Constrain(-0.0, 0, nan), -0.0));
}

TEST(Radians, ConstrainDoesNotNormalize)
{
    EXPECT_EQ(Radians::Constrain(7.0, 4, 0.0), twoPi);
    EXPECT_EQ(Radians::Constrain(-7.0, 4, 0.0), -twoPi);
    EXPECT_EQ(Radians::Constrain(14.0, 4, 0.0), 2.25 * twoPi);
}

TEST(Radians, ConstrainGroupsAsStated)
{
    RandomSource random(6);
    for (int i = 0; i < 1000; ++i) {
        const double angle = random.Uniform(-20.0, 20.0);
        const double origin = random.Uniform(-4.0, 4.0);
        const int steps = random.Integer(1, 50);
        const double k = RoundToInt(((angle - origin) / twoPi) * steps);
        EXPECT_EQ(Radians::Constrain(angle, steps, origin), ((k / steps) * twoPi) + origin);
    }
}

TEST(Radians, ConstrainSaturates)
{
    EXPECT_EQ(Radians::Constrain(1e300, 8, 0.0), 2147483647.0 / 8.0 * twoPi);
    EXPECT_EQ(Radians::Constrain(nan, 8, 1.0), 1.0); // NaN rounds to 0
}

TEST(Radians, GetQuadrantAtItsBoundaries)
{
    EXPECT_EQ(Radians::GetQuadrant(0.0), 0);
    EXPECT_EQ(Radians::GetQuadrant(Below(halfPi)), 0);
    EXPECT_EQ(Radians::GetQuadrant(halfPi), 1);
    EXPECT_EQ(Radians::GetQuadrant(Above(halfPi)), 1);
    EXPECT_EQ(Radians::GetQuadrant(Below(pi)), 1);
    EXPECT_EQ(Radians::GetQuadrant(pi), 2);
    EXPECT_EQ(Radians::GetQuadrant(Above(pi)), 2);
    EXPECT_EQ(Radians::GetQuadrant(Below(threeHalvesPi)), 2);
    EXPECT_EQ(Radians::GetQuadrant(threeHalvesPi), 3);
    EXPECT_EQ(Radians::GetQuadrant(Above(threeHalvesPi)), 3);
    EXPECT_EQ(Radians::GetQuadrant(Below(twoPi)), 3);
    EXPECT_EQ(Radians::GetQuadrant(twoPi), 0);
    EXPECT_EQ(Radians::GetQuadrant(-0.1), 3);
    EXPECT_EQ(Radians::GetQuadrant(-1e-20), 3); // normalised to a full turn
    EXPECT_EQ(Radians::GetQuadrant(nan), 3);
}

TEST(Degrees, GetRotatedSizeExchangesTheSides)
{
    EXPECT_EQ(Degrees::GetRotatedSize({10, 20}, 0.0), (SIZE{20, 10}));
    EXPECT_EQ(Degrees::GetRotatedSize({-10, -20}, 0.0), (SIZE{20, 10}));
    // The cosine of 90 degrees is a small positive double, whose products round up to 1.
    EXPECT_EQ(Degrees::GetRotatedSize({10, 20}, 90.0), (SIZE{11, 21}));
    EXPECT_EQ(Degrees::GetRotatedSize({0, 0}, 33.0), (SIZE{0, 0}));
}

TEST(Degrees, GetRotatedSizeRoundsEachProductUp)
{
    // 3 * 0.7071 is 2.12, four times up to 3; the sum 4.24 would be 5.
    EXPECT_EQ(Degrees::GetRotatedSize({3, 3}, 45.0), (SIZE{6, 6}));
}

TEST(Degrees, GetRotatedSizeSaturatesAndWraps)
{
    EXPECT_EQ(Degrees::GetRotatedSize({0, smallestInt}, 0.0), (SIZE{2147483647, 0}));
    // 2147483647 + ceil(6.1e-17 * 2^31) is 2^31.
    EXPECT_EQ(Degrees::GetRotatedSize({smallestInt, smallestInt}, 90.0), (SIZE{smallestInt, smallestInt}));
}

TEST(MatrixAngles, TransformedRadians)
{
    EXPECT_EQ(identity.GetTransformedRadians(0.0), 0.0);
    EXPECT_NEAR(identity.GetTransformedRadians(7.0), 7.0 - twoPi, 1e-14);
    EXPECT_NEAR((MATRIX{0, -1, 50, 1, 0, 60}).GetTransformedRadians(0.5), 0.5 + halfPi, 1e-15);
    EXPECT_NEAR((MATRIX{2, 0, 0, 0, 1, 0}).GetTransformedRadians(0.7853981633974483), std::atan(0.5), 1e-15);
}

TEST(MatrixAngles, MirrorReversesTheSenseOfTurn)
{
    const MATRIX mirror{1, 0, 0, 0, -1, 0};
    const MATRIX swap{0, 1, 0, 1, 0, 0};
    EXPECT_NEAR(mirror.GetTransformedRadians(0.5), twoPi - 0.5, 1e-15);
    EXPECT_NEAR(swap.GetTransformedRadians(0.5), halfPi - 0.5, 1e-15);
    EXPECT_NEAR(swap.GetTransformedRadians(0.6), halfPi - 0.6, 1e-15);
}

TEST(MatrixAngles, UntransformedVector)
{
    const MATRIX m{2.0, 1.0, 100.0, 1.0, 1.0, 200.0};
    EXPECT_TRUE(SameBits(m.GetUntransformedVector({5.0, 3.0}), vector2d{2.0, 1.0}));
    EXPECT_TRUE(SameBits((MATRIX{2, 0, 0, 0, 4, 0}).GetUntransformedVector({5.0, 3.0}), vector2d{2.5, 0.75}));
}

TEST(MatrixAngles, SingularMatrixLeavesTheVector)
{
    const vector2d v{-0.0, 3.0};
    EXPECT_TRUE(SameBits((MATRIX{1, 2, 0, 2, 4, 0}).GetUntransformedVector(v), v));
    const MATRIX at{0x1p-26, 0.0, 0.0, 0.0, 0x1p-26, 0.0};
    EXPECT_TRUE(SameBits(at.GetUntransformedVector(v), v));
    const MATRIX above = With(at, &MATRIX::m11, Above(0x1p-26));
    EXPECT_NEAR(above.GetUntransformedVector(v).y, 3.0 * 0x1p26, 1.0);
    EXPECT_TRUE(std::isnan(With(identity, &MATRIX::m12, nan).GetUntransformedVector(v).x));
}

TEST(MatrixAngles, SingularMatrixNormalizesTheDirection)
{
    const MATRIX singular{1, 2, 0, 2, 4, 0};
    EXPECT_NEAR(singular.GetUntransformedRadians(-halfPi), threeHalvesPi, 1e-15);
    EXPECT_EQ(singular.GetUntransformedRadians(7.0), Radians::NormalizeAngle(std::atan2(std::sin(7.0), std::cos(7.0))));
}

TEST(MatrixAngles, UntransformedAfterTransformed)
{
    ForEachMatrixClass(7, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const double r = random.Uniform(0.0, twoPi);
        const double back = m.GetUntransformedRadians(m.GetTransformedRadians(r));
        EXPECT_TRUE(IsNearVector(Radians::AngleToVector(back), Radians::AngleToVector(r), 1e-12));
        const vector2d v = random.Point(10.0) - point2d{};
        EXPECT_TRUE(IsNearVector(m.GetUntransformedVector(m(v)), v, 1e-11));
    });
}

} // namespace

} // namespace ZarnMath
