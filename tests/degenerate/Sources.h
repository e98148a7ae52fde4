/// @file
/// Ordinary arguments with one degenerate thing among them.
#pragma once

#include "tests/catalogue/OrdinarySource.h"

#include <array>
#include <map>
#include <string>
#include <vector>

namespace ZarnMath::Degenerate {

/// The class of each control point: points of one class coincide.
using Partition = std::array<int, 4>;

/// Makes the control points of one curve coincide.
class CoincidentSource : public Catalogue::OrdinarySource
{
public:
    /// @param classes which points coincide
    /// @param whose   which of the curves that the call draws, from 0 on
    /// @param setFlags what every flag is
    CoincidentSource(const Partition& classes, int whose, bool setFlags = true) noexcept
        : OrdinarySource(setFlags), partition(classes), degenerateCurve(whose)
    {}

    Catalogue::CurveOf<POINT> IntegerCubic() override;

    /// The number of curves so far.
    [[nodiscard]] int Curves() const noexcept
    {
        return curves;
    }

private:
    Partition partition;
    int degenerateCurve;
    int curves = 0;
};

/// A value that stands in for an ordinary one: for a floating-point number or for an integer.
struct Special
{
    const char* name;
    bool isInteger;
    double number;
    std::int32_t integer;
};

/// NaN, the infinities, the zeros, the smallest and the largest number; the smallest and the largest integer.
extern const std::array<Special, 9> specials;

inline constexpr Partition distinctPoints = {0, 1, 2, 3};

/// Replaces one of the numbers that a call draws.
class SpecialSource : public CoincidentSource
{
public:
    /// @param value    what stands in
    /// @param place    which number it replaces, counted from 0 over those of its type; -1 for none
    /// @param classes  which control points coincide, but for the number that is replaced
    /// @param whose    in which of the curves
    /// @param setFlags what every flag is
    SpecialSource(const Special& value, int place, const Partition& classes = distinctPoints, int whose = 0,
                  bool setFlags = true) noexcept
        : CoincidentSource(classes, whose, setFlags), special(value), specialPlace(place)
    {}

    double Number() override;
    float Single() override;
    std::int32_t Integer() override;
    double Coordinate() override;
    double Parameter() override;
    double Angle(double turn) override;
    std::int32_t IntegerAngle() override;
    double Tolerance() override;
    double Distance() override;
    point2d Point() override;
    POINT IntegerPoint() override;
    vector2d Vector() override;
    Catalogue::CurveOf<point2d> Cubic() override;
    Catalogue::CurveOf<POINT> IntegerCubic() override;
    /// The special value stands in for a coefficient.
    Catalogue::Coefficients PowerForm() override;

    /// What the numbers of the special value's type were drawn as, in order, where none was replaced: `t`, `P0.x` and the
    /// like.
    [[nodiscard]] const std::vector<std::string>& Names() const noexcept
    {
        return names;
    }

private:
    double Replaced(double value, const std::string& name);
    std::int32_t Replaced(std::int32_t value, const std::string& name);
    bool IsPlaceOf(bool isInteger, const std::string& name);
    std::string Numbered(const char* name);
    [[nodiscard]] bool IsCounting() const noexcept;
    template <typename P>
    void Replace(P& point, const char* name);
    template <typename P>
    void ReplaceControlPoints(Catalogue::CurveOf<P>& curve);
    Catalogue::CurveOf<point2d> UnreplacedCubic();

    const Special& special;
    int specialPlace;
    int places = 0;
    std::vector<std::string> names;
    std::map<std::string, int> draws;
};

} // namespace ZarnMath::Degenerate
