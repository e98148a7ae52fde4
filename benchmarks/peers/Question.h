/// @file
/// How libraries are compared: each answers the same question for every element of the corpus, in turn.
#pragma once

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstddef>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace ZarnMath::Peers {

/// What is known of a library's answers, by name: how many, how far off.
using Measures = std::vector<std::pair<std::string, double>>;

/// The error of half of the answers, of nine in ten, and the largest. Answers that are NaN are counted.
///
/// @param errors one for each answer; their order is lost
[[nodiscard]] Measures Errors(std::vector<double> errors);

/// A question, with all libraries that answer it.
class Question
{
public:
    /// @param name  what is asked
    /// @param count elements it is asked for
    Question(std::string name, std::size_t count);

    /// Adds one library's way to answer.
    ///
    /// @param library  its name
    /// @param setting  tolerance or order, where there is a choice; a pair of library and setting is unique
    /// @param answer   answer(i) for an element; what it returns is kept from being optimised away
    /// @param measures what is known of its answers
    template <typename Answer>
    void Add(std::string library, std::string setting, Answer answer, Measures measures = {})
    {
        const auto pass = [answer, n = count]() {
            for (std::size_t i = 0; i < n; ++i) {
                auto result = answer(i);
                benchmark::DoNotOptimize(result);
            }
        };
        AddPass(std::move(library), std::move(setting), pass, std::move(measures));
    }

    /// The same for a way that answers for all elements at once.
    void AddPass(std::string library, std::string setting, std::function<void()> pass, Measures measures = {})
    {
        solvers.push_back({std::move(library), std::move(setting), std::move(pass), std::move(measures), 1, {}});
    }

    /// Times all of them in turn, several rounds over, and prints a line of JSON for each: the median time of an answer,
    /// and its cycles.
    void Ask();

private:
    /// What an answer costs.
    struct Cost
    {
        double nanoseconds;
        double cycles; ///< 0 where they cannot be counted
    };

    struct Solver
    {
        std::string library;
        std::string setting;
        std::function<void()> pass;
        Measures measures;
        int repetitions;
        std::vector<Cost> costs;
    };

    [[nodiscard]] Cost Time(const Solver& solver) const;

    std::string name;
    std::size_t count;
    std::vector<Solver> solvers;
};

} // namespace ZarnMath::Peers
