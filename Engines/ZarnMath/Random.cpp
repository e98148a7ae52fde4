#include "ZarnMath/Random.h"

#include "ZarnMath/RandomInternal.h"
#include "ZarnMath/ValueTypesInternal.h"

#include <bit>

std::mt19937& GetEngine()
{
    thread_local std::mt19937 engine(std::random_device("/dev/urandom")());
    return engine;
}

namespace ZarnMath {

namespace {

constexpr double twoToThe32 = 4294967296.0;
constexpr double twoToTheMinus64 = 5.421010862427522e-20;

std::uint32_t Draw(std::mt19937& engine)
{
    return static_cast<std::uint32_t>(engine());
}

} // namespace

double Random::Generate(double low, double high)
{
    std::mt19937& engine = GetEngine();
    const double span = high - low;
    const double lower = Draw(engine);
    const double upper = Draw(engine);
    return span * ((upper * twoToThe32 + lower) * twoToTheMinus64) + low;
}

int Random::Generate(int low, int high)
{
    if (high == low)
        return low;
    std::mt19937& engine = GetEngine();
    const auto range = static_cast<std::uint32_t>(WrappingAdd(WrappingSubtract(high, low), 1));
    if (range == 0)
        return static_cast<int>(Draw(engine));
    const std::uint32_t mask = ~std::uint32_t{0} >> std::countl_zero(range - 1);
    std::uint32_t value = 0;
    do {
        value = Draw(engine) & mask;
    } while (value >= range);
    return WrappingAdd(low, static_cast<int>(value));
}

} // namespace ZarnMath
