#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

constexpr auto changedMatrix3 = [](Draft& draft) { return ChangedByPointer<MATRIX3D>{draft.in.Matrix3()}; };
constexpr auto matrix3 = [](Draft& draft) { return Pointed<MATRIX3D>{draft.in.Matrix3()}; };
constexpr auto quaternionByPointer = [](Draft& draft) { return Pointed<Quaternion>{draft.in.Quaternion()}; };

std::vector<POINT3D> DrawPoints3(Source& in, int count)
{
    std::vector<POINT3D> points;
    for (int i = 0; i < count; ++i)
        points.push_back(in.IntegerPoint3());
    return points;
}

void AddPointRuns(Family& family)
{
    family.AddWith<void(POINT3D*, const MATRIX3D*, int)>("MTHTransform3DPoints", MTHTransform3DPoints,
                                                         [](auto call, Source& in, Sink& out) {
                                                             const int count = in.Count(-1, 12);
                                                             std::vector<POINT3D> points = DrawPoints3(in, count);
                                                             const MATRIX3D transform = in.Matrix3();
                                                             call(points.data(), &transform, count);
                                                             out.Put(points);
                                                         });
    family.AddWith<int(const POINT3D*, POINT*, int, const POINT3D*)>(
        "MTHPerspective3DProjection", MTHPerspective3DProjection, [](auto call, Source& in, Sink& out) {
            const int count = in.Count(-1, 12);
            const std::vector<POINT3D> points = DrawPoints3(in, count);
            std::vector<POINT> images(points.size(), unwritten<POINT>);
            const POINT3D viewpoint = in.IntegerPoint3();
            out.Put(call(points.data(), images.data(), count, &viewpoint));
            out.Put(images);
        });
}

} // namespace

void AddWMath3D(std::vector<Function>& list)
{
    Family family(list, "WMath3D");
    family.Add<void(MATRIX3D*)>("MTHGet3DIdentityMatrix", MTHGet3DIdentityMatrix, writtenByPointer<MATRIX3D>);
    family.Add<void(MATRIX3D*, int, int, int)>("MTHTranslate3DMatrix", MTHTranslate3DMatrix, changedMatrix3, integer,
                                               integer, integer);
    AddPointRuns(family);
    family.Add<void(const Quaternion*, MATRIX3D*)>("VECT_QuaternionToMat", VECT_QuaternionToMat, quaternionByPointer,
                                                   writtenByPointer<MATRIX3D>);
    family.Add<void(const MATRIX3D*, Quaternion*)>("VECT_MatToQuaternion", VECT_MatToQuaternion, matrix3,
                                                   writtenByPointer<Quaternion>);
}

} // namespace ZarnMath::Catalogue
