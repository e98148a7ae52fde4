/// @file
/// Offsets of a cubic: the curve at a signed distance from it, positive to the left of the direction of travel.
///
/// The offset of a cubic is not a cubic. A caller cuts the curve into pieces whose offset does not fold, fits a cubic to
/// the offset of each, and cuts further where that is not near enough.
///
/// All functions but `GetSegmentsToOffset` are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"

#include <vector>

namespace ZarnMath {

/// Whether a piece of a cubic can be offset, judged by three samples of its radius of curvature.
///
/// A piece is rejected only where it turns toward the offset with a radius below the distance at each of t = 0.5, 0.25 and
/// 0.75: one good sample is enough. So this is a test of pieces that were cut at the cusps of the offset, not of whole
/// curves.
///
/// @param a, b, c  power form
/// @param distance in drawing units, positive to the left; with 0 every piece is valid
/// @return whether any sample is straight, turns away, or has a radius that is not below the distance
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsBezierValidForOffset(const point2d& a, const point2d& b, const point2d& c,
                                                       double distance) noexcept;

/// The same for control points.
///
/// @param bezier   four control points
/// @param distance in drawing units, positive to the left; with 0 every piece is valid
/// @return whether the piece can be offset: a straight one, and a point, always
/// @arithmetic
[[nodiscard]] ZARNMATH_API bool IsBezierValidForOffset(const point2d* bezier, double distance) noexcept;

/// The stretches of a cubic whose offset does not fold.
///
/// The curve is cut at the cusps of its offset, the pieces that `IsBezierValidForOffset` rejects are dropped, and valid
/// neighbours are one stretch again. Two cusps in a row that are at most 0.05 apart in the parameter are passed over where
/// the curve turns by less than 2 degrees from one to the other, counter-clockwise; any turn clockwise is less than that.
/// A curve without cusps comes through unchanged, or not at all where it is invalid.
///
/// The turn is measured by the machine's mathematical library: where it is 2 degrees to the last bits, two machines may
/// differ.
///
/// @param bezier                  the curve
/// @param[in,out] segments        the stretches are appended, in the order of the curve, at most one more than there are
///                                cusps, of which there are no more than 12; may hold `bezier` itself
/// @param distance                in drawing units, positive to the left; with 0 the curve comes through unchanged
/// @param[in,out] validityChanges the parameters in (0, 1) at which a valid and an invalid piece meet are appended, in
///                                the order of the curve; may be null
/// @platform
ZARNMATH_API void GetSegmentsToOffset(const CubicBezier::bezier2dT<point2d>& bezier,
                                      std::vector<CubicBezier::bezier2dT<point2d>>& segments, double distance,
                                      std::vector<double>* validityChanges);

/// One cubic that is close to the offset of a cubic.
///
/// The ends and the end tangents are those of the offset, as far as no handle of the fit comes out on the wrong side. The
/// lengths of the handles are fitted to points of the offset: at t = 0, 0.1 to 1, and where the curve is sharpest or
/// flattest, if it bends there with a radius of at most ten times its size.
///
/// @param bezier              four control points
/// @param[out] offsetBezier   four control points, the best fit whether or not it is within tolerance; may be `bezier`
/// @param distance            in drawing units, positive to the left
/// @param tolerance           the *square* of a distance, in drawing units squared
/// @param[out] splitParameter always 0.5, in the middle of 0 to 1: where to cut the curve if the fit is not near enough
/// @return whether the largest squared distance of a sample from the fit, and by which the fit leaves the box of the
///         samples, is below the tolerance. A curve that is a point gives true and handles of NaN
/// @arithmetic
ZARNMATH_API bool FindBezierOffsetCurve(const point2d* bezier, point2d* offsetBezier, double distance, double tolerance,
                                        double& splitParameter);

} // namespace ZarnMath
