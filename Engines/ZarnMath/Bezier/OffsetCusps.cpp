#include "ZarnMath/Bezier/Speed.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

namespace ZarnMath::CubicBezier {

namespace {

/// Cross(P'(t), P''(t)), of which the cubic term cancels.
Polynomial<2> TurningPolynomial(const DerivativeForm& f) noexcept
{
    return {{Cross(f.v, f.u), 2.0 * Cross(f.w, f.u), Cross(f.w, f.v)}};
}

/// Whether a curve of this signed radius turns toward the side on which the offset lies.
bool TurnsTowards(double distance, double radius) noexcept
{
    return (distance > 0.0 && radius >= 0.0) || (distance < 0.0 && radius < 0.0);
}

} // namespace

int FindAllOffsetCusp(const point2d& a, const point2d& b, const point2d& c, double distance,
                      double* parameters) noexcept
{
    const DerivativeForm f = ToDerivativeForm(a, b, c);
    const Polynomial<4> turningSquared = Square(TurningPolynomial(f));
    const Polynomial<12> p = SpeedToTheSixth(f) + -(distance * distance) * turningSquared;
    return RootFinder::FindRoots<12>(p.c, parameters, false);
}

bool FindOffsetCusps(const point2d& a, const point2d& b, const point2d& c, double distance,
                     std::vector<double>& parameters)
{
    double roots[13];
    const int count = FindAllOffsetCusp(a, b, c, distance, roots);
    parameters.clear();
    for (int i = 0; i < count; ++i) {
        double radius = 0.0;
        GetCurvatureRadiusAt(roots[i], a, b, c, radius);
        if (TurnsTowards(distance, radius))
            parameters.push_back(roots[i]);
    }
    return !parameters.empty();
}

} // namespace ZarnMath::CubicBezier
