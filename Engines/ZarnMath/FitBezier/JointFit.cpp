#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezier/Moments.h"
#include "ZarnMath/FitBezier/Passes.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/SmallMatrix.h"

#include <algorithm>

namespace ZarnMath {

namespace {

using Matrix6 = matrix<6, 6, double>;

/// The two cubics of a fit.
struct CurvePair
{
    CubicBezier::bezier2dT<point2d> a;
    CubicBezier::bezier2dT<point2d> b;
};

/// The sums of the two halves, each without its outer end.
struct HalfSums
{
    Moments first;
    Moments second;

    HalfSums(const point2d* points, int n, int split, const double* u1, const double* u2) noexcept
    {
        for (int i = 1; i < split; ++i)
            first.Add(u1[i], AsVector(points[i]));
        for (int i = split; i < n - 1; ++i)
            second.Add(u2[i - split], AsVector(points[i]));
    }
};

/// The matrix of the unknowns: the lengths along t1 and t2, the join point, the join handle. Rows 0 and 1 balance the
/// residuals of each half along its outer tangent; rows 2 to 5 are the normal equations of the join point and handle.
Matrix6 MakeSystem(const HalfSums& sums, double r, const vector2d& t1, const vector2d& t2) noexcept
{
    const auto& [C, S1, S2, S3, S4, S5, S6] = sums.first.s;
    const auto& [D, T1, T2, T3, T4, T5, T6] = sums.second.s;
    const double E1 = 3.0 * S2 - 2.0 * S3;
    const double E2 = 3.0 * S2 - 3.0 * S3;
    const double F1 = 2.0 * T3 + (D - 3.0 * T2);
    const double F2 = 3.0 * T3 + (3.0 * T1 - 6.0 * T2);
    const double G1 = 6.0 * S6 + (24.0 * S4 - 9.0 * S3 - 21.0 * S5);
    const double G2 = 3.0 * T3 + (9.0 * T4 - 3.0 * T2 - 15.0 * T5) + 6.0 * T6;
    const double G3 = -((12.0 * S5 - 9.0 * S4 - 4.0 * S6) - D + 6.0 * T2 - 4.0 * T3 - 9.0 * T4 + 12.0 * T5 - 4.0 * T6);
    const double G4 =
        r * (15.0 * S5 - 9.0 * S4 - 6.0 * S6) - (21.0 * T5 + (6.0 * T2 + (6.0 * T3 - 3.0 * T1 - 24.0 * T4)) - 6.0 * T6);
    const double H1 = 27.0 * S5 + (9.0 * S3 - 27.0 * S4) - 9.0 * S6;
    const double H2 = 9.0 * T6 + (27.0 * T4 - 9.0 * T3 - 27.0 * T5);
    const double H3 =
        6.0 * T6 + (24.0 * T4 + (3.0 * T1 - r * (6.0 * S6 + (9.0 * S4 - 15.0 * S5)) - 6.0 * T2 - 6.0 * T3) - 21.0 * T5);
    const double H4 =
        54.0 * T4 + (r * r * (9.0 * S6 + (9.0 * S4 - 18.0 * S5)) + 9.0 * T2 - 36.0 * T3) - 36.0 * T5 + 9.0 * T6;

    Matrix6 M;
    M(0, 0) = (3.0 * S3 + (3.0 * S1 - 6.0 * S2)) * -Dot(t1, t1);
    M(1, 1) = (3.0 * T2 - 3.0 * T3) * Dot(t2, t2);
    const double start[2] = {t1.x, t1.y};
    const double end[2] = {t2.x, t2.y};
    for (unsigned long k = 0; k < 2; ++k) {
        M(0, 2 + k) = -start[k] * E1;
        M(0, 4 + k) = start[k] * r * E2;
        M(1, 2 + k) = -end[k] * F1;
        M(1, 4 + k) = -end[k] * F2;
        M(2 + k, 0) = -start[k] * G1;
        M(2 + k, 1) = end[k] * G2;
        M(2 + k, 2 + k) = G3;
        M(2 + k, 4 + k) = G4;
        M(4 + k, 0) = H1 * r * -start[k];
        M(4 + k, 1) = end[k] * H2;
        M(4 + k, 2 + k) = H3;
        M(4 + k, 4 + k) = H4;
    }
    return M;
}

/// The negative of what the system is to give.
struct RightHandSide
{
    double rows[6];

    RightHandSide(const HalfSums& sums, double r, const vector2d& t1, const vector2d& t2, const vector2d& P0,
                  const vector2d& PN) noexcept
    {
        const auto& [C, S1, S2, S3, S4, S5, S6] = sums.first.s;
        const auto& [D, T1, T2, T3, T4, T5, T6] = sums.second.s;
        const auto& [X0, X1, X2, X3] = sums.first.m;
        const auto& [Z0, Z1, Z2, Z3] = sums.second.m;
        const double Q = 4.0 * S6 + (9.0 * S4 + (2.0 * S3 - 3.0 * S2) - 12.0 * S5);
        const double R = 4.0 * T6 + (2.0 * T3 + (9.0 * T4 - 3.0 * T2 - 12.0 * T5));
        const double V = 15.0 * S5 + ((3.0 * S2 - 3.0 * S3) - 9.0 * S4) - 6.0 * S6;
        const double W = 6.0 * T6 + (24.0 * T4 - 9.0 * T3 - 21.0 * T5);
        rows[0] = Dot(X0, t1) - (2.0 * S3 + (C - 3.0 * S2)) * Dot(P0, t1);
        rows[1] = Dot(Z0, t2) - (3.0 * T2 - 2.0 * T3) * Dot(t2, PN);
        const vector2d join = 2.0 * X3 - 3.0 * X2 + (3.0 * Z2 - Z0 - 2.0 * Z3) - Q * P0 - R * PN;
        const vector2d handle = r * (3.0 * X2 - 3.0 * X3) + (6.0 * Z2 - 3.0 * Z1 - 3.0 * Z3) - r * P0 * V - W * PN;
        rows[2] = join.x;
        rows[3] = join.y;
        rows[4] = handle.x;
        rows[5] = handle.y;
    }
};

/// The negated product of a row of the inverse with the right-hand side.
double SolveRow(const Matrix6& inverse, unsigned long row, const RightHandSide& rhs) noexcept
{
    double w = 0.0;
    for (unsigned long k = 0; k < 6; ++k)
        w -= rhs.rows[k] * inverse(row, k);
    return w;
}

/// The parameters of the two halves, each in the range of its own cubic: the join is where 1.0 of the first meets 0.0 of
/// the second, halfway between the parameters of the points beside it.
struct SplitParameters
{
    std::vector<double> u1;
    std::vector<double> u2;

    SplitParameters(const double* u, int n, int split)
        : u1(static_cast<std::size_t>(split)), u2(static_cast<std::size_t>(n - split))
    {
        const double join = (u[split - 1] + u[split]) * 0.5;
        for (std::size_t i = 0; i < u1.size(); ++i)
            u1[i] = u[i] / join;
        for (std::size_t i = 0; i < u2.size(); ++i)
            u2[i] = (u[u1.size() + i] - join) / (1.0 - join);
    }
};

} // namespace

bool LeastSquaresSingleIteration_2Cubics(const point2d* points, const vector2d& t1, const vector2d& t2, int n,
                                         int split, const double* u1, const double* u2, point2d* a, point2d* b) noexcept
{
    const double r = (u1[split - 1] - u1[0]) / (u2[n - split - 1] - u2[0]);
    const HalfSums sums(points, n, split, u1, u2);
    Matrix6 inverse;
    if (!MakeSystem(sums, r, t1, t2).GetInverse(inverse))
        return false;

    const point2d start = points[0];
    const point2d end = points[n - 1];
    const RightHandSide rhs(sums, r, t1, t2, AsVector(start), AsVector(end));
    double w[6];
    for (unsigned long k = 0; k < 6; ++k)
        w[k] = SolveRow(inverse, k, rhs);
    const point2d join{w[2], w[3]};
    const vector2d handle{w[4], w[5]};
    a[0] = start;
    a[1] = start + t1 * w[0];
    a[2] = join - r * handle;
    a[3] = join;
    b[0] = join;
    b[1] = join + handle;
    b[2] = end - t2 * w[1];
    b[3] = end;
    return true;
}

double LeastSquares(const point2d* points, double* u, int n, int split, const vector2d& t1, const vector2d& t2,
                    point2d* a, point2d* b, int iterations)
{
    if (n < 5)
        return noFit;
    const BoundsT<double> bounds = GetPointsBBox(points, n);
    NormalizeParameters(u, n);
    SplitParameters halves(u, n, split);
    CurvePair fit{{{a[0], a[1], a[2], a[3]}}, {{b[0], b[1], b[2], b[3]}}};
    double* const u1 = halves.u1.data();
    double* const u2 = halves.u2.data();
    const double best = KeepBestPass(iterations, noFit, noThreshold, fit, [&](CurvePair& curves) -> PassResult {
        point2d* const first = curves.a.points;
        point2d* const second = curves.b.points;
        const bool isSound = LeastSquaresSingleIteration_2Cubics(points, t1, t2, n, split, u1, u2, first, second);
        const double firstError = Reparameterize_u(points, first, u1, split, nullptr, bounds);
        const double secondError = Reparameterize_u(points + split, second, u2, n - split, nullptr, bounds);
        return {isSound, std::max(firstError, secondError)};
    });
    std::copy_n(fit.a.points, 4, a);
    std::copy_n(fit.b.points, 4, b);
    return best;
}

double LeastSquares(const point2d* points, int n, int split, const vector2d& t1, const vector2d& t2, point2d* a,
                    point2d* b, int iterations)
{
    std::vector<double> u;
    Calculate_u(points, n, u);
    return LeastSquares(points, u.data(), n, split, t1, t2, a, b, iterations);
}

} // namespace ZarnMath
