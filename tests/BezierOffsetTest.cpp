#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/BezierOffsetInternal.h"
#include "ZarnMath/FitBezier.h"
#include "ZarnMath/WMath.h"

#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath {
namespace {

using CubicBezier::PowerForm;
using CubicBezier::ToPowerForm;
using Segment = CubicBezier::bezier2dT<point2d>;
using Bezier = Guarded<point2d, 4>;

/// It bends to the right, with a radius of 50*(1 + 36*(t - 1/2)^2)^(3/2): the least, 50, is at its summit.
constexpr Segment arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
/// The same mirrored: it bends to the left.
constexpr Segment bowl = {{{0.0, 0.0}, {100.0, -300.0}, {200.0, -300.0}, {300.0, 0.0}}};
/// A quarter of a circle about the origin, counter-clockwise.
constexpr double kappa = 0.5522847498307936;

Segment QuarterCircle(double radius)
{
    return {{{radius, 0.0}, {radius, radius * kappa}, {radius * kappa, radius}, {0.0, radius}}};
}

/// What the splitting gave.
struct Stretches
{
    std::vector<Segment> segments;
    std::vector<double> validityChanges;
};

Stretches Split(const Segment& curve, double distance)
{
    Stretches result;
    GetSegmentsToOffset(curve, result.segments, distance, &result.validityChanges);
    return result;
}

bool IsValid(const Segment& curve, double distance)
{
    return IsBezierValidForOffset(curve.points, distance);
}

Segment Part(const Segment& curve, double start, double end)
{
    Segment part;
    CubicBezier::Subsection(start, end, curve.points, part.points);
    return part;
}

void ExpectCurve(const point2d* actual, const Segment& expected, double tolerance)
{
    for (std::size_t i = 0; i < 4; ++i) {
        EXPECT_NEAR(actual[i].x, expected[i].x, tolerance) << i;
        EXPECT_NEAR(actual[i].y, expected[i].y, tolerance) << i;
    }
}

// Validity.

TEST(IsBezierValidForOffset, OneGoodSampleIsEnough)
{
    EXPECT_TRUE(IsValid(arch, -100.0)); // its summit is too tight, its flanks are not
    EXPECT_FALSE(IsValid(Part(arch, 0.45, 0.55), -100.0));
    EXPECT_TRUE(IsValid(Part(arch, 0.45, 0.55), 100.0)); // on the outside nothing is tight
    EXPECT_TRUE(IsValid(Part(bowl, 0.45, 0.55), -100.0));
    EXPECT_FALSE(IsValid(Part(bowl, 0.45, 0.55), 100.0));
}

/// A curve whose tightest part, radius 1/2 at a given parameter, is alone too tight for an offset of 0.5 + slack.
Segment Parabola(double vertex)
{
    // (t, (t - vertex)^2)
    const double c = -2.0 * vertex;
    const double d = vertex * vertex;
    return {{{0.0, d}, {1.0 / 3.0, d + c / 3.0}, {2.0 / 3.0, d + 2.0 * c / 3.0 + 1.0 / 3.0}, {1.0, d + c + 1.0}}};
}

TEST(IsBezierValidForOffset, EachOfTheThreeSamplesCounts)
{
    // The radius at distance s from the vertex is (1 + 4*s^2)^(3/2)/2: 0.5 at it, 0.70 a quarter away, 1.41 a half away.
    EXPECT_FALSE(IsValid(Parabola(0.5), 0.8));
    EXPECT_TRUE(IsValid(Parabola(0.5), 0.6));  // good at 0.25 and 0.75
    EXPECT_TRUE(IsValid(Parabola(0.25), 1.3)); // good at 0.75 alone
    EXPECT_TRUE(IsValid(Parabola(0.75), 1.3)); // good at 0.25 alone
    EXPECT_FALSE(IsValid(Parabola(0.25), 1.5));
    EXPECT_FALSE(IsValid(Parabola(0.75), 1.5));
    EXPECT_TRUE(IsValid(Parabola(0.5), -1.5));
}

TEST(IsBezierValidForOffset, RadiusEqualToTheDistanceIsGood)
{
    // A parabola in power form, so that all numbers are exact: (t - 1/2, (t - 1/2)^2), radius 1/2 at 1/2.
    const point2d a{0.0, 0.0};
    const point2d b{0.0, 1.0};
    const point2d c{1.0, -1.0};
    double radius = 0.0;
    ASSERT_TRUE(CubicBezier::GetCurvatureRadiusAt(0.25, a, b, c, radius)); // 0.6987..., the same at 0.75
    EXPECT_TRUE(IsBezierValidForOffset(a, b, c, 0.5));
    EXPECT_TRUE(IsBezierValidForOffset(a, b, c, radius));
    EXPECT_FALSE(IsBezierValidForOffset(a, b, c, std::nextafter(radius, 1.0)));
    const point2d mirrored{0.0, -1.0};
    const point2d down{1.0, 1.0};
    EXPECT_TRUE(IsBezierValidForOffset(a, mirrored, down, -radius));
    EXPECT_FALSE(IsBezierValidForOffset(a, mirrored, down, -std::nextafter(radius, 1.0)));
}

TEST(IsBezierValidForOffset, DistanceOfZeroAndStraightCurvesAreValid)
{
    EXPECT_TRUE(IsValid(Part(arch, 0.45, 0.55), 0.0));
    const Segment straight = {{{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}}};
    const Segment point = {{{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}}};
    for (const double distance : {-1e9, 1e9, nan}) {
        EXPECT_TRUE(IsValid(straight, distance));
        EXPECT_TRUE(IsValid(point, distance));
        EXPECT_TRUE(IsValid(arch, nan));
    }
}

// Splitting.

TEST(GetSegmentsToOffset, FoldIsCutOut)
{
    const Stretches s = Split(arch, -100.0);
    ASSERT_EQ(s.segments.size(), 2U);
    ExpectCurve(s.segments[0].points, {{{0.0, 0.0}, {37.2263, 111.679}, {74.4526, 181.7839}, {111.679, 210.315}}},
                5e-4);
    ExpectCurve(s.segments[1].points, {{{188.321, 210.315}, {225.5474, 181.7839}, {262.7737, 111.679}, {300.0, 0.0}}},
                5e-4);
    ASSERT_EQ(s.validityChanges.size(), 2U);
    EXPECT_NEAR(s.validityChanges[0], 0.37226, 5e-6);
    EXPECT_NEAR(s.validityChanges[1], 0.62774, 5e-6);
    EXPECT_TRUE(SameBits(s.segments[0].points, Part(arch, 0.0, s.validityChanges[0]).points, 4));
    EXPECT_TRUE(SameBits(s.segments[1].points, Part(arch, s.validityChanges[1], 1.0).points, 4));
}

TEST(GetSegmentsToOffset, CurveWithoutCuspsComesThroughUnchanged)
{
    const Stretches s = Split(arch, 100.0);
    ASSERT_EQ(s.segments.size(), 1U);
    EXPECT_TRUE(SameBits(s.segments[0].points, arch.points, 4));
    EXPECT_TRUE(s.validityChanges.empty());
}

TEST(GetSegmentsToOffset, InvalidCurveWithoutCuspsGivesNothing)
{
    const Stretches s = Split(QuarterCircle(10.0), 50.0); // to its centre and far beyond
    EXPECT_TRUE(s.segments.empty());
    EXPECT_TRUE(s.validityChanges.empty());
}

TEST(GetSegmentsToOffset, ResultsAreAppended)
{
    std::vector<Segment> segments{bowl};
    std::vector<double> changes{7.0};
    GetSegmentsToOffset(arch, segments, -100.0, &changes);
    ASSERT_EQ(segments.size(), 3U);
    EXPECT_EQ(segments[0], bowl);
    ASSERT_EQ(changes.size(), 3U);
    EXPECT_EQ(changes[0], 7.0);
    GetSegmentsToOffset(arch, segments, 100.0, &changes);
    EXPECT_EQ(segments.size(), 4U);
    EXPECT_EQ(changes.size(), 3U);
}

TEST(GetSegmentsToOffset, ChangesNeedNotBeAsked)
{
    std::vector<Segment> segments;
    GetSegmentsToOffset(arch, segments, -100.0, nullptr);
    EXPECT_EQ(segments, Split(arch, -100.0).segments);
}

TEST(GetSegmentsToOffset, CurveMayBeOneOfTheSegments)
{
    std::vector<Segment> segments{arch};
    segments.shrink_to_fit();
    GetSegmentsToOffset(segments[0], segments, -100.0, nullptr);
    ASSERT_EQ(segments.size(), 3U);
    const Stretches s = Split(arch, -100.0);
    EXPECT_EQ(segments[1], s.segments[0]);
    EXPECT_EQ(segments[2], s.segments[1]);
}

TEST(GetSegmentsToOffset, CurveThatEndsInvalid)
{
    const Segment left = Part(arch, 0.0, 0.5);
    const Stretches s = Split(left, -100.0);
    ASSERT_EQ(s.segments.size(), 1U);
    ASSERT_EQ(s.validityChanges.size(), 1U);
    EXPECT_NEAR(s.validityChanges[0], 0.37226 / 0.5, 2e-5);
    EXPECT_EQ(s.segments[0], Part(left, 0.0, s.validityChanges[0]));
}

TEST(GetSegmentsToOffset, CurveThatBeginsInvalidRecordsNoChangeAtItsStart)
{
    const Segment right = Part(arch, 0.5, 1.0);
    const Stretches s = Split(right, -100.0);
    ASSERT_EQ(s.segments.size(), 1U);
    ASSERT_EQ(s.validityChanges.size(), 1U);
    EXPECT_NEAR(s.validityChanges[0], (0.62774 - 0.5) / 0.5, 2e-5);
    EXPECT_EQ(s.segments[0], Part(right, s.validityChanges[0], 1.0));
}

TEST(GetSegmentsToOffset, CuspBeforeTheCurveIsPassedOver)
{
    // At such a distance all cusps are as good as at the inflections, which are double roots; the root finder's test for
    // these finds the one of the curve's extension backwards.
    const Segment s = {{{-0.3, 0.7}, {0.6, 0.8}, {-0.7, 0.6}, {0.4, -0.1}}};
    const PowerForm f = ToPowerForm(s.points);
    std::vector<double> cusps;
    ASSERT_TRUE(CubicBezier::FindOffsetCusps(f.a, f.b, f.c, 1e10, cusps));
    ASSERT_EQ(cusps.size(), 1U);
    ASSERT_NEAR(cusps[0], -0.0658, 1e-4);
    ASSERT_NE(Part(s, cusps[0], 1.0), s); // it would be cut, and rounded
    const Stretches stretches = Split(s, 1e10);
    ASSERT_EQ(stretches.segments.size(), 1U);
    EXPECT_TRUE(SameBits(stretches.segments[0].points, s.points, 4));
    EXPECT_TRUE(stretches.validityChanges.empty());
}

TEST(GetSegmentsToOffset, CuspBetweenValidPiecesLeavesNoTrace)
{
    // It turns back at 1/2, which counts as a cusp for positive distances; both ways are straight.
    const Segment back = {{{0.0, 0.0}, {-100.0, 0.0}, {-100.0, 0.0}, {0.0, 0.0}}};
    const PowerForm f = ToPowerForm(back.points);
    std::vector<double> cusps;
    ASSERT_TRUE(CubicBezier::FindOffsetCusps(f.a, f.b, f.c, 5.0, cusps));
    const Stretches s = Split(back, 5.0);
    ASSERT_EQ(s.segments.size(), 1U);
    EXPECT_EQ(s.segments[0], back);
    EXPECT_TRUE(s.validityChanges.empty());
}

/// The distance at which the cusps of the bowl lie at 1/2 - delta and 1/2 + delta.
double DistanceOfCusps(double delta)
{
    return 50.0 * std::pow(1.0 + 36.0 * delta * delta, 1.5);
}

TEST(GetSegmentsToOffset, PairOfCuspsWithLittleTurnIsPassedOver)
{
    // Between the cusps the bowl turns to the left by 2*atan(6*delta): 2 degrees at delta = 0.0029092.
    const double twoDegrees = std::tan(0.017453292519943295) / 6.0;
    const Stretches less = Split(bowl, DistanceOfCusps(twoDegrees * 0.999));
    ASSERT_EQ(less.segments.size(), 1U);
    EXPECT_EQ(less.segments[0], bowl);
    EXPECT_TRUE(less.validityChanges.empty());
    const Stretches more = Split(bowl, DistanceOfCusps(twoDegrees * 1.001));
    EXPECT_EQ(more.segments.size(), 2U);
    EXPECT_EQ(more.validityChanges.size(), 2U);
}

TEST(GetSegmentsToOffset, AnyTurnToTheRightIsLittle)
{
    // The arch turns by -17 degrees between these cusps, and counts as turning less than 2.
    const double distance = DistanceOfCusps(0.0249);
    const Stretches right = Split(arch, -distance);
    ASSERT_EQ(right.segments.size(), 1U);
    EXPECT_EQ(right.segments[0], arch);
    EXPECT_TRUE(right.validityChanges.empty());
    EXPECT_EQ(Split(bowl, distance).segments.size(), 2U); // the bowl by 17
}

TEST(GetSegmentsToOffset, CurveWhoseOnlyCuspsArePassedOverComesThroughUnchanged)
{
    Segment shifted = arch;
    for (point2d& p : shifted.points)
        p = p + vector2d{0.1, 0.7};
    ASSERT_NE(Part(shifted, 0.0, 1.0), shifted); // a cut rounds
    const Stretches s = Split(shifted, -DistanceOfCusps(0.0249));
    ASSERT_EQ(s.segments.size(), 1U);
    EXPECT_EQ(s.segments[0], shifted);
}

TEST(GetSegmentsToOffset, PairOfCuspsIsPassedOverOnlyIfClose)
{
    EXPECT_EQ(Split(arch, -DistanceOfCusps(0.02499)).segments.size(), 1U); // 0.05 apart, all but
    EXPECT_EQ(Split(arch, -DistanceOfCusps(0.02501)).segments.size(), 2U);
}

TEST(GetSegmentsToOffsetProperties, StretchesAreValidAndInOrder)
{
    RandomSource random(1);
    int cut = 0;
    for (int n = 0; n < 2000; ++n) {
        const Cubic points = random.Curve(random.AnyShape(), 100.0);
        const Segment curve{{points[0], points[1], points[2], points[3]}};
        const double distance = random.Uniform(-60.0, 60.0);
        const Stretches s = Split(curve, distance);
        cut += s.validityChanges.empty() ? 0 : 1;
        if (s.segments.empty())
            continue;
        EXPECT_LE(s.segments.size(), s.validityChanges.size() / 2 + 1) << n;
        for (const double t : s.validityChanges) {
            EXPECT_GT(t, 0.0);
            EXPECT_LT(t, 1.0);
        }
        EXPECT_TRUE(std::is_sorted(s.validityChanges.begin(), s.validityChanges.end())) << n;
    }
    EXPECT_GT(cut, 100);
}

// Samples.

struct Samples
{
    std::vector<double> parameters;
    std::vector<point2d> points;

    void Add(double t, const PowerForm& f, double distance)
    {
        GetOffsetPoint(t, f.a, f.b, f.c, f.d, distance, parameters, points);
    }
};

const PowerForm level = {{0.0, 0.0}, {0.0, 0.0}, {300.0, 0.0}, {0.0, 0.0}};

TEST(GetOffsetPoint, LiesToTheLeft)
{
    Samples s;
    s.Add(0.5, level, 10.0);
    s.Add(0.75, level, -10.0);
    EXPECT_EQ(s.parameters, (std::vector<double>{0.5, 0.75}));
    EXPECT_EQ(s.points, (std::vector<point2d>{{150.0, 10.0}, {225.0, -10.0}}));
}

TEST(GetOffsetPoint, NeighboursKeepTheirDistance)
{
    Samples s;
    s.Add(0.3, level, 1.0);
    s.Add(0.304, level, 1.0);
    s.Add(0.296, level, 1.0);
    s.Add(0.3, level, 1.0);
    EXPECT_EQ(s.parameters, std::vector<double>{0.3});
    s.Add(0.305, level, 1.0);
    EXPECT_EQ(s.parameters, (std::vector<double>{0.3, 0.305}));
    s.Add(0.294, level, 1.0);
    EXPECT_EQ(s.parameters, (std::vector<double>{0.294, 0.3, 0.305}));
    EXPECT_EQ(s.points.size(), 3U);
    EXPECT_EQ(s.points[0], (point2d{0.294 * 300.0, 1.0}));
}

TEST(GetOffsetPoint, EndsAlwaysGetIn)
{
    Samples s;
    s.Add(0.002, level, 1.0);
    s.Add(0.998, level, 1.0);
    s.Add(0.0, level, 1.0);
    s.Add(1.0, level, 1.0);
    EXPECT_EQ(s.parameters, (std::vector<double>{0.0, 0.002, 0.998, 1.0}));
    EXPECT_EQ(s.points[0], (point2d{0.0, 1.0}));
    EXPECT_EQ(s.points[3], (point2d{300.0, 1.0}));
}

TEST(GetOffsetPoint, EndThatIsThereIsInsertedBehindIt)
{
    Samples s{{0.0, 1.0}, {sentinel<point2d>, sentinel<point2d>}};
    s.Add(0.0, level, 1.0);
    s.Add(1.0, level, 1.0);
    EXPECT_EQ(s.parameters, (std::vector<double>{0.0, 0.0, 1.0, 1.0}));
    const std::vector<point2d> expected{sentinel<point2d>, {0.0, 1.0}, sentinel<point2d>, {300.0, 1.0}};
    EXPECT_EQ(s.points, expected);
}

TEST(GetOffsetPoint, PointCurveHasATangentAlongX)
{
    Samples s;
    s.Add(0.5, {{0.0, 0.0}, {0.0, 0.0}, {0.0, 0.0}, {3.0, 4.0}}, 2.0);
    EXPECT_EQ(s.points[0], (point2d{3.0, 6.0}));
}

// The fit.

TEST(FindBezierOffsetCurve, OutsideOfTheArch)
{
    Bezier offset;
    double splitParameter = sentinel<double>;
    EXPECT_TRUE(FindBezierOffsetCurve(arch.points, offset.data(), 10.0, 1.0, splitParameter));
    EXPECT_EQ(splitParameter, 0.5);
    ExpectCurve(offset.data(), {{{-9.487, 3.162}, {93.77, 312.932}, {206.23, 312.932}, {309.487, 3.162}}}, 6e-4);
    EXPECT_TRUE(offset.IsIntact());
}

TEST(FindBezierOffsetCurve, InsideOfTheArch)
{
    Bezier offset;
    double splitParameter = sentinel<double>;
    FindBezierOffsetCurve(arch.points, offset.data(), -10.0, 1.0, splitParameter);
    EXPECT_EQ(splitParameter, 0.5);
    ExpectCurve(offset.data(), {{{9.487, -3.162}, {106.168, 286.882}, {193.832, 286.882}, {290.513, -3.162}}}, 6e-4);
}

TEST(FindBezierOffsetCurve, FailureGivesTheSameCurve)
{
    Bezier good;
    Bezier bad;
    double splitParameter = sentinel<double>;
    EXPECT_TRUE(FindBezierOffsetCurve(arch.points, good.data(), 10.0, 1.0, splitParameter));
    splitParameter = sentinel<double>;
    EXPECT_FALSE(FindBezierOffsetCurve(arch.points, bad.data(), 10.0, 0.001, splitParameter));
    EXPECT_EQ(splitParameter, 0.5);
    EXPECT_TRUE(SameBits(bad.data(), good.data(), 4));
}

TEST(FindBezierOffsetCurve, ResultMayBeTheCurveItself)
{
    Bezier offset;
    double splitParameter = 0.0;
    FindBezierOffsetCurve(arch.points, offset.data(), 10.0, 1.0, splitParameter);
    Segment curve = arch;
    FindBezierOffsetCurve(curve.points, curve.points, 10.0, 1.0, splitParameter);
    EXPECT_TRUE(SameBits(curve.points, offset.data(), 4));
}

TEST(FindBezierOffsetCurve, PointCurveGivesTrueAndNan)
{
    const Segment point = {{{3.0, 4.0}, {3.0, 4.0}, {3.0, 4.0}, {3.0, 4.0}}};
    Bezier offset;
    double splitParameter = sentinel<double>;
    EXPECT_TRUE(FindBezierOffsetCurve(point.points, offset.data(), 2.0, 1.0, splitParameter));
    EXPECT_EQ(splitParameter, 0.5);
    EXPECT_EQ(offset[0], (point2d{3.0, 6.0}));
    EXPECT_TRUE(std::isnan(offset[1].x));
    EXPECT_TRUE(std::isnan(offset[2].x));
    EXPECT_EQ(offset[3], (point2d{3.0, 6.0}));
}

TEST(FindBezierOffsetCurve, StraightCurveIsMoved)
{
    const Segment straight = {{{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}}};
    Bezier offset;
    double splitParameter = 0.0;
    EXPECT_TRUE(FindBezierOffsetCurve(straight.points, offset.data(), 25.0, 1e-12, splitParameter));
    ExpectCurve(offset.data(), {{{0.0, 25.0}, {100.0, 25.0}, {200.0, 25.0}, {300.0, 25.0}}}, 1e-9);
}

/// The samples as they are told: the extremes that bend enough, then the grid.
Samples SamplesOf(const Segment& curve, double distance)
{
    const PowerForm f = ToPowerForm(curve.points);
    Samples s;
    double extremes[11];
    const int count = CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes);
    double minX = 0.0;
    double minY = 0.0;
    double maxX = 0.0;
    double maxY = 0.0;
    CubicBezier::GetTightBounds<double>(f.a, f.b, f.c, f.d, minX, minY, maxX, maxY);
    const double size = std::max(std::fabs(maxX - minX), std::fabs(maxY - minY));
    for (int i = 0; i < count; ++i) {
        double k = 0.0;
        const bool isDefined = CubicBezier::GetCurvatureAt(extremes[i], f.a, f.b, f.c, k);
        if (!isDefined || std::fabs(k) >= (size != 0.0 ? 0.1 / size : 0.0))
            s.Add(extremes[i], f, distance);
    }
    for (const double t : {0.0, 0.1, 0.2, 0.3, 0.4, 0.5, 0.6, 0.7, 0.8, 0.9, 1.0})
        s.Add(t, f, distance);
    return s;
}

TEST(FindBezierOffsetCurve, ToleranceEqualToTheErrorFails)
{
    const PowerForm f = ToPowerForm(arch.points);
    const Samples s = SamplesOf(arch, 10.0);
    Bezier offset;
    double error = 0.0;
    double splitParameter = 0.0;
    ASSERT_TRUE(FindBezierOffsetUsingLeastSquares(f.a, f.b, f.c, f.d, offset.data(), nan, s.points.data(),
                                                  static_cast<unsigned long>(s.points.size()), error, splitParameter));
    EXPECT_EQ(splitParameter, 0.5);
    EXPECT_GT(error, 0.001);
    EXPECT_LT(error, 1.0);
    EXPECT_FALSE(FindBezierOffsetCurve(arch.points, offset.data(), 10.0, error, splitParameter));
    EXPECT_TRUE(FindBezierOffsetCurve(arch.points, offset.data(), 10.0, Above(error), splitParameter));
}

void FitSamples(const Segment& curve, const Samples& s, Bezier& fit)
{
    const PowerForm f = ToPowerForm(curve.points);
    double error = 0.0;
    double splitParameter = 0.0;
    FindBezierOffsetUsingLeastSquares(f.a, f.b, f.c, f.d, fit.data(), nan, s.points.data(),
                                      static_cast<unsigned long>(s.points.size()), error, splitParameter);
}

TEST(FindBezierOffsetCurve, ExtremeWithoutACurvatureIsASample)
{
    // Straight, and back again from 7/16.
    const Segment back = {{{0.0, 0.0}, {-224.0, 0.0}, {-192.0, 0.0}, {96.0, 0.0}}};
    const PowerForm f = ToPowerForm(back.points);
    double extremes[11];
    ASSERT_EQ(CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes), 1);
    ASSERT_EQ(extremes[0], 0.4375);
    double curvature = 0.0;
    ASSERT_FALSE(CubicBezier::GetCurvatureAt(extremes[0], f.a, f.b, f.c, curvature));
    Samples s;
    for (const double t : {0.4375, 0.0, 0.1, 0.2, 0.3, 0.4, 0.5, 0.6, 0.7, 0.8, 0.9, 1.0})
        s.Add(t, f, 5.0);
    ASSERT_EQ(s.parameters.size(), 12U);
    Bezier expected;
    FitSamples(back, s, expected);
    Bezier offset;
    double splitParameter = 0.0;
    FindBezierOffsetCurve(back.points, offset.data(), 5.0, 1.0, splitParameter);
    EXPECT_TRUE(SameBits(offset.data(), expected.data(), 4));
}

TEST(FindBezierOffsetCurve, FlatExtremesAreNoSamples)
{
    // Its speed is extreme at about 0.44, where it bends with a radius far beyond ten times its size.
    const Segment flat = {{{0.0, 0.0}, {70.0, 0.1}, {240.0, 0.1}, {300.0, 0.0}}};
    const PowerForm f = ToPowerForm(flat.points);
    double extremes[11];
    ASSERT_EQ(CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes), 1);
    EXPECT_EQ(SamplesOf(flat, 5.0).parameters.size(), 11U);
}

TEST(FindBezierOffsetCurve, ExtremeThatBendsJustEnoughIsASample)
{
    // At its extreme the curvature is a tenth of 1/300, the size being 300, to the last bit.
    const Segment bent = {{{0.0, 0.0}, {70.0, 6.9171473050497703}, {240.0, 6.9171473050497703}, {300.0, 0.0}}};
    const PowerForm f = ToPowerForm(bent.points);
    double extremes[11];
    ASSERT_EQ(CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes), 1);
    double curvature = 0.0;
    ASSERT_TRUE(CubicBezier::GetCurvatureAt(extremes[0], f.a, f.b, f.c, curvature));
    ASSERT_EQ(std::fabs(curvature), 0.1 / 300.0);
    const Samples s = SamplesOf(bent, 5.0);
    ASSERT_EQ(s.parameters.size(), 12U);
    Bezier expected;
    Bezier offset;
    double error = 0.0;
    double splitParameter = 0.0;
    FindBezierOffsetUsingLeastSquares(f.a, f.b, f.c, f.d, expected.data(), nan, s.points.data(), 12, error,
                                      splitParameter);
    FindBezierOffsetCurve(bent.points, offset.data(), 5.0, 1.0, splitParameter);
    EXPECT_TRUE(SameBits(offset.data(), expected.data(), 4));
}

TEST(FindBezierOffsetCurveProperties, FitsTheSamples)
{
    RandomSource random(2);
    int extremes = 0;
    for (int n = 0; n < 1000; ++n) {
        const Cubic points = random.Curve(random.AnyShape(), 100.0);
        const Segment curve{{points[0], points[1], points[2], points[3]}};
        const double distance = random.Uniform(-20.0, 20.0);
        const Samples s = SamplesOf(curve, distance);
        extremes += s.points.size() > 11 ? 1 : 0;
        EXPECT_TRUE(std::is_sorted(s.parameters.begin(), s.parameters.end()));
        const PowerForm f = ToPowerForm(curve.points);
        const vector2d start = Normalize(CubicBezier::SafeBezierTangent(0.0, f.a, f.b, f.c, f.d));
        const vector2d end = Normalize(CubicBezier::SafeBezierTangent(1.0, f.a, f.b, f.c, f.d));
        Bezier expected;
        const double error =
            LeastSquares(s.points.data(), static_cast<int>(s.points.size()), start, end, expected.data(), 10);
        Bezier offset;
        double splitParameter = sentinel<double>;
        EXPECT_EQ(FindBezierOffsetCurve(curve.points, offset.data(), distance, 1.0, splitParameter), error < 1.0) << n;
        EXPECT_TRUE(SameBits(offset.data(), expected.data(), 4)) << n;
        EXPECT_EQ(splitParameter, 0.5);
    }
    EXPECT_GT(extremes, 300);
}

TEST(FindBezierOffsetCurveProperties, CircularArcsStayCircular)
{
    RandomSource random(3);
    for (int n = 0; n < 500; ++n) {
        const double radius = std::exp(random.Uniform(0.0, 9.0));
        const double distance = random.Uniform(-2.0, 0.7) * radius; // to the left is inward
        const Segment arc = QuarterCircle(radius);
        Bezier offset;
        double splitParameter = 0.0;
        FindBezierOffsetCurve(arc.points, offset.data(), distance, 1.0, splitParameter);
        const double expected = radius - distance;
        // A cubic quarter of a circle is out by at most 2.8e-4 of its radius: that of the source, and that of the fit.
        const double allowed = 2.8e-4 * (radius + expected);
        const PowerForm f = ToPowerForm(offset.data());
        for (int i = 0; i <= 64; ++i) {
            const point2d p = CubicBezier::Evaluate(f, i / 64.0);
            EXPECT_NEAR(std::sqrt(LengthSquared(p)), expected, allowed) << n << ", " << i;
        }
    }
}

} // namespace
} // namespace ZarnMath
