/// @file
/// Tridiagonal systems, held against their own rows.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/TridiagonalMatrix.h"

namespace ZarnMath::Fuzzing {

namespace {

struct Row
{
    double a;
    double b;
    double c;

    [[nodiscard]] bool IsDominant() const noexcept
    {
        return IsOrdinary(a) && IsOrdinary(b) && IsOrdinary(c) && std::fabs(b) >= 2.0 * (std::fabs(a) + std::fabs(c)) &&
               std::fabs(b) >= 1e-3;
    }
};

struct System
{
    std::vector<Row> rows;
    TridiagonalMatrix matrix;
    bool isDominant = true; ///< by rows, well enough for every divisor to be far from 0

    void Add(const Row& row)
    {
        rows.push_back(row);
        matrix.AddRow(row.a, row.b, row.c);
        isDominant = isDominant && row.IsDominant();
    }
};

/// What the rows make of a solution has to be the right-hand side, but for rounding in proportion to the terms.
void CheckResidual(const System& system, const std::vector<double>& x, const std::vector<double>& rhs, bool cyclic)
{
    const std::size_t n = x.size();
    for (std::size_t i = 0; i < n; ++i) {
        const auto& [a, b, c] = system.rows[i];
        const double before = cyclic || i > 0 ? a * x[(i + n - 1) % n] : 0.0;
        const double after = cyclic || i + 1 < n ? c * x[(i + 1) % n] : 0.0;
        const double terms = std::fabs(before) + std::fabs(b * x[i]) + std::fabs(after) + std::fabs(rhs[i]);
        Require(std::fabs(before + b * x[i] + after - rhs[i]) <= 1e-9 * terms + 1e-30, "the solution solves each row");
    }
}

void CheckSystem(const System& system, const std::vector<point2d>& points, bool cyclic)
{
    std::vector<double> rhs;
    for (const point2d& p : points)
        rhs.push_back(p.x);
    const auto solve = [&] { return system.matrix.Solve(rhs, cyclic); };
    const auto size = static_cast<double>(rhs.size());
    const std::vector<double> x = cyclic ? Bounded("TridiagonalMatrix::Solve cyclic", solve, size)
                                         : Bounded("TridiagonalMatrix::Solve", solve, size);
    const std::vector<point2d> solved = system.matrix.Solve(points, cyclic);
    Require(x.size() == rhs.size() && solved.size() == rhs.size(), "an unknown for each row");
    for (std::size_t i = 0; i < x.size(); ++i)
        Require(IsSame(x[i], solved[i].x), "a coordinate is solved for as a number is");
    if (system.isDominant && AreOrdinary(rhs.data(), static_cast<int>(rhs.size())))
        CheckResidual(system, x, rhs, cyclic);
}

} // namespace

void FuzzTridiagonal(Input& input)
{
    constexpr int mostRows = 40;
    const int count = 1 + input.Choice(mostRows);
    const bool cyclic = count > 1 && input.Flag();
    const bool isMadeDominant = input.Flag();
    System system;
    std::vector<point2d> points;
    for (int i = 0; i < count; ++i) {
        Row row{input.Double(), input.Double(), input.Double()};
        if (isMadeDominant)
            row.b = 2.5 * (std::fabs(row.a) + std::fabs(row.c)) + 0.5;
        system.Add(row);
        points.push_back(input.Point());
    }
    CheckSystem(system, points, cyclic);
}

} // namespace ZarnMath::Fuzzing
