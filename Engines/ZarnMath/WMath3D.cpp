#include "ZarnMath/WMath3D.h"

#include "ZarnMath/ValueTypesInternal.h"

using ZarnMath::Quaternion;
using ZarnMath::TruncateToInt;
using ZarnMath::WrappingAdd;

namespace {

constexpr MATRIX3D mIdentity3DMatrix{{{65536, 0, 0, 0}, {0, 65536, 0, 0}, {0, 0, 65536, 0}}};

constexpr float fixedToFloat = 1.52587890625e-05F; // 2^-16
constexpr double one = 65536.0;

/// The rotation part of a matrix in single precision.
struct Rotation
{
    float e[3][3];
};

Rotation RotationOf(const MATRIX3D& matrix) noexcept
{
    Rotation rotation{};
    for (int r = 0; r < 3; ++r)
        for (int c = 0; c < 3; ++c)
            rotation.e[r][c] = static_cast<float>(matrix.m[r][c]) * fixedToFloat;
    return rotation;
}

float Row(const float (&e)[3], float x, float y, float z) noexcept
{
    return (e[0] * x + e[1] * y) + e[2] * z;
}

/// Twice a number as fixed point: truncated first, doubled modulo 2^32 afterwards.
std::uint32_t TwiceFixed(double v) noexcept
{
    return 2U * static_cast<std::uint32_t>(TruncateToInt(v * one));
}

std::int32_t AsInt(std::uint32_t v) noexcept
{
    return static_cast<std::int32_t>(v);
}

/// The quaternion of a rotation of positive trace.
Quaternion FromTrace(const double (&a)[3][3], double trace) noexcept
{
    const double w = std::sqrt(trace + 1.0) * 0.5;
    const double h = w * 4.0;
    return {(a[2][1] - a[1][2]) / h, (a[0][2] - a[2][0]) / h, (a[1][0] - a[0][1]) / h, w};
}

/// The quaternion of a rotation by the largest element of its diagonal, which keeps the divisor away from 0.
Quaternion FromLargestDiagonal(const double (&a)[3][3]) noexcept
{
    constexpr int next[3] = {1, 2, 0};
    int i = a[1][1] > a[0][0] ? 1 : 0;
    if (a[i][i] < a[2][2])
        i = 2;
    const int j = next[i];
    const int k = next[j];
    const double s = std::sqrt((a[i][i] - (a[j][j] + a[k][k])) + 1.0);
    const double divisor = s + s;
    double axis[3];
    axis[i] = s * 0.5;
    axis[j] = (a[i][j] + a[j][i]) / divisor;
    axis[k] = (a[i][k] + a[k][i]) / divisor;
    return {axis[0], axis[1], axis[2], (a[k][j] - a[j][k]) / divisor};
}

} // namespace

void MTHGet3DIdentityMatrix(MATRIX3D* out) noexcept
{
    *out = mIdentity3DMatrix;
}

void MTHTranslate3DMatrix(MATRIX3D* m, int x, int y, int z) noexcept
{
    m->m[0][3] = WrappingAdd(m->m[0][3], x);
    m->m[1][3] = WrappingAdd(m->m[1][3], y);
    m->m[2][3] = WrappingAdd(m->m[2][3], z);
}

void MTHTransform3DPoints(POINT3D* points, const MATRIX3D* m, int count) noexcept
{
    if (count < 1)
        return;
    const Rotation rotation = RotationOf(*m);
    const std::int32_t translation[3] = {m->m[0][3], m->m[1][3], m->m[2][3]};
    const auto image = [&](int r, float x, float y, float z) {
        return WrappingAdd(TruncateToInt(Row(rotation.e[r], x, y, z)), translation[r]);
    };
    for (int i = 0; i < count; ++i) {
        const auto x = static_cast<float>(points[i].x);
        const auto y = static_cast<float>(points[i].y);
        const auto z = static_cast<float>(points[i].z);
        points[i] = {image(0, x, y, z), image(1, x, y, z), image(2, x, y, z)};
    }
}

int MTHPerspective3DProjection(const POINT3D* points, Framework::common_types::POINT* out, int count,
                               const POINT3D* viewpoint) noexcept
{
    if (count < 1)
        return 1;
    const double vx = viewpoint->x;
    const double vy = viewpoint->y;
    const double vz = viewpoint->z;
    for (int i = 0; i < count; ++i) {
        const double x = points[i].x;
        const double y = points[i].y;
        const double z = points[i].z;
        const double w = vz - z;
        out[i] = {TruncateToInt((vz * x - vx * z) / w), TruncateToInt((vz * y - vy * z) / w)};
    }
    return 1;
}

void VECT_QuaternionToMat(const Quaternion* q, MATRIX3D* out) noexcept
{
    const std::uint32_t xx = TwiceFixed(q->x * q->x);
    const std::uint32_t yy = TwiceFixed(q->y * q->y);
    const std::uint32_t zz = TwiceFixed(q->z * q->z);
    const std::uint32_t xw = TwiceFixed(q->x * q->w);
    const std::uint32_t yw = TwiceFixed(q->y * q->w);
    const std::uint32_t zw = TwiceFixed(q->z * q->w);
    const std::uint32_t xy = TwiceFixed(q->x * q->y);
    const std::uint32_t xz = TwiceFixed(q->x * q->z);
    const std::uint32_t yz = TwiceFixed(q->y * q->z);
    constexpr std::uint32_t unit = 65536;
    *out = {{{AsInt(unit - (yy + zz)), AsInt(zw + xy), AsInt(xz - yw), 0},
             {AsInt(xy - zw), AsInt(unit - xx - zz), AsInt(xw + yz), 0},
             {AsInt(yw + xz), AsInt(yz - xw), AsInt(unit - xx - yy), 0}}};
}

void VECT_MatToQuaternion(const MATRIX3D* m, Quaternion* out) noexcept
{
    const Rotation rotation = RotationOf(*m);
    double a[3][3];
    for (int r = 0; r < 3; ++r)
        for (int c = 0; c < 3; ++c)
            a[r][c] = rotation.e[c][r];
    const double trace = (a[0][0] + a[1][1]) + a[2][2];
    *out = trace > DBL_EPSILON ? FromTrace(a, trace) : FromLargestDiagonal(a);
}
