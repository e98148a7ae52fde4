/// @file
/// The root finder in its plainest form: polygons on the stack, every sum a loop, each root polished where it is found.
/// It says what the library's fast one has to give, bit for bit, and how long the obvious way takes.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <algorithm>
#include <cmath>

namespace ZarnMath::Literal {

/// C(n, k), the rows of Pascal's triangle from 0 to 12.
inline constexpr double binomials[13][13] = {
    {1},
    {1, 1},
    {1, 2, 1},
    {1, 3, 3, 1},
    {1, 4, 6, 4, 1},
    {1, 5, 10, 10, 5, 1},
    {1, 6, 15, 20, 15, 6, 1},
    {1, 7, 21, 35, 35, 21, 7, 1},
    {1, 8, 28, 56, 70, 56, 28, 8, 1},
    {1, 9, 36, 84, 126, 126, 84, 36, 9, 1},
    {1, 10, 45, 120, 210, 252, 210, 120, 45, 10, 1},
    {1, 11, 55, 165, 330, 462, 462, 330, 165, 55, 11, 1},
    {1, 12, 66, 220, 495, 792, 924, 792, 495, 220, 66, 12, 1},
};

template <int N>
void ToBernstein(const double* c, vector2d* bez)
{
    bez[0] = {0.0, c[N]};
    for (int k = 1; k <= N; ++k) {
        double s = bez[0].y;
        for (int j = 1; j < k; ++j)
            s = binomials[k][j] * bez[j].y - s;
        bez[k] = {static_cast<double>(k) / static_cast<double>(N), c[N - k] / binomials[N][k] + s};
    }
}

template <int N>
int CountCrossings(const vector2d* bez, int& lastCrossing)
{
    int count = 0;
    for (int i = 0; i < N; ++i) {
        const bool leg = bez[i].y * bez[i + 1].y < 0.0;
        const bool zero = i > 0 && bez[i].y == 0.0 && bez[i + 1].y * bez[i - 1].y < 0.0;
        if (leg || zero) {
            ++count;
            lastCrossing = i;
        }
    }
    return count;
}

/// de Casteljau's triangle with a step of the caller's: its left side, and its right side from the apex on.
template <int N, typename Step>
void Cut(const vector2d* bez, vector2d* left, vector2d* right, Step step)
{
    vector2d row[N + 1];
    std::copy(bez, bez + N + 1, row);
    for (int last = N; last >= 0; --last) {
        left[N - last] = row[0];
        right[last] = row[last];
        for (int i = 0; i < last; ++i)
            row[i] = step(row[i], row[i + 1]);
    }
}

template <int N>
double Value(const double* c, double t)
{
    double value = c[0];
    for (int i = 1; i <= N; ++i)
        value = c[i] + t * value;
    return value;
}

template <int N>
double Slope(const double* c, double t)
{
    double value = N * c[0];
    for (int i = 1; i < N; ++i)
        value = (N - i) * c[i] + t * value;
    return value;
}

template <int N>
bool Newton(const double* c, double start, double tolerance, double& root)
{
    double t = start;
    double previous = 1.0;
    for (int n = 200;; --n) {
        const double d = Slope<N>(c, t);
        if (d == 0.0)
            return false;
        const double next = t - Value<N>(c, t) / d;
        const double delta = std::fabs(t - next);
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

template <int N>
double NewtonGuaranteed(const double* c, double start, double lower, double upper, double tolerance)
{
    double t = start;
    double previous = 1.0;
    int n = 101;
    while (true) {
        const double d = Slope<N>(c, t);
        if (d == 0.0)
            return start;
        const double next = t - Value<N>(c, t) / d;
        const double delta = std::fabs(t - next);
        if (!(delta < tolerance)) {
            if (delta >= previous)
                return lower < t && t < upper ? t : start;
            --n;
            previous = delta;
            t = next;
            if (n > 1)
                continue;
        }
        return lower < next && next < upper ? next : start;
    }
}

inline bool HasSameBits(double a, double b)
{
    return a != a ? b != b : a == b && std::signbit(a) == std::signbit(b);
}

template <int N>
bool AreSame(const vector2d* p, const vector2d* q)
{
    for (int i = 0; i <= N; ++i)
        if (!HasSameBits(p[i].x, q[i].x) || !HasSameBits(p[i].y, q[i].y))
            return false;
    return true;
}

/// How many levels the deepest search so far went down, that of the whole polygon included.
inline int deepestLevel = 0;

template <int N>
void Solve(const vector2d* bez, const double* c, double* roots, int& count, int level = 1)
{
    deepestLevel = std::max(deepestLevel, level);
    const double width = bez[N].x - bez[0].x;
    int lastCrossing = -1;
    const int n = CountCrossings<N>(bez, lastCrossing);
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
        roots[count++] = NewtonGuaranteed<N>(c, start, bez[0].x, bez[N].x, 1e-07);
        return;
    }
    if (n == 2 && width < 2e-07) {
        double derivative[N];
        for (int i = 0; i < N; ++i)
            derivative[i] = c[i] * (N - i);
        double root = -1.0;
        if (Newton<N - 1>(derivative, (bez[0].x - bez[N].x) * 0.5, 1e-07, root) &&
            std::fabs(Value<N>(c, root)) < 1e-07) {
            roots[count++] = root;
            return;
        }
    }
    vector2d left[N + 1];
    vector2d right[N + 1];
    if (n == 2) {
        const double u = (from.x - bez[0].x) / width;
        Cut<N>(bez, left, right, [u](const vector2d& p, const vector2d& q) { return p + (q - p) * u; });
    } else {
        Cut<N>(bez, left, right, [](const vector2d& p, const vector2d& q) { return (p + q) * 0.5; });
    }
    if (AreSame<N>(left, bez) || AreSame<N>(right, bez)) {
        roots[count++] = bez[0].x;
        return;
    }
    Solve<N>(left, c, roots, count, level + 1);
    if (count > N - 1)
        return;
    Solve<N>(right, c, roots, count, level + 1);
}

inline int FindQuadraticRoots(const double* c, double* roots, bool includeEndpoints)
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
int FindRoots(const double* c, double* roots, bool includeEndpoints)
{
    if constexpr (N == 2) {
        return FindQuadraticRoots(c, roots, includeEndpoints);
    } else {
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
        ToBernstein<N>(c, bez);
        int count = 0;
        if (includeEndpoints && IsNearZero(bez[0].y))
            roots[count++] = 0.0;
        Solve<N>(bez, c, roots, count);
        if (includeEndpoints && IsNearZero(bez[N].y))
            roots[count++] = 1.0;
        return count;
    }
}

} // namespace ZarnMath::Literal
