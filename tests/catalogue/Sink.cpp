#include "tests/catalogue/Sink.h"

namespace ZarnMath::Catalogue {

void Sink::Put(const vector3dT<double>& value)
{
    Put(value.x);
    Put(value.y);
    Put(value.z);
}

void Sink::Put(const POINT& value)
{
    Put(value.x);
    Put(value.y);
}

void Sink::Put(const SIZE& value)
{
    Put(value.cx);
    Put(value.cy);
}

void Sink::Put(const RECT& value)
{
    Put(value.left);
    Put(value.top);
    Put(value.right);
    Put(value.bottom);
}

void Sink::Put(const BoundsT<double>& value)
{
    Put(value.left);
    Put(value.top);
    Put(value.right);
    Put(value.bottom);
}

void Sink::Put(const MATRIX& value)
{
    Put(value.m11);
    Put(value.m12);
    Put(value.dx);
    Put(value.m21);
    Put(value.m22);
    Put(value.dy);
}

void Sink::Put(const MATRIX3D& value)
{
    for (const auto& row : value.m)
        for (const std::int32_t element : row)
            Put(element);
}

void Sink::Put(const POINT3D& value)
{
    Put(value.x);
    Put(value.y);
    Put(value.z);
}

void Sink::Put(const Quaternion& value)
{
    Put(value.x);
    Put(value.y);
    Put(value.z);
    Put(value.w);
}

void Sink::Put(const AFF_TRANSFORM& value)
{
    Put(value.scaleX);
    Put(value.scaleY);
    Put(value.skew);
    Put(value.rotation);
    Put(value.translation);
}

void Sink::Put(const CubicBezier::bezier2dT<point2d>& value)
{
    for (const point2d& point : value.points)
        Put(point);
}

void Sink::Put(const VectorField& value)
{
    Put(value.width);
    Put(value.height);
    Put(value.originX);
    Put(value.originY);
    Size(value.rows.size());
    for (const VectorField::Row& row : value.rows) {
        Size(row.length);
        for (std::uint64_t i = 0; i < row.length; ++i)
            Put(row[i]);
    }
}

} // namespace ZarnMath::Catalogue
