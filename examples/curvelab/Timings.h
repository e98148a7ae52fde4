/// @file
/// How long the library takes for its answers.
#pragma once

#include "Command.h"

#include <cstdint>
#include <string>
#include <vector>

namespace curvelab {

/// The time of one question that was asked of all curves in turn.
struct Timing
{
    std::string question;
    std::string function; ///< of the library
    std::int64_t calls;
    double seconds; ///< of all calls together
};

/// Asks the library each question once of every curve of a job's drawing, without any check of its answers.
[[nodiscard]] std::vector<Timing> TimeQuestions(const Job& job);

/// The seconds that have gone by since some moment.
[[nodiscard]] double SecondsNow();

} // namespace curvelab
