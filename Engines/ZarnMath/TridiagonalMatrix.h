/// @file
/// Tridiagonal systems of equations, plain and cyclic, as they arise from splines through points.
///
/// All functions are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

#include <vector>

namespace ZarnMath {

/// A tridiagonal matrix, row by row. It keeps no factorisation: a solve reads the rows and leaves them unchanged, so that
/// several threads may solve at once as long as none adds a row.
///
/// @code
///   plain                        cyclic
///   | b0 c0             |        | b0 c0          a0 |
///   | a1 b1 c1          |        | a1 b1 c1          |
///   |    a2 b2 c2       |        |    a2 b2 c2       |
///   |       ...         |        |       ...         |
///   |        an-1  bn-1 |        | cn-1     an-1 bn-1|
/// @endcode
///
/// There is no pivoting and no check of a divisor: where one vanishes, the solution holds infinities or NaN. A matrix
/// that is diagonally dominant by rows has no such divisor. The exceptions of growing vectors pass through.
class TridiagonalMatrix
{
public:
    /// Appends a row of any numbers at the end.
    ///
    /// @param a coefficient of the unknown before; in row 0 of a plain system ignored, of a cyclic one that of the last
    /// @param b coefficient of the row's own unknown
    /// @param c coefficient of the unknown after; in the last row of a plain system ignored, of a cyclic one that of the
    ///          first. The two cyclic rules hold for two rows too, where both side coefficients meet one unknown
    /// @arithmetic
    ZARNMATH_API void AddRow(double a, double b, double c);

    /// Solves for a right-hand side of numbers, or of points, whose coordinates are solved for side by side.
    ///
    /// Linear in the number of rows.
    ///
    /// @param rhs    as many elements as there are rows: at least one, or two for a cyclic system
    /// @param cyclic whether the first and the last row wrap round to each other
    /// @return the unknowns
    /// @arithmetic
    [[nodiscard]] ZARNMATH_API std::vector<double> Solve(const std::vector<double>& rhs, bool cyclic) const;
    [[nodiscard]] ZARNMATH_API std::vector<point2d> Solve(const std::vector<point2d>& rhs, bool cyclic) const;

    /// @name Internal
    /// Not exported; for `double` and `point2d`.
    /// @{

    /// Elimination downward and substitution upward (L. H. Thomas, 1949).
    ///
    /// @param rhs         the right-hand side
    /// @param[out] result another vector; resized to the size of rhs
    template <typename T>
    void SolveNonCyclic(const std::vector<T>& rhs, std::vector<T>& result) const;

    /// Takes the first unknown as a parameter s: the others are p + s*q, by one plain elimination of rows 1 to n-1 for p
    /// and q together, and row 0 then fixes s.
    ///
    /// @param rhs         the right-hand side, of at least two elements
    /// @param[out] result another vector; resized to the size of rhs
    template <typename T>
    void SolveCyclic(const std::vector<T>& rhs, std::vector<T>& result) const;

    /// @}

private:
    struct Row
    {
        double a;
        double b;
        double c;
    };

    std::vector<Row> rows;
};

} // namespace ZarnMath
