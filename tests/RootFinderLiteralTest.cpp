#include "ZarnMath/RootFinder.h"
#include "tests/LiteralRootFinder.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <gtest/gtest.h>
#include <random>

// The library's root finder isolates first, polishes several roots side by side and works on both coordinates at once;
// none of that may show in a single bit.

namespace ZarnMath {
namespace {

template <int N>
using Coefficients = std::array<double, N + 1>;

/// Seeded polynomials of every kind that the steps of the root finder tell apart.
template <int N>
class Polynomials
{
public:
    Coefficients<N> RandomOrdinates()
    {
        return FromOrdinates([this] { return Uniform(); });
    }

    Coefficients<N> WholeOrdinates()
    {
        return FromOrdinates([this] { return std::round(4.0 * Uniform()); });
    }

    Coefficients<N> AnyMagnitude()
    {
        return FromOrdinates([this] { return Uniform() * std::pow(10.0, 300.0 * Uniform()); });
    }

    Coefficients<N> TinyOrdinates()
    {
        return FromOrdinates([this] { return 1e-16 * Uniform(); });
    }

    Coefficients<N> ZerosAndUnderflow()
    {
        constexpr std::array<double, 6> values = {0.0, -0.0, 1.0, -1.0, 1e-200, -1e-200};
        return FromOrdinates([this, &values] { return values[Below(values.size())]; });
    }

    Coefficients<N> EveryLegCrosses()
    {
        double sign = 1.0;
        return FromOrdinates([this, &sign] {
            sign = -sign;
            return sign * (1.0 + 0.1 * Uniform());
        });
    }

    Coefficients<N> NotFinite()
    {
        constexpr std::array<double, 3> values = {HUGE_VAL, -HUGE_VAL, std::numeric_limits<double>::quiet_NaN()};
        Coefficients<N> c = RandomOrdinates();
        for (std::size_t i = 0; i <= Below(2); ++i)
            c[Below(N + 1)] = values[Below(values.size())];
        return c;
    }

    Coefficients<N> AnyBits()
    {
        Coefficients<N> c;
        for (double& value : c) {
            const std::uint64_t bits = engine();
            std::memcpy(&value, &bits, sizeof value);
        }
        return c;
    }

    Coefficients<N> PlantedRoots()
    {
        double root = 0.0;
        return FromRoots([this, &root] {
            if (Below(3) != 0)
                root = Below(4) == 0 ? static_cast<double>(Below(65)) / 64.0 : 0.5 + Uniform();
            return root;
        });
    }

    Coefficients<N> Squares()
    {
        std::array<double, N / 2 + 1> half;
        for (double& value : half)
            value = Uniform();
        Coefficients<N> c{};
        for (std::size_t i = 0; i < half.size(); ++i)
            for (std::size_t j = 0; j < half.size(); ++j)
                c[i + j + N % 2] += half[i] * half[j];
        return c;
    }

    Coefficients<N> VanishingEnds()
    {
        Coefficients<N> c;
        for (double& value : c)
            value = std::round(10.0 * Uniform());
        for (const std::size_t i : {std::size_t{0}, std::size_t{1}, std::size_t{N - 1}, std::size_t{N}})
            if (Below(2) == 0)
                c[i] = 0.0;
        return c;
    }

    Coefficients<N> ClosePairs()
    {
        double root = 0.0;
        bool second = true;
        return FromRoots([this, &root, &second] {
            second = !second;
            root = second ? root + 1e-7 * Uniform() : 0.5 + 0.5 * Uniform();
            return root;
        });
    }

    /// Two roots next to 0 below a last ordinate that is huge: the last sign change stays at the last leg, where a cut
    /// takes off least, all the way down.
    Coefficients<N> SteepEnds()
    {
        const auto magnitude = [this](double exponent) { return std::pow(10.0, exponent + 10.0 * Uniform()); };
        Coefficients<N> c{};
        c[0] = magnitude(290.0);
        c[N - 1] = -magnitude(0.0);
        c[N] = magnitude(-30.0);
        return c;
    }

    bool Coin()
    {
        return Below(2) == 0;
    }

private:
    double Uniform()
    {
        return static_cast<double>(engine() >> 11) * 0x1p-52 - 1.0;
    }

    std::size_t Below(std::size_t n)
    {
        return static_cast<std::size_t>(engine() % n);
    }

    template <typename Draw>
    Coefficients<N> FromOrdinates(Draw draw)
    {
        std::array<double, N + 1> differences;
        for (double& value : differences)
            value = draw();
        Coefficients<N> c;
        for (std::size_t i = 0; i <= N; ++i) {
            c[N - i] = Literal::binomials[N][i] * differences[0];
            for (std::size_t j = 0; j + i < N; ++j)
                differences[j] = differences[j + 1] - differences[j];
        }
        return c;
    }

    template <typename Draw>
    Coefficients<N> FromRoots(Draw draw)
    {
        Coefficients<N> c{100.0};
        for (std::size_t degree = 1; degree <= N; ++degree) {
            const double root = draw();
            for (std::size_t i = degree; i > 0; --i)
                c[i] -= root * c[i - 1];
        }
        return c;
    }

    std::mt19937_64 engine{20240229 + N};
};

template <int N>
struct Kind
{
    const char* name;
    Coefficients<N> (Polynomials<N>::*draw)();
};

template <int N>
constexpr std::array<Kind<N>, 13> kinds = {{
    {"random ordinates", &Polynomials<N>::RandomOrdinates},
    {"whole ordinates", &Polynomials<N>::WholeOrdinates},
    {"ordinates of any magnitude", &Polynomials<N>::AnyMagnitude},
    {"tiny ordinates", &Polynomials<N>::TinyOrdinates},
    {"zeros and products that underflow", &Polynomials<N>::ZerosAndUnderflow},
    {"a sign change at every leg", &Polynomials<N>::EveryLegCrosses},
    {"NaN and infinities", &Polynomials<N>::NotFinite},
    {"any bits at all", &Polynomials<N>::AnyBits},
    {"planted roots, on cuts and multiple", &Polynomials<N>::PlantedRoots},
    {"squares, all roots double", &Polynomials<N>::Squares},
    {"vanishing ends", &Polynomials<N>::VanishingEnds},
    {"close pairs of roots", &Polynomials<N>::ClosePairs},
    {"steep ends", &Polynomials<N>::SteepEnds},
}};

template <typename Degree>
class RootFinderAgainstLiteral : public testing::Test
{};

template <int N>
using Degree = std::integral_constant<int, N>;
using Degrees = testing::Types<Degree<3>, Degree<4>, Degree<5>, Degree<6>, Degree<7>, Degree<8>, Degree<9>, Degree<10>,
                               Degree<11>, Degree<12>>;
TYPED_TEST_SUITE(RootFinderAgainstLiteral, Degrees);

/// What no root is, so that a write beyond the count shows.
template <int N>
std::array<double, N + 3> Untouched()
{
    std::array<double, N + 3> values;
    for (std::size_t i = 0; i < values.size(); ++i)
        values[i] = -77.0 - static_cast<double>(i);
    return values;
}

/// A cut at the last of two changes leaves at most (N - 1)/N of the width, and none is made at a width of 2^-52.
template <int N>
const int mostLevels = 1 + static_cast<int>(std::ceil(52.0 / std::log2(N / (N - 1.0))));

TYPED_TEST(RootFinderAgainstLiteral, GivesTheSameBitsAndGoesNoDeeperThanTheFloorAllows)
{
    constexpr int N = TypeParam::value;
    constexpr int casesOfAKind = 900; // 117,000 polynomials over all kinds and degrees
    Polynomials<N> polynomials;
    Literal::deepestLevel = 0;
    for (const auto& [name, draw] : kinds<N>) {
        for (int i = 0; i < casesOfAKind; ++i) {
            const Coefficients<N> c = (polynomials.*draw)();
            const bool includeEndpoints = polynomials.Coin();
            auto expected = Untouched<N>();
            auto actual = expected;
            const int expectedCount = Literal::FindRoots<N>(c.data(), expected.data(), includeEndpoints);
            const int count = RootFinder::FindRoots<N>(c.data(), actual.data(), includeEndpoints);
            ASSERT_EQ(count, expectedCount) << name << ", case " << i;
            ASSERT_LE(Literal::deepestLevel, mostLevels<N>) << name << ", case " << i;
            for (std::size_t k = 0; k < expected.size(); ++k)
                ASSERT_TRUE(Literal::HasSameBits(actual[k], expected[k]))
                    << name << ", case " << i << ", element " << k << ": " << actual[k] << " for " << expected[k];
        }
    }
    EXPECT_EQ(Literal::deepestLevel, mostLevels<N>); // the steep ends go all the way
}

TYPED_TEST(RootFinderAgainstLiteral, ContinuesAnArrayThatHoldsRootsAlready)
{
    constexpr int N = TypeParam::value;
    Polynomials<N> polynomials;
    for (int i = 0; i < 2000; ++i) {
        const Coefficients<N> c = polynomials.RandomOrdinates();
        vector2d bez[N + 1];
        Literal::ToBernstein<N>(c.data(), bez);
        const int before = i % (N + 2);
        std::array<double, 2 * N + 4> expected;
        expected.fill(-77.0);
        auto actual = expected;
        int expectedCount = before;
        int count = before;
        Literal::Solve<N>(bez, c.data(), expected.data(), expectedCount);
        RootFinder::SolvePolynomial_BezierDivide_NewtonsMethod<N>(bez, c.data(), actual.data(), count);
        ASSERT_EQ(count, expectedCount);
        ASSERT_EQ(actual, expected);
    }
}

} // namespace
} // namespace ZarnMath
