/// @file
/// Transforms of the plane, and angles.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include <iterator>

namespace ZarnMath::Fuzzing {

namespace {

constexpr double twoPi = 6.283185307179586;
constexpr double pi = 3.141592653589793;

bool IsFiniteMatrix(const MATRIX& m) noexcept
{
    for (const double f : {m.m11, m.m12, m.dx, m.m21, m.m22, m.dy})
        if (!IsFinite(f))
            return false;
    return true;
}

bool IsOrdinaryMatrix(const MATRIX& m) noexcept
{
    const double fields[6] = {m.m11, m.m12, m.dx, m.m21, m.m22, m.dy};
    return AreOrdinary(fields, 6);
}

bool IsSame(const MATRIX& a, const MATRIX& b) noexcept
{
    const double fields[6] = {a.m11, a.m12, a.dx, a.m21, a.m22, a.dy};
    const double others[6] = {b.m11, b.m12, b.dx, b.m21, b.m22, b.dy};
    return AreSame(fields, others, 6);
}

/// From 0 to a limit, or NaN.
bool IsUpTo(double limit, double x) noexcept
{
    return x != x || (0.0 <= x && x <= limit);
}

bool IsWithin(double limit, double x) noexcept
{
    return x != x || (-limit <= x && x <= limit);
}

void CheckSteps(const MATRIX& m, const MATRIX& t, const point2d& centre, double angle)
{
    MATRIX changed = m;
    Bounded("MATRIX::Rotate", [&] { changed.Rotate(angle); });
    changed.RotateAroundPoint(angle, centre);
    changed.ScaleMatrix(AsVector(centre));
    changed.ScaleMatrix(AsVector(centre), {angle, angle});
    changed.TransformAroundPoint(t, centre);
    changed.RemoveScaling();
    MATRIX byItself = m;
    byItself.TransformAroundPoint(byItself, centre);
    MATRIX byCopy = m;
    byCopy.TransformAroundPoint(m, centre);
    Require(IsSame(byItself, byCopy), "a matrix may be transformed by itself");
    (void)(m * t);
    (void)m(centre);
    (void)m(AsVector(centre));
}

void CheckInverse(const MATRIX& m, double tolerance)
{
    const double determinant = m.m11 * m.m22 - m.m21 * m.m12;
    MATRIX inverse = m;
    const bool isInvertible = Bounded("MATRIX::Invert", [&] { return inverse.Invert(tolerance); });
    Require(isInvertible == (std::fabs(determinant) > tolerance), "the determinant has to exceed the tolerance");
    if (!isInvertible)
        Require(inverse == MATRIX{0.0, 0.0, 0.0, 0.0, 0.0, 0.0}, "without an inverse the matrix is lost");
    Require(!isInvertible || determinant == determinant, "NaN has no inverse");
}

void CheckClasses(const MATRIX& m, double tolerance)
{
    if (IsFiniteMatrix(m))
        Require(IsEqual(m, m, 0.0), "a matrix equals itself");
    Require(!IsZero(m, tolerance) || IsFiniteMatrix(m) || tolerance == std::numeric_limits<double>::infinity(),
            "only numbers are near 0");
    if (m.IsIdentity(false, tolerance))
        Require(m == IdentityMatrix(), "the bits of the identity");
    if (m.IsSkewedOrRotated(tolerance))
        Require(m.IsSkewedOrRotatedOrMirrored(tolerance) && m.IsScaledOrSkewedOrRotated(tolerance) &&
                    m.IsNonUniformScaledOrSkewedOrRotated(tolerance),
                "what is skewed is skewed or something else");
    Require(!m.IsOrthonormal(tolerance) || m.IsOrthogonal(tolerance), "an orthonormal matrix is orthogonal");
    Require(!m.IsUniformOrthogonal(tolerance) || m.IsOrthogonal(tolerance),
            "a uniform orthogonal matrix is orthogonal");
    (void)m.IsIdentity(true, tolerance);
    (void)m.IsScaled(tolerance);
    (void)m.IsMirrored();
    (void)m.IsOrthonormalAxisAligned(tolerance);
    const double scale = Bounded("GetMaximumMatrixVectorScale", [&] { return m.GetMaximumMatrixVectorScale(); });
    Require(!(scale < 0.0), "no factor is negative");
}

void CheckFixedPoints(MATRIX m)
{
    Result<point2d> centre;
    const bool hasCentre =
        Bounded("GetCenterOfTransformation", [&] { return m.GetCenterOfTransformation(centre.value); });
    Require(hasCentre || centre.value == point2d{0.0, 0.0}, "the origin, if there is no centre");
    Result<point2d> p0;
    Result<point2d> p1;
    const bool hasLine =
        Bounded("GetLineOfTransformation", [&] { return m.GetLineOfTransformation(p0.value, p1.value); });
    Require(hasLine || (p0.IsUntouched() && p1.IsUntouched()), "without a line nothing is written");
}

void CheckDirections(const MATRIX& m, double radians, const vector2d& v)
{
    Require(IsUpTo(twoPi, Bounded("GetTransformedRadians", [&] { return m.GetTransformedRadians(radians); })),
            "from 0 to a full turn");
    Require(IsUpTo(twoPi, m.GetUntransformedRadians(radians)), "from 0 to a full turn");
    const vector2d source = m.GetUntransformedVector(v);
    if (IsNearZero(m.m11 * m.m22 - m.m21 * m.m12))
        Require(Fuzzing::IsSame(source, v), "a singular matrix gives the vector itself");
}

void CheckDecomposition(const MATRIX& m, const MATRIX& then)
{
    AFF_TRANSFORM parts{guard<double>, guard<double>, guard<double>, guard<double>, guard<point2d>};
    const bool isTakenApart = Bounded("DecomposeAffineTransform", [&] { return DecomposeAffineTransform(parts, m); });
    Require(IsWithin(pi, parts.rotation), "from minus half a turn to half a turn");
    Require(Fuzzing::IsSame(parts.translation, {m.dx, m.dy}), "the translation is the image of the origin");
    if (!isTakenApart)
        Require(parts.skew == guard<double>, "the skew is not written on failure");
    if (!isTakenApart && m.m12 == 0.0 && m.m22 == 0.0)
        Require(parts.scaleY == guard<double>, "nor the second scale, where the second column is zero");
    MATRIX whole{};
    const bool isPutTogether = ComposeAffineTransform(whole, parts);
    Require(isPutTogether == (parts.scaleX != 0.0 && parts.scaleY != 0.0), "neither scale is 0");
    vector2d scale{};
    (void)Bounded("TransformMatrixAndSeparateScale", [&] { return TransformMatrixAndSeparateScale(m, then, scale); });
}

void CheckConstruction(const point2d* p, double a, double b, const BoundsT<double>& from, const BoundsT<double>& to,
                       MapMode mode)
{
    (void)ConstructMatrix(AsVector(p[0]), AsVector(p[1]), AsVector(p[2]));
    (void)ConstructTranslationMatrix(AsVector(p[0]));
    (void)ConstructRotationMatrix(a);
    (void)ConstructScaledRotationMatrix(a, b, a);
    (void)ConstructRotateAroundMatrix(a, p[0]);
    (void)ConstructScaleAroundMatrix(a, b, p[0]);
    (void)Bounded("ConstructSkewAroundMatrix", [&] { return ConstructSkewAroundMatrix(a, b, p[0]); });
    (void)ConstructTransformAroundMatrix(SwapXYMatrix(), p[0]);
    (void)Bounded("ConstructVectorTransformMatrix",
                  [&] { return ConstructVectorTransformMatrix(AsVector(p[0]), AsVector(p[1])); });
    (void)ConstructLineSegmentTransformMatrix(p[0], p[1], p[2], p[3]);
    (void)ConstructBBoxScaleMatrix(from, a > b);
    const MATRIX map =
        Bounded("ConstructRectTransformMatrix", [&] { return ConstructRectTransformMatrix(from, to, mode); });
    Require(!(std::fabs(map.m12) > 0.0) && !(std::fabs(map.m21) > 0.0), "boxes are not turned");
    (void)GetScaleForSizeTransform(AsVector(p[0]), AsVector(p[1]), mode);
}

void CheckAngles(double angle, const point2d* p, int steps)
{
    const vector2d v = AsVector(p[0]);
    const vector2d w = AsVector(p[1]);
    Require(IsUpTo(twoPi, Radians::NormalizeAngle(angle)) && IsUpTo(360.0, Degrees::NormalizeAngle(angle)),
            "from 0 to a full turn");
    Require(IsWithin(pi, Radians::NormalizeFineAngle(angle)), "half a turn either way");
    Require(IsUpTo(twoPi, Radians::VectorToAngle(v)) && IsUpTo(360.0, Degrees::VectorToAngle(v)),
            "from 0 to a full turn");
    const double turn = Bounded("GetAngle", [&] { return Radians::GetAngle(v, w); });
    Require(IsUpTo(twoPi, turn) && IsUpTo(360.0, Degrees::GetAngle(v, w)), "from 0 to a full turn");
    Require(IsUpTo(twoPi, Radians::GetAngle(p[0], p[1], p[2])) && IsUpTo(360.0, Degrees::GetAngle(p[0], p[1], p[2])),
            "from 0 to a full turn");
    Require(IsWithin(pi, Radians::GetFineAngle(v, w)) && IsWithin(180.0, Degrees::GetFineAngle(v, w)),
            "half a turn either way");
    const int quadrant = Radians::GetQuadrant(angle);
    Require(0 <= quadrant && quadrant <= 3 && (angle == angle || quadrant == 3), "one of four quadrants");
    Require(steps != 0 || Fuzzing::IsSame(Radians::Constrain(angle, 0, p[0].x), angle), "no steps constrain nothing");
    (void)Bounded("Constrain", [&] { return Radians::Constrain(angle, steps, p[0].x); });
    (void)Radians::RotatePoint(p[0], angle, p[1]);
    (void)Degrees::RotatePoint(p[0], angle, p[1]);
    (void)Radians::AngleToVector(angle, p[0].x);
    (void)Degrees::AngleToVector(angle, p[0].x);
    (void)Bounded("GetRotatedSize", [&] { return Degrees::GetRotatedSize({steps, steps}, angle); });
}

void CheckIntegerAngles(int angle, const point2d* p)
{
    constexpr int fullTurn = 360000000;
    const int normal = Bounded("KELDANGLE::NormalizeAngle", [&] { return KELDANGLE::NormalizeAngle(angle); });
    Require(0 <= normal && normal < fullTurn && (static_cast<std::int64_t>(angle) - normal) % fullTurn == 0,
            "the same direction, from 0 to less than a full turn");
    const int direction = KELDANGLE::VectorToAngle(AsVector(p[0]));
    const int turn = KELDANGLE::GetAngle(p[0], p[1], p[2]);
    const int fineTurn = KELDANGLE::GetFineAngle(p[0], p[1], p[2]);
    Require(0 <= direction && direction <= fullTurn && 0 <= turn && turn <= fullTurn, "from 0 to a full turn");
    Require(-fullTurn / 2 <= fineTurn && fineTurn <= fullTurn / 2, "half a turn either way");
}

void CheckPlainC(const MATRIX& m, const RECT& numbers, double sx, double sy)
{
    const int angle = numbers.left;
    const int other = numbers.top;
    const int cx = numbers.right;
    const int cy = numbers.bottom;
    MATRIX changed = m;
    Bounded("UTLRotateMatrix", [&] { UTLRotateMatrix(&changed, angle); });
    Require(angle % 360000000 != 0 || IsSame(changed, m), "a full turn changes no bit");
    changed = m;
    Bounded("UTLRotateMatrixAround", [&] { UTLRotateMatrixAround(&changed, angle, cx, cy); });
    Require(angle % 360000000 != 0 || IsSame(changed, m), "a full turn changes no bit");
    UTLTranslateMatrix(&changed, cx, cy);
    UTLStretchMatrix(&changed, cx, cy, sx, sy);
    Bounded("UTLSkewMatrix", [&] { UTLSkewMatrix(&changed, angle, other, cx, cy); });
    UTLGetIdentityMatrix(&changed);
    Require(changed.IsIdentity(false, 0.0), "the identity");
}

} // namespace

void FuzzMatrices(Input& input)
{
    const MATRIX m = input.Matrix();
    const MATRIX other = input.Matrix();
    point2d p[4];
    for (point2d& point : p)
        point = input.Point();
    const double angle = input.Double();
    const double tolerance = input.Flag() ? DBL_EPSILON : input.Double();
    const int integer = input.Int();
    CheckSteps(m, other, p[0], angle);
    CheckInverse(m, tolerance);
    CheckClasses(m, tolerance);
    CheckFixedPoints(m);
    CheckDirections(m, angle, AsVector(p[0]));
    CheckDecomposition(m, other);
    const BoundsT<double> from = input.Bounds();
    const auto mode = static_cast<MapMode>(input.Flag() ? input.Choice(3) : integer);
    CheckConstruction(p, angle, tolerance, from, {p[0].x, p[0].y, p[1].x, p[1].y}, mode);
    CheckAngles(angle, p, integer);
    CheckIntegerAngles(integer, p);
    CheckPlainC(m, input.Rect(), p[0].x, p[0].y);
    if (IsOrdinaryMatrix(m) && IsOrdinaryMatrix(other) && IsOrdinary(p[0]))
        Require(IsFinite((m * other)(p[0])), "ordinary transforms of an ordinary point are finite");
}

} // namespace ZarnMath::Fuzzing
