#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

const std::set<Platform> turns = {Platform::Sin, Platform::Cos};
const std::set<Platform> measuredTurns = {Platform::Sin, Platform::Cos, Platform::Acos};

/// A function from arguments of these types to a matrix or a vector.
template <typename Result, typename... Arguments>
void AddConstructor(Table& table, const std::string& name, Result (*construct)(Arguments...) noexcept,
                    std::set<Platform> uses = {})
{
    const auto adapter = [construct](Input& in, Output& out) {
        std::tuple<std::remove_cvref_t<Arguments>...> arguments;
        std::apply([&](auto&... each) { in.Into(each...); }, arguments);
        out.Add(std::apply(construct, arguments));
    };
    table.Add(name, adapter, std::move(uses));
}

/// The sign of a zero in the linear part is not recorded.
void TransformAround(Input& in, Output& out)
{
    const MATRIX t = in.Get<MATRIX>();
    MATRIX m = ConstructTransformAroundMatrix(t, in.Get<point2d>());
    for (double* field : {&m.m11, &m.m12, &m.m21, &m.m22})
        *field += 0.0;
    out.Add(m);
}

} // namespace

void AddConstructorsAdapters(Table& table)
{
    AddConstructor(table, "IdentityMatrix", IdentityMatrix);
    AddConstructor(table, "SwapXYMatrix", SwapXYMatrix);
    AddConstructor(table, "ConstructMatrix", ConstructMatrix);
    AddConstructor(table, "ConstructTranslationMatrix", ConstructTranslationMatrix);
    AddConstructor(table, "ConstructRotationMatrix", ConstructRotationMatrix, turns);
    AddConstructor(table, "ConstructScaledRotationMatrix", ConstructScaledRotationMatrix, turns);
    AddConstructor(table, "ConstructRotateAroundMatrix", ConstructRotateAroundMatrix, turns);
    AddConstructor(table, "ConstructScaleAroundMatrix", ConstructScaleAroundMatrix);
    AddConstructor(table, "ConstructSkewAroundMatrix", ConstructSkewAroundMatrix, {Platform::Tan});
    table.Add("ConstructTransformAroundMatrix", TransformAround);
    AddConstructor(table, "ConstructVectorTransformMatrix", ConstructVectorTransformMatrix, measuredTurns);
    AddConstructor(table, "ConstructLineSegmentTransformMatrix", ConstructLineSegmentTransformMatrix, measuredTurns);
    AddConstructor(table, "ConstructBBoxScaleMatrix", ConstructBBoxScaleMatrix);
    AddConstructor(table, "ConstructRectTransformMatrix", ConstructRectTransformMatrix);
    AddConstructor(table, "GetScaleForSizeTransform", GetScaleForSizeTransform);
}

} // namespace ZarnMath::Vectors
