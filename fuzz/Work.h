/// @file
/// Work, counted and not timed: no input takes more than a fixed multiple of the steps that a function takes as a rule.
///
/// A step is a basic block of the library that is run. The compiler counts them where the library is built for it; in
/// any other build none are counted, and every budget holds.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace ZarnMath::Fuzzing {

/// The steps of one function.
struct Budget
{
    std::string_view function;
    double median = 0.0; ///< the steps of half of all calls, for each unit of their size
    double limit = 0.0;  ///< the most steps that a call may take, for each unit
    double largest = 0.0;
    std::vector<double> samples; ///< kept only while medians are measured
    int index = 0;
};

/// The budget of a function that is listed in Medians.h. One that is not ends the program, but while medians are
/// measured.
[[nodiscard]] Budget& FindBudget(std::string_view function);

/// From now on the steps of every call are kept, and none is held against its budget.
void StartMeasuring();

/// Forgets the samples, and holds the calls from now on against the new medians.
void FinishMeasuring();

/// All budgets that were asked for, in the order of their names.
[[nodiscard]] std::vector<const Budget*> AllBudgets();

/// Counts the steps from its making to its end.
class Meter
{
public:
    Meter(Budget& callBudget, double callSize) noexcept;
    Meter(const Meter&) = delete;
    Meter& operator=(const Meter&) = delete;
    ~Meter();

private:
    Budget& budget;
    double size;
    std::uint64_t start;
};

/// Makes a call, within the budget of the function called.
///
/// @param function its name in Medians.h
/// @param call     calls it
/// @param size     the number of things that it has to do, at least 1, where that is up to the caller
template <typename Call>
auto Bounded(std::string_view function, Call call, double size = 1.0)
{
    const Meter meter(FindBudget(function), size);
    return call();
}

} // namespace ZarnMath::Fuzzing
