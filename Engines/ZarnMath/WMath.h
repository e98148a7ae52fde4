/// @file
/// Affine transforms of the plane: the matrix, what kind it is, what it is made of, how it is built, and what it does to
/// angles and to arrays of points.
///
/// Two classes of numbers, told apart function by function:
/// - *arithmetic*: only + - * /, sqrt, fmod, ceil, floor, fabs and integers. The same bits on every machine.
/// - *platform*: goes through sin, cos, tan, atan, atan2 or acos, and has the last bits of that machine's mathematical
///   library. With the same library it is as reproducible as the other class.
///
/// A tolerance is absolute and compares the numbers named, never scaled by the size of the matrix.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

/// An affine transform, applied to column vectors.
///
/// @code
///   | x' |   | m11  m12  dx |   | x |      column (m11, m21)  image of the unit vector along x
///   | y' | = | m21  m22  dy | * | y |      column (m12, m22)  image of the unit vector along y
///   | 1  |   |  0    0    1 |   | 1 |      column (dx, dy)    image of the origin
/// @endcode
///
/// A turn by r, counter-clockwise, has m11 = cos r, m12 = -sin r, m21 = sin r, m22 = cos r. In a product the right-hand
/// operand acts first; a member that changes the matrix adds its step after what the matrix already does.
struct ZARNMATH_API MATRIX
{
    double m11; ///< x output per x input
    double m12; ///< x output per y input
    double dx;  ///< x translation
    double m21; ///< y output per x input
    double m22; ///< y output per y input
    double dy;  ///< y translation

    /// Field by field, so that -0.0 equals 0.0 and NaN nothing.
    friend constexpr bool operator==(const MATRIX&, const MATRIX&) noexcept = default;

    /// @name Application and product
    /// @{

    /// The image of the point p = (x, y): (dx + (m11*x + m12*y), dy + (m21*x + m22*y)). Any matrix will do.
    /// @arithmetic
    [[nodiscard]] ZarnMath::point2d operator()(const ZarnMath::point2d& p) const noexcept;

    /// The image of the displacement v = (x, y), which no translation moves: (m11*x + m12*y, m21*x + m22*y). Any matrix
    /// will do.
    /// @arithmetic
    [[nodiscard]] ZarnMath::vector2d operator()(const ZarnMath::vector2d& v) const noexcept;

    /// The transform that does `other` first and this one after it: (a * b)(p) is a(b(p)), up to rounding. Any two
    /// matrices have a product.
    /// @arithmetic
    [[nodiscard]] MATRIX operator*(const MATRIX& other) const noexcept;

    /// @}
    /// @name Steps added after what the matrix does
    /// The arguments are read before the matrix is written, so that a matrix may be transformed by itself. Angles are in
    /// radians, counter-clockwise. But for `Invert` no matrix is refused, a singular one included.
    /// @{

    /// Turns about the origin. No angle is exact, quarter turns and 0 included.
    ///
    /// @param radians the angle, counter-clockwise
    /// @platform
    void Rotate(double radians) noexcept;

    /// Turns about a point. No angle is exact, quarter turns and 0 included.
    ///
    /// @param radians the angle, counter-clockwise
    /// @param centre  the point about which it turns
    /// @platform
    void RotateAroundPoint(double radians, const ZarnMath::point2d& centre) noexcept;

    /// Does t about a point, the centre: Translate(centre) * t * Translate(-centre) * this.
    /// @arithmetic
    void TransformAroundPoint(const MATRIX& t, const ZarnMath::point2d& centre) noexcept;

    /// Scales about the origin: the first row by scale.x, the second by scale.y, translation included. A factor of 0
    /// makes the matrix singular.
    /// @arithmetic
    void ScaleMatrix(const ZarnMath::vector2d& scale) noexcept;

    /// Scales about a point.
    ///
    /// @param scale  the factors along x and y; 0 makes the matrix singular
    /// @param centre the point that stays where it is
    /// @arithmetic
    void ScaleMatrix(const ZarnMath::vector2d& scale, const ZarnMath::point2d& centre) noexcept;

    /// Brings each *row* of the linear part to length 1 by itself, as `Normalize` does, so that a row of squared length
    /// up to DBL_EPSILON stays. The translation stays too.
    ///
    /// What turns first and scales after it comes out as the pure turn; what scales unevenly first does not. A row of
    /// zeros stays zero.
    /// @arithmetic
    void RemoveScaling() noexcept;

    /// Becomes its own inverse.
    ///
    /// @param tolerance the determinant of the linear part, a ratio of areas, has to exceed it in magnitude, strictly
    /// @return whether it did; if not, and if the determinant is NaN, all six fields are 0: the matrix is lost
    /// @arithmetic
    bool Invert(double tolerance) noexcept;

    /// @}
    /// @name Classification
    /// Of the predicates only `IsIdentity` looks at the translation. A tolerance is compared with fields of the linear
    /// part, or with products of them: ratios, without a unit. In the conditions |v| > tolerance stands for the negation
    /// of |v| <= tolerance, and m <= 0 for that of m > 0, so that NaN counts as out of tolerance.
    /// @{

    /// Whether this is the identity.
    ///
    /// @param useTolerance false compares bits, so that one -0.0 denies it, and ignores the tolerance
    /// @param tolerance    how far each field may lie off
    /// @arithmetic
    [[nodiscard]] bool IsIdentity(bool useTolerance, double tolerance) const noexcept;

    /// Whether |m21| > tolerance or |m12| > tolerance.
    /// @arithmetic
    [[nodiscard]] bool IsSkewedOrRotated(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether |m21| > tolerance or |m12| > tolerance or m11 <= 0 or m22 <= 0: of the diagonal the signs alone, so that a
    /// half turn counts.
    /// @arithmetic
    [[nodiscard]] bool IsSkewedOrRotatedOrMirrored(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether any of |m11 - 1|, |m22 - 1|, |m21| and |m12| is > tolerance.
    /// @arithmetic
    [[nodiscard]] bool IsScaledOrSkewedOrRotated(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether |m21| > tolerance or |m12| > tolerance or m11 <= 0 or |m11 - m22| > tolerance: a uniform negative scale
    /// counts.
    /// @arithmetic
    [[nodiscard]] bool IsNonUniformScaledOrSkewedOrRotated(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether the length of either column is off 1 by more than the tolerance. `IsOrthonormal` compares squares, to which
    /// the same tolerance is about twice as strict.
    /// @arithmetic
    [[nodiscard]] bool IsScaled(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether the determinant is below 0. A singular matrix is not mirrored.
    /// @arithmetic
    [[nodiscard]] bool IsMirrored() const noexcept;

    /// Whether the product of the columns is 0 within the tolerance. Perpendicular rows do not make a matrix orthogonal;
    /// a column of zeros does.
    /// @arithmetic
    [[nodiscard]] bool IsOrthogonal(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether the columns have squared lengths of 1 and a product of 0, each within the tolerance.
    /// @arithmetic
    [[nodiscard]] bool IsOrthonormal(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether the columns have equal squared lengths and a product of 0, each within the tolerance; so has a linear part
    /// of zeros.
    /// @arithmetic
    [[nodiscard]] bool IsUniformOrthogonal(double tolerance = DBL_EPSILON) const noexcept;

    /// Whether the linear part is, each field within the tolerance, one of the eight that permute the axes and their
    /// directions.
    /// @arithmetic
    [[nodiscard]] bool IsOrthonormalAxisAligned(double tolerance = DBL_EPSILON) const noexcept;

    /// The largest factor by which the linear part lengthens a vector: its larger singular value, 0 for a linear part of
    /// zeros.
    /// @arithmetic
    [[nodiscard]] double GetMaximumMatrixVectorScale() const noexcept;

    /// The one point that the transform leaves in place.
    ///
    /// @param[out] centre the point; (0, 0) if there is none, or a whole line of them
    /// @return whether there is one: |(m11 - 1)*(m22 - 1) - m21*m12| > DBL_EPSILON
    /// @arithmetic
    bool GetCenterOfTransformation(ZarnMath::point2d& centre) noexcept;

    /// A line of points that the transform leaves in place, as a mirror or a scale along one direction has it.
    ///
    /// @param[out] p0, p1 two points of the line, one unit apart in one coordinate; untouched on false
    /// @return whether one was found. With m11 near 1, a line that only the second row of the transform determines is
    ///         found where that row changes y and the first one nothing, and refused otherwise
    /// @arithmetic
    bool GetLineOfTransformation(ZarnMath::point2d& p0, ZarnMath::point2d& p1) noexcept;

    /// @}
    /// @name Directions through the linear part
    /// Angles are in radians, counter-clockwise from the x axis.
    /// @{

    /// The direction, from 0 to 2*pi, of the image of a direction. Where a singular linear part makes it the zero vector,
    /// the direction is 0, or pi, by the signs of its zeros.
    ///
    /// @param radians the direction, of any size
    /// @platform
    [[nodiscard]] double GetTransformedRadians(double radians) const noexcept;

    /// The direction, from 0 to 2*pi, whose image has the given direction; with a singular linear part the given one
    /// itself.
    ///
    /// @param radians the direction of the image, of any size
    /// @platform
    [[nodiscard]] double GetUntransformedRadians(double radians) const noexcept;

    /// The displacement whose image is v; v itself where the determinant is at most DBL_EPSILON in magnitude.
    /// @arithmetic
    [[nodiscard]] ZarnMath::vector2d GetUntransformedVector(const ZarnMath::vector2d& v) const noexcept;

    /// @}
    /// @name Arrays of points
    /// In place and independently of each other, with the bits of one point at a time. Linear in the count.
    /// @{

    /// Each coordinate is rounded by `RoundToInt`, which saturates at the limits of 32 bits.
    ///
    /// @param[in,out] points the points; may be null with a count of 0
    /// @param count          their number
    /// @arithmetic
    void TransformPoints(Framework::common_types::POINT* points, unsigned long count) const noexcept;
    void TransformPoints(ZarnMath::point2d* points, unsigned long count) const noexcept;

    /// As `TransformPoints`, and then every coordinate is clamped to -536870912 .. 536870911, a quarter of the range,
    /// silently.
    ///
    /// @param[in,out] points the points; may be null with a count of 0
    /// @param count          their number
    /// @arithmetic
    void TransformPointsWithRangeCheck(Framework::common_types::POINT* points, unsigned long count) const noexcept;

    /// @}
};

/// @name The plain-C family
/// Steps added after what a matrix does, in integer units: angles in millionths of a degree, counter-clockwise; centres
/// and points in whole drawing units. Degrees become radians by the constant 0.017453292519943, which falls short of
/// pi/180 by about 3e-16. No pointer may be null, but for an array of no points. Any matrix is accepted, a singular one
/// too.
/// @{
extern "C" {

/// Makes the matrix the identity.
/// @arithmetic
ZARNMATH_API void UTLGetIdentityMatrix(MATRIX* matrix) noexcept;

/// Turns about the origin. A multiple of a full turn changes no bit; quarter turns are not exact.
///
/// @param[in,out] matrix what is turned
/// @param angle          in millionths of a degree
/// @platform
ZARNMATH_API void UTLRotateMatrix(MATRIX* matrix, int angle) noexcept;

/// Turns about (cx, cy). A multiple of a full turn changes no bit, and quarter turns are exact.
///
/// @param[in,out] matrix what is turned
/// @param angle          in millionths of a degree
/// @param cx, cy         the centre; -2147483648 is negated to itself
/// @platform
ZARNMATH_API void UTLRotateMatrixAround(MATRIX* matrix, int angle, int cx, int cy) noexcept;

/// Adds (x, y) to the translation of `matrix`.
/// @arithmetic
ZARNMATH_API void UTLTranslateMatrix(MATRIX* matrix, int x, int y) noexcept;

/// Scales about (cx, cy).
///
/// @param[in,out] matrix what is scaled
/// @param cx, cy         the centre; -2147483648 is negated to itself
/// @param sx, sy         the factors; 0 makes the matrix singular
/// @arithmetic
ZARNMATH_API void UTLStretchMatrix(MATRIX* matrix, int cx, int cy, double sx, double sy) noexcept;

/// Shears x by -tan(angleX) per y, then y by tan(angleY) per new x, about (cx, cy).
///
/// @param[in,out] matrix what is sheared
/// @param angleX, angleY in millionths of a degree; near a quarter turn the tangent is huge
/// @param cx, cy         the centre; -2147483648 is negated to itself
/// @platform
ZARNMATH_API void UTLSkewMatrix(MATRIX* matrix, int angleX, int angleY, int cx, int cy) noexcept;

/// `MATRIX::TransformPoints` with a signed count.
///
/// @param[in,out] points the points, each coordinate rounded by `RoundToInt`; may be null with a count below 1
/// @param matrix         the transform
/// @param count          their number; below 1 nothing happens
/// @arithmetic
ZARNMATH_API void UTLTransformPoint(Framework::common_types::POINT* points, const MATRIX* matrix,
                                    std::int64_t count) noexcept;
}

/// @}

namespace ZarnMath {

/// @name Comparison of matrices
/// @{

/// Whether |a.f - b.f| <= tolerance for all six fields f; false with any NaN. One number serves the linear part, which
/// holds ratios, and the translation, in drawing units.
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsEqual(const MATRIX& a, const MATRIX& b, double tolerance) noexcept;

/// Whether |m.f| <= tolerance for all six fields f, the translation in drawing units included; false with any NaN.
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsZero(const MATRIX& m, double tolerance = DBL_EPSILON) noexcept;

/// @}

/// Angles in radians: a full turn is 2*pi.
namespace Radians {

/// The angle from 0 to 2*pi. A tiny negative one gives 2*pi itself, and a -0.0 stays.
/// @arithmetic
[[nodiscard]] ZARNMATH_API double NormalizeAngle(double angle) noexcept;

/// The angle in radians from -pi to pi, both included: what lies there already is returned as it is, and so is NaN.
/// @arithmetic
[[nodiscard]] ZARNMATH_API double NormalizeFineAngle(double angle) noexcept;

/// (cos, sin) of the angle in radians, times a length; NaN for an infinite angle.
/// @platform
[[nodiscard]] ZARNMATH_API vector2d AngleToVector(double angle) noexcept;
[[nodiscard]] ZARNMATH_API vector2d AngleToVector(double angle, double length) noexcept;

/// The direction of v from 0 to 2*pi; 0 for the zero vector.
/// @platform
[[nodiscard]] ZARNMATH_API double VectorToAngle(const vector2d& v) noexcept;

/// The turn from a to b, counter-clockwise, from 0 to 2*pi, both included.
///
/// @return the turn; 0 where either vector is zero, holds NaN, or the product of their squared lengths underflows
/// @platform
[[nodiscard]] ZARNMATH_API double GetAngle(const vector2d& a, const vector2d& b) noexcept;

/// The turn from a to b as seen from the vertex, from 0 to 2*pi; 0 where either of them is the vertex.
/// @platform
[[nodiscard]] ZARNMATH_API double GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept;

/// `GetAngle` from a to b in radians, folded to above -pi up to pi: opposite vectors give pi whichever way they are
/// turned, and 0 comes out where `GetAngle` gives it.
/// @platform
[[nodiscard]] ZARNMATH_API double GetFineAngle(const vector2d& a, const vector2d& b) noexcept;

/// The point p turned by an angle in radians about a centre, by way of its difference from the centre. The centre
/// itself stays, but no angle is exact otherwise, 0 included; an infinite one gives NaN.
/// @platform
[[nodiscard]] ZARNMATH_API point2d RotatePoint(const point2d& p, double angle, const point2d& centre) noexcept;

/// The nearest of the angles origin + k * 2*pi/steps, not normalised; the angle itself if steps is 0.
/// @arithmetic
[[nodiscard]] ZARNMATH_API double Constrain(double angle, int steps, double origin) noexcept;

/// The quadrant, 0 to 3, of the angle brought to a turn of 2*pi. A boundary belongs to the higher one; NaN gives 3.
/// @arithmetic
[[nodiscard]] ZARNMATH_API int GetQuadrant(double angle) noexcept;

/// Turns points about a centre and rounds them, with the centre hoisted into two offsets, so that a point may come out
/// otherwise than by `RotatePoint` and rounding.
///
/// @param[in,out] points the points
/// @param count          their number; taken as signed, below 1 changes nothing
/// @param angle          in radians; up to DBL_EPSILON in magnitude the array is left alone
/// @param centre         the fixed point
/// @platform
ZARNMATH_API void RotatePoints(POINT* points, unsigned long count, double angle, const point2d& centre) noexcept;

} // namespace Radians

/// Angles in degrees: a full turn is 360. Each function is that of `Radians`, with the angle multiplied by pi/180 on the
/// way in or by 180/pi on the way out, each constant rounded once.
namespace Degrees {

/// The angle from 0 to 360. A tiny negative one gives 360 itself, and a -0.0 stays.
/// @arithmetic
[[nodiscard]] ZARNMATH_API double NormalizeAngle(double angle) noexcept;

/// (cos, sin) of the angle in degrees, times a length; NaN for an infinite angle.
/// @platform
[[nodiscard]] ZARNMATH_API vector2d AngleToVector(double angle) noexcept;
[[nodiscard]] ZARNMATH_API vector2d AngleToVector(double angle, double length) noexcept;

/// The direction of v from 0 to 360; 0 for the zero vector.
/// @platform
[[nodiscard]] ZARNMATH_API double VectorToAngle(const vector2d& v) noexcept;

/// The turn from a to b, counter-clockwise and as seen from the vertex, if there is one: from 0 to 360, both included; 0
/// where `Radians::GetAngle` is.
/// @platform
[[nodiscard]] ZARNMATH_API double GetAngle(const vector2d& a, const vector2d& b) noexcept;
[[nodiscard]] ZARNMATH_API double GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept;

/// The turn from a to b, above -180 up to 180; 0 where `Radians::GetAngle` is.
/// @platform
[[nodiscard]] ZARNMATH_API double GetFineAngle(const vector2d& a, const vector2d& b) noexcept;

/// The point p turned by an angle in degrees about a centre. The centre itself stays; an infinite angle gives NaN.
/// @platform
[[nodiscard]] ZARNMATH_API point2d RotatePoint(const point2d& p, double angle, const point2d& centre) noexcept;

/// The room that a turned box takes, with its sides exchanged: at 0 degrees the width comes out as `cy`.
///
/// @param size  the box, in whole drawing units; of a negative side the magnitude counts
/// @param angle in degrees, of any size
/// @return cx: |cos*cy| + |sin*cx|, cy: |sin*cy| + |cos*cx|, each of the four products rounded up by itself
/// @platform
[[nodiscard]] ZARNMATH_API SIZE GetRotatedSize(const SIZE& size, double angle) noexcept;

/// As `Radians::RotatePoints`.
///
/// @param[in,out] points the points
/// @param count          their number; taken as signed, below 1 changes nothing
/// @param angle          in degrees, compared with DBL_EPSILON after it has become radians
/// @param centre         the fixed point
/// @platform
ZARNMATH_API void RotatePoints(POINT* points, unsigned long count, double angle, const point2d& centre) noexcept;

} // namespace Degrees

/// Angles as an `int` of millionths of a degree: a full turn is 360000000.
namespace KELDANGLE {

/// The angle from 0 to 359999999 millionths of a degree; any `int` will do.
/// @arithmetic
[[nodiscard]] ZARNMATH_API int NormalizeAngle(int angle) noexcept;

/// The direction of v, rounded: 360000000 just below the x axis, and 0 for (0, 0).
/// @platform
[[nodiscard]] ZARNMATH_API int VectorToAngle(const vector2d& v) noexcept;

/// The turn from a to b as seen from the vertex, from 0 to 360000000; 0 where either of them is the vertex.
/// @platform
[[nodiscard]] ZARNMATH_API int GetAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept;

/// The turn from a to b as seen from the vertex, from -180000000 to 180000000; 0 where either of them is the vertex.
/// @platform
[[nodiscard]] ZARNMATH_API int GetFineAngle(const point2d& vertex, const point2d& a, const point2d& b) noexcept;

} // namespace KELDANGLE

/// An affine transform told as what it is made of: R(rotation) * (scaleX, scaleY*skew; 0, scaleY), then the translation.
struct AFF_TRANSFORM
{
    double scaleX;       ///< along the turned x axis; below 0 where a left-handed pair had to be flipped
    double scaleY;       ///< along the skewed y axis; below 0 where y lies clockwise of the turned x axis
    double skew;         ///< the tangent of the shear, not an angle
    double rotation;     ///< radians from -pi to pi
    point2d translation; ///< image of the origin

    friend constexpr bool operator==(const AFF_TRANSFORM&, const AFF_TRANSFORM&) noexcept = default;
};

/// @name Decomposition
/// @{

/// Takes a transform apart.
///
/// @param[out] out on false only `translation`, `rotation` and `scaleX` are written, and `scaleY` where the second
///                 column is not zero
/// @param m        the transform. A zero first column gives NaN in `scaleY` and `skew`, and true
/// @return whether the columns are further than 0.9 degrees from parallel, the second one not being zero. Parallel columns
///         whose cosine rounds above 1 give NaN and true
/// @platform
ZARNMATH_API bool DecomposeAffineTransform(AFF_TRANSFORM& out, const MATRIX& m) noexcept;

/// As `DecomposeAffineTransform`, of the transform with these columns.
///
/// @param[out] out         on false partly written, as by `DecomposeAffineTransform`
/// @param origin           image of the origin
/// @param xVector, yVector images of the unit vectors. A zero xVector gives NaN in `scaleY` and `skew`, and true
/// @return whether the two vectors are further than 0.9 degrees from parallel, the second one not being zero
/// @platform
ZARNMATH_API bool DecomposeAffineTransformFromVectors(AFF_TRANSFORM& out, const point2d& origin,
                                                      const vector2d& xVector, const vector2d& yVector) noexcept;

/// Puts a transform together.
///
/// @param[out] out the matrix, written in any case
/// @param a        its parts
/// @return whether neither scale is 0; NaN is not 0
/// @platform
ZARNMATH_API bool ComposeAffineTransform(MATRIX& out, const AFF_TRANSFORM& a) noexcept;

/// Applies a transform to what another one has placed, but holds the change of scale apart.
///
/// @param first      places the object; with a zero scale of its own, `scale` becomes infinite or NaN
/// @param then       acts on the placed object
/// @param[out] scale the factors by which the scales of `then * first` exceed those of `first`
/// @return the transform with position, turn and skew of `then * first` and the scales of `first`. Of a transform that
///         cannot be taken apart, what was found before the refusal counts, and scales 1, skew 0 for the rest
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX TransformMatrixAndSeparateScale(const MATRIX& first, const MATRIX& then,
                                                                  vector2d& scale) noexcept;

/// @}
/// @name Construction
/// Fields that are not named are 0. Angles are in radians, counter-clockwise. Nothing is refused: a factor of 0 gives a
/// singular matrix, and infinities and NaN go through.
/// @{

/// How a box is fitted into another. Any other value acts as `MapFill`.
enum MapMode : std::int32_t
{
    MapStretch = 0, ///< each axis by its own factor
    MapFit = 1,     ///< both axes by the smaller magnitude: the source lies inside the target
    MapFill = 2,    ///< both axes by the larger magnitude: the source covers the target
};

/// The transform that changes nothing.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX IdentityMatrix() noexcept;

/// The mirror that exchanges x and y.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX SwapXYMatrix() noexcept;

/// The transform with the columns xVector, yVector and translation, whatever they are.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructMatrix(const vector2d& xVector, const vector2d& yVector,
                                                  const vector2d& translation) noexcept;

/// Moves by v.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructTranslationMatrix(const vector2d& v) noexcept;

/// Turns about the origin by an angle in radians.
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructRotationMatrix(double radians) noexcept;

/// Scales by (sx, sy), then turns by an angle in radians, about the origin.
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructScaledRotationMatrix(double sx, double sy, double radians) noexcept;

/// Turns by an angle in radians about a point, the centre.
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructRotateAroundMatrix(double radians, const point2d& centre) noexcept;

/// Scales by (sx, sy) about a point, the centre.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructScaleAroundMatrix(double sx, double sy, const point2d& centre) noexcept;

/// Shears x by -tan(angleX) per y, then y by tan(angleY) per new x, about a point, the centre; angles in radians.
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructSkewAroundMatrix(double angleX, double angleY,
                                                            const point2d& centre) noexcept;

/// Does t about a point, the centre.
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructTransformAroundMatrix(const MATRIX& t, const point2d& centre) noexcept;

/// The turn and uniform scale that takes one displacement to another, without translation.
///
/// @param from its length; up to DBL_EPSILON the scale is 1. Zero, the angle is 0 as well
/// @param to   zero, the result is zero
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructVectorTransformMatrix(const vector2d& from, const vector2d& to) noexcept;

/// The turn, uniform scale and move that takes a0 to b0 and a1 to b1, never mirrored. If a0 is a1, it moves.
/// @platform
[[nodiscard]] ZARNMATH_API MATRIX ConstructLineSegmentTransformMatrix(const point2d& a0, const point2d& a1,
                                                                      const point2d& b0, const point2d& b1) noexcept;

/// Scales the unit square to the size of a box.
///
/// @param box        a side of up to DBL_EPSILON in magnitude counts as 1
/// @param withOffset whether it is also moved onto the box
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructBBoxScaleMatrix(const BoundsT<double>& box, bool withOffset) noexcept;

/// Takes a box into another, centre to centre.
///
/// @param from, to the boxes; one inside out flips, in every mode. A side of 0 in `from` gives infinities or NaN
/// @param mode     how the factors are chosen
/// @return the transform; under a negative factor m12 or m21 is -0.0
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX ConstructRectTransformMatrix(const BoundsT<double>& from, const BoundsT<double>& to,
                                                               MapMode mode) noexcept;

/// The factors that take the size `from` to the size `to`, chosen by `mode` as in `ConstructRectTransformMatrix`. A side
/// of 0 in `from` gives infinities or NaN.
/// @arithmetic
[[nodiscard]] ZARNMATH_API vector2d GetScaleForSizeTransform(const vector2d& from, const vector2d& to,
                                                             MapMode mode) noexcept;

/// @}
/// @name Arrays of points
/// @{

/// Moves points in place. Integers wrap.
///
/// @param[in,out] points the points; may be null with a count of 0
/// @param count          their number
/// @param offset         the displacement; if it is one of the points, it is read anew for each of them
/// @arithmetic
ZARNMATH_API void TranslatePoints(point2d* points, unsigned long count, const point2d& offset) noexcept;
ZARNMATH_API void TranslatePoints(POINT* points, unsigned long count, const POINT& offset) noexcept;

/// @}

} // namespace ZarnMath
