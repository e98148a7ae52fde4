#include "ZarnMath/FitBezier.h"
#include "ZarnMath/SmallMatrix.h"

namespace ZarnMath {

namespace {

/// The sums of the normal equations.
struct ParabolaSums
{
    double s[5]{}; ///< of the powers of x
    double m[3]{}; ///< of y times the powers of x

    void Add(const point2d& point) noexcept
    {
        const auto [x, y] = point;
        const double x2 = x * x;
        const double x3 = x2 * x;
        s[0] += 1.0;
        s[1] += x;
        s[2] += x2;
        s[3] += x3;
        s[4] += x3 * x;
        m[0] += y;
        m[1] += x * y;
        m[2] += x2 * y;
    }
};

} // namespace

bool LeastSquares(const point2d* points, unsigned long count, std::vector<double>& coefficients)
{
    if (count < 3)
        return false;
    ParabolaSums sums;
    for (unsigned long i = 0; i < count; ++i)
        sums.Add(points[i]);
    matrix<3, 6, double> system;
    for (unsigned long i = 0; i < 3; ++i) {
        for (unsigned long j = 0; j < 3; ++j)
            system(i, j) = sums.s[i + j];
        system(i, 3 + i) = 1.0;
    }
    if (!system.GaussJordenEliminate())
        return false;
    double c[3];
    for (unsigned long i = 0; i < 3; ++i)
        c[i] = system(i, 3) * sums.m[0] + 0.0 + system(i, 4) * sums.m[1] + system(i, 5) * sums.m[2];
    coefficients.insert(coefficients.end(), c, c + 3); // all of them or, where memory runs out, none
    return true;
}

} // namespace ZarnMath
