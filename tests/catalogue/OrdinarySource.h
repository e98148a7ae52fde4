/// @file
/// Arguments from an ordinary drawing, the same ones in every run.
#pragma once

#include "tests/catalogue/Source.h"

namespace ZarnMath::Catalogue {

/// Curves and points of a few hundred units, parameters within the curve, small tolerances. Each kind of value goes round
/// a short list, so that two points of one call differ.
class OrdinarySource : public Source
{
public:
    /// @param setFlags  what every flag is
    /// @param firstCall where the lists begin: calls that begin elsewhere have other arguments
    explicit OrdinarySource(bool setFlags = true, unsigned firstCall = 0) noexcept : flags(setFlags), next(firstCall) {}

    double Number() override;
    float Single() override;
    std::int32_t Integer() override;
    bool Flag() override;
    int Count(int low, int high) override;
    double Coordinate() override;
    double Parameter() override;
    double Angle(double turn) override;
    std::int32_t IntegerAngle() override;
    double Tolerance() override;
    double Distance() override;
    /// The points of `IntegerCubic`.
    CurveOf<point2d> Cubic() override;
    /// Four different points.
    CurveOf<POINT> IntegerCubic() override;

private:
    bool flags;
    unsigned next;
};

} // namespace ZarnMath::Catalogue
