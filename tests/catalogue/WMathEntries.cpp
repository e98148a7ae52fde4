// The matrix: its members, the plain-C family, comparison, decomposition and construction.
#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using Point = const point2d&;
using Vector = const vector2d&;
using Bounded = const BoundsT<double>&;
using Matrix = const MATRIX&;

constexpr auto parts = [](Draft& draft) {
    Source& in = draft.in;
    return Given<AFF_TRANSFORM>{{in.Distance(), in.Distance(), in.Number(), in.Angle(6.283185307179586), in.Point()}};
};
constexpr auto mode = count<-1, 3, MapMode>;

void AddSteps(Family& family)
{
    family.AddMember<MATRIX, point2d(Point) const>("MATRIX::operator()", &MATRIX::operator(), matrix, point<>);
    family.AddMember<MATRIX, vector2d(Vector) const>("MATRIX::operator()", &MATRIX::operator(), matrix, vector);
    family.AddMember<MATRIX, MATRIX(Matrix) const>("MATRIX::operator*", &MATRIX::operator*, matrix, matrix);
    family.AddMember<MATRIX, void(Matrix, Point)>("MATRIX::TransformAroundPoint", &MATRIX::TransformAroundPoint,
                                                  changedMatrix, matrix, point<>);
    family.AddMember<MATRIX, void(Vector)>("MATRIX::ScaleMatrix", &MATRIX::ScaleMatrix, changedMatrix, vector);
    family.AddMember<MATRIX, void(Vector, Point)>("MATRIX::ScaleMatrix", &MATRIX::ScaleMatrix, changedMatrix, vector,
                                                  point<>);
    family.AddMember<MATRIX, void()>("MATRIX::RemoveScaling", &MATRIX::RemoveScaling, changedMatrix);
    family.AddMember<MATRIX, bool(double)>("MATRIX::Invert", &MATRIX::Invert, changedMatrix, tolerance);
    family.AddMember<MATRIX, vector2d(Vector) const>("MATRIX::GetUntransformedVector", &MATRIX::GetUntransformedVector,
                                                     matrix, vector);
    family.AddMember<MATRIX, void(POINT*, unsigned long) const>("MATRIX::TransformPoints", &MATRIX::TransformPoints,
                                                                matrix, changedPoints<POINT>,
                                                                countOfPoints<unsigned long>);
    family.AddMember<MATRIX, void(point2d*, unsigned long) const>("MATRIX::TransformPoints", &MATRIX::TransformPoints,
                                                                  matrix, changedPoints<point2d>,
                                                                  countOfPoints<unsigned long>);
    family.AddMember<MATRIX, void(POINT*, unsigned long) const>("MATRIX::TransformPointsWithRangeCheck",
                                                                &MATRIX::TransformPointsWithRangeCheck, matrix,
                                                                changedPoints<POINT>, countOfPoints<unsigned long>);
    family.Set(NumberClass::Platform);
    family.AddMember<MATRIX, void(double)>("MATRIX::Rotate", &MATRIX::Rotate, changedMatrix, radians);
    family.AddMember<MATRIX, void(double, Point)>("MATRIX::RotateAroundPoint", &MATRIX::RotateAroundPoint,
                                                  changedMatrix, radians, point<>);
    family.AddMember<MATRIX, double(double) const>("MATRIX::GetTransformedRadians", &MATRIX::GetTransformedRadians,
                                                   matrix, radians);
    family.AddMember<MATRIX, double(double) const>("MATRIX::GetUntransformedRadians", &MATRIX::GetUntransformedRadians,
                                                   matrix, radians);
    family.Set(NumberClass::Arithmetic);
}

void AddClassification(Family& family)
{
    family.AddMember<MATRIX, bool(bool, double) const>("MATRIX::IsIdentity", &MATRIX::IsIdentity, matrix, flag,
                                                       tolerance);
    family.AddMember<MATRIX, bool() const>("MATRIX::IsMirrored", &MATRIX::IsMirrored, matrix);
    family.AddMember<MATRIX, double() const>("MATRIX::GetMaximumMatrixVectorScale",
                                             &MATRIX::GetMaximumMatrixVectorScale, matrix);
    family.AddMember<MATRIX, bool(point2d&)>("MATRIX::GetCenterOfTransformation", &MATRIX::GetCenterOfTransformation,
                                             changedMatrix, written<point2d>);
    family.AddMember<MATRIX, bool(point2d&, point2d&)>("MATRIX::GetLineOfTransformation",
                                                       &MATRIX::GetLineOfTransformation, changedMatrix,
                                                       written<point2d>, written<point2d>);
    const auto add = [&family](const char* name, bool (MATRIX::*member)(double) const) {
        family.AddMember<MATRIX, bool(double) const>(name, member, matrix, tolerance);
    };
    add("MATRIX::IsSkewedOrRotated", &MATRIX::IsSkewedOrRotated);
    add("MATRIX::IsSkewedOrRotatedOrMirrored", &MATRIX::IsSkewedOrRotatedOrMirrored);
    add("MATRIX::IsScaledOrSkewedOrRotated", &MATRIX::IsScaledOrSkewedOrRotated);
    add("MATRIX::IsNonUniformScaledOrSkewedOrRotated", &MATRIX::IsNonUniformScaledOrSkewedOrRotated);
    add("MATRIX::IsScaled", &MATRIX::IsScaled);
    add("MATRIX::IsOrthogonal", &MATRIX::IsOrthogonal);
    add("MATRIX::IsOrthonormal", &MATRIX::IsOrthonormal);
    add("MATRIX::IsUniformOrthogonal", &MATRIX::IsUniformOrthogonal);
    add("MATRIX::IsOrthonormalAxisAligned", &MATRIX::IsOrthonormalAxisAligned);
    family.Add<bool(Matrix, Matrix, double)>("IsEqual", IsEqual, matrix, matrix, tolerance);
    family.Add<bool(Matrix, double)>("IsZero", IsZero, matrix, tolerance);
}

void AddPlainC(Family& family)
{
    constexpr auto changed = changedMatrixByPointer;
    family.Add<void(MATRIX*)>("UTLGetIdentityMatrix", UTLGetIdentityMatrix, writtenByPointer<MATRIX>);
    family.Add<void(MATRIX*, int, int)>("UTLTranslateMatrix", UTLTranslateMatrix, changed, integer, integer);
    family.Add<void(MATRIX*, int, int, double, double)>("UTLStretchMatrix", UTLStretchMatrix, changed, integer, integer,
                                                        number, number);
    family.AddWith<void(POINT*, const MATRIX*, std::int64_t)>("UTLTransformPoint", UTLTransformPoint,
                                                              [](auto call, Source& in, Sink& out) {
                                                                  const int count = in.Count(-1, 12);
                                                                  std::vector<POINT> points = in.IntegerPoints(count);
                                                                  const MATRIX transform = in.Matrix();
                                                                  call(points.data(), &transform, count);
                                                                  out.Put(points);
                                                              });
    family.Set(NumberClass::Platform);
    family.Add<void(MATRIX*, int)>("UTLRotateMatrix", UTLRotateMatrix, changed, fineDegrees);
    family.Add<void(MATRIX*, int, int, int)>("UTLRotateMatrixAround", UTLRotateMatrixAround, changed, fineDegrees,
                                             integer, integer);
    family.Add<void(MATRIX*, int, int, int, int)>("UTLSkewMatrix", UTLSkewMatrix, changed, fineDegrees, fineDegrees,
                                                  integer, integer);
    family.Set(NumberClass::Arithmetic);
}

void AddDecomposition(Family& family)
{
    family.Set(NumberClass::Platform);
    family.Add<bool(AFF_TRANSFORM&, Matrix)>("DecomposeAffineTransform", DecomposeAffineTransform,
                                             written<AFF_TRANSFORM>, matrix);
    family.Add<bool(AFF_TRANSFORM&, Point, Vector, Vector)>("DecomposeAffineTransformFromVectors",
                                                            DecomposeAffineTransformFromVectors, written<AFF_TRANSFORM>,
                                                            point<>, vector, vector);
    family.Add<bool(MATRIX&, const AFF_TRANSFORM&)>("ComposeAffineTransform", ComposeAffineTransform, written<MATRIX>,
                                                    parts);
    family.Add<MATRIX(Matrix, Matrix, vector2d&)>("TransformMatrixAndSeparateScale", TransformMatrixAndSeparateScale,
                                                  matrix, matrix, written<vector2d>);
    family.Set(NumberClass::Arithmetic);
}

void AddConstructors(Family& family)
{
    family.Add<MATRIX()>("IdentityMatrix", IdentityMatrix);
    family.Add<MATRIX()>("SwapXYMatrix", SwapXYMatrix);
    family.Add<MATRIX(Vector, Vector, Vector)>("ConstructMatrix", ConstructMatrix, vector, vector, vector);
    family.Add<MATRIX(Vector)>("ConstructTranslationMatrix", ConstructTranslationMatrix, vector);
    family.Add<MATRIX(double, double, Point)>("ConstructScaleAroundMatrix", ConstructScaleAroundMatrix, number, number,
                                              point<>);
    family.Add<MATRIX(Matrix, Point)>("ConstructTransformAroundMatrix", ConstructTransformAroundMatrix, matrix,
                                      point<>);
    family.Add<MATRIX(Bounded, bool)>("ConstructBBoxScaleMatrix", ConstructBBoxScaleMatrix, bounds, flag);
    family.Add<MATRIX(Bounded, Bounded, MapMode)>("ConstructRectTransformMatrix", ConstructRectTransformMatrix, bounds,
                                                  bounds, mode);
    family.Add<vector2d(Vector, Vector, MapMode)>("GetScaleForSizeTransform", GetScaleForSizeTransform, vector, vector,
                                                  mode);
    family.Add<void(point2d*, unsigned long, Point)>("TranslatePoints", TranslatePoints, changedPoints<point2d>,
                                                     countOfPoints<unsigned long>, point<>);
    family.Add<void(POINT*, unsigned long, const POINT&)>("TranslatePoints", TranslatePoints, changedPoints<POINT>,
                                                          countOfPoints<unsigned long>, point<POINT>);
    family.Set(NumberClass::Platform);
    family.Add<MATRIX(double)>("ConstructRotationMatrix", ConstructRotationMatrix, radians);
    family.Add<MATRIX(double, double, double)>("ConstructScaledRotationMatrix", ConstructScaledRotationMatrix, number,
                                               number, radians);
    family.Add<MATRIX(double, Point)>("ConstructRotateAroundMatrix", ConstructRotateAroundMatrix, radians, point<>);
    family.Add<MATRIX(double, double, Point)>("ConstructSkewAroundMatrix", ConstructSkewAroundMatrix, radians, radians,
                                              point<>);
    family.Add<MATRIX(Vector, Vector)>("ConstructVectorTransformMatrix", ConstructVectorTransformMatrix, vector,
                                       vector);
    family.Add<MATRIX(Point, Point, Point, Point)>(
        "ConstructLineSegmentTransformMatrix", ConstructLineSegmentTransformMatrix, point<>, point<>, point<>, point<>);
    family.Set(NumberClass::Arithmetic);
}

} // namespace

void AddWMath(std::vector<Function>& list)
{
    Family family(list, "WMath");
    AddSteps(family);
    AddClassification(family);
    AddPlainC(family);
    AddDecomposition(family);
    AddConstructors(family);
}

} // namespace ZarnMath::Catalogue
