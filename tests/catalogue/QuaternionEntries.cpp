#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

constexpr auto vector3 = [](Draft& draft) { return Given<vector3dT<double>>{draft.in.Vector3()}; };
constexpr auto changedVector3 = [](Draft& draft) { return Changed<vector3dT<double>>{draft.in.Vector3()}; };

} // namespace

void AddQuaternion(std::vector<Function>& list)
{
    using Vector = vector3dT<double>;
    using Unit = const Quaternion&;
    Family family(list, "Quaternion");
    family.AddMember<Quaternion, Quaternion(Unit) const>("Quaternion::operator*", &Quaternion::operator*, quaternion,
                                                         quaternion);
    family.AddMember<Quaternion, void(Vector&) const>("Quaternion::RotateQuick", &Quaternion::RotateQuick, quaternion,
                                                      changedVector3);
    family.AddMember<Quaternion, void(Vector&) const>("Quaternion::Rotate", &Quaternion::Rotate, quaternion,
                                                      changedVector3);
    family.AddMember<Quaternion, void(const Vector&, const Vector&)>(
        "Quaternion::RotationCreate", &Quaternion::RotationCreate, written<Quaternion>, vector3, vector3);
    family.AddMember<Quaternion, void()>("Quaternion::ForceZeros", &Quaternion::ForceZeros, changedQuaternion);
    family.Set(NumberClass::Platform);
    family.Add<bool(Unit, Unit, double, Quaternion&)>("Quaternion::Interpolate", Quaternion::Interpolate, quaternion,
                                                      quaternion, parameter, written<Quaternion>);
}

} // namespace ZarnMath::Catalogue
