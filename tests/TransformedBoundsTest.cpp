#include "ZarnMath/Bounds.h"

#include "tests/WMath/Matrices.h"

#include <array>
#include <vector>

namespace ZarnMath {

namespace {

constexpr std::int32_t smallestInt = -2147483647 - 1;
constexpr std::int32_t largestInt = 2147483647;

using Bounds = BoundsT<double>;

static_assert(noexcept(GetTransformedBBox(RECT{}, identity)));
static_assert(noexcept(GetRemappedPoint(point2d{}, Bounds{}, Bounds{})));

constexpr MATRIX Scale(double s)
{
    return {s, 0.0, 0.0, 0.0, s, 0.0};
}

Bounds ToDouble(const RECT& r)
{
    return {static_cast<double>(r.left), static_cast<double>(r.top), static_cast<double>(r.right),
            static_cast<double>(r.bottom)};
}

TEST(TransformedBounds, IdentityGivesTheBoxBack)
{
    const RECT rect{-5, 7, 3, -2};
    EXPECT_EQ(GetTransformedBBox(rect, identity), rect);
    EXPECT_EQ(GetTransformedBBox(ToDouble(rect), identity), ToDouble(rect));
    EXPECT_EQ(GetUntransformedBBox(rect, identity), rect);
    EXPECT_EQ(GetUntransformedBBox(ToDouble(rect), identity), ToDouble(rect));
}

TEST(TransformedBounds, ThreeWaysOfMeasuring)
{
    const MATRIX m = Scale(0.4);
    // A rectangle rounds its corners to the nearest unit ...
    EXPECT_EQ(GetTransformedBBox(RECT{0, 1, 1, 0}, m), (RECT{0, 0, 0, 0}));
    // ... points are enclosed ...
    const POINT corners[4] = {{0, 1}, {1, 1}, {1, 0}, {0, 0}};
    EXPECT_EQ(GetTransformedPointsBBox(corners, 4, m), (RECT{0, 1, 1, 0}));
    // ... and double points are measured from the integer limits on.
    const point2d far[2] = {{1e10, -1e10}, {2e10, -2e10}};
    EXPECT_EQ(GetTransformedPointsBBox(far, 2, m), (Bounds{2147483647.0, -2147483648.0, 8e9, -8e9}));
    EXPECT_EQ(GetPointsBBox(far, 2), (Bounds{1e10, -1e10, 2e10, -2e10}));
}

TEST(TransformedBounds, QuarterTurnExchangesWidthAndHeight)
{
    const MATRIX quarter{0.0, -1.0, 10.0, 1.0, 0.0, 20.0};
    EXPECT_EQ(GetTransformedBBox(Bounds{1.0, 5.0, 3.0, 2.0}, quarter), (Bounds{5.0, 23.0, 8.0, 21.0}));
    EXPECT_EQ(GetTransformedBBox(RECT{1, 5, 3, 2}, quarter), (RECT{5, 23, 8, 21}));
}

TEST(TransformedBounds, MirrorIsPutInOrder)
{
    EXPECT_EQ(GetTransformedBBox(RECT{1, 5, 3, 2}, {-1.0, 0.0, 0.0, 0.0, 1.0, 0.0}), (RECT{-3, 5, -1, 2}));
    // Inside out comes out in order too.
    EXPECT_EQ(GetTransformedBBox(RECT{3, 2, 1, 5}, identity), (RECT{1, 5, 3, 2}));
}

TEST(TransformedBounds, EmptyBoxIsTransformedLikeAnyOther)
{
    EXPECT_EQ(GetTransformedBBox(GetEmptyRect(), identity), (RECT{smallestInt, largestInt, largestInt, smallestInt}));
    Bounds empty{};
    InitializeEmpty(empty);
    EXPECT_EQ(GetTransformedBBox(empty, Scale(2.0)),
              (Bounds{-2.0 * 2147483648.0, 2.0 * 2147483647.0, 2.0 * 2147483647.0, -2.0 * 2147483648.0}));
}

TEST(TransformedBounds, FirstCornerSeedsBoundsAndOthersReplaceStrictly)
{
    // Corner 0 has NaN in x and keeps it; from corner 1 on NaN is passed over.
    const Bounds box = GetTransformedBBox(Bounds{nan, 1.0, 2.0, 0.0}, identity);
    EXPECT_TRUE(std::isnan(box.left));
    EXPECT_TRUE(std::isnan(box.right));
    const Bounds later = GetTransformedBBox(Bounds{0.0, 1.0, nan, 0.0}, identity);
    EXPECT_EQ(later.left, 0.0);
    EXPECT_EQ(later.right, 0.0);
    // The images of corners 0 and 1 have x = 0 and x = -0, which does not replace it.
    const MATRIX keepsSign{1.0, -0.0, -0.0, 0.0, 1.0, 0.0};
    EXPECT_TRUE(std::signbit(keepsSign(point2d{-0.0, 1.0}).x));
    EXPECT_FALSE(std::signbit(GetTransformedBBox(Bounds{0.0, 1.0, -0.0, 0.0}, keepsSign).left));
}

TEST(TransformedBounds, UntransformedUndoesTheMatrix)
{
    EXPECT_EQ(GetUntransformedBBox(RECT{2, 10, 6, 4}, {2.0, 0.0, 0.0, 0.0, 2.0, 2.0}), (RECT{1, 4, 3, 1}));
    EXPECT_EQ(GetUntransformedBBox(Bounds{2.0, 10.0, 6.0, 4.0}, {2.0, 0.0, 0.0, 0.0, 2.0, 2.0}),
              (Bounds{1.0, 4.0, 3.0, 1.0}));
}

TEST(TransformedBounds, UntransformedOfASingularMatrixIsTheOrigin)
{
    const MATRIX matrices[] = {zeroMatrix,
                               {1.0, 2.0, 5.0, 2.0, 4.0, 6.0},
                               {0x1p-26, 0.0, 5.0, 0.0, 0x1p-26, 6.0}, // the determinant is DBL_EPSILON
                               {nan, 0.0, 5.0, 0.0, 1.0, 6.0}};
    for (const MATRIX& m : matrices) {
        EXPECT_EQ(GetUntransformedBBox(RECT{1, 5, 3, 2}, m), (RECT{0, 0, 0, 0}));
        EXPECT_EQ(GetUntransformedBBox(Bounds{1.0, 5.0, 3.0, 2.0}, m), (Bounds{0.0, 0.0, 0.0, 0.0}));
    }
    const MATRIX above{Above(0x1p-26), 0.0, 0.0, 0.0, 0x1p-26, 0.0};
    EXPECT_NE(GetUntransformedBBox(Bounds{1.0, 5.0, 3.0, 2.0}, above).right, 0.0);
}

TEST(TransformedBounds, NoPointsGiveTheEmptyBox)
{
    Bounds empty{};
    InitializeEmpty(empty);
    EXPECT_EQ(GetTransformedPointsBBox(static_cast<const POINT*>(nullptr), 0, identity), GetEmptyRect());
    EXPECT_EQ(GetTransformedPointsBBox(static_cast<const point2d*>(nullptr), 0, identity), empty);
}

TEST(TransformedBounds, PointsAreRoundedOutwardAndNotBefore)
{
    const POINT points[2] = {{1, -1}, {3, 2}};
    const MATRIX m{1.0, 0.0, 0.25, 0.0, 1.0, 0.25};
    EXPECT_EQ(GetTransformedPointsBBox(points, 2, m), (RECT{1, 3, 4, -1}));
    // Whole images stay where they are.
    EXPECT_EQ(GetTransformedPointsBBox(points, 2, identity), (RECT{1, 2, 3, -1}));
    const POINT one{5, 6};
    EXPECT_EQ(GetTransformedPointsBBox(&one, 1, identity), (RECT{5, 6, 5, 6}));
}

TEST(TransformedBounds, NaNImagesWidenNothing)
{
    const MATRIX m = With(identity, &MATRIX::dx, nan);
    const POINT integer{1, 2};
    const point2d real{1.0, 2.0};
    EXPECT_EQ(GetTransformedPointsBBox(&integer, 1, m), (RECT{largestInt, 2, smallestInt, 2}));
    EXPECT_EQ(GetTransformedPointsBBox(&real, 1, m), (Bounds{2147483647.0, 2.0, -2147483648.0, 2.0}));
}

TEST(TransformedBounds, FarPointsShowTheSeeds)
{
    const point2d positive[2] = {{3e9, 4e9}, {5e9, 6e9}};
    EXPECT_EQ(GetTransformedPointsBBox(positive, 2, identity), (Bounds{2147483647.0, 6e9, 5e9, 2147483647.0}));
    const point2d negative[2] = {{-3e9, -4e9}, {-5e9, -6e9}};
    EXPECT_EQ(GetTransformedPointsBBox(negative, 2, identity), (Bounds{-5e9, -2147483648.0, -2147483648.0, -6e9}));
}

TEST(TransformedBounds, EncloseWhatTheyMeasure)
{
    ForEachMatrixClass(1, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        std::vector<POINT> points;
        std::vector<point2d> images;
        for (int i = 0; i < 7; ++i) {
            points.push_back(random.IntegerPoint(1000));
            images.push_back(m(ToPoint2d(points.back())));
        }
        const RECT box = GetTransformedPointsBBox(points.data(), points.size(), m);
        const Bounds exact = GetPointsBBox(images.data(), 7);
        EXPECT_EQ(box, (RECT{static_cast<int>(std::floor(exact.left)), static_cast<int>(std::ceil(exact.top)),
                             static_cast<int>(std::ceil(exact.right)), static_cast<int>(std::floor(exact.bottom))}));
    });
}

TEST(TransformedBounds, BoxOfARectIsThatOfItsRoundedCorners)
{
    ForEachMatrixClass(2, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const POINT a = random.IntegerPoint(1000);
        const RECT rect{a.x, a.y, a.x + random.Integer(0, 100), a.y - random.Integer(0, 100)};
        const Bounds exact = GetTransformedBBox(ToDouble(rect), m);
        EXPECT_EQ(GetTransformedBBox(rect, m), (RECT{RoundToInt(exact.left), RoundToInt(exact.top),
                                                     RoundToInt(exact.right), RoundToInt(exact.bottom)}));
    });
}

TEST(TransformedBounds, BoxOfTheBoxHoldsTheBox)
{
    ForEachMatrixClass(3, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const point2d a = random.Point(100.0);
        const Bounds box{a.x, a.y, a.x + random.Uniform(0.0, 50.0), a.y - random.Uniform(0.0, 50.0)};
        const Bounds back = GetUntransformedBBox(GetTransformedBBox(box, m), m);
        EXPECT_LE(back.left, box.left + 1e-10);
        EXPECT_GE(back.top, box.top - 1e-10);
        EXPECT_GE(back.right, box.right - 1e-10);
        EXPECT_LE(back.bottom, box.bottom + 1e-10);
    });
}

TEST(RemappedPoint, TakesCornersToCorners)
{
    RandomSource random(4);
    for (int i = 0; i < 2000; ++i) {
        const point2d a = random.Point(100.0);
        const point2d b = random.Point(100.0);
        const Bounds from{a.x, a.y, a.x + random.Uniform(1.0, 50.0), a.y - random.Uniform(1.0, 50.0)};
        const Bounds to{b.x, b.y, b.x + random.Uniform(-50.0, 50.0), b.y - random.Uniform(-50.0, 50.0)};
        std::array<point2d, 4> sources;
        std::array<point2d, 4> targets;
        GetRectCorners(from, sources.data());
        GetRectCorners(to, targets.data());
        for (std::size_t k = 0; k < 4; ++k)
            EXPECT_TRUE(IsNearPoint(GetRemappedPoint(sources[k], from, to), targets[k], 1e-9));
    }
}

TEST(RemappedPoint, IsTheStretchAppliedToThePoint)
{
    const Bounds from{0.0, 1.0, 2.0, 0.0};
    const Bounds to{10.0, 24.0, 14.0, 20.0};
    EXPECT_EQ(GetRemappedPoint({1.0, 0.5}, from, to), (point2d{12.0, 22.0}));
    EXPECT_EQ(GetRemappedPoint({3.0, -1.0}, from, to), (point2d{16.0, 16.0}));
    EXPECT_TRUE(std::isnan(GetRemappedPoint({1.0, 0.5}, {1.0, 1.0, 1.0, 0.0}, to).x));
}

TEST(TransformedPointsBBox, RoundsTheExtremesAsEveryPointWouldBe)
{
    RandomSource random(11);
    for (int n = 0; n < 300; ++n) {
        const MATRIX m =
            RandomMatrix(random, allMatrixClasses[static_cast<std::size_t>(n) % std::size(allMatrixClasses)]);
        std::vector<POINT> points;
        RECT expected = GetEmptyRect();
        for (int i = 0; i < 1 + n % 7; ++i) {
            points.push_back(random.IntegerPoint(n % 3 == 0 ? largestInt : 50));
            UnionPointWithRect(expected, m(ToPoint2d(points.back())));
        }
        EXPECT_EQ(GetTransformedPointsBBox(points.data(), points.size(), m), expected) << n;
    }
}

} // namespace

} // namespace ZarnMath
