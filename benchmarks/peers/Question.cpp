#include "benchmarks/peers/Question.h"

#include <nlohmann/json.hpp>

#include <time.h>

#include <cmath>
#include <iostream>

namespace ZarnMath::Peers {

namespace {

constexpr int rounds = 11;

/// Long enough for the clock, short enough for all libraries to see the same weather on a shared machine.
constexpr double sliceInNanoseconds = 4e6;

double Median(std::vector<double> values)
{
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

/// The time that this thread has run, which other programs on the machine do not add to.
double NanosecondsRun()
{
    timespec time;
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) * 1e9 + static_cast<double>(time.tv_nsec);
}

} // namespace

Measures Errors(std::vector<double> errors)
{
    const auto firstNaN = std::partition(errors.begin(), errors.end(), [](double e) { return !std::isnan(e); });
    const auto failed = static_cast<double>(errors.end() - firstNaN);
    errors.erase(firstNaN, errors.end());
    std::sort(errors.begin(), errors.end());
    Measures measures;
    if (!errors.empty()) {
        measures.emplace_back("median error", errors[errors.size() / 2]);
        measures.emplace_back("nine in ten", errors[errors.size() * 9 / 10]);
        measures.emplace_back("largest error", errors.back());
    }
    if (failed > 0.0)
        measures.emplace_back("failed", failed);
    return measures;
}

Question::Question(std::string asked, std::size_t elements) : name(std::move(asked)), count(elements) {}

double Question::Time(const Solver& solver) const
{
    const double start = NanosecondsRun();
    for (int i = 0; i < solver.repetitions; ++i)
        solver.pass();
    return (NanosecondsRun() - start) / (static_cast<double>(count) * solver.repetitions);
}

void Question::Ask()
{
    for (Solver& solver : solvers) {
        const double pass = Time(solver) * static_cast<double>(count);
        solver.repetitions = static_cast<int>(std::max(1.0, sliceInNanoseconds / pass));
    }
    for (int round = 0; round < rounds; ++round)
        for (Solver& solver : solvers)
            solver.nanoseconds.push_back(Time(solver));
    for (const Solver& solver : solvers) {
        nlohmann::ordered_json line;
        line["question"] = name;
        line["library"] = solver.library;
        line["setting"] = solver.setting;
        line["nanoseconds"] = Median(solver.nanoseconds);
        for (const auto& [measure, value] : solver.measures)
            line["measures"][measure] = value;
        std::cout << line << '\n';
    }
}

} // namespace ZarnMath::Peers
