/// @file
/// Polynomials from random Bernstein coefficients in [-1, 1], which is how they come from curves.
#pragma once

#include "benchmarks/Corpus.h"
#include "tests/LiteralRootFinder.h"

#include <array>
#include <vector>

namespace ZarnMath::Benchmarks {

template <int N>
using Ordinates = std::array<double, N + 1>;

/// Control polygons, the same for every count as far as they go.
template <int N>
std::vector<Ordinates<N>> RandomPolygons(std::size_t count = corpusSize)
{
    RandomSource random(N);
    std::vector<Ordinates<N>> polygons(count);
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

} // namespace ZarnMath::Benchmarks
