#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace ZarnMath::CubicBezier {

namespace {

static_assert(std::is_same_v<std::underlying_type_t<Side>, std::int32_t> && std::is_convertible_v<Side, int>);
static_assert(SideNone == 0 && SidePositive == 1 && SideNegative == 2);

constexpr Side untouchedSide = static_cast<Side>(77);

/// The results of a search, sentinels before it.
template <typename P>
struct Nearest
{
    double t = sentinel<double>;
    P point = sentinel<P>;
    double distanceSquared = sentinel<double>;

    [[nodiscard]] bool IsUntouched() const
    {
        return HasSameBits(t, sentinel<double>) && HasSameBits(point, sentinel<P>) &&
               HasSameBits(distanceSquared, sentinel<double>);
    }
};

static_assert(noexcept(FindClosestPointOnBezier(std::declval<const point2d*>(), point2d{}, std::declval<double&>(),
                                                std::declval<point2d&>(), std::declval<double&>())));
static_assert(noexcept(FindClosestPointOnBezier(std::declval<const POINT*>(), POINT{})));
static_assert(noexcept(GetSide(point2d{}, point2d{}, point2d{}, point2d{}, point2d{})));
static_assert(noexcept(FindTangentsToPoint(point2d{}, point2d{}, point2d{}, point2d{}, point2d{}, nullptr)));

template <typename P>
bool Find(const CubicOf<P>& curve, const P& q, Nearest<P>& nearest)
{
    return FindClosestPointOnBezier(curve.data(), q, nearest.t, nearest.point, nearest.distanceSquared);
}

bool Find(const PowerForm& f, const point2d& q, Nearest<point2d>& nearest)
{
    return FindClosestPointOnBezier(f.a, f.b, f.c, f.d, q, nearest.t, nearest.point, nearest.distanceSquared);
}

bool FindExtended(const PowerForm& f, const point2d& q, Nearest<point2d>& nearest)
{
    return FindClosestPointOnBezierExtendedRange(f.a, f.b, f.c, f.d, q, nearest.t, nearest.point,
                                                 nearest.distanceSquared);
}

bool FindSide(const PowerForm& f, const point2d& q, Nearest<point2d>& nearest, Side& side)
{
    return GetSide(f.a, f.b, f.c, f.d, q, nearest.t, nearest.point, nearest.distanceSquared, side);
}

Side SideOf(const PowerForm& f, const point2d& q)
{
    return GetSide(f.a, f.b, f.c, f.d, q);
}

/// What `Invert` appends to an empty vector.
std::vector<double> Inverted(const PowerForm& f, const point2d& q)
{
    std::vector<double> parameters;
    const bool found = Invert(f.a, f.b, f.c, f.d, q, parameters);
    EXPECT_EQ(found, !parameters.empty());
    return parameters;
}

/// All stationary points in the open interval.
template <typename P>
struct Stationary
{
    std::vector<double> ts;
    std::vector<P> points;
    std::vector<double> squaredDistances;
};

template <typename P>
bool FindAll(const CubicOf<P>& curve, const P& q, Stationary<P>& all)
{
    return FindClosestPointsOnBezier(curve.data(), q, all.ts, all.points, all.squaredDistances);
}

const Cubic straight = {{{0, 0}, {100, 0}, {200, 0}, {300, 0}}};
const IntegerCubic straightIntegers = {{{0, 0}, {100, 0}, {200, 0}, {300, 0}}};
/// Symmetric about x = 150; its cubic coefficient is (0, 0).
const Cubic arch = {{{0, 0}, {100, 300}, {200, 300}, {300, 0}}};
const Cubic collapsed = {{{5, 7}, {5, 7}, {5, 7}, {5, 7}}};

PowerForm PowerOf(const Cubic& curve)
{
    return ToPowerForm(curve.data());
}

// ---- the nearest point

TEST(ClosestPoint, OfAPointBeyondTheEndIsNotFound)
{
    Nearest<point2d> nearest;
    EXPECT_FALSE(Find(straight, {400, 0}, nearest));
    EXPECT_FALSE(Find(PowerOf(straight), {400, 0}, nearest));
    EXPECT_TRUE(nearest.IsUntouched());
    Nearest<POINT> integers;
    EXPECT_FALSE(Find(straightIntegers, {400, 0}, integers));
    EXPECT_TRUE(integers.IsUntouched());
}

TEST(ClosestPoint, OnALineIsTheFoot)
{
    Nearest<point2d> nearest;
    EXPECT_TRUE(Find(straight, {150, 10}, nearest));
    EXPECT_EQ(nearest.t, 0.5);
    EXPECT_EQ(nearest.point, (point2d{150, 0}));
    EXPECT_EQ(nearest.distanceSquared, 100.0);
}

TEST(ClosestPoint, AtAnEndIsFoundWhereItIsStationary)
{
    Nearest<point2d> nearest;
    EXPECT_TRUE(Find(straight, {0, 10}, nearest));
    EXPECT_EQ(nearest.t, 0.0);
    EXPECT_EQ(nearest.distanceSquared, 100.0);
    EXPECT_TRUE(Find(straight, {300, -10}, nearest));
    EXPECT_EQ(nearest.t, 1.0);
    EXPECT_EQ(nearest.point, (point2d{300, 0}));
    EXPECT_FALSE(Find(straight, {-1e-9, 10}, nearest));
}

// The foot at t = 0.5 falls on the root finder's first cut.
TEST(ClosestPoint, OnACutIsLost)
{
    Nearest<point2d> nearest;
    EXPECT_FALSE(Find(arch, {150, 300}, nearest));
    EXPECT_TRUE(nearest.IsUntouched());
}

// The start itself, distance 0, is dropped for the two other roots of a cubic.
TEST(ClosestPoint, AtTheStartIsDroppedWhereTheDegreeFalls)
{
    Nearest<point2d> nearest;
    EXPECT_TRUE(Find(arch, {0, 0}, nearest));
    EXPECT_NEAR(nearest.t, 0.83333, 1e-5);
    EXPECT_NEAR(nearest.point.x, 250.0, 0.01);
    EXPECT_NEAR(nearest.point.y, 125.0, 0.01);
    EXPECT_NEAR(nearest.distanceSquared, 78125.0, 0.01);
}

TEST(ClosestPoint, OfACollapsedCurveIsNotFound)
{
    Nearest<point2d> nearest;
    for (const point2d q : {point2d{5, 7}, point2d{0, 0}}) {
        EXPECT_FALSE(Find(collapsed, q, nearest));
        EXPECT_FALSE(FindExtended(PowerOf(collapsed), q, nearest));
        EXPECT_TRUE(nearest.IsUntouched());
    }
}

// x = 300t(1 - t) passes 56.25 at t = 1/4 and 3/4, at distance 10 either way.
TEST(ClosestPoint, OfTwoEquallyNearIsTheFirst)
{
    const Cubic thereAndBack = {{{0, 0}, {100, 0}, {100, 0}, {0, 0}}};
    Nearest<point2d> nearest;
    EXPECT_TRUE(Find(thereAndBack, {56.25, 10}, nearest));
    EXPECT_NEAR(nearest.t, 0.25, 1e-9);
    EXPECT_EQ(nearest.distanceSquared, 100.0);
    Stationary<point2d> all;
    EXPECT_TRUE(FindAll(thereAndBack, {56.25, 10}, all));
    EXPECT_EQ(std::count(all.squaredDistances.begin(), all.squaredDistances.end(), 100.0), 2);
}

TEST(ClosestPoint, MayTakeItsResultForTheQuery)
{
    const PowerForm f = PowerOf(arch);
    Nearest<point2d> nearest;
    ASSERT_TRUE(Find(f, {40, 200}, nearest));
    double t = 0.0;
    double distanceSquared = 0.0;
    point2d inOut = {40, 200};
    ASSERT_TRUE(FindClosestPointOnBezier(f.a, f.b, f.c, f.d, inOut, t, inOut, distanceSquared));
    EXPECT_TRUE(SameBits(inOut, nearest.point));
    EXPECT_EQ(distanceSquared, nearest.distanceSquared);
}

// Found by the fuzzer: the square of the distance overflows, but none of the quintic's coefficients does.
TEST(ClosestPoint, FartherThanAnySquareLeavesParameterAndPointAlone)
{
    constexpr Cubic curve{{{0.0, 0.0}, {100.0, 300.0}, {200.0, -300.0}, {300.0, 0.0}}};
    Nearest<point2d> nearest;
    EXPECT_TRUE(Find(curve, point2d{0.0, 1e160}, nearest));
    EXPECT_EQ(nearest.distanceSquared, std::numeric_limits<double>::max());
    EXPECT_TRUE(SameBits(nearest.t, sentinel<double>));
    EXPECT_TRUE(SameBits(nearest.point, sentinel<point2d>));
}

TEST(ClosestPoint, OfNaNIsNotFound)
{
    Nearest<point2d> nearest;
    EXPECT_FALSE(Find(straight, {nan, nan}, nearest));
    EXPECT_FALSE(Find({{{nan, nan}, {1, 1}, {2, 2}, {3, 3}}}, {0, 0}, nearest));
    EXPECT_FALSE(FindExtended(PowerOf(straight), {nan, 0}, nearest));
    EXPECT_TRUE(nearest.IsUntouched());
    EXPECT_EQ(SideOf(PowerOf(straight), {nan, nan}), SideNone);
    EXPECT_TRUE(Inverted(PowerOf(straight), {nan, nan}).empty());
}

/// Whether a parameter is a cut of a subdivision in halves, within the root finder's tolerance.
bool IsNearCut(double t)
{
    const double scaled = t * 64.0;
    return std::fabs(scaled - std::round(scaled)) < 1e-5;
}

struct Losses
{
    int curves = 0;
    int onCuts = 0;
    int others = 0;
};

/// Compares a found point with the feet of a dense sample.
void ExpectNoNearerFoot(const PowerForm& f, const point2d& q, bool found, const Nearest<point2d>& nearest,
                        Losses& losses)
{
    constexpr int samples = 256;
    double squared[samples + 1];
    for (int i = 0; i <= samples; ++i)
        squared[i] = LengthSquared(Evaluate(f, static_cast<double>(i) / samples) - q);
    ++losses.curves;
    for (int i = 1; i < samples; ++i) {
        const bool isFoot = squared[i] < squared[i - 1] && squared[i] < squared[i + 1];
        if (isFoot && (!found || squared[i] < nearest.distanceSquared * (1.0 - 1e-9)))
            ++(IsNearCut(static_cast<double>(i) / samples) ? losses.onCuts : losses.others);
    }
}

TEST(ClosestPoint, IsOnTheCurveAndNoFootIsNearer)
{
    RandomSource random(61);
    Losses losses;
    for (int i = 0; i < 6000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const point2d q = random.Point(extent * 1.5);
        const PowerForm f = PowerOf(curve);
        Nearest<point2d> nearest;
        const bool found = Find(curve, q, nearest);
        if (found) {
            EXPECT_GE(nearest.t, 0.0);
            EXPECT_LE(nearest.t, 1.0);
            EXPECT_TRUE(SameBits(nearest.point, Evaluate(f, nearest.t)));
            EXPECT_TRUE(SameBits(nearest.distanceSquared, LengthSquared(nearest.point - q)));
            Nearest<point2d> same;
            EXPECT_TRUE(Find(f, q, same));
            EXPECT_TRUE(SameBits(same.t, nearest.t));
        }
        ExpectNoNearerFoot(f, q, found, nearest, losses);
    }
    EXPECT_EQ(losses.others, 0);
    EXPECT_LE(losses.onCuts, losses.curves / 200);
    RecordProperty("feetLostOnCuts", losses.onCuts);
}

// Symmetric curves asked about from their axis: the foot in the middle is lost again and again.
TEST(ClosestPoint, LosesFeetInTheMiddleOfSymmetricCurves)
{
    Losses losses;
    for (int height = 10; height <= 100; ++height) {
        const Cubic symmetric = {{{0, 0}, {100, 1.0 * height}, {200, 1.0 * height}, {300, 0}}};
        const point2d q = {150, 0};
        Nearest<point2d> nearest;
        const bool found = Find(symmetric, q, nearest);
        ExpectNoNearerFoot(PowerOf(symmetric), q, found, nearest, losses);
    }
    EXPECT_GT(losses.onCuts, 0);
    EXPECT_EQ(losses.others, 0);
}

// ---- integer curves

TEST(ClosestPointOfIntegers, RoundsThePointAndMeasuresTheUnrounded)
{
    const IntegerCubic line = {{{0, 0}, {2, 1}, {4, 2}, {6, 3}}};
    Nearest<POINT> nearest;
    EXPECT_TRUE(Find(line, {3, 0}, nearest));
    EXPECT_NEAR(nearest.t, 0.4, 1e-12);
    EXPECT_EQ(nearest.point, (POINT{2, 1}));
    EXPECT_NEAR(nearest.distanceSquared, 1.8, 1e-12);
}

TEST(ClosestPointOfIntegers, IsThatOfTheSameCurveInDouble)
{
    RandomSource random(62);
    for (int i = 0; i < 2000; ++i) {
        const IntegerCubic curve = random.IntegerCurve(1000);
        const POINT q = random.IntegerPoint(1500);
        const Cubic same = {ToPoint2d(curve[0]), ToPoint2d(curve[1]), ToPoint2d(curve[2]), ToPoint2d(curve[3])};
        Nearest<POINT> integers;
        Nearest<point2d> doubles;
        ASSERT_EQ(Find(curve, q, integers), Find(same, ToPoint2d(q), doubles));
        EXPECT_TRUE(SameBits(integers.t, doubles.t));
        EXPECT_TRUE(SameBits(integers.distanceSquared, doubles.distanceSquared));
        EXPECT_EQ(integers.IsUntouched(), doubles.IsUntouched());
        if (!doubles.IsUntouched()) {
            EXPECT_EQ(integers.point, ToPOINT(doubles.point));
            EXPECT_TRUE(SameBits(FindClosestPointOnBezier(curve.data(), q), doubles.t));
        }
    }
}

TEST(ClosestParameter, FallsBackOnTheNearerEnd)
{
    EXPECT_EQ(FindClosestPointOnBezier(straightIntegers.data(), POINT{400, 0}), 1.0);
    EXPECT_EQ(FindClosestPointOnBezier(straightIntegers.data(), POINT{-50, 0}), 0.0);
    EXPECT_EQ(FindClosestPointOnBezier(straightIntegers.data(), POINT{150, 100}), 0.5);
}

TEST(ClosestParameter, ComparesWithTheEndsAndNotWithTheControlPoints)
{
    // Straight up with a speed of 1890*(t - 1/3)^2 + 90, past neither control point: P2 alone is nearer than the start.
    const POINT upward[4] = {{0, 0}, {0, 100}, {0, -10}, {0, 300}};
    EXPECT_EQ(FindClosestPointOnBezier(upward, POINT{0, -20}), 0.0);
    // The same downward: P1 alone is nearer than the end.
    const POINT downward[4] = {{0, 300}, {0, -10}, {0, 100}, {0, 0}};
    EXPECT_EQ(FindClosestPointOnBezier(downward, POINT{0, -20}), 1.0);
}

TEST(ClosestParameter, TakesTheEndAmongEquallyNear)
{
    const IntegerCubic point = {{{5, 7}, {5, 7}, {5, 7}, {5, 7}}};
    EXPECT_EQ(FindClosestPointOnBezier(point.data(), POINT{0, 0}), 1.0);
    EXPECT_EQ(FindClosestPointOnBezier(point.data(), POINT{5, 7}), 1.0);
}

// The squares differ by one unit in the last place, and have the same root: a tie after the root, not before it.
TEST(ClosestParameter, ComparesDistancesAndNotTheirSquares)
{
    const double toStart = 1.0 + 268435457.0 * 268435457.0;
    const double toEnd = 16.0 + 268435457.0 * 268435457.0;
    ASSERT_LT(toStart, toEnd);
    ASSERT_EQ(std::sqrt(toStart), std::sqrt(toEnd));
    const IntegerCubic line = {{{0, 0}, {1, 0}, {2, 0}, {3, 0}}};
    EXPECT_EQ(FindClosestPointOnBezier(line.data(), POINT{-1, 268435457}), 1.0);
    EXPECT_EQ(FindClosestPointOnBezier(line.data(), POINT{-1, 1000}), 0.0);
}

// ---- all stationary points

TEST(ClosestPoints, LeaveOutTheEnds)
{
    Stationary<point2d> all;
    EXPECT_TRUE(FindAll(arch, {0, 0}, all));
    ASSERT_EQ(all.ts.size(), 2u);
    EXPECT_NEAR(all.ts[0], 0.66667, 1e-5);
    EXPECT_NEAR(all.ts[1], 0.83333, 1e-5);
    EXPECT_NEAR(all.squaredDistances[0], 80000.0, 0.01);
    EXPECT_NEAR(all.squaredDistances[1], 78125.0, 0.01);
    Stationary<point2d> none;
    EXPECT_FALSE(FindAll(straight, {0, 10}, none));
    EXPECT_FALSE(FindAll(straight, {300, 10}, none));
    EXPECT_FALSE(FindAll(collapsed, {0, 0}, none));
    EXPECT_TRUE(none.ts.empty() && none.points.empty() && none.squaredDistances.empty());
}

TEST(ClosestPoints, AreAppended)
{
    Stationary<point2d> all = {{9.0}, {{8, 7}, {6, 5}}, {4.0, 3.0, 2.0}};
    EXPECT_TRUE(FindAll(straight, {75, 10}, all));
    EXPECT_EQ(all.ts, (std::vector<double>{9.0, 0.25}));
    EXPECT_EQ(all.points, (std::vector<point2d>{{8, 7}, {6, 5}, {75, 0}}));
    EXPECT_EQ(all.squaredDistances, (std::vector<double>{4.0, 3.0, 2.0, 100.0}));
    // The result tells of this call alone.
    EXPECT_FALSE(FindAll(straight, {400, 0}, all));
    EXPECT_EQ(all.ts.size(), 2u);
}

TEST(ClosestPoints, OfIntegersAreMeasuredFromTheRoundedPoint)
{
    const IntegerCubic line = {{{0, 0}, {2, 1}, {4, 2}, {6, 3}}};
    Stationary<POINT> all;
    EXPECT_TRUE(FindAll(line, {3, 0}, all));
    ASSERT_EQ(all.points.size(), 1u);
    EXPECT_NEAR(all.ts[0], 0.4, 1e-12);
    EXPECT_EQ(all.points[0], (POINT{2, 1}));
    EXPECT_EQ(all.squaredDistances[0], 2.0);
}

// q - p is -4e9 in double; as a 32-bit difference it would wrap.
TEST(ClosestPoints, OfIntegersAreMeasuredInDouble)
{
    const IntegerCubic line = {{{2000000000, -30}, {2000000000, -10}, {2000000000, 10}, {2000000000, 30}}};
    Stationary<POINT> all;
    EXPECT_TRUE(FindAll(line, {-2000000000, 15}, all));
    ASSERT_EQ(all.points.size(), 1u);
    EXPECT_EQ(all.points[0], (POINT{2000000000, 15}));
    EXPECT_EQ(all.squaredDistances[0], 1.6e19);
}

TEST(ClosestPoints, AreStationaryAndOnTheCurve)
{
    RandomSource random(63);
    int total = 0;
    for (int i = 0; i < 3000; ++i) {
        const Cubic curve = random.Curve(random.AnyShape(), 100.0);
        const point2d q = random.Point(150.0);
        const PowerForm f = PowerOf(curve);
        Stationary<point2d> all;
        const bool found = FindAll(curve, q, all);
        EXPECT_EQ(found, !all.ts.empty());
        ASSERT_LE(all.ts.size(), 5u);
        ASSERT_EQ(all.points.size(), all.ts.size());
        ASSERT_EQ(all.squaredDistances.size(), all.ts.size());
        EXPECT_TRUE(std::is_sorted(all.ts.begin(), all.ts.end()));
        for (std::size_t k = 0; k < all.ts.size(); ++k) {
            EXPECT_TRUE(SameBits(all.points[k], Evaluate(f, all.ts[k])));
            EXPECT_TRUE(SameBits(all.squaredDistances[k], LengthSquared(q - all.points[k])));
            EXPECT_NEAR(Dot(all.points[k] - q, Derivative(f.a, f.b, f.c, all.ts[k])), 0.0, 1e-4);
            ++total;
        }
    }
    EXPECT_GT(total, 2000);
}

TEST(ClosestPoints, OfTheTemplateAreTheSame)
{
    RandomSource random(64);
    for (int i = 0; i < 500; ++i) {
        const IntegerCubic curve = random.IntegerCurve(100);
        const POINT q = random.IntegerPoint(150);
        Stationary<POINT> exported, inner;
        EXPECT_EQ(FindAll(curve, q, exported),
                  FindClosestPointsOnBezierT<POINT>(curve.data(), q, inner.ts, inner.points, inner.squaredDistances));
        EXPECT_EQ(exported.ts, inner.ts);
        EXPECT_EQ(exported.points, inner.points);
        EXPECT_EQ(exported.squaredDistances, inner.squaredDistances);
    }
}

// ---- beyond the ends

TEST(ExtendedRange, ReachesOneCurveLengthBeyondEitherEnd)
{
    const PowerForm f = PowerOf(straight);
    Nearest<point2d> nearest;
    EXPECT_TRUE(FindExtended(f, {450, 10}, nearest));
    EXPECT_NEAR(nearest.t, 1.5, 1e-12);
    EXPECT_NEAR(nearest.point.x, 450.0, 1e-9);
    EXPECT_TRUE(FindExtended(f, {-150, 10}, nearest));
    EXPECT_NEAR(nearest.t, -0.5, 1e-12);
    Nearest<point2d> beyond;
    EXPECT_FALSE(FindExtended(f, {-300, 10}, beyond));
    EXPECT_FALSE(FindExtended(f, {600, 10}, beyond));
    EXPECT_FALSE(FindExtended(f, {601, 10}, beyond));
    EXPECT_TRUE(beyond.IsUntouched());
}

TEST(ExtendedRange, FindsStationaryPointsOnTheContinuation)
{
    RandomSource random(65);
    int found = 0;
    for (int i = 0; i < 3000; ++i) {
        const PowerForm f = PowerOf(random.Curve(random.AnyShape(), 100.0));
        const double planted = random.Uniform(-0.9, 1.9);
        const vector2d tangent = Derivative(f.a, f.b, f.c, planted);
        if (LengthSquared(tangent) < 100.0)
            continue;
        // From so near a point on the curve no other is as near, but where the curve meets itself.
        const double offset = random.Uniform(-0.01, 0.01);
        const point2d q = Evaluate(f, planted) + Normalize(Perpendicular(tangent)) * offset;
        Nearest<point2d> nearest;
        if (!FindExtended(f, q, nearest))
            continue;
        EXPECT_GT(nearest.t, -1.0);
        EXPECT_LT(nearest.t, 2.0);
        EXPECT_TRUE(SameBits(nearest.point, Evaluate(f, nearest.t)));
        EXPECT_LE(std::sqrt(nearest.distanceSquared), std::fabs(offset) + 1e-5);
        ++found;
    }
    EXPECT_GT(found, 2000);
}

// ---- sides

TEST(GetSide, TellsLeftFromRight)
{
    const PowerForm f = PowerOf(straight);
    Nearest<point2d> nearest;
    Side side = untouchedSide;
    EXPECT_TRUE(FindSide(f, {150, 10}, nearest, side));
    EXPECT_EQ(side, SidePositive);
    EXPECT_EQ(nearest.t, 0.5);
    EXPECT_EQ(nearest.point, (point2d{150, 0}));
    EXPECT_EQ(nearest.distanceSquared, 100.0);
    EXPECT_TRUE(FindSide(f, {150, -10}, nearest, side));
    EXPECT_EQ(side, SideNegative);
    EXPECT_EQ(SideOf(f, {150, 10}), SidePositive);
    EXPECT_EQ(SideOf(f, {150, -10}), SideNegative);
}

TEST(GetSide, OfAPointOnTheCurveIsNone)
{
    const PowerForm f = PowerOf(straight);
    Nearest<point2d> nearest;
    Side side = untouchedSide;
    EXPECT_TRUE(FindSide(f, {150, 0}, nearest, side));
    EXPECT_EQ(side, SideNone);
    EXPECT_EQ(SideOf(f, {150, 0}), SideNone);
}

TEST(GetSide, WithoutANearestPointWritesNothing)
{
    const PowerForm f = PowerOf(straight);
    Nearest<point2d> nearest;
    Side side = untouchedSide;
    EXPECT_FALSE(FindSide(f, {400, 10}, nearest, side));
    EXPECT_TRUE(nearest.IsUntouched());
    EXPECT_EQ(side, untouchedSide);
    EXPECT_EQ(SideOf(f, {400, 10}), SideNone);
    EXPECT_EQ(SideOf(PowerOf(collapsed), {0, 0}), SideNone);
}

// Seen from a centre of curvature the distance has a double root. On a tiny curve everything is near 0 for the search of
// the derivative, which then may settle on a root outside the unit interval.
TEST(GetSide, OutOfRangeWritesAllButTheSide)
{
    RandomSource random(66);
    int outOfRange = 0;
    for (int i = 0; i < 20000; ++i) {
        const double extent = std::pow(10.0, random.Uniform(-5.0, -2.0));
        const PowerForm f = {random.Point(extent), random.Point(extent), random.Point(extent), {0, 0}};
        const double t = random.Uniform(0.1, 0.9);
        const vector2d tangent = Derivative(f.a, f.b, f.c, t);
        const vector2d bend = AsVector(f.a) * (6.0 * t) + AsVector(f.b) * 2.0;
        const double radius = std::pow(LengthSquared(tangent), 1.5) / Cross(tangent, bend);
        const vector2d normal = Perpendicular(tangent) / std::sqrt(LengthSquared(tangent));
        const point2d centre = Evaluate(f, t) + normal * radius;
        Nearest<point2d> nearest;
        Side side = untouchedSide;
        if (FindSide(f, centre, nearest, side)) {
            EXPECT_NE(side, untouchedSide);
            continue;
        }
        EXPECT_EQ(side, untouchedSide);
        EXPECT_EQ(SideOf(f, centre), SideNone);
        if (nearest.IsUntouched())
            continue;
        ++outOfRange;
        EXPECT_FALSE(nearest.t >= 0.0 && nearest.t <= 1.0);
        EXPECT_TRUE(SameBits(nearest.point, Evaluate(f, nearest.t)));
        EXPECT_TRUE(SameBits(nearest.distanceSquared, LengthSquared(nearest.point - centre)));
    }
    EXPECT_GT(outOfRange, 0);
}

TEST(GetSide, FollowsTheNormalOfThePlantedPoint)
{
    RandomSource random(67);
    int told = 0;
    for (int i = 0; i < 2000; ++i) {
        const PowerForm f = PowerOf(random.Curve(Shape::Arc, 100.0));
        const double t = random.Uniform(0.05, 0.95);
        const double offset = random.Uniform(-2.0, 2.0);
        const vector2d tangent = Derivative(f.a, f.b, f.c, t);
        const point2d q = Evaluate(f, t) + Normalize(Perpendicular(tangent)) * offset;
        if (SideOf(f, q) == SideNone)
            continue;
        EXPECT_EQ(SideOf(f, q), offset > 0.0 ? SidePositive : SideNegative);
        ++told;
    }
    EXPECT_GT(told, 1900);
}

// ---- inversion

TEST(Invert, FindsPointsNearTheCurve)
{
    const PowerForm f = PowerOf(straight);
    const auto near = Inverted(f, {100, 0.09});
    ASSERT_EQ(near.size(), 1u);
    EXPECT_NEAR(near[0], 1.0 / 3.0, 1e-9);
    EXPECT_TRUE(Inverted(f, {100, 0.11}).empty());
}

// 0.1 squared rounds above 0.01, and its neighbour's square below.
TEST(Invert, ReachesATenthOfAUnit)
{
    const PowerForm f = PowerOf(straight);
    ASSERT_FALSE(0.1 * 0.1 < 0.01);
    ASSERT_TRUE(Below(0.1) * Below(0.1) < 0.01);
    EXPECT_TRUE(Inverted(f, {75, 0.1}).empty());
    EXPECT_EQ(Inverted(f, {75, Below(0.1)}).size(), 1u);
    EXPECT_EQ(Inverted(f, {75, -Below(0.1)}).size(), 1u);
}

TEST(Invert, FindsTheEnds)
{
    const PowerForm f = PowerOf(straight);
    EXPECT_EQ(Inverted(f, {0, 0}), std::vector<double>{0.0});
    EXPECT_EQ(Inverted(f, {300, 0}), std::vector<double>{1.0});
    EXPECT_TRUE(Inverted(f, {-0.01, 0}).empty());
    EXPECT_TRUE(Inverted(f, {300.01, 0}).empty());
}

TEST(Invert, LosesAFootOnACut)
{
    EXPECT_TRUE(Inverted(PowerOf(arch), {150, 225}).empty());
}

TEST(Invert, RejectsAFootOnTheContinuation)
{
    EXPECT_TRUE(Inverted(PowerOf(straight), {450, 0}).empty());
}

// x = 1000(t - 0.9)^2 turns back at t = 0.9, and y = 0.2(1.1 - t): q is the curve's point at t = 1.1, and 0.08 from the
// one at 0.7.
TEST(Invert, IsNotContentWithAFootOnTheCurveBesideABetterOneBeyond)
{
    const PowerForm f = {{0, 0}, {1000, 0}, {-1800, -0.2}, {810, 0.22}};
    const point2d q = {40, 0};
    Nearest<point2d> onCurve;
    ASSERT_TRUE(Find(f, q, onCurve));
    EXPECT_NEAR(onCurve.t, 0.7, 1e-3);
    EXPECT_LT(onCurve.distanceSquared, 0.01);
    EXPECT_TRUE(Inverted(f, q).empty());
    // On the other side of the curve's two branches the one within its range is the nearer.
    EXPECT_EQ(Inverted(f, {40, 0.07}).size(), 1u);
}

TEST(Invert, TellsOfAVectorThatCameInWithElements)
{
    const PowerForm f = PowerOf(straight);
    std::vector<double> parameters = {9.0};
    EXPECT_TRUE(Invert(f.a, f.b, f.c, f.d, {100, 0.11}, parameters));
    EXPECT_EQ(parameters, std::vector<double>{9.0});
    EXPECT_TRUE(Invert(f.a, f.b, f.c, f.d, {0, 0}, parameters));
    EXPECT_EQ(parameters, (std::vector<double>{9.0, 0.0}));
}

TEST(Invert, UndoesEvaluation)
{
    RandomSource random(68);
    int inverted = 0;
    for (int i = 0; i < 2000; ++i) {
        const PowerForm f = PowerOf(random.Curve(Shape::Arc, 1000.0));
        const double t = random.Uniform(0.0, 1.0);
        for (const double found : Inverted(f, Evaluate(f, t))) {
            EXPECT_NEAR(found, t, 1e-6);
            ++inverted;
        }
    }
    EXPECT_GT(inverted, 1980);
}

// ---- tangents

/// The parameters for a query, with nothing written beyond the count.
std::vector<double> TangentsTo(const PowerForm& f, const point2d& q)
{
    Guarded<double, 5> parameters;
    const int count = FindTangentsToPoint(f.a, f.b, f.c, f.d, q, parameters.data());
    EXPECT_TRUE(parameters.IsUntouchedFrom(std::max(count, 1)));
    return std::vector<double>(parameters.data(), parameters.data() + count);
}

TEST(Tangents, ToPointsOutsideAnArch)
{
    const auto both = TangentsTo(PowerOf(arch), {150, 400});
    ASSERT_EQ(both.size(), 2u);
    EXPECT_NEAR(both[0], 0.05904, 1e-5);
    EXPECT_NEAR(both[1], 0.94096, 1e-5);
    const auto one = TangentsTo(PowerOf(arch), {0, 300});
    ASSERT_EQ(one.size(), 1u);
    EXPECT_NEAR(one[0], 0.57735, 1e-5);
    EXPECT_TRUE(TangentsTo(PowerOf(arch), {150, 100}).empty());
}

TEST(Tangents, CountAtTheEnds)
{
    // The end tangents of the arch meet at (150, 450).
    EXPECT_EQ(TangentsTo(PowerOf(arch), {150, 450}), (std::vector<double>{0.0, 1.0}));
}

TEST(Tangents, OfDegenerateCurvesAreNone)
{
    EXPECT_TRUE(TangentsTo(PowerOf(collapsed), {0, 0}).empty());
    EXPECT_TRUE(TangentsTo(PowerOf(straight), {50, 0}).empty());
    EXPECT_TRUE(TangentsTo(PowerOf(straight), {50, 10}).empty());
    EXPECT_TRUE(TangentsTo(PowerOf(straight), {nan, nan}).empty());
}

TEST(Tangents, RunThroughThePoint)
{
    RandomSource random(69);
    int total = 0;
    for (int i = 0; i < 3000; ++i) {
        const double extent = random.Uniform(1.0, 1000.0);
        const PowerForm f = PowerOf(random.Curve(random.AnyShape(), extent));
        const point2d q = random.Point(extent);
        for (const double t : TangentsTo(f, q)) {
            EXPECT_NEAR(Cross(Derivative(f.a, f.b, f.c, t), Evaluate(f, t) - q), 0.0, 1e-9 * extent * extent);
            ++total;
        }
    }
    EXPECT_GT(total, 1000);
}

} // namespace

} // namespace ZarnMath::CubicBezier
