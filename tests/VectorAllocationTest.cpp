// Functions that give their results through vectors allocate only where these grow. A failed allocation comes out as an
// exception and leaves nothing behind.
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/Line.h"

#include "tests/AllocationCases.h"
#include "tests/Sentinels.h"

#include <algorithm>
#include <new>
#include <string>
#include <vector>

namespace ZarnMath {

namespace {

template <typename T>
bool BeginsWithSentinels(const std::vector<T>& elements, std::size_t count)
{
    return elements.size() >= count &&
           std::all_of(elements.begin(), elements.begin() + static_cast<std::ptrdiff_t>(count),
                       [](const T& element) { return HasSameBits(element, sentinel<T>); });
}

/// The vectors that a call may fill.
struct Results
{
    std::vector<double> first;
    std::vector<double> second;
    std::vector<point2d> points;
    std::vector<POINT> integerPoints;

    /// Vectors of `count` sentinels, without room for more.
    [[nodiscard]] static Results Holding(std::size_t count)
    {
        Results results;
        results.first.assign(count, sentinel<double>);
        results.second.assign(count, sentinel<double>);
        results.points.assign(count, sentinel<point2d>);
        results.integerPoints.assign(count, sentinel<POINT>);
        return results;
    }

    [[nodiscard]] bool AreEmpty() const
    {
        return first.empty() && second.empty() && points.empty() && integerPoints.empty();
    }

    /// Whether the vectors begin with what `Holding`(count) put there.
    [[nodiscard]] bool KeepTheirStart(std::size_t count) const
    {
        return BeginsWithSentinels(first, count) && BeginsWithSentinels(second, count) &&
               BeginsWithSentinels(points, count) && BeginsWithSentinels(integerPoints, count);
    }

    void Clear()
    {
        first.clear();
        second.clear();
        points.clear();
        integerPoints.clear();
    }
};

/// A call that gives its results through vectors.
struct VectorCall
{
    const char* name;
    bool onlyAppends;
    void (*call)(const Input&, Results&);
};

const VectorCall vectorCalls[] = {
    {"FindClosestPointsOnBezier", true,
     [](const Input& in, Results& out) {
         CubicBezier::FindClosestPointsOnBezier(in.curve.data(), in.point, out.first, out.points, out.second);
     }},
    {"FindClosestPointsOnBezierOfIntegers", true,
     [](const Input& in, Results& out) {
         CubicBezier::FindClosestPointsOnBezier(in.integerCurve.data(), in.integerPoint, out.first, out.integerPoints,
                                                out.second);
     }},
    {"Invert", true,
     [](const Input& in, Results& out) {
         const auto [a, b, c, d] = in.Form();
         CubicBezier::Invert(a, b, c, d, in.PointOnCurve(), out.first);
     }},
    {"FindBezierIntersections", false,
     [](const Input& in, Results& out) {
         CubicBezier::FindBezierIntersections(in.curve.data(), in.other.data(), out.first, out.second, out.points);
     }},
    {"FindBezierIntersectionsOfIntegers", false,
     [](const Input& in, Results& out) {
         CubicBezier::FindBezierIntersections(in.integerCurve.data(), in.integerOther.data(), out.first, out.second,
                                              out.points);
     }},
    {"StraightBezierIntersectionTest", true,
     [](const Input& in, Results& out) {
         const Cubic straight = {in.line[0], in.line[0], in.line[1], in.line[1]};
         CubicBezier::StraightBezierIntersectionTest(straight.data(), in.other.data(), out.first, out.second,
                                                     out.points);
     }},
    {"FindBezierLineIntersection", false,
     [](const Input& in, Results& out) {
         CubicBezier::FindBezierLineIntersection(in.curve.data(), in.line.data(), out.first, out.second, true);
     }},
    {"FindBezierLineIntersectionOfIntegers", false,
     [](const Input& in, Results& out) {
         CubicBezier::FindBezierLineIntersection(in.integerCurve.data(), in.integerLine.data(), out.first, out.second,
                                                 false);
     }},
    {"FindBezierIntersectionsAtX", true,
     [](const Input& in, Results& out) {
         CubicBezier::FindBezierIntersectionsAtX(in.curve.data(), in.point.x, out.first, true);
     }},
    {"GetVerticalTangents", true,
     [](const Input& in, Results& out) {
         const auto [a, b, c, d] = in.Form();
         CubicBezier::GetVerticalTangents(a, b, c, out.first);
     }},
    {"GetHorizontalTangents", true,
     [](const Input& in, Results& out) {
         const auto [a, b, c, d] = in.Form();
         CubicBezier::GetHorizontalTangents(a, b, c, out.first);
     }},
    {"GetParallels", true,
     [](const Input& in, Results& out) {
         const auto [a, b, c, d] = in.Form();
         bool allParallel;
         CubicBezier::GetParallels(a, b, c, in.line[1] - in.line[0], out.first, allParallel);
     }},
    {"FindOffsetCusps", false,
     [](const Input& in, Results& out) {
         const auto [a, b, c, d] = in.Form();
         CubicBezier::FindOffsetCusps(a, b, c, in.distance, out.first);
     }},
};

/// A call whose vectors are its own.
const VectorCall localCalls[] = {
    {"DoBeziersIntersect", true,
     [](const Input& in, Results&) {
         static_cast<void>(CubicBezier::DoBeziersIntersect(in.curve.data(), in.other.data()));
     }},
    {"DoBeziersIntersectOfIntegers", true,
     [](const Input& in, Results&) {
         static_cast<void>(CubicBezier::DoBeziersIntersect(in.integerCurve.data(), in.integerOther.data()));
     }},
    {"AreCollinearOfIntegers", true,
     [](const Input& in, Results&) { static_cast<void>(AreCollinear(in.integerCurve.data(), 4, 4.0)); }},
};

std::string NameOf(const testing::TestParamInfo<VectorCall>& tested)
{
    return tested.param.name;
}

class VectorCalls : public testing::TestWithParam<VectorCall>
{};

TEST_P(VectorCalls, AllocateNothingWhereThereIsRoom)
{
    constexpr std::size_t room = 16;
    Results results = Results::Holding(room);
    int successes = 0;
    ForManyInputs([&](const Input& in) {
        results.Clear();
        EXPECT_EQ(AllocationsOf([&] { GetParam().call(in, results); }), 0);
        successes += results.AreEmpty() ? 0 : 1;
    });
    EXPECT_GE(successes, 50);
}

TEST_P(VectorCalls, AllocateNothingWhereNothingIsFound)
{
    ForManyInputs([](const Input& in) {
        Results results;
        const long allocations = AllocationsOf([&] { GetParam().call(in, results); });
        EXPECT_EQ(allocations != 0, !results.AreEmpty());
    });
}

INSTANTIATE_TEST_SUITE_P(Allocation, VectorCalls, testing::ValuesIn(vectorCalls), NameOf);

TEST(Allocation, OnlyForTheCrossingsInAPredicate)
{
    ForManyInputs([](const Input& in) {
        const long allocations = AllocationsOf([&] {
            Results crossings;
            CubicBezier::FindBezierIntersections(in.curve.data(), in.other.data(), crossings.first, crossings.second,
                                                 crossings.points);
        });
        bool doIntersect = false;
        const auto ask = [&] { doIntersect = CubicBezier::DoBeziersIntersect(in.curve.data(), in.other.data()); };
        EXPECT_EQ(AllocationsOf(ask), allocations);
        EXPECT_EQ(doIntersect, allocations != 0);
    });
}

TEST(Allocation, NoneForCurvesThatShareAnEnd)
{
    ForManyInputs([](Input in) {
        in.other[3] = in.curve[0];
        in.integerOther[0] = in.integerCurve[3];
        bool doIntersect = false;
        const auto ask = [&] {
            doIntersect = CubicBezier::DoBeziersIntersect(in.curve.data(), in.other.data()) &&
                          CubicBezier::DoBeziersIntersect(in.integerCurve.data(), in.integerOther.data());
        };
        EXPECT_EQ(AllocationsOf(ask), 0);
        EXPECT_TRUE(doIntersect);
    });
}

/// Lets each allocation of a call fail in turn, from the first one on, until the call succeeds.
///
/// @param held the number of sentinels that each vector holds before the call
/// @return the number of times that the call failed
long FailEachAllocation(const VectorCall& tested, const Input& in, std::size_t held)
{
    const Input given = in;
    long failures = 0;
    const auto call = [&] {
        Results results = Results::Holding(held);
        try {
            tested.call(given, results);
        } catch (const std::bad_alloc&) {
            ++failures;
            EXPECT_TRUE(!tested.onlyAppends || results.KeepTheirStart(held)) << "content lost at failure " << failures;
            throw;
        }
    };
    FailEveryAllocation(call, [&] { EXPECT_TRUE(given == in) << "input changed at failure " << failures; });
    return failures;
}

class FailingCalls : public testing::TestWithParam<VectorCall>
{};

TEST_P(FailingCalls, ThrowAndLeakNothing)
{
    for (const std::size_t held : {std::size_t{0}, std::size_t{1}}) {
        long failures = 0;
        ForManyInputs([&](const Input& in) { failures += FailEachAllocation(GetParam(), in, held); });
        EXPECT_GE(failures, 50) << held;
    }
}

INSTANTIATE_TEST_SUITE_P(AllocationWithVectors, FailingCalls, testing::ValuesIn(vectorCalls), NameOf);
INSTANTIATE_TEST_SUITE_P(AllocationWithin, FailingCalls, testing::ValuesIn(localCalls), NameOf);

} // namespace

} // namespace ZarnMath
