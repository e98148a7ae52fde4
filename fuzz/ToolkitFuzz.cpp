/// @file
/// Scalar functions, random numbers and layout.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/Layout.h"
#include "ZarnMath/Numeric.h"
#include "ZarnMath/Random.h"
#include "ZarnMath/RandomInternal.h"
#include "ZarnMath/SmallMatrix.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

void CheckScalars(double x, double y, double z)
{
    const double density = Bounded("Gaussian", [&] { return Gaussian(x, y, z); });
    Require(!(density < 0.0), "no density is negative");
    const double root = Bounded("CubeRoot", [&] { return CubeRoot(x); });
    Require(root == -CubeRoot(-x), "a cube root is odd, and a number for NaN too");
    const double bent = Bounded("Bias", [&] { return Bias(x, y); });
    const double shaped = Bounded("Gain", [&] { return Gain(x, y); });
    constexpr double rounding = 1e-9;
    if (IsInUnit(x) && 1e-6 <= y && y <= 0.999)
        Require(bent >= 0.0 && bent <= 1.0 + rounding && shaped >= -rounding && shaped <= 1.0 + rounding,
                "a ramp stays a ramp");
    (void)Bounded("GetLogarithmicBlendFactor", [&] { return GetLogarithmicBlendFactor(x, y); });
    Require(IsSame(GetBiasGainBlendFactor(x, z, y), Gain(bent, z)), "the gain of the bias");
}

void CheckIntegers(int a, int b)
{
    const int divisor = Bounded("GCD", [&] { return GCD(a, b); });
    Require(divisor == GCD(b, a), "a divisor of both");
    if (divisor > 0)
        Require(std::int64_t{a} % divisor == 0 && std::int64_t{b} % divisor == 0, "a divisor of both");
    else
        Require(std::int64_t{a} % 2147483648 == 0 && std::int64_t{b} % 2147483648 == 0,
                "no divisor but of 0 and of what has no magnitude");
    const auto steps = static_cast<unsigned long>(static_cast<unsigned>(b));
    const double factor = GetLinearBlendFactor(static_cast<unsigned long>(static_cast<unsigned>(a)), steps);
    Require(factor >= 0.0 && (steps != 0 || factor == 1.0), "a share, and all of nothing");
}

void CheckRandom(int low, int high, double from, double to, std::uint32_t seed)
{
    GetEngine().seed(seed); // the same input has to take the same steps
    const int drawn = Bounded("Random::Generate of integers", [&] { return Random::Generate(low, high); });
    if (low <= high)
        Require(low <= drawn && drawn <= high, "an integer of the range");
    const double number = Bounded("Random::Generate", [&] { return Random::Generate(from, to); });
    if (IsOrdinary(from) && IsOrdinary(to)) {
        const double rounding = 1e-15 * (std::fabs(from) + std::fabs(to));
        Require(std::min(from, to) - rounding <= number && number <= std::max(from, to) + rounding,
                "a number between both");
    }
}

LayoutMeasure ReadMeasure(Input& input)
{
    const auto kind = static_cast<LayoutUnit>(input.Flag() ? input.Choice(3) : input.Int());
    return {kind, input.Double()};
}

void CheckLayout(Input& input)
{
    const BoundsT<double> frame = input.Bounds();
    const BoundsT<double> object = input.Bounds();
    Layout layout{};
    const LayoutMeasure none{LayoutUnit::None, 0.0};
    for (LayoutMeasure* measure : {&layout.width, &layout.height, &layout.minWidth, &layout.minHeight,
                                   &layout.leftMargin, &layout.rightMargin, &layout.topMargin, &layout.bottomMargin})
        *measure = input.Flag() ? none : ReadMeasure(input);
    layout.verticalAlign = input.Flag() ? input.Choice(4) : input.Int();
    layout.horizontalAlign = input.Flag() ? input.Choice(4) : input.Int();
    (void)Bounded("LayoutObject", [&] { return LayoutObject(frame, layout); });
    (void)Bounded("GetLayoutTransformation", [&] { return GetLayoutTransformation(frame, object, layout); });
    const BoundsT<double> whole = LayoutObject(frame, Layout{});
    Require(whole.left == frame.left || !IsFinite(frame.left), "without a description it is the frame itself");
}

void CheckSmallMatrix(Input& input)
{
    matrix<4, 4, double> m;
    matrix<4, 4, double> inverse;
    for (unsigned long r = 0; r < 4; ++r) {
        for (unsigned long c = 0; c < 4; ++c) {
            m(r, c) = input.Double();
            inverse(r, c) = guard<double>;
        }
    }
    if (Bounded("matrix::GetInverse", [&] { return m.GetInverse(inverse); }))
        return;
    for (unsigned long r = 0; r < 4; ++r)
        for (unsigned long c = 0; c < 4; ++c)
            Require(IsSame(inverse(r, c), guard<double>), "without an inverse nothing is written");
}

} // namespace

void FuzzToolkit(Input& input)
{
    const double x = input.Flag() ? input.Parameter() : input.Double();
    const double y = input.Flag() ? input.Parameter() : input.Double();
    const double z = input.Flag() ? input.Parameter() : input.Double();
    CheckScalars(x, y, z);
    const int a = input.Int();
    const int b = input.Int();
    CheckIntegers(a, b);
    CheckRandom(a, b, x, y, static_cast<std::uint32_t>(input.Int()));
    CheckLayout(input);
    CheckSmallMatrix(input);
}

} // namespace ZarnMath::Fuzzing
