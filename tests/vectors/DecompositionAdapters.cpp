#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

const std::set<Platform> composes = {Platform::Sin, Platform::Cos};
const std::set<Platform> decomposes = {Platform::Sin, Platform::Cos, Platform::Tan, Platform::Acos, Platform::Atan2};

void DecomposeVectors(Input& in, Output& out)
{
    AFF_TRANSFORM parts = in.Get<AFF_TRANSFORM>();
    const point2d origin = in.Get<point2d>();
    const vector2d x = in.Get<vector2d>();
    const bool result = DecomposeAffineTransformFromVectors(parts, origin, x, in.Get<vector2d>());
    out.Add(result, parts);
}

void DecomposeMatrix(Input& in, Output& out)
{
    AFF_TRANSFORM parts = in.Get<AFF_TRANSFORM>();
    const bool result = DecomposeAffineTransform(parts, in.Get<MATRIX>());
    out.Add(result, parts);
}

void Compose(Input& in, Output& out)
{
    MATRIX m = in.Get<MATRIX>();
    const bool result = ComposeAffineTransform(m, in.Get<AFF_TRANSFORM>());
    out.Add(result, m);
}

void SeparateScale(Input& in, Output& out)
{
    const MATRIX first = in.Get<MATRIX>();
    const MATRIX then = in.Get<MATRIX>();
    vector2d scale = in.Get<vector2d>();
    const MATRIX m = TransformMatrixAndSeparateScale(first, then, scale);
    out.Add(m, scale);
}

} // namespace

void AddDecompositionAdapters(Table& table)
{
    table.Add("DecomposeAffineTransformFromVectors", DecomposeVectors, decomposes);
    table.Add("DecomposeAffineTransform", DecomposeMatrix, decomposes);
    table.Add("ComposeAffineTransform", Compose, composes);
    table.Add("TransformMatrixAndSeparateScale", SeparateScale, decomposes);
}

} // namespace ZarnMath::Vectors
