/// @file
/// What the right answers are, found slowly and by other means than the library's.
#pragma once

#include "benchmarks/RandomPolynomials.h"
#include "tests/census/BruteForce.h"

namespace ZarnMath::Peers {

struct Box
{
    double left;
    double bottom;
    double right;
    double top;
};

/// The distance of a point from a curve, ends included.
[[nodiscard]] double TrueDistance(const Cubic& curve, const point2d& q);

/// The length, by adaptive quadrature of GSL to an estimated error of 1e-10.
[[nodiscard]] double TrueLength(const Cubic& curve);

/// The extent of many samples.
[[nodiscard]] Box TrueBox(const Cubic& curve);

/// The value at t by repeated linear interpolation (de Casteljau), which is as exact as it gets.
template <int N>
double ValueAt(Benchmarks::Ordinates<N> y, double t)
{
    for (std::size_t n = N; n > 0; --n)
        for (std::size_t i = 0; i < n; ++i)
            y[i] += (y[i + 1] - y[i]) * t;
    return y[0];
}

/// The roots in (0, 1) of each polynomial, by brute force.
template <int N>
std::vector<std::vector<double>> TrueRoots(const std::vector<Benchmarks::Ordinates<N>>& polygons)
{
    std::vector<std::vector<double>> roots;
    for (const auto& polygon : polygons)
        roots.push_back(Census::FindZeros([&](double t) { return ValueAt<N>(polygon, t); }, 0.0));
    return roots;
}

} // namespace ZarnMath::Peers
