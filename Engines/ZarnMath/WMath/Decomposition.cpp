#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

bool DecomposeAffineTransformFromVectors(AFF_TRANSFORM& out, const point2d& origin, const vector2d& xVector,
                                         const vector2d& yVector) noexcept
{
    const vector2d given = xVector;
    const vector2d y = yVector;
    out.translation = origin;

    // A left-handed pair whose first vector points leftward; any other one gets its sign from the last test.
    const bool isFlipped = given.x < 0.0 && Cross(given, y) < 0.0;
    const vector2d x = isFlipped ? vector2d{-given.x, -given.y} : given;
    out.rotation = std::atan2(x.y, x.x);
    const double xLength = std::sqrt(LengthSquared(x));
    out.scaleX = isFlipped ? -xLength : xLength;

    const double yLength = std::sqrt(LengthSquared(y));
    if (yLength <= 0.0)
        return false;
    const double between = std::acos(Dot(y, given) / (out.scaleX * yLength));
    out.scaleY = yLength * std::fabs(std::sin(between));
    if (out.scaleY <= 0.0)
        return false;
    const double shear = halfPi - between;
    if (std::fabs(shear) >= largestSkewAngle)
        return false;
    out.skew = std::tan(shear);
    if (Cross(Radians::AngleToVector(out.rotation), y) < 0.0) {
        out.scaleY = -out.scaleY;
        out.skew = -out.skew;
    }
    return true;
}

bool DecomposeAffineTransform(AFF_TRANSFORM& out, const MATRIX& m) noexcept
{
    return DecomposeAffineTransformFromVectors(out, Translation(m), XColumn(m), YColumn(m));
}

bool ComposeAffineTransform(MATRIX& out, const AFF_TRANSFORM& a) noexcept
{
    const auto [s, c] = GetSineCosine(a.rotation);
    const double k = a.scaleY * a.skew;
    // The products with 0 decide the sign of a zero.
    out = {a.scaleX * c - s * 0.0, k * c - a.scaleY * s, a.translation.x,
           a.scaleX * s + c * 0.0, k * s + a.scaleY * c, a.translation.y};
    return a.scaleX != 0.0 && a.scaleY != 0.0;
}

MATRIX TransformMatrixAndSeparateScale(const MATRIX& first, const MATRIX& then, vector2d& scale) noexcept
{
    constexpr AFF_TRANSFORM neutral{1.0, 1.0, 0.0, 0.0, {0.0, 0.0}};
    AFF_TRANSFORM placed = neutral;
    AFF_TRANSFORM moved = neutral;
    DecomposeAffineTransform(placed, first);
    DecomposeAffineTransform(moved, then * first);
    scale = {moved.scaleX / placed.scaleX, moved.scaleY / placed.scaleY};
    moved.scaleX = placed.scaleX;
    moved.scaleY = placed.scaleY;
    MATRIX result;
    ComposeAffineTransform(result, moved);
    return result;
}

} // namespace ZarnMath
