/// @file
/// The processor's own count of its cycles, where the system lets a program read it.
#pragma once

#include <linux/perf_event.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cstdint>

namespace ZarnMath::Peers {

/// Cycles of this thread outside the kernel. Other than time they depend neither on the clock's rate nor on who else runs.
class CycleCounter
{
public:
    CycleCounter()
    {
        perf_event_attr wanted{};
        wanted.type = PERF_TYPE_HARDWARE;
        wanted.size = sizeof wanted;
        wanted.config = PERF_COUNT_HW_CPU_CYCLES;
        wanted.pinned = 1; // counted all the time, or not at all
        wanted.exclude_kernel = 1;
        wanted.exclude_hv = 1;
        descriptor = static_cast<int>(syscall(SYS_perf_event_open, &wanted, 0, -1, -1, 0));
    }

    ~CycleCounter()
    {
        if (descriptor >= 0)
            close(descriptor);
    }

    CycleCounter(const CycleCounter&) = delete;
    CycleCounter& operator=(const CycleCounter&) = delete;

    /// @return the cycles so far; 0 where they are not to be had
    [[nodiscard]] double Read() const
    {
        std::uint64_t count = 0;
        if (descriptor < 0 || read(descriptor, &count, sizeof count) != sizeof count)
            return 0.0;
        return static_cast<double>(count);
    }

private:
    int descriptor;
};

} // namespace ZarnMath::Peers
