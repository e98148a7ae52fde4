/// @file
/// A heap that counts, and that fails when it is told to. It replaces the heap of the whole program.
#pragma once

namespace ZarnMath {

/// Counts what is allocated and released while it lives. Only one may live at a time, and only one thread may run.
class HeapWatch
{
public:
    static constexpr long never = 0;

    /// @param failing number of the allocation, counted from 1, that throws `std::bad_alloc`
    explicit HeapWatch(long failing = never) noexcept;
    ~HeapWatch();
    HeapWatch(const HeapWatch&) = delete;
    HeapWatch& operator=(const HeapWatch&) = delete;

    /// The number of allocations that succeeded.
    [[nodiscard]] long Allocations() const noexcept;

    /// That number less the number of blocks released, whenever they were allocated.
    [[nodiscard]] long Live() const noexcept;
};

/// The number of allocations that a call makes.
template <typename F>
long AllocationsOf(F call)
{
    const HeapWatch heap;
    call();
    return heap.Allocations();
}

} // namespace ZarnMath
