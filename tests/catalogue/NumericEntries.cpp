#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

/// Counts of steps, up to the range that an `unsigned long` has everywhere.
constexpr auto steps = [](Draft& draft) {
    return Given<unsigned long>{static_cast<std::uint32_t>(draft.in.Integer())};
};

} // namespace

void AddNumeric(std::vector<Function>& list)
{
    Family family(list, "Numeric");
    family.Add<int(int, int)>("GCD", GCD, integer, integer);
    family.Add<double(double, double)>("Bias", Bias, parameter, parameter);
    family.Add<double(double, double)>("Gain", Gain, parameter, parameter);
    family.Add<double(unsigned long, unsigned long)>("GetLinearBlendFactor", GetLinearBlendFactor, steps, steps);
    family.Add<double(double, double, double)>("GetBiasGainBlendFactor", GetBiasGainBlendFactor, parameter, parameter,
                                               parameter);
    family.Set(NumberClass::Platform);
    family.Add<double(double, double, double)>("Gaussian", Gaussian, number, number, number);
    family.Add<double(double)>("CubeRoot", CubeRoot, number);
    family.Add<double(double, double)>("GetLogarithmicBlendFactor", GetLogarithmicBlendFactor, parameter, number);
}

} // namespace ZarnMath::Catalogue
