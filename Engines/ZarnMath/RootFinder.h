/// @file
/// Real roots of a polynomial of degree 2 to 12 on the unit interval. Internal.
///
/// A polynomial is an array of N + 1 coefficients, highest power first:
/// p(t) = c[0]*t^N + c[1]*t^(N-1) + ... + c[N]. Its graph over [0, 1] is a Bezier curve, whose control polygon is an array
/// of N + 1 points: x the position on the parameter axis, y the Bernstein coefficient. The graph cannot cross zero more
/// often than its polygon does (variation diminishing; Lane and Riesenfeld, 1981), so that a polygon with no sign change
/// has no root, one with a single change has one, which Newton's method polishes, and every other one is cut.
///
/// Everything runs on fixed-size arrays of the stack and allocates nothing.
#pragma once

#include "ZarnMath/ValueTypes.h"

namespace ZarnMath::RootFinder {

/// The length of a Newton step, and the distance from 0, at which a root counts as found.
inline constexpr double rootTolerance = 1e-07;

/// C(n, k) as a double.
[[nodiscard]] constexpr double Binomial(int n, int k) noexcept
{
    double value = 1.0;
    for (int i = 1; i <= k; ++i)
        value = value * (n - k + i) / i;
    return value;
}

/// The conversion of coefficients to a control polygon; M is the first control point that is computed.
template <int N, int M>
struct PolynomialToBernsteinT
{
    /// Fills bez[M] to bez[N].
    ///
    /// The k-th forward difference of the ordinates is a_k / C(N, k), with a_k the coefficient of t^k. Solved for the
    /// ordinate k from low to high, by s = C(k, j)*b_j - s over j = 1 to k - 1, starting from b_0. The sums for all k
    /// advance side by side, which leaves each of them as it is.
    ///
    /// @param c   N + 1 coefficients, of which c[0] to c[N-M] are read
    /// @param bez N + 1 points, of which 0 to M - 1 stand already
    static constexpr void Convert(const double* c, vector2d* bez) noexcept
    {
        double b[N + 1]{};
        double s[N + 1]{};
        for (int k = 0; k <= N; ++k) {
            if (k < M)
                b[k] = bez[k].y;
            else if (k == 0)
                b[k] = c[N];
            else
                b[k] = c[N - k] / Binomial(N, k) + s[k];
            for (int i = k + 1; i <= N; ++i)
                s[i] = k == 0 ? b[0] : Binomial(i, k) * b[k] - s[i];
        }
        for (int k = M; k <= N; ++k)
            bez[k] = {static_cast<double>(k) / static_cast<double>(N), b[k]};
    }
};

/// The number of sign changes of a control polygon.
///
/// An ordinate of exactly 0 between two of opposite sign is one change, charged to the zero's index. Two zeros in a row
/// hide a change, and a zero at an end is none. All comparisons are exact.
///
/// @param bez                  N + 1 points
/// @param[out] lastCrossing    index of the leg, or of the zero, of the last change; untouched if there is none
template <int N>
[[nodiscard]] constexpr int CrossingCount(const vector2d* bez, int& lastCrossing) noexcept
{
    int count = 0;
    for (int i = 0; i < N; ++i) {
        const bool crosses = bez[i].y * bez[i + 1].y < 0.0 ||
                             (i > 0 && bez[i].y == 0.0 && bez[i + 1].y * bez[i - 1].y < 0.0);
        if (crosses) {
            ++count;
            lastCrossing = i;
        }
    }
    return count;
}

/// The cut of a control polygon in two, by de Casteljau's construction on both coordinates.
template <int N>
struct SplitBezierT
{
    /// Cuts at a parameter relative to the polygon, by steps p + (q - p)*t.
    ///
    /// @param interior     the N - 1 points between the ends of the polygon
    /// @param t            in (0, 1)
    /// @param[in,out] left  N + 1 points; left[0] is the start of the polygon already
    /// @param[in,out] right N + 1 points; right[N] is the end of the polygon already
    static constexpr void Split(const vector2d* interior, double t, vector2d* left, vector2d* right) noexcept
    {
        Construct(interior, left, right, [t](const vector2d& p, const vector2d& q) { return p + (q - p) * t; });
    }

    /// Cuts in the middle, by steps (p + q)*0.5: not the cut at t = 0.5.
    static constexpr void Split(const vector2d* interior, vector2d* left, vector2d* right) noexcept
    {
        Construct(interior, left, right, [](const vector2d& p, const vector2d& q) { return (p + q) * 0.5; });
    }

private:
    template <typename Step>
    static constexpr void Construct(const vector2d* interior, vector2d* left, vector2d* right, Step step) noexcept
    {
        for (int i = 1; i < N; ++i)
            right[i - 1] = interior[i - 1];
        vector2d first = left[0];
        for (int level = 1; level <= N; ++level) {
            first = step(first, right[0]);
            left[level] = first;
            for (int i = 0; i < N - level; ++i)
                right[i] = step(right[i], right[i + 1]);
        }
        right[0] = first;
    }
};

/// p(t) by Horner's rule, from the highest power inward.
template <int N>
[[nodiscard]] constexpr double Value(const double* c, double t) noexcept
{
    double value = c[0];
    for (int i = 1; i <= N; ++i)
        value = c[i] + t * value;
    return value;
}

/// The coefficients of p', each the product of a coefficient and its power.
template <int N>
struct Derivative
{
    double c[N];

    explicit constexpr Derivative(const double* p) noexcept
    {
        for (int i = 0; i < N; ++i)
            c[i] = p[i] * (N - i);
    }
};

/// Newton's method, at most 200 steps, each of which has to be shorter than the one before and the first below 1.
///
/// @param c          N + 1 coefficients
/// @param start      where to begin
/// @param tolerance  a step below this length ends the search
/// @param[out] root  the last iterate, which may lie anywhere; untouched without convergence
/// @return whether the search converged
template <int N>
[[nodiscard]] constexpr bool FindSolutionNewtonsMethod(const double* c, double start, double tolerance,
                                                       double& root) noexcept
{
    const Derivative<N> derivative(c);
    double t = start;
    double previous = 1.0;
    for (int n = 200;; --n) {
        const double d = Value<N - 1>(derivative.c, t);
        if (d == 0.0)
            return false;
        const double next = t - Value<N>(c, t) / d;
        const double delta = next < t ? t - next : next - t;
        if (delta < tolerance) {
            root = next;
            return true;
        }
        if (n < 2 || delta >= previous)
            return false;
        previous = delta;
        t = next;
    }
}

/// Newton's method, at most 100 steps, that always gives a value to go on with.
///
/// Nothing confines the iteration; only the value about to be returned is held against the bounds.
///
/// @param c            N + 1 coefficients
/// @param start        where to begin
/// @param lower, upper the bounds, exclusive
/// @param tolerance    a step below this length ends the search
/// @return the last iterate, or at a divergence the one before the step that grew, if strictly within the bounds;
///         otherwise start, wherever it lies
template <int N>
[[nodiscard]] constexpr double FindSolutionNewtonsMethod_Guaranteed(const double* c, double start, double lower,
                                                                    double upper, double tolerance) noexcept
{
    const auto orStart = [=](double value) { return lower < value && value < upper ? value : start; };
    const Derivative<N> derivative(c);
    double t = start;
    double previous = 1.0;
    for (int n = 100;; --n) {
        const double d = Value<N - 1>(derivative.c, t);
        if (d == 0.0)
            return start;
        const double next = t - Value<N>(c, t) / d;
        const double delta = next < t ? t - next : next - t;
        if (!(delta < tolerance) && delta >= previous)
            return orStart(t);
        if (delta < tolerance || n == 1)
            return orStart(next);
        previous = delta;
        t = next;
    }
}

/// The roots of a polynomial, from a stretch of its control polygon on; for N from 3 to 12.
///
/// @param bez            N + 1 points
/// @param c              N + 1 coefficients of the whole polynomial
/// @param[in,out] roots  the roots are appended, left before right
/// @param[in,out] count  the number of roots in the array; the search stops once it holds N
template <int N>
void SolvePolynomial_BezierDivide_NewtonsMethod(const vector2d* bez, const double* c, double* roots,
                                                int& count) noexcept;

/// The real roots of a polynomial on the unit interval; for N from 2 to 12.
///
/// Exact zeros among the leading coefficients and at the constant term lower the degree. Roots usually come in ascending
/// order, but above degree 2 nothing sorts them or removes neighbours. Degenerate answers, all of them kept:
/// - a simple root that falls exactly on a cut of the subdivision is lost;
/// - a double root is reported once, twice or not at all;
/// - the zero polynomial has no roots, and NaN ordinates show no crossing;
/// - a root at 0 is dropped where the lower degree has filled the array.
///
/// @param c                N + 1 coefficients, highest power first
/// @param[out] roots       room for N + 1 values. No more is written than the count says, but that degree 2 leaves its
///                         linear or single root in element 0 even where that root is out of range
/// @param includeEndpoints whether a root at t = 0 or t = 1 counts
/// @return the number of roots
template <int N>
int FindRoots(const double* c, double* roots, bool includeEndpoints) noexcept;

} // namespace ZarnMath::RootFinder
