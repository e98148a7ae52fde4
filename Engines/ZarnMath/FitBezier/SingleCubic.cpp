#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezier/Moments.h"
#include "ZarnMath/FitBezier/Passes.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/SmallMatrix.h"

#include <algorithm>

namespace ZarnMath {

namespace {

using Curve = CubicBezier::bezier2dT<point2d>;

constexpr double third = 1.0 / 3.0;
constexpr double twoThirds = 2.0 / 3.0;

/// The signed lengths of the handles along t1 at the first point and along t2 at the last.
struct HandleLengths
{
    double alpha;
    double beta;
};

/// Handles on the wrong side of their ends get about a third of the chord. Both go by the length of t1.
///
/// @return whether any was on the wrong side
bool RepairSigns(const vector2d& chord, const vector2d& t1, HandleLengths& handles) noexcept
{
    const bool isBad = handles.alpha < 0.0 || handles.beta > 0.0;
    const double chordLength = std::sqrt(Dot(chord, chord));
    const double longer = std::max(std::sqrt(Dot(t1, t1)), chordLength);
    if (handles.alpha < 0.0)
        handles.alpha = chordLength / longer * 0.333;
    if (handles.beta > 0.0)
        handles.beta = chordLength / longer * -0.333;
    return isBad;
}

/// The cubic whose handles are a third of the distance of its ends long, times the length of the tangents.
Curve MakeThirdsCurve(const point2d& start, const point2d& end, const vector2d& t1, const vector2d& t2) noexcept
{
    const double length = std::sqrt(LengthSquared(start - end)) / 3.0;
    return {{start, start + t1 * length, end - t2 * length, end}};
}

Curve MakeStraightCurve(const point2d& start, const point2d& end) noexcept
{
    const vector2d chord = end - start;
    return {{start, start + chord * third, start + chord * twoThirds, end}};
}

void Store(const Curve& curve, point2d* bezier) noexcept
{
    std::copy_n(curve.points, 4, bezier);
}

/// One coefficient of the power form: a row of the inverse times the moments, highest power first.
vector2d SolveRow(const matrix<4, 8, double>& system, unsigned long row, const vector2d (&m)[4]) noexcept
{
    return vector2d{0.0, 0.0} + system(row, 4) * m[3] + system(row, 5) * m[2] + system(row, 6) * m[1] +
           system(row, 7) * m[0];
}

} // namespace

bool LeastSquaresSingleIteration(const point2d* points, const double* u, int count, const vector2d& t1,
                                 const vector2d& t2, point2d* bezier) noexcept
{
    bezier[0] = points[0];
    bezier[3] = points[count - 1];
    Moments sums;
    for (int i = 1; i < count - 1; ++i)
        sums.Add(u[i], points[i] - points[0]);
    const auto& [S0, S1, S2, S3, S4, S5, S6] = sums.s;
    const auto& [A0, A1, A2, A3] = sums.m;

    const double c11 = (S6 + ((6.0 * S4 + (S2 - 4.0 * S3)) - 4.0 * S5)) * Dot(t1, t1);
    const double c12 = (3.0 * S5 + (S3 - 3.0 * S4) - S6) * Dot(t1, t2);
    const double c22 = (S6 + (S4 - 2.0 * S5)) * Dot(t2, t2);
    const double D = c12 * c12 - c11 * c22;
    if (D == 0.0) {
        bezier[1] = bezier[0] + t1;
        bezier[2] = bezier[3] - t2;
        return false;
    }

    const vector2d chord = points[count - 1] - points[0];
    const double r1 = (7.0 * S5 + (3.0 * S3 - 8.0 * S4) - 2.0 * S6) * Dot(t1, chord) - Dot(A3 + (A1 - 2.0 * A2), t1);
    const double r2 = (2.0 * S6 + (3.0 * S4 - 5.0 * S5)) * Dot(t2, chord) - Dot(A2 - A3, t2);
    const double inv = 1.0 / D;
    HandleLengths handles{(c22 * inv * r1 + c12 * (-inv) * r2) / 3.0, (c12 * (-inv) * r1 + c11 * inv * r2) / 3.0};
    const bool isBad = RepairSigns(chord, t1, handles);
    bezier[1] = bezier[0] + t1 * handles.alpha;
    bezier[2] = bezier[3] + t2 * handles.beta;
    return !isBad;
}

bool LeastSquaresSingleIteration(const point2d* points, const double* u, int count, point2d* bezier) noexcept
{
    Moments sums;
    for (int i = 0; i < count; ++i)
        sums.Add(u[i], AsVector(points[i]));
    matrix<4, 8, double> system;
    for (unsigned long i = 0; i < 4; ++i) {
        for (unsigned long j = 0; j < 4; ++j)
            system(i, j) = sums.s[6 - i - j];
        system(i, 4 + i) = 1.0;
    }
    if (!system.GaussJordenEliminate())
        return false;

    const vector2d a = SolveRow(system, 0, sums.m);
    const vector2d b = SolveRow(system, 1, sums.m);
    const vector2d c = SolveRow(system, 2, sums.m);
    const vector2d d = SolveRow(system, 3, sums.m);
    bezier[0] = AsPoint(d);
    bezier[1] = AsPoint(c * third + d);
    bezier[2] = AsPoint(d + (b * third + c * twoThirds));
    bezier[3] = AsPoint(a + b + c + d);
    return true;
}

double LeastSquares(const point2d* points, double* u, int count, const vector2d& t1, const vector2d& t2,
                    point2d* bezier, int iterations, double* worst_u, double threshold) noexcept
{
    if (count < 2)
        return noFit;
    Curve fit = MakeThirdsCurve(points[0], points[count - 1], t1, t2);
    double best = noFit;
    if (count == 2) {
        Store(fit, bezier);
        return 0.0;
    }
    const BoundsT<double> bounds = GetPointsBBox(points, count);
    if (count == 3) {
        NormalizeParameters(u, count);
        best = Reparameterize_u(points, fit.points, u, count, worst_u, bounds);
    }
    best = KeepBestPass(iterations, best, threshold, fit, [&](Curve& curve) -> PassResult {
        NormalizeParameters(u, count);
        const bool isSound = LeastSquaresSingleIteration(points, u, count, t1, t2, curve.points);
        return {isSound, Reparameterize_u(points, curve.points, u, count, worst_u, bounds)};
    });
    Store(fit, bezier);
    return best;
}

double LeastSquares(const point2d* points, double* u, int count, point2d* bezier, int iterations,
                    double* worst_u) noexcept
{
    if (count < 2)
        return noFit;
    if (count == 2) {
        Store(MakeStraightCurve(points[0], points[1]), bezier);
        return 0.0;
    }
    const BoundsT<double> bounds = GetPointsBBox(points, count);
    NormalizeParameters(u, count);
    Curve fit{{bezier[0], bezier[1], bezier[2], bezier[3]}};
    const double best = KeepBestPass(iterations, noFit, noThreshold, fit, [&](Curve& curve) -> PassResult {
        const bool isSound = LeastSquaresSingleIteration(points, u, count, curve.points);
        const double error = Reparameterize_u(points, curve.points, u, count, worst_u, bounds);
        NormalizeParameters(u, count);
        return {isSound, error};
    });
    Store(fit, bezier);
    return best;
}

double LeastSquares(const point2d* points, int count, const vector2d& t1, const vector2d& t2, point2d* bezier,
                    int iterations)
{
    std::vector<double> u;
    Calculate_u(points, count, u);
    return LeastSquares(points, u.data(), count, t1, t2, bezier, iterations, nullptr, noThreshold);
}

double LeastSquares(const point2d* points, int count, point2d* bezier, int iterations)
{
    std::vector<double> u;
    Calculate_u(points, count, u);
    return LeastSquares(points, u.data(), count, bezier, iterations, nullptr);
}

} // namespace ZarnMath
