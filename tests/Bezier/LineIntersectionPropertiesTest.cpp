// What holds of every crossing with a line, on thousands of curves of all shapes and sizes. Where a known loss
// breaks a rule, the loss is named, counted, and kept rare.
#include "ZarnMath/Bezier.h"

#include "tests/Bezier/CurveMeasures.h"

#include <gtest/gtest.h>

namespace ZarnMath::CubicBezier {

namespace {

constexpr std::uint64_t seed = 20261120;

TEST(LineIntersectionProperties, ReportsPointsOnTheCurveAndOnTheLine)
{
    RandomSource random(seed);
    int crossings = 0;
    int multiple = 0;
    int takenForLinear = 0;
    for (int i = 0; i < 20000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const auto line = AnyLine(random, extent);
        std::vector<double> ts;
        std::vector<double> us;
        const bool found = FindBezierLineIntersection(curve.data(), line.data(), ts, us, i % 2 == 0);
        ASSERT_EQ(found, !ts.empty());
        ASSERT_EQ(ts.size(), us.size());
        ASSERT_LE(ts.size(), 4U);
        if (IsTakenForLinear(curve, line)) {
            ++takenForLinear;
            continue;
        }
        const PowerForm f = ToPowerForm(curve.data());
        for (std::size_t k = 0; k < ts.size(); ++k, ++crossings) {
            ASSERT_TRUE(IsInUnit(ts[k]));
            const vector2d along = line[1] - line[0];
            const double distance = Distance(At(curve, ts[k]), line[0] + along * us[k]);
            // The root finder stops at a step of 1e-7; where the curve grazes the line, a root of higher order stays
            // that far off, and the point with it.
            const vector2d velocity = Derivative(f.a, f.b, f.c, ts[k]);
            const bool isMultiple = std::fabs(Cross(velocity, along)) < 1e-4 * extent * std::sqrt(LengthSquared(along));
            multiple += isMultiple ? 1 : 0;
            ASSERT_LE(distance, (isMultiple ? 1e-6 : 1e-9) * extent) << i;
        }
    }
    RecordProperty("crossings", crossings);
    RecordProperty("multiple", multiple);
    RecordProperty("takenForLinear", takenForLinear);
    EXPECT_GT(crossings, 5000);
    EXPECT_LT(multiple, crossings / 20);
    EXPECT_LT(takenForLinear, 500);
}

TEST(LineIntersectionProperties, CrossesAnOddNumberOfTimesToTheOtherSide)
{
    RandomSource random(seed);
    int opposite = 0;
    for (int i = 0; i < 20000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const auto line = AnyLine(random, extent);
        const vector2d along = line[1] - line[0];
        const double start = Cross(curve[0] - line[0], along);
        const double end = Cross(curve[3] - line[0], along);
        const double size = extent * std::sqrt(LengthSquared(along));
        if (!(std::fabs(start) > 1e-6 * size && std::fabs(end) > 1e-6 * size) || IsTakenForLinear(curve, line))
            continue;
        std::vector<double> ts;
        std::vector<double> us;
        FindBezierLineIntersection(curve.data(), line.data(), ts, us, false);
        const bool isOpposite = (start < 0.0) != (end < 0.0);
        opposite += isOpposite ? 1 : 0;
        ASSERT_EQ(ts.size() % 2 == 1, isOpposite) << i;
    }
    EXPECT_GT(opposite, 2000);
}

TEST(LineIntersectionProperties, OfAVerticalLineIsThatAtItsX)
{
    RandomSource random(seed);
    for (int i = 0; i < 10000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const double x = random.Uniform(-extent, extent);
        const point2d line[2] = {{x, 0.0}, {x, 1.0}};
        const bool includeEndpoints = i % 2 == 0;
        std::vector<double> ts;
        std::vector<double> us;
        std::vector<double> atX;
        FindBezierLineIntersection(curve.data(), line, ts, us, includeEndpoints);
        ASSERT_EQ(FindBezierIntersectionsAtX(curve.data(), x, atX, includeEndpoints), !ts.empty());
        ASSERT_EQ(atX, ts);
    }
}

TEST(LineIntersectionProperties, TellsAsMuchOfTheSegmentAsOfTheLine)
{
    RandomSource random(seed);
    int crossed = 0;
    for (int i = 0; i < 20000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const auto line = AnyLine(random, extent);
        std::vector<double> ts;
        std::vector<double> us;
        FindBezierLineIntersection(curve.data(), line.data(), ts, us, false);
        const bool expected = std::any_of(us.begin(), us.end(), IsInUnit);
        ASSERT_EQ(DoesBezierIntersectLineSegment(curve.data(), line.data()), expected);
        crossed += expected ? 1 : 0;
    }
    EXPECT_GT(crossed, 1000);
}

/// The distance from a segment to a curve, from above: of the nearest of many points.
double SampledDistance(const Cubic& curve, const std::array<point2d, 2>& line)
{
    constexpr int samples = 4000;
    const PowerForm f = ToPowerForm(curve.data());
    const vector2d along = line[1] - line[0];
    double nearest = std::numeric_limits<double>::max();
    for (int i = 0; i <= samples; ++i) {
        const point2d p = Evaluate(f, static_cast<double>(i) / samples);
        const double s = std::clamp(Dot(p - line[0], along) / LengthSquared(along), 0.0, 1.0);
        nearest = std::min(nearest, Distance(line[0] + along * s, p));
    }
    return nearest;
}

TEST(PredicateProperties, AFatLineThatTouchesIsNear)
{
    RandomSource random(seed);
    int touching = 0;
    for (int i = 0; i < 8000; ++i) {
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(random.AnyShape(), extent);
        const auto line = AnyLine(random, extent);
        const double halfWidth = random.Uniform(0.0, 0.2 * extent);
        const bool touches = DoesFatlineIntersectBezier(curve.data(), line[0], line[1], halfWidth);
        ASSERT_EQ(DoesFatlineIntersectBezier(curve.data(), line[1], line[0], halfWidth), touches) << i;
        if (!touches || IsTakenForLinear(curve, line))
            continue;
        ++touching;
        ASSERT_LT(SampledDistance(curve, line), halfWidth + 0.01 * extent) << i;
    }
    EXPECT_GT(touching, 1000);
    RecordProperty("touching", touching);
}

} // namespace

} // namespace ZarnMath::CubicBezier
