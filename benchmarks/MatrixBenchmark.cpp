// Matrices: applied, combined, classified, taken apart and made. The shears, turns and mirrors of the corpus are invertible.

#include "ZarnMath/Bounds.h"
#include "ZarnMath/Circle.h"
#include "ZarnMath/WMath.h"
#include "benchmarks/Inputs.h"

namespace ZarnMath::Benchmarks {
namespace {

const auto matrices = Inputs([](RandomSource& random) {
    MATRIX m =
        ConstructScaledRotationMatrix(random.Uniform(0.2, 3.0), random.Uniform(-3.0, -0.2), random.Uniform(-3.0, 3.0));
    m.m12 += random.Uniform(0.0, 0.1);
    m.dx = random.Uniform(-1000.0, 1000.0);
    return m;
});
const std::vector<MATRIX> otherMatrices(matrices.rbegin(), matrices.rend());
const auto parts = Inputs([](RandomSource& random) {
    return AFF_TRANSFORM{random.Uniform(0.2, 3.0), random.Uniform(0.2, 3.0), random.Uniform(-1.0, 1.0),
                         random.Uniform(-3.0, 3.0), random.Point(1000.0)};
});
const auto angles = Inputs([](RandomSource& random) { return random.Uniform(-10.0, 10.0); });
const auto millionths = Inputs([](RandomSource& random) { return random.Integer(-60000000, 60000000); });
const auto points = Inputs([](RandomSource& random) { return random.Point(1000.0); });
const auto vectors = Inputs([](RandomSource& random) { return AsVector(random.Point(1000.0)); });
const std::vector<point2d> otherPoints(points.rbegin(), points.rend());
const std::vector<vector2d> otherVectors(vectors.rbegin(), vectors.rend());
const auto boxes = Inputs([](RandomSource& random) {
    const point2d corners[] = {random.Point(1000.0), random.Point(1000.0)};
    return GetPointsBBox(corners, 2);
});
const std::vector<BoundsT<double>> otherBoxes(boxes.rbegin(), boxes.rend());
const auto rectangles = Inputs([](RandomSource& random) {
    const POINT corners[] = {random.IntegerPoint(1000), random.IntegerPoint(1000)};
    return GetPointsBBox(corners, 2);
});

constexpr point2d centre{512.25, -300.5};
constexpr double tolerance = 1e-09;

void AddSteps()
{
    Add(
        "MATRIX()(point2d)", [](auto& m, auto& p) { return m(p); }, matrices, points);
    Add(
        "MATRIX()(vector2d)", [](auto& m, auto& v) { return m(v); }, matrices, vectors);
    Add(
        "MATRIX*MATRIX", [](auto& m, auto& n) { return m * n; }, matrices, otherMatrices);
    Add("MATRIX::Rotate", Changing([](MATRIX& m, double a) { m.Rotate(a); }), matrices, angles);
    Add("MATRIX::RotateAroundPoint", Changing([](MATRIX& m, double a) { m.RotateAroundPoint(a, centre); }), matrices,
        angles);
    Add("MATRIX::TransformAroundPoint", Changing([](MATRIX& m, auto& n) { m.TransformAroundPoint(n, centre); }),
        matrices, otherMatrices);
    Add("MATRIX::ScaleMatrix", Changing([](MATRIX& m, auto& v) { m.ScaleMatrix(v); }), matrices, vectors);
    Add("MATRIX::ScaleMatrix about a point", Changing([](MATRIX& m, auto& v) { m.ScaleMatrix(v, centre); }), matrices,
        vectors);
    Add("MATRIX::RemoveScaling", Changing([](MATRIX& m) { m.RemoveScaling(); }), matrices);
    Add("MATRIX::Invert", Changing([](MATRIX& m) { m.Invert(0.0); }), matrices);
    Add(
        "MATRIX::GetTransformedRadians", [](auto& m, double a) { return m.GetTransformedRadians(a); }, matrices,
        angles);
    Add(
        "MATRIX::GetUntransformedRadians", [](auto& m, double a) { return m.GetUntransformedRadians(a); }, matrices,
        angles);
    Add(
        "MATRIX::GetUntransformedVector", [](auto& m, auto& v) { return m.GetUntransformedVector(v); }, matrices,
        vectors);
    Add("UTLGetIdentityMatrix", Changing([](MATRIX& m) { UTLGetIdentityMatrix(&m); }), matrices);
    Add("UTLRotateMatrix", Changing([](MATRIX& m, int a) { UTLRotateMatrix(&m, a); }), matrices, millionths);
    Add("UTLRotateMatrixAround", Changing([](MATRIX& m, int a) { UTLRotateMatrixAround(&m, a, 3, 4); }), matrices,
        millionths);
    Add("UTLTranslateMatrix", Changing([](MATRIX& m, int x) { UTLTranslateMatrix(&m, x, 7); }), matrices, millionths);
    Add("UTLStretchMatrix", Changing([](MATRIX& m) { UTLStretchMatrix(&m, 3, 4, 1.5, 0.5); }), matrices);
    Add("UTLSkewMatrix", Changing([](MATRIX& m, int a) { UTLSkewMatrix(&m, a, 1000000, 3, 4); }), matrices, millionths);
}

void AddClassification()
{
    Add(
        "MATRIX::IsIdentity", [](auto& m) { return m.IsIdentity(true, tolerance); }, matrices);
    Add(
        "MATRIX::IsSkewedOrRotated", [](auto& m) { return m.IsSkewedOrRotated(); }, matrices);
    Add(
        "MATRIX::IsSkewedOrRotatedOrMirrored", [](auto& m) { return m.IsSkewedOrRotatedOrMirrored(); }, matrices);
    Add(
        "MATRIX::IsScaledOrSkewedOrRotated", [](auto& m) { return m.IsScaledOrSkewedOrRotated(); }, matrices);
    Add(
        "MATRIX::IsNonUniformScaledOrSkewedOrRotated", [](auto& m) { return m.IsNonUniformScaledOrSkewedOrRotated(); },
        matrices);
    Add(
        "MATRIX::IsScaled", [](auto& m) { return m.IsScaled(); }, matrices);
    Add(
        "MATRIX::IsMirrored", [](auto& m) { return m.IsMirrored(); }, matrices);
    Add(
        "MATRIX::IsOrthogonal", [](auto& m) { return m.IsOrthogonal(); }, matrices);
    Add(
        "MATRIX::IsOrthonormal", [](auto& m) { return m.IsOrthonormal(); }, matrices);
    Add(
        "MATRIX::IsUniformOrthogonal", [](auto& m) { return m.IsUniformOrthogonal(); }, matrices);
    Add(
        "MATRIX::IsOrthonormalAxisAligned", [](auto& m) { return m.IsOrthonormalAxisAligned(); }, matrices);
    Add(
        "IsEqual(MATRIX)", [](auto& m, auto& n) { return IsEqual(m, n, tolerance); }, matrices, otherMatrices);
    Add(
        "IsZero(MATRIX)", [](auto& m) { return IsZero(m); }, matrices);
    Add(
        "MATRIX::GetMaximumMatrixVectorScale", [](auto& m) { return m.GetMaximumMatrixVectorScale(); }, matrices);
}

/// Those that write a result of type R through a reference.
template <typename R, typename F>
auto Giving(F f)
{
    return [f](auto&... inputs) {
        R result;
        f(result, inputs...);
        return result;
    };
}

void AddDecomposition()
{
    using Pair = std::array<point2d, 2>;
    using Axes = std::array<vector2d, 2>;
    Add("MATRIX::GetCenterOfTransformation", Giving<point2d>([](auto& p, MATRIX m) { m.GetCenterOfTransformation(p); }),
        matrices);
    Add("MATRIX::GetLineOfTransformation",
        Giving<Pair>([](auto& line, MATRIX m) { m.GetLineOfTransformation(line[0], line[1]); }), matrices);
    Add("DecomposeAffineTransform", Giving<AFF_TRANSFORM>(DecomposeAffineTransform), matrices);
    Add("DecomposeAffineTransformFromVectors", Giving<AFF_TRANSFORM>(DecomposeAffineTransformFromVectors), points,
        vectors, otherVectors);
    Add("ComposeAffineTransform", Giving<MATRIX>(ComposeAffineTransform), parts);
    Add("TransformMatrixAndSeparateScale", Giving<vector2d>([](auto& scale, auto& m, auto& n) {
            benchmark::DoNotOptimize(TransformMatrixAndSeparateScale(m, n, scale));
        }),
        matrices, otherMatrices);
    Add("GetTransformedCircleAxisLengths",
        Giving<vector2d>([](auto& v, auto& m) { GetTransformedCircleAxisLengths(m, v.x, v.y); }), matrices);
    Add("GetTransformedCircleAxes",
        Giving<Axes>([](auto& axes, auto& m) { GetTransformedCircleAxes(m, axes[0], axes[1]); }), matrices);
    Add("GetNormalOnTransformedCircle", GetNormalOnTransformedCircle, matrices, points);
    Add(
        "FindPointOnEllipseThatHasNormal", [](auto& v) { return FindPointOnEllipseThatHasNormal(v, 30.0, 20.0); },
        vectors);
}

void AddConstructors()
{
    Add("IdentityMatrix", IdentityMatrix);
    Add("SwapXYMatrix", SwapXYMatrix);
    Add("ConstructMatrix", ConstructMatrix, vectors, otherVectors, vectors);
    Add("ConstructTranslationMatrix", ConstructTranslationMatrix, vectors);
    Add("ConstructRotationMatrix", ConstructRotationMatrix, angles);
    Add("ConstructScaledRotationMatrix", ConstructScaledRotationMatrix, angles, angles, angles);
    Add("ConstructRotateAroundMatrix", ConstructRotateAroundMatrix, angles, points);
    Add("ConstructScaleAroundMatrix", ConstructScaleAroundMatrix, angles, angles, points);
    Add("ConstructSkewAroundMatrix", ConstructSkewAroundMatrix, angles, angles, points);
    Add("ConstructTransformAroundMatrix", ConstructTransformAroundMatrix, matrices, points);
    Add("ConstructVectorTransformMatrix", ConstructVectorTransformMatrix, vectors, otherVectors);
    Add(
        "ConstructLineSegmentTransformMatrix",
        [](auto& p, auto& q) { return ConstructLineSegmentTransformMatrix(p, q, centre, p); }, points, otherPoints);
    Add(
        "ConstructBBoxScaleMatrix", [](auto& box) { return ConstructBBoxScaleMatrix(box, true); }, boxes);
    Add(
        "ConstructRectTransformMatrix", [](auto& a, auto& b) { return ConstructRectTransformMatrix(a, b, MapFit); },
        boxes, otherBoxes);
    Add(
        "GetScaleForSizeTransform", [](auto& a, auto& b) { return GetScaleForSizeTransform(a, b, MapFit); }, vectors,
        otherVectors);
}

void AddBoxes()
{
    Add(
        "GetTransformedBBox<BoundsT<double>>", [](auto& box, auto& m) { return GetTransformedBBox(box, m); }, boxes,
        matrices);
    Add(
        "GetTransformedBBox<RECT>", [](auto& box, auto& m) { return GetTransformedBBox(box, m); }, rectangles,
        matrices);
    Add(
        "GetUntransformedBBox<BoundsT<double>>", [](auto& box, auto& m) { return GetUntransformedBBox(box, m); }, boxes,
        matrices);
    Add(
        "GetUntransformedBBox<RECT>", [](auto& box, auto& m) { return GetUntransformedBBox(box, m); }, rectangles,
        matrices);
    Add("GetRemappedPoint", GetRemappedPoint, points, boxes, otherBoxes);
    Add(
        "GetTransformedCircleBBox", [](auto& m, auto& p) { return GetTransformedCircleBBox(m, 5.0, p); }, matrices,
        points);
}

[[maybe_unused]] const bool areAdded = [] {
    AddSteps();
    AddClassification();
    AddDecomposition();
    AddConstructors();
    AddBoxes();
    return true;
}();

} // namespace
} // namespace ZarnMath::Benchmarks
