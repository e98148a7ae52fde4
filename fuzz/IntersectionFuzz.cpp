/// @file
/// Cubics against each other, against lines and against segments; straight lines among themselves.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

/// The results of one search, before which the vectors hold something.
struct Crossings
{
    Appended<double> first;
    Appended<double> second;
    Appended<point2d> points;

    [[nodiscard]] bool AreAppended() const noexcept
    {
        return first.IsAppended() && second.IsAppended() && points.IsAppended();
    }

    [[nodiscard]] bool AreParallel() const noexcept
    {
        return first.Count() == second.Count() && first.Count() == points.Count();
    }
};

bool IsTakenAsStraight(const point2d* curve)
{
    return AreCollinear(curve, 4, 4.0);
}

bool IsTakenAsStraight(const POINT* curve)
{
    return AreCollinear(curve, 4, 4.0);
}

template <typename P>
void CheckCurves(const P* one, const P* other)
{
    std::vector<double> first;
    std::vector<double> second;
    std::vector<point2d> points;
    Bounded("FindBezierIntersections", [&] { FindBezierIntersections(one, other, first, second, points); });
    Require(first.size() == second.size() && first.size() == points.size(), "the vectors are parallel");
    Require(first.size() <= 9, "at most nine crossings");
    // A crossing with a chord may be a double root, whose search is not confined.
    if (!IsTakenAsStraight(one) && !IsTakenAsStraight(other))
        for (std::size_t i = 0; i < first.size(); ++i)
            Require(IsInUnit(first[i]) && IsInUnit(second[i]), "on both curves");

    const bool meet = Bounded("DoBeziersIntersect", [&] { return DoBeziersIntersect(one, other); });
    const bool sharesEnd = one[0] == other[0] || one[3] == other[0] || one[0] == other[3] || one[3] == other[3];
    Require(meet == (sharesEnd || !first.empty()), "they meet where they share an end or cross");
}

void CheckStages(const Cubic& one, const Cubic& other)
{
    Crossings found;
    const bool isStraight = Bounded("StraightBezierIntersectionTest", [&] {
        return StraightBezierIntersectionTest(one.points, other.points, found.first.Vector(), found.second.Vector(),
                                              found.points.Vector());
    });
    Require(found.AreAppended() && found.AreParallel(), "the straight test appends");
    Require(isStraight == (found.first.Count() > 0) && found.first.Count() <= 3, "at most three crossings");
    for (int i = 0; i < found.first.Count(); ++i)
        Require(IsInside(found.first[i]), "strictly within the straight curve");

    Guarded<double, 10> polynomial;
    GetBezierIntersectionPolynomial(one.a, one.b, one.c, one.d, other.a, other.b, other.c, other.d, polynomial.data());
    Require(polynomial.IsIntact(), "ten coefficients");
    std::vector<double> first{7.0};
    std::vector<double> second{7.0};
    std::vector<point2d> points{{7.0, 7.0}};
    Bounded("FindBezierIntersections of power forms", [&] {
        FindBezierIntersections(one.a, one.b, one.c, one.d, other.a, other.b, other.c, other.d, first, second, points);
    });
    Require(first.size() == second.size() && first.size() == points.size() && first.size() <= 9,
            "the algebraic stage clears its parallel vectors");
    for (std::size_t i = 0; i < first.size(); ++i)
        Require(IsInUnit(first[i]) && IsInUnit(second[i]), "on both curves");

    double k[10];
    ConvertBezierToImplicit(one.a, one.b, one.c, one.d, k[0], k[1], k[2], k[3], k[4], k[5], k[6], k[7], k[8], k[9]);
    if (AreOrdinary(one.points, 4))
        Require(AreSame(k, k, 10) && std::isfinite(k[0] + k[9]), "the implicit form of an ordinary curve is finite");
}

template <typename P>
void CheckLine(const P* curve, const P* line, bool includeEndpoints)
{
    std::vector<double> onCurve{7.0};
    std::vector<double> onLine{7.0};
    const bool found = Bounded("FindBezierLineIntersection", [&] {
        return FindBezierLineIntersection(curve, line, onCurve, onLine, includeEndpoints);
    });
    Require(onCurve.size() == onLine.size() && onCurve.size() <= 4 && found == !onCurve.empty(),
            "at most four crossings, in parallel vectors that were cleared");
    Require(!(line[0] == line[1]) || !found, "a point is no line");
    (void)Bounded("DoesBezierIntersectLineSegment", [&] { return DoesBezierIntersectLineSegment(curve, line); });
}

void CheckAtX(const point2d* curve, double x, bool includeEndpoints)
{
    Appended<double> parameters;
    Require(Bounded("FindBezierIntersectionsAtX",
                    [&] { return FindBezierIntersectionsAtX(curve, x, parameters.Vector(), includeEndpoints); }),
            "true where there was something before");
    Require(parameters.IsAppended() && parameters.Count() <= 4, "at most four are appended");
}

void CheckStraightLines(const point2d* p, double width)
{
    const double squared =
        Bounded("DistanceToLineSegmentSqrd", [&] { return DistanceToLineSegmentSqrd(p[0], p[1], p[2]); });
    Require(!(squared < 0.0), "no square is negative");
    (void)Bounded("DoesFatlineIntersectLine", [&] { return DoesFatlineIntersectLine(p[0], p[1], p[2], p[3], width); });
    for (unsigned long count = 0; count <= 2; ++count)
        Require(AreCollinear(p, count, width), "two points are collinear");
    (void)Bounded("AreCollinear", [&] { return AreCollinear(p, 4, width); });
    Result<point2d> point;
    Result<vector2d> direction;
    GetLeastSquaresLines(p, 1, point.value, direction.value);
    Require(point.IsUntouched() && direction.IsUntouched(), "one point has no line");
    Bounded("GetLeastSquaresLines", [&] { GetLeastSquaresLines(p, 4, point.value, direction.value); });
    Require(direction.value.y == 1.0 || direction.value == vector2d{1.0, 0.0}, "one of the two forms of a line");
}

void CheckIntegerLines(const POINT* points, POINT direction, double tolerance)
{
    Require(AreCollinear(points, 0, tolerance) && AreCollinear(points, 2, tolerance), "two points are collinear");
    (void)AreCollinear(points, 4, tolerance);
    Guarded<POINT, 4> mirrored;
    std::copy_n(points, 4, mirrored.data());
    Bounded("ReflectAcross", [&] { ReflectAcross(direction, points[0], mirrored.data(), 4); });
    Require(mirrored.IsIntact(), "four points");
    ReflectAcross(direction, points[0], nullptr, 4);
}

} // namespace

void FuzzIntersection(Input& input)
{
    const Cubic one = input.Curve();
    const Cubic other = input.Curve();
    const bool includeEndpoints = input.Flag();
    CheckCurves(one.points, other.points);
    CheckStages(one, other);
    CheckLine(one.points, other.points, includeEndpoints);
    CheckAtX(one.points, input.Double(), includeEndpoints);
    const double halfWidth = input.Double();
    (void)Bounded("DoesFatlineIntersectBezier",
                  [&] { return DoesFatlineIntersectBezier(one.points, other.points[0], other.points[1], halfWidth); });
    CheckStraightLines(other.points, halfWidth);
    const IntegerCubic first = input.IntegerCurve();
    const IntegerCubic second = input.IntegerCurve();
    CheckCurves(first.points, second.points);
    CheckLine(first.points, second.points, includeEndpoints);
    CheckIntegerLines(first.points, second.points[0], halfWidth);
}

} // namespace ZarnMath::Fuzzing
