// What the fits leave behind when memory runs out, and how often they ask for it.
#include "ZarnMath/BezierOffset.h"
#include "ZarnMath/FitBezier.h"

#include "tests/CountingHeap.h"
#include "tests/FitBezier/Runs.h"
#include "tests/Sentinels.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

using Bezier = Guarded<point2d, 4>;
using Segments = std::vector<CubicBezier::bezier2dT<point2d>>;

constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
constexpr vector2d t1{1.0, 3.0};
constexpr vector2d t2{1.0, -3.0};

PointRun ArchRun()
{
    RandomSource random(1);
    return NoisyRun(random, arch, 12, 3.0);
}

TEST(Allocations, ChordLengthParameters)
{
    const PointRun run = ArchRun();
    const long allocations = FailEveryAllocation(
        [&] {
            std::vector<double> u;
            Calculate_u(run.points.data(), 12, u);
        },
        [] {});
    EXPECT_EQ(allocations, 2); // the parameters and the lengths
}

TEST(Allocations, SingleCubicFromParametersAllocatesNothing)
{
    PointRun run = ArchRun();
    Bezier bezier;
    EXPECT_EQ(FailEveryAllocation(
                  [&] {
                      LeastSquares(run.points.data(), run.u.data(), 12, t1, t2, bezier.data(), 5, nullptr, -1.0);
                      LeastSquares(run.points.data(), run.u.data(), 12, bezier.data(), 5, nullptr);
                  },
                  [] {}),
              0);
}

TEST(Allocations, SingleCubicFromChordLengths)
{
    const PointRun run = ArchRun();
    Bezier bezier;
    const auto isUntouched = [&] { EXPECT_TRUE(bezier.IsUntouchedFrom(0)); };
    EXPECT_EQ(FailEveryAllocation([&] { LeastSquares(run.points.data(), 12, t1, t2, bezier.data(), 5); }, isUntouched),
              2);
    EXPECT_FALSE(bezier.IsUntouchedFrom(0));
    bezier = {};
    EXPECT_EQ(FailEveryAllocation([&] { LeastSquares(run.points.data(), 12, bezier.data(), 5); }, isUntouched), 2);
    EXPECT_FALSE(bezier.IsUntouchedFrom(0));
}

TEST(Allocations, TwoCubics)
{
    PointRun run = ArchRun();
    Bezier a;
    Bezier b;
    const auto areUntouched = [&] {
        EXPECT_TRUE(a.IsUntouchedFrom(0));
        EXPECT_TRUE(b.IsUntouchedFrom(0));
    };
    EXPECT_EQ(FailEveryAllocation([&] { LeastSquares(run.points.data(), 12, 6, t1, t2, a.data(), b.data(), 5); },
                                  areUntouched),
              4); // two more, for the halves
    EXPECT_FALSE(a.IsUntouchedFrom(0));
    a = {};
    b = {};
    EXPECT_EQ(
        FailEveryAllocation(
            [&] { LeastSquares(run.points.data(), run.u.data(), 12, 6, t1, t2, a.data(), b.data(), 5); }, areUntouched),
        2);
    EXPECT_FALSE(a.IsUntouchedFrom(0));
}

TEST(Allocations, ParabolaAppendsAllOrNothing)
{
    const PointRun run = ArchRun();
    std::size_t size = 0;
    const long allocations = FailEveryAllocation(
        [&] {
            size = 1;
            std::vector<double> coefficients(1, 7.0);
            try {
                LeastSquares(run.points.data(), 12UL, coefficients);
            } catch (...) {
                size = coefficients.size();
                throw;
            }
            size = coefficients.size();
        },
        [&] { EXPECT_EQ(size, 1U); });
    EXPECT_EQ(size, 4U);
    EXPECT_EQ(allocations, 2); // the vector as it was, and its growth
}

bool HasSamePoints(const CubicBezier::bezier2dT<point2d>& a, const Cubic& b)
{
    return std::equal(b.begin(), b.end(), a.points);
}

TEST(Allocations, OffsetSegmentsKeepWhatWasThere)
{
    const auto call = [] {
        Segments segments{{{arch[0], arch[1], arch[2], arch[3]}}};
        std::vector<double> validityChanges{sentinel<double>};
        try {
            GetSegmentsToOffset(segments[0], segments, -100.0, &validityChanges);
        } catch (const std::bad_alloc&) {
            EXPECT_TRUE(HasSamePoints(segments[0], arch));
            EXPECT_EQ(validityChanges[0], sentinel<double>);
            throw;
        }
    };
    EXPECT_GE(FailEveryAllocation(call, [] {}), 5);
}

TEST(Allocations, OffsetCurveReservesItsSamplesOnce)
{
    Bezier offset;
    double splitParameter = sentinel<double>;
    const long allocations =
        FailEveryAllocation([&] { FindBezierOffsetCurve(arch.data(), offset.data(), 10.0, 1.0, splitParameter); },
                            [&] { EXPECT_TRUE(offset.IsUntouchedFrom(0)); });
    EXPECT_EQ(allocations, 4); // parameters, points, and those of the fit
    EXPECT_FALSE(offset.IsUntouchedFrom(0));
    EXPECT_EQ(splitParameter, 0.5);
}

} // namespace
} // namespace ZarnMath
