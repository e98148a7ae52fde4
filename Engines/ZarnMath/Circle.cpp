#include "ZarnMath/Circle.h"

#include "ZarnMath/CircleInternal.h"
#include "ZarnMath/WMathInternal.h"

namespace ZarnMath {

namespace {

constexpr double squareRootOfTwo = 1.4142135623730951; // 0x3FF6A09E667F3BCD

struct HalfAxes
{
    double major;
    double minor;
};

/// Where the rows of the linear part stand obliquely. P and Q are the squared lengths of the second and the first row, R
/// is their product. The squared half axes are the roots of s^2 - (P + Q)*s + det^2, which are ((P + Q) +- D)/2, and each
/// half axis is had as |det| over the other one.
HalfAxes GetObliqueAxes(double det, double P, double Q, double R) noexcept
{
    const double e = P - Q;
    const double f = -R - R;
    const double D = std::sqrt(e * e + f * f);
    const double g = det * squareRootOfTwo;
    return {g / std::sqrt((P + Q) - D), g / std::sqrt((P + Q) + D)};
}

/// A quotient that is infinite gives the right quarter where P and Q are equal and R is negative, and -pi/4, the minor
/// axis, where R is positive: that is how it has always been drawn.
double GetObliqueAngle(double P, double Q, double R) noexcept
{
    const double angle = std::atan((-R - R) / (P - Q)) * 0.5;
    return P > Q ? angle + halfPi : angle;
}

} // namespace

void GetTransformedCircleParams(const MATRIX& m, double& major, double& minor, double* angle) noexcept
{
    const double det = Determinant(m);
    const double P = LengthSquared(YRow(m));
    const double Q = LengthSquared(XRow(m));
    const double R = Dot(XRow(m), YRow(m));
    const bool isOblique = std::fabs(R) > DBL_EPSILON;
    if (angle != nullptr)
        *angle = isOblique ? GetObliqueAngle(P, Q, R) : P < Q ? 0.0 : halfPi;
    const HalfAxes axes = isOblique ? GetObliqueAxes(det, P, Q, R)
                          : P < Q   ? HalfAxes{det / std::sqrt(P), det / std::sqrt(Q)}
                                    : HalfAxes{det / std::sqrt(Q), det / std::sqrt(P)};
    major = std::fabs(axes.major);
    minor = std::fabs(axes.minor);
}

void GetTransformedCircleAxisLengths(const MATRIX& m, double& major, double& minor) noexcept
{
    GetTransformedCircleParams(m, major, minor, nullptr);
}

void GetTransformedCircleAxes(const MATRIX& m, vector2d& major, vector2d& minor) noexcept
{
    double a = 0.0;
    double b = 0.0;
    double angle = 0.0;
    GetTransformedCircleParams(m, a, b, &angle);
    major = Radians::AngleToVector(angle, a);
    const double squared = LengthSquared(major);
    if (squared > DBL_EPSILON)
        minor = b * (Perpendicular(major) / std::sqrt(squared));
    else
        minor = {b, major.x};
}

vector2d GetNormalOnTransformedCircle(const MATRIX& m, const point2d& p) noexcept
{
    const point2d image = Image(m, p);
    const vector2d tangent = m.GetUntransformedVector({-image.y, image.x});
    return m.IsMirrored() ? vector2d{-tangent.y, tangent.x} : vector2d{tangent.y, -tangent.x};
}

point2d FindPointOnEllipseThatHasNormal(const vector2d& normal, double a, double b) noexcept
{
    const double k = std::sqrt(normal.x * (a * a * normal.x) + normal.y * (b * b * normal.y));
    return {-normal.x * a / k, -normal.y * b / k};
}

} // namespace ZarnMath
