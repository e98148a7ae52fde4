#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/Bezier/Speed.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

namespace ZarnMath::CubicBezier {

namespace {

/// How far a parameter steps away from a point where the derivative vanishes.
constexpr double degenerateStep = 1e-05;

/// What curvature is the quotient of.
struct Turning
{
    double cross;      ///< Cross(P', P'')
    double speedCubed; ///< |P'|^3
};

Turning TurningAt(double t, const point2d& a, const point2d& b, const point2d& c) noexcept
{
    const vector2d first = Derivative(a, b, c, t);
    const double s = LengthSquared(first);
    return {Cross(first, SecondDerivative(a, b, t)), s * std::sqrt(s)};
}

/// The chord from `from` to `to`.
vector2d Chord(const PowerForm& f, double from, double to) noexcept
{
    return Evaluate(f, to) - Evaluate(f, from);
}

} // namespace

bool GetCurvatureAt(double t, const point2d& a, const point2d& b, const point2d& c, double& curvature) noexcept
{
    const auto [cross, speedCubed] = TurningAt(t, a, b, c);
    if (!(speedCubed > 0.0))
        return false;
    curvature = cross / speedCubed;
    return true;
}

bool GetCurvatureRadiusAt(double t, const point2d& a, const point2d& b, const point2d& c, double& radius) noexcept
{
    constexpr double infinite = std::numeric_limits<double>::max();
    const auto [cross, speedCubed] = TurningAt(t, a, b, c);
    if (cross == 0.0) {
        radius = speedCubed >= 0.0 ? infinite : -infinite;
        return false;
    }
    radius = speedCubed / cross;
    return true;
}

double SafeBezierCurvature(double t, const point2d& a, const point2d& b, const point2d& c) noexcept
{
    double curvature = 0.0;
    if (!GetCurvatureAt(t, a, b, c, curvature))
        GetCurvatureAt(t <= 0.5 ? t + degenerateStep : t - degenerateStep, a, b, c, curvature);
    return curvature;
}

int BezierInflectionPoints(const point2d& a, const point2d& b, const point2d& c, double* out) noexcept
{
    const double A = Cross(b, a) * 6.0;
    const double B = Cross(c, a) * 6.0;
    const double w = Cross(c, b);
    const double discriminant = B * B + (A * -4.0) * (w + w);
    if (discriminant < 0.0)
        return 0;
    const double h = 0.5 / A;
    const double r = std::sqrt(discriminant);
    out[0] = h * (r - B);
    out[1] = h * (-B - r);
    return 2;
}

int FindCurvatureMinMax(const point2d& a, const point2d& b, const point2d& c, double* out) noexcept
{
    const RootFinder::Derivative<12> derivative(SpeedToTheSixth(ToDerivativeForm(a, b, c)).c);
    return RootFinder::FindRoots<11>(derivative.c, out, false);
}

vector2d SafeBezierTangent(double t, const point2d& a, const point2d& b, const point2d& c, const point2d& d) noexcept
{
    const vector2d derivative = Derivative(a, b, c, t);
    if (LengthSquared(derivative) >= DBL_EPSILON)
        return derivative;
    const PowerForm f{a, b, c, d};
    const vector2d chord = t > 0.5 ? Chord(f, t - degenerateStep, t) : Chord(f, t, t + degenerateStep);
    if (LengthSquared(chord) >= DBL_EPSILON)
        return chord;
    const point2d start = Evaluate(f, 1e-06);
    const point2d end = Evaluate(f, 0.999999);
    return start == end ? vector2d{1.0, 0.0} : end - start;
}

} // namespace ZarnMath::CubicBezier
