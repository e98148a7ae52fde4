/// @file
/// Point arrays through a matrix, written by hand for registers of four doubles: how fast it can be done with the bits
/// of the library.
#pragma once

#if defined(__x86_64__)

#include "ZarnMath/ValueTypes.h"

#include <immintrin.h>

namespace ZarnMath::Benchmarks {

/// Whether the kernels run on this processor.
[[nodiscard]] inline bool HasWideKernels()
{
    return __builtin_cpu_supports("avx2");
}

/// A matrix for two points at a time, x y x y.
struct WideMatrix
{
    __m256d same;  ///< what a coordinate gives to its own kind
    __m256d other; ///< what it gives to the other one
    __m256d translation;
};

[[nodiscard, gnu::target("avx2")]] inline WideMatrix Widen(const MATRIX& m)
{
    return {_mm256_setr_pd(m.m11, m.m22, m.m11, m.m22), _mm256_setr_pd(m.m12, m.m21, m.m12, m.m21),
            _mm256_setr_pd(m.dx, m.dy, m.dx, m.dy)};
}

[[nodiscard, gnu::target("avx2"), gnu::always_inline]] inline __m256d Image(const WideMatrix& m, __m256d p)
{
    const __m256d swapped = _mm256_permute_pd(p, 0b0101);
    return _mm256_add_pd(m.translation, _mm256_add_pd(_mm256_mul_pd(m.same, p), _mm256_mul_pd(m.other, swapped)));
}

/// To the nearest whole numbers, halves away from zero; cut off at the ends of 32 bits; NaN gives 0.
[[nodiscard, gnu::target("avx2"), gnu::always_inline]] inline __m128i RoundAndSaturate(__m256d v)
{
    const __m256d number = _mm256_and_pd(v, _mm256_cmp_pd(v, v, _CMP_ORD_Q));
    const __m256d within =
        _mm256_min_pd(_mm256_max_pd(number, _mm256_set1_pd(-2147483648.0)), _mm256_set1_pd(2147483647.0));
    const __m256d signs = _mm256_and_pd(within, _mm256_set1_pd(-0.0));
    return _mm256_cvttpd_epi32(_mm256_add_pd(within, _mm256_or_pd(signs, _mm256_set1_pd(0.5))));
}

/// @param count even
[[gnu::target("avx2"), gnu::noinline]] inline void TransformByHand(const MATRIX& matrix, point2d* points,
                                                                   std::size_t count)
{
    const WideMatrix m = Widen(matrix);
    for (std::size_t i = 0; i < count; i += 2) {
        double* pair = &points[i].x;
        _mm256_storeu_pd(pair, Image(m, _mm256_loadu_pd(pair)));
    }
}

/// @param count even
[[gnu::target("avx2"), gnu::noinline]] inline void TransformByHand(const MATRIX& matrix, POINT* points,
                                                                   std::size_t count)
{
    const WideMatrix m = Widen(matrix);
    for (std::size_t i = 0; i < count; i += 2) {
        auto* pair = reinterpret_cast<__m128i*>(&points[i]);
        _mm_storeu_si128(pair, RoundAndSaturate(Image(m, _mm256_cvtepi32_pd(_mm_loadu_si128(pair)))));
    }
}

} // namespace ZarnMath::Benchmarks

#endif
