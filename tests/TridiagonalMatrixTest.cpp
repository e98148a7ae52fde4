#include "ZarnMath/TridiagonalMatrix.h"

#include "tests/Bits.h"

#include <array>
#include <cmath>
#include <random>

namespace ZarnMath {
namespace {

using Rows = std::vector<std::array<double, 3>>;

TridiagonalMatrix MatrixOf(const Rows& rows)
{
    TridiagonalMatrix matrix;
    for (const auto& row : rows)
        matrix.AddRow(row[0], row[1], row[2]);
    return matrix;
}

/// A matrix whose diagonal outweighs its neighbours by a margin, and a solution to find again.
struct System
{
    Rows rows;
    std::vector<double> solution;
};

System RandomSystem(std::size_t n, unsigned seed)
{
    std::mt19937 engine(seed);
    std::uniform_real_distribution<double> number(-1.0, 1.0);
    System system;
    for (std::size_t i = 0; i < n; ++i) {
        const double a = number(engine);
        const double c = number(engine);
        const double margin = 0.5 + std::fabs(number(engine));
        const double b = std::fabs(a) + std::fabs(c) + margin;
        system.rows.push_back({a, engine() % 2 == 0 ? b : -b, c});
        system.solution.push_back(100.0 * number(engine));
    }
    return system;
}

/// A row times x, where the neighbours of the ends are each other, or nothing.
double RowTimes(const Rows& rows, const std::vector<double>& x, std::size_t i, bool cyclic)
{
    const std::size_t last = rows.size() - 1;
    const double before = i > 0 ? x[i - 1] : cyclic ? x[last] : 0.0;
    const double after = i < last ? x[i + 1] : cyclic ? x[0] : 0.0;
    return rows[i][0] * before + rows[i][1] * x[i] + rows[i][2] * after;
}

std::vector<double> Times(const Rows& rows, const std::vector<double>& x, bool cyclic)
{
    std::vector<double> product(rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i)
        product[i] = RowTimes(rows, x, i, cyclic);
    return product;
}

testing::AssertionResult SameSolution(const std::vector<double>& actual, const std::vector<double>& expected)
{
    if (actual.size() != expected.size())
        return testing::AssertionFailure() << actual.size() << " values, expected " << expected.size();
    return SameBits(actual.data(), expected.data(), static_cast<int>(actual.size()));
}

TEST(TridiagonalMatrix, OneRow)
{
    const TridiagonalMatrix matrix = MatrixOf({{5.0, 8.0, 7.0}});
    EXPECT_EQ(matrix.Solve(std::vector<double>{20.0}, false), (std::vector<double>{2.5}));
    EXPECT_EQ(matrix.Solve(std::vector<point2d>{{20.0, 4.0}}, false), (std::vector<point2d>{{2.5, 0.5}}));
}

TEST(TridiagonalMatrix, PlainSystemByHand)
{
    // | 2 1   | 1     | 4      a and c outside the matrix are ignored.
    // | 1 4 2 | 2  =  | 15
    // |   3 4 | 3     | 18
    const TridiagonalMatrix matrix = MatrixOf({{99.0, 2.0, 1.0}, {1.0, 4.0, 2.0}, {3.0, 4.0, 99.0}});
    const std::vector<double> x = matrix.Solve(std::vector<double>{4.0, 15.0, 18.0}, false);
    ASSERT_EQ(x.size(), 3U);
    EXPECT_NEAR(x[0], 1.0, 1e-14);
    EXPECT_NEAR(x[1], 2.0, 1e-14);
    EXPECT_NEAR(x[2], 3.0, 1e-14);
}

TEST(TridiagonalMatrix, ExactWhereNothingIsRounded)
{
    // bet is 2, 4, 8; gam is 2, 1.
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 2.0, 4.0}, {1.0, 6.0, 4.0}, {4.0, 12.0, 0.0}});
    EXPECT_EQ(matrix.Solve(std::vector<double>{10.0, 25.0, 44.0}, false), (std::vector<double>{1.0, 2.0, 3.0}));
}

TEST(TridiagonalMatrix, CyclicSystemByHand)
{
    // | 4 1 2 | 1     | 12     row 0 meets x2 by its a, row 2 meets x0 by its c.
    // | 1 4 1 | 2  =  | 12
    // | 3 1 5 | 3     | 20
    const TridiagonalMatrix matrix = MatrixOf({{2.0, 4.0, 1.0}, {1.0, 4.0, 1.0}, {1.0, 5.0, 3.0}});
    const std::vector<double> x = matrix.Solve(std::vector<double>{12.0, 12.0, 20.0}, true);
    ASSERT_EQ(x.size(), 3U);
    EXPECT_NEAR(x[0], 1.0, 1e-14);
    EXPECT_NEAR(x[1], 2.0, 1e-14);
    EXPECT_NEAR(x[2], 3.0, 1e-14);
}

TEST(TridiagonalMatrix, CyclicSystemOfTwoRowsAddsBothSides)
{
    // Row 0: 1*x1 + 8*x0 + 2*x1; row 1: 3*x0 + 8*x1 + 1*x0.
    const TridiagonalMatrix matrix = MatrixOf({{1.0, 8.0, 2.0}, {3.0, 8.0, 1.0}});
    const std::vector<double> x = matrix.Solve(std::vector<double>{8.0 * 3.0 + 3.0 * 5.0, 4.0 * 3.0 + 8.0 * 5.0}, true);
    ASSERT_EQ(x.size(), 2U);
    EXPECT_NEAR(x[0], 3.0, 1e-14);
    EXPECT_NEAR(x[1], 5.0, 1e-14);
    // bet is 8; q1 is -(1 + 3)/8 and p1 is 52/8: all of it is exact.
    EXPECT_EQ(x[0], (39.0 - 6.5 - 13.0) / (8.0 - 0.5 - 1.0));
    EXPECT_EQ(x[1], 6.5 - 0.5 * x[0]);
}

TEST(TridiagonalMatrix, CyclicWithoutWrappingTermsIsPlain)
{
    for (std::size_t n = 2; n < 40; ++n) {
        System system = RandomSystem(n, static_cast<unsigned>(n));
        system.rows.front()[0] = 0.0;
        system.rows.back()[2] = 0.0;
        const TridiagonalMatrix matrix = MatrixOf(system.rows);
        const std::vector<double> rhs = Times(system.rows, system.solution, false);
        const std::vector<double> plain = matrix.Solve(rhs, false);
        const std::vector<double> cyclic = matrix.Solve(rhs, true);
        for (std::size_t i = 0; i < n; ++i)
            EXPECT_NEAR(cyclic[i], plain[i], 1e-11);
    }
}

TEST(TridiagonalMatrix, PointsAreSolvedCoordinateByCoordinate)
{
    for (std::size_t n = 2; n < 30; ++n) {
        const System system = RandomSystem(n, static_cast<unsigned>(n));
        const std::vector<double> ys = RandomSystem(n, static_cast<unsigned>(n + 100)).solution;
        const TridiagonalMatrix matrix = MatrixOf(system.rows);
        std::vector<point2d> points;
        for (std::size_t i = 0; i < n; ++i)
            points.push_back({system.solution[i], ys[i]});
        for (const bool cyclic : {false, true}) {
            std::vector<double> x;
            std::vector<double> y;
            for (const point2d& p : matrix.Solve(points, cyclic)) {
                x.push_back(p.x);
                y.push_back(p.y);
            }
            EXPECT_TRUE(SameSolution(x, matrix.Solve(system.solution, cyclic)));
            EXPECT_TRUE(SameSolution(y, matrix.Solve(ys, cyclic)));
        }
    }
}

TEST(TridiagonalMatrix, ZeroDivisorsAreNotReported)
{
    const TridiagonalMatrix plain = MatrixOf({{0.0, 0.0, 1.0}, {1.0, 1.0, 0.0}});
    const std::vector<double> x = plain.Solve(std::vector<double>{1.0, 2.0}, false);
    EXPECT_FALSE(std::isfinite(x[0]));
    EXPECT_EQ(MatrixOf({{0.0, 0.0, 0.0}}).Solve(std::vector<double>{1.0}, false)[0], infinity);
    EXPECT_TRUE(std::isnan(MatrixOf({{0.0, 0.0, 0.0}}).Solve(std::vector<double>{0.0}, false)[0]));
    // Rows (1, 1) and (1, 1): row 0 has nothing left to fix x0 with.
    const TridiagonalMatrix singular = MatrixOf({{0.0, 1.0, 1.0}, {1.0, 1.0, 0.0}});
    EXPECT_FALSE(std::isfinite(singular.Solve(std::vector<double>{1.0, 2.0}, true)[0]));
}

TEST(TridiagonalMatrix, OverflowReachesTheFirstUnknownAsAnInfinity)
{
    // p1 overflows and q1 is 0, so that row 0 leaves (0 - p1 - p1)/1; p0 takes no part in it.
    const TridiagonalMatrix matrix = MatrixOf({{1.0, 1.0, 1.0}, {0.0, 0.125, 0.0}});
    EXPECT_EQ(matrix.Solve(std::vector<double>{0.0, 1e308}, true)[0], -infinity);
}

TEST(TridiagonalMatrix, DividesAndDoesNotMultiplyByAReciprocal)
{
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 49.0, 0.0}});
    EXPECT_EQ(matrix.Solve(std::vector<double>{49.0}, false)[0], 1.0); // 49 * (1/49) is less than 1
}

TEST(TridiagonalMatrix, SolutionOfZeroHasNoNegativeZeroAtItsStart)
{
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}});
    EXPECT_TRUE(std::signbit(matrix.Solve(std::vector<double>{-0.0, 1.0, 1.0}, false)[0]));
    EXPECT_FALSE(std::signbit(matrix.Solve(std::vector<double>{-0.0, 1.0, 1.0}, true)[0]));
    EXPECT_FALSE(std::signbit(matrix.Solve(std::vector<point2d>{{-0.0, -0.0}, {1.0, 1.0}, {1.0, 1.0}}, true)[0].y));
}

/// q in the last row is -c - a*q, a negative zero where both are 0.
TEST(TridiagonalMatrix, SignOfZeroInTheLastCyclicRow)
{
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}});
    const std::vector<double> x = matrix.Solve(std::vector<double>{1.0, -0.0, -0.0, -0.0}, true);
    EXPECT_EQ(x[0], 1.0);
    EXPECT_TRUE(std::signbit(x[1])); // q1 = -a/bet = -0
    EXPECT_FALSE(std::signbit(x[2]));
    EXPECT_TRUE(std::signbit(x[3]));
}

/// q in the rows between is 0 - a*q, a positive zero where a is 0; -a*q would be a negative one.
TEST(TridiagonalMatrix, SignOfZeroInTheMiddleCyclicRows)
{
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 1.0, 0.0}, {-1.0, 1.0, 0.0}, {0.0, 1.0, 0.0}, {0.0, 1.0, 0.0}});
    const std::vector<double> x = matrix.Solve(std::vector<double>{1.0, 1.0, -0.0, 0.0}, true);
    EXPECT_EQ(x[1], 2.0); // p1 and q1 are 1
    EXPECT_EQ(x[2], 0.0);
    EXPECT_FALSE(std::signbit(x[2])); // p2 is -0
}

/// A half of the last place each: added one after the other they leave 1 as it is.
TEST(TridiagonalMatrix, RowZeroAddsUpFromTheLeft)
{
    const TridiagonalMatrix divisor = MatrixOf({{0x1p-53, 1.0, 0x1p-53}, {-1.0, 1.0, 0.0}}); // q1 = 1
    EXPECT_EQ(divisor.Solve(std::vector<double>{1.0, 0.0}, true)[0], 1.0);
    const TridiagonalMatrix rest = MatrixOf({{0x1p-53, 1.0, 0x1p-53}, {0.0, 1.0, 0.0}}); // p1 = -1, q1 = 0
    EXPECT_EQ(rest.Solve(std::vector<double>{1.0, -1.0}, true)[0], 1.0);
}

TEST(TridiagonalMatrix, SolvingLeavesTheMatrixAsItIs)
{
    const System system = RandomSystem(20, 5);
    const TridiagonalMatrix matrix = MatrixOf(system.rows);
    const auto first = matrix.Solve(system.solution, true);
    matrix.Solve(system.solution, false).clear();
    EXPECT_TRUE(SameSolution(matrix.Solve(system.solution, true), first));
}

TEST(TridiagonalMatrix, RowsCanFollowASolve)
{
    TridiagonalMatrix matrix = MatrixOf({{0.0, 2.0, 0.0}});
    EXPECT_EQ(matrix.Solve(std::vector<double>{4.0}, false), (std::vector<double>{2.0}));
    matrix.AddRow(1.0, 2.0, 0.0);
    EXPECT_EQ(matrix.Solve(std::vector<double>{4.0, 4.0}, false), (std::vector<double>{2.0, 1.0}));
}

TEST(TridiagonalMatrix, InternalSolversReplaceTheResult)
{
    const TridiagonalMatrix matrix = MatrixOf({{0.0, 2.0, 0.0}, {0.0, 4.0, 0.0}});
    std::vector<double> result(7, 1.0);
    matrix.SolveNonCyclic(std::vector<double>{4.0, 4.0}, result);
    EXPECT_EQ(result, (std::vector<double>{2.0, 1.0}));
    result.assign(7, 1.0);
    matrix.SolveCyclic(std::vector<double>{4.0, 4.0}, result);
    EXPECT_EQ(result, (std::vector<double>{2.0, 1.0}));
}

/// The residual, row by row, in units of what the row adds up.
double LargestResidual(const System& system, const std::vector<double>& x, const std::vector<double>& rhs, bool cyclic)
{
    double largest = 0.0;
    for (std::size_t i = 0; i < rhs.size(); ++i)
        largest = std::max(largest, std::fabs(RowTimes(system.rows, x, i, cyclic) - rhs[i]));
    return largest;
}

TEST(TridiagonalMatrix, SolvesDominantSystemsOfAnySize)
{
    for (const std::size_t n : {2U, 3U, 4U, 10U, 1000U, 1000000U}) {
        const System system = RandomSystem(n, static_cast<unsigned>(n) + 7);
        const TridiagonalMatrix matrix = MatrixOf(system.rows);
        for (const bool cyclic : {false, true}) {
            const std::vector<double> rhs = Times(system.rows, system.solution, cyclic);
            const std::vector<double> x = matrix.Solve(rhs, cyclic);
            EXPECT_LT(LargestResidual(system, x, rhs, cyclic), 1e-12) << n << (cyclic ? " cyclic" : " plain");
            for (std::size_t i = 0; i < n; ++i)
                ASSERT_NEAR(x[i], system.solution[i], 1e-12) << n << ", row " << i;
        }
    }
}

} // namespace
} // namespace ZarnMath
