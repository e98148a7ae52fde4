/// @file
/// The whole state of interval vectors and vector fields.
#pragma once

#include "ZarnMath/VectorField.h"
#include "tests/vectors/Vectors.h"

namespace ZarnMath::Vectors {

template <typename T>
ZarnUtils::interval_vector<T> ReadIntervalVector(Input& in)
{
    ZarnUtils::interval_vector<T> v(in.Get<T>(), 0);
    in.Into(v.start, v.end, v.length);
    v.data = in.GetVector<T>();
    return v;
}

template <typename T>
void Write(Output& out, const ZarnUtils::interval_vector<T>& v)
{
    out.Add(v.fill, v.start, v.end, v.length);
    out.AddVector(v.data);
}

inline void Read(Input& in, VectorField& field)
{
    in.Into(field.width, field.height, field.originX, field.originY);
    const auto count = in.Get<std::uint32_t>();
    field.rows.clear();
    for (std::uint32_t i = 0; i < count; ++i)
        field.rows.push_back(ReadIntervalVector<vector2dT<float, false>>(in));
}

inline void Write(Output& out, const VectorField& field)
{
    out.Add(field.width, field.height, field.originX, field.originY);
    out.AddVector(field.rows);
}

} // namespace ZarnMath::Vectors
