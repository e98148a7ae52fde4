/// @file
/// Fixed-point matrices, projections and quaternions.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/Quaternion.h"
#include "ZarnMath/WMath3D.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

constexpr int mostPoints = 20;

POINT3D ReadPoint(Input& input)
{
    const std::int32_t x = input.Int();
    const std::int32_t y = input.Int();
    return {x, y, input.Int()};
}

Quaternion ReadQuaternion(Input& input)
{
    const double x = input.Double();
    const double y = input.Double();
    const double z = input.Double();
    return {x, y, z, input.Double()};
}

MATRIX3D ReadMatrix(Input& input)
{
    MATRIX3D m{};
    for (auto& row : m.m)
        for (std::int32_t& element : row)
            element = input.Int();
    return m;
}

void CheckPoints(const std::vector<POINT3D>& points, const MATRIX3D& m, const POINT3D& viewpoint)
{
    const int count = static_cast<int>(points.size());
    std::vector<POINT3D> together = points;
    Bounded(
        "MTHTransform3DPoints", [&] { MTHTransform3DPoints(together.data(), &m, count); }, count + 1);
    Guarded<POINT, mostPoints> projected;
    const int one = Bounded(
        "MTHPerspective3DProjection",
        [&] { return MTHPerspective3DProjection(points.data(), projected.data(), count, &viewpoint); }, count + 1);
    Require(one == 1 && projected.IsUntouchedFrom(count), "a point for each point");
    for (int i = 0; i < count; ++i) {
        POINT3D single = points[static_cast<std::size_t>(i)];
        POINT image{};
        MTHPerspective3DProjection(&single, &image, 1, &viewpoint);
        Require(image == projected[i], "an array is projected one by one");
        MTHTransform3DPoints(&single, &m, 1);
        Require(single == together[static_cast<std::size_t>(i)], "an array is transformed one by one");
    }
    MTHTransform3DPoints(nullptr, nullptr, -count);
    Require(MTHPerspective3DProjection(nullptr, nullptr, -count, nullptr) == 1, "always 1");
}

void CheckMatrix(const MATRIX3D& m, const POINT3D& by)
{
    MATRIX3D moved = m;
    MTHTranslate3DMatrix(&moved, by.x, by.y, by.z);
    for (int r = 0; r < 3; ++r)
        Require(std::equal(m.m[r], m.m[r] + 3, moved.m[r]), "a translation leaves the rotation alone");
    Quaternion q{};
    Bounded("VECT_MatToQuaternion", [&] { VECT_MatToQuaternion(&m, &q); });
    MATRIX3D back{};
    VECT_QuaternionToMat(&q, &back);
    MATRIX3D identity{};
    MTHGet3DIdentityMatrix(&identity);
    VECT_MatToQuaternion(&identity, &q);
    Require(q == Quaternion{0.0, 0.0, 0.0, 1.0}, "the identity turns nothing");
}

void CheckQuaternions(const Quaternion& p, const Quaternion& q, double t)
{
    MATRIX3D m{};
    Bounded("VECT_QuaternionToMat", [&] { VECT_QuaternionToMat(&p, &m); });
    Require(m.m[0][3] == 0 && m.m[1][3] == 0 && m.m[2][3] == 0, "a quaternion does not move");
    const Quaternion product = p * q;
    vector3dT<double> v{q.x, q.y, q.z};
    Bounded("Quaternion::Rotate", [&] { p.Rotate(v); });
    p.RotateQuick(v);
    Quaternion made{};
    made.RotationCreate({p.x, p.y, p.z}, v);
    Quaternion rounded = product;
    rounded.ForceZeros();
    Require((rounded.x == 0.0 || std::fabs(rounded.x) > 1000.0 * DBL_EPSILON || rounded.x != rounded.x) &&
                (rounded.w == 0.0 || std::fabs(rounded.w) > DBL_EPSILON || rounded.w != rounded.w),
            "nothing is nearly 0");
    Quaternion between{};
    if (!Bounded("Quaternion::Interpolate", [&] { return Quaternion::Interpolate(p, q, t, between); }))
        Require(IsSame(between.x, p.x) && IsSame(between.y, p.y) && IsSame(between.z, p.z) && IsSame(between.w, p.w),
                "where the ends are too close the result is the first");
    Quaternion inPlace = q;
    Quaternion::Interpolate(p, inPlace, t, inPlace);
    Require(IsSame(inPlace.x, between.x) && IsSame(inPlace.y, between.y) && IsSame(inPlace.z, between.z) &&
                IsSame(inPlace.w, between.w),
            "the result may be one of the ends");
}

} // namespace

void FuzzSpace(Input& input)
{
    const double t = input.Parameter();
    const Quaternion p = ReadQuaternion(input);
    const Quaternion q = input.Flag() ? p : ReadQuaternion(input);
    CheckQuaternions(p, q, t);
    const MATRIX3D m = ReadMatrix(input);
    const POINT3D viewpoint = ReadPoint(input);
    CheckMatrix(m, viewpoint);
    std::vector<POINT3D> points(static_cast<std::size_t>(input.Choice(mostPoints + 1)));
    for (POINT3D& point : points)
        point = ReadPoint(input);
    CheckPoints(points, m, viewpoint);
}

} // namespace ZarnMath::Fuzzing
