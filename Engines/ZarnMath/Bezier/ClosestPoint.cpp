#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

namespace ZarnMath::CubicBezier {

namespace {

/// Half the derivative of |P(t) - q|^2, Dot(P(t) - q, P'(t)).
Polynomial<5> DistancePolynomial(const PowerForm& f, const point2d& q) noexcept
{
    const vector2d offset = f.d - q;
    return {{
        3.0 * Dot(f.a, f.a),
        5.0 * Dot(f.a, f.b),
        4.0 * Dot(f.a, f.c) + 2.0 * Dot(f.b, f.b),
        3.0 * (Dot(f.a, offset) + Dot(f.b, f.c)),
        2.0 * Dot(f.b, offset) + Dot(f.c, f.c),
        Dot(f.c, offset),
    }};
}

/// Substitutes t = 3*s - 1, which carries s in (0, 1) to t in (-1, 2).
Polynomial<5> ExtendRange(const Polynomial<5>& p) noexcept
{
    const auto& [a, b, c, e, f, g] = p.c;
    return {{
        243.0 * a,
        81.0 * (b - 5.0 * a),
        27.0 * (c - 4.0 * b + 10.0 * a),
        9.0 * (e - 3.0 * c + 6.0 * b - 10.0 * a),
        3.0 * (f - 2.0 * e + 3.0 * c - 4.0 * b + 5.0 * a),
        g - f + e - c + b - a,
    }};
}

/// Keeps the nearest of the points at the given parameters; the first among equals.
///
/// @return whether there was any; otherwise the results are untouched
bool KeepNearest(const PowerForm& f, const point2d& q, const double* parameters, int count, double& t, point2d& point,
                 double& distanceSquared) noexcept
{
    if (count == 0)
        return false;
    distanceSquared = std::numeric_limits<double>::max();
    for (int i = 0; i < count; ++i) {
        const point2d candidate = Evaluate(f, parameters[i]);
        const double candidateSquared = LengthSquared(candidate - q);
        if (candidateSquared < distanceSquared) {
            distanceSquared = candidateSquared;
            point = candidate;
            t = parameters[i];
        }
    }
    return true;
}

/// The query point comes by value: a caller's result may be the very point that is asked about.
bool FindClosest(const PowerForm& f, point2d q, double& t, point2d& point, double& distanceSquared) noexcept
{
    double roots[6];
    const int count = RootFinder::FindRoots<5>(DistancePolynomial(f, q).c, roots, true);
    return KeepNearest(f, q, roots, count, t, point, distanceSquared);
}

double Distance(const point2d& p, const point2d& q) noexcept
{
    return std::sqrt(LengthSquared(p - q));
}

/// The point as its overload reports it, in double: rounded to whole units for integer curves.
template <typename P>
P ToReported(const point2d& p) noexcept
{
    if constexpr (std::is_same_v<P, POINT>)
        return ToPOINT(p);
    else
        return p;
}

Side SideOf(double cross) noexcept
{
    if (cross > 0.0)
        return SidePositive;
    return cross < 0.0 ? SideNegative : SideNone;
}

} // namespace

bool FindClosestPointOnBezier(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                              double& t, point2d& point, double& distanceSquared) noexcept
{
    return FindClosest({a, b, c, d}, q, t, point, distanceSquared);
}

bool FindClosestPointOnBezier(const point2d* bezier, const point2d& q, double& t, point2d& point,
                              double& distanceSquared) noexcept
{
    return FindClosest(ToPowerForm(bezier), q, t, point, distanceSquared);
}

bool FindClosestPointOnBezier(const POINT* bezier, const POINT& q, double& t, POINT& point,
                              double& distanceSquared) noexcept
{
    point2d exact{};
    if (!FindClosest(ToPowerForm(bezier), ToPoint2d(q), t, exact, distanceSquared))
        return false;
    point = ToPOINT(exact);
    return true;
}

double FindClosestPointOnBezier(const POINT* bezier, const POINT& q) noexcept
{
    double t = 0.0;
    POINT point{};
    double distanceSquared = 0.0;
    if (FindClosestPointOnBezier(bezier, q, t, point, distanceSquared))
        return t;
    const double toStart = Distance(ToPoint2d(bezier[0]), ToPoint2d(q));
    const double toEnd = Distance(ToPoint2d(bezier[3]), ToPoint2d(q));
    return toStart < toEnd ? 0.0 : 1.0;
}

bool FindClosestPointOnBezierExtendedRange(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                           const point2d& q, double& t, point2d& point,
                                           double& distanceSquared) noexcept
{
    const PowerForm f{a, b, c, d};
    const point2d target = q;
    double roots[6];
    const int count = RootFinder::FindRoots<5>(ExtendRange(DistancePolynomial(f, target)).c, roots, false);
    for (int i = 0; i < count; ++i)
        roots[i] = 3.0 * roots[i] + -1.0;
    return KeepNearest(f, target, roots, count, t, point, distanceSquared);
}

template <typename P>
bool FindClosestPointsOnBezierT(const P* bezier, const P& q, std::vector<double>& ts, std::vector<P>& points,
                                std::vector<double>& squaredDistances)
{
    const PowerForm f = ToPowerForm(bezier);
    const point2d target = ToPoint2d(q);
    double roots[6];
    const int count = RootFinder::FindRoots<5>(DistancePolynomial(f, target).c, roots, false);
    for (int i = 0; i < count; ++i) {
        const P reported = ToReported<P>(Evaluate(f, roots[i]));
        ts.push_back(roots[i]);
        points.push_back(reported);
        squaredDistances.push_back(LengthSquared(target - ToPoint2d(reported)));
    }
    return count > 0;
}

template bool FindClosestPointsOnBezierT<point2d>(const point2d*, const point2d&, std::vector<double>&,
                                                  std::vector<point2d>&, std::vector<double>&);
template bool FindClosestPointsOnBezierT<POINT>(const POINT*, const POINT&, std::vector<double>&, std::vector<POINT>&,
                                                std::vector<double>&);

bool FindClosestPointsOnBezier(const point2d* bezier, const point2d& q, std::vector<double>& ts,
                               std::vector<point2d>& points, std::vector<double>& squaredDistances)
{
    return FindClosestPointsOnBezierT(bezier, q, ts, points, squaredDistances);
}

bool FindClosestPointsOnBezier(const POINT* bezier, const POINT& q, std::vector<double>& ts, std::vector<POINT>& points,
                               std::vector<double>& squaredDistances)
{
    return FindClosestPointsOnBezierT(bezier, q, ts, points, squaredDistances);
}

bool GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q, double& t,
             point2d& point, double& distanceSquared, Side& side) noexcept
{
    const PowerForm f{a, b, c, d};
    const point2d target = q;
    if (!FindClosest(f, target, t, point, distanceSquared))
        return false;
    if (!(0.0 <= t && t <= 1.0))
        return false;
    side = SideOf(Cross(Derivative(f.a, f.b, f.c, t), target - point));
    return true;
}

Side GetSide(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q) noexcept
{
    double t = 0.0;
    point2d point{};
    double distanceSquared = 0.0;
    Side side = SideNone;
    return GetSide(a, b, c, d, q, t, point, distanceSquared, side) ? side : SideNone;
}

bool Invert(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
            double& parameter) noexcept
{
    double t = 0.0;
    point2d point{};
    double distanceSquared = 0.0;
    if (!FindClosestPointOnBezierExtendedRange(a, b, c, d, q, t, point, distanceSquared))
        return false;
    if (!(0.0 <= t && t <= 1.0 && distanceSquared < 0.01))
        return false;
    parameter = t;
    return true;
}

bool Invert(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
            std::vector<double>& parameters)
{
    double t = 0.0;
    if (Invert(a, b, c, d, q, t))
        parameters.push_back(t);
    return !parameters.empty();
}

int FindTangentsToPoint(const point2d& a, const point2d& b, const point2d& c, const point2d& d, const point2d& q,
                        double* parameters) noexcept
{
    const vector2d offset = d - q;
    const double quartic[5] = {
        Cross(a, b), 2.0 * Cross(a, c), 3.0 * Cross(a, offset) + Cross(b, c), 2.0 * Cross(b, offset), Cross(c, offset),
    };
    return RootFinder::FindRoots<4>(quartic, parameters, true);
}

} // namespace ZarnMath::CubicBezier
