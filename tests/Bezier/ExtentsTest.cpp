#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath::CubicBezier {

namespace {

using Parameters = std::vector<double>;

constexpr point2d zero{0.0, 0.0};
/// Up and down again, its tangents vertical at both ends.
constexpr Cubic arch = {{{0.0, 0.0}, {0.0, 100.0}, {100.0, 100.0}, {100.0, 0.0}}};

Parameters Vertical(const PowerForm& f)
{
    Parameters parameters;
    GetVerticalTangents(f.a, f.b, f.c, parameters);
    return parameters;
}

Parameters Horizontal(const PowerForm& f)
{
    Parameters parameters;
    GetHorizontalTangents(f.a, f.b, f.c, parameters);
    return parameters;
}

struct ParallelsResult
{
    Parameters parameters;
    bool allParallel;
};

ParallelsResult Parallels(const PowerForm& f, const vector2d& direction)
{
    ParallelsResult result{{}, false};
    GetParallels(f.a, f.b, f.c, direction, result.parameters, result.allParallel);
    return result;
}

/// The curve whose x row of the derivative is A*t^2 + B*t + C. A has to be a triple.
PowerForm WithDerivativeOfX(double A, double B, double C)
{
    return {{A / 3.0, 0.0}, {B / 2.0, 0.0}, {C, 0.0}, zero};
}

PowerForm SwapAxes(const PowerForm& f)
{
    const auto swapped = [](const point2d& p) { return point2d{p.y, p.x}; };
    return {swapped(f.a), swapped(f.b), swapped(f.c), swapped(f.d)};
}

/// Both functions on a derivative, each on its own axis; they have to agree.
Parameters TangentsOf(double A, double B, double C)
{
    const PowerForm f = WithDerivativeOfX(A, B, C);
    const Parameters vertical = Vertical(f);
    EXPECT_EQ(Horizontal(SwapAxes(f)), vertical);
    EXPECT_TRUE(Horizontal(f).empty());
    EXPECT_TRUE(Vertical(SwapAxes(f)).empty());
    return vertical;
}

/// `GetParallels` to the vertical on the same derivative, whose coefficients change their sign.
Parameters ParallelsOf(double A, double B, double C)
{
    const ParallelsResult result = Parallels(WithDerivativeOfX(A, B, C), {0.0, 1.0});
    EXPECT_FALSE(result.allParallel);
    return result.parameters;
}

TEST(Tangents, TwoRootsInAscendingOrder)
{
    EXPECT_EQ(TangentsOf(3.0, -3.0, 0.5625), (Parameters{0.25, 0.75})); // 3*(t - 1/4)*(t - 3/4)
    EXPECT_EQ(TangentsOf(-3.0, 3.0, -0.5625), (Parameters{0.25, 0.75}));
    EXPECT_EQ(ParallelsOf(3.0, -3.0, 0.5625), (Parameters{0.25, 0.75}));
}

TEST(Tangents, OneRootInRange)
{
    EXPECT_EQ(TangentsOf(3.0, -9.0, 3.75), Parameters{0.5}); // 1/2 and 5/2
    EXPECT_EQ(TangentsOf(3.0, 3.0, -2.25), Parameters{0.5}); // 1/2 and -3/2
    EXPECT_EQ(TangentsOf(3.0, -12.0, 11.25), Parameters{});  // 3/2 and 5/2
    EXPECT_EQ(TangentsOf(3.0, -3.0, 3.0), Parameters{});     // no real root
}

TEST(Tangents, DoubleRootIsReportedOnce)
{
    EXPECT_EQ(TangentsOf(3.0, -3.0, 0.75), Parameters{0.5});
    EXPECT_EQ(ParallelsOf(3.0, -3.0, 0.75), Parameters{0.5});
    EXPECT_EQ(TangentsOf(3.0, -9.0, 6.75), Parameters{}); // at 3/2
    EXPECT_EQ(ParallelsOf(3.0, -9.0, 6.75), Parameters{});
}

TEST(Tangents, EndsCountForParallelsAlone)
{
    EXPECT_EQ(TangentsOf(3.0, -6.0, 3.0), Parameters{}); // double at 1
    EXPECT_EQ(ParallelsOf(3.0, -6.0, 3.0), Parameters{1.0});
    EXPECT_EQ(TangentsOf(0.0, 1.0, -1.0), Parameters{}); // linear, at 1
    EXPECT_EQ(ParallelsOf(0.0, 1.0, -1.0), Parameters{1.0});
    EXPECT_EQ(TangentsOf(0.0, 1.0, 0.0), Parameters{}); // linear, at 0
    EXPECT_EQ(ParallelsOf(0.0, 1.0, 0.0), Parameters{0.0});
    EXPECT_EQ(TangentsOf(3.0, -4.5, 1.5), Parameters{0.5}); // 1/2 and 1
    EXPECT_EQ(ParallelsOf(3.0, -4.5, 1.5), (Parameters{0.5, 1.0}));
}

TEST(Tangents, RootAtTheStart)
{
    EXPECT_EQ(TangentsOf(3.0, -1.5, 0.0), Parameters{0.5});
    EXPECT_EQ(ParallelsOf(3.0, -1.5, 0.0), (Parameters{0.0, 0.5}));
    EXPECT_EQ(TangentsOf(3.0, -3.0, 0.0), Parameters{}); // 0 and 1
    EXPECT_EQ(ParallelsOf(3.0, -3.0, 0.0), (Parameters{0.0, 1.0}));
    EXPECT_EQ(ParallelsOf(3.0, -6.0, 0.0), Parameters{0.0}); // 0 and 2
}

TEST(Tangents, DoubleRootAtTheStartIsListedTwice)
{
    EXPECT_EQ(TangentsOf(3.0, 0.0, 0.0), Parameters{});
    const Parameters parameters = ParallelsOf(3.0, 0.0, 0.0);
    ASSERT_EQ(parameters.size(), 2U);
    EXPECT_TRUE(SameBits(parameters[0], 0.0));
    EXPECT_EQ(parameters[1], 0.0); // -B/A, of either sign
}

TEST(Tangents, LinearEquation)
{
    EXPECT_EQ(TangentsOf(0.0, 4.0, -1.0), Parameters{0.25});
    EXPECT_EQ(TangentsOf(0.0, 4.0, -5.0), Parameters{});
    EXPECT_EQ(TangentsOf(0.0, 0.0, 4.0), Parameters{});
    EXPECT_EQ(TangentsOf(0.0, 0.0, 0.0), Parameters{});
}

TEST(Tangents, LeadingCoefficientOfABillionthCountsAsZero)
{
    ASSERT_EQ(1e-9 / 3.0 * 3.0, 1e-9);
    ASSERT_GT(Above(1e-9) / 3.0 * 3.0, 1e-9);
    EXPECT_EQ(TangentsOf(1e-9, -1e-9, 0.1875e-9), Parameters{0.1875e-9 / 1e-9}); // the linear part's
    const Parameters parameters = TangentsOf(Above(1e-9), -1e-9, 0.1875e-9);
    ASSERT_EQ(parameters.size(), 2U);
    EXPECT_NEAR(parameters[0], 0.25, 1e-12);
    EXPECT_NEAR(parameters[1], 0.75, 1e-12);
    EXPECT_EQ(TangentsOf(-1e-9, 1e-9, -0.1875e-9), Parameters{0.1875e-9 / 1e-9});
}

TEST(Tangents, StraightCurvesHaveNone)
{
    const Cubic vertical = {{{5.0, 0.0}, {5.0, 1.0}, {5.0, 2.0}, {5.0, 3.0}}};
    EXPECT_EQ(Vertical(ToPowerForm(vertical.data())), Parameters{});
    EXPECT_EQ(Horizontal(ToPowerForm(vertical.data())), Parameters{});
}

TEST(Tangents, ResultsAreAppended)
{
    Parameters parameters{7.0, 8.0};
    const PowerForm f = ToPowerForm(arch.data());
    GetVerticalTangents(f.a, f.b, f.c, parameters);
    EXPECT_EQ(parameters, (Parameters{7.0, 8.0}));
    GetHorizontalTangents(f.a, f.b, f.c, parameters);
    EXPECT_EQ(parameters, (Parameters{7.0, 8.0, 0.5}));
    bool allParallel = true;
    GetParallels(f.a, f.b, f.c, {0.0, 1.0}, parameters, allParallel);
    EXPECT_EQ(parameters, (Parameters{7.0, 8.0, 0.5, 0.0, 1.0}));
    EXPECT_FALSE(allParallel);
    GetParallels(f.a, f.b, f.c, {0.0, 0.0}, parameters, allParallel);
    EXPECT_EQ(parameters, (Parameters{7.0, 8.0, 0.5, 0.0, 1.0}));
    EXPECT_TRUE(allParallel);
}

TEST(Tangents, OfTheArch)
{
    const PowerForm f = ToPowerForm(arch.data());
    EXPECT_EQ(Vertical(f), Parameters{});
    EXPECT_EQ(Horizontal(f), Parameters{0.5});
    EXPECT_EQ(Parallels(f, {0.0, 1.0}).parameters, (Parameters{0.0, 1.0}));
    EXPECT_EQ(Parallels(f, {0.0, -3.0}).parameters, (Parameters{0.0, 1.0}));
}

TEST(GetParallels, StraightCurveIsParallelToItself)
{
    const Cubic line = {{{0.0, 0.0}, {100.0, 0.0}, {200.0, 0.0}, {300.0, 0.0}}};
    const ParallelsResult along = Parallels(ToPowerForm(line.data()), {1.0, 0.0});
    EXPECT_TRUE(along.allParallel);
    EXPECT_EQ(along.parameters, Parameters{});
    const ParallelsResult across = Parallels(ToPowerForm(line.data()), {0.0, 1.0});
    EXPECT_FALSE(across.allParallel);
    EXPECT_EQ(across.parameters, Parameters{});
}

TEST(GetParallels, EverythingIsParallelToNothing)
{
    const ParallelsResult result = Parallels(ToPowerForm(arch.data()), {0.0, 0.0});
    EXPECT_TRUE(result.allParallel);
    EXPECT_EQ(result.parameters, Parameters{});
}

TEST(GetParallels, EachCoefficientMayReachTheTolerance)
{
    const double e = DBL_EPSILON;
    const vector2d right{1.0, 0.0};
    ASSERT_EQ(e / 3.0 * 3.0, e);
    const double moreThanAThird = Above(Above(e / 3.0));
    ASSERT_GT(moreThanAThird * 3.0, e);
    EXPECT_TRUE(Parallels({{0.0, e / 3.0}, {0.0, e / 2.0}, {0.0, -e}, zero}, right).allParallel);
    EXPECT_FALSE(Parallels({{0.0, moreThanAThird}, zero, zero, zero}, right).allParallel);
    EXPECT_FALSE(Parallels({zero, {0.0, Above(e / 2.0)}, zero, zero}, right).allParallel);
    EXPECT_FALSE(Parallels({zero, zero, {0.0, Above(e)}, zero}, right).allParallel);
    EXPECT_FALSE(Parallels({zero, zero, {0.0, nan}, zero}, right).allParallel);
}

double AreaUnder(const Cubic& curve)
{
    const auto [a, b, c, d] = ToPowerForm(curve.data());
    return GetAreaUnderBezier(a, b, c, d);
}

TEST(GetAreaUnderBezier, TriangleUnderAStraightCurve)
{
    const Cubic up = {{{0.0, 0.0}, {1.0, 1.0}, {2.0, 2.0}, {3.0, 3.0}}};
    const Cubic down = {{{3.0, 3.0}, {2.0, 2.0}, {1.0, 1.0}, {0.0, 0.0}}};
    EXPECT_EQ(AreaUnder(up), 4.5);
    EXPECT_EQ(AreaUnder(down), -4.5);
}

TEST(GetAreaUnderBezier, SignFollowsTheTravel)
{
    const Cubic above = {{{0.0, 2.0}, {1.0, 2.0}, {2.0, 2.0}, {3.0, 2.0}}};
    const Cubic below = {{{0.0, -2.0}, {1.0, -2.0}, {2.0, -2.0}, {3.0, -2.0}}};
    EXPECT_EQ(AreaUnder(above), 6.0);
    EXPECT_EQ(AreaUnder(below), -6.0);
}

TEST(GetAreaUnderBezier, Arch)
{
    // y = 300*t*(1 - t) and x' = 600*t*(1 - t); the integral of t^2*(1 - t)^2 is 1/30.
    EXPECT_DOUBLE_EQ(AreaUnder(arch), 6000.0);
}

struct Box
{
    double minX = 0.0;
    double minY = 0.0;
    double maxX = 0.0;
    double maxY = 0.0;

    friend bool operator==(const Box&, const Box&) = default;
};

Box TightBox(const PowerForm& f)
{
    Box box;
    GetTightBounds(f.a, f.b, f.c, f.d, box.minX, box.minY, box.maxX, box.maxY);
    return box;
}

TEST(GetTightBounds, OfTheArch)
{
    EXPECT_EQ(TightBox(ToPowerForm(arch.data())), (Box{0.0, 0.0, 100.0, 75.0}));
}

TEST(GetTightBounds, WithoutInteriorExtremesIsTheBoxOfTheEnds)
{
    const Cubic rising = {{{1.0, 2.0}, {3.0, 3.0}, {4.0, 5.0}, {7.0, 6.0}}};
    EXPECT_EQ(TightBox(ToPowerForm(rising.data())), (Box{1.0, 2.0, 7.0, 6.0}));
    const Cubic falling = {{{7.0, 6.0}, {4.0, 5.0}, {3.0, 3.0}, {1.0, 2.0}}};
    EXPECT_EQ(TightBox(ToPowerForm(falling.data())), (Box{1.0, 2.0, 7.0, 6.0}));
}

TEST(GetTightBounds, ExtremesOnEachSide)
{
    // x runs over [0, 1] and out to both sides by 3*t*(1 - t)*(1 - 2*t) times a factor, y stays on a parabola.
    const Cubic s = {{{0.0, 0.0}, {-4.0, -4.0}, {5.0, -4.0}, {1.0, 0.0}}};
    const Box box = TightBox(ToPowerForm(s.data()));
    EXPECT_DOUBLE_EQ(box.minY, -3.0);
    EXPECT_EQ(box.maxY, 0.0);
    EXPECT_LT(box.minX, -0.5);
    EXPECT_NEAR(box.minX + box.maxX, 1.0, 1e-14);
}

TEST(GetTightBounds, OfAPoint)
{
    EXPECT_EQ(TightBox({zero, zero, zero, {3.0, -4.0}}), (Box{3.0, -4.0, 3.0, -4.0}));
}

TEST(GetTightBounds, StartsFromTheEvaluationAtZero)
{
    const Box box = TightBox({{infinity, 0.0}, zero, zero, {1.0, 2.0}}); // infinity * 0 is NaN
    EXPECT_TRUE(std::isnan(box.minX));
    EXPECT_TRUE(std::isnan(box.maxX));
    EXPECT_EQ(box.minY, 2.0);
    EXPECT_EQ(box.maxY, 2.0);
}

TEST(GetTightBounds, OfTwoZerosTheFirstStays)
{
    // 3*t^2 - 3*t - 0 begins at -0.0, dips below zero and ends at +0.0.
    const Box box = TightBox({zero, {3.0, 3.0}, {-3.0, -3.0}, {-0.0, -0.0}});
    EXPECT_TRUE(SameBits(box.maxX, -0.0));
    EXPECT_TRUE(SameBits(box.maxY, -0.0));
}

TEST(GetTightBounds, ResultsMayBeTheCoefficients)
{
    PowerForm f = ToPowerForm(arch.data());
    GetTightBounds(f.a, f.b, f.c, f.d, f.a.x, f.a.y, f.b.x, f.b.y);
    EXPECT_EQ(f.a, (point2d{0.0, 0.0}));
    EXPECT_EQ(f.b, (point2d{100.0, 75.0}));
}

TEST(MapToBezier, OffsetsToTheLeft)
{
    const Cubic line = {{{0.0, 0.0}, {1.0, 0.0}, {2.0, 0.0}, {3.0, 0.0}}};
    EXPECT_EQ(MapToBezier(line.data(), 0.5, 2.0, 3.0), (point2d{1.5, 6.0}));
    EXPECT_EQ(MapToBezier(line.data(), 0.5, -2.0, 3.0), (point2d{1.5, -6.0}));
    EXPECT_EQ(MapToBezier(line.data(), 0.5, -2.0, -3.0), (point2d{1.5, 6.0}));
    EXPECT_EQ(MapToBezier(line.data(), 2.0, 1.0, 1.0), (point2d{6.0, 1.0}));
}

TEST(MapToBezier, NoDistanceIsThePointItself)
{
    for (const double t : {0.0, 0.3, 1.0}) {
        const point2d p = Evaluate(ToPowerForm(arch.data()), t);
        EXPECT_EQ(MapToBezier(arch.data(), t, 0.0, 5.0), p);
        EXPECT_EQ(MapToBezier(arch.data(), t, 5.0, 0.0), p);
    }
}

TEST(MapToBezier, OfAPointGoesUp)
{
    const Cubic point = {{{5.0, 6.0}, {5.0, 6.0}, {5.0, 6.0}, {5.0, 6.0}}};
    EXPECT_EQ(MapToBezier(point.data(), 0.5, 2.0, 1.0), (point2d{5.0, 8.0}));
}

TEST(MapToBezier, DirectionTooShortToNormaliseStaysShort)
{
    const Cubic tiny = {{{0.0, 0.0}, {0x1p-30, 0.0}, {0x1p-29, 0.0}, {3.0 * 0x1p-30, 0.0}}};
    const point2d mapped = MapToBezier(tiny.data(), 0.5, 1.0, 1.0);
    EXPECT_NEAR(mapped.y, 3.0 * 0x1p-30, 1e-14); // not 1
}

/// The relative size of the first coefficient of a quadratic, where it is taken as linear although it is not.
bool IsTinyLeading(double A)
{
    return A != 0.0 && std::fabs(A) <= 1e-9;
}

TEST(ExtentsProperties, TangentsHaveTheirDirection)
{
    RandomSource random(1);
    int found = 0;
    int tinyLeading = 0;
    for (int n = 0; n < 6000; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const PowerForm f = ToPowerForm(curve.data());
        const vector2d u = AsVector(random.Point(1.0));
        if (IsTinyLeading(f.a.x * 3.0) || IsTinyLeading(f.a.y * 3.0) || IsTinyLeading(Cross(u, f.a) * 3.0)) {
            ++tinyLeading;
            continue;
        }
        const auto expectZero = [&](double value, double t) {
            ++found;
            EXPECT_NEAR(value / extent, 0.0, 1e-6) << n << " at " << t;
        };
        for (const double t : Vertical(f))
            expectZero(Derivative(f.a, f.b, f.c, t).x, t);
        for (const double t : Horizontal(f))
            expectZero(Derivative(f.a, f.b, f.c, t).y, t);
        const Parameters parallels = Parallels(f, u).parameters;
        EXPECT_LE(parallels.size(), 2U);
        EXPECT_TRUE(std::is_sorted(parallels.begin(), parallels.end()));
        for (const double t : parallels)
            expectZero(Cross(u, Derivative(f.a, f.b, f.c, t)), t);
    }
    EXPECT_GT(found, 5000);
    EXPECT_LT(tinyLeading, 1200);
    RecordProperty("found", found);
    RecordProperty("tinyLeading", tinyLeading);
}

TEST(ExtentsProperties, EveryChangeOfDirectionIsFound)
{
    RandomSource random(2);
    int found = 0;
    int tinyLeading = 0;
    for (int n = 0; n < 4000; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const PowerForm f = ToPowerForm(curve.data());
        if (IsTinyLeading(f.a.x * 3.0)) {
            ++tinyLeading;
            continue;
        }
        const Parameters vertical = Vertical(f);
        constexpr int steps = 256;
        for (int i = 0; i < steps; ++i) {
            const double low = static_cast<double>(i) / steps;
            const double high = static_cast<double>(i + 1) / steps;
            const double before = Derivative(f.a, f.b, f.c, low).x / extent;
            const double after = Derivative(f.a, f.b, f.c, high).x / extent;
            if (before * after >= 0.0 || std::min(std::fabs(before), std::fabs(after)) < 1e-9)
                continue; // a change by rounding alone, as where the tangent is vertical at an end
            ++found;
            EXPECT_TRUE(std::any_of(vertical.begin(), vertical.end(),
                                    [=](double t) { return low - 1e-6 <= t && t <= high + 1e-6; }))
                << n << " at " << low;
        }
    }
    EXPECT_GT(found, 1000);
    RecordProperty("found", found);
    RecordProperty("tinyLeading", tinyLeading);
}

TEST(ExtentsProperties, TightBoundsHoldTheCurveAndTouchIt)
{
    RandomSource random(3);
    int tinyLeading = 0;
    for (int n = 0; n < 3000; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const PowerForm f = ToPowerForm(curve.data());
        if (IsTinyLeading(f.a.x * 3.0) || IsTinyLeading(f.a.y * 3.0)) {
            ++tinyLeading; // an extreme is missed
            continue;
        }
        const Box box = TightBox(f);
        Box sampled{infinity, infinity, -infinity, -infinity};
        for (int i = 0; i <= 500; ++i) {
            const point2d p = Evaluate(f, i / 500.0);
            sampled = {std::min(sampled.minX, p.x), std::min(sampled.minY, p.y), std::max(sampled.maxX, p.x),
                       std::max(sampled.maxY, p.y)};
        }
        const double rounding = extent * 1e-12;
        const double sampling = extent * 1e-4;
        EXPECT_LE(box.minX, sampled.minX + rounding) << n;
        EXPECT_LE(box.minY, sampled.minY + rounding) << n;
        EXPECT_GE(box.maxX, sampled.maxX - rounding) << n;
        EXPECT_GE(box.maxY, sampled.maxY - rounding) << n;
        EXPECT_GE(box.minX, sampled.minX - sampling) << n;
        EXPECT_GE(box.minY, sampled.minY - sampling) << n;
        EXPECT_LE(box.maxX, sampled.maxX + sampling) << n;
        EXPECT_LE(box.maxY, sampled.maxY + sampling) << n;
    }
    EXPECT_LT(tinyLeading, 500);
    RecordProperty("tinyLeading", tinyLeading);
}

/// Twice the signed area of a polygon is the sum of the crosses of its corners; counter-clockwise is positive.
double PolygonArea(const std::vector<point2d>& polygon)
{
    double twice = 0.0;
    for (std::size_t i = 0; i < polygon.size(); ++i)
        twice += Cross(polygon[i] - polygon[0], polygon[(i + 1) % polygon.size()] - polygon[0]);
    return twice / 2.0;
}

TEST(ExtentsProperties, AreaOfAClosedOutlineIsThatOfItsFlattening)
{
    RandomSource random(4);
    for (int n = 0; n < 1000; ++n) {
        const double extent = random.Magnitude();
        const int segments = random.Integer(1, 5);
        const point2d origin = random.Point(extent);
        point2d start = origin;
        double area = 0.0;
        std::vector<point2d> polygon;
        for (int i = 0; i < segments; ++i) {
            const point2d end = i + 1 < segments ? random.Point(extent) : origin;
            const Cubic curve = {{start, random.Point(extent), random.Point(extent), end}};
            area += AreaUnder(curve);
            for (int k = 0; k < 400; ++k)
                polygon.push_back(Evaluate(ToPowerForm(curve.data()), k / 400.0));
            start = end;
        }
        EXPECT_NEAR(area, -PolygonArea(polygon), 1e-4 * extent * extent) << n;
    }
}

TEST(ExtentsProperties, AreaOfACircleMadeOfFourArcs)
{
    RandomSource random(5);
    for (int n = 0; n < 500; ++n) {
        const Cubic first = random.Curve(Shape::Arc, random.Magnitude());
        // The centre of the right isosceles triangle on the chord, whose legs are the radii.
        const vector2d chord = first[3] - first[0];
        const point2d centre = first[0] + chord * 0.5 + Perpendicular(chord) * 0.5;
        double area = 0.0;
        Cubic arc = first;
        for (int i = 0; i < 4; ++i) {
            area += AreaUnder(arc);
            for (point2d& p : arc)
                p = centre + Perpendicular(p - centre);
        }
        const double radiusSquared = LengthSquared(chord) / 2.0;
        EXPECT_NEAR(area / radiusSquared, -3.141592653589793, 1e-3) << n; // counter-clockwise
    }
}

TEST(ExtentsProperties, AreaChangesItsSignWithTheTravel)
{
    RandomSource random(6);
    for (int n = 0; n < 3000; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const Cubic reversed = {{curve[3], curve[2], curve[1], curve[0]}};
        EXPECT_NEAR(AreaUnder(curve), -AreaUnder(reversed), 1e-12 * extent * extent) << n;
    }
}

TEST(ExtentsProperties, MappedPointsLieAtTheirDistanceOnTheirSide)
{
    RandomSource random(7);
    int compared = 0;
    for (int n = 0; n < 3000; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const PowerForm f = ToPowerForm(curve.data());
        const double t = random.Uniform(0.0, 1.0);
        const vector2d tangent = Derivative(f.a, f.b, f.c, t);
        if (LengthSquared(tangent) < 1e-14)
            continue;
        ++compared;
        const double distance = random.Uniform(-2.0, 2.0) * extent;
        const vector2d away = MapToBezier(curve.data(), t, distance / 4.0, 4.0) - Evaluate(f, t);
        EXPECT_NEAR(Cross(Normalize(tangent), away), distance, 1e-12 * extent) << n;
        EXPECT_NEAR(Dot(Normalize(tangent), away), 0.0, 1e-12 * extent) << n;
    }
    EXPECT_GT(compared, 2500);
}

} // namespace

} // namespace ZarnMath::CubicBezier
