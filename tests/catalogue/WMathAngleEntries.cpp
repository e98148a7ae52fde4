// Angles in their three units.
#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using Point = const point2d&;
using Vector = const vector2d&;

void AddRadians(Family& family)
{
    family.Add<double(double)>("Radians::NormalizeAngle", Radians::NormalizeAngle, radians);
    family.Add<double(double)>("Radians::NormalizeFineAngle", Radians::NormalizeFineAngle, radians);
    family.Add<double(double, int, double)>("Radians::Constrain", Radians::Constrain, radians, integer, radians);
    family.Add<int(double)>("Radians::GetQuadrant", Radians::GetQuadrant, radians);
    family.Set(NumberClass::Platform);
    family.Add<vector2d(double)>("Radians::AngleToVector", Radians::AngleToVector, radians);
    family.Add<vector2d(double, double)>("Radians::AngleToVector", Radians::AngleToVector, radians, distance);
    family.Add<double(Vector)>("Radians::VectorToAngle", Radians::VectorToAngle, vector);
    family.Add<double(Vector, Vector)>("Radians::GetAngle", Radians::GetAngle, vector, vector);
    family.Add<double(Point, Point, Point)>("Radians::GetAngle", Radians::GetAngle, point<>, point<>, point<>);
    family.Add<double(Vector, Vector)>("Radians::GetFineAngle", Radians::GetFineAngle, vector, vector);
    family.Add<point2d(Point, double, Point)>("Radians::RotatePoint", Radians::RotatePoint, point<>, radians, point<>);
    family.Add<void(POINT*, unsigned long, double, Point)>("Radians::RotatePoints", Radians::RotatePoints,
                                                           changedPoints<POINT>, countOfPoints<unsigned long>, radians,
                                                           point<>);
    family.Set(NumberClass::Arithmetic);
}

void AddDegrees(Family& family)
{
    family.Add<double(double)>("Degrees::NormalizeAngle", Degrees::NormalizeAngle, degrees);
    family.Set(NumberClass::Platform);
    family.Add<vector2d(double)>("Degrees::AngleToVector", Degrees::AngleToVector, degrees);
    family.Add<vector2d(double, double)>("Degrees::AngleToVector", Degrees::AngleToVector, degrees, distance);
    family.Add<double(Vector)>("Degrees::VectorToAngle", Degrees::VectorToAngle, vector);
    family.Add<double(Vector, Vector)>("Degrees::GetAngle", Degrees::GetAngle, vector, vector);
    family.Add<double(Point, Point, Point)>("Degrees::GetAngle", Degrees::GetAngle, point<>, point<>, point<>);
    family.Add<double(Vector, Vector)>("Degrees::GetFineAngle", Degrees::GetFineAngle, vector, vector);
    family.Add<point2d(Point, double, Point)>("Degrees::RotatePoint", Degrees::RotatePoint, point<>, degrees, point<>);
    family.Add<SIZE(const SIZE&, double)>(
        "Degrees::GetRotatedSize", Degrees::GetRotatedSize, [](Draft& draft) { return Given<SIZE>{draft.in.Size()}; },
        degrees);
    family.Add<void(POINT*, unsigned long, double, Point)>("Degrees::RotatePoints", Degrees::RotatePoints,
                                                           changedPoints<POINT>, countOfPoints<unsigned long>, degrees,
                                                           point<>);
    family.Set(NumberClass::Arithmetic);
}

void AddFineDegrees(Family& family)
{
    family.Add<int(int)>("KELDANGLE::NormalizeAngle", KELDANGLE::NormalizeAngle, fineDegrees);
    family.Set(NumberClass::Platform);
    family.Add<int(Vector)>("KELDANGLE::VectorToAngle", KELDANGLE::VectorToAngle, vector);
    family.Add<int(Point, Point, Point)>("KELDANGLE::GetAngle", KELDANGLE::GetAngle, point<>, point<>, point<>);
    family.Add<int(Point, Point, Point)>("KELDANGLE::GetFineAngle", KELDANGLE::GetFineAngle, point<>, point<>, point<>);
}

} // namespace

void AddWMathAngles(std::vector<Function>& list)
{
    Family family(list, "WMath");
    AddRadians(family);
    AddDegrees(family);
    AddFineDegrees(family);
}

} // namespace ZarnMath::Catalogue
