#include "ZarnMath/WMath3D.h"

#include "tests/Bits.h"

#include <cmath>
#include <random>
#include <vector>

namespace ZarnMath {
namespace {

constexpr int smallest = std::numeric_limits<int>::min();
constexpr int largest = std::numeric_limits<int>::max();

MATRIX3D Identity()
{
    MATRIX3D matrix{};
    MTHGet3DIdentityMatrix(&matrix);
    return matrix;
}

MATRIX3D Diagonal(std::int32_t element)
{
    return {{{element, 0, 0, 0}, {0, element, 0, 0}, {0, 0, element, 0}}};
}

POINT3D Transformed(const MATRIX3D& matrix, POINT3D p)
{
    MTHTransform3DPoints(&p, &matrix, 1);
    return p;
}

POINT Projected(const POINT3D& p, const POINT3D& viewpoint)
{
    POINT image{-77, 77};
    EXPECT_EQ(MTHPerspective3DProjection(&p, &image, 1, &viewpoint), 1);
    return image;
}

MATRIX3D ToMatrix(const Quaternion& q)
{
    MATRIX3D matrix{{{-7, -7, -7, -7}, {-7, -7, -7, -7}, {-7, -7, -7, -7}}};
    VECT_QuaternionToMat(&q, &matrix);
    return matrix;
}

Quaternion ToQuaternion(const MATRIX3D& matrix)
{
    Quaternion q{-7.0, -7.0, -7.0, -7.0};
    VECT_MatToQuaternion(&matrix, &q);
    return q;
}

Quaternion RandomUnit(std::mt19937& engine)
{
    std::normal_distribution<double> number;
    const Quaternion q{number(engine), number(engine), number(engine), number(engine)};
    const double length = std::sqrt(q.x * q.x + q.y * q.y + q.z * q.z + q.w * q.w);
    return {q.x / length, q.y / length, q.z / length, q.w / length};
}

void ExpectNear(const Quaternion& a, const Quaternion& b, double tolerance)
{
    EXPECT_NEAR(a.x, b.x, tolerance);
    EXPECT_NEAR(a.y, b.y, tolerance);
    EXPECT_NEAR(a.z, b.z, tolerance);
    EXPECT_NEAR(a.w, b.w, tolerance);
}

TEST(Matrix3D, Identity)
{
    EXPECT_EQ(Identity(), (MATRIX3D{{{65536, 0, 0, 0}, {0, 65536, 0, 0}, {0, 0, 65536, 0}}}));
}

TEST(Matrix3D, TranslationActsAfterTheRest)
{
    MATRIX3D matrix = Identity();
    MTHTranslate3DMatrix(&matrix, 1, 2, 3);
    EXPECT_EQ(Transformed(matrix, {0, 0, 0}), (POINT3D{1, 2, 3}));
    matrix = Diagonal(2 * 65536);
    MTHTranslate3DMatrix(&matrix, 1, 2, 3);
    EXPECT_EQ(Transformed(matrix, {10, 20, 30}), (POINT3D{21, 42, 63}));
    EXPECT_EQ(matrix, (MATRIX3D{{{131072, 0, 0, 1}, {0, 131072, 0, 2}, {0, 0, 131072, 3}}}));
}

TEST(Matrix3D, TranslationWraps)
{
    MATRIX3D matrix{{{0, 0, 0, largest}, {0, 0, 0, smallest}, {0, 0, 0, -5}}};
    MTHTranslate3DMatrix(&matrix, 1, -1, 5);
    EXPECT_EQ(matrix, (MATRIX3D{{{0, 0, 0, smallest}, {0, 0, 0, largest}, {0, 0, 0, 0}}}));
}

TEST(Transform3D, IdentityKeepsCoordinatesBelowTwoToThe24)
{
    std::vector<POINT3D> points;
    std::mt19937 engine(1);
    std::uniform_int_distribution<int> coordinate(-16777216, 16777216);
    for (int i = 0; i < 1000; ++i)
        points.push_back({coordinate(engine), coordinate(engine), coordinate(engine)});
    const std::vector<POINT3D> before = points;
    const MATRIX3D matrix = Identity();
    MTHTransform3DPoints(points.data(), &matrix, 1000);
    EXPECT_EQ(points, before);
}

TEST(Transform3D, LargerCoordinatesLoseTheirLowBits)
{
    EXPECT_EQ(Transformed(Identity(), {16777217, 16777219, -16777217}), (POINT3D{16777216, 16777220, -16777216}));
    EXPECT_EQ(Transformed(Identity(), {33554435, 33554433, 1}), (POINT3D{33554436, 33554432, 1}));
}

TEST(Transform3D, TruncatesTowardZero)
{
    EXPECT_EQ(Transformed(Diagonal(98304), {3, -3, 1}), (POINT3D{4, -4, 1})); // 4.5, -4.5, 1.5
    EXPECT_EQ(Transformed(Diagonal(65535), {1, -1, 100}), (POINT3D{0, 0, 99}));
}

TEST(Transform3D, ReadsTheMatrixByRows)
{
    const MATRIX3D matrix{{{1 << 16, 2 << 16, 3 << 16, 7}, {4 << 16, 5 << 16, 6 << 16, 8}, {-1 << 16, 0, 1 << 16, 9}}};
    EXPECT_EQ(Transformed(matrix, {1, 10, 100}), (POINT3D{321 + 7, 654 + 8, 99 + 9}));
}

TEST(Transform3D, AddsInSinglePrecisionFromTheLeft)
{
    // (2^24 + 1) + 1 stays 2^24, while 2^24 + (1 + 1) would be 2^24 + 2.
    const MATRIX3D sum{{{65536, 65536, 65536, 0}, {0, 0, 0, 0}, {0, 0, 0, 0}}};
    EXPECT_EQ(Transformed(sum, {16777216, 1, 1}).x, 16777216);
    EXPECT_EQ(Transformed(sum, {1, 1, 16777216}).x, 16777218);
}

TEST(Transform3D, AddsTheTranslationInIntegers)
{
    MATRIX3D matrix = Identity();
    MTHTranslate3DMatrix(&matrix, 1, -1, 0);
    EXPECT_EQ(Transformed(matrix, {16777216, 16777216, 5}), (POINT3D{16777217, 16777215, 5}));
    matrix = Identity();
    MTHTranslate3DMatrix(&matrix, largest, smallest, 0);
    EXPECT_EQ(Transformed(matrix, {1, -1, 0}), (POINT3D{smallest, largest, 0}));
}

TEST(Transform3D, SaturatesBeforeTheTranslation)
{
    MATRIX3D matrix = Diagonal(largest);
    EXPECT_EQ(Transformed(matrix, {largest, smallest, 0}), (POINT3D{largest, smallest, 0}));
    MTHTranslate3DMatrix(&matrix, -1, 1, 0);
    EXPECT_EQ(Transformed(matrix, {largest, smallest, 0}), (POINT3D{largest - 1, smallest + 1, 0}));
}

TEST(Transform3D, LargeMatrixElementsAreRoundedToSinglePrecision)
{
    // 2^30 + 1 is 2^30 as a float: 16384 times the coordinate.
    EXPECT_EQ(Transformed(Diagonal((1 << 30) + 1), {3, 5, 7}), (POINT3D{49152, 81920, 114688}));
}

TEST(Transform3D, CountBelowOneDoesNothing)
{
    POINT3D p{1, 2, 3};
    const MATRIX3D matrix = Diagonal(0);
    MTHTransform3DPoints(&p, &matrix, 0);
    MTHTransform3DPoints(&p, &matrix, -5);
    MTHTransform3DPoints(nullptr, nullptr, 0);
    EXPECT_EQ(p, (POINT3D{1, 2, 3}));
}

TEST(Transform3D, ArraysOfAnyLengthArePointByPoint)
{
    std::mt19937 engine(2);
    std::uniform_int_distribution<int> element(-100000, 100000);
    MATRIX3D matrix{};
    for (auto& row : matrix.m)
        for (std::int32_t& e : row)
            e = element(engine);
    for (int n = 1; n <= 17; ++n) {
        std::vector<POINT3D> points;
        for (int i = 0; i <= n; ++i)
            points.push_back({element(engine), element(engine), element(engine)});
        std::vector<POINT3D> expected = points;
        for (int i = 0; i < n; ++i)
            expected[static_cast<std::size_t>(i)] = Transformed(matrix, points[static_cast<std::size_t>(i)]);
        MTHTransform3DPoints(points.data(), &matrix, n);
        EXPECT_EQ(points, expected) << n;
    }
}

TEST(Perspective3D, PlaneOfProjectionStays)
{
    for (const int z : {1, -1, 77, 100000})
        EXPECT_EQ(Projected({123, -456, 0}, {9, 8, z}), (POINT{123, -456}));
}

TEST(Perspective3D, PointHalfwayDoubles)
{
    EXPECT_EQ(Projected({10, 0, 50}, {0, 0, 100}), (POINT{20, 0}));
    EXPECT_EQ(Projected({10, -4, 50}, {0, 0, 100}), (POINT{20, -8}));
    EXPECT_EQ(Projected({10, 0, -100}, {0, 0, 100}), (POINT{5, 0}));
}

TEST(Perspective3D, ViewpointInThePlaneTakesEveryPointToItself)
{
    EXPECT_EQ(Projected({10, 20, 50}, {7, -3, 0}), (POINT{7, -3}));
    EXPECT_EQ(Projected({-99, 5, -1}, {7, -3, 0}), (POINT{7, -3}));
}

TEST(Perspective3D, LiesOnTheRayFromTheViewpoint)
{
    // (100*32 - 10*40) / 60 = 46.67, (100*-50 - 20*40) / 60 = -96.67
    EXPECT_EQ(Projected({32, -50, 40}, {10, 20, 100}), (POINT{46, -96}));
    EXPECT_EQ(Projected({-50, 32, 40}, {20, 10, 100}), (POINT{-96, 46}));
}

TEST(Perspective3D, WorksInDoublePrecision)
{
    // The products are beyond 2^53, but the quotient is one by another exactly.
    EXPECT_EQ(Projected({16777217, 16777219, 0}, {5, 5, 16777216}), (POINT{16777217, 16777219}));
}

TEST(Perspective3D, PointAtTheViewpointsDepthDoesNotTrap)
{
    EXPECT_EQ(Projected({1, -1, 100}, {0, 0, 100}), (POINT{largest, smallest}));
    EXPECT_EQ(Projected({0, 0, 100}, {0, 0, 100}), (POINT{0, 0})); // 0 / 0
    EXPECT_EQ(Projected({largest, smallest, 99}, {0, 0, 100}), (POINT{largest, smallest}));
}

TEST(Perspective3D, CountBelowOneDoesNothing)
{
    const POINT3D p{1, 2, 3};
    const POINT3D viewpoint{0, 0, 100};
    POINT image{-77, 77};
    EXPECT_EQ(MTHPerspective3DProjection(&p, &image, 0, &viewpoint), 1);
    EXPECT_EQ(MTHPerspective3DProjection(&p, &image, -1, &viewpoint), 1);
    EXPECT_EQ(MTHPerspective3DProjection(nullptr, nullptr, 0, nullptr), 1);
    EXPECT_EQ(image, (POINT{-77, 77}));
}

TEST(Perspective3D, WritesOneImageAPoint)
{
    const POINT3D points[3] = {{1, 2, 0}, {3, 4, 0}, {5, 6, 0}};
    const POINT3D viewpoint{0, 0, 100};
    POINT images[4] = {{-7, -7}, {-7, -7}, {-7, -7}, {-7, -7}};
    MTHPerspective3DProjection(points, images, 3, &viewpoint);
    EXPECT_EQ(images[0], (POINT{1, 2}));
    EXPECT_EQ(images[1], (POINT{3, 4}));
    EXPECT_EQ(images[2], (POINT{5, 6}));
    EXPECT_EQ(images[3], (POINT{-7, -7}));
}

TEST(QuaternionToMatrix, UnitGivesTheIdentity)
{
    EXPECT_EQ(ToMatrix({0.0, 0.0, 0.0, 1.0}), Identity());
}

TEST(QuaternionToMatrix, QuarterTurnAboutZ)
{
    const double h = 0.7853981633974483;
    const Quaternion q{0.0, 0.0, std::sin(h), std::cos(h)};
    const MATRIX3D matrix = ToMatrix(q);
    EXPECT_NEAR(matrix.m[0][1], 65536, 2);
    EXPECT_NEAR(matrix.m[1][0], -65536, 2);
    EXPECT_NEAR(matrix.m[0][0], 0, 2);
    EXPECT_NEAR(matrix.m[1][1], 0, 2);
    EXPECT_EQ(matrix.m[2][2], 65536);
}

TEST(QuaternionToMatrix, EachProductIsTruncatedAndThenDoubled)
{
    // All products are 0.25, 16384 in fixed point, so that nothing is lost.
    EXPECT_EQ(ToMatrix({0.5, 0.5, 0.5, 0.5}), (MATRIX3D{{{0, 65536, 0, 0}, {0, 0, 65536, 0}, {65536, 0, 0, 0}}}));
    // z*w = 0.48: 31457.28 is cut to 31457 and doubled; 0.96 at once would be 62914.56. w*w does not occur.
    const MATRIX3D matrix = ToMatrix({0.0, 0.0, 0.6, 0.8});
    EXPECT_EQ(matrix.m[0][1], 62914);
    EXPECT_EQ(matrix.m[1][0], -62914);
    EXPECT_EQ(matrix.m[0][0], 65536 - 2 * 23592); // z*z = 0.36: 23592.96
}

TEST(QuaternionToMatrix, EachElementHasItsPlace)
{
    // Products of distinct powers of two tell which of them stands where.
    const Quaternion q{1.0, 0.5, 0.0625, 0.0009765625};
    constexpr int xx = 131072;
    constexpr int yy = 32768;
    constexpr int zz = 512;
    constexpr int xw = 128;
    constexpr int yw = 64;
    constexpr int zw = 8;
    constexpr int xy = 65536;
    constexpr int xz = 8192;
    constexpr int yz = 4096;
    EXPECT_EQ(ToMatrix(q), (MATRIX3D{{{65536 - (yy + zz), zw + xy, xz - yw, 0},
                                      {xy - zw, 65536 - xx - zz, xw + yz, 0},
                                      {yw + xz, yz - xw, 65536 - xx - yy, 0}}}));
}

TEST(QuaternionToMatrix, NegativeProductsAreTruncatedTowardZero)
{
    const MATRIX3D matrix = ToMatrix({0.0, 0.0, -0.6, 0.8});
    EXPECT_EQ(matrix.m[0][1], -62914);
    EXPECT_EQ(matrix.m[1][0], 62914);
}

TEST(QuaternionToMatrix, LargeAndNanComponentsDoNotTrap)
{
    const MATRIX3D huge = ToMatrix({1e10, 0.0, 0.0, 1.0});
    EXPECT_EQ(huge.m[0][0], 65536);
    EXPECT_EQ(huge.m[1][1], 65538); // twice 2147483647 is -2 modulo 2^32
    EXPECT_EQ(huge.m[1][2], -2);
    EXPECT_EQ(ToMatrix({nan, nan, nan, nan}), Identity());
}

/// As the transform of points reads it, the matrix turns by the inverse.
TEST(QuaternionToMatrix, IsTheTransposeOfRotate)
{
    const double h = 0.7853981633974483;
    const Quaternion q{0.0, 0.0, std::sin(h), std::cos(h)};
    const POINT3D turned = Transformed(ToMatrix(q), {1000, 0, 0});
    EXPECT_NEAR(turned.x, 0, 1);
    EXPECT_NEAR(turned.y, -1000, 1);
    EXPECT_EQ(turned.z, 0);

    std::mt19937 engine(3);
    for (int i = 0; i < 1000; ++i) {
        const Quaternion unit = RandomUnit(engine);
        const Quaternion inverse{-unit.x, -unit.y, -unit.z, unit.w};
        vector3dT<double> v{1000.0, -2000.0, 3000.0};
        inverse.Rotate(v);
        const POINT3D p = Transformed(ToMatrix(unit), {1000, -2000, 3000});
        EXPECT_NEAR(p.x, v.x, 1.5);
        EXPECT_NEAR(p.y, v.y, 1.5);
        EXPECT_NEAR(p.z, v.z, 1.5);
    }
}

TEST(MatrixToQuaternion, IdentityGivesTheUnit)
{
    EXPECT_EQ(ToQuaternion(Identity()), (Quaternion{0.0, 0.0, 0.0, 1.0}));
}

TEST(MatrixToQuaternion, HalfTurnsAboutTheAxes)
{
    EXPECT_EQ(ToMatrix({1.0, 0.0, 0.0, 0.0}), (MATRIX3D{{{65536, 0, 0, 0}, {0, -65536, 0, 0}, {0, 0, -65536, 0}}}));
    EXPECT_EQ(ToQuaternion(ToMatrix({1.0, 0.0, 0.0, 0.0})), (Quaternion{1.0, 0.0, 0.0, 0.0}));
    EXPECT_EQ(ToQuaternion(ToMatrix({0.0, 1.0, 0.0, 0.0})), (Quaternion{0.0, 1.0, 0.0, 0.0}));
    EXPECT_EQ(ToQuaternion(ToMatrix({0.0, 0.0, 1.0, 0.0})), (Quaternion{0.0, 0.0, 1.0, 0.0}));
}

TEST(MatrixToQuaternion, GivesBackWhatTheMatrixWasMadeOf)
{
    std::mt19937 engine(4);
    for (int i = 0; i < 5000; ++i) {
        const Quaternion q = RandomUnit(engine);
        const Quaternion back = ToQuaternion(ToMatrix(q));
        const double sign = back.x * q.x + back.y * q.y + back.z * q.z + back.w * q.w < 0.0 ? -1.0 : 1.0;
        ExpectNear(back, {sign * q.x, sign * q.y, sign * q.z, sign * q.w}, 1e-4);
        const double trace = 4.0 * q.w * q.w - 1.0;
        EXPECT_TRUE(trace < 1e-3 || back.w >= 0.0);
    }
}

TEST(MatrixToQuaternion, TiesOfTheDiagonalTakeTheEarlierAxis)
{
    // A third of a turn about (1, 1, 1), transposed: the diagonal and the trace are 0.
    const Quaternion third = ToQuaternion({{{0, 65536, 0, 0}, {0, 0, 65536, 0}, {65536, 0, 0, 0}}});
    EXPECT_EQ(third, (Quaternion{0.5, 0.5, 0.5, 0.5}));
    // Half a turn about (1, 1, 0): the first two are equal, and x is formed first.
    const Quaternion half = ToQuaternion({{{0, 65536, 0, 0}, {65536, 0, 0, 0}, {0, 0, -65536, 0}}});
    EXPECT_EQ(half.x, std::sqrt(2.0) * 0.5);
    EXPECT_EQ(half.y, 2.0 / (std::sqrt(2.0) + std::sqrt(2.0)));
    EXPECT_EQ(half.z, 0.0);
    EXPECT_EQ(half.w, 0.0);
}

TEST(MatrixToQuaternion, TraceDecidesByTheTolerance)
{
    // The smallest trace above 0 in fixed point takes the first form: w is half the root of 1 + 2^-16.
    const MATRIX3D justAbove{{{1, 0, 0, 0}, {0, 0, 0, 0}, {0, 0, 0, 0}}};
    EXPECT_EQ(ToQuaternion(justAbove), (Quaternion{0.0, 0.0, 0.0, std::sqrt(1.0 + 0x1p-16) * 0.5}));
    // At 0 the second form starts from x.
    const MATRIX3D zero{};
    EXPECT_EQ(ToQuaternion(zero), (Quaternion{0.5, 0.0, 0.0, 0.0}));
}

TEST(MatrixToQuaternion, DoesNotReadTheTranslation)
{
    MATRIX3D matrix = ToMatrix({0.1, 0.7, 0.1, 0.7});
    const Quaternion q = ToQuaternion(matrix);
    MTHTranslate3DMatrix(&matrix, 5, largest, smallest);
    EXPECT_EQ(ToQuaternion(matrix), q);
}

TEST(MatrixToQuaternion, ReadsElementsInSinglePrecision)
{
    // 2^24 + 1 becomes 2^24, which is 256.
    const MATRIX3D matrix{{{16777217, 0, 0, 0}, {0, 0, 0, 0}, {0, 0, 0, 0}}};
    EXPECT_EQ(ToQuaternion(matrix).w, std::sqrt(257.0) * 0.5);
}

} // namespace
} // namespace ZarnMath
