/// @file
/// Arguments of all kinds from a seed, the same on every machine: integers from the standard's engine, and from there on
/// only operations that are exact or correctly rounded.
#pragma once

#include "tests/catalogue/Source.h"

#include <random>

namespace ZarnMath::Digest {

/// Every call draws all of its arguments in one mood, so that they belong together: a point lies where the curve is.
class SeededSource final : public Catalogue::Source
{
public:
    explicit SeededSource(std::uint64_t seed) : engine(seed) {}

    /// Begins a call: forgets what the last one has drawn, and picks a mood.
    void BeginCall();

    double Number() override;
    float Single() override;
    std::int32_t Integer() override;
    bool Flag() override;
    int Count(int low, int high) override;
    double Parameter() override;
    double Angle(double turn) override;
    std::int32_t IntegerAngle() override;
    double Tolerance() override;
    double Distance() override;
    point2d Point() override;
    POINT IntegerPoint() override;
    vector2d Vector() override;
    RECT Rect() override;
    BoundsT<double> Bounds() override;
    MATRIX Matrix() override;
    MATRIX3D Matrix3() override;
    ZarnMath::Quaternion Quaternion() override;
    Catalogue::CurveOf<point2d> Cubic() override;
    Catalogue::CurveOf<POINT> IntegerCubic() override;
    Catalogue::Coefficients PowerForm() override;
    std::vector<point2d> Points(int count) override;
    std::vector<POINT> IntegerPoints(int count) override;

private:
    enum class Mood
    {
        Drawing,    ///< as in a drawing, some thousands of units wide
        Unit,       ///< a few units wide
        Grid,       ///< small whole numbers: much coincides, is collinear, cancels exactly
        BinaryGrid, ///< the same times a power of two
        Scaled,     ///< all about one power of ten
        Boundary,   ///< among them the tolerances and limits of the library, and their neighbours
        Special,    ///< among them signed zeros, denormals, the largest numbers, infinities and NaN
        AnyBits     ///< any double, any integer
    };

    static constexpr int moods = 8;

    [[nodiscard]] std::uint64_t Below(std::uint64_t limit);
    [[nodiscard]] bool IsOneIn(std::uint64_t chances);
    [[nodiscard]] double Uniform(double low, double high);
    [[nodiscard]] int Between(int low, int high);
    [[nodiscard]] double AnyDouble();
    [[nodiscard]] double NearBoundary();
    [[nodiscard]] double SpecialNumber();
    [[nodiscard]] std::int32_t SpecialInteger();
    [[nodiscard]] double Plain();
    /// A vector that is turned by no angle or by that of a 3-4-5 triangle, or by quarters of a turn from there.
    [[nodiscard]] vector2d Turned(double x, double y);
    [[nodiscard]] double Perturbed(double value);
    [[nodiscard]] point2d FreshPoint();
    [[nodiscard]] point2d PointOnLastCurve();
    [[nodiscard]] Catalogue::CurveOf<point2d> CoincidentCurve();
    [[nodiscard]] Catalogue::CurveOf<point2d> PlacedCurve();
    [[nodiscard]] Catalogue::CurveOf<point2d> FreshCurve();

    std::mt19937_64 engine;
    Mood mood = Mood::Drawing;
    double scale = 1.0;
    std::vector<point2d> seen; ///< the points of this call
    std::vector<POINT> seenIntegers;
    ZarnMath::Quaternion lastQuaternion{0.0, 0.0, 0.0, 1.0};
    int quarters = 0;
    bool isOblique = false;
};

} // namespace ZarnMath::Digest
