#include "ZarnMath/BezierToLinesInternal.h"

#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath {

namespace {

using CubicBezier::Evaluate;
using CubicBezier::GetLooseBounds;
using CubicBezier::PowerForm;
using CubicBezier::ToPowerForm;

constexpr int smallestInt = -2147483647 - 1;
constexpr int largestInt = 2147483647;

static_assert(noexcept(CalculateNumBezierLines(RECT{}, 64)));
static_assert(noexcept(BezierToLines(std::declval<const POINT*>(), std::declval<POINT*>(), 4)));
static_assert(noexcept(AdaptiveBezierToLines(std::declval<const point2d*>(), std::declval<point2d*>(), 1.0, 64)));
static_assert(std::is_aggregate_v<FastConvert> && sizeof(FastConvert) == sizeof(POINT*));
static_assert(std::is_aggregate_v<DirectConvert> && sizeof(DirectConvert) == sizeof(point2d*));

/// The polyline of the adaptive walk; nothing else is written.
template <typename P>
std::vector<P> Flatten(const CubicOf<P>& curve, double tolerance, int maxLines)
{
    constexpr std::size_t guard = 4;
    std::vector<P> out(static_cast<std::size_t>(std::clamp(maxLines, 0, 2047)) + 1 + guard, sentinel<P>);
    const int n = AdaptiveBezierToLines(curve.data(), out.data(), tolerance, maxLines);
    for (auto i = static_cast<std::size_t>(maxLines < 1 ? 0 : n + 1); i < out.size(); ++i)
        EXPECT_TRUE(SameBits(out[i], sentinel<P>)) << i;
    out.resize(maxLines < 1 ? 0 : static_cast<std::size_t>(n) + 1);
    EXPECT_EQ(n, maxLines < 1 ? 0 : static_cast<int>(out.size()) - 1);
    return out;
}

template <typename P>
int SegmentsOf(const CubicOf<P>& curve, double tolerance, int maxLines)
{
    const auto line = Flatten(curve, tolerance, maxLines);
    return std::max(static_cast<int>(line.size()) - 1, 0);
}

struct Depths
{
    int least;
    int greatest;
    friend bool operator==(const Depths&, const Depths&) = default;
};

void PrintTo(const Depths& d, std::ostream* out)
{
    *out << d.least << " to " << d.greatest;
}

template <typename P>
Depths DepthsOf(const CubicOf<P>& curve, double tolerance, int maxLines)
{
    Depths depths{sentinel<int>, sentinel<int>};
    CalculateRecursionDepth<P>(curve.data(), tolerance, maxLines, depths.least, depths.greatest);
    return depths;
}

/// A straight curve along x, whose polygon has this length.
Cubic StraightOf(double length)
{
    return {{{0, 0}, {length * 0.25, 0}, {length * 0.5, 0}, {length, 0}}};
}

// ---- the box

struct Box
{
    int minX = sentinel<int>;
    int minY = sentinel<int>;
    int maxX = sentinel<int>;
    int maxY = sentinel<int>;
    friend bool operator==(const Box&, const Box&) = default;
};

Box LooseBoundsOf(const Cubic& curve)
{
    Box box;
    GetLooseBounds<point2d, int>(curve.data(), box.minX, box.minY, box.maxX, box.maxY);
    return box;
}

TEST(LooseBounds, RoundOutward)
{
    EXPECT_EQ(LooseBoundsOf({{{0.5, -0.5}, {29.2, 3}, {-1.1, 7.9}, {4, 4}}}), (Box{-2, -1, 30, 8}));
    EXPECT_EQ(LooseBoundsOf({{{1.5, 2.5}, {1.5, 2.5}, {1.5, 2.5}, {1.5, 2.5}}}), (Box{1, 2, 2, 3}));
    EXPECT_EQ(LooseBoundsOf({{{3, -4}, {3, -4}, {3, -4}, {3, -4}}}), (Box{3, -4, 3, -4}));
}

TEST(LooseBounds, HoldTheControlPointsAndTheCurve)
{
    RandomSource random(81);
    for (int i = 0; i < 1000; ++i) {
        const Cubic curve = random.Curve(random.AnyShape(), 1000.0);
        const Box box = LooseBoundsOf(curve);
        double minX = curve[0].x, minY = curve[0].y, maxX = curve[0].x, maxY = curve[0].y;
        for (const point2d& p : curve) {
            minX = std::min(minX, p.x);
            minY = std::min(minY, p.y);
            maxX = std::max(maxX, p.x);
            maxY = std::max(maxY, p.y);
        }
        EXPECT_EQ(box, (Box{static_cast<int>(std::floor(minX)), static_cast<int>(std::floor(minY)),
                            static_cast<int>(std::ceil(maxX)), static_cast<int>(std::ceil(maxY))}));
    }
}

TEST(LooseBounds, SaturateAndTakeNaNForZero)
{
    EXPECT_EQ(LooseBoundsOf({{{-1e300, -infinity}, {0, 0}, {0, 0}, {1e300, infinity}}}),
              (Box{smallestInt, smallestInt, largestInt, largestInt}));
    EXPECT_EQ(LooseBoundsOf({{{nan, nan}, {5, -5}, {nan, nan}, {nan, nan}}}), (Box{0, -5, 5, 0}));
}

// ---- the number of lines

constexpr std::pair<int, int> linesBySize[] = {{0, 8},    {29, 8},   {30, 16},  {159, 16},
                                               {160, 32}, {649, 32}, {650, 64}, {100000, 64}};

TEST(NumberOfLines, OfABoxGoesByItsSize)
{
    for (const auto& [size, lines] : linesBySize) {
        EXPECT_EQ(CalculateNumBezierLines(RECT{10, 7, 10 + size, 5}, 64), lines) << size;
        EXPECT_EQ(CalculateNumBezierLines(RECT{10, 7 + size, 12, 7}, 64), lines) << size;
    }
}

TEST(NumberOfLines, OfIntegerPointsGoesByTheirBox)
{
    for (const auto& [size, lines] : linesBySize) {
        const IntegerCubic wide = {{{5, 3}, {5 + size, 1}, {5, 2}, {5 + size / 2, 3}}};
        const IntegerCubic high = {{{3, 5 + size / 2}, {2, 5}, {1, 5 + size}, {3, 5}}};
        EXPECT_EQ(CalculateNumBezierLines(wide.data(), 64), lines) << size;
        EXPECT_EQ(CalculateNumBezierLines(high.data(), 64), lines) << size;
    }
}

TEST(NumberOfLines, OfPointsGoesByTheirOutwardBox)
{
    for (const auto& [size, lines] : linesBySize) {
        const double s = size;
        const Cubic exact = {{{5, 3}, {5 + s, 1}, {5, 2}, {5, 3}}};
        const Cubic high = {{{3, 5}, {2, 5}, {1, 5 + s}, {3, 5}}};
        EXPECT_EQ(CalculateNumBezierLines(exact.data(), 64), lines) << size;
        EXPECT_EQ(CalculateNumBezierLines(high.data(), 64), lines) << size;
    }
    // From 0.5 to 29.2 the box is 0 to 30; from 0 to 29 it stays 29.
    const Cubic widened = {{{0.5, 0}, {29.2, 0}, {1, 0}, {2, 0}}};
    EXPECT_EQ(CalculateNumBezierLines(widened.data(), 64), 16);
    const Cubic whole = {{{0, 0}, {29, 0}, {1, 0}, {2, 0}}};
    EXPECT_EQ(CalculateNumBezierLines(whole.data(), 64), 8);
}

TEST(NumberOfLines, CountsAnInsideOutHeightAndNoSuchWidth)
{
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, 0, 10, 650}, 64), 64);
    EXPECT_EQ(CalculateNumBezierLines(RECT{650, 5, 0, 5}, 64), 8);
    EXPECT_EQ(CalculateNumBezierLines(RECT{650, 40, 0, 5}, 64), 16);
}

TEST(NumberOfLines, Truncates)
{
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, 0, 10, 0}, 5), 0);
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, 0, 100, 0}, 7), 1);
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, 0, 200, 0}, 7), 3);
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, 0, 100, 0}, -7), -1);
}

// 2147483647 + 2147483648 wraps to -1, and 2147483648 is its own negative.
TEST(NumberOfLines, WrapsTheDifferences)
{
    EXPECT_EQ(CalculateNumBezierLines(RECT{smallestInt, 0, largestInt, 0}, 64), 8);
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, smallestInt, 0, 0}, 64), 64);
    EXPECT_EQ(CalculateNumBezierLines(RECT{0, largestInt, 0, smallestInt}, 64), 8);
    const IntegerCubic curve = {{{smallestInt, 0}, {largestInt, 0}, {0, 0}, {0, 0}}};
    EXPECT_EQ(CalculateNumBezierLines(curve.data(), 64), 8);
    const Cubic doubles = {{{-1e300, 0}, {1e300, 0}, {0, 0}, {0, 0}}};
    EXPECT_EQ(CalculateNumBezierLines(doubles.data(), 64), 8);
}

// ---- the uniform walk

const Cubic arch = {{{0, 0}, {0, 4}, {4, 4}, {4, 0}}};

TEST(BezierToLines, InFourStoresTheQuarters)
{
    Guarded<point2d, 5> out;
    BezierToLines(arch.data(), out.data(), 4);
    const point2d expected[] = {{0, 0}, {0.625, 2.25}, {2, 3}, {3.375, 2.25}, {4, 0}};
    EXPECT_TRUE(SameBits(out.data(), expected, 5));
    EXPECT_TRUE(out.IsIntact());
}

TEST(BezierToLines, InOneStoresTheEnds)
{
    Guarded<point2d, 2> out;
    BezierToLines(arch.data(), out.data(), 1);
    EXPECT_EQ(out[0], arch[0]);
    EXPECT_EQ(out[1], arch[3]);
    EXPECT_TRUE(out.IsIntact());
}

TEST(BezierToLines, InNoneStoresTheEndAlone)
{
    Guarded<point2d, 2> out;
    BezierToLines(arch.data(), out.data(), 0);
    EXPECT_EQ(out[0], arch[3]);
    EXPECT_TRUE(out.IsUntouchedFrom(1));
    Guarded<POINT, 2> integers;
    const IntegerCubic curve = {{{1, 2}, {3, 4}, {5, 6}, {7, 8}}};
    BezierToLines(curve.data(), integers.data(), 0);
    EXPECT_EQ(integers[0], (POINT{7, 8}));
    EXPECT_TRUE(integers.IsUntouchedFrom(1));
}

TEST(BezierToLines, ComputesEachPointAfresh)
{
    RandomSource random(82);
    for (int i = 0; i < 500; ++i) {
        const Cubic curve = random.Curve();
        const PowerForm f = ToPowerForm(curve.data());
        const int lines = random.Integer(1, 40);
        Guarded<point2d, 41> out;
        BezierToLines(curve.data(), out.data(), lines);
        EXPECT_TRUE(SameBits(out[0], curve[0]));
        EXPECT_TRUE(SameBits(out[lines], curve[3]));
        for (int k = 1; k < lines; ++k)
            EXPECT_TRUE(SameBits(out[k], Evaluate(f, static_cast<double>(k) / static_cast<double>(lines))));
        EXPECT_TRUE(out.IsUntouchedFrom(lines + 1));
    }
}

TEST(BezierToLines, OfIntegersRoundsWhatItStores)
{
    RandomSource random(83);
    for (int i = 0; i < 500; ++i) {
        const IntegerCubic curve = random.IntegerCurve(i % 2 == 0 ? 10 : largestInt);
        const PowerForm f = ToPowerForm(curve.data());
        const int lines = random.Integer(1, 40);
        Guarded<POINT, 41> out;
        BezierToLines(curve.data(), out.data(), lines);
        EXPECT_EQ(out[0], curve[0]);
        EXPECT_EQ(out[lines], curve[3]);
        for (int k = 1; k < lines; ++k)
            EXPECT_EQ(out[k], ToPOINT(Evaluate(f, static_cast<double>(k) / static_cast<double>(lines))));
        EXPECT_TRUE(out.IsUntouchedFrom(lines + 1));
    }
}

TEST(BezierToLines, ThroughAPolicyIsTheSame)
{
    const IntegerCubic integers = {{{0, 0}, {3, 50}, {70, 11}, {90, -7}}};
    POINT wrapped[8], direct[8];
    FastConvert rounding{wrapped};
    BezierToLines<POINT, FastConvert>(integers.data(), 7, rounding);
    BezierToLines(integers.data(), direct, 7);
    EXPECT_TRUE(SameBits(wrapped, direct, 8));
    point2d wrappedDoubles[8], directDoubles[8];
    DirectConvert storing{wrappedDoubles};
    BezierToLines<point2d, DirectConvert>(arch.data(), 7, storing);
    BezierToLines(arch.data(), directDoubles, 7);
    EXPECT_TRUE(SameBits(wrappedDoubles, directDoubles, 8));
}

// ---- the depth of the adaptive walk

// 700, 150 and 30 allowed deviations, squared. The quotient by the double next to 1 lies just below its limit.
TEST(RecursionDepth, GrowsWithTheSizeOfThePolygon)
{
    const std::pair<double, int> leastDepths[] = {{700.0, 3}, {150.0, 2}, {30.0, 1}};
    for (const auto& [length, depth] : leastDepths) {
        const Cubic curve = StraightOf(length);
        EXPECT_EQ(DepthsOf(curve, 1.0, 1024), (Depths{depth, 9})) << length;
        EXPECT_EQ(DepthsOf(curve, Above(1.0), 1024), (Depths{depth - 1, 9})) << length;
        EXPECT_EQ(DepthsOf(curve, Below(1.0), 1024), (Depths{depth, 9})) << length;
        const int whole = static_cast<int>(length);
        const IntegerCubic integers = {{{0, 5}, {0, 5}, {0, 5 + whole}, {0, 5 + whole}}};
        EXPECT_EQ(DepthsOf(integers, 1.0, 1024), (Depths{depth, 9})) << length;
        EXPECT_EQ(DepthsOf(integers, Above(1.0), 1024), (Depths{depth - 1, 9})) << length;
    }
    EXPECT_EQ(DepthsOf(StraightOf(1.0), 1.0, 1024), (Depths{0, 9}));
    EXPECT_EQ(DepthsOf(StraightOf(1e9), 1.0, 1024), (Depths{3, 9}));
}

// Back and forth along x: 10 + 10 + 10, where the box is 10 wide.
TEST(RecursionDepth, MeasuresThePolygonAndNotTheBox)
{
    const Cubic folded = {{{0, 0}, {10, 0}, {0, 0}, {10, 0}}};
    EXPECT_EQ(DepthsOf(folded, 1.0, 64).least, 1);
    const Cubic foldedUp = {{{0, 0}, {0, -10}, {0, 0}, {0, -10}}};
    EXPECT_EQ(DepthsOf(foldedUp, 1.0, 64).least, 1);
    // The longer of the axes, not the sum.
    const Cubic diagonal = {{{0, 0}, {10, 10}, {20, 20}, {29, 29}}};
    EXPECT_EQ(DepthsOf(diagonal, 1.0, 64).least, 0);
}

TEST(RecursionDepth, WrapsIntegerDifferences)
{
    // 2147483647 + 2147483648 wraps to -1, of length 1.
    const IntegerCubic curve = {{{smallestInt, 0}, {largestInt, 0}, {largestInt, 0}, {largestInt, 0}}};
    EXPECT_EQ(DepthsOf(curve, 1.0, 1024), (Depths{0, 9}));
}

TEST(RecursionDepth, GrowsWithTheBudget)
{
    const Cubic tiny = StraightOf(1.0);
    const Cubic huge = StraightOf(1000.0);
    const std::pair<int, int> greatest[] = {{1, -1},  {2, 0},    {3, 0},    {4, 1},   {7, 1},  {8, 2},
                                            {15, 2},  {16, 3},   {31, 3},   {32, 4},  {64, 5}, {127, 5},
                                            {128, 6}, {1023, 8}, {1024, 9}, {2047, 9}};
    for (const auto& [maxLines, depth] : greatest) {
        EXPECT_EQ(DepthsOf(tiny, 1.0, maxLines), (Depths{std::min(0, depth), depth})) << maxLines;
        EXPECT_EQ(DepthsOf(huge, 1.0, maxLines), (Depths{std::min(3, depth), depth})) << maxLines;
    }
    EXPECT_EQ(DepthsOf(huge, 1.0, 0), (Depths{-2, -2}));
}

TEST(RecursionDepth, WithoutToleranceHasNoFloor)
{
    EXPECT_EQ(DepthsOf(StraightOf(1e6), 0.0, 64), (Depths{0, 5}));
    EXPECT_EQ(DepthsOf(StraightOf(1e6), -0.0, 64), (Depths{0, 5}));
    EXPECT_EQ(DepthsOf(StraightOf(1e6), nan, 64), (Depths{0, 5}));
    EXPECT_EQ(DepthsOf(StraightOf(1e6), -1.0, 64), (Depths{0, 5}));
    EXPECT_EQ(DepthsOf(StraightOf(1e6), 5e-324, 64), (Depths{3, 5}));
    EXPECT_EQ(DepthsOf(StraightOf(0.0), 1.0, 64), (Depths{0, 5}));
}

// ---- the adaptive walk

TEST(AdaptiveLines, OfNoBudgetAreNone)
{
    for (const int maxLines : {0, -1, smallestInt}) {
        Guarded<point2d, 4> out;
        EXPECT_EQ(AdaptiveBezierToLines(arch.data(), out.data(), 1.0, maxLines), 0);
        EXPECT_TRUE(out.IsUntouchedFrom(0));
    }
}

TEST(AdaptiveLines, OfABudgetOfOneAreTheChord)
{
    EXPECT_EQ(Flatten(arch, 0.0, 1), (std::vector<point2d>{{0, 0}, {4, 0}}));
    const IntegerCubic closed = {{{1, 2}, {30, 4}, {5, 60}, {1, 2}}};
    EXPECT_EQ(Flatten(closed, 0.0, 1), (std::vector<POINT>{{1, 2}, {1, 2}}));
}

TEST(AdaptiveLines, OfABudgetOfTwoOrThreeAreOneLeaf)
{
    for (const int maxLines : {2, 3})
        for (const double tolerance : {0.0, 1e-9, 1e9})
            EXPECT_EQ(Flatten(arch, tolerance, maxLines), (std::vector<point2d>{{0, 0}, {2, 3}, {4, 0}}));
}

TEST(AdaptiveLines, OfALongStraightCurveReachTheLeastDepth)
{
    EXPECT_EQ(SegmentsOf(StraightOf(1000.0), 1.0, 64), 16);
    EXPECT_EQ(SegmentsOf(StraightOf(699.0), 1.0, 64), 8);
    EXPECT_EQ(SegmentsOf(StraightOf(149.0), 1.0, 64), 4);
    EXPECT_EQ(SegmentsOf(StraightOf(29.0), 1.0, 64), 2);
}

// x*x < 0 never holds.
TEST(AdaptiveLines, WithoutToleranceReachTheGreatestDepth)
{
    EXPECT_EQ(SegmentsOf(StraightOf(1000.0), 0.0, 64), 64);
    EXPECT_EQ(SegmentsOf(arch, 0.0, 63), 32);
    EXPECT_EQ(SegmentsOf(arch, nan, 64), 64);
    EXPECT_EQ(SegmentsOf(arch, -1.0, 64), 64);
}

// P(1/2) is P0, so that the first half's chord is zero and its middle is taken as it is. The second half goes on.
TEST(AdaptiveLines, StopAtAZeroChord)
{
    const Cubic curve = {{{0, 0}, {8, 0}, {0, 8}, {-24, -24}}};
    const auto line = Flatten(curve, 0.0, 16);
    ASSERT_EQ(line.size(), 11u);
    const PowerForm f = ToPowerForm(curve.data());
    EXPECT_EQ(line[1], Evaluate(f, 0.25));
    EXPECT_EQ(line[2], (point2d{0, 0}));
    EXPECT_EQ(line[3], Evaluate(f, 0.5625));
}

TEST(AdaptiveLines, OfAPointAreTwo)
{
    const Cubic point = {{{5, 7}, {5, 7}, {5, 7}, {5, 7}}};
    EXPECT_EQ(Flatten(point, 1.0, 64), (std::vector<point2d>{{5, 7}, {5, 7}, {5, 7}}));
    EXPECT_EQ(Flatten(point, 1e-300, 64), (std::vector<point2d>{{5, 7}, {5, 7}, {5, 7}}));
    const IntegerCubic integers = {{{5, 7}, {5, 7}, {5, 7}, {5, 7}}};
    EXPECT_EQ(Flatten(integers, 1.0, 64), (std::vector<POINT>{{5, 7}, {5, 7}, {5, 7}}));
    // Without tolerance only zero chords stop: all but those that end in the displaced point.
    EXPECT_EQ(SegmentsOf(point, 0.0, 64), 12);
}

// Height 3 above a chord of length 8: x*x = 24*24 = 8*8*9.
TEST(AdaptiveLines, AreFlatStrictlyWithinTheTolerance)
{
    const Cubic curve = {{{0, 0}, {2, 4}, {6, 4}, {8, 0}}};
    EXPECT_EQ(SegmentsOf(curve, 9.0, 64), 4);
    EXPECT_EQ(SegmentsOf(curve, Above(9.0), 64), 2);
}

// The middle of this S lies on its chord, which the least depth alone sees through.
TEST(AdaptiveLines, OfAnSDependOnTheLeastDepth)
{
    const auto sOf = [](double s) { return Cubic{{{0, 0}, {s, 2 * s}, {2 * s, -2 * s}, {3 * s, 0}}}; };
    EXPECT_EQ(SegmentsOf(sOf(1.0), 1.0, 64), 2);
    EXPECT_GT(SegmentsOf(sOf(10.0), 1.0, 64), 2);
}

// A closed curve of which P(7/8), P(15/16) and the end moved by exactly (-1, -1) stand in a line: at level 3 the last
// stretch is flat, and all others are far from it.
template <typename P>
void ExpectTheEndToBeDisplacedByOne(const CubicOf<P>& curve)
{
    const PowerForm f = ToPowerForm(curve.data());
    const auto isFlat = [&f](double from, double to, const point2d& end, double tolerance) {
        const vector2d chord = Evaluate(f, from) - end;
        const double x = Cross(chord, Evaluate(f, (from + to) * 0.5) - end);
        return x * x < LengthSquared(chord) * tolerance;
    };
    constexpr double tolerance = 1e-6;
    for (int i = 0; i < 7; ++i)
        ASSERT_FALSE(isFlat(i / 8.0, (i + 1) / 8.0, Evaluate(f, (i + 1) / 8.0), tolerance));
    for (const double displacement : {-2.0, -0.5, 0.0, 0.5, 1.0, 2.0})
        ASSERT_FALSE(isFlat(0.875, 1.0, {displacement, displacement}, tolerance)) << displacement;
    ASSERT_TRUE(isFlat(0.875, 1.0, {-1.0, -1.0}, tolerance));
    EXPECT_EQ(SegmentsOf(curve, tolerance, 32), 30);
}

TEST(AdaptiveLines, OfAClosedCurveDisplaceTheEndByOne)
{
    ExpectTheEndToBeDisplacedByOne<point2d>({{{0, 0}, {-8, 119}, {-8, -9}, {0, 0}}});
    ExpectTheEndToBeDisplacedByOne<POINT>({{{0, 0}, {-8, 119}, {-8, -9}, {0, 0}}});
}

TEST(AdaptiveLines, OfAnAlmostClosedCurveDisplaceNothing)
{
    // The last stretch is not flat without the displacement.
    const Cubic almost = {{{0, 0}, {-8, 119}, {-8, -9}, {0, 1e-300}}};
    EXPECT_EQ(SegmentsOf(almost, 1e-6, 32), 32);
}

TEST(AdaptiveLines, OfAClosedCurveEndExactlyWhereTheyStart)
{
    RandomSource random(84);
    for (int i = 0; i < 300; ++i) {
        Cubic curve = random.Curve(Shape::Generic, 100.0);
        curve[3] = curve[0];
        const auto line = Flatten(curve, random.Uniform(0.01, 10.0), 128);
        EXPECT_TRUE(SameBits(line.front(), curve[0]));
        EXPECT_TRUE(SameBits(line.back(), curve[0]));
        for (std::size_t k = 1; k + 1 < line.size(); ++k)
            EXPECT_NE(line[k], (curve[0] - vector2d{1.0, 1.0}));
    }
}

TEST(AdaptiveLines, NeverExceedTheDepthOfTheirStacks)
{
    for (const int maxLines : {1024, 2047, 2048, 4096, 1 << 30, largestInt}) {
        std::vector<point2d> out(2048 + 1, sentinel<point2d>);
        EXPECT_EQ(AdaptiveBezierToLines(arch.data(), out.data(), 0.0, maxLines), 1024) << maxLines;
        EXPECT_EQ(out[1024], arch[3]);
        EXPECT_TRUE(SameBits(out[1025], sentinel<point2d>));
    }
}

TEST(AdaptiveLines, OfNaNEnd)
{
    const Cubic curve = {{{nan, nan}, {1, 2}, {3, 4}, {5, 6}}};
    EXPECT_EQ(SegmentsOf(curve, 1.0, 64), 64);
    const Cubic infinite = {{{0, 0}, {infinity, 2}, {3, 4}, {5, 6}}};
    EXPECT_EQ(SegmentsOf(infinite, 1.0, 64), 64);
}

/// The walk as a recursion.
struct ReferenceWalk
{
    PowerForm f;
    double tolerance;
    Depths depths;
    std::vector<point2d> points;
    std::vector<double> parameters;

    void Process(double l, const point2d& left, double r, const point2d& right, int level)
    {
        const double mid = (l + r) * 0.5;
        const point2d m = Evaluate(f, mid);
        if (level >= depths.least && (level == depths.greatest || IsFlat(left, m, right))) {
            points.insert(points.end(), {m, right});
            parameters.insert(parameters.end(), {mid, r});
            return;
        }
        Process(l, left, mid, m, level + 1);
        Process(mid, m, r, right, level + 1);
    }

    [[nodiscard]] bool IsFlat(const point2d& left, const point2d& m, const point2d& right) const
    {
        const vector2d e = left - right;
        if (e.x == 0.0 && e.y == 0.0)
            return true;
        const double x = e.x * (m.y - right.y) - e.y * (m.x - right.x);
        return x * x < (e.x * e.x + e.y * e.y) * tolerance;
    }
};

template <typename P>
ReferenceWalk WalkByRecursion(const CubicOf<P>& curve, double tolerance, int maxLines)
{
    const point2d start = ToPoint2d(curve[0]);
    const point2d end = ToPoint2d(curve[3]);
    ReferenceWalk walk = {ToPowerForm(curve.data()), tolerance, DepthsOf(curve, tolerance, maxLines), {start}, {0.0}};
    walk.Process(0.0, start, 1.0, start == end ? end - vector2d{1.0, 1.0} : end, 0);
    walk.points.back() = end;
    return walk;
}

TEST(AdaptiveLines, AreThoseOfTheRecursionToTheBit)
{
    RandomSource random(85);
    for (int i = 0; i < 3000; ++i) {
        const double extent = random.Magnitude();
        Cubic curve = random.Curve(random.AnyShape(), extent);
        if (i % 10 == 0)
            curve[3] = curve[0];
        const double tolerance = extent * extent * std::pow(10.0, random.Uniform(-7.0, 0.0));
        const int maxLines = random.Integer(2, 300);
        const auto expected = WalkByRecursion(curve, tolerance, maxLines);
        const auto line = Flatten(curve, tolerance, maxLines);
        ASSERT_EQ(line.size(), expected.points.size());
        EXPECT_TRUE(SameBits(line.data(), expected.points.data(), static_cast<int>(line.size())));
        EXPECT_EQ(line.size() % 2, 1u);
        EXPECT_LE(line.size(), static_cast<std::size_t>(maxLines) + 1);
        EXPECT_TRUE(std::is_sorted(expected.parameters.begin(), expected.parameters.end()));
    }
}

TEST(AdaptiveLines, OfIntegersRoundOnlyWhatTheyStore)
{
    RandomSource random(86);
    bool repeatsAPoint = false;
    for (int i = 0; i < 2000; ++i) {
        IntegerCubic curve = random.IntegerCurve(i % 2 == 0 ? 6 : 2000);
        if (i % 10 == 0)
            curve[3] = curve[0];
        const double tolerance = random.Uniform(0.0, 2.0);
        const int maxLines = random.Integer(2, 200);
        const auto expected = WalkByRecursion(curve, tolerance, maxLines);
        const auto line = Flatten(curve, tolerance, maxLines);
        ASSERT_EQ(line.size(), expected.points.size());
        for (std::size_t k = 0; k < line.size(); ++k)
            EXPECT_EQ(line[k], ToPOINT(expected.points[k]));
        repeatsAPoint = repeatsAPoint || std::adjacent_find(line.begin(), line.end()) != line.end();
    }
    EXPECT_TRUE(repeatsAPoint);
}

double DistanceToSegment(const point2d& p, const point2d& a, const point2d& b)
{
    const vector2d ab = b - a;
    const double squared = LengthSquared(ab);
    const double t = squared > 0.0 ? std::clamp(Dot(p - a, ab) / squared, 0.0, 1.0) : 0.0;
    return std::sqrt(LengthSquared(p - (a + ab * t)));
}

// Without an inflection a stretch is farthest from its chord near the middle, and the chords of its halves are nearer.
TEST(AdaptiveLines, OfAnArcDeviateLessThanTheTolerance)
{
    RandomSource random(87);
    for (int i = 0; i < 300; ++i) {
        const Cubic arc = random.Curve(Shape::Arc, 1000.0);
        const PowerForm f = ToPowerForm(arc.data());
        const double deviation = random.Uniform(0.05, 20.0);
        const auto line = Flatten(arc, deviation * deviation, 1024);
        ASSERT_LT(line.size(), 513u);
        for (int k = 0; k <= 200; ++k) {
            const point2d p = Evaluate(f, k / 200.0);
            double nearest = infinity;
            for (std::size_t s = 0; s + 1 < line.size(); ++s)
                nearest = std::min(nearest, DistanceToSegment(p, line[s], line[s + 1]));
            EXPECT_LE(nearest, deviation);
        }
    }
}

TEST(AdaptiveLines, ThroughAPolicyAreTheSame)
{
    const IntegerCubic integers = {{{0, 0}, {3, 500}, {70, 110}, {90, -7}}};
    std::vector<POINT> points(65, sentinel<POINT>);
    FastConvert rounding{points.data()};
    const int n = AdaptiveBezierToLines<POINT, FastConvert>(integers.data(), 0.5, 64, rounding);
    points.resize(static_cast<std::size_t>(n) + 1);
    EXPECT_EQ(points, Flatten(integers, 0.5, 64));
    std::vector<point2d> doubles(65, sentinel<point2d>);
    DirectConvert storing{doubles.data()};
    const int m = AdaptiveBezierToLines<point2d, DirectConvert>(arch.data(), 0.001, 64, storing);
    doubles.resize(static_cast<std::size_t>(m) + 1);
    EXPECT_EQ(doubles, Flatten(arch, 0.001, 64));
}

} // namespace

} // namespace ZarnMath
