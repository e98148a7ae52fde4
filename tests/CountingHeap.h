/// @file
/// A heap that counts, and that fails when it is told to. It replaces the heap of the whole program.
///
/// Its operators stand in a source file of their own: where the compiler sees through both sides of one, it takes them
/// for a mismatch.
#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <limits>
#include <new>

namespace ZarnMath {

/// Counts what its thread allocates and releases while it lives. Only one may live in a thread at a time.
class HeapWatch
{
public:
    static constexpr long never = 0;

    /// @param failing number of the allocation, counted from 1, that throws `std::bad_alloc`
    explicit HeapWatch(long failing = never) noexcept;

    /// A watch under which every allocation of more bytes throws.
    [[nodiscard]] static HeapWatch WithoutBlocksAbove(std::size_t largest) noexcept;

    ~HeapWatch();
    HeapWatch(const HeapWatch&) = delete;
    HeapWatch& operator=(const HeapWatch&) = delete;

    /// The number of allocations that succeeded.
    [[nodiscard]] long Allocations() const noexcept;

    /// That number less the number of blocks released, whenever they were allocated.
    [[nodiscard]] long Live() const noexcept;

private:
    HeapWatch(long failing, std::size_t largest) noexcept;
};

/// The number of allocations that a call makes.
template <typename F>
long AllocationsOf(F call)
{
    const HeapWatch heap;
    call();
    return heap.Allocations();
}

/// Makes a call with its first allocation failing, then with its second, and so on until it succeeds. Each time nothing
/// may be leaked. All vectors that the call fills have to be made inside.
///
/// @param call  the call
/// @param check what holds after each failure
/// @return the number of allocations of the call
template <typename Call, typename Check>
long FailEveryAllocation(Call call, Check check)
{
    for (long failing = 1;; ++failing) {
        bool hasFailed = false;
        long live = 0;
        {
            const HeapWatch heap(failing);
            try {
                call();
            } catch (const std::bad_alloc&) {
                hasFailed = true;
            }
            live = heap.Live();
        }
        EXPECT_EQ(live, 0) << "allocation " << failing;
        if (!hasFailed)
            return failing - 1;
        check();
    }
}

} // namespace ZarnMath
