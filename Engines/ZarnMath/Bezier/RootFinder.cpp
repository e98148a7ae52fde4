#include "ZarnMath/RootFinder.h"
#include <algorithm>

namespace ZarnMath::RootFinder {

namespace {
bool SameBits(const vector2d* p, const vector2d* q, int n)
{
    for (int i = 0; i < n; ++i) {
        const auto same = [](double a, double b) { return (a != a && b != b) || (a == b && std::signbit(a) == std::signbit(b)); };
        if (!same(p[i].x, q[i].x) || !same(p[i].y, q[i].y)) return false;
    }
    return true;
}
} // namespace

template <int N>
void SolvePolynomial_BezierDivide_NewtonsMethod(const vector2d* bez, const double* c, double* roots,
                                                int& count) noexcept
{
    const double width = bez[N].x - bez[0].x;
    int lastCrossing = -1;
    const int n = CrossingCount<N>(bez, lastCrossing);
    if (!(width > DBL_EPSILON)) {
        if (n >= 1)
            roots[count++] = bez[0].x;
        return;
    }
    if (n == 0) {
        if (bez[0].y == 0.0 && bez[1].y == 0.0)
            roots[count++] = bez[0].x;
        return;
    }
    const vector2d from = bez[lastCrossing];
    const vector2d to = bez[lastCrossing + 1];
    if (n == 1) {
        const double start = from.x - (to.x - from.x) * (from.y / (to.y - from.y));
        roots[count++] = FindSolutionNewtonsMethod_Guaranteed<N>(c, start, bez[0].x, bez[N].x, 1e-07);
        return;
    }
    if (n == 2 && width < 2e-07) {
        const Derivative<N> d(c);
        double r = -1.0;
        if (FindSolutionNewtonsMethod<N - 1>(d.c, (bez[0].x - bez[N].x) * 0.5, 1e-07, r) && std::fabs(Value<N>(c, r)) < 1e-07) {
            roots[count++] = r;
            return;
        }
    }
    vector2d left[N + 1], right[N + 1];
    left[0] = bez[0];
    right[N] = bez[N];
    if (n == 2)
        SplitBezierT<N>::Split(bez + 1, (from.x - bez[0].x) / width, left, right);
    else
        SplitBezierT<N>::Split(bez + 1, left, right);
    if (SameBits(left, bez, N + 1) || SameBits(right, bez, N + 1)) {
        roots[count++] = bez[0].x;
        return;
    }
    SolvePolynomial_BezierDivide_NewtonsMethod<N>(left, c, roots, count);
    if (count > N - 1)
        return;
    SolvePolynomial_BezierDivide_NewtonsMethod<N>(right, c, roots, count);
}

template <>
int FindRoots<2>(const double* c, double* roots, bool includeEndpoints) noexcept
{
    const auto inside = [includeEndpoints](double r) {
        return includeEndpoints ? 0.0 <= r && r <= 1.0 : 0.0 < r && r < 1.0;
    };
    if (std::fabs(c[0]) <= 1e-09) {
        if (c[1] == 0.0)
            return 0;
        roots[0] = -c[2] / c[1];
        return inside(roots[0]) ? 1 : 0;
    }
    if (c[2] == 0.0) {
        const double r = -c[1] / c[0];
        if (!includeEndpoints) {
            roots[0] = r;
            return inside(r) ? 1 : 0;
        }
        roots[0] = 0.0;
        if (!inside(r))
            return 1;
        roots[1] = r;
        return 2;
    }
    const double p = c[1] / c[0] * 0.5;
    const double q = c[2] / c[0];
    const double discriminant = p * p - q;
    if (discriminant == 0.0) {
        roots[0] = -p;
        return inside(-p) ? 1 : 0;
    }
    if (discriminant < 0.0)
        return 0;
    const double s = std::sqrt(discriminant);
    int count = 0;
    for (const double r : {s - p, -s - p})
        if (inside(r))
            roots[count++] = r;
    if (count == 2 && roots[1] < roots[0])
        std::swap(roots[0], roots[1]);
    return count;
}

template <int N>
int FindRoots(const double* c, double* roots, bool includeEndpoints) noexcept
{
    if (c[0] == 0.0)
        return FindRoots<N - 1>(c + 1, roots, includeEndpoints);
    if (c[N] == 0.0) {
        const int n = FindRoots<N - 1>(c, roots, includeEndpoints);
        if (!includeEndpoints || c[N - 1] == 0.0)
            return n;
        if (n >= 1 && std::fabs(roots[0]) <= 1e-07) {
            roots[0] = 0.0;
            return n;
        }
        if (n >= 1 && n > N - 2)
            return n;
        roots[n] = 0.0;
        std::stable_sort(roots, roots + n + 1);
        return n + 1;
    }
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

#define INST(N) template void SolvePolynomial_BezierDivide_NewtonsMethod<N>(const vector2d*, const double*, double*, int&) noexcept; template int FindRoots<N>(const double*, double*, bool) noexcept;
INST(3) INST(4) INST(5) INST(6) INST(7) INST(8) INST(9) INST(10) INST(11) INST(12)
} // namespace ZarnMath::RootFinder
