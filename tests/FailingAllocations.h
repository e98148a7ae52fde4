/// @file
/// Memory that runs out at the n-th request, to see that a call lets go of everything and leaves its results in order.
#pragma once

#include <gtest/gtest.h>

#include <new>

namespace ZarnMath {

/// While one lives, allocations of this thread are counted, and one of them fails.
class FailingAllocations
{
public:
    /// @param failing the number of the allocation that fails, from 0 on
    explicit FailingAllocations(int failing) noexcept;
    ~FailingAllocations();

    FailingAllocations(const FailingAllocations&) = delete;
    FailingAllocations& operator=(const FailingAllocations&) = delete;

    /// The number of blocks that were allocated and not released since.
    [[nodiscard]] static int Live() noexcept;
};

/// Makes a call with its first allocation failing, then with its second, and so on until it succeeds. Each time nothing
/// may be leaked. All vectors that the call fills have to be made inside.
///
/// @param call  the call
/// @param check what holds after each failure
/// @return the number of allocations of the call
template <typename Call, typename Check>
int FailEveryAllocation(Call call, Check check)
{
    for (int failing = 0;; ++failing) {
        bool hasFailed = false;
        int live = 0;
        {
            const FailingAllocations armed(failing);
            try {
                call();
            } catch (const std::bad_alloc&) {
                hasFailed = true;
            }
            live = FailingAllocations::Live();
        }
        EXPECT_EQ(live, 0) << "allocation " << failing;
        if (!hasFailed)
            return failing;
        check();
    }
}

} // namespace ZarnMath
