// A tridiagonal system, diagonally dominant. LAPACK's dgtsv pivots, and overwrites its arrays: filling them again is part
// of its time, as allocating the result is part of ours. The time is that of a row.

#include "ZarnMath/TridiagonalMatrix.h"
#include "benchmarks/peers/Questions.h"
#include "tests/Random.h"

#include <cmath>

// Fortran: everything by address.
extern "C" void dgtsv_(const int* n, const int* rightSides, double* below, double* diagonal, double* above, double* b,
                       const int* stride, int* info);

namespace ZarnMath::Peers {
namespace {

struct Rows
{
    std::vector<double> below;
    std::vector<double> diagonal;
    std::vector<double> above;
    std::vector<double> rightSide;
};

Rows RandomRows(int count)
{
    RandomSource random(3);
    Rows rows;
    for (int i = 0; i < count; ++i) {
        rows.below.push_back(random.Uniform(-1.0, 1.0));
        rows.above.push_back(random.Uniform(-1.0, 1.0));
        rows.diagonal.push_back(0.5 + std::fabs(rows.below.back()) + std::fabs(rows.above.back()));
        rows.rightSide.push_back(random.Uniform(-1.0, 1.0));
    }
    return rows;
}

std::vector<double> SolveByLapack(Rows rows)
{
    const int count = static_cast<int>(rows.diagonal.size());
    const int rightSides = 1;
    int info = 0;
    dgtsv_(&count, &rightSides, rows.below.data() + 1, rows.diagonal.data(), rows.above.data(), rows.rightSide.data(),
           &count, &info);
    return std::move(rows.rightSide);
}

/// The largest residual of any row.
Measures Residual(const Rows& rows, const std::vector<double>& x)
{
    double largest = 0.0;
    for (std::size_t i = 0; i < x.size(); ++i) {
        const double before = i > 0 ? rows.below[i] * x[i - 1] : 0.0;
        const double after = i + 1 < x.size() ? rows.above[i] * x[i + 1] : 0.0;
        largest = std::max(largest, std::fabs(before + rows.diagonal[i] * x[i] + after - rows.rightSide[i]));
    }
    return {{"largest error", largest}};
}

void AskForRows(int count)
{
    const Rows rows = RandomRows(count);
    TridiagonalMatrix matrix;
    for (std::size_t i = 0; i < rows.diagonal.size(); ++i)
        matrix.AddRow(rows.below[i], rows.diagonal[i], rows.above[i]);
    Question question("tridiagonal solve, " + std::to_string(count), rows.diagonal.size());
    const auto add = [&](const char* library, auto solve) {
        question.AddPass(
            library, "", [solve] { benchmark::DoNotOptimize(solve()); }, Residual(rows, solve()));
    };
    add("ZarnMath", [&] { return matrix.Solve(rows.rightSide, false); });
    add("LAPACK", [&] { return SolveByLapack(rows); });
    question.Ask();
}

} // namespace

void AskForTridiagonalSolve()
{
    AskForRows(100);
    AskForRows(100000);
}

} // namespace ZarnMath::Peers
