/// @file
/// Functions of one or two numbers: a Gaussian, a cube root, a divisor, and the curves that shape a linear ramp when two
/// states are blended.
///
/// No input is rejected: where a formula divides by zero or leaves the domain of a logarithm, the infinity or NaN that
/// it gives is the result. `Gaussian` (exp), `CubeRoot` (pow) and `GetLogarithmicBlendFactor` (log) are in the platform
/// class; all others are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"

namespace ZarnMath {

/// The density of the normal distribution.
///
/// @param x     where
/// @param mean  the mean
/// @param sigma the standard deviation; its sign does not count, and 0 gives NaN
/// @return the density at x
/// @platform
[[nodiscard]] ZARNMATH_API double Gaussian(double x, double mean, double sigma) noexcept;

/// The real cube root, odd in x, by the platform's power.
///
/// @param x any number
/// @return the root; 0 where |x| <= 1e-10, and for NaN
/// @platform
[[nodiscard]] ZARNMATH_API double CubeRoot(double x) noexcept;

/// The greatest common divisor of the absolute values.
///
/// @param a, b any integers; of 0 and n it is |n|
/// @return the divisor; 2147483648 has no `int`, so that the pairs of -2147483648 with itself and with 0 have no
///         meaningful result
/// @arithmetic
[[nodiscard]] ZARNMATH_API int GCD(int a, int b) noexcept;

/// @name Shaping curves
/// Each maps 0 to 0 and 1 to 1, but for the limits that are stated (C. Schlick, Fast alternatives to Perlin's bias and
/// gain functions, 1994).
/// @{

/// Bends the ramp so that 0.5 goes to `bias`: the ramp itself at 0.5.
///
/// @param x    the ramp, 0 to 1; outside, the same formula
/// @param bias taken into 0 to 1, NaN being 1; at 0 every x gives 0. At 1 every x above 0 gives 1, and x = 0 gives NaN
/// @return the bent value
/// @arithmetic
[[nodiscard]] ZARNMATH_API double Bias(double x, double bias) noexcept;

/// Bends the ramp to an S about its middle, which stays: the ramp itself at 0.
///
/// @param x    the ramp, 0 to 1; outside, the same formula
/// @param gain taken into -1 to 1; 1 flattens the middle into 0.5 at either side, -1 steepens it into a step
/// @return the bent value. Where the denominator of the lower half vanishes the result is 1: at x = 0 with gain 1, and at
///         one x above the middle too with every gain below -1/3, as at x = 2/3 with -0.6. At x = 1 with gain 1 it is NaN
/// @arithmetic
[[nodiscard]] ZARNMATH_API double Gain(double x, double gain) noexcept;

/// How far a step is on the way.
///
/// @param step  number of the step; above `steps` the result is above 1
/// @param steps how many there are
/// @return step / steps; 1 if there are none
/// @arithmetic
[[nodiscard]] ZARNMATH_API double GetLinearBlendFactor(unsigned long step, unsigned long steps) noexcept;

/// A logarithmic ramp: log(1 + (base - 1)*x) to that base.
///
/// @param x    the ramp, 0 to 1
/// @param base above 0; above 1 it rises fast first, below 1 slowly first
/// @return the value; x itself where base is 1 within `DBL_EPSILON`
/// @platform
[[nodiscard]] ZARNMATH_API double GetLogarithmicBlendFactor(double x, double base) noexcept;

/// `Gain` of `Bias`.
///
/// @param x    the ramp, 0 to 1
/// @param gain for `Gain`, which comes second
/// @param bias for `Bias`, which comes first
/// @return Gain(Bias(x, bias), gain), NaN where either gives it
/// @arithmetic
[[nodiscard]] ZARNMATH_API double GetBiasGainBlendFactor(double x, double gain, double bias) noexcept;

/// @}

} // namespace ZarnMath
