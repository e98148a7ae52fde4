#include "benchmarks/peers/Question.h"

#include "benchmarks/peers/Cycles.h"

#include <nlohmann/json.hpp>

#include <time.h>

#include <cmath>
#include <iostream>

namespace ZarnMath::Peers {

namespace {

constexpr int rounds = 11;

/// Long enough for the clock, short enough for all libraries to see the same weather on a shared machine.
constexpr double sliceInNanoseconds = 4e6;

template <typename Cost>
double MedianOf(std::vector<Cost> costs, double Cost::*kind)
{
    const auto middle = costs.begin() + static_cast<std::ptrdiff_t>(costs.size() / 2);
    std::ranges::nth_element(costs, middle, {}, kind);
    return (*middle).*kind;
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

Question::Cost Question::Time(const Solver& solver) const
{
    static const CycleCounter cycles;
    const Cost start{NanosecondsRun(), cycles.Read()};
    for (int i = 0; i < solver.repetitions; ++i)
        solver.pass();
    const double answers = static_cast<double>(count) * solver.repetitions;
    return {(NanosecondsRun() - start.nanoseconds) / answers, (cycles.Read() - start.cycles) / answers};
}

void Question::Ask()
{
    for (Solver& solver : solvers) {
        const double pass = Time(solver).nanoseconds * static_cast<double>(count);
        solver.repetitions = static_cast<int>(std::max(1.0, sliceInNanoseconds / pass));
    }
    for (int round = 0; round < rounds; ++round)
        for (Solver& solver : solvers)
            solver.costs.push_back(Time(solver));
    for (const Solver& solver : solvers) {
        nlohmann::ordered_json line;
        line["question"] = name;
        line["library"] = solver.library;
        line["setting"] = solver.setting;
        line["nanoseconds"] = MedianOf(solver.costs, &Cost::nanoseconds);
        line["cycles"] = MedianOf(solver.costs, &Cost::cycles);
        for (const auto& [measure, value] : solver.measures)
            line["measures"][measure] = value;
        std::cout << line << '\n';
    }
}

} // namespace ZarnMath::Peers
