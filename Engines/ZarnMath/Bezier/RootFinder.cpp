#include "ZarnMath/RootFinder.h"

#include "ZarnMath/Bezier/RootPolishing.h"

#include <utility>

namespace ZarnMath::RootFinder {

namespace {

/// Below this width two sign changes are taken for a double root.
constexpr double sliverWidth = 2e-07;

[[nodiscard]] bool HasAtMostOneBit(unsigned bits) noexcept
{
    return (bits & (bits - 1)) == 0;
}

[[nodiscard]] bool HasSameBits(double a, double b) noexcept
{
    return std::isnan(a) ? std::isnan(b) : a == b && std::signbit(a) == std::signbit(b);
}

template <int N>
[[nodiscard]] bool HasSameBits(const vector2d* p, const vector2d* q) noexcept
{
    for (int i = 0; i <= N; ++i)
        if (!HasSameBits(p[i].x, q[i].x) || !HasSameBits(p[i].y, q[i].y))
            return false;
    return true;
}

/// Whether one of the pieces is the polygon itself: rounding has moved the cut onto an end of a polygon a few last
/// places wide, and cutting on would never end.
template <int N>
[[nodiscard]] bool IsWithoutProgress(const vector2d* bez, const vector2d* left, const vector2d* right) noexcept
{
    const double cut = left[N].x;
    return (cut == bez[N].x && HasSameBits<N>(left, bez)) || (cut == bez[0].x && HasSameBits<N>(right, bez));
}

/// Isolates first and polishes afterwards: a single sign change yields exactly one root, so that its place among the
/// roots is known before its value is.
template <int N>
class Search
{
public:
    Search(const double* coefficients, double* rootArray, int rootCount) noexcept
        : c(coefficients), roots(rootArray), count(rootCount)
    {}

    /// @return the number of roots in the array
    [[nodiscard]] int Run(const vector2d* bez) noexcept
    {
        Isolate(bez);
        Polish<N>(c, crossings, crossingCount, roots);
        return count;
    }

private:
    void Isolate(const vector2d* bez) noexcept
    {
        const double width = bez[N].x - bez[0].x;
        const unsigned changes = SignChanges<N>(bez);
        if (!(width > DBL_EPSILON)) {
            if (changes != 0)
                Append(bez[0].x);
        } else if (changes == 0) {
            if (bez[0].y == 0.0 && bez[1].y == 0.0) // the graph begins along the axis
                Append(bez[0].x);
        } else if (HasAtMostOneBit(changes)) {
            AppendCrossing(bez, LastChange(changes));
        } else {
            Cut(bez, width, changes);
        }
    }

    void Append(double root) noexcept
    {
        roots[count++] = root;
    }

    /// The start is where the chord of the leg i meets zero.
    void AppendCrossing(const vector2d* bez, int i) noexcept
    {
        const vector2d from = bez[i];
        const vector2d to = bez[i + 1];
        const double start = from.x - (to.x - from.x) * (from.y / (to.y - from.y));
        crossings[crossingCount++] = {start, bez[0].x, bez[N].x, count++};
    }

    /// Two sign changes are cut apart at the last one; more are cut in the middle.
    void Cut(const vector2d* bez, double width, unsigned changes) noexcept
    {
        vector2d left[N + 1];
        vector2d right[N + 1];
        left[0] = bez[0];
        right[N] = bez[N];
        if (HasAtMostOneBit(changes & (changes - 1))) {
            if (width < sliverWidth && AppendDoubleRoot(bez))
                return;
            const double t = (bez[LastChange(changes)].x - bez[0].x) / width;
            SplitBezierT<N>::Split(bez + 1, t, left, right);
        } else {
            SplitBezierT<N>::Split(bez + 1, left, right);
        }
        if (IsWithoutProgress<N>(bez, left, right)) {
            Append(bez[0].x);
            return;
        }
        Isolate(left);
        if (count > N - 1) // more sign changes than the degree come from rounding
            return;
        Isolate(right);
    }

    /// A double root is a root of the derivative at which the polynomial is small. The search for it starts at half the
    /// negative width, a number near zero, and is not confined to the sliver.
    [[nodiscard]] bool AppendDoubleRoot(const vector2d* bez) noexcept
    {
        const Derivative<N> derivative(c);
        const double start = (bez[0].x - bez[N].x) * 0.5;
        double root = -1.0;
        if (!FindSolutionNewtonsMethod<N - 1>(derivative.c, start, rootTolerance, root))
            return false;
        if (!(std::fabs(Value<N>(c, root)) < rootTolerance))
            return false;
        Append(root);
        return true;
    }

    const double* c;
    double* roots;
    int count;
    int crossingCount = 0;
    Crossing crossings[N];
};

/// By insertion: a handful of values, and an order that is the same with NaN among them on every machine.
void SortAscending(double* values, int count) noexcept
{
    for (int i = 1; i < count; ++i)
        for (int j = i; j > 0 && values[j] < values[j - 1]; --j)
            std::swap(values[j], values[j - 1]);
}

/// Adds the root at t = 0 to those of p(t)/t, unless it is among them or the array has no room for it.
template <int N>
[[nodiscard]] int AddRootAtZero(double* roots, int count) noexcept
{
    if (count >= 1 && std::fabs(roots[0]) <= rootTolerance) {
        roots[0] = 0.0;
        return count;
    }
    if (count >= 1 && count > N - 2)
        return count;
    roots[count] = 0.0;
    SortAscending(roots, count + 1);
    return count + 1;
}

} // namespace

template <int N>
void SolvePolynomial_BezierDivide_NewtonsMethod(const vector2d* bez, const double* c, double* roots,
                                                int& count) noexcept
{
    count = Search<N>(c, roots, count).Run(bez);
}

namespace {

/// Degree 3 and higher.
template <int N>
int FindRootsBySubdivision(const double* c, double* roots, bool includeEndpoints) noexcept
{
    vector2d bez[N + 1];
    PolynomialToBernsteinT<N, 0>::Convert(c, bez);
    int count = 0;
    if (includeEndpoints && IsNearZero(bez[0].y))
        roots[count++] = 0.0;
    SolvePolynomial_BezierDivide_NewtonsMethod<N>(bez, c, roots, count);
    if (includeEndpoints && IsNearZero(bez[N].y))
        roots[count++] = 1.0;
    return count;
}

} // namespace

template <int N>
int FindRoots(const double* c, double* roots, bool includeEndpoints) noexcept
{
    if constexpr (N == 2) {
        return FindQuadraticRoots(c, roots, includeEndpoints);
    } else {
        if (c[0] == 0.0)
            return FindRoots<N - 1>(c + 1, roots, includeEndpoints);
        if (c[N] == 0.0) {
            const int count = FindRoots<N - 1>(c, roots, includeEndpoints);
            return includeEndpoints && c[N - 1] != 0.0 ? AddRootAtZero<N>(roots, count) : count;
        }
        return FindRootsBySubdivision<N>(c, roots, includeEndpoints);
    }
}

template void SolvePolynomial_BezierDivide_NewtonsMethod<3>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<4>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<5>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<6>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<7>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<8>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<9>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<10>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<11>(const vector2d*, const double*, double*, int&) noexcept;
template void SolvePolynomial_BezierDivide_NewtonsMethod<12>(const vector2d*, const double*, double*, int&) noexcept;

template int FindRoots<2>(const double*, double*, bool) noexcept;
template int FindRoots<3>(const double*, double*, bool) noexcept;
template int FindRoots<4>(const double*, double*, bool) noexcept;
template int FindRoots<5>(const double*, double*, bool) noexcept;
template int FindRoots<6>(const double*, double*, bool) noexcept;
template int FindRoots<7>(const double*, double*, bool) noexcept;
template int FindRoots<8>(const double*, double*, bool) noexcept;
template int FindRoots<9>(const double*, double*, bool) noexcept;
template int FindRoots<10>(const double*, double*, bool) noexcept;
template int FindRoots<11>(const double*, double*, bool) noexcept;
template int FindRoots<12>(const double*, double*, bool) noexcept;

} // namespace ZarnMath::RootFinder
