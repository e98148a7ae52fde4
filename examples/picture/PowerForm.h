/// @file
/// A cubic as a polynomial, the form that the library's questions about directions and lengths take.
#pragma once

#include <ZarnMath/ZarnMath.h>

/// P(t) = ((a*t + b)*t + c)*t + d
struct PowerForm
{
    ZarnMath::point2d a;
    ZarnMath::point2d b;
    ZarnMath::point2d c;
    ZarnMath::point2d d;

    explicit PowerForm(const ZarnMath::CubicBezier::bezier2dT<ZarnMath::point2d>& p)
        : a(ZarnMath::AsPoint((p[3] - p[0]) - 3.0 * (p[2] - p[1]))),
          b(ZarnMath::AsPoint(3.0 * ((p[2] - p[1]) - (p[1] - p[0])))), c(ZarnMath::AsPoint(3.0 * (p[1] - p[0]))),
          d(p[0])
    {}

    [[nodiscard]] ZarnMath::point2d operator()(double t) const
    {
        return d + ((AsVector(a) * t + AsVector(b)) * t + AsVector(c)) * t;
    }
};
