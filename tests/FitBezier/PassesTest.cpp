// Which pass of an iterating fit counts, told by passes that are written down beforehand.
#include "ZarnMath/FitBezier/Passes.h"

#include "tests/FitBezier/Runs.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

struct Outcome
{
    int curve; ///< the number of the pass that is kept, from 1 on; 0 for none
    double error;
    int passes; ///< how many were made

    friend bool operator==(const Outcome&, const Outcome&) = default;
};

void PrintTo(const Outcome& outcome, std::ostream* out)
{
    *out << "pass " << outcome.curve << " of " << outcome.passes << ", error " << outcome.error;
}

/// A curve is the number of passes behind it.
Outcome Keep(const std::vector<PassResult>& script, double threshold = noThreshold)
{
    int fit = 0;
    std::size_t made = 0;
    const double error = KeepBestPass(static_cast<int>(script.size()), noFit, threshold, fit, [&](int& curve) {
        ++curve;
        EXPECT_EQ(curve, static_cast<int>(made) + 1); // what did not count is not undone
        return script[made++];
    });
    return {fit, error, static_cast<int>(made)};
}

TEST(KeepBestPass, SmallerErrorsCount)
{
    EXPECT_EQ(Keep({{true, 9.0}, {true, 5.0}, {true, 3.0}}), (Outcome{3, 3.0, 3}));
}

TEST(KeepBestPass, EqualErrorDoesNotCount)
{
    EXPECT_EQ(Keep({{true, 5.0}, {true, 5.0}}), (Outcome{1, 5.0, 2}));
    EXPECT_EQ(Keep({{true, 5.0}, {true, Below(5.0)}}), (Outcome{2, Below(5.0), 2}));
    EXPECT_EQ(Keep({{true, 0.0}, {true, 0.0}, {true, 0.0}}), (Outcome{1, 0.0, 3}));
}

TEST(KeepBestPass, RejectedPassIsFollowedByABetterOne)
{
    EXPECT_EQ(Keep({{true, 5.0}, {true, 7.0}, {true, 4.0}}), (Outcome{3, 4.0, 3}));
    EXPECT_EQ(Keep({{true, 5.0}, {false, 4.5}, {true, 4.0}}), (Outcome{3, 4.0, 3}));
}

TEST(KeepBestPass, ErrorBeyondTwiceTheBestEnds)
{
    EXPECT_EQ(Keep({{true, 5.0}, {true, 10.0}, {true, 4.0}}), (Outcome{3, 4.0, 3}));
    EXPECT_EQ(Keep({{true, 5.0}, {true, Above(10.0)}, {true, 4.0}}), (Outcome{1, 5.0, 2}));
    EXPECT_EQ(Keep({{true, 0.0}, {true, 1e-300}, {true, 0.0}}), (Outcome{1, 0.0, 2}));
}

TEST(KeepBestPass, RepairedPassCountsOnlyAsTheFirst)
{
    EXPECT_EQ(Keep({{false, 5.0}}), (Outcome{1, 5.0, 1}));
    EXPECT_EQ(Keep({{false, 5.0}, {false, 4.0}, {false, 3.0}}), (Outcome{1, 5.0, 3}));
}

TEST(KeepBestPass, ErrorBelowTheThresholdEnds)
{
    EXPECT_EQ(Keep({{true, 5.0}, {true, 3.0}}, Above(5.0)), (Outcome{1, 5.0, 1}));
    EXPECT_EQ(Keep({{true, 5.0}, {true, 3.0}}, 5.0), (Outcome{2, 3.0, 2}));
    EXPECT_EQ(Keep({{true, 9.0}, {false, 1.0}, {true, 3.0}}, 5.0), (Outcome{3, 3.0, 3})); // it has to count
    EXPECT_EQ(Keep({{true, 0.0}, {true, 0.0}}, 1e-300), (Outcome{1, 0.0, 1}));
    EXPECT_EQ(Keep({{true, 0.0}, {true, 0.0}}, -1.0), (Outcome{1, 0.0, 2}));
}

TEST(KeepBestPass, FirstPassCountsWhateverItsError)
{
    EXPECT_EQ(Keep({{false, largestDouble}}), (Outcome{1, largestDouble, 1}));
    int fit = 0;
    const double error = KeepBestPass(1, 2.0, noThreshold, fit, [](int& curve) {
        curve = 1;
        return PassResult{true, 50.0};
    });
    EXPECT_EQ(error, 50.0);
    EXPECT_EQ(fit, 1);
}

TEST(KeepBestPass, NoPassKeepsWhatThereWas)
{
    for (const int iterations : {0, -1}) {
        int fit = 7;
        const auto never = [](int&) {
            ADD_FAILURE();
            return PassResult{true, 0.0};
        };
        EXPECT_EQ(KeepBestPass(iterations, 2.0, noThreshold, fit, never), 2.0);
        EXPECT_EQ(fit, 7);
    }
}

TEST(NormalizeParameters, EndsAreExact)
{
    double u[4] = {3.0, 4.0, 4.5, 5.0};
    NormalizeParameters(u, 4);
    EXPECT_EQ(u[0], 0.0);
    EXPECT_EQ(u[1], 0.5);
    EXPECT_EQ(u[2], 0.75);
    EXPECT_EQ(u[3], 1.0);
    double two[2] = {7.0, 7.0};
    NormalizeParameters(two, 2);
    EXPECT_EQ(two[0], 0.0);
    EXPECT_EQ(two[1], 1.0);
}

TEST(NormalizeParameters, MultipliesByTheReciprocalOfTheSpan)
{
    double u[3] = {1.0, 6.0, 4.0};
    NormalizeParameters(u, 3);
    EXPECT_EQ(u[1], (1.0 / 3.0) * 5.0);
    EXPECT_NE(u[1], 5.0 / 3.0);
}

} // namespace
} // namespace ZarnMath
