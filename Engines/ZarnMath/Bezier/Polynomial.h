/// @file
/// Polynomials of fixed degree and their arithmetic. Internal.
#pragma once

namespace ZarnMath::CubicBezier {

/// A polynomial of degree N: N + 1 coefficients, highest power first, as the root finder takes them.
template <int N>
struct Polynomial
{
    double c[N + 1];
};

/// p + q, for q of the same or a lower degree.
template <int N, int M>
[[nodiscard]] constexpr Polynomial<N> operator+(Polynomial<N> p, const Polynomial<M>& q) noexcept
{
    static_assert(M <= N);
    for (int i = 0; i <= M; ++i)
        p.c[N - M + i] += q.c[i];
    return p;
}

/// s*p
template <int N>
[[nodiscard]] constexpr Polynomial<N> operator*(double s, Polynomial<N> p) noexcept
{
    for (double& c : p.c)
        c *= s;
    return p;
}

/// p*q: the convolution of the coefficients. Each sum runs from the high powers of p to the low ones.
template <int N, int M>
[[nodiscard]] constexpr Polynomial<N + M> operator*(const Polynomial<N>& p, const Polynomial<M>& q) noexcept
{
    Polynomial<N + M> product{};
    for (int i = 0; i <= N; ++i)
        for (int j = 0; j <= M; ++j) {
            const double term = p.c[i] * q.c[j];
            const bool isFirst = i == 0 || j == M;
            product.c[i + j] = isFirst ? term : product.c[i + j] + term;
        }
    return product;
}

/// p^2: every pair of different coefficients counts twice. Each sum runs from the outermost pair inward, the square of
/// the middle coefficient last.
template <int N>
[[nodiscard]] constexpr Polynomial<2 * N> Square(const Polynomial<N>& p) noexcept
{
    Polynomial<2 * N> square{};
    for (int k = 0; k <= 2 * N; ++k) {
        const int outermost = k < N ? 0 : k - N;
        for (int i = outermost; 2 * i <= k; ++i) {
            const int j = k - i;
            const double term = i == j ? p.c[i] * p.c[i] : 2.0 * p.c[i] * p.c[j];
            square.c[k] = i == outermost ? term : square.c[k] + term;
        }
    }
    return square;
}

} // namespace ZarnMath::CubicBezier
