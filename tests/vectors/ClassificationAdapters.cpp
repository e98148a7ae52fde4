#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

void AddPredicate(Table& table, const std::string& name, bool (MATRIX::*predicate)(double) const noexcept)
{
    table.Add("MATRIX::" + name, [predicate](Input& in, Output& out) {
        const MATRIX m = in.Get<MATRIX>();
        out.Add((m.*predicate)(in.Get<double>()));
    });
}

void CenterOfTransformation(Input& in, Output& out)
{
    MATRIX m = in.Get<MATRIX>();
    point2d centre = in.Get<point2d>();
    const bool result = m.GetCenterOfTransformation(centre);
    out.Add(result, centre, m);
}

void LineOfTransformation(Input& in, Output& out)
{
    MATRIX m = in.Get<MATRIX>();
    point2d p0 = in.Get<point2d>();
    point2d p1 = in.Get<point2d>();
    const bool result = m.GetLineOfTransformation(p0, p1);
    out.Add(result, p0, p1, m);
}

} // namespace

void AddClassificationAdapters(Table& table)
{
    AddPredicate(table, "IsSkewedOrRotatedOrMirrored", &MATRIX::IsSkewedOrRotatedOrMirrored);
    AddPredicate(table, "IsSkewedOrRotated", &MATRIX::IsSkewedOrRotated);
    AddPredicate(table, "IsScaledOrSkewedOrRotated", &MATRIX::IsScaledOrSkewedOrRotated);
    AddPredicate(table, "IsScaled", &MATRIX::IsScaled);
    AddPredicate(table, "IsNonUniformScaledOrSkewedOrRotated", &MATRIX::IsNonUniformScaledOrSkewedOrRotated);
    AddPredicate(table, "IsOrthogonal", &MATRIX::IsOrthogonal);
    AddPredicate(table, "IsOrthonormal", &MATRIX::IsOrthonormal);
    AddPredicate(table, "IsUniformOrthogonal", &MATRIX::IsUniformOrthogonal);
    AddPredicate(table, "IsOrthonormalAxisAligned", &MATRIX::IsOrthonormalAxisAligned);
    table.Add("MATRIX::IsMirrored", [](Input& in, Output& out) { out.Add(in.Get<MATRIX>().IsMirrored()); });
    table.Add("IsZero", [](Input& in, Output& out) {
        const MATRIX m = in.Get<MATRIX>();
        out.Add(IsZero(m, in.Get<double>()));
    });
    table.Add("MATRIX::GetMaximumMatrixVectorScale",
              [](Input& in, Output& out) { out.Add(in.Get<MATRIX>().GetMaximumMatrixVectorScale()); });
    table.Add("MATRIX::GetCenterOfTransformation", CenterOfTransformation);
    table.Add("MATRIX::GetLineOfTransformation", LineOfTransformation);
}

} // namespace ZarnMath::Vectors
