/// @file
/// Two doubles that one instruction works on side by side, each with its own rounding. Internal.
///
/// The vector extension is that of GCC and Clang; where a processor has no such registers it becomes two plain
/// operations, with the same bits.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <cmath>
#include <cstring>

namespace ZarnMath {

using Pair = double __attribute__((vector_size(16)));
/// The result of a comparison of pairs: all ones or all zeros in each half.
using PairMask = decltype(Pair{} < Pair{});

[[nodiscard]] inline Pair Both(double v) noexcept
{
    return Pair{v, v};
}

template <bool IsPosition>
[[nodiscard]] inline Pair LoadPair(const vector2dT<double, IsPosition>& v) noexcept
{
    Pair p;
    std::memcpy(&p, &v, sizeof p);
    return p;
}

/// In one piece, so that a `LoadPair` that follows need not wait for two halves.
inline void StorePair(vector2d& v, Pair p) noexcept
{
    std::memcpy(&v, &p, sizeof p);
}

[[nodiscard]] inline Pair LoadPair(const double* v) noexcept
{
    Pair p;
    std::memcpy(&p, v, sizeof p);
    return p;
}

[[nodiscard]] inline Pair Absolute(Pair p) noexcept
{
    constexpr std::int64_t allButTheSign = std::numeric_limits<std::int64_t>::max();
    return reinterpret_cast<Pair>(reinterpret_cast<PairMask>(p) & PairMask{allButTheSign, allButTheSign});
}

[[nodiscard]] inline Pair SquareRoots(Pair p) noexcept
{
    return Pair{std::sqrt(p[0]), std::sqrt(p[1])};
}

[[nodiscard]] inline bool IsAny(PairMask mask) noexcept
{
    return (mask[0] | mask[1]) != 0;
}

} // namespace ZarnMath
