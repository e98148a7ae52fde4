/// @file
/// The templates behind the flattening functions, and their output policies. Internal.
///
/// The policies are template parameters, so that storing a point costs no indirect call.
#pragma once

#include "ZarnMath/BezierToLines.h"

namespace ZarnMath {

/// Stores points rounded to whole units.
struct FastConvert
{
    POINT* points; ///< the caller's output array

    void Store(int index, const point2d& p) const noexcept
    {
        points[index] = ToPOINT(p);
    }
};

/// Stores points as they are.
struct DirectConvert
{
    point2d* points; ///< the caller's output array

    void Store(int index, const point2d& p) const noexcept
    {
        points[index] = p;
    }
};

/// `BezierToLines` with an output policy; for `POINT` with `FastConvert` and `point2d` with `DirectConvert`.
template <typename P, typename C>
void BezierToLines(const P* curve, int lines, C& output) noexcept;

/// `AdaptiveBezierToLines` with an output policy; for the same pairs.
template <typename P, typename C>
int AdaptiveBezierToLines(const P* curve, double tolerance, int maxLines, C& output) noexcept;

/// The least and the greatest level of the adaptive subdivision; for `POINT` and `point2d`.
///
/// @param curve         four control points
/// @param tolerance     the square of a distance
/// @param maxLines      the most segments wanted
/// @param[out] minDepth 0 to 3 from the size of the control polygon, never above maxDepth
/// @param[out] maxDepth floor(log2(maxLines)) - 1, and -2 for maxLines < 1
template <typename P>
void CalculateRecursionDepth(const P* curve, double tolerance, int maxLines, int& minDepth, int& maxDepth) noexcept;

extern template void BezierToLines<POINT, FastConvert>(const POINT*, int, FastConvert&) noexcept;
extern template void BezierToLines<point2d, DirectConvert>(const point2d*, int, DirectConvert&) noexcept;
extern template int AdaptiveBezierToLines<POINT, FastConvert>(const POINT*, double, int, FastConvert&) noexcept;
extern template int AdaptiveBezierToLines<point2d, DirectConvert>(const point2d*, double, int, DirectConvert&) noexcept;
extern template void CalculateRecursionDepth<POINT>(const POINT*, double, int, int&, int&) noexcept;
extern template void CalculateRecursionDepth<point2d>(const point2d*, double, int, int&, int&) noexcept;

} // namespace ZarnMath

namespace ZarnMath::CubicBezier {

/// The integer box of four control points, rounded outward; for `point2d` and `int`.
///
/// It encloses the curve and is not tight to it. Coordinates beyond 32 bits saturate.
///
/// @param curve                         four control points
/// @param[out] minX, minY, maxX, maxY   the box
template <typename P, typename I>
void GetLooseBounds(const P* curve, I& minX, I& minY, I& maxX, I& maxY) noexcept;

extern template void GetLooseBounds<point2d, int>(const point2d*, int&, int&, int&, int&) noexcept;

} // namespace ZarnMath::CubicBezier
