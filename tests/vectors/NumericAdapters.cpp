#include "tests/vectors/Table.h"

#include "ZarnMath/Numeric.h"
#include "ZarnMath/Random.h"
#include "ZarnMath/RandomInternal.h"

namespace ZarnMath::Vectors {

namespace {

/// A function of doubles.
template <typename... Double>
void AddScalar(Table& table, const std::string& name, double (*function)(Double...) noexcept,
               std::set<Platform> uses = {})
{
    table.Add(
        name,
        [function](Input& in, Output& out) {
            const auto arguments = in.GetArray<double, sizeof...(Double)>();
            out.Add(std::apply(function, arguments));
        },
        std::move(uses));
}

/// Brings the generator to a known place, draws once between two ends, and shows which output comes next.
template <typename T>
void Draw(Input& in, Output& out)
{
    GetEngine().seed(in.Get<std::uint32_t>());
    GetEngine().discard(in.Get<std::uint64_t>());
    const T low = in.Get<T>();
    const T value = Random::Generate(low, in.Get<T>());
    out.Add(value, GetEngine()());
}

} // namespace

void AddNumericAdapters(Table& table)
{
    AddScalar(table, "Gaussian", Gaussian, {Platform::Exp});
    AddScalar(table, "CubeRoot", CubeRoot, {Platform::Pow});
    AddScalar(table, "Bias", Bias);
    AddScalar(table, "Gain", Gain);
    AddScalar(table, "GetLogarithmicBlendFactor", GetLogarithmicBlendFactor, {Platform::Log});
    AddScalar(table, "GetBiasGainBlendFactor", GetBiasGainBlendFactor);
    table.Add("GCD", [](Input& in, Output& out) {
        const int a = in.Get<int>();
        out.Add(GCD(a, in.Get<int>()));
    });
    table.Add("GetLinearBlendFactor", [](Input& in, Output& out) {
        const auto step = in.Get<unsigned long>();
        out.Add(GetLinearBlendFactor(step, in.Get<unsigned long>()));
    });
    table.Add("Random::Generate(double)", Draw<double>);
    table.Add("Random::Generate(int)", Draw<int>);
}

} // namespace ZarnMath::Vectors
