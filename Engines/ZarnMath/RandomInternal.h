/// @file
/// The generator behind the random numbers. Internal.
#pragma once

#include <random>

/// The calling thread's generator, seeded from the system at its first call and again after a call that failed.
/// @throws std::exception of a kind of `std::random_device`'s choice, if there is no entropy to be had
std::mt19937& GetEngine();
