#include "ZarnMath/Random.h"

#include "ZarnMath/RandomInternal.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <sys/resource.h>
#include <thread>
#include <vector>

namespace ZarnMath {
namespace {

constexpr int smallest = std::numeric_limits<int>::min();
constexpr int largest = std::numeric_limits<int>::max();
constexpr std::uint32_t mostBits = 0xFFFFFFFFU;

std::uint32_t Draw(std::mt19937& engine)
{
    return static_cast<std::uint32_t>(engine());
}

/// The rule of the double form, replayed.
double Replay(std::mt19937& engine, double low, double high)
{
    const double r0 = Draw(engine);
    const double r1 = Draw(engine);
    const double f = (r1 * 4294967296.0 + r0) * 5.421010862427522e-20;
    return (high - low) * f + low;
}

/// The rule of the integer form, replayed with 64-bit sums and the mask found bit by bit.
int Replay(std::mt19937& engine, int low, int high)
{
    if (low == high)
        return low;
    const std::int64_t range = std::int64_t{high} - low + 1;
    if (range == 4294967296)
        return static_cast<int>(Draw(engine));
    std::uint64_t mask = 0;
    while (static_cast<std::int64_t>(mask) + 1 < range)
        mask = mask * 2 + 1;
    std::int64_t kept = 0;
    do
        kept = static_cast<std::int64_t>(Draw(engine) & mask);
    while (kept >= range);
    return static_cast<int>(low + kept);
}

template <typename T>
void ExpectReplayed(T low, T high)
{
    for (int i = 0; i < 200; ++i) {
        std::mt19937 copy = GetEngine();
        const T expected = Replay(copy, low, high);
        EXPECT_EQ(Random::Generate(low, high), expected) << low << " to " << high;
        ASSERT_EQ(GetEngine(), copy) << "as many outputs consumed, from " << low << " to " << high;
    }
}

TEST(Random, IsTheStandardTwister)
{
    EXPECT_TRUE((std::is_same_v<decltype(GetEngine()), std::mt19937&>));
    EXPECT_EQ(&GetEngine(), &GetEngine());
}

TEST(Random, DoublesFollowTheirRule)
{
    ExpectReplayed(0.0, 1.0);
    ExpectReplayed(-1e6, 1e6);
    ExpectReplayed(5.0, -3.0);
    ExpectReplayed(1e-300, 2e-300);
}

TEST(Random, IntegersFollowTheirRule)
{
    const std::array<std::array<int, 2>, 14> ranges{{{0, 1},
                                                     {0, 2},
                                                     {0, 3},
                                                     {-1, 1},
                                                     {1, 6},
                                                     {-5, 250},
                                                     {-5, 251},
                                                     {0, 65535},
                                                     {0, 65536},
                                                     {0, largest},
                                                     {smallest, 0},
                                                     {smallest, -1},
                                                     {smallest, largest - 1},
                                                     {smallest, largest}}};
    for (const auto& range : ranges)
        ExpectReplayed(range[0], range[1]);
}

TEST(Random, EqualIntegersDrawNothing)
{
    for (const int value : {5, 0, smallest, largest}) {
        const std::mt19937 before = GetEngine();
        EXPECT_EQ(Random::Generate(value, value), value);
        EXPECT_EQ(GetEngine(), before);
    }
}

TEST(Random, EqualDoublesDrawTwoOutputs)
{
    std::mt19937 copy = GetEngine();
    EXPECT_EQ(Random::Generate(2.0, 2.0), 2.0);
    copy.discard(2);
    EXPECT_EQ(GetEngine(), copy);
}

TEST(Random, OneBitIsTheLowestOfOneOutput)
{
    for (int i = 0; i < 100; ++i) {
        std::mt19937 copy = GetEngine();
        EXPECT_EQ(Random::Generate(0, 1), static_cast<int>(copy() & 1));
        EXPECT_EQ(GetEngine(), copy);
    }
}

TEST(Random, FullRangeIsTheOutputAsItStands)
{
    std::mt19937 copy = GetEngine();
    EXPECT_EQ(Random::Generate(smallest, largest), static_cast<int>(Draw(copy)));
}

TEST(Random, HighBelowLowEnds)
{
    for (int i = 0; i < 100; ++i) {
        (void)Random::Generate(5, 4); // 2^32 values
        (void)Random::Generate(5, 3); // 2^32 - 1 of them
        (void)Random::Generate(largest, smallest);
        (void)Random::Generate(1, smallest);
    }
    for (int i = 0; i < 1000; ++i) {
        const double value = Random::Generate(5.0, -3.0);
        EXPECT_GE(value, -3.0);
        EXPECT_LE(value, 5.0);
    }
}

TEST(Random, StaysWithinItsEnds)
{
    for (int i = 0; i < 10000; ++i) {
        const int die = Random::Generate(1, 6);
        EXPECT_TRUE(die >= 1 && die <= 6);
        const double number = Random::Generate(-2.0, 3.0);
        EXPECT_TRUE(number >= -2.0 && number <= 3.0);
    }
}

/// The state word that comes out as a given output: the tempering is linear over the bits, so that the word is found
/// from what each of its bits does.
std::uint32_t Untemper(std::uint32_t output)
{
    const auto temper = [](std::uint32_t y) {
        y ^= y >> 11;
        y ^= (y << 7) & 0x9D2C5680U;
        y ^= (y << 15) & 0xEFC60000U;
        return y ^ (y >> 18);
    };
    std::array<std::uint32_t, 32> image{};
    std::array<std::uint32_t, 32> source{};
    for (std::size_t i = 0; i < 32; ++i) {
        source[i] = std::uint32_t{1} << i;
        image[i] = temper(source[i]);
    }
    std::uint32_t word = 0;
    for (std::size_t bit = 0; bit < 32; ++bit) {
        std::size_t pivot = bit;
        while ((image[pivot] >> bit & 1) == 0)
            ++pivot;
        std::swap(image[bit], image[pivot]);
        std::swap(source[bit], source[pivot]);
        for (std::size_t i = 0; i < 32; ++i)
            if (i != bit && (image[i] >> bit & 1) != 0) {
                image[i] ^= image[bit];
                source[i] ^= source[bit];
            }
    }
    for (std::size_t bit = 0; bit < 32; ++bit)
        if ((output >> bit & 1) != 0)
            word ^= source[bit];
    return word;
}

/// Seeds a twister so that its first two outputs are as large as can be.
struct LargestFirst
{
    using result_type = std::uint32_t;

    template <typename Iterator>
    void generate(Iterator first, Iterator last) const
    {
        std::fill(first, last, 0U);
        first[397] = Untemper(mostBits); // word i of the first turn is word i + 397 and parts of words i and i + 1
        first[398] = Untemper(mostBits);
    }
};

TEST(Random, HighIsReachable)
{
    LargestFirst seeds;
    std::mt19937 largestFirst(seeds);
    std::mt19937 copy = largestFirst;
    ASSERT_EQ(Draw(copy), mostBits);
    ASSERT_EQ(Draw(copy), mostBits);
    GetEngine() = largestFirst;
    EXPECT_EQ(Random::Generate(0.0, 1.0), 1.0);
    GetEngine() = largestFirst;
    EXPECT_EQ(Random::Generate(-3.0, 5.0), 5.0);
    GetEngine() = largestFirst;
    EXPECT_EQ(Random::Generate(smallest, largest), -1);
    GetEngine() = largestFirst;
    EXPECT_EQ(Random::Generate(10, 17), 17);
}

TEST(Random, SecondDrawIsTheUpperHalf)
{
    GetEngine().seed(5489);
    // The first two outputs of the standard's own seed.
    EXPECT_EQ(Random::Generate(0.0, 1.0), (581869302.0 * 4294967296.0 + 3499211612.0) * 0x1p-64);
    GetEngine().seed(5489);
    EXPECT_EQ(Random::Generate(smallest, largest), static_cast<int>(3499211612U));
}

double ChiSquare(const std::vector<int>& counts, int draws)
{
    const double expected = static_cast<double>(draws) / static_cast<double>(counts.size());
    double sum = 0.0;
    for (const int count : counts)
        sum += (count - expected) * (count - expected) / expected;
    return sum;
}

/// Far beyond any honest draw: the sum has the mean k - 1 and the deviation sqrt(2 (k - 1)).
double GenerousBound(std::size_t cells)
{
    const double freedom = static_cast<double>(cells) - 1.0;
    return freedom + 10.0 * std::sqrt(2.0 * freedom) + 30.0;
}

TEST(Random, IntegersAreUniform)
{
    constexpr int draws = 200000;
    for (const int cells : {2, 3, 7, 10, 17, 100}) {
        std::vector<int> counts(static_cast<std::size_t>(cells));
        for (int i = 0; i < draws; ++i)
            ++counts[static_cast<std::size_t>(Random::Generate(-5, cells - 6) + 5)];
        EXPECT_LT(ChiSquare(counts, draws), GenerousBound(counts.size())) << cells;
    }
}

TEST(Random, DoublesAreUniform)
{
    constexpr int draws = 200000;
    std::vector<int> counts(64);
    std::vector<int> fine(64);
    for (int i = 0; i < draws; ++i) {
        const double number = Random::Generate(0.0, 1.0) * 64.0;
        ++counts[static_cast<std::size_t>(std::min(number, 63.0))];
        ++fine[static_cast<std::size_t>(std::min(std::fmod(number * 1048576.0, 64.0), 63.0))];
    }
    EXPECT_LT(ChiSquare(counts, draws), GenerousBound(counts.size()));
    EXPECT_LT(ChiSquare(fine, draws), GenerousBound(fine.size()));
}

TEST(Random, EachThreadHasItsOwnGenerator)
{
    constexpr std::size_t threads = 8;
    std::array<std::array<int, 4>, threads> draws{};
    std::array<std::mt19937*, threads> engines{};
    std::vector<std::thread> running;
    for (std::size_t i = 0; i < threads; ++i)
        running.emplace_back([&draw = draws[i], &engine = engines[i]] {
            engine = &GetEngine();
            for (int& value : draw)
                value = Random::Generate(smallest, largest);
        });
    for (std::thread& thread : running)
        thread.join();
    for (std::size_t i = 0; i < threads; ++i)
        for (std::size_t j = 0; j < i; ++j)
            EXPECT_NE(draws[i], draws[j]);
    for (std::mt19937* engine : engines)
        EXPECT_NE(engine, &GetEngine());
}

/// Sets how many files may be open.
void LimitFiles(rlim_t files)
{
    rlimit limit{};
    getrlimit(RLIMIT_NOFILE, &limit);
    limit.rlim_cur = std::min(files, limit.rlim_max);
    setrlimit(RLIMIT_NOFILE, &limit);
}

template <typename Generate>
bool Throws(Generate generate)
{
    try {
        generate();
    } catch (const std::exception&) {
        return true;
    }
    return false;
}

/// In a thread of its own, whose generator is not there yet. Ends the process with 0 if all is as it should be.
[[noreturn]] void DrawWithoutTheDevice()
{
    bool isRight = true;
    const auto expect = [&isRight](bool condition) { isRight = isRight && condition; };
    std::thread([&] {
        LimitFiles(0);
        expect(Random::Generate(5, 5) == 5); // asks for no generator
        expect(Throws([] { (void)Random::Generate(0, 10); }));
        expect(Throws([] { (void)Random::Generate(0.0, 1.0); })); // not taken as seeded
        LimitFiles(64);
        expect(!Throws([] { (void)Random::Generate(0, 10); })); // the next call tries again
        LimitFiles(0);
        expect(!Throws([] { (void)Random::Generate(0.0, 1.0); })); // and from then on needs no device
        LimitFiles(64);                                            // the sanitizers look into files, too
    }).join();
    std::_Exit(isRight ? 0 : 1);
}

TEST(RandomDeathTest, FailingDevicePassesItsExceptionAndIsTriedAgain)
{
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(DrawWithoutTheDevice(), testing::ExitedWithCode(0), "");
}

} // namespace
} // namespace ZarnMath
