#include "ZarnMath/Bounds.h"

#include "tests/Bits.h"

#include <gtest/gtest.h>

#include <cstring>
#include <random>
#include <vector>

namespace ZarnMath {
namespace {

constexpr std::int32_t smallest = -2147483647 - 1;
constexpr std::int32_t largest = 2147483647;
constexpr RECT empty{largest, smallest, smallest, largest};

std::uint64_t Bits(double value)
{
    std::uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    return bits;
}

TEST(Bounds, EmptyBoxesAreInsideOutAtTheIntegerLimits)
{
    EXPECT_EQ(GetEmptyRect(), empty);
    RECT rect{1, 2, 3, 4};
    InitializeEmpty(rect);
    EXPECT_EQ(rect, empty);
    BoundsT<double> bounds{1.0, 2.0, 3.0, 4.0};
    InitializeEmpty(bounds);
    EXPECT_EQ(Bits(bounds.left), 0x41DFFFFFFFC00000U);
    EXPECT_EQ(Bits(bounds.top), 0xC1E0000000000000U);
    EXPECT_EQ(Bits(bounds.right), 0xC1E0000000000000U);
    EXPECT_EQ(Bits(bounds.bottom), 0x41DFFFFFFFC00000U);
}

TEST(Bounds, NormalizeSwapsEachPairForItself)
{
    RECT rect{5, 1, 2, 9};
    NormalizeRect(rect);
    EXPECT_EQ(rect, (RECT{2, 9, 5, 1}));
    rect = {5, 9, 2, 1};
    NormalizeRect(rect);
    EXPECT_EQ(rect, (RECT{2, 9, 5, 1}));
    rect = {2, 1, 5, 9};
    NormalizeRect(rect);
    EXPECT_EQ(rect, (RECT{2, 9, 5, 1}));
    rect = {3, 4, 3, 4};
    NormalizeRect(rect);
    EXPECT_EQ(rect, (RECT{3, 4, 3, 4}));
}

TEST(Bounds, NormalizedEmptyRectIsTheLargest)
{
    RECT rect = GetEmptyRect();
    NormalizeRect(rect);
    EXPECT_EQ(rect, (RECT{smallest, largest, largest, smallest}));
}

TEST(Bounds, BoxOfNoPointsIsEmpty)
{
    const POINT points[1] = {{1, 2}};
    const point2d doubles[1] = {{1.0, 2.0}};
    const BoundsT<double> emptyBounds{2147483647.0, -2147483648.0, -2147483648.0, 2147483647.0};
    for (const int count : {0, -1}) {
        EXPECT_EQ(GetPointsBBox(points, count), empty);
        EXPECT_EQ(GetPointsBBox(doubles, count), emptyBounds);
        RECT out{1, 2, 3, 4};
        GetPointsBBox(points, count, out);
        EXPECT_EQ(out, empty);
    }
    EXPECT_EQ(GetPointsBBox(static_cast<const POINT*>(nullptr), 3), empty);
    EXPECT_EQ(GetPointsBBox(static_cast<const point2d*>(nullptr), 3), emptyBounds);
    RECT out{1, 2, 3, 4};
    GetPointsBBox(nullptr, 3, out);
    EXPECT_EQ(out, empty);
}

TEST(Bounds, BoxOfOnePointHasNoSize)
{
    const POINT point{7, -3};
    EXPECT_EQ(GetPointsBBox(&point, 1), (RECT{7, -3, 7, -3}));
    RECT out{};
    GetPointsBBox(&point, 1, out);
    EXPECT_EQ(out, (RECT{7, -3, 7, -3}));
    const point2d real{7.5, -3.25};
    EXPECT_EQ(GetPointsBBox(&real, 1), (BoundsT<double>{7.5, -3.25, 7.5, -3.25}));
}

TEST(Bounds, BoxOfPoints)
{
    const POINT points[4] = {{1, 1}, {-4, 3}, {2, -8}, {0, 0}};
    EXPECT_EQ(GetPointsBBox(points, 4), (RECT{-4, 3, 2, -8}));
    EXPECT_EQ(GetPointsBBox(points, 2), (RECT{-4, 3, 1, 1}));
}

TEST(Bounds, BoxOfDoublesHoldsBeyondTheIntegerLimits)
{
    const point2d points[2] = {{1e12, 1e13}, {2e12, 3e13}};
    EXPECT_EQ(GetPointsBBox(points, 2), (BoundsT<double>{1e12, 3e13, 2e12, 1e13}));
    const point2d low[2] = {{-1e12, -1e13}, {-2e12, -3e13}};
    EXPECT_EQ(GetPointsBBox(low, 2), (BoundsT<double>{-2e12, -1e13, -1e12, -3e13}));
}

TEST(Bounds, NanCountsInTheFirstPointOnly)
{
    const point2d later[3] = {{1.0, 2.0}, {nan, nan}, {3.0, nan}};
    EXPECT_EQ(GetPointsBBox(later, 3), (BoundsT<double>{1.0, 2.0, 3.0, 2.0}));
    const point2d first[2] = {{nan, 2.0}, {3.0, 4.0}};
    const BoundsT<double> box = GetPointsBBox(first, 2);
    EXPECT_TRUE(std::isnan(box.left));
    EXPECT_TRUE(std::isnan(box.right));
    EXPECT_EQ(box.top, 4.0);
    EXPECT_EQ(box.bottom, 2.0);
}

TEST(Bounds, MergingPointsNeedsNoTestForEmptiness)
{
    RECT rect = GetEmptyRect();
    UnionPointWithRect(rect, POINT{3, 4});
    EXPECT_EQ(rect, (RECT{3, 4, 3, 4}));
    UnionPointWithRect(rect, POINT{-1, 6});
    EXPECT_EQ(rect, (RECT{-1, 6, 3, 4}));
    UnionPointWithRect(rect, POINT{0, 5});
    EXPECT_EQ(rect, (RECT{-1, 6, 3, 4}));
}

TEST(Bounds, MergingAPointAtTheLimit)
{
    RECT rect = GetEmptyRect();
    UnionPointWithRect(rect, POINT{largest, 0});
    EXPECT_EQ(rect, (RECT{largest, 0, largest, 0}));
}

TEST(Bounds, MergingAFractionalPointRoundsOutward)
{
    RECT rect = GetEmptyRect();
    UnionPointWithRect(rect, point2d{1.2, -1.2});
    EXPECT_EQ(rect, (RECT{1, -1, 2, -2}));
    rect = GetEmptyRect();
    UnionPointWithRect(rect, point2d{-0.5, 0.5});
    EXPECT_EQ(rect, (RECT{-1, 1, 0, 0}));
}

TEST(Bounds, MergingAWholePointGivesNoSize)
{
    RECT rect = GetEmptyRect();
    UnionPointWithRect(rect, point2d{5.0, -6.0});
    EXPECT_EQ(rect, (RECT{5, -6, 5, -6}));
}

TEST(Bounds, MergingAFractionalPointLeavesFieldsThatHoldIt)
{
    RECT rect{1, 5, 3, 2};
    UnionPointWithRect(rect, point2d{2.5, 4.5});
    EXPECT_EQ(rect, (RECT{1, 5, 3, 2}));
    UnionPointWithRect(rect, point2d{3.5, 1.5});
    EXPECT_EQ(rect, (RECT{1, 5, 4, 1}));
}

TEST(Bounds, MergingNanSetsNothing)
{
    RECT rect{1, 5, 3, 2};
    UnionPointWithRect(rect, point2d{nan, nan});
    EXPECT_EQ(rect, (RECT{1, 5, 3, 2}));
    UnionPointWithRect(rect, point2d{nan, 9.0});
    EXPECT_EQ(rect, (RECT{1, 9, 3, 2}));
}

TEST(Bounds, MergingBeyondTheIntegersSaturates)
{
    RECT rect = GetEmptyRect();
    UnionPointWithRect(rect, point2d{1e12, -1e12});
    EXPECT_EQ(rect.right, largest);
    EXPECT_EQ(rect.bottom, smallest);
    EXPECT_EQ(rect.left, largest); // 1e12 is not below the field
    EXPECT_EQ(rect.top, smallest); // -1e12 is not above it
}

TEST(Bounds, MergingManyPoints)
{
    const POINT points[3] = {{1, 1}, {-4, 3}, {2, -8}};
    RECT rect = GetEmptyRect();
    UnionPointsWithRect(rect, points, 3);
    EXPECT_EQ(rect, (RECT{-4, 3, 2, -8}));
    for (const int count : {0, -1}) {
        RECT untouched{5, 6, 7, 8};
        UnionPointsWithRect(untouched, nullptr, count);
        EXPECT_EQ(untouched, (RECT{5, 6, 7, 8}));
    }
}

TEST(Bounds, UnionOfTwoEmptyRectsIsACopy)
{
    RECT a = GetEmptyRect();
    const RECT b{9, 1, 8, 2};
    EXPECT_FALSE(UnionRect(a, b));
    EXPECT_EQ(a, b);
}

TEST(Bounds, UnionOverwritesAFlatRectAndIgnoresOne)
{
    const RECT solid{0, 10, 10, 0};
    const RECT flat{20, 10, 20, 0};
    RECT a = solid;
    EXPECT_TRUE(UnionRect(a, flat));
    EXPECT_EQ(a, solid);
    a = flat;
    EXPECT_TRUE(UnionRect(a, solid));
    EXPECT_EQ(a, solid);
    const RECT level{0, 20, 10, 20};
    a = solid;
    EXPECT_TRUE(UnionRect(a, level));
    EXPECT_EQ(a, solid);
    a = level;
    EXPECT_FALSE(UnionRect(a, flat));
    EXPECT_EQ(a, flat);
}

TEST(Bounds, UnionOfTwoSolidRects)
{
    RECT a{0, 10, 10, 0};
    EXPECT_TRUE(UnionRect(a, {-5, 8, 4, -3}));
    EXPECT_EQ(a, (RECT{-5, 10, 10, -3}));
    EXPECT_TRUE(UnionRect(a, a));
    EXPECT_EQ(a, (RECT{-5, 10, 10, -3}));
}

TEST(Bounds, IntersectionAtAnEdgeIsFlatAndFalse)
{
    RECT a{0, 10, 10, 0};
    EXPECT_FALSE(IntersectRect(a, {10, 10, 20, 0}));
    EXPECT_EQ(a, (RECT{10, 10, 10, 0}));
    a = {0, 10, 10, 0};
    EXPECT_FALSE(IntersectRect(a, {0, 20, 10, 10}));
    EXPECT_EQ(a, (RECT{0, 10, 10, 10}));
}

TEST(Bounds, IntersectionWithAnEmptyRectChangesNothing)
{
    RECT a{0, 10, 10, 0};
    EXPECT_FALSE(IntersectRect(a, GetEmptyRect()));
    EXPECT_EQ(a, (RECT{0, 10, 10, 0}));
    a = GetEmptyRect();
    EXPECT_FALSE(IntersectRect(a, {0, 10, 10, 0}));
    EXPECT_EQ(a, empty);
}

TEST(Bounds, IntersectionAsksOnlyForTheVerticalOrderAtItsEntry)
{
    RECT a{10, 10, 0, 0}; // inside out horizontally
    EXPECT_FALSE(IntersectRect(a, {2, 8, 5, 4}));
    EXPECT_EQ(a, (RECT{10, 8, 0, 4}));
    a = {0, 5, 10, 5}; // of no height, which is still in order
    EXPECT_FALSE(IntersectRect(a, {2, 8, 5, 4}));
    EXPECT_EQ(a, (RECT{2, 5, 5, 5}));
    a = {0, 10, 10, 0};
    EXPECT_FALSE(IntersectRect(a, {2, 5, 8, 5}));
    EXPECT_EQ(a, (RECT{2, 5, 8, 5}));
}

TEST(Bounds, IntersectionOfDistantRectsIsLeftInsideOut)
{
    RECT a{0, 10, 10, 0};
    EXPECT_FALSE(IntersectRect(a, {20, 40, 30, 20}));
    EXPECT_EQ(a, (RECT{20, 10, 10, 20}));
}

TEST(Bounds, IntersectionOfOverlappingRects)
{
    RECT a{0, 10, 10, 0};
    EXPECT_TRUE(IntersectRect(a, {-5, 8, 4, -3}));
    EXPECT_EQ(a, (RECT{0, 8, 4, 0}));
    EXPECT_TRUE(IntersectRect(a, a));
    EXPECT_EQ(a, (RECT{0, 8, 4, 0}));
}

TEST(Bounds, TranslateMovesWhateverThereIs)
{
    RECT rect{0, 10, 10, 0};
    TranslateRect(rect, 3, -4);
    EXPECT_EQ(rect, (RECT{3, 6, 13, -4}));
    rect = GetEmptyRect();
    TranslateRect(rect, 1, 1);
    EXPECT_EQ(rect, (RECT{smallest, smallest + 1, smallest + 1, smallest})); // the fields wrap
}

TEST(Bounds, TranslateValidKeepsTheEmptyRect)
{
    RECT rect = GetEmptyRect();
    TranslateValidRect(rect, 1, 1);
    EXPECT_EQ(rect, empty);
    rect = {5, 5, 5, 5};
    TranslateValidRect(rect, 1, 2);
    EXPECT_EQ(rect, (RECT{6, 7, 6, 7}));
    rect = {6, 5, 5, 5};
    TranslateValidRect(rect, 1, 2);
    EXPECT_EQ(rect, (RECT{6, 5, 5, 5}));
    rect = {5, 5, 5, 6};
    TranslateValidRect(rect, 1, 2);
    EXPECT_EQ(rect, (RECT{5, 5, 5, 6}));
}

TEST(Bounds, InflateMovesTheEdgesOutward)
{
    RECT rect{0, 10, 10, 0};
    InflateRect(rect, 2, 3);
    EXPECT_EQ(rect, (RECT{-2, 13, 12, -3}));
    InflateRect(rect, -8, -9);
    EXPECT_EQ(rect, (RECT{6, 4, 4, 6}));
    rect = {smallest, largest, largest, smallest};
    InflateRect(rect, 1, 1);
    EXPECT_EQ(rect, (RECT{largest, smallest, smallest, largest}));
}

TEST(Bounds, CornersRunClockwiseFromTheLeftTop)
{
    const POINT sentinel{77, -77};
    POINT corners[6] = {sentinel, sentinel, sentinel, sentinel, sentinel, sentinel};
    GetRectCorners(RECT{1, 4, 3, 2}, corners + 1);
    const POINT expected[6] = {sentinel, {1, 4}, {3, 4}, {3, 2}, {1, 2}, sentinel};
    for (int i = 0; i < 6; ++i)
        EXPECT_EQ(corners[i], expected[i]) << i;
    point2d doubles[5] = {{}, {}, {}, {}, {77.0, -77.0}};
    GetRectCorners(BoundsT<double>{1.5, 4.5, 3.5, 2.5}, doubles);
    EXPECT_EQ(doubles[0], (point2d{1.5, 4.5}));
    EXPECT_EQ(doubles[1], (point2d{3.5, 4.5}));
    EXPECT_EQ(doubles[2], (point2d{3.5, 2.5}));
    EXPECT_EQ(doubles[3], (point2d{1.5, 2.5}));
    EXPECT_EQ(doubles[4], (point2d{77.0, -77.0}));
}

TEST(Bounds, CenterTruncatesTowardZero)
{
    EXPECT_EQ(GetRectCenter({-3, 0, 0, -3}), (POINT{-1, -1}));
    EXPECT_EQ(GetRectCenter({0, 3, 3, 0}), (POINT{1, 1}));
    EXPECT_EQ(GetRectCenter({largest, 10, largest, 4}), (POINT{-1, 7})); // the sum wraps to -2
}

TEST(Bounds, AreaIsPositive)
{
    EXPECT_EQ(GetRectArea({0, 10, 20, 0}), 200.0);
    EXPECT_EQ(GetRectArea({20, 10, 0, 0}), 200.0);
    EXPECT_EQ(GetRectArea({20, 0, 0, 10}), 200.0);
    EXPECT_EQ(GetRectArea({5, 10, 5, 0}), 0.0);
    EXPECT_EQ(GetRectArea({0, 2000000000, 2000000000, 0}), 4e18); // the product is taken in double
    EXPECT_EQ(GetRectArea({smallest, 1, largest, 0}), 1.0);       // the width wraps to -1
}

TEST(Bounds, EdgesBelongToTheRect)
{
    const RECT rect{0, 10, 20, 5};
    for (const POINT p : {POINT{0, 7}, {20, 7}, {10, 5}, {10, 10}, {0, 5}, {20, 10}}) {
        EXPECT_TRUE(IsPointInRect(p, rect));
        EXPECT_TRUE(IsPointInRect(ToPoint2d(p), rect));
    }
    for (const POINT p : {POINT{-1, 7}, {21, 7}, {10, 4}, {10, 11}})
        EXPECT_FALSE(IsPointInRect(p, rect));
    EXPECT_FALSE(IsPointInRect(point2d{std::nextafter(20.0, 21.0), 7.0}, rect));
    EXPECT_FALSE(IsPointInRect(point2d{10.0, std::nextafter(5.0, 0.0)}, rect));
}

TEST(Bounds, NothingLiesInTheEmptyRect)
{
    for (const POINT p : {POINT{0, 0}, {largest, smallest}, {smallest, largest}, {largest, largest}})
        EXPECT_FALSE(IsPointInRect(p, GetEmptyRect()));
    EXPECT_FALSE(IsPointInRect(point2d{0.0, 0.0}, GetEmptyRect()));
}

TEST(Bounds, TopAndBottomMayChangePlacesButNotLeftAndRight)
{
    EXPECT_TRUE(IsPointInRect(POINT{5, 5}, {0, 0, 10, 10}));
    EXPECT_FALSE(IsPointInRect(POINT{5, 5}, {10, 10, 0, 0}));
    EXPECT_TRUE(IsPointInRect(point2d{5.0, 5.0}, {0, 0, 10, 10}));
    EXPECT_FALSE(IsPointInRect(point2d{5.0, 5.0}, {10, 10, 0, 0}));
    EXPECT_TRUE(IsPointInRect(POINT{5, 0}, {0, 0, 10, 10}));
    EXPECT_TRUE(IsPointInRect(POINT{5, 10}, {0, 0, 10, 10}));
    EXPECT_FALSE(IsPointInRect(POINT{5, 11}, {0, 0, 10, 10}));
}

TEST(Bounds, NanLiesNowhere)
{
    const RECT rect{0, 10, 10, 0};
    EXPECT_FALSE(IsPointInRect(point2d{nan, 5.0}, rect));
    EXPECT_FALSE(IsPointInRect(point2d{5.0, nan}, rect));
}

TEST(Bounds, AnyPointInRect)
{
    const RECT rect{0, 10, 10, 0};
    const POINT points[3] = {{-1, 0}, {11, 0}, {10, 10}};
    EXPECT_TRUE(IsAnyPointInRect(points, 3, rect));
    EXPECT_FALSE(IsAnyPointInRect(points, 2, rect));
    EXPECT_FALSE(IsAnyPointInRect(points + 2, 0, rect));
    EXPECT_FALSE(IsAnyPointInRect(nullptr, 0, rect));
    EXPECT_TRUE(IsAnyPointInRect(points, 3, {5, 0, 12, 2}));
}

TEST(Bounds, RectAboutAPoint)
{
    EXPECT_EQ(GetPointRect({3, 4}, 2), (RECT{1, 6, 5, 2}));
    EXPECT_EQ(GetPointRect({3, 4}, -2), (RECT{5, 2, 1, 6}));
    EXPECT_EQ(GetPointRect({3, 4}, 2, 7), (RECT{1, 11, 5, -3}));
    EXPECT_EQ(GetPointRect({largest, smallest}, 1), (RECT{largest - 1, smallest + 1, smallest, largest}));
}

TEST(Bounds, UnitSquare)
{
    EXPECT_EQ(IdentityBounds(), (BoundsT<double>{0.0, 1.0, 1.0, 0.0}));
    EXPECT_EQ(&IdentityBounds(), &IdentityBounds());
}

std::vector<POINT> RandomPoints(std::mt19937& engine, int count, int range)
{
    std::vector<POINT> points;
    for (int i = 0; i < count; ++i) {
        const auto draw = [&] {
            return static_cast<std::int32_t>(engine() % static_cast<unsigned>(2 * range + 1)) - range;
        };
        const std::int32_t x = draw();
        points.push_back({x, draw()});
    }
    return points;
}

TEST(BoundsProperties, BoxHoldsEveryPointAndTouchesOneOnEachSide)
{
    std::mt19937 engine(1);
    for (int n = 0; n < 2000; ++n) {
        const int count = 1 + n % 9;
        const std::vector<POINT> points = RandomPoints(engine, count, 1 + n % 50);
        const RECT box = GetPointsBBox(points.data(), count);
        bool touches[4]{};
        for (const POINT& p : points) {
            EXPECT_TRUE(IsPointInRect(p, box));
            touches[0] |= p.x == box.left;
            touches[1] |= p.y == box.top;
            touches[2] |= p.x == box.right;
            touches[3] |= p.y == box.bottom;
        }
        EXPECT_TRUE(touches[0] && touches[1] && touches[2] && touches[3]);
        RECT merged = GetEmptyRect();
        UnionPointsWithRect(merged, points.data(), count);
        EXPECT_EQ(merged, box);
    }
}

/// The box of points whose extremes stand at one index, by merging one point after the other.
RECT MergedOneByOne(const RECT& start, const std::vector<POINT>& points)
{
    RECT rect = start;
    for (const POINT& p : points)
        UnionPointWithRect(rect, p);
    return rect;
}

TEST(BoundsProperties, ManyPointsAreMergedAsOneByOneWhereverTheExtremesStand)
{
    std::mt19937 engine(2);
    for (int count = 0; count <= 40; ++count) {
        for (int at = 0; at < count; ++at) {
            std::vector<POINT> points = RandomPoints(engine, count, 1000);
            points[static_cast<std::size_t>(at)] = at % 2 == 0 ? POINT{largest, smallest} : POINT{smallest, largest};
            for (const RECT& start : {empty, RECT{-10, 2000, 3000, -20}}) {
                RECT rect = start;
                UnionPointsWithRect(rect, points.data(), count);
                ASSERT_EQ(rect, MergedOneByOne(start, points)) << count << " points, the extreme at " << at;
            }
            ASSERT_EQ(GetPointsBBox(points.data(), count), MergedOneByOne(empty, points));
        }
    }
}

TEST(BoundsProperties, OfTwoZerosTheFirstStays)
{
    const point2d zeros[] = {{-0.0, 0.0}, {0.0, -0.0}, {nan, nan}, {-0.0, 0.0}};
    for (int first = 0; first < 2; ++first) {
        const BoundsT<double> box = GetPointsBBox(zeros + first, 4 - first);
        for (const double x : {box.left, box.right})
            EXPECT_EQ(Bits(x), Bits(zeros[first].x));
        for (const double y : {box.top, box.bottom})
            EXPECT_EQ(Bits(y), Bits(zeros[first].y));
    }
}

TEST(BoundsProperties, UnionAndIntersectionAgreeWithMembership)
{
    std::mt19937 engine(2);
    int overlapping = 0;
    for (int n = 0; n < 2000; ++n) {
        const std::vector<POINT> corners = RandomPoints(engine, 4, 12);
        const RECT a = GetPointsBBox(corners.data(), 2);
        const RECT b = GetPointsBBox(corners.data() + 2, 2);
        RECT common = a;
        const bool overlap = IntersectRect(common, b);
        overlapping += overlap ? 1 : 0;
        RECT both = a;
        const bool solid = UnionRect(both, b);
        for (const POINT& p : RandomPoints(engine, 20, 13)) {
            const bool inBoth = IsPointInRect(p, a) && IsPointInRect(p, b);
            if (overlap) {
                EXPECT_EQ(IsPointInRect(p, common), inBoth);
            }
            if (solid && a.left < a.right && a.bottom < a.top && IsPointInRect(p, a)) {
                EXPECT_TRUE(IsPointInRect(p, both));
            }
        }
    }
    EXPECT_GT(overlapping, 500);
    EXPECT_LT(overlapping, 1900);
}

TEST(BoundsProperties, MovingAndGrowingCanBeUndone)
{
    std::mt19937 engine(3);
    for (int n = 0; n < 2000; ++n) {
        const auto draw = [&] { return static_cast<std::int32_t>(engine()); };
        const std::int32_t left = draw();
        const std::int32_t top = draw();
        const std::int32_t right = draw();
        const RECT rect{left, top, right, draw()};
        const std::int32_t dx = draw() / 2;
        const std::int32_t dy = draw() / 2;
        RECT moved = rect;
        TranslateRect(moved, dx, dy);
        TranslateRect(moved, -dx, -dy);
        EXPECT_EQ(moved, rect);
        InflateRect(moved, dx, dy);
        InflateRect(moved, -dx, -dy);
        EXPECT_EQ(moved, rect);
    }
}

} // namespace
} // namespace ZarnMath
