#include "ZarnMath/Numeric.h"

#include "ZarnMath/ValueTypes.h"

#include <cmath>
#include <numeric>

namespace ZarnMath {

namespace {

constexpr double twoPi = 6.283185307179586;
constexpr double oneThird = 0.3333333333333333;

/// Below this a cube root is a flat zero.
constexpr double smallestCube = 1e-10;

/// Into [low, high]; NaN, which is not below low and not within high, becomes high.
double Clamp(double v, double low, double high) noexcept
{
    if (v < low)
        return low;
    return v <= high ? v : high;
}

/// |v|, which for -2147483648 is no `int`.
unsigned Magnitude(int v) noexcept
{
    const auto bits = static_cast<unsigned>(v);
    return v < 0 ? 0U - bits : bits;
}

} // namespace

double Gaussian(double x, double mean, double sigma) noexcept
{
    const double v = sigma * sigma;
    const double e = (x - mean) * -(x - mean) / (v + v);
    const double k = 1.0 / std::sqrt(v * twoPi);
    return k * std::exp(e);
}

double CubeRoot(double x) noexcept
{
    if (x > smallestCube)
        return std::pow(x, oneThird);
    if (x < -smallestCube)
        return -std::pow(-x, oneThird);
    return 0.0;
}

int GCD(int a, int b) noexcept
{
    return static_cast<int>(std::gcd(Magnitude(a), Magnitude(b)));
}

double Bias(double x, double bias) noexcept
{
    if (IsNearZero(bias - 0.5))
        return x;
    const double c = Clamp(bias, 0.0, 1.0);
    if (IsNearZero(c))
        return 0.0;
    return (c * x) / (c + (1.0 - x) * (1.0 - (c + c)));
}

double Gain(double x, double gain) noexcept
{
    if (IsNearZero(gain))
        return x;
    const double c = Clamp(gain, -1.0, 1.0);
    const double s = c + 1.0;
    const double h = (x + x - 1.0) * (c + c);
    const double denominator = s + h;
    if (IsNearZero(denominator))
        return 1.0;
    const double n = s * x;
    return x < 0.5 ? n / denominator : (h - n) / (h - s);
}

double GetLinearBlendFactor(unsigned long step, unsigned long steps) noexcept
{
    return steps == 0 ? 1.0 : static_cast<double>(step) / static_cast<double>(steps);
}

double GetLogarithmicBlendFactor(double x, double base) noexcept
{
    const double m = base - 1.0;
    if (IsNearZero(m))
        return x;
    return std::log(m * x + 1.0) / std::log(base);
}

double GetBiasGainBlendFactor(double x, double gain, double bias) noexcept
{
    return Gain(Bias(x, bias), gain);
}

} // namespace ZarnMath
