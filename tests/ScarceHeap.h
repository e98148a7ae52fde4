/// @file
/// A heap that counts, and that has no large blocks when it is told so. It replaces the heap of the whole program.
///
/// It stands in a file of its own: where the compiler sees through both sides of it, it takes them for a mismatch.
#pragma once

#include <cstddef>

namespace ZarnMath {

/// Makes larger allocations of this thread fail for as long as it lives.
class Scarcity
{
public:
    explicit Scarcity(std::size_t largestSize) noexcept;
    ~Scarcity();
    Scarcity(const Scarcity&) = delete;
    Scarcity& operator=(const Scarcity&) = delete;
};

/// The number of allocations of this thread so far.
[[nodiscard]] std::size_t CountAllocations() noexcept;

} // namespace ZarnMath
