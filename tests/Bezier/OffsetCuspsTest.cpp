#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"

#include "tests/Bits.h"
#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath::CubicBezier {

namespace {

using Parameters = std::vector<double>;

constexpr point2d zero{0.0, 0.0};
constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};

Parameters Cusps(const PowerForm& f, double distance)
{
    Parameters parameters;
    const bool isAny = FindOffsetCusps(f.a, f.b, f.c, distance, parameters);
    EXPECT_EQ(isAny, !parameters.empty());
    return parameters;
}

Parameters CuspsOfBothSides(const PowerForm& f, double distance)
{
    double parameters[13];
    const int count = FindAllOffsetCusp(f.a, f.b, f.c, distance, parameters);
    return {parameters, parameters + count};
}

/// (t, (t - vertex)^2), which turns to the left; its radius of curvature is (1 + 4*s^2)^(3/2)/2 at s = t - vertex.
PowerForm Parabola(double vertex)
{
    return {zero, {0.0, 1.0}, {1.0, -2.0 * vertex}, zero};
}

TEST(FindOffsetCusps, OfTheArchToItsInside)
{
    const Parameters at100 = Cusps(ToPowerForm(arch.data()), -100.0);
    ASSERT_EQ(at100.size(), 2U);
    EXPECT_NEAR(at100[0], 0.37226, 5e-6);
    EXPECT_NEAR(at100[1], 0.62774, 5e-6);
    const Parameters at200 = Cusps(ToPowerForm(arch.data()), -200.0);
    ASSERT_EQ(at200.size(), 2U);
    EXPECT_NEAR(at200[0], 0.29453, 5e-6);
    EXPECT_NEAR(at200[1], 0.70547, 5e-6);
}

TEST(FindOffsetCusps, OfTheArchToItsOutsideThereAreNone)
{
    for (const double distance : {10.0, 100.0, 200.0})
        EXPECT_EQ(Cusps(ToPowerForm(arch.data()), distance), Parameters{}) << distance;
}

TEST(FindOffsetCusps, RadiusLargerThanTheDistance)
{
    EXPECT_EQ(Cusps(ToPowerForm(arch.data()), -10.0), Parameters{});
}

TEST(FindOffsetCusps, BothSidesShareThePolynomial)
{
    const PowerForm f = ToPowerForm(arch.data());
    EXPECT_EQ(CuspsOfBothSides(f, 100.0).size(), 2U);
    EXPECT_EQ(CuspsOfBothSides(f, 100.0), CuspsOfBothSides(f, -100.0));
    EXPECT_EQ(CuspsOfBothSides(f, -100.0), Cusps(f, -100.0));
}

TEST(FindOffsetCusps, DistanceOfZeroHasNone)
{
    EXPECT_EQ(Cusps(ToPowerForm(arch.data()), 0.0), Parameters{});
    EXPECT_EQ(Cusps({zero, {1.0, 0.0}, {-1.0, 0.0}, zero}, 0.0), Parameters{}); // though the speed vanishes
}

TEST(FindOffsetCusps, StraightAndPointCurvesHaveNone)
{
    for (const double distance : {-100.0, 100.0}) {
        EXPECT_EQ(Cusps({zero, zero, {3.0, 4.0}, zero}, distance), Parameters{});
        EXPECT_EQ(Cusps({{1.0, 1.0}, {1.0, 1.0}, {1.0, 1.0}, zero}, distance), Parameters{});
        EXPECT_EQ(Cusps({zero, zero, zero, zero}, distance), Parameters{});
    }
}

TEST(FindOffsetCusps, ResultIsClearedFirst)
{
    Parameters parameters{7.0, 8.0, 9.0};
    EXPECT_FALSE(FindOffsetCusps(zero, zero, {3.0, 4.0}, 10.0, parameters));
    EXPECT_EQ(parameters, Parameters{});
    const PowerForm f = ToPowerForm(arch.data());
    parameters = {7.0, 8.0, 9.0};
    EXPECT_FALSE(FindOffsetCusps(f.a, f.b, f.c, 100.0, parameters)); // roots of the other side alone
    EXPECT_EQ(parameters, Parameters{});
    parameters = {7.0, 8.0, 9.0};
    EXPECT_TRUE(FindOffsetCusps(f.a, f.b, f.c, -100.0, parameters));
    EXPECT_EQ(parameters.size(), 2U);
}

TEST(FindOffsetCusps, RadiusAroundTheDistance)
{
    const PowerForm f = Parabola(0.375);
    // (1 + 4*s^2)^(3/2) = 1.001
    const double s = std::sqrt((std::pow(1.001, 2.0 / 3.0) - 1.0) / 4.0);
    const Parameters beyond = Cusps(f, 0.5005);
    ASSERT_EQ(beyond.size(), 2U);
    EXPECT_NEAR(beyond[0], 0.375 - s, 1e-7);
    EXPECT_NEAR(beyond[1], 0.375 + s, 1e-7);
    EXPECT_EQ(Cusps(f, 0.4995), Parameters{});
    EXPECT_EQ(Cusps(f, -0.5005), Parameters{});
    for (const double t : Cusps(f, 0.5)) // a double root, listed once, twice or not at all
        EXPECT_NEAR(t, 0.375, 1e-3);
    EXPECT_EQ(Cusps(f, -0.5), Parameters{});
}

TEST(FindOffsetCusps, TurnsToTheRightMirrorThoseToTheLeft)
{
    PowerForm f = Parabola(0.375);
    const Parameters left = Cusps(f, 0.6);
    ASSERT_EQ(left.size(), 2U);
    for (point2d* p : {&f.a, &f.b, &f.c, &f.d})
        p->y = -p->y;
    EXPECT_EQ(Cusps(f, -0.6), left);
    EXPECT_EQ(Cusps(f, 0.6), Parameters{});
}

TEST(FindOffsetCusps, WhereTheCurveTurnsBackTheRadiusIsInfiniteAndPositive)
{
    // (t^2 - t, 0): the speed vanishes at 1/2, and with it Cross(P', P'') everywhere.
    const PowerForm f{zero, {1.0, 0.0}, {-1.0, 0.0}, zero};
    const Parameters all = CuspsOfBothSides(f, 5.0);
    ASSERT_FALSE(all.empty());
    for (const double t : all)
        EXPECT_NEAR(t, 0.5, 1e-6);
    EXPECT_EQ(Cusps(f, 5.0), all);
    EXPECT_EQ(Cusps(f, -5.0), Parameters{});
}

TEST(FindOffsetCusps, RadiusThatUnderflowsIsThatOfALeftTurn)
{
    // (1e-110*t, (t - 5/16)^2) all but turns back at 5/16: the cube of its speed is 0 there, its turning 2e-110.
    const PowerForm f{zero, {0.0, 1.0}, {1e-110, -0.625}, zero};
    ASSERT_EQ(CuspsOfBothSides(f, 1.0), Parameters{0.3125});
    EXPECT_EQ(Cusps(f, 1.0), Parameters{0.3125});
    EXPECT_EQ(Cusps(f, -1.0), Parameters{});
}

TEST(FindOffsetCusps, NotANumber)
{
    EXPECT_EQ(Cusps(ToPowerForm(arch.data()), nan), Parameters{});
    EXPECT_EQ(Cusps({{nan, nan}, {1.0, 2.0}, {3.0, 4.0}, zero}, 1.0), Parameters{});
}

struct Sample
{
    PowerForm f;
    double extent;
    double distance;
};

template <typename Check>
void ForManyCurves(std::uint64_t seed, int count, Check check)
{
    RandomSource random(seed);
    for (int n = 0; n < count; ++n) {
        const Shape shape = random.AnyShape();
        const double extent = random.Magnitude();
        const Cubic curve = random.Curve(shape, extent);
        const double distance = random.Uniform(-1.0, 1.0) * extent;
        SCOPED_TRACE(testing::Message() << "curve " << n << ", shape " << static_cast<int>(shape) << ", extent "
                                        << extent << ", distance " << distance);
        check(Sample{ToPowerForm(curve.data()), extent, distance});
    }
}

/// The speed of the offset relative to that of the curve, 1 - distance*curvature: below 0 the offset runs backwards.
double Advance(const Sample& s, double t)
{
    return 1.0 - s.distance * SafeBezierCurvature(t, s.f.a, s.f.b, s.f.c);
}

double RelativeSpeed(const Sample& s, double t)
{
    return std::sqrt(LengthSquared(Derivative(s.f.a, s.f.b, s.f.c, t))) / s.extent;
}

TEST(OffsetCuspsProperties, RadiusEqualsTheDistance)
{
    int compared = 0;
    int slow = 0;
    ForManyCurves(1, 4000, [&](const Sample& s) {
        for (const double t : Cusps(s.f, s.distance)) {
            EXPECT_LT(0.0, t);
            EXPECT_LT(t, 1.0);
            if (RelativeSpeed(s, t) < 0.2) {
                ++slow; // near a zero of the speed the root is all but sixfold, and rounding moves it
                continue;
            }
            ++compared;
            double radius = 0.0;
            GetCurvatureRadiusAt(t, s.f.a, s.f.b, s.f.c, radius);
            EXPECT_NEAR(radius / s.distance, 1.0, 1e-3) << t;
        }
    });
    EXPECT_GT(compared, 500);
    RecordProperty("compared", compared);
    RecordProperty("slow", slow);
}

TEST(OffsetCuspsProperties, OffsetTurnsBackAtEveryCusp)
{
    int found = 0;
    int slow = 0;
    int lost = 0;
    ForManyCurves(2, 4000, [&](const Sample& s) {
        constexpr int steps = 512;
        const Parameters cusps = Cusps(s.f, s.distance);
        for (int i = 0; i < steps; ++i) {
            const double low = static_cast<double>(i) / steps;
            const double high = static_cast<double>(i + 1) / steps;
            if (Advance(s, low) * Advance(s, high) >= 0.0)
                continue;
            const bool isListed =
                std::any_of(cusps.begin(), cusps.end(), [=](double t) { return low - 1e-4 <= t && t <= high + 1e-4; });
            if (isListed)
                ++found;
            else if (RelativeSpeed(s, low) < 0.05 || RelativeSpeed(s, high) < 0.05)
                ++slow; // where curvature jumps through infinity
            else
                ++lost; // a root on a cut
        }
    });
    EXPECT_GT(found, 1000);
    EXPECT_LT(lost, found / 100);
    RecordProperty("found", found);
    RecordProperty("slow", slow);
    RecordProperty("lostOnACut", lost);
}

TEST(OffsetCuspsProperties, SidesShareOutAllParameters)
{
    ForManyCurves(3, 2000, [](const Sample& s) {
        const Parameters all = CuspsOfBothSides(s.f, s.distance);
        Parameters shared = Cusps(s.f, s.distance);
        const Parameters other = Cusps(s.f, -s.distance);
        EXPECT_LE(all.size(), 12U);
        shared.insert(shared.end(), other.begin(), other.end());
        std::sort(shared.begin(), shared.end());
        Parameters sorted = all;
        std::sort(sorted.begin(), sorted.end());
        EXPECT_EQ(shared, sorted);
    });
}

TEST(OffsetCuspsProperties, DistanceOfZeroKeepsNothingOfEitherSign)
{
    int zerosOfTheSpeed = 0;
    ForManyCurves(5, 3000, [&](const Sample& s) {
        zerosOfTheSpeed += static_cast<int>(CuspsOfBothSides(s.f, 0.0).size());
        EXPECT_EQ(Cusps(s.f, 0.0), Parameters{});
        EXPECT_EQ(Cusps(s.f, -0.0), Parameters{});
    });
    EXPECT_GT(zerosOfTheSpeed, 10);
    RecordProperty("zerosOfTheSpeed", zerosOfTheSpeed);
}

TEST(OffsetCuspsProperties, NothingIsWrittenBehindTheCount)
{
    ForManyCurves(4, 500, [](const Sample& s) {
        Guarded<double, 13> parameters;
        const int count = FindAllOffsetCusp(s.f.a, s.f.b, s.f.c, s.distance, parameters.data());
        EXPECT_TRUE(parameters.IsUntouchedFrom(std::max(count, 1))); // a single root out of range may stay in the first
    });
}

} // namespace

} // namespace ZarnMath::CubicBezier
