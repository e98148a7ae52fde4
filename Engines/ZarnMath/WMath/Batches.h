/// @file
/// One loop for every array of points that is changed in place. Internal.
///
/// Each point is a function of itself and of one argument of the whole array, so that compilers take several at a time
/// with the bits of one at a time.
#pragma once

#include "ZarnMath/WMath/WideRegisters.h"
#include "ZarnMath/WMathInternal.h"

#include <cstring>

namespace ZarnMath {

/// Whether an argument shares storage with the points that are about to change.
template <typename P, typename Argument>
[[nodiscard]] bool DoOverlap(const P* points, std::uint64_t count, const Argument& argument) noexcept
{
    const auto pointsBegin = reinterpret_cast<std::uintptr_t>(points);
    const auto argumentBegin = reinterpret_cast<std::uintptr_t>(&argument);
    return argumentBegin < pointsBegin + count * sizeof(P) && pointsBegin < argumentBegin + sizeof(Argument);
}

/// The argument as it stands in memory now, whatever type it was last written by.
template <typename Argument>
[[nodiscard]] Argument ReadAnew(const Argument& argument) noexcept
{
    Argument copy;
    std::memcpy(&copy, &argument, sizeof copy);
    return copy;
}

/// Makes each point step(point, argument), for an argument that the loop cannot change.
template <typename P, typename Argument, typename Step>
[[gnu::always_inline]] inline void ForEachPointApart(P* points, std::uint64_t count, const Argument& argument,
                                                     Step step) noexcept
{
    const Argument fixed = argument;
    for (std::uint64_t i = 0; i < count; ++i)
        points[i] = step(points[i], fixed);
}

/// Makes each point step(point, argument), first to last.
///
/// An argument inside the array is read again for each point; any other one is held in registers, which is what lets the
/// loop be vectorised.
template <typename P, typename Argument, typename Step>
void ForEachPoint(P* points, std::uint64_t count, const Argument& argument, Step step) noexcept
{
    if (DoOverlap(points, count, argument)) {
        for (std::uint64_t i = 0; i < count; ++i)
            points[i] = step(points[i], ReadAnew(argument));
        return;
    }
    OnWidestRegisters([&]() __attribute__((always_inline)) { ForEachPointApart(points, count, argument, step); });
}

/// Where a rounded coordinate is cut off: two whole numbers within 32 bits.
struct CoordinateRange
{
    double smallest;
    double largest;
};

/// What an integer coordinate can hold.
inline constexpr CoordinateRange wholeRange{-2147483648.0, 2147483647.0};
/// A quarter of it.
inline constexpr CoordinateRange checkedRange{-0x20000000, 0x1FFFFFFF};

/// Transforms integer points in place: each coordinate as by `RoundToInt`, then cut off at the ends of the range.
void TransformRounded(POINT* points, std::uint64_t count, const MATRIX& m, CoordinateRange range) noexcept;

} // namespace ZarnMath
