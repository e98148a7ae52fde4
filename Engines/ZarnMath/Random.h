/// @file
/// Uniform random numbers, from a generator that each thread has for itself.
#pragma once

#include "ZarnMath/Export.h"

namespace ZarnMath {

/// Draws from the calling thread's Mersenne twister (MT19937; M. Matsumoto, T. Nishimura, 1998). It is seeded with 32 bits
/// from "/dev/urandom" at the thread's first draw, and no sequence can be asked for again. No locks, nothing shared.
///
/// If the device cannot be opened or read, the exception of `std::random_device` passes through, and the next draw tries
/// again. The rule from the generator's outputs to a result is in the arithmetic class, the same on every machine.
struct Random
{
    /// A number between two others. Consumes two outputs.
    ///
    /// @param low, high the ends, in any order and also equal
    /// @return a number from low to high. High itself is reachable: 64 random bits are rounded to the 53 of a double
    /// @arithmetic
    ZARNMATH_API static double Generate(double low, double high);

    /// An integer from a range, each equally likely. Consumes one output, and as many more as it takes to land in the
    /// range, at least half of the masked values being inside; none at all where low equals high.
    ///
    /// @param low  the smallest
    /// @param high the largest, included; below low there is no meaningful result
    /// @return the integer
    /// @arithmetic
    ZARNMATH_API static int Generate(int low, int high);
};

} // namespace ZarnMath
