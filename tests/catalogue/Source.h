/// @file
/// Where the arguments of a catalogued function come from.
#pragma once

#include "ZarnMath/ZarnMath.h"

#include <array>
#include <vector>

namespace ZarnMath::Catalogue {

/// Four control points.
template <typename P>
using CurveOf = std::array<P, 4>;

/// A cubic in power form, P(t) = ((a*t + b)*t + c)*t + d.
struct Coefficients
{
    point2d a;
    point2d b;
    point2d c;
    point2d d;
};

[[nodiscard]] Coefficients ToPowerForm(const CurveOf<point2d>& curve) noexcept;

/// One function that is called has drawn its arguments in order from one of these, each by the method that says what it
/// means. All values but those of `Count` may be anything that their type holds.
///
/// Five methods have to be there; the others draw through them, and are replaced where a source knows better.
class Source
{
public:
    Source() = default;
    Source(const Source&) = delete;
    Source& operator=(const Source&) = delete;
    virtual ~Source() = default;

    /// @name One value
    /// @{
    virtual double Number() = 0;
    virtual float Single() = 0;
    virtual std::int32_t Integer() = 0;
    virtual bool Flag() = 0;

    /// From low to high, both included: what the function's contract, or the size of an array, allows.
    virtual int Count(int low, int high) = 0;

    /// A coordinate on the drawing.
    virtual double Coordinate();
    /// A parameter of a curve.
    virtual double Parameter();
    /// An angle in a unit of which so many make a turn.
    virtual double Angle(double turn);
    /// An angle in millionths of a degree.
    virtual std::int32_t IntegerAngle();
    virtual double Tolerance();
    /// A distance or a radius, of any sign.
    virtual double Distance();
    /// @}

    /// @name Values of several numbers
    /// @{
    virtual point2d Point();
    virtual POINT IntegerPoint();
    virtual vector2d Vector();
    virtual vector3dT<double> Vector3();
    virtual POINT3D IntegerPoint3();
    virtual SIZE Size();
    virtual RECT Rect();
    virtual BoundsT<double> Bounds();
    virtual MATRIX Matrix();
    virtual MATRIX3D Matrix3();
    virtual ZarnMath::Quaternion Quaternion();
    /// @}

    /// @name Curves and runs of points
    /// @{
    virtual CurveOf<point2d> Cubic();
    virtual CurveOf<POINT> IntegerCubic();
    virtual Coefficients PowerForm();
    virtual std::vector<point2d> Points(int count);
    virtual std::vector<POINT> IntegerPoints(int count);
    /// @}
};

/// @name The same by type
/// For entries that are written once for `point2d` and `POINT`.
/// @{
template <typename P>
P DrawPoint(Source& in);
template <typename P>
CurveOf<P> DrawCubic(Source& in);
template <typename P>
std::vector<P> DrawPoints(Source& in, int count);

template <>
inline point2d DrawPoint<point2d>(Source& in)
{
    return in.Point();
}

template <>
inline POINT DrawPoint<POINT>(Source& in)
{
    return in.IntegerPoint();
}

template <>
inline CurveOf<point2d> DrawCubic<point2d>(Source& in)
{
    return in.Cubic();
}

template <>
inline CurveOf<POINT> DrawCubic<POINT>(Source& in)
{
    return in.IntegerCubic();
}

template <>
inline std::vector<point2d> DrawPoints<point2d>(Source& in, int count)
{
    return in.Points(count);
}

template <>
inline std::vector<POINT> DrawPoints<POINT>(Source& in, int count)
{
    return in.IntegerPoints(count);
}

/// @}

} // namespace ZarnMath::Catalogue
