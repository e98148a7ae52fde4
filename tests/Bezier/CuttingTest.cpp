#include "ZarnMath/Bezier.h"

#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace ZarnMath::CubicBezier {

namespace {

constexpr int smallestInt = -2147483647 - 1;

static_assert(noexcept(Split(0.5, std::declval<const point2d*>(), std::declval<point2d*>(), std::declval<point2d*>())));
static_assert(noexcept(Split(std::declval<const POINT*>(), std::declval<POINT*>(), std::declval<POINT*>())));
static_assert(noexcept(LeftOf(0.5, std::declval<const POINT*>(), std::declval<POINT*>())));
static_assert(noexcept(RightOf(0.5, std::declval<const point2d*>(), std::declval<point2d*>())));
static_assert(noexcept(Subsection(0.0, 1.0, std::declval<const point2d*>(), std::declval<point2d*>())));

point2d Lerp(const point2d& p, const point2d& q, double t)
{
    return {p.x + (q.x - p.x) * t, p.y + (q.y - p.y) * t};
}

point2d Mid(const point2d& p, const point2d& q)
{
    return {(p.x + q.x) * 0.5, (p.y + q.y) * 0.5};
}

/// The seven points of a cut, from the definition.
template <typename P, typename Step>
std::array<P, 7> DeCasteljau(const P* in, Step step)
{
    const P q0 = step(in[0], in[1]);
    const P q1 = step(in[1], in[2]);
    const P q2 = step(in[2], in[3]);
    const P r0 = step(q0, q1);
    const P r1 = step(q1, q2);
    return {in[0], q0, r0, step(r0, r1), r1, q2, in[3]};
}

std::array<point2d, 7> CutAt(double t, const point2d* in)
{
    return DeCasteljau(in, [t](const point2d& p, const point2d& q) { return Lerp(p, q, t); });
}

std::array<POINT, 7> Rounded(const std::array<point2d, 7>& points)
{
    std::array<POINT, 7> rounded;
    std::transform(points.begin(), points.end(), rounded.begin(), ToPOINT);
    return rounded;
}

Cubic ToDouble(const IntegerCubic& curve)
{
    return {ToPoint2d(curve[0]), ToPoint2d(curve[1]), ToPoint2d(curve[2]), ToPoint2d(curve[3])};
}

/// The curve by the Bernstein polynomials.
point2d At(const Cubic& p, double t)
{
    const double s = 1.0 - t;
    const double w[] = {s * s * s, 3.0 * s * s * t, 3.0 * s * t * t, t * t * t};
    point2d sum = {0.0, 0.0};
    for (std::size_t i = 0; i < 4; ++i)
        sum = sum + AsVector(p[i]) * w[i];
    return sum;
}

double SizeOf(const Cubic& curve)
{
    double size = 0.0;
    for (const point2d& p : curve)
        size = std::max({size, std::fabs(p.x), std::fabs(p.y)});
    return size;
}

const Cubic arch = {{{0, 0}, {0, 4}, {4, 4}, {4, 0}}};

TEST(Split, AtAQuarterGivesTheWorkedValues)
{
    Guarded<point2d, 4> left;
    Guarded<point2d, 4> right;
    Split(0.25, arch.data(), left.data(), right.data());
    const Cubic expectedLeft = {{{0, 0}, {0, 1}, {0.25, 1.75}, {0.625, 2.25}}};
    const Cubic expectedRight = {{{0.625, 2.25}, {1.75, 3.75}, {4, 3}, {4, 0}}};
    EXPECT_TRUE(SameBits(left.data(), expectedLeft.data(), 4));
    EXPECT_TRUE(SameBits(right.data(), expectedRight.data(), 4));
    EXPECT_TRUE(left.IsIntact());
    EXPECT_TRUE(right.IsIntact());
}

TEST(Split, AtZeroLeavesAPointAndTheCurve)
{
    RandomSource random(11);
    for (int i = 0; i < 200; ++i) {
        const Cubic curve = random.Curve();
        Cubic left;
        Cubic right;
        Split(0.0, curve.data(), left.data(), right.data());
        for (const point2d& p : left)
            EXPECT_EQ(p, curve[0]);
        EXPECT_EQ(right, curve);
    }
}

// p + (q - p) need not be q: 1e-17 vanishes next to 1.
TEST(Split, AtOneKeepsTheRoundingOfTheStep)
{
    const Cubic curve = {{{1, 0}, {1e-17, 0}, {1, 0}, {1e-17, 5}}};
    Cubic left;
    Cubic right;
    Split(1.0, curve.data(), left.data(), right.data());
    EXPECT_EQ(left[0], curve[0]);
    EXPECT_EQ(left[1], (point2d{0, 0}));
    EXPECT_EQ(right[3], (point2d{1e-17, 5}));
    EXPECT_EQ(right[0], (point2d{0, 5}));
    EXPECT_EQ(left[3], right[0]);
}

TEST(Split, AtOneGivesTheCurveAndItsEndWithinRounding)
{
    RandomSource random(12);
    for (int i = 0; i < 500; ++i) {
        const Cubic curve = random.Curve();
        const double rounding = 8.0 * DBL_EPSILON * SizeOf(curve);
        Cubic left;
        Cubic right;
        Split(1.0, curve.data(), left.data(), right.data());
        for (std::size_t k = 0; k < 4; ++k) {
            EXPECT_NEAR(left[k].x, curve[k].x, rounding);
            EXPECT_NEAR(left[k].y, curve[k].y, rounding);
            EXPECT_NEAR(right[k].x, curve[3].x, rounding);
            EXPECT_NEAR(right[k].y, curve[3].y, rounding);
        }
        EXPECT_TRUE(SameBits(right[3], curve[3]));
    }
}

TEST(Split, ExtrapolatesOutsideTheUnitInterval)
{
    const Cubic line = {{{0, 0}, {1, 2}, {2, 4}, {3, 6}}};
    Cubic left;
    Cubic right;
    Split(2.0, line.data(), left.data(), right.data());
    EXPECT_EQ(left[3], (point2d{6, 12}));
    EXPECT_EQ(right[0], (point2d{6, 12}));
    Split(-1.0, line.data(), left.data(), right.data());
    EXPECT_EQ(left[3], (point2d{-3, -6}));
    EXPECT_EQ(right[3], (point2d{3, 6}));
}

/// Both forms of the cut, and nothing beyond their arrays.
template <typename P>
void ExpectPieces(double t, const std::array<P, 4>& curve, const std::array<P, 7>& expected)
{
    Guarded<P, 4> left;
    Guarded<P, 4> right;
    Guarded<P, 7> seven;
    Split(t, curve.data(), left.data(), right.data());
    Split(t, curve.data(), seven.data());
    EXPECT_TRUE(SameBits(left.data(), expected.data(), 4));
    EXPECT_TRUE(SameBits(right.data(), expected.data() + 3, 4));
    EXPECT_TRUE(SameBits(seven.data(), expected.data(), 7));
    EXPECT_TRUE(left.IsIntact() && right.IsIntact() && seven.IsIntact());
}

TEST(Split, FollowsDeCasteljauToTheBit)
{
    RandomSource random(13);
    for (int i = 0; i < 3000; ++i) {
        const Cubic curve = random.Curve();
        const double t = random.Uniform(-1.0, 2.0);
        ExpectPieces(t, curve, CutAt(t, curve.data()));
    }
}

TEST(Split, PiecesDescribeTheSameCurve)
{
    RandomSource random(14);
    for (int i = 0; i < 1000; ++i) {
        const Cubic curve = random.Curve();
        const double t = random.Uniform(0.0, 1.0);
        const double u = random.Uniform(0.0, 1.0);
        const double rounding = 32.0 * DBL_EPSILON * SizeOf(curve);
        Cubic left;
        Cubic right;
        Split(t, curve.data(), left.data(), right.data());
        const point2d onLeft = At(left, u);
        const point2d onRight = At(right, u);
        EXPECT_NEAR(onLeft.x, At(curve, t * u).x, rounding);
        EXPECT_NEAR(onLeft.y, At(curve, t * u).y, rounding);
        EXPECT_NEAR(onRight.x, At(curve, t + (1.0 - t) * u).x, rounding);
        EXPECT_NEAR(onRight.y, At(curve, t + (1.0 - t) * u).y, rounding);
    }
}

TEST(Split, OfIntegersRoundsOnceAtTheEnd)
{
    RandomSource random(15);
    for (int i = 0; i < 3000; ++i) {
        const IntegerCubic curve = random.IntegerCurve(i % 2 == 0 ? 20 : 1000000000);
        const double t = random.Uniform(0.0, 1.0);
        ExpectPieces(t, curve, Rounded(CutAt(t, ToDouble(curve).data())));
    }
}

TEST(Split, OfIntegersSaturatesBeyondThirtyTwoBits)
{
    const IntegerCubic curve = {{{0, 0}, {2147483647, smallestInt}, {2147483647, smallestInt}, {0, 0}}};
    IntegerCubic left;
    IntegerCubic right;
    Split(2.0, curve.data(), left.data(), right.data());
    EXPECT_EQ(left[1], (POINT{2147483647, smallestInt}));
    EXPECT_EQ(left[0], (POINT{0, 0}));
    EXPECT_EQ(right[3], (POINT{0, 0}));
    Split(nan, curve.data(), left.data(), right.data());
    EXPECT_EQ(left[3], (POINT{0, 0}));
}

TEST(SplitInHalf, GivesTheWorkedValues)
{
    Guarded<point2d, 4> left;
    Guarded<point2d, 4> right;
    Split(arch.data(), left.data(), right.data());
    const Cubic expectedLeft = {{{0, 0}, {0, 2}, {1, 3}, {2, 3}}};
    const Cubic expectedRight = {{{2, 3}, {3, 3}, {4, 2}, {4, 0}}};
    EXPECT_TRUE(SameBits(left.data(), expectedLeft.data(), 4));
    EXPECT_TRUE(SameBits(right.data(), expectedRight.data(), 4));
    EXPECT_TRUE(left.IsIntact() && right.IsIntact());
}

// (p + q)*0.5 is exact where p + (q - p)*0.5 loses p next to q, and overflows where the other does not.
TEST(SplitInHalf, IsNotTheCutAtOneHalf)
{
    const Cubic small = {{{1e-17, 0}, {1, 0}, {1, 0}, {1, 0}}};
    const Cubic large = {{{1.5e308, 0}, {1e308, 0}, {1e308, 0}, {1e308, 0}}};
    Cubic left;
    Cubic right;
    Split(large.data(), left.data(), right.data());
    EXPECT_EQ(left[1].x, infinity);
    Split(0.5, large.data(), left.data(), right.data());
    EXPECT_EQ(left[1].x, 1.25e308);

    RandomSource random(16);
    int differing = 0;
    for (int i = 0; i < 200; ++i) {
        const Cubic curve = random.Curve(Shape::Generic, 1.0);
        Cubic other;
        Split(curve.data(), left.data(), right.data());
        Split(0.5, curve.data(), other.data(), right.data());
        differing += left == other ? 0 : 1;
    }
    EXPECT_GT(differing, 0);
    Split(small.data(), left.data(), right.data());
    EXPECT_EQ(left[1].x, 0.5);
}

TEST(SplitInHalf, FollowsTheMidpointsToTheBit)
{
    RandomSource random(17);
    for (int i = 0; i < 2000; ++i) {
        const Cubic curve = random.Curve();
        const auto expected = DeCasteljau(curve.data(), Mid);
        Cubic left;
        Cubic right;
        Split(curve.data(), left.data(), right.data());
        EXPECT_TRUE(SameBits(left.data(), expected.data(), 4));
        EXPECT_TRUE(SameBits(right.data(), expected.data() + 3, 4));
    }
}

TEST(SplitInHalf, OfIntegersStaysInIntegers)
{
    const IntegerCubic curve = {{{1, 1}, {2, 2}, {3, 3}, {4, 4}}};
    Guarded<POINT, 4> left;
    Guarded<POINT, 4> right;
    Split(curve.data(), left.data(), right.data());
    const IntegerCubic expectedLeft = {{{1, 1}, {1, 1}, {1, 1}, {1, 1}}};
    const IntegerCubic expectedRight = {{{1, 1}, {2, 2}, {3, 3}, {4, 4}}};
    EXPECT_TRUE(SameBits(left.data(), expectedLeft.data(), 4));
    EXPECT_TRUE(SameBits(right.data(), expectedRight.data(), 4));
    EXPECT_TRUE(left.IsIntact() && right.IsIntact());
    // The cut at one half rounds 2.5 once, to 3.
    Split(0.5, curve.data(), left.data(), right.data());
    EXPECT_EQ(left[3], (POINT{3, 3}));
}

TEST(SplitInHalf, OfIntegersTruncatesTowardZero)
{
    const IntegerCubic curve = {{{-1, -1}, {-2, -2}, {-2, -2}, {-1, -1}}};
    IntegerCubic left;
    IntegerCubic right;
    Split(curve.data(), left.data(), right.data());
    EXPECT_EQ(left[1], (POINT{-1, -1}));
    EXPECT_EQ(right[1], (POINT{-1, -1}));
    EXPECT_EQ(right[2], (POINT{-1, -1}));
}

TEST(SplitInHalf, OfIntegersIsItsDefinitionInSixtyFourBits)
{
    RandomSource random(18);
    const auto middle = [](std::int32_t a, std::int32_t b) {
        return static_cast<std::int32_t>((std::int64_t{a} + std::int64_t{b}) / 2);
    };
    for (int i = 0; i < 3000; ++i) {
        const IntegerCubic curve = random.IntegerCurve(i % 2 == 0 ? 12 : 1073741823);
        const auto expected = DeCasteljau(curve.data(), [middle](const POINT& p, const POINT& q) {
            return POINT{middle(p.x, q.x), middle(p.y, q.y)};
        });
        IntegerCubic left;
        IntegerCubic right;
        Split(curve.data(), left.data(), right.data());
        EXPECT_TRUE(SameBits(left.data(), expected.data(), 4));
        EXPECT_TRUE(SameBits(right.data(), expected.data() + 3, 4));
    }
}

// 2147483647 + 1 wraps to -2147483648.
TEST(SplitInHalf, OfIntegersWrapsTheSum)
{
    const IntegerCubic curve = {{{2147483647, smallestInt}, {1, -1}, {1, -1}, {1, -1}}};
    IntegerCubic left;
    IntegerCubic right;
    Split(curve.data(), left.data(), right.data());
    EXPECT_EQ(left[1], (POINT{-1073741824, 1073741823}));
}

TEST(Halves, AreThoseOfSplitToTheBit)
{
    RandomSource random(19);
    for (int i = 0; i < 2000; ++i) {
        const Cubic curve = random.Curve();
        const IntegerCubic integers = random.IntegerCurve(1000);
        const double t = random.Uniform(-0.5, 1.5);
        Cubic left, right;
        IntegerCubic integerLeft, integerRight;
        Split(t, curve.data(), left.data(), right.data());
        Split(t, integers.data(), integerLeft.data(), integerRight.data());
        Guarded<point2d, 4> piece;
        LeftOf(t, curve.data(), piece.data());
        EXPECT_TRUE(SameBits(piece.data(), left.data(), 4));
        RightOf(t, curve.data(), piece.data());
        EXPECT_TRUE(SameBits(piece.data(), right.data(), 4));
        EXPECT_TRUE(piece.IsIntact());
        Guarded<POINT, 4> integerPiece;
        LeftOf(t, integers.data(), integerPiece.data());
        EXPECT_TRUE(SameBits(integerPiece.data(), integerLeft.data(), 4));
        RightOf(t, integers.data(), integerPiece.data());
        EXPECT_TRUE(SameBits(integerPiece.data(), integerRight.data(), 4));
        EXPECT_TRUE(integerPiece.IsIntact());
    }
}

template <typename P>
void ExpectToWorkInPlace(const CubicOf<P>& curve, double t)
{
    CubicOf<P> left, right, inPlace, rightToo;
    Split(t, curve.data(), left.data(), right.data());
    inPlace = curve;
    Split(t, inPlace.data(), inPlace.data(), rightToo.data());
    EXPECT_TRUE(SameBits(inPlace.data(), left.data(), 4));
    EXPECT_TRUE(SameBits(rightToo.data(), right.data(), 4));
    inPlace = curve;
    LeftOf(t, inPlace.data(), inPlace.data());
    EXPECT_TRUE(SameBits(inPlace.data(), left.data(), 4));
    inPlace = curve;
    RightOf(t, inPlace.data(), inPlace.data());
    EXPECT_TRUE(SameBits(inPlace.data(), right.data(), 4));
    Split(curve.data(), left.data(), right.data());
    inPlace = curve;
    Split(inPlace.data(), inPlace.data(), rightToo.data());
    EXPECT_TRUE(SameBits(inPlace.data(), left.data(), 4));
    EXPECT_TRUE(SameBits(rightToo.data(), right.data(), 4));
}

TEST(Cutting, MayStoreTheLeftPieceInTheInput)
{
    RandomSource random(20);
    for (int i = 0; i < 500; ++i) {
        const double t = random.Uniform(0.0, 1.0);
        ExpectToWorkInPlace(random.Curve(), t);
        ExpectToWorkInPlace(random.IntegerCurve(1000), t);
    }
}

TEST(Subsection, OfTheWholeIsTheLeftPieceAtOne)
{
    const Cubic curve = {{{1, 0}, {1e-17, 0}, {1, 0}, {1e-17, 5}}};
    Cubic piece;
    Cubic left;
    Subsection(0.0, 1.0, curve.data(), piece.data());
    LeftOf(1.0, curve.data(), left.data());
    EXPECT_TRUE(SameBits(piece.data(), left.data(), 4));
    EXPECT_NE(piece[1], curve[1]);
}

TEST(Subsection, CountsANegativeStartAsZeroAndThenExtrapolates)
{
    Cubic piece;
    Cubic expected;
    for (const double t0 : {0.0, -0.0, -3.0, -infinity}) {
        for (const double t1 : {0.25, 1.0, 1.5, -1.0}) {
            Subsection(t0, t1, arch.data(), piece.data());
            LeftOf(t1, arch.data(), expected.data());
            EXPECT_TRUE(SameBits(piece.data(), expected.data(), 4));
        }
    }
}

TEST(Subsection, CountsAnEndFromOneOnAsOne)
{
    Cubic piece;
    Cubic expected;
    for (const double t1 : {1.0, Above(1.0), 7.0}) {
        Subsection(0.25, t1, arch.data(), piece.data());
        RightOf(0.25, arch.data(), expected.data());
        EXPECT_TRUE(SameBits(piece.data(), expected.data(), 4));
    }
    // Cut on the left at 1 first, the end would be 0: 1 + (1e-17 - 1).
    const Cubic lossy = {{{1, 0}, {1, 0}, {1, 0}, {1e-17, 0}}};
    Subsection(0.25, 1.0, lossy.data(), piece.data());
    EXPECT_EQ(piece[3].x, 1e-17);
}

// Left at t1 first, then right at t0/t1: the other order rounds otherwise.
TEST(Subsection, CutsOnTheLeftOfItsEndFirst)
{
    RandomSource random(21);
    int differing = 0;
    for (int i = 0; i < 2000; ++i) {
        const Cubic curve = random.Curve(random.AnyShape(), 100.0);
        const double t0 = random.Uniform(0.001, 0.999);
        const double t1 = random.Uniform(0.001, 0.999);
        const auto left = CutAt(t1, curve.data());
        const auto expected = CutAt(t0 / t1, left.data());
        Guarded<point2d, 4> piece;
        Subsection(t0, t1, curve.data(), piece.data());
        EXPECT_TRUE(SameBits(piece.data(), expected.data() + 3, 4));
        EXPECT_TRUE(SameBits(piece[3], left[3]));
        EXPECT_TRUE(piece.IsIntact());

        const auto right = CutAt(t0, curve.data());
        const auto otherOrder = CutAt((t1 - t0) / (1.0 - t0), right.data() + 3);
        differing += SameBits(piece.data(), otherOrder.data(), 4) ? 0 : 1;
    }
    EXPECT_GT(differing, 1000);
}

TEST(Subsection, JustBelowOneStillCutsTwice)
{
    Cubic piece;
    Subsection(0.5, Below(1.0), arch.data(), piece.data());
    const auto left = CutAt(Below(1.0), arch.data());
    const auto expected = CutAt(0.5 / Below(1.0), left.data());
    EXPECT_TRUE(SameBits(piece.data(), expected.data() + 3, 4));
}

// 0.75/0.5 = 1.5 of the left half: the direction stays.
TEST(Subsection, WithItsEndBeforeItsStartExtrapolates)
{
    const Cubic line = {{{0, 0}, {1, 0}, {2, 0}, {3, 0}}};
    Cubic piece;
    Subsection(0.75, 0.5, line.data(), piece.data());
    EXPECT_EQ(piece[0], (point2d{2.25, 0}));
    EXPECT_EQ(piece[3], (point2d{1.5, 0}));
}

TEST(Subsection, ToZeroIsNotFiniteButForItsEnd)
{
    const Cubic curve = {{{1, 2}, {3, 5}, {6, 7}, {9, 8}}};
    Cubic piece;
    Subsection(0.5, 0.0, curve.data(), piece.data());
    for (std::size_t i = 0; i < 3; ++i) {
        EXPECT_FALSE(std::isfinite(piece[i].x)) << i;
        EXPECT_FALSE(std::isfinite(piece[i].y)) << i;
    }
    EXPECT_EQ(piece[3], (point2d{1, 2}));
}

TEST(Subsection, OfIntegersRoundsOnlyItsFourPoints)
{
    RandomSource random(22);
    for (int i = 0; i < 2000; ++i) {
        const IntegerCubic curve = random.IntegerCurve(50);
        const double t0 = random.Uniform(-0.2, 1.0);
        const double t1 = random.Uniform(0.1, 1.2);
        Cubic exact;
        Subsection(t0, t1, ToDouble(curve).data(), exact.data());
        Guarded<POINT, 4> piece;
        Subsection(t0, t1, curve.data(), piece.data());
        for (int k = 0; k < 4; ++k)
            EXPECT_EQ(piece[k], ToPOINT(exact[static_cast<std::size_t>(k)]));
        EXPECT_TRUE(piece.IsIntact());
    }
}

/// The ten points from the three pieces, in the order in which they are stored.
std::array<point2d, 10> ThreePieces(double t0, double t1, const point2d* in)
{
    std::array<point2d, 10> out;
    LeftOf(t0, in, out.data());
    Subsection(t0, t1, in, out.data() + 3);
    RightOf(t1, in, out.data() + 6);
    return out;
}

TEST(SplitInThree, SharesThePointsOfTheLaterPieces)
{
    RandomSource random(23);
    int startsDiffer = 0;
    int endsDiffer = 0;
    for (int i = 0; i < 2000; ++i) {
        const Cubic curve = random.Curve();
        const double t0 = random.Uniform(0.0, 0.5);
        const double t1 = random.Uniform(0.5, 1.0);
        const auto expected = ThreePieces(t0, t1, curve.data());
        Guarded<point2d, 10> pieces;
        Split(t0, t1, curve.data(), pieces.data());
        EXPECT_TRUE(SameBits(pieces.data(), expected.data(), 10));
        EXPECT_TRUE(pieces.IsIntact());

        Cubic left, middle;
        LeftOf(t0, curve.data(), left.data());
        Subsection(t0, t1, curve.data(), middle.data());
        startsDiffer += left[3] == pieces[3] ? 0 : 1;
        endsDiffer += middle[3] == pieces[6] ? 0 : 1;
    }
    // Element 3 is the start of the middle piece. Element 6 has the same construction in both, and the same bits.
    EXPECT_GT(startsDiffer, 0);
    EXPECT_EQ(endsDiffer, 0);
}

TEST(SplitInThree, TakesTheSpecialPathsForTheMiddleOnly)
{
    const double parameters[][2] = {{-0.5, 0.75}, {0.0, 0.5}, {0.25, 1.0}, {0.25, 1.5}, {-1.0, 2.0}};
    for (const auto& [t0, t1] : parameters) {
        const auto expected = ThreePieces(t0, t1, arch.data());
        Guarded<point2d, 10> pieces;
        Split(t0, t1, arch.data(), pieces.data());
        EXPECT_TRUE(SameBits(pieces.data(), expected.data(), 10));
    }
    // Extrapolated on the outside, clamped in the middle.
    Guarded<point2d, 10> pieces;
    Split(-1.0, 2.0, arch.data(), pieces.data());
    const auto before = CutAt(-1.0, arch.data());
    const auto after = CutAt(2.0, arch.data());
    EXPECT_TRUE(SameBits(pieces[2], before[2]));
    EXPECT_TRUE(SameBits(pieces[3], arch[0]));
    EXPECT_TRUE(SameBits(pieces[6], after[3]));
    EXPECT_TRUE(SameBits(pieces[7], after[4]));
}

TEST(SplitInThree, OfIntegersRoundsTheTenPoints)
{
    RandomSource random(24);
    for (int i = 0; i < 2000; ++i) {
        const IntegerCubic curve = random.IntegerCurve(40);
        const double t0 = random.Uniform(-0.1, 0.6);
        const double t1 = random.Uniform(0.4, 1.1);
        const auto exact = ThreePieces(t0, t1, ToDouble(curve).data());
        Guarded<POINT, 10> pieces;
        Split(t0, t1, curve.data(), pieces.data());
        for (int k = 0; k < 10; ++k)
            EXPECT_EQ(pieces[k], ToPOINT(exact[static_cast<std::size_t>(k)]));
        EXPECT_TRUE(pieces.IsIntact());
    }
}

} // namespace

} // namespace ZarnMath::CubicBezier
