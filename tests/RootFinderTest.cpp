#include "ZarnMath/RootFinder.h"

#include "tests/Random.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace ZarnMath::RootFinder {

namespace {

constexpr double epsilon = DBL_EPSILON;

static_assert(noexcept(FindRoots<2>(nullptr, nullptr, false)) && noexcept(FindRoots<12>(nullptr, nullptr, true)));
static_assert(noexcept(SolvePolynomial_BezierDivide_NewtonsMethod<3>(nullptr, nullptr, nullptr, std::declval<int&>())));
static_assert(noexcept(PolynomialToBernsteinT<9, 3>::Convert(nullptr, nullptr)));
static_assert(noexcept(CrossingCount<2>(nullptr, std::declval<int&>())));
static_assert(noexcept(FindSolutionNewtonsMethod<2>(nullptr, 0.0, 0.0, std::declval<double&>())));
static_assert(noexcept(FindSolutionNewtonsMethod_Guaranteed<2>(nullptr, 0.0, 0.0, 0.0, 0.0)));

/// C(N, 1) to C(N, N - 1) for N from 3 on.
const std::vector<std::vector<double>> binomialRows = {
    {3, 3},
    {4, 6, 4},
    {5, 10, 10, 5},
    {6, 15, 20, 15, 6},
    {7, 21, 35, 35, 21, 7},
    {8, 28, 56, 70, 56, 28, 8},
    {9, 36, 84, 126, 126, 84, 36, 9},
    {10, 45, 120, 210, 252, 210, 120, 45, 10},
    {11, 55, 165, 330, 462, 462, 330, 165, 55, 11},
    {12, 66, 220, 495, 792, 924, 792, 495, 220, 66, 12},
};

/// Calls f with the degrees from Low to High as compile-time constants.
template <int Low, int High, typename F>
void ForEachDegree(F f)
{
    f(std::integral_constant<int, Low>{});
    if constexpr (Low < High)
        ForEachDegree<Low + 1, High>(f);
}

bool AreSame(const vector2d* p, const vector2d* q, int n)
{
    return SameBits(p, q, n);
}

template <int N>
std::array<double, N + 1> RandomCoefficients(RandomSource& random, double extent)
{
    std::array<double, N + 1> c;
    for (double& one : c)
        one = random.Uniform(-extent, extent);
    return c;
}

template <std::size_t Size>
std::array<vector2d, Size> PolygonOf(const double (&ordinates)[Size], double from = 0.0, double to = 1.0)
{
    std::array<vector2d, Size> polygon;
    for (std::size_t i = 0; i < Size; ++i)
        polygon[i] = {from + (to - from) * (static_cast<double>(i) / static_cast<double>(Size - 1)), ordinates[i]};
    return polygon;
}

template <int N>
double ValueAt(const std::array<double, N + 1>& c, double t)
{
    double value = 0.0;
    for (const double one : c)
        value = value * t + one;
    return value;
}

/// What `FindRoots` gave, and whether it wrote no more than that.
template <int N>
std::vector<double> RootsOf(const std::array<double, N + 1>& c, bool includeEndpoints)
{
    Guarded<double, N + 1> roots;
    const std::array<double, N + 1> before = c;
    const int count = FindRoots<N>(c.data(), roots.data(), includeEndpoints);
    EXPECT_TRUE(SameBits(c.data(), before.data(), N + 1));
    // Only degree 2, be it reached by way of a higher one, leaves its lone root in place uncounted.
    const bool mayEndInAQuadratic = N == 2 || c.front() == 0.0 || c.back() == 0.0;
    EXPECT_TRUE(roots.IsUntouchedFrom(mayEndInAQuadratic ? std::max(count, 1) : count));
    return std::vector<double>(roots.data(), roots.data() + count);
}

template <int N>
std::vector<double> Solve(const std::array<vector2d, N + 1>& polygon, const std::array<double, N + 1>& c,
                          int countBefore = 0)
{
    Guarded<double, 3 * N> roots;
    int count = countBefore;
    SolvePolynomial_BezierDivide_NewtonsMethod<N>(polygon.data(), c.data(), roots.data(), count);
    for (int i = 0; i < countBefore; ++i)
        EXPECT_TRUE(SameBits(roots[i], sentinel<double>));
    EXPECT_TRUE(roots.IsIntact());
    return std::vector<double>(roots.data() + countBefore, roots.data() + count);
}

using Roots = std::vector<double>;

// ---- conversion to a control polygon

TEST(Bernstein, OfAShiftedCube)
{
    const std::array<double, 4> c = {1, 0, 0, -0.5};
    std::array<vector2d, 4> bez;
    PolynomialToBernsteinT<3, 0>::Convert(c.data(), bez.data());
    EXPECT_EQ(bez[0].y, -0.5);
    EXPECT_EQ(bez[1].y, -0.5);
    EXPECT_EQ(bez[2].y, -0.5);
    EXPECT_EQ(bez[3].y, 0.5);
    int lastCrossing = -1;
    EXPECT_EQ(CrossingCount<3>(bez.data(), lastCrossing), 1);
    EXPECT_EQ(lastCrossing, 2);
}

TEST(Bernstein, AbscissaeAreTheRoundedQuotients)
{
    ForEachDegree<2, 12>([](auto degree) {
        constexpr int N = degree;
        const std::array<double, N + 1> c = {1.0};
        Guarded<vector2d, N + 1> bez;
        PolynomialToBernsteinT<N, 0>::Convert(c.data(), bez.data());
        for (int i = 0; i <= N; ++i)
            EXPECT_TRUE(SameBits(bez[i].x, static_cast<double>(i) / static_cast<double>(N)));
        EXPECT_TRUE(SameBits(bez[0].x, 0.0));
        EXPECT_TRUE(SameBits(bez[N].x, 1.0));
        EXPECT_TRUE(bez.IsIntact());
    });
}

// The monomial t^k has b_k = 1/C(N, k), a single division, and zeros before.
TEST(Bernstein, DividesByTheBinomials)
{
    ForEachDegree<3, 12>([](auto degree) {
        constexpr int N = degree;
        const auto& row = binomialRows[N - 3];
        for (int k = 1; k <= N; ++k) {
            std::array<double, N + 1> c{};
            c[static_cast<std::size_t>(N - k)] = 1.0;
            std::array<vector2d, N + 1> bez;
            PolynomialToBernsteinT<N, 0>::Convert(c.data(), bez.data());
            const double divisor = k < N ? row[static_cast<std::size_t>(k - 1)] : 1.0;
            EXPECT_EQ(bez[static_cast<std::size_t>(k)].y, 1.0 / divisor) << N << ' ' << k;
            for (int i = 0; i < k; ++i)
                EXPECT_EQ(bez[static_cast<std::size_t>(i)].y, 0.0);
        }
    });
}

// Multiples of all divisors make every step exact: b_k = sum of C(k, j)/C(N, j)*a_j over j.
TEST(Bernstein, IsExactWhereEveryQuotientIs)
{
    RandomSource random(41);
    const auto choose = [](int n, int k) {
        std::int64_t c = 1;
        for (int i = 1; i <= k; ++i)
            c = c * (n - k + i) / i;
        return c;
    };
    ForEachDegree<3, 12>([&](auto degree) {
        constexpr int N = degree;
        for (int repeat = 0; repeat < 50; ++repeat) {
            std::array<double, N + 1> c;
            std::array<std::int64_t, N + 1> quotients;
            for (int j = 0; j <= N; ++j) {
                const int quotient = random.Integer(-50, 50);
                quotients[static_cast<std::size_t>(j)] = quotient;
                c[static_cast<std::size_t>(N - j)] = static_cast<double>(quotient * choose(N, j));
            }
            std::array<vector2d, N + 1> bez;
            PolynomialToBernsteinT<N, 0>::Convert(c.data(), bez.data());
            for (int k = 0; k <= N; ++k) {
                std::int64_t expected = 0;
                for (int j = 0; j <= k; ++j)
                    expected += choose(k, j) * quotients[static_cast<std::size_t>(j)];
                EXPECT_EQ(bez[static_cast<std::size_t>(k)].y, static_cast<double>(expected));
            }
        }
    });
}

TEST(Bernstein, KeepsTheGroupingOfDegreeFour)
{
    RandomSource random(42);
    for (int i = 0; i < 2000; ++i) {
        const auto c = RandomCoefficients<4>(random, 10.0);
        std::array<vector2d, 5> bez;
        PolynomialToBernsteinT<4, 0>::Convert(c.data(), bez.data());
        const double b0 = c[4];
        const double b1 = b0 + c[3] / 4.0;
        const double b2 = ((b1 + b1) - b0) + c[2] / 6.0;
        const double b3 = c[1] / 4.0 + (3.0 * b2 - (3.0 * b1 - b0));
        const double b4 = c[0] + (4.0 * b3 - (6.0 * b2 - (4.0 * b1 - b0)));
        EXPECT_TRUE(SameBits(bez[0].y, b0));
        EXPECT_TRUE(SameBits(bez[1].y, b1));
        EXPECT_TRUE(SameBits(bez[2].y, b2));
        EXPECT_TRUE(SameBits(bez[3].y, b3));
        EXPECT_TRUE(SameBits(bez[4].y, b4));
    }
}

/// Whether a conversion can go on from point M: the points before stay, the result is that of the whole, and no
/// coefficient of a point before is read.
template <int N, int M>
bool GoesOnFrom(const std::array<double, N + 1>& c, const std::array<vector2d, N + 1>& whole)
{
    std::array<vector2d, N + 1> resumed;
    std::array<vector2d, N + 1> expected = whole;
    std::array<double, N + 1> known = c;
    resumed.fill(sentinel<vector2d>);
    for (std::size_t i = 0; i < M; ++i) {
        resumed[i] = expected[i] = {sentinel<double>, whole[i].y};
        known[N - i] = nan;
    }
    PolynomialToBernsteinT<N, M>::Convert(known.data(), resumed.data());
    return AreSame(resumed.data(), expected.data(), N + 1);
}

template <int N, int... M>
bool GoesOnFromEach(RandomSource& random, std::integer_sequence<int, M...>)
{
    const auto c = RandomCoefficients<N>(random, 10.0);
    std::array<vector2d, N + 1> whole;
    PolynomialToBernsteinT<N, 0>::Convert(c.data(), whole.data());
    return (GoesOnFrom<N, M>(c, whole) && ...);
}

TEST(Bernstein, GoesOnFromAnyPoint)
{
    RandomSource random(43);
    ForEachDegree<3, 12>([&](auto degree) {
        EXPECT_TRUE(GoesOnFromEach<degree>(random, std::make_integer_sequence<int, degree + 1>{})) << degree;
    });
}

// ---- sign changes

/// The count and the last crossing, -1 before the call.
template <std::size_t Size>
std::pair<int, int> CountOf(const double (&ordinates)[Size])
{
    const auto polygon = PolygonOf(ordinates);
    int lastCrossing = -1;
    const int count = CrossingCount<static_cast<int>(Size) - 1>(polygon.data(), lastCrossing);
    return {count, lastCrossing};
}

using Crossings = std::pair<int, int>;

TEST(CrossingCount, ChargesAZeroBetweenOppositeSignsToItself)
{
    EXPECT_EQ(CountOf({1, 0, -1}), Crossings(1, 1));
    EXPECT_EQ(CountOf({-1, 0, 1}), Crossings(1, 1));
    EXPECT_EQ(CountOf({-1, -0.0, 1}), Crossings(1, 1));
    EXPECT_EQ(CountOf({1, 0, 1}), Crossings(0, -1));
}

TEST(CrossingCount, DoesNotSeeAChangeAcrossTwoZeros)
{
    EXPECT_EQ(CountOf({1, 0, 0, -1}), Crossings(0, -1));
    EXPECT_EQ(CountOf({1, 0, 0, -1, 1}), Crossings(1, 3));
}

TEST(CrossingCount, TakesAZeroAtAnEndForNone)
{
    EXPECT_EQ(CountOf({0, 1, -1}), Crossings(1, 1));
    EXPECT_EQ(CountOf({0, 0, 0}), Crossings(0, -1));
    EXPECT_EQ(CountOf({-1, 1, 0}), Crossings(1, 0));
    EXPECT_EQ(CountOf({0, -1, -1}), Crossings(0, -1));
}

TEST(CrossingCount, LeavesTheIndexWithoutACrossing)
{
    const auto polygon = PolygonOf({1, 2, 3});
    int lastCrossing = 17;
    EXPECT_EQ(CrossingCount<2>(polygon.data(), lastCrossing), 0);
    EXPECT_EQ(lastCrossing, 17);
}

TEST(CrossingCount, KeepsTheLastOfMany)
{
    EXPECT_EQ(CountOf({1, -1, 1, -1, 1, 1, 1}), Crossings(4, 3));
    EXPECT_EQ(CountOf({1, -1, 1, -1, 1, -1, 1, -1, 1, -1, 1, -1, 1}), Crossings(12, 11));
    EXPECT_EQ(CountOf({-1, 0, 1, 0, -1, 0, 1, 0, -1, 0, 1, 0, -1}), Crossings(6, 11));
}

// The product of two tiny ordinates is a zero, which is not below zero.
TEST(CrossingCount, MissesAChangeWhoseProductUnderflows)
{
    EXPECT_EQ(CountOf({1e-200, -1e-200, -1e-200}), Crossings(0, -1));
    EXPECT_EQ(CountOf({1e-200, 0, -1e-200}), Crossings(0, -1));
    EXPECT_EQ(CountOf({1e-150, -1e-150, -1e-150}), Crossings(1, 0));
}

TEST(CrossingCount, TakesNaNForNoCrossing)
{
    EXPECT_EQ(CountOf({nan, nan, nan}), Crossings(0, -1));
    EXPECT_EQ(CountOf({1, nan, -1}), Crossings(0, -1));
    EXPECT_EQ(CountOf({1, -1, nan}), Crossings(1, 0));
    EXPECT_EQ(CountOf({infinity, -infinity, 0}), Crossings(1, 0));
}

// ---- cutting a polygon

/// The construction by rows, from its definition.
template <int N, typename Step>
void CutByRows(const std::array<vector2d, N + 1>& bez, std::array<vector2d, N + 1>& left,
               std::array<vector2d, N + 1>& right, Step step)
{
    std::vector<vector2d> row(bez.begin(), bez.end());
    for (std::size_t level = 0; level <= N; ++level) {
        left[level] = row.front();
        right[N - level] = row.back();
        for (std::size_t i = 0; i + 1 < row.size(); ++i)
            row[i] = step(row[i], row[i + 1]);
        row.pop_back();
    }
}

TEST(PolygonSplit, InTheMiddleHalvesTheAbscissae)
{
    const std::array<double, 4> c = {1, 0, 0, -0.5};
    std::array<vector2d, 4> bez, left, right;
    PolynomialToBernsteinT<3, 0>::Convert(c.data(), bez.data());
    left[0] = bez[0];
    right[3] = bez[3];
    SplitBezierT<3>::Split(bez.data() + 1, left.data(), right.data());
    for (int i = 0; i <= 3; ++i) {
        EXPECT_NEAR(left[static_cast<std::size_t>(i)].x, i / 6.0, epsilon);
        EXPECT_NEAR(right[static_cast<std::size_t>(i)].x, 0.5 + i / 6.0, epsilon);
    }
}

TEST(PolygonSplit, FollowsDeCasteljauToTheBit)
{
    RandomSource random(44);
    ForEachDegree<3, 12>([&](auto degree) {
        constexpr int N = degree;
        int differing = 0;
        for (int repeat = 0; repeat < 200; ++repeat) {
            std::array<vector2d, N + 1> bez, expectedLeft, expectedRight;
            for (vector2d& p : bez)
                p = AsVector(random.Point(1.0));
            const double t = repeat == 0 ? 0.5 : random.Uniform(0.0, 1.0);
            Guarded<vector2d, N + 1> left, right;
            *left.data() = bez[0];
            *(right.data() + N) = bez[N];
            SplitBezierT<N>::Split(bez.data() + 1, t, left.data(), right.data());
            CutByRows<N>(bez, expectedLeft, expectedRight, [t](const vector2d& p, const vector2d& q) {
                return vector2d{p.x + (q.x - p.x) * t, p.y + (q.y - p.y) * t};
            });
            EXPECT_TRUE(SameBits(left.data(), expectedLeft.data(), N + 1));
            EXPECT_TRUE(SameBits(right.data(), expectedRight.data(), N + 1));
            EXPECT_TRUE(SameBits(left[N], right[0]));

            SplitBezierT<N>::Split(bez.data() + 1, left.data(), right.data());
            CutByRows<N>(bez, expectedLeft, expectedRight, [](const vector2d& p, const vector2d& q) {
                return vector2d{(p.x + q.x) * 0.5, (p.y + q.y) * 0.5};
            });
            EXPECT_TRUE(SameBits(left.data(), expectedLeft.data(), N + 1));
            EXPECT_TRUE(SameBits(right.data(), expectedRight.data(), N + 1));
            EXPECT_TRUE(left.IsIntact() && right.IsIntact());

            std::array<vector2d, N + 1> atHalf;
            atHalf[0] = bez[0];
            SplitBezierT<N>::Split(bez.data() + 1, 0.5, atHalf.data(), right.data());
            differing += SameBits(atHalf.data(), expectedLeft.data(), N + 1) ? 0 : 1;
        }
        EXPECT_GT(differing, 0) << "the middle is no cut at one half";
    });
}

// ---- Newton's method

const std::array<double, 3> squareMinusTwo = {1, 0, -2};
/// The iteration on a double root at 0 halves its argument, exactly.
const std::array<double, 3> square = {1, 0, 0};

TEST(Newton, FindsTheRootOfTwoInFiveSteps)
{
    double iterates[6] = {1.0};
    for (int i = 0; i < 5; ++i)
        iterates[i + 1] = iterates[i] - (-2.0 + iterates[i] * (iterates[i] * 1.0)) / (iterates[i] * 2.0);
    EXPECT_NEAR(std::fabs(iterates[4] - iterates[3]), 2.1e-06, 0.05e-06);
    EXPECT_NEAR(std::fabs(iterates[5] - iterates[4]), 1.6e-12, 0.05e-12);

    double root = -1.0;
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(squareMinusTwo.data(), 1.0, 1e-07, root));
    EXPECT_TRUE(SameBits(root, iterates[5]));
    EXPECT_NEAR(root, std::sqrt(2.0), 1e-15);
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(squareMinusTwo.data(), 1.0, 2.2e-06, root));
    EXPECT_TRUE(SameBits(root, iterates[4]));
}

TEST(Newton, FailsOnAFlatStart)
{
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(squareMinusTwo.data(), 0.0, 1e-07, root));
    EXPECT_TRUE(SameBits(root, sentinel<double>));
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(squareMinusTwo.data(), 0.0, 1.0, 2.0, 1e-07), 0.0);
}

// t^2 + 1/4 from 1/2: the first step, of length 1/2, lands where the slope is 0.
TEST(Newton, GoesBackToTheStartFromAFlatIterate)
{
    const std::array<double, 3> c = {1, 0, 0.25};
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(c.data(), 0.5, 1e-07, root));
    EXPECT_TRUE(SameBits(root, sentinel<double>));
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.5, -1.0, 1.0, 1e-07), 0.5);
}

// A line needs one step, to its root.
TEST(Newton, RejectsAFirstStepOfLengthOne)
{
    const std::array<double, 3> stepOfOne = {0, 1, -1};
    const std::array<double, 3> stepBelowOne = {0, 1, -Below(1.0)};
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(stepOfOne.data(), 0.0, 1e-07, root));
    EXPECT_TRUE(SameBits(root, sentinel<double>));
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(stepBelowOne.data(), 0.0, 1e-07, root));
    EXPECT_EQ(root, Below(1.0));

    const auto guaranteed = [](const auto& c, double lower, double upper) {
        return FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.0, lower, upper, 1e-07);
    };
    EXPECT_EQ(guaranteed(stepOfOne, -1.0, 2.0), 0.0);
    EXPECT_EQ(guaranteed(stepOfOne, 0.5, 2.0), 0.0);
    EXPECT_EQ(guaranteed(stepBelowOne, -1.0, 2.0), Below(1.0));
}

TEST(Newton, TestsTheToleranceBeforeTheGrowth)
{
    const std::array<double, 3> stepOfOne = {0, 1, -1};
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(stepOfOne.data(), 0.0, 1.0, root));
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(stepOfOne.data(), 0.0, Above(1.0), root));
    EXPECT_EQ(root, 1.0);
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(stepOfOne.data(), 0.0, -2.0, 2.0, Above(1.0)), 1.0);
}

// Step k has the length 2^-k.
TEST(Newton, TakesTwoHundredSteps)
{
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(square.data(), 1.0, std::ldexp(1.0, -200), root));
    EXPECT_TRUE(SameBits(root, sentinel<double>));
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(square.data(), 1.0, Above(std::ldexp(1.0, -200)), root));
    EXPECT_EQ(root, std::ldexp(1.0, -200));
    EXPECT_TRUE(FindSolutionNewtonsMethod<2>(square.data(), 1.0, std::ldexp(1.0, -198), root));
    EXPECT_EQ(root, std::ldexp(1.0, -199));
}

TEST(Newton, TakesAHundredStepsWhereItIsGuaranteed)
{
    const auto solve = [](double upper, double tolerance) {
        return FindSolutionNewtonsMethod_Guaranteed<2>(square.data(), 1.0, 0.0, upper, tolerance);
    };
    EXPECT_EQ(solve(2.0, 0.0), std::ldexp(1.0, -100));
    EXPECT_EQ(solve(2.0, std::ldexp(1.0, -98)), std::ldexp(1.0, -99));
    EXPECT_EQ(solve(2.0, Above(std::ldexp(1.0, -100))), std::ldexp(1.0, -100));
    // The last iterate, too, has to lie strictly within the bounds.
    EXPECT_EQ(solve(std::ldexp(1.0, -100), 0.0), 1.0);
    EXPECT_EQ(solve(Above(std::ldexp(1.0, -100)), 0.0), std::ldexp(1.0, -100));
}

TEST(Newton, CountsItsStepsAtEveryDegree)
{
    ForEachDegree<2, 12>([](auto degree) {
        constexpr int N = degree;
        std::array<double, N + 1> c{};
        c[N - 2] = 1.0;
        double root = sentinel<double>;
        EXPECT_FALSE(FindSolutionNewtonsMethod<N>(c.data(), 1.0, std::ldexp(1.0, -200), root));
        EXPECT_TRUE(FindSolutionNewtonsMethod<N>(c.data(), 1.0, Above(std::ldexp(1.0, -200)), root));
        EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<N>(c.data(), 1.0, 0.0, 2.0, 0.0), std::ldexp(1.0, -100));
    });
}

// t^2 + 3/16 from 1/2: to 1/16 by 7/16, and from there by 49/32.
TEST(Newton, KeepsTheIterateBeforeAStepThatGrows)
{
    const std::array<double, 3> c = {1, 0, 0.1875};
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(c.data(), 0.5, 1e-07, root));
    EXPECT_TRUE(SameBits(root, sentinel<double>));
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.5, 0.0, 1.0, 1e-07), 0.0625);
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.5, 0.0625, 1.0, 1e-07), 0.5);
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.5, 0.0, 0.0625, 1e-07), 0.5);
}

// t^2 + 3/16 from 1/4 goes to -1/4 and back, by 1/2 each time.
TEST(Newton, TakesAStepOfEqualLengthForOneThatGrows)
{
    const std::array<double, 3> c = {1, 0, 0.1875};
    double root = sentinel<double>;
    EXPECT_FALSE(FindSolutionNewtonsMethod<2>(c.data(), 0.25, 1e-07, root));
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.25, -1.0, 1.0, 1e-07), -0.25);
    EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.25, 0.0, 1.0, 1e-07), 0.25);
}

TEST(Newton, TakesBothBoundsForOutside)
{
    const std::array<double, 3> c = {0, 1, -0.5};
    const auto solve = [&c](double start, double lower, double upper) {
        return FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), start, lower, upper, 1e-07);
    };
    EXPECT_EQ(solve(0.25, 0.0, 0.5), 0.25);
    EXPECT_EQ(solve(0.25, 0.0, Above(0.5)), 0.5);
    EXPECT_EQ(solve(0.75, 0.5, 1.0), 0.75);
    EXPECT_EQ(solve(0.75, Below(0.5), 1.0), 0.5);
    // A start outside the bounds comes back all the same.
    EXPECT_EQ(solve(0.25, 0.6, 1.0), 0.25);
}

// From 0.9 the iteration on t^2 - 2t + 7/8 leaves (0.5, 1) and comes back to its root near 0.6464.
TEST(Newton, MayLeaveTheBoundsOnItsWay)
{
    const std::array<double, 3> c = {1, -2, 0.875};
    const double first = 0.9 - (0.875 + 0.9 * (-2.0 + 0.9)) / (-2.0 + 2.0 * 0.9);
    ASSERT_LT(first, 0.5);
    EXPECT_NEAR(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.9, 0.5, 1.0, 1e-07), 1.0 - std::sqrt(0.125), 1e-9);
}

TEST(Newton, EndsOnNaN)
{
    const std::array<double, 3> polynomials[] = {{nan, 1, 1}, {1, nan, 1}, {1, 1, nan}, {infinity, 1, -infinity}};
    for (const auto& c : polynomials) {
        double root = sentinel<double>;
        EXPECT_FALSE(FindSolutionNewtonsMethod<2>(c.data(), 0.5, 1e-07, root));
        EXPECT_TRUE(SameBits(root, sentinel<double>));
        EXPECT_EQ(FindSolutionNewtonsMethod_Guaranteed<2>(c.data(), 0.5, 0.0, 1.0, 1e-07), 0.5);
    }
    EXPECT_TRUE(std::isnan(FindSolutionNewtonsMethod_Guaranteed<2>(square.data(), nan, 0.0, 1.0, 1e-07)));
}

// ---- subdivision

/// t - 2^-54 as a cubic, whose root lies within an interval of the least width.
const std::array<double, 4> rootNearZero = {0, 0, 1, -0x1p-54};

TEST(Subdivision, CollapsesAtTheWidthOfTheTolerance)
{
    EXPECT_EQ(Solve<3>(PolygonOf({-1, -1, 1, 1}, 0.0, epsilon), rootNearZero), Roots{0.0});
    EXPECT_EQ(Solve<3>(PolygonOf({-1, -1, 1, 1}, 0.0, Above(epsilon)), rootNearZero), Roots{0x1p-54});
}

TEST(Subdivision, OfACollapsedIntervalGivesItsStartOnce)
{
    EXPECT_EQ(Solve<3>(PolygonOf({1, -1, 1, -1}, 0.5, 0.5), rootNearZero), Roots{0.5});
    EXPECT_EQ(Solve<3>(PolygonOf({1, 1, 1, 1}, 0.5, 0.5), rootNearZero), Roots{});
    EXPECT_EQ(Solve<3>(PolygonOf({0, 0, 0, 0}, 0.5, 0.5), rootNearZero), Roots{});
    // A width that is no number is not above the tolerance.
    auto polygon = PolygonOf({1, -1, 1, -1});
    polygon[3].x = nan;
    EXPECT_EQ(Solve<3>(polygon, rootNearZero), Roots{0.0});
}

TEST(Subdivision, WithoutACrossingNeedsTwoZerosAtTheStart)
{
    EXPECT_EQ(Solve<3>(PolygonOf({0, 0, 1, 1}, 0.25, 0.5), rootNearZero), Roots{0.25});
    EXPECT_EQ(Solve<3>(PolygonOf({-0.0, 0, -1, -1}, 0.25, 0.5), rootNearZero), Roots{0.25});
    EXPECT_EQ(Solve<3>(PolygonOf({0, 0, 0, 0}, 0.25, 0.5), rootNearZero), Roots{0.25});
    EXPECT_EQ(Solve<3>(PolygonOf({0, 1, 1, 1}, 0.25, 0.5), rootNearZero), Roots{});
    EXPECT_EQ(Solve<3>(PolygonOf({1, 1, 0, 0}, 0.25, 0.5), rootNearZero), Roots{});
    EXPECT_EQ(Solve<3>(PolygonOf({0, 1e-300, 1, 1}, 0.25, 0.5), rootNearZero), Roots{});
}

// The derivative of a constant is 0, so that Newton's method gives the start back: the crossing of the leg's chord.
TEST(Subdivision, StartsWhereTheChordOfTheLegCrosses)
{
    const std::array<double, 4> constant = {0, 0, 0, 5};
    RandomSource random(45);
    for (int i = 0; i < 500; ++i) {
        const double below = -random.Uniform(0.01, 1.0);
        const double above = random.Uniform(0.01, 1.0);
        const std::array<vector2d, 4> polygon = {{{0.125, below}, {0.3, below}, {0.41, above}, {0.77, above}}};
        const double expected = 0.3 - (0.41 - 0.3) * (below / (above - below));
        const Roots roots = Solve<3>(polygon, constant);
        ASSERT_EQ(roots.size(), 1u);
        EXPECT_TRUE(SameBits(roots[0], expected));
    }
    EXPECT_EQ(Solve<3>(PolygonOf({-1, -1, 0, 1}, 0.0, 3.0), constant), Roots{2.0});
}

/// A hundred steps of Newton's method on t^12: each takes a twelfth off, and none is short enough to end the search.
double AfterAHundredSteps(double t)
{
    for (int step = 0; step < 100; ++step) {
        const double tenth = std::pow(t, 10.0);
        t = t - t * t * tenth / (12.0 * t * tenth);
    }
    return t;
}

// Two crossings on either side of 0, which are polished together.
TEST(Subdivision, TakesAHundredStepsOnEachOfTwoCrossings)
{
    std::array<double, 13> power{};
    power[0] = 1.0;
    const auto polygon = PolygonOf({1, 1, 1, -5, -5, -5, -5, 1, 1, 1, 1, 1, 1}, -1.0, 1.0);
    const Roots roots = Solve<12>(polygon, power);
    ASSERT_EQ(roots.size(), 2u);

    std::array<vector2d, 13> pieces[2];
    pieces[0][0] = polygon[0];
    pieces[1][12] = polygon[12];
    SplitBezierT<12>::Split(polygon.data() + 1, 0.5, pieces[0].data(), pieces[1].data());
    for (std::size_t side = 0; side < 2; ++side) {
        int i = -1;
        ASSERT_EQ(CrossingCount<12>(pieces[side].data(), i), 1);
        const vector2d from = pieces[side][static_cast<std::size_t>(i)];
        const vector2d to = pieces[side][static_cast<std::size_t>(i) + 1];
        const double start = from.x - (to.x - from.x) * (from.y / (to.y - from.y));
        const double expected = AfterAHundredSteps(start);
        EXPECT_NEAR(roots[side] / expected, 1.0, 1e-9);
    }
}

// t^3 has the triple root 0 and its derivative a double one, so that the first step from s is to s/2.
const std::array<double, 4> cube = {1, 0, 0, 0};

TEST(Sliver, SearchesTheDerivativeFromHalfItsNegativeWidth)
{
    EXPECT_EQ(Solve<3>(PolygonOf({1, -1, -1, 1}, 0.5, 0.5 + 0x1p-24), cube), Roots{-0x1p-26});
    EXPECT_EQ(Solve<3>(PolygonOf({1, -1, -1, 1}, 0.25, 0.25 + 0x1p-23), cube), Roots{-0x1p-25});
}

// (t - 1/4)^2 (t - 3/4)^2 with a sliver at 3/4: the search from near 0 finds the other root.
TEST(Sliver, MayGiveARootOutsideItself)
{
    const std::array<double, 5> c = {1, -2, 1.375, -0.375, 0.03515625};
    const Roots roots = Solve<4>(PolygonOf({1, -1, -1, -1, 1}, 0.75 - 0x1p-25, 0.75 + 0x1p-25), c);
    ASSERT_EQ(roots.size(), 1u);
    EXPECT_NEAR(roots[0], 0.25, 1e-12);
}

TEST(Sliver, IsNarrowerThanTwiceTheRootTolerance)
{
    const Roots roots = Solve<3>(PolygonOf({1, -1, -1, 1}, 0.0, Below(2e-07)), cube);
    ASSERT_EQ(roots.size(), 1u);
    EXPECT_NEAR(roots[0], -5e-08, 1e-20);
    // At the limit it is cut like any other, and either piece has its one crossing.
    EXPECT_EQ(Solve<3>(PolygonOf({1, -1, -1, 1}, 0.0, 2e-07), cube).size(), 2u);
}

// p at the root found is the constant, since the cube of 1e-08 vanishes next to it.
TEST(Sliver, TakesARootOfTheDerivativeWherePIsBelowTheRootTolerance)
{
    const auto polygon = PolygonOf({1, -1, -1, 1}, 0.5, 0.5 + 0x1p-24);
    EXPECT_EQ(Solve<3>(polygon, {1, 0, 0, Below(1e-07)}), Roots{-0x1p-26});
    EXPECT_EQ(Solve<3>(polygon, {1, 0, 0, 1e-07}).size(), 2u);
    EXPECT_EQ(Solve<3>(polygon, {1, 0, 0, -Below(1e-07)}), Roots{-0x1p-26});
    EXPECT_EQ(Solve<3>(polygon, {1, 0, 0, -1e-07}).size(), 2u);
}

TEST(Sliver, IsCutWhereTheDerivativeHasNoRoot)
{
    EXPECT_EQ(Solve<3>(PolygonOf({1, -1, -1, 1}, 0.5, 0.5 + 0x1p-24), {0, 0, 0, 1e-09}).size(), 2u);
    // Three crossings are no pair; the middle one falls on the cut.
    const Roots roots = Solve<3>(PolygonOf({9, -13, 13, -9}, 0.5, 0.5 + 0x1p-24), cube);
    ASSERT_EQ(roots.size(), 2u);
    EXPECT_GT(roots[0], 0.5);
    EXPECT_GT(roots[1], roots[0]);
}

const std::array<double, 4> constantFive = {0, 0, 0, 5};

// The last crossing stands at an end of the interval, so that one piece is the polygon itself.
TEST(Subdivision, EndsWhereACutMakesNoProgress)
{
    const std::array<vector2d, 4> atStart = {{{0.75, 1}, {0.75, -1}, {0.75 + 0x1p-50, 1}, {0.75 + 0x1p-50, 1}}};
    EXPECT_EQ(Solve<3>(atStart, constantFive), Roots{0.75});
    const std::array<vector2d, 4> atEnd = {
        {{0.75, 1}, {0.75 + 0x1p-50, -1}, {0.75 + 0x1p-50, -1}, {0.75 + 0x1p-50, 1}}};
    EXPECT_EQ(Solve<3>(atEnd, constantFive), Roots{0.75});
    // However wide it is.
    const std::array<vector2d, 4> wide = {{{0.0, 1}, {0.0, -1}, {1.0, 1}, {1.0, 1}}};
    EXPECT_EQ(Solve<3>(wide, constantFive), Roots{0.0});
}

/// 96*(t - 1/4)*(t - 1/2)*(t - 3/4): the ordinates -9, 13, -13, 9, and exactly 0 in the middle.
const std::array<double, 4> threeQuarters = {96, -144, 66, -9};

TEST(Subdivision, LosesASimpleRootOnACut)
{
    const Roots roots = RootsOf<3>(threeQuarters, true);
    ASSERT_EQ(roots.size(), 2u);
    EXPECT_NEAR(roots[0], 0.25, 1e-12);
    EXPECT_NEAR(roots[1], 0.75, 1e-12);
}

TEST(Subdivision, LeavesOffOnceItHoldsAsManyRootsAsTheDegree)
{
    const auto polygon = PolygonOf({-9, 13, -13, 9});
    EXPECT_EQ(Solve<3>(polygon, threeQuarters, 0).size(), 2u);
    EXPECT_EQ(Solve<3>(polygon, threeQuarters, 1).size(), 2u);
    const Roots capped = Solve<3>(polygon, threeQuarters, 2);
    ASSERT_EQ(capped.size(), 1u);
    EXPECT_NEAR(capped[0], 0.25, 1e-12);
}

// ---- degree 2

TEST(Quadratic, FindsBothRootsInOrder)
{
    EXPECT_EQ(RootsOf<2>({1, -1, 0.1875}, false), (Roots{0.25, 0.75}));
    EXPECT_EQ(RootsOf<2>({-1, 1, -0.1875}, false), (Roots{0.25, 0.75}));
    EXPECT_EQ(RootsOf<2>({1, -2.25, 0.5}, false), Roots{0.25});
    EXPECT_EQ(RootsOf<2>({1, 1.75, -0.5}, true), Roots{0.25});
    EXPECT_EQ(RootsOf<2>({1, 0, 1}, true), Roots{});
}

TEST(Quadratic, CountsTheEndsWhereAsked)
{
    EXPECT_EQ(RootsOf<2>({1, -1, 0}, true), (Roots{0.0, 1.0}));
    EXPECT_EQ(RootsOf<2>({1, -1, 0}, false), Roots{});
    EXPECT_EQ(RootsOf<2>({2, -3, 1}, true), (Roots{0.5, 1.0}));
    EXPECT_EQ(RootsOf<2>({2, -3, 1}, false), Roots{0.5});
}

TEST(Quadratic, WithARootAtZero)
{
    EXPECT_EQ(RootsOf<2>({2, -1, 0}, true), (Roots{0.0, 0.5}));
    EXPECT_EQ(RootsOf<2>({2, -1, 0}, false), Roots{0.5});
    EXPECT_EQ(RootsOf<2>({1, -2, 0}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<2>({1, 2, -0.0}, true), Roots{0.0});
    double roots[3] = {sentinel<double>, sentinel<double>, sentinel<double>};
    const double doubleZero[] = {1, 0, 0};
    ASSERT_EQ(FindRoots<2>(doubleZero, roots, true), 2);
    EXPECT_TRUE(SameBits(roots[0], 0.0));
    EXPECT_TRUE(SameBits(roots[1], -0.0));
}

// The lone candidate stays in the first element whether it counts or not.
TEST(Quadratic, LeavesItsLoneRootBehind)
{
    const auto firstOf = [](std::array<double, 3> c, bool includeEndpoints, int expectedCount) {
        Guarded<double, 3> roots;
        EXPECT_EQ(FindRoots<2>(c.data(), roots.data(), includeEndpoints), expectedCount);
        EXPECT_TRUE(roots.IsUntouchedFrom(1));
        return roots[0];
    };
    EXPECT_EQ(firstOf({0, 2, -3}, true, 0), 1.5);
    EXPECT_EQ(firstOf({1, -4, 4}, true, 0), 2.0);
    EXPECT_EQ(firstOf({1, -2, 0}, false, 0), 2.0);
    EXPECT_TRUE(SameBits(firstOf({1, 0, 0}, false, 0), -0.0));
    EXPECT_EQ(firstOf({1, -1, 0.25}, false, 1), 0.5);
    EXPECT_EQ(firstOf({0, 0, 1}, true, 0), sentinel<double>);
    EXPECT_EQ(firstOf({1, 0, 1}, true, 0), sentinel<double>);
    EXPECT_EQ(firstOf({1, -5, 6}, true, 0), sentinel<double>);
}

TEST(Quadratic, CountsADoubleRootOnce)
{
    EXPECT_EQ(RootsOf<2>({1, -1, 0.25}, true), Roots{0.5});
    EXPECT_EQ(RootsOf<2>({4, -8, 4}, true), Roots{1.0});
    EXPECT_EQ(RootsOf<2>({4, -8, 4}, false), Roots{});
}

// As a quadratic the root cancels: it is a multiple of 2^-24 there, which 0.3 is not.
TEST(Quadratic, IsALineUpToItsThreshold)
{
    EXPECT_EQ(RootsOf<2>({1e-09, 1, -0.3}, false), Roots{0.3});
    EXPECT_EQ(RootsOf<2>({-1e-09, 1, -0.3}, false), Roots{0.3});
    for (const double leading : {Above(1e-09), -Above(1e-09)}) {
        const Roots roots = RootsOf<2>({leading, 1, -0.3}, false);
        ASSERT_EQ(roots.size(), 1u);
        EXPECT_NE(roots[0], 0.3);
        EXPECT_NEAR(roots[0], 0.3, 1e-07);
    }
}

TEST(Quadratic, OfAlmostNothingHasNoRoot)
{
    EXPECT_EQ(RootsOf<2>({1e-09, 0, 0}, true), Roots{});
    EXPECT_EQ(RootsOf<2>({0, 0, 0}, true), Roots{});
    EXPECT_EQ(RootsOf<2>({0, 1, 0}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<2>({0, 1, 0}, false), Roots{});
    EXPECT_EQ(RootsOf<2>({0, 5e-324, -5e-324}, true), Roots{1.0});
}

TEST(Quadratic, OfNaNHasNoRoot)
{
    EXPECT_EQ(RootsOf<2>({nan, nan, nan}, true), Roots{});
    EXPECT_EQ(RootsOf<2>({1, nan, 1}, true), Roots{});
    EXPECT_EQ(RootsOf<2>({1, 1, nan}, true), Roots{});
    EXPECT_EQ(RootsOf<2>({0, 1, nan}, true), Roots{});
}

// ---- the entry point

TEST(FindRoots, OfTheZeroPolynomialHasNone)
{
    ForEachDegree<2, 12>([](auto degree) {
        EXPECT_EQ(RootsOf<degree>({}, true), Roots{});
        EXPECT_EQ(RootsOf<degree>({}, false), Roots{});
    });
}

TEST(FindRoots, OfACubeGivesBothZerosOfItsLowerDegree)
{
    double roots[4];
    ASSERT_EQ(FindRoots<3>(cube.data(), roots, true), 2);
    EXPECT_TRUE(SameBits(roots[0], 0.0));
    EXPECT_TRUE(SameBits(roots[1], -0.0));
    EXPECT_EQ(FindRoots<3>(cube.data(), roots, false), 0);
}

TEST(FindRoots, LowersTheDegreeOnlyForAnExactZero)
{
    EXPECT_EQ(RootsOf<3>({0, 1, -1, 0.1875}, false), (Roots{0.25, 0.75}));
    EXPECT_EQ(RootsOf<3>({-0.0, 1, -1, 0.1875}, false), (Roots{0.25, 0.75}));
    EXPECT_EQ(RootsOf<12>({0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 1, -1, 0.1875}, false), (Roots{0.25, 0.75}));
    // A tiny coefficient stays, and the roots are polished instead of written down.
    const Roots roots = RootsOf<3>({1e-300, 1, -1.03125, 0.21875}, false);
    ASSERT_EQ(roots.size(), 2u);
    EXPECT_NEAR(roots[0], 0.515625 - std::sqrt(0.047119140625), 1e-12);
    EXPECT_NEAR(roots[1], 0.515625 + std::sqrt(0.047119140625), 1e-12);
}

TEST(FindRoots, IgnoresRootsOutsideTheUnitInterval)
{
    ForEachDegree<3, 12>([](auto degree) {
        constexpr int N = degree;
        // (t + 1)^N and (2 - t)^N
        std::array<double, N + 1> left = {1.0}, right = {1.0};
        for (std::size_t i = 0; i < N; ++i) {
            for (std::size_t k = i + 1; k > 0; --k) {
                left[k] += left[k - 1];
                right[k] = 2.0 * right[k - 1] - right[k];
            }
            right[0] = -right[0];
        }
        for (const bool includeEndpoints : {false, true}) {
            EXPECT_EQ(RootsOf<N>(left, includeEndpoints), Roots{});
            EXPECT_EQ(RootsOf<N>(right, includeEndpoints), Roots{});
        }
    });
}

TEST(FindRoots, AppendsARootAtOne)
{
    EXPECT_EQ(RootsOf<3>({-1, 0, 0, 1}, true), Roots{1.0});
    EXPECT_EQ(RootsOf<3>({-1, 0, 0, 1}, false), Roots{});
    ForEachDegree<3, 12>([](auto degree) {
        std::array<double, degree + 1> c{};
        c[0] = -1.0;
        c[degree] = 1.0;
        EXPECT_EQ(RootsOf<degree>(c, true), Roots{1.0});
    });
}

TEST(FindRoots, AppendsWithinTheToleranceOfZeroAtTheEnds)
{
    EXPECT_EQ(RootsOf<3>({1, 1, 1, epsilon}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<3>({1, 1, 1, epsilon}, false), Roots{});
    EXPECT_EQ(RootsOf<3>({1, 1, 1, Above(epsilon)}, true), Roots{});
    // All ordinates are whole multiples of the tolerance: 5, 5, 5, 1 and 6, 6, 6, 2.
    EXPECT_EQ(RootsOf<3>({-4 * epsilon, 0, 0, 5 * epsilon}, true), Roots{1.0});
    EXPECT_EQ(RootsOf<3>({-4 * epsilon, 0, 0, 6 * epsilon}, true), Roots{});
}

TEST(FindRoots, DoesNotMergeANeighbourWithARootAtTheEnd)
{
    // p(0) = -1e-16 counts as a root, and the crossing right behind it as another.
    const Roots roots = RootsOf<3>({1, 1, 1, -1e-16}, true);
    ASSERT_EQ(roots.size(), 2u);
    EXPECT_EQ(roots[0], 0.0);
    EXPECT_NEAR(roots[1], 1e-16, 1e-18);
}

TEST(FindRoots, AddsARootAtZeroInOrder)
{
    EXPECT_EQ(RootsOf<3>({2, -3, 0, 0}, true).size(), 1u);
    EXPECT_EQ(RootsOf<3>({0, 2, -1, 0}, true), (Roots{0.0, 0.5}));
    EXPECT_EQ(RootsOf<3>({1, 1, 1, 0}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<3>({1, 1, 1, 0}, false), Roots{});
    // t*(2t + 1)*(2t - 1): the lower degree has one root.
    EXPECT_EQ(RootsOf<3>({4, 0, -1, 0}, true), (Roots{0.0, 0.5}));
    EXPECT_EQ(RootsOf<3>({4, 0, -1, 0}, false), Roots{0.5});
}

// The value that the lower degree leaves behind without counting it must not pass for a root at 0.
TEST(FindRoots, AddsARootAtZeroWhereTheLowerDegreeHasNone)
{
    EXPECT_EQ(RootsOf<3>({1e-10, 1, -2, 0}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<3>({1e-10, 1, 1e-08, 0}, true), Roots{0.0});
}

TEST(FindRoots, SnapsARootWithinTheToleranceToZero)
{
    EXPECT_EQ(RootsOf<3>({1e-10, 1, -1e-07, 0}, true), Roots{0.0});
    EXPECT_EQ(RootsOf<3>({1e-10, 1, -Above(1e-07), 0}, true), (Roots{0.0, Above(1e-07)}));
    const Roots roots = RootsOf<3>({1, -0.50000005, 2.5e-08, 0}, true);
    ASSERT_EQ(roots.size(), 2u);
    EXPECT_TRUE(SameBits(roots[0], 0.0));
    EXPECT_NEAR(roots[1], 0.5, 1e-12);
}

TEST(FindRoots, DropsTheRootAtZeroWhereTheArrayIsFull)
{
    EXPECT_EQ(RootsOf<3>({1, -1.5, 0.5, 0}, true), (Roots{0.5, 1.0}));
    EXPECT_EQ(RootsOf<3>({1, -1.5, 0.5, 0}, false), Roots{0.5});
}

// t^2 (t - 1/2)(t - 1): the lower degree drops its zero, and a double one is left to it alone.
TEST(FindRoots, LeavesAZeroOfHigherMultiplicityToTheLowerDegree)
{
    EXPECT_EQ(RootsOf<4>({1, -1.5, 0.5, 0, 0}, true), (Roots{0.5, 1.0}));
    EXPECT_EQ(RootsOf<4>({1, -1.5, 0.5, 0, 0}, false), Roots{0.5});
    EXPECT_EQ(RootsOf<3>({1, -0.5, 0, 0}, true), (Roots{0.0, 0.5}));
}

TEST(FindRoots, OfNaNHasNone)
{
    ForEachDegree<3, 12>([](auto degree) {
        std::array<double, degree + 1> c;
        c.fill(nan);
        EXPECT_EQ(RootsOf<degree>(c, true), Roots{});
        EXPECT_EQ(RootsOf<degree>(c, false), Roots{});
    });
}

// b = -1, 1, 3, NaN: the crossing of the first leg counts, and Newton's method gives its chord's back.
TEST(FindRoots, CountsTheCrossingsOfFiniteOrdinatesBesideNaN)
{
    const Roots roots = RootsOf<3>({nan, 0, 6, -1}, false);
    ASSERT_EQ(roots.size(), 1u);
    EXPECT_TRUE(SameBits(roots[0], 0.0 - (1.0 / 3.0 - 0.0) * (-1.0 / 2.0)));
}

TEST(FindRoots, OfInfinitiesEnds)
{
    RandomSource random(46);
    const double values[] = {infinity, -infinity, nan, 0.0, 1.0, -1.0, 1e308, -1e308, 5e-324};
    ForEachDegree<2, 12>([&](auto degree) {
        for (int i = 0; i < 300; ++i) {
            std::array<double, degree + 1> c;
            for (double& one : c)
                one = values[random.Integer(0, 8)];
            const bool includeEndpoints = i % 2 == 0;
            EXPECT_LE(RootsOf<degree>(c, includeEndpoints).size(), degree + std::size_t{1});
        }
    });
}

/// A polynomial with the given roots in the unit interval, the others well to the left or right of it.
template <int N>
std::array<double, N + 1> WithRoots(const Roots& inside, RandomSource& random)
{
    std::array<double, N + 1> c = {random.Uniform(0.5, 2.0)};
    for (std::size_t i = 0; i < N; ++i) {
        const double outside = random.Integer(0, 1) == 0 ? random.Uniform(-4.0, -1.0) : random.Uniform(2.0, 5.0);
        const double root = i < inside.size() ? inside[i] : outside;
        for (std::size_t k = i + 1; k > 0; --k)
            c[k] -= root * c[k - 1];
    }
    return c;
}

TEST(FindRoots, FindsPlantedSimpleRoots)
{
    RandomSource random(47);
    ForEachDegree<2, 12>([&](auto degree) {
        constexpr int N = degree;
        for (int repeat = 0; repeat < 400; ++repeat) {
            Roots planted;
            double next = random.Uniform(0.02, 0.3);
            while (next < 0.98 && planted.size() < std::min<std::size_t>(N, 4)) {
                planted.push_back(next);
                next += random.Uniform(0.08, 0.5);
            }
            const auto c = WithRoots<N>(planted, random);
            const bool includeEndpoints = repeat % 2 == 0;
            const Roots found = RootsOf<N>(c, includeEndpoints);
            ASSERT_EQ(found.size(), planted.size()) << N;
            for (std::size_t i = 0; i < found.size(); ++i)
                EXPECT_NEAR(found[i], planted[i], 1e-08) << N;
        }
    });
}

TEST(FindRoots, LeavesASmallResidual)
{
    RandomSource random(48);
    ForEachDegree<3, 12>([&](auto degree) {
        constexpr int N = degree;
        int total = 0;
        for (int repeat = 0; repeat < 1000; ++repeat) {
            const auto c = RandomCoefficients<N>(random, 1.0);
            const Roots roots = RootsOf<N>(c, repeat % 2 == 0);
            EXPECT_TRUE(std::is_sorted(roots.begin(), roots.end()));
            for (const double root : roots) {
                EXPECT_GE(root, 0.0);
                EXPECT_LE(root, 1.0);
                EXPECT_NEAR(ValueAt<N>(c, root), 0.0, 1e-10);
                ++total;
            }
        }
        EXPECT_GT(total, 300);
    });
}

TEST(FindRoots, FindsEverySignChangeOfASample)
{
    RandomSource random(49);
    ForEachDegree<3, 12>([&](auto degree) {
        constexpr int N = degree;
        for (int repeat = 0; repeat < 200; ++repeat) {
            const auto c = RandomCoefficients<N>(random, 1.0);
            const Roots roots = RootsOf<N>(c, false);
            constexpr int samples = 64;
            for (int i = 0; i < samples; ++i) {
                const double from = static_cast<double>(i) / samples;
                const double to = static_cast<double>(i + 1) / samples;
                if (ValueAt<N>(c, from) * ValueAt<N>(c, to) < 0.0) {
                    EXPECT_TRUE(std::any_of(roots.begin(), roots.end(), [=](double r) { return from < r && r < to; }));
                }
            }
        }
    });
}

// A power of two changes no sign and no quotient.
TEST(FindRoots, DoesNotDependOnTheScaleOfItsCoefficients)
{
    RandomSource random(50);
    for (int repeat = 0; repeat < 500; ++repeat) {
        const auto c = RandomCoefficients<5>(random, 1.0);
        auto scaled = c;
        for (double& one : scaled)
            one = std::ldexp(one, 300);
        const Roots roots = RootsOf<5>(c, false);
        const Roots same = RootsOf<5>(scaled, false);
        EXPECT_EQ(roots, same);
    }
}

// At most once by the derivative's test, at most twice by crossings that rounding makes.
TEST(FindRoots, GivesADoubleRootAtMostTwice)
{
    RandomSource random(51);
    for (int repeat = 0; repeat < 1000; ++repeat) {
        const double root = random.Uniform(0.05, 0.95);
        const auto c = WithRoots<6>({root, root}, random);
        const Roots found = RootsOf<6>(c, false);
        EXPECT_LE(found.size(), 2u);
        for (const double one : found)
            EXPECT_NEAR(one, root, 1e-06);
    }
}

} // namespace

} // namespace ZarnMath::RootFinder
