#include "fuzz/Work.h"

#include "fuzz/Medians.h"
#include "fuzz/Oracles.h"

#include <algorithm>
#include <cmath>
#include <iostream>
#include <map>

namespace {

std::uint64_t steps = 0;
bool isMeasuring = false;

/// How far a call was toward the end of its budget, by powers of two: what the fuzzer takes for new ground, so that it
/// looks for inputs that take longer and longer.
constexpr int levels = 16;
constexpr int mostFunctions = 256;

#ifdef __linux__
[[gnu::section("__libfuzzer_extra_counters")]]
#endif
std::uint8_t reached[mostFunctions * levels];

} // namespace

#ifdef ZARNMATH_FUZZ_COUNTS_STEPS
extern "C" void __wrap___sanitizer_cov_trace_pc();

[[gnu::used]] __attribute__((no_sanitize("coverage"))) extern "C" void __wrap___sanitizer_cov_trace_pc()
{
    ++steps;
}
#endif

namespace ZarnMath::Fuzzing {

namespace {

using Budgets = std::map<std::string_view, Budget>;

Budgets& TheBudgets()
{
    static Budgets budgets;
    return budgets;
}

void SetLimits(Budget& budget)
{
    const auto* const found = std::find_if(std::begin(medians), std::end(medians),
                                           [&](const Median& median) { return median.function == budget.function; });
    if (found == std::end(medians)) {
        Require(isMeasuring, "every function called has its median in fuzz/Medians.h");
        return;
    }
    budget.median = found->steps;
    budget.limit = found->steps * found->mostTimes;
}

void MarkAsReached(const Budget& budget, double ratio) noexcept
{
    int level = 0;
    for (; ratio > 1.0 && level < levels - 1; ratio *= 0.5)
        ++level;
    reached[budget.index * levels + level] = 1;
}

} // namespace

Budget& FindBudget(std::string_view function)
{
    const auto [place, isNew] = TheBudgets().try_emplace(function);
    Budget& budget = place->second;
    if (isNew) {
        budget.function = function;
        SetLimits(budget);
        budget.index = static_cast<int>(TheBudgets().size()) - 1;
        Require(budget.index < mostFunctions, "there is a counter for every function");
    }
    return budget;
}

void StartMeasuring()
{
    isMeasuring = true;
}

void FinishMeasuring()
{
    isMeasuring = false;
    for (auto& [function, budget] : TheBudgets()) {
        const auto middle = budget.samples.begin() + static_cast<std::ptrdiff_t>(budget.samples.size() / 2);
        std::nth_element(budget.samples.begin(), middle, budget.samples.end());
        budget.median = std::max(1.0, std::ceil(*middle));
        budget.samples = {};
    }
}

std::vector<const Budget*> AllBudgets()
{
    std::vector<const Budget*> all;
    for (const auto& [function, budget] : TheBudgets())
        all.push_back(&budget);
    return all;
}

Meter::Meter(Budget& callBudget, double callSize) noexcept : budget(callBudget), size(callSize), start(steps) {}

Meter::~Meter()
{
    const double taken = static_cast<double>(steps - start) / size;
    budget.largest = std::max(budget.largest, taken);
    if (isMeasuring) {
        budget.samples.push_back(taken);
        return;
    }
    if (taken == 0.0)
        return;
    MarkAsReached(budget, taken / budget.median);
    if (taken > budget.limit) {
        std::cerr << budget.function << ": " << taken << " steps, of " << budget.limit << " at most\n";
        Require(false, "the work of a call is bounded");
    }
}

} // namespace ZarnMath::Fuzzing
