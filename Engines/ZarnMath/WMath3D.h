/// @file
/// A small layer in space: a fixed-point matrix, a transform of integer points, a perspective onto the plane z = 0, and
/// the bridge between the matrix and quaternions. Plain C linkage.
///
/// It works in integers and in single precision. Conversions to integers truncate toward zero, saturate at the limits of
/// 32 bits and give 0 for NaN; sums of integers wrap. All functions are in the arithmetic class, the same bits on every
/// machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/Quaternion.h"
#include "ZarnMath/ValueTypes.h"

/// Three rows of an affine map in the column convention, new = M * (x, y, z, 1):
///
/// @code
///   | m[0][0] m[0][1] m[0][2] | m[0][3] |     x from x, y, z | x translation
///   | m[1][0] m[1][1] m[1][2] | m[1][3] |     y from x, y, z | y translation
///   | m[2][0] m[2][1] m[2][2] | m[2][3] |     z from x, y, z | z translation
/// @endcode
///
/// The rotation part, columns 0 to 2, is fixed point with 65536 for 1; the translation is in whole units.
struct MATRIX3D
{
    std::int32_t m[3][4]; ///< m[row][column]

    friend constexpr bool operator==(const MATRIX3D&, const MATRIX3D&) noexcept = default;
};

/// A position in space, in whole units.
struct POINT3D
{
    std::int32_t x; ///< grows to the right
    std::int32_t y; ///< grows upward
    std::int32_t z; ///< distance from the plane of projection

    friend constexpr bool operator==(const POINT3D&, const POINT3D&) noexcept = default;
};

extern "C" {

/// The identity, whatever stood in the matrix.
///
/// @param[out] out 65536 on the diagonal, 0 elsewhere
/// @arithmetic
ZARNMATH_API void MTHGet3DIdentityMatrix(MATRIX3D* out) noexcept;

/// Adds a translation after what the matrix does, whatever that is. Sums wrap in 32 bits.
///
/// @param[in,out] m the matrix, of which column 3 changes
/// @param x, y, z   the translation
/// @arithmetic
ZARNMATH_API void MTHTranslate3DMatrix(MATRIX3D* m, int x, int y, int z) noexcept;

/// Transforms points in place, in single precision: coordinates above 2^24 lose their low bits on the way in. The image
/// under the rotation part is truncated, and the translation then added in integers.
///
/// @param[in,out] points the points
/// @param m              the matrix
/// @param count          their number; below 1 nothing happens
/// @arithmetic
ZARNMATH_API void MTHTransform3DPoints(POINT3D* points, const MATRIX3D* m, int count) noexcept;

/// Projects points from a viewpoint onto the plane z = 0, in double precision, truncated at the end.
///
/// @param points    the points
/// @param[out] out  another array, a point each; one at the viewpoint's z has no meaningful image
/// @param count     their number; below 1 nothing happens
/// @param viewpoint where the eye is
/// @return always 1
/// @arithmetic
ZARNMATH_API int MTHPerspective3DProjection(const POINT3D* points, Framework::common_types::POINT* out, int count,
                                            const POINT3D* viewpoint) noexcept;

/// The fixed-point matrix of a unit quaternion, by the transpose of what `Quaternion::Rotate` does: as
/// `MTHTransform3DPoints` reads it, it turns by the inverse. Callers rely on that.
///
/// @param q        the quaternion
/// @param[out] out the matrix, without translation; each product is truncated to fixed point and then doubled
/// @arithmetic
ZARNMATH_API void VECT_QuaternionToMat(const ZarnMath::Quaternion* q, MATRIX3D* out) noexcept;

/// The unit quaternion of a fixed-point rotation, the inverse of `VECT_QuaternionToMat`. The elements are read in single
/// precision, the rest is in double precision.
///
/// @param m        the matrix, whose translation is not read
/// @param[out] out the quaternion. Its w is positive where the trace of the rotation is above 0; otherwise the component
///                 of the largest diagonal element is (a rotation has one above -1/3), and a matrix that is no rotation
///                 may give NaN
/// @arithmetic
ZARNMATH_API void VECT_MatToQuaternion(const MATRIX3D* m, ZarnMath::Quaternion* out) noexcept;

} // extern "C"
