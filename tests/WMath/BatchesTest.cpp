// Point arrays against one point at a time: the same bits at every count, at every alignment, and with whatever stands
// in the array.
#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMath/Batches.h"

#include <functional>
#include <new>
#include <vector>

namespace ZarnMath {

namespace {

constexpr std::int32_t smallestInt = -2147483647 - 1;
constexpr std::int32_t largestInt = 2147483647;
constexpr int mostPoints = 33;

static_assert(noexcept(identity.TransformPoints(std::declval<POINT*>(), 0)));
static_assert(noexcept(TranslatePoints(std::declval<point2d*>(), 0, point2d{})));

template <typename P>
using Batch = std::function<void(P*, unsigned long)>;
template <typename P>
using Step = std::function<P(const P&)>;

/// A run of points at any address that their type allows, with guards before and behind.
template <typename P>
class PlacedPoints
{
public:
    PlacedPoints(const std::vector<P>& points, std::size_t shift) : count(points.size())
    {
        first = reinterpret_cast<P*>(storage + shift * alignof(P));
        for (std::size_t i = 0; i < count + 2 * guards; ++i)
            new (first + i) P(i < guards || i >= guards + count ? guard : points[i - guards]);
    }

    P* data()
    {
        return first + guards;
    }

    [[nodiscard]] testing::AssertionResult Holds(const std::vector<P>& expected) const
    {
        for (std::size_t i = 0; i < count + 2 * guards; ++i) {
            const bool isGuard = i < guards || i >= guards + count;
            const P& wanted = isGuard ? guard : expected[i - guards];
            if (!HasSameBits(first[i], wanted))
                return SameBits(first[i], wanted) << (isGuard ? " (a guard)" : "") << " at " << i;
        }
        return testing::AssertionSuccess();
    }

private:
    static constexpr std::size_t guards = 2;
    static constexpr P guard{77, -78};
    std::size_t count;
    P* first;
    alignas(64) std::byte storage[(mostPoints + 2 * guards) * sizeof(P) + 64];
};

/// At every count from 0 to 33 and every alignment.
template <typename P>
void ExpectOneByOne(const std::vector<P>& points, const Batch<P>& batch, const Step<P>& step)
{
    ASSERT_GE(points.size(), std::size_t{mostPoints});
    for (std::size_t count = 0; count <= mostPoints; ++count) {
        const std::vector<P> input(points.begin(), points.begin() + static_cast<std::ptrdiff_t>(count));
        std::vector<P> expected;
        for (const P& p : input)
            expected.push_back(step(p));
        for (std::size_t shift = 0; shift < 64 / alignof(P); ++shift) {
            PlacedPoints<P> placed(input, shift);
            batch(placed.data(), count);
            ASSERT_TRUE(placed.Holds(expected)) << count << " points, shifted by " << shift;
        }
    }
}

std::vector<POINT> IntegerPoints(RandomSource& random)
{
    std::vector<POINT> points = {{0, 0}, {smallestInt, largestInt}, {largestInt, smallestInt}, {1, -1}};
    while (points.size() < mostPoints)
        points.push_back(random.IntegerPoint(random.Integer(0, 1) == 0 ? 100 : largestInt));
    return points;
}

std::vector<point2d> RealPoints(RandomSource& random)
{
    std::vector<point2d> points = {{0.0, -0.0}, {nan, 1.0}, {1.0, nan}, {infinity, -infinity}, {1e300, 1e-300}};
    while (points.size() < mostPoints)
        points.push_back(random.Point(random.Magnitude()));
    return points;
}

/// Ordinary ones, and those that leave the range of the integers or have no number in them.
std::vector<MATRIX> TrickyMatrices(RandomSource& random)
{
    std::vector<MATRIX> matrices = {identity,
                                    zeroMatrix,
                                    {1.0, 0.0, 0.5, 0.0, 1.0, -0.5},
                                    {0.5, 0.0, 0.0, 0.0, -0.5, -0.0},
                                    {0.25, 0.25, 0.0, -0.25, 0.25, 0.0},
                                    {1e6, 0.0, 0.0, 0.0, -1e6, 0.0},
                                    {1e300, -1e300, 0.0, 1e300, 1e300, 0.0},
                                    {nan, 0.0, 0.0, 0.0, 1.0, 0.0},
                                    {1.0, 0.0, infinity, 0.0, 1.0, -infinity}};
    for (const MatrixClass kind : allMatrixClasses)
        matrices.push_back(RandomMatrix(random, kind));
    return matrices;
}

POINT RoundedImage(const MATRIX& m, const POINT& p)
{
    const double x = p.x;
    const double y = p.y;
    return {RoundToInt(m.dx + (m.m11 * x + m.m12 * y)), RoundToInt(m.dy + (m.m21 * x + m.m22 * y))};
}

std::int32_t Clamp(std::int32_t v)
{
    const std::int32_t low = v > 536870911 ? 536870911 : v;
    return low < -536870912 ? -536870912 : low;
}

TEST(Batches, TransformIntegerPointsOneByOne)
{
    RandomSource random(1);
    for (const MATRIX& m : TrickyMatrices(random)) {
        const std::vector<POINT> points = IntegerPoints(random);
        const Step<POINT> step = [&](const POINT& p) { return RoundedImage(m, p); };
        ExpectOneByOne<POINT>(
            points, [&](POINT* p, unsigned long n) { m.TransformPoints(p, n); }, step);
        ExpectOneByOne<POINT>(
            points, [&](POINT* p, unsigned long n) { UTLTransformPoint(p, &m, static_cast<std::int64_t>(n)); }, step);
    }
}

TEST(Batches, TransformWithRangeCheckOneByOne)
{
    RandomSource random(2);
    for (const MATRIX& m : TrickyMatrices(random))
        ExpectOneByOne<POINT>(
            IntegerPoints(random), [&](POINT* p, unsigned long n) { m.TransformPointsWithRangeCheck(p, n); },
            [&](const POINT& p) {
                const POINT image = RoundedImage(m, p);
                return POINT{Clamp(image.x), Clamp(image.y)};
            });
}

TEST(Batches, TransformRealPointsOneByOne)
{
    RandomSource random(3);
    for (const MATRIX& m : TrickyMatrices(random))
        ExpectOneByOne<point2d>(
            RealPoints(random), [&](point2d* p, unsigned long n) { m.TransformPoints(p, n); },
            [&](const point2d& p) {
                return point2d{m.dx + (m.m11 * p.x + m.m12 * p.y), m.dy + (m.m21 * p.x + m.m22 * p.y)};
            });
}

TEST(Batches, RotateOneByOne)
{
    RandomSource random(4);
    for (int i = 0; i < 20; ++i) {
        const double r = random.Uniform(-7.0, 7.0);
        const point2d centre = random.Point(i < 10 ? 100.0 : 1e12);
        const double s = std::sin(r);
        const double c = std::cos(r);
        const double ox = centre.x + (s * centre.y - c * centre.x);
        const double oy = centre.y + (c * (-centre.y) - s * centre.x);
        ExpectOneByOne<POINT>(
            IntegerPoints(random), [&](POINT* p, unsigned long n) { Radians::RotatePoints(p, n, r, centre); },
            [&](const POINT& p) {
                return POINT{RoundToInt(ox + (c * p.x - s * p.y)), RoundToInt(oy + (s * p.x + c * p.y))};
            });
    }
}

TEST(Batches, TranslateOneByOne)
{
    RandomSource random(5);
    for (const point2d& offset : {point2d{0.1, -3.0}, {infinity, nan}, {-0.0, 0.0}})
        ExpectOneByOne<point2d>(
            RealPoints(random), [&](point2d* p, unsigned long n) { TranslatePoints(p, n, offset); },
            [&](const point2d& p) {
                return point2d{offset.x + p.x, offset.y + p.y};
            });
    for (const POINT& offset : {POINT{3, -4}, {largestInt, smallestInt}})
        ExpectOneByOne<POINT>(
            IntegerPoints(random), [&](POINT* p, unsigned long n) { TranslatePoints(p, n, offset); },
            [&](const POINT& p) {
                const auto wrap = [](std::int64_t v) { return static_cast<std::int32_t>(v); };
                return POINT{wrap(std::int64_t{offset.x} + p.x), wrap(std::int64_t{offset.y} + p.y)};
            });
}

/// The loop itself, on the registers that every processor has: what the library runs where there are no wider ones.
TEST(Batches, NarrowRegistersGiveTheSameBits)
{
    RandomSource random(6);
    for (const MATRIX& m : TrickyMatrices(random)) {
        ExpectOneByOne<point2d>(
            RealPoints(random),
            [&](point2d* p, unsigned long n) {
                ForEachPointApart(p, n, m, [](const point2d& q, const MATRIX& fixed) { return Image(fixed, q); });
            },
            [&](point2d p) {
                m.TransformPoints(&p, 1);
                return p;
            });
    }
}

TEST(Batches, NoPointsAtAll)
{
    identity.TransformPoints(static_cast<POINT*>(nullptr), 0);
    identity.TransformPoints(static_cast<point2d*>(nullptr), 0);
    identity.TransformPointsWithRangeCheck(nullptr, 0);
    Radians::RotatePoints(nullptr, 0, 1.0, {0.0, 0.0});
    Degrees::RotatePoints(nullptr, 0, 1.0, {0.0, 0.0});
    TranslatePoints(static_cast<POINT*>(nullptr), 0, POINT{1, 1});
    TranslatePoints(static_cast<point2d*>(nullptr), 0, point2d{1.0, 1.0});
}

TEST(Batches, IdentityLeavesIntegersExactly)
{
    RandomSource random(6);
    const std::vector<POINT> points = IntegerPoints(random);
    std::vector<POINT> transformed = points;
    identity.TransformPoints(transformed.data(), transformed.size());
    EXPECT_EQ(transformed, points);
}

TEST(Batches, BeyondTheIntegersSaturates)
{
    const MATRIX m{1.0, 0.0, 1e12, 0.0, 1.0, -1e12};
    POINT p{5, 5};
    m.TransformPoints(&p, 1);
    EXPECT_EQ(p, (POINT{largestInt, smallestInt}));
    p = {5, 5};
    With(identity, &MATRIX::dx, nan).TransformPoints(&p, 1);
    EXPECT_EQ(p, (POINT{0, 5}));
}

POINT RangeChecked(const MATRIX& m, POINT p)
{
    m.TransformPointsWithRangeCheck(&p, 1);
    return p;
}

TEST(RangeCheck, ClampsToAQuarterOfTheRange)
{
    const MATRIX thousand{1000.0, 0.0, 0.0, 0.0, 1000.0, 0.0};
    EXPECT_EQ(RangeChecked(thousand, {1000000, -1000000}), (POINT{536870911, -536870912}));
    EXPECT_EQ(536870911, 0x1FFFFFFF);
    EXPECT_EQ(-536870912, -0x20000000);
}

TEST(RangeCheck, AtTheLimits)
{
    EXPECT_EQ(RangeChecked(identity, {536870911, -536870912}), (POINT{536870911, -536870912}));
    EXPECT_EQ(RangeChecked(identity, {536870912, -536870913}), (POINT{536870911, -536870912}));
    EXPECT_EQ(RangeChecked(identity, {536870910, -536870911}), (POINT{536870910, -536870911}));
    EXPECT_EQ(RangeChecked(identity, {largestInt, smallestInt}), (POINT{536870911, -536870912}));
}

TEST(RangeCheck, RoundsBeforeItClamps)
{
    for (const double fraction : {0.25, 0.5, 0.75}) {
        const MATRIX m{1.0, 0.0, fraction, 0.0, 1.0, -fraction};
        EXPECT_EQ(RangeChecked(m, {536870911, -536870912}), (POINT{536870911, -536870912}));
        const int up = fraction < 0.5 ? 0 : 1;
        EXPECT_EQ(RangeChecked(m, {536870910, -536870911}), (POINT{536870910 + up, -536870911 - up}));
    }
}

TEST(RangeCheck, ClampsWhatNoIntegerHolds)
{
    EXPECT_EQ(RangeChecked({1e300, 0.0, 0.0, 0.0, 1e300, 0.0}, {1, -1}), (POINT{536870911, -536870912}));
    EXPECT_EQ(RangeChecked({1.0, 0.0, infinity, 0.0, 1.0, -infinity}, {1, -1}), (POINT{536870911, -536870912}));
    EXPECT_EQ(RangeChecked({nan, 0.0, 0.0, 0.0, 1.0, 0.0}, {1, -1}), (POINT{0, -1}));
}

/// Far enough away that the least turn about it moves every point out of range.
constexpr point2d farCentre{1e300, 1e300};

TEST(RotatePoints, LeavesTheArrayForTheLeastAngles)
{
    for (const double angle : {0.0, -0.0, 1e-16, -1e-16, DBL_EPSILON, -DBL_EPSILON}) {
        POINT p{2, -3};
        Radians::RotatePoints(&p, 1, angle, farCentre);
        EXPECT_EQ(p, (POINT{2, -3})) << angle;
    }
    for (const double angle : {Above(DBL_EPSILON), -Above(DBL_EPSILON)}) {
        POINT p{2, -3};
        Radians::RotatePoints(&p, 1, angle, farCentre);
        EXPECT_NE(p, (POINT{2, -3})) << angle;
    }
}

TEST(RotatePoints, ComparesDegreesAfterTheyAreRadians)
{
    for (const double angle : {1e-15, -1e-15, 1.2e-14}) { // 1.2e-14 degrees are 2.1e-16 radians
        POINT p{2, -3};
        Degrees::RotatePoints(&p, 1, angle, farCentre);
        EXPECT_EQ(p, (POINT{2, -3})) << angle;
    }
    POINT p{2, -3};
    Degrees::RotatePoints(&p, 1, 1.3e-14, farCentre);
    EXPECT_NE(p, (POINT{2, -3}));
}

TEST(RotatePoints, TakesTheCountAsSigned)
{
    POINT p{2, -3};
    Radians::RotatePoints(&p, ~0UL, 1.0, {0.0, 0.0});
    Radians::RotatePoints(&p, (~0UL >> 1) + 1, 1.0, {0.0, 0.0});
    EXPECT_EQ(p, (POINT{2, -3}));
}

TEST(RotatePoints, QuarterTurn)
{
    POINT p{10, 0};
    Radians::RotatePoints(&p, 1, halfPi, {0.0, 0.0});
    EXPECT_EQ(p, (POINT{0, 10}));
    Degrees::RotatePoints(&p, 1, 90.0, {0.0, 0.0});
    EXPECT_EQ(p, (POINT{-10, 0}));
    Degrees::RotatePoints(&p, 1, -90.0, {-10.0, 10.0});
    EXPECT_EQ(p, (POINT{-20, 10}));
}

TEST(RotatePoints, NaNAngleGivesZeros)
{
    POINT p{10, 7};
    Radians::RotatePoints(&p, 1, nan, {0.0, 0.0});
    EXPECT_EQ(p, (POINT{0, 0}));
}

TEST(RotatePoints, HoistsTheCentreUnlikeRotatePoint)
{
    // The hoisted offsets are rounded at the size of the centre, the differences are not.
    RandomSource random(7);
    int differing = 0;
    for (int i = 0; i < 1000; ++i) {
        const point2d centre = random.Point(1e15);
        const double angle = random.Uniform(1e-8, 1e-7);
        const POINT p = random.IntegerPoint(1000);
        POINT rotated = p;
        Radians::RotatePoints(&rotated, 1, angle, centre);
        differing += rotated == ToPOINT(Radians::RotatePoint(ToPoint2d(p), angle, centre)) ? 0 : 1;
    }
    EXPECT_GT(differing, 0);
}

TEST(RotatePoints, DegreesAreRadiansByTheExactConstant)
{
    RandomSource random(8);
    for (int i = 0; i < 200; ++i) {
        const double degrees = random.Uniform(-400.0, 400.0);
        std::vector<POINT> a = IntegerPoints(random);
        std::vector<POINT> b = a;
        Degrees::RotatePoints(a.data(), a.size(), degrees, {1.5, 2.5});
        Radians::RotatePoints(b.data(), b.size(), degrees * 0.017453292519943295, {1.5, 2.5});
        EXPECT_EQ(a, b);
    }
}

TEST(TranslatePoints, WrapsIntegers)
{
    POINT p{largestInt, smallestInt};
    TranslatePoints(&p, 1, POINT{1, -1});
    EXPECT_EQ(p, (POINT{smallestInt, largestInt}));
}

/// An offset inside the array is doubled when its turn comes, and counts doubled from there on.
template <typename P>
void ExpectOffsetReadAnew(const std::vector<P>& points)
{
    for (std::size_t at = 0; at < points.size(); ++at) {
        std::vector<P> expected = points;
        for (P& p : expected) {
            const P offset = expected[at];
            p = {offset.x + p.x, offset.y + p.y};
        }
        std::vector<P> translated = points;
        TranslatePoints(translated.data(), translated.size(), translated[at]);
        EXPECT_TRUE(SameBits(translated.data(), expected.data(), static_cast<int>(expected.size()))) << at;
    }
}

TEST(TranslatePoints, OffsetInsideTheArrayIsReadAnew)
{
    std::vector<POINT> integers;
    std::vector<point2d> reals;
    for (int i = 0; i < 9; ++i) {
        integers.push_back({i + 1, 10 * i - 3});
        reals.push_back({i + 0.5, 10.0 * i - 3.25});
    }
    ExpectOffsetReadAnew(integers);
    ExpectOffsetReadAnew(reals);
}

TEST(TranslatePoints, OffsetNextToTheArrayIsNotPartOfIt)
{
    std::vector<point2d> points = {{1.0, 2.0}, {3.0, 4.0}, {5.0, 6.0}, {7.0, 8.0}};
    TranslatePoints(points.data() + 1, 2, points[0]);
    EXPECT_EQ(points, (std::vector<point2d>{{1.0, 2.0}, {4.0, 6.0}, {6.0, 8.0}, {7.0, 8.0}}));
    TranslatePoints(points.data() + 1, 2, points[3]);
    EXPECT_EQ(points, (std::vector<point2d>{{1.0, 2.0}, {11.0, 14.0}, {13.0, 16.0}, {7.0, 8.0}}));
}

TEST(Batches, MatrixInsideTheArrayIsReadAnew)
{
    // A matrix that lies over points 1 to 3: it changes when their turn comes.
    constexpr std::size_t count = 6;
    const MATRIX m{2.0, 1.0, 3.0, -1.0, 0.5, 4.0};
    alignas(MATRIX) std::byte storage[count * sizeof(point2d)];
    std::byte expected[sizeof storage];
    for (std::size_t i = 0; i < count; ++i)
        new (storage + i * sizeof(point2d)) point2d{static_cast<double>(i) + 1.0, 2.0 * static_cast<double>(i)};
    auto* inside = new (storage + sizeof(point2d)) MATRIX(m);
    std::memcpy(expected, storage, sizeof storage);
    for (std::size_t i = 0; i < count; ++i) {
        MATRIX now;
        point2d p;
        std::memcpy(&now, expected + sizeof(point2d), sizeof now);
        std::memcpy(&p, expected + i * sizeof p, sizeof p);
        p = now(p);
        std::memcpy(expected + i * sizeof p, &p, sizeof p);
    }
    inside->TransformPoints(reinterpret_cast<point2d*>(storage), count);
    EXPECT_EQ(std::memcmp(storage, expected, sizeof storage), 0);
}

} // namespace

} // namespace ZarnMath
