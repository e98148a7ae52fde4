#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include "tests/Bits.h"
#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath::CubicBezier {

namespace {

constexpr point2d zero{0.0, 0.0};
constexpr double largest = 1.7976931348623157e+308;

/// (s^2 + 10*s^3, s^3)*size with s = t - place: a cusp whose two sides differ. The derivative at `place` is exactly 0 for
/// the dyadic places used here.
PowerForm CuspAt(double place, double size)
{
    const double p = place;
    return {{10.0 * size, size},
            {(1.0 - 30.0 * p) * size, -3.0 * p * size},
            {(30.0 * p * p - 2.0 * p) * size, 3.0 * p * p * size},
            {(p * p - 10.0 * p * p * p) * size, -p * p * p * size}};
}

/// Its curvature at a distance s from the cusp, for size 1.
double CurvatureBesideCusp(double s)
{
    const double x = 2.0 * s + 30.0 * s * s;
    const double y = 3.0 * s * s;
    return (x * 6.0 * s - y * (2.0 + 60.0 * s)) / std::pow(x * x + y * y, 1.5);
}

TEST(GetCurvatureAt, StraightLine)
{
    double curvature = sentinel<double>;
    EXPECT_TRUE(GetCurvatureAt(0.5, zero, zero, {1.0, 0.0}, curvature));
    EXPECT_EQ(curvature, 0.0);
}

TEST(GetCurvatureAt, PointCurveHasNone)
{
    double curvature = sentinel<double>;
    EXPECT_FALSE(GetCurvatureAt(0.5, zero, zero, zero, curvature));
    EXPECT_TRUE(SameBits(curvature, sentinel<double>));
}

TEST(GetCurvatureAt, IsPositiveToTheLeft)
{
    double curvature = 0.0;
    EXPECT_TRUE(GetCurvatureAt(0.0, zero, {0.0, 1.0}, {1.0, 0.0}, curvature)); // (t, t^2)
    EXPECT_EQ(curvature, 2.0);
    EXPECT_TRUE(GetCurvatureAt(0.0, zero, {0.0, -1.0}, {1.0, 0.0}, curvature));
    EXPECT_EQ(curvature, -2.0);
    EXPECT_TRUE(GetCurvatureAt(1.0, zero, {0.0, 1.0}, {1.0, 0.0}, curvature));
    EXPECT_DOUBLE_EQ(curvature, 2.0 / (5.0 * std::sqrt(5.0)));
}

TEST(GetCurvatureAt, OnlyAVanishingCubeOfTheSpeedFails)
{
    double curvature = sentinel<double>;
    EXPECT_TRUE(GetCurvatureAt(0.0, zero, zero, {1e-100, 0.0}, curvature));
    EXPECT_EQ(curvature, 0.0);
    curvature = sentinel<double>;
    EXPECT_FALSE(GetCurvatureAt(0.0, zero, {0.0, 1.0}, {1e-109, 0.0}, curvature)); // the cube underflows
    EXPECT_FALSE(GetCurvatureAt(0.0, zero, {0.0, 1.0}, {nan, 0.0}, curvature));
    EXPECT_TRUE(SameBits(curvature, sentinel<double>));
}

TEST(GetCurvatureRadiusAt, StraightAndPointCurvesAreInfinite)
{
    double radius = sentinel<double>;
    EXPECT_FALSE(GetCurvatureRadiusAt(0.5, zero, zero, {1.0, 0.0}, radius));
    EXPECT_EQ(radius, largest);
    radius = sentinel<double>;
    EXPECT_FALSE(GetCurvatureRadiusAt(0.5, zero, zero, zero, radius));
    EXPECT_EQ(radius, largest);
}

TEST(GetCurvatureRadiusAt, CuspIsInfinite)
{
    const PowerForm f = CuspAt(0.75, 1.0);
    double radius = sentinel<double>;
    EXPECT_FALSE(GetCurvatureRadiusAt(0.75, f.a, f.b, f.c, radius));
    EXPECT_EQ(radius, largest);
}

TEST(GetCurvatureRadiusAt, HasTheSignOfTheTurn)
{
    double radius = 0.0;
    EXPECT_TRUE(GetCurvatureRadiusAt(0.0, zero, {0.0, 1.0}, {1.0, 0.0}, radius));
    EXPECT_EQ(radius, 0.5);
    EXPECT_TRUE(GetCurvatureRadiusAt(0.0, zero, {0.0, -1.0}, {1.0, 0.0}, radius));
    EXPECT_EQ(radius, -0.5);
}

TEST(GetCurvatureRadiusAt, NanIsNotStraight)
{
    double radius = 0.0;
    EXPECT_TRUE(GetCurvatureRadiusAt(0.0, zero, {0.0, 1.0}, {nan, 0.0}, radius));
    EXPECT_TRUE(std::isnan(radius));
}

TEST(SafeBezierCurvature, IsPlainCurvatureWhereThereIsOne)
{
    EXPECT_EQ(SafeBezierCurvature(0.0, zero, {0.0, 1.0}, {1.0, 0.0}), 2.0);
    EXPECT_EQ(SafeBezierCurvature(0.5, zero, zero, {1.0, 0.0}), 0.0);
}

TEST(SafeBezierCurvature, StepsTowardTheMiddle)
{
    for (const double place : {0.0, 0.25, 0.5}) {
        const PowerForm f = CuspAt(place, 1.0);
        const double expected = CurvatureBesideCusp(1e-05);
        EXPECT_NEAR(SafeBezierCurvature(place, f.a, f.b, f.c), expected, expected * 1e-4) << place;
    }
    for (const double place : {0.625, 0.75, 1.0}) {
        const PowerForm f = CuspAt(place, 1.0);
        const double expected = CurvatureBesideCusp(-1e-05);
        EXPECT_NEAR(SafeBezierCurvature(place, f.a, f.b, f.c), expected, expected * 1e-4) << place;
    }
    // What tells the sides apart.
    EXPECT_GT(CurvatureBesideCusp(-1e-05), CurvatureBesideCusp(1e-05) * 1.0008);
}

TEST(SafeBezierCurvature, GivesUpAfterOneStep)
{
    EXPECT_EQ(SafeBezierCurvature(0.5, zero, zero, zero), 0.0);
    EXPECT_EQ(SafeBezierCurvature(0.75, zero, zero, zero), 0.0);
    EXPECT_EQ(SafeBezierCurvature(0.0, {0.0, 1e-104}, {1e-104, 0.0}, zero), 0.0); // the cube underflows
    EXPECT_EQ(SafeBezierCurvature(nan, {0.0, 1.0}, {1.0, 0.0}, zero), 0.0);
}

TEST(BezierInflectionPoints, AreNotSorted)
{
    double out[2]{};
    EXPECT_EQ(BezierInflectionPoints({1.0, 0.0}, {0.0, 1.0}, {-0.5625, -1.0}, out), 2); // -6*(t^2 - t + 3/16)
    EXPECT_DOUBLE_EQ(out[0], 0.25);
    EXPECT_DOUBLE_EQ(out[1], 0.75);
    EXPECT_EQ(BezierInflectionPoints({-1.0, 0.0}, {0.0, 1.0}, {0.5625, -1.0}, out), 2); // 6*(t^2 - t + 3/16)
    EXPECT_DOUBLE_EQ(out[0], 0.75);
    EXPECT_DOUBLE_EQ(out[1], 0.25);
}

TEST(BezierInflectionPoints, AreNotFiltered)
{
    double out[2]{};
    EXPECT_EQ(BezierInflectionPoints({1.0, 0.0}, {0.0, 1.0}, {6.0, -1.0}, out), 2); // -6*(t^2 - t - 2)
    EXPECT_DOUBLE_EQ(out[0], -1.0);
    EXPECT_DOUBLE_EQ(out[1], 2.0);
}

TEST(BezierInflectionPoints, DoubleRootCountsTwice)
{
    double out[2]{};
    EXPECT_EQ(BezierInflectionPoints({1.0, 0.0}, {0.0, 1.0}, {-0.75, -1.0}, out), 2);
    EXPECT_DOUBLE_EQ(out[0], 0.5);
    EXPECT_DOUBLE_EQ(out[1], 0.5);
}

TEST(BezierInflectionPoints, NegativeDiscriminantWritesNothing)
{
    Guarded<double, 2> out;
    EXPECT_EQ(BezierInflectionPoints({1.0, 0.0}, {0.0, 1.0}, {-1.0, -1.0}, out.data()), 0);
    EXPECT_TRUE(out.IsUntouchedFrom(0));
}

TEST(BezierInflectionPoints, WithoutQuadraticTermCountTwoAll)
{
    double out[2]{};
    EXPECT_EQ(BezierInflectionPoints(zero, {0.0, 1.0}, {1.0, 0.0}, out), 2);
    EXPECT_TRUE(std::isnan(out[0]));
    EXPECT_TRUE(std::isnan(out[1]));
    out[0] = out[1] = 0.0;
    EXPECT_EQ(BezierInflectionPoints({0.0, 1.0}, {0.0, 1.0}, {1.0, 0.0}, out), 2); // 6*t + 2
    EXPECT_TRUE(std::isnan(out[0]));
    EXPECT_EQ(out[1], -infinity);
    EXPECT_EQ(BezierInflectionPoints({nan, 0.0}, {0.0, 1.0}, {1.0, 0.0}, out), 2);
    EXPECT_TRUE(std::isnan(out[0]));
}

TEST(FindCurvatureMinMax, VertexOfAParabola)
{
    Guarded<double, 11> out;
    ASSERT_EQ(FindCurvatureMinMax(zero, {0.0, 1.0}, {1.0, -0.625}, out.data()), 1); // (t, (t - 0.3125)^2 + ...)
    EXPECT_NEAR(out[0], 0.3125, 1e-9);
    EXPECT_TRUE(out.IsUntouchedFrom(1));
}

TEST(FindCurvatureMinMax, EndsAreExcluded)
{
    Guarded<double, 11> out;
    EXPECT_EQ(FindCurvatureMinMax(zero, {0.0, 1.0}, {1.0, 0.0}, out.data()), 0);  // slowest at 0
    EXPECT_EQ(FindCurvatureMinMax(zero, {0.0, 1.0}, {1.0, -2.0}, out.data()), 0); // slowest at 1
    EXPECT_TRUE(out.IsUntouchedFrom(1));
}

TEST(FindCurvatureMinMax, ConstantSpeedHasNoExtreme)
{
    Guarded<double, 11> out;
    EXPECT_EQ(FindCurvatureMinMax(zero, zero, {3.0, 4.0}, out.data()), 0);
    EXPECT_EQ(FindCurvatureMinMax(zero, zero, zero, out.data()), 0);
    EXPECT_TRUE(out.IsUntouchedFrom(0));
}

TEST(FindCurvatureMinMax, CurvatureItselfDoesNotEnter)
{
    // A straight line at a changing pace, (t^3/3 - t^2/4 + t, 0): curvature is 0, the speed t^2 - t/2 + 1 is least at 1/4.
    Guarded<double, 11> out;
    ASSERT_EQ(FindCurvatureMinMax({1.0 / 3.0, 0.0}, {-0.25, 0.0}, {1.0, 0.0}, out.data()), 1);
    EXPECT_NEAR(out[0], 0.25, 1e-7);
}

TEST(SafeBezierTangent, IsTheDerivativeDownToTheTolerance)
{
    const double edge = 0x1p-26; // whose square is the tolerance
    EXPECT_EQ(SafeBezierTangent(0.25, zero, {0.0, 1.0}, {1.0, 0.0}, zero), (vector2d{1.0, 0.5}));
    EXPECT_EQ(SafeBezierTangent(0.0, zero, zero, {edge, 0.0}, zero), (vector2d{edge, 0.0}));
    const vector2d chord = SafeBezierTangent(0.0, zero, zero, {Below(edge), 0.0}, zero);
    EXPECT_NEAR(chord.x, edge * 0.999998, edge * 1e-9); // from 1e-06 to 0.999999
}

TEST(SafeBezierTangent, PointCurveRunsToTheRight)
{
    EXPECT_EQ(SafeBezierTangent(0.5, zero, zero, zero, {3.0, 4.0}), (vector2d{1.0, 0.0}));
}

TEST(SafeBezierTangent, StepsTowardTheMiddle)
{
    // The chord is 1000*1e-10 long, in the direction of travel: away from the cusp before it, toward it behind.
    for (const double place : {0.0, 0.25, 0.5}) {
        const PowerForm f = CuspAt(place, 1000.0);
        EXPECT_NEAR(SafeBezierTangent(place, f.a, f.b, f.c, f.d).x, 1e-7, 1e-10) << place;
    }
    for (const double place : {0.625, 0.75, 1.0}) {
        const PowerForm f = CuspAt(place, 1000.0);
        EXPECT_NEAR(SafeBezierTangent(place, f.a, f.b, f.c, f.d).x, -1e-7, 1e-10) << place;
    }
}

TEST(SafeBezierTangent, ChordOfACoincidentStartNeedsALargeCurve)
{
    const vector2d atLarge = SafeBezierTangent(0.0, {0.0, 1000.0}, {150.0, 0.0}, zero, zero);
    EXPECT_NEAR(atLarge.x, 1.5e-8, 1e-12);
    EXPECT_NEAR(atLarge.y, 0.0, 2e-12);
    const vector2d atSmall = SafeBezierTangent(0.0, {0.0, 1000.0}, {148.0, 0.0}, zero, zero);
    EXPECT_NEAR(atSmall.x, 148.0, 1e-3); // the direction of the whole curve
    EXPECT_NEAR(atSmall.y, 1000.0, 1e-2);
}

TEST(SafeBezierTangent, LastChordIsReturnedHoweverShort)
{
    // 3*t^2*(1 - t)*10 runs out and back: P0 = P1 = P3.
    const vector2d chord = SafeBezierTangent(0.0, {-30.0, 0.0}, {30.0, 0.0}, zero, zero);
    EXPECT_NEAR(chord.x, 3e-5, 1e-9);
    EXPECT_EQ(chord.y, 0.0);
}

struct Sample
{
    PowerForm f;
    double t;
    double extent;
};

template <typename Check>
void ForManyCurves(std::uint64_t seed, int count, Check check)
{
    RandomSource random(seed);
    for (int n = 0; n < count; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        SCOPED_TRACE(testing::Message() << "curve " << n << ", shape " << static_cast<int>(shape) << ", extent "
                                        << extent);
        check(Sample{ToPowerForm(curve.data()), random.Uniform(0.0, 1.0), extent});
    }
}

double SpeedAt(const PowerForm& f, double t)
{
    return std::sqrt(LengthSquared(Derivative(f.a, f.b, f.c, t)));
}

TEST(CurvatureProperties, AgreesWithFiniteDifferences)
{
    int compared = 0;
    ForManyCurves(1, 6000, [&](const Sample& s) {
        constexpr double h = 1e-4;
        const auto& [a, b, c, d] = s.f;
        double curvature = 0.0;
        if (SpeedAt(s.f, s.t) < 0.1 * s.extent || !GetCurvatureAt(s.t, a, b, c, curvature))
            return;
        ++compared;
        const vector2d before = Derivative(a, b, c, s.t - h);
        const vector2d after = Derivative(a, b, c, s.t + h);
        const double turned = std::atan2(Cross(before, after), Dot(before, after));
        const double measured = turned / (2.0 * h * SpeedAt(s.f, s.t));
        EXPECT_NEAR(curvature * s.extent, measured * s.extent, 1e-4 * (1.0 + std::fabs(measured * s.extent)));
    });
    EXPECT_GT(compared, 3000);
    RecordProperty("compared", compared);
}

TEST(CurvatureProperties, RadiusIsTheReciprocal)
{
    ForManyCurves(2, 6000, [](const Sample& s) {
        double curvature = 0.0;
        double radius = 0.0;
        const bool isCurved = GetCurvatureRadiusAt(s.t, s.f.a, s.f.b, s.f.c, radius);
        const bool isDefined = GetCurvatureAt(s.t, s.f.a, s.f.b, s.f.c, curvature);
        if (isCurved && isDefined) {
            EXPECT_NEAR(radius * curvature, 1.0, 1e-15);
        } else if (isDefined) {
            EXPECT_EQ(curvature, 0.0);
        }
        EXPECT_TRUE(SameBits(SafeBezierCurvature(s.t, s.f.a, s.f.b, s.f.c), curvature) || !isDefined);
    });
}

TEST(CurvatureProperties, TurnsAndMirrorsWithTheCurve)
{
    ForManyCurves(3, 3000, [](const Sample& s) {
        const auto turned = [](const point2d& p) { return point2d{-p.y, p.x}; };
        const auto mirrored = [](const point2d& p) { return point2d{-p.x, p.y}; };
        const auto doubled = [](const point2d& p) { return point2d{2.0 * p.x, 2.0 * p.y}; };
        const auto& [a, b, c, d] = s.f;
        const double curvature = SafeBezierCurvature(s.t, a, b, c);
        EXPECT_EQ(SafeBezierCurvature(s.t, turned(a), turned(b), turned(c)), curvature);
        EXPECT_EQ(SafeBezierCurvature(s.t, mirrored(a), mirrored(b), mirrored(c)), -curvature);
        EXPECT_EQ(SafeBezierCurvature(s.t, doubled(a), doubled(b), doubled(c)), curvature / 2.0);
    });
}

TEST(CurvatureProperties, ArcsOfACircleTurnEvenly)
{
    RandomSource random(4);
    for (int n = 0; n < 1000; ++n) {
        const Cubic arc = random.Curve(Shape::Arc, random.Magnitude());
        const PowerForm f = ToPowerForm(arc.data());
        // The radius is the leg of the right isosceles triangle on the chord.
        const double radius = std::sqrt(LengthSquared(arc[3] - arc[0]) / 2.0);
        for (int i = 0; i <= 10; ++i)
            EXPECT_NEAR(SafeBezierCurvature(i / 10.0, f.a, f.b, f.c) * radius, 1.0, 0.022) << n;
    }
}

TEST(CurvatureProperties, ChangesItsSignAtInflections)
{
    int changes = 0;
    int tinyLeadingCoefficient = 0;
    ForManyCurves(5, 6000, [&](const Sample& s) {
        const auto& [a, b, c, d] = s.f;
        const double largestProduct = std::fabs(Cross(a, b)) + std::fabs(Cross(a, c)) + std::fabs(Cross(b, c));
        if (largestProduct < 1e-9 * s.extent * s.extent)
            return; // straight, but for rounding
        if (std::fabs(Cross(a, b)) < 1e-6 * largestProduct) {
            ++tinyLeadingCoefficient; // as for a symmetric S, whose second root is at infinity
            return;
        }
        double out[2]{};
        if (BezierInflectionPoints(a, b, c, out) == 0 || std::fabs(out[0] - out[1]) < 1e-2)
            return;
        for (const double t : out) {
            constexpr double h = 1e-3;
            if (!(h < t && t < 1.0 - h) || SpeedAt(s.f, t) < 0.1 * s.extent)
                continue;
            ++changes;
            EXPECT_LT(SafeBezierCurvature(t - h, a, b, c) * SafeBezierCurvature(t + h, a, b, c), 0.0) << t;
        }
    });
    EXPECT_GT(changes, 300);
    EXPECT_LT(tinyLeadingCoefficient, 2000);
    RecordProperty("changes", changes);
    RecordProperty("tinyLeadingCoefficient", tinyLeadingCoefficient);
}

TEST(CurvatureProperties, EveryExtremeOfTheSpeedIsFound)
{
    int found = 0;
    int lost = 0;
    int atCusp = 0;
    ForManyCurves(6, 4000, [&](const Sample& s) {
        constexpr int steps = 512;
        double out[11]{};
        const int count = FindCurvatureMinMax(s.f.a, s.f.b, s.f.c, out);
        const auto slope = [&](int i) { // half the derivative of the squared speed
            const double t = static_cast<double>(i) / steps;
            return Dot(Derivative(s.f.a, s.f.b, s.f.c, t), SecondDerivative(s.f.a, s.f.b, t));
        };
        for (int i = 0; i < steps; ++i) {
            if (slope(i) * slope(i + 1) >= 0.0)
                continue;
            const double low = (i - 0.01) / steps;
            const double high = (i + 1.01) / steps;
            if (std::any_of(out, out + count, [=](double r) { return low <= r && r <= high; }))
                ++found;
            else if (SpeedAt(s.f, (low + high) / 2.0) < 0.02 * s.extent)
                ++atCusp; // next to a root that is all but double
            else
                ++lost; // on a cut
        }
    });
    EXPECT_GT(found, 1000);
    EXPECT_LT(lost, found / 50);
    EXPECT_LT(atCusp, found / 5);
    RecordProperty("found", found);
    RecordProperty("lostOnACut", lost);
    RecordProperty("lostAtACusp", atCusp);
}

TEST(CurvatureProperties, EveryParameterOfMinMaxIsStationary)
{
    int listed = 0;
    ForManyCurves(7, 4000, [&](const Sample& s) {
        double out[11]{};
        const int count = FindCurvatureMinMax(s.f.a, s.f.b, s.f.c, out);
        for (int i = 0; i < count; ++i) {
            ++listed;
            EXPECT_LT(0.0, out[i]);
            EXPECT_LT(out[i], 1.0);
            const double speed = SpeedAt(s.f, out[i]) / s.extent;
            const vector2d first = Derivative(s.f.a, s.f.b, s.f.c, out[i]) / s.extent;
            const vector2d second = SecondDerivative(s.f.a, s.f.b, out[i]) / s.extent;
            EXPECT_NEAR(speed * speed * speed * speed * Dot(first, second), 0.0, 1e-4) << out[i];
        }
    });
    EXPECT_GT(listed, 1000);
    RecordProperty("listed", listed);
}

TEST(CurvatureProperties, SafeTangentAlwaysPointsAlongTheCurve)
{
    ForManyCurves(8, 6000, [](const Sample& s) {
        const auto& [a, b, c, d] = s.f;
        for (const double t : {0.0, s.t, 1.0}) {
            const vector2d tangent = SafeBezierTangent(t, a, b, c, d);
            EXPECT_TRUE(std::isfinite(tangent.x) && std::isfinite(tangent.y));
            EXPECT_FALSE(tangent.x == 0.0 && tangent.y == 0.0);
            if (SpeedAt(s.f, t) > 2e-8) {
                EXPECT_EQ(tangent, Derivative(a, b, c, t));
            }
        }
    });
}

} // namespace

} // namespace ZarnMath::CubicBezier
