/// @file
/// Real roots of a polynomial of degree 2 to 12 on the unit interval. Internal.
///
/// A polynomial is an array of N + 1 coefficients, highest power first:
/// p(t) = c[0]*t^N + c[1]*t^(N-1) + ... + c[N]. Its graph over [0, 1] is a Bezier curve, whose control polygon is an array
/// of N + 1 points: x the position on the parameter axis, y the Bernstein coefficient. The graph cannot cross zero more
/// often than its polygon does (variation diminishing; Lane and Riesenfeld, 1981), so that a polygon with no sign change
/// has no root, one with a single change has one, which Newton's method polishes, and every other one is cut.
///
/// Everything runs on fixed-size arrays of the stack and allocates nothing. An interval is not cut below a width of 2^-52,
/// and a cut leaves at most (N - 1)/N of it, so that a search goes 1 + ceil(52/log2(N/(N - 1))) levels down at most: 90
/// for a cubic, 416 at degree 12. A polynomial that is huge at t = 1 and has two roots next to 0 reaches that.
///
/// All loops have a length known to the compiler and are unrolled: that alone is worth a factor of two here.
#pragma once

#include "ZarnMath/Bezier/Pair.h"

#include <bit>
#include <initializer_list>

namespace ZarnMath::RootFinder {

/// The length of a Newton step, and the distance from 0, at which a root counts as found.
inline constexpr double rootTolerance = 1e-07;

/// The highest degree that is instantiated.
inline constexpr int highestDegree = 12;

/// The rows of Pascal's triangle, C(n, k), up to the highest degree.
struct PascalTriangle
{
    double c[highestDegree + 1][highestDegree + 1]{};

    constexpr PascalTriangle() noexcept
    {
        for (int n = 0; n <= highestDegree; ++n) {
            c[n][0] = 1.0;
            for (int k = 1; k <= n; ++k)
                c[n][k] = c[n - 1][k - 1] + c[n - 1][k];
        }
    }
};

inline constexpr PascalTriangle binomial;

/// The conversion of coefficients to a control polygon; M is the first control point that is computed.
template <int N, int M>
struct PolynomialToBernsteinT
{
    /// Fills bez[M] to bez[N].
    ///
    /// The k-th forward difference of the ordinates is a_k / C(N, k), with a_k the coefficient of t^k. Solved for b_k
    /// from low k to high, with s = C(k, j)*b_j - s over j = 1 to k - 1 from s = b_0 on, this is b_k = a_k / C(N, k) + s.
    /// The sums of all k advance side by side, which leaves each of them as it is.
    ///
    /// @param c   N + 1 coefficients, of which c[0] to c[N-M] are read
    /// @param bez N + 1 points, of which 0 to M - 1 stand already
    static void Convert(const double* c, vector2d* bez) noexcept
    {
        double b[N + 1];
        double s[N + 1];
        b[0] = M > 0 ? bez[0].y : c[N];
#pragma GCC unroll 16
        for (int k = 1; k <= N; ++k)
            s[k] = b[0];
#pragma GCC unroll 16
        for (int k = 1; k <= N; ++k) {
            b[k] = k < M ? bez[k].y : c[N - k] / binomial.c[N][k] + s[k];
#pragma GCC unroll 16
            for (int i = k + 1; i <= N; ++i)
                s[i] = binomial.c[i][k] * b[k] - s[i];
        }
#pragma GCC unroll 16
        for (int k = M; k <= N; ++k)
            StorePair(bez[k], Pair{static_cast<double>(k) / static_cast<double>(N), b[k]});
    }
};

/// The sign changes of a control polygon, bit i for one that is charged to index i.
///
/// An ordinate of exactly 0 between two of opposite sign is one change, charged to the zero's index. Two zeros in a row
/// hide a change, and a zero at an end is none. All comparisons are exact; so is the product that takes them, down to
/// its underflow, which hides a change too.
///
/// @param bez N + 1 points
template <int N>
[[nodiscard]] inline unsigned SignChanges(const vector2d* bez) noexcept
{
    PairMask changing{};
    PairMask zero{};
    Pair from = LoadPair(bez[0]);
#pragma GCC unroll 16
    for (int i = 0; i < N; ++i) {
        const Pair to = LoadPair(bez[i + 1]);
        changing |= (from * to < Both(0.0)) & PairMask{0, 1 << i};
        zero |= to == Both(0.0);
        from = to;
    }
    auto changes = static_cast<unsigned>(changing[1]);
    if (zero[1] != 0) [[unlikely]]
        for (int i = 1; i < N; ++i)
            changes |= static_cast<unsigned>(bez[i].y == 0.0 && bez[i + 1].y * bez[i - 1].y < 0.0) << i;
    return changes;
}

/// The index of the last of the changes; there is at least one.
[[nodiscard]] inline int LastChange(unsigned changes) noexcept
{
    return 31 - std::countl_zero(changes);
}

/// The number of sign changes of a control polygon.
///
/// @param bez                  N + 1 points
/// @param[out] lastCrossing    index of the leg, or of the zero, of the last change; untouched if there is none
template <int N>
[[nodiscard]] inline int CrossingCount(const vector2d* bez, int& lastCrossing) noexcept
{
    const unsigned changes = SignChanges<N>(bez);
    if (changes != 0)
        lastCrossing = LastChange(changes);
    return std::popcount(changes);
}

/// The cut of a control polygon in two, by de Casteljau's construction on both coordinates at once.
template <int N>
struct SplitBezierT
{
    /// Cuts at a parameter relative to the polygon, by steps p + (q - p)*t.
    ///
    /// @param interior      the N - 1 points between the ends of the polygon
    /// @param t             in (0, 1)
    /// @param[in,out] left  N + 1 points; left[0] is the start of the polygon already
    /// @param[in,out] right N + 1 points; right[N] is the end of the polygon already
    static void Split(const vector2d* interior, double t, vector2d* left, vector2d* right) noexcept
    {
        const Pair u = Both(t);
        Construct(interior, left, right, [u](Pair p, Pair q) { return p + (q - p) * u; });
    }

    /// Cuts in the middle, by steps (p + q)*0.5: not the cut at t = 0.5.
    static void Split(const vector2d* interior, vector2d* left, vector2d* right) noexcept
    {
        Construct(interior, left, right, [](Pair p, Pair q) { return (p + q) * Both(0.5); });
    }

private:
    template <typename Step>
    static void Construct(const vector2d* interior, vector2d* left, vector2d* right, Step step) noexcept
    {
        Pair row[N + 1];
        row[0] = LoadPair(left[0]);
        row[N] = LoadPair(right[N]);
#pragma GCC unroll 16
        for (int i = 1; i < N; ++i)
            row[i] = LoadPair(interior[i - 1]);
#pragma GCC unroll 16
        for (int last = N - 1; last >= 0; --last) {
#pragma GCC unroll 16
            for (int i = 0; i <= last; ++i)
                row[i] = step(row[i], row[i + 1]);
            StorePair(left[N - last], row[0]);
            StorePair(right[last], row[last]);
        }
    }
};

/// p(t) by Horner's rule, from the highest power inward; of one number or of a pair of them.
template <int N, typename Number>
[[nodiscard]] inline Number Value(const double* c, Number t) noexcept
{
    Number value = c[1] + t * c[0];
#pragma GCC unroll 16
    for (int i = 2; i <= N; ++i)
        value = c[i] + t * value;
    return value;
}

/// The coefficients of p', each the product of a coefficient and its power.
template <int N>
struct Derivative
{
    double c[N];

    explicit Derivative(const double* p) noexcept
    {
#pragma GCC unroll 16
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
[[nodiscard]] inline bool FindSolutionNewtonsMethod(const double* c, double start, double tolerance,
                                                    double& root) noexcept
{
    const Derivative<N> derivative(c);
    double t = start;
    double previous = 1.0;
    for (int stepsLeft = 200; stepsLeft > 0; --stepsLeft) {
        const double slope = Value<N - 1>(derivative.c, t);
        if (slope == 0.0)
            return false;
        const double next = t - Value<N>(c, t) / slope;
        const double delta = std::fabs(t - next);
        if (delta < tolerance) {
            root = next;
            return true;
        }
        if (!(delta < previous)) // NaN, too, would last until the steps run out
            return false;
        previous = delta;
        t = next;
    }
    return false;
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
[[nodiscard]] inline double FindSolutionNewtonsMethod_Guaranteed(const double* c, double start, double lower,
                                                                 double upper, double tolerance) noexcept
{
    const auto orStart = [=](double value) { return lower < value && value < upper ? value : start; };
    const Derivative<N> derivative(c);
    double t = start;
    double previous = 1.0;
    for (int stepsLeft = 100; stepsLeft > 0; --stepsLeft) {
        const double slope = Value<N - 1>(derivative.c, t);
        if (slope == 0.0)
            return start;
        const double next = t - Value<N>(c, t) / slope;
        const double delta = std::fabs(t - next);
        if (delta < tolerance)
            return orStart(next);
        if (delta >= previous)
            return orStart(t);
        if (std::isnan(delta)) // it would last until the steps run out
            return start;
        previous = delta;
        t = next;
    }
    return orStart(t);
}

/// The roots of c[0]*t^2 + c[1]*t + c[2] on the unit interval in closed form, in ascending order.
///
/// Up to |c[0]| = 1e-09 the polynomial counts as linear: an absolute limit, where the higher degrees ask for an exact
/// zero. A double root counts once. A root at 0 comes first, and where c[1] = 0 as well it comes twice.
///
/// @param c                three coefficients
/// @param[out] roots       room for two values. A linear polynomial, a double root, and c[2] = 0 without the ends leave
///                         their single candidate in roots[0], even where it is out of range
/// @param includeEndpoints whether t = 0 and t = 1 count
/// @return the number of roots
[[nodiscard]] inline int FindQuadraticRoots(const double* c, double* roots, bool includeEndpoints) noexcept
{
    constexpr double linearLimit = 1e-09;
    const auto isInside = [includeEndpoints](double r) {
        return includeEndpoints ? 0.0 <= r && r <= 1.0 : 0.0 < r && r < 1.0;
    };
    const auto storeSingle = [&isInside, roots](double r) {
        roots[0] = r;
        return isInside(r) ? 1 : 0;
    };
    if (std::fabs(c[0]) <= linearLimit)
        return c[1] == 0.0 ? 0 : storeSingle(-c[2] / c[1]);
    if (c[2] == 0.0) {
        const double r = -c[1] / c[0];
        if (!includeEndpoints)
            return storeSingle(r);
        roots[0] = 0.0;
        if (!isInside(r))
            return 1;
        roots[1] = r;
        return 2;
    }
    const double p = c[1] / c[0] * 0.5;
    const double q = c[2] / c[0];
    const double discriminant = p * p - q;
    if (discriminant == 0.0)
        return storeSingle(-p);
    if (discriminant < 0.0)
        return 0;
    const double s = std::sqrt(discriminant);
    int count = 0;
    for (const double r : {-s - p, s - p}) // s >= 0: ascending
        if (isInside(r))
            roots[count++] = r;
    return count;
}

/// The roots of a polynomial, from a stretch of its control polygon on; for N from 3 to 12.
///
/// @param bez            N + 1 points
/// @param c              N + 1 coefficients of the whole polynomial
/// @param[in,out] roots  the roots are appended, left before right
/// @param[in,out] count  the number of roots in the array, not negative; the search stops once it holds N
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

extern template int FindRoots<2>(const double*, double*, bool) noexcept;
extern template int FindRoots<3>(const double*, double*, bool) noexcept;
extern template int FindRoots<4>(const double*, double*, bool) noexcept;
extern template int FindRoots<5>(const double*, double*, bool) noexcept;
extern template int FindRoots<6>(const double*, double*, bool) noexcept;
extern template int FindRoots<7>(const double*, double*, bool) noexcept;
extern template int FindRoots<8>(const double*, double*, bool) noexcept;
extern template int FindRoots<9>(const double*, double*, bool) noexcept;
extern template int FindRoots<10>(const double*, double*, bool) noexcept;
extern template int FindRoots<11>(const double*, double*, bool) noexcept;
extern template int FindRoots<12>(const double*, double*, bool) noexcept;

} // namespace ZarnMath::RootFinder
