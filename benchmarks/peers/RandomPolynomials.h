/// @file
/// Polynomials from random Bernstein coefficients in [-1, 1], which is how they come from curves, with their roots.
#pragma once

#include "benchmarks/Corpus.h"
#include "tests/LiteralRootFinder.h"
#include "tests/census/BruteForce.h"

#include <array>
#include <random>
#include <vector>

namespace ZarnMath::Peers {

template <int N>
using Ordinates = std::array<double, N + 1>;

template <int N>
std::vector<Ordinates<N>> RandomPolygons()
{
    RandomSource random(N);
    std::vector<Ordinates<N>> polygons(Benchmarks::corpusSize);
    for (auto& polygon : polygons)
        for (double& y : polygon)
            y = random.Uniform(-1.0, 1.0);
    return polygons;
}

/// Highest power first, by forward differences.
template <int N>
std::array<double, N + 1> ToFallingPowers(Ordinates<N> differences)
{
    std::array<double, N + 1> c;
    for (std::size_t i = 0; i <= N; ++i) {
        c[N - i] = Literal::binomials[N][i] * differences[0];
        for (std::size_t j = 0; j + i < N; ++j)
            differences[j] = differences[j + 1] - differences[j];
    }
    return c;
}

/// The value at t by repeated linear interpolation (de Casteljau), which is as exact as it gets.
template <int N>
double ValueAt(Ordinates<N> y, double t)
{
    for (std::size_t n = N; n > 0; --n)
        for (std::size_t i = 0; i < n; ++i)
            y[i] += (y[i + 1] - y[i]) * t;
    return y[0];
}

/// The roots in (0, 1) by brute force.
template <int N>
std::vector<std::vector<double>> TrueRoots(const std::vector<Ordinates<N>>& polygons)
{
    std::vector<std::vector<double>> roots;
    for (const auto& polygon : polygons)
        roots.push_back(Census::FindZeros([&](double t) { return ValueAt<N>(polygon, t); }, 0.0));
    return roots;
}

} // namespace ZarnMath::Peers
