// What needs no vector allocates nothing, and a test of integer points for collinearity one temporary.
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/RootFinder.h"

#include "tests/AllocationCases.h"

#include <new>
#include <vector>

namespace ZarnMath {

namespace {

TEST(CountingHeap, SeesAVectorGrowAndGo)
{
    auto* vector = new std::vector<double>;
    const HeapWatch heap;
    vector->push_back(1.0);
    vector->push_back(2.0);
    const long allocations = heap.Allocations();
    const long liveBefore = heap.Live();
    delete vector;
    const long liveAfter = heap.Live();
    EXPECT_EQ(allocations, 2);
    EXPECT_EQ(liveBefore, 1);
    EXPECT_EQ(liveAfter, -1); // the vector itself is older than the watch
}

TEST(CountingHeap, FailsOnceAndAtTheAllocationAskedFor)
{
    std::vector<double> vector;
    const HeapWatch heap(2);
    vector.push_back(1.0);
    bool failed = false;
    try {
        vector.push_back(2.0);
    } catch (const std::bad_alloc&) {
        failed = true;
    }
    vector.push_back(3.0);
    const long allocations = heap.Allocations();
    EXPECT_TRUE(failed);
    EXPECT_EQ(allocations, 2);
    EXPECT_EQ(vector, (std::vector<double>{1.0, 3.0}));
}

/// Expects that f(input) never allocates.
template <typename F>
void ExpectNoAllocations(F f)
{
    ForManyInputs([f](const Input& in) { EXPECT_EQ(AllocationsOf([&] { f(in); }), 0); });
}

template <int N>
void FindRootsOfEachDegree(RandomSource& random)
{
    double c[N + 1];
    double roots[N + 1];
    for (double& coefficient : c)
        coefficient = random.Uniform(-1.0, 1.0);
    RootFinder::FindRoots<N>(c, roots, true);
    RootFinder::FindRoots<N>(c, roots, false);
    if constexpr (N < RootFinder::highestDegree)
        FindRootsOfEachDegree<N + 1>(random);
}

TEST(Allocation, NoneInTheRootFinder)
{
    RandomSource random(allocationSeed);
    for (int i = 0; i < 500; ++i)
        ASSERT_EQ(AllocationsOf([&random] { FindRootsOfEachDegree<2>(random); }), 0);
}

template <typename P>
void CutInEveryWay(const P* curve, double t)
{
    P left[4];
    P right[4];
    P run[10];
    CubicBezier::Split(t, curve, left, right);
    CubicBezier::Split(curve, left, right);
    CubicBezier::Split(t, curve, run);
    CubicBezier::Split(0.5 * t, t, curve, run);
    CubicBezier::LeftOf(t, curve, left);
    CubicBezier::RightOf(t, curve, right);
    CubicBezier::Subsection(0.5 * t, t, curve, left);
}

TEST(Allocation, NoneInCutting)
{
    ExpectNoAllocations([](const Input& in) {
        CutInEveryWay(in.curve.data(), in.t);
        CutInEveryWay(in.integerCurve.data(), in.t);
    });
}

TEST(Allocation, NoneInConstruction)
{
    ExpectNoAllocations([](const Input& in) {
        const auto& [p0, p1, p2, p3] = in.curve;
        POINT out[4];
        CubicBezier::From3Points(out, p0, in.point, p3, false);
        CubicBezier::From3Points(out, p0, in.point, p3, true);
        CubicBezier::From3Points(out, p0, p1 - p0, in.point, p3, p2 - p3);
    });
}

TEST(Allocation, NoneInCurvature)
{
    ExpectNoAllocations([](const Input& in) {
        const auto [a, b, c, d] = in.Form();
        double values[11];
        CubicBezier::GetCurvatureAt(in.t, a, b, c, values[0]);
        CubicBezier::GetCurvatureRadiusAt(in.t, a, b, c, values[0]);
        values[0] = CubicBezier::SafeBezierCurvature(in.t, a, b, c);
        CubicBezier::BezierInflectionPoints(a, b, c, values);
        CubicBezier::FindCurvatureMinMax(a, b, c, values);
        values[0] = CubicBezier::SafeBezierTangent(in.t, a, b, c, d).x;
    });
}

TEST(Allocation, NoneInLength)
{
    ExpectNoAllocations([](const Input& in) {
        constexpr auto accuracy = LengthAccuracy::Order10;
        const auto [a, b, c, d] = in.Form();
        double sum = CubicBezier::Length(a, b, c, 16, 0.0, in.t);
        sum += CubicBezier::Length(a, b, c, accuracy);
        sum += CubicBezier::Length(in.curve.data(), accuracy);
        sum += CubicBezier::LengthTo(in.t, in.curve.data()) + CubicBezier::LengthTo(in.t, in.integerCurve.data());
        sum += CubicBezier::LengthFrom(in.t, in.curve.data()) + CubicBezier::LengthFrom(in.t, in.integerCurve.data());
        sum += CubicBezier::GetCurveRelativeLengthParameter(in.t, a, b, c, 0.01, accuracy);
        static_cast<void>(sum);
    });
}

TEST(Allocation, NoneInTheNearestPoint)
{
    ExpectNoAllocations([](const Input& in) {
        const auto [a, b, c, d] = in.Form();
        double t = 0.0;
        double distanceSquared;
        point2d point;
        POINT integerPoint;
        Side side;
        double parameters[5];
        CubicBezier::FindClosestPointOnBezier(a, b, c, d, in.point, t, point, distanceSquared);
        CubicBezier::FindClosestPointOnBezier(in.curve.data(), in.point, t, point, distanceSquared);
        CubicBezier::FindClosestPointOnBezier(in.integerCurve.data(), in.integerPoint, t, integerPoint,
                                              distanceSquared);
        t += CubicBezier::FindClosestPointOnBezier(in.integerCurve.data(), in.integerPoint);
        CubicBezier::GetSide(a, b, c, d, in.point, t, point, distanceSquared, side);
        side = CubicBezier::GetSide(a, b, c, d, in.point);
        CubicBezier::FindTangentsToPoint(a, b, c, d, in.point, parameters);
    });
}

template <typename P>
bool LooksForLoops(const P* curve)
{
    double s0, s1, t0, t1;
    point2d point;
    const bool isDetected = CubicBezier::DoesBezierSelfIntersect(curve, s0, s1, t0, t1, true);
    return CubicBezier::FindBezierSelfIntersection(curve, s0, t0, point) || isDetected;
}

TEST(Allocation, NoneInImplicitFormsLoopsAndPredicates)
{
    ExpectNoAllocations([](const Input& in) {
        const auto [a, b, c, d] = in.Form();
        double k[10];
        CubicBezier::ConvertBezierToImplicit(a, b, c, d, k[0], k[1], k[2], k[3], k[4], k[5], k[6], k[7], k[8], k[9]);
        bool found = LooksForLoops(in.curve.data());
        found |= LooksForLoops(in.integerCurve.data());
        found |= CubicBezier::DoesBezierIntersectLineSegment(in.curve.data(), in.line.data());
        found |= CubicBezier::DoesBezierIntersectLineSegment(in.integerCurve.data(), in.integerLine.data());
        found |= CubicBezier::DoesFatlineIntersectBezier(in.curve.data(), in.line[0], in.line[1], in.distance);
        static_cast<void>(found);
    });
}

TEST(Allocation, NoneInExtents)
{
    ExpectNoAllocations([](const Input& in) {
        const auto [a, b, c, d] = in.Form();
        BoundsT<double> box;
        CubicBezier::GetTightBounds(a, b, c, d, box.left, box.bottom, box.right, box.top);
        double sum = CubicBezier::GetAreaUnderBezier(a, b, c, d);
        sum += CubicBezier::MapToBezier(in.curve.data(), in.t, in.distance, 1.0).x;
        static_cast<void>(sum);
    });
}

template <typename P>
void FlattenInEveryWay(const P* curve, P* out)
{
    constexpr int most = 2047;
    BezierToLines(curve, out, CalculateNumBezierLines(curve, most) + 1);
    AdaptiveBezierToLines(curve, out, 0.01, most);
}

TEST(Allocation, NoneInFlattening)
{
    static point2d out[2049];
    static POINT integerOut[2049];
    ExpectNoAllocations([](const Input& in) {
        FlattenInEveryWay(in.curve.data(), out);
        FlattenInEveryWay(in.integerCurve.data(), integerOut);
        BezierToLines(in.curve.data(), out, CalculateNumBezierLines(RECT{0, 500, 500, 0}, 64));
    });
}

void ChangeRects(const Input& in, RECT& rect, RECT& other)
{
    InitializeEmpty(rect);
    GetPointsBBox(in.integerCurve.data(), 4, rect);
    UnionPointWithRect(rect, in.point);
    UnionPointWithRect(rect, in.integerPoint);
    UnionPointsWithRect(rect, in.integerOther.data(), 4);
    UnionRect(rect, other);
    IntersectRect(rect, other);
    NormalizeRect(rect);
    TranslateRect(rect, 3, 4);
    TranslateValidRect(rect, 5, 6);
    InflateRect(rect, 7, 8);
}

TEST(Allocation, NoneInBounds)
{
    ExpectNoAllocations([](const Input& in) {
        RECT rect = GetEmptyRect();
        RECT other = GetPointRect(in.integerPoint, 200);
        ChangeRects(in, rect, other);
        BoundsT<double> box = GetPointsBBox(in.curve.data(), 4);
        point2d corners[4];
        POINT integerCorners[4];
        GetRectCorners(box, corners);
        GetRectCorners(rect, integerCorners);
        InitializeEmpty(box);
        other = GetPointRect(GetRectCenter(rect), TruncateToInt(GetRectArea(rect)) % 100, 20);
        const bool isInside = IsPointInRect(in.point, other) || IsPointInRect(in.integerPoint, other) ||
                              IsAnyPointInRect(in.integerCurve.data(), 4, other);
        box = isInside ? IdentityBounds() : box;
    });
}

TEST(Allocation, NoneInLines)
{
    ExpectNoAllocations([](const Input& in) {
        const point2d& p = in.point;
        point2d point;
        vector2d direction;
        IntegerCubic mirrored = in.integerCurve;
        GetLeastSquaresLines(in.curve.data(), 4, point, direction);
        GetLeastSquaresLines(p.x, p.y, p.x * p.y, p.x * p.x, p.y * p.y, &p, 1, point, direction);
        bool found = AreCollinear(in.curve.data(), 4, 4.0);
        found |= DistanceToLineSegmentSqrd(in.line[0], in.line[1], p) < 100.0;
        found |= DoesFatlineIntersectLine(in.curve[0], in.curve[3], in.line[0], in.line[1], in.distance);
        ReflectAcross({3, 4}, in.integerPoint, mirrored.data(), 4);
        static_cast<void>(found);
    });
}

TEST(Allocation, OneForTheConvertedPointsOfACollinearityTest)
{
    const std::vector<POINT> points(1000, POINT{3, 4});
    for (const unsigned long count : {0ul, 1ul, 2ul, 3ul, 4ul, 1000ul}) {
        bool areCollinear = false;
        const auto ask = [&] { areCollinear = AreCollinear(points.data(), count, 1.0); };
        EXPECT_EQ(AllocationsOf(ask), count == 0 ? 0 : 1) << count;
        EXPECT_TRUE(areCollinear) << count;
    }
}

} // namespace

} // namespace ZarnMath
