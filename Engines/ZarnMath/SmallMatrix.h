/// @file
/// Small dense matrices of fixed size, for the normal equations of the fits. Internal.
#pragma once

#include <cmath>
#include <utility>

/// R rows by C columns of T, by rows; all zeros at first.
template <unsigned long R, unsigned long C, typename T>
class matrix
{
public:
    [[nodiscard]] constexpr T& operator()(unsigned long row, unsigned long column) noexcept
    {
        return elements[row][column];
    }

    [[nodiscard]] constexpr const T& operator()(unsigned long row, unsigned long column) const noexcept
    {
        return elements[row][column];
    }

    /// Makes the identity of the left R columns by operations on whole rows, with partial pivoting: Gauss-Jordan
    /// elimination. With the identity in the columns to the right of them, these hold the inverse afterwards.
    ///
    /// Any pivot but 0 is accepted, however small; NaN is none.
    ///
    /// @return false where there is no pivot left for a column; the matrix is then reduced in part
    [[nodiscard]] bool GaussJordenEliminate() noexcept
    {
        static_assert(C >= R);
        for (unsigned long k = 0; k < R; ++k) {
            const unsigned long pivot = FindPivotRow(k);
            if (pivot == R)
                return false;
            if (pivot != k)
                std::swap(elements[pivot], elements[k]);
            ScaleRow(k, T{1} / elements[k][k]);
            for (unsigned long i = 0; i < R; ++i)
                if (i != k)
                    SubtractRow(i, elements[i][k], k);
        }
        return true;
    }

    /// @param[out] result the inverse; untouched where there is none. It may be this matrix
    /// @return whether there is one, as far as `GaussJordenEliminate` can tell
    [[nodiscard]] bool GetInverse(matrix& result) const noexcept requires(R == C)
    {
        matrix<R, 2 * C, T> augmented;
        for (unsigned long i = 0; i < R; ++i) {
            for (unsigned long j = 0; j < C; ++j)
                augmented(i, j) = elements[i][j];
            augmented(i, C + i) = T{1};
        }
        if (!augmented.GaussJordenEliminate())
            return false;
        for (unsigned long i = 0; i < R; ++i)
            for (unsigned long j = 0; j < C; ++j)
                result(i, j) = augmented(i, C + j);
        return true;
    }

private:
    /// The first of the rows from k on with the largest magnitude in column k; R where all of them are 0 or NaN.
    [[nodiscard]] unsigned long FindPivotRow(unsigned long k) const noexcept
    {
        unsigned long pivot = R;
        T best{};
        for (unsigned long i = k; i < R; ++i) {
            const T magnitude = std::fabs(elements[i][k]);
            if (magnitude > best) {
                best = magnitude;
                pivot = i;
            }
        }
        return pivot;
    }

    void ScaleRow(unsigned long row, T factor) noexcept
    {
        for (T& element : elements[row])
            element *= factor;
    }

    /// The columns that are reduced already take part: infinities in them are to reach the result.
    void SubtractRow(unsigned long row, T factor, unsigned long other) noexcept
    {
        for (unsigned long j = 0; j < C; ++j)
            elements[row][j] -= factor * elements[other][j];
    }

    T elements[R][C]{};
};
