#include "ZarnMath/WMathInternal.h"

#include <optional>

namespace ZarnMath {

namespace {

/// |v| <= tolerance. NaN is not within it, and !IsWithin(v, t) is what |v| > t stands for.
bool IsWithin(double v, double tolerance) noexcept
{
    return std::fabs(v) <= tolerance;
}

/// A NaN is not positive either.
bool IsPositive(double v) noexcept
{
    return v > 0.0;
}

double ColumnProduct(const MATRIX& m) noexcept
{
    return Dot(XColumn(m), YColumn(m));
}

MATRIX MinusIdentity(const MATRIX& m) noexcept
{
    return {m.m11 - 1.0, m.m12, m.dx, m.m21, m.m22 - 1.0, m.dy};
}

/// Neither this nor `IsNearZero` holds for NaN.
bool IsBeyondZero(double v) noexcept
{
    return std::fabs(v) > DBL_EPSILON;
}

/// A row of M - I: the points with x*p.x + y*p.y + constant = 0 keep one coordinate.
struct Equation
{
    double x;
    double y;
    double constant;
};

/// Whether `dependent` is the multiple of `leading` that their coefficients of x make it. The coefficient of x leads.
bool AreConsistent(const Equation& leading, const Equation& dependent) noexcept
{
    const double ratio = dependent.x / leading.x;
    return !(std::fabs(dependent.y - leading.y * ratio) > fixedLineTolerance ||
             std::fabs(dependent.constant - ratio * leading.constant) > fixedLineTolerance);
}

struct PointPair
{
    point2d p0;
    point2d p1;
};

/// At x = 0 and x = 1.
PointPair SolveForY(const Equation& e) noexcept
{
    return {{0.0, -e.constant / e.y}, {1.0, -(e.x + e.constant) / e.y}};
}

/// At y = 0 and y = 1.
PointPair SolveForX(const Equation& e) noexcept
{
    return {{-e.constant / e.x, 0.0}, {-(e.y + e.constant) / e.x, 1.0}};
}

/// The second equation follows from the first, whose coefficient of x is not zero.
std::optional<PointPair> SolveLeadingFirst(const Equation& first, const Equation& second) noexcept
{
    if (!AreConsistent(first, second))
        return std::nullopt;
    return std::fabs(first.y) > std::fabs(first.x) ? SolveForY(first) : SolveForX(first);
}

/// The first equation follows from the second, and is solved all the same, so that it must not be flat in y.
std::optional<PointPair> SolveLeadingSecond(const Equation& first, const Equation& second) noexcept
{
    if (!AreConsistent(second, first) || std::fabs(first.y) <= std::fabs(first.x))
        return std::nullopt;
    return SolveForY(first);
}

/// Neither equation has x: one of them has to be void.
std::optional<PointPair> SolveWithoutX(const Equation& first, const Equation& second) noexcept
{
    const bool isFirstVoid = IsNearZero(first.y) && IsNearZero(first.constant);
    if (!isFirstVoid && (IsBeyondZero(second.y) || IsBeyondZero(second.constant)))
        return std::nullopt;
    const Equation& remaining = isFirstVoid ? second : first;
    if (std::fabs(remaining.y) <= std::fabs(remaining.x))
        return std::nullopt;
    return SolveForY(remaining);
}

/// A NaN among the coefficients of x leads nowhere.
std::optional<PointPair> FindFixedLine(const MATRIX& m) noexcept
{
    const MATRIX change = MinusIdentity(m);
    if (IsBeyondZero(Determinant(change)))
        return std::nullopt;
    const Equation first{change.m11, change.m12, change.dx};
    const Equation second{change.m21, change.m22, change.dy};
    if (IsBeyondZero(first.x))
        return SolveLeadingFirst(first, second);
    if (IsNearZero(first.x) && IsBeyondZero(second.x))
        return SolveLeadingSecond(first, second);
    if (IsNearZero(first.x) && IsNearZero(second.x))
        return SolveWithoutX(first, second);
    return std::nullopt;
}

} // namespace

} // namespace ZarnMath

using namespace ZarnMath;

bool MATRIX::IsSkewedOrRotated(double tolerance) const noexcept
{
    return !IsWithin(m21, tolerance) || !IsWithin(m12, tolerance);
}

bool MATRIX::IsSkewedOrRotatedOrMirrored(double tolerance) const noexcept
{
    return IsSkewedOrRotated(tolerance) || !IsPositive(m11) || !IsPositive(m22);
}

bool MATRIX::IsScaledOrSkewedOrRotated(double tolerance) const noexcept
{
    return !IsWithin(m11 - 1.0, tolerance) || !IsWithin(m22 - 1.0, tolerance) || IsSkewedOrRotated(tolerance);
}

bool MATRIX::IsNonUniformScaledOrSkewedOrRotated(double tolerance) const noexcept
{
    return IsSkewedOrRotated(tolerance) || !IsPositive(m11) || !IsWithin(m11 - m22, tolerance);
}

bool MATRIX::IsScaled(double tolerance) const noexcept
{
    return !IsWithin(std::sqrt(LengthSquared(XColumn(*this))) - 1.0, tolerance) ||
           !IsWithin(std::sqrt(LengthSquared(YColumn(*this))) - 1.0, tolerance);
}

bool MATRIX::IsMirrored() const noexcept
{
    return Determinant(*this) < 0.0;
}

bool MATRIX::IsOrthogonal(double tolerance) const noexcept
{
    return IsWithin(ColumnProduct(*this), tolerance);
}

bool MATRIX::IsOrthonormal(double tolerance) const noexcept
{
    return IsWithin(LengthSquared(XColumn(*this)) - 1.0, tolerance) &&
           IsWithin(LengthSquared(YColumn(*this)) - 1.0, tolerance) && IsOrthogonal(tolerance);
}

bool MATRIX::IsUniformOrthogonal(double tolerance) const noexcept
{
    return IsWithin(LengthSquared(XColumn(*this)) - LengthSquared(YColumn(*this)), tolerance) &&
           IsOrthogonal(tolerance);
}

bool MATRIX::IsOrthonormalAxisAligned(double tolerance) const noexcept
{
    const auto isZero = [tolerance](double v) { return IsWithin(v, tolerance); };
    const auto isUnit = [tolerance](double v) { return IsWithin(std::fabs(v) - 1.0, tolerance); };
    const bool areAxesExchanged = isZero(m11) && isUnit(m21) && isUnit(m12) && isZero(m22);
    return areAxesExchanged || (isUnit(m11) && isZero(m21) && isZero(m12) && isUnit(m22));
}

double MATRIX::GetMaximumMatrixVectorScale() const noexcept
{
    const double s = LengthSquared(XColumn(*this));
    const double h = ((s + m12 * m12) + m22 * m22) * 0.5;
    const double g = ((s - m12 * m12) - m22 * m22) * 0.5;
    const double f = ColumnProduct(*this);
    return std::sqrt(h + std::sqrt(f * f + g * g));
}

bool MATRIX::GetCenterOfTransformation(point2d& centre) noexcept
{
    const MATRIX change = MinusIdentity(*this);
    const double det = Determinant(change);
    const bool isFound = IsBeyondZero(det);
    centre = {0.0, 0.0};
    if (isFound)
        centre = {(change.m12 * change.dy - change.m22 * change.dx) / det,
                  (change.dx * change.m21 - change.dy * change.m11) / det};
    return isFound;
}

bool MATRIX::GetLineOfTransformation(point2d& p0, point2d& p1) noexcept
{
    const std::optional<PointPair> line = FindFixedLine(*this);
    if (line) {
        p0 = line->p0;
        p1 = line->p1;
    }
    return line.has_value();
}
