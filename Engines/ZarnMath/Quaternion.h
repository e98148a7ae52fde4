/// @file
/// Quaternions in double precision: rotation of vectors in space, and interpolation between orientations.
///
/// Nothing here normalises: functions that need unit length say so. `Interpolate` (acos, sin) is in the platform class;
/// all others are in the arithmetic class, the same bits on every machine. The bridge to the fixed-point matrix stands in
/// WMath3D.h.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

namespace ZarnMath {

/// x i + y j + z k + w. A unit quaternion (n sin h, cos h) stands for the rotation about the unit axis n by the angle 2h,
/// counter-clockwise as seen against the axis.
struct Quaternion
{
    double x; ///< along i
    double y; ///< along j
    double z; ///< along k
    double w; ///< the scalar part

    /// The Hamilton product: as a rotation, the right operand `other` acts first. Of unit quaternions it is one, but for
    /// rounding; any others have a product too.
    /// @arithmetic
    [[nodiscard]] ZARNMATH_API Quaternion operator*(const Quaternion& other) const noexcept;

    /// Multiplies by a vector from one side only: the vector part of q * v. This is no rotation by q, but for q = 1.
    ///
    /// @param[in,out] v the vector; any will do
    /// @arithmetic
    ZARNMATH_API void RotateQuick(vector3dT<double>& v) const noexcept;

    /// Rotates a vector: q * v * conjugate(q).
    ///
    /// @param[in,out] v the vector; multiplied by the squared length of this quaternion, which should be 1. The zero
    ///                  quaternion makes it zero
    /// @arithmetic
    ZARNMATH_API void Rotate(vector3dT<double>& v) const noexcept;

    /// Becomes (a x b, a . b): for unit vectors the rotation by twice the angle from a to b.
    ///
    /// @param a, b the vectors; parallel ones give (0, 0, 0, a . b)
    /// @arithmetic
    ZARNMATH_API void RotationCreate(const vector3dT<double>& a, const vector3dT<double>& b) noexcept;

    /// Sets components that are nearly 0 to 0: x, y, z of at most 1000 * `DBL_EPSILON` in absolute value, and w of at
    /// most `DBL_EPSILON`.
    /// @arithmetic
    ZARNMATH_API void ForceZeros() noexcept;

    /// Spherical linear interpolation between unit quaternions (K. Shoemake, 1985). Opposite ones are not flipped to the
    /// short way round, and the result is not normalised.
    ///
    /// @param a, b     the ends
    /// @param t        0 to 1, from a to b; outside, it goes on along the great circle
    /// @param[out] out the quaternion in between; may be one of the ends
    /// @return false if a and b are too close to equal or to opposite, 1 - |a . b| < 1e-08: out is written, and is a,
    ///         which serves as the result
    /// @platform
    ZARNMATH_API static bool Interpolate(const Quaternion& a, const Quaternion& b, double t, Quaternion& out) noexcept;

    friend constexpr bool operator==(const Quaternion&, const Quaternion&) noexcept = default;
};

} // namespace ZarnMath
