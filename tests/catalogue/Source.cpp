#include "tests/catalogue/Source.h"

namespace ZarnMath::Catalogue {

Coefficients ToPowerForm(const CurveOf<point2d>& curve) noexcept
{
    const auto& [p0, p1, p2, p3] = curve;
    return {{p3.x - (p2.x - p1.x) * 3.0 - p0.x, p3.y - (p2.y - p1.y) * 3.0 - p0.y},
            {(p0.x + (p2.x - (p1.x + p1.x))) * 3.0, (p0.y + (p2.y - (p1.y + p1.y))) * 3.0},
            {(p1.x - p0.x) * 3.0, (p1.y - p0.y) * 3.0},
            p0};
}

double Source::Coordinate()
{
    return Number();
}

double Source::Parameter()
{
    return Number();
}

double Source::Angle(double)
{
    return Number();
}

std::int32_t Source::IntegerAngle()
{
    return Integer();
}

double Source::Tolerance()
{
    return Number();
}

double Source::Distance()
{
    return Number();
}

// Braces, unlike the arguments of a call, are evaluated in order.

point2d Source::Point()
{
    return {Coordinate(), Coordinate()};
}

POINT Source::IntegerPoint()
{
    return {Integer(), Integer()};
}

vector2d Source::Vector()
{
    return {Coordinate(), Coordinate()};
}

vector3dT<double> Source::Vector3()
{
    return {Coordinate(), Coordinate(), Coordinate()};
}

POINT3D Source::IntegerPoint3()
{
    return {Integer(), Integer(), Integer()};
}

SIZE Source::Size()
{
    return {Integer(), Integer()};
}

RECT Source::Rect()
{
    return {Integer(), Integer(), Integer(), Integer()};
}

BoundsT<double> Source::Bounds()
{
    return {Coordinate(), Coordinate(), Coordinate(), Coordinate()};
}

MATRIX Source::Matrix()
{
    return {Number(), Number(), Number(), Number(), Number(), Number()};
}

MATRIX3D Source::Matrix3()
{
    MATRIX3D m{};
    for (auto& row : m.m)
        for (std::int32_t& element : row)
            element = Integer();
    return m;
}

Quaternion Source::Quaternion()
{
    return {Number(), Number(), Number(), Number()};
}

CurveOf<point2d> Source::Cubic()
{
    return {Point(), Point(), Point(), Point()};
}

CurveOf<POINT> Source::IntegerCubic()
{
    return {IntegerPoint(), IntegerPoint(), IntegerPoint(), IntegerPoint()};
}

Coefficients Source::PowerForm()
{
    return ToPowerForm(Cubic());
}

std::vector<point2d> Source::Points(int count)
{
    std::vector<point2d> points;
    for (int i = 0; i < count; ++i)
        points.push_back(Point());
    return points;
}

std::vector<POINT> Source::IntegerPoints(int count)
{
    std::vector<POINT> points;
    for (int i = 0; i < count; ++i)
        points.push_back(IntegerPoint());
    return points;
}

} // namespace ZarnMath::Catalogue
