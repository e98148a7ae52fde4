#include "ZarnMath/ValueTypesInternal.h"
#include "ZarnMath/WMath/Batches.h"
#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

constexpr int fullTurn = 360000000;

/// By the short constant of this family, division first.
double ToRadians(int angle) noexcept
{
    return angle / unitsPerDegree * truncatedDegreesToRadians;
}

/// The angle from 0 to below a full turn.
int Reduce(int angle) noexcept
{
    const int remainder = angle % fullTurn;
    return remainder < 0 ? remainder + fullTurn : remainder;
}

/// Exact at the quarter turns.
SineCosine GetReducedSineCosine(int angle) noexcept
{
    switch (angle) {
    case fullTurn / 4:
        return {1.0, 0.0};
    case fullTurn / 2:
        return {0.0, -1.0};
    case fullTurn / 4 * 3:
        return {-1.0, 0.0};
    default:
        return GetSineCosine(ToRadians(angle));
    }
}

/// The displacement that brings a centre to the origin. It is negated as an integer, so that the smallest one stays.
vector2d ToOrigin(int cx, int cy) noexcept
{
    return {static_cast<double>(WrappingSubtract(0, cx)), static_cast<double>(WrappingSubtract(0, cy))};
}

void Translate(MATRIX& m, const vector2d& v) noexcept
{
    m.dx += v.x;
    m.dy += v.y;
}

vector2d FromOrigin(int cx, int cy) noexcept
{
    return {static_cast<double>(cx), static_cast<double>(cy)};
}

/// v sheared: x by -kx per y, then y by ky per new x.
vector2d Skewed(const vector2d& v, double kx, double ky) noexcept
{
    const double q = 1.0 - kx * ky;
    return {v.x - kx * v.y, v.x * ky + v.y * q};
}

} // namespace

} // namespace ZarnMath

using namespace ZarnMath;

void UTLGetIdentityMatrix(MATRIX* matrix) noexcept
{
    *matrix = gmIdentityMatrix;
}

void UTLRotateMatrix(MATRIX* matrix, int angle) noexcept
{
    if (angle % fullTurn != 0)
        Turn(*matrix, GetSineCosine(ToRadians(angle)));
}

void UTLRotateMatrixAround(MATRIX* matrix, int angle, int cx, int cy) noexcept
{
    const int reduced = Reduce(angle);
    if (reduced == 0)
        return;
    Translate(*matrix, ToOrigin(cx, cy));
    Turn(*matrix, GetReducedSineCosine(reduced));
    Translate(*matrix, FromOrigin(cx, cy));
}

void UTLTranslateMatrix(MATRIX* matrix, int x, int y) noexcept
{
    Translate(*matrix, FromOrigin(x, y));
}

void UTLStretchMatrix(MATRIX* matrix, int cx, int cy, double sx, double sy) noexcept
{
    Translate(*matrix, ToOrigin(cx, cy));
    matrix->ScaleMatrix(vector2d{sx, sy});
    Translate(*matrix, FromOrigin(cx, cy));
}

void UTLSkewMatrix(MATRIX* matrix, int angleX, int angleY, int cx, int cy) noexcept
{
    const double kx = std::tan(ToRadians(angleX));
    const double ky = std::tan(ToRadians(angleY));
    Translate(*matrix, ToOrigin(cx, cy));
    *matrix = FromColumns(Skewed(XColumn(*matrix), kx, ky), Skewed(YColumn(*matrix), kx, ky),
                          AsPoint(Skewed(AsVector(Translation(*matrix)), kx, ky)));
    Translate(*matrix, FromOrigin(cx, cy));
}

void UTLTransformPoint(Framework::common_types::POINT* points, const MATRIX* matrix, std::int64_t count) noexcept
{
    if (count > 0)
        TransformRounded(points, static_cast<std::uint64_t>(count), *matrix, wholeRange);
}
