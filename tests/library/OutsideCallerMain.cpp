// Compiled for the least processor, so that it can find out whether the other part may run.
#include "tests/library/OutsideCaller.h"

#include <cstdio>

namespace {

/// What CTest takes for a test that was not run.
constexpr int skipped = 77;

} // namespace

int main()
{
    __builtin_cpu_init();
    if (!__builtin_cpu_supports("avx2") || !__builtin_cpu_supports("fma") || !__builtin_cpu_supports("bmi2")) {
        std::puts("Skipped: this processor has no fused multiply-add.");
        return skipped;
    }
    const bool same = GivesTheSameBits();
    std::puts(same ? "The same bits." : "The bits differ.");
    return same ? 0 : 1;
}
