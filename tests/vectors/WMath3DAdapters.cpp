#include "tests/vectors/Table.h"

#include "ZarnMath/Quaternion.h"
#include "ZarnMath/WMath3D.h"

#include <array>

namespace ZarnMath::Vectors {

static void Read(Input& in, MATRIX3D& matrix)
{
    for (auto& row : matrix.m)
        in.Into(row[0], row[1], row[2], row[3]);
}

static void Write(Output& out, const MATRIX3D& matrix)
{
    for (const auto& row : matrix.m)
        out.AddRun(row, 4);
}

static void Read(Input& in, POINT3D& p)
{
    in.Into(p.x, p.y, p.z);
}

static void Write(Output& out, const POINT3D& p)
{
    out.Add(p.x, p.y, p.z);
}

static void Read(Input& in, Quaternion& q)
{
    in.Into(q.x, q.y, q.z, q.w);
}

static void Write(Output& out, const Quaternion& q)
{
    out.Add(q.x, q.y, q.z, q.w);
}

namespace {

void Translate(Input& in, Output& out)
{
    auto matrix = in.Get<MATRIX3D>();
    const auto by = in.GetArray<int, 3>();
    MTHTranslate3DMatrix(&matrix, by[0], by[1], by[2]);
    out.Add(matrix);
}

void Transform(Input& in, Output& out)
{
    auto points = in.GetVector<POINT3D>();
    const auto matrix = in.Get<MATRIX3D>();
    MTHTransform3DPoints(points.data(), &matrix, in.Get<int>());
    out.AddVector(points);
    out.Add(matrix);
}

void Project(Input& in, Output& out)
{
    const auto points = in.GetVector<POINT3D>();
    const int count = in.Get<int>();
    const auto viewpoint = in.Get<POINT3D>();
    std::vector<POINT> images(points.size(), POINT{-77777, 777});
    out.Add(MTHPerspective3DProjection(points.data(), images.data(), count, &viewpoint));
    out.AddVector(images);
    out.AddVector(points);
}

void AddRotation(Table& table, const std::string& name, void (Quaternion::*rotate)(vector3dT<double>&) const noexcept)
{
    table.Add("Quaternion::" + name, [rotate](Input& in, Output& out) {
        const auto q = in.Get<Quaternion>();
        auto v = in.Get<vector3dT<double>>();
        (q.*rotate)(v);
        out.Add(v, q);
    });
}

void CreateRotation(Input& in, Output& out)
{
    auto q = in.Get<Quaternion>();
    const auto a = in.Get<vector3dT<double>>();
    q.RotationCreate(a, in.Get<vector3dT<double>>());
    out.Add(q);
}

void InterpolateQuaternions(Input& in, Output& out)
{
    const auto a = in.Get<Quaternion>();
    const auto b = in.Get<Quaternion>();
    const double t = in.Get<double>();
    auto between = in.Get<Quaternion>();
    const bool result = Quaternion::Interpolate(a, b, t, between);
    out.Add(result, between);
}

/// One of the two bridges: what it reads, what it writes into, and after the call both.
template <typename From, typename To>
void AddBridge(Table& table, const std::string& name, void (*convert)(const From*, To*))
{
    table.Add(name, [convert](Input& in, Output& out) {
        const auto from = in.Get<From>();
        auto to = in.Get<To>();
        convert(&from, &to);
        out.Add(to, from);
    });
}

} // namespace

void AddWMath3DAdapters(Table& table)
{
    table.Add("MTHGet3DIdentityMatrix", [](Input& in, Output& out) {
        auto matrix = in.Get<MATRIX3D>();
        MTHGet3DIdentityMatrix(&matrix);
        out.Add(matrix);
    });
    table.Add("MTHTranslate3DMatrix", Translate);
    table.Add("MTHTransform3DPoints", Transform);
    table.Add("MTHPerspective3DProjection", Project);
    table.Add("Quaternion::operator*", [](Input& in, Output& out) {
        const auto a = in.Get<Quaternion>();
        out.Add(a * in.Get<Quaternion>());
    });
    AddRotation(table, "Rotate", &Quaternion::Rotate);
    AddRotation(table, "RotateQuick", &Quaternion::RotateQuick);
    table.Add("Quaternion::RotationCreate", CreateRotation);
    table.Add("Quaternion::ForceZeros", [](Input& in, Output& out) {
        auto q = in.Get<Quaternion>();
        q.ForceZeros();
        out.Add(q);
    });
    table.Add("Quaternion::Interpolate", InterpolateQuaternions, {Platform::Acos, Platform::Sin});
    AddBridge<Quaternion, MATRIX3D>(table, "VECT_QuaternionToMat", VECT_QuaternionToMat);
    AddBridge<MATRIX3D, Quaternion>(table, "VECT_MatToQuaternion", VECT_MatToQuaternion);
}

} // namespace ZarnMath::Vectors
