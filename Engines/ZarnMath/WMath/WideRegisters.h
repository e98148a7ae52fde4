/// @file
/// Loops compiled twice: for every processor, and for the wider registers that most of them have. Internal.
#pragma once

namespace ZarnMath {

#if defined(__x86_64__)

/// Whether the processor takes four doubles or eight integers at a time.
[[nodiscard]] inline bool HasWideRegisters() noexcept
{
    return __builtin_cpu_supports("avx2");
}

/// Runs a loop on wide registers, which the processor must have. These bring no fused multiply-add with them, so that
/// the loop rounds as it does anywhere else.
template <typename Loop>
[[gnu::target("avx2"), gnu::noinline]] auto OnWideRegisters(const Loop& loop) noexcept
{
    return loop();
}

/// Runs a loop on the registers that every processor has.
template <typename Loop>
[[gnu::noinline]] auto OnNarrowRegisters(const Loop& loop) noexcept
{
    return loop();
}

/// Runs a loop on the widest registers of the processor. The loop has to be inlined by force: only code that stands
/// within the body that is made for wide registers gets to use them.
template <typename Loop>
auto OnWidestRegisters(const Loop& loop) noexcept
{
    return HasWideRegisters() ? OnWideRegisters(loop) : OnNarrowRegisters(loop);
}

#else

/// Elsewhere one body serves.
template <typename Loop>
auto OnWidestRegisters(const Loop& loop) noexcept
{
    return loop();
}

#endif

} // namespace ZarnMath
