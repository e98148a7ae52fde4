/// @file
/// What an affine transform makes of a circle: the axes of the ellipse, and normals on it. Its box is
/// `GetTransformedCircleBBox`, with the other boxes.
///
/// @code
///        minor  \          / major        The unit circle becomes an ellipse about the image of the
///            .---\--------/--.            origin. Its axes are displacements from there; the length of
///          /      \     /      \          `major` is the larger singular value of the linear part,
///         |        `--o         |         that of `minor` the smaller one.
///          \                   /
///            `---------------`
/// @endcode
///
/// Everything is in closed form. Nothing is tested for a singular transform: its major axis comes out as NaN or as a
/// meaningless number, and its minor axis as 0.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/WMath.h"

namespace ZarnMath {

/// The lengths of the half axes of the unit circle's image.
///
/// @param m          the transform; its translation is not used
/// @param[out] major the longer half axis, at least 0; of a singular transform NaN, or a meaningless number
/// @param[out] minor the shorter half axis, at least 0; of a singular transform 0
/// @arithmetic
ZARNMATH_API void GetTransformedCircleAxisLengths(const MATRIX& m, double& major, double& minor) noexcept;

/// The half axes of the unit circle's image, perpendicular to each other.
///
/// @param m          the transform; its translation is not used
/// @param[out] major the longer half axis, as a displacement from the centre
/// @param[out] minor `major` turned a quarter to the left and cut to the other length b; where `major` is shorter than
///                   about 1.49e-8, or NaN, it is (b, major.x)
/// @platform
ZARNMATH_API void GetTransformedCircleAxes(const MATRIX& m, vector2d& major, vector2d& minor) noexcept;

/// The outward normal, at p, of the ellipse that the transform takes to the circle about the origin through the image of
/// p.
///
/// @param m the transform
/// @param p the point, before the transform
/// @return the transpose of the linear part times the image of p, over the magnitude of the determinant: no unit vector.
///         The image itself where the determinant is at most DBL_EPSILON in magnitude and not below 0, and its opposite
///         where it is below 0
/// @arithmetic
[[nodiscard]] ZARNMATH_API vector2d GetNormalOnTransformedCircle(const MATRIX& m, const point2d& p) noexcept;

/// The point of the unit circle that the scale by (a, b) takes to where the ellipse with these half axes has the inward
/// normal given.
///
/// @param normal the direction, of any length but zero, which gives NaN
/// @param a, b   the half axes along x and y; both 0 give NaN
/// @return (-normal.x*a, -normal.y*b) over its length; times (a, b) it is the point of the ellipse, from its centre
/// @arithmetic
[[nodiscard]] ZARNMATH_API point2d FindPointOnEllipseThatHasNormal(const vector2d& normal, double a, double b) noexcept;

} // namespace ZarnMath
