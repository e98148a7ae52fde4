/// @file
/// Benchmarks that take a line each: functions of a few instructions, over random arguments.
#pragma once

#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {

/// `corpusSize` values, each of them made by make(random).
template <typename Make>
[[nodiscard]] auto Inputs(Make make)
{
    RandomSource random(11);
    std::vector<decltype(make(random))> inputs;
    for (std::size_t i = 0; i < corpusSize; ++i)
        inputs.push_back(make(random));
    return inputs;
}

/// Adds a benchmark of f(inputs[i]...). The inputs have to outlive it.
template <typename F, typename... T>
void Add(const char* name, F f, const std::vector<T>&... inputs)
{
    benchmark::RegisterBenchmark(name, [f, &inputs...](benchmark::State& state) { Measure(state, f, inputs...); });
}

/// f(object, inputs...) as a call on a copy of the object, which it changes and which is the result.
template <typename F>
[[nodiscard]] auto Changing(F f)
{
    return [f](auto object, const auto&... inputs) {
        f(object, inputs...);
        return object;
    };
}

} // namespace ZarnMath::Benchmarks
