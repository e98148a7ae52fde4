/// @file
/// The root finder in its plainest form: the degree is a number, every sum is a loop, and each root is polished where it
/// is found. It defines what the library's fast one has to give, bit for bit.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <vector>

namespace ZarnMath::Literal {

using Polygon = std::vector<vector2d>;

inline double BinomialCoefficient(int n, int k)
{
    double value = 1.0;
    for (int i = 0; i < k; ++i)
        value = value * (n - i) / (i + 1);
    return value;
}

inline Polygon ToBernstein(int degree, const double* c)
{
    Polygon bez(static_cast<std::size_t>(degree) + 1);
    for (int k = 0; k <= degree; ++k) {
        const double a = c[degree - k];
        double y = a;
        if (k > 0) {
            double s = bez[0].y;
            for (int j = 1; j < k; ++j)
                s = BinomialCoefficient(k, j) * bez[static_cast<std::size_t>(j)].y - s;
            y = a / BinomialCoefficient(degree, k) + s;
        }
        bez[static_cast<std::size_t>(k)] = {static_cast<double>(k) / static_cast<double>(degree), y};
    }
    return bez;
}

inline int CountCrossings(const Polygon& bez, int& lastCrossing)
{
    int count = 0;
    for (std::size_t i = 0; i + 1 < bez.size(); ++i) {
        const bool leg = bez[i].y * bez[i + 1].y < 0.0;
        const bool zero = i > 0 && bez[i].y == 0.0 && bez[i + 1].y * bez[i - 1].y < 0.0;
        if (leg || zero) {
            ++count;
            lastCrossing = static_cast<int>(i);
        }
    }
    return count;
}

/// de Casteljau's triangle with a step of the caller's; the cut point ends the left and starts the right polygon.
template <typename Step>
void Cut(const Polygon& bez, Polygon& left, Polygon& right, Step step)
{
    Polygon row = bez;
    left.clear();
    right.clear();
    while (true) {
        left.push_back(row.front());
        right.push_back(row.back());
        if (row.size() == 1)
            break;
        Polygon next;
        for (std::size_t i = 0; i + 1 < row.size(); ++i)
            next.push_back({step(row[i].x, row[i + 1].x), step(row[i].y, row[i + 1].y)});
        row = next;
    }
    std::reverse(right.begin(), right.end());
}

inline double Value(int degree, const double* c, double t)
{
    double value = c[0];
    for (int i = 1; i <= degree; ++i)
        value = c[i] + t * value;
    return value;
}

inline double Slope(int degree, const double* c, double t)
{
    double value = degree * c[0];
    for (int i = 1; i < degree; ++i)
        value = (degree - i) * c[i] + t * value;
    return value;
}

inline bool Newton(int degree, const double* c, double start, double tolerance, double& root)
{
    double t = start;
    double previous = 1.0;
    for (int n = 200;; --n) {
        const double d = Slope(degree, c, t);
        if (d == 0.0)
            return false;
        const double next = t - Value(degree, c, t) / d;
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

inline double NewtonGuaranteed(int degree, const double* c, double start, double lower, double upper, double tolerance)
{
    double t = start;
    double previous = 1.0;
    int n = 101;
    while (true) {
        const double d = Slope(degree, c, t);
        if (d == 0.0)
            return start;
        const double next = t - Value(degree, c, t) / d;
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

/// Whether two polygons are the same, with any NaN equal to any other.
inline bool AreSame(const Polygon& p, const Polygon& q)
{
    const auto same = [](double a, double b) {
        return (a != a && b != b) || std::memcmp(&a, &b, sizeof a) == 0;
    };
    for (std::size_t i = 0; i < p.size(); ++i)
        if (!same(p[i].x, q[i].x) || !same(p[i].y, q[i].y))
            return false;
    return true;
}

inline void Solve(int degree, const Polygon& bez, const double* c, double* roots, int& count)
{
    const double width = bez.back().x - bez.front().x;
    int lastCrossing = -1;
    const int n = CountCrossings(bez, lastCrossing);
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
    const vector2d& from = bez[static_cast<std::size_t>(lastCrossing)];
    const vector2d& to = bez[static_cast<std::size_t>(lastCrossing) + 1];
    if (n == 1) {
        const double start = from.x - (to.x - from.x) * (from.y / (to.y - from.y));
        roots[count++] = NewtonGuaranteed(degree, c, start, bez.front().x, bez.back().x, 1e-07);
        return;
    }
    if (n == 2 && width < 2e-07) {
        std::vector<double> derivative;
        for (int i = 0; i < degree; ++i)
            derivative.push_back(c[i] * (degree - i));
        double root = -1.0;
        const double start = (bez.front().x - bez.back().x) * 0.5;
        if (Newton(degree - 1, derivative.data(), start, 1e-07, root) &&
            std::fabs(Value(degree, c, root)) < 1e-07) {
            roots[count++] = root;
            return;
        }
    }
    Polygon left;
    Polygon right;
    if (n == 2) {
        const double u = (from.x - bez.front().x) / width;
        Cut(bez, left, right, [u](double p, double q) { return p + (q - p) * u; });
    } else {
        Cut(bez, left, right, [](double p, double q) { return (p + q) * 0.5; });
    }
    if (AreSame(left, bez) || AreSame(right, bez)) {
        roots[count++] = bez[0].x;
        return;
    }
    Solve(degree, left, c, roots, count);
    if (count > degree - 1)
        return;
    Solve(degree, right, c, roots, count);
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

inline int FindRoots(int degree, const double* c, double* roots, bool includeEndpoints)
{
    if (degree == 2)
        return FindQuadraticRoots(c, roots, includeEndpoints);
    if (c[0] == 0.0)
        return FindRoots(degree - 1, c + 1, roots, includeEndpoints);
    if (c[degree] == 0.0) {
        const int n = FindRoots(degree - 1, c, roots, includeEndpoints);
        if (!includeEndpoints || c[degree - 1] == 0.0)
            return n;
        if (n >= 1 && std::fabs(roots[0]) <= 1e-07) {
            roots[0] = 0.0;
            return n;
        }
        if (n >= 1 && n > degree - 2)
            return n;
        roots[n] = 0.0;
        std::stable_sort(roots, roots + n + 1);
        return n + 1;
    }
    const Polygon bez = ToBernstein(degree, c);
    int count = 0;
    if (includeEndpoints && IsNearZero(bez.front().y))
        roots[count++] = 0.0;
    Solve(degree, bez, c, roots, count);
    if (includeEndpoints && IsNearZero(bez.back().y))
        roots[count++] = 1.0;
    return count;
}

} // namespace ZarnMath::Literal
