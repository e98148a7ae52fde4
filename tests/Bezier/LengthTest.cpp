#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <boost/multiprecision/cpp_dec_float.hpp>
#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath::CubicBezier {

namespace {

constexpr point2d zero{0.0, 0.0};
constexpr int orders[] = {2, 3, 4, 5, 6, 7, 8, 10, 16};

struct Rule
{
    const double* weights = nullptr;
    const double* abscissae = nullptr;

    explicit Rule(int order)
    {
        GetGaussianQuadratureWeightsAndAbscissae(order, weights, abscissae);
    }
};

TEST(Quadrature, RequestsGoToTheOrdersThatExist)
{
    const std::pair<int, int> served[] = {{-2147483647, 2}, {-1, 2},  {0, 2},   {1, 2},   {2, 2},     {3, 3},
                                          {4, 4},           {5, 5},   {6, 6},   {7, 7},   {8, 8},     {9, 10},
                                          {10, 10},         {11, 16}, {16, 16}, {17, 16}, {1000, 16}, {2147483647, 16}};
    for (const auto& [requested, order] : served) {
        EXPECT_EQ(NormalizeQuadratureOrder(requested), order) << requested;
        EXPECT_EQ(Rule(requested).weights, Rule(order).weights) << requested;
        EXPECT_EQ(Rule(requested).abscissae, Rule(order).abscissae) << requested;
    }
}

TEST(Quadrature, OrdersStandOneAfterTheOther)
{
    const Rule first(2);
    const int starts[] = {0, 2, 5, 9, 14, 20, 27, 35, 45};
    for (std::size_t i = 0; i < std::size(orders); ++i) {
        EXPECT_EQ(Rule(orders[i]).abscissae - first.abscissae, starts[i]) << orders[i];
        EXPECT_EQ(Rule(orders[i]).weights - first.weights, starts[i]) << orders[i];
    }
}

TEST(Quadrature, StatedRows)
{
    const struct
    {
        int order;
        std::vector<std::pair<double, double>> upper; // the node 0 and the positive ones, with their weights
    } rows[] = {
        {2, {{0.577350269189626, 1.0}}},
        {3, {{0.0, 0.8888888888888888}, {0.77459667, 0.5555555555555556}}},
        {5, {{0.0, 0.56888889}, {0.53846931, 0.47862867}, {0.90617985, 0.23692689}}},
        {6, {{0.23861918, 0.46791393}, {0.66120939, 0.36076157}, {0.93246951, 0.17132449}}},
        {7, {{0.0, 0.41795918}, {0.40584515, 0.38183005}, {0.74153119, 0.27970539}, {0.94910791, 0.12948497}}},
        {10,
         {{0.14887434, 0.29552422},
          {0.43339539, 0.26926672},
          {0.67940957, 0.21908636},
          {0.86506337, 0.14945135},
          {0.97390653, 0.06667134}}},
    };

    for (const auto& [order, upper] : rows) {
        const Rule rule(order);
        const int half = order - static_cast<int>(upper.size());
        for (int i = 0; i < static_cast<int>(upper.size()); ++i) {
            const auto& [node, weight] = upper[static_cast<std::size_t>(i)];
            EXPECT_EQ(rule.abscissae[half + i], node) << order;
            EXPECT_EQ(rule.abscissae[order - 1 - half - i], -node) << order;
            EXPECT_EQ(rule.weights[half + i], weight) << order;
            EXPECT_EQ(rule.weights[order - 1 - half - i], weight) << order;
        }
    }
}

using Decimal = boost::multiprecision::cpp_dec_float_50;

/// P_n and P_{n-1} at x, by the recurrence (k+1)P_{k+1} = (2k+1)x*P_k - k*P_{k-1}.
std::pair<Decimal, Decimal> Legendre(int n, const Decimal& x)
{
    Decimal before = 1;
    Decimal value = x;
    for (int k = 1; k < n; ++k) {
        const Decimal next = ((2 * k + 1) * x * value - k * before) / (k + 1);
        before = value;
        value = next;
    }
    return {value, before};
}

Decimal LegendreSlope(int n, const Decimal& x)
{
    const auto [value, before] = Legendre(n, x);
    return n * (x * value - before) / (x * x - 1);
}

/// The i-th node of order n, from the most negative one.
Decimal ExactNode(int n, int i)
{
    if (2 * i == n - 1)
        return 0;
    Decimal x = -std::cos(3.141592653589793 * (i + 0.75) / (n + 0.5));
    for (int step = 0; step < 10; ++step)
        x -= Legendre(n, x).first / LegendreSlope(n, x);
    return x;
}

Decimal ExactWeight(int n, const Decimal& x)
{
    const Decimal slope = LegendreSlope(n, x);
    return 2 / ((1 - x * x) * slope * slope);
}

/// As many decimal places as a double holds.
constexpr int allPlaces = 0;

double RoundedToPlaces(const Decimal& value, int places)
{
    if (places == allPlaces)
        return value.convert_to<double>();
    const Decimal scale = pow(Decimal(10), places);
    const Decimal rounded = floor(abs(value) * scale + Decimal("0.5")) / scale;
    const auto magnitude = std::stod(rounded.str(places, std::ios_base::fixed));
    return value < 0 ? -magnitude : magnitude;
}

TEST(Quadrature, TablesAreTheRoundedNodesAndWeights)
{
    const struct
    {
        int order;
        int nodePlaces;
        int weightPlaces;
    } places[] = {{2, 15, 15}, {3, 8, allPlaces}, {4, 15, 15}, {5, 8, 8},   {6, 8, 8},
                  {7, 8, 8},   {8, 15, 15},       {10, 8, 8},  {16, 14, 14}};

    int cut = 0;
    for (const auto& [order, nodePlaces, weightPlaces] : places) {
        const Rule rule(order);
        for (int i = 0; i < order; ++i) {
            const Decimal node = ExactNode(order, i);
            EXPECT_LT(abs(Legendre(order, node).first), Decimal("1e-40")) << order << ' ' << i;
            const double expectedNode = RoundedToPlaces(node, nodePlaces);
            const bool isTheCutPair = order == 6 && (i == 2 || i == 3);
            if (isTheCutPair) {
                ++cut;
                EXPECT_EQ(std::fabs(expectedNode), 0.23861919);
                EXPECT_EQ(std::fabs(rule.abscissae[i]), 0.23861918);
            } else {
                EXPECT_EQ(rule.abscissae[i], expectedNode) << order << ' ' << i;
            }
            EXPECT_EQ(rule.weights[i], RoundedToPlaces(ExactWeight(order, node), weightPlaces)) << order << ' ' << i;
        }
    }
    EXPECT_EQ(cut, 2);
}

TEST(Length, StraightUnitSegment)
{
    const point2d c{1.0, 0.0};
    EXPECT_EQ(Length(zero, zero, c, 2, 0.0, 1.0), 1.0);
    EXPECT_DOUBLE_EQ(Length(zero, zero, c, 5, 0.0, 1.0), 1.000000005);
    EXPECT_DOUBLE_EQ(Length(zero, zero, c, 6, 0.0, 1.0), 0.99999999);
    EXPECT_DOUBLE_EQ(Length(zero, zero, c, 10, 0.0, 1.0), 0.99999999);
    for (const int order : {3, 4, 7, 8, 16})
        EXPECT_NEAR(Length(zero, zero, c, order, 0.0, 1.0), 1.0, 1e-14) << order;
}

TEST(Length, StraightLineAtAChangingPace)
{
    EXPECT_NEAR(Length({3.0, 4.0}, zero, zero, 2, 0.0, 1.0), 5.0, 1e-14); // 5*t^3, exact from order 2 on
    EXPECT_NEAR(Length({3.0, 4.0}, zero, zero, 2, 0.0, 2.0), 40.0, 1e-13);
    EXPECT_NEAR(Length({3.0, 4.0}, zero, zero, 4, 0.5, 1.0), 4.375, 1e-14);
}

TEST(Length, BackwardsIsNegative)
{
    EXPECT_EQ(Length(zero, zero, {1.0, 0.0}, 2, 1.0, 0.0), -1.0);
    EXPECT_EQ(Length(zero, zero, {1.0, 0.0}, 2, 0.75, 0.25), -0.5);
    EXPECT_EQ(Length(zero, zero, {1.0, 0.0}, 2, 0.5, 0.5), 0.0);
}

TEST(Length, GoesOnBeyondTheSegment)
{
    EXPECT_EQ(Length(zero, zero, {1.0, 0.0}, 2, -1.0, 3.0), 4.0);
}

TEST(Length, OverloadsAgree)
{
    const Cubic curve = {{{1.0, 2.0}, {3.0, 7.0}, {8.0, -1.0}, {9.0, 4.0}}};
    const PowerForm f = ToPowerForm(curve.data());
    for (const int order : {-1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 16, 1000}) {
        const double length = Length(f.a, f.b, f.c, order, 0.0, 1.0);
        const auto accuracy = static_cast<LengthAccuracy>(order);
        EXPECT_TRUE(SameBits(Length(f.a, f.b, f.c, accuracy), length));
        EXPECT_TRUE(SameBits(Length(curve.data(), accuracy), length));
    }
    EXPECT_EQ(Length(f.a, f.b, f.c, LengthAccuracy::Order10), Length(f.a, f.b, f.c, 9, 0.0, 1.0));
    EXPECT_NE(Length(f.a, f.b, f.c, LengthAccuracy::Order10), Length(f.a, f.b, f.c, LengthAccuracy::Order8));
}

TEST(LengthOfPieces, NothingIsExactlyNothing)
{
    const Cubic curve = {{{1.0, 2.0}, {3.0, 7.0}, {8.0, -1.0}, {9.0, 4.0}}};
    EXPECT_TRUE(SameBits(LengthTo(0.0, curve.data()), 0.0));
    EXPECT_TRUE(SameBits(LengthTo(-0.0, curve.data()), 0.0));
    EXPECT_TRUE(SameBits(LengthFrom(1.0, curve.data()), 0.0));
    const Cubic unbounded = {{{infinity, 2.0}, {3.0, 7.0}, {8.0, -1.0}, {9.0, 4.0}}};
    EXPECT_TRUE(SameBits(LengthTo(0.0, unbounded.data()), 0.0));
    EXPECT_TRUE(SameBits(LengthFrom(1.0, unbounded.data()), 0.0));
}

TEST(LengthOfPieces, NearlyNothingIsMeasured)
{
    const Cubic line = {{{0.0, 0.0}, {1e20, 0.0}, {2e20, 0.0}, {3e20, 0.0}}};
    EXPECT_NEAR(LengthTo(1e-17, line.data()), 3000.0, 0.01);
    const Cubic back = {{{3e20, 0.0}, {2e20, 0.0}, {1e20, 0.0}, {0.0, 0.0}}};
    EXPECT_GT(LengthFrom(Below(1.0), back.data()), 0.0);
}

TEST(LengthOfPieces, AreThoseOfTheCutPiecesAtOrderTen)
{
    const Cubic curve = {{{1.0, 2.0}, {3.0, 7.0}, {8.0, -1.0}, {9.0, 4.0}}};
    for (const double t : {-0.5, 0.25, 0.7, 1.0, 1.5}) {
        Cubic left{};
        Cubic right{};
        Split(t, curve.data(), left.data(), right.data());
        EXPECT_TRUE(SameBits(LengthTo(t, curve.data()), Length(left.data(), LengthAccuracy::Order10)));
        if (t != 1.0) {
            EXPECT_TRUE(SameBits(LengthFrom(t, curve.data()), Length(right.data(), LengthAccuracy::Order10)));
        }
    }
}

TEST(LengthOfPieces, ExtrapolateBeyondTheSegment)
{
    const Cubic line = {{{0.0, 0.0}, {1.0, 0.0}, {2.0, 0.0}, {3.0, 0.0}}};
    EXPECT_NEAR(LengthTo(2.0, line.data()), 6.0, 1e-6);
    EXPECT_NEAR(LengthTo(-1.0, line.data()), 3.0, 1e-6);
    EXPECT_NEAR(LengthFrom(-1.0, line.data()), 6.0, 1e-6);
    EXPECT_NEAR(LengthFrom(2.0, line.data()), 3.0, 1e-6);
}

TEST(LengthOfPieces, OfIntegerCurvesAreNotRounded)
{
    const IntegerCubic integers = {{{0, 0}, {1, 3}, {2, -3}, {3, 1}}};
    const Cubic doubles = {{{0.0, 0.0}, {1.0, 3.0}, {2.0, -3.0}, {3.0, 1.0}}};
    for (const double t : {0.0, 0.3, 0.5, 1.0}) {
        EXPECT_TRUE(SameBits(LengthTo(t, integers.data()), LengthTo(t, doubles.data())));
        EXPECT_TRUE(SameBits(LengthFrom(t, integers.data()), LengthFrom(t, doubles.data())));
    }
}

TEST(LengthOfPieces, IntegerCoordinatesMayBeOfAnySize)
{
    const IntegerCubic diagonal = {{{-2147483647, 0}, {-2147483647, 0}, {2147483647, 0}, {2147483647, 0}}};
    EXPECT_NEAR(LengthTo(1.0, diagonal.data()) / 4294967294.0, 1.0, 1e-7);
    EXPECT_NEAR(LengthFrom(0.0, diagonal.data()) / 4294967294.0, 1.0, 1e-7);
}

/// On (t, 0) the length from 0 to t is exactly t at order 2.
double OnUnitSegment(double fraction, double tolerance)
{
    return GetCurveRelativeLengthParameter(fraction, zero, zero, {1.0, 0.0}, tolerance, LengthAccuracy::Order2);
}

TEST(RelativeLength, FractionsBeyondTheEnds)
{
    EXPECT_TRUE(SameBits(OnUnitSegment(0.0, 0.1), 0.0));
    EXPECT_TRUE(SameBits(OnUnitSegment(-3.0, 0.1), 0.0));
    EXPECT_EQ(OnUnitSegment(1.0, 0.1), 1.0);
    EXPECT_EQ(OnUnitSegment(3.0, 0.1), 1.0);
    EXPECT_EQ(OnUnitSegment(infinity, 0.1), 1.0);
    EXPECT_EQ(OnUnitSegment(nan, 0.0), 0.5); // one pass, after which nothing is above the tolerance
    const point2d undefined{nan, nan};
    for (const double fraction : {0.0, 0.25, 1.0}) // the ends are decided before anything is measured
        EXPECT_EQ(
            GetCurveRelativeLengthParameter(fraction, undefined, undefined, undefined, 0.0, LengthAccuracy::Order8),
            fraction == 0.25 ? 0.5 : fraction);
}

TEST(RelativeLength, FirstPassBisects)
{
    EXPECT_EQ(OnUnitSegment(0.5, 0.0), 0.5);
    EXPECT_EQ(OnUnitSegment(0.25, 0.25), 0.5);         // off by the tolerance: near enough
    EXPECT_EQ(OnUnitSegment(0.25, Below(0.25)), 0.25); // the second pass interpolates
}

TEST(RelativeLength, CurveOfNoLength)
{
    for (const double fraction : {1e-300, 0.25, 0.999})
        EXPECT_EQ(GetCurveRelativeLengthParameter(fraction, zero, zero, zero, 0.0, LengthAccuracy::Order8), 0.5);
}

TEST(RelativeLength, SymmetricCurveEndsInTheMiddleIfTheOrderIsHighEnough)
{
    const Cubic curve = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
    const auto [a, b, c, d] = ToPowerForm(curve.data());
    EXPECT_EQ(GetCurveRelativeLengthParameter(0.5, a, b, c, 0.01, LengthAccuracy::Order16), 0.5);
    // Half of the range is not half of the quadrature: at a low order the search goes on.
    const double t = GetCurveRelativeLengthParameter(0.5, a, b, c, 1e-9, LengthAccuracy::Order4);
    EXPECT_NE(t, 0.5);
    EXPECT_NEAR(Length(a, b, c, 4, 0.0, t), 0.5 * Length(a, b, c, 4, 0.0, 1.0), 1e-9);
}

TEST(RelativeLength, NearEndsOfTheBracketComeBeforeTheTolerance)
{
    EXPECT_EQ(OnUnitSegment(1e-16, 10.0), 0.0);       // the lower end, though 0.5 is within the tolerance
    EXPECT_EQ(OnUnitSegment(DBL_EPSILON, 10.0), 0.0); // as near as counts
    EXPECT_EQ(OnUnitSegment(Above(DBL_EPSILON), 10.0), 0.5);
    EXPECT_EQ(OnUnitSegment(Below(1.0), 10.0), 1.0);    // the upper end
    EXPECT_EQ(OnUnitSegment(1.0 - 0x1p-52, 10.0), 1.0); // as near as counts
    EXPECT_EQ(OnUnitSegment(1.0 - 3.0 * 0x1p-53, 10.0), 0.5);
}

TEST(RelativeLength, UpperEndOfTheBracketIsTakenInPassing)
{
    // The bisection comes out 2^-54 above the target and becomes the upper end.
    EXPECT_EQ(OnUnitSegment(Below(0.5), 0.0), 0.5);
}

TEST(RelativeLength, StepsAreHeldOffTheEndsOfTheBracket)
{
    EXPECT_EQ(OnUnitSegment(1e-6, 4.95e-5), 0.5 * 1e-4);
    EXPECT_EQ(OnUnitSegment(1.0 - 1e-6, 4.95e-5), 0.5 + 0.5 * 0.9999);
}

TEST(RelativeLength, StopsAfterTwoHundredPasses)
{
    // On (t^3, 0) the target 1e-6 lies at t = 0.01. After the bisection, which is too long, every pass moves the lower end
    // by 1e-4 of the bracket and stays short: the p-th pass tries 0.5*(1 - 0.9999^(p - 1)), and the 200th gets to 0.00985.
    const double last = GetCurveRelativeLengthParameter(1e-6, {1.0, 0.0}, zero, zero, 0.0, LengthAccuracy::Order4);
    EXPECT_NEAR(last, 0.5 * (1.0 - std::pow(0.9999, 199.0)), 1e-12);
    EXPECT_GT(last - 0.5 * (1.0 - std::pow(0.9999, 198.0)), 4e-5); // what one pass less would have given
}

TEST(RelativeLength, ToleranceIsALength)
{
    const double t = GetCurveRelativeLengthParameter(0.3, zero, zero, {1e6, 0.0}, 1.0, LengthAccuracy::Order2);
    EXPECT_NEAR(t, 0.3, 1e-6);
    EXPECT_EQ(GetCurveRelativeLengthParameter(0.3, zero, zero, {1e6, 0.0}, 2e5, LengthAccuracy::Order2), 0.5);
}

/// The length by ever finer chords, extrapolated from two counts of them.
double ChordLength(const PowerForm& f, double t0, double t1)
{
    const auto polyline = [&](int chords) {
        double sum = 0.0;
        point2d from = Evaluate(f, t0);
        for (int i = 1; i <= chords; ++i) {
            const point2d to = Evaluate(f, t0 + (t1 - t0) * i / chords);
            sum += std::sqrt(LengthSquared(to - from));
            from = to;
        }
        return sum;
    };
    return (4.0 * polyline(512) - polyline(256)) / 3.0;
}

struct Pace
{
    double slowest;
    double fastest;
};

Pace PaceOf(const PowerForm& f)
{
    Pace pace{infinity, 0.0};
    for (int i = 0; i <= 100; ++i) {
        const double speed = std::sqrt(LengthSquared(Derivative(f.a, f.b, f.c, i / 100.0)));
        pace = {std::min(pace.slowest, speed), std::max(pace.fastest, speed)};
    }
    return pace;
}

TEST(LengthProperties, PiecesAddUpToTheWhole)
{
    RandomSource random(1);
    int belowZero = 0;
    for (int n = 0; n < 2000; ++n) {
        const Cubic curve = random.Curve();
        const PowerForm f = ToPowerForm(curve.data());
        double sum = 0.0;
        for (int i = 0; i < 64; ++i)
            sum += Length(f.a, f.b, f.c, 16, i / 64.0, (i + 1) / 64.0);
        if (std::isnan(sum))
            ++belowZero; // the squared speed, by rounding
        else
            EXPECT_NEAR(sum, ChordLength(f, 0.0, 1.0), 1e-4 * PaceOf(f).fastest) << n;
    }
    EXPECT_LT(belowZero, 200);
    RecordProperty("squaredSpeedBelowZero", belowZero);
}

TEST(LengthProperties, BothPiecesOfACutHaveTheirOwnLength)
{
    RandomSource random(2);
    int fixedQuadrature = 0;
    int compared = 0;
    for (int n = 0; n < 2000; ++n) {
        const Cubic curve = random.Curve();
        const PowerForm f = ToPowerForm(curve.data());
        const Pace pace = PaceOf(f);
        if (!(pace.slowest > 0.25 * pace.fastest)) {
            ++fixedQuadrature; // a sharp turn between the samples
            continue;
        }
        ++compared;
        const double t = random.Uniform(0.0, 1.0);
        EXPECT_NEAR(LengthTo(t, curve.data()), ChordLength(f, 0.0, t), 1e-3 * pace.fastest) << n;
        EXPECT_NEAR(LengthFrom(t, curve.data()), ChordLength(f, t, 1.0), 1e-3 * pace.fastest) << n;
        EXPECT_NEAR(LengthTo(t, curve.data()) + LengthFrom(t, curve.data()),
                    Length(curve.data(), LengthAccuracy::Order16), 1e-3 * pace.fastest)
            << n;
    }
    EXPECT_GT(compared, 400);
    RecordProperty("fixedQuadrature", fixedQuadrature);
    RecordProperty("compared", compared);
}

TEST(LengthProperties, HigherOrdersAreMoreExact)
{
    RandomSource random(3);
    double worst[17]{};
    for (int n = 0; n < 1000; ++n) {
        const Cubic curve = random.Curve();
        const PowerForm f = ToPowerForm(curve.data());
        const Pace pace = PaceOf(f);
        if (!(pace.slowest > 0.25 * pace.fastest))
            continue;
        for (const int order : orders)
            worst[order] =
                std::max(worst[order],
                         std::fabs(Length(f.a, f.b, f.c, order, 0.0, 1.0) - ChordLength(f, 0.0, 1.0)) / pace.fastest);
    }
    EXPECT_LT(worst[2], 0.5);
    EXPECT_LT(worst[4], 0.05);
    EXPECT_LT(worst[8], 5e-3);
    EXPECT_LT(worst[16], 1e-4);
    EXPECT_LT(worst[16], worst[8]);
    EXPECT_LT(worst[8], worst[4]);
    EXPECT_LT(worst[4], worst[2]);
}

TEST(LengthProperties, DoesNotChangeByTurningAndDoublesWithTheScale)
{
    RandomSource random(4);
    for (int n = 0; n < 3000; ++n) {
        const Cubic curve = random.Curve();
        const auto [a, b, c, d] = ToPowerForm(curve.data());
        const auto turned = [](const point2d& p) { return point2d{-p.y, p.x}; };
        const auto doubled = [](const point2d& p) { return point2d{2.0 * p.x, 2.0 * p.y}; };
        const int order = orders[static_cast<std::size_t>(n) % std::size(orders)];
        const double t0 = random.Uniform(0.0, 1.0);
        const double t1 = random.Uniform(0.0, 1.0);
        const double length = Length(a, b, c, order, t0, t1);
        EXPECT_TRUE(SameBits(Length(turned(a), turned(b), turned(c), order, t0, t1), length));
        EXPECT_TRUE(SameBits(Length(doubled(a), doubled(b), doubled(c), order, t0, t1), 2.0 * length));
    }
}

TEST(LengthProperties, ParameterHasTheFractionOfTheLength)
{
    RandomSource random(5);
    int notReached = 0;
    for (int n = 0; n < 3000; ++n) {
        const Cubic curve = random.Curve();
        const auto [a, b, c, d] = ToPowerForm(curve.data());
        const double total = Length(a, b, c, LengthAccuracy::Order16);
        if (std::isnan(total) || total < 1e-9)
            continue;
        const double fraction = random.Uniform(0.0, 1.0);
        const double tolerance = total * 1e-6;
        const double t = GetCurveRelativeLengthParameter(fraction, a, b, c, tolerance, LengthAccuracy::Order16);
        EXPECT_TRUE(0.0 <= t && t <= 1.0) << n;
        const double error = std::fabs(Length(a, b, c, 16, 0.0, t) - fraction * total);
        if (!(error <= tolerance * 1.0000001))
            ++notReached; // lengths from 0 need not grow with t where the quadrature misses a sharp turn
    }
    EXPECT_LT(notReached, 30);
    RecordProperty("notReached", notReached);
}

} // namespace

} // namespace ZarnMath::CubicBezier
