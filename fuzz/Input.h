/// @file
/// Values of every kind out of a run of bytes, as the fuzzer makes them.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/WMath.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace ZarnMath::Fuzzing {

/// A cubic in both forms.
struct Cubic : CubicBezier::PowerForm
{
    point2d points[4];

    explicit Cubic(const std::array<point2d, 4>& p) noexcept
        : CubicBezier::PowerForm(CubicBezier::ToPowerForm(p.data())), points{p[0], p[1], p[2], p[3]}
    {}
};

/// An integer cubic.
struct IntegerCubic
{
    POINT points[4];
};

/// Reads values, and zeros when the bytes are used up.
///
/// The first two bytes choose how numbers are read. As raw bits every double and every integer occurs, but hardly ever a
/// curve: what happens deep inside needs numbers that have to do with each other. So they can be whole, on a grid, with
/// a fraction, from a list of borders, or equal or next to a number before, and in a mixture each one says for itself
/// what it is.
class Input
{
public:
    Input(const std::uint8_t* bytes, std::size_t size) noexcept;

    [[nodiscard]] std::uint8_t Byte() noexcept;
    [[nodiscard]] bool Flag() noexcept;

    /// From 0 to `count` - 1; up to 256 of them.
    [[nodiscard]] int Choice(int count) noexcept;

    /// Any 32 bits.
    [[nodiscard]] std::int32_t Int() noexcept;

    /// Any 64 bits.
    [[nodiscard]] double Double() noexcept;

    /// A double that is mostly in [0, 1], with many simple fractions.
    [[nodiscard]] double Parameter() noexcept;

    [[nodiscard]] point2d Point() noexcept;
    [[nodiscard]] vector2d Vector() noexcept;
    [[nodiscard]] POINT IntegerPoint() noexcept;
    [[nodiscard]] RECT Rect() noexcept;
    [[nodiscard]] BoundsT<double> Bounds() noexcept;
    [[nodiscard]] MATRIX Matrix() noexcept;

    /// Control points of any kind, some of which may coincide.
    [[nodiscard]] Cubic Curve() noexcept;
    [[nodiscard]] IntegerCubic IntegerCurve() noexcept;

    [[nodiscard]] std::vector<point2d> Points(int count);
    [[nodiscard]] std::vector<POINT> IntegerPoints(int count);

    /// Whether there are bytes left.
    [[nodiscard]] bool HasMore() const noexcept
    {
        return next != end;
    }

private:
    [[nodiscard]] std::uint64_t Bits(int bytes) noexcept;
    [[nodiscard]] double DoubleOfKind(int kind) noexcept;
    [[nodiscard]] std::int32_t IntOfKind(int kind) noexcept;
    [[nodiscard]] double Remember(double value) noexcept;

    const std::uint8_t* next;
    const std::uint8_t* end;
    int reading = 0;
    double gridStep = 1.0;
    static constexpr int memory = 16;
    double earlier[memory]{};
    int remembered = 0;
};

} // namespace ZarnMath::Fuzzing
