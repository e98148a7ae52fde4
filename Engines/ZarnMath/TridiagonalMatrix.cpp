#include "ZarnMath/TridiagonalMatrix.h"

namespace ZarnMath {

namespace {

/// @name The steps of the elimination on an unknown, which is a number or, coordinate by coordinate, a point
/// @{

double Divide(double v, double divisor) noexcept
{
    return v / divisor;
}

point2d Divide(const point2d& v, double divisor) noexcept
{
    return {v.x / divisor, v.y / divisor};
}

/// v - k*x
double SubtractMultiple(double v, double k, double x) noexcept
{
    return v - k * x;
}

point2d SubtractMultiple(const point2d& v, double k, const point2d& x) noexcept
{
    return {v.x - k * x.x, v.y - k * x.y};
}

/// v + x*k
double AddMultiple(double v, double x, double k) noexcept
{
    return v + x * k;
}

point2d AddMultiple(const point2d& v, const point2d& x, double k) noexcept
{
    return {v.x + x.x * k, v.y + x.y * k};
}

/// @}

template <typename T>
std::vector<T> SolveFor(const TridiagonalMatrix& matrix, const std::vector<T>& rhs, bool cyclic)
{
    std::vector<T> result;
    if (cyclic)
        matrix.SolveCyclic(rhs, result);
    else
        matrix.SolveNonCyclic(rhs, result);
    return result;
}

} // namespace

void TridiagonalMatrix::AddRow(double a, double b, double c)
{
    rows.push_back({a, b, c});
}

std::vector<double> TridiagonalMatrix::Solve(const std::vector<double>& rhs, bool cyclic) const
{
    return SolveFor(*this, rhs, cyclic);
}

std::vector<point2d> TridiagonalMatrix::Solve(const std::vector<point2d>& rhs, bool cyclic) const
{
    return SolveFor(*this, rhs, cyclic);
}

template <typename T>
void TridiagonalMatrix::SolveNonCyclic(const std::vector<T>& rhs, std::vector<T>& result) const
{
    const std::size_t n = rows.size();
    result.resize(rhs.size());
    std::vector<double> gam(n);

    double bet = rows[0].b;
    result[0] = Divide(rhs[0], bet);
    for (std::size_t j = 1; j < n; ++j) {
        const Row& row = rows[j];
        gam[j] = rows[j - 1].c / bet;
        bet = row.b - row.a * gam[j];
        result[j] = Divide(SubtractMultiple(rhs[j], row.a, result[j - 1]), bet);
    }
    for (std::size_t j = n - 1; j-- > 0;)
        result[j] = SubtractMultiple(result[j], gam[j + 1], result[j + 1]);
}

template <typename T>
void TridiagonalMatrix::SolveCyclic(const std::vector<T>& rhs, std::vector<T>& result) const
{
    const std::size_t n = rows.size();
    const std::size_t last = n - 1;
    result.resize(rhs.size());
    std::vector<T>& p = result; // p turns into the solution in place
    std::vector<double> q(n);
    std::vector<double> gam(n);

    p[0] = T{};
    q[0] = 1.0;
    double bet = rows[1].b;
    p[1] = Divide(rhs[1], bet);
    q[1] = -rows[1].a / bet;
    for (std::size_t j = 2; j < n; ++j) {
        const Row& row = rows[j];
        gam[j] = rows[j - 1].c / bet;
        bet = row.b - row.a * gam[j];
        p[j] = Divide(SubtractMultiple(rhs[j], row.a, p[j - 1]), bet);
        q[j] = (0.0 - row.a * q[j - 1]) / bet;
    }
    // The last row meets the first unknown directly.
    q[last] = (-rows[last].c - rows[last].a * q[last - 1]) / bet;
    for (std::size_t j = last; j-- > 1;) {
        p[j] = SubtractMultiple(p[j], gam[j + 1], p[j + 1]);
        q[j] = q[j] - gam[j + 1] * q[j + 1];
    }

    const Row& first = rows[0];
    const T rest = SubtractMultiple(SubtractMultiple(rhs[0], first.a, p[last]), first.c, p[1]);
    T s = Divide(rest, first.b + first.a * q[last] + first.c * q[1]);
    s = AddMultiple(p[0], s, q[0]); // 0 + s: a negative zero becomes a positive one
    result[0] = s;
    for (std::size_t i = 1; i < n; ++i)
        result[i] = AddMultiple(p[i], s, q[i]);
}

template void TridiagonalMatrix::SolveNonCyclic(const std::vector<double>&, std::vector<double>&) const;
template void TridiagonalMatrix::SolveNonCyclic(const std::vector<point2d>&, std::vector<point2d>&) const;
template void TridiagonalMatrix::SolveCyclic(const std::vector<double>&, std::vector<double>&) const;
template void TridiagonalMatrix::SolveCyclic(const std::vector<point2d>&, std::vector<point2d>&) const;

} // namespace ZarnMath
