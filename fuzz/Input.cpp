#include "fuzz/Input.h"

#include <cmath>
#include <cstring>
#include <limits>

namespace ZarnMath::Fuzzing {

namespace {

/// What a number can be.
enum Kind
{
    RawBits,
    OnGrid,
    Whole,
    WithFraction,
    RawFloat,
    AnyMagnitude,
    Border,
    Earlier,
    NextToEarlier,
    EarlierNegated,
    kinds
};

/// How the numbers of one input are read: all alike, or each as it says. The tame mixture has no raw bits.
enum Reading
{
    AllOnGrid = OnGrid,
    AllWhole = Whole,
    AllWithFraction = WithFraction,
    TameMixture,
    Mixture,
    AllRaw,
    readings
};

constexpr double infinity = std::numeric_limits<double>::infinity();

/// Numbers at which something ends: the arithmetic, the integers, a tolerance.
constexpr double borders[] = {
    0.0,
    -0.0,
    0.5,
    0.49999999999999994,
    1.0,
    -1.0,
    2.0,
    infinity,
    -infinity,
    std::numeric_limits<double>::quiet_NaN(),
    std::numeric_limits<double>::max(),
    std::numeric_limits<double>::min(),
    std::numeric_limits<double>::denorm_min(),
    DBL_EPSILON,
    -DBL_EPSILON,
    1e-10,
    1e-9,
    1e-8,
    1e-7,
    1e-5,
    1e-3,
    0.01,
    0.1,
    4.0,
    360.0,
    3.141592653589793,
    6.283185307179586,
    2147483647.0,
    2147483647.5,
    -2147483648.0,
    -2147483648.5,
    4294967296.0,
    9007199254740992.0,
    1e100,
    1e154,
    1e200,
    1e-100,
    1e-154,
    1e-200,
    3.4028234663852886e38,
};

constexpr std::int32_t smallest = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t largest = std::numeric_limits<std::int32_t>::max();

constexpr std::int32_t integerBorders[] = {
    0,          1,         -1,       2,     -2,     smallest, smallest + 1, largest,   largest - 1, 1 << 30,
    -(1 << 30), 1 << 29,   1 << 24,  65536, -65536, 46341,    46340,        360000000, -360000000,  180000000,
    90000000,   270000000, 16777217, 2047,  650,    160,      30,           3,
};

} // namespace

Input::Input(const std::uint8_t* bytes, std::size_t size) noexcept : next(bytes), end(bytes + size)
{
    constexpr Reading choices[] = {Mixture,  TameMixture,     AllOnGrid,   AllOnGrid,
                                   AllWhole, AllWithFraction, TameMixture, AllRaw};
    reading = choices[Byte() % std::size(choices)];
    gridStep = std::ldexp(1.0, Byte() % 16 - 4);
}

std::uint8_t Input::Byte() noexcept
{
    return next == end ? std::uint8_t{0} : *next++;
}

bool Input::Flag() noexcept
{
    return (Byte() & 1) != 0;
}

int Input::Choice(int count) noexcept
{
    return Byte() % count;
}

std::uint64_t Input::Bits(int bytes) noexcept
{
    std::uint64_t bits = 0;
    for (int i = 0; i < bytes; ++i)
        bits |= std::uint64_t{Byte()} << (8 * i);
    return bits;
}

double Input::Remember(double value) noexcept
{
    earlier[remembered++ % memory] = value;
    return value;
}

double Input::DoubleOfKind(int kind) noexcept
{
    switch (kind) {
    case RawBits: {
        const std::uint64_t bits = Bits(8);
        double value;
        std::memcpy(&value, &bits, sizeof value);
        return value;
    }
    case OnGrid:
        return static_cast<std::int8_t>(Byte()) * gridStep;
    case Whole:
        return static_cast<std::int16_t>(Bits(2));
    case WithFraction:
        return static_cast<std::int32_t>(Bits(4)) / 65536.0;
    case RawFloat: {
        const auto bits = static_cast<std::uint32_t>(Bits(4));
        float value;
        std::memcpy(&value, &bits, sizeof value);
        return static_cast<double>(value);
    }
    case AnyMagnitude: {
        const auto mantissa = static_cast<std::int16_t>(Bits(2));
        return std::ldexp(mantissa, static_cast<std::int8_t>(Byte()));
    }
    case Border:
        return borders[Byte() % std::size(borders)];
    case Earlier:
        return earlier[Byte() % memory];
    case NextToEarlier:
        return std::nextafter(earlier[Byte() % memory], Flag() ? infinity : -infinity);
    default:
        return -earlier[Byte() % memory];
    }
}

double Input::Double() noexcept
{
    switch (reading) {
    case Mixture:
        return Remember(DoubleOfKind(Byte() % kinds));
    case TameMixture: {
        constexpr Kind tame[] = {OnGrid, Whole, WithFraction, Earlier, NextToEarlier, EarlierNegated};
        return Remember(DoubleOfKind(tame[Byte() % std::size(tame)]));
    }
    case AllRaw:
        return Remember(DoubleOfKind(RawBits));
    default:
        return Remember(DoubleOfKind(reading));
    }
}

std::int32_t Input::IntOfKind(int kind) noexcept
{
    switch (kind) {
    case RawBits:
        return static_cast<std::int32_t>(Bits(4));
    case OnGrid:
        return static_cast<std::int8_t>(Byte());
    case Whole:
        return static_cast<std::int16_t>(Bits(2));
    case Border:
        return integerBorders[Byte() % std::size(integerBorders)];
    default:
        return TruncateToInt(earlier[Byte() % memory]);
    }
}

std::int32_t Input::Int() noexcept
{
    constexpr Kind any[] = {RawBits, OnGrid, Whole, Border, Earlier};
    switch (reading) {
    case AllOnGrid:
        return IntOfKind(OnGrid);
    case AllWhole:
    case AllWithFraction:
        return IntOfKind(Whole);
    case AllRaw:
        return IntOfKind(RawBits);
    case TameMixture:
        return IntOfKind(any[1 + Byte() % 2]);
    default:
        const std::int32_t value = IntOfKind(any[Byte() % std::size(any)]);
        earlier[remembered++ % memory] = value;
        return value;
    }
}

double Input::Parameter() noexcept
{
    const std::uint8_t kind = Byte();
    if (kind < 128)
        return kind / 127.0;
    if (kind < 192)
        return static_cast<double>(Bits(4)) / 4294967295.0;
    if (kind < 224)
        return (static_cast<double>(Byte()) - 128.0) / 64.0;
    return DoubleOfKind(kind % kinds);
}

point2d Input::Point() noexcept
{
    const double x = Double();
    return {x, Double()};
}

vector2d Input::Vector() noexcept
{
    return AsVector(Point());
}

POINT Input::IntegerPoint() noexcept
{
    const std::int32_t x = Int();
    return {x, Int()};
}

RECT Input::Rect() noexcept
{
    const POINT leftTop = IntegerPoint();
    const POINT rightBottom = IntegerPoint();
    return {leftTop.x, leftTop.y, rightBottom.x, rightBottom.y};
}

BoundsT<double> Input::Bounds() noexcept
{
    const point2d leftTop = Point();
    const point2d rightBottom = Point();
    return {leftTop.x, leftTop.y, rightBottom.x, rightBottom.y};
}

MATRIX Input::Matrix() noexcept
{
    const point2d x = Point();
    const point2d y = Point();
    const point2d translation = Point();
    return {x.x, y.x, translation.x, x.y, y.y, translation.y};
}

Cubic Input::Curve() noexcept
{
    const int shape = Choice(8);
    std::array<point2d, 4> p;
    for (point2d& point : p)
        point = Point();
    if (shape == 7) // two of them coincide
        p[static_cast<std::size_t>(Choice(4))] = p[static_cast<std::size_t>(Choice(4))];
    return Cubic(p);
}

IntegerCubic Input::IntegerCurve() noexcept
{
    return {{IntegerPoint(), IntegerPoint(), IntegerPoint(), IntegerPoint()}};
}

std::vector<point2d> Input::Points(int count)
{
    std::vector<point2d> points(static_cast<std::size_t>(count));
    for (point2d& p : points)
        p = Point();
    return points;
}

std::vector<POINT> Input::IntegerPoints(int count)
{
    std::vector<POINT> points(static_cast<std::size_t>(count));
    for (POINT& p : points)
        p = IntegerPoint();
    return points;
}

} // namespace ZarnMath::Fuzzing
