/// @file
/// What one function answers to degenerate arguments, as a section of the manual.
#pragma once

#include "tests/catalogue/Catalogue.h"

#include <string>

namespace ZarnMath::Degenerate {

/// A heading, a table of the 15 partitions for each curve that the function takes, and a table of the special values.
[[nodiscard]] std::string SectionOn(const Catalogue::Function& function);

/// Calls a function with each special value in the place of each number, flags set and not, and looks at no answer.
void CallWithSpecials(const Catalogue::Function& function);

} // namespace ZarnMath::Degenerate
