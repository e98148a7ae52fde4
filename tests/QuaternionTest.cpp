#include "ZarnMath/Quaternion.h"

#include "tests/Bits.h"

#include <cmath>
#include <cstring>
#include <random>

namespace ZarnMath {
namespace {

using Vector3 = vector3dT<double>;

constexpr double quarterOfPi = 0.7853981633974483;
constexpr double epsilon = 2.220446049250313e-16;
constexpr Quaternion unit{0.0, 0.0, 0.0, 1.0};

Vector3 Rotated(const Quaternion& q, Vector3 v)
{
    q.Rotate(v);
    return v;
}

Vector3 QuicklyRotated(const Quaternion& q, Vector3 v)
{
    q.RotateQuick(v);
    return v;
}

Quaternion Between(const Vector3& a, const Vector3& b)
{
    Quaternion q{7.0, 7.0, 7.0, 7.0};
    q.RotationCreate(a, b);
    return q;
}

Quaternion ForcedToZero(Quaternion q)
{
    q.ForceZeros();
    return q;
}

Quaternion Conjugate(const Quaternion& q)
{
    return {-q.x, -q.y, -q.z, q.w};
}

double Dot(const Quaternion& a, const Quaternion& b)
{
    return a.x * b.x + a.y * b.y + a.z * b.z + a.w * b.w;
}

void ExpectNear(const Vector3& a, const Vector3& b, double tolerance)
{
    EXPECT_NEAR(a.x, b.x, tolerance);
    EXPECT_NEAR(a.y, b.y, tolerance);
    EXPECT_NEAR(a.z, b.z, tolerance);
}

void ExpectNear(const Quaternion& a, const Quaternion& b, double tolerance)
{
    ExpectNear(Vector3{a.x, a.y, a.z}, Vector3{b.x, b.y, b.z}, tolerance);
    EXPECT_NEAR(a.w, b.w, tolerance);
}

class RandomUnits
{
public:
    Quaternion Next()
    {
        const Quaternion q{number(engine), number(engine), number(engine), number(engine)};
        const double length = std::sqrt(Dot(q, q));
        return {q.x / length, q.y / length, q.z / length, q.w / length};
    }

    Vector3 NextVector()
    {
        return {number(engine), number(engine), number(engine)};
    }

private:
    std::mt19937 engine{5};
    std::normal_distribution<double> number;
};

TEST(Quaternion, ProductsOfTheUnits)
{
    const Quaternion i{1.0, 0.0, 0.0, 0.0};
    const Quaternion j{0.0, 1.0, 0.0, 0.0};
    const Quaternion k{0.0, 0.0, 1.0, 0.0};
    const Quaternion minusOne{0.0, 0.0, 0.0, -1.0};
    EXPECT_EQ(i * j, k);
    EXPECT_EQ(j * k, i);
    EXPECT_EQ(k * i, j);
    EXPECT_EQ(j * i, (Quaternion{0.0, 0.0, -1.0, 0.0}));
    EXPECT_EQ(i * i, minusOne);
    EXPECT_EQ(j * j, minusOne);
    EXPECT_EQ(k * k, minusOne);
    EXPECT_EQ(i * unit, i);
    EXPECT_EQ(unit * k, k);
}

TEST(Quaternion, ProductByHand)
{
    EXPECT_EQ((Quaternion{2.0, 3.0, 4.0, 1.0} * Quaternion{6.0, 7.0, 8.0, 5.0}), (Quaternion{12.0, 30.0, 24.0, -60.0}));
}

TEST(Quaternion, ProductRotatesByTheRightOperandFirst)
{
    RandomUnits random;
    for (int n = 0; n < 1000; ++n) {
        const Quaternion a = random.Next();
        const Quaternion b = random.Next();
        const Vector3 v = random.NextVector();
        ExpectNear(Rotated(a * b, v), Rotated(a, Rotated(b, v)), 1e-14);
    }
}

TEST(Quaternion, UnitRotatesNothing)
{
    const Vector3 v{1.5, -2.5, 1e300};
    EXPECT_EQ(Rotated(unit, v), v);
    EXPECT_EQ(QuicklyRotated(unit, v), v);
}

TEST(Quaternion, QuarterTurnAboutZ)
{
    const Quaternion q{0.0, 0.0, std::sin(quarterOfPi), std::cos(quarterOfPi)};
    ExpectNear(Rotated(q, {1.0, 0.0, 0.0}), {0.0, 1.0, 0.0}, 1e-15);
    ExpectNear(Rotated(q, {0.0, 0.0, 1.0}), {0.0, 0.0, 1.0}, 1e-15);
    EXPECT_EQ(QuicklyRotated(q, {1.0, 0.0, 0.0}), (Vector3{q.w, q.z, 0.0}));
}

TEST(Quaternion, RotateIsTheSandwichProduct)
{
    RandomUnits random;
    for (int n = 0; n < 1000; ++n) {
        const Quaternion q = random.Next();
        const Vector3 v = random.NextVector();
        const Quaternion product = q * Quaternion{v.x, v.y, v.z, 0.0} * Conjugate(q);
        ExpectNear(Rotated(q, v), {product.x, product.y, product.z}, 1e-14);
        const Quaternion oneSided = q * Quaternion{v.x, v.y, v.z, 0.0};
        ExpectNear(QuicklyRotated(q, v), {oneSided.x, oneSided.y, oneSided.z}, 1e-14);
    }
}

TEST(Quaternion, ConjugateUndoesTheRotation)
{
    RandomUnits random;
    for (int n = 0; n < 1000; ++n) {
        const Quaternion q = random.Next();
        const Vector3 v = random.NextVector();
        ExpectNear(Rotated(Conjugate(q), Rotated(q, v)), v, 1e-14);
    }
}

TEST(Quaternion, RotateByHand)
{
    // q * v is (5, 5, 7, -9); its squared length is |q|^2 |v|^2 = 30 * 6, and that of the rotated vector 30 * 30 * 6.
    EXPECT_EQ(QuicklyRotated({1.0, 2.0, 3.0, 4.0}, {1.0, 1.0, 2.0}), (Vector3{5.0, 5.0, 7.0}));
    EXPECT_EQ(Rotated({1.0, 2.0, 3.0, 4.0}, {1.0, 1.0, 2.0}), (Vector3{28.0, 46.0, 50.0}));
}

TEST(Quaternion, ZeroRotatesToZero)
{
    const Quaternion zero{0.0, 0.0, 0.0, 0.0};
    EXPECT_EQ(Rotated(zero, {1.0, 2.0, 3.0}), (Vector3{0.0, 0.0, 0.0}));
    EXPECT_EQ(QuicklyRotated(zero, {1.0, 2.0, 3.0}), (Vector3{0.0, 0.0, 0.0}));
}

TEST(RotationCreate, IsTheCrossAndTheDotProduct)
{
    EXPECT_EQ(Between({1.0, 2.0, 3.0}, {4.0, 5.0, 6.0}), (Quaternion{-3.0, 6.0, -3.0, 32.0}));
    EXPECT_EQ(Between({1.0, 0.0, 0.0}, {0.0, 1.0, 0.0}), (Quaternion{0.0, 0.0, 1.0, 0.0}));
}

TEST(RotationCreate, OfParallelVectors)
{
    EXPECT_EQ(Between({1.0, 2.0, 2.0}, {2.0, 4.0, 4.0}), (Quaternion{0.0, 0.0, 0.0, 18.0}));
    EXPECT_EQ(Between({1.0, 2.0, 2.0}, {-1.0, -2.0, -2.0}), (Quaternion{0.0, 0.0, 0.0, -9.0}));
    EXPECT_EQ(Between({0.0, 0.0, 0.0}, {1.0, 2.0, 3.0}), (Quaternion{0.0, 0.0, 0.0, 0.0}));
}

TEST(RotationCreate, TurnsByTwiceTheAngle)
{
    for (int degrees = 0; degrees < 360; degrees += 7) {
        const double angle = degrees * quarterOfPi / 45.0;
        const Quaternion q = Between({1.0, 0.0, 0.0}, {std::cos(angle), std::sin(angle), 0.0});
        EXPECT_NEAR(Dot(q, q), 1.0, 1e-15);
        ExpectNear(Rotated(q, {1.0, 0.0, 0.0}), {std::cos(2.0 * angle), std::sin(2.0 * angle), 0.0}, 1e-15);
    }
}

TEST(ForceZeros, HasAThresholdForTheAxisAndOneForTheScalar)
{
    EXPECT_EQ(ForcedToZero({1e-13, -1e-13, 1e-13, 1e-13}), (Quaternion{0.0, 0.0, 0.0, 1e-13}));
    EXPECT_EQ(ForcedToZero({1.0, -2.0, 3.0, -4.0}), (Quaternion{1.0, -2.0, 3.0, -4.0}));
}

TEST(ForceZeros, ThresholdsAreInclusive)
{
    double axis = 0.0;
    const std::uint64_t bits = 0x3D4F400000000000U;
    std::memcpy(&axis, &bits, sizeof axis);
    ASSERT_EQ(axis, 2.220446049250313e-13);
    const double aboveAxis = Above(axis);
    const double aboveScalar = Above(epsilon);
    EXPECT_EQ(ForcedToZero({axis, -axis, axis, epsilon}), (Quaternion{0.0, 0.0, 0.0, 0.0}));
    EXPECT_EQ(ForcedToZero({axis, -axis, axis, -epsilon}), (Quaternion{0.0, 0.0, 0.0, 0.0}));
    const Quaternion kept{aboveAxis, -aboveAxis, aboveAxis, aboveScalar};
    EXPECT_EQ(ForcedToZero(kept), kept);
    EXPECT_EQ(ForcedToZero({1.0, 1.0, 1.0, -aboveScalar}).w, -aboveScalar);
}

TEST(ForceZeros, LeavesNoNegativeZero)
{
    const Quaternion q = ForcedToZero({-1e-20, -1e-20, -0.0, -1e-20});
    EXPECT_FALSE(std::signbit(q.x) || std::signbit(q.y) || std::signbit(q.z) || std::signbit(q.w));
}

TEST(ForceZeros, LeavesNan)
{
    const Quaternion q = ForcedToZero({nan, nan, nan, nan});
    EXPECT_TRUE(std::isnan(q.x) && std::isnan(q.y) && std::isnan(q.z) && std::isnan(q.w));
}

TEST(Interpolate, OfEqualAndOppositeOnesGivesTheFirst)
{
    const Quaternion q{0.5, -0.5, 0.5, 0.5};
    Quaternion out{7.0, 7.0, 7.0, 7.0};
    EXPECT_FALSE(Quaternion::Interpolate(q, q, 0.3, out));
    EXPECT_EQ(out, q);
    out = {7.0, 7.0, 7.0, 7.0};
    EXPECT_FALSE(Quaternion::Interpolate(q, {-0.5, 0.5, -0.5, -0.5}, 0.3, out));
    EXPECT_EQ(out, q);
}

TEST(Interpolate, ReachesBothEnds)
{
    RandomUnits random;
    for (int n = 0; n < 1000; ++n) {
        const Quaternion a = random.Next();
        const Quaternion b = random.Next();
        Quaternion out{};
        ASSERT_TRUE(Quaternion::Interpolate(a, b, 0.0, out));
        ExpectNear(out, a, 1e-12);
        ASSERT_TRUE(Quaternion::Interpolate(a, b, 1.0, out));
        ExpectNear(out, b, 1e-12);
    }
}

TEST(Interpolate, RunsAlongTheArcAtConstantSpeed)
{
    const Quaternion a = unit;
    const Quaternion b{0.0, 0.0, 1.0, 0.0}; // half a turn about z
    for (int i = -10; i <= 20; ++i) {
        const double t = i / 10.0;
        Quaternion out{};
        ASSERT_TRUE(Quaternion::Interpolate(a, b, t, out));
        ExpectNear(out, {0.0, 0.0, std::sin(2.0 * quarterOfPi * t), std::cos(2.0 * quarterOfPi * t)}, 1e-15);
    }
}

TEST(Interpolate, TakesTheLongWayWhereTheSignsSaySo)
{
    const Quaternion a = unit;
    const Quaternion b{0.0, 0.0, 0.6, -0.8}; // d = -0.8: nearer to -a
    Quaternion out{};
    ASSERT_TRUE(Quaternion::Interpolate(a, b, 0.5, out));
    const double half = std::acos(-0.8) / 2.0;
    ExpectNear(out, {0.0, 0.0, std::sin(half), std::cos(half)}, 1e-15);
}

/// A quaternion whose product with the unit is d.
Quaternion AtCosine(double d)
{
    return {0.0, 0.0, std::sqrt(1.0 - d * d), d};
}

TEST(Interpolate, RefusesArcsBelowItsThreshold)
{
    // 1 - d is exact near 1; 1e-08 itself is not below.
    const double inside = 1.0 - 0.99e-08;
    const double outside = 1.0 - 1.01e-08;
    Quaternion out{7.0, 7.0, 7.0, 7.0};
    for (const double sign : {1.0, -1.0}) {
        EXPECT_FALSE(Quaternion::Interpolate(unit, AtCosine(sign * inside), 0.5, out));
        EXPECT_EQ(out, unit);
        EXPECT_TRUE(Quaternion::Interpolate(unit, AtCosine(sign * outside), 0.5, out));
        EXPECT_NE(out, unit);
    }
}

TEST(Interpolate, RefusesExactlyBelowItsThreshold)
{
    // The two doubles d next to 1 - 1e-08, on either side of it.
    double below = 1.0 - 1e-08;
    while (1.0 - below < 1e-08)
        below = Below(below);
    const double above = Above(below);
    Quaternion out{};
    EXPECT_TRUE(Quaternion::Interpolate(unit, AtCosine(below), 0.5, out));
    EXPECT_FALSE(Quaternion::Interpolate(unit, AtCosine(above), 0.5, out));
}

TEST(Interpolate, LongerQuaternionsAreRefused)
{
    // |d| above 1 has no angle.
    Quaternion out{};
    EXPECT_FALSE(Quaternion::Interpolate({0.0, 0.0, 0.0, 2.0}, {0.0, 0.0, 1.0, 2.0}, 0.5, out));
    EXPECT_EQ(out, (Quaternion{0.0, 0.0, 0.0, 2.0}));
}

TEST(Interpolate, DoesNotNormalise)
{
    // d = 0: the sum of both, weighted by sines.
    Quaternion out{};
    ASSERT_TRUE(Quaternion::Interpolate({3.0, 0.0, 0.0, 0.0}, {0.0, 5.0, 0.0, 0.0}, 0.5, out));
    const double s = std::sqrt(0.5);
    ExpectNear(out, {3.0 * s, 5.0 * s, 0.0, 0.0}, 1e-15);
}

TEST(Interpolate, NanGoesThrough)
{
    Quaternion out{};
    EXPECT_TRUE(Quaternion::Interpolate({nan, 0.0, 0.0, 0.0}, unit, 0.5, out));
    EXPECT_TRUE(std::isnan(out.w));
}

TEST(Interpolate, ResultMayBeOneOfTheEnds)
{
    RandomUnits random;
    for (int n = 0; n < 100; ++n) {
        const Quaternion a = random.Next();
        const Quaternion b = random.Next();
        Quaternion expected{};
        Quaternion::Interpolate(a, b, 0.3, expected);
        Quaternion first = a;
        Quaternion::Interpolate(first, b, 0.3, first);
        EXPECT_EQ(first, expected);
        Quaternion second = b;
        Quaternion::Interpolate(a, second, 0.3, second);
        EXPECT_EQ(second, expected);
    }
    Quaternion same = unit;
    EXPECT_FALSE(Quaternion::Interpolate(unit, same, 0.3, same));
    EXPECT_EQ(same, unit);
}

} // namespace
} // namespace ZarnMath
