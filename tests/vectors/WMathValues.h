/// @file
/// Matrices and their parts as recorded values.
#pragma once

#include "tests/vectors/Table.h"

#include "ZarnMath/WMath.h"

namespace ZarnMath::Vectors {

inline void Read(Input& in, MATRIX& m)
{
    in.Into(m.m11, m.m12, m.dx, m.m21, m.m22, m.dy);
}

inline void Write(Output& out, const MATRIX& m)
{
    out.Add(m.m11, m.m12, m.dx, m.m21, m.m22, m.dy);
}

inline void Read(Input& in, AFF_TRANSFORM& a)
{
    in.Into(a.scaleX, a.scaleY, a.skew, a.rotation, a.translation);
}

inline void Write(Output& out, const AFF_TRANSFORM& a)
{
    out.Add(a.scaleX, a.scaleY, a.skew, a.rotation, a.translation);
}

} // namespace ZarnMath::Vectors
