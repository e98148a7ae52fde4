#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/RootFinder.h"

#include <utility>

namespace ZarnMath::CubicBezier {

namespace {

/// How far, squared, the control points of a straight curve may lie from their line, and a crossing from that curve.
constexpr double straightnessSquared = 4.0;

/// Whether a crossing with the chord of a straight curve counts as one with the curve.
///
/// @param[out] s where the nearest point of the curve is, strictly between its ends
bool IsOnStraightCurve(const PowerForm& straight, const point2d& crossing, double& s) noexcept
{
    const auto& [a, b, c, d] = straight;
    point2d closest{};
    double distanceSquared = 0.0;
    // A NaN leaves the parameter unwritten, and out of range.
    s = -1.0;
    return FindClosestPointOnBezier(a, b, c, d, crossing, s, closest, distanceSquared) && 0.0 < s && s < 1.0 &&
           distanceSquared < straightnessSquared;
}

} // namespace

bool StraightBezierIntersectionTest(const point2d* straight, const point2d* other,
                                    std::vector<double>& straightParameters, std::vector<double>& otherParameters,
                                    std::vector<point2d>& points)
{
    if (!AreCollinear(straight, 4, straightnessSquared))
        return false;
    const PowerForm straightForm = ToPowerForm(straight);
    const PowerForm otherForm = ToPowerForm(other);
    const point2d chord[2] = {straight[0], straight[3]};
    double roots[4];
    const int count = FindRootsOnLine(otherForm, chord, roots, false);
    bool found = false;
    for (int i = 0; i < count; ++i) {
        const point2d crossing = Evaluate(otherForm, roots[i]);
        double s = 0.0;
        if (!IsOnStraightCurve(straightForm, crossing, s))
            continue;
        straightParameters.push_back(s);
        otherParameters.push_back(roots[i]);
        points.push_back(crossing);
        found = true;
    }
    return found;
}

void FindBezierIntersections(point2d a1, point2d b1, point2d c1, point2d d1, point2d a2, point2d b2, point2d c2,
                             point2d d2, std::vector<double>& firstParameters, std::vector<double>& secondParameters,
                             std::vector<point2d>& points)
{
    const bool exchanged = a1.x == 0.0 && a1.y == 0.0;
    if (exchanged) {
        std::swap(a1, a2);
        std::swap(b1, b2);
        std::swap(c1, c2);
        std::swap(d1, d2);
    }
    double polynomial[10];
    GetBezierIntersectionPolynomial(a1, b1, c1, d1, a2, b2, c2, d2, polynomial);
    firstParameters.clear();
    secondParameters.clear();
    points.clear();
    double roots[10];
    const int count = RootFinder::FindRoots<9>(polynomial, roots, false);
    for (int i = 0; i < count; ++i) {
        const double t = roots[i];
        if (!(0.0 <= t && t <= 1.0))
            continue;
        const point2d crossing = Evaluate(a2, b2, c2, d2, t);
        double onImplicit = 0.0;
        if (!Invert(a1, b1, c1, d1, crossing, onImplicit))
            continue;
        points.push_back(crossing);
        secondParameters.push_back(t);
        firstParameters.push_back(onImplicit);
    }
    if (exchanged)
        firstParameters.swap(secondParameters);
}

void FindBezierIntersections(const point2d* first, const point2d* second, std::vector<double>& firstParameters,
                             std::vector<double>& secondParameters, std::vector<point2d>& points)
{
    if (StraightBezierIntersectionTest(first, second, firstParameters, secondParameters, points))
        return;
    if (StraightBezierIntersectionTest(second, first, secondParameters, firstParameters, points))
        return;
    const PowerForm f = ToPowerForm(first);
    const PowerForm g = ToPowerForm(second);
    const vector2d origin = AsVector(f.d);
    FindBezierIntersections(f.a, f.b, f.c, f.d - origin, g.a, g.b, g.c, g.d - origin, firstParameters, secondParameters,
                            points);
    for (point2d& point : points)
        point = point + origin;
}

void FindBezierIntersections(const POINT* first, const POINT* second, std::vector<double>& firstParameters,
                             std::vector<double>& secondParameters, std::vector<point2d>& points)
{
    FindBezierIntersections(ToDoubleCubic(first).points, ToDoubleCubic(second).points, firstParameters,
                            secondParameters, points);
}

} // namespace ZarnMath::CubicBezier
