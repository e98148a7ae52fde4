/// @file
/// Counts the calls of those functions of the C library whose last bits are not the same everywhere.
#pragma once

#include <cstdint>

namespace ZarnMath::Digest {

/// So far, by the whole program. The linker puts counting functions in the place of the library's own (`--wrap`).
[[nodiscard]] std::uint64_t CallsOfMathematics() noexcept;

} // namespace ZarnMath::Digest
