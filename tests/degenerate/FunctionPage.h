/// @file
/// What one function answers to degenerate arguments, as a section of the manual.
#pragma once

#include "tests/catalogue/Catalogue.h"

#include <cstdint>
#include <string>

namespace ZarnMath::Degenerate {

/// A heading, a table of the 15 partitions for each curve that the function takes, a table of the special values, and how
/// many answers there are to both at once.
[[nodiscard]] std::string SectionOn(const Catalogue::Function& function);

/// The answers to each special value in the place of each number, with each partition of each curve, flags set and not.
struct Crossing
{
    long calls = 0;
    long answers = 0;           ///< that differ
    std::uint32_t checksum = 0; ///< of all answers in order
};

[[nodiscard]] Crossing CrossAll(const Catalogue::Function& function);

} // namespace ZarnMath::Degenerate
