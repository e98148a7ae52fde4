#include "ZarnMath/ValueTypesInternal.h"

#include "tests/Bits.h"
#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <vector>

// The library leaves these names of the global namespace to its callers.
enum class POINT;
enum class SIZE;
enum class RECT;

namespace ZarnMath {

namespace {

using CubicBezier::bezier2dT;
using Point2f = vector2dT<float, true>;
using Vector2f = vector2dT<float, false>;

constexpr double epsilon = DBL_EPSILON;

template <typename T>
constexpr bool isPlain = std::is_aggregate_v<T>&& std::is_trivially_copyable_v<T>&& std::is_standard_layout_v<T> &&
                         !std::is_polymorphic_v<T> && std::is_trivially_default_constructible_v<T>;

static_assert(isPlain<point2d> && isPlain<vector2d> && isPlain<Point2f> && isPlain<Vector2f>);
static_assert(isPlain<vector3dT<double>> && isPlain<bezier2dT<point2d>> && isPlain<BoundsT<double>>);
static_assert(isPlain<ZarnMath::POINT> && isPlain<ZarnMath::SIZE> && isPlain<ZarnMath::RECT>);

static_assert(sizeof(point2d) == 16 && offsetof(point2d, x) == 0 && offsetof(point2d, y) == 8);
static_assert(sizeof(vector2d) == 16 && offsetof(vector2d, x) == 0 && offsetof(vector2d, y) == 8);
static_assert(sizeof(Point2f) == 8 && offsetof(Point2f, x) == 0 && offsetof(Point2f, y) == 4);
static_assert(sizeof(vector3dT<double>) == 24 && offsetof(vector3dT<double>, x) == 0 &&
              offsetof(vector3dT<double>, y) == 8 && offsetof(vector3dT<double>, z) == 16);
static_assert(sizeof(bezier2dT<point2d>) == 64);
static_assert(sizeof(ZarnMath::POINT) == 8 && offsetof(ZarnMath::POINT, x) == 0 && offsetof(ZarnMath::POINT, y) == 4);
static_assert(sizeof(ZarnMath::SIZE) == 8 && offsetof(ZarnMath::SIZE, cx) == 0 && offsetof(ZarnMath::SIZE, cy) == 4);
static_assert(sizeof(ZarnMath::RECT) == 16 && offsetof(ZarnMath::RECT, left) == 0 &&
              offsetof(ZarnMath::RECT, top) == 4 && offsetof(ZarnMath::RECT, right) == 8 &&
              offsetof(ZarnMath::RECT, bottom) == 12);
static_assert(sizeof(BoundsT<double>) == 32 && offsetof(BoundsT<double>, left) == 0 &&
              offsetof(BoundsT<double>, top) == 8 && offsetof(BoundsT<double>, right) == 16 &&
              offsetof(BoundsT<double>, bottom) == 24);

static_assert(std::is_same_v<ZarnMath::POINT, Framework::common_types::POINT>);
static_assert(std::is_same_v<ZarnMath::SIZE, Framework::common_types::SIZE>);
static_assert(std::is_same_v<ZarnMath::RECT, Framework::common_types::RECT>);
static_assert(std::is_same_v<decltype(ZarnMath::POINT::x), std::int32_t>);
static_assert(std::is_same_v<decltype(ZarnMath::RECT::left), std::int32_t>);

// Positions and displacements are different types.
template <typename A, typename B>
concept CanAdd = requires(A a, B b)
{
    a + b;
};

template <typename A, typename B>
concept CanSubtract = requires(A a, B b)
{
    a - b;
};

template <typename A>
concept CanScale = requires(A a)
{
    a * 2.0;
};

static_assert(std::is_same_v<decltype(point2d{} - point2d{}), vector2d>);
static_assert(std::is_same_v<decltype(point2d{} + vector2d{}), point2d>);
static_assert(std::is_same_v<decltype(point2d{} - vector2d{}), point2d>);
static_assert(std::is_same_v<decltype(vector2d{} + vector2d{}), vector2d>);
static_assert(std::is_same_v<decltype(vector2d{} - vector2d{}), vector2d>);
static_assert(!CanAdd<point2d, point2d> && !CanAdd<vector2d, point2d> && !CanSubtract<vector2d, point2d>);
static_assert(CanScale<vector2d> && !CanScale<point2d>);
static_assert(!std::is_convertible_v<vector2d, point2d> && !std::is_convertible_v<point2d, vector2d>);

// What needs no square root is known to the compiler.
static_assert(Dot(point2d{1, 2}, vector2d{3, 4}) == 11.0);
static_assert(Cross(vector2d{1, 2}, point2d{3, 4}) == -2.0);
static_assert(LengthSquared(vector2d{3, 4}) == 25.0);
static_assert(Perpendicular(vector2d{3, 4}) == vector2d{-4, 3});
static_assert(IsNearEqual(1.0, 1.0 + epsilon) && IsNearZero(-epsilon) && IsAtLeast(1.0, 1.0 + epsilon));
static_assert(RoundToInt(2.5) == 3 && RoundToInt(-2.5) == -3);
static_assert(ToPOINT({0.5, -0.5}) == ZarnMath::POINT{1, -1});

static_assert(noexcept(point2d{} - point2d{}) && noexcept(point2d{} + vector2d{}) && noexcept(vector2d{} / 2.0));
static_assert(noexcept(Dot(point2d{}, point2d{})) && noexcept(Cross(point2d{}, point2d{})));
static_assert(noexcept(LengthSquared(point2d{})) && noexcept(Perpendicular(vector2d{})));
static_assert(noexcept(Normalize(vector2d{})) && noexcept(RoundToInt(0.0)));
static_assert(noexcept(IsNearZero(0.0)) && noexcept(IsNearEqual(0.0, 0.0)) && noexcept(IsAtLeast(0.0, 0.0)));
static_assert(noexcept(IsNearEqual(point2d{}, point2d{})) && noexcept(point2d2ZGIPOINT<10>(nullptr, nullptr)));

TEST(ValueTypes, KeepTheFieldOrderOfBraces)
{
    const ZarnMath::RECT rect = {1, 2, 3, 4};
    EXPECT_EQ(rect.left, 1);
    EXPECT_EQ(rect.top, 2);
    EXPECT_EQ(rect.right, 3);
    EXPECT_EQ(rect.bottom, 4);
    const BoundsT<double> bounds = {1.0, 2.0, 3.0, 4.0};
    EXPECT_EQ(bounds.left, 1.0);
    EXPECT_EQ(bounds.top, 2.0);
    EXPECT_EQ(bounds.right, 3.0);
    EXPECT_EQ(bounds.bottom, 4.0);
    const vector3dT<double> v = {1.0, 2.0, 3.0};
    EXPECT_EQ(v.x, 1.0);
    EXPECT_EQ(v.y, 2.0);
    EXPECT_EQ(v.z, 3.0);
}

TEST(ValueTypes, ACubicIsItsFourPoints)
{
    bezier2dT<point2d> curve = {{{1, 2}, {3, 4}, {5, 6}, {7, 8}}};
    EXPECT_EQ(curve[0], (point2d{1, 2}));
    EXPECT_EQ(curve.points[3], (point2d{7, 8}));
    curve[2].y = 60.0;
    EXPECT_EQ(curve.points[2], (point2d{5, 60}));
}

TEST(Vector, ArithmeticGoesByComponents)
{
    const point2d a = {5, 7};
    const vector2d v = {2, -3};
    EXPECT_EQ(a - point2d({1, 10}), (vector2d{4, -3}));
    EXPECT_EQ(a + v, (point2d{7, 4}));
    EXPECT_EQ(a - v, (point2d{3, 10}));
    EXPECT_EQ(v + v, (vector2d{4, -6}));
    EXPECT_EQ(v - vector2d({1, 1}), (vector2d{1, -4}));
    EXPECT_EQ(v * 2.0, (vector2d{4, -6}));
    EXPECT_EQ(2.0 * v, (vector2d{4, -6}));
    EXPECT_EQ(v / 2.0, (vector2d{1, -1.5}));
}

TEST(Vector, FloatArithmeticStaysInFloat)
{
    const Vector2f v = {16777216.0f, 1.0f};
    EXPECT_EQ(v + Vector2f({1.0f, 1.0f}), (Vector2f{16777216.0f, 2.0f}));
    static_assert(std::is_same_v<decltype(Dot(v, v)), float>);
}

// 1/49 rounds, and 49*(1/49) rounds again: below 1.
TEST(Vector, DivisionDivides)
{
    EXPECT_EQ((vector2d{49.0, 98.0} / 49.0), (vector2d{1.0, 2.0}));
    volatile double reciprocal = 1.0 / 49.0;
    ASSERT_NE(49.0 * reciprocal, 1.0);
}

TEST(Products, TakePointsAndVectorsInAnyMixture)
{
    const point2d p = {2, 3};
    const point2d q = {5, 7};
    for (const double dot : {Dot(p, q), Dot(p, AsVector(q)), Dot(AsVector(p), q), Dot(AsVector(p), AsVector(q))})
        EXPECT_EQ(dot, 31.0);
    for (const double x : {Cross(p, q), Cross(p, AsVector(q)), Cross(AsVector(p), q), Cross(AsVector(p), AsVector(q))})
        EXPECT_EQ(x, -1.0);
    EXPECT_EQ(LengthSquared(p), 13.0);
    EXPECT_EQ(LengthSquared(AsVector(p)), 13.0);
}

// (1 + e)(1 - e) = 1 - e^2 rounds to 1, so that the plain sum is 0; a fused one would keep -e^2.
TEST(Products, RoundOncePerOperation)
{
    const double up = 1.0 + epsilon;
    const double down = 1.0 - epsilon;
    ASSERT_NE(std::fma(up, down, -1.0), 0.0);
    volatile double one = 1.0;
    EXPECT_EQ(Dot(vector2d{up, -one}, vector2d{down, one}), 0.0);
    EXPECT_EQ(Cross(vector2d{up, one}, vector2d{one, down}), 0.0);
}

TEST(Products, CrossIsPositiveToTheLeft)
{
    EXPECT_GT(Cross(vector2d{1, 0}, vector2d{0, 1}), 0.0);
    EXPECT_LT(Cross(vector2d{1, 0}, vector2d{0, -1}), 0.0);
}

TEST(Perpendicular, IsAQuarterTurnToTheLeft)
{
    EXPECT_TRUE(SameBits(Perpendicular(vector2d{1.0, 0.0}), {-0.0, 1.0}));
    EXPECT_TRUE(SameBits(Perpendicular(vector2d{0.0, 1.0}), {-1.0, 0.0}));
    EXPECT_TRUE(SameBits(Perpendicular(vector2d{3.0, -0.0}), {0.0, 3.0}));
}

TEST(Normalize, LeavesAShortVectorAlone)
{
    EXPECT_EQ(Normalize({0.0, 0.0}), (vector2d{0.0, 0.0}));
    EXPECT_EQ(Normalize({1e-8, 0.0}), (vector2d{1e-8, 0.0}));
    EXPECT_EQ(Normalize({2e-8, 0.0}), (vector2d{1.0, 0.0}));
    EXPECT_TRUE(SameBits(Normalize({-0.0, 0.0}), {-0.0, 0.0}));
}

// 2^-26 squared is the tolerance itself.
TEST(Normalize, CountsTheToleranceAsShort)
{
    const double border = std::ldexp(1.0, -26);
    EXPECT_EQ(Normalize({0.0, border}), (vector2d{0.0, border}));
    EXPECT_EQ(Normalize({0.0, Above(border)}), (vector2d{0.0, 1.0}));
}

TEST(Normalize, DividesBothComponents)
{
    EXPECT_EQ(Normalize({3.0, -4.0}), (vector2d{3.0 / 5.0, -4.0 / 5.0}));
    EXPECT_EQ(Normalize({0.0, -49.0}), (vector2d{0.0, -1.0}));
}

TEST(Normalize, GivesUnitLengthWithinRounding)
{
    RandomSource random(1);
    for (int i = 0; i < 2000; ++i) {
        const vector2d v = AsVector(random.Point(random.Magnitude()));
        if (LengthSquared(v) > epsilon) {
            EXPECT_NEAR(LengthSquared(Normalize(v)), 1.0, 4.0 * epsilon);
        }
    }
}

TEST(Normalize, PropagatesNaN)
{
    EXPECT_TRUE(SameBits(Normalize({nan, 1.0}), {nan, nan}));
    EXPECT_TRUE(SameBits(Normalize({infinity, 1.0}), {nan, 0.0}));
}

TEST(IsNearZero, IncludesTheTolerance)
{
    EXPECT_TRUE(IsNearZero(0.0));
    EXPECT_TRUE(IsNearZero(-0.0));
    EXPECT_TRUE(IsNearZero(2.220446049250313e-16));
    EXPECT_TRUE(IsNearZero(-2.220446049250313e-16));
    EXPECT_FALSE(IsNearZero(Above(epsilon)));
    EXPECT_FALSE(IsNearZero(-Above(epsilon)));
    EXPECT_FALSE(IsNearZero(infinity));
    EXPECT_FALSE(IsNearZero(nan));
}

TEST(IsNearEqual, IncludesTheTolerance)
{
    EXPECT_TRUE(IsNearEqual(1.0, 1.0 + epsilon));
    EXPECT_FALSE(IsNearEqual(1.0, 1.0 + 2.0 * epsilon));
    EXPECT_FALSE(IsNearEqual(nan, nan));
    EXPECT_FALSE(IsNearEqual(infinity, infinity));
}

TEST(IsNearEqual, IsNotScaledByTheOperands)
{
    EXPECT_FALSE(IsNearEqual(1e16, 1e16 + 2.0));
    EXPECT_TRUE(IsNearEqual(1e-16, -1e-16));
}

TEST(IsNearEqual, ComparesPointsByCoordinate)
{
    EXPECT_TRUE(IsNearEqual(point2d{0, 0}, point2d{1e-16, 1e-16}));
    EXPECT_FALSE(IsNearEqual(point2d{0, 0}, point2d{1e-15, 0}));
    EXPECT_FALSE(IsNearEqual(point2d{0, 0}, point2d{0, 1e-15}));
    // A square, not a circle: the corner is farther away than the tolerance.
    EXPECT_TRUE(IsNearEqual(point2d{0, 0}, point2d{epsilon, epsilon}));
    EXPECT_FALSE(IsNearEqual(point2d{0, nan}, point2d{0, nan}));
}

TEST(IsAtLeast, IncludesTheToleranceBelow)
{
    EXPECT_TRUE(IsAtLeast(2.0, 1.0));
    EXPECT_TRUE(IsAtLeast(1.0, 1.0));
    EXPECT_TRUE(IsAtLeast(1.0, 1.0 + epsilon));
    EXPECT_FALSE(IsAtLeast(1.0, 1.0 + 2.0 * epsilon));
    EXPECT_FALSE(IsAtLeast(nan, 1.0));
    EXPECT_FALSE(IsAtLeast(1.0, nan));
    EXPECT_TRUE(IsAtLeast(infinity, 1.0));
    EXPECT_FALSE(IsAtLeast(infinity, infinity));
}

TEST(RoundToInt, SendsHalvesAwayFromZero)
{
    EXPECT_EQ(RoundToInt(2.5), 3);
    EXPECT_EQ(RoundToInt(-2.5), -3);
    EXPECT_EQ(RoundToInt(0.5), 1);
    EXPECT_EQ(RoundToInt(-0.5), -1);
    EXPECT_EQ(RoundToInt(0.49), 0);
    EXPECT_EQ(RoundToInt(-0.49), 0);
    EXPECT_EQ(RoundToInt(0.0), 0);
    EXPECT_EQ(RoundToInt(-0.0), 0);
}

TEST(RoundToInt, AddsAndTruncates)
{
    EXPECT_EQ(RoundToInt(0.49999999999999994), 1);
    EXPECT_EQ(RoundToInt(-0.49999999999999994), -1);
    EXPECT_EQ(RoundToInt(Below(0.49999999999999994)), 0);
}

TEST(RoundToInt, ReachesBothLimits)
{
    EXPECT_EQ(RoundToInt(2147483647.0), 2147483647);
    EXPECT_EQ(RoundToInt(2147483647.4), 2147483647);
    EXPECT_EQ(RoundToInt(2147483646.4), 2147483646);
    EXPECT_EQ(RoundToInt(-2147483648.0), -2147483647 - 1);
    EXPECT_EQ(RoundToInt(-2147483648.4), -2147483647 - 1);
    EXPECT_EQ(RoundToInt(-2147483647.4), -2147483647);
}

TEST(RoundToInt, SaturatesBeyondThem)
{
    for (const double v : {2147483647.5, 2147483648.0, 4294967296.0, 1e300, infinity})
        EXPECT_EQ(RoundToInt(v), 2147483647) << v;
    for (const double v : {-2147483648.5, -2147483649.0, -4294967296.0, -1e300, -infinity})
        EXPECT_EQ(RoundToInt(v), -2147483647 - 1) << v;
    EXPECT_EQ(RoundToInt(nan), 0);
    EXPECT_EQ(RoundToInt(-nan), 0);
}

TEST(RoundToInt, KeepsIntegers)
{
    RandomSource random(2);
    for (int i = 0; i < 2000; ++i) {
        const int n = random.Integer(-2147483647 - 1, 2147483647);
        EXPECT_EQ(RoundToInt(n), n);
    }
}

TEST(OutwardRounding, IsThatOfTheWholeNumberAboveAndBelow)
{
    RandomSource random(5);
    std::vector<double> values = {
        0.0,           -0.0,          0.5,           -0.5,  1e-300, -1e-300,  2147483646.5, 2147483647.0, 2147483647.5,
        -2147483647.5, -2147483648.0, -2147483648.5, 1e300, -1e300, infinity, -infinity,    nan};
    for (int i = 0; i < 1000; ++i)
        values.push_back(random.Uniform(-1.0, 1.0) * random.Magnitude());
    for (int i = -20; i <= 20; ++i)
        for (const double v : {i * 1.0, Below(i * 1.0), -Below(i * 1.0)})
            values.push_back(v);
    for (const double v : values) {
        EXPECT_EQ(CeilToInt(v), RoundToInt(std::ceil(v))) << v;
        EXPECT_EQ(FloorToInt(v), RoundToInt(std::floor(v))) << v;
    }
    EXPECT_EQ(RoundOutward({-1.5, 2.25, 3.0, -4.0}), (RECT{-2, 3, 3, -4}));
}

TEST(Point2dToPoint, RoundsElementByElementAndNoMore)
{
    point2d in[11];
    for (int i = 0; i < 11; ++i)
        in[i] = {i + 0.5, -i - 0.25};
    Guarded<ZarnMath::POINT, 10> out;
    point2d2ZGIPOINT<10>(out.data(), in);
    for (int i = 0; i < 10; ++i)
        EXPECT_EQ(out[i], (ZarnMath::POINT{i + 1, -i}));
    EXPECT_TRUE(out.IsIntact());
    Guarded<ZarnMath::POINT, 10> four;
    point2d2ZGIPOINT<4>(four.data(), in);
    EXPECT_EQ(four[3], (ZarnMath::POINT{4, -3}));
    EXPECT_TRUE(four.IsUntouchedFrom(4));
}

TEST(PointToPoint2d, IsExact)
{
    EXPECT_EQ(ToPoint2d(ZarnMath::POINT{2147483647, -2147483647 - 1}), (point2d{2147483647.0, -2147483648.0}));
}

} // namespace

} // namespace ZarnMath
